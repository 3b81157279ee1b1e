#include <gtest/gtest.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <algorithm>
#include <cmath>
#include <random>
#include <string>
#include <tuple>
#include <vector>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::ForEachPairOfNamedLayouts;
using testing::ParseLayout;

using Rows = std::vector<std::vector<double>>;

Rows ToRows(const ChannelConversionMatrix& matrix) {
  Rows rows;
  for (const ChannelConversionMatrixRow& row : matrix) rows.emplace_back(row.begin(), row.end());
  return rows;
}

Rows Compute(const AudioChannelLayout& source, const AudioChannelLayout& destination,
             ChannelConversionMatrix matrix = {}) {
  ComputeChannelConversionMatrix(source, destination, matrix);
  return ToRows(matrix);
}

Rows Identity(std::size_t sourceCount, std::size_t destinationCount) {
  Rows rows(destinationCount, std::vector<double>(sourceCount, 0.0));
  for (std::size_t k = 0; k < sourceCount && k < destinationCount; ++k) rows[k][k] = 1.0;
  return rows;
}

void ExpectMatrices(const std::vector<std::tuple<const char*, const char*, Rows>>& cases) {
  for (const auto& [source, destination, rows] : cases) {
    SCOPED_TRACE(std::string(source) + " -> " + destination);
    EXPECT_EQ(Compute(ParseLayout(source), ParseLayout(destination)), rows);
  }
}

constexpr double kHalf = 0.5;
constexpr double kSixth = 1.0 / 6.0;

TEST(ComputeChannelConversionMatrix, GivesTheRoutingForCommonConversions) {
  // clang-format off
  ExpectMatrices({
      {"L R C LFE Ls Rs", "L R", {{1, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0}}},
      {"L R", "L R C LFE Ls Rs", {{1, 0}, {0, 1}, {kHalf, kHalf}, {0, 0}, {1, 0}, {0, 1}}},
      // 7.1 into 5.1: the centre-front pair is dropped, nothing is folded in.
      {"L R C LFE Ls Rs Lc Rc", "L R C LFE Ls Rs", Identity(8, 6)},
      {"* *", "*", {{1, 0}}}, {"*", "L R C LFE Ls Rs", {{1}, {1}, {1}, {1}, {1}, {1}}},
      {"* * * *", "L R C LFE Ls Rs", Identity(4, 6)},
      {"L R C LFE Ls Rs", "*", {{kSixth, kSixth, kSixth, kSixth, kSixth, kSixth}}},
      // An exact label beats a nearer-looking neighbour seen first.
      {"Lw L", "L", {{0, 1}}},
      // LFE is fed only from its own label, never from LFE2.
      {"L R LFE2", "LFE LFE2", {{0, 0, 0}, {0, 0, 1}}},
      // Ls Rs into a centre: Ls Rs are behind, Cs is nearer to both equally.
      {"L R Ls Rs", "Cs", {{0, 0, kHalf, kHalf}}}, {"L C R", "Vhc", {{0, 1, 0}}},
      // Heights are nearer to the top centre than listener-height speakers.
      {"Vhl Vhr L R", "Ts", {{kHalf, kHalf, 0, 0}}},
      {"L R C", "Y", {{0, 0, 1}}}, {"Lsd Rsd C", "Ts", {{1.0 / 3, 1.0 / 3, 1.0 / 3}}},
      // Discrete destination channels match Discrete sources by ordinal.
      {"L * * R", "* C *", {{0, 1, 0, 0}, {kHalf, 0, 0, kHalf}, {0, 0, 1, 0}}},
      {"L *", "* *", Identity(2, 2)}, {"", "L R", Identity(0, 2)}, {"L R", "", {}}, {"", "*", {{}}},
      // An unknown value is no low-frequency channel: it is a speaker at the
      // centre, as near to Lc as to Rc and nearer than to L.
      {"? #125", "#125 L", {{0, 1}, {kHalf, kHalf}}},
      {"L Lc Rc", "?", {{0, kHalf, kHalf}}}, {"?", "* ?", {{1}, {1}}},
  });
  // clang-format on
}

TEST(ComputeChannelConversionMatrix, LabelledMonoSourceFeedsEveryDiscreteDestinationChannel) {
  // clang-format off
  ExpectMatrices({
      {"C", "* *", {{1}, {1}}}, {"LFE", "* *", {{1}, {1}}}, {"C", "* L", {{1}, {1}}},
  });
  // clang-format on
}

TEST(ComputeChannelConversionMatrix, DiscreteSourcesShareASingleLabelledChannel) {
  // clang-format off
  ExpectMatrices({
      {"* *", "C", {{kHalf, kHalf}}}, {"* *", "LFE", {{kHalf, kHalf}}},
      {"* * * * * *", "L", {{kSixth, kSixth, kSixth, kSixth, kSixth, kSixth}}},
      // Only the Discrete channels share it; an LFE still reaches only an LFE.
      {"* LFE *", "C", {{kHalf, 0, kHalf}}},
      // A speaker in the source is still routed by nearness.
      {"* R *", "C", {{0, 1, 0}}},
  });
  // clang-format on
}

// Well formed: one row per destination channel, one entry per source channel,
// every row either silent or 1/n on exactly n entries.
void ExpectWellFormed(const AudioChannelLayout& source, const AudioChannelLayout& destination,
                      const Rows& matrix) {
  ASSERT_EQ(matrix.size(), destination.size());
  for (const std::vector<double>& row : matrix) {
    ASSERT_EQ(row.size(), source.size());
    const auto fed = static_cast<double>(
        std::count_if(row.begin(), row.end(), [](double gain) { return gain != 0.0; }));
    for (double gain : row) {
      ASSERT_TRUE(std::isfinite(gain));
      ASSERT_TRUE(gain == 0.0 || gain == 1.0 / fed) << gain;
    }
  }
}

TEST(ComputeChannelConversionMatrix,
     EveryPairOfNamedLayoutsGivesEqualSplitGainsAndIdentityOntoItself) {
  ForEachPairOfNamedLayouts(
      [](const AudioChannelLayout& source, const AudioChannelLayout& destination) {
        const Rows matrix = Compute(source, destination);
        ExpectWellFormed(source, destination, matrix);
        EXPECT_TRUE(source != destination || matrix == Identity(source.size(), source.size()));
      });
}

bool IsLowFrequency(AudioChannelLabel label) {
  return label == AudioChannelLabel::LowFrequency || label == AudioChannelLabel::LFE2;
}

// Outside the identity fallback (both sides multichannel, one side unlabelled):
// a labelled destination channel whose label the source carries takes exactly
// the first such source channel at 1.0; no row is silent when either side is
// mono, nor a speaker row (neither Discrete nor low-frequency) when the source
// has a speaker; and a low-frequency channel is fed only from its own label
// (or from a mono source).
TEST(ComputeChannelConversionMatrix,
     EveryPairOfNamedLayoutsTakesSharedLabelsAndLeavesNoRoutableRowSilent) {
  ForEachPairOfNamedLayouts(
      [](const AudioChannelLayout& source, const AudioChannelLayout& destination) {
        if (source.size() != 1 && destination.size() != 1 &&
            (!HasChannelLabeling(source) || !HasChannelLabeling(destination))) {
          return;
        }
        const auto isSpeaker = [](AudioChannelDescription c) {
          return c.label != AudioChannelLabel::Discrete && !IsLowFrequency(c.label);
        };
        const bool sourceHasSpeaker = std::any_of(source.begin(), source.end(), isSpeaker);
        const Rows rows = Compute(source, destination);
        for (std::size_t j = 0; j < destination.size(); ++j) {
          SCOPED_TRACE(j);
          const AudioChannelLabel label = destination[j].label;
          const auto first = std::find(source.begin(), source.end(), destination[j]);
          if (label != AudioChannelLabel::Discrete && first != source.end()) {
            const auto taken = static_cast<std::size_t>(first - source.begin());
            EXPECT_EQ(rows[j], Identity(source.size(), source.size())[taken]);
          }
          const bool routable = (isSpeaker(label) && sourceHasSpeaker) || source.size() == 1 ||
                                destination.size() == 1;
          EXPECT_FALSE(routable && rows[j] == std::vector<double>(source.size(), 0.0));
          if (!IsLowFrequency(label) || source.size() == 1) continue;
          for (std::size_t i = 0; i < source.size(); ++i) {
            EXPECT_TRUE(rows[j][i] == 0.0 || source[i].label == label) << "source channel " << i;
          }
        }
      });
}

TEST(ChannelConversionMatrix, BothBuildersReplaceWhateverTheResultHeld) {
  const AudioChannelLayout source = Create51ChannelLayout(),
                           destination = CreateStereoChannelLayout();
  const Rows expected = Compute(source, destination);
  for (std::size_t rows : {std::size_t{2}, std::size_t{5}}) {
    SCOPED_TRACE(rows);
    ChannelConversionMatrix matrix(rows, ChannelConversionMatrixRow(7 - rows, 9.0));
    EXPECT_EQ(Compute(source, destination, matrix), expected);
    CreateIdentityChannelConversionMatrix(2, 3, matrix);
    EXPECT_EQ(ToRows(matrix), (Rows{{1, 0}, {0, 1}, {0, 0}}));
    CreateIdentityChannelConversionMatrix(3, 2, matrix);
    EXPECT_EQ(ToRows(matrix), (Rows{{1, 0, 0}, {0, 1, 0}}));
    CreateIdentityChannelConversionMatrix(0, 2, matrix);
    EXPECT_EQ(ToRows(matrix), (Rows{{}, {}}));
  }
}

TEST(ComputeChannelConversionMatrix, LargeLayoutsGiveFullSizeMatrices) {
  const AudioChannelLayout wide = CreateMultichannelLayoutWithDefaultLabels(kAudioChannelCount_Max);
  EXPECT_EQ(Compute(wide, Create51ChannelLayout()), Identity(wide.size(), 6));
  AudioChannelLayout labelled = wide;
  labelled[1] = AudioChannelLabel::FrontRight;
  const Rows matrix = Compute(labelled, CreateStereoChannelLayout());
  ExpectWellFormed(labelled, CreateStereoChannelLayout(), matrix);
  EXPECT_EQ(matrix[0][1], 1.0);
  EXPECT_EQ(matrix[1][1], 1.0);
}

TEST(ComputeChannelConversionMatrix, RandomLayoutsGiveWellFormedMatricesExhaustive) {
  std::mt19937 random(20261206);
  std::uniform_int_distribution<std::size_t> size(0, 20);
  std::uniform_int_distribution<std::size_t> pick(0, kAudioChannelLabelCount);
  for (int round = 0; round < 200000; ++round) {
    AudioChannelLayout layouts[2];
    for (AudioChannelLayout& layout : layouts) {
      layout.resize(size(random));
      for (AudioChannelDescription& channel : layout) {
        const std::size_t k = pick(random);  // the count itself picks the unknown value
        channel = k < kAudioChannelLabelCount ? AudioChannelLabel(testing::KnownLabelValue(k))
                                              : testing::kUnknownLabel;
      }
    }
    SCOPED_TRACE(testing::LayoutText(layouts[0]) + " -> " + testing::LayoutText(layouts[1]));
    ExpectWellFormed(layouts[0], layouts[1], Compute(layouts[0], layouts[1]));
    if (::testing::Test::HasFatalFailure()) return;
  }
}

}  // namespace
}  // namespace zebmediatypes
