#include <gtest/gtest.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <algorithm>
#include <climits>
#include <cmath>
#include <limits>
#include <string>
#include <vector>

#include "audio_layout_test_support.h"

extern "C" {
#include <libavutil/channel_layout.h>
#include <libswresample/swresample.h>
}

namespace zebmediatypes {
namespace {

using Label = AudioChannelLabel;
using testing::ParseLayout;
using Rows = std::vector<std::vector<double>>;

Rows ToRows(const ChannelConversionMatrix& matrix) {
  Rows rows;
  for (const ChannelConversionMatrixRow& row : matrix) rows.emplace_back(row.begin(), row.end());
  return rows;
}

Rows Downmix(const AudioChannelLayout& source, const AudioChannelLayout& destination,
             const DownmixLevels& levels = {}) {
  ChannelConversionMatrix matrix;
  ComputeDownmixMatrix(source, destination, matrix, levels);
  return ToRows(matrix);
}

Rows Routing(const AudioChannelLayout& source, const AudioChannelLayout& destination) {
  ChannelConversionMatrix matrix;
  ComputeChannelConversionMatrix(source, destination, matrix);
  return ToRows(matrix);
}

void ExpectNear(const Rows& ours, const Rows& expected) {
  ASSERT_EQ(ours.size(), expected.size());
  for (std::size_t j = 0; j < ours.size(); ++j) {
    ASSERT_EQ(ours[j].size(), expected[j].size());
    for (std::size_t i = 0; i < ours[j].size(); ++i) {
      EXPECT_NEAR(ours[j][i], expected[j][i], 1e-9) << "row " << j << " column " << i;
    }
  }
}

struct PeerChannel {
  std::uint64_t mask;
  Label label;
};
constexpr PeerChannel kPeerChannels[] = {
    {AV_CH_FRONT_LEFT, Label::FrontLeft},
    {AV_CH_FRONT_RIGHT, Label::FrontRight},
    {AV_CH_FRONT_CENTER, Label::FrontCenter},
    {AV_CH_LOW_FREQUENCY, Label::LowFrequency},
    {AV_CH_BACK_LEFT, Label::BackLeft},
    {AV_CH_BACK_RIGHT, Label::BackRight},
    {AV_CH_FRONT_LEFT_OF_CENTER, Label::FrontLeftOfCenter},
    {AV_CH_FRONT_RIGHT_OF_CENTER, Label::FrontRightOfCenter},
    {AV_CH_BACK_CENTER, Label::BackCenter},
    {AV_CH_SIDE_LEFT, Label::SideLeft},
    {AV_CH_SIDE_RIGHT, Label::SideRight},
};

// The peer's channel order is ascending mask bits; its mono is a front centre,
// ours a Discrete channel.
AudioChannelLayout FromPeerMask(std::uint64_t mask) {
  if (mask == AV_CH_LAYOUT_MONO) return CreateMonoChannelLayout();
  AudioChannelLayout layout;
  for (const PeerChannel& channel : kPeerChannels) {
    if ((mask & channel.mask) != 0) layout.push_back(channel.label);
  }
  return layout;
}

struct PeerLayout {
  const char* name;
  std::uint64_t mask;
};
constexpr PeerLayout kPeerLayouts[] = {
    {"mono", AV_CH_LAYOUT_MONO},
    {"stereo", AV_CH_LAYOUT_STEREO},
    {"2.1", AV_CH_LAYOUT_2POINT1},
    {"3.0", AV_CH_LAYOUT_SURROUND},
    {"3.1", AV_CH_LAYOUT_3POINT1},
    {"4.0", AV_CH_LAYOUT_4POINT0},
    {"quad", AV_CH_LAYOUT_QUAD},
    {"quad side", AV_CH_LAYOUT_2_2},
    {"5.0", AV_CH_LAYOUT_5POINT0_BACK},
    {"5.0 side", AV_CH_LAYOUT_5POINT0},
    {"5.1", AV_CH_LAYOUT_5POINT1_BACK},
    {"5.1 side", AV_CH_LAYOUT_5POINT1},
    {"6.0", AV_CH_LAYOUT_6POINT0},
    {"6.1", AV_CH_LAYOUT_6POINT1},
    {"7.0", AV_CH_LAYOUT_7POINT0},
    {"7.1", AV_CH_LAYOUT_7POINT1},
    {"7.1 wide", AV_CH_LAYOUT_7POINT1_WIDE_BACK},
    {"7.1 wide side", AV_CH_LAYOUT_7POINT1_WIDE},
    {"octagonal", AV_CH_LAYOUT_OCTAGONAL},
};

Rows PeerDownmix(std::uint64_t sourceMask, std::uint64_t destinationMask,
                 const DownmixLevels& levels) {
  AVChannelLayout source{};
  AVChannelLayout destination{};
  av_channel_layout_from_mask(&source, sourceMask);
  av_channel_layout_from_mask(&destination, destinationMask);
  constexpr int kStride = 64;
  std::vector<double> matrix(kStride * kStride);
  // Without normalizing, the peer's own ceiling for float output.
  const int status = swr_build_matrix2(&source, &destination, levels.center, levels.surround,
                                       levels.lfe, levels.normalize ? 1.0 : double{INT_MAX}, 1.0,
                                       matrix.data(), kStride, AV_MATRIX_ENCODING_NONE, nullptr);
  EXPECT_EQ(status, 0);
  Rows rows(static_cast<std::size_t>(destination.nb_channels));
  for (std::size_t j = 0; j < rows.size(); ++j) {
    const auto begin = matrix.begin() + static_cast<std::ptrdiff_t>(j * kStride);
    rows[j].assign(begin, begin + source.nb_channels);
  }
  return rows;
}

TEST(ComputeDownmixMatrix, EqualsLibswresampleForEveryCommonDownmix) {
  const DownmixLevels kLevels[] = {
      {},
      {0.7071067811865476, 0.7071067811865476, 0.0, false},
      {0.5, 0.5946035575013605, 1.0, true},
      {1.0, 0.0, 0.3162277660168379, false},
  };
  ChannelConversionMatrix matrix;  // reused: every shape in turn replaces the last
  for (const DownmixLevels& levels : kLevels) {
    for (const PeerLayout& from : kPeerLayouts) {
      const AudioChannelLayout source = FromPeerMask(from.mask);
      for (const PeerLayout& to : kPeerLayouts) {
        const AudioChannelLayout destination = FromPeerMask(to.mask);
        if (destination.size() > source.size()) continue;
        SCOPED_TRACE(std::string(from.name) + " -> " + to.name + " centre " +
                     std::to_string(levels.center) + " normalize " +
                     std::to_string(levels.normalize));
        ComputeDownmixMatrix(source, destination, matrix, levels);
        ExpectNear(ToRows(matrix), PeerDownmix(from.mask, to.mask, levels));
      }
    }
  }
}

// Where the header says the down-mix applies.
bool DownmixApplies(const AudioChannelLayout& source, const AudioChannelLayout& destination) {
  const auto folds = [](const AudioChannelLayout& layout) {
    if (layout.size() == 1 && layout[0].label == Label::Discrete) return true;
    return std::all_of(layout.begin(), layout.end(), [&](AudioChannelDescription c) {
      const std::string text = testing::LabelText(c.label);
      const Label partner = LeftRightPair(c.label);
      return std::count(layout.begin(), layout.end(), c) == 1 &&
             std::string(" L R C LFE Ls Rs Cs Lc Rc Lsd Rsd Rls Rrs ").find(" " + text + " ") !=
                 std::string::npos &&
             (partner == Label::Discrete || partner == Label::LFE2 ||
              HasChannelLabel(layout, partner));
    });
  };
  const bool front = destination == CreateMonoChannelLayout() ||
                     HasChannelLabel(destination, Label::FrontCenter) ||
                     HasChannelLabel(destination, Label::FrontLeft);
  return !destination.empty() && destination.size() <= source.size() && folds(source) &&
         folds(destination) && front;
}

// The index of the mirror image of channel k: its left/right partner, or k.
std::size_t Mirror(const AudioChannelLayout& layout, std::size_t k) {
  const auto partner = std::find(layout.begin(), layout.end(),
                                 AudioChannelDescription(LeftRightPair(layout[k].label)));
  return partner == layout.end() ? k : static_cast<std::size_t>(partner - layout.begin());
}

TEST(ComputeDownmixMatrix, EveryPairOfNamedLayoutsFoldsEveryChannelWithinFullScale) {
  std::size_t downmixes = 0;
  testing::ForEachPairOfNamedLayouts(
      [&](const AudioChannelLayout& source, const AudioChannelLayout& destination) {
        const Rows rows = Downmix(source, destination);
        if (!DownmixApplies(source, destination)) {
          EXPECT_EQ(rows, Routing(source, destination));
          return;
        }
        ++downmixes;
        ASSERT_EQ(rows.size(), destination.size());
        std::vector<bool> reached(source.size(), false);
        for (std::size_t j = 0; j < rows.size(); ++j) {
          double sum = 0.0;
          for (std::size_t i = 0; i < source.size(); ++i) {
            ASSERT_TRUE(std::isfinite(rows[j][i]));
            sum += std::fabs(rows[j][i]);
            reached[i] = reached[i] || rows[j][i] != 0.0;
            EXPECT_EQ(rows[j][i], rows[Mirror(destination, j)][Mirror(source, i)]);
          }
          EXPECT_LE(sum, 1.0 + 1e-12) << "row " << j;
        }
        for (std::size_t i = 0; i < source.size(); ++i) {
          EXPECT_TRUE(reached[i] || source[i].label == Label::LowFrequency) << "channel " << i;
        }
      });
  EXPECT_EQ(downmixes, 1616u);
}

TEST(ComputeDownmixMatrix, FoldsRearSurroundsAndFallsBackWhereNoFoldApplies) {
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
      {"L R C LFE Ls Rs Rls Rrs",
       "L R C LFE Lsd Rsd",
       kAsIs,
       {{1, 0, 0, 0, 0, 0, 0, 0},
        {0, 1, 0, 0, 0, 0, 0, 0},
        {0, 0, 1, 0, 0, 0, 0, 0},
        {0, 0, 0, 1, 0, 0, 0, 0},
        {0, 0, 0, 0, 1, 0, r, 0},
        {0, 0, 0, 0, 0, 1, 0, r}}},
      {"L R C Rls Rrs",
       "L R C Ls Rs",
       kAsIs,
       {{1, 0, 0, 0, 0}, {0, 1, 0, 0, 0}, {0, 0, 1, 0, 0}, {0, 0, 0, 1, 0}, {0, 0, 0, 0, 1}}},
      {"L R Rls Rrs", "Cs C", kAsIs, {{0, 0, r, r}, {r, r, 0, 0}}},
      // Normalizing only ever scales down.
      {"Ls Rs Lsd Rsd", "L R", {r, 0.25, 0.0, true}, {{0.25, 0, 0.25, 0}, {0, 0.25, 0, 0.25}}},
      // Levels that are not finite count as 0; a negative one counts at its size.
      {"L R C LFE Ls Rs",
       "L R",
       {kNaN, kInf, -kInf, true},
       {{1, 0, 0, 0, 0, 0}, {0, 1, 0, 0, 0, 0}}},
      {"L R C LFE Ls Rs",
       "L R",
       {1.0, 1.0, -2 * r, true},
       {{0.25, 0, 0.25, -0.25, 0.25, 0}, {0, 0.25, 0.25, -0.25, 0, 0.25}}},
      // Lopsided, repeated, wide, empty, Discrete: the routing matrix.
      {"L R C Ls", "L R", {}, {}},
      {"L R L R", "L R", {}, {}},
      {"L R Lw Rw", "L R", {}, {}},
      {"L R C", "", {}, {}},
      {"* * *", "*", {}, {}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.source) + " -> " + c.destination);
    const AudioChannelLayout source = ParseLayout(c.source);
    const AudioChannelLayout destination = ParseLayout(c.destination);
    const Rows expected = c.rows.empty() ? Routing(source, destination) : c.rows;
    ExpectNear(Downmix(source, destination, c.levels), expected);
  }
}

}  // namespace
}  // namespace zebmediatypes
