#include <gtest/gtest.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <cmath>
#include <cstdint>
#include <random>
#include <string>
#include <vector>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::kNamedLayouts;
using testing::LayoutText;
using testing::ParseLayout;

using Rows = std::vector<std::vector<double>>;

Rows ToRows(const ChannelConversionMatrix& matrix) {
  Rows rows;
  for (const ChannelConversionMatrixRow& row : matrix) rows.emplace_back(row.begin(), row.end());
  return rows;
}

Rows Compute(const AudioChannelLayout& source, const AudioChannelLayout& destination) {
  ChannelConversionMatrix matrix;
  ComputeChannelConversionMatrix(source, destination, matrix);
  return ToRows(matrix);
}

Rows Identity(std::size_t sourceCount, std::size_t destinationCount) {
  Rows rows(destinationCount, std::vector<double>(sourceCount, 0.0));
  for (std::size_t k = 0; k < sourceCount && k < destinationCount; ++k) rows[k][k] = 1.0;
  return rows;
}

bool IsSilent(const std::vector<double>& row) {
  for (double gain : row) {
    if (gain != 0.0) return false;
  }
  return true;
}

constexpr double kHalf = 0.5;
constexpr double kThird = 1.0 / 3.0;
constexpr double kSixth = 1.0 / 6.0;

TEST(ComputeChannelConversionMatrix, GivesTheRoutingForCommonConversions) {
  struct Case {
    const char* source;
    const char* destination;
    Rows rows;
  };
  const Case kCases[] = {
      {"L R C LFE Ls Rs", "L R", {{1, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0}}},
      {"L R", "L R C LFE Ls Rs", {{1, 0}, {0, 1}, {kHalf, kHalf}, {0, 0}, {1, 0}, {0, 1}}},
      {"L R", "*", {{kHalf, kHalf}}},
      {"* *", "*", {{1, 0}}},
      {"*", "L R C LFE Ls Rs", {{1}, {1}, {1}, {1}, {1}, {1}}},
      {"* * * *", "L R C LFE Ls Rs", Identity(4, 6)},
      {"L R Ls Rs", "L R C", {{1, 0, 0, 0}, {0, 1, 0, 0}, {kHalf, kHalf, 0, 0}}},
      {"L", "Lw", {{1}}},
      {"L R C LFE Ls Rs", "*", {{kSixth, kSixth, kSixth, kSixth, kSixth, kSixth}}},
      // 7.1 into 5.1: the centre-front pair is dropped, nothing is folded in.
      {"L R C LFE Ls Rs Lc Rc",
       "L R C LFE Ls Rs",
       {{1, 0, 0, 0, 0, 0, 0, 0},
        {0, 1, 0, 0, 0, 0, 0, 0},
        {0, 0, 1, 0, 0, 0, 0, 0},
        {0, 0, 0, 1, 0, 0, 0, 0},
        {0, 0, 0, 0, 1, 0, 0, 0},
        {0, 0, 0, 0, 0, 1, 0, 0}}},
      // An exact label beats a nearer-looking neighbour seen first.
      {"Lw L", "L", {{0, 1}}},
      // LFE is fed only from its own label, never from LFE2.
      {"L R LFE2", "LFE LFE2", {{0, 0, 0}, {0, 0, 1}}},
      // Ls Rs into a centre: Ls Rs are behind, Cs is nearer to both equally.
      {"L R Ls Rs", "Cs", {{0, 0, kHalf, kHalf}}},
      {"L C R", "Vhc", {{0, 1, 0}}},
      // Heights are nearer to the top centre than listener-height speakers.
      {"Vhl Vhr L R", "Ts", {{kHalf, kHalf, 0, 0}}},
      {"L R C", "Y", {{0, 0, 1}}},
      {"L R Cs", "Ts", {{0, 0, 1}}},
      {"Lsd Rsd C", "Ts", {{kThird, kThird, kThird}}},
      // Discrete destination channels match Discrete sources by ordinal.
      {"L * * R", "* C *", {{0, 1, 0, 0}, {kHalf, 0, 0, kHalf}, {0, 0, 1, 0}}},
      {"L *", "* *", Identity(2, 2)},
      {"* *", "L R C", Identity(2, 3)},
      {"", "L R", Identity(0, 2)},
      {"L R", "", {}},
      {"", "", {}},
      {"", "*", {{}}},
      {"? #125", "#125 L", {{0, 1}, {kHalf, kHalf}}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    EXPECT_EQ(Compute(ParseLayout(c.source), ParseLayout(c.destination)), c.rows);
  }
}

TEST(ComputeChannelConversionMatrix, LabelledMonoSourceFeedsEveryDiscreteDestinationChannel) {
  struct Case {
    const char* source;
    const char* destination;
    Rows rows;
  };
  const Case kCases[] = {
      {"C", "* *", {{1}, {1}}},   {"L", "* * * *", {{1}, {1}, {1}, {1}}},
      {"LFE", "* *", {{1}, {1}}}, {"C", "* L", {{1}, {1}}},
      {"C", "*", {{1}}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    EXPECT_EQ(Compute(ParseLayout(c.source), ParseLayout(c.destination)), c.rows);
  }
}

TEST(ComputeChannelConversionMatrix, DiscreteSourcesShareASingleLabelledChannel) {
  struct Case {
    const char* source;
    const char* destination;
    Rows rows;
  };
  const Case kCases[] = {
      {"* *", "C", {{kHalf, kHalf}}},
      {"* * * * * *", "L", {{kSixth, kSixth, kSixth, kSixth, kSixth, kSixth}}},
      {"* *", "LFE", {{kHalf, kHalf}}},
      {"*", "C", {{1}}},
      // Only the Discrete channels share it; an LFE still reaches only an LFE.
      {"* LFE *", "C", {{kHalf, 0, kHalf}}},
      // A speaker in the source is still routed by nearness.
      {"* R *", "C", {{0, 1, 0}}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    EXPECT_EQ(Compute(ParseLayout(c.source), ParseLayout(c.destination)), c.rows);
  }
}

// Well formed: one row per destination channel, one entry per source channel,
// every row either silent or 1/n on exactly n entries.
void ExpectWellFormed(const AudioChannelLayout& source, const AudioChannelLayout& destination,
                      const ChannelConversionMatrix& matrix) {
  ASSERT_EQ(matrix.size(), destination.size());
  for (const ChannelConversionMatrixRow& row : matrix) {
    ASSERT_EQ(row.size(), source.size());
    std::size_t fed = 0;
    for (double gain : row) {
      ASSERT_TRUE(std::isfinite(gain));
      ASSERT_GE(gain, 0.0);
      fed += gain != 0.0;
    }
    for (double gain : row) {
      if (gain != 0.0) {
        ASSERT_EQ(gain, 1.0 / static_cast<double>(fed));
      }
    }
  }
}

TEST(ComputeChannelConversionMatrix, EveryPairOfNamedLayoutsGivesEqualSplitGains) {
  for (const testing::NamedLayout& from : kNamedLayouts) {
    const AudioChannelLayout source = from.create();
    for (const testing::NamedLayout& to : kNamedLayouts) {
      SCOPED_TRACE(std::string(from.name) + " -> " + to.name);
      const AudioChannelLayout destination = to.create();
      ChannelConversionMatrix matrix;
      ComputeChannelConversionMatrix(source, destination, matrix);
      ExpectWellFormed(source, destination, matrix);
    }
  }
}

TEST(ComputeChannelConversionMatrix, EveryNamedLayoutOntoItselfIsTheIdentity) {
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout layout = named.create();
    EXPECT_EQ(Compute(layout, layout), Identity(layout.size(), layout.size()));
  }
}

// For every pair of named layouts, a destination channel whose label the source
// carries takes exactly that source channel (the first one) at 1.0.
TEST(ComputeChannelConversionMatrix, SharedLabelIsTakenAtFullGainAlone) {
  for (const testing::NamedLayout& from : kNamedLayouts) {
    const AudioChannelLayout source = from.create();
    if (!HasChannelLabeling(source)) continue;
    for (const testing::NamedLayout& to : kNamedLayouts) {
      const AudioChannelLayout destination = to.create();
      if (!HasChannelLabeling(destination)) continue;
      SCOPED_TRACE(std::string(from.name) + " -> " + to.name);
      const Rows rows = Compute(source, destination);
      for (std::size_t j = 0; j < destination.size(); ++j) {
        if (destination[j].label == AudioChannelLabel::Discrete) continue;
        for (std::size_t i = 0; i < source.size(); ++i) {
          if (source[i] != destination[j]) continue;
          std::vector<double> expected(source.size(), 0.0);
          expected[i] = 1.0;
          EXPECT_EQ(rows[j], expected) << "destination channel " << j;
          break;
        }
      }
    }
  }
}

bool IsSpeaker(AudioChannelLabel label) {
  return label != AudioChannelLabel::Discrete && label != AudioChannelLabel::LowFrequency &&
         label != AudioChannelLabel::LFE2;
}

// For every pair of named layouts: a speaker destination channel (neither
// Discrete nor low-frequency) is never silent when the source has a speaker
// channel; a low-frequency destination channel is fed from its own label only.
TEST(ComputeChannelConversionMatrix, SpeakerRowIsSilentOnlyWhenTheSourceHasNoSpeaker) {
  for (const testing::NamedLayout& from : kNamedLayouts) {
    const AudioChannelLayout source = from.create();
    bool sourceHasSpeaker = false;
    for (AudioChannelDescription channel : source) sourceHasSpeaker |= IsSpeaker(channel.label);
    for (const testing::NamedLayout& to : kNamedLayouts) {
      const AudioChannelLayout destination = to.create();
      SCOPED_TRACE(std::string(from.name) + " -> " + to.name);
      const bool identityFallback =
          source.size() != 1 && destination.size() != 1 &&
          (!HasChannelLabeling(source) || !HasChannelLabeling(destination));
      if (identityFallback) continue;
      const Rows rows = Compute(source, destination);
      for (std::size_t j = 0; j < destination.size(); ++j) {
        const AudioChannelLabel label = destination[j].label;
        if (IsSpeaker(label) && sourceHasSpeaker) {
          EXPECT_FALSE(IsSilent(rows[j])) << "destination channel " << j;
        }
        if (label == AudioChannelLabel::LowFrequency || label == AudioChannelLabel::LFE2) {
          for (std::size_t i = 0; i < source.size(); ++i) {
            if (rows[j][i] == 0.0) continue;
            const bool mono = source.size() == 1;
            EXPECT_TRUE(source[i].label == label || mono) << "destination channel " << j;
          }
        }
      }
    }
  }
}

TEST(ComputeChannelConversionMatrix, NoRowIsSilentBetweenMonoAndAnyNamedLayout) {
  const AudioChannelLayout mono = CreateMonoChannelLayout();
  for (const testing::NamedLayout& named : kNamedLayouts) {
    SCOPED_TRACE(named.name);
    const AudioChannelLayout layout = named.create();
    for (const std::vector<double>& row : Compute(mono, layout)) EXPECT_FALSE(IsSilent(row));
    for (const std::vector<double>& row : Compute(layout, mono)) EXPECT_FALSE(IsSilent(row));
  }
}

TEST(ComputeChannelConversionMatrix, ReplacesWhateverTheResultHeld) {
  const AudioChannelLayout source = Create51ChannelLayout();
  const AudioChannelLayout destination = CreateStereoChannelLayout();
  const Rows expected = Compute(source, destination);
  std::vector<ChannelConversionMatrix> previous(3);
  previous[1] = ChannelConversionMatrix(2, ChannelConversionMatrixRow(6, 7.0));
  previous[2] = ChannelConversionMatrix(5, ChannelConversionMatrixRow(1, 7.0));
  previous[2][3].resize(6, 7.0);
  for (std::size_t k = 0; k < previous.size(); ++k) {
    SCOPED_TRACE(k);
    ComputeChannelConversionMatrix(source, destination, previous[k]);
    EXPECT_EQ(ToRows(previous[k]), expected);
  }
  ChannelConversionMatrix identity(2, ChannelConversionMatrixRow(2, 7.0));
  ComputeChannelConversionMatrix(ParseLayout("* *"), ParseLayout("* *"), identity);
  EXPECT_EQ(ToRows(identity), Identity(2, 2));
}

TEST(ComputeChannelConversionMatrix, UnknownLabelsSitAtTheCentre) {
  // An unknown value is no low-frequency channel: it is a speaker at the
  // centre, as near to Lc as to Rc and nearer than to L.
  EXPECT_EQ(Compute(ParseLayout("L Lc Rc"), ParseLayout("?")), (Rows{{0, kHalf, kHalf}}));
  EXPECT_EQ(Compute(ParseLayout("? #125"), ParseLayout("L")), (Rows{{kHalf, kHalf}}));
  EXPECT_EQ(Compute(ParseLayout("?"), ParseLayout("* ?")), (Rows{{1}, {1}}));
}

TEST(ComputeChannelConversionMatrix, LargeLayoutsGiveFullSizeMatrices) {
  const AudioChannelLayout wide = CreateMultichannelLayoutWithDefaultLabels(kAudioChannelCount_Max);
  ChannelConversionMatrix matrix;
  ComputeChannelConversionMatrix(wide, Create51ChannelLayout(), matrix);
  EXPECT_EQ(ToRows(matrix), Identity(wide.size(), 6));
  AudioChannelLayout labelled = wide;
  labelled[1] = AudioChannelLabel::FrontRight;
  ComputeChannelConversionMatrix(labelled, CreateStereoChannelLayout(), matrix);
  ExpectWellFormed(labelled, CreateStereoChannelLayout(), matrix);
  EXPECT_EQ(matrix[0][1], 1.0);
  EXPECT_EQ(matrix[1][1], 1.0);
}

TEST(CreateIdentityChannelConversionMatrix, PutsOnesOnTheLeadingDiagonal) {
  struct Case {
    std::size_t sources;
    std::size_t destinations;
    Rows rows;
  };
  const Case kCases[] = {
      {2, 3, {{1, 0}, {0, 1}, {0, 0}}},
      {3, 2, {{1, 0, 0}, {0, 1, 0}}},
      {2, 0, {}},
      {0, 2, {{}, {}}},
      {1, 1, {{1}}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::to_string(c.sources) + " x " + std::to_string(c.destinations));
    ChannelConversionMatrix matrix(4, ChannelConversionMatrixRow(4, 9.0));
    CreateIdentityChannelConversionMatrix(c.sources, c.destinations, matrix);
    EXPECT_EQ(ToRows(matrix), c.rows);
  }
}

TEST(ComputeChannelConversionMatrix, RandomLayoutsGiveWellFormedMatricesExhaustive) {
  std::mt19937 random(20261206);
  std::uniform_int_distribution<std::size_t> size(0, 20);
  std::uniform_int_distribution<std::size_t> pick(0, std::size(testing::kLabelNames) - 1);
  for (int round = 0; round < 200000; ++round) {
    AudioChannelLayout layouts[2];
    for (AudioChannelLayout& layout : layouts) {
      layout.resize(size(random));
      for (AudioChannelDescription& channel : layout) {
        channel = testing::kLabelNames[pick(random)].label;
      }
    }
    SCOPED_TRACE(LayoutText(layouts[0]) + " -> " + LayoutText(layouts[1]));
    ChannelConversionMatrix matrix;
    ComputeChannelConversionMatrix(layouts[0], layouts[1], matrix);
    ExpectWellFormed(layouts[0], layouts[1], matrix);
    if (::testing::Test::HasFatalFailure()) return;
  }
}

}  // namespace
}  // namespace zebmediatypes
