// Numbers as text, slot replacement and trimming.

#include <zebcore/string.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <string>

namespace zebcore::string {
namespace {

constexpr int kMaxFractionDigits = 17;
constexpr int kMaxIntegerDigits = 400;  // more than the largest double has
// Room for the longest fixed form: 309 integer digits, sign, point, 17 digits.
constexpr std::size_t kFixedBufferSize = 400;

bool IsSpace(char16_t c) noexcept {
  return c == u' ' || c == u'\t' || c == u'\r' || c == u'\n' || c == u'\v' || c == u'\f';
}

// True when |value| lies exactly halfway between two multiples of
// 10^-fractionDigits. A double m * 2^e (m odd) has exactly -e decimal fraction
// digits, the last of them a 5, so it is a tie exactly when -e == digits + 1.
bool IsDecimalTie(double value, int fractionDigits) noexcept {
  std::uint64_t bits;
  std::memcpy(&bits, &value, sizeof bits);
  const int biased = static_cast<int>((bits >> 52) & 0x7FF);
  std::uint64_t mantissa = bits & ((std::uint64_t{1} << 52) - 1);
  int exponent;
  if (biased == 0) {
    exponent = -1074;
  } else {
    mantissa |= std::uint64_t{1} << 52;
    exponent = biased - 1075;
  }
  if (mantissa == 0) return false;
  while ((mantissa & 1u) == 0) {
    mantissa >>= 1;
    ++exponent;
  }
  return -exponent == fractionDigits + 1;
}

// Adds one unit in the last digit of a run of decimal digits (with an optional
// '.'), carrying leftwards; returns whether a new leading '1' is needed.
bool IncrementDecimal(char* first, char* last) noexcept {
  for (char* p = last; p != first;) {
    --p;
    if (*p == '.') continue;
    if (*p == '9') {
      *p = '0';
    } else {
      ++*p;
      return false;
    }
  }
  return true;
}

// |value| in fixed notation with `fractionDigits` digits, rounded half away
// from zero. Returns the digits (no sign).
std::string FixedMagnitude(double magnitude, int fractionDigits) {
  std::array<char, kFixedBufferSize> buffer;
  char* const first = buffer.data() + 1;  // room for a carried '1'
  char* const end = buffer.data() + buffer.size();
  if (IsDecimalTie(magnitude, fractionDigits)) {
    // The exact expansion has fractionDigits + 1 digits ending in '5': drop the
    // 5 and round the magnitude up.
    const auto r =
        std::to_chars(first, end, magnitude, std::chars_format::fixed, fractionDigits + 1);
    char* last = r.ptr - 1;
    if (fractionDigits == 0) --last;  // the '.' before the dropped digit
    if (IncrementDecimal(first, last)) {
      buffer[0] = '1';
      return std::string(buffer.data(), last);
    }
    return std::string(first, last);
  }
  const auto r = std::to_chars(first, end, magnitude, std::chars_format::fixed, fractionDigits);
  return std::string(first, r.ptr);
}

void TrimZeros(std::string& mantissa) {
  const std::size_t point = mantissa.find('.');
  if (point == std::string::npos) return;
  std::size_t last = mantissa.find_last_not_of('0');
  if (last == point) --last;
  mantissa.erase(last + 1);
}

UTF16String Widen(std::string_view text) {
  UTF16String out;
  out.reserve(text.size());
  for (char c : text) out.push_back(static_cast<char16_t>(static_cast<unsigned char>(c)));
  return out;
}

// The scientific form with as many significant digits as fit in maxLength (at
// least one digit).
std::string Scientific(double value, bool trim, const std::string& sign, std::size_t maxLength) {
  std::array<char, 64> buffer;
  std::string best;
  for (int precision = 16; precision >= 0; --precision) {
    const auto r = std::to_chars(buffer.data(), buffer.data() + buffer.size(), std::fabs(value),
                                 std::chars_format::scientific, precision);
    std::string text(buffer.data(), r.ptr);
    if (trim) {
      const std::size_t e = text.find('e');
      std::string mantissa = text.substr(0, e);
      TrimZeros(mantissa);
      text = mantissa + text.substr(e);
    }
    best = sign + text;
    if (best.size() <= maxLength) break;
  }
  return best;
}

// The power of ten of the leading digit of a well-formed decimal number (the
// exponent saturates), e.g. 2 for "123.4", -3 for "0.00123e0".
long long DecimalMagnitude(const char* first, const char* last) noexcept {
  long long integerDigits = 0;
  long long leadingFractionZeros = 0;
  bool seenNonZero = false;
  bool inFraction = false;
  const char* p = first;
  for (; p != last && *p != 'e' && *p != 'E'; ++p) {
    if (*p == '.') {
      inFraction = true;
    } else if (!inFraction) {
      seenNonZero = seenNonZero || *p != '0';
      if (seenNonZero) ++integerDigits;
    } else if (!seenNonZero) {
      if (*p != '0') {
        seenNonZero = true;
      } else {
        ++leadingFractionZeros;
      }
    }
  }
  long long exponent = 0;
  if (p != last) {
    ++p;
    bool negative = false;
    if (p != last && (*p == '+' || *p == '-')) negative = *p++ == '-';
    for (; p != last; ++p) exponent = std::min(exponent * 10 + (*p - '0'), 1000000LL);
    if (negative) exponent = -exponent;
  }
  const long long lead = integerDigits > 0 ? integerDigits - 1 : -leadingFractionZeros - 1;
  return lead + exponent;
}

}  // namespace

UTF16String NumberToString(double value, int minIntegerDigits, int fractionDigits,
                           utility::Flags<unsigned int> flags, std::size_t maxLength) {
  const bool plus = flags.IsSet(kNumberToString_ShowPlusSign);
  const bool trim = flags.IsSet(kNumberToString_TrimTrailingZeros);
  if (std::isnan(value)) return u"nan";
  if (std::isinf(value)) return value < 0 ? u"-inf" : (plus ? u"+inf" : u"inf");

  fractionDigits = std::clamp(fractionDigits, 0, kMaxFractionDigits);
  minIntegerDigits = std::clamp(minIntegerDigits, 1, kMaxIntegerDigits);

  std::string digits = FixedMagnitude(std::fabs(value), fractionDigits);
  if (trim) TrimZeros(digits);
  const bool isZero = digits.find_first_not_of("0.") == std::string::npos;
  // A value that rounds to zero is written without a sign.
  const std::string sign = isZero ? "" : (value < 0 ? "-" : (plus ? "+" : ""));

  const std::size_t integerDigits = std::min(digits.find('.'), digits.size());
  const std::size_t padding = integerDigits < static_cast<std::size_t>(minIntegerDigits)
                                  ? static_cast<std::size_t>(minIntegerDigits) - integerDigits
                                  : 0;
  if (sign.size() + padding + digits.size() <= maxLength) {
    return Widen(sign + std::string(padding, '0') + digits);
  }
  return Widen(Scientific(value, trim, value < 0 ? "-" : (plus ? "+" : ""), maxLength));
}

bool StringToNumber(std::u16string_view text, double& value) {
  std::size_t begin = 0;
  std::size_t end = text.size();
  while (begin < end && IsSpace(text[begin])) ++begin;
  while (end > begin && IsSpace(text[end - 1])) --end;

  std::string narrow;
  narrow.reserve(end - begin);
  for (std::size_t i = begin; i < end; ++i) {
    const char16_t c = text[i];
    if (c > 0x7F) return false;
    narrow.push_back(static_cast<char>(c));
  }

  // Grammar: [+-] (digits [. digits*] | . digits) [(e|E) [+-] digits]
  std::size_t i = 0;
  const std::size_t n = narrow.size();
  bool negative = false;
  if (i < n && (narrow[i] == '+' || narrow[i] == '-')) {
    negative = narrow[i] == '-';
    ++i;
  }
  const std::size_t numberStart = i;
  std::size_t mantissaDigits = 0;
  while (i < n && narrow[i] >= '0' && narrow[i] <= '9') ++i, ++mantissaDigits;
  if (i < n && narrow[i] == '.') {
    ++i;
    while (i < n && narrow[i] >= '0' && narrow[i] <= '9') ++i, ++mantissaDigits;
  }
  if (mantissaDigits == 0) return false;
  if (i < n && (narrow[i] == 'e' || narrow[i] == 'E')) {
    ++i;
    if (i < n && (narrow[i] == '+' || narrow[i] == '-')) ++i;
    std::size_t exponentDigits = 0;
    while (i < n && narrow[i] >= '0' && narrow[i] <= '9') ++i, ++exponentDigits;
    if (exponentDigits == 0) return false;
  }
  if (i != n) return false;

  double parsed = 0.0;
  const char* first = narrow.data() + numberStart;
  const char* last = narrow.data() + n;
  const auto r = std::from_chars(first, last, parsed, std::chars_format::general);
  if (r.ec == std::errc::result_out_of_range) {
    // Too small for a double is a (tiny) number; too large is not.
    if (DecimalMagnitude(first, last) >= 0) return false;
    parsed = 0.0;
  } else if (r.ec != std::errc() || r.ptr != last) {
    return false;
  }
  value = negative ? -parsed : parsed;
  return true;
}

UTF16String ReplaceInString(const UTF16String& text, const UTF16String& r0, const UTF16String& r1,
                            const UTF16String& r2, const UTF16String& r3, const UTF16String& r4,
                            const UTF16String& r5, const UTF16String& r6, const UTF16String& r7,
                            const UTF16String& r8, const UTF16String& r9) {
  const UTF16String* const replacements[10] = {&r0, &r1, &r2, &r3, &r4, &r5, &r6, &r7, &r8, &r9};
  UTF16String out;
  out.reserve(text.size());
  const std::size_t n = text.size();
  for (std::size_t i = 0; i < n; ++i) {
    const char16_t c = text[i];
    if (c == u'@' && i + 1 < n) {
      const char16_t next = text[i + 1];
      if (next >= u'0' && next <= u'9') {
        out += *replacements[next - u'0'];
        ++i;
        continue;
      }
      if (next == u'@') {
        out.push_back(u'@');
        ++i;
        continue;
      }
    }
    out.push_back(c);
  }
  return out;
}

UTF16String LeftTrim(std::u16string_view text) {
  std::size_t begin = 0;
  while (begin < text.size() && IsSpace(text[begin])) ++begin;
  return UTF16String(text.data() + begin, text.size() - begin);
}

UTF16String RightTrim(std::u16string_view text) {
  std::size_t end = text.size();
  while (end > 0 && IsSpace(text[end - 1])) --end;
  return UTF16String(text.data(), end);
}

}  // namespace zebcore::string
