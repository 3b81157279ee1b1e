#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/ratio_time.h>

#include <cmath>
#include <limits>
#include <tuple>
#include <utility>

namespace zebmediatypes {
namespace {

using Limits = std::numeric_limits<std::int64_t>;
constexpr std::int64_t kInt64Max = Limits::max(), kInt64Min = Limits::min();

double Value(RatioTime r) { return boost::rational_cast<double>(r); }
double Value(LegacyRatioTime r) { return boost::rational_cast<double>(r); }

// The 29.97 stream frame that a 23.976 film frame maps to.
TickTime Pulldown(std::int64_t filmFrame, PulldownCadence cadence, bool& split) {
  return MapPulldownFrameTo2997Frame(TickTime(filmFrame, kFrameRate_Video23_976),
                                     kFrameRate_Video29_97, cadence, split);
}

TEST(RatioTime, TimeToRatioTimeIsInLowestTerms) {
  // clang-format off
  const std::pair<TickTime, RatioTime> kCases[] = {
      {TickTime(1, kFrameRate_Video29_97), RatioTime(1001, 30000)}, {TickTime(100, kFrameRate_Video29_97), RatioTime(1001, 300)},
      {-kTime_OneSecond / 2, RatioTime(-1, 2)}, {kTime_Zero, RatioTime(0)}, {TickTime(1), RatioTime(1, 254016000000)},
      {TickTime(kInt64Min), RatioTime(kInt64Min / 4096, 254016000000 / 4096)}};
  // clang-format on
  for (const auto& [time, ratio] : kCases)
    EXPECT_EQ(TimeToRatioTime(time), ratio) << time.GetTicks();
}

TEST(RatioTime, RatioTimeToTimeRoundsHalfUpAndGivesInvalidOutOfRange) {
  // One tick is 1/254016000000 s, so 5/508032000000 s is 2.5 ticks.
  // clang-format off
  const std::pair<RatioTime, TickTime> kCases[] = {
      {RatioTime(1001, 30000), TickTime(8475667200)}, {RatioTime(-1, 1), -kTime_OneSecond},
      {RatioTime(5, 508032000000), TickTime(3)}, {RatioTime(-5, 508032000000), TickTime(-2)},
      {RatioTime(-27, 2540160000000), TickTime(-3)}, {RatioTime(-23, 2540160000000), TickTime(-2)},
      {RatioTime(kInt64Max, 1), kTime_Invalid}, {RatioTime(kInt64Min, 1), kTime_Invalid}, {RatioTime(kInt64Max / 1000, 3), kTime_Invalid}};
  // clang-format on
  for (const auto& [ratio, time] : kCases) EXPECT_EQ(RatioTimeToTime(ratio), time) << ratio;
}

TEST(RatioTime, TimesSurviveTheTripThroughRatioTime) {
  for (FrameRate rate : {kFrameRate_Video23_976, kFrameRate_Video29_97, kFrameRate_Video25,
                         kFrameRate_Video59_94, kFrameRate_Audio44100}) {
    for (std::int64_t frame = -1000; frame <= 100000; frame += 997) {
      const TickTime t(frame, rate);
      EXPECT_EQ(RatioTimeToTime(TimeToRatioTime(t)), t) << t.GetTicks();
    }
  }
}

TEST(RatioTime, LegacyFormApproximatesInsteadOfTruncating) {
  for (RatioTime r :
       {RatioTime(1, 254016000000), RatioTime(3000000001, 2), RatioTime(5, 2147483647),
        RatioTime(-2147483647, 3), RatioTime(1, 3000000000)}) {
    const RatioTime back = LegacyRatioTimeToRatioTime(RatioTimeToLegacyRatioTime(r));
    EXPECT_NEAR(Value(back), Value(r), std::fabs(Value(r)) * 1e-6 + 1e-9) << r;
  }
  // Exact where the terms fit.
  EXPECT_EQ(RatioTimeToLegacyRatioTime(RatioTime(1001, 300)), LegacyRatioTime(1001, 300));
  EXPECT_EQ(RatioTimeToLegacyRatioTime(RatioTime(-2147483646, 2147483645)),
            LegacyRatioTime(-2147483646, 2147483645));
}

TEST(RatioTime, FrameRateToRatioOfNoRateIsZero) {
  // clang-format off
  const std::pair<FrameRate, RatioTime> kCases[] = {
      {kFrameRate_Video29_97, RatioTime(30000, 1001)}, {kFrameRate_Video25, RatioTime(25)}, {kFrameRate_Video119_88, RatioTime(120000, 1001)},
      {kFrameRate_Audio44100, RatioTime(44100)}, {kFrameRate_Invalid, RatioTime(0, 1)}};
  // clang-format on
  for (const auto& [rate, ratio] : kCases) EXPECT_EQ(FrameRateToRatio(rate), ratio) << ratio;
  EXPECT_THROW(FrameRateToRatio(FrameRate(0)), boost::bad_rational);
}

TEST(RatioTime, IsLegacyTimeScaleForEveryMultipleOf2997) {
  // clang-format off
  const std::pair<std::int64_t, bool> kCases[] = {
      {2997, true}, {5994, true}, {0, true}, {-2997, true}, {29970, true}, {std::int64_t{2997} * 3000000000, true},
      {30000, false}, {60000, false}, {1, false}, {kInt64Min, false}, {kInt64Max, false}};
  // clang-format on
  for (const auto& [scale, legacy] : kCases) EXPECT_EQ(IsLegacyTimeScale(scale), legacy) << scale;
}

TEST(RatioTime, LegacyCorrectionDoesNotOverflow32Bits) {
  // 100 units of the 2997 scale are one 29.97 fps frame once corrected. For
  // 3600 s on a 2997 scale the 32-bit product 3600 * 999999 overflows.
  // clang-format off
  const std::tuple<LegacyRatioTime, std::int64_t, LegacyRatioTime> kCases[] = {
      {LegacyRatioTime(3000, 2997), 2997, LegacyRatioTime(1001, 1000)}, {LegacyRatioTime(3000, 2997), 30000, LegacyRatioTime(3000, 2997)},
      {LegacyRatioTime(100, 2997), 2997, LegacyRatioTime(1001, 30000)}, {LegacyRatioTime(3600, 1), 2997, LegacyRatioTime(8999991, 2500)}};
  // clang-format on
  for (const auto& [ratio, scale, corrected] : kCases) {
    EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(ratio, scale), corrected) << ratio << " " << scale;
  }
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(3000, 2997), 5994), RatioTime(1001, 1000));
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(3000, 2997), 30000), RatioTime(3000, 2997));
  for (LegacyRatioTime r : {LegacyRatioTime(10789200, 2997), LegacyRatioTime(2147483647, 1),
                            LegacyRatioTime(-2147483647, 7)}) {
    const double corrected = Value(CorrectLegacyRatioTimeAtTimeScale(r, 2997));
    EXPECT_NEAR(corrected, Value(r) * 0.999999, std::fabs(Value(r)) * 1e-6) << r;
  }
  const RatioTime big(kInt64Max, 3);  // the 64-bit form near its limits
  EXPECT_NEAR(Value(CorrectLegacyRatioTimeAtTimeScale(big, 2997)) / Value(big), 0.999999, 1e-9);
}

TEST(RatioTime, PulldownPhaseZeroMapsFilmFramesToStreamFrames) {
  // film frame, stream frame, split
  // clang-format off
  const std::tuple<std::int64_t, std::int64_t, bool> kCases[] = {
      {0, 0, false}, {1, 1, false}, {2, 3, true}, {3, 4, false}, {4, 5, false}, {5, 6, false}, {6, 8, true}, {7, 9, false}};
  // clang-format on
  // Values outside 1 to 10 behave as phase 0 with split frames reported.
  for (PulldownCadence cadence : {kPulldownCadence_Phase0, kPulldownCadence_Phase0NoSplitFrames,
                                  PulldownCadence(0), PulldownCadence(11), PulldownCadence(-3)}) {
    const bool reports = cadence != kPulldownCadence_Phase0NoSplitFrames;
    for (const auto& [film, stream, splits] : kCases) {
      SCOPED_TRACE(testing::Message() << cadence << " " << film);
      bool split = !splits;
      EXPECT_EQ(Pulldown(film, cadence, split), TickTime(stream, kFrameRate_Video29_97));
      EXPECT_EQ(split, reports && splits);
    }
  }
}

TEST(RatioTime, PulldownEveryCadenceIsAnIncreasingMapIntoGroupsOfFive) {
  for (int cadence = 1; cadence <= 10; ++cadence) {
    SCOPED_TRACE(cadence);
    std::int64_t previous = -1;
    int splits = 0;
    for (std::int64_t film = 0; film < 400; ++film) {
      bool split = false;
      const TickTime mapped = Pulldown(film, PulldownCadence(cadence), split);
      const std::int64_t frame = mapped.ToFrame64(kFrameRate_Video29_97);
      EXPECT_EQ(mapped, TickTime(frame, kFrameRate_Video29_97));
      EXPECT_GT(frame, previous);
      EXPECT_EQ(frame / 5, film / 4);
      previous = frame;
      splits += split ? 1 : 0;
    }
    EXPECT_EQ(splits == 0, cadence >= 6);
  }
}

TEST(RatioTime, PulldownBeforeZeroReportsAndReadsNoTableOutOfBounds) {
  zebcore::debug::ScopedAssertionCapture capture;
  bool split = true;
  // Taken as film frame 0: phase 2 puts it at position 1, a split frame.
  EXPECT_EQ(Pulldown(-5, kPulldownCadence_Phase2, split), TickTime(1, kFrameRate_Video29_97));
  EXPECT_TRUE(split);
  EXPECT_EQ(capture.Count(), 1u);
  // A film frame index beyond the 32-bit range wraps to a negative index. At 4
  // ticks per stream frame a film frame lasts 5 ticks.
  MapPulldownFrameTo2997Frame(TickTime(5 * 2147483649LL), FrameRate(4), kPulldownCadence_Phase0,
                              split);
  EXPECT_EQ(capture.Count(), 2u);
}

TEST(RatioTime, PulldownWithNoRateGivesInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-8475667200)}) {
    bool split = true;
    EXPECT_EQ(MapPulldownFrameTo2997Frame(kTime_OneSecond, rate, kPulldownCadence_Phase2, split),
              kTime_Invalid)
        << rate.GetTicksPerFrame();
    EXPECT_FALSE(split);
  }
  EXPECT_EQ(capture.Count(), 0u);
}

}  // namespace
}  // namespace zebmediatypes
