#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/audio_format.h>

#include <cstdint>
#include <limits>
#include <vector>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;
constexpr AudioSampleType kInt16 = kAudioSampleType_16BitInteger;
constexpr AudioSampleType kFloat = kAudioSampleType_32BitFloat;
const AudioChannelLayout kLR = {L::FrontLeft, L::FrontRight};
const AudioChannelLayout kRL = {L::FrontRight, L::FrontLeft};

AudioFormat Format(int rate, AudioSampleType type, const AudioChannelLayout& layout) {
  AudioFormat format = AudioFormat::CreateAudioFormat(layout, rate);
  format.SetSampleType(type);
  return format;
}

TEST(AudioFormat, CreateDefaultAudioFormatChoosesTheLayoutByCount) {
  for (std::size_t count : {0u, 1u, 2u, 3u, 4u, 6u, 8u}) {
    SCOPED_TRACE(count);
    const AudioFormat format = AudioFormat::CreateDefaultAudioFormat(count, 48000);
    const AudioChannelLayout expected = count == 2   ? kLR
                                        : count == 6 ? CreateBroadcast51ChannelLayout()
                                                     : AudioChannelLayout(count, L::Discrete);
    EXPECT_EQ(format, Format(48000, kFloat, expected));
    EXPECT_EQ(format.GetSampleAlignment(), static_cast<int>(4 * count));
  }
}

TEST(AudioFormat, HugeChannelCountIsReportedAndClamped) {
  const std::size_t kCases[] = {kAudioChannelCount_Max, kAudioChannelCount_Max + 1,
                                (std::size_t{1} << 32) + 3,
                                std::numeric_limits<std::size_t>::max()};
  for (std::size_t count : kCases) {
    SCOPED_TRACE(count);
    zebcore::debug::ScopedAssertionCapture capture;
    EXPECT_EQ(AudioFormat::CreateDefaultAudioFormat(count, 44100).GetChannelCount(),
              kAudioChannelCount_Max);
    EXPECT_EQ(capture.Count(), count > kAudioChannelCount_Max ? 1u : 0u);
  }
  // A layout set directly is clamped where the alignment narrows its count.
  zebcore::debug::ScopedAssertionCapture capture;
  const AudioFormat oversized = AudioFormat::CreateAudioFormat(
      AudioChannelLayout(kAudioChannelCount_Max + 5, L::Discrete), 48000);
  EXPECT_EQ(oversized.GetSampleAlignment(), static_cast<int>(4 * kAudioChannelCount_Max));
  EXPECT_EQ(capture.Count(), 1u);
}

TEST(AudioFormat, SampleAlignmentIsBytesPerSampleTimesChannels) {
  struct Case {
    std::uint32_t type;
    std::size_t channels;
    int alignment;
  };
  constexpr Case kCases[] = {{10, 2, 2}, {20, 2, 4}, {30, 2, 6}, {40, 2, 8}, {40, 6, 24},
                             {0, 6, 0},  {8, 2, 0},  {25, 2, 0}, {32, 2, 0}, {30, 0, 0}};
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.type << " x " << c.channels);
    AudioFormat format = AudioFormat::CreateDefaultAudioFormat(c.channels, 48000);
    format.SetSampleType(static_cast<AudioSampleType>(c.type));
    EXPECT_EQ(format.GetSampleAlignment(), c.alignment);
  }
}

TEST(AudioFormat, ChannelLookupsGiveNeutralResultsOutOfRange) {
  const AudioFormat format = Format(48000, kInt16, {L::FrontLeft, L::FrontRight, L::FrontLeft});
  EXPECT_EQ(format.GetChannelDescription(1), AudioChannelDescription(L::FrontRight));
  EXPECT_EQ(format.GetChannelDescription(3), AudioChannelDescription(L::Discrete));
  EXPECT_EQ(format.GetChannelDescription(std::numeric_limits<std::size_t>::max()),
            AudioChannelDescription(L::Discrete));
  EXPECT_EQ(format.GetChannelIndex(L::FrontLeft), 0u);  // first of two
  EXPECT_EQ(format.GetChannelIndex(L::FrontCenter), format.GetChannelCount());
}

TEST(AudioFormatExactCompare, IsAStrictWeakOrderWhoseEquivalenceIsEquality) {
  // clang-format off
  const AudioChannelLayout layouts[] = {{}, {L::FrontLeft}, kLR, kRL, {L::Discrete, L::Discrete},
                                        CreateBroadcast51ChannelLayout(), CreateLegacy51ChannelLayout()};
  // clang-format on
  std::vector<AudioFormat> formats;
  for (int rate : {-1, 0, 44100, 48000})
    for (AudioSampleType type : {kInt16, kFloat})
      for (const AudioChannelLayout& layout : layouts)
        formats.push_back(Format(rate, type, layout));
  const AudioFormatExactCompare less;
  for (const AudioFormat& a : formats) {
    for (const AudioFormat& b : formats) {
      EXPECT_FALSE(less(a, b) && less(b, a));
      EXPECT_EQ(!less(a, b) && !less(b, a), &a == &b);  // every sample differs from the others
      EXPECT_EQ(a == b, &a == &b);
      for (const AudioFormat& c : formats) EXPECT_TRUE(!(less(a, b) && less(b, c)) || less(a, c));
    }
  }
}

TEST(AudioFormatCompare, ExactOrdersByRateLayoutTypeAndSimpleIgnoresLabels) {
  const AudioChannelLayout k51 = CreateBroadcast51ChannelLayout();
  struct Case {
    AudioFormat a, b;
    bool exactLess, simpleLess, simpleGreater;
  };
  // clang-format off
  const Case kCases[] = {
      {Format(44100, kFloat, kRL), Format(48000, kInt16, kLR), true, true, false},
      {Format(-1, kFloat, kLR), Format(0, kFloat, kLR), true, true, false},
      {Format(48000, kFloat, kLR), Format(48000, kInt16, kRL), true, false, true},
      {Format(48000, kFloat, {L::FrontLeft}), Format(48000, kInt16, kLR), true, true, false},
      {Format(48000, kFloat, {}), Format(48000, kInt16, {L::Discrete}), true, true, false},
      {Format(48000, kInt16, kLR), Format(48000, kFloat, kLR), true, true, false},
      {Format(48000, kFloat, kLR), Format(48000, kFloat, kRL), true, false, false},
      {Format(48000, kFloat, kLR), Format(48000, kFloat, {L::Discrete, L::Discrete}), false, false, false},
      {Format(48000, kFloat, kLR), Format(48000, kInt16, k51), true, true, false},
      {Format(44100, kFloat, k51), Format(48000, kFloat, kLR), true, true, false},
  };
  // clang-format on
  const AudioFormatExactCompare exact;
  const AudioFormatSimpleCompare simple;
  for (std::size_t i = 0; i < std::size(kCases); ++i) {
    SCOPED_TRACE(i);
    const Case& c = kCases[i];
    EXPECT_EQ(exact(c.a, c.b), c.exactLess);
    EXPECT_EQ(simple(c.a, c.b), c.simpleLess);
    EXPECT_EQ(simple(c.b, c.a), c.simpleGreater);
  }
}

}  // namespace
}  // namespace zebmediatypes
