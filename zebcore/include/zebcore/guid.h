// Guid and the Murmur3 hasher that makes content identifiers.
//
// Murmur3 is the x64 128-bit variant with seed 0, fed in a stream: the result
// depends only on the concatenation of the bytes fed, not on how they were cut.
// The Guid's 16 bytes are the two 64-bit halves h1 and h2 of the hash, each
// little-endian, h1 first (the byte order of the reference implementation's
// output buffer).
#pragma once

#include <zebcore/export.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>

namespace zebcore::utility {

class ZEBCORE_API Guid {
 public:
  using Bytes = std::array<unsigned char, 16>;

  // The null Guid: 16 zero bytes.
  constexpr Guid() noexcept = default;
  explicit constexpr Guid(const Bytes& bytes) noexcept : bytes_(bytes) {}

  constexpr const Bytes& GuidToBytes() const noexcept { return bytes_; }
  bool IsNull() const noexcept { return *this == Guid(); }

  // "xxxxxxxx-xxxx-xxxx-xxxx-xxxxxxxxxxxx" of the bytes in order, lower case.
  std::string ToString() const;

  friend bool operator==(const Guid& a, const Guid& b) noexcept {
    return std::memcmp(a.bytes_.data(), b.bytes_.data(), 16) == 0;
  }
  friend bool operator!=(const Guid& a, const Guid& b) noexcept { return !(a == b); }
  // Orders by the bytes compared as unsigned, first to last (memcmp).
  friend bool operator<(const Guid& a, const Guid& b) noexcept {
    return std::memcmp(a.bytes_.data(), b.bytes_.data(), 16) < 0;
  }
  friend bool operator>(const Guid& a, const Guid& b) noexcept { return b < a; }
  friend bool operator<=(const Guid& a, const Guid& b) noexcept { return !(b < a); }
  friend bool operator>=(const Guid& a, const Guid& b) noexcept { return !(a < b); }

 private:
  Bytes bytes_{};
};

// The running state of a Murmur3 hash: a partial 16-byte block and the count.
struct Murmur3MixerState {
  std::uint64_t h1 = 0;
  std::uint64_t h2 = 0;
  unsigned char tail[16] = {};
  std::size_t tailLength = 0;
  std::uint64_t totalLength = 0;
};

// Feeds `length` bytes at `data` (null is allowed when length is 0).
ZEBCORE_API void UpdateHashState(Murmur3MixerState& state, const void* data,
                                 std::size_t length) noexcept;

// The hash of everything fed so far, as a Guid. The state is not changed, so
// more bytes may be fed afterwards.
ZEBCORE_API Guid GetHashResult(const Murmur3MixerState& state) noexcept;

}  // namespace zebcore::utility
