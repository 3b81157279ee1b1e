// TimeDisplay: the display table, display choice, predicates, text and JSON
// forms and descriptions.
#include <zebcore/localizer.h>
#include <zebcore/logging.h>
#include <zebmediatypes/time_display.h>

#include <cmath>
#include <iterator>
#include <limits>
#include <ostream>
#include <string_view>

namespace zebmediatypes {

namespace {

// What each display code stands for. `mediaRate` displays take their count and
// rate from the media; for them `framesPerSecond` is the fallback count 30.
struct DisplayInfo {
  TimeDisplayType type;
  std::int64_t framesPerSecond;
  bool mediaRate;
  FrameRate nominalRate;
  std::string_view key;
  std::string_view plainText;
};

constexpr DisplayInfo kDisplays[] = {
    {kTimeDisplay_24Timecode, 24, false, kFrameRate_Video24,
     "$$$/zebmediatypes/TimeDisplay/24=24 fps Timecode", "24 fps"},
    {kTimeDisplay_25Timecode, 25, false, kFrameRate_Video25,
     "$$$/zebmediatypes/TimeDisplay/25=25 fps Timecode", "25 fps"},
    {kTimeDisplay_2997DropTimecode, 30, false, kFrameRate_Video29_97,
     "$$$/zebmediatypes/TimeDisplay/2997DF=29.97 fps Drop-Frame Timecode", "29.97 fps Drop-Frame"},
    {kTimeDisplay_2997NonDropTimecode, 30, false, kFrameRate_Video29_97,
     "$$$/zebmediatypes/TimeDisplay/2997NDF=29.97 fps Non-Drop-Frame Timecode",
     "29.97 fps Non-Drop-Frame"},
    {kTimeDisplay_30Timecode, 30, false, kFrameRate_Video30,
     "$$$/zebmediatypes/TimeDisplay/30=30 fps Timecode", "30 fps"},
    {kTimeDisplay_50Timecode, 50, false, kFrameRate_Video50,
     "$$$/zebmediatypes/TimeDisplay/50=50 fps Timecode", "50 fps"},
    {kTimeDisplay_5994DropTimecode, 60, false, kFrameRate_Video59_94,
     "$$$/zebmediatypes/TimeDisplay/5994DF=59.94 fps Drop-Frame Timecode", "59.94 fps Drop-Frame"},
    {kTimeDisplay_5994NonDropTimecode, 60, false, kFrameRate_Video59_94,
     "$$$/zebmediatypes/TimeDisplay/5994NDF=59.94 fps Non-Drop-Frame Timecode",
     "59.94 fps Non-Drop-Frame"},
    {kTimeDisplay_60Timecode, 60, false, kFrameRate_Video60,
     "$$$/zebmediatypes/TimeDisplay/60=60 fps Timecode", "60 fps"},
    {kTimeDisplay_Frames, 30, true, kFrameRate_Invalid,
     "$$$/zebmediatypes/TimeDisplay/Frames=Frames", "Frames"},
    {kTimeDisplay_23976Timecode, 24, false, kFrameRate_Video23_976,
     "$$$/zebmediatypes/TimeDisplay/23976=23.976 fps Timecode", "23.976 fps"},
    {kTimeDisplay_16mmFeetFrames, 30, true, kFrameRate_Invalid,
     "$$$/zebmediatypes/TimeDisplay/16mmFeetFrames=Feet + Frames 16 mm", "Feet + Frames 16 mm"},
    {kTimeDisplay_35mmFeetFrames, 30, true, kFrameRate_Invalid,
     "$$$/zebmediatypes/TimeDisplay/35mmFeetFrames=Feet + Frames 35 mm", "Feet + Frames 35 mm"},
    {kTimeDisplay_48Timecode, 48, false, kFrameRate_Video48,
     "$$$/zebmediatypes/TimeDisplay/48=48 fps Timecode", "48 fps"},
    {kTimeDisplay_11988Timecode, 12, false, kFrameRate_Video11_988,
     "$$$/zebmediatypes/TimeDisplay/11988=11.988 fps Timecode", "11.988 fps"},
    {kTimeDisplay_14985Timecode, 15, false, kFrameRate_Video14_985,
     "$$$/zebmediatypes/TimeDisplay/14985=14.985 fps Timecode", "14.985 fps"},
    {kTimeDisplay_AudioSamplesTimecode, 30, true, kFrameRate_Invalid,
     "$$$/zebmediatypes/TimeDisplay/AudioSamples=Audio Samples", "Audio Samples"},
    {kTimeDisplay_AudioMsTimecode, 1000, false, kFrameRate_Milliseconds,
     "$$$/zebmediatypes/TimeDisplay/Milliseconds=Milliseconds", "Milliseconds"},
};
static_assert(std::size(kDisplays) == 18);

constexpr std::string_view kCustomKey = "$$$/zebmediatypes/TimeDisplay/Custom=@0 fps Timecode";
constexpr std::string_view kCustomPlainText = "Custom fps";
constexpr unsigned int kDefaultCustomFps = 30;

// The entry of a standard display; null for custom, invalid and unknown codes.
const DisplayInfo* FindDisplay(TimeDisplayType type) noexcept {
  for (const DisplayInfo& info : kDisplays) {
    if (info.type == type) return &info;
  }
  return nullptr;
}

bool TakesMediaRate(TimeDisplayType type) noexcept {
  return type == kTimeDisplay_Frames || type == kTimeDisplay_16mmFeetFrames ||
         type == kTimeDisplay_35mmFeetFrames || type == kTimeDisplay_AudioSamplesTimecode;
}

// Frames per second rounded half away from zero, at least 1. No rate counts as
// 0. At most 254016000000 (one tick per frame).
std::int64_t RoundedFramesPerSecond(FrameRate rate) noexcept {
  const double rounded = std::round(rate.GetFramesPerSecond());
  return rounded < 1.0 ? 1 : static_cast<std::int64_t>(rounded);
}

// The same as a custom display count, at most the largest 32-bit count.
unsigned int RoundedCustomFramesPerSecond(FrameRate rate) noexcept {
  const std::int64_t fps = RoundedFramesPerSecond(rate);
  return fps > std::numeric_limits<unsigned int>::max() ? std::numeric_limits<unsigned int>::max()
                                                        : static_cast<unsigned int>(fps);
}

int DecimalDigits(std::int64_t value) noexcept {
  int digits = 1;
  while (value >= 10) {
    value /= 10;
    ++digits;
  }
  return digits;
}

int FrameFieldWidth(std::int64_t framesPerSecond) noexcept {
  return framesPerSecond < 2 ? 1 : DecimalDigits(framesPerSecond - 1);
}

void LogCustomDisplayWithoutRate() {
  if (!zebcore::logging::LoggingIsEnabled() &&
      !zebcore::logging::TraceEnabled("zebcore.StructuredLogging", 4)) {
    return;
  }
  zebcore::logging::LogRecord record;
  record.message = "WARNING: A custom TimeDisplay was created without a frame rate; using default";
  record.fields.emplace_back("Default rate", boost::any(std::int64_t{kDefaultCustomFps}));
  record.fields.emplace_back(
      "expression",
      boost::any(zebcore::string::ToUTF8String("mType == kTimeDisplay_CustomFrameRateTimecode")));
  record.source = "TimeDisplay";
  record.function = "zebmediatypes::TimeDisplay::TimeDisplay";
  zebcore::logging::Log(record);
}

zebcore::UTF16String Localize(std::string_view key) {
  return zebcore::config::Localizer::Get().Localize(key);
}

}  // namespace

namespace details {

void LogCustomTimeDisplayWithoutRate() noexcept {
  try {
    LogCustomDisplayWithoutRate();
  } catch (...) {
    // A failing log sink must not make a value constructor fail.
  }
}

}  // namespace details

TimeDisplay TimeDisplay::Create(TimeDisplayType type, FrameRate rate) noexcept {
  if (type != kTimeDisplay_CustomFrameRateTimecode) return TimeDisplay(type);
  return GetTimeDisplayForFrameRate(rate, true, true, kTimeDisplay_2997DropTimecode, false);
}

bool TimeDisplay::HasFramesPerSecond() const noexcept { return !TakesMediaRate(type_); }

std::int64_t TimeDisplay::GetDisplayFramesPerSecond() const noexcept {
  if (IsCustom()) return customFps_;
  const DisplayInfo* info = FindDisplay(type_);
  return info ? info->framesPerSecond : 30;
}

std::int64_t TimeDisplay::GetDisplayFramesPerSecond(FrameRate rate) const noexcept {
  return TakesMediaRate(type_) ? RoundedFramesPerSecond(rate) : GetDisplayFramesPerSecond();
}

FrameRate GetFrameRateForTimeDisplay(TimeDisplay display, FrameRate mediaRate) noexcept {
  if (display.IsCustom()) {
    return FrameRate::FromFramesPerSecond(display.GetCustomFramesPerSecond());
  }
  if (TakesMediaRate(display.GetType())) return mediaRate;
  const DisplayInfo* info = FindDisplay(display.GetType());
  return info ? info->nominalRate : kFrameRate_Invalid;
}

TimeDisplay GetTimeDisplayForFrameRate(FrameRate rate, bool dropFrame, bool /*unused*/,
                                       TimeDisplayType fallback, bool allowMilliseconds) noexcept {
  struct RateDisplay {
    FrameRate rate;
    TimeDisplayType display;
    TimeDisplayType dropDisplay;
  };
  static constexpr RateDisplay kRateDisplays[] = {
      {kFrameRate_Video11_988, kTimeDisplay_11988Timecode, kTimeDisplay_11988Timecode},
      {kFrameRate_Video14_985, kTimeDisplay_14985Timecode, kTimeDisplay_14985Timecode},
      {kFrameRate_Video23_976, kTimeDisplay_23976Timecode, kTimeDisplay_23976Timecode},
      {kFrameRate_Video24, kTimeDisplay_24Timecode, kTimeDisplay_24Timecode},
      {kFrameRate_Video25, kTimeDisplay_25Timecode, kTimeDisplay_25Timecode},
      {kFrameRate_Video29_97, kTimeDisplay_2997NonDropTimecode, kTimeDisplay_2997DropTimecode},
      {kFrameRate_Video30, kTimeDisplay_30Timecode, kTimeDisplay_30Timecode},
      {kFrameRate_Video48, kTimeDisplay_48Timecode, kTimeDisplay_48Timecode},
      {kFrameRate_Video50, kTimeDisplay_50Timecode, kTimeDisplay_50Timecode},
      {kFrameRate_Video59_94, kTimeDisplay_5994NonDropTimecode, kTimeDisplay_5994DropTimecode},
      {kFrameRate_Video60, kTimeDisplay_60Timecode, kTimeDisplay_60Timecode},
  };
  static_assert(std::size(kRateDisplays) == 11);

  for (const RateDisplay& entry : kRateDisplays) {
    if (entry.rate == rate) return TimeDisplay(dropFrame ? entry.dropDisplay : entry.display);
  }
  if (allowMilliseconds && rate == kFrameRate_Milliseconds) {
    return TimeDisplay(kTimeDisplay_AudioMsTimecode);
  }
  if (IsFrameRateAudio(rate)) return TimeDisplay(kTimeDisplay_AudioSamplesTimecode);
  if (rate != kFrameRate_Invalid || fallback == kTimeDisplay_CustomFrameRateTimecode) {
    return TimeDisplay::CreateCustom(RoundedCustomFramesPerSecond(rate));
  }
  return TimeDisplay(fallback);
}

TimeDisplay GetDurationTimeDisplay(FrameRate rate, TimeDisplay display,
                                   bool forceTimecode) noexcept {
  const TimeDisplayType type = display.GetType();
  if (!forceTimecode && (type == kTimeDisplay_Frames || IsFeetFramesDisplay(display))) {
    return display;
  }
  return GetTimeDisplayForFrameRate(rate, display.IsDropFrame(), true,
                                    kTimeDisplay_2997DropTimecode, false);
}

int GetTimeDisplayFrameStringWidth(TimeDisplay display) noexcept {
  return FrameFieldWidth(display.GetDisplayFramesPerSecond());
}

int GetTimeDisplayFrameStringWidth(TimeDisplay display, FrameRate rate) noexcept {
  return FrameFieldWidth(display.GetDisplayFramesPerSecond(rate));
}

bool IsDropFrameApplicableForTimeDisplay(TimeDisplay display) noexcept {
  const TimeDisplayType type = display.GetType();
  return type == kTimeDisplay_2997DropTimecode || type == kTimeDisplay_2997NonDropTimecode ||
         type == kTimeDisplay_5994DropTimecode || type == kTimeDisplay_5994NonDropTimecode;
}

bool IsFeetFramesDisplay(TimeDisplay display) noexcept {
  return display.GetType() == kTimeDisplay_16mmFeetFrames ||
         display.GetType() == kTimeDisplay_35mmFeetFrames;
}

int GetFramesPerFoot(TimeDisplay display) noexcept {
  switch (display.GetType()) {
    case kTimeDisplay_16mmFeetFrames:
      return 40;
    case kTimeDisplay_35mmFeetFrames:
      return 16;
    default:
      return 0;
  }
}

bool IsHMSFTimeDisplay(TimeDisplay display, bool framesCount) noexcept {
  switch (display.GetType()) {
    case kTimeDisplay_16mmFeetFrames:
    case kTimeDisplay_35mmFeetFrames:
    case kTimeDisplay_Invalid:
      return false;
    case kTimeDisplay_Frames:
      return framesCount;
    default:
      return true;
  }
}

bool IsTimeDisplayDropFrame(TimeDisplay display) noexcept { return display.IsDropFrame(); }

bool IsTimeDisplayFormatAudio(TimeDisplay display) noexcept {
  return display.GetType() == kTimeDisplay_AudioSamplesTimecode ||
         display.GetType() == kTimeDisplay_AudioMsTimecode;
}

namespace {

zebcore::UTF16String TypeCodeText(TimeDisplay display) {
  return zebcore::string::NumberToString(static_cast<double>(display.GetType()), 1, 2,
                                         zebcore::string::kNumberToString_Default, 31);
}

}  // namespace

std::ostream& operator<<(std::ostream& out, TimeDisplay display) {
  return out << zebcore::string::UTF16toNarrow(zebcore::string::View(TypeCodeText(display)));
}

zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out, TimeDisplay display) {
  return out << TypeCodeText(display);
}

void PrintTo(TimeDisplay display, std::ostream* out) {
  *out << "TimeDisplay(" << static_cast<std::int32_t>(display.GetType());
  if (display.IsCustom()) *out << ", " << display.GetCustomFramesPerSecond() << " fps";
  *out << ")";
}

zebcore::UTF16String TimeDisplayDescription(TimeDisplay display, LocalizedDescription localized) {
  const bool useLocalizer = localized == 1;
  if (display.IsCustom()) {
    if (!useLocalizer) return zebcore::string::AsciiToUTF16(kCustomPlainText);
    return zebcore::string::ReplaceInString(
        Localize(kCustomKey),
        zebcore::string::AsciiToUTF16(std::to_string(display.GetCustomFramesPerSecond())));
  }
  const DisplayInfo* info = FindDisplay(display.GetType());
  if (!info) return {};
  return useLocalizer ? Localize(info->key) : zebcore::string::AsciiToUTF16(info->plainText);
}

zebcore::UTF16String FrameRateDescription(FrameRate rate) {
  // Rates slower than the slowest named audio rate (8000 Hz) are video rates.
  const bool video = !rate.IsValid() || rate > details::kAudioRateConstants[0];
  const zebcore::UTF16String text =
      Localize(video ? "$$$/zebmediatypes/FrameRateFormat/Video=@0fps"
                     : "$$$/zebmediatypes/FrameRateFormat/Audio=@0Hz");
  return zebcore::string::ReplaceInString(text, FrameRateToUTF16String(rate));
}

}  // namespace zebmediatypes

namespace zebcore::serialization {

namespace {

// The integer held by a JSON member; bad_any_cast for any other JSON type.
std::int64_t MemberInteger(const JSONValue& member, std::int64_t absent) {
  if (!member) return absent;
  if (const auto* u = boost::any_cast<std::uint64_t>(member.get())) {
    return static_cast<std::int64_t>(*u);
  }
  return boost::any_cast<std::int64_t>(*member);
}

zebmediatypes::TimeDisplayType TypeFromCode(std::int64_t code) {
  if (code < std::numeric_limits<std::int32_t>::min() ||
      code > std::numeric_limits<std::int32_t>::max()) {
    return zebmediatypes::kTimeDisplay_Invalid;
  }
  return static_cast<zebmediatypes::TimeDisplayType>(static_cast<std::int32_t>(code));
}

}  // namespace

boost::any JSONConvert<zebmediatypes::TimeDisplay>::ToJSON(
    const zebmediatypes::TimeDisplay& display) {
  boost::any object;
  AddToObject(object, std::string_view("type"),
              boost::any(static_cast<std::int64_t>(display.GetType())), true);
  if (display.IsCustom()) {
    AddToObject(object, std::string_view("fps"),
                boost::any(static_cast<std::int64_t>(display.GetCustomFramesPerSecond())), true);
  }
  return object;
}

zebmediatypes::TimeDisplay JSONConvert<zebmediatypes::TimeDisplay>::FromJSON(
    const boost::any& value) {
  using zebmediatypes::TimeDisplay;
  if (boost::any_cast<JSONObject>(&value) != nullptr) {
    const zebmediatypes::TimeDisplayType type =
        TypeFromCode(MemberInteger(GetVariantInObject(value, "type"), 0));
    const std::int64_t fps = MemberInteger(GetVariantInObject(value, "fps"), 30);
    if (type == zebmediatypes::kTimeDisplay_CustomFrameRateTimecode) {
      // A count outside the 32-bit range is unreadable; it reads as the default.
      const bool fits = fps >= 0 && fps <= std::numeric_limits<unsigned int>::max();
      return TimeDisplay::CreateCustom(fits ? static_cast<unsigned int>(fps) : 0u);
    }
    return TimeDisplay(type);
  }
  std::int64_t code = 0;
  if (GetJSONInt64(value, code)) return TimeDisplay(TypeFromCode(code));
  if (const auto* u = boost::any_cast<std::uint64_t>(&value)) {
    return TimeDisplay(TypeFromCode(static_cast<std::int64_t>(*u)));
  }
  logging::LogException(
      "zebcore::serialization::JSONConvert<class zebmediatypes::TimeDisplay>::FromJSON",
      "not a TimeDisplay");
  return TimeDisplay();
}

}  // namespace zebcore::serialization
