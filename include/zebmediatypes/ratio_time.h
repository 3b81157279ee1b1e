// Ratio times: exact fractions of a second, and rate conversions.
//
// Outside the tick scale, times and rates travel as fractions of a second: a
// RatioTime is a boost::rational<int64> of seconds; older data stores a
// LegacyRatioTime, a boost::rational<int>, often on the time scales 2997 and
// 5994 that stand for 29.97 and 59.94 fps. All functions here are pure and
// thread-safe.
//
//   TimeToRatioTime(TickTime(1, kFrameRate_Video29_97));   // 1001/30000
//   FrameRateToRatio(kFrameRate_Video29_97);               // 30000/1001
#pragma once

#include <zebmediatypes/export.h>
#include <zebmediatypes/tick_time.h>

#include <boost/rational.hpp>
#include <cstdint>

namespace zebmediatypes {

using RatioTime = boost::rational<std::int64_t>;
using LegacyRatioTime = boost::rational<int>;

// The 2:3 pulldown cadences. Only 1 to 10 mean something; every other value
// behaves as phase 0 with split frames reported.
enum PulldownCadence : int {
  kPulldownCadence_None = 0,
  kPulldownCadence_Phase1 = 1,
  kPulldownCadence_Phase2 = 2,
  kPulldownCadence_Phase3 = 3,
  kPulldownCadence_Phase4 = 4,
  kPulldownCadence_Phase0 = 5,
  kPulldownCadence_Phase4NoSplitFrames = 6,
  kPulldownCadence_Phase0NoSplitFrames = 7,
  kPulldownCadence_Phase1NoSplitFrames = 8,
  kPulldownCadence_Phase2NoSplitFrames = 9,
  kPulldownCadence_Phase3NoSplitFrames = 10,
};

// ticks / 254016000000 seconds, in lowest terms (one 29.97 fps frame is
// 1001/30000).
ZEBMEDIATYPES_API RatioTime TimeToRatioTime(TickTime time) noexcept;

// RatioTimeToTime()
//
// n/d seconds in ticks: (254016000000 / d) * n in double precision, rounded half
// up (toward positive infinity: 2.5 ticks give 3, -2.5 give -2). A result that
// is NaN or beyond the 64-bit range gives kTime_Invalid.
ZEBMEDIATYPES_API TickTime RatioTimeToTime(RatioTime ratio) noexcept;

// Frames per second as a fraction: 254016000000 / ticks per frame in lowest
// terms (kFrameRate_Video29_97 gives 30000/1001). kFrameRate_Invalid gives 0/1
// (no rate); a rate of 0 ticks throws boost::bad_rational.
ZEBMEDIATYPES_API RatioTime FrameRateToRatio(FrameRate rate);

// The same fraction, widened.
ZEBMEDIATYPES_API RatioTime LegacyRatioTimeToRatioTime(LegacyRatioTime ratio) noexcept;

// The same fraction when numerator and denominator both lie in
// [-2147483646, 2147483646]; otherwise the closest 32-bit fraction of its value
// (zebcore::utility::RationalApproximation), never a truncated term.
ZEBMEDIATYPES_API LegacyRatioTime RatioTimeToLegacyRatioTime(RatioTime ratio) noexcept;

// Whether `scale` is a whole multiple of 2997 (0, 2997, 5994 and -2997 are;
// 30000 and 60000 are not).
ZEBMEDIATYPES_API bool IsLegacyTimeScale(std::int64_t scale) noexcept;

// CorrectLegacyRatioTimeAtTimeScale()
//
// A time recorded on a 2997-multiple time scale, where 100 units stood for one
// 29.97 fps frame, corrected to the true frame duration: ratio * 999999/1000000
// when IsLegacyTimeScale(scale), otherwise `ratio` unchanged. The product is
// computed in 64-bit for both widths; a 32-bit result whose terms do not fit
// is the closest 32-bit fraction of its value.
//
//   CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(3000, 2997), 2997)  // 1001/1000
ZEBMEDIATYPES_API LegacyRatioTime CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime ratio,
                                                                    std::int64_t scale) noexcept;
ZEBMEDIATYPES_API RatioTime CorrectLegacyRatioTimeAtTimeScale(RatioTime ratio,
                                                              std::int64_t scale) noexcept;

// MapPulldownFrameTo2997Frame()
//
// Maps a time on a film timeline running at four fifths of `rate` (23.976 fps
// film in a 29.97 fps stream) to the start of the stream frame that carries
// that film frame under the 2:3 pulldown `cadence`. `isSplitFrame` is set to
// whether that stream frame is one of the mixed (split) frames, when the
// cadence reports them. A time before zero is a contract breach: it is
// reported and taken as film frame 0. With no rate (ticks <= 0 or
// kFrameRate_Invalid) the result is kTime_Invalid and no split frame.
ZEBMEDIATYPES_API TickTime MapPulldownFrameTo2997Frame(TickTime time, FrameRate rate,
                                                       PulldownCadence cadence,
                                                       bool& isSplitFrame) noexcept;

}  // namespace zebmediatypes
