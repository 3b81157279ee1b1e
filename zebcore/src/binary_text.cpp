// Base64 (RFC 4648, standard alphabet, '=' padding).

#include <zebcore/binary_text.h>

#include <array>

namespace zebcore::utility {
namespace {

constexpr char kAlphabet[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
static_assert(sizeof(kAlphabet) == 65);

constexpr unsigned char kInvalid = 0xFF;
constexpr unsigned char kPad = 0xFE;

constexpr std::array<unsigned char, 256> MakeDecodeTable() {
  std::array<unsigned char, 256> table{};
  for (auto& entry : table) entry = kInvalid;
  for (unsigned char i = 0; i < 64; ++i) table[static_cast<unsigned char>(kAlphabet[i])] = i;
  table['='] = kPad;
  return table;
}
constexpr std::array<unsigned char, 256> kDecode = MakeDecodeTable();

}  // namespace

UTF8String EncodeBinaryDataToUTF8String(const unsigned char* data, std::size_t size) {
  UTF8String out;
  if (data == nullptr || size == 0) return out;
  out.reserve((size + 2) / 3 * 4);
  std::size_t i = 0;
  for (; i + 3 <= size; i += 3) {
    const unsigned v = (unsigned{data[i]} << 16) | (unsigned{data[i + 1]} << 8) | data[i + 2];
    out.push_back(static_cast<unsigned char>(kAlphabet[(v >> 18) & 63]));
    out.push_back(static_cast<unsigned char>(kAlphabet[(v >> 12) & 63]));
    out.push_back(static_cast<unsigned char>(kAlphabet[(v >> 6) & 63]));
    out.push_back(static_cast<unsigned char>(kAlphabet[v & 63]));
  }
  const std::size_t left = size - i;
  if (left > 0) {
    unsigned v = unsigned{data[i]} << 16;
    if (left == 2) v |= unsigned{data[i + 1]} << 8;
    out.push_back(static_cast<unsigned char>(kAlphabet[(v >> 18) & 63]));
    out.push_back(static_cast<unsigned char>(kAlphabet[(v >> 12) & 63]));
    out.push_back(left == 2 ? static_cast<unsigned char>(kAlphabet[(v >> 6) & 63]) : '=');
    out.push_back('=');
  }
  return out;
}

bool DecodeBinaryDataFromUTF8String(const UTF8String& text, std::vector<unsigned char>& out) {
  out.clear();
  const std::size_t n = text.size();
  if (n % 4 != 0) {
    // Still hand back the complete groups before the fault.
    for (std::size_t g = 0; g + 4 <= n; g += 4) {
      unsigned v = 0;
      for (std::size_t k = 0; k < 4; ++k) {
        const unsigned char d = kDecode[text[g + k]];
        if (d >= 64) return false;
        v = (v << 6) | d;
      }
      out.push_back(static_cast<unsigned char>(v >> 16));
      out.push_back(static_cast<unsigned char>(v >> 8));
      out.push_back(static_cast<unsigned char>(v));
    }
    return false;
  }
  out.reserve(n / 4 * 3);
  for (std::size_t g = 0; g < n; g += 4) {
    unsigned char d[4];
    for (std::size_t k = 0; k < 4; ++k) d[k] = kDecode[text[g + k]];
    const bool last = g + 4 == n;
    if (d[0] >= 64 || d[1] >= 64) return false;
    unsigned v = (unsigned{d[0]} << 18) | (unsigned{d[1]} << 12);
    if (d[2] == kPad) {
      // "xx==": one byte.
      if (!last || d[3] != kPad) return false;
      out.push_back(static_cast<unsigned char>(v >> 16));
      return true;
    }
    if (d[2] >= 64) return false;
    v |= unsigned{d[2]} << 6;
    if (d[3] == kPad) {
      // "xxx=": two bytes.
      if (!last) return false;
      out.push_back(static_cast<unsigned char>(v >> 16));
      out.push_back(static_cast<unsigned char>(v >> 8));
      return true;
    }
    if (d[3] >= 64) return false;
    v |= d[3];
    out.push_back(static_cast<unsigned char>(v >> 16));
    out.push_back(static_cast<unsigned char>(v >> 8));
    out.push_back(static_cast<unsigned char>(v));
  }
  return true;
}

}  // namespace zebcore::utility
