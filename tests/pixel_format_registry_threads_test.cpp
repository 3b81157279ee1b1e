#include <gtest/gtest.h>
#include <zebmediatypes/pixel_format.h>

#include <atomic>
#include <cstdint>
#include <thread>
#include <vector>

namespace zebmediatypes {
namespace {

// a word every thread registers
constexpr PixelFormatProperties kShared(0x7777);

PixelFormatName CustomName(int thread, int index) {
  return MakePixelFormatName('_', static_cast<char>('a' + thread), static_cast<char>(index / 16),
                             static_cast<char>(index % 16));
}

TEST(CustomPixelFormatRegistry, ConcurrentRegistrationsAreAllKept) {
  std::atomic<int> mismatches{0};
  std::vector<std::thread> threads;
  for (int t = 0; t < 8; ++t) {
    threads.emplace_back([t, &mismatches] {
      for (int i = 0; i < 200; ++i) {
        const PixelFormatProperties word(static_cast<std::uint32_t>(t * 1000 + i + 1));
        RegisterCustomPixelFormatProperties(CustomName(t, i), word);
        RegisterCustomPixelFormatProperties(CustomName(t, 255), kShared);
        mismatches += LookupPropertiesForName(CustomName(t, i)) != word;
        mismatches += !IsCustomPixelFormatName(FindCustomPixelFormatByProperties(kShared));
        // Built-in lookups take no lock and still work alongside.
        mismatches += LookupPropertiesForName(MakePixelFormatName("bgra")) !=
                      kPixelFormat_BGRA_4444_8u.properties;
      }
    });
  }
  for (std::thread& t : threads) t.join();
  EXPECT_EQ(mismatches.load(), 0);
  // Every entry is kept; the smallest name of the shared word comes back.
  EXPECT_EQ(LookupPropertiesForName(CustomName(7, 199)).Word(), 7200u);
  EXPECT_EQ(FindCustomPixelFormatByProperties(kShared), CustomName(0, 255));
}

}  // namespace
}  // namespace zebmediatypes
