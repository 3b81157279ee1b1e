// Strings of the family and the conversions between them.
//
// Display texts are UTF-16 strings (`UTF16String`, char16_t elements). Keys and
// serialized texts are UTF-8 byte strings (`UTF8String`, unsigned char
// elements). Both use STLAllocator.
//
// Conversions never fail: an invalid sequence (a lone surrogate, a truncated or
// overlong UTF-8 sequence, a byte that starts nothing) becomes U+FFFD and
// reading goes on after it; nothing is read past the end of the input.
#pragma once

#include <zebcore/allocator.h>
#include <zebcore/export.h>
#include <zebcore/flags.h>

#include <cstddef>
#include <iosfwd>
#include <string>
#include <string_view>
#include <vector>

namespace zebcore {

using UTF16String =
    std::basic_string<char16_t, std::char_traits<char16_t>, allocator::STLAllocator<char16_t>>;
using UTF8String = std::basic_string<unsigned char, std::char_traits<unsigned char>,
                                     allocator::STLAllocator<unsigned char>>;
using UTF16StringVector = std::vector<UTF16String, allocator::STLAllocator<UTF16String>>;
using UTF8StringVector = std::vector<UTF8String, allocator::STLAllocator<UTF8String>>;

namespace allocator {

// Both string types written to a narrow stream as UTF-8: a UTF16String
// converted as by UTF16to8, a UTF8String byte for byte; the stream's width and
// fill apply as to a std::string. They are declared here, in the namespace of
// the strings' allocator, because that and std are the only namespaces that
// argument-dependent lookup searches for these types: `std::cout << text`
// finds them from any namespace, with no using-declaration.
ZEBCORE_API std::ostream& operator<<(std::ostream& out, const UTF16String& text);
ZEBCORE_API std::ostream& operator<<(std::ostream& out, const UTF8String& text);

}  // namespace allocator

namespace string {

// ASCII text widened byte by byte; bytes above 0x7F become U+FFFD.
ZEBCORE_API UTF16String AsciiToUTF16(std::string_view ascii);

// UTF-8 to UTF-16. When `hadErrors` is given it is set to whether any invalid
// sequence was replaced.
ZEBCORE_API UTF16String UTF8to16(std::string_view utf8, bool* hadErrors = nullptr);
ZEBCORE_API UTF16String UTF8to16(const UTF8String& utf8, bool* hadErrors = nullptr);

// UTF-16 to UTF-8 (as bytes, or as a narrow std::string).
ZEBCORE_API UTF8String UTF16to8(std::u16string_view utf16, bool* hadErrors = nullptr);
ZEBCORE_API std::string UTF16toNarrow(std::u16string_view utf16, bool* hadErrors = nullptr);

// The bytes of a narrow string as a UTF8String and back; no conversion.
ZEBCORE_API UTF8String ToUTF8String(std::string_view bytes);
ZEBCORE_API std::string ToStdString(const UTF8String& bytes);

inline std::u16string_view View(const UTF16String& s) noexcept { return {s.data(), s.size()}; }
inline std::string_view View(const UTF8String& s) noexcept {
  return {reinterpret_cast<const char*>(s.data()), s.size()};
}

// NumberToString flags.
enum ENumberToStringFlags : unsigned int {
  kNumberToString_Default = 0,
  kNumberToString_ShowPlusSign = 1,      // "+1.5" for positive values
  kNumberToString_TrimTrailingZeros = 4  // "25" not "25.00"; "29.97" not "29.970"
};

// NumberToString()
//
// `value` in fixed notation with `fractionDigits` digits after the point
// (0 to 17; the exact binary value rounded at the last digit, an exact half
// away from zero), at least `minIntegerDigits` digits before it (1 to 400,
// zero-padded), a '-' for negative values (none when the text is all zeros),
// and '.' as the decimal point whatever the locale. `maxLength` bounds the text:
// when the fixed form would be longer, the value is written in scientific
// notation with as many significant digits as fit (at most 17; a maxLength too
// small for even one digit gives the one-digit form). NaN is "nan", infinities
// "inf" and "-inf". Flag kNumberToString_TrimTrailingZeros also trims the
// mantissa of the scientific form.
//
//   NumberToString(29.97002997, 1, 2, kNumberToString_TrimTrailingZeros, 31)  // u"29.97"
ZEBCORE_API UTF16String NumberToString(double value, int minIntegerDigits, int fractionDigits,
                                       utility::Flags<unsigned int> flags, std::size_t maxLength);

// StringToNumber()
//
// Reads a whole decimal number (optional sign, digits, optional fraction and
// exponent; surrounding ASCII white space allowed) into `value`, correctly
// rounded, and returns true. A number too small for a double reads as zero.
// Text that is not a number (including "inf", "nan", hex, and a number too large
// for a double) leaves `value` unchanged and returns false.
ZEBCORE_API bool StringToNumber(std::u16string_view text, double& value);

// Replaces each slot @0 to @9 in `text` with the replacement of that number.
// "@@" is a literal '@'; an '@' not followed by a digit stays as it is.
ZEBCORE_API UTF16String ReplaceInString(const UTF16String& text, const UTF16String& r0 = {},
                                        const UTF16String& r1 = {}, const UTF16String& r2 = {},
                                        const UTF16String& r3 = {}, const UTF16String& r4 = {},
                                        const UTF16String& r5 = {}, const UTF16String& r6 = {},
                                        const UTF16String& r7 = {}, const UTF16String& r8 = {},
                                        const UTF16String& r9 = {});

// Copies without the leading (LeftTrim) or trailing (RightTrim) white space
// (space, tab, CR, LF, vertical tab, form feed).
ZEBCORE_API UTF16String LeftTrim(std::u16string_view text);
ZEBCORE_API UTF16String RightTrim(std::u16string_view text);

}  // namespace string
}  // namespace zebcore
