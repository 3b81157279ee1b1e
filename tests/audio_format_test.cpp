#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/audio_bus.h>
#include <zebmediatypes/audio_format.h>
#include <zebmediatypes/audio_frame_rate_utils.h>

#include <cstdint>
#include <limits>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;

TEST(AudioFormat, SampleAlignmentIsBytesPerSampleTimesChannels) {
  struct Case {
    std::uint32_t type;
    std::size_t channels;
    int alignment;
  };
  const Case kCases[] = {
      {20, 2, 4},   // 16-bit
      {30, 2, 6},   // packed 24-bit
      {40, 6, 24},  // float
      {25, 2, 0},   // no such type
      {30, 0, 0},   // no channels
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.type);
    AudioFormat format = AudioFormat::CreateDefaultAudioFormat(c.channels, 48000);
    format.SetSampleType(static_cast<AudioSampleType>(c.type));
    EXPECT_EQ(format.GetSampleAlignment(), c.alignment);
  }
}

TEST(AudioFormat, HugeChannelCountIsReportedAndClamped) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(AudioFormat::CreateDefaultAudioFormat(SIZE_MAX, 44100).GetChannelCount(),
            kAudioChannelCount_Max);
  // A layout set directly is clamped where the alignment narrows its count.
  const AudioFormat oversized = AudioFormat::CreateAudioFormat(
      AudioChannelLayout(kAudioChannelCount_Max + 5, L::Discrete), 48000);
  EXPECT_EQ(oversized.GetSampleAlignment(), static_cast<int>(4 * kAudioChannelCount_Max));
  EXPECT_EQ(capture.Count(), 2u);
}

// Exact orders by rate first and tells the 5.1 orders apart; simple is blind
// to labels.
TEST(AudioFormatCompare, ExactOrdersByRateAndSimpleIgnoresLabels) {
  const AudioFormat broadcast = AudioFormat::CreateDefaultAudioFormat(6, 48000);
  const AudioFormat legacy = AudioFormat::CreateAudioFormat(CreateLegacy51ChannelLayout(), 48000);
  const AudioFormat slower = AudioFormat::CreateDefaultAudioFormat(8, 44100);
  const AudioFormatExactCompare exact;
  const AudioFormatSimpleCompare simple;
  EXPECT_NE(exact(broadcast, legacy), exact(legacy, broadcast));
  EXPECT_FALSE(simple(broadcast, legacy) || simple(legacy, broadcast));
  EXPECT_TRUE(exact(slower, legacy) && simple(slower, legacy) && !exact(legacy, slower));
}

// Equivalent buses carry the same layouts (in order, when order counts).
TEST(AudioBusDescription, EquivalenceLooksAtLayoutsOnly) {
  const auto stereo = AudioBusDescription::CreateStereo(u"s", AudioBusDescription::Main);
  const AudioBusDescription discrete(u"d", CreateMultichannelLayout(2), AudioBusDescription::Main);
  EXPECT_FALSE(AreAudioBusDescriptionsEquivalent({stereo}, {discrete}, true));
  EXPECT_TRUE(AreAudioBusDescriptionsEquivalent({stereo}, {discrete}, false));
}

constexpr std::int64_t kTicksPerSecond = 254016000000;

TEST(FindBestNativeAudioRate, PrefersWholeMultiplesThenTheNextRateAbove) {
  struct Case {
    std::int64_t hertz;
    std::int64_t nativeHertz;
  };
  const Case kCases[] = {
      {100000, 96000},  // above all
      {176400, 88200},  // twice 88200
      {22000, 22050},   // the next above
      {3000, 48000},    // sixteen times, the most taken
      {7350, 22050},    // three times
      {500, 8000},      // below all
  };
  zebcore::debug::ScopedAssertionCapture capture;
  for (const Case& c : kCases) {
    EXPECT_EQ(FindBestNativeAudioRate(FrameRate(kTicksPerSecond / c.hertz)),
              FrameRate(kTicksPerSecond / c.nativeHertz))
        << c.hertz;
  }
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(FindBestNativeAudioRate, RatesOfNoValueAreReportedAndGiveFixedRates) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(FindBestNativeAudioRate(FrameRate(0)), kFrameRate_Audio96000);
  EXPECT_EQ(FindBestNativeAudioRate(kFrameRate_Invalid), kFrameRate_Audio8000);
  EXPECT_EQ(capture.Count(), 2u);
}

// The result is native and, up to 96000 Hz, never slower than the request, so
// the host only ever upsamples.
TEST(FindBestNativeAudioRate, NeverDownsamplesAudibleRatesExhaustive) {
  const NativeFrameRateSet native = GetNativeFrameRates();
  ASSERT_EQ(native.size(), 9u);
  for (std::int64_t ticks = 1; ticks <= 40000000; ++ticks) {
    const FrameRate best = FindBestNativeAudioRate(FrameRate(ticks));
    ASSERT_EQ(native.count(best), 1u) << ticks;
    ASSERT_TRUE(ticks < 2646000 || ticks > 31752000 || best.GetTicksPerFrame() <= ticks) << ticks;
  }
}

}  // namespace
}  // namespace zebmediatypes
