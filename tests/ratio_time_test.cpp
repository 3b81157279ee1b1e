#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/ratio_time.h>

#include <limits>
#include <utility>

namespace zebmediatypes {
namespace {

constexpr std::int64_t kInt64Max = std::numeric_limits<std::int64_t>::max();

double Value(RatioTime r) { return boost::rational_cast<double>(r); }

// The 29.97 stream frame that a 23.976 film frame maps to.
TickTime Pulldown(std::int64_t filmFrame, PulldownCadence cadence, bool& split) {
  return MapPulldownFrameTo2997Frame(TickTime(filmFrame, kFrameRate_Video23_976),
                                     kFrameRate_Video29_97, cadence, split);
}

TEST(RatioTime, TimesSurviveTheTripThroughRatioTimeInLowestTerms) {
  EXPECT_EQ(TimeToRatioTime(TickTime(100, kFrameRate_Video29_97)), RatioTime(1001, 300));
  EXPECT_EQ(FrameRateToRatio(kFrameRate_Video29_97), RatioTime(30000, 1001));
  for (FrameRate rate : {kFrameRate_Video23_976, kFrameRate_Audio44100}) {
    for (std::int64_t frame = -1000; frame <= 100000; frame += 997) {
      const TickTime t(frame, rate);
      ASSERT_EQ(RatioTimeToTime(TimeToRatioTime(t)), t) << t.GetTicks();
    }
  }
}

TEST(RatioTime, RatioTimeToTimeRoundsHalfUpAndGivesInvalidOutOfRange) {
  // One tick is 1/254016000000 s: 5/508032000000 s is 2.5 ticks.
  const std::pair<RatioTime, TickTime> kCases[] = {
      {RatioTime(5, 508032000000), TickTime(3)},
      {RatioTime(-27, 2540160000000), TickTime(-3)},
      {RatioTime(-kInt64Max, 1), kTime_Invalid},
  };
  for (const auto& [ratio, time] : kCases) EXPECT_EQ(RatioTimeToTime(ratio), time) << ratio;
}

TEST(RatioTime, LegacyFormsApproximateAndCorrectWithoutOverflow) {
  const RatioTime r(3000000001, 2);  // approximated, not truncated
  EXPECT_NEAR(Value(LegacyRatioTimeToRatioTime(RatioTimeToLegacyRatioTime(r))), Value(r),
              Value(r) * 1e-6);
  // scale 2997 (and its multiples) is corrected by 0.999999; for 3600 s the
  // 32-bit product 3600 * 999999 overflows.
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(3000, 2997), 5994),
            LegacyRatioTime(1001, 1000));
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(3600, 1), 2997),
            LegacyRatioTime(8999991, 2500));
  EXPECT_THROW(FrameRateToRatio(FrameRate(0)), boost::bad_rational);
}

TEST(RatioTime, PulldownPhaseZeroSplitsTheThirdFilmFrameOfFour) {
  // Values outside 1 to 10 behave as phase 0 with split frames reported.
  for (PulldownCadence cadence :
       {kPulldownCadence_Phase0, kPulldownCadence_Phase0NoSplitFrames, PulldownCadence(11)}) {
    SCOPED_TRACE(cadence);
    bool split = false;
    EXPECT_EQ(Pulldown(6, cadence, split), TickTime(8, kFrameRate_Video29_97));
    EXPECT_EQ(split, cadence != kPulldownCadence_Phase0NoSplitFrames);
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

TEST(RatioTime, PulldownOutOfRangeReportsAndNoRateGivesInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  bool split = false;
  // Taken as film frame 0: phase 2 puts it at position 1, a split frame.
  EXPECT_EQ(Pulldown(-5, kPulldownCadence_Phase2, split), TickTime(1, kFrameRate_Video29_97));
  EXPECT_TRUE(split);
  // A film frame index beyond 32 bits (5 ticks a film frame at 4 a stream frame).
  MapPulldownFrameTo2997Frame(TickTime(5 * 2147483649LL), FrameRate(4), kPulldownCadence_Phase0,
                              split);
  EXPECT_EQ(capture.Count(), 2u);
  EXPECT_EQ(
      MapPulldownFrameTo2997Frame(kTime_OneSecond, FrameRate(0), kPulldownCadence_Phase2, split),
      kTime_Invalid);
  EXPECT_FALSE(split);
  EXPECT_EQ(capture.Count(), 2u);
}

}  // namespace
}  // namespace zebmediatypes
