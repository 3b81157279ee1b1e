#include <gtest/gtest.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <vector>

#include "audio_layout_test_support.h"

namespace zebmediatypes {
namespace {

using testing::ParseLayout;
using Rows = std::vector<std::vector<double>>;

Rows ComputeRows(const AudioChannelLayout& source, const AudioChannelLayout& destination) {
  ChannelConversionMatrix matrix;
  ComputeChannelConversionMatrix(source, destination, matrix);
  Rows rows;
  for (const ChannelConversionMatrixRow& row : matrix) rows.emplace_back(row.begin(), row.end());
  return rows;
}

Rows Identity(std::size_t sourceCount, std::size_t destinationCount) {
  Rows rows(destinationCount, std::vector<double>(sourceCount, 0.0));
  for (std::size_t k = 0; k < sourceCount && k < destinationCount; ++k) rows[k][k] = 1.0;
  return rows;
}

constexpr double kHalf = 0.5;
constexpr double kSixth = 1.0 / 6.0;

TEST(ComputeChannelConversionMatrix, RoutesByLabelThenNearnessThenOrdinal) {
  struct Case {
    const char* source;
    const char* destination;
    Rows rows;
  };
  const Case kCases[] = {
      {"L R C LFE Ls Rs", "L R", {{1, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0}}},
      // 7.1 into 5.1: the centre-front pair is dropped, nothing is folded in.
      {"L R C LFE Ls Rs Lc Rc", "L R C LFE Ls Rs", Identity(8, 6)},
      {"* * * *", "L R C LFE Ls Rs", Identity(4, 6)},
      {"L R C LFE Ls Rs", "*", {{kSixth, kSixth, kSixth, kSixth, kSixth, kSixth}}},
      // An exact label beats a nearer-looking neighbour seen first.
      {"Lw L", "L", {{0, 1}}},
      // LFE is fed only from its own label, never from LFE2.
      {"L R LFE2", "LFE LFE2", {{0, 0, 0}, {0, 0, 1}}},
      // Discrete destination channels match Discrete sources by ordinal.
      {"L * * R", "* C *", {{0, 1, 0, 0}, {kHalf, 0, 0, kHalf}, {0, 0, 1, 0}}},
      {"", "*", {{}}},
      // A labelled mono source feeds every Discrete destination channel.
      {"LFE", "* *", {{1}, {1}}},
      // Discrete sources share a single labelled channel; an LFE reaches only an LFE.
      {"* LFE *", "C", {{kHalf, 0, kHalf}}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    EXPECT_EQ(ComputeRows(ParseLayout(c.source), ParseLayout(c.destination)), c.rows);
  }
}

// One row per destination channel, one entry per source channel, every row
// either silent or 1/n on exactly n entries.
void ExpectWellFormed(const AudioChannelLayout& source, const AudioChannelLayout& destination,
                      const Rows& matrix) {
  ASSERT_EQ(matrix.size(), destination.size());
  for (const std::vector<double>& row : matrix) {
    ASSERT_EQ(row.size(), source.size());
    const auto fed = static_cast<double>(
        std::count_if(row.begin(), row.end(), [](double gain) { return gain != 0.0; }));
    for (double gain : row) ASSERT_TRUE(gain == 0.0 || gain == 1.0 / fed) << gain;
  }
}

bool IsLowFrequency(AudioChannelLabel label) {
  return label == AudioChannelLabel::LowFrequency || label == AudioChannelLabel::LFE2;
}

// Outside the identity fallback (both sides multichannel, one side unlabelled)
// no row is silent when either side is mono, nor a speaker row when the source
// has a speaker; a low-frequency channel is fed only from its own label (or
// from a mono source).
TEST(ComputeChannelConversionMatrix, EveryPairOfNamedLayoutsSplitsEquallyAndFeedsEverySpeaker) {
  testing::ForEachPairOfNamedLayouts(
      [](const AudioChannelLayout& source, const AudioChannelLayout& destination) {
        const Rows rows = ComputeRows(source, destination);
        ExpectWellFormed(source, destination, rows);
        EXPECT_TRUE(source != destination || rows == Identity(source.size(), source.size()));
        const bool mono = source.size() == 1 || destination.size() == 1;
        if (!mono && (!HasChannelLabeling(source) || !HasChannelLabeling(destination))) return;
        const auto isSpeaker = [](AudioChannelDescription c) {
          return c.label != AudioChannelLabel::Discrete && !IsLowFrequency(c.label);
        };
        const bool sourceHasSpeaker = std::any_of(source.begin(), source.end(), isSpeaker);
        for (std::size_t j = 0; j < destination.size(); ++j) {
          SCOPED_TRACE(j);
          const bool silent = rows[j] == std::vector<double>(source.size(), 0.0);
          EXPECT_FALSE(silent && (mono || (isSpeaker(destination[j]) && sourceHasSpeaker)));
          for (std::size_t i = 0; i < source.size() && source.size() > 1; ++i) {
            EXPECT_TRUE(!IsLowFrequency(destination[j].label) || rows[j][i] == 0.0 ||
                        source[i] == destination[j]);
          }
        }
      });
}

}  // namespace
}  // namespace zebmediatypes
