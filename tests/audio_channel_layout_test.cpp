#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/audio_channel_layout.h>

#include <climits>
#include <cstdint>
#include <iterator>
#include <tuple>
#include <type_traits>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::LayoutText;
using testing::ParseLayout;

// Labels are unsigned 32-bit values; only the 38 are known (and in the supported
// set), and the index of every other value (0xFFFFFFFF included) is the count,
// never a table slot.
TEST(AudioChannelLabel, OnlyTheThirtyEightValuesAreKnownIndexedAndSupported) {
  const AudioChannelDescriptionSet& supported = GetSupportedAudioChannelDescriptions();
  EXPECT_EQ(supported.size(), kAudioChannelLabelCount);
  static_assert(std::is_same_v<std::underlying_type_t<AudioChannelLabel>, std::uint32_t>);
  static_assert(AudioChannelDescription(AudioChannelLabel::FrontLeft) < testing::kUnknownLabel);
  std::size_t next = 0;
  for (std::uint32_t value = 0; value < 1000; ++value) {
    SCOPED_TRACE(value);
    const auto label = static_cast<AudioChannelLabel>(value);
    const bool known = next < kAudioChannelLabelCount && value == testing::KnownLabelValue(next);
    EXPECT_EQ(IsKnownAudioChannelLabel(label), known);
    EXPECT_EQ(supported.count(label), known ? 1u : 0u);
    EXPECT_EQ(AudioChannelLabelIndex(label), known ? next++ : kAudioChannelLabelCount);
  }
  EXPECT_EQ(next, kAudioChannelLabelCount);
  for (std::uint32_t value : {0xFFFFFFFFu, 0x80000064u, 0x10000u + 100u}) {
    const auto label = static_cast<AudioChannelLabel>(value);
    EXPECT_EQ(std::make_pair(IsKnownAudioChannelLabel(label), AudioChannelLabelIndex(label)),
              std::make_pair(false, kAudioChannelLabelCount))
        << value;
  }
}

// Each factory gives the channels its name spells (or its name promises), so
// its channel count is the count the name spells.
TEST(AudioChannelLayoutFactory, EveryNamedLayoutHasTheOrderItPromises) {
  for (const testing::NamedLayout& named : testing::kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout layout = named.create();
    EXPECT_EQ(LayoutText(layout), testing::PromisedOrder(named));
    EXPECT_LE(layout.size(), 16u);
  }
}

// Counts above the largest supported one are reported and clamped.
TEST(CreateMultichannelLayout, GivesThatManyDiscreteChannelsAndClampsHugeCounts) {
  // clang-format off
  const std::tuple<int, std::size_t, std::size_t> kCases[] = {
      {INT_MIN, 0, 0}, {-1, 0, 0}, {0, 0, 0}, {3, 3, 0}, {1024, 1024, 0}, {1025, 1024, 1}, {INT_MAX, 1024, 1},
  };
  // clang-format on
  for (const auto& [count, size, assertions] : kCases) {
    SCOPED_TRACE(count);
    zebcore::debug::ScopedAssertionCapture capture;
    const AudioChannelLayout layout = CreateMultichannelLayout(count);
    EXPECT_EQ(std::make_tuple(layout.size(), HasChannelLabeling(layout), capture.Count()),
              std::make_tuple(size, false, assertions));
  }
}

TEST(CreateMultichannelLayoutWithDefaultLabels, LabelsTheCommonCounts) {
  // clang-format off
  const char* const kOrders[] = {"", "*", "L R", "* * *", "L R Ls Rs", "* * * * *", "L R C LFE Ls Rs",
                                 "* * * * * * *", "L R C LFE Ls Rs Rls Rrs", "* * * * * * * * *"};
  // clang-format on
  for (std::size_t count = 0; count < std::size(kOrders); ++count) {
    SCOPED_TRACE(count);
    EXPECT_EQ(LayoutText(CreateMultichannelLayoutWithDefaultLabels(count)), kOrders[count]);
  }
}

TEST(CreateMultichannelLayoutWithDefaultLabels, HugeCountIsReportedAndClampedNotWrapped) {
  const std::size_t kCounts[] = {kAudioChannelCount_Max, kAudioChannelCount_Max + 1,
                                 (std::size_t{1} << 32) + 3, (std::size_t{1} << 32) + 6, SIZE_MAX};
  for (std::size_t count : kCounts) {
    SCOPED_TRACE(count);
    zebcore::debug::ScopedAssertionCapture capture;
    const AudioChannelLayout layout = CreateMultichannelLayoutWithDefaultLabels(count);
    EXPECT_EQ(
        std::make_tuple(layout.size(), HasChannelLabeling(layout), capture.Count()),
        std::make_tuple(kAudioChannelCount_Max, false, count == kAudioChannelCount_Max ? 0u : 1u));
  }
}

TEST(GetChannelCount, SumsTheLayoutsOfAList) {
  EXPECT_EQ(GetChannelCount({}), 0u);
  EXPECT_EQ(GetChannelCount({CreateStereoChannelLayout(), Create51ChannelLayout(), {}}), 8u);
}

TEST(AudioChannelLayoutQuery, AnswersForEachLayout) {
  // layout, HasChannelLabeling, HasLFEChannel, HasChannelLabel C, HasChannelLabel Discrete
  // clang-format off
  const std::tuple<const char*, bool, bool, bool, bool> kCases[] = {
      {"", false, false, false, false}, {"* * *", false, false, false, true},
      {"L R", true, false, false, false}, {"LFE2", true, false, false, false},
      {"* LFE", true, true, false, true}, {"L R C LFE Ls Rs", true, true, true, false},
      {"#125", true, false, false, false}, {"? * C", true, false, true, true},
  };
  // clang-format on
  for (const auto& [text, labelled, lfe, centre, discrete] : kCases) {
    SCOPED_TRACE(text);
    const AudioChannelLayout layout = ParseLayout(text);
    EXPECT_EQ(std::make_tuple(HasChannelLabeling(layout), HasLFEChannel(layout),
                              HasChannelLabel(layout, AudioChannelLabel::FrontCenter),
                              HasChannelLabel(layout, AudioChannelLabel::Discrete)),
              std::make_tuple(labelled, lfe, centre, discrete));
  }
  EXPECT_TRUE(HasChannelLabel(ParseLayout("#125"), static_cast<AudioChannelLabel>(125)));
}

}  // namespace
}  // namespace zebmediatypes
