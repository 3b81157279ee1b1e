// Murmur3 hashing and Guid.

#include <gtest/gtest.h>
#include <zebcore/guid.h>

#include <algorithm>
#include <cstdint>
#include <random>
#include <string>
#include <vector>

namespace {

using namespace zebcore::utility;

Guid HashOf(const std::string& text) {
  Murmur3MixerState state;
  UpdateHashState(state, text.data(), text.size());
  return GetHashResult(state);
}

// MurmurHash3_x64_128 with seed 0 in one shot, written apart from the
// streaming mixer as an independent check of it.
Guid ReferenceMurmur3(const unsigned char* data, std::size_t len) {
  constexpr std::uint64_t c1 = 0x87c37b91114253d5ULL, c2 = 0x4cf5ad432745937fULL;
  auto rotl = [](std::uint64_t x, int r) { return (x << r) | (x >> (64 - r)); };
  auto fmix = [](std::uint64_t k) {
    k = (k ^ (k >> 33)) * 0xff51afd7ed558ccdULL;
    k = (k ^ (k >> 33)) * 0xc4ceb9fe1a85ec53ULL;
    return k ^ (k >> 33);
  };
  auto load = [&](std::size_t from, std::size_t count) {  // little-endian
    std::uint64_t v = 0;
    for (std::size_t b = 0; b < count; ++b) v |= std::uint64_t{data[from + b]} << (8 * b);
    return v;
  };
  std::uint64_t h1 = 0, h2 = 0;
  const std::size_t blocks = len / 16 * 16;
  for (std::size_t i = 0; i < blocks; i += 16) {
    h1 ^= rotl(load(i, 8) * c1, 31) * c2;
    h1 = (rotl(h1, 27) + h2) * 5 + 0x52dce729;
    h2 ^= rotl(load(i + 8, 8) * c2, 33) * c1;
    h2 = (rotl(h2, 31) + h1) * 5 + 0x38495ab5;
  }
  const std::size_t tail = len - blocks;
  if (tail > 8) h2 ^= rotl(load(blocks + 8, tail - 8) * c2, 33) * c1;
  if (tail > 0) h1 ^= rotl(load(blocks, std::min<std::size_t>(tail, 8)) * c1, 31) * c2;
  h1 = (h1 ^ len) + (h2 ^ len);
  h2 = fmix((h2 ^ len) + h1);
  h1 = fmix(h1) + h2;
  h2 += h1;
  Guid::Bytes bytes;
  for (std::size_t b = 0; b < 8; ++b) {
    bytes[b] = static_cast<unsigned char>(h1 >> (8 * b));
    bytes[8 + b] = static_cast<unsigned char>(h2 >> (8 * b));
  }
  return Guid(bytes);
}

TEST(Murmur3, MatchesPublishedDigests) {
  // clang-format off
  struct Case { const char* text; const char* digest; };  // the bytes of h1 then h2, little-endian
  const Case kCases[] = {
      {"", "00000000-0000-0000-0000-000000000000"},
      {"foo", "6145f501-5786-71e2-877d-ba2be487af7e"},
      {"The quick brown fox jumps over the lazy dog", "6c1b07bc-7bbc-4be3-4793-9ac4a93c437a"},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(HashOf(c.text).ToString(), c.digest);
  }
}

TEST(Murmur3, StreamingMatchesTheOneShotAlgorithm) {
  std::mt19937 random(2024);
  std::vector<unsigned char> data(517);
  for (auto& b : data) b = static_cast<unsigned char>(random());
  for (std::size_t n = 0; n <= 300; ++n) {  // every tail length, many block counts
    SCOPED_TRACE(n);
    Murmur3MixerState state;
    UpdateHashState(state, data.data(), n);
    EXPECT_EQ(GetHashResult(state), ReferenceMurmur3(data.data(), n));
  }
  for (int round = 0; round < 500; ++round) {
    SCOPED_TRACE(round);
    // Chunks of 0 to 40 bytes meet the 16-byte blocks at every alignment, empty
    // chunks with a null pointer included; the result may be taken mid-stream.
    Murmur3MixerState state;
    for (std::size_t pos = 0; pos < data.size();) {
      const std::size_t chunk = std::min<std::size_t>(random() % 41, data.size() - pos);
      UpdateHashState(state, chunk == 0 ? nullptr : data.data() + pos, chunk);
      pos += chunk;
      ASSERT_EQ(GetHashResult(state), ReferenceMurmur3(data.data(), pos)) << pos;
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
  EXPECT_EQ(kNull.ToString() + " " + Guid(counting).ToString(),
            "00000000-0000-0000-0000-000000000000 00112233-4455-6677-8899-aabbccddeeff");
  const Guid ordered[] = {kNull, Guid(low), Guid(counting), Guid(highBit)};
  for (std::size_t i = 1; i < std::size(ordered); ++i) {
    SCOPED_TRACE(i);
    EXPECT_TRUE(ordered[i - 1] < ordered[i] && ordered[i - 1] != ordered[i]);
    EXPECT_FALSE(ordered[i] < ordered[i - 1] || ordered[i] <= ordered[i - 1]);
    EXPECT_TRUE(ordered[i] == Guid(ordered[i].GuidToBytes()) && ordered[i] >= ordered[i]);
  }
}

}  // namespace
