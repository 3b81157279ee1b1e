#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/channel_map.h>

#include <limits>
#include <utility>
#include <vector>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;
constexpr int kIntMin = std::numeric_limits<int>::min();
constexpr int kIntMax = std::numeric_limits<int>::max();

// Each channel's labels and mapping, in channel order.
std::vector<std::pair<AudioChannelLayout, int>> Channels(const ChannelMap& map) {
  std::vector<std::pair<AudioChannelLayout, int>> channels;
  for (int k = 0; k < map.GetNumberOfChannels(); ++k)
    channels.emplace_back(map.GetChannelLayout(k), map[k]);
  return channels;
}

TEST(ChannelMap, CreateDefaultChannelMapRoutesEachChannelToItself) {
  struct Case {
    int count;
    std::vector<AudioChannelLabel> labels;
  };
  // clang-format off
  const Case kCases[] = {
      {-3, {}},
      {0, {}},
      {1, {L::Discrete}},
      {2, {L::FrontLeft, L::FrontRight}},
      {4, {L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency}},
      {6, {L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency, L::BackLeft, L::BackRight}},
      {9, {L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency, L::BackLeft, L::BackRight, L::FrontLeftOfCenter, L::FrontRightOfCenter, L::BackCenter}},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.count);
    std::vector<std::pair<AudioChannelLayout, int>> expected;
    for (AudioChannelLabel label : c.labels)
      expected.emplace_back(AudioChannelLayout{label}, static_cast<int>(expected.size()));
    const ChannelMap map = ChannelMap::CreateDefaultChannelMap(c.count);
    EXPECT_EQ(Channels(map), expected);
    EXPECT_EQ(map.GetNumberOfAssignments(), map.GetNumberOfChannels());
  }
}

TEST(ChannelMap, ChannelsBeyondTheDefaultOrderCarryTheUnknownLabel) {
  const ChannelMap map(40);
  std::vector<std::pair<AudioChannelLayout, int>> expected;
  for (int k = 0; k < 40; ++k)
    expected.emplace_back(AudioChannelLayout{GetChannelMapDefaultLabel(k)}, -1);
  EXPECT_EQ(Channels(map), expected);
  EXPECT_EQ(expected[12].first, AudioChannelLayout{L::TopFrontLeft});
  EXPECT_EQ(expected[35].first, AudioChannelLayout{L::ProximityRight});
  EXPECT_EQ(expected[36].first, AudioChannelLayout{kChannelMapUnknownLabel});
  EXPECT_EQ(map.GetNumberOfAssignments(), 0);
  EXPECT_EQ(map.Find(0), -1);
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
  EXPECT_EQ(GetChannelMapDefaultLabel(36), kChannelMapUnknownLabel);
  EXPECT_EQ(GetChannelMapDefaultLabel(-1), kChannelMapUnknownLabel);
}

TEST(ChannelMap, SourceIndexIsTheMappingOfTheFirstChannelCarryingTheLabel) {
  ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontCenter), -1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(kChannelMapUnknownLabel), -1);
  map.SetChannel(1, -1);
  map.AddChannel({L::FrontRight}, 4);  // a later channel does not win
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontRight), -1);
  EXPECT_EQ(map.Find(4), 2);
}

TEST(ChannelMap, NumberOfAssignmentsCountsTheLabelsOfEachRoutedChannel) {
  ChannelMap crossed;  // two labels routed to 1, then one label unrouted
  crossed.AddChannel({L::FrontLeft, L::FrontRight}, 1);
  crossed.AddChannel({L::FrontCenter}, -1);
  EXPECT_EQ(crossed.GetNumberOfAssignments(), 2);
  ChannelMap far;  // routed beyond the map's own channel count is still routed
  far.AddChannel({L::FrontLeft}, 5);
  EXPECT_EQ(far.GetNumberOfAssignments(), 1);
  ChannelMap swapped = ChannelMap::CreateDefaultChannelMap(2);
  swapped.SetChannelLayout(0, {L::FrontLeft, L::BackLeft});
  swapped.SetChannel(0, 1);
  swapped.SetChannel(1, 0);
  EXPECT_EQ(swapped.GetNumberOfAssignments(), 3);
  EXPECT_EQ(ChannelMap(3).GetNumberOfAssignments(), 0);
}

TEST(ChannelMap, SetDeviceChannelIndexMovesTheLabel) {
  using Channel = std::pair<AudioChannelLayout, int>;
  const std::pair<int, std::vector<Channel>> kCases[] = {
      {1, {{{L::FrontRight, L::FrontLeft}, 1}}},
      {5, {{{L::FrontRight}, 1}, {{L::FrontLeft}, 5}}},
      {-1, {{{L::FrontRight}, 1}}},
      // Its own channel goes away first, so the label comes back as a new last channel.
      {0, {{{L::FrontRight}, 1}, {{L::FrontLeft}, 0}}},
  };
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
  ChannelMap b(AudioChannelLayout{L::BackLeft, L::BackRight});
  b.SetChannel(0, 0);
  b.SetChannel(1, 1);
  EXPECT_TRUE(ChannelMap::CreateDefaultChannelMap(2).IsMappingEqual(b));
  EXPECT_NE(ChannelMap::CreateDefaultChannelMap(2), b);
}

}  // namespace
}  // namespace zebmediatypes
