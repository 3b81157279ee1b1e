#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/json.h>
#include <zebcore/stream.h>
#include <zebmediatypes/tick_time.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <iomanip>
#include <limits>
#include <random>
#include <sstream>
#include <tuple>

namespace zebmediatypes {
namespace {

using Limits = std::numeric_limits<std::int64_t>;
constexpr std::int64_t kInt64Max = Limits::max(), kInt64Min = Limits::min();
const double kNaN = std::numeric_limits<double>::quiet_NaN();
const double kInf = std::numeric_limits<double>::infinity();
using Aligned3 = std::array<std::int64_t, 3>;  // floor, ceiling, nearest

std::string Utf8(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

Aligned3 Aligned(std::int64_t t, FrameRate rate) {
  return {TickTime(t).AlignToFrame(rate).GetTicks(), TickTime(t).AlignToFrameCeil(rate).GetTicks(),
          TickTime(t).AlignToNearestFrame(rate).GetTicks()};
}

TEST(TickTime, EveryNamedRateIsAWholeNumberOfTicksPerSecond) {
  // numerator frames take exactly denominator seconds.
  // clang-format off
  const std::tuple<FrameRate, std::int64_t, std::int64_t> kCases[] = {
      {kFrameRate_Video11_988, 12000, 1001}, {kFrameRate_Video14_985, 15000, 1001}, {kFrameRate_Video23_976, 24000, 1001}, {kFrameRate_Video24, 24, 1},
      {kFrameRate_Video25, 25, 1}, {kFrameRate_Video29_97, 30000, 1001}, {kFrameRate_Video30, 30, 1}, {kFrameRate_Video48, 48, 1},
      {kFrameRate_Video50, 50, 1}, {kFrameRate_Video59_94, 60000, 1001}, {kFrameRate_Video60, 60, 1}, {kFrameRate_Video100, 100, 1},
      {kFrameRate_Video119_88, 120000, 1001}, {kFrameRate_Milliseconds, 1000, 1}, {kFrameRate_Audio8000, 8000, 1}, {kFrameRate_Audio11025, 11025, 1},
      {kFrameRate_Audio16000, 16000, 1}, {kFrameRate_Audio22050, 22050, 1}, {kFrameRate_Audio32000, 32000, 1}, {kFrameRate_Audio44100, 44100, 1},
      {kFrameRate_Audio48000, 48000, 1}, {kFrameRate_Audio88200, 88200, 1}, {kFrameRate_Audio96000, 96000, 1}, {kFrameRate_Audio192000, 192000, 1},
  };
  // clang-format on
  for (const auto& [rate, numerator, denominator] : kCases) {
    EXPECT_EQ(TickTime(numerator, rate), kTime_OneSecond * denominator) << numerator;
  }
  EXPECT_EQ(kTime_Max, kTime_OneSecond * 360000);
  EXPECT_EQ(kTime_Min, -kTime_Max);
  EXPECT_EQ(kTime_Invalid, kTime_OneSecond * -400000);
  EXPECT_EQ(FrameRate::FromFramesPerSecond(-25), kFrameRate_Invalid);
}

TEST(TickTime, GoldenValues) {
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::milliseconds(-1500)), kTime_OneSecond * -1.5);
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::duration<double>(0.5)), kTime_OneSecond / 2);
  EXPECT_EQ(TickTime::DurationToTicks(std::chrono::duration<double>(kNaN)), kTime_Invalid);
  EXPECT_DOUBLE_EQ(TickTime(30, kFrameRate_Video29_97).ToSeconds(), 1.001);
  EXPECT_EQ(kFrameRate_Video30 * 2, kFrameRate_Video60);
  EXPECT_EQ(kFrameRate_Video60 / 2, kFrameRate_Video30);
  EXPECT_EQ(kFrameRate_Video25 * 2.0, kFrameRate_Video50);
  EXPECT_EQ(kFrameRate_Video50 / 2.0, kFrameRate_Video25);
  EXPECT_DOUBLE_EQ(GetFrameRateRatio(kFrameRate_Video60, kFrameRate_Video30), 2.0);
  EXPECT_DOUBLE_EQ(GetFrameRateRatio(FrameRate(0), kFrameRate_Video30), 0.0);
  EXPECT_LT(kFrameRate_Video60, kFrameRate_Video30);  // a faster rate orders first
}

TEST(TickTime, ArithmeticWrapsWithoutOverflow) {
  // Each of these is signed overflow if done in int64; the sanitizer build checks.
  // clang-format off
  const std::pair<TickTime, TickTime> kCases[] = {
      {TickTime(kInt64Max) + TickTime(1), TickTime(kInt64Min)}, {TickTime(kInt64Min) - TickTime(1), TickTime(kInt64Max)},
      {-TickTime(kInt64Min), TickTime(kInt64Min)}, {TickTime(kInt64Min).Abs(), TickTime(kInt64Min)},
      {TickTime(kInt64Max) * 2, TickTime(-2)}, {TickTime(kInt64Max) * 2u, TickTime(-2)}, {TickTime(kInt64Max) * std::int64_t{3}, TickTime(kInt64Max - 2)},
      {TickTime(-3) * 4294967295u, TickTime(-3 * std::int64_t{4294967295})}, {TickTime(kInt64Max / 2 + 1, FrameRate(2)), TickTime(kInt64Min)},
      {TickTime(kInt64Max).AddFrames(1, FrameRate(1)), TickTime(kInt64Min)},
  };
  // clang-format on
  for (const auto& [result, expected] : kCases) EXPECT_EQ(result, expected);
}

TEST(TickTime, TrappingDivisionsReportAndGiveInvalid) {
  zebcore::debug::ScopedAssertionCapture capture;
  // clang-format off
  const TickTime kResults[] = {kTime_OneSecond / 0, kTime_OneSecond / 0u, kTime_OneSecond / 0.0, kTime_OneSecond / std::int64_t{0},
                               TickTime(kInt64Min) / -1, TickTime(kInt64Min) / std::int64_t{-1}, TickTime(kTime_OneSecond) /= 0};
  // clang-format on
  for (TickTime t : kResults) EXPECT_EQ(t, kTime_Invalid);
  ASSERT_EQ(capture.Count(), 7u);
  EXPECT_EQ(capture.Reports()[1].at(zebcore::debug::kDebugMessage),
            "Attempt to divide by zero in zebmediatypes::TickTime");
  EXPECT_DOUBLE_EQ(kTime_OneSecond * 3 / TickTime(0), 3.0);  // the dividend in seconds
  EXPECT_EQ(capture.Count(), 8u);
  EXPECT_EQ(TickTime(kInt64Min + 1) / -1, TickTime(kInt64Max));
  EXPECT_EQ(TickTime(-7) / 2, TickTime(-3));  // truncates toward zero
  EXPECT_EQ(capture.Count(), 8u);
}

TEST(TickTime, DoubleResultsAreCheckedBeforeConversion) {
  zebcore::debug::ScopedAssertionCapture capture;
  // clang-format off
  const std::tuple<const char*, TickTime, TickTime> kCases[] = {
      {"nan factor", kTime_OneSecond * kNaN, kTime_Invalid}, {"nan divisor", kTime_OneSecond / kNaN, kTime_Invalid},
      {"huge factor", kTime_OneSecond * 1e300, TickTime(kInt64Max)}, {"huge negative factor", kTime_OneSecond * -1e300, TickTime(kInt64Min)},
      {"infinite factor", kTime_OneSecond * kInf, TickTime(kInt64Max)}, {"tiny divisor", kTime_OneSecond / 1e-300, TickTime(kInt64Max)},
      {"infinite divisor", kTime_OneSecond / kInf, kTime_Zero}, {"truncates toward zero", TickTime(-10) * 0.25, TickTime(-2)},
  };
  // clang-format on
  for (const auto& [label, result, expected] : kCases) EXPECT_EQ(result, expected) << label;
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(TickTime, FromSecondsRoundsToTheNearestTickAndClamps) {
  struct Case {
    double seconds;
    TickTime expected;
  };
  const Case kCases[] = {
      {1.001, TickTime(30, kFrameRate_Video29_97)},
      {-1.001, TickTime(-30, kFrameRate_Video29_97)},
      {0.5, kTime_OneSecond / 2},
      {1e-12, kTime_Zero},   // 0.254 ticks
      {3e-12, TickTime(1)},  // 0.762 ticks
      {-3e-12, TickTime(-1)},
      {kNaN, kTime_Invalid},
      {4e7, TickTime(kInt64Max)},
      {-4e7, TickTime(kInt64Min)},
      {kInf, TickTime(kInt64Max)},
      {-kInf, TickTime(kInt64Min)},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.seconds);
    EXPECT_EQ(TickTime::FromSeconds(c.seconds), c.expected);
  }
  // Below 2^51 ticks a double holds every tick: the seconds read back exactly.
  std::mt19937_64 random(51);
  for (int i = 0; i < 10000; ++i) {
    const auto t = static_cast<std::int64_t>(random() >> (13 + i % 50)) * (i % 2 != 0 ? -1 : 1);
    ASSERT_EQ(TickTime::FromSeconds(TickTime(t).ToSeconds()), TickTime(t)) << t;
  }
}

TEST(TickTime, EveryFrameStartWithinADaySurvivesSecondsAsDouble) {
  const FrameRate kVideoRates[] = {
      kFrameRate_Video11_988, kFrameRate_Video14_985, kFrameRate_Video23_976, kFrameRate_Video24,
      kFrameRate_Video25,     kFrameRate_Video29_97,  kFrameRate_Video30,     kFrameRate_Video48,
      kFrameRate_Video50,     kFrameRate_Video59_94,  kFrameRate_Video60,     kFrameRate_Video100,
      kFrameRate_Video119_88};
  for (FrameRate rate : kVideoRates) {
    const std::int64_t last = (kTime_OneHour * 24).ToFrame64(rate);
    for (std::int64_t f = -last; f <= last; ++f) {
      const TickTime start(f, rate);
      TickTime back = TickTime::FromSeconds(start.ToSeconds());
      if (back.AlignToNearestFrame(rate) != start) {
        FAIL() << "frame " << f << " at " << rate.GetTicksPerFrame() << " ticks/frame";
      }
    }
  }
}

TEST(FrameRate, InvalidRateStaysInvalidAndMultiplyByZeroReports) {
  zebcore::debug::ScopedAssertionCapture capture;
  // clang-format off
  const FrameRate kQuiet[] = {kFrameRate_Invalid * 2, kFrameRate_Invalid / 2, kFrameRate_Invalid * 2.0, kFrameRate_Invalid / 0.5,
                              kFrameRate_Invalid * -1, kFrameRate_Video25 * kNaN, kFrameRate_Video25 / kNaN, kFrameRate_Video25 / 1e300};
  for (FrameRate r : kQuiet) EXPECT_EQ(r, kFrameRate_Invalid);
  EXPECT_EQ(capture.Count(), 0u);
  const FrameRate kReported[] = {kFrameRate_Video25 * 0, kFrameRate_Video25 * 0.0, FrameRate(kInt64Min) * -1, FrameRate(kFrameRate_Video30) *= 0};
  // clang-format on
  for (FrameRate r : kReported) EXPECT_EQ(r, kFrameRate_Invalid);
  EXPECT_EQ(capture.Count(), 4u);
}

TEST(FrameRate, NoRateHasZeroFramesPerSecond) {
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-1), FrameRate(kInt64Min)}) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    EXPECT_EQ(rate.GetFramesPerSecond(), 0.0);
    EXPECT_EQ(Utf8(FrameRateToUTF16String(rate)), "0");
    EXPECT_EQ(TickTime(kInt64Min).ToFrame64(rate), 0);
    EXPECT_EQ(kTime_OneHour.ToFrame32(rate), 0);
    EXPECT_EQ(details::ExplainTickTimeWithFrameRate(kTime_OneSecond * 1.5, rate),
              "which is 1.5 seconds");
    for (std::int64_t t : {std::int64_t{-12345}, kInt64Max, kInt64Min}) {
      EXPECT_EQ(Aligned(t, rate), (Aligned3{t, t, t}));  // alignment leaves the time as it is
    }
  }
}

TEST(TickTime, AlignmentGoldenValues) {
  const std::int64_t p24 = kFrameRate_Video24.GetTicksPerFrame();
  // The ceiling formula t + p - 1 moves negative times toward zero: -1.5 frames
  // gives 0 and an exact -2 frames gives -1 frame. Nearest rounds the half away
  // from zero.
  // clang-format off
  const std::pair<std::int64_t, Aligned3> kCases[] = {
      {p24 / 2, {0, p24, p24}}, {-p24 / 2, {0, 0, -p24}}, {-3 * p24 / 2, {-p24, 0, -2 * p24}}, {-2 * p24, {-2 * p24, -p24, -2 * p24}}};
  // clang-format on
  for (const auto& [t, want] : kCases) EXPECT_EQ(Aligned(t, kFrameRate_Video24), want) << t;
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

TEST(TickTime, AlignmentAtTheInt64LimitsDoesNotOverflow) {
  // Nearest clamps to the bound on t's side; so does it 200 hours out.
  const std::int64_t h200 = 200 * kTime_OneHour.GetTicks();
  // clang-format off
  for (std::int64_t p : {kFrameRate_Video29_97.GetTicksPerFrame(), std::int64_t{1}, std::int64_t{2}, kInt64Max / 2, kInt64Max - 1}) {
    for (std::int64_t t : {kInt64Max, kInt64Max - 1, kInt64Min, kInt64Min + 1, h200, -h200}) ExpectAlignmentAgrees(t, p);
  }
  // clang-format on
}

TEST(TickTime, AlignmentAgreesWithWideArithmetic) {
  // Every frame boundary and half frame around zero at real rates.
  // clang-format off
  for (std::int64_t p : {kFrameRate_Video23_976.GetTicksPerFrame(), kFrameRate_Video29_97.GetTicksPerFrame(), kFrameRate_Audio44100.GetTicksPerFrame(), std::int64_t{7}, std::int64_t{2}}) {
    for (std::int64_t k = -20; k <= 20; ++k) {
      for (std::int64_t offset : {std::int64_t{0}, std::int64_t{1}, p / 2 - 1, p / 2, p / 2 + 1, p - 1}) ExpectAlignmentAgrees(k * p + offset, p);
    }
  }
  // clang-format on
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

TEST(TickTime, CalculateFrameRateOfNoDurationIsInvalid) {
  // A duration shorter than the frame count gives under one tick per frame.
  // clang-format off
  const std::tuple<TickTime, std::uint64_t, FrameRate> kCases[] = {
      {kTime_OneSecond, 25, kFrameRate_Video25}, {TickTime(30, kFrameRate_Video29_97), 30, kFrameRate_Video29_97},
      {kTime_OneSecond, 0, kFrameRate_Invalid}, {TickTime(10), 11, kFrameRate_Invalid}, {kTime_Zero, 5, kFrameRate_Invalid},
      {-kTime_OneSecond, 25, kFrameRate_Invalid}, {kTime_OneSecond, ~std::uint64_t{0}, kFrameRate_Invalid},
  };
  // clang-format on
  for (const auto& [duration, frames, expected] : kCases) {
    FrameRate rate = kFrameRate_Video24;
    duration.CalculateFrameRate(frames, rate);
    EXPECT_EQ(rate, expected) << duration.GetTicks() << " " << frames;
  }
}

TEST(FrameRate, MatchedFrameRateFromFloat) {
  // 29.965 lies 0.00503 from 30000/1001, outside the tolerance: not snapped.
  // 1e12 fps is shorter than one tick; 1e-300 fps is beyond the 64-bit range.
  // clang-format off
  const std::pair<double, FrameRate> kCases[] = {
      {29.97, kFrameRate_Video29_97}, {29.975, kFrameRate_Video29_97}, {23.976, kFrameRate_Video23_976}, {11.988, kFrameRate_Video11_988},
      {29.965, FrameRate(static_cast<std::int64_t>(254016000000 / 29.965))}, {29.98, FrameRate(static_cast<std::int64_t>(254016000000 / 29.98))},
      {14.985, kFrameRate_Video14_985}, {59.94, kFrameRate_Video59_94}, {119.88, kFrameRate_Video119_88}, {25.0, kFrameRate_Video25},
      {44100.0, kFrameRate_Audio44100}, {0.0, kFrameRate_Invalid}, {-25.0, kFrameRate_Invalid}, {kNaN, kFrameRate_Invalid},
      {kInf, kFrameRate_Invalid}, {-kInf, kFrameRate_Invalid}, {1e12, kFrameRate_Invalid}, {1e-300, kFrameRate_Invalid},
  };
  // clang-format on
  for (const auto& [fps, expected] : kCases)
    EXPECT_EQ(MatchedFrameRateFromFloat(fps), expected) << fps;
}

TEST(FrameRate, IsFrameRateAudioCoversOnlyTheHighSampleRates) {
  // clang-format off
  const std::pair<FrameRate, bool> kCases[] = {
      {kFrameRate_Audio22050, true}, {kFrameRate_Audio32000, true}, {kFrameRate_Audio44100, true}, {kFrameRate_Audio48000, true}, {kFrameRate_Audio88200, true},
      {kFrameRate_Audio96000, true}, {kFrameRate_Audio192000, true}, {kFrameRate_Audio8000, false}, {kFrameRate_Audio11025, false}, {kFrameRate_Audio16000, false},
      {kFrameRate_Video48, false}, {kFrameRate_Milliseconds, false}, {kFrameRate_Invalid, false}};
  // clang-format on
  for (const auto& [rate, audio] : kCases) {
    EXPECT_EQ(IsFrameRateAudio(rate), audio) << rate.GetTicksPerFrame();
  }
}

TEST(TickTime, TextFormsOfTimesAndRates) {
  // Rates not written here show in the frame rate descriptions.
  std::ostringstream narrow;
  zebcore::string::oUTF16StringStream wide;
  narrow << std::setprecision(3) << TickTime(30, kFrameRate_Video29_97) << " ";
  PrintTo(kTime_OneSecond, &narrow);
  narrow << " " << kFrameRate_Video23_976 << " " << kFrameRate_Video119_88;
  wide << TickTime(30, kFrameRate_Video29_97) << u" " << kTime_OneSecond / 3 << u" "
       << kFrameRate_Audio44100 << u" " << kFrameRate_Invalid;
  EXPECT_EQ(narrow.str() + " " + Utf8(wide.str()),
            "1 254016000000 ticks 23.976 119.88 1.001 0.333333 44100 0");
  EXPECT_EQ(zebcore::string::ToStdString(FrameRateToUTF8String(kFrameRate_Video29_97)), "29.97");
  // clang-format off
  const std::tuple<TickTime, FrameRate, const char*> kCases[] = {
      {kTime_OneSecond, kFrameRate_Video24, "which is 24 frames at 24fps"}, {kTime_OneSecond / 2, kFrameRate_Video25, "which is 12.5 frames at 25fps"},
      {kTime_OneSecond, kFrameRate_Audio8000, "which is 8000 samples at 8000Hz"}, {kTime_OneSecond, kFrameRate_Video48, "which is 48 frames at 48fps"}};
  // clang-format on
  for (const auto& [time, rate, text] : kCases) {
    EXPECT_EQ(details::ExplainTickTimeWithFrameRate(time, rate), text);
  }
}

TEST(TickTime, JSONRoundTripAndBadForms) {
  auto read = [](const std::string& text) {
    const auto parsed = zebcore::serialization::JSONParse(zebcore::string::ToUTF8String(text));
    if (!parsed) throw std::runtime_error(text);
    return zebcore::serialization::JSONConvert<TickTime>::FromJSON(*parsed);
  };
  auto write = [](TickTime t) {
    return zebcore::string::ToStdString(zebcore::serialization::ToJSONText(t));
  };
  EXPECT_EQ(write(kTime_OneSecond), R"({"ticks":254016000000})");
  for (TickTime t : {kTime_Zero, kTime_Invalid, TickTime(kInt64Max), TickTime(kInt64Min)})
    EXPECT_EQ(read(write(t)), t);
  EXPECT_EQ(read(R"({"other":5})"), kTime_Zero);
  for (const char* bad : {R"({"ticks":"5"})", R"({"ticks":1.5})", R"({"ticks":null})",
                          R"({"ticks":{}})", R"({"ticks":true})", "5", "[]"}) {
    EXPECT_THROW(read(bad), boost::bad_any_cast) << bad;
  }
}

}  // namespace
}  // namespace zebmediatypes
