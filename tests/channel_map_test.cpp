#include <gtest/gtest.h>
#include <zebmediatypes/channel_map.h>

#include <limits>
#include <vector>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;

AudioChannelLayout Layout(std::initializer_list<AudioChannelLabel> labels) {
  AudioChannelLayout layout;
  for (AudioChannelLabel label : labels) layout.push_back(label);
  return layout;
}

std::vector<int> Mappings(const ChannelMap& map) {
  std::vector<int> mappings;
  for (int k = 0; k < map.GetNumberOfChannels(); ++k) mappings.push_back(map[k]);
  return mappings;
}

TEST(ChannelMap, CreateDefaultChannelMapRoutesEachChannelToItself) {
  struct Case {
    int count;
    AudioChannelLayout labels;
  };
  const Case kCases[] = {
      {-3, {}},
      {0, {}},
      {1, Layout({L::Discrete})},
      {2, Layout({L::FrontLeft, L::FrontRight})},
      {4, Layout({L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency})},
      {6, CreateBroadcast51ChannelLayout()},
      {9, Layout({L::FrontLeft, L::FrontRight, L::FrontCenter, L::LowFrequency, L::BackLeft,
                  L::BackRight, L::FrontLeftOfCenter, L::FrontRightOfCenter, L::BackCenter})},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.count);
    const ChannelMap map = ChannelMap::CreateDefaultChannelMap(c.count);
    ASSERT_EQ(map.GetNumberOfChannels(), static_cast<int>(c.labels.size()));
    for (int k = 0; k < map.GetNumberOfChannels(); ++k) {
      EXPECT_EQ(map[k], k);
      EXPECT_EQ(map.GetChannelLayout(k), Layout({c.labels[static_cast<std::size_t>(k)].label}));
    }
    EXPECT_EQ(map.GetNumberOfAssignments(), map.GetNumberOfChannels());
  }
}

TEST(ChannelMap, ChannelsBeyondTheDefaultOrderCarryTheUnknownLabel) {
  const ChannelMap map(40);
  ASSERT_EQ(map.GetNumberOfChannels(), 40);
  EXPECT_EQ(map.GetChannelLayout(35), Layout({L::ProximityRight}));
  EXPECT_EQ(map.GetChannelLayout(12), Layout({L::TopFrontLeft}));
  EXPECT_EQ(map.GetChannelLayout(13), Layout({L::TopFrontCenter}));
  for (int k = 36; k < 40; ++k)
    EXPECT_EQ(map.GetChannelLayout(k), Layout({kChannelMapUnknownLabel}));
  EXPECT_EQ(Mappings(map), std::vector<int>(40, -1));
  EXPECT_EQ(map.GetNumberOfAssignments(), 0);
  EXPECT_EQ(map.Find(0), -1);
}

TEST(ChannelMap, InvalidIndexesGiveNeutralResults) {
  ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  const ChannelMap before = map;
  constexpr int kBad[] = {-1, 2, std::numeric_limits<int>::min(), std::numeric_limits<int>::max()};
  for (int k : kBad) {
    SCOPED_TRACE(k);
    EXPECT_EQ(map[k], -1);
    EXPECT_TRUE(map.GetChannelLayout(k).empty());
    map.SetChannel(k, 7);
    AudioChannelLayout labels = Layout({L::FrontCenter});
    map.SetChannelLayout(k, labels);
    EXPECT_EQ(map, before);
  }
  for (int labelIndex :
       {-1, 36, std::numeric_limits<int>::min(), std::numeric_limits<int>::max()}) {
    EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(labelIndex),
              kSourceChannelIndex_OutOfRange);
  }
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(1), 1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabelIndex(2), kSourceChannelIndex_NoMatch);
}

TEST(ChannelMap, SourceIndexIsTheMappingOfTheFirstChannelCarryingTheLabel) {
  ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontRight), 1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontCenter), -1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(kChannelMapUnknownLabel), -1);
  map.SetChannel(1, -1);
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontRight), -1);
  map.AddChannel(Layout({L::FrontRight}), 4);  // a later channel does not win
  EXPECT_EQ(map.GetSourceChannelIndexForChannelLabel(L::FrontRight), -1);
  EXPECT_EQ(map.Find(4), 2);
}

TEST(ChannelMap, NumberOfAssignmentsCountsTheLabelsOfEachRoutedChannel) {
  // Channel 0 carries two labels routed to 1; channel 1 one label, unrouted.
  ChannelMap crossed;
  crossed.AddChannel(Layout({L::FrontLeft, L::FrontRight}), 1);
  crossed.AddChannel(Layout({L::FrontCenter}), -1);
  EXPECT_EQ(crossed.GetNumberOfAssignments(), 2);

  // A channel routed beyond the map's own channel count is still routed.
  ChannelMap far;
  far.AddChannel(Layout({L::FrontLeft}), 5);
  EXPECT_EQ(far.GetNumberOfAssignments(), 1);

  ChannelMap swapped = ChannelMap::CreateDefaultChannelMap(2);
  AudioChannelLayout two = Layout({L::FrontLeft, L::BackLeft});
  swapped.SetChannelLayout(0, two);
  swapped.SetChannel(0, 1);
  swapped.SetChannel(1, 0);
  EXPECT_EQ(swapped.GetNumberOfAssignments(), 3);
  EXPECT_EQ(ChannelMap(3).GetNumberOfAssignments(), 0);
}

TEST(ChannelMap, SetDeviceChannelIndexMovesTheLabel) {
  struct Case {
    int deviceIndex;
    std::vector<AudioChannelLayout> labels;
    std::vector<int> mappings;
  };
  const Case kCases[] = {
      {1, {Layout({L::FrontRight, L::FrontLeft})}, {1}},
      {5, {Layout({L::FrontRight}), Layout({L::FrontLeft})}, {1, 5}},
      {-1, {Layout({L::FrontRight})}, {1}},
      // Its own channel goes away first, so the label comes back as a new last channel.
      {0, {Layout({L::FrontRight}), Layout({L::FrontLeft})}, {1, 0}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.deviceIndex);
    ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
    map.SetDeviceChannelIndexForChannelLabel(L::FrontLeft, c.deviceIndex);
    ASSERT_EQ(map.GetNumberOfChannels(), static_cast<int>(c.labels.size()));
    for (int k = 0; k < map.GetNumberOfChannels(); ++k) {
      EXPECT_EQ(map.GetChannelLayout(k), c.labels[static_cast<std::size_t>(k)]);
    }
    EXPECT_EQ(Mappings(map), c.mappings);
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
  EXPECT_EQ(GetChannelMapDefaultLabel(36), kChannelMapUnknownLabel);
  EXPECT_EQ(GetChannelMapDefaultLabel(-1), kChannelMapUnknownLabel);
}

TEST(ChannelMap, EqualityComparesLabelsAndMappings) {
  const ChannelMap a = ChannelMap::CreateDefaultChannelMap(2);
  ChannelMap b(Layout({L::BackLeft, L::BackRight}));
  b.SetChannel(0, 0);
  b.SetChannel(1, 1);
  EXPECT_TRUE(a.IsMappingEqual(b));
  EXPECT_NE(a, b);
}

}  // namespace
}  // namespace zebmediatypes
