#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/audio_frame_rate_utils.h>

#include <cstdint>
#include <limits>
#include <vector>

namespace zebmediatypes {
namespace {

constexpr std::int64_t kTicksPerSecond = 254016000000;

FrameRate Hertz(std::int64_t hz) { return FrameRate(kTicksPerSecond / hz); }

TEST(NativeAudioRates, AreTheNineRatesFastestFirstAndMapToThemselves) {
  const NativeFrameRateSet rates = GetNativeFrameRates();
  // clang-format off
  const std::vector<FrameRate> expected = {
      kFrameRate_Audio96000, kFrameRate_Audio88200, kFrameRate_Audio48000, kFrameRate_Audio44100,
      kFrameRate_Audio32000, kFrameRate_Audio22050, kFrameRate_Audio16000, kFrameRate_Audio11025,
      kFrameRate_Audio8000};
  // clang-format on
  EXPECT_EQ(std::vector<FrameRate>(rates.begin(), rates.end()), expected);
  zebcore::debug::ScopedAssertionCapture capture;
  for (FrameRate rate : expected) EXPECT_EQ(FindBestNativeAudioRate(rate), rate);
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(FindBestNativeAudioRate, PrefersWholeMultiplesThenTheNextRateAbove) {
  // Requested rate and the native rate chosen for it, both in hertz.
  // clang-format off
  const std::pair<std::int64_t, std::int64_t> kCases[] = {
      {100000, 96000}, {176400, 88200}, {192000, 96000}, {4000, 8000},   {9000, 11025},
      {15000, 16000},  {22000, 22050},  {30000, 32000},  {44000, 44100}, {47000, 48000},
      {88000, 88200},  {88500, 96000},  {24000, 48000},  {12000, 48000}, {6000, 48000},
      {3000, 48000},   {7350, 22050},   {2000, 8000},    {1000, 8000},   {500, 8000},
      {400, 8000},     {14700, 44100},
  };
  // clang-format on
  zebcore::debug::ScopedAssertionCapture capture;
  for (const auto& [hz, expected] : kCases)
    EXPECT_EQ(FindBestNativeAudioRate(Hertz(hz)), Hertz(expected)) << hz;
  // Slower than 1 Hz: no whole-hertz multiple to look for.
  EXPECT_EQ(FindBestNativeAudioRate(FrameRate(kTicksPerSecond * 3)), kFrameRate_Audio8000);
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(FindBestNativeAudioRate, RatesOfNoValueAreReportedAndGiveFixedRates) {
  constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();
  // clang-format off
  const std::pair<std::int64_t, FrameRate> kCases[] = {
      {kMax, kFrameRate_Audio8000}, {0, kFrameRate_Audio96000}, {-1, kFrameRate_Audio96000},
      {-kMax - 1, kFrameRate_Audio96000}};
  // clang-format on
  for (const auto& [ticks, expected] : kCases) {
    SCOPED_TRACE(ticks);
    zebcore::debug::ScopedAssertionCapture capture;
    EXPECT_EQ(FindBestNativeAudioRate(FrameRate(ticks)), expected);
    ASSERT_EQ(capture.Count(), 1u);
    EXPECT_EQ(capture.Reports()[0].at(zebcore::debug::kDebugSource), "AudioFrameRateUtils");
  }
}

// The result is native and, up to 96000 Hz, never slower than the request, so
// the host only ever upsamples.
void CheckNeverDownsamples(std::int64_t step) {
  const NativeFrameRateSet native = GetNativeFrameRates();
  const std::int64_t fastest = kFrameRate_Audio96000.GetTicksPerFrame();
  const std::int64_t slowest = kFrameRate_Audio8000.GetTicksPerFrame();
  for (std::int64_t ticks = 1; ticks <= 40000000; ticks += step) {
    const FrameRate best = FindBestNativeAudioRate(FrameRate(ticks));
    ASSERT_EQ(native.count(best), 1u) << ticks;
    ASSERT_TRUE(ticks < fastest || ticks > slowest || best.GetTicksPerFrame() <= ticks) << ticks;
  }
}

TEST(FindBestNativeAudioRate, NeverDownsamplesAudibleRates) { CheckNeverDownsamples(9973); }

TEST(FindBestNativeAudioRate, NeverDownsamplesAudibleRatesExhaustive) { CheckNeverDownsamples(1); }

}  // namespace
}  // namespace zebmediatypes
