// Timecode text
//
// A TickTime written as the text a person reads for a media frame (or sample)
// rate and a TimeDisplay, and that text read back:
//
//   hours:minutes:seconds:frames   "00:01:00:00", drop-frame "00;01;00;02"
//   milliseconds                   "00:00:01.500"
//   audio samples                  "00:00:01:00000" (48000 Hz media)
//   a frame count                  "1800"
//   feet and frames of film        "2+03" (35 mm: 16 frames a foot; 16 mm: 40)
//
// `rate` is always the media's own rate; `display` chooses the labelling. The
// default display (kTimeDisplay_Invalid, and any code that names no display) is
// replaced by the media's standard display, drop-frame for 29.97 and 59.94 fps.
// Media frames are labelled at the display's frame count: 86400 frames of
// 23.976 fps media read "00:57:36:00" in the 25 fps display. Audio media at one
// of the ten sample-rate constants (8000 to 192000 Hz) is counted in frames of
// the display's nominal rate; other media is counted in its own frames.
//
// For the same rate, display and flags, TimecodeToTime reads what
// TimeToTimecode wrote back as the same frame-aligned time, negative times
// included when they are written with kTimecodeFlag_ShowSign (or in the frame
// count and film displays, which carry their own sign), within the 24 hours
// that the hours field holds (it wraps at 24). kTimecodeFlag_OmitHours is the
// exception: a text without its hours reads back modulo one hour.
//
// Display texts are zebcore::UTF16String; `std::cout << TimeToTimecode(...)`
// prints them as UTF-8 (zebcore/string.h). The readers take UTF-16 or UTF-8.
//
// All functions are pure and thread-safe.
#pragma once

#include <zebcore/flags.h>
#include <zebcore/string.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/tick_time.h>
#include <zebmediatypes/time_display.h>

#include <boost/rational.hpp>
#include <cstdint>
#include <optional>
#include <string_view>

namespace zebmediatypes {

// Style flags of the timecode text; combine them in a
// zebcore::utility::Flags<unsigned int>.
enum ETimecodeFlags : unsigned int {
  kTimecodeFlag_None = 0,
  // The hours field and its separator are not written.
  kTimecodeFlag_OmitHours = 0x1,
  // A leading hours or minutes field that is zero is not written, and the first
  // field written is not zero-padded: 24 frames at 24 fps read "1:00".
  kTimecodeFlag_TrimLeadingZeros = 0x2,
  // A positive time is prefixed "+", a negative one "-"; zero has no sign.
  // Without it a negative time reads 23 - hours of its magnitude in the hours
  // field (-1 s at 24 fps: "23:00:01:00"), which does not read back.
  kTimecodeFlag_ShowSign = 0x4,
  // The text names the last frame of a span that ends at the time: formatting
  // moves the time back one frame of `rate`, reading moves it forward one.
  // Without a rate (0 or kFrameRate_Invalid) nothing is moved.
  kTimecodeFlag_InclusiveEnd = 0x8,
  // With kTimecodeFlag_TrimLeadingZeros: a text cut down to seconds and frames
  // is widened to minutes, seconds and frames ("0:01:00", "0:01.500").
  kTimecodeFlag_KeepMinutes = 0x10,
  // Drop-frame displays separate the fields with ':' instead of ';'.
  kTimecodeFlag_ColonSeparators = 0x20,
};

// TimeToTimecode()
//
// The text of `time` for media of `rate` in `display`. A rate of 0 or
// kFrameRate_Invalid counts no frames, so every time then reads as zero fields
// (the milliseconds display does not depend on the rate). Never fails.
//
//   TimeToTimecode(TickTime(1800, kFrameRate_Video29_97), kFrameRate_Video29_97,
//                  TimeDisplay(kTimeDisplay_2997DropTimecode), {})   // u"00;01;00;02"
ZEBMEDIATYPES_API zebcore::UTF16String TimeToTimecode(
    TickTime time, FrameRate rate, TimeDisplay display = TimeDisplay(),
    zebcore::utility::Flags<unsigned int> flags = {});

// TimeToTimecode() of RatioTimeToTime(time).
ZEBMEDIATYPES_API zebcore::UTF16String RatioTimeToTimecode(
    const boost::rational<std::int64_t>& time, FrameRate rate, TimeDisplay display = TimeDisplay(),
    zebcore::utility::Flags<unsigned int> flags = {});

// TimeToHMSF()
//
// The fields the text is made of: magnitudes, hours wrapped at 24. `negative`
// is whether the time is below zero (in the drop-frame displays), or the
// counted milliseconds or frames are (in the others); with no rate every field
// is zero and `negative` false. For kTimeDisplay_Frames only `frames` (the
// two's-complement bits of the signed frame count) and `negative` (the time is
// below zero) are set.
ZEBMEDIATYPES_API void TimeToHMSF(unsigned& hours, unsigned& minutes, unsigned& seconds,
                                  std::uint64_t& frames, bool& negative, TickTime time,
                                  FrameRate rate, TimeDisplay display);

// TimecodeToTime()
//
// Reads timecode text for media of `rate` in `display`; of the flags only
// kTimecodeFlag_InclusiveEnd is read. Accepted:
//   - one to four fields of decimal digits separated by ':', ';' or '.' (any
//     mix), assigned from the right: frames, seconds, minutes, hours. Empty
//     fields are 0. Fields may exceed their range and are carried ("00:00:90:00"
//     is 1:30); hours wrap at 24. In the milliseconds display the frames field
//     is a whole count of milliseconds, not a decimal fraction: "1.5" is 1 s
//     and 5 ms, "1.500" is 1.5 s.
//   - a single run of digits, split from the right into frames (as many digits
//     as the display's frame count needs; three in the milliseconds display),
//     then two digits each of seconds, minutes and hours: "1000" at 24 fps is
//     10 s, "24" is 24 frames.
//   - a leading separator (":102") or kTimeDisplay_Frames: a raw frame count.
//   - an optional leading '-' or '+'.
//   - film displays: feet and frames split by one of ':', ';', '.', '+'
//     ("2+03"), or digits whose last two are the frames ("203").
// The empty text reads as kTime_Zero. Everything else gives kTime_Invalid: a
// bare sign or separator, any other character (blanks too), a fifth field, a
// separator in a kTimeDisplay_Frames text, a second separator in a film text,
// film text without digits, a digit run beyond 2^63 - 1, a time whose ticks do
// not fit in 64 bits, and a non-zero count when there is no counting rate.
ZEBMEDIATYPES_API TickTime TimecodeToTime(std::u16string_view text, FrameRate rate,
                                          TimeDisplay display = TimeDisplay(),
                                          zebcore::utility::Flags<unsigned int> flags = {});
// The same for UTF-8 text: it reads as its UTF-16 conversion (an invalid
// sequence becomes U+FFFD, which does not read).
ZEBMEDIATYPES_API TickTime TimecodeToTime(std::string_view text, FrameRate rate,
                                          TimeDisplay display = TimeDisplay(),
                                          zebcore::utility::Flags<unsigned int> flags = {});

// TryTimecodeToTime()
//
// TimecodeToTime that says when it failed: std::nullopt exactly where
// TimecodeToTime gives kTime_Invalid for text that does not read. A text that
// reads as -400000 s (the tick count of kTime_Invalid) is that value, not a
// failure.
ZEBMEDIATYPES_API std::optional<TickTime> TryTimecodeToTime(
    std::u16string_view text, FrameRate rate, TimeDisplay display = TimeDisplay(),
    zebcore::utility::Flags<unsigned int> flags = {});
ZEBMEDIATYPES_API std::optional<TickTime> TryTimecodeToTime(
    std::string_view text, FrameRate rate, TimeDisplay display = TimeDisplay(),
    zebcore::utility::Flags<unsigned int> flags = {});

// TimeToRatioTime() of TimecodeToTime(); text that does not read gives the
// ratio of kTime_Invalid.
ZEBMEDIATYPES_API boost::rational<std::int64_t> TimecodeToRatioTime(
    std::u16string_view text, FrameRate rate, TimeDisplay display = TimeDisplay(),
    zebcore::utility::Flags<unsigned int> flags = {});

// HMSFToTime()
//
// The inverse of TimeToHMSF for the timecode, audio and milliseconds displays:
// the fields are carried (frames into seconds into minutes into hours, without
// limit) and hours wrap at 24. In a drop-frame display the labels that a minute
// does not have read as the first label it has (";00" as ";02"), and ";01" as
// the frame before it. kTime_Invalid when there is no counting rate for a
// non-zero count.
ZEBMEDIATYPES_API TickTime HMSFToTime(unsigned hours, unsigned minutes, unsigned seconds,
                                      std::uint64_t frames, bool negative, FrameRate rate,
                                      TimeDisplay display);

}  // namespace zebmediatypes
