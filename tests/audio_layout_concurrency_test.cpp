#include <gtest/gtest.h>
#include <zebmediatypes/audio_descriptions.h>

#include <array>
#include <thread>
#include <vector>

namespace zebmediatypes {
namespace {

// The supported set, and the named layouts that descriptions compare against,
// are built on first use; threads racing to that first use must all see them
// whole.
TEST(GetSupportedAudioChannelDescriptions, FirstUseFromManyThreadsSeesCompleteTables) {
  struct Seen {
    const AudioChannelDescriptionSet* set;
    zebcore::UTF16String text;
  };
  std::array<Seen, 8> seen{};
  std::vector<std::thread> threads;
  for (Seen& each : seen) {
    threads.emplace_back([&each] {
      const AudioChannelDescriptionSet& set = GetSupportedAudioChannelDescriptions();
      each = {&set, AudioChannelLayoutDescription(CreateLegacy51ChannelLayout())};
    });
  }
  for (std::thread& thread : threads) thread.join();
  for (const Seen& each : seen) {
    EXPECT_EQ(each.set, &GetSupportedAudioChannelDescriptions());
    EXPECT_EQ(each.text, AudioChannelLayoutDescription(CreateLegacy51ChannelLayout()));
  }
}

}  // namespace
}  // namespace zebmediatypes
