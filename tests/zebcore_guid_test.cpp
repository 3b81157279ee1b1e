// Murmur3 hashing and Guid.

#include <gtest/gtest.h>
#include <zebcore/guid.h>

#include <cstdint>
#include <cstring>
#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

using namespace zebcore::utility;

std::string Hex(const Guid& guid) {
  static const char kHex[] = "0123456789abcdef";
  std::string out;
  for (unsigned char b : guid.GuidToBytes()) {
    out.push_back(kHex[b >> 4]);
    out.push_back(kHex[b & 15]);
  }
  return out;
}

Guid HashOf(const void* data, std::size_t size) {
  Murmur3MixerState state;
  UpdateHashState(state, data, size);
  return GetHashResult(state);
}

Guid HashOf(const std::string& text) { return HashOf(text.data(), text.size()); }

// MurmurHash3_x64_128 written out as the published one-shot algorithm, with
// the tail read by its fall-through switch, as an independent check of the
// streaming mixer.
Guid ReferenceMurmur3(const unsigned char* data, std::size_t len, std::uint64_t seed = 0) {
  auto rotl = [](std::uint64_t x, int r) { return (x << r) | (x >> (64 - r)); };
  auto fmix = [](std::uint64_t k) {
    k ^= k >> 33;
    k *= 0xff51afd7ed558ccdULL;
    k ^= k >> 33;
    k *= 0xc4ceb9fe1a85ec53ULL;
    k ^= k >> 33;
    return k;
  };
  auto block = [&](std::size_t i) {
    std::uint64_t v = 0;
    for (int b = 0; b < 8; ++b)
      v |= std::uint64_t{data[i + static_cast<std::size_t>(b)]} << (8 * b);
    return v;
  };
  const std::size_t nblocks = len / 16;
  std::uint64_t h1 = seed, h2 = seed;
  const std::uint64_t c1 = 0x87c37b91114253d5ULL, c2 = 0x4cf5ad432745937fULL;
  for (std::size_t i = 0; i < nblocks; ++i) {
    std::uint64_t k1 = block(i * 16), k2 = block(i * 16 + 8);
    k1 *= c1;
    k1 = rotl(k1, 31);
    k1 *= c2;
    h1 ^= k1;
    h1 = rotl(h1, 27);
    h1 += h2;
    h1 = h1 * 5 + 0x52dce729;
    k2 *= c2;
    k2 = rotl(k2, 33);
    k2 *= c1;
    h2 ^= k2;
    h2 = rotl(h2, 31);
    h2 += h1;
    h2 = h2 * 5 + 0x38495ab5;
  }
  const unsigned char* tail = data + nblocks * 16;
  std::uint64_t k1 = 0, k2 = 0;
  switch (len & 15) {
    case 15:
      k2 ^= std::uint64_t{tail[14]} << 48;
      [[fallthrough]];
    case 14:
      k2 ^= std::uint64_t{tail[13]} << 40;
      [[fallthrough]];
    case 13:
      k2 ^= std::uint64_t{tail[12]} << 32;
      [[fallthrough]];
    case 12:
      k2 ^= std::uint64_t{tail[11]} << 24;
      [[fallthrough]];
    case 11:
      k2 ^= std::uint64_t{tail[10]} << 16;
      [[fallthrough]];
    case 10:
      k2 ^= std::uint64_t{tail[9]} << 8;
      [[fallthrough]];
    case 9:
      k2 ^= std::uint64_t{tail[8]};
      k2 *= c2;
      k2 = rotl(k2, 33);
      k2 *= c1;
      h2 ^= k2;
      [[fallthrough]];
    case 8:
      k1 ^= std::uint64_t{tail[7]} << 56;
      [[fallthrough]];
    case 7:
      k1 ^= std::uint64_t{tail[6]} << 48;
      [[fallthrough]];
    case 6:
      k1 ^= std::uint64_t{tail[5]} << 40;
      [[fallthrough]];
    case 5:
      k1 ^= std::uint64_t{tail[4]} << 32;
      [[fallthrough]];
    case 4:
      k1 ^= std::uint64_t{tail[3]} << 24;
      [[fallthrough]];
    case 3:
      k1 ^= std::uint64_t{tail[2]} << 16;
      [[fallthrough]];
    case 2:
      k1 ^= std::uint64_t{tail[1]} << 8;
      [[fallthrough]];
    case 1:
      k1 ^= std::uint64_t{tail[0]};
      k1 *= c1;
      k1 = rotl(k1, 31);
      k1 *= c2;
      h1 ^= k1;
  }
  h1 ^= len;
  h2 ^= len;
  h1 += h2;
  h2 += h1;
  h1 = fmix(h1);
  h2 = fmix(h2);
  h1 += h2;
  h2 += h1;
  Guid::Bytes bytes;
  for (int b = 0; b < 8; ++b) {
    bytes[static_cast<std::size_t>(b)] = static_cast<unsigned char>(h1 >> (8 * b));
    bytes[static_cast<std::size_t>(8 + b)] = static_cast<unsigned char>(h2 >> (8 * b));
  }
  return Guid(bytes);
}

TEST(Murmur3, MatchesPublishedDigests) {
  struct Case {
    const char* text;
    const char* digest;  // the bytes of h1 then h2, each little-endian
  };
  const Case kCases[] = {
      {"", "00000000000000000000000000000000"},
      {"foo", "6145f501578671e2877dba2be487af7e"},
      {"The quick brown fox jumps over the lazy dog", "6c1b07bc7bbc4be347939ac4a93c437a"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Hex(HashOf(std::string(c.text))), c.digest);
  }
}

TEST(Murmur3, MatchesTheOneShotAlgorithmForEveryTailLength) {
  std::mt19937 random(2024);
  std::vector<unsigned char> data(300);
  for (auto& b : data) b = static_cast<unsigned char>(random());
  for (std::size_t n = 0; n <= data.size(); ++n) {
    SCOPED_TRACE(n);
    EXPECT_EQ(HashOf(data.data(), n), ReferenceMurmur3(data.data(), n));
  }
}

TEST(Murmur3, ChunkingDoesNotChangeTheResult) {
  std::mt19937 random(77);
  std::vector<unsigned char> data(517);
  for (auto& b : data) b = static_cast<unsigned char>(random());
  const Guid whole = ReferenceMurmur3(data.data(), data.size());
  for (int round = 0; round < 500; ++round) {
    SCOPED_TRACE(round);
    Murmur3MixerState state;
    std::size_t pos = 0;
    while (pos < data.size()) {
      // Chunks of 0 to 40 bytes, so every alignment against the 16-byte blocks
      // comes up, empty chunks (with a null pointer) included.
      const std::size_t chunk = std::min<std::size_t>(random() % 41, data.size() - pos);
      UpdateHashState(state, chunk == 0 ? nullptr : data.data() + pos, chunk);
      pos += chunk;
    }
    EXPECT_EQ(GetHashResult(state), whole);
  }
}

TEST(Murmur3, ResultCanBeTakenMidStream) {
  const std::string text = "0123456789abcdefghijklmnopqrstuvwxyz";
  Murmur3MixerState state;
  UpdateHashState(state, text.data(), 20);
  EXPECT_EQ(GetHashResult(state), HashOf(text.substr(0, 20)));
  UpdateHashState(state, text.data() + 20, text.size() - 20);
  EXPECT_EQ(GetHashResult(state), HashOf(text));
}

TEST(Murmur3, DistinctInputsGiveDistinctGuids) {
  std::set<Guid> seen;
  for (int i = 0; i < 10000; ++i) seen.insert(HashOf(std::to_string(i)));
  EXPECT_EQ(seen.size(), 10000u);
  EXPECT_EQ(seen.count(Guid()), 0u);
}

TEST(Guid, DefaultIsNull) {
  constexpr Guid null;
  EXPECT_TRUE(null.IsNull());
  EXPECT_EQ(null.ToString(), "00000000-0000-0000-0000-000000000000");
  Guid::Bytes bytes{};
  bytes[15] = 1;
  EXPECT_FALSE(Guid(bytes).IsNull());
}

TEST(Guid, OrdersByUnsignedBytesFirstToLast) {
  Guid::Bytes low{}, high{}, highFirst{};
  low[15] = 0xFF;
  high[0] = 0x01;
  highFirst[0] = 0x80;  // above 0x7F: compared unsigned
  const Guid a(low), b(high), c(highFirst);
  EXPECT_LT(Guid(), a);
  EXPECT_LT(a, b);
  EXPECT_LT(b, c);
  EXPECT_GT(c, a);
  EXPECT_LE(a, a);
  EXPECT_GE(a, a);
  EXPECT_NE(a, b);
}

TEST(Guid, TextShowsTheBytesInOrder) {
  Guid::Bytes bytes;
  for (std::size_t i = 0; i < 16; ++i) bytes[i] = static_cast<unsigned char>(i * 17);
  EXPECT_EQ(Guid(bytes).ToString(), "00112233-4455-6677-8899-aabbccddeeff");
}

}  // namespace
