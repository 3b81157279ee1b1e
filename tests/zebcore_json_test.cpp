// JSON text and the boost::any value model.

#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/json.h>

#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>
#include <random>
#include <string>

namespace {

using zebcore::UTF8String;
using namespace zebcore::serialization;

JSONValue Parse(const std::string& text) {
  return JSONParse(reinterpret_cast<const unsigned char*>(text.data()), text.size());
}

std::string Print(const boost::any& value, bool pretty = false) {
  return zebcore::string::ToStdString(GetJSONUTF8String(value, pretty));
}

// The text read and written again; "(unreadable)" when it does not read.
std::string Reprint(const std::string& text, bool pretty = false) {
  const JSONValue value = Parse(text);
  return value ? Print(*value, pretty) : "(unreadable)";
}

UTF8String U8(const char* s) { return zebcore::string::ToUTF8String(s); }

TEST(JSONParse, GivesEachValueItsTypeAndKeepsIntegersExact) {
  // A null `printed` means the text prints as it reads.
  struct Case {
    const char* text;
    const std::type_info& type;
    const char* printed;
  };
  const Case kCases[] = {
      // A document that is JSON null is not a failure; of a repeated key the last counts.
      {"null", typeid(void), nullptr},
      {"{\"a\":1,\"a\":2}", typeid(JSONObject), "{\"a\":2}"},
      {"-0", typeid(std::int64_t), "0"},
      {"9223372036854775807", typeid(std::int64_t), nullptr},
      {"-9223372036854775808", typeid(std::int64_t), nullptr},
      {"9223372036854775808", typeid(std::uint64_t), nullptr},
      {"1e2", typeid(double), "100.0"},
      // Tiny numbers underflow towards zero.
      {"-0.0", typeid(double), "-0.0"},
      {"1e-400", typeid(double), "0.0"},
      {" \t\r\n \"text\" \n", typeid(UTF8String), "\"text\""},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    const JSONValue value = Parse(c.text);
    ASSERT_TRUE(value);
    EXPECT_EQ(value->type(), c.type);
    EXPECT_EQ(Print(*value), c.printed ? c.printed : c.text);
  }
}

TEST(JSONParse, RejectsMalformedTextAndNumbersOutsideTheirRanges) {
  const std::string kCases[] = {
      "",
      "{",
      "[1,]",
      "{\"a\":1,}",
      "{a:1}",
      "nul",
      "/* comment */ 1",
      "{} x",                         // two documents
      std::string("{\"a\"\0:1}", 8),  // a zero byte ends the text
      "01",
      ".5",
      "+1",
      "NaN",
      "\"bad \\x escape\"",
      "\"\\u12\"",
      "\"\\udc00\\ud800\"",  // lone surrogate escapes
      "\"a\x01z\"",          // a raw control character
      "\"\xED\xA0\x80\"",    // invalid UTF-8
      "18446744073709551616",
      "-9223372036854775809",
      "1e400",
  };
  for (const std::string& text : kCases) {
    SCOPED_TRACE(::testing::PrintToString(text));
    EXPECT_FALSE(Parse(text));
  }
  EXPECT_FALSE(JSONParse(nullptr, 10));
  EXPECT_TRUE(Parse(std::string("[2]\0garbage", 11)));
}

TEST(JSONParse, LimitsNesting) {
  for (const char* open : {"[", "{\"k\":"}) {
    auto nested = [&](std::size_t depth) {
      std::string text;
      for (std::size_t i = 0; i < depth; ++i) text += open;
      return text + "1" + std::string(depth, open[0] == '[' ? ']' : '}');
    };
    SCOPED_TRACE(open);
    // The deepest readable document prints whole, without a report.
    zebcore::debug::ScopedAssertionCapture capture;
    EXPECT_EQ(Reprint(nested(kMaxJSONDepth)), nested(kMaxJSONDepth));
    EXPECT_EQ(capture.Count(), 0u);
    EXPECT_FALSE(Parse(nested(kMaxJSONDepth + 1)));
    EXPECT_FALSE(Parse(nested(100000)));
    EXPECT_FALSE(Parse(std::string(1000000, open[0])));  // never closed
  }
}

TEST(JSONParse, RejectsEveryTruncation) {
  const std::string text =
      "{\"a\":[1,-2,3.5e1,true,false,null,\"s\\n\\u00e9\\ud83c\\udfac\"],\"b\":{\"c\":{}}}";
  ASSERT_TRUE(Parse(text));
  for (std::size_t n = 0; n < text.size(); ++n) {
    SCOPED_TRACE(n);
    // An exact-size copy, so a read past the end shows under the sanitizers.
    std::unique_ptr<unsigned char[]> exact(new unsigned char[n + 1]);
    std::memcpy(exact.get(), text.data(), n);
    EXPECT_FALSE(JSONParse(exact.get(), n));
  }
}

TEST(GetJSONUTF8String, WritesMembersInKeyOrderCompactOrIndented) {
  // Escapes are read in any form and written in the shortest one.
  EXPECT_EQ(Reprint("{\"zebra\":-5,\"alpha\":true,\"mid\":\"q\\u0022\\\\\\/\\u0008\\u000c\\u000A"
                    "\\u000d\\u0009\\u0001\\u001F\\u00e9\",\"num\":0.1,\"whole\":25.0,"
                    "\"big\":18446744073709551615,\"none\":null,\"list\":[1,{},[]]}"),
            "{\"alpha\":true,\"big\":18446744073709551615,\"list\":[1,{},[]],"
            "\"mid\":\"q\\\"\\\\/\\b\\f\\n\\r\\t\\u0001\\u001f\xC3\xA9\",\"none\":null,"
            "\"num\":0.1,\"whole\":25.0,\"zebra\":-5}");
  EXPECT_EQ(Reprint("{\"b\":[true],\"a\":1}", true),
            "{\n  \"a\": 1,\n  \"b\": [\n    true\n  ]\n}");
}

TEST(GetJSONUTF8String, WritesValidTextForAnyValue) {
  struct Case {
    boost::any value;
    const char* text;
  };
  const Case kCases[] = {
      {std::numeric_limits<double>::quiet_NaN(), "null"},  // JSON has no NaN
      {U8("bad \xFF\xC3 utf8"), "\"bad \xEF\xBF\xBD\xEF\xBF\xBD utf8\""},
      {std::make_shared<boost::any>(std::int64_t{3}), "3"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Print(c.value), c.text);
  }
}

TEST(GetJSONUTF8String, AValueThatContainsItselfPrintsAndReports) {
  auto self = std::make_shared<boost::any>(JSONArray());
  boost::any_cast<JSONArray>(self.get())->push_back(self);
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_TRUE(Parse(Print(*self)));
  EXPECT_EQ(capture.Count(), 1u);
  boost::any_cast<JSONArray>(self.get())->clear();  // break the cycle
}

TEST(GetJSONUTF8String, DoublesRoundTripBitForBit) {
  std::mt19937_64 random(99);
  for (int i = 0; i < 20000; ++i) {
    std::uint64_t bits = random();
    double value;
    std::memcpy(&value, &bits, sizeof value);
    if (!std::isfinite(value)) continue;
    const std::string text = Print(value);
    const JSONValue back = Parse(text);
    ASSERT_TRUE(back && back->type() == typeid(double)) << text;
    const double parsed = boost::any_cast<double>(*back);
    EXPECT_EQ(std::memcmp(&parsed, &value, sizeof value), 0) << text;
  }
}

}  // namespace
