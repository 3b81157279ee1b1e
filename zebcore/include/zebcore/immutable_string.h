// ImmutableString: a constant string that exists before any static initializer
// runs (constant-initialized) and never changes.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace zebcore::utility {

class ImmutableString {
 public:
  constexpr ImmutableString() noexcept = default;

  // A constant over a string literal (or any text that outlives it).
  static constexpr ImmutableString _PrivateCreateStatic(const char* text) noexcept {
    return ImmutableString(text, std::char_traits<char>::length(text));
  }

  constexpr const char* c_str() const noexcept { return text_; }
  constexpr std::size_t size() const noexcept { return size_; }
  constexpr bool empty() const noexcept { return size_ == 0; }
  constexpr std::string_view View() const noexcept { return {text_, size_}; }
  std::string ToString() const { return std::string(text_, size_); }

  friend constexpr bool operator==(ImmutableString a, ImmutableString b) noexcept {
    return a.View() == b.View();
  }
  friend constexpr bool operator!=(ImmutableString a, ImmutableString b) noexcept {
    return !(a == b);
  }
  friend constexpr bool operator==(ImmutableString a, std::string_view b) noexcept {
    return a.View() == b;
  }
  friend constexpr bool operator<(ImmutableString a, ImmutableString b) noexcept {
    return a.View() < b.View();
  }

 private:
  constexpr ImmutableString(const char* text, std::size_t size) noexcept
      : text_(text), size_(size) {}

  const char* text_ = "";
  std::size_t size_ = 0;
};

}  // namespace zebcore::utility
