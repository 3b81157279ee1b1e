#include <gtest/gtest.h>
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <array>
#include <thread>
#include <vector>

namespace zebmediatypes {
namespace {

constexpr std::size_t kThreads = 8;

template <typename Body>
void RunOnThreads(Body body) {
  std::vector<std::thread> threads;
  for (std::size_t t = 0; t < kThreads; ++t) threads.emplace_back(body, t);
  for (std::thread& thread : threads) thread.join();
}

// The supported set is built on first use; threads racing to that first use
// must all see the one complete set.
TEST(GetSupportedAudioChannelDescriptions, FirstUseFromManyThreadsSeesOneCompleteSet) {
  std::array<std::pair<const AudioChannelDescriptionSet*, std::size_t>, kThreads> seen{};
  RunOnThreads([&](std::size_t t) {
    const AudioChannelDescriptionSet& set = GetSupportedAudioChannelDescriptions();
    seen[t] = {&set, set.size()};
  });
  for (const auto& each : seen)
    EXPECT_EQ(each, std::make_pair(seen[0].first, kAudioChannelLabelCount));
}

TEST(ComputeChannelConversionMatrix, ThreadsSharingTheLayoutsGetTheSameMatrix) {
  const AudioChannelLayout source = Create7_1ItuChannelLayout();
  const AudioChannelLayout destination = CreateStereoChannelLayout();
  ChannelConversionMatrix expected;
  ComputeChannelConversionMatrix(source, destination, expected);
  std::array<ChannelConversionMatrix, kThreads> results;
  RunOnThreads([&](std::size_t t) {
    for (int round = 0; round < 200; ++round) {
      ComputeChannelConversionMatrix(source, destination, results[t]);
    }
  });
  for (const ChannelConversionMatrix& result : results) EXPECT_EQ(result, expected);
}

}  // namespace
}  // namespace zebmediatypes
