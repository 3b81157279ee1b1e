#include <gtest/gtest.h>
#include <zebcore/json.h>
#include <zebmediatypes/time_range.h>

#include <limits>
#include <utility>

namespace zebmediatypes {
namespace {

const TickTime sec1 = kTime_OneSecond;
const TickTime sec2 = kTime_OneSecond * 2;
const TickTime sec3 = kTime_OneSecond * 3;

TEST(TimeRange, ValidityAndDuration) {
  struct Case {
    const char* label;
    TimeRange range;
    TickTime start, end, duration;
    bool valid;
  };
  const Case kCases[] = {
      {"default", TimeRange(), kTime_Invalid, kTime_Invalid, kTime_Invalid, false},
      {"one to two", TimeRange(sec1, sec2), sec1, sec2, sec1, true},
      {"no end", TimeRange(sec1, kTime_Invalid), sec1, kTime_Invalid, kTime_Invalid, false},
      {"no start", TimeRange(kTime_Invalid, sec1), kTime_Invalid, sec1, kTime_Invalid, false},
      {"start and duration", TimeRange(sec1, TimeRange::Duration(sec2)), sec1, sec3, sec2, true},
      {"empty", TimeRange(sec2, sec2), sec2, sec2, kTime_Zero, true},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    EXPECT_EQ(c.range.GetStart(), c.start);
    EXPECT_EQ(c.range.GetEnd(), c.end);
    EXPECT_EQ(c.range.GetDuration(), c.duration);
    EXPECT_EQ(static_cast<bool>(c.range), c.valid);
  }
}

TEST(TimeRange, StartPlusDurationSaturatesAtTimeMax) {
  const std::int64_t kInt64Max = std::numeric_limits<std::int64_t>::max();
  struct Case {
    const char* label;
    TickTime start, duration, end;
  };
  const Case kCases[] = {
      {"200 hours", sec1, kTime_OneHour * 200, kTime_Max},
      {"just fits", kTime_Max - sec1, sec1, kTime_Max},
      {"one tick over", kTime_Max - sec1, sec1 + TickTime(1), kTime_Max},
      // The raw sum would wrap to a negative time.
      {"sum beyond int64", TickTime(kInt64Max - 5), TickTime(10), kTime_Max},
      {"huge duration", sec1, TickTime(kInt64Max), kTime_Max},
      {"negative duration", sec3, -sec2, sec1},
      {"invalid start", kTime_Invalid, sec1, kTime_Invalid},
      {"invalid duration", sec1, kTime_Invalid, kTime_Invalid},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    EXPECT_EQ(TimeRange(c.start, TimeRange::Duration(c.duration)).GetEnd(), c.end);
  }
}

TEST(TimeRange, CopyKeepsAndMoveInvalidatesTheSource) {
  const TimeRange original(sec1, sec2);
  TimeRange copy = original;
  EXPECT_EQ(copy, original);
  TimeRange third = std::move(copy);
  EXPECT_EQ(third, original);
  EXPECT_FALSE(copy);  // NOLINT(bugprone-use-after-move): moved-from state is defined
  EXPECT_NE(copy, original);
  EXPECT_EQ(copy.GetStart(), kTime_Invalid);
  TimeRange fourth;
  fourth = std::move(third);
  EXPECT_EQ(fourth, original);
  EXPECT_FALSE(third);       // NOLINT(bugprone-use-after-move)
  TimeRange& same = fourth;  // self-move through an alias
  fourth = std::move(same);
  EXPECT_EQ(fourth, original);
}

TEST(TimeRange, IntersectAndContain) {
  const TimeRange a(sec1, sec3);
  EXPECT_EQ(Intersect(a, TimeRange(sec2, kTime_OneSecond * 5)), TimeRange(sec2, sec3));
  EXPECT_FALSE(Intersect(a, TimeRange(sec3, kTime_OneSecond * 4)));  // touching only
  EXPECT_FALSE(Intersect(a, TimeRange(sec1, kTime_Invalid)));
  EXPECT_EQ(Intersect(a, a), a);
  EXPECT_TRUE(a.Contains(sec1));
  EXPECT_TRUE(a.Contains(sec2));
  EXPECT_FALSE(a.Contains(sec3));
  EXPECT_FALSE(TimeRange().Contains(sec1));
  EXPECT_LT(TimeRange(sec1, sec2), TimeRange(sec1, sec3));
  EXPECT_LT(TimeRange(sec1, sec3), TimeRange(sec2, sec2));
}

TEST(TimeRange, JSONRoundTrip) {
  using zebcore::serialization::JSONConvert;
  const TimeRange kRanges[] = {TimeRange(sec1, sec2), TimeRange(), TimeRange(kTime_Min, kTime_Max),
                               TimeRange(-sec3, kTime_Invalid)};
  for (const TimeRange& r : kRanges) {
    SCOPED_TRACE(r.GetStart().GetTicks());
    const auto text = zebcore::serialization::ToJSONText(r);
    EXPECT_FALSE(text.empty());
    const auto parsed = zebcore::serialization::JSONParse(text);
    ASSERT_TRUE(parsed);
    EXPECT_EQ(JSONConvert<TimeRange>::FromJSON(*parsed), r);
  }
  EXPECT_EQ(zebcore::string::ToStdString(zebcore::serialization::ToJSONText(TimeRange(sec1, sec2))),
            R"({"mEnd":{"ticks":508032000000},"mStart":{"ticks":254016000000}})");
}

TEST(TimeRange, JSONReadsAbsentAsZeroAndRejectsNonObjects) {
  using zebcore::serialization::JSONConvert;
  auto read = [](const char* text) {
    const auto parsed = zebcore::serialization::JSONParse(zebcore::string::ToUTF8String(text));
    if (!parsed) throw std::runtime_error("unparsed test input");
    return JSONConvert<TimeRange>::FromJSON(*parsed);
  };
  EXPECT_EQ(read("{}"), TimeRange(kTime_Zero, kTime_Zero));
  EXPECT_EQ(read(R"({"mStart":{}, "mEnd":{"ticks":7}})"), TimeRange(kTime_Zero, TickTime(7)));
  for (const char* bad :
       {R"({"mStart":5})", R"({"mEnd":[1]})", R"({"mStart":{"ticks":"1"}})", "[]", "12"}) {
    SCOPED_TRACE(bad);
    EXPECT_THROW(read(bad), boost::bad_any_cast);
  }
}

}  // namespace
}  // namespace zebmediatypes
