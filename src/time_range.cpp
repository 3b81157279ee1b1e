// TimeRange: intersection and the JSON form.
#include <zebmediatypes/time_range.h>

#include <algorithm>

namespace zebmediatypes {

TimeRange Intersect(const TimeRange& a, const TimeRange& b) noexcept {
  if (!a || !b) return TimeRange();
  const TickTime start = std::max(a.GetStart(), b.GetStart());
  const TickTime end = std::min(a.GetEnd(), b.GetEnd());
  if (!(start < end)) return TimeRange();
  return TimeRange(start, end);
}

}  // namespace zebmediatypes

namespace zebcore::serialization {

namespace {

// A member in the TickTime form; an absent member reads as 0 ticks.
zebmediatypes::TickTime ReadTime(const boost::any& object, std::string_view key) {
  const JSONValue member = GetVariantInObject(object, key);
  if (!member) return zebmediatypes::TickTime(0);
  return JSONConvert<zebmediatypes::TickTime>::FromJSON(*member);
}

}  // namespace

boost::any JSONConvert<zebmediatypes::TimeRange>::ToJSON(const zebmediatypes::TimeRange& range) {
  boost::any object;
  AddToObject(object, std::string_view("mStart"),
              JSONConvert<zebmediatypes::TickTime>::ToJSON(range.GetStart()), true);
  AddToObject(object, std::string_view("mEnd"),
              JSONConvert<zebmediatypes::TickTime>::ToJSON(range.GetEnd()), true);
  return object;
}

zebmediatypes::TimeRange JSONConvert<zebmediatypes::TimeRange>::FromJSON(const boost::any& value) {
  (void)boost::any_cast<const JSONObject&>(value);  // anything but an object throws
  return zebmediatypes::TimeRange(ReadTime(value, "mStart"), ReadTime(value, "mEnd"));
}

}  // namespace zebcore::serialization
