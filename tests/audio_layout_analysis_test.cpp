#include <gtest/gtest.h>
#include <zebmediatypes/audio_channel_layout.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <numeric>
#include <vector>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::kNamedLayouts;
using testing::LabelText;
using testing::LayoutText;
using testing::ParseLabel;
using testing::ParseLayout;

using Mapping = std::vector<std::size_t>;
constexpr std::size_t kNoDestination = std::numeric_limits<std::size_t>::max();

using PairFunction = AudioChannelLabel (*)(AudioChannelLabel) noexcept;

struct Pairing {
  const char* name;
  PairFunction pair;
  const char* pairs;  // "a b" pairs separated by commas
};

const Pairing kPairings[] = {
    {"LeftRightPair", &LeftRightPair,
     "L R, LFE LFE2, Ls Rs, Lc Rc, Lsd Rsd, Vhl Vhr, Tbl Tbr, Lw Rw, Tsl Tsr, Rls Rrs, Lt Rt, "
     "Bfl Bfr, Pl Pr"},
    {"FrontBackPair", &FrontBackPair,
     "L Ls, R Rs, C Cs, Lc Rls, Rc Rrs, Vhl Tbl, Vhr Tbr, Vhc Tbc"},
    {"TopMiddlePair", &TopMiddlePair, "L Vhl, R Vhr, C Vhc, Ls Tbl, Rs Tbr, Cs Tbc"},
    {"TopBottomPair", &TopBottomPair, "Vhl Bfl, Vhr Bfr, Vhc Bfc"},
    {"BottomMiddlePair", &BottomMiddlePair, "L Bfl, R Bfr, C Bfc"},
};

// Every value of interest: the labels, the gaps between them, and the extremes.
std::vector<std::uint32_t> SweepValues() {
  std::vector<std::uint32_t> values(300);
  std::iota(values.begin(), values.end(), 0u);
  values.insert(values.end(), {0x7FFFFFFFu, 0x80000000u, 0xFFFFFFFEu, 0xFFFFFFFFu});
  return values;
}

TEST(LabelPair, EachPairingGivesItsTableBothWaysAndDiscreteElsewhere) {
  for (const Pairing& pairing : kPairings) {
    SCOPED_TRACE(pairing.name);
    std::string text = pairing.pairs;
    std::replace(text.begin(), text.end(), ',', ' ');
    const AudioChannelLayout pairs = ParseLayout(text);
    ASSERT_EQ(pairs.size() % 2, 0u);
    std::vector<AudioChannelLabel> expected(0x100, AudioChannelLabel::Discrete);
    for (std::size_t k = 0; k < pairs.size(); k += 2) {
      expected[static_cast<std::uint32_t>(pairs[k].label)] = pairs[k + 1].label;
      expected[static_cast<std::uint32_t>(pairs[k + 1].label)] = pairs[k].label;
    }
    for (std::uint32_t value : SweepValues()) {
      SCOPED_TRACE(value);
      const AudioChannelLabel want =
          value < expected.size() ? expected[value] : AudioChannelLabel::Discrete;
      EXPECT_EQ(LabelText(pairing.pair(static_cast<AudioChannelLabel>(value))), LabelText(want));
    }
  }
}

TEST(LabelPair, EveryPairingIsAnInvolution) {
  for (const Pairing& pairing : kPairings) {
    SCOPED_TRACE(pairing.name);
    for (std::uint32_t value : SweepValues()) {
      const auto label = static_cast<AudioChannelLabel>(value);
      const AudioChannelLabel partner = pairing.pair(label);
      if (partner == AudioChannelLabel::Discrete) continue;
      SCOPED_TRACE(value);
      EXPECT_TRUE(IsKnownAudioChannelLabel(label));
      EXPECT_NE(partner, label);
      EXPECT_EQ(pairing.pair(partner), label);
    }
  }
}

TEST(LabelPair, CentreAndAmbisonicLabelsHaveNoMirrorImage) {
  for (const char* name : {"*", "C", "Cs", "Ts", "Vhc", "Tbc", "Bfc", "W", "X", "Y", "Z", "HOA"}) {
    SCOPED_TRACE(name);
    EXPECT_EQ(LeftRightPair(ParseLabel(name)), AudioChannelLabel::Discrete);
  }
}

TEST(IsStereoPair, HoldsForMirrorImagesInEitherOrder) {
  struct Case {
    const char* a;
    const char* b;
    bool stereo;
  };
  constexpr Case kCases[] = {
      {"L", "R", true},  {"R", "L", true},     {"LFE", "LFE2", true}, {"Lt", "Rt", true},
      {"*", "*", false}, {"L", "L", false},    {"C", "*", false},     {"L", "Rs", false},
      {"?", "*", false}, {"#125", "*", false},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.a) + " " + c.b);
    EXPECT_EQ(IsStereoPair(ParseLabel(c.a), ParseLabel(c.b)), c.stereo);
  }
  for (std::uint32_t a = 0; a < 150; ++a) {
    for (std::uint32_t b = 0; b < 150; ++b) {
      const auto la = static_cast<AudioChannelLabel>(a);
      const auto lb = static_cast<AudioChannelLabel>(b);
      ASSERT_EQ(IsStereoPair(la, lb), IsStereoPair(lb, la)) << a << " " << b;
    }
  }
}

TEST(ContainsSameChannelsIgnoreOrder, ComparesLabelsWithMultiplicity) {
  struct Case {
    const char* a;
    const char* b;
    bool same;
  };
  constexpr Case kCases[] = {
      {"", "", true},
      {"L R C", "C L R", true},
      {"L R L", "L R R", false},
      {"L R", "L R C", false},
      {"* *", "* *", true},
      {"* L", "L *", true},
      {"? L", "L ?", true},
      {"L R C LFE Ls Rs", "L R Ls Rs C LFE", true},
      {"", "*", false},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.a) + " | " + c.b);
    EXPECT_EQ(ContainsSameChannelsIgnoreOrder(ParseLayout(c.a), ParseLayout(c.b)), c.same);
    EXPECT_EQ(ContainsSameChannelsIgnoreOrder(ParseLayout(c.b), ParseLayout(c.a)), c.same);
  }
}

TEST(ContainsSameChannelsIgnoreOrder, LongLayoutsCompareLikeShortOnes) {
  for (std::size_t size : {31u, 32u, 33u, 64u}) {
    SCOPED_TRACE(size);
    AudioChannelLayout a = CreateMultichannelLayout(static_cast<int>(size));
    a.front() = AudioChannelLabel::FrontLeft;
    AudioChannelLayout b = a;
    std::reverse(b.begin(), b.end());
    EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(a, b));
    b.front() = AudioChannelLabel::FrontRight;
    EXPECT_FALSE(ContainsSameChannelsIgnoreOrder(a, b));
  }
}

TEST(NormalizeChannelOrder, SortsByLabelKeepingRepeats) {
  struct Case {
    const char* layout;
    const char* normalized;
  };
  constexpr Case kCases[] = {
      {"", ""},
      {"R L L", "L L R"},
      {"Ls Rs L R C LFE", "L R C LFE Ls Rs"},
      {"? L *", "* L ?"},
      {"Tbc Vhc Tbr", "Vhc Tbr Tbc"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.layout);
    AudioChannelLayout layout = ParseLayout(c.layout);
    NormalizeChannelOrder(layout);
    EXPECT_EQ(LayoutText(layout), c.normalized);
  }
}

TEST(NormalizeChannelOrder, EveryNamedLayoutKeepsItsChannels) {
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout original = named.create();
    AudioChannelLayout layout = original;
    NormalizeChannelOrder(layout);
    EXPECT_TRUE(std::is_sorted(layout.begin(), layout.end()));
    EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(layout, original));
  }
}

TEST(RemapChannelOrdering, MapsEachDestinationChannelToItsSource) {
  struct Case {
    const char* source;
    const char* destination;
    Mapping mapping;
  };
  const Case kCases[] = {
      {"L R C LFE Ls Rs", "L R Ls Rs C LFE", {0, 1, 4, 5, 2, 3}},
      {"* *", "* *", {0, 1}},
      {"L * R *", "* R * L", {1, 2, 3, 0}},
      {"L R", "", {}},
      {"", "", {}},
      {"L R L", "L L R", {0, 0, 1}},
      {"? #125", "#125 ?", {1, 0}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    Mapping mapping = {7, 7, 7};
    EXPECT_TRUE(RemapChannelOrdering(ParseLayout(c.source), ParseLayout(c.destination), mapping));
    EXPECT_EQ(mapping, c.mapping);
  }
}

TEST(RemapChannelOrdering, FailureLeavesTheMappingAsItWas) {
  struct Case {
    const char* source;
    const char* destination;
  };
  constexpr Case kCases[] = {
      {"L R", "L C"}, {"L R", "L"}, {"", "L"}, {"* L", "* *"}, {"L R", "* *"}, {"L", "?"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    Mapping mapping = {9, 8};
    EXPECT_FALSE(RemapChannelOrdering(ParseLayout(c.source), ParseLayout(c.destination), mapping));
    EXPECT_EQ(mapping, (Mapping{9, 8}));
  }
}

TEST(RemapChannelOrdering, EveryNamedLayoutOntoItselfIsTheIdentity) {
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout layout = named.create();
    Mapping mapping;
    ASSERT_TRUE(RemapChannelOrdering(layout, layout, mapping));
    Mapping identity(layout.size());
    std::iota(identity.begin(), identity.end(), std::size_t{0});
    EXPECT_EQ(mapping, identity);
  }
}

// Reordering a layout and remapping back must gather every sample where it was.
TEST(RemapChannelOrdering, ReorderedNamedLayoutsMapBackToTheSameSpeakers) {
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout source = named.create();
    AudioChannelLayout destination = source;
    std::reverse(destination.begin(), destination.end());
    std::rotate(destination.begin(), destination.begin() + 1, destination.end());
    Mapping mapping;
    ASSERT_TRUE(RemapChannelOrdering(source, destination, mapping));
    ASSERT_EQ(mapping.size(), destination.size());
    for (std::size_t j = 0; j < destination.size(); ++j) {
      ASSERT_LT(mapping[j], source.size());
      EXPECT_EQ(source[mapping[j]], destination[j]);
    }
    Mapping sorted = mapping;
    std::sort(sorted.begin(), sorted.end());
    EXPECT_TRUE(std::adjacent_find(sorted.begin(), sorted.end()) == sorted.end())
        << "not a permutation";
  }
}

TEST(RemapChannelLabelOrdering, MapsEachSourceChannelToADestination) {
  struct Case {
    const char* source;
    const char* destination;
    Mapping mapping;
  };
  const Case kCases[] = {
      {"L R C", "R L", {1, 0, kNoDestination}},
      {"L R C", "C R L Ls", {2, 1, 0}},
      {"* * L", "L * *", {1, 2, 0}},
      {"L L", "L R L", {0, 2}},
      {"?", "L ?", {1}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    Mapping mapping = {7};
    EXPECT_TRUE(
        RemapChannelLabelOrdering(ParseLayout(c.source), ParseLayout(c.destination), mapping));
    EXPECT_EQ(mapping, c.mapping);
  }
}

// Source channels without a label match all go to the first destination
// channel no label match took, so two of them may fold into one channel while
// another destination channel stays unfed.
TEST(RemapChannelLabelOrdering, LeftOverChannelsFoldIntoTheFirstFreeDestination) {
  struct Case {
    const char* source;
    const char* destination;
    Mapping mapping;
  };
  const Case kCases[] = {
      {"C LFE", "L R", {0, 0}},
      {"L C LFE", "L R Ls", {0, 1, 1}},
      {"L L L", "L R", {0, 1, 1}},
      {"Ls C Rs", "C R L", {1, 0, 1}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    Mapping mapping;
    EXPECT_TRUE(
        RemapChannelLabelOrdering(ParseLayout(c.source), ParseLayout(c.destination), mapping));
    EXPECT_EQ(mapping, c.mapping);
  }
}

TEST(RemapChannelLabelOrdering, EmptyLayoutFailsAndLeavesTheMapping) {
  for (auto [source, destination] : {std::pair{"", "L R"}, {"L R", ""}, {"", ""}}) {
    SCOPED_TRACE(std::string(source) + " -> " + destination);
    Mapping mapping = {5};
    EXPECT_FALSE(RemapChannelLabelOrdering(ParseLayout(source), ParseLayout(destination), mapping));
    EXPECT_EQ(mapping, Mapping{5});
  }
}

TEST(RemapChannelLabelOrdering, EveryPairOfNamedLayoutsGivesValidDestinations) {
  for (const testing::NamedLayout& from : kNamedLayouts) {
    const AudioChannelLayout source = from.create();
    for (const testing::NamedLayout& to : kNamedLayouts) {
      const AudioChannelLayout destination = to.create();
      SCOPED_TRACE(std::string(from.name) + " -> " + to.name);
      Mapping mapping;
      ASSERT_TRUE(RemapChannelLabelOrdering(source, destination, mapping));
      ASSERT_EQ(mapping.size(), source.size());
      std::vector<int> labelMatches(destination.size(), 0);
      for (std::size_t i = 0; i < source.size(); ++i) {
        if (mapping[i] == kNoDestination) continue;
        ASSERT_LT(mapping[i], destination.size());
        if (destination[mapping[i]] == source[i]) ++labelMatches[mapping[i]];
      }
      // A destination channel is claimed by at most one source of its label.
      for (int count : labelMatches) EXPECT_LE(count, 1);
      if (from.create == to.create) {
        Mapping identity(source.size());
        std::iota(identity.begin(), identity.end(), std::size_t{0});
        EXPECT_EQ(mapping, identity);
      }
    }
  }
}

TEST(ReplaceDiscreteLabelsWithDestinationLayoutLabels, FillsDiscreteChannelsWithMissingLabels) {
  struct Case {
    const char* source;
    const char* destination;
    bool replaced;
    const char* result;
  };
  constexpr Case kCases[] = {
      {"* *", "L R", true, "L R"},
      {"L *", "L R", true, "L R"},
      {"L R", "C LFE", false, "untouched"},
      {"* * *", "L R", true, "L R *"},
      {"* R", "L R C", true, "L R"},
      {"*", "* L", true, "L"},
      {"* *", "* *", false, "untouched"},
      {"* *", "", false, "untouched"},
      {"", "L R", false, "untouched"},
      {"* C *", "L C R", true, "L C R"},
      {"*", "?", true, "?"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " + " + c.destination);
    AudioChannelLayout result = ParseLayout("Pl Pr");
    EXPECT_EQ(ReplaceDiscreteLabelsWithDestinationLayoutLabels(ParseLayout(c.source),
                                                               ParseLayout(c.destination), result),
              c.replaced);
    EXPECT_EQ(LayoutText(result), c.replaced ? c.result : "Pl Pr");
  }
}

}  // namespace
}  // namespace zebmediatypes
