// Shared by the UTF conversions and the JSON printer: one step of the checked
// UTF-8 decoder and the UTF-8 encoder.
#pragma once

#include <cstddef>

namespace zebcore::string::detail {

struct DecodeResult {
  char32_t codePoint;  // U+FFFD when !valid
  std::size_t length;  // bytes consumed, at least 1, at most `available`
  bool valid;
};

// Decodes the sequence at `p` (available > 0). An ill-formed sequence consumes
// its maximal valid prefix (at least one byte) and gives U+FFFD.
DecodeResult DecodeUTF8(const unsigned char* p, std::size_t available) noexcept;

// Appends the UTF-8 form of `cp` (a scalar value) to a byte string.
template <class Out>
void AppendUTF8(Out& out, char32_t cp) {
  using C = typename Out::value_type;
  if (cp < 0x80) {
    out.push_back(static_cast<C>(cp));
  } else if (cp < 0x800) {
    out.push_back(static_cast<C>(0xC0 | (cp >> 6)));
    out.push_back(static_cast<C>(0x80 | (cp & 0x3F)));
  } else if (cp < 0x10000) {
    out.push_back(static_cast<C>(0xE0 | (cp >> 12)));
    out.push_back(static_cast<C>(0x80 | ((cp >> 6) & 0x3F)));
    out.push_back(static_cast<C>(0x80 | (cp & 0x3F)));
  } else {
    out.push_back(static_cast<C>(0xF0 | (cp >> 18)));
    out.push_back(static_cast<C>(0x80 | ((cp >> 12) & 0x3F)));
    out.push_back(static_cast<C>(0x80 | ((cp >> 6) & 0x3F)));
    out.push_back(static_cast<C>(0x80 | (cp & 0x3F)));
  }
}

}  // namespace zebcore::string::detail
