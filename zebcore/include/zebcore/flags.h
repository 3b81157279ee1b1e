// Flags<T>: a small set of bits in an unsigned integer.
//
//   Flags<unsigned int> f(kShowSign);
//   if (f.IsSet(kShowSign)) ...
#pragma once

#include <type_traits>

namespace zebcore::utility {

template <class T>
class Flags {
  static_assert(std::is_unsigned_v<T>, "Flags holds an unsigned bit set");

 public:
  constexpr Flags() noexcept = default;
  constexpr Flags(T bits) noexcept : bits_(bits) {}  // NOLINT: a bit value is a set

  constexpr T Value() const noexcept { return bits_; }
  // True when every bit of `bits` is set.
  constexpr bool IsSet(T bits) const noexcept { return (bits_ & bits) == bits; }
  // True when any bit of `bits` is set.
  constexpr bool IsAnySet(T bits) const noexcept { return (bits_ & bits) != 0; }
  constexpr Flags& Set(T bits) noexcept {
    bits_ |= bits;
    return *this;
  }
  constexpr Flags& Clear(T bits) noexcept {
    bits_ &= static_cast<T>(~bits);
    return *this;
  }

  friend constexpr Flags operator|(Flags a, Flags b) noexcept { return Flags(a.bits_ | b.bits_); }
  friend constexpr Flags operator&(Flags a, Flags b) noexcept { return Flags(a.bits_ & b.bits_); }
  friend constexpr bool operator==(Flags a, Flags b) noexcept { return a.bits_ == b.bits_; }
  friend constexpr bool operator!=(Flags a, Flags b) noexcept { return a.bits_ != b.bits_; }

 private:
  T bits_ = 0;
};

}  // namespace zebcore::utility
