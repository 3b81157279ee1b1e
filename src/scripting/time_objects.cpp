// Script classes of the time values.
#include <zebmediatypes/scripting/time_objects.h>
#include <zebmediatypes/timecode.h>
#include <zebscripting/definition.h>
#include <zebscripting/factory.h>

#include <boost/rational.hpp>
#include <cmath>
#include <limits>
#include <numeric>
#include <string>

#include "scripting/script_hash.h"

namespace zebmediatypes::scripting {
namespace {

using zebscripting::ParameterType;
using zebscripting::PropertyType;
using zebscripting::definition::kItemFlag_Host;
using zebscripting::definition::ScriptObjectDefinitionBase;
namespace def = zebscripting::definition;

// The value of an object parameter through its cast interface: `fallback` for
// a missing (null) object, ParameterErrorException for an object without one.
template <class T>
T CastParameter(const ScriptObjectPtr& object, T fallback, std::size_t index) {
  if (!object) return fallback;
  T value = fallback;
  if (!zebscripting::CastScriptObject(object, value)) {
    throw zebscripting::ParameterErrorException(
        zebscripting::ParameterErrorException::kWrongType, index,
        std::string("argument ") + std::to_string(index + 1) + " cannot be read as this type");
  }
  return value;
}

ScriptObjectDefinitionBase& Current() { return *ScriptObjectDefinitionBase::sCurrent; }

template <TickTime const& kValue>
ScriptObjectPtr MakeTimeConstant(int contextHandle) {
  return CreateTickTimeObject(kValue, contextHandle);
}

// A ratio value/scale in lowest terms with a positive scale, when it can be
// held in boost::rational<int64> without overflow: false for a zero scale,
// a numerator of -2^63, or a scale of 2^63.
bool ReduceRatio(std::int64_t value, std::int64_t scale, RatioTime& ratio) noexcept {
  if (scale == 0) return false;
  auto magnitude = [](std::int64_t v) {
    return v < 0 ? std::uint64_t{0} - static_cast<std::uint64_t>(v) : static_cast<std::uint64_t>(v);
  };
  std::uint64_t a = magnitude(value);
  std::uint64_t b = magnitude(scale);
  const std::uint64_t divisor = std::gcd(a, b);  // b != 0, so at least 1
  a /= divisor;
  b /= divisor;
  const bool negative = (value < 0) != (scale < 0) && a != 0;
  constexpr std::uint64_t kMax =
      static_cast<std::uint64_t>(std::numeric_limits<std::int64_t>::max());
  if (a > kMax || b > kMax) return false;
  const std::int64_t numerator =
      negative ? -static_cast<std::int64_t>(a) : static_cast<std::int64_t>(a);
  ratio = RatioTime(numerator, static_cast<std::int64_t>(b));
  return true;
}

}  // namespace

// ---------------------------------------------------------------------------
// TickTime

TickTimeObject::TickTimeObject() : ScriptObject(GetClassname()) {}

void TickTimeObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  if (definition.IsDefinitionOf(GetClassname()))
    definition.AddOrModifyNamespace("zebmediatypes", 0);
  using Self = TickTimeObject;
  const PropertyType<ScriptObjectPtr> tickTime("TickTime");
  definition.AddProperty(def::Constructor<Self>("Constructs a TickTime object"));
  definition.AddProperty(
      def::Property("seconds", PropertyType<double>(""), &Self::GetSeconds, &Self::SetSeconds,
                    "Read/Write property to get/set TickTime in seconds", kItemFlag_Host));
  definition.AddProperty(
      def::Method("equals", PropertyType<bool>(), &Self::Equals,
                  "Returns true if the given TickTime is equal to the TickTime object",
                  kItemFlag_Host, ParameterType<ScriptObjectPtr>("TickTime")));
  definition.AddProperty(def::Property(
      "ticks", PropertyType<zebcore::UTF16String>(""), &Self::GetTicks, &Self::SetTicks,
      "Read/Write property to get/set TickTime in ticks as a string", kItemFlag_Host));
  definition.AddProperty(def::Property(
      "ticksNumber", PropertyType<std::int64_t>(""), &Self::GetTicksNumber, &Self::SetTicksNumber,
      "Read/Write property to get/set TickTime in ticks as a number", kItemFlag_Host));
  definition.AddProperty(
      def::StaticMethod("timecodeToTime", tickTime, &Self::TimecodeToTime,
                        "Convert a timecode string to a TickTime using the current display format",
                        kItemFlag_Host, ParameterType<zebcore::UTF16String>("TimecodeString"),
                        ParameterType<ScriptObjectPtr>("FrameRate", "FrameRate"),
                        ParameterType<ScriptObjectPtr>("TimeDisplay", "TimeDisplay")));
  definition.AddProperty(def::StaticMethod(
      "timeToTimecode", PropertyType<zebcore::UTF16String>(), &Self::TimeToTimecode,
      "Convert a TickTime to a string using the current display format", kItemFlag_Host,
      ParameterType<ScriptObjectPtr>("TickTime", "TickTime"),
      ParameterType<ScriptObjectPtr>("FrameRate", "FrameRate"),
      ParameterType<ScriptObjectPtr>("TimeDisplay", "TimeDisplay")));
  definition.AddProperty(def::Method(
      "alignToNearestFrame", tickTime, &Self::AlignToNearestFrame,
      "AlignToNearestFrame will return a TickTime that is aligned to the nearest frame boundary "
      "greater than or less than the given time, for a given frame rate by rounding any "
      "fractional portion.",
      kItemFlag_Host, ParameterType<ScriptObjectPtr>("FrameRate", "FrameRate")));
  definition.AddProperty(def::Method(
      "alignToFrame", tickTime, &Self::AlignToFrame,
      "alignToFrame will return a TickTime that is aligned to the nearest frame boundary less "
      "than the given time, for a given frame rate by rounding any fractional portion.",
      kItemFlag_Host, ParameterType<ScriptObjectPtr>("FrameRate", "FrameRate")));
  struct Constant {
    const char* name;
    ScriptObjectPtr (*make)(int);
    const char* description;
  };
  static constexpr Constant kConstants[] = {
      {"TIME_ZERO", &MakeTimeConstant<kTime_Zero>, "Zero Tick Time Constant"},
      {"TIME_ONE_SECOND", &MakeTimeConstant<kTime_OneSecond>, "One Second Tick Time Constant"},
      {"TIME_ONE_MINUTE", &MakeTimeConstant<kTime_OneMinute>, "One Minute Tick Time Constant"},
      {"TIME_ONE_HOUR", &MakeTimeConstant<kTime_OneHour>, "One Hour Tick Time Constant"},
      {"TIME_MAX", &MakeTimeConstant<kTime_Max>, "Max Tick Time Constant"},
      {"TIME_MIN", &MakeTimeConstant<kTime_Min>, "Min Tick Time Constant"},
      {"TIME_INVALID", &MakeTimeConstant<kTime_Invalid>, "Invalid Tick Time Constant"},
  };
  static_assert(std::size(kConstants) == 7);
  for (const Constant& constant : kConstants) {
    definition.AddProperty(def::StaticProperty(constant.name, tickTime, constant.make,
                                               constant.description, kItemFlag_Host));
  }
}

bool TickTimeObject::CastTo(TickTime& time) const {
  time = time_;
  return true;
}

bool TickTimeObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const TickTimeObject*>(other.get());
  return same != nullptr && same->time_ == time_;
}

std::uint64_t TickTimeObject::Hash() const {
  return Fnv1a(static_cast<std::uint64_t>(time_.GetTicks()), 8);
}

double TickTimeObject::GetSeconds() const noexcept {
  return static_cast<double>(time_.GetTicks()) / static_cast<double>(details::kTicksPerSecond);
}

bool TickTimeObject::SetSeconds(double seconds) noexcept {
  if (!std::isfinite(seconds)) return false;
  const double ticks = std::round(seconds * static_cast<double>(details::kTicksPerSecond));
  // [-2^63, 2^63): every double in it converts exactly.
  if (!(ticks >= -9223372036854775808.0 && ticks < 9223372036854775808.0)) return false;
  time_ = TickTime(static_cast<std::int64_t>(ticks));
  return true;
}

zebcore::UTF16String TickTimeObject::GetTicks() const {
  return zebcore::string::AsciiToUTF16(std::to_string(time_.GetTicks()));
}

bool TickTimeObject::SetTicks(const zebcore::UTF16String& text) {
  std::size_t at = 0;
  auto isSpace = [](char16_t c) { return c == u' ' || (c >= u'\t' && c <= u'\r'); };
  while (at < text.size() && isSpace(text[at])) ++at;
  bool negative = false;
  if (at < text.size() && (text[at] == u'+' || text[at] == u'-')) negative = text[at++] == u'-';
  // Magnitudes up to 2^63 (the magnitude of INT64_MIN).
  constexpr std::uint64_t kLimit = std::uint64_t{1} << 63;
  std::uint64_t magnitude = 0;
  bool digits = false;
  for (; at < text.size() && text[at] >= u'0' && text[at] <= u'9'; ++at) {
    digits = true;
    const auto digit = static_cast<std::uint64_t>(text[at] - u'0');
    if (magnitude > (kLimit - digit) / 10) return false;  // beyond 64 bits
    magnitude = magnitude * 10 + digit;
  }
  std::int64_t ticks = 0;
  if (digits) {
    if (!negative && magnitude == kLimit) return false;
    ticks = negative ? static_cast<std::int64_t>(std::uint64_t{0} - magnitude)
                     : static_cast<std::int64_t>(magnitude);
  }
  if (TickTime(ticks) == kTime_Invalid) return false;
  time_ = TickTime(ticks);
  return true;
}

bool TickTimeObject::SetTicksNumber(std::int64_t ticks) noexcept {
  if (TickTime(ticks) == kTime_Invalid) return false;
  time_ = TickTime(ticks);
  return true;
}

bool TickTimeObject::Equals(const ScriptObjectPtr& other) const { return IsEqual(other); }

ScriptObjectPtr TickTimeObject::AlignToNearestFrame(const ScriptObjectPtr& rate) const {
  TickTime aligned = time_;
  aligned.AlignToNearestFrame(CastParameter(rate, kFrameRate_Invalid, 0));
  return CreateTickTimeObject(aligned, GetContextHandle());
}

ScriptObjectPtr TickTimeObject::AlignToFrame(const ScriptObjectPtr& rate) const {
  TickTime aligned = time_;
  aligned.AlignToFrame(CastParameter(rate, kFrameRate_Invalid, 0));
  return CreateTickTimeObject(aligned, GetContextHandle());
}

ScriptObjectPtr TickTimeObject::TimecodeToTime(int contextHandle, const zebcore::UTF16String& text,
                                               const ScriptObjectPtr& rate,
                                               const ScriptObjectPtr& display) {
  const TickTime time = zebmediatypes::TimecodeToTime(zebcore::string::View(text),
                                                      CastParameter(rate, kFrameRate_Invalid, 1),
                                                      CastParameter(display, TimeDisplay(), 2), {});
  return CreateTickTimeObject(time, contextHandle);
}

zebcore::UTF16String TickTimeObject::TimeToTimecode(int /*contextHandle*/,
                                                    const ScriptObjectPtr& time,
                                                    const ScriptObjectPtr& rate,
                                                    const ScriptObjectPtr& display) {
  return zebmediatypes::TimeToTimecode(CastParameter(time, kTime_Zero, 0),
                                       CastParameter(rate, kFrameRate_Invalid, 1),
                                       CastParameter(display, TimeDisplay(), 2), {});
}

ScriptObjectPtr CreateTickTimeObject(const TickTime& time, int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, TickTimeObject::GetClassname(), [&time](const ScriptObjectPtr& object) {
        static_cast<TickTimeObject&>(*object).Initialize(time);
      });
}

// ---------------------------------------------------------------------------
// FrameRate

FrameRateObject::FrameRateObject() : ScriptObject(GetClassname()) {}

void FrameRateObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  if (definition.IsDefinitionOf(GetClassname()))
    definition.AddOrModifyNamespace("zebmediatypes", 0);
  using Self = FrameRateObject;
  definition.AddProperty(def::Constructor<Self>("Constructs a FrameRateObject object"));
  definition.AddProperty(def::Property(
      "ticksPerFrame", PropertyType<std::int64_t>(""), &Self::GetTicksPerFrame,
      &Self::SetTicksPerFrame, "Read/Write property to get/set ticks per frame.", kItemFlag_Host));
  definition.AddProperty(def::StaticMethod(
      "createWithValue", PropertyType<ScriptObjectPtr>("FrameRate"), &Self::CreateWithValue,
      "Create frame rate object with a value", kItemFlag_Host, ParameterType<double>("")));
}

bool FrameRateObject::CastTo(FrameRate& rate) const {
  rate = rate_;
  return true;
}

bool FrameRateObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const FrameRateObject*>(other.get());
  return same != nullptr && same->rate_ == rate_;
}

std::uint64_t FrameRateObject::Hash() const {
  return Fnv1a(static_cast<std::uint64_t>(rate_.GetTicksPerFrame()), 8);
}

bool FrameRateObject::SetTicksPerFrame(std::int64_t ticks) noexcept {
  rate_ = FrameRate(ticks);
  return true;
}

ScriptObjectPtr FrameRateObject::CreateWithValue(int contextHandle, double framesPerSecond) {
  FrameRate rate = kFrameRate_Invalid;
  if (std::isfinite(framesPerSecond) && framesPerSecond > 0.0) {
    const double ticks =
        std::trunc(static_cast<double>(details::kTicksPerSecond) / framesPerSecond);
    if (ticks >= 1.0 && ticks < 9223372036854775808.0) {
      rate = FrameRate(static_cast<std::int64_t>(ticks));
    }
  }
  return CreateFrameRateObject(rate, contextHandle);
}

ScriptObjectPtr CreateFrameRateObject(const FrameRate& rate, int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, FrameRateObject::GetClassname(), [&rate](const ScriptObjectPtr& object) {
        static_cast<FrameRateObject&>(*object).Initialize(rate);
      });
}

// ---------------------------------------------------------------------------
// RatioTime

RatioTimeObject::RatioTimeObject() : ScriptObject(GetClassname()) {}

void RatioTimeObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  if (definition.IsDefinitionOf(GetClassname())) {
    definition.AddOrModifyNamespace("zebmediatypes", 0);
    definition.AddOrModifyNamespace("RatioTime", zebscripting::definition::kNamespaceFlag_Global);
  }
  using Self = RatioTimeObject;
  definition.AddProperty(def::StaticMethod(
      "createRatioTime", PropertyType<ScriptObjectPtr>("RatioTime"), &Self::CreateRatioTime,
      "Construct a ratio time.", kItemFlag_Host, ParameterType<std::int64_t>("value"),
      ParameterType<std::int64_t>("scale")));
  definition.AddProperty(def::Property("value", PropertyType<std::int64_t>(""), &Self::GetValue,
                                       &Self::SetValue, "Ratio time value.", kItemFlag_Host));
  definition.AddProperty(def::Property("scale", PropertyType<std::int64_t>(""), &Self::GetScale,
                                       &Self::SetScale, "Ratio time scale.", kItemFlag_Host));
}

ScriptObjectPtr RatioTimeObject::CreateRatioTime(int contextHandle, std::int64_t value,
                                                 std::int64_t scale) {
  if (scale == 0) return CreateRatioTimeObject(RatioTime(value, scale), contextHandle);  // throws
  RatioTime ratio;
  if (!ReduceRatio(value, scale, ratio)) {
    throw boost::bad_rational("bad rational: value and scale cannot be held in lowest terms");
  }
  return CreateRatioTimeObject(ratio, contextHandle);
}

bool RatioTimeObject::SetValue(std::int64_t value) noexcept {
  return ReduceRatio(value, ratio_.denominator(), ratio_);
}

bool RatioTimeObject::SetScale(std::int64_t scale) noexcept {
  return ReduceRatio(ratio_.numerator(), scale, ratio_);
}

ScriptObjectPtr CreateRatioTimeObject(const RatioTime& ratio, int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, RatioTimeObject::GetClassname(), [&ratio](const ScriptObjectPtr& object) {
        static_cast<RatioTimeObject&>(*object).Initialize(ratio);
      });
}

// ---------------------------------------------------------------------------
// TimeDisplay

TimeDisplayObject::TimeDisplayObject() : ScriptObject(GetClassname()) {}

void TimeDisplayObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  if (definition.IsDefinitionOf(GetClassname()))
    definition.AddOrModifyNamespace("zebmediatypes", 0);
  using Self = TimeDisplayObject;
  definition.AddProperty(def::Constructor<Self>("Constructs a TimeDisplay object"));
  definition.AddProperty(def::Property(
      "type", PropertyType<std::int64_t>(""), &Self::GetType, &Self::SetType,
      "Read/Write property to get/set the time display type numeric code", kItemFlag_Host));
  definition.AddProperty(def::Property(
      "customFPS", PropertyType<unsigned int>(""), &Self::GetCustomFPS, &Self::SetCustomFPS,
      "Read/Write property to get/set the time display custom frames per second value",
      kItemFlag_Host));
}

bool TimeDisplayObject::CastTo(TimeDisplay& display) const {
  display = display_;
  return true;
}

bool TimeDisplayObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const TimeDisplayObject*>(other.get());
  return same != nullptr && same->display_ == display_;
}

std::uint64_t TimeDisplayObject::Hash() const {
  return Fnv1a(static_cast<std::uint32_t>(display_.GetType()), 4);
}

bool TimeDisplayObject::SetType(std::int64_t type) noexcept {
  const auto low = static_cast<std::int32_t>(static_cast<std::uint32_t>(type & 0xFFFFFFFF));
  display_.SetType(static_cast<TimeDisplayType>(low));
  return true;
}

unsigned int TimeDisplayObject::GetCustomFPS() const noexcept {
  return display_.IsCustom() ? display_.GetCustomFramesPerSecond() : 0;
}

bool TimeDisplayObject::SetCustomFPS(unsigned int framesPerSecond) noexcept {
  if (framesPerSecond == 0) return false;  // a custom display needs a frame each second
  display_.SetCustomFramesPerSecond(framesPerSecond);
  return true;
}

ScriptObjectPtr CreateTimeDisplayObject(
    const TimeDisplay& display, const boost::intrusive_ptr<zebscripting::ScriptContext>& context) {
  return zebscripting::utils::CreateScriptObject(
      context ? context->GetHandle() : 0, TimeDisplayObject::GetClassname(),
      [&display](const ScriptObjectPtr& object) {
        static_cast<TimeDisplayObject&>(*object).Initialize(display);
      });
}

namespace {

using zebscripting::factory::ScriptObjectDefinitionInitiator;
using zebscripting::factory::ScriptObjectDefinitionRegistrar;

// The classes are registered with the host when the library loads.
const ScriptObjectDefinitionRegistrar kTickTimeRegistrar(
    new ScriptObjectDefinitionInitiator<TickTimeObject>());
const ScriptObjectDefinitionRegistrar kFrameRateRegistrar(
    new ScriptObjectDefinitionInitiator<FrameRateObject>());
const ScriptObjectDefinitionRegistrar kRatioTimeRegistrar(
    new ScriptObjectDefinitionInitiator<RatioTimeObject>());
const ScriptObjectDefinitionRegistrar kTimeDisplayRegistrar(
    new ScriptObjectDefinitionInitiator<TimeDisplayObject>());

}  // namespace
}  // namespace zebmediatypes::scripting
