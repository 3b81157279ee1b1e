#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/audio_channel_layout.h>

#include <climits>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::LayoutText;
using testing::ParseLayout;

// Only the 38 values are known (and supported); the index of every other
// value is the count, never a table slot.
TEST(AudioChannelLabel, OnlyTheThirtyEightValuesAreKnownIndexedAndSupported) {
  const AudioChannelDescriptionSet& supported = GetSupportedAudioChannelDescriptions();
  EXPECT_EQ(supported.size(), kAudioChannelLabelCount);
  std::size_t next = 0;
  for (std::uint32_t value = 0; value < 1000; ++value) {
    SCOPED_TRACE(value);
    const auto label = static_cast<AudioChannelLabel>(value);
    const bool known = next < kAudioChannelLabelCount && value == testing::KnownLabelValue(next);
    EXPECT_EQ(IsKnownAudioChannelLabel(label), known);
    EXPECT_EQ(supported.count(label), known ? 1u : 0u);
    EXPECT_EQ(AudioChannelLabelIndex(label), known ? next++ : kAudioChannelLabelCount);
  }
  EXPECT_EQ(AudioChannelLabelIndex(testing::kUnknownLabel), kAudioChannelLabelCount);
}

TEST(AudioChannelLayoutFactory, EverySpelledNameGivesItsOrder) {
  for (const testing::NamedLayout& named : testing::kNamedLayouts) {
    SCOPED_TRACE(named.name);
    std::string order = named.spelled != nullptr ? named.spelled : "";
    std::replace(order.begin(), order.end(), '_', ' ');
    EXPECT_TRUE(order.empty() || LayoutText(named.create()) == order);
  }
}

// Counts above the largest supported one are reported and clamped, not wrapped.
TEST(CreateMultichannelLayout, ClampsHugeCountsAndLabelsTheCommonOnes) {
  EXPECT_EQ(LayoutText(CreateMultichannelLayoutWithDefaultLabels(3)), "* * *");
  EXPECT_EQ(LayoutText(CreateMultichannelLayoutWithDefaultLabels(8)), "L R C LFE Ls Rs Rls Rrs");
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels((std::size_t{1} << 32) + 3),
            CreateMultichannelLayout(INT_MAX));
  EXPECT_EQ(CreateMultichannelLayout(INT_MAX).size(), kAudioChannelCount_Max);
  EXPECT_TRUE(CreateMultichannelLayout(-1).empty());
  EXPECT_EQ(capture.Count(), 3u);
}

TEST(AudioChannelLayoutQuery, AnswersForEachLayout) {
  EXPECT_FALSE(HasChannelLabeling(ParseLayout("* * *")));
  EXPECT_TRUE(HasChannelLabeling(ParseLayout("* ?")));
  EXPECT_FALSE(HasLFEChannel(ParseLayout("LFE2")));
}

}  // namespace
}  // namespace zebmediatypes
