// TickTime and FrameRate: the library's one time scale.
//
// Every time and every frame or sample rate is an integer count of ticks; a
// tick is 1/254016000000 s. 254016000000 = 2^12 * 3^4 * 5^6 * 7^2, so the frame
// duration of every video rate in use (the 1000/1001 rates included) and the
// sample period of every common audio rate is a whole number of ticks, and times
// built from frame counts carry no rounding error.
//
//   TickTime t(30, kFrameRate_Video29_97);   // 30 frames at 30000/1001 fps = 1.001 s
//   t.AlignToNearestFrame(kFrameRate_Video25);
//
// Both types are one signed 64-bit integer, trivially copyable, constexpr and
// noexcept: pass them by value. Arithmetic wraps like two's-complement integers
// (it is done in unsigned 64-bit, never as signed overflow). The few operations
// with no defined integer result (a division by zero, INT64_MIN / -1, a rate
// multiplied by 0) are reported through the assertion service and give the
// type's invalid value; execution goes on.
#pragma once

#include <zebcore/json.h>
#include <zebcore/stream.h>
#include <zebmediatypes/export.h>

#include <chrono>
#include <cmath>
#include <cstdint>
#include <iosfwd>
#include <iterator>
#include <limits>
#include <string>
#include <type_traits>

namespace zebmediatypes {

class FrameRate;
class TickTime;

namespace details {

inline constexpr std::int64_t kTicksPerSecond = 254016000000;

// Two's-complement wrapping arithmetic without signed overflow.
constexpr std::int64_t WrappingAdd(std::int64_t a, std::int64_t b) noexcept {
  return static_cast<std::int64_t>(static_cast<std::uint64_t>(a) + static_cast<std::uint64_t>(b));
}
constexpr std::int64_t WrappingSub(std::int64_t a, std::int64_t b) noexcept {
  return static_cast<std::int64_t>(static_cast<std::uint64_t>(a) - static_cast<std::uint64_t>(b));
}
constexpr std::int64_t WrappingMul(std::int64_t a, std::int64_t b) noexcept {
  return static_cast<std::int64_t>(static_cast<std::uint64_t>(a) * static_cast<std::uint64_t>(b));
}
constexpr std::int64_t WrappingNeg(std::int64_t a) noexcept {
  return static_cast<std::int64_t>(std::uint64_t{0} - static_cast<std::uint64_t>(a));
}

// A double truncated toward zero into int64: NaN gives `nanValue`, values
// beyond the range clamp to INT64_MIN / INT64_MAX.
constexpr std::int64_t CheckedTruncate(double value, std::int64_t nanValue) noexcept {
  if (value != value) return nanValue;
  if (value >= 9223372036854775808.0) return std::numeric_limits<std::int64_t>::max();
  if (value < -9223372036854775808.0) return std::numeric_limits<std::int64_t>::min();
  return static_cast<std::int64_t>(value);
}

// Reports a TickTime division by zero (or INT64_MIN / -1) from `function`.
ZEBMEDIATYPES_API void ReportTickTimeDivision(const char* function, int line) noexcept;
// Reports a FrameRate operation with no defined result (a rate multiplied by 0).
ZEBMEDIATYPES_API void ReportFrameRateBreach(const char* function, int line) noexcept;

}  // namespace details

// FrameRate
//
// The length of one frame (or one audio sample) in ticks, signed 64-bit. A
// larger value is a slower rate: frames per second = 254016000000 / ticks.
// kFrameRate_Invalid (INT64_MAX) means "no rate". A tick count of 0 or below is
// no rate too: its frames per second are 0.0, and the alignment and frame-count
// operations of TickTime leave times alone / count 0 frames with it.
//
// Ordering compares ticks per frame, so a faster rate compares less.
class FrameRate {
 public:
  // No rate (kFrameRate_Invalid).
  constexpr FrameRate() noexcept = default;
  constexpr explicit FrameRate(std::int64_t ticksPerFrame) noexcept : ticks_(ticksPerFrame) {}

  // The rate of `n` whole frames per second: 254016000000 / n ticks (exact for
  // every named rate). n <= 0 gives kFrameRate_Invalid.
  static constexpr FrameRate FromFramesPerSecond(std::int64_t n) noexcept {
    return n > 0 ? FrameRate(details::kTicksPerSecond / n) : FrameRate();
  }

  constexpr std::int64_t GetTicksPerFrame() const noexcept { return ticks_; }

  // Whether this is a usable rate: ticks per frame > 0 and not kFrameRate_Invalid.
  constexpr bool IsValid() const noexcept {
    return ticks_ > 0 && ticks_ != std::numeric_limits<std::int64_t>::max();
  }

  // Frames per second; 0.0 when IsValid() is false.
  constexpr double GetFramesPerSecond() const noexcept {
    return IsValid() ? static_cast<double>(details::kTicksPerSecond) / static_cast<double>(ticks_)
                     : 0.0;
  }

  // Multiplying a rate makes it faster: the tick count is divided by n
  // (truncated toward zero). kFrameRate_Invalid stays invalid. n == 0 (and the
  // unrepresentable INT64_MIN / -1) is reported and gives kFrameRate_Invalid.
  constexpr FrameRate& operator*=(int n) noexcept {
    if (ticks_ == kInvalidTicks) return *this;
    if (n == 0 || (n == -1 && ticks_ == std::numeric_limits<std::int64_t>::min())) {
      details::ReportFrameRateBreach("zebmediatypes::FrameRate::operator *", __LINE__);
      ticks_ = kInvalidTicks;
      return *this;
    }
    ticks_ /= n;
    return *this;
  }
  // ticks / d truncated toward zero; NaN, 0.0 and results beyond the range give
  // kFrameRate_Invalid or clamp (0.0 is reported). kFrameRate_Invalid stays.
  constexpr FrameRate& operator*=(double d) noexcept {
    if (ticks_ == kInvalidTicks) return *this;
    if (d == 0.0) {
      details::ReportFrameRateBreach("zebmediatypes::FrameRate::operator *", __LINE__);
      ticks_ = kInvalidTicks;
      return *this;
    }
    ticks_ = details::CheckedTruncate(static_cast<double>(ticks_) / d, kInvalidTicks);
    return *this;
  }
  // Dividing a rate makes it slower: ticks * n (wrapping). kFrameRate_Invalid
  // stays invalid.
  constexpr FrameRate& operator/=(int n) noexcept {
    if (ticks_ != kInvalidTicks) ticks_ = details::WrappingMul(ticks_, n);
    return *this;
  }
  // ticks * d truncated toward zero; NaN gives kFrameRate_Invalid, results
  // beyond the range clamp. kFrameRate_Invalid stays invalid.
  constexpr FrameRate& operator/=(double d) noexcept {
    if (ticks_ != kInvalidTicks) {
      ticks_ = details::CheckedTruncate(static_cast<double>(ticks_) * d, kInvalidTicks);
    }
    return *this;
  }

  friend constexpr FrameRate operator*(FrameRate r, int n) noexcept { return r *= n; }
  friend constexpr FrameRate operator*(FrameRate r, double d) noexcept { return r *= d; }
  friend constexpr FrameRate operator/(FrameRate r, int n) noexcept { return r /= n; }
  friend constexpr FrameRate operator/(FrameRate r, double d) noexcept { return r /= d; }

  friend constexpr bool operator==(FrameRate a, FrameRate b) noexcept {
    return a.ticks_ == b.ticks_;
  }
  friend constexpr bool operator!=(FrameRate a, FrameRate b) noexcept {
    return a.ticks_ != b.ticks_;
  }
  friend constexpr bool operator<(FrameRate a, FrameRate b) noexcept { return a.ticks_ < b.ticks_; }
  friend constexpr bool operator>(FrameRate a, FrameRate b) noexcept { return a.ticks_ > b.ticks_; }
  friend constexpr bool operator<=(FrameRate a, FrameRate b) noexcept {
    return a.ticks_ <= b.ticks_;
  }
  friend constexpr bool operator>=(FrameRate a, FrameRate b) noexcept {
    return a.ticks_ >= b.ticks_;
  }

 private:
  static constexpr std::int64_t kInvalidTicks = std::numeric_limits<std::int64_t>::max();
  std::int64_t ticks_ = kInvalidTicks;
};

static_assert(std::is_trivially_copyable_v<FrameRate>);
static_assert(sizeof(FrameRate) == sizeof(std::int64_t));

// Named rates (ticks per frame).
inline constexpr FrameRate kFrameRate_Video11_988{21189168000};  // 12000/1001
inline constexpr FrameRate kFrameRate_Video14_985{16951334400};  // 15000/1001
inline constexpr FrameRate kFrameRate_Video23_976{10594584000};  // 24000/1001
inline constexpr FrameRate kFrameRate_Video24{10584000000};
inline constexpr FrameRate kFrameRate_Video25{10160640000};
inline constexpr FrameRate kFrameRate_Video29_97{8475667200};  // 30000/1001
inline constexpr FrameRate kFrameRate_Video30{8467200000};
inline constexpr FrameRate kFrameRate_Video48{5292000000};
inline constexpr FrameRate kFrameRate_Video50{5080320000};
inline constexpr FrameRate kFrameRate_Video59_94{4237833600};  // 60000/1001
inline constexpr FrameRate kFrameRate_Video60{4233600000};
inline constexpr FrameRate kFrameRate_Video100{2540160000};
inline constexpr FrameRate kFrameRate_Video119_88{2118916800};  // 120000/1001
inline constexpr FrameRate kFrameRate_Milliseconds{254016000};  // one frame per millisecond
inline constexpr FrameRate kFrameRate_Audio8000{31752000};
inline constexpr FrameRate kFrameRate_Audio11025{23040000};
inline constexpr FrameRate kFrameRate_Audio16000{15876000};
inline constexpr FrameRate kFrameRate_Audio22050{11520000};
inline constexpr FrameRate kFrameRate_Audio32000{7938000};
inline constexpr FrameRate kFrameRate_Audio44100{5760000};
inline constexpr FrameRate kFrameRate_Audio48000{5292000};
inline constexpr FrameRate kFrameRate_Audio88200{2880000};
inline constexpr FrameRate kFrameRate_Audio96000{2646000};
inline constexpr FrameRate kFrameRate_Audio192000{1323000};
inline constexpr FrameRate kFrameRate_Invalid{std::numeric_limits<std::int64_t>::max()};

namespace details {

// The ten named audio sample rates, slowest first: the one list the library
// keeps of them. The first nine are the native rates (audio_frame_rate_utils.h);
// the last seven, from 22050 Hz, are the rates IsFrameRateAudio() accepts.
inline constexpr FrameRate kAudioRateConstants[] = {
    kFrameRate_Audio8000,  kFrameRate_Audio11025, kFrameRate_Audio16000, kFrameRate_Audio22050,
    kFrameRate_Audio32000, kFrameRate_Audio44100, kFrameRate_Audio48000, kFrameRate_Audio88200,
    kFrameRate_Audio96000, kFrameRate_Audio192000};
static_assert(std::size(kAudioRateConstants) == 10);

// Whether `rate` is one of the ten named audio rates kFrameRate_Audio8000 to
// kFrameRate_Audio192000.
constexpr bool IsAudioRateConstant(FrameRate rate) noexcept {
  for (FrameRate r : kAudioRateConstants) {
    if (r == rate) return true;
  }
  return false;
}

}  // namespace details

// TickTime
//
// A point or span on the tick scale: a signed 64-bit tick count, 254016000000
// per second. kTime_Invalid is an ordinary value for arithmetic and comparison
// (it orders below every time in [kTime_Min, kTime_Max]); it propagates only
// where an operation says it returns it.
class TickTime {
 public:
  // Zero.
  constexpr TickTime() noexcept = default;
  constexpr explicit TickTime(std::int64_t ticks) noexcept : ticks_(ticks) {}
  // `frames` frames of `rate`: frames * ticks per frame, wrapping.
  constexpr TickTime(std::int64_t frames, FrameRate rate) noexcept
      : ticks_(details::WrappingMul(frames, rate.GetTicksPerFrame())) {}

  // A standard-library duration in ticks (DurationToTicks(5s) is 5 seconds).
  // Integer durations convert exactly where the tick scale allows (truncated
  // otherwise) and wrap beyond the range; floating-point durations truncate
  // toward zero, NaN gives kTime_Invalid and values beyond the range clamp.
  template <class Rep, class Period>
  static constexpr TickTime DurationToTicks(std::chrono::duration<Rep, Period> d) noexcept;

  constexpr std::int64_t GetTicks() const noexcept { return ticks_; }
  constexpr void SetTicks(std::int64_t ticks) noexcept { ticks_ = ticks; }
  // FromSeconds()
  //
  // seconds * 254016000000 (one double product) rounded to the nearest tick,
  // an exact half away from zero. NaN gives kTime_Invalid; values beyond the
  // 64-bit range, infinities included, clamp to INT64_MIN / INT64_MAX like the
  // other double conversions. FromSeconds(1.001) is 30 frames at
  // kFrameRate_Video29_97, and every tick count of magnitude below 2^51 comes
  // back from FromSeconds(t.ToSeconds()) unchanged (beyond it a double no
  // longer holds every tick).
  ZEBMEDIATYPES_API static TickTime FromSeconds(double seconds) noexcept;

  // ticks / 254016000000.
  constexpr double ToSeconds() const noexcept {
    return static_cast<double>(ticks_) / static_cast<double>(details::kTicksPerSecond);
  }

  constexpr TickTime operator-() const noexcept { return TickTime(details::WrappingNeg(ticks_)); }
  constexpr TickTime& operator+=(TickTime o) noexcept {
    ticks_ = details::WrappingAdd(ticks_, o.ticks_);
    return *this;
  }
  constexpr TickTime& operator-=(TickTime o) noexcept {
    ticks_ = details::WrappingSub(ticks_, o.ticks_);
    return *this;
  }

  // ticks * factor, wrapping.
  constexpr TickTime& operator*=(int factor) noexcept {
    ticks_ = details::WrappingMul(ticks_, factor);
    return *this;
  }
  constexpr TickTime& operator*=(unsigned int factor) noexcept {
    ticks_ = details::WrappingMul(ticks_, static_cast<std::int64_t>(factor));
    return *this;
  }
  constexpr TickTime& operator*=(std::int64_t factor) noexcept {
    ticks_ = details::WrappingMul(ticks_, factor);
    return *this;
  }
  // ticks * factor truncated toward zero; NaN gives kTime_Invalid, results
  // beyond the 64-bit range clamp to it.
  constexpr TickTime& operator*=(double factor) noexcept;

  // ticks / divisor truncated toward zero. A zero divisor, and INT64_MIN / -1,
  // are reported and give kTime_Invalid.
  constexpr TickTime& operator/=(int divisor) noexcept {
    return DivideByInteger(divisor, "zebmediatypes::TickTime::operator /=", __LINE__);
  }
  constexpr TickTime& operator/=(unsigned int divisor) noexcept {
    return DivideByInteger(static_cast<std::int64_t>(divisor),
                           "zebmediatypes::TickTime::operator /=", __LINE__);
  }
  constexpr TickTime& operator/=(std::int64_t divisor) noexcept {
    return DivideByInteger(divisor, "zebmediatypes::TickTime::operator /=", __LINE__);
  }
  // ticks / divisor truncated toward zero; 0.0 is reported and gives
  // kTime_Invalid, NaN gives kTime_Invalid, results beyond the range clamp.
  constexpr TickTime& operator/=(double divisor) noexcept {
    return DivideByDouble(divisor, "zebmediatypes::TickTime::operator /=", __LINE__);
  }

  friend constexpr TickTime operator+(TickTime a, TickTime b) noexcept { return a += b; }
  friend constexpr TickTime operator-(TickTime a, TickTime b) noexcept { return a -= b; }
  friend constexpr TickTime operator*(TickTime a, int f) noexcept { return a *= f; }
  friend constexpr TickTime operator*(TickTime a, unsigned int f) noexcept { return a *= f; }
  friend constexpr TickTime operator*(TickTime a, std::int64_t f) noexcept { return a *= f; }
  friend constexpr TickTime operator*(TickTime a, double f) noexcept { return a *= f; }
  friend constexpr TickTime operator/(TickTime a, int d) noexcept {
    return a.DivideByInteger(d, "zebmediatypes::TickTime::operator /", __LINE__);
  }
  friend constexpr TickTime operator/(TickTime a, unsigned int d) noexcept {
    return a.DivideByInteger(static_cast<std::int64_t>(d), "zebmediatypes::TickTime::operator /",
                             __LINE__);
  }
  friend constexpr TickTime operator/(TickTime a, std::int64_t d) noexcept {
    return a.DivideByInteger(d, "zebmediatypes::TickTime::operator /", __LINE__);
  }
  friend constexpr TickTime operator/(TickTime a, double d) noexcept {
    return a.DivideByDouble(d, "zebmediatypes::TickTime::operator /", __LINE__);
  }
  // The ratio a / b of two times. b == 0 is reported and gives a in seconds.
  friend constexpr double operator/(TickTime a, TickTime b) noexcept {
    if (b.ticks_ == 0) {
      details::ReportTickTimeDivision("zebmediatypes::TickTime::operator /", __LINE__);
      return a.ToSeconds();
    }
    return static_cast<double>(a.ticks_) / static_cast<double>(b.ticks_);
  }

  friend constexpr bool operator==(TickTime a, TickTime b) noexcept { return a.ticks_ == b.ticks_; }
  friend constexpr bool operator!=(TickTime a, TickTime b) noexcept { return a.ticks_ != b.ticks_; }
  friend constexpr bool operator<(TickTime a, TickTime b) noexcept { return a.ticks_ < b.ticks_; }
  friend constexpr bool operator>(TickTime a, TickTime b) noexcept { return a.ticks_ > b.ticks_; }
  friend constexpr bool operator<=(TickTime a, TickTime b) noexcept { return a.ticks_ <= b.ticks_; }
  friend constexpr bool operator>=(TickTime a, TickTime b) noexcept { return a.ticks_ >= b.ticks_; }

  // Makes the count non-negative in place (INT64_MIN stays as it is).
  constexpr TickTime& Abs() noexcept {
    if (ticks_ < 0 && ticks_ != std::numeric_limits<std::int64_t>::min()) ticks_ = -ticks_;
    return *this;
  }

  // ticks += count * ticks per frame, wrapping.
  constexpr TickTime& AddFrames(std::int64_t count, FrameRate rate) noexcept {
    ticks_ = details::WrappingAdd(ticks_, details::WrappingMul(count, rate.GetTicksPerFrame()));
    return *this;
  }

  // Whole frames of `rate` in this time, truncated toward zero; 0 when `rate`
  // is no rate (ticks <= 0 or kFrameRate_Invalid). ToFrame32 is the low 32 bits
  // of the same count.
  constexpr std::int64_t ToFrame64(FrameRate rate) const noexcept {
    return rate.IsValid() ? ticks_ / rate.GetTicksPerFrame() : 0;
  }
  constexpr int ToFrame32(FrameRate rate) const noexcept {
    return static_cast<int>(
        static_cast<std::uint32_t>(static_cast<std::uint64_t>(ToFrame64(rate))));
  }

  // AlignToFrame()
  //
  // Moves toward zero onto a frame boundary of `rate`: positive times down,
  // negative times up (-1.5 frames becomes -1 frame). Does nothing when `rate`
  // is no rate.
  constexpr TickTime& AlignToFrame(FrameRate rate) noexcept {
    if (rate.IsValid()) ticks_ -= ticks_ % rate.GetTicksPerFrame();
    return *this;
  }

  // AlignToFrameCeil()
  //
  // With p the ticks per frame: u = t + p - 1, then u moved toward zero onto a
  // boundary. For t >= 0 this is the smallest boundary at or above t. For
  // negative t it is the boundary at or above t + p - 1: -0.5 and -1.5 frames
  // become 0, and an exact negative boundary moves one frame toward zero (-2
  // frames become -1 frame). A ceiling beyond the 64-bit range gives the last
  // representable boundary. Does nothing when `rate` is no rate.
  constexpr TickTime& AlignToFrameCeil(FrameRate rate) noexcept;

  // AlignToNearestFrame()
  //
  // Rounds to the nearest frame boundary of `rate`, an exact half away from
  // zero, then clamps to [kTime_Min, kTime_Max] (times near the 64-bit limits
  // clamp to the bound on their side). Does nothing when `rate` is no rate. The
  // only operation of this type that clamps to [kTime_Min, kTime_Max]; the
  // double conversions clamp only to the 64-bit range, and integer arithmetic
  // wraps.
  constexpr TickTime& AlignToNearestFrame(FrameRate rate) noexcept;

  // CalculateFrameRate()
  //
  // The rate at which this duration holds `frameCount` frames: ticks /
  // frameCount, truncated. kFrameRate_Invalid when frameCount is 0, when the
  // duration is 0 or negative, or when the quotient is 0 (a duration shorter
  // than frameCount ticks).
  constexpr void CalculateFrameRate(std::uint64_t frameCount, FrameRate& rate) const noexcept {
    if (frameCount == 0 || ticks_ <= 0 || frameCount > static_cast<std::uint64_t>(ticks_)) {
      rate = FrameRate();
      return;
    }
    rate = FrameRate(ticks_ / static_cast<std::int64_t>(frameCount));
  }

 private:
  constexpr TickTime& DivideByInteger(std::int64_t divisor, const char* function,
                                      int line) noexcept;
  constexpr TickTime& DivideByDouble(double divisor, const char* function, int line) noexcept;

  std::int64_t ticks_ = 0;
};

static_assert(std::is_trivially_copyable_v<TickTime>);
static_assert(sizeof(TickTime) == sizeof(std::int64_t));

inline constexpr TickTime kTime_Zero{0};
inline constexpr TickTime kTime_OneSecond{254016000000};
inline constexpr TickTime kTime_OneMinute{15240960000000};
inline constexpr TickTime kTime_OneHour{914457600000000};
// +/-100 hours: the largest and smallest times the library produces by rounding.
inline constexpr TickTime kTime_Max{91445760000000000};
inline constexpr TickTime kTime_Min{-91445760000000000};
// -400000 seconds: no valid time (a division by zero, a failed parse).
inline constexpr TickTime kTime_Invalid{-101606400000000000};

// The frames-per-second ratio fps(a) / fps(b), that is ticks(b) / ticks(a);
// 0.0 when a's tick count is 0.
constexpr double GetFrameRateRatio(FrameRate a, FrameRate b) noexcept {
  return a.GetTicksPerFrame() == 0 ? 0.0
                                   : static_cast<double>(b.GetTicksPerFrame()) /
                                         static_cast<double>(a.GetTicksPerFrame());
}

// MatchedFrameRateFromFloat()
//
// The rate for a frames-per-second value: within 0.005 of 11.988, 14.985,
// 23.976, 29.97, 59.94 or 119.88 (the 1000/1001 rates, tested in that order) it
// is that named rate; otherwise 254016000000 / fps truncated toward zero (25
// gives kFrameRate_Video25, 44100 gives kFrameRate_Audio44100).
// kFrameRate_Invalid for fps <= 0, NaN, infinities, and for fps so high that a
// frame would be shorter than one tick.
ZEBMEDIATYPES_API FrameRate MatchedFrameRateFromFloat(double fps) noexcept;

// Whether `rate` is one of the seven audio sample rates 22050, 32000, 44100,
// 48000, 88200, 96000 and 192000 Hz. 8000, 11025 and 16000 Hz are not audio
// rates for this test.
ZEBMEDIATYPES_API bool IsFrameRateAudio(FrameRate rate) noexcept;

// Text forms.
//
// A TickTime writes its seconds: on a narrow stream with the stream's current
// floating-point formatting, on a wide stream with the default formatting (six
// significant digits). A FrameRate writes its frames per second with two
// decimals (three for 23.976, 11.988 and 14.985), trailing zeros trimmed, "0"
// for no rate: "29.97", "25", "23.976".
ZEBMEDIATYPES_API std::ostream& operator<<(std::ostream& out, TickTime time);
ZEBMEDIATYPES_API zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out,
                                                            TickTime time);
ZEBMEDIATYPES_API std::ostream& operator<<(std::ostream& out, FrameRate rate);
ZEBMEDIATYPES_API zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out,
                                                            FrameRate rate);

// The text of a FrameRate as above, as UTF-16 and as UTF-8 bytes.
ZEBMEDIATYPES_API zebcore::UTF16String FrameRateToUTF16String(FrameRate rate);
ZEBMEDIATYPES_API zebcore::UTF8String FrameRateToUTF8String(FrameRate rate);

// For test output: the tick count and " ticks" ("254016000000 ticks"), and the
// ticks per frame and " ticks/frame".
ZEBMEDIATYPES_API void PrintTo(TickTime time, std::ostream* out);
ZEBMEDIATYPES_API void PrintTo(FrameRate rate, std::ostream* out);

namespace details {

// ExplainTickTimeWithFrameRate()
//
// A short English explanation of a time in frames of a rate, for diagnostics:
// "which is 24 frames at 24fps", "which is 48000 samples at 48000Hz" (for the
// ten named audio rates) and, when `rate` is no rate, "which is 1.5 seconds".
// Numbers use the default stream formatting.
ZEBMEDIATYPES_API std::string ExplainTickTimeWithFrameRate(TickTime time, FrameRate rate);

}  // namespace details

// ---------------------------------------------------------------------------
// Inline definitions.

template <class Rep, class Period>
constexpr TickTime TickTime::DurationToTicks(std::chrono::duration<Rep, Period> d) noexcept {
  using TickPeriod = std::ratio<1, details::kTicksPerSecond>;
  if constexpr (std::is_floating_point_v<Rep>) {
    const double ticks = static_cast<double>(std::chrono::duration<double, TickPeriod>(d).count());
    return TickTime(details::CheckedTruncate(ticks, kTime_Invalid.GetTicks()));
  } else {
    // Multiply and divide by the reduced conversion factor in unsigned 64-bit so
    // that large counts wrap instead of overflowing.
    using Factor = std::ratio_divide<Period, TickPeriod>;
    const std::int64_t count = static_cast<std::int64_t>(d.count());
    if constexpr (Factor::den == 1) {
      return TickTime(details::WrappingMul(count, Factor::num));
    } else {
      return TickTime(details::WrappingMul(count, Factor::num) / Factor::den);
    }
  }
}

constexpr TickTime& TickTime::operator*=(double factor) noexcept {
  ticks_ = details::CheckedTruncate(static_cast<double>(ticks_) * factor, kTime_Invalid.ticks_);
  return *this;
}

constexpr TickTime& TickTime::DivideByInteger(std::int64_t divisor, const char* function,
                                              int line) noexcept {
  if (divisor == 0 || (divisor == -1 && ticks_ == std::numeric_limits<std::int64_t>::min())) {
    details::ReportTickTimeDivision(function, line);
    ticks_ = kTime_Invalid.ticks_;
    return *this;
  }
  ticks_ /= divisor;
  return *this;
}

constexpr TickTime& TickTime::DivideByDouble(double divisor, const char* function,
                                             int line) noexcept {
  if (divisor == 0.0) {
    details::ReportTickTimeDivision(function, line);
    ticks_ = kTime_Invalid.ticks_;
    return *this;
  }
  ticks_ = details::CheckedTruncate(static_cast<double>(ticks_) / divisor, kTime_Invalid.ticks_);
  return *this;
}

constexpr TickTime& TickTime::AlignToFrameCeil(FrameRate rate) noexcept {
  if (!rate.IsValid()) return *this;
  const std::int64_t p = rate.GetTicksPerFrame();
  if (ticks_ > std::numeric_limits<std::int64_t>::max() - (p - 1)) {
    // t + p - 1 is not representable; so is the ceiling unless t is a boundary.
    if (ticks_ % p != 0) {
      ticks_ =
          std::numeric_limits<std::int64_t>::max() - std::numeric_limits<std::int64_t>::max() % p;
    }
    return *this;
  }
  const std::int64_t u = ticks_ + (p - 1);
  ticks_ = u - u % p;
  return *this;
}

constexpr TickTime& TickTime::AlignToNearestFrame(FrameRate rate) noexcept {
  if (!rate.IsValid()) return *this;
  const std::int64_t p = rate.GetTicksPerFrame();
  const std::int64_t h = p / 2;
  if (ticks_ >= 0) {
    if (ticks_ > std::numeric_limits<std::int64_t>::max() - h) {
      ticks_ = kTime_Max.ticks_;  // the nearest boundary lies far above kTime_Max
      return *this;
    }
    const std::int64_t u = ticks_ + h;
    const std::int64_t aligned = u - u % p;
    ticks_ = aligned > kTime_Max.ticks_ ? kTime_Max.ticks_ : aligned;
  } else {
    if (ticks_ < std::numeric_limits<std::int64_t>::min() + h) {
      ticks_ = kTime_Min.ticks_;
      return *this;
    }
    const std::int64_t u = ticks_ - h;
    const std::int64_t aligned = u - u % p;
    ticks_ = aligned < kTime_Min.ticks_ ? kTime_Min.ticks_ : aligned;
  }
  return *this;
}

}  // namespace zebmediatypes

// JSON form: {"ticks": n}. Reading takes "ticks" as a signed or unsigned 64-bit
// integer (an absent member reads as 0); a value that is not an object, or a
// "ticks" member of any other JSON type, raises boost::bad_any_cast.
template <>
struct ZEBMEDIATYPES_API zebcore::serialization::JSONConvert<zebmediatypes::TickTime> {
  static boost::any ToJSON(const zebmediatypes::TickTime& time);
  static zebmediatypes::TickTime FromJSON(const boost::any& value);
};
