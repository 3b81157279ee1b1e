#include <gtest/gtest.h>
#include <zebmediatypes/audio_descriptions.h>

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
  for (auto& perThread : texts) {
    threads.emplace_back([&] {
      for (int i = 0; i < 150; ++i)
        perThread.push_back(AudioChannelLayoutDescription(layouts[i % 3]));
    });
  }
  for (std::thread& thread : threads) thread.join();
  for (const auto& perThread : texts) {
    ASSERT_EQ(perThread.size(), 150u);
    for (std::size_t i = 0; i < perThread.size(); ++i)
      EXPECT_EQ(perThread[i], AudioChannelLayoutDescription(layouts[i % 3]));
  }
}

}  // namespace
}  // namespace zebmediatypes
