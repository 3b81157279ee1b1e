// TickTime and FrameRate: the out-of-line parts (reports, matching, text forms,
// JSON form).
#include <zebcore/assert.h>
#include <zebcore/string.h>
#include <zebmediatypes/tick_time.h>

#include <array>
#include <cmath>
#include <iterator>
#include <ostream>
#include <sstream>

namespace zebmediatypes {

namespace details {

void ReportTickTimeDivision(const char* function, int line) noexcept {
  zebcore::debug::ReportAssertion("false", "Attempt to divide by zero in zebmediatypes::TickTime",
                                  "TickTime", function, line);
}

void ReportFrameRateBreach(const char* function, int line) noexcept {
  zebcore::debug::ReportAssertion("false", "Attempt to multiply a zebmediatypes::FrameRate by zero",
                                  "FrameRate", function, line);
}

std::string ExplainTickTimeWithFrameRate(TickTime time, FrameRate rate) {
  std::ostringstream text;
  text << "which is ";
  if (!rate.IsValid()) {
    text << time.ToSeconds() << " seconds";
    return text.str();
  }
  const bool audio = IsAudioRateConstant(rate);
  text << static_cast<double>(time.GetTicks()) / static_cast<double>(rate.GetTicksPerFrame())
       << (audio ? " samples" : " frames") << " at " << rate.GetFramesPerSecond()
       << (audio ? "Hz" : "fps");
  return text.str();
}

}  // namespace details

namespace {

struct MatchedRate {
  double fps;
  FrameRate rate;
};

// The 1000/1001 rates, matched within kMatchTolerance in this order.
constexpr MatchedRate kMatchedRates[] = {
    {11.988011988011989, kFrameRate_Video11_988}, {14.985014985014985, kFrameRate_Video14_985},
    {23.976023976023978, kFrameRate_Video23_976}, {29.97002997002997, kFrameRate_Video29_97},
    {59.94005994005994, kFrameRate_Video59_94},   {119.88011988011988, kFrameRate_Video119_88}};
static_assert(std::size(kMatchedRates) == 6);
constexpr double kMatchTolerance = 0.005;

// IsFrameRateAudio() accepts the named audio rates from 22050 Hz up.
constexpr std::size_t kFirstAudioRate = 3;
static_assert(details::kAudioRateConstants[kFirstAudioRate] == kFrameRate_Audio22050);

}  // namespace

FrameRate MatchedFrameRateFromFloat(double fps) noexcept {
  if (!std::isfinite(fps) || fps <= 0.0) return kFrameRate_Invalid;
  for (const MatchedRate& m : kMatchedRates) {
    if (std::fabs(fps - m.fps) <= kMatchTolerance) return m.rate;
  }
  const std::int64_t ticks = details::CheckedTruncate(
      static_cast<double>(details::kTicksPerSecond) / fps, kFrameRate_Invalid.GetTicksPerFrame());
  return ticks > 0 ? FrameRate(ticks) : kFrameRate_Invalid;
}

bool IsFrameRateAudio(FrameRate rate) noexcept {
  for (std::size_t i = kFirstAudioRate; i < std::size(details::kAudioRateConstants); ++i) {
    if (details::kAudioRateConstants[i] == rate) return true;
  }
  return false;
}

TickTime TickTime::FromSeconds(double seconds) noexcept {
  const double ticks = std::round(seconds * static_cast<double>(details::kTicksPerSecond));
  return TickTime(details::CheckedTruncate(ticks, kTime_Invalid.GetTicks()));
}

std::ostream& operator<<(std::ostream& out, TickTime time) { return out << time.ToSeconds(); }

zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out, TickTime time) {
  std::ostringstream text;
  text << time.ToSeconds();
  return out << zebcore::string::UTF8to16(text.str());
}

zebcore::UTF16String FrameRateToUTF16String(FrameRate rate) {
  const bool threeDecimals = rate == kFrameRate_Video23_976 || rate == kFrameRate_Video11_988 ||
                             rate == kFrameRate_Video14_985;
  return zebcore::string::NumberToString(rate.GetFramesPerSecond(), 1, threeDecimals ? 3 : 2,
                                         zebcore::string::kNumberToString_TrimTrailingZeros, 31);
}

zebcore::UTF8String FrameRateToUTF8String(FrameRate rate) {
  return zebcore::string::UTF16to8(zebcore::string::View(FrameRateToUTF16String(rate)));
}

std::ostream& operator<<(std::ostream& out, FrameRate rate) {
  const zebcore::UTF8String text = FrameRateToUTF8String(rate);
  return out << zebcore::string::View(text);
}

zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out, FrameRate rate) {
  return out << FrameRateToUTF16String(rate);
}

void PrintTo(TickTime time, std::ostream* out) { *out << time.GetTicks() << " ticks"; }

void PrintTo(FrameRate rate, std::ostream* out) {
  *out << rate.GetTicksPerFrame() << " ticks/frame";
}

}  // namespace zebmediatypes

namespace zebcore::serialization {

boost::any JSONConvert<zebmediatypes::TickTime>::ToJSON(const zebmediatypes::TickTime& time) {
  boost::any object;
  AddToObject(object, std::string_view("ticks"), boost::any(time.GetTicks()), true);
  return object;
}

zebmediatypes::TickTime JSONConvert<zebmediatypes::TickTime>::FromJSON(const boost::any& value) {
  (void)boost::any_cast<const JSONObject&>(value);  // anything but an object throws
  const JSONValue ticks = GetVariantInObject(value, "ticks");
  if (!ticks) return zebmediatypes::TickTime(0);
  if (const auto* u = boost::any_cast<std::uint64_t>(ticks.get())) {
    return zebmediatypes::TickTime(static_cast<std::int64_t>(*u));
  }
  return zebmediatypes::TickTime(boost::any_cast<std::int64_t>(*ticks));
}

}  // namespace zebcore::serialization
