// UTF conversion, number text, slot replacement and the UTF-16 output stream.

#include <gtest/gtest.h>
#include <zebcore/stream.h>
#include <zebcore/string.h>

#include <cfloat>
#include <cmath>
#include <random>
#include <string>
#include <vector>

namespace {

using zebcore::UTF16String;
using zebcore::UTF8String;
using namespace zebcore::string;

std::string Narrow(const UTF16String& s) { return UTF16toNarrow(View(s)); }

TEST(UTF8to16, DecodesValidTextAndReplacesEachIllFormedSubsequenceOnce) {
  struct Case {
    std::string utf8;
    std::u16string utf16;
  };
  const Case kCases[] = {
      {"", u""},
      {"A\xC3\xA9\xE2\x82\xAC", u"A\u00E9\u20AC"},                    // one, two and three bytes
      {"\xF0\x9F\x8E\xAC\xF4\x8F\xBF\xBF", u"\U0001F3AC\U0010FFFF"},  // four, up to the last scalar
      {std::string("a\0b", 3), std::u16string(u"a\0b", 3)},  // zero is an ordinary character
      {"\x80", u"\uFFFD"},
      {"\xBF\x80", u"\uFFFD\uFFFD"},  // lone continuation bytes
      // Overlong forms: C0 and C1 start nothing.
      {"\xC0\xAF", u"\uFFFD\uFFFD"},
      {"\xC1\xBF", u"\uFFFD\uFFFD"},
      {"\xE0\x80\xAF", u"\uFFFD\uFFFD\uFFFD"},
      {"\xF0\x80\x80\xAF", u"\uFFFD\uFFFD\uFFFD\uFFFD"},
      // An encoded surrogate, above U+10FFFF, bytes that start nothing.
      {"\xED\xA0\x80", u"\uFFFD\uFFFD\uFFFD"},
      {"\xF4\x90\x80\x80", u"\uFFFD\uFFFD\uFFFD\uFFFD"},
      {"\xF5\x80", u"\uFFFD\uFFFD"},
      {"\xFF", u"\uFFFD"},
      {"\xC3", u"\uFFFD"},
      {"\xE2\x82", u"\uFFFD"},
      {"\xF0\x9F\x8E", u"\uFFFD"},  // truncated
      // The byte that breaks a sequence is read again.
      {"\xE2\x82\x41", u"\uFFFDA"},
      {"\xF0\x9F\xC3\xA9", u"\uFFFD\u00E9"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(::testing::PrintToString(c.utf8));
    // An exact-size copy, so a read past the end shows under the sanitizers.
    const std::vector<char> exact(c.utf8.begin(), c.utf8.end());
    const bool replaced = c.utf16.find(u'\uFFFD') != std::u16string::npos;
    bool errors = !replaced;
    const UTF16String out = UTF8to16(std::string_view(exact.data(), exact.size()), &errors);
    EXPECT_EQ(std::u16string(out.begin(), out.end()), c.utf16);
    EXPECT_EQ(errors, replaced);
  }
}

TEST(UTF16to8, EveryScalarValueRoundTripsExhaustive) {
  for (char32_t cp = 0; cp <= 0x10FFFF; ++cp) {
    if (cp >= 0xD800 && cp <= 0xDFFF) continue;
    const char32_t v = cp - 0x10000;
    const std::u16string one = cp < 0x10000
                                   ? std::u16string(1, static_cast<char16_t>(cp))
                                   : std::u16string{static_cast<char16_t>(0xD800 + (v >> 10)),
                                                    static_cast<char16_t>(0xDC00 + (v & 0x3FF))};
    bool errors = true;
    const UTF16String back = UTF8to16(UTF16to8(one), &errors);
    ASSERT_TRUE(std::u16string(back.begin(), back.end()) == one && !errors) << std::hex << cp;
  }
}

TEST(UTF16to8, RandomTextRoundTripsAndRandomBytesStayValid) {
  std::mt19937 random(12345);
  for (int round = 0; round < 2000; ++round) {
    // Random UTF-16 (lone surrogates included) becomes valid UTF-8 that
    // round-trips exactly; random bytes decode to text that encodes validly.
    std::u16string wide;
    std::string bytes;
    for (auto i = random() % 12; i > 0; --i) {
      wide.push_back(static_cast<char16_t>(random() % 0x10000));
      bytes.push_back(static_cast<char>(random() % 256));
    }
    const UTF8String utf8 = UTF16to8(wide);
    bool errors = true;
    EXPECT_EQ(UTF16to8(View(UTF8to16(utf8, &errors))), utf8);
    EXPECT_FALSE(errors);
    UTF8to16(UTF16to8(View(UTF8to16(std::string_view(bytes)))), &errors);
    EXPECT_FALSE(errors);
  }
}

TEST(NumberToString, RoundsPadsTrimsAndFitsTheLength) {
  constexpr unsigned kPlus = kNumberToString_ShowPlusSign;
  constexpr unsigned kTrim = kNumberToString_TrimTrailingZeros;
  struct Case {
    double value;
    int minInt, fraction;
    unsigned flags;
    std::size_t maxLength;
    const char* text;
  };
  const Case kCases[] = {
      {29.97002997, 1, 2, kTrim, 31, "29.97"},
      {0.5, 1, 0, 0, 31, "1"},        // an exact half rounds away from zero
      {9.995, 1, 2, 0, 31, "9.99"},   // stored just below the half
      {99.95, 1, 1, 0, 31, "100.0"},  // just above; the carry adds a digit
      {-0.001, 1, 2, 0, 31, "0.00"},  // rounds to zero: no sign
      {-1.5, 3, 1, 0, 31, "-001.5"},
      {1.5, 1, 1, kPlus, 31, "+1.5"},
      {0.1, 1, 40, 0, 31, "0.10000000000000001"},  // fraction digits above 17 mean 17
      {123456789.0, 1, 2, 0, 8, "1.23e+08"},
      {DBL_MAX, 1, 2, 0, 0, "2e+308"},  // 0: the shortest form
      {std::nan(""), 1, 2, 0, 31, "nan"},
      {-HUGE_VAL, 1, 2, 0, 31, "-inf"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Narrow(NumberToString(c.value, c.minInt, c.fraction, c.flags, c.maxLength)), c.text);
  }
}

TEST(NumberToString, TextReadsBackForEveryMagnitudeAndDigitCount) {
  for (int exponent = -320; exponent <= 308; ++exponent) {
    const double value = -1.2345678901234567 * std::pow(10.0, exponent);
    const UTF16String text = NumberToString(value, 1, 17, 0, 31);
    double back = 0;
    EXPECT_TRUE(text.size() <= 31u && StringToNumber(View(text), back)) << Narrow(text);
  }
  // Fixed text read back is within half a unit of the last digit.
  std::mt19937_64 random(7);
  std::uniform_real_distribution<double> uniform(-1e6, 1e6);
  for (int i = 0; i < 5000; ++i) {
    const double value = uniform(random);
    const int digits = static_cast<int>(random() % 7);
    double back = 0;
    ASSERT_TRUE(StringToNumber(View(NumberToString(value, 1, digits, 0, 31)), back)) << value;
    EXPECT_LE(std::fabs(back - value), 0.5 * std::pow(10.0, -digits) * (1 + 1e-9)) << value;
  }
}

TEST(StringToNumber, ReadsWholeDecimalTokensOnly) {
  struct Case {
    const char16_t* text;
    double value;
  };
  const Case kGood[] = {
      {u"-42", -42.0}, {u".5", 0.5}, {u"-2.5e+2", -250.0}, {u"\t8\r\n ", 8.0}, {u"-1e-400", -0.0},
  };
  const char16_t* const kBad[] = {
      u"",   u"abc",  u"1a",  u"1 2", u"--1",   u".",
      u"1e", u"0x10", u"inf", u"nan", u"1e400", u"1\u0661",
  };
  for (const Case& c : kGood) {
    SCOPED_TRACE(Narrow(c.text));
    double value = -123.0;
    EXPECT_TRUE(StringToNumber(c.text, value));
    EXPECT_TRUE(value == c.value && std::signbit(value) == std::signbit(c.value)) << value;
  }
  for (const char16_t* text : kBad) {
    SCOPED_TRACE(Narrow(text));
    double value = 0.25;
    EXPECT_FALSE(StringToNumber(text, value));
    EXPECT_EQ(value, 0.25);  // left alone
  }
}

TEST(ReplaceInString, FillsNumberedSlotsOnce) {
  struct Case {
    const char16_t* text;
    const char16_t* expected;
  };
  const Case kCases[] = {
      {u"@1/@0 fps", u"B/A fps"},
      {u"@0@0@9.", u"AAJ."},
      {u"", u""},
      {u"@3", u""},
      {u"50@", u"50@"},
      {u"a@b", u"a@b"},  // '@' at the end or before a letter stays
      {u"@@0", u"@0"},
      {u"@@@0", u"@A"},  // "@@" is a literal '@'
  };
  const UTF16String a = u"A", b = u"B", j = u"J";
  for (const Case& c : kCases) {
    SCOPED_TRACE(Narrow(c.text));
    EXPECT_EQ(ReplaceInString(c.text, a, b, {}, {}, {}, {}, {}, {}, {}, j),
              UTF16String(c.expected));
  }
  // Replaced text is not scanned again.
  EXPECT_EQ(ReplaceInString(u"@0-@1", u"@1", u"x"), UTF16String(u"@1-x"));
}

TEST(UTF16OStream, FormatsLikeTheDefaultNarrowStreamAndFlushesOnEndl) {
  struct Counting final : UTF16OStream {
    UTF16String text;
    int flushes = 0;
    void Flush() override { ++flushes; }

   protected:
    void Write(std::u16string_view t) override { text.append(t.data(), t.size()); }
  } out;
  out << u"t=" << -7LL << ' ' << 29.97002997 << u' ' << 123456789.0 << "\xC3\xA9" << endl << flush;
  out << static_cast<const char*>(nullptr) << static_cast<const char16_t*>(nullptr);  // nothing
  EXPECT_EQ(Narrow(out.text), "t=-7 29.97 1.23457e+08\xC3\xA9\n");
  EXPECT_EQ(out.flushes, 2);
}

}  // namespace
