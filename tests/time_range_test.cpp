#include <gtest/gtest.h>
#include <zebcore/json.h>
#include <zebmediatypes/time_range.h>

#include <limits>
#include <tuple>
#include <utility>

namespace zebmediatypes {
namespace {

const TickTime sec1 = kTime_OneSecond, sec2 = sec1 * 2, sec3 = sec1 * 3;

TEST(TimeRange, StartPlusDurationSaturatesAtTimeMax) {
  constexpr std::int64_t kInt64Max = std::numeric_limits<std::int64_t>::max();
  constexpr std::int64_t kInt64Min = std::numeric_limits<std::int64_t>::min();
  const std::tuple<const char*, TickTime, TickTime, TickTime> kCases[] = {
      {"negative duration", sec3, -sec2, sec1},
      {"sum beyond int64", TickTime(kInt64Max - 5), TickTime(10), kTime_Max},
      {"invalid duration", sec1, kTime_Invalid, kTime_Invalid},
      // Below, only the 64-bit range is a bound.
      {"below kTime_Min", kTime_Min, -sec1, kTime_Min - sec1},
      {"sum below int64", TickTime(kInt64Min + 5), TickTime(-10), TickTime(kInt64Min)},
  };
  for (const auto& [label, start, duration, end] : kCases) {
    EXPECT_EQ(TimeRange(start, TimeRange::Duration(duration)), TimeRange(start, end)) << label;
  }
}

TEST(TimeRange, MoveInvalidatesTheSourceAndIntersectNeedsOverlap) {
  TimeRange source(sec1, sec3);
  const TimeRange target = std::move(source);
  EXPECT_FALSE(source);  // NOLINT(bugprone-use-after-move): moved-from state is defined
  EXPECT_EQ(Intersect(target, TimeRange(sec2, sec1 * 5)), TimeRange(sec2, sec3));
  EXPECT_FALSE(Intersect(target, TimeRange(sec3, sec1 * 4)));  // touching only
}

TEST(TimeRange, JSONRoundTripAndBadForms) {
  using zebcore::serialization::JSONParse;
  const auto read = [](const char* text) {
    return zebcore::serialization::JSONConvert<TimeRange>::FromJSON(
        *JSONParse(zebcore::string::ToUTF8String(text)));
  };
  EXPECT_EQ(zebcore::string::ToStdString(
                zebcore::serialization::ToJSONText(TimeRange(sec1, kTime_Invalid))),
            R"({"mEnd":{"ticks":-101606400000000000},"mStart":{"ticks":254016000000}})");
  EXPECT_EQ(read(R"({"mEnd":{"ticks":-9223372036854775808}})"),
            TimeRange(kTime_Zero, TickTime(std::numeric_limits<std::int64_t>::min())));
  for (const char* bad : {R"({"mStart":5})", R"({"mEnd":{"ticks":"1"}})", "[]"}) {
    EXPECT_THROW(read(bad), boost::bad_any_cast) << bad;
  }
}

}  // namespace
}  // namespace zebmediatypes
