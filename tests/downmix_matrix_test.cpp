#include <gtest/gtest.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <climits>
#include <cmath>
#include <limits>
#include <random>
#include <vector>

#include "audio_layout_test_support.h"

extern "C" {
#include <libavutil/channel_layout.h>
#include <libswresample/swresample.h>
}

namespace zebmediatypes {
namespace {

using Rows = std::vector<std::vector<double>>;
using testing::LayoutText;
using testing::ParseLayout;

template <class Matrix, class Expected>
void ExpectNear(const Matrix& ours, const Expected& expected) {
  ASSERT_EQ(ours.size(), expected.size());
  for (std::size_t j = 0; j < ours.size(); ++j) {
    ASSERT_EQ(ours[j].size(), expected[j].size());
    for (std::size_t i = 0; i < ours[j].size(); ++i) {
      EXPECT_NEAR(ours[j][i], expected[j][i], 1e-9) << "row " << j << " column " << i;
    }
  }
}

// Our labels for the peer's channel bits 0 to 10 (FL FR FC LFE BL BR FLC FRC BC
// SL SR), in the peer's channel order; the peer's mono is a front centre, ours
// a Discrete channel.
AudioChannelLayout FromPeerMask(std::uint64_t mask) {
  if (mask == AV_CH_LAYOUT_MONO) return CreateMonoChannelLayout();
  const AudioChannelLayout byBit = ParseLayout("L R C LFE Ls Rs Lc Rc Cs Lsd Rsd");
  AudioChannelLayout layout;
  for (std::size_t bit = 0; bit < byBit.size(); ++bit) {
    if ((mask >> bit) & 1) layout.push_back(byBit[bit]);
  }
  return layout;
}

Rows PeerDownmix(std::uint64_t sourceMask, std::uint64_t destinationMask,
                 const DownmixLevels& levels) {
  AVChannelLayout source{};
  AVChannelLayout destination{};
  av_channel_layout_from_mask(&source, sourceMask);
  av_channel_layout_from_mask(&destination, destinationMask);
  std::vector<double> matrix(64 * 64);
  // Without normalizing, the peer's own ceiling for float output.
  EXPECT_EQ(swr_build_matrix2(&source, &destination, levels.center, levels.surround, levels.lfe,
                              levels.normalize ? 1.0 : double{INT_MAX}, 1.0, matrix.data(), 64,
                              AV_MATRIX_ENCODING_NONE, nullptr),
            0);
  Rows rows;
  for (int j = 0; j < destination.nb_channels; ++j) {
    rows.emplace_back(matrix.begin() + j * 64, matrix.begin() + j * 64 + source.nb_channels);
  }
  return rows;
}

TEST(ComputeDownmixMatrix, EqualsLibswresampleForEveryCommonDownmix) {
  std::istringstream names(
      "mono stereo 2.1 3.0 3.1 4.0 quad quad(side) 5.0 5.0(side) 5.1 5.1(side) 6.0 6.1 7.0 7.1 "
      "7.1(wide) 7.1(wide-side) octagonal");
  std::vector<std::uint64_t> masks;
  for (std::string name; names >> name;) {
    AVChannelLayout layout{};
    ASSERT_EQ(av_channel_layout_from_string(&layout, name.c_str()), 0) << name;
    masks.push_back(layout.u.mask);
  }
  const DownmixLevels kLevels[] = {
      {},
      {0.7071067811865476, 0.7071067811865476, 0.0, false},
      {0.5, 0.5946035575013605, 1.0, true},
      {1.0, 0.0, 0.3162277660168379, false},
  };
  ChannelConversionMatrix matrix;  // reused: every shape in turn replaces the last
  for (const DownmixLevels& levels : kLevels) {
    for (std::uint64_t from : masks) {
      const AudioChannelLayout source = FromPeerMask(from);
      for (std::uint64_t to : masks) {
        const AudioChannelLayout destination = FromPeerMask(to);
        if (destination.size() > source.size()) continue;
        SCOPED_TRACE(LayoutText(source) + " -> " + LayoutText(destination) + " at " +
                     std::to_string(levels.center));
        ComputeDownmixMatrix(source, destination, matrix, levels);
        ExpectNear(matrix, PeerDownmix(from, to, levels));
      }
    }
  }
}

// The index of the mirror image of channel k: its left/right partner, or k.
std::size_t Mirror(const AudioChannelLayout& layout, std::size_t k) {
  const auto partner = std::find(layout.begin(), layout.end(),
                                 AudioChannelDescription(LeftRightPair(layout[k].label)));
  return partner == layout.end() ? k : static_cast<std::size_t>(partner - layout.begin());
}

// Where the down-mix differs from the routing matrix: finite, symmetric, every
// channel but the LFE folded in, no row above full scale. Returns whether it
// differs.
bool ExpectDownmixProperties(const AudioChannelLayout& source,
                             const AudioChannelLayout& destination) {
  ChannelConversionMatrix rows;
  ChannelConversionMatrix routing;
  ComputeDownmixMatrix(source, destination, rows);
  ComputeChannelConversionMatrix(source, destination, routing);
  if (rows == routing) return false;
  std::vector<bool> reached(source.size(), false);
  for (std::size_t j = 0; j < rows.size(); ++j) {
    double sum = 0.0;
    for (std::size_t i = 0; i < source.size(); ++i) {
      EXPECT_TRUE(std::isfinite(rows[j][i]));
      sum += std::fabs(rows[j][i]);
      reached[i] = reached[i] || rows[j][i] != 0.0;
      EXPECT_EQ(rows[j][i], rows[Mirror(destination, j)][Mirror(source, i)]);
    }
    EXPECT_LE(sum, 1.0 + 1e-12) << "row " << j;
  }
  for (std::size_t i = 0; i < source.size(); ++i) {
    EXPECT_TRUE(reached[i] || source[i].label == AudioChannelLabel::LowFrequency)
        << "channel " << i;
  }
  return true;
}

TEST(ComputeDownmixMatrix, EveryPairOfNamedLayoutsFoldsEveryChannelWithinFullScale) {
  std::size_t downmixes = 0;
  testing::ForEachPairOfNamedLayouts(
      [&](const AudioChannelLayout& source, const AudioChannelLayout& destination) {
        downmixes += ExpectDownmixProperties(source, destination);
      });
  // A fold applied or skipped where it should not be changes the count.
  EXPECT_EQ(downmixes, 1413u);
}

TEST(ComputeDownmixMatrix, EveryPairOfFoldableSpeakerSetsInAnyOrderFoldsWithinFullScaleExhaustive) {
  const std::string kGroups[] = {"L R", "C", "LFE", "Ls Rs", "Cs", "Lc Rc", "Lsd Rsd", "Rls Rrs"};
  std::mt19937 random(20261207);
  std::vector<AudioChannelLayout> layouts;
  for (unsigned set = 1; set < 1u << std::size(kGroups); ++set) {
    std::string text;
    for (std::size_t k = 0; k < std::size(kGroups); ++k) {
      if ((set >> k) & 1) text += " " + kGroups[k];
    }
    layouts.push_back(ParseLayout(text));
    std::shuffle(layouts.back().begin(), layouts.back().end(), random);
  }
  std::size_t downmixes = 0;
  for (const AudioChannelLayout& source : layouts) {
    for (const AudioChannelLayout& destination : layouts) {
      SCOPED_TRACE(LayoutText(source) + " -> " + LayoutText(destination));
      downmixes += ExpectDownmixProperties(source, destination);
      if (::testing::Test::HasFailure()) return;
    }
  }
  // A fold applied or skipped where it should not be changes the count.
  EXPECT_EQ(downmixes, 24053u);
}

TEST(ComputeDownmixMatrix, FoldsRearSurroundsKeepsLevelsInRangeAndFallsBackWhereNoFoldApplies) {
  constexpr double r = 0.7071067811865476;
  constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
  constexpr double kInf = std::numeric_limits<double>::infinity();
  const DownmixLevels kAsIs{r, r, 0.0, false};
  struct Case {
    const char* source;
    const char* destination;
    DownmixLevels levels;
    Rows rows;  // empty: the routing matrix
  };
  const Case kCases[] = {
      {"L R C LFE Ls Rs Rls Rrs",
       "L R",
       kAsIs,
       {{1, 0, r, 0, r, 0, r, 0}, {0, 1, r, 0, 0, r, 0, r}}},
      // A centre without a front pair beside it spreads at -3 dB, whatever the level.
      {"C Ls Rs", "L R", {0.5, r, 0.0, false}, {{r, r, 0}, {r, 0, r}}},
      // Levels that are not finite count as 0; a negative one counts at its size.
      {"L R C LFE Ls Rs",
       "L R",
       {kNaN, kInf, -kInf, true},
       {{1, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0}}},
      {"L R C LFE Ls Rs",
       "L R",
       {1, 1, -2 * r, true},
       {{0.25, 0, 0.25, -0.25, 0.25, 0}, {0, 0.25, 0.25, -0.25, 0, 0.25}}},
      // Lopsided or Discrete: the routing matrix.
      {"L R C Ls", "L R", {}, {}},
      {"* * *", "*", {}, {}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    const AudioChannelLayout source = ParseLayout(c.source);
    const AudioChannelLayout destination = ParseLayout(c.destination);
    ChannelConversionMatrix ours;
    ChannelConversionMatrix routing;
    ComputeDownmixMatrix(source, destination, ours, c.levels);
    ComputeChannelConversionMatrix(source, destination, routing);
    if (c.rows.empty()) {
      EXPECT_EQ(ours, routing);
    } else {
      ExpectNear(ours, c.rows);
    }
  }
}

}  // namespace
}  // namespace zebmediatypes
