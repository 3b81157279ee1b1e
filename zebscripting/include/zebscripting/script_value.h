// ScriptValue: a value as it crosses between script and native code, the same
// whatever engine runs the script.
//
//   undefined, null, a boolean, a number (double), a string (UTF-16, kept as
//   given: lone surrogates survive), a script object of this host, an array of
//   values, or "other" (a value native code cannot take: a function, a plain
//   script object, a symbol...; only a short name of what it was is kept).
//
// ScriptArguments is a read-only view of the arguments of one call; reading
// past the end gives undefined, which every parameter treats as missing.
#pragma once

#include <zebscripting/export.h>
#include <zebscripting/script_object.h>

#include <boost/intrusive_ptr.hpp>
#include <cstddef>
#include <memory>
#include <string>
#include <vector>

namespace zebscripting {

class ZEBSCRIPTING_API ScriptValue {
 public:
  enum class Kind { kUndefined, kNull, kBool, kNumber, kString, kObject, kArray, kOther };

  ScriptValue() noexcept = default;  // undefined
  ScriptValue(bool value) noexcept : kind_(Kind::kBool), bool_(value) {}
  ScriptValue(double value) noexcept : kind_(Kind::kNumber), number_(value) {}
  ScriptValue(std::u16string text)
      : kind_(Kind::kString), payload_(new Payload{std::move(text), {}, {}}) {}
  ScriptValue(const char16_t* text) : ScriptValue(std::u16string(text)) {}
  // A script object; a null pointer gives null.
  ScriptValue(ScriptObjectPtr object);
  ScriptValue(std::vector<ScriptValue> elements)
      : kind_(Kind::kArray), payload_(new Payload{{}, std::move(elements), {}}) {}
  ScriptValue(const ScriptValue& other);
  ScriptValue& operator=(const ScriptValue& other);
  ScriptValue(ScriptValue&&) noexcept = default;
  ScriptValue& operator=(ScriptValue&&) noexcept = default;
  ~ScriptValue() = default;
  // No implicit conversion from integers or narrow text: say which is meant.
  ScriptValue(int) = delete;
  ScriptValue(const char*) = delete;

  static ScriptValue Null() noexcept {
    ScriptValue value;
    value.kind_ = Kind::kNull;
    return value;
  }
  // A value native code cannot take; `what` says what it was ("function").
  static ScriptValue Other(std::string what) {
    ScriptValue value;
    value.kind_ = Kind::kOther;
    value.payload_.reset(new Payload{{}, {}, std::move(what)});
    return value;
  }

  Kind GetKind() const noexcept { return kind_; }
  bool IsUndefined() const noexcept { return kind_ == Kind::kUndefined; }
  bool IsNull() const noexcept { return kind_ == Kind::kNull; }
  // Undefined or null: what a parameter reads as missing.
  bool IsNullish() const noexcept { return kind_ == Kind::kUndefined || kind_ == Kind::kNull; }
  bool IsBool() const noexcept { return kind_ == Kind::kBool; }
  bool IsNumber() const noexcept { return kind_ == Kind::kNumber; }
  bool IsString() const noexcept { return kind_ == Kind::kString; }
  bool IsObject() const noexcept { return kind_ == Kind::kObject; }
  bool IsArray() const noexcept { return kind_ == Kind::kArray; }

  // The stored value; the defaults (false, 0.0, empty, null) for another kind.
  bool GetBool() const noexcept { return kind_ == Kind::kBool && bool_; }
  double GetNumber() const noexcept { return kind_ == Kind::kNumber ? number_ : 0.0; }
  const std::u16string& GetString() const noexcept { return Data().text; }
  const ScriptObjectPtr& GetObject() const noexcept { return object_; }
  const std::vector<ScriptValue>& GetElements() const noexcept { return Data().elements; }
  const std::string& GetOtherName() const noexcept { return Data().other; }

  // A short English name of the kind ("number", "TickTime object", "function").
  std::string Describe() const;

 private:
  // Strings, arrays and "other" names live apart, so that the common kinds
  // (numbers, booleans, objects) stay small and cheap to move.
  struct Payload {
    std::u16string text;
    std::vector<ScriptValue> elements;
    std::string other;
  };
  static const Payload& Empty() noexcept;
  const Payload& Data() const noexcept { return payload_ ? *payload_ : Empty(); }

  Kind kind_ = Kind::kUndefined;
  bool bool_ = false;
  double number_ = 0.0;
  ScriptObjectPtr object_;
  std::unique_ptr<Payload> payload_;
};

// The arguments of one call, borrowed from the caller.
class ScriptArguments {
 public:
  ScriptArguments() noexcept = default;
  ScriptArguments(const ScriptValue* values, std::size_t count) noexcept
      : values_(values), count_(count) {}
  ScriptArguments(const std::vector<ScriptValue>& values) noexcept
      : values_(values.data()), count_(values.size()) {}

  std::size_t size() const noexcept { return count_; }
  // Argument `index`; undefined past the end.
  const ScriptValue& operator[](std::size_t index) const noexcept {
    return index < count_ ? values_[index] : Undefined();
  }

 private:
  ZEBSCRIPTING_API static const ScriptValue& Undefined() noexcept;
  const ScriptValue* values_ = nullptr;
  std::size_t count_ = 0;
};

}  // namespace zebscripting
