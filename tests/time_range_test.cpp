#include <gtest/gtest.h>
#include <zebcore/json.h>
#include <zebmediatypes/time_range.h>

#include <limits>
#include <tuple>
#include <utility>

namespace zebmediatypes {
namespace {

const TickTime sec1 = kTime_OneSecond, sec2 = sec1 * 2, sec3 = sec1 * 3;

TEST(TimeRange, DurationIsInvalidWithoutBothEnds) {
  // clang-format off
  const std::pair<TimeRange, TickTime> kCases[] = {
      {TimeRange(), kTime_Invalid}, {TimeRange(sec1, sec3), sec2}, {TimeRange(sec2, sec2), kTime_Zero},
      {TimeRange(sec1, kTime_Invalid), kTime_Invalid}, {TimeRange(kTime_Invalid, sec1), kTime_Invalid}};
  // clang-format on
  for (const auto& [range, duration] : kCases) {
    EXPECT_EQ(range.GetDuration(), duration);
    EXPECT_EQ(static_cast<bool>(range), duration != kTime_Invalid);
  }
}

TEST(TimeRange, StartPlusDurationSaturatesAtTimeMax) {
  const std::int64_t kInt64Max = std::numeric_limits<std::int64_t>::max();
  const std::int64_t kInt64Min = std::numeric_limits<std::int64_t>::min();
  // clang-format off
  const std::tuple<const char*, TickTime, TickTime, TickTime> kCases[] = {
      {"start and duration", sec1, sec2, sec3}, {"negative duration", sec3, -sec2, sec1}, {"just fits", kTime_Max - sec1, sec1, kTime_Max},
      {"one tick over", kTime_Max - sec1, sec1 + TickTime(1), kTime_Max}, {"huge duration", sec1, TickTime(kInt64Max), kTime_Max},
      {"sum beyond int64", TickTime(kInt64Max - 5), TickTime(10), kTime_Max},  // the raw sum wraps
      {"invalid start", kTime_Invalid, sec1, kTime_Invalid}, {"invalid duration", sec1, kTime_Invalid, kTime_Invalid},
      // Below, only the 64-bit range is a bound.
      {"below kTime_Min", kTime_Min, -sec1, kTime_Min - sec1},
      {"sum below int64", TickTime(kInt64Min + 5), TickTime(-10), TickTime(kInt64Min)}};
  // clang-format on
  for (const auto& [label, start, duration, end] : kCases) {
    EXPECT_EQ(TimeRange(start, TimeRange::Duration(duration)), TimeRange(start, end)) << label;
  }
}

TEST(TimeRange, MoveInvalidatesTheSource) {
  TimeRange source(sec1, sec2);
  TimeRange target = std::move(source);
  EXPECT_EQ(target, TimeRange(sec1, sec2));
  EXPECT_EQ(source, TimeRange());  // NOLINT(bugprone-use-after-move): moved-from state is defined
  TimeRange assigned;
  assigned = std::move(target);
  EXPECT_EQ(assigned, TimeRange(sec1, sec2));
  EXPECT_FALSE(target);        // NOLINT(bugprone-use-after-move)
  TimeRange& same = assigned;  // self-move through an alias
  assigned = std::move(same);
  EXPECT_EQ(assigned, TimeRange(sec1, sec2));
}

TEST(TimeRange, IntersectAndContain) {
  const TimeRange a(sec1, sec3);
  EXPECT_EQ(Intersect(a, TimeRange(sec2, kTime_OneSecond * 5)), TimeRange(sec2, sec3));
  EXPECT_FALSE(Intersect(a, TimeRange(sec3, kTime_OneSecond * 4)));  // touching only
  EXPECT_FALSE(Intersect(a, TimeRange(sec1, kTime_Invalid)));
  EXPECT_EQ(Intersect(a, a), a);
  EXPECT_TRUE(a.Contains(sec1));
  EXPECT_FALSE(a.Contains(sec3));
  EXPECT_FALSE(TimeRange().Contains(sec1));
  EXPECT_LT(TimeRange(sec1, sec2), TimeRange(sec1, sec3));
  EXPECT_LT(TimeRange(sec1, sec3), TimeRange(sec2, sec2));
}

TEST(TimeRange, JSONRoundTripAndBadForms) {
  auto read = [](const std::string& text) {
    const auto parsed = zebcore::serialization::JSONParse(zebcore::string::ToUTF8String(text));
    if (!parsed) throw std::runtime_error(text);
    return zebcore::serialization::JSONConvert<TimeRange>::FromJSON(*parsed);
  };
  auto write = [](const TimeRange& r) {
    return zebcore::string::ToStdString(zebcore::serialization::ToJSONText(r));
  };
  EXPECT_EQ(write(TimeRange(sec1, sec2)),
            R"({"mEnd":{"ticks":508032000000},"mStart":{"ticks":254016000000}})");
  for (const TimeRange& r :
       {TimeRange(), TimeRange(kTime_Min, kTime_Max), TimeRange(-sec3, kTime_Invalid)}) {
    EXPECT_EQ(read(write(r)), r) << write(r);
  }
  EXPECT_EQ(read("{}"), TimeRange(kTime_Zero, kTime_Zero));
  EXPECT_EQ(read(R"({"mStart":{}, "mEnd":{"ticks":7}})"), TimeRange(kTime_Zero, TickTime(7)));
  for (const char* bad :
       {R"({"mStart":5})", R"({"mEnd":[1]})", R"({"mStart":{"ticks":"1"}})", "[]", "12"}) {
    EXPECT_THROW(read(bad), boost::bad_any_cast) << bad;
  }
}

}  // namespace
}  // namespace zebmediatypes
