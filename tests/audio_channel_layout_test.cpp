#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/audio_channel_layout.h>

#include <climits>
#include <cstdint>
#include <set>
#include <string>
#include <type_traits>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::kNamedLayouts;
using testing::LayoutText;
using testing::ParseLayout;

TEST(AudioChannelLabel, ValuesAreTheStoredOnes) {
  struct Case {
    AudioChannelLabel label;
    std::uint32_t value;
  };
  constexpr Case kCases[] = {
      {AudioChannelLabel::Discrete, 0},
      {AudioChannelLabel::FrontLeft, 100},
      {AudioChannelLabel::LowFrequency, 103},
      {AudioChannelLabel::BackCenter, 106},
      {AudioChannelLabel::FrontLeftOfCenter, 107},
      {AudioChannelLabel::TopFrontRight, 113},
      {AudioChannelLabel::TopFrontCenter, 114},
      {AudioChannelLabel::TopBackRight, 116},
      {AudioChannelLabel::TopBackCenter, 117},
      {AudioChannelLabel::FrontRightWide, 119},
      {AudioChannelLabel::LeftHeight, 127},
      {AudioChannelLabel::LFE2, 131},
      {AudioChannelLabel::AmbisonicsW, 134},
      {AudioChannelLabel::BottomFrontCenter, 139},
      {AudioChannelLabel::BottomFrontRight, 140},
      {AudioChannelLabel::AmbisonicsHOA, 143},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.value);
    EXPECT_EQ(static_cast<std::uint32_t>(c.label), c.value);
  }
  static_assert(std::is_same_v<std::underlying_type_t<AudioChannelLabel>, std::uint32_t>);
}

TEST(AudioChannelLabel, OnlyTheThirtyEightValuesAreKnown) {
  std::set<std::uint32_t> known;
  for (std::uint32_t value = 0; value < 1000; ++value) {
    if (IsKnownAudioChannelLabel(static_cast<AudioChannelLabel>(value))) known.insert(value);
  }
  std::set<std::uint32_t> expected = {0};
  for (std::uint32_t value = 100; value <= 119; ++value) expected.insert(value);
  for (std::uint32_t value = 127; value <= 143; ++value) expected.insert(value);
  EXPECT_EQ(known, expected);
  for (std::uint32_t value : {0xFFFFFFFFu, 0x80000064u, 0x10000u + 100u}) {
    SCOPED_TRACE(value);
    EXPECT_FALSE(IsKnownAudioChannelLabel(static_cast<AudioChannelLabel>(value)));
    EXPECT_EQ(AudioChannelLabelIndex(static_cast<AudioChannelLabel>(value)),
              kAudioChannelLabelCount);
  }
}

TEST(AudioChannelLabel, IndexNumbersTheKnownLabelsInValueOrder) {
  std::size_t next = 0;
  for (std::uint32_t value = 0; value < 1000; ++value) {
    const auto label = static_cast<AudioChannelLabel>(value);
    if (!IsKnownAudioChannelLabel(label)) continue;
    SCOPED_TRACE(value);
    EXPECT_EQ(AudioChannelLabelIndex(label), next++);
  }
  EXPECT_EQ(next, kAudioChannelLabelCount);
}

TEST(AudioChannelDescription, IsAFourByteValueOrderedByLabel) {
  static_assert(std::is_trivially_copyable_v<AudioChannelDescription>);
  static_assert(sizeof(AudioChannelDescription) == 4);
  constexpr AudioChannelDescription kDefault;
  static_assert(kDefault.label == AudioChannelLabel::Discrete);
  constexpr AudioChannelDescription kLeft = AudioChannelLabel::FrontLeft;
  constexpr AudioChannelDescription kRight = AudioChannelLabel::FrontRight;
  static_assert(kLeft < kRight && kLeft <= kRight && kRight > kLeft && kRight >= kLeft);
  static_assert(kLeft != kRight && !(kLeft == kRight) && kLeft == kLeft && kLeft <= kLeft);
  static_assert(kDefault < kLeft);
  constexpr AudioChannelDescription kUnknown = static_cast<AudioChannelLabel>(0xFFFFFFFFu);
  static_assert(kLeft < kUnknown, "labels compare as unsigned values");
}

TEST(AudioChannelLayoutFactory, EveryNamedLayoutHasTheOrderItPromises) {
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    EXPECT_EQ(LayoutText(named.create()), named.order);
  }
}

// A factory named Create_A_B_..._ChannelLayout spells its channels; the two
// layouts ending in _Ts_Vhl_Vhc_Vhr_Tbl_Tbr also carry a Tbc between Tbl and Tbr.
TEST(AudioChannelLayoutFactory, SpelledNamesGiveTheirChannelsInOrder) {
  const std::string prefix = "Create_";
  const std::string suffix = "_ChannelLayout";
  int spelled = 0;
  for (const testing::NamedLayout& named : kNamedLayouts) {
    const std::string name = named.name;
    if (name.rfind(prefix, 0) != 0 || name.size() < prefix.size() + suffix.size() ||
        name.compare(name.size() - suffix.size(), suffix.size(), suffix) != 0) {
      continue;
    }
    SCOPED_TRACE(name);
    ++spelled;
    std::string spelledText =
        name.substr(prefix.size(), name.size() - prefix.size() - suffix.size());
    for (char& c : spelledText) {
      if (c == '_') c = ' ';
    }
    const std::string tbcGap = "Tbl Tbr";
    if (name.find("_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_") != std::string::npos) {
      spelledText.replace(spelledText.size() - tbcGap.size(), tbcGap.size(), "Tbl Tbc Tbr");
    }
    EXPECT_EQ(LayoutText(named.create()), spelledText);
  }
  EXPECT_EQ(spelled, 58);
}

TEST(AudioChannelLayoutFactory, NamedLayoutsHoldOnlyKnownLabels) {
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout layout = named.create();
    EXPECT_FALSE(layout.empty());
    EXPECT_LE(layout.size(), 16u);
    for (AudioChannelDescription channel : layout) {
      EXPECT_TRUE(IsKnownAudioChannelLabel(channel.label));
    }
  }
}

TEST(AudioChannelLayoutFactory, AliasesReturnEqualLayouts) {
  EXPECT_EQ(Create51ChannelLayout(), CreateBroadcast51ChannelLayout());
  EXPECT_EQ(Create_L_R_Ls_Rs_C_ChannelLayout(), CreatePentagonalChannelLayout());
  EXPECT_NE(CreateLegacy51ChannelLayout(), CreateBroadcast51ChannelLayout());
  EXPECT_TRUE(
      ContainsSameChannelsIgnoreOrder(CreateLegacy51ChannelLayout(), Create51ChannelLayout()));
}

TEST(CreateMultichannelLayout, GivesThatManyDiscreteChannels) {
  struct Case {
    int count;
    std::size_t size;
  };
  constexpr Case kCases[] = {{INT_MIN, 0}, {-1, 0}, {0, 0}, {1, 1}, {3, 3}, {32, 32}, {1024, 1024}};
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.count);
    zebcore::debug::ScopedAssertionCapture capture;
    const AudioChannelLayout layout = CreateMultichannelLayout(c.count);
    EXPECT_EQ(layout.size(), c.size);
    EXPECT_FALSE(HasChannelLabeling(layout));
    EXPECT_EQ(capture.Count(), 0u);
  }
}

TEST(CreateMultichannelLayoutWithDefaultLabels, LabelsTheCommonCounts) {
  struct Case {
    std::size_t count;
    const char* order;
  };
  const Case kCases[] = {
      {0, ""},
      {1, "*"},
      {2, "L R"},
      {3, "* * *"},
      {4, "L R Ls Rs"},
      {5, "* * * * *"},
      {6, "L R C LFE Ls Rs"},
      {7, "* * * * * * *"},
      {8, "L R C LFE Ls Rs Rls Rrs"},
      {9, "* * * * * * * * *"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.count);
    EXPECT_EQ(LayoutText(CreateMultichannelLayoutWithDefaultLabels(c.count)), c.order);
  }
  EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(16).size(), 16u);
}

TEST(CreateMultichannelLayoutWithDefaultLabels, HugeCountIsReportedAndClampedNotWrapped) {
  const std::size_t kCounts[] = {kAudioChannelCount_Max + 1, (std::size_t{1} << 32) + 3,
                                 (std::size_t{1} << 32) + 6, SIZE_MAX};
  for (std::size_t count : kCounts) {
    SCOPED_TRACE(count);
    zebcore::debug::ScopedAssertionCapture capture;
    const AudioChannelLayout layout = CreateMultichannelLayoutWithDefaultLabels(count);
    EXPECT_EQ(layout.size(), kAudioChannelCount_Max);
    EXPECT_FALSE(HasChannelLabeling(layout));
    EXPECT_EQ(capture.Count(), 1u);
  }
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(CreateMultichannelLayoutWithDefaultLabels(kAudioChannelCount_Max).size(),
            kAudioChannelCount_Max);
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(CreateMultichannelLayout, HugeCountIsReportedAndClamped) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(CreateMultichannelLayout(INT_MAX).size(), kAudioChannelCount_Max);
  EXPECT_EQ(capture.Count(), 1u);
}

TEST(GetChannelCount, SumsTheLayoutsOfAList) {
  AudioChannelLayoutList list;
  EXPECT_EQ(GetChannelCount(list), 0u);
  list.push_back(CreateStereoChannelLayout());
  list.push_back(Create51ChannelLayout());
  EXPECT_EQ(GetChannelCount(list), 8u);
  list.emplace_back();
  EXPECT_EQ(GetChannelCount(list), 8u);
}

TEST(GetSupportedAudioChannelDescriptions, HoldsExactlyTheKnownLabels) {
  const AudioChannelDescriptionSet& supported = GetSupportedAudioChannelDescriptions();
  EXPECT_EQ(&supported, &GetSupportedAudioChannelDescriptions());
  EXPECT_EQ(supported.size(), kAudioChannelLabelCount);
  EXPECT_EQ(supported.count(AudioChannelLabel::AmbisonicsHOA), 1u);
  EXPECT_EQ(supported.count(static_cast<AudioChannelLabel>(120)), 0u);
  for (std::uint32_t value = 0; value < 300; ++value) {
    SCOPED_TRACE(value);
    const auto label = static_cast<AudioChannelLabel>(value);
    EXPECT_EQ(supported.count(label) == 1, IsKnownAudioChannelLabel(label));
  }
}

TEST(AudioChannelLayoutQuery, AnswersForEachLayout) {
  struct Case {
    const char* layout;
    bool hasLabeling;
    bool hasLfe;
    bool hasCenter;
  };
  constexpr Case kCases[] = {
      {"", false, false, false},
      {"*", false, false, false},
      {"* * *", false, false, false},
      {"L R", true, false, false},
      {"LFE2", true, false, false},
      {"* LFE", true, true, false},
      {"L R C LFE Ls Rs", true, true, true},
      {"#125", true, false, false},
      {"? * C", true, false, true},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.layout);
    const AudioChannelLayout layout = ParseLayout(c.layout);
    EXPECT_EQ(HasChannelLabeling(layout), c.hasLabeling);
    EXPECT_EQ(HasLFEChannel(layout), c.hasLfe);
    EXPECT_EQ(HasChannelLabel(layout, AudioChannelLabel::FrontCenter), c.hasCenter);
  }
  EXPECT_TRUE(HasChannelLabel(ParseLayout("#125"), static_cast<AudioChannelLabel>(125)));
  EXPECT_TRUE(HasChannelLabel(ParseLayout("L *"), AudioChannelLabel::Discrete));
  EXPECT_FALSE(HasChannelLabel(ParseLayout(""), AudioChannelLabel::Discrete));
}

}  // namespace
}  // namespace zebmediatypes
