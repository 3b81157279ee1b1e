#include <gtest/gtest.h>
#include <zebmediatypes/pixel_format.h>

#include <atomic>
#include <cstdint>
#include <thread>
#include <vector>

namespace zebmediatypes {
namespace {

constexpr int kThreads = 8, kNamesPerThread = 200;
constexpr PixelFormat kBGRA = kPixelFormat_BGRA_4444_8u;
constexpr PixelFormatProperties kShared(0x7777);  // a word every thread registers

PixelFormatName CustomName(int thread, int index) {
  return MakePixelFormatName('_', static_cast<char>('a' + thread), static_cast<char>(index / 16),
                             static_cast<char>(index % 16));
}

TEST(CustomPixelFormatRegistry, ConcurrentRegistrationsAreAllKept) {
  std::atomic<int> mismatches{0};
  std::vector<std::thread> threads;
  for (int t = 0; t < kThreads; ++t) {
    threads.emplace_back([t, &mismatches] {
      for (int i = 0; i < kNamesPerThread; ++i) {
        const PixelFormatName name = CustomName(t, i);
        const PixelFormatProperties word(static_cast<std::uint32_t>(t * 1000 + i + 1));
        RegisterCustomPixelFormatProperties(name, word);
        mismatches += LookupPropertiesForName(name) != word;
        // A word shared by every thread: the smallest name must come back.
        RegisterCustomPixelFormatProperties(CustomName(t, 255), kShared);
        mismatches += !IsCustomPixelFormatName(FindCustomPixelFormatByProperties(kShared));
        // Built-in lookups take no lock and still work alongside.
        mismatches += LookupPropertiesForName(kBGRA.fourCC) != kBGRA.properties;
      }
    });
  }
  for (std::thread& t : threads) t.join();
  EXPECT_EQ(mismatches.load(), 0);
  for (int t = 0; t < kThreads; ++t) {
    for (int i = 0; i < kNamesPerThread; ++i)
      ASSERT_EQ(LookupPropertiesForName(CustomName(t, i)).Word(), unsigned(t * 1000 + i + 1));
  }
  EXPECT_EQ(FindCustomPixelFormatByProperties(kShared), CustomName(0, 255));
}

}  // namespace
}  // namespace zebmediatypes
