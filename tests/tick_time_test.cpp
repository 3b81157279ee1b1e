#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/json.h>
#include <zebcore/stream.h>
#include <zebmediatypes/tick_time.h>

#include <chrono>
#include <cmath>
#include <limits>
#include <sstream>
#include <type_traits>

namespace zebmediatypes {
namespace {

constexpr std::int64_t kInt64Max = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kInt64Min = std::numeric_limits<std::int64_t>::min();

std::string Utf8(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

TEST(TickTime, IsTriviallyCopyable) {
  static_assert(std::is_trivially_copyable_v<TickTime>);
  static_assert(std::is_trivially_copyable_v<FrameRate>);
  static_assert(TickTime() == kTime_Zero);
  static_assert(FrameRate() == kFrameRate_Invalid);
}

TEST(TickTime, EveryNamedRateIsAWholeNumberOfTicksPerSecond) {
  struct Case {
    FrameRate rate;
    std::int64_t numerator;  // frames per second = numerator / denominator
    std::int64_t denominator;
  };
  const Case kCases[] = {
      {kFrameRate_Video11_988, 12000, 1001},
      {kFrameRate_Video14_985, 15000, 1001},
      {kFrameRate_Video23_976, 24000, 1001},
      {kFrameRate_Video24, 24, 1},
      {kFrameRate_Video25, 25, 1},
      {kFrameRate_Video29_97, 30000, 1001},
      {kFrameRate_Video30, 30, 1},
      {kFrameRate_Video48, 48, 1},
      {kFrameRate_Video50, 50, 1},
      {kFrameRate_Video59_94, 60000, 1001},
      {kFrameRate_Video60, 60, 1},
      {kFrameRate_Video100, 100, 1},
      {kFrameRate_Video119_88, 120000, 1001},
      {kFrameRate_Milliseconds, 1000, 1},
      {kFrameRate_Audio8000, 8000, 1},
      {kFrameRate_Audio11025, 11025, 1},
      {kFrameRate_Audio16000, 16000, 1},
      {kFrameRate_Audio22050, 22050, 1},
      {kFrameRate_Audio32000, 32000, 1},
      {kFrameRate_Audio44100, 44100, 1},
      {kFrameRate_Audio48000, 48000, 1},
      {kFrameRate_Audio88200, 88200, 1},
      {kFrameRate_Audio96000, 96000, 1},
      {kFrameRate_Audio192000, 192000, 1},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.numerator);
    // numerator frames take exactly denominator seconds.
    EXPECT_EQ(TickTime(c.numerator, c.rate), kTime_OneSecond * c.denominator);
    if (c.denominator == 1) {
      EXPECT_EQ(FrameRate::FromFramesPerSecond(c.numerator), c.rate);
    }
  }
  EXPECT_EQ(kTime_OneMinute, kTime_OneSecond * 60);
  EXPECT_EQ(kTime_OneHour, kTime_OneMinute * 60);
  EXPECT_EQ(kTime_Max, kTime_OneHour * 100);
  EXPECT_EQ(kTime_Min, -kTime_Max);
  EXPECT_EQ(kTime_Invalid, kTime_OneSecond * -400000);
  EXPECT_EQ(FrameRate::FromFramesPerSecond(0), kFrameRate_Invalid);
  EXPECT_EQ(FrameRate::FromFramesPerSecond(-25), kFrameRate_Invalid);
}

TEST(TickTime, GoldenValues) {
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::seconds(5)), kTime_OneSecond * 5);
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::hours(6)), kTime_OneHour * 6);
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::milliseconds(-1500)), kTime_OneSecond * -1.5);
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::duration<double>(0.5)), kTime_OneSecond / 2);
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::duration<double>(std::nan(""))), kTime_Invalid);
  EXPECT_EQ(TickTime(1, kFrameRate_Video29_97).GetTicks(), 8475667200);
  EXPECT_EQ(TickTime(30, kFrameRate_Video29_97).GetTicks(), 254270016000);
  EXPECT_DOUBLE_EQ(TickTime(30, kFrameRate_Video29_97).ToSeconds(), 1.001);
  EXPECT_EQ(kFrameRate_Video30 * 2, kFrameRate_Video60);
  EXPECT_EQ(kFrameRate_Video60 / 2, kFrameRate_Video30);
  EXPECT_EQ(kFrameRate_Video25 * 2.0, kFrameRate_Video50);
  EXPECT_EQ(kFrameRate_Video50 / 2.0, kFrameRate_Video25);
  EXPECT_DOUBLE_EQ(GetFrameRateRatio(kFrameRate_Video60, kFrameRate_Video30), 2.0);
  EXPECT_DOUBLE_EQ(GetFrameRateRatio(FrameRate(0), kFrameRate_Video30), 0.0);
  EXPECT_DOUBLE_EQ(kTime_OneSecond / kTime_OneMinute, 1.0 / 60.0);
  EXPECT_LT(kFrameRate_Video60, kFrameRate_Video30);  // a faster rate orders first
  EXPECT_LT(kTime_Invalid, kTime_Min);
}

TEST(TickTime, ArithmeticWrapsWithoutOverflow) {
  // These would be signed overflow if done in int64; the sanitizer build checks.
  EXPECT_EQ(TickTime(kInt64Max) + TickTime(1), TickTime(kInt64Min));
  EXPECT_EQ(TickTime(kInt64Min) - TickTime(1), TickTime(kInt64Max));
  EXPECT_EQ(-TickTime(kInt64Min), TickTime(kInt64Min));
  EXPECT_EQ(TickTime(kInt64Max) * 2, TickTime(-2));
  EXPECT_EQ(TickTime(kInt64Max) * 2u, TickTime(-2));
  EXPECT_EQ(TickTime(kInt64Max) * std::int64_t{3}, TickTime(kInt64Max - 2));
  EXPECT_EQ(TickTime(kInt64Max / 2 + 1, FrameRate(2)), TickTime(kInt64Min));
  TickTime t(kInt64Max);
  t.AddFrames(1, FrameRate(1));
  EXPECT_EQ(t, TickTime(kInt64Min));
  TickTime m(kInt64Min);
  EXPECT_EQ(m.Abs(), TickTime(kInt64Min));
  EXPECT_EQ(TickTime(-5).Abs(), TickTime(5));
  EXPECT_EQ(TickTime(-3) * 4294967295u, TickTime(-3 * std::int64_t{4294967295}));
}

TEST(TickTime, DivisionByZeroReportsAndGivesInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(kTime_OneSecond / 0, kTime_Invalid);
  EXPECT_EQ(kTime_OneSecond / 0u, kTime_Invalid);
  EXPECT_EQ(kTime_OneSecond / 0.0, kTime_Invalid);
  EXPECT_EQ(kTime_OneSecond / std::int64_t{0}, kTime_Invalid);
  EXPECT_EQ(capture.Count(), 4u);
  const auto reports = capture.Reports();
  ASSERT_FALSE(reports.empty());
  EXPECT_EQ(reports[0].at(zebcore::debug::kDebugMessage),
            "Attempt to divide by zero in zebmediatypes::TickTime");
  EXPECT_EQ(reports[0].at(zebcore::debug::kDebugExpression), "false");
  EXPECT_EQ(reports[0].at(zebcore::debug::kDebugSource), "TickTime");
  EXPECT_EQ(reports[0].at(zebcore::debug::kDebugFunction), "zebmediatypes::TickTime::operator /");

  capture.Clear();
  TickTime t = kTime_OneSecond;
  t /= 0;
  EXPECT_EQ(t, kTime_Invalid);
  ASSERT_EQ(capture.Count(), 1u);
  EXPECT_EQ(capture.Reports()[0].at(zebcore::debug::kDebugFunction),
            "zebmediatypes::TickTime::operator /=");

  capture.Clear();
  EXPECT_DOUBLE_EQ(kTime_OneSecond * 3 / TickTime(0), 3.0);  // the dividend in seconds
  EXPECT_EQ(capture.Count(), 1u);
}

TEST(TickTime, MostNegativeDividedByMinusOneReportsAndGivesInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(TickTime(kInt64Min) / -1, kTime_Invalid);
  EXPECT_EQ(TickTime(kInt64Min) / std::int64_t{-1}, kTime_Invalid);
  EXPECT_EQ(capture.Count(), 2u);
  EXPECT_EQ(TickTime(kInt64Min + 1) / -1, TickTime(kInt64Max));
  EXPECT_EQ(TickTime(-7) / 2, TickTime(-3));  // truncates toward zero
  EXPECT_EQ(TickTime(7) / 2u, TickTime(3));
  EXPECT_EQ(capture.Count(), 2u);
}

TEST(TickTime, DoubleResultsAreCheckedBeforeConversion) {
  zebcore::debug::ScopedAssertionCapture capture;
  const double kNaN = std::numeric_limits<double>::quiet_NaN();
  const double kInf = std::numeric_limits<double>::infinity();
  struct Case {
    const char* label;
    TickTime result;
    TickTime expected;
  };
  const Case kCases[] = {
      {"nan factor", kTime_OneSecond * kNaN, kTime_Invalid},
      {"nan divisor", kTime_OneSecond / kNaN, kTime_Invalid},
      {"huge factor", kTime_OneSecond * 1e300, TickTime(kInt64Max)},
      {"huge negative factor", kTime_OneSecond * -1e300, TickTime(kInt64Min)},
      {"infinite factor", kTime_OneSecond * kInf, TickTime(kInt64Max)},
      {"tiny divisor", kTime_OneSecond / 1e-300, TickTime(kInt64Max)},
      {"infinite divisor", kTime_OneSecond / kInf, kTime_Zero},
      {"truncates toward zero", TickTime(-10) * 0.25, TickTime(-2)},
      {"one and a half", kTime_OneSecond * 1.5, TickTime(381024000000)},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    EXPECT_EQ(c.result, c.expected);
  }
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(FrameRate, InvalidRateStaysInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  const double kNaN = std::numeric_limits<double>::quiet_NaN();
  EXPECT_EQ(kFrameRate_Invalid * 2, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Invalid / 2, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Invalid * 2.0, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Invalid / 0.5, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Invalid * -1, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Video25 * kNaN, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Video25 / kNaN, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Video25 / 1e300, kFrameRate_Invalid);  // clamps to the slowest
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(FrameRate, MultiplyByZeroReportsAndGivesInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(kFrameRate_Video25 * 0, kFrameRate_Invalid);
  FrameRate r = kFrameRate_Video30;
  r *= 0;
  EXPECT_EQ(r, kFrameRate_Invalid);
  EXPECT_EQ(kFrameRate_Video25 * 0.0, kFrameRate_Invalid);
  EXPECT_EQ(FrameRate(kInt64Min) * -1, kFrameRate_Invalid);
  EXPECT_EQ(capture.Count(), 4u);
}

TEST(FrameRate, NoRateHasZeroFramesPerSecond) {
  const FrameRate kNoRates[] = {kFrameRate_Invalid, FrameRate(0), FrameRate(-1),
                                FrameRate(kInt64Min)};
  for (FrameRate rate : kNoRates) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    EXPECT_FALSE(rate.IsValid());
    EXPECT_EQ(rate.GetFramesPerSecond(), 0.0);
    EXPECT_EQ(Utf8(FrameRateToUTF16String(rate)), "0");
    EXPECT_EQ(TickTime(kInt64Min).ToFrame64(rate), 0);
    EXPECT_EQ(kTime_OneHour.ToFrame32(rate), 0);
    EXPECT_EQ(details::ExplainTickTimeWithFrameRate(kTime_OneSecond * 1.5, rate),
              "which is 1.5 seconds");
  }
}

TEST(TickTime, AlignmentGoldenValues) {
  const std::int64_t p60 = kFrameRate_Video60.GetTicksPerFrame();
  const std::int64_t p24 = kFrameRate_Video24.GetTicksPerFrame();
  struct Case {
    const char* label;
    std::int64_t ticks;
    FrameRate rate;
    std::int64_t floor, ceil, nearest;
  };
  const Case kCases[] = {
      {"3 frames + 1 tick", 3 * p60 + 1, kFrameRate_Video60, 3 * p60, 4 * p60, 3 * p60},
      {"exact boundary", 5 * p60, kFrameRate_Video60, 5 * p60, 5 * p60, 5 * p60},
      {"zero", 0, kFrameRate_Video60, 0, 0, 0},
      {"half frame", p24 / 2, kFrameRate_Video24, 0, p24, p24},
      {"minus half frame", -p24 / 2, kFrameRate_Video24, 0, 0, -p24},
      {"just under half", p24 / 2 - 1, kFrameRate_Video24, 0, p24, 0},
      // The ceiling formula t + p - 1 moves negative times toward zero:
      // -1.5 frames gives 0 and an exact -2 frames gives -1 frame.
      {"minus 1.5 frames", -3 * p24 / 2, kFrameRate_Video24, -p24, 0, -2 * p24},
      {"minus 2 frames", -2 * p24, kFrameRate_Video24, -2 * p24, -p24, -2 * p24},
      {"minus 1 tick", -1, kFrameRate_Video24, 0, 0, 0},
      {"200 hours", 200 * kTime_OneHour.GetTicks(), kFrameRate_Video29_97,
       200 * kTime_OneHour.GetTicks() - 200 * kTime_OneHour.GetTicks() % 8475667200,
       200 * kTime_OneHour.GetTicks() + 8475667200 - 200 * kTime_OneHour.GetTicks() % 8475667200,
       kTime_Max.GetTicks()},
      {"minus 200 hours", -200 * kTime_OneHour.GetTicks(), kFrameRate_Video25,
       -200 * kTime_OneHour.GetTicks(), -200 * kTime_OneHour.GetTicks() + 10160640000,
       kTime_Min.GetTicks()},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    TickTime floor(c.ticks), ceil(c.ticks), nearest(c.ticks);
    EXPECT_EQ(floor.AlignToFrame(c.rate).GetTicks(), c.floor);
    EXPECT_EQ(ceil.AlignToFrameCeil(c.rate).GetTicks(), c.ceil);
    EXPECT_EQ(nearest.AlignToNearestFrame(c.rate).GetTicks(), c.nearest);
  }
}

TEST(TickTime, AlignmentWithNoRateLeavesTimeUnchanged) {
  const FrameRate kNoRates[] = {kFrameRate_Invalid, FrameRate(0), FrameRate(-7)};
  const std::int64_t kTimes[] = {0, 12345, -12345, kInt64Max, kInt64Min};
  for (FrameRate rate : kNoRates) {
    for (std::int64_t ticks : kTimes) {
      SCOPED_TRACE(testing::Message() << rate.GetTicksPerFrame() << " " << ticks);
      TickTime a(ticks), b(ticks), c(ticks);
      EXPECT_EQ(a.AlignToFrame(rate).GetTicks(), ticks);
      EXPECT_EQ(b.AlignToFrameCeil(rate).GetTicks(), ticks);
      EXPECT_EQ(c.AlignToNearestFrame(rate).GetTicks(), ticks);
    }
  }
}

TEST(TickTime, AlignmentAtTheInt64LimitsDoesNotOverflow) {
  const FrameRate kRates[] = {
      kFrameRate_Video29_97, kFrameRate_Audio192000,   FrameRate(1),
      FrameRate(2),          FrameRate(kInt64Max - 1), FrameRate(kInt64Max / 2)};
  const std::int64_t kTimes[] = {kInt64Max, kInt64Max - 1, kInt64Min, kInt64Min + 1};
  for (FrameRate rate : kRates) {
    const std::int64_t p = rate.GetTicksPerFrame();
    for (std::int64_t ticks : kTimes) {
      SCOPED_TRACE(testing::Message() << p << " " << ticks);
      TickTime nearest(ticks);
      nearest.AlignToNearestFrame(rate);
      EXPECT_EQ(nearest, ticks > 0 ? kTime_Max : kTime_Min);
      TickTime floor(ticks);
      floor.AlignToFrame(rate);
      EXPECT_EQ(floor.GetTicks() % p, 0);
      TickTime ceil(ticks);
      ceil.AlignToFrameCeil(rate);
      EXPECT_EQ(ceil.GetTicks() % p, 0);
      if (ticks < 0) {
        EXPECT_GE(ceil.GetTicks(), ticks);
      }
    }
  }
}

TEST(TickTime, AlignmentPropertiesHoldAcrossASweep) {
  const FrameRate kRates[] = {kFrameRate_Video23_976, kFrameRate_Video29_97, kFrameRate_Video25,
                              kFrameRate_Audio44100,  FrameRate(7),          FrameRate(2)};
  for (FrameRate rate : kRates) {
    const std::int64_t p = rate.GetTicksPerFrame();
    for (std::int64_t k = -20; k <= 20; ++k) {
      for (std::int64_t offset :
           {std::int64_t{0}, std::int64_t{1}, p / 2 - 1, p / 2, p / 2 + 1, p - 1}) {
        const std::int64_t ticks = k * p + offset;
        SCOPED_TRACE(testing::Message() << p << " " << ticks);
        TickTime floor(ticks), ceil(ticks), nearest(ticks);
        floor.AlignToFrame(rate);
        ceil.AlignToFrameCeil(rate);
        nearest.AlignToNearestFrame(rate);
        for (TickTime aligned : {floor, ceil, nearest}) EXPECT_EQ(aligned.GetTicks() % p, 0);
        // Toward zero, at most one frame away.
        EXPECT_LE(std::abs(floor.GetTicks()), std::abs(ticks));
        EXPECT_LT(std::abs(ticks - floor.GetTicks()), p);
        EXPECT_LE(std::abs(ticks - nearest.GetTicks()) * 2, p);
        if (ticks >= 0) {
          EXPECT_GE(ceil.GetTicks(), ticks);
          EXPECT_LT(ceil.GetTicks() - ticks, p);
        }
        EXPECT_EQ(TickTime(ticks).ToFrame64(rate), floor.GetTicks() / p);
      }
    }
  }
}

TEST(TickTime, CalculateFrameRate) {
  struct Case {
    const char* label;
    TickTime duration;
    std::uint64_t frames;
    FrameRate expected;
  };
  const Case kCases[] = {
      {"one second, 25 frames", kTime_OneSecond, 25, kFrameRate_Video25},
      {"1.001 s, 30 frames", TickTime(30, kFrameRate_Video29_97), 30, kFrameRate_Video29_97},
      {"no frames", kTime_OneSecond, 0, kFrameRate_Invalid},
      {"shorter than the frame count", TickTime(10), 11, kFrameRate_Invalid},
      {"zero duration", kTime_Zero, 5, kFrameRate_Invalid},
      {"negative duration", -kTime_OneSecond, 25, kFrameRate_Invalid},
      {"huge frame count", kTime_OneSecond, ~std::uint64_t{0}, kFrameRate_Invalid},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    FrameRate rate = kFrameRate_Video24;
    c.duration.CalculateFrameRate(c.frames, rate);
    EXPECT_EQ(rate, c.expected);
  }
}

TEST(FrameRate, MatchedFrameRateFromFloat) {
  const double kNaN = std::numeric_limits<double>::quiet_NaN();
  const double kInf = std::numeric_limits<double>::infinity();
  struct Case {
    double fps;
    FrameRate expected;
  };
  const Case kCases[] = {
      {29.97, kFrameRate_Video29_97},
      {29.975, kFrameRate_Video29_97},
      // 29.965 lies 0.00503 from 30000/1001, outside the tolerance: it is not
      // snapped to the named rate.
      {29.965, FrameRate(static_cast<std::int64_t>(254016000000 / 29.965))},
      {29.98, FrameRate(static_cast<std::int64_t>(254016000000 / 29.98))},
      {23.976, kFrameRate_Video23_976},
      {11.988, kFrameRate_Video11_988},
      {14.985, kFrameRate_Video14_985},
      {59.94, kFrameRate_Video59_94},
      {119.88, kFrameRate_Video119_88},
      {25.0, kFrameRate_Video25},
      {24.0, kFrameRate_Video24},
      {44100.0, kFrameRate_Audio44100},
      {48000.0, kFrameRate_Audio48000},
      {0.0, kFrameRate_Invalid},
      {-25.0, kFrameRate_Invalid},
      {kNaN, kFrameRate_Invalid},
      {kInf, kFrameRate_Invalid},
      {-kInf, kFrameRate_Invalid},
      {1e12, kFrameRate_Invalid},    // shorter than one tick
      {1e-300, kFrameRate_Invalid},  // beyond the 64-bit range
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.fps);
    EXPECT_EQ(MatchedFrameRateFromFloat(c.fps), c.expected);
  }
}

TEST(FrameRate, IsFrameRateAudio) {
  const FrameRate kAudio[] = {kFrameRate_Audio22050, kFrameRate_Audio32000, kFrameRate_Audio44100,
                              kFrameRate_Audio48000, kFrameRate_Audio88200, kFrameRate_Audio96000,
                              kFrameRate_Audio192000};
  for (FrameRate r : kAudio) EXPECT_TRUE(IsFrameRateAudio(r)) << r.GetTicksPerFrame();
  const FrameRate kNotAudio[] = {kFrameRate_Audio8000,    kFrameRate_Audio11025,
                                 kFrameRate_Audio16000,   kFrameRate_Video48,
                                 kFrameRate_Milliseconds, kFrameRate_Invalid};
  for (FrameRate r : kNotAudio) EXPECT_FALSE(IsFrameRateAudio(r)) << r.GetTicksPerFrame();
}

TEST(FrameRate, TextForms) {
  struct Case {
    FrameRate rate;
    const char* text;
  };
  const Case kCases[] = {
      {kFrameRate_Video23_976, "23.976"}, {kFrameRate_Video11_988, "11.988"},
      {kFrameRate_Video14_985, "14.985"}, {kFrameRate_Video29_97, "29.97"},
      {kFrameRate_Video59_94, "59.94"},   {kFrameRate_Video119_88, "119.88"},
      {kFrameRate_Video25, "25"},         {kFrameRate_Audio44100, "44100"},
      {kFrameRate_Invalid, "0"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    std::ostringstream narrow;
    narrow << c.rate;
    EXPECT_EQ(narrow.str(), c.text);
    zebcore::string::oUTF16StringStream wide;
    wide << c.rate;
    EXPECT_EQ(Utf8(wide.str()), c.text);
    EXPECT_EQ(zebcore::string::ToStdString(FrameRateToUTF8String(c.rate)), c.text);
  }
}

TEST(TickTime, TextForms) {
  std::ostringstream narrow;
  narrow.precision(3);
  narrow << TickTime(30, kFrameRate_Video29_97);
  EXPECT_EQ(narrow.str(), "1");
  zebcore::string::oUTF16StringStream wide;
  wide << TickTime(30, kFrameRate_Video29_97) << u" " << kTime_OneSecond / 3;
  EXPECT_EQ(Utf8(wide.str()), "1.001 0.333333");
  std::ostringstream printed;
  PrintTo(kTime_OneSecond, &printed);
  EXPECT_EQ(printed.str(), "254016000000 ticks");
}

TEST(TickTime, ExplainTickTimeWithFrameRate) {
  struct Case {
    TickTime time;
    FrameRate rate;
    const char* text;
  };
  const Case kCases[] = {
      {kTime_OneSecond, kFrameRate_Video24, "which is 24 frames at 24fps"},
      {kTime_OneSecond / 2, kFrameRate_Video25, "which is 12.5 frames at 25fps"},
      {kTime_OneSecond, kFrameRate_Audio48000, "which is 48000 samples at 48000Hz"},
      {kTime_OneSecond, kFrameRate_Audio8000, "which is 8000 samples at 8000Hz"},
      {kTime_OneSecond, kFrameRate_Video48, "which is 48 frames at 48fps"},
      {kTime_OneSecond * 2, kFrameRate_Invalid, "which is 2 seconds"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(details::ExplainTickTimeWithFrameRate(c.time, c.rate), c.text);
  }
}

TEST(TickTime, JSONRoundTrip) {
  using zebcore::serialization::JSONConvert;
  EXPECT_EQ(zebcore::string::ToStdString(zebcore::serialization::ToJSONText(kTime_OneSecond)),
            R"({"ticks":254016000000})");
  const TickTime kTimes[] = {kTime_Zero, kTime_OneSecond,     kTime_Invalid,       kTime_Max,
                             kTime_Min,  TickTime(kInt64Max), TickTime(kInt64Min), TickTime(-1)};
  for (TickTime t : kTimes) {
    SCOPED_TRACE(t.GetTicks());
    const auto text = zebcore::serialization::ToJSONText(t);
    const auto parsed = zebcore::serialization::JSONParse(text);
    ASSERT_TRUE(parsed);
    EXPECT_EQ(JSONConvert<TickTime>::FromJSON(*parsed), t);
  }
}

TEST(TickTime, JSONReadsAbsentAsZeroAndRejectsOtherTypes) {
  using zebcore::serialization::JSONConvert;
  auto read = [](const char* text) {
    const auto parsed = zebcore::serialization::JSONParse(zebcore::string::ToUTF8String(text));
    if (!parsed) throw std::runtime_error("unparsed test input");
    return JSONConvert<TickTime>::FromJSON(*parsed);
  };
  EXPECT_EQ(read("{}"), kTime_Zero);
  EXPECT_EQ(read(R"({"other":5})"), kTime_Zero);
  EXPECT_EQ(read(R"({"ticks":-5})"), TickTime(-5));
  const char* kBad[] = {R"({"ticks":"5"})",
                        R"({"ticks":1.5})",
                        R"({"ticks":null})",
                        R"({"ticks":{}})",
                        R"({"ticks":true})",
                        "5",
                        "[]",
                        R"("ticks")"};
  for (const char* text : kBad) {
    SCOPED_TRACE(text);
    EXPECT_THROW(read(text), boost::bad_any_cast);
  }
}

}  // namespace
}  // namespace zebmediatypes
