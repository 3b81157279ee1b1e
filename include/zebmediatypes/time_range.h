// TimeRange: a span of media time from a start to an end TickTime.
//
// Either end may be missing (kTime_Invalid); a range is usable only when both
// are present.
//
//   TimeRange range(kTime_OneSecond, TimeRange::Duration(kTime_OneSecond));  // 1 s to 2 s
#pragma once

#include <zebcore/json.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/tick_time.h>

namespace zebmediatypes {

class TimeRange {
 public:
  // A duration, to tell the start-and-duration constructor from start-and-end.
  struct Duration {
    constexpr explicit Duration(TickTime length) noexcept : value(length) {}
    TickTime value;
  };

  // Invalid: both ends kTime_Invalid.
  constexpr TimeRange() noexcept = default;
  // From a start and an end; either may be kTime_Invalid.
  constexpr TimeRange(TickTime start, TickTime end) noexcept : mStart(start), mEnd(end) {}
  // From a start and a duration: end = start + duration, capped above at
  // kTime_Max. Below, the sum is not capped at kTime_Min: a negative sum keeps
  // its value, and one beyond the 64-bit range gives INT64_MIN instead of
  // wrapping. When either is kTime_Invalid the end is kTime_Invalid.
  constexpr TimeRange(TickTime start, Duration duration) noexcept
      : mStart(start), mEnd(SaturatingEnd(start, duration.value)) {}

  constexpr TimeRange(const TimeRange&) noexcept = default;
  constexpr TimeRange& operator=(const TimeRange&) noexcept = default;
  // Moving leaves the moved-from range invalid.
  constexpr TimeRange(TimeRange&& other) noexcept : mStart(other.mStart), mEnd(other.mEnd) {
    other.mStart = kTime_Invalid;
    other.mEnd = kTime_Invalid;
  }
  constexpr TimeRange& operator=(TimeRange&& other) noexcept {
    if (this != &other) {
      mStart = other.mStart;
      mEnd = other.mEnd;
      other.mStart = kTime_Invalid;
      other.mEnd = kTime_Invalid;
    }
    return *this;
  }

  constexpr TickTime GetStart() const noexcept { return mStart; }
  constexpr TickTime GetEnd() const noexcept { return mEnd; }
  // end - start when the range is valid, otherwise kTime_Invalid.
  constexpr TickTime GetDuration() const noexcept {
    return IsValid() ? mEnd - mStart : kTime_Invalid;
  }

  // Neither end is kTime_Invalid.
  constexpr bool IsValid() const noexcept {
    return mStart != kTime_Invalid && mEnd != kTime_Invalid;
  }
  constexpr explicit operator bool() const noexcept { return IsValid(); }

  // Whether `time` lies in [start, end). False for an invalid range or time.
  constexpr bool Contains(TickTime time) const noexcept {
    return IsValid() && time != kTime_Invalid && mStart <= time && time < mEnd;
  }

  friend constexpr bool operator==(const TimeRange& a, const TimeRange& b) noexcept {
    return a.mStart == b.mStart && a.mEnd == b.mEnd;
  }
  friend constexpr bool operator!=(const TimeRange& a, const TimeRange& b) noexcept {
    return !(a == b);
  }
  // By start, then by end.
  friend constexpr bool operator<(const TimeRange& a, const TimeRange& b) noexcept {
    return a.mStart < b.mStart || (a.mStart == b.mStart && a.mEnd < b.mEnd);
  }

 private:
  static constexpr TickTime SaturatingEnd(TickTime start, TickTime duration) noexcept {
    if (start == kTime_Invalid || duration == kTime_Invalid) return kTime_Invalid;
    // start + duration > kTime_Max, decided without forming the sum.
    const std::int64_t s = start.GetTicks();
    const std::int64_t d = duration.GetTicks();
    if (d > 0 && s > kTime_Max.GetTicks() - d) return kTime_Max;
    if (d < 0 && s < std::numeric_limits<std::int64_t>::min() - d) {
      return TickTime(std::numeric_limits<std::int64_t>::min());
    }
    const TickTime end(s + d);
    return end > kTime_Max ? kTime_Max : end;
  }

  TickTime mStart = kTime_Invalid;
  TickTime mEnd = kTime_Invalid;
};

// The overlap of two ranges, [max(starts), min(ends)); an invalid range when
// either is invalid or they do not overlap.
ZEBMEDIATYPES_API TimeRange Intersect(const TimeRange& a, const TimeRange& b) noexcept;

}  // namespace zebmediatypes

// JSON form: {"mEnd":{"ticks":e},"mStart":{"ticks":s}}. An absent member, or an
// absent "ticks", reads as 0 ticks; a member that is not an object raises
// boost::bad_any_cast.
template <>
struct ZEBMEDIATYPES_API zebcore::serialization::JSONConvert<zebmediatypes::TimeRange> {
  static boost::any ToJSON(const zebmediatypes::TimeRange& range);
  static zebmediatypes::TimeRange FromJSON(const boost::any& value);
};
