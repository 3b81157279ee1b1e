// Murmur3 hashing and Guid.

#include <gtest/gtest.h>
#include <zebcore/guid.h>

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <random>
#include <vector>

namespace {

using namespace zebcore::utility;

Guid HashOf(const void* data, std::size_t size) {
  Murmur3MixerState state;
  UpdateHashState(state, data, size);
  return GetHashResult(state);
}

TEST(Murmur3, MatchesPublishedDigests) {
  struct Case {
    const char* text;
    const char* digest;
  };  // the bytes of h1 then h2, little-endian
  const Case kCases[] = {
      {"", "00000000-0000-0000-0000-000000000000"},
      {"foo", "6145f501-5786-71e2-877d-ba2be487af7e"},
      {"The quick brown fox jumps over the lazy dog", "6c1b07bc-7bbc-4be3-4793-9ac4a93c437a"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(HashOf(c.text, std::strlen(c.text)).ToString(), c.digest);
  }
}

TEST(Murmur3, EveryLengthGivesTheKnownDigestAndChunkingChangesNothing) {
  std::mt19937 random(2024);
  std::vector<unsigned char> data(517);
  for (auto& b : data) b = static_cast<unsigned char>(random());
  // The digests of every prefix (every tail length, many block counts) folded
  // into one; the value was checked against an independent one-shot version.
  Murmur3MixerState all;
  for (std::size_t n = 0; n <= 300; ++n) {
    const Guid::Bytes digest = HashOf(data.data(), n).GuidToBytes();
    UpdateHashState(all, digest.data(), digest.size());
  }
  EXPECT_EQ(GetHashResult(all).ToString(), "ba4e12f2-db48-86a8-19a0-f7c5b1059b9e");
  for (int round = 0; round < 500; ++round) {
    SCOPED_TRACE(round);
    // Chunks of 0 to 40 bytes meet the 16-byte blocks at every alignment, empty
    // chunks with a null pointer included; the result may be taken mid-stream.
    Murmur3MixerState state;
    for (std::size_t pos = 0; pos < data.size();) {
      const std::size_t chunk = std::min<std::size_t>(random() % 41, data.size() - pos);
      UpdateHashState(state, chunk == 0 ? nullptr : data.data() + pos, chunk);
      pos += chunk;
      ASSERT_EQ(GetHashResult(state), HashOf(data.data(), pos)) << pos;
    }
  }
}

TEST(Guid, TextAndOrderFollowTheUnsignedBytesFirstToLast) {
  constexpr Guid kNull;
  Guid::Bytes counting, low{}, highBit{};
  for (std::size_t i = 0; i < 16; ++i) counting[i] = static_cast<unsigned char>(i * 17);
  low[15] = 0xFF;
  highBit[0] = 0x80;  // above 0x7F: compared unsigned
  EXPECT_TRUE(kNull.IsNull() && !Guid(low).IsNull());
  EXPECT_EQ(Guid(counting).ToString(), "00112233-4455-6677-8899-aabbccddeeff");
  const Guid ordered[] = {kNull, Guid(low), Guid(counting), Guid(highBit)};
  for (std::size_t i = 1; i < std::size(ordered); ++i) {
    SCOPED_TRACE(i);
    EXPECT_TRUE(ordered[i - 1] < ordered[i] && ordered[i - 1] != ordered[i]);
    EXPECT_FALSE(ordered[i] < ordered[i - 1] || ordered[i] <= ordered[i - 1]);
    EXPECT_TRUE(ordered[i] == Guid(ordered[i].GuidToBytes()) && ordered[i] >= ordered[i]);
  }
}

}  // namespace
