#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/ratio_time.h>

#include <cmath>
#include <limits>

namespace zebmediatypes {
namespace {

constexpr std::int64_t kInt64Max = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kInt64Min = std::numeric_limits<std::int64_t>::min();

TEST(RatioTime, TimeToRatioTimeIsInLowestTerms) {
  struct Case {
    TickTime time;
    std::int64_t num, den;
  };
  const Case kCases[] = {
      {kTime_OneSecond, 1, 1},
      {TickTime(1, kFrameRate_Video29_97), 1001, 30000},
      {TickTime(100, kFrameRate_Video29_97), 1001, 300},
      {-kTime_OneSecond / 2, -1, 2},
      {kTime_Zero, 0, 1},
      {TickTime(1), 1, 254016000000},
      {TickTime(kInt64Min), kInt64Min / 4096, 254016000000 / 4096},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.time.GetTicks());
    EXPECT_EQ(TimeToRatioTime(c.time), RatioTime(c.num, c.den));
  }
}

TEST(RatioTime, RatioTimeToTimeRoundsHalfUp) {
  // One tick is 1/254016000000 s; 2.5 ticks is 5/508032000000 s.
  struct Case {
    RatioTime ratio;
    std::int64_t ticks;
  };
  const Case kCases[] = {
      {RatioTime(1001, 30000), 8475667200},
      {RatioTime(5, 508032000000), 3},      // 2.5 ticks
      {RatioTime(-5, 508032000000), -2},    // -2.5 ticks
      {RatioTime(-27, 2540160000000), -3},  // -2.7 ticks
      {RatioTime(-23, 2540160000000), -2},  // -2.3 ticks
      {RatioTime(0, 1), 0},
      {RatioTime(-1, 1), -254016000000},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.ticks);
    EXPECT_EQ(RatioTimeToTime(c.ratio).GetTicks(), c.ticks);
  }
}

TEST(RatioTime, RatioTimeToTimeOutOfRangeGivesInvalid) {
  const RatioTime kHuge[] = {RatioTime(kInt64Max, 1), RatioTime(kInt64Min, 1),
                             RatioTime(kInt64Max / 1000, 3)};
  for (const RatioTime& r : kHuge) {
    SCOPED_TRACE(r.numerator());
    EXPECT_EQ(RatioTimeToTime(r), kTime_Invalid);
  }
}

TEST(RatioTime, TimesSurviveTheTripThroughRatioTime) {
  const FrameRate kRates[] = {kFrameRate_Video23_976, kFrameRate_Video29_97, kFrameRate_Video25,
                              kFrameRate_Video59_94, kFrameRate_Audio44100};
  for (FrameRate rate : kRates) {
    for (std::int64_t frame = -1000; frame <= 100000; frame += 997) {
      const TickTime t(frame, rate);
      SCOPED_TRACE(t.GetTicks());
      EXPECT_EQ(RatioTimeToTime(TimeToRatioTime(t)), t);
    }
  }
}

TEST(RatioTime, LegacyRoundTripStaysWithinTolerance) {
  const std::int64_t kDay = 24 * kTime_OneHour.GetTicks();
  const TickTime kTimes[] = {TickTime(1),          kTime_OneSecond,
                             kTime_OneMinute,      kTime_OneHour,
                             TickTime(kDay),       TickTime(7 * kDay),
                             TickTime(365 * kDay), TickTime(100, kFrameRate_Video29_97)};
  for (TickTime t : kTimes) {
    SCOPED_TRACE(t.GetTicks());
    const LegacyRatioTime legacy = RatioTimeToLegacyRatioTime(TimeToRatioTime(t));
    const TickTime back = RatioTimeToTime(LegacyRatioTimeToRatioTime(legacy));
    EXPECT_LE(std::llabs(back.GetTicks() - t.GetTicks()), 132300);
  }
  // Exact where the terms fit.
  const TickTime kFrames100(100, kFrameRate_Video29_97);
  EXPECT_EQ(RatioTimeToLegacyRatioTime(TimeToRatioTime(kFrames100)), LegacyRatioTime(1001, 300));
  EXPECT_EQ(RatioTimeToTime(LegacyRatioTimeToRatioTime(LegacyRatioTime(1001, 300))).GetTicks(),
            847566720000);
}

TEST(RatioTime, LegacyFormApproximatesInsteadOfTruncating) {
  // 1 tick: the denominator does not fit in 32 bits.
  const LegacyRatioTime tick = RatioTimeToLegacyRatioTime(RatioTime(1, 254016000000));
  EXPECT_GT(tick.denominator(), 0);
  EXPECT_NEAR(boost::rational_cast<double>(tick), 1.0 / 254016000000, 1e-9);
  const RatioTime kCases[] = {RatioTime(3000000001, 2), RatioTime(5, 2147483647),
                              RatioTime(-2147483647, 3), RatioTime(1, 3000000000)};
  for (const RatioTime& r : kCases) {
    SCOPED_TRACE(boost::rational_cast<double>(r));
    const LegacyRatioTime legacy = RatioTimeToLegacyRatioTime(r);
    const double value = boost::rational_cast<double>(r);
    EXPECT_NEAR(boost::rational_cast<double>(legacy), value, std::fabs(value) * 1e-6 + 1e-9);
  }
  EXPECT_EQ(RatioTimeToLegacyRatioTime(RatioTime(-2147483646, 2147483645)),
            LegacyRatioTime(-2147483646, 2147483645));
}

TEST(RatioTime, FrameRateToRatio) {
  struct Case {
    FrameRate rate;
    std::int64_t num, den;
  };
  const Case kCases[] = {
      {kFrameRate_Video29_97, 30000, 1001},   {kFrameRate_Video25, 25, 1},
      {kFrameRate_Video23_976, 24000, 1001},  {kFrameRate_Audio44100, 44100, 1},
      {kFrameRate_Video119_88, 120000, 1001}, {kFrameRate_Invalid, 0, 1},  // no rate: 0 fps
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.rate.GetTicksPerFrame());
    EXPECT_EQ(FrameRateToRatio(c.rate), RatioTime(c.num, c.den));
  }
  EXPECT_THROW(FrameRateToRatio(FrameRate(0)), boost::bad_rational);
}

TEST(RatioTime, IsLegacyTimeScale) {
  struct Case {
    std::int64_t scale;
    bool legacy;
  };
  const Case kCases[] = {{2997, true},
                         {5994, true},
                         {0, true},
                         {-2997, true},
                         {29970, true},
                         {30000, false},
                         {60000, false},
                         {1, false},
                         {kInt64Min, false},
                         {kInt64Max, false},
                         {2997 * 3000000000LL, true}};
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.scale);
    EXPECT_EQ(IsLegacyTimeScale(c.scale), c.legacy);
  }
}

TEST(RatioTime, CorrectLegacyRatioTimeAtTimeScale) {
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(3000, 2997), 2997),
            LegacyRatioTime(1001, 1000));
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(3000, 2997), 5994), RatioTime(1001, 1000));
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(3000, 2997), 30000),
            LegacyRatioTime(3000, 2997));
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(RatioTime(3000, 2997), 30000), RatioTime(3000, 2997));
  // 100 units of the 2997 scale are one 29.97 fps frame once corrected.
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(100, 2997), 2997),
            LegacyRatioTime(1001, 30000));
}

TEST(RatioTime, LegacyCorrectionDoesNotOverflow32Bits) {
  // 3600 s on a 2997 scale: the 32-bit product 3600 * 999999 overflows; the
  // product is formed in 64-bit and the result keeps its value.
  const LegacyRatioTime kCases[] = {LegacyRatioTime(3600, 1), LegacyRatioTime(10789200, 2997),
                                    LegacyRatioTime(2147483647, 1),
                                    LegacyRatioTime(-2147483647, 7)};
  for (const LegacyRatioTime& r : kCases) {
    SCOPED_TRACE(r.numerator());
    const LegacyRatioTime corrected = CorrectLegacyRatioTimeAtTimeScale(r, 2997);
    const double expected = boost::rational_cast<double>(r) * 0.999999;
    EXPECT_GT(corrected.denominator(), 0);
    EXPECT_NEAR(boost::rational_cast<double>(corrected), expected, std::fabs(expected) * 1e-6);
  }
  EXPECT_EQ(CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime(3600, 1), 2997),
            LegacyRatioTime(8999991, 2500));
  // The 64-bit form near its limits keeps its value too.
  const RatioTime big(kInt64Max, 3);
  const RatioTime corrected = CorrectLegacyRatioTimeAtTimeScale(big, 2997);
  EXPECT_NEAR(boost::rational_cast<double>(corrected) / boost::rational_cast<double>(big), 0.999999,
              1e-9);
}

TEST(RatioTime, PulldownPhaseZeroMapsFilmFramesToStreamFrames) {
  struct Case {
    std::int64_t filmFrame;
    std::int64_t streamFrame;
    bool split;
  };
  const Case kCases[] = {{0, 0, false}, {1, 1, false}, {2, 3, true}, {3, 4, false},
                         {4, 5, false}, {5, 6, false}, {6, 8, true}, {7, 9, false}};
  for (PulldownCadence cadence : {kPulldownCadence_Phase0, kPulldownCadence_Phase0NoSplitFrames,
                                  PulldownCadence(0), PulldownCadence(11), PulldownCadence(-3)}) {
    const bool reports = cadence != kPulldownCadence_Phase0NoSplitFrames;
    for (const Case& c : kCases) {
      SCOPED_TRACE(testing::Message() << "cadence " << cadence << " film " << c.filmFrame);
      bool split = !c.split;
      const TickTime mapped = MapPulldownFrameTo2997Frame(
          TickTime(c.filmFrame, kFrameRate_Video23_976), kFrameRate_Video29_97, cadence, split);
      EXPECT_EQ(mapped, TickTime(c.streamFrame, kFrameRate_Video29_97));
      EXPECT_EQ(split, reports && c.split);
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
      const TickTime mapped =
          MapPulldownFrameTo2997Frame(TickTime(film, kFrameRate_Video23_976), kFrameRate_Video29_97,
                                      PulldownCadence(cadence), split);
      const std::int64_t frame = mapped.ToFrame64(kFrameRate_Video29_97);
      EXPECT_EQ(mapped, TickTime(frame, kFrameRate_Video29_97));
      EXPECT_GT(frame, previous);
      EXPECT_EQ(frame / 5, film / 4);
      previous = frame;
      splits += split ? 1 : 0;
    }
    if (cadence >= 6) {
      EXPECT_EQ(splits, 0);
    }
  }
}

TEST(RatioTime, PulldownBeforeZeroReportsAndReadsNoTableOutOfBounds) {
  zebcore::debug::ScopedAssertionCapture capture;
  bool split = true;
  const TickTime mapped = MapPulldownFrameTo2997Frame(
      TickTime(-5, kFrameRate_Video23_976), kFrameRate_Video29_97, kPulldownCadence_Phase2, split);
  EXPECT_EQ(capture.Count(), 1u);
  // Taken as film frame 0: phase 2 puts it at position 1, a split frame.
  EXPECT_EQ(mapped, TickTime(1, kFrameRate_Video29_97));
  EXPECT_TRUE(split);
  // A film frame index beyond the 32-bit range wraps to a negative index. At 4
  // ticks per stream frame a film frame lasts 5 ticks.
  MapPulldownFrameTo2997Frame(TickTime(5 * 2147483649LL), FrameRate(4), kPulldownCadence_Phase0,
                              split);
  EXPECT_EQ(capture.Count(), 2u);
}

TEST(RatioTime, PulldownWithNoRateGivesInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-8475667200)}) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    bool split = true;
    EXPECT_EQ(MapPulldownFrameTo2997Frame(kTime_OneSecond, rate, kPulldownCadence_Phase2, split),
              kTime_Invalid);
    EXPECT_FALSE(split);
  }
  EXPECT_EQ(capture.Count(), 0u);
}

}  // namespace
}  // namespace zebmediatypes
