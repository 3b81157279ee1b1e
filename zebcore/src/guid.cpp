// Murmur3 (x64, 128-bit, seed 0) fed as a stream, and the Guid's text form.

#include <zebcore/guid.h>

#include <algorithm>
#include <cstring>

namespace zebcore::utility {
namespace {

constexpr std::uint64_t kC1 = 0x87c37b91114253d5ULL;
constexpr std::uint64_t kC2 = 0x4cf5ad432745937fULL;

constexpr std::uint64_t Rotl(std::uint64_t x, int r) noexcept { return (x << r) | (x >> (64 - r)); }

constexpr std::uint64_t FMix(std::uint64_t k) noexcept {
  k ^= k >> 33;
  k *= 0xff51afd7ed558ccdULL;
  k ^= k >> 33;
  k *= 0xc4ceb9fe1a85ec53ULL;
  k ^= k >> 33;
  return k;
}

std::uint64_t LoadLE(const unsigned char* p) noexcept {
  std::uint64_t v = 0;
  for (int i = 7; i >= 0; --i) v = (v << 8) | p[i];
  return v;
}

void StoreLE(unsigned char* p, std::uint64_t v) noexcept {
  for (int i = 0; i < 8; ++i) {
    p[i] = static_cast<unsigned char>(v);
    v >>= 8;
  }
}

void MixBlock(std::uint64_t& h1, std::uint64_t& h2, const unsigned char* block) noexcept {
  std::uint64_t k1 = LoadLE(block);
  std::uint64_t k2 = LoadLE(block + 8);
  k1 *= kC1;
  k1 = Rotl(k1, 31);
  k1 *= kC2;
  h1 ^= k1;
  h1 = Rotl(h1, 27);
  h1 += h2;
  h1 = h1 * 5 + 0x52dce729;
  k2 *= kC2;
  k2 = Rotl(k2, 33);
  k2 *= kC1;
  h2 ^= k2;
  h2 = Rotl(h2, 31);
  h2 += h1;
  h2 = h2 * 5 + 0x38495ab5;
}

}  // namespace

void UpdateHashState(Murmur3MixerState& state, const void* data, std::size_t length) noexcept {
  if (length == 0) return;
  const auto* p = static_cast<const unsigned char*>(data);
  state.totalLength += length;
  if (state.tailLength > 0) {
    const std::size_t take = std::min(length, 16 - state.tailLength);
    std::memcpy(state.tail + state.tailLength, p, take);
    state.tailLength += take;
    p += take;
    length -= take;
    if (state.tailLength < 16) return;
    MixBlock(state.h1, state.h2, state.tail);
    state.tailLength = 0;
  }
  for (; length >= 16; p += 16, length -= 16) MixBlock(state.h1, state.h2, p);
  if (length > 0) {
    std::memcpy(state.tail, p, length);
    state.tailLength = length;
  }
}

Guid GetHashResult(const Murmur3MixerState& state) noexcept {
  std::uint64_t h1 = state.h1;
  std::uint64_t h2 = state.h2;
  const unsigned char* tail = state.tail;
  const std::size_t n = state.tailLength;
  std::uint64_t k1 = 0;
  std::uint64_t k2 = 0;
  for (std::size_t i = n; i > 8; --i) k2 = (k2 << 8) | tail[i - 1];
  if (n > 8) {
    k2 *= kC2;
    k2 = Rotl(k2, 33);
    k2 *= kC1;
    h2 ^= k2;
  }
  for (std::size_t i = std::min<std::size_t>(n, 8); i > 0; --i) k1 = (k1 << 8) | tail[i - 1];
  if (n > 0) {
    k1 *= kC1;
    k1 = Rotl(k1, 31);
    k1 *= kC2;
    h1 ^= k1;
  }
  h1 ^= state.totalLength;
  h2 ^= state.totalLength;
  h1 += h2;
  h2 += h1;
  h1 = FMix(h1);
  h2 = FMix(h2);
  h1 += h2;
  h2 += h1;
  Guid::Bytes bytes;
  StoreLE(bytes.data(), h1);
  StoreLE(bytes.data() + 8, h2);
  return Guid(bytes);
}

std::string Guid::ToString() const {
  constexpr char kHex[] = "0123456789abcdef";
  std::string out;
  out.reserve(36);
  for (std::size_t i = 0; i < 16; ++i) {
    if (i == 4 || i == 6 || i == 8 || i == 10) out.push_back('-');
    out.push_back(kHex[bytes_[i] >> 4]);
    out.push_back(kHex[bytes_[i] & 0xF]);
  }
  return out;
}

}  // namespace zebcore::utility
