#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/audio_format.h>

#include <cstdint>
#include <limits>
#include <vector>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;

AudioChannelLayout Layout(std::initializer_list<AudioChannelLabel> labels) {
  AudioChannelLayout layout;
  for (AudioChannelLabel label : labels) layout.push_back(label);
  return layout;
}

AudioFormat Format(int rate, AudioSampleType type, const AudioChannelLayout& layout) {
  AudioFormat format;
  format.SetSampleRate(rate);
  format.SetSampleType(type);
  format.SetChannelLayout(layout);
  return format;
}

TEST(AudioFormat, CreateDefaultAudioFormatChoosesTheLayoutByCount) {
  const AudioChannelLabel D = L::Discrete;
  struct Case {
    std::size_t count;
    AudioChannelLayout layout;
  };
  const Case kCases[] = {
      {0, {}},
      {1, Layout({D})},
      {2, Layout({L::FrontLeft, L::FrontRight})},
      {3, Layout({D, D, D})},
      {4, Layout({D, D, D, D})},
      {6, Layout({L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency, L::BackLeft,
                  L::BackRight})},
      {8, Layout({D, D, D, D, D, D, D, D})},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.count);
    const AudioFormat format = AudioFormat::CreateDefaultAudioFormat(c.count, 48000);
    EXPECT_EQ(format.GetChannelLayout(), c.layout);
    EXPECT_EQ(format.GetSampleRate(), 48000);
    EXPECT_EQ(format.GetSampleType(), kAudioSampleType_32BitFloat);
    EXPECT_EQ(format.GetSampleAlignment(), static_cast<int>(4 * c.count));
  }
}

TEST(AudioFormat, HugeChannelCountIsReportedAndClamped) {
  const std::size_t kCases[] = {kAudioChannelCount_Max + 1, (std::size_t{1} << 32) + 3,
                                std::numeric_limits<std::size_t>::max()};
  for (std::size_t count : kCases) {
    SCOPED_TRACE(count);
    zebcore::debug::ScopedAssertionCapture capture;
    const AudioFormat format = AudioFormat::CreateDefaultAudioFormat(count, 44100);
    EXPECT_EQ(format.GetChannelCount(), kAudioChannelCount_Max);
    EXPECT_EQ(capture.Count(), 1u);
  }
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(AudioFormat::CreateDefaultAudioFormat(kAudioChannelCount_Max, 44100).GetChannelCount(),
            kAudioChannelCount_Max);
  EXPECT_EQ(capture.Count(), 0u);
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
    SCOPED_TRACE(c.type);
    SCOPED_TRACE(c.channels);
    AudioFormat format = AudioFormat::CreateDefaultAudioFormat(c.channels, 48000);
    format.SetSampleType(static_cast<AudioSampleType>(c.type));
    EXPECT_EQ(format.GetSampleAlignment(), c.alignment);
  }
}

TEST(AudioFormat, SampleAlignmentOfAnOversizedLayoutIsReportedAndClamped) {
  AudioFormat format = AudioFormat::CreateAudioFormat(
      AudioChannelLayout(kAudioChannelCount_Max + 5, L::Discrete), 48000);
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(format.GetSampleAlignment(), static_cast<int>(4 * kAudioChannelCount_Max));
  EXPECT_EQ(capture.Count(), 1u);
}

TEST(AudioFormat, ChannelLookupsGiveNeutralResultsOutOfRange) {
  const AudioFormat stereo = Format(48000, kAudioSampleType_16BitInteger,
                                    Layout({L::FrontLeft, L::FrontRight, L::FrontLeft}));
  EXPECT_EQ(stereo.GetChannelDescription(1), AudioChannelDescription(L::FrontRight));
  EXPECT_EQ(stereo.GetChannelDescription(3), AudioChannelDescription(L::Discrete));
  EXPECT_EQ(stereo.GetChannelDescription(std::numeric_limits<std::size_t>::max()),
            AudioChannelDescription(L::Discrete));
  EXPECT_EQ(stereo.GetChannelIndex(L::FrontLeft), 0u);  // first of two
  EXPECT_EQ(stereo.GetChannelIndex(L::FrontRight), 1u);
  EXPECT_EQ(stereo.GetChannelIndex(L::FrontCenter), stereo.GetChannelCount());
}

TEST(AudioFormat, EqualityNeedsRateTypeAndLabelsInOrder) {
  const AudioFormat base = Format(48000, kAudioSampleType_32BitFloat, CreateStereoChannelLayout());
  EXPECT_EQ(base, Format(48000, kAudioSampleType_32BitFloat, CreateStereoChannelLayout()));
  EXPECT_NE(base, Format(44100, kAudioSampleType_32BitFloat, CreateStereoChannelLayout()));
  EXPECT_NE(base, Format(48000, kAudioSampleType_16BitInteger, CreateStereoChannelLayout()));
  EXPECT_NE(base,
            Format(48000, kAudioSampleType_32BitFloat, Layout({L::FrontRight, L::FrontLeft})));
  EXPECT_NE(base, Format(48000, kAudioSampleType_32BitFloat, Layout({L::FrontLeft})));
}

std::vector<AudioFormat> SampleFormats() {
  std::vector<AudioFormat> formats;
  const AudioChannelLayout layouts[] = {{},
                                        Layout({L::FrontLeft}),
                                        Layout({L::FrontLeft, L::FrontRight}),
                                        Layout({L::FrontRight, L::FrontLeft}),
                                        Layout({L::Discrete, L::Discrete}),
                                        CreateBroadcast51ChannelLayout(),
                                        CreateLegacy51ChannelLayout()};
  for (int rate : {-1, 0, 44100, 48000}) {
    for (AudioSampleType type : {kAudioSampleType_16BitInteger, kAudioSampleType_32BitFloat}) {
      for (const AudioChannelLayout& layout : layouts)
        formats.push_back(Format(rate, type, layout));
    }
  }
  return formats;
}

TEST(AudioFormatExactCompare, IsAStrictWeakOrderWhoseEquivalenceIsEquality) {
  const std::vector<AudioFormat> formats = SampleFormats();
  const AudioFormatExactCompare less;
  for (const AudioFormat& a : formats) {
    EXPECT_FALSE(less(a, a));
    for (const AudioFormat& b : formats) {
      EXPECT_FALSE(less(a, b) && less(b, a));
      EXPECT_EQ(!less(a, b) && !less(b, a), a == b);
      for (const AudioFormat& c : formats) {
        if (less(a, b) && less(b, c)) {
          EXPECT_TRUE(less(a, c));
        }
      }
    }
  }
}

TEST(AudioFormatExactCompare, OrdersByRateThenLayoutThenType) {
  const AudioFormatExactCompare less;
  const auto lr = Layout({L::FrontLeft, L::FrontRight});
  const auto rl = Layout({L::FrontRight, L::FrontLeft});
  EXPECT_TRUE(less(Format(44100, kAudioSampleType_32BitFloat, rl),
                   Format(48000, kAudioSampleType_16BitInteger, lr)));
  EXPECT_TRUE(less(Format(-1, kAudioSampleType_32BitFloat, lr),
                   Format(0, kAudioSampleType_32BitFloat, lr)));
  EXPECT_TRUE(less(Format(48000, kAudioSampleType_32BitFloat, lr),
                   Format(48000, kAudioSampleType_16BitInteger, rl)));
  EXPECT_TRUE(less(Format(48000, kAudioSampleType_32BitFloat, Layout({L::FrontLeft})),
                   Format(48000, kAudioSampleType_16BitInteger, lr)));
  EXPECT_TRUE(less(Format(48000, kAudioSampleType_32BitFloat, {}),
                   Format(48000, kAudioSampleType_16BitInteger, Layout({L::Discrete}))));
  EXPECT_TRUE(less(Format(48000, kAudioSampleType_16BitInteger, lr),
                   Format(48000, kAudioSampleType_32BitFloat, lr)));
}

TEST(AudioFormatSimpleCompare, IgnoresLabelsAndOrdersCountBeforeType) {
  const AudioFormatSimpleCompare less;
  const auto lr = Layout({L::FrontLeft, L::FrontRight});
  const auto rl = Layout({L::FrontRight, L::FrontLeft});
  const auto discrete = Layout({L::Discrete, L::Discrete});
  const AudioFormat a = Format(48000, kAudioSampleType_32BitFloat, lr);
  for (const auto& other : {rl, discrete}) {
    const AudioFormat b = Format(48000, kAudioSampleType_32BitFloat, other);
    EXPECT_FALSE(less(a, b));
    EXPECT_FALSE(less(b, a));
  }
  EXPECT_TRUE(
      less(a, Format(48000, kAudioSampleType_16BitInteger, CreateBroadcast51ChannelLayout())));
  EXPECT_TRUE(less(Format(48000, kAudioSampleType_16BitInteger, lr), a));
  EXPECT_TRUE(
      less(Format(44100, kAudioSampleType_32BitFloat, CreateBroadcast51ChannelLayout()), a));
}

}  // namespace
}  // namespace zebmediatypes
