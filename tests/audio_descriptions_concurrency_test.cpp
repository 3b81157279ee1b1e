#include <gtest/gtest.h>
#include <zebmediatypes/audio_descriptions.h>

#include <functional>
#include <thread>
#include <vector>

namespace zebmediatypes {
namespace {

// The named layouts that descriptions compare against are built on first use;
// threads that race to that first use must all see them whole.
TEST(AudioChannelLayoutDescription, FirstUseFromManyThreadsGivesTheSameTexts) {
  const AudioChannelLayout layouts[] = {CreateStereoChannelLayout(), CreateLegacy51ChannelLayout(),
                                        CreateSmpteDtvChannelLayout()};
  std::vector<std::vector<zebcore::UTF16String>> texts(8);
  std::vector<std::thread> threads;
  const auto describe = [&layouts](std::vector<zebcore::UTF16String>& out) {
    for (int i = 0; i < 150; ++i) out.push_back(AudioChannelLayoutDescription(layouts[i % 3]));
  };
  for (auto& perThread : texts) threads.emplace_back(describe, std::ref(perThread));
  for (std::thread& thread : threads) thread.join();
  std::vector<zebcore::UTF16String> expected;
  describe(expected);
  for (const auto& perThread : texts) EXPECT_EQ(perThread, expected);
}

}  // namespace
}  // namespace zebmediatypes
