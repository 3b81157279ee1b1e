#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/stream.h>
#include <zebmediatypes/tick_time.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <random>

namespace zebmediatypes {
namespace {

using Limits = std::numeric_limits<std::int64_t>;
constexpr std::int64_t kInt64Max = Limits::max(), kInt64Min = Limits::min();
const double kNaN = std::numeric_limits<double>::quiet_NaN();
const double kInf = std::numeric_limits<double>::infinity();
using Aligned3 = std::array<std::int64_t, 3>;  // floor, ceiling, nearest

Aligned3 Aligned(std::int64_t t, FrameRate rate) {
  return {TickTime(t).AlignToFrame(rate).GetTicks(), TickTime(t).AlignToFrameCeil(rate).GetTicks(),
          TickTime(t).AlignToNearestFrame(rate).GetTicks()};
}

TEST(TickTime, ArithmeticWrapsWithoutOverflow) {
  // Each of these is signed overflow if done in int64; the sanitizer build checks.
  const std::pair<TickTime, TickTime> kCases[] = {
      {TickTime(kInt64Max) + TickTime(1), TickTime(kInt64Min)},
      {TickTime(-3) * 4294967295u, TickTime(-3 * std::int64_t{4294967295})},
      {TickTime(kInt64Max / 2 + 1, FrameRate(2)), TickTime(kInt64Min)},
      {TickTime(kInt64Max).AddFrames(1, FrameRate(1)), TickTime(kInt64Min)},
      {TickTime(-7) / 2, TickTime(-3)},  // truncates toward zero
  };
  for (const auto& [result, expected] : kCases) EXPECT_EQ(result, expected);
}

TEST(TickTime, TrappingOperationsReportAndGiveInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(TickTime(kInt64Min) / std::int64_t{-1}, kTime_Invalid);
  EXPECT_EQ(TickTime(kTime_OneSecond) /= 0, kTime_Invalid);
  EXPECT_EQ(FrameRate(kInt64Min) * -1, kFrameRate_Invalid);
  ASSERT_EQ(capture.Count(), 3u);
  EXPECT_EQ(capture.Reports()[1].at(zebcore::debug::kDebugMessage),
            "Attempt to divide by zero in zebmediatypes::TickTime");
  // NaN and out-of-range doubles are checked quietly before conversion.
  EXPECT_EQ(kTime_OneSecond * kNaN, kTime_Invalid);
  EXPECT_EQ(capture.Count(), 3u);
}

TEST(TickTime, FromSecondsRoundsToTheNearestTickAndClamps) {
  const std::pair<double, TickTime> kCases[] = {
      {-3e-12, TickTime(-1)},  // 0.762 ticks
      {kNaN, kTime_Invalid},
      {-kInf, TickTime(kInt64Min)},
  };
  for (const auto& [seconds, expected] : kCases) {
    EXPECT_EQ(TickTime::FromSeconds(seconds), expected) << seconds;
  }
  // Below 2^51 ticks a double holds every tick: the seconds read back exactly.
  std::mt19937_64 random(51);
  for (int i = 0; i < 10000; ++i) {
    const auto t = static_cast<std::int64_t>(random() >> (13 + i % 50)) * (i % 2 != 0 ? -1 : 1);
    ASSERT_EQ(TickTime::FromSeconds(TickTime(t).ToSeconds()), TickTime(t)) << t;
  }
}

TEST(TickTime, EveryVideoFrameStartWithinADaySurvivesSecondsAsDouble) {
  for (double fps :
       {11.988, 14.985, 23.976, 24.0, 25.0, 29.97, 30.0, 48.0, 50.0, 59.94, 60.0, 100.0, 119.88}) {
    const FrameRate rate = MatchedFrameRateFromFloat(fps);
    // 1001 s is a whole number of frames of every rate.
    const double frames = std::round(rate.GetFramesPerSecond() * 1001);
    EXPECT_EQ(TickTime(static_cast<std::int64_t>(frames), rate), kTime_OneSecond * 1001) << fps;
    const std::int64_t last = (kTime_OneHour * 24).ToFrame64(rate);
    for (std::int64_t f = -last; f <= last; ++f) {
      const TickTime start(f, rate);
      if (TickTime::FromSeconds(start.ToSeconds()).AlignToNearestFrame(rate) != start) {
        FAIL() << "frame " << f << " at " << fps << " fps";
      }
    }
  }
}

// Reference alignment in 128-bit arithmetic, written from the rules rather
// than from the 64-bit code: floor toward zero, ceiling by t + p - 1 (the last
// representable boundary when beyond int64), nearest with the half away from
// zero, then the clamp to [kTime_Min, kTime_Max].
void ExpectAlignmentAgrees(std::int64_t t, std::int64_t p) {
  using Wide = __int128;
  auto towardZero = [p](Wide u) { return u - u % p; };
  const Wide ceil = std::min<Wide>(towardZero(Wide{t} + p - 1), kInt64Max - kInt64Max % p);
  const Wide nearest = towardZero(t >= 0 ? Wide{t} + p / 2 : Wide{t} - p / 2);
  const Wide clamped = std::clamp<Wide>(nearest, kTime_Min.GetTicks(), kTime_Max.GetTicks());
  EXPECT_EQ(Aligned(t, FrameRate(p)),
            (Aligned3{std::int64_t(towardZero(t)), std::int64_t(ceil), std::int64_t(clamped)}))
      << t << " / " << p;
}

TEST(TickTime, AlignmentAgreesWithWideArithmetic) {
  // No rate leaves every time as it is.
  for (FrameRate none : {kFrameRate_Invalid, FrameRate(0), FrameRate(kInt64Min)}) {
    EXPECT_EQ(Aligned(-12345, none), (Aligned3{-12345, -12345, -12345}));
    EXPECT_EQ(TickTime(kInt64Min).ToFrame64(none), 0);
  }
  // The int64 limits and 200 hours out, where nearest clamps.
  const std::int64_t h200 = 200 * kTime_OneHour.GetTicks();
  for (std::int64_t p : {std::int64_t{1}, std::int64_t{2}, kInt64Max / 2, kInt64Max - 1}) {
    for (std::int64_t t : {kInt64Max, kInt64Min, kInt64Min + 1, h200, -h200}) {
      ExpectAlignmentAgrees(t, p);
    }
  }
  // Rates from 1 tick to near INT64_MAX, times anywhere in the 64-bit range.
  std::mt19937_64 random(20000);  // the standard fixes this engine's sequence
  for (int i = 0; i < 20000; ++i) {
    const std::uint64_t r = random();
    std::int64_t p = static_cast<std::int64_t>(random() >> (1 + r % 63));
    if (p <= 0 || p == kInt64Max) p = 1;
    const std::int64_t t =
        static_cast<std::int64_t>(r >> (random() % 64)) * ((random() & 1) != 0 ? -1 : 1);
    ExpectAlignmentAgrees(t, p);
  }
}

TEST(FrameRate, RatesFromFloatsAndDurationsAreInvalidOutOfRange) {
  // 29.975 lies 0.00497 from 30000/1001; 1e12 fps is under one tick.
  EXPECT_EQ(MatchedFrameRateFromFloat(29.975), kFrameRate_Video29_97);
  for (double fps : {0.0, kNaN, -kInf, 1e12, 1e-300}) {
    EXPECT_EQ(MatchedFrameRateFromFloat(fps), kFrameRate_Invalid) << fps;
  }
  FrameRate rate = kFrameRate_Video24;
  TickTime(10).CalculateFrameRate(11, rate);  // under one tick per frame
  EXPECT_EQ(rate, kFrameRate_Invalid);
}

TEST(FrameRate, IsFrameRateAudioCoversOnlyTheHighSampleRates) {
  for (FrameRate rate : details::kAudioRateConstants) {
    const double hz = rate.GetFramesPerSecond();
    EXPECT_EQ(TickTime(static_cast<std::int64_t>(hz), rate), kTime_OneSecond) << hz;
    EXPECT_EQ(IsFrameRateAudio(rate), hz >= 22050) << hz;
  }
}

}  // namespace
}  // namespace zebmediatypes
