// Script classes of the time values: "TickTime", "FrameRate", "RatioTime" and
// "TimeDisplay", in the script namespace "zebmediatypes".
//
// Each wraps one native value. Every item is defined with the host flag
// 0x80000; static items (flag 64) belong to the class. Script sees, for
// example:
//
//   var t = new zebmediatypes.TickTime();
//   t.seconds = 1.001;                                 // 254270016000 ticks
//   var rate = zebmediatypes.FrameRate.createWithValue(25);
//   t.alignToFrame(rate).ticksNumber;                  // 254016000000
//   RatioTime.createRatioTime(2, 4).scale;             // 2
//
// Writes that a setter refuses (returns false) leave the value as it was.
// Objects the items make (the constants, the results of static and alignment
// items) are made in the calling script context.
#pragma once

#include <zebcore/string.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/ratio_time.h>
#include <zebmediatypes/tick_time.h>
#include <zebmediatypes/time_display.h>
#include <zebscripting/script_context.h>
#include <zebscripting/script_object.h>
#include <zebscripting/utils.h>

#include <boost/intrusive_ptr.hpp>
#include <cstdint>

namespace zebmediatypes::scripting {

using zebscripting::ScriptObjectPtr;

// "TickTime": one TickTime, 0 at first.
//
// Items, in order: constructor; "seconds" (double); "equals"(TickTime);
// "ticks" (decimal text); "ticksNumber" (64-bit integer); static
// "timecodeToTime"(text, FrameRate, TimeDisplay) and "timeToTimecode"(TickTime,
// FrameRate, TimeDisplay); "alignToNearestFrame"(FrameRate) and
// "alignToFrame"(FrameRate); the static constants TIME_ZERO, TIME_ONE_SECOND,
// TIME_ONE_MINUTE, TIME_ONE_HOUR, TIME_MAX, TIME_MIN, TIME_INVALID (each read
// is a new object). A missing FrameRate is kFrameRate_Invalid, a missing
// TimeDisplay the default display, a missing TickTime 0.
class ZEBMEDIATYPES_API TickTimeObject : public zebscripting::ScriptObject,
                                         public zebscripting::ScriptCastInterface<TickTime> {
 public:
  TickTimeObject();
  static const char* GetClassname() noexcept { return "TickTime"; }
  static const char* GetDescription() noexcept { return "TickTime class"; }
  static void DefineObject();

  void Initialize(const TickTime& time) noexcept { time_ = time; }
  bool CastTo(TickTime& time) const override;
  // True for a "TickTime" object with the same tick count.
  bool IsEqual(const ScriptObjectPtr& other) const override;
  // 64-bit FNV-1a of the tick count's 8 bytes, lowest first.
  std::uint64_t Hash() const override;

  TickTime GetTickTime() const noexcept { return time_; }
  // ticks / 254016000000.
  double GetSeconds() const noexcept;
  // value x 254016000000 rounded to the nearest tick (an exact half away from
  // zero). Refused: NaN, infinities, and values whose ticks do not fit in 64
  // bits.
  bool SetSeconds(double seconds) noexcept;
  // The tick count in decimal.
  zebcore::UTF16String GetTicks() const;
  // Reads a signed decimal integer after any leading white space, up to the
  // first character that is not part of it; text that does not start with a
  // number reads as 0. Refused: a number beyond the 64-bit range, and
  // kTime_Invalid.
  bool SetTicks(const zebcore::UTF16String& text);
  std::int64_t GetTicksNumber() const noexcept { return time_.GetTicks(); }
  // Refused: kTime_Invalid.
  bool SetTicksNumber(std::int64_t ticks) noexcept;

  // IsEqual(other): false for null and for objects of other classes.
  bool Equals(const ScriptObjectPtr& other) const;
  ScriptObjectPtr AlignToNearestFrame(const ScriptObjectPtr& rate) const;
  ScriptObjectPtr AlignToFrame(const ScriptObjectPtr& rate) const;
  static ScriptObjectPtr TimecodeToTime(int contextHandle, const zebcore::UTF16String& text,
                                        const ScriptObjectPtr& rate,
                                        const ScriptObjectPtr& display);
  static zebcore::UTF16String TimeToTimecode(int contextHandle, const ScriptObjectPtr& time,
                                             const ScriptObjectPtr& rate,
                                             const ScriptObjectPtr& display);

 private:
  TickTime time_;
};

// "FrameRate": one FrameRate, kFrameRate_Invalid at first.
//
// Items: constructor; "ticksPerFrame" (64-bit integer, any value accepted);
// static "createWithValue"(fps).
class ZEBMEDIATYPES_API FrameRateObject : public zebscripting::ScriptObject,
                                          public zebscripting::ScriptCastInterface<FrameRate> {
 public:
  FrameRateObject();
  static const char* GetClassname() noexcept { return "FrameRate"; }
  static const char* GetDescription() noexcept { return "FrameRate class"; }
  static void DefineObject();

  void Initialize(const FrameRate& rate) noexcept { rate_ = rate; }
  bool CastTo(FrameRate& rate) const override;
  bool IsEqual(const ScriptObjectPtr& other) const override;
  std::uint64_t Hash() const override;

  FrameRate GetFrameRate() const noexcept { return rate_; }
  std::int64_t GetTicksPerFrame() const noexcept { return rate_.GetTicksPerFrame(); }
  bool SetTicksPerFrame(std::int64_t ticks) noexcept;
  // 254016000000 / fps truncated toward zero. kFrameRate_Invalid for 0, NaN,
  // infinities, negative rates, and rates whose frame would be shorter than
  // one tick or longer than the 64-bit range.
  static ScriptObjectPtr CreateWithValue(int contextHandle, double framesPerSecond);

 private:
  FrameRate rate_;
};

// "RatioTime": a boost::rational<int64> (value over scale), 0/1 at first,
// always in lowest terms with a positive scale. No script constructor.
//
// Items: static "createRatioTime"(value, scale); "value" and "scale" (64-bit
// integers). A ratio whose lowest terms cannot be held (a numerator of -2^63,
// or a scale that would have to be 2^63, as in -2^63 / -1) is refused by the
// setters and makes "createRatioTime" throw boost::bad_rational, like a zero
// scale.
class ZEBMEDIATYPES_API RatioTimeObject : public zebscripting::ScriptObject {
 public:
  RatioTimeObject();
  static const char* GetClassname() noexcept { return "RatioTime"; }
  static const char* GetDescription() noexcept { return "Ratio time has a value and time scale."; }
  static void DefineObject();

  void Initialize(const RatioTime& ratio) noexcept { ratio_ = ratio; }
  const RatioTime& GetRatioTime() const noexcept { return ratio_; }

  static ScriptObjectPtr CreateRatioTime(int contextHandle, std::int64_t value, std::int64_t scale);
  std::int64_t GetValue() const noexcept { return ratio_.numerator(); }
  // (value)/(current scale), reduced: writing 2 to 1/2 gives 1/1.
  bool SetValue(std::int64_t value) noexcept;
  std::int64_t GetScale() const noexcept { return ratio_.denominator(); }
  // (current value)/(scale), reduced; 0 is refused.
  bool SetScale(std::int64_t scale) noexcept;

 private:
  RatioTime ratio_;
};

// "TimeDisplay": one TimeDisplay, the default display at first.
//
// Items: constructor; "type" (64-bit integer; the low 32 bits are stored);
// "customFPS" (unsigned; reads 0 unless the display is custom; writing makes
// it a custom display; 0 is refused).
class ZEBMEDIATYPES_API TimeDisplayObject : public zebscripting::ScriptObject,
                                            public zebscripting::ScriptCastInterface<TimeDisplay> {
 public:
  TimeDisplayObject();
  static const char* GetClassname() noexcept { return "TimeDisplay"; }
  static const char* GetDescription() noexcept { return "TimeDisplay class"; }
  static void DefineObject();

  void Initialize(const TimeDisplay& display) noexcept { display_ = display; }
  bool CastTo(TimeDisplay& display) const override;
  bool IsEqual(const ScriptObjectPtr& other) const override;
  // FNV-1a of the type code's 4 bytes only.
  std::uint64_t Hash() const override;

  TimeDisplay GetTimeDisplay() const noexcept { return display_; }
  std::int64_t GetType() const noexcept { return display_.GetType(); }
  bool SetType(std::int64_t type) noexcept;
  unsigned int GetCustomFPS() const noexcept;
  bool SetCustomFPS(unsigned int framesPerSecond) noexcept;

 private:
  TimeDisplay display_;
};

// Factories: a new object of the class in script context `contextHandle`.
ZEBMEDIATYPES_API ScriptObjectPtr CreateTickTimeObject(const TickTime& time, int contextHandle);
ZEBMEDIATYPES_API ScriptObjectPtr CreateFrameRateObject(const FrameRate& rate, int contextHandle);
ZEBMEDIATYPES_API ScriptObjectPtr CreateRatioTimeObject(const RatioTime& ratio, int contextHandle);
ZEBMEDIATYPES_API ScriptObjectPtr CreateTimeDisplayObject(
    const TimeDisplay& display, const boost::intrusive_ptr<zebscripting::ScriptContext>& context);

}  // namespace zebmediatypes::scripting

template <>
struct zebscripting::utility::TransformObjectIntoScriptingObject<zebmediatypes::TickTime> {
  zebscripting::ScriptObjectPtr operator()(const zebmediatypes::TickTime& time,
                                           int contextHandle) const {
    return zebmediatypes::scripting::CreateTickTimeObject(time, contextHandle);
  }
};

template <>
struct zebscripting::utility::TransformObjectIntoScriptingObject<zebmediatypes::FrameRate> {
  zebscripting::ScriptObjectPtr operator()(const zebmediatypes::FrameRate& rate,
                                           int contextHandle) const {
    return zebmediatypes::scripting::CreateFrameRateObject(rate, contextHandle);
  }
};
