// UTF-16 text streams over narrow, locale-independent number formatting.

#include <zebcore/stream.h>

#include <array>
#include <charconv>

namespace zebcore::string {
namespace {

template <class T>
UTF16String FormatInteger(T value) {
  std::array<char, 24> buffer;
  const auto r = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
  return UTF16String(buffer.data(), r.ptr);
}

bool IsSpace(char16_t c) noexcept {
  return c == u' ' || c == u'\t' || c == u'\r' || c == u'\n' || c == u'\v' || c == u'\f';
}

}  // namespace

UTF16OStream& UTF16OStream::operator<<(std::string_view utf8) {
  const UTF16String wide = UTF8to16(utf8);
  Write(View(wide));
  return *this;
}

UTF16OStream& UTF16OStream::operator<<(long long v) {
  const UTF16String text = FormatInteger(v);
  Write(View(text));
  return *this;
}

UTF16OStream& UTF16OStream::operator<<(unsigned long long v) {
  const UTF16String text = FormatInteger(v);
  Write(View(text));
  return *this;
}

UTF16OStream& UTF16OStream::operator<<(double v) {
  // The default stream formatting: %g with six significant digits.
  std::array<char, 32> buffer;
  const auto r =
      std::to_chars(buffer.data(), buffer.data() + buffer.size(), v, std::chars_format::general, 6);
  const UTF16String text(buffer.data(), r.ptr);
  Write(View(text));
  return *this;
}

UTF16OStream& endl(UTF16OStream& out) {
  out << u'\n';
  out.Flush();
  return out;
}

UTF16OStream& flush(UTF16OStream& out) {
  out.Flush();
  return out;
}

bool iUTF16StringStream::NextToken(UTF16String& token) {
  std::size_t p = pos_;
  while (p < text_.size() && IsSpace(text_[p])) ++p;
  if (p >= text_.size()) return false;
  std::size_t end = p;
  while (end < text_.size() && !IsSpace(text_[end])) ++end;
  token.assign(text_, p, end - p);
  pos_ = end;
  return true;
}

iUTF16StringStream& iUTF16StringStream::operator>>(UTF16String& token) {
  UTF16String next;
  if (failed_ || !NextToken(next)) {
    failed_ = true;
    return *this;
  }
  token = std::move(next);
  return *this;
}

iUTF16StringStream& iUTF16StringStream::operator>>(double& value) {
  const std::size_t start = pos_;
  UTF16String token;
  if (failed_ || !NextToken(token) || !StringToNumber(View(token), value)) {
    pos_ = start;
    failed_ = true;
  }
  return *this;
}

iUTF16StringStream& iUTF16StringStream::operator>>(std::int64_t& value) {
  const std::size_t start = pos_;
  UTF16String token;
  bool ok = !failed_ && NextToken(token);
  if (ok) {
    std::string narrow;
    for (char16_t c : token) {
      if (c > 0x7F) {
        ok = false;
        break;
      }
      narrow.push_back(static_cast<char>(c));
    }
    const char* first = narrow.data();
    const char* last = first + narrow.size();
    if (ok && first != last && *first == '+') {
      ++first;
      ok = first == last || *first != '-';  // "+-1" is not a number
    }
    std::int64_t parsed = 0;
    const auto r = std::from_chars(first, last, parsed);
    ok = ok && r.ec == std::errc() && r.ptr == last && first != last;
    if (ok) value = parsed;
  }
  if (!ok) {
    pos_ = start;
    failed_ = true;
  }
  return *this;
}

}  // namespace zebcore::string
