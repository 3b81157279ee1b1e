#include <gtest/gtest.h>
#include <zebmediatypes/audio_descriptions.h>

#include <string>
#include <thread>
#include <vector>

namespace zebmediatypes {
namespace {

// The named layouts that descriptions compare against are built on first use;
// threads that race to that first use must all see them whole.
TEST(AudioChannelLayoutDescription, FirstUseFromManyThreadsGivesTheSameTexts) {
  const AudioChannelLayout layouts[] = {CreateStereoChannelLayout(), CreateLegacy51ChannelLayout(),
                                        CreateSmpteDtvChannelLayout()};
  constexpr int kThreads = 8;
  std::vector<std::vector<zebcore::UTF16String>> texts(kThreads);
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t) {
    threads.emplace_back([&, t] {
      for (int round = 0; round < 50; ++round) {
        for (const AudioChannelLayout& layout : layouts) {
          texts[static_cast<std::size_t>(t)].push_back(AudioChannelLayoutDescription(layout));
        }
      }
    });
  }
  for (std::thread& thread : threads) thread.join();
  for (const auto& perThread : texts) {
    ASSERT_EQ(perThread.size(), 150u);
    for (std::size_t i = 0; i < perThread.size(); ++i) {
      EXPECT_EQ(perThread[i], AudioChannelLayoutDescription(layouts[i % 3]));
    }
  }
}

}  // namespace
}  // namespace zebmediatypes
