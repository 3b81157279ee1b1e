// The colour caches and the lifecycle under eight threads.
#include <gtest/gtest.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/initialization.h>

#include <atomic>
#include <chrono>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "color/color_test_support.h"

namespace zebmediatypes {
namespace {

using color::ColorSpace;
using testing::DefaultSpace;

constexpr int kThreads = 8;

TEST(ColorCaches, EightThreadsLoseNoEntryAndAgreeOnTexts) {
  Initialize();  // keeps the library started whatever the workers do
  std::atomic<int> failures{0};
  std::atomic<long> rounds{0};
  const auto deadline = std::chrono::steady_clock::now() + std::chrono::seconds(3);
  std::vector<std::thread> workers;
  for (int t = 0; t < kThreads; ++t) {
    workers.emplace_back([t, deadline, &failures, &rounds] {
      std::vector<std::pair<zebcore::utility::Guid, ColorSpace>> mine;
      for (int i = 0; std::chrono::steady_clock::now() < deadline; ++i, ++rounds) {
        // A balanced start and stop around each round: the cache is never
        // emptied under a round, because the test's own start outlives them.
        Initialize();
        const auto space = testing::MakeSpace(std::to_string(t) + "/" + std::to_string(i),
                                              static_cast<std::uint32_t>(i % 5), (i & 1) != 0);
        const auto id = color::AddColorSpaceToCache(space);
        mine.emplace_back(id, space);
        // Every entry this thread ever added is still there.
        const auto& check = mine[static_cast<std::size_t>(i) % mine.size()];
        if (color::RetrieveColorSpaceFromCache(check.first) != check.second) ++failures;

        // Texts through the reader (which enters the result) and the text caches.
        const zebcore::UTF8String text = space.ToSerializedString();
        const ColorSpace read = color::ColorSpaceFromSerializedString(text);
        if (read != space || read.cachedGuid != id) ++failures;
        auto& textCache = SerializationCache::GetColorSpaceCache();
        textCache.Add(text, space);
        if (textCache.FindValue(text) != space) ++failures;
        // Setting the same default again takes the colour lock twice over.
        if (i % 64 == 0) color::SetDefaultColorSpace(DefaultSpace());
        if (color::GetDefaultColorSpace() != DefaultSpace()) ++failures;
        Terminate();
      }
    });
  }
  for (std::thread& worker : workers) worker.join();
  EXPECT_EQ(failures.load(), 0);
  EXPECT_GT(rounds.load(), kThreads);
  Terminate();
  EXPECT_EQ(color::GetDefaultColorSpace(), ColorSpace());
  SerializationCache::ClearAll();
}

TEST(ColorCaches, StartsAndStopsFromManyThreadsStayBalanced) {
  std::vector<std::thread> workers;
  for (int t = 0; t < kThreads; ++t) {
    workers.emplace_back([] {
      for (int i = 0; i < 2000; ++i) {
        Initialize();
        if (i % 3 == 0) Initialize();
        (void)color::GetDefaultColorSpace();
        if (i % 3 == 0) Terminate();
        Terminate();
      }
    });
  }
  for (std::thread& worker : workers) worker.join();
  // Every start was matched: the library is stopped again.
  EXPECT_EQ(color::GetDefaultColorSpace(), ColorSpace());
}

}  // namespace
}  // namespace zebmediatypes
