#include "commands/time_commands.h"

#include <zebmediatypes/tick_time.h>
#include <zebmediatypes/time_display.h>
#include <zebmediatypes/timecode.h>

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string_view>
#include <vector>

namespace zebmediatypes::Commands {

const char16_t* const TimeToTimecode::kHelp =
    u"zebmediatypes.TimeToTimecode [-s] <time> <source_fps> <display_fps> [-d]- This command "
    u"will convert a time in frames to a timecode and print it. Time will be interpreted as "
    u"seconds if -s is specified before the time. Time display will use drop frame if -d is "
    u"specified after display_fps";

const char16_t* const TimecodeToTime::kHelp =
    u"zebmediatypes.TimecodeToTime <timecode> <source_fps> <display_fps> [-d]- This command "
    u"will convert a timecode string to a time in seconds and frames and print it. <timecode> "
    u"should be in HH:MM:SS:FF format. Time display will use drop frame if -d is specified "
    u"after display_fps";

namespace {

constexpr LocalizedDescription kLocalized = 1;

// The argument text split at spaces (runs of spaces are one separator), each
// token trimmed of white space at both ends.
class Arguments {
 public:
  explicit Arguments(const zebcore::UTF16String& text) {
    const std::u16string_view all(text.data(), text.size());
    std::size_t i = 0;
    while (i < all.size()) {
      while (i < all.size() && all[i] == u' ') ++i;
      const std::size_t start = i;
      while (i < all.size() && all[i] != u' ') ++i;
      if (i > start) {
        zebcore::UTF16String token = zebcore::string::RightTrim(
            zebcore::string::View(zebcore::string::LeftTrim(all.substr(start, i - start))));
        tokens_.push_back(std::move(token));
      }
    }
  }

  // The next token, or an empty one when there are no more.
  zebcore::UTF16String Next() {
    return next_ < tokens_.size() ? tokens_[next_++] : zebcore::UTF16String();
  }
  bool HasNext() const noexcept { return next_ < tokens_.size(); }

 private:
  std::vector<zebcore::UTF16String> tokens_;
  std::size_t next_ = 0;
};

// Whether `token` is the switch `name` ("-s", "-d"), whatever the letter case.
bool IsSwitch(const zebcore::UTF16String& token, char16_t letter) {
  if (token.size() != 2 || token[0] != u'-') return false;
  const char16_t c = token[1];
  return c == letter || c == letter - (u'a' - u'A');
}

// A number, or 0.0 for text that is not one.
double ReadNumber(const zebcore::UTF16String& token) {
  double value = 0.0;
  zebcore::string::StringToNumber(zebcore::string::View(token), value);
  return value;
}

// A frame count of `rate` from a double, truncated or rounded toward the
// nearest as asked, and clamped so that the time stays within
// [kTime_Min, kTime_Max]; NaN is 0.
TickTime TimeOfFrames(double frames, FrameRate rate, bool round) {
  if (!rate.IsValid() || !(frames == frames)) return kTime_Zero;
  const auto limit = static_cast<double>(kTime_Max.GetTicks() / rate.GetTicksPerFrame());
  if (frames > limit) frames = limit;
  if (frames < -limit) frames = -limit;
  const std::int64_t count =
      round ? static_cast<std::int64_t>(std::llround(frames)) : static_cast<std::int64_t>(frames);
  return TickTime(count, rate);
}

struct RateAndDisplay {
  FrameRate source;
  TimeDisplay display;
};

RateAndDisplay ReadRates(Arguments& args) {
  const FrameRate source = MatchedFrameRateFromFloat(ReadNumber(args.Next()));
  const FrameRate displayRate = MatchedFrameRateFromFloat(ReadNumber(args.Next()));
  const bool dropFrame = args.HasNext() && IsSwitch(args.Next(), u'd');
  return {source, GetTimeDisplayForFrameRate(displayRate, dropFrame, true,
                                             kTimeDisplay_2997DropTimecode, false)};
}

}  // namespace

void TimeToTimecode::Execute(const zebcore::UTF16String& arguments,
                             zebcore::string::UTF16OStream& out) {
  Arguments args(arguments);
  zebcore::UTF16String timeToken = args.Next();
  const bool inSeconds = IsSwitch(timeToken, u's');
  if (inSeconds) timeToken = args.Next();
  const double value = ReadNumber(timeToken);
  const RateAndDisplay rates = ReadRates(args);

  // Seconds are snapped to the nearest whole frame of the source.
  const TickTime time =
      inSeconds ? TimeOfFrames(rates.source.GetFramesPerSecond() * value, rates.source, true)
                : TimeOfFrames(value, rates.source, false);

  out << u"Timecode at time " << timeToken << u" in a " << rates.source
      << u" fps clip, displayed at " << TimeDisplayDescription(rates.display, kLocalized)
      << u" fps is: " << zebmediatypes::TimeToTimecode(time, rates.source, rates.display, {})
      << zebcore::string::endl;
}

void TimecodeToTime::Execute(const zebcore::UTF16String& arguments,
                             zebcore::string::UTF16OStream& out) {
  Arguments args(arguments);
  const zebcore::UTF16String timecode = args.Next();
  const RateAndDisplay rates = ReadRates(args);
  const TickTime time = zebmediatypes::TimecodeToTime(zebcore::string::View(timecode), rates.source,
                                                      rates.display, {});

  out << timecode << u" in a " << rates.source << u" fps clip, displayed at "
      << TimeDisplayDescription(rates.display, kLocalized) << u" fps is: ";
  if (time == kTime_Invalid) {
    out << u"INVALID";
  } else {
    out << time << u" seconds (" << time.ToFrame32(rates.source) << u" frames)";
  }
  out << zebcore::string::endl;
}

void RegisterTimeCommands() {
  auto& registry = zebcore::console::CommandRegistry::Get();
  registry.RegisterCommand(TimeToTimecode::kName, TimeToTimecode::kHelp,
                           [] { return std::make_shared<TimeToTimecode>(); });
  registry.RegisterCommand(TimecodeToTime::kName, TimecodeToTime::kHelp,
                           [] { return std::make_shared<TimecodeToTime>(); });
}

void UnregisterTimeCommands() {
  auto& registry = zebcore::console::CommandRegistry::Get();
  registry.UnregisterCommand(TimecodeToTime::kName);
  registry.UnregisterCommand(TimeToTimecode::kName);
}

}  // namespace zebmediatypes::Commands
