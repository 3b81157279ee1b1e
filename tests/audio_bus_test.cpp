#include <gtest/gtest.h>
#include <zebmediatypes/audio_bus.h>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;
using Bus = AudioBusDescription;

TEST(AudioBusDescription, FactoriesGiveTheNamedLayouts) {
  struct Case {
    Bus bus;
    AudioChannelLayout layout;
  };
  const Case kCases[] = {
      {Bus::CreateMono(u"m", Bus::Main), CreateMonoChannelLayout()},
      {Bus::CreateStereo(u"s", Bus::Auxiliary), CreateStereoChannelLayout()},
      {Bus::CreateSurround51(u"5", Bus::Main), CreateBroadcast51ChannelLayout()},
      {Bus::CreateSurround71(u"7", Bus::Main), Create7_1ChannelLayout()},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.layout.size());
    EXPECT_EQ(c.bus.GetLayout(), c.layout);
    EXPECT_EQ(c.bus.GetChannelCount(), c.layout.size());
  }
  EXPECT_EQ(kCases[3].bus.GetLayout().back(), AudioChannelDescription(L::FrontRightOfCenter));
  EXPECT_EQ(kCases[2].bus.GetLayout()[3], AudioChannelDescription(L::LowFrequency));
  EXPECT_EQ(kCases[1].bus.GetType(), Bus::Auxiliary);
  EXPECT_EQ(kCases[1].bus.GetName(), zebcore::UTF16String(u"s"));
}

TEST(AudioBusDescription, DefaultIsAnEmptyMainBus) {
  const Bus bus;
  EXPECT_TRUE(bus.GetName().empty());
  EXPECT_EQ(bus.GetChannelCount(), 0u);
  EXPECT_EQ(bus.GetType(), Bus::Main);
}

TEST(AudioBusDescription, EquivalenceLooksAtLayoutsOnly) {
  const Bus stereo = Bus::CreateStereo(u"Main", Bus::Main);
  const Bus sideChain = Bus::CreateStereo(u"Side", Bus::Auxiliary);
  const Bus discrete(u"Main", CreateMultichannelLayout(2), Bus::Main);
  EXPECT_NE(stereo, sideChain);
  EXPECT_TRUE(stereo.IsEquivalent(sideChain, true));
  EXPECT_TRUE(stereo.IsEquivalent(sideChain, false));
  EXPECT_TRUE(stereo.IsEquivalent(discrete, false));
  EXPECT_FALSE(stereo.IsEquivalent(discrete, true));
  EXPECT_FALSE(stereo.IsEquivalent(Bus::CreateMono(u"Main", Bus::Main), false));
}

TEST(AudioBusDescription, ListsAreEquivalentPositionByPosition) {
  const Bus stereo = Bus::CreateStereo(u"a", Bus::Main);
  const Bus mono = Bus::CreateMono(u"b", Bus::Auxiliary);
  const Bus discrete(u"c", CreateMultichannelLayout(2), Bus::Main);
  EXPECT_TRUE(AreAudioBusDescriptionsEquivalent({}, {}, true));
  EXPECT_TRUE(AreAudioBusDescriptionsEquivalent(
      {stereo, mono}, {Bus::CreateStereo(u"x", Bus::Auxiliary), mono}, true));
  EXPECT_FALSE(AreAudioBusDescriptionsEquivalent({stereo, mono}, {mono, stereo}, false));
  EXPECT_FALSE(AreAudioBusDescriptionsEquivalent({stereo}, {stereo, stereo}, false));
  EXPECT_FALSE(AreAudioBusDescriptionsEquivalent({stereo}, {discrete}, true));
  EXPECT_TRUE(AreAudioBusDescriptionsEquivalent({stereo}, {discrete}, false));
}

TEST(AudioBusDescription, CopyAssignmentAndSwapExchangeEveryField) {
  Bus a = Bus::CreateSurround51(u"five", Bus::Main);
  Bus b = Bus::CreateMono(u"one", Bus::Auxiliary);
  const Bus a0 = a, b0 = b;
  swap(a, b);
  EXPECT_EQ(a, b0);
  EXPECT_EQ(b, a0);
  a = a;
  EXPECT_EQ(a, b0);
  a = b;
  EXPECT_EQ(a, a0);
  a.SetType(static_cast<Bus::Type>(7));  // stored unchecked
  EXPECT_EQ(static_cast<std::uint32_t>(a.GetType()), 7u);
}

}  // namespace
}  // namespace zebmediatypes
