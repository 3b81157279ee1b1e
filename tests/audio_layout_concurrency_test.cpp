#include <gtest/gtest.h>
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <thread>
#include <vector>

namespace zebmediatypes {
namespace {

// The supported set is built on first use; threads racing to that first use
// must all see the one complete set.
TEST(GetSupportedAudioChannelDescriptions, FirstUseFromManyThreadsSeesOneCompleteSet) {
  constexpr int kThreads = 8;
  std::vector<const AudioChannelDescriptionSet*> seen(kThreads, nullptr);
  std::vector<std::size_t> sizes(kThreads, 0);
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t) {
    threads.emplace_back([&, t] {
      const AudioChannelDescriptionSet& supported = GetSupportedAudioChannelDescriptions();
      seen[static_cast<std::size_t>(t)] = &supported;
      sizes[static_cast<std::size_t>(t)] = supported.size();
    });
  }
  for (std::thread& thread : threads) thread.join();
  for (int t = 0; t < kThreads; ++t) {
    SCOPED_TRACE(t);
    EXPECT_EQ(seen[static_cast<std::size_t>(t)], seen[0]);
    EXPECT_EQ(sizes[static_cast<std::size_t>(t)], kAudioChannelLabelCount);
  }
}

TEST(ComputeChannelConversionMatrix, ThreadsSharingTheLayoutsGetTheSameMatrix) {
  const AudioChannelLayout source = Create7_1ItuChannelLayout();
  const AudioChannelLayout destination = CreateStereoChannelLayout();
  ChannelConversionMatrix expected;
  ComputeChannelConversionMatrix(source, destination, expected);
  constexpr int kThreads = 4;
  std::vector<ChannelConversionMatrix> results(kThreads);
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t) {
    threads.emplace_back([&, t] {
      for (int round = 0; round < 200; ++round) {
        ComputeChannelConversionMatrix(source, destination, results[static_cast<std::size_t>(t)]);
      }
    });
  }
  for (std::thread& thread : threads) thread.join();
  for (const ChannelConversionMatrix& result : results) EXPECT_EQ(result, expected);
}

}  // namespace
}  // namespace zebmediatypes
