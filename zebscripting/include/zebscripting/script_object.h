// ScriptObject: the base of every native object that script code can hold.
//
// A script object wraps one native value. It is reference counted
// (boost::intrusive_ptr<ScriptObject>, alias ScriptObjectPtr); the host holds
// one reference for each engine wrapper and releases it when the wrapper is
// collected or its heap is destroyed. Objects are made through
// utils::CreateScriptObject (utils.h) or by script with `new`, never on the
// stack.
//
// ScriptCastInterface<T> is the second base of objects that can give their
// native value as a T; CastScriptObject reads it from any object.
#pragma once

#include <zebcore/ref_counted.h>
#include <zebscripting/export.h>

#include <atomic>
#include <boost/intrusive_ptr.hpp>
#include <cstddef>
#include <cstdint>
#include <stdexcept>
#include <string>

namespace zebscripting {

class ScriptObject;
using ScriptObjectPtr = boost::intrusive_ptr<ScriptObject>;

class ZEBSCRIPTING_API ScriptObjectBase {
 public:
  virtual ~ScriptObjectBase();
};

// The reference-counted base comes first, so that the object and its counted
// part share one address.
class ZEBSCRIPTING_API ScriptObject : public zebcore::utility::RefCountedObjectWithWeakPtr,
                                      public ScriptObjectBase {
 public:
  // `name` is the registered class name; it must outlive the object (a
  // literal or the class's GetClassname()).
  explicit ScriptObject(const char* name);
  ~ScriptObject() override;

  const char* GetClassName() const noexcept { return className_; }

  // The script context the object was made in (0 for none). Set by the host
  // when it creates the object.
  int GetContextHandle() const noexcept { return contextHandle_; }
  void SetContextHandle(int handle) noexcept { contextHandle_ = handle; }

  // Script equality (the `isEqual` method every script object has). The host's
  // own: the same object. Classes with a value of their own override it: true
  // exactly for an object of the same class with an equal value.
  virtual bool IsEqual(const ScriptObjectPtr& other) const;
  // A hash consistent with IsEqual. The host's own hashes the address.
  virtual std::uint64_t Hash() const;

  // A native owner that keeps this object as a part of itself ("held") locks
  // it: each lock holds one more reference until the matching unlock. Locks
  // nest; an unlock without a lock is ignored.
  void LockObject() noexcept;
  void UnlockObject() noexcept;
  bool IsLocked() const noexcept { return locks_.load(std::memory_order_acquire) > 0; }

  // Script objects alive in the process (all classes); for leak checks.
  static std::size_t LiveObjectCount() noexcept;

 private:
  const char* className_;
  int contextHandle_ = 0;
  std::atomic<int> locks_{0};
};

// A wrong argument or receiver of a script call, raised while the host
// converts arguments (ParameterType::Validate) or by an item itself. Script
// sees a TypeError for kWrongType and kMissing, a RangeError for kOutOfRange.
class ZEBSCRIPTING_API ParameterErrorException : public std::runtime_error {
 public:
  enum Kind { kWrongType, kOutOfRange, kMissing };
  // Index of the receiver (`this`) when the wrong object is called.
  static constexpr std::size_t kReceiver = static_cast<std::size_t>(-1);

  ParameterErrorException(Kind kind, std::size_t index, const std::string& message)
      : std::runtime_error(message), kind_(kind), index_(index) {}
  ~ParameterErrorException() override;

  Kind GetKind() const noexcept { return kind_; }
  std::size_t GetIndex() const noexcept { return index_; }

 private:
  Kind kind_;
  std::size_t index_;
};

template <class T>
class ZEBSCRIPTING_API ScriptCastInterface {
 public:
  virtual ~ScriptCastInterface() = default;
  // Copies the native value into `value`; true when it did.
  virtual bool CastTo(T& value) const = 0;
};

// Reads a T from `object` through its ScriptCastInterface<T>. False (and
// `value` unchanged) when the object is null or has no such interface.
template <class T>
bool CastScriptObject(const ScriptObjectPtr& object, T& value) {
  const auto* cast = dynamic_cast<const ScriptCastInterface<T>*>(object.get());
  return cast != nullptr && cast->CastTo(value);
}

}  // namespace zebscripting
