// 64-bit FNV-1a, fed with integers byte by byte (lowest byte first), for the
// Hash() of script objects: each class feeds exactly the parts its IsEqual
// compares.
#pragma once

#include <cstdint>

namespace zebmediatypes::scripting {

class Fnv1aHash {
 public:
  // Adds the `count` low bytes of `value`, lowest first.
  void Add(std::uint64_t value, int count) noexcept {
    for (int i = 0; i < count; ++i) {
      hash_ ^= (value >> (8 * i)) & 0xFFu;
      hash_ *= 1099511628211ull;
    }
  }
  std::uint64_t Value() const noexcept { return hash_; }

 private:
  std::uint64_t hash_ = 14695981039346656037ull;
};

// The hash of one integer's `count` low bytes, lowest first.
inline std::uint64_t Fnv1a(std::uint64_t value, int count) noexcept {
  Fnv1aHash hash;
  hash.Add(value, count);
  return hash.Value();
}

}  // namespace zebmediatypes::scripting
