// Script values to native values and back (ParameterType::Validate and
// PropertyType::ToScript).
#include <zebcore/string.h>
#include <zebscripting/definition.h>
#include <zebscripting/types.h>

#include <cmath>
#include <limits>
#include <string>

namespace zebscripting::conversion {
namespace {

std::string Ordinal(std::size_t index) {
  if (index == ParameterErrorException::kReceiver) return "the receiver";
  return "argument " + std::to_string(index + 1);
}

[[noreturn]] void WrongType(const ScriptValue& value, std::size_t index, const char* wanted) {
  throw ParameterErrorException(
      ParameterErrorException::kWrongType, index,
      Ordinal(index) + " must be " + wanted + ", not " + value.Describe());
}

[[noreturn]] void OutOfRange(std::size_t index, const char* wanted) {
  throw ParameterErrorException(ParameterErrorException::kOutOfRange, index,
                                Ordinal(index) + " must be " + wanted);
}

// An integral number in [low, high] (both exactly representable as doubles).
double Integral(const ScriptValue& value, std::size_t index, double low, double high,
                const char* wanted) {
  if (!value.IsNumber()) WrongType(value, index, "a number");
  const double number = value.GetNumber();
  if (!(number >= low && number <= high) || std::trunc(number) != number) {
    OutOfRange(index, wanted);
  }
  return number;
}

}  // namespace

void ThrowMissing(std::size_t index, const std::string& name) {
  throw ParameterErrorException(
      ParameterErrorException::kMissing, index,
      Ordinal(index) + (name.empty() ? std::string() : " (" + name + ")") + " is missing");
}

bool ToBool(const ScriptValue& value, std::size_t index) {
  if (!value.IsBool()) WrongType(value, index, "a boolean");
  return value.GetBool();
}

int ToInt(const ScriptValue& value, std::size_t index) {
  return static_cast<int>(Integral(value, index, -2147483648.0, 2147483647.0,
                                   "an integer in [-2147483648, 2147483647]"));
}

unsigned int ToUnsigned(const ScriptValue& value, std::size_t index) {
  return static_cast<unsigned int>(
      Integral(value, index, 0.0, 4294967295.0, "an integer in [0, 4294967295]"));
}

std::int64_t ToInt64(const ScriptValue& value, std::size_t index) {
  const double number = Integral(value, index, -9223372036854775808.0, 9223372036854775808.0,
                                 "an integer in [-2^63, 2^63]");
  // 2^63 is the nearest double to 2^63 - 1.
  if (number >= 9223372036854775808.0) return std::numeric_limits<std::int64_t>::max();
  return static_cast<std::int64_t>(number);
}

float ToFloat(const ScriptValue& value, std::size_t index) {
  if (!value.IsNumber()) WrongType(value, index, "a number");
  const double number = value.GetNumber();
  if (std::isfinite(number) && std::fabs(number) > std::numeric_limits<float>::max()) {
    OutOfRange(index, "a number within the float range");
  }
  return static_cast<float>(number);
}

double ToDouble(const ScriptValue& value, std::size_t index) {
  if (!value.IsNumber()) WrongType(value, index, "a number");
  return value.GetNumber();
}

zebcore::UTF8String ToUTF8(const ScriptValue& value, std::size_t index) {
  if (!value.IsString()) WrongType(value, index, "a string");
  return zebcore::string::UTF16to8(value.GetString());
}

zebcore::UTF16String ToUTF16(const ScriptValue& value, std::size_t index) {
  if (!value.IsString()) WrongType(value, index, "a string");
  const std::u16string& text = value.GetString();
  return zebcore::UTF16String(text.begin(), text.end());
}

std::vector<int> ToIntVector(const ScriptValue& value, std::size_t index) {
  if (!value.IsArray()) WrongType(value, index, "an array of integers");
  std::vector<int> result;
  result.reserve(value.GetElements().size());
  for (const ScriptValue& element : value.GetElements()) {
    if (!element.IsNumber()) WrongType(element, index, "an array of integers");
    const double number = element.GetNumber();
    if (!(number >= -2147483648.0 && number <= 2147483647.0) || std::trunc(number) != number) {
      OutOfRange(index, "an array of integers in [-2147483648, 2147483647]");
    }
    result.push_back(static_cast<int>(number));
  }
  return result;
}

ScriptObjectPtr ToObject(const ScriptValue& value, std::size_t index,
                         const std::string& className) {
  if (!value.IsObject()) {
    WrongType(value, index, className.empty() ? "a script object" : ("a " + className).c_str());
  }
  if (!className.empty() && className != value.GetObject()->GetClassName()) {
    WrongType(value, index, ("a " + className + " object").c_str());
  }
  return value.GetObject();
}

ScriptValue FromUTF8(const zebcore::UTF8String& text) {
  const zebcore::UTF16String wide = zebcore::string::UTF8to16(text);
  return ScriptValue(std::u16string(wide.begin(), wide.end()));
}

ScriptValue FromUTF16(const zebcore::UTF16String& text) {
  return ScriptValue(std::u16string(text.begin(), text.end()));
}

ScriptValue FromIntVector(const std::vector<int>& values) {
  std::vector<ScriptValue> elements;
  elements.reserve(values.size());
  for (int value : values) elements.emplace_back(static_cast<double>(value));
  return ScriptValue(std::move(elements));
}

}  // namespace zebscripting::conversion
