#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/channel_map.h>

#include <limits>
#include <utility>
#include <vector>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;
using Channel = std::pair<AudioChannelLayout, int>;  // a channel's labels and its mapping
constexpr int kIntMin = std::numeric_limits<int>::min();
constexpr int kIntMax = std::numeric_limits<int>::max();

std::vector<Channel> Channels(const ChannelMap& map) {
  std::vector<Channel> channels;
  for (int k = 0; k < map.GetNumberOfChannels(); ++k)
    channels.emplace_back(map.GetChannelLayout(k), map[k]);
  return channels;
}

ChannelMap MapOf(const std::vector<Channel>& channels) {
  ChannelMap map;
  for (const auto& [labels, mapping] : channels) map.AddChannel(labels, mapping);
  return map;
}

TEST(ChannelMap, CreateDefaultChannelMapRoutesEachChannelToItself) {
  // clang-format off
  const std::pair<int, std::vector<AudioChannelLabel>> kCases[] = {
      {-3, {}}, {0, {}}, {1, {L::Discrete}}, {2, {L::FrontLeft, L::FrontRight}},
      {4, {L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency}},
      {6, {L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency, L::BackLeft, L::BackRight}},
  };
  // clang-format on
  for (const auto& [count, labels] : kCases) {
    SCOPED_TRACE(count);
    std::vector<Channel> expected;
    for (AudioChannelLabel label : labels)
      expected.emplace_back(AudioChannelLayout{label}, static_cast<int>(expected.size()));
    const ChannelMap map = ChannelMap::CreateDefaultChannelMap(count);
    EXPECT_EQ(Channels(map), expected);
    EXPECT_EQ(map.GetNumberOfAssignments(), map.GetNumberOfChannels());
  }
}

TEST(ChannelMap, ChannelsBeyondTheDefaultOrderCarryTheUnknownLabel) {
  const std::vector<Channel> channels = Channels(ChannelMap(40));
  ASSERT_EQ(channels.size(), 40u);
  // clang-format off
  const std::pair<int, AudioChannelLabel> kCases[] = {
      {0, L::FrontLeft}, {6, L::FrontLeftOfCenter}, {8, L::BackCenter}, {12, L::TopFrontLeft},
      {35, L::ProximityRight}, {36, kChannelMapUnknownLabel}, {39, kChannelMapUnknownLabel}};
  // clang-format on
  for (const auto& [k, label] : kCases)
    EXPECT_EQ(channels[static_cast<std::size_t>(k)], Channel({label}, -1)) << k;
  EXPECT_EQ(ChannelMap(40).GetNumberOfAssignments(), 0);
}

TEST(ChannelMap, HugeChannelCountIsReportedAndClamped) {
  for (int count : {static_cast<int>(kAudioChannelCount_Max) + 1, kIntMax}) {
    SCOPED_TRACE(count);
    zebcore::debug::ScopedAssertionCapture capture;
    EXPECT_EQ(ChannelMap::CreateDefaultChannelMap(count).GetNumberOfChannels(),
              static_cast<int>(kAudioChannelCount_Max));
    EXPECT_EQ(capture.Count(), 1u);
  }
}

TEST(ChannelMap, InvalidIndexesGiveNeutralResults) {
  ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  const ChannelMap before = map;
  for (int k : {-1, 2, kIntMin, kIntMax}) {
    SCOPED_TRACE(k);
    EXPECT_EQ(map[k], -1);
    EXPECT_TRUE(map.GetChannelLayout(k).empty());
    map.SetChannel(k, 7);
    map.SetChannelLayout(k, {L::FrontCenter});
    EXPECT_EQ(map, before);
  }
  for (int labelIndex : {-1, 36, kIntMin, kIntMax})
    EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(labelIndex),
              kSourceChannelIndex_OutOfRange);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(1), 1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(2), kSourceChannelIndex_NoMatch);
  EXPECT_EQ(GetChannelMapDefaultLabel(-1), kChannelMapUnknownLabel);
}

TEST(ChannelMap, SourceIndexIsTheMappingOfTheFirstChannelCarryingTheLabel) {
  // A later channel carrying the label does not win.
  const ChannelMap map = MapOf({{{L::FrontLeft}, 0}, {{L::FrontRight}, -1}, {{L::FrontRight}, 4}});
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontRight), -1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(kChannelMapUnknownLabel), -1);
  EXPECT_EQ(map.Find(4), 2);
}

TEST(ChannelMap, NumberOfAssignmentsCountsTheLabelsOfEachRoutedChannel) {
  // Two labels routed to channel 1 and one label unrouted; a mapping beyond the
  // map's own channel count is still routed.
  EXPECT_EQ(
      MapOf({{{L::FrontLeft, L::FrontRight}, 1}, {{L::FrontCenter}, -1}}).GetNumberOfAssignments(),
      2);
  EXPECT_EQ(MapOf({{{L::FrontLeft}, 5}}).GetNumberOfAssignments(), 1);
  EXPECT_EQ(ChannelMap(3).GetNumberOfAssignments(), 0);
}

TEST(ChannelMap, SetDeviceChannelIndexMovesTheLabel) {
  // At 0 its own channel goes away first, so the label comes back as a new last channel.
  // clang-format off
  const std::pair<int, std::vector<Channel>> kCases[] = {
      {1, {{{L::FrontRight, L::FrontLeft}, 1}}},        {-1, {{{L::FrontRight}, 1}}},
      {5, {{{L::FrontRight}, 1}, {{L::FrontLeft}, 5}}}, {0, {{{L::FrontRight}, 1}, {{L::FrontLeft}, 0}}},
  };
  // clang-format on
  for (const auto& [deviceIndex, expected] : kCases) {
    SCOPED_TRACE(deviceIndex);
    ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
    map.SetDeviceChannelIndexForChannelLabel(L::FrontLeft, deviceIndex);
    EXPECT_EQ(Channels(map), expected);
  }
}

TEST(ChannelMap, EveryDefaultLabelCanBeRoutedAnywhereAndFoundAgain) {
  for (int index = 0; index < kChannelMapDefaultLabelCount; ++index) {
    SCOPED_TRACE(index);
    const AudioChannelLabel label = GetChannelMapDefaultLabel(index);
    ChannelMap map = ChannelMap::CreateDefaultChannelMap(8);
    const int device = (index * 7) % 11;
    map.SetDeviceChannelIndexForChannelLabel(label, device);
    EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(label), device);
    EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(index), device);
    map.SetDeviceChannelIndexForChannelLabel(label, -1);
    EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(label), -1);
  }
}

TEST(ChannelMap, EqualityComparesLabelsAndMappings) {
  const ChannelMap back = MapOf({{{L::BackLeft}, 0}, {{L::BackRight}, 1}});
  EXPECT_TRUE(ChannelMap::CreateDefaultChannelMap(2).IsMappingEqual(back));
  EXPECT_NE(ChannelMap::CreateDefaultChannelMap(2), back);
}

}  // namespace
}  // namespace zebmediatypes
