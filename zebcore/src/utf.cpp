// UTF-8 <-> UTF-16 conversion and the plain byte/ASCII conversions.
//
// The decoder replaces each maximal ill-formed subsequence with one U+FFFD (the
// practice Unicode recommends), so a truncated sequence costs one replacement
// and the byte that broke it is read again as the start of the next one.

#include <zebcore/string.h>

#include <ostream>
#include <string>

#include "utf_internal.h"

namespace zebcore::string {
namespace {

constexpr char16_t kReplacement = 0xFFFD;

void AppendUTF16(UTF16String& out, char32_t cp) {
  if (cp < 0x10000) {
    out.push_back(static_cast<char16_t>(cp));
  } else {
    cp -= 0x10000;
    out.push_back(static_cast<char16_t>(0xD800 + (cp >> 10)));
    out.push_back(static_cast<char16_t>(0xDC00 + (cp & 0x3FF)));
  }
}

template <class Out>
void ConvertUTF16to8(std::u16string_view in, Out& out, bool* hadErrors) {
  bool errors = false;
  out.reserve(in.size());
  const std::size_t n = in.size();
  for (std::size_t i = 0; i < n; ++i) {
    char32_t cp = in[i];
    if (cp >= 0xD800 && cp <= 0xDBFF && i + 1 < n && in[i + 1] >= 0xDC00 && in[i + 1] <= 0xDFFF) {
      cp = 0x10000 + ((cp - 0xD800) << 10) + (static_cast<char32_t>(in[i + 1]) - 0xDC00);
      ++i;
    } else if (cp >= 0xD800 && cp <= 0xDFFF) {
      cp = kReplacement;
      errors = true;
    }
    detail::AppendUTF8(out, cp);
  }
  if (hadErrors) *hadErrors = errors;
}

}  // namespace

namespace detail {

DecodeResult DecodeUTF8(const unsigned char* p, std::size_t available) noexcept {
  const unsigned char b0 = p[0];
  if (b0 < 0x80) return {b0, 1, true};
  std::size_t need;
  char32_t cp;
  unsigned char lo = 0x80;
  unsigned char hi = 0xBF;
  if (b0 >= 0xC2 && b0 <= 0xDF) {
    need = 1;
    cp = b0 & 0x1Fu;
  } else if (b0 >= 0xE0 && b0 <= 0xEF) {
    need = 2;
    cp = b0 & 0x0Fu;
    if (b0 == 0xE0) lo = 0xA0;  // overlong
    if (b0 == 0xED) hi = 0x9F;  // surrogates
  } else if (b0 >= 0xF0 && b0 <= 0xF4) {
    need = 3;
    cp = b0 & 0x07u;
    if (b0 == 0xF0) lo = 0x90;  // overlong
    if (b0 == 0xF4) hi = 0x8F;  // above U+10FFFF
  } else {
    return {kReplacement, 1, false};
  }
  std::size_t used = 1;
  for (std::size_t k = 0; k < need; ++k) {
    if (used >= available) return {kReplacement, used, false};
    const unsigned char b = p[used];
    if (b < lo || b > hi) return {kReplacement, used, false};
    cp = (cp << 6) | (b & 0x3Fu);
    ++used;
    lo = 0x80;
    hi = 0xBF;
  }
  return {cp, used, true};
}

}  // namespace detail

UTF16String AsciiToUTF16(std::string_view ascii) {
  UTF16String out;
  out.reserve(ascii.size());
  for (char c : ascii) {
    const auto b = static_cast<unsigned char>(c);
    out.push_back(b < 0x80 ? static_cast<char16_t>(b) : kReplacement);
  }
  return out;
}

UTF16String UTF8to16(std::string_view utf8, bool* hadErrors) {
  UTF16String out;
  out.reserve(utf8.size());
  bool errors = false;
  const auto* p = reinterpret_cast<const unsigned char*>(utf8.data());
  std::size_t left = utf8.size();
  while (left > 0) {
    if (*p < 0x80) {  // the common case, without a call
      out.push_back(*p);
      ++p;
      --left;
      continue;
    }
    const detail::DecodeResult r = detail::DecodeUTF8(p, left);
    errors = errors || !r.valid;
    AppendUTF16(out, r.codePoint);
    p += r.length;
    left -= r.length;
  }
  if (hadErrors) *hadErrors = errors;
  return out;
}

UTF16String UTF8to16(const UTF8String& utf8, bool* hadErrors) {
  return UTF8to16(View(utf8), hadErrors);
}

UTF8String UTF16to8(std::u16string_view utf16, bool* hadErrors) {
  UTF8String out;
  ConvertUTF16to8(utf16, out, hadErrors);
  return out;
}

std::string UTF16toNarrow(std::u16string_view utf16, bool* hadErrors) {
  std::string out;
  ConvertUTF16to8(utf16, out, hadErrors);
  return out;
}

UTF8String ToUTF8String(std::string_view bytes) {
  return UTF8String(reinterpret_cast<const unsigned char*>(bytes.data()), bytes.size());
}

std::string ToStdString(const UTF8String& bytes) { return std::string(View(bytes)); }

}  // namespace zebcore::string

namespace zebcore::allocator {

std::ostream& operator<<(std::ostream& out, const UTF16String& text) {
  return out << string::UTF16toNarrow(string::View(text));
}

std::ostream& operator<<(std::ostream& out, const UTF8String& text) {
  return out << string::View(text);
}

}  // namespace zebcore::allocator
