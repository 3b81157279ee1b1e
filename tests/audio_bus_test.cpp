#include <gtest/gtest.h>
#include <zebmediatypes/audio_bus.h>

namespace zebmediatypes {
namespace {

using Bus = AudioBusDescription;

TEST(AudioBusDescription, FactoriesGiveTheNamedLayouts) {
  EXPECT_EQ(Bus::CreateMono(u"m", Bus::Main).GetLayout(), CreateMonoChannelLayout());
  EXPECT_EQ(Bus::CreateStereo(u"s", Bus::Main).GetLayout(), CreateStereoChannelLayout());
  EXPECT_EQ(Bus::CreateSurround51(u"5", Bus::Main).GetLayout(), CreateBroadcast51ChannelLayout());
  // 7.1 ends in Lc Rc, not in the ITU order.
  EXPECT_EQ(Bus::CreateSurround71(u"7", Bus::Main).GetLayout(), Create7_1ChannelLayout());
}

TEST(AudioBusDescription, EquivalenceLooksAtLayoutsOnly) {
  const Bus stereo = Bus::CreateStereo(u"Main", Bus::Main);
  const Bus side = Bus::CreateStereo(u"Side", Bus::Auxiliary);
  const Bus discrete(u"Main", CreateMultichannelLayout(2), Bus::Main);
  const Bus mono = Bus::CreateMono(u"Mono", Bus::Main);
  EXPECT_NE(stereo, side);
  EXPECT_TRUE(AreAudioBusDescriptionsEquivalent({}, {}, true));
  EXPECT_TRUE(AreAudioBusDescriptionsEquivalent({stereo, mono}, {side, mono}, true));
  EXPECT_FALSE(AreAudioBusDescriptionsEquivalent({stereo, mono}, {mono, stereo}, false));
  EXPECT_FALSE(AreAudioBusDescriptionsEquivalent({stereo}, {stereo, stereo}, false));
  EXPECT_FALSE(AreAudioBusDescriptionsEquivalent({stereo}, {discrete}, true));
  EXPECT_TRUE(AreAudioBusDescriptionsEquivalent({stereo}, {discrete}, false));
}

TEST(AudioBusDescription, AssignmentAndSwapExchangeEveryField) {
  Bus a = Bus::CreateSurround51(u"five", Bus::Main), b = Bus::CreateMono(u"one", Bus::Auxiliary);
  const Bus a0 = a, b0 = b;
  swap(a, b);
  EXPECT_TRUE(a == b0 && b == a0);
  a = b;
  EXPECT_EQ(a, a0);
}

}  // namespace
}  // namespace zebmediatypes
