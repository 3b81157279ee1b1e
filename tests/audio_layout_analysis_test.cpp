#include <gtest/gtest.h>
#include <zebmediatypes/audio_channel_layout.h>

#include <limits>
#include <optional>
#include <vector>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::LayoutText;
using testing::ParseLayout;
using Mapping = std::vector<std::size_t>;
constexpr std::size_t kNoDestination = std::numeric_limits<std::size_t>::max();

// Each pairing's table as "a b" pairs; the partner of every other value is
// Discrete. Checked both ways, which also makes each an involution.
TEST(LabelPair, EachPairingGivesItsTableBothWaysAndDiscreteElsewhere) {
  struct Pairing {
    AudioChannelLabel (*pair)(AudioChannelLabel) noexcept;
    const char* pairs;
  };
  const Pairing kPairings[] = {
      {&LeftRightPair,
       "L R LFE LFE2 Ls Rs Lc Rc Lsd Rsd Vhl Vhr Tbl Tbr Lw Rw Tsl Tsr Rls Rrs Lt Rt Bfl Bfr Pl "
       "Pr"},
      {&FrontBackPair, "L Ls R Rs C Cs Lc Rls Rc Rrs Vhl Tbl Vhr Tbr Vhc Tbc"},
      {&TopMiddlePair, "L Vhl R Vhr C Vhc Ls Tbl Rs Tbr Cs Tbc"},
      {&TopBottomPair, "Vhl Bfl Vhr Bfr Vhc Bfc"},
      {&BottomMiddlePair, "L Bfl R Bfr C Bfc"},
  };
  for (const Pairing& pairing : kPairings) {
    SCOPED_TRACE(pairing.pairs);
    const AudioChannelLayout pairs = ParseLayout(pairing.pairs);
    std::vector<AudioChannelLabel> expected(0x100, AudioChannelLabel::Discrete);
    for (std::size_t k = 0; k < pairs.size(); k += 2) {
      expected[static_cast<std::uint32_t>(pairs[k].label)] = pairs[k + 1].label;
      expected[static_cast<std::uint32_t>(pairs[k + 1].label)] = pairs[k].label;
    }
    for (std::uint32_t value = 0; value < 0x100; ++value) {
      const auto label = static_cast<AudioChannelLabel>(value);
      EXPECT_EQ(pairing.pair(label), expected[value]) << value;
      EXPECT_EQ(IsStereoPair(label, LeftRightPair(label)), LeftRightPair(label) != expected[0]);
    }
  }
}

// Up to 32 channels are sorted on the stack, longer layouts on the heap.
TEST(ContainsSameChannelsIgnoreOrder, ComparesLabelsWithMultiplicityAtAnySize) {
  EXPECT_FALSE(ContainsSameChannelsIgnoreOrder(ParseLayout("L R L"), ParseLayout("L R R")));
  for (int size : {3, 32, 33, 64}) {
    SCOPED_TRACE(size);
    AudioChannelLayout a = CreateMultichannelLayout(size);
    a.front() = AudioChannelLabel::FrontLeft;
    AudioChannelLayout b(a.rbegin(), a.rend());
    EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(a, b));
    b.front() = AudioChannelLabel::FrontRight;
    EXPECT_FALSE(ContainsSameChannelsIgnoreOrder(a, b));
  }
}

// A failing remap (no mapping expected) leaves the mapping exactly as it was.
TEST(RemapChannelOrdering, MapsByLabelAndDiscreteOrdinalOrFailsUntouched) {
  using Remap = bool (*)(const AudioChannelLayout&, const AudioChannelLayout&, Mapping&);
  struct Case {
    Remap remap;
    const char* source;
    const char* destination;
    std::optional<Mapping> mapping;
  };
  const Remap kByDestination = &RemapChannelOrdering;
  const Remap kBySource = &RemapChannelLabelOrdering;
  const Case kCases[] = {
      {kByDestination, "L R C LFE Ls Rs", "L R Ls Rs C LFE", Mapping{0, 1, 4, 5, 2, 3}},
      {kByDestination, "L R L", "L L R", Mapping{0, 0, 1}},
      {kByDestination, "L R", "L C", std::nullopt},
      {kBySource, "L R C", "R L", Mapping{1, 0, kNoDestination}},
      {kBySource, "L L", "L R L", Mapping{0, 2}},
      // Channels without a label match go to the first destination no label match took.
      {kBySource, "L C LFE", "L R Ls", Mapping{0, 1, 1}},
      {kBySource, "Ls C Rs", "C R L", Mapping{1, 0, 1}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    Mapping mapping = {9, 8};
    EXPECT_EQ(c.remap(ParseLayout(c.source), ParseLayout(c.destination), mapping),
              c.mapping.has_value());
    EXPECT_EQ(mapping, c.mapping.value_or(Mapping{9, 8}));
  }
}

// On failure nothing is replaced and the result is left untouched.
TEST(ReplaceDiscreteLabelsWithDestinationLayoutLabels, FillsDiscreteChannelsWithMissingLabels) {
  AudioChannelLayout result;
  EXPECT_TRUE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(ParseLayout("* * *"),
                                                               ParseLayout("L R"), result));
  EXPECT_EQ(LayoutText(result), "L R *");
  EXPECT_FALSE(ReplaceDiscreteLabelsWithDestinationLayoutLabels(ParseLayout("L R"),
                                                                ParseLayout("C LFE"), result));
  EXPECT_EQ(LayoutText(result), "L R *");
}

}  // namespace
}  // namespace zebmediatypes
