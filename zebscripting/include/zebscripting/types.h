// PropertyType<T> and ParameterType<T>: the native types that cross into
// script, and how script values are converted to them.
//
// T is one of: bool, int, unsigned int, std::int64_t, float, double,
// zebcore::UTF8String, zebcore::UTF16String, std::vector<int>, ScriptObjectPtr,
// and ScriptValue (the argument untouched, for an item that takes more than
// one kind of value and sorts it out itself; undefined when missing). Both are built with a name (a
// parameter's name, or "" for a setter's value), optionally a default used when the argument is
// missing, and, for objects, optionally the class name the argument must have:
//
//   ParameterType<std::int64_t>("value")
//   ParameterType<unsigned int>("samplerate", 44100u)
//   ParameterType<ScriptObjectPtr>("FrameRate", "FrameRate")   // only "FrameRate" objects
//   ParameterType<ScriptObjectPtr>("other")                    // any script object
//
// Validate(index, arguments) converts argument `index` or throws
// ParameterErrorException:
//   - missing (past the end, undefined, or null): the default when there is
//     one; null for an object; otherwise kMissing.
//   - bool: a boolean only.
//   - int, unsigned int, std::int64_t: an integral number (-0 is 0) in the
//     type's range, else kOutOfRange (NaN, infinities, 1.5, -1 for unsigned,
//     2^31 for int). std::int64_t takes [-2^63, 2^63], 2^63 meaning 2^63 - 1
//     (the nearest double to 2^63 - 1 is 2^63). Never wrapped.
//   - float: any number whose magnitude is not beyond the largest float (NaN
//     and infinities pass); double: any number.
//   - strings: a string only. UTF-16 is taken as it is (lone surrogates kept);
//     UTF-8 is converted, a lone surrogate becoming U+FFFD.
//   - std::vector<int>: an array whose every element is an int as above.
//   - ScriptObjectPtr: a script object of this host (of the given class when
//     one was named); anything else is kWrongType.
// Anything of another kind is kWrongType.
//
// ToScript(value) is the other way: integers and floats become numbers (a
// 64-bit integer the nearest double, exact up to 2^53), strings strings,
// vectors arrays, objects objects (null for a null pointer).
#pragma once

#include <zebcore/string.h>
#include <zebscripting/export.h>
#include <zebscripting/script_object.h>
#include <zebscripting/script_value.h>

#include <cstddef>
#include <cstdint>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace zebscripting {

// What a PropertyType or ParameterType carries, without the template.
enum class ValueType {
  kVoid,
  kBool,
  kInt,
  kUnsignedInt,
  kInt64,
  kFloat,
  kDouble,
  kUTF8String,
  kUTF16String,
  kIntVector,
  kObject,
  kAny  // ScriptValue: the argument as script gave it, for items that sort it out themselves
};

// The engine-neutral conversions behind Validate and ToScript.
namespace conversion {
ZEBSCRIPTING_API bool ToBool(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API int ToInt(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API unsigned int ToUnsigned(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API std::int64_t ToInt64(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API float ToFloat(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API double ToDouble(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API zebcore::UTF8String ToUTF8(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API zebcore::UTF16String ToUTF16(const ScriptValue& value, std::size_t index);
ZEBSCRIPTING_API std::vector<int> ToIntVector(const ScriptValue& value, std::size_t index);
// `className` empty: any script object.
ZEBSCRIPTING_API ScriptObjectPtr ToObject(const ScriptValue& value, std::size_t index,
                                          const std::string& className);

ZEBSCRIPTING_API ScriptValue FromUTF8(const zebcore::UTF8String& text);
ZEBSCRIPTING_API ScriptValue FromUTF16(const zebcore::UTF16String& text);
ZEBSCRIPTING_API ScriptValue FromIntVector(const std::vector<int>& values);
// Throws ParameterErrorException(kMissing) for parameter `index` named `name`.
[[noreturn]] ZEBSCRIPTING_API void ThrowMissing(std::size_t index, const std::string& name);
}  // namespace conversion

// The non-template part of a type: its kind, name, class name and default.
class ZEBSCRIPTING_API TypeDescription {
 public:
  ValueType GetType() const noexcept { return type_; }
  const std::string& GetName() const noexcept { return name_; }
  // For objects: the required class, or empty for any object.
  const std::string& GetClassName() const noexcept { return className_; }
  bool HasDefault() const noexcept { return hasDefault_; }
  const ScriptValue& GetDefault() const noexcept { return default_; }

 protected:
  TypeDescription(ValueType type, std::string name, std::string className, bool hasDefault,
                  ScriptValue defaultValue)
      : type_(type),
        name_(std::move(name)),
        className_(std::move(className)),
        hasDefault_(hasDefault),
        default_(std::move(defaultValue)) {}

 private:
  ValueType type_;
  std::string name_;
  std::string className_;
  bool hasDefault_;
  ScriptValue default_;
};

template <class T>
struct ValueTraits;  // only the types listed above

template <>
struct ValueTraits<bool> {
  static constexpr ValueType kType = ValueType::kBool;
  static bool FromScript(const ScriptValue& v, std::size_t i) { return conversion::ToBool(v, i); }
  static ScriptValue ToScript(bool value) { return ScriptValue(value); }
};
template <>
struct ValueTraits<int> {
  static constexpr ValueType kType = ValueType::kInt;
  static int FromScript(const ScriptValue& v, std::size_t i) { return conversion::ToInt(v, i); }
  static ScriptValue ToScript(int value) { return ScriptValue(static_cast<double>(value)); }
};
template <>
struct ValueTraits<unsigned int> {
  static constexpr ValueType kType = ValueType::kUnsignedInt;
  static unsigned int FromScript(const ScriptValue& v, std::size_t i) {
    return conversion::ToUnsigned(v, i);
  }
  static ScriptValue ToScript(unsigned int value) {
    return ScriptValue(static_cast<double>(value));
  }
};
template <>
struct ValueTraits<std::int64_t> {
  static constexpr ValueType kType = ValueType::kInt64;
  static std::int64_t FromScript(const ScriptValue& v, std::size_t i) {
    return conversion::ToInt64(v, i);
  }
  static ScriptValue ToScript(std::int64_t value) {
    return ScriptValue(static_cast<double>(value));
  }
};
template <>
struct ValueTraits<float> {
  static constexpr ValueType kType = ValueType::kFloat;
  static float FromScript(const ScriptValue& v, std::size_t i) { return conversion::ToFloat(v, i); }
  static ScriptValue ToScript(float value) { return ScriptValue(static_cast<double>(value)); }
};
template <>
struct ValueTraits<double> {
  static constexpr ValueType kType = ValueType::kDouble;
  static double FromScript(const ScriptValue& v, std::size_t i) {
    return conversion::ToDouble(v, i);
  }
  static ScriptValue ToScript(double value) { return ScriptValue(value); }
};
template <>
struct ValueTraits<zebcore::UTF8String> {
  static constexpr ValueType kType = ValueType::kUTF8String;
  static zebcore::UTF8String FromScript(const ScriptValue& v, std::size_t i) {
    return conversion::ToUTF8(v, i);
  }
  static ScriptValue ToScript(const zebcore::UTF8String& value) {
    return conversion::FromUTF8(value);
  }
};
template <>
struct ValueTraits<zebcore::UTF16String> {
  static constexpr ValueType kType = ValueType::kUTF16String;
  static zebcore::UTF16String FromScript(const ScriptValue& v, std::size_t i) {
    return conversion::ToUTF16(v, i);
  }
  static ScriptValue ToScript(const zebcore::UTF16String& value) {
    return conversion::FromUTF16(value);
  }
};
template <>
struct ValueTraits<std::vector<int>> {
  static constexpr ValueType kType = ValueType::kIntVector;
  static std::vector<int> FromScript(const ScriptValue& v, std::size_t i) {
    return conversion::ToIntVector(v, i);
  }
  static ScriptValue ToScript(const std::vector<int>& value) {
    return conversion::FromIntVector(value);
  }
};
template <>
struct ValueTraits<ScriptObjectPtr> {
  static constexpr ValueType kType = ValueType::kObject;
  static ScriptValue ToScript(const ScriptObjectPtr& value) { return ScriptValue(value); }
};

template <>
struct ValueTraits<ScriptValue> {
  static constexpr ValueType kType = ValueType::kAny;
  static ScriptValue ToScript(const ScriptValue& value) { return value; }
};

template <class T>
class PropertyType : public TypeDescription {
  static constexpr bool kIsObject = std::is_same_v<T, ScriptObjectPtr>;
  static constexpr bool kIsAny = std::is_same_v<T, ScriptValue>;

 public:
  using ValueTypeT = T;

  // No default: a missing argument is an error (null for an object).
  explicit PropertyType(std::string name = {})
      : TypeDescription(ValueTraits<T>::kType, std::move(name), {}, false, {}) {}
  // With a default used when the argument is missing.
  template <class U = T, std::enable_if_t<!std::is_same_v<U, ScriptObjectPtr>, int> = 0>
  PropertyType(std::string name, T defaultValue)
      : TypeDescription(ValueTraits<T>::kType, std::move(name), {}, true,
                        ValueTraits<T>::ToScript(defaultValue)),
        defaultValue_(std::move(defaultValue)) {}
  // An object of class `className` only.
  template <class U = T, std::enable_if_t<std::is_same_v<U, ScriptObjectPtr>, int> = 0>
  PropertyType(std::string name, const char* className)
      : TypeDescription(ValueType::kObject, std::move(name), className, false, {}) {}

  // Argument `index` of `arguments` as a T, or ParameterErrorException.
  T Validate(std::size_t index, const ScriptArguments& arguments) const {
    const ScriptValue& value = arguments[index];
    if constexpr (kIsAny) {
      return value.IsUndefined() && HasDefault() ? defaultValue_ : value;
    }
    if (value.IsNullish()) {
      if constexpr (kIsObject) {
        return {};
      } else {
        if (HasDefault()) return defaultValue_;
        conversion::ThrowMissing(index, GetName());
      }
    }
    if constexpr (kIsObject) {
      return conversion::ToObject(value, index, GetClassName());
    } else if constexpr (kIsAny) {
      return value;
    } else {
      return ValueTraits<T>::FromScript(value, index);
    }
  }

  static ScriptValue ToScript(const T& value) { return ValueTraits<T>::ToScript(value); }

 private:
  T defaultValue_{};
};

template <class T>
class ParameterType : public PropertyType<T> {
 public:
  using PropertyType<T>::PropertyType;
};

}  // namespace zebscripting
