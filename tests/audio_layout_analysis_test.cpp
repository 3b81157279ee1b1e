#include <gtest/gtest.h>
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/audio_format.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <numeric>
#include <optional>
#include <string>
#include <tuple>
#include <vector>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::kNamedLayouts;
using testing::LayoutText;
using testing::ParseLayout;

using Mapping = std::vector<std::size_t>;
constexpr std::size_t kNoDestination = std::numeric_limits<std::size_t>::max();

Mapping Identity(std::size_t size) {
  Mapping identity(size);
  std::iota(identity.begin(), identity.end(), std::size_t{0});
  return identity;
}

// Each pairing's table as "a b" pairs; the partner of every other value
// (centres, ambisonics, unknown values) is Discrete.
// clang-format off
const std::tuple<const char*, AudioChannelLabel (*)(AudioChannelLabel) noexcept, const char*> kPairings[] = {
    {"LeftRightPair", &LeftRightPair, "L R LFE LFE2 Ls Rs Lc Rc Lsd Rsd Vhl Vhr Tbl Tbr Lw Rw Tsl Tsr Rls Rrs Lt Rt Bfl Bfr Pl Pr"},
    {"FrontBackPair", &FrontBackPair, "L Ls R Rs C Cs Lc Rls Rc Rrs Vhl Tbl Vhr Tbr Vhc Tbc"},
    {"TopMiddlePair", &TopMiddlePair, "L Vhl R Vhr C Vhc Ls Tbl Rs Tbr Cs Tbc"},
    {"TopBottomPair", &TopBottomPair, "Vhl Bfl Vhr Bfr Vhc Bfc"},
    {"BottomMiddlePair", &BottomMiddlePair, "L Bfl R Bfr C Bfc"},
};
// clang-format on

// The labels, the gaps between them, and the extremes.
std::vector<std::uint32_t> SweepValues() {
  std::vector<std::uint32_t> values = {0x7FFFFFFFu, 0x80000000u, 0xFFFFFFFEu, 0xFFFFFFFFu};
  for (std::uint32_t value = 0; value < 300; ++value) values.push_back(value);
  return values;
}

// Built both ways from the table, the expectation also makes each an involution.
TEST(LabelPair, EachPairingGivesItsTableBothWaysAndDiscreteElsewhere) {
  for (const auto& [name, pair, text] : kPairings) {
    SCOPED_TRACE(name);
    const AudioChannelLayout pairs = ParseLayout(text);
    std::vector<AudioChannelLabel> expected(0x100, AudioChannelLabel::Discrete);
    for (std::size_t k = 0; k < pairs.size(); k += 2) {
      expected[static_cast<std::uint32_t>(pairs[k].label)] = pairs[k + 1].label;
      expected[static_cast<std::uint32_t>(pairs[k + 1].label)] = pairs[k].label;
    }
    for (std::uint32_t value : SweepValues()) {
      SCOPED_TRACE(value);
      const AudioChannelLabel want = value < 0x100 ? expected[value] : AudioChannelLabel::Discrete;
      EXPECT_EQ(testing::LabelText(pair(static_cast<AudioChannelLabel>(value))),
                testing::LabelText(want));
    }
  }
}

TEST(IsStereoPair, HoldsForLeftRightPartnersInEitherOrder) {
  for (std::uint32_t a : SweepValues()) {
    for (std::uint32_t b = 0; b < 150; ++b) {
      const auto la = static_cast<AudioChannelLabel>(a);
      const auto lb = static_cast<AudioChannelLabel>(b);
      ASSERT_EQ(IsStereoPair(la, lb), a != 0 && b != 0 && LeftRightPair(la) == lb) << a << " " << b;
      ASSERT_EQ(IsStereoPair(la, lb), IsStereoPair(lb, la)) << a << " " << b;
    }
  }
}

TEST(ContainsSameChannelsIgnoreOrder, ComparesLabelsWithMultiplicity) {
  // clang-format off
  const std::tuple<const char*, const char*, bool> kCases[] = {
      {"", "", true}, {"L R C", "C L R", true}, {"L R L", "L R R", false}, {"L R", "L R C", false},
      {"* L", "L *", true}, {"L R C LFE Ls Rs", "L R Ls Rs C LFE", true}, {"", "*", false},
  };
  // clang-format on
  for (const auto& [a, b, same] : kCases) {
    SCOPED_TRACE(std::string(a) + " | " + b);
    EXPECT_EQ(ContainsSameChannelsIgnoreOrder(ParseLayout(a), ParseLayout(b)), same);
    EXPECT_EQ(ContainsSameChannelsIgnoreOrder(ParseLayout(b), ParseLayout(a)), same);
  }
}

// Up to 32 channels are sorted on the stack, longer layouts on the heap.
TEST(ContainsSameChannelsIgnoreOrder, LongLayoutsCompareLikeShortOnes) {
  for (int size : {32, 33, 64}) {
    SCOPED_TRACE(size);
    AudioChannelLayout a = CreateMultichannelLayout(size);
    a.front() = AudioChannelLabel::FrontLeft;
    AudioChannelLayout b(a.rbegin(), a.rend());
    EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(a, b));
    b.front() = AudioChannelLabel::FrontRight;
    EXPECT_FALSE(ContainsSameChannelsIgnoreOrder(a, b));
  }
}

TEST(NormalizeChannelOrder, SortsByLabelKeepingRepeats) {
  // clang-format off
  const std::pair<const char*, const char*> kCases[] = {
      {"R L L", "L L R"}, {"Ls Rs L R C LFE", "L R C LFE Ls Rs"}, {"? L *", "* L ?"},
      {"Tbc Vhc Tbr", "Vhc Tbr Tbc"},
  };
  // clang-format on
  for (const auto& [text, normalized] : kCases) {
    SCOPED_TRACE(text);
    AudioChannelLayout layout = ParseLayout(text);
    NormalizeChannelOrder(layout);
    EXPECT_EQ(LayoutText(layout), normalized);
  }
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    AudioChannelLayout layout = named.create();
    NormalizeChannelOrder(layout);
    EXPECT_TRUE(std::is_sorted(layout.begin(), layout.end()));
    EXPECT_TRUE(ContainsSameChannelsIgnoreOrder(layout, named.create()));
  }
}

TEST(NormalizeChannelOrder, SortsAFormatsLayoutOnly) {
  AudioFormat format = AudioFormat::CreateAudioFormat(CreateLegacy51ChannelLayout(), 44100);
  AudioFormat expected = AudioFormat::CreateAudioFormat(Create51ChannelLayout(), 44100);
  for (AudioFormat* f : {&format, &expected}) f->SetSampleType(kAudioSampleType_24BitInteger);
  NormalizeChannelOrder(format);
  EXPECT_EQ(format, expected);
}

// A failing remap (no mapping expected) leaves the mapping exactly as it was.
using RemapCase = std::tuple<const char*, const char*, std::optional<Mapping>>;
using Remap = bool (*)(const AudioChannelLayout&, const AudioChannelLayout&, Mapping&);

void ExpectRemaps(Remap remap, const std::vector<RemapCase>& cases) {
  for (const auto& [source, destination, expected] : cases) {
    SCOPED_TRACE(std::string(source) + " -> " + destination);
    Mapping mapping = {9, 8};
    EXPECT_EQ(remap(ParseLayout(source), ParseLayout(destination), mapping), expected.has_value());
    EXPECT_EQ(mapping, expected.value_or(Mapping{9, 8}));
  }
}

TEST(RemapChannelOrdering, MapsEachDestinationChannelToItsSourceOrFailsUntouched) {
  // clang-format off
  ExpectRemaps(&RemapChannelOrdering, {
      {"L R C LFE Ls Rs", "L R Ls Rs C LFE", Mapping{0, 1, 4, 5, 2, 3}}, {"* *", "* *", Mapping{0, 1}},
      {"L * R *", "* R * L", Mapping{1, 2, 3, 0}}, {"L R", "", Mapping{}}, {"L R L", "L L R", Mapping{0, 0, 1}},
      {"? #125", "#125 ?", Mapping{1, 0}}, {"L R", "L C", std::nullopt}, {"L R", "L", std::nullopt},
      {"L R", "* *", std::nullopt}, {"L", "?", std::nullopt},
  });
  // clang-format on
}

// Onto itself every named layout maps by identity; onto a reordering of itself
// the mapping is a permutation that gathers every channel where it was.
TEST(RemapChannelOrdering, EveryNamedLayoutOntoItselfIsTheIdentityAndReorderingsMapBack) {
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout source = named.create();
    Mapping mapping;
    ASSERT_TRUE(RemapChannelOrdering(source, source, mapping));
    EXPECT_EQ(mapping, Identity(source.size()));
    AudioChannelLayout destination(source.rbegin(), source.rend());
    std::rotate(destination.begin(), destination.begin() + 1, destination.end());
    ASSERT_TRUE(RemapChannelOrdering(source, destination, mapping));
    AudioChannelLayout gathered;
    for (std::size_t i : mapping)
      gathered.push_back(i < source.size() ? source[i] : testing::kUnknownLabel);
    EXPECT_EQ(gathered, destination);
    std::sort(mapping.begin(), mapping.end());
    EXPECT_EQ(mapping, Identity(source.size())) << "not a permutation";
  }
}

TEST(RemapChannelLabelOrdering, MapsEachSourceChannelToADestinationOrFailsUntouched) {
  // clang-format off
  ExpectRemaps(&RemapChannelLabelOrdering, {
      {"L R C", "R L", Mapping{1, 0, kNoDestination}}, {"L R C", "C R L Ls", Mapping{2, 1, 0}},
      {"* * L", "L * *", Mapping{1, 2, 0}}, {"L L", "L R L", Mapping{0, 2}}, {"?", "L ?", Mapping{1}},
      {"", "L R", std::nullopt}, {"L R", "", std::nullopt}, {"", "", std::nullopt},
  });
  // clang-format on
}

// Source channels without a label match all go to the first destination
// channel no label match took, so two of them may fold into one channel while
// another destination channel stays unfed.
TEST(RemapChannelLabelOrdering, LeftOverChannelsFoldIntoTheFirstFreeDestination) {
  // clang-format off
  ExpectRemaps(&RemapChannelLabelOrdering, {
      {"C LFE", "L R", Mapping{0, 0}}, {"L C LFE", "L R Ls", Mapping{0, 1, 1}},
      {"L L L", "L R", Mapping{0, 1, 1}}, {"Ls C Rs", "C R L", Mapping{1, 0, 1}},
  });
  // clang-format on
}

// A destination channel is claimed by at most one source channel of its label,
// and a layout onto itself maps by identity.
TEST(RemapChannelLabelOrdering, EveryPairOfNamedLayoutsGivesValidDestinations) {
  testing::ForEachPairOfNamedLayouts(
      [](const AudioChannelLayout& source, const AudioChannelLayout& destination) {
        Mapping mapping;
        ASSERT_TRUE(RemapChannelLabelOrdering(source, destination, mapping));
        ASSERT_EQ(mapping.size(), source.size());
        std::vector<int> labelMatches(destination.size(), 0);
        for (std::size_t i = 0; i < source.size(); ++i) {
          if (mapping[i] == kNoDestination) continue;
          ASSERT_LT(mapping[i], destination.size());
          if (destination[mapping[i]] == source[i]) ++labelMatches[mapping[i]];
        }
        for (int count : labelMatches) EXPECT_LE(count, 1);
        EXPECT_TRUE(source != destination || mapping == Identity(source.size()));
      });
}

// A null result: nothing is replaced and the result layout is left untouched.
TEST(ReplaceDiscreteLabelsWithDestinationLayoutLabels, FillsDiscreteChannelsWithMissingLabels) {
  // clang-format off
  const std::tuple<const char*, const char*, const char*> kCases[] = {
      {"* *", "L R", "L R"}, {"L *", "L R", "L R"}, {"L R", "C LFE", nullptr}, {"* * *", "L R", "L R *"},
      {"*", "* L", "L"}, {"* *", "* *", nullptr}, {"", "L R", nullptr}, {"* C *", "L C R", "L C R"},
      {"*", "?", "?"},
  };
  // clang-format on
  for (const auto& [source, destination, expected] : kCases) {
    SCOPED_TRACE(std::string(source) + " + " + destination);
    AudioChannelLayout result = ParseLayout("Pl Pr");
    EXPECT_EQ(ReplaceDiscreteLabelsWithDestinationLayoutLabels(ParseLayout(source),
                                                               ParseLayout(destination), result),
              expected != nullptr);
    EXPECT_EQ(LayoutText(result), expected != nullptr ? expected : "Pl Pr");
  }
}

}  // namespace
}  // namespace zebmediatypes
