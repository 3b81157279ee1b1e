// TimeDisplay: how a time is shown to a user.
//
// Hours:minutes:seconds:frames timecode at a nominal frame count per second
// (drop-frame or not), a plain frame count, feet and frames of 16 mm or 35 mm
// film, audio samples or milliseconds. The timecode formatter and parser take a
// TimeDisplay together with the media's own FrameRate.
//
//   TimeDisplay display = GetTimeDisplayForFrameRate(kFrameRate_Video29_97, true, true,
//                                                    kTimeDisplay_2997DropTimecode, false);
//   display.IsDropFrame();   // true
#pragma once

#include <zebcore/json.h>
#include <zebcore/stream.h>
#include <zebcore/string.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/localized_description.h>
#include <zebmediatypes/tick_time.h>

#include <cstdint>
#include <iosfwd>

namespace zebmediatypes {

// Display type codes. Any code not listed behaves like kTimeDisplay_Invalid.
enum TimeDisplayType : std::int32_t {
  kTimeDisplay_24Timecode = 100,
  kTimeDisplay_25Timecode = 101,
  kTimeDisplay_2997DropTimecode = 102,
  kTimeDisplay_2997NonDropTimecode = 103,
  kTimeDisplay_30Timecode = 104,
  kTimeDisplay_50Timecode = 105,
  kTimeDisplay_5994DropTimecode = 106,
  kTimeDisplay_5994NonDropTimecode = 107,
  kTimeDisplay_60Timecode = 108,
  kTimeDisplay_Frames = 109,  // frame count at the media's own rate
  kTimeDisplay_23976Timecode = 110,
  kTimeDisplay_16mmFeetFrames = 111,  // 40 frames per foot, media rate
  kTimeDisplay_35mmFeetFrames = 112,  // 16 frames per foot, media rate
  kTimeDisplay_48Timecode = 113,
  kTimeDisplay_11988Timecode = 114,
  kTimeDisplay_14985Timecode = 115,
  kTimeDisplay_AudioSamplesTimecode = 200,  // samples at the media's own rate
  kTimeDisplay_AudioMsTimecode = 201,       // milliseconds
  kTimeDisplay_CustomFrameRateTimecode = 998,
  kTimeDisplay_Invalid = 999,  // the default: "the display for the media's rate"
};

namespace details {
// Logs the warning for a custom display made without a frame count.
ZEBMEDIATYPES_API void LogCustomTimeDisplayWithoutRate() noexcept;
}  // namespace details

// TimeDisplay
//
// A type code and a custom frames-per-second count. The custom count means
// something only for kTimeDisplay_CustomFrameRateTimecode, is then at least 1,
// and is kept at 30 for every other type. Trivially copyable; pass by value.
class ZEBMEDIATYPES_API TimeDisplay {
 public:
  // (kTimeDisplay_Invalid, 30).
  constexpr TimeDisplay() noexcept = default;
  // (type, 30). A custom type given this way has no frame count: a warning is
  // logged and 30 is used.
  constexpr explicit TimeDisplay(TimeDisplayType type) noexcept : type_(type) {
    if (type == kTimeDisplay_CustomFrameRateTimecode) details::LogCustomTimeDisplayWithoutRate();
  }
  // The same from a raw type code.
  constexpr explicit TimeDisplay(unsigned int typeCode) noexcept
      : TimeDisplay(static_cast<TimeDisplayType>(static_cast<std::int32_t>(typeCode))) {}

  // The constructor's display for every type but the custom one; for that,
  // the display GetTimeDisplayForFrameRate picks for `rate` (a standard display
  // for a standard rate, a custom display otherwise).
  static TimeDisplay Create(TimeDisplayType type, FrameRate rate) noexcept;
  // A custom display of `framesPerSecond` (0 is taken as 30).
  static constexpr TimeDisplay CreateCustom(unsigned int framesPerSecond) noexcept {
    return TimeDisplay(kTimeDisplay_CustomFrameRateTimecode,
                       framesPerSecond == 0 ? kDefaultFps : framesPerSecond);
  }

  constexpr TimeDisplayType GetType() const noexcept { return type_; }
  constexpr unsigned int GetCustomFramesPerSecond() const noexcept { return customFps_; }

  // Stores `type`; for any type but the custom one the custom count goes back
  // to 30.
  constexpr void SetType(TimeDisplayType type) noexcept {
    type_ = type;
    if (type != kTimeDisplay_CustomFrameRateTimecode) customFps_ = kDefaultFps;
  }
  // Makes this a custom display of `framesPerSecond` (0 is taken as 30, since
  // timecode needs at least one frame per second).
  constexpr void SetCustomFramesPerSecond(unsigned int framesPerSecond) noexcept {
    type_ = kTimeDisplay_CustomFrameRateTimecode;
    customFps_ = framesPerSecond == 0 ? kDefaultFps : framesPerSecond;
  }

  constexpr bool IsCustom() const noexcept { return type_ == kTimeDisplay_CustomFrameRateTimecode; }
  // 29.97 or 59.94 drop-frame.
  constexpr bool IsDropFrame() const noexcept {
    return type_ == kTimeDisplay_2997DropTimecode || type_ == kTimeDisplay_5994DropTimecode;
  }
  // False for the displays that take their count from the media rate (frames,
  // feet and frames, audio samples), true for every other code.
  bool HasFramesPerSecond() const noexcept;

  // The display's frames per second: 24 for 24 and 23.976 timecode, 30 for the
  // 29.97 displays, 1000 for milliseconds, the custom count, and 30 for the
  // displays without a count of their own and for unknown codes.
  std::int64_t GetDisplayFramesPerSecond() const noexcept;
  // The same, except that the frames, feet and frames and audio-sample
  // displays take the frames per second of `rate` rounded to nearest (half away
  // from zero), at least 1 (no rate counts as 0, so gives 1).
  std::int64_t GetDisplayFramesPerSecond(FrameRate rate) const noexcept;

  // Equal when the types are equal and, for two custom displays, the counts.
  friend constexpr bool operator==(TimeDisplay a, TimeDisplay b) noexcept {
    return a.type_ == b.type_ && (!a.IsCustom() || a.customFps_ == b.customFps_);
  }
  friend constexpr bool operator!=(TimeDisplay a, TimeDisplay b) noexcept { return !(a == b); }
  // By type code (signed); two custom displays by their counts.
  friend constexpr bool operator<(TimeDisplay a, TimeDisplay b) noexcept {
    if (a.type_ != b.type_) return a.type_ < b.type_;
    return a.IsCustom() && a.customFps_ < b.customFps_;
  }
  friend constexpr bool operator>(TimeDisplay a, TimeDisplay b) noexcept { return b < a; }
  friend constexpr bool operator<=(TimeDisplay a, TimeDisplay b) noexcept { return !(b < a); }
  friend constexpr bool operator>=(TimeDisplay a, TimeDisplay b) noexcept { return !(a < b); }

 private:
  constexpr TimeDisplay(TimeDisplayType type, unsigned int customFps) noexcept
      : type_(type), customFps_(customFps) {}

  static constexpr unsigned int kDefaultFps = 30;

  TimeDisplayType type_ = kTimeDisplay_Invalid;
  unsigned int customFps_ = kDefaultFps;
};

// The nominal rate of a display: the named rate of a standard timecode
// display, `mediaRate` for frames, feet and frames and audio samples,
// 254016000000 / count for a custom display, kFrameRate_Invalid for the
// invalid display and unknown codes.
ZEBMEDIATYPES_API FrameRate GetFrameRateForTimeDisplay(TimeDisplay display,
                                                       FrameRate mediaRate) noexcept;

// GetTimeDisplayForFrameRate()
//
// The display for a rate: the standard timecode display of a named video rate
// (drop-frame for 29.97 and 59.94 when `dropFrame`), milliseconds for
// kFrameRate_Milliseconds when `allowMilliseconds`, audio samples for an audio
// rate (IsFrameRateAudio), otherwise a custom display of the rate's frames per
// second rounded (at least 1). For kFrameRate_Invalid the display of type
// `fallback`, or custom 1 when `fallback` is the custom type. `unused` is not
// consulted.
ZEBMEDIATYPES_API TimeDisplay GetTimeDisplayForFrameRate(FrameRate rate, bool dropFrame,
                                                         bool unused, TimeDisplayType fallback,
                                                         bool allowMilliseconds) noexcept;

// The display for durations: frames and feet and frames stay as they are
// unless `forceTimecode`; everything else becomes the timecode display of
// `rate` (drop-frame when `display` is).
ZEBMEDIATYPES_API TimeDisplay GetDurationTimeDisplay(FrameRate rate, TimeDisplay display,
                                                     bool forceTimecode) noexcept;

// Digits of the frame field: 1 when the display's frames per second f < 2,
// else the digits of f - 1 (24, 25, 30, 60 give 2; 1000 gives 3; 101 gives 3).
ZEBMEDIATYPES_API int GetTimeDisplayFrameStringWidth(TimeDisplay display) noexcept;
ZEBMEDIATYPES_API int GetTimeDisplayFrameStringWidth(TimeDisplay display, FrameRate rate) noexcept;

// The 29.97 and 59.94 displays, drop-frame or not.
ZEBMEDIATYPES_API bool IsDropFrameApplicableForTimeDisplay(TimeDisplay display) noexcept;
// 16 mm and 35 mm feet and frames.
ZEBMEDIATYPES_API bool IsFeetFramesDisplay(TimeDisplay display) noexcept;
// 40 for 16 mm, 16 for 35 mm, 0 for every other display.
ZEBMEDIATYPES_API int GetFramesPerFoot(TimeDisplay display) noexcept;
// Whether the display is hours:minutes:seconds:frames text: false for feet and
// frames and the invalid display, `framesCount` for the frames display, true
// otherwise.
ZEBMEDIATYPES_API bool IsHMSFTimeDisplay(TimeDisplay display, bool framesCount) noexcept;
ZEBMEDIATYPES_API bool IsTimeDisplayDropFrame(TimeDisplay display) noexcept;
// Audio samples and milliseconds.
ZEBMEDIATYPES_API bool IsTimeDisplayFormatAudio(TimeDisplay display) noexcept;

// The type code as a number with two decimals ("102.00").
ZEBMEDIATYPES_API std::ostream& operator<<(std::ostream& out, TimeDisplay display);
ZEBMEDIATYPES_API zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out,
                                                            TimeDisplay display);
ZEBMEDIATYPES_API void PrintTo(TimeDisplay display, std::ostream* out);

// The name of a display ("29.97 fps Drop-Frame", localized as "29.97 fps
// Drop-Frame Timecode"); an empty string for the invalid display and unknown
// codes. `localized` 1 asks for the localizer's text.
ZEBMEDIATYPES_API zebcore::UTF16String TimeDisplayDescription(TimeDisplay display,
                                                              LocalizedDescription localized);
// A rate as "29.97fps", or "48000Hz" for rates of 8000 Hz and faster
// (localized).
ZEBMEDIATYPES_API zebcore::UTF16String FrameRateDescription(FrameRate rate);

}  // namespace zebmediatypes

// JSON form: {"type": code}, with "fps": count added for a custom display.
// Reading also takes a bare integer type code. A "type" or "fps" member that is
// not an integer raises boost::bad_any_cast; any other unreadable value is
// logged and reads as the default display.
template <>
struct ZEBMEDIATYPES_API zebcore::serialization::JSONConvert<zebmediatypes::TimeDisplay> {
  static boost::any ToJSON(const zebmediatypes::TimeDisplay& display);
  static zebmediatypes::TimeDisplay FromJSON(const boost::any& value);
};
