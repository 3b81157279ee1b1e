#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/channel_map.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;
using Channel = std::pair<AudioChannelLayout, int>;  // a channel's labels and its mapping

std::vector<Channel> Channels(const ChannelMap& map) {
  std::vector<Channel> channels;
  for (int k = 0; k < map.GetNumberOfChannels(); ++k) {
    channels.emplace_back(map.GetChannelLayout(k), map[k]);
  }
  return channels;
}

// The default map routes each channel to itself under the default labels (a
// single channel is Discrete); huge counts are reported and clamped.
TEST(ChannelMap, CreateDefaultChannelMapRoutesEachChannelToItself) {
  for (int count : {-3, 1, 6, 40, 1025}) {
    SCOPED_TRACE(count);
    zebcore::debug::ScopedAssertionCapture capture;
    const std::vector<Channel> channels = Channels(ChannelMap::CreateDefaultChannelMap(count));
    EXPECT_EQ(channels.size(), static_cast<std::size_t>(std::clamp(count, 0, 1024)));
    EXPECT_EQ(capture.Count(), count > 1024 ? 1u : 0u);
    for (int k = 0; k < static_cast<int>(channels.size()); ++k) {
      const L label = count == 1 ? L::Discrete : GetChannelMapDefaultLabel(k);
      EXPECT_EQ(channels[static_cast<std::size_t>(k)], Channel({label}, k));
    }
  }
}

TEST(ChannelMap, InvalidIndexesGiveNeutralResults) {
  ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  const ChannelMap before = map;
  for (int k : {-1, 2, 36}) {
    SCOPED_TRACE(k);
    EXPECT_EQ(map[k], -1);
    map.SetChannel(k, 7);
    EXPECT_EQ(map, before);
  }
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(36), kSourceChannelIndex_OutOfRange);
}

// Two labels routed to channel 5 and one unrouted: the first channel carrying
// a label gives its source index, and the routed labels are counted.
TEST(ChannelMap, FirstChannelCarryingALabelGivesItsSourceIndex) {
  ChannelMap map;
  map.AddChannel({L::FrontLeft, L::FrontCenter}, 0);
  map.AddChannel({L::FrontRight}, -1);
  map.AddChannel({L::FrontRight}, 4);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontRight), -1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontCenter), 0);
  EXPECT_EQ(map.Find(4), 2);
  EXPECT_EQ(map.GetNumberOfAssignments(), 3);
}

// At 0 its own channel goes away first, so the label comes back as a new last channel.
TEST(ChannelMap, SetDeviceChannelIndexMovesTheLabel) {
  struct Case {
    int deviceIndex;
    std::vector<Channel> channels;
  };
  const Case kCases[] = {
      {1, {{{L::FrontRight, L::FrontLeft}, 1}}},
      {-1, {{{L::FrontRight}, 1}}},
      {0, {{{L::FrontRight}, 1}, {{L::FrontLeft}, 0}}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.deviceIndex);
    ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
    map.SetDeviceChannelIndexForChannelLabel(L::FrontLeft, c.deviceIndex);
    EXPECT_EQ(Channels(map), c.channels);
  }
}

}  // namespace
}  // namespace zebmediatypes
