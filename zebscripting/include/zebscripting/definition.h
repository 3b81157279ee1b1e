// Script class definitions: the items of each class, their flags, and the
// builders that bind native member functions to items.
//
// A class definition holds the class name and description, its namespace
// entries and its items in definition order. It is filled once by the class's
// static DefineObject() while it is ScriptObjectDefinitionBase::sCurrent (see
// factory.h), and read-only afterwards.
//
// Item flags word (32 bits): the kind in the low bits (kItemFlag_...), 64 for
// an item of the class rather than of instances, the caller's host flags masked
// with 0x580000 and further flags masked with 0x60000. Constructors take only
// the 0x60000 part (no host flags, no static bit), whatever the caller passes.
//
// Every item is called with a ScriptCall: the handle of the calling script
// context (also for static items, which have no object), the receiver (null
// for static items) and the arguments. Native code is called synchronously on
// the calling thread; the asynchronous flags 0x100000 and 0x200000 are kept in
// the word but not acted on.
#pragma once

#include <zebscripting/export.h>
#include <zebscripting/script_object.h>
#include <zebscripting/script_value.h>
#include <zebscripting/types.h>

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <typeinfo>
#include <utility>
#include <vector>

namespace zebscripting {

// One call of an item.
struct ScriptCall {
  int contextHandle = 0;         // the calling script context
  ScriptObject* self = nullptr;  // the receiver; null for static items
  ScriptArguments arguments;     // setter: the value is argument 0
};

namespace definition {

enum ItemFlag : std::uint32_t {
  kItemFlag_ReadOnlyProperty = 0x1,
  kItemFlag_ReadWriteProperty = 0x2,
  kItemFlag_Method = 0x4,
  kItemFlag_Static = 0x40,
  kItemFlag_Constructor = 0x80,
  kItemFlag_Constant = 0x101,       // a static value: an integer or a UTF-8 string
  kItemFlag_ElementCount = 0x2001,  // `length` of an indexable object
  kItemFlag_IndexedGetter = 0x4001,
  kItemFlag_HostFlagsMask = 0x580000,
  kItemFlag_FurtherFlagsMask = 0x60000,
  kItemFlag_Host = 0x80000,                 // passed by every item of the media library
  kItemFlag_Asynchronous = 0x100000,        // would run on a worker; not acted on
  kItemFlag_UserInterfaceThread = 0x200000  // would run on the UI thread; not acted on
};

// Namespace entry flag: the class is also a global of the entry's name.
inline constexpr std::uint32_t kNamespaceFlag_Global = 0x10000;

enum class ItemKind {
  kReadOnlyProperty,
  kReadWriteProperty,
  kMethod,
  kConstructor,
  kConstant,
  kElementCount,
  kIndexedGetter,
  kUnknown
};

constexpr ItemKind GetItemKind(std::uint32_t flags) noexcept {
  if ((flags & 0x4000u) != 0) return ItemKind::kIndexedGetter;
  if ((flags & 0x2000u) != 0) return ItemKind::kElementCount;
  if ((flags & 0x100u) != 0) return ItemKind::kConstant;
  if ((flags & kItemFlag_Constructor) != 0) return ItemKind::kConstructor;
  if ((flags & kItemFlag_Method) != 0) return ItemKind::kMethod;
  if ((flags & kItemFlag_ReadWriteProperty) != 0) return ItemKind::kReadWriteProperty;
  if ((flags & kItemFlag_ReadOnlyProperty) != 0) return ItemKind::kReadOnlyProperty;
  return ItemKind::kUnknown;
}

// The flags word of an item of kind `kind` (one of the kItemFlag_ kinds).
constexpr std::uint32_t MakeItemFlags(std::uint32_t kind, bool isStatic, std::uint32_t hostFlags,
                                      std::uint32_t furtherFlags = 0) noexcept {
  return kind | (isStatic ? std::uint32_t{kItemFlag_Static} : 0u) |
         (hostFlags & kItemFlag_HostFlagsMask) | (furtherFlags & kItemFlag_FurtherFlagsMask);
}
constexpr std::uint32_t MakeConstructorFlags(std::uint32_t furtherFlags = 0) noexcept {
  return kItemFlag_Constructor | (furtherFlags & kItemFlag_FurtherFlagsMask);
}

class ZEBSCRIPTING_API ScriptItemDefinitionBase {
 public:
  // Getter, method, constructor, element count, indexed getter (index is
  // argument 0). Returns the result (undefined for none).
  using Function = std::function<ScriptValue(const ScriptCall&)>;
  // Setter: the value is argument 0. True when the value was taken.
  using Setter = std::function<bool(const ScriptCall&)>;

  ScriptItemDefinitionBase(std::uint32_t flags, std::string name, const TypeDescription& type,
                           std::vector<TypeDescription> parameters, std::string description);

  std::uint32_t GetFlags() const noexcept { return flags_; }
  ItemKind GetKind() const noexcept { return GetItemKind(flags_); }
  bool IsStatic() const noexcept {
    return (flags_ & kItemFlag_Static) != 0 || GetKind() == ItemKind::kConstant;
  }
  const std::string& GetName() const noexcept { return name_; }
  // The result type (a property's type; kVoid for a constructor).
  const TypeDescription& GetType() const noexcept { return type_; }
  // Parameters; for a setter, the one value parameter.
  const std::vector<TypeDescription>& GetParameters() const noexcept { return parameters_; }
  const std::string& GetDescription() const noexcept { return description_; }
  // The stored value of a constant.
  const ScriptValue& GetConstant() const noexcept { return constant_; }

  void SetFunction(Function function) { function_ = std::move(function); }
  void SetSetter(Setter setter) { setter_ = std::move(setter); }
  void SetConstant(ScriptValue value) { constant_ = std::move(value); }
  bool HasSetter() const noexcept { return static_cast<bool>(setter_); }

  // Runs the item (a constant gives its value). Native exceptions pass
  // through: ParameterErrorException for a bad argument or receiver, others
  // from the item itself.
  ScriptValue Invoke(const ScriptCall& call) const {
    if (function_) return function_(call);
    return constant_;
  }
  // Writes a read/write property; false for a refused value or an item
  // without a setter.
  bool Set(const ScriptCall& call) const { return setter_ ? setter_(call) : false; }

 private:
  std::uint32_t flags_;
  std::string name_;
  TypeDescription type_;
  std::vector<TypeDescription> parameters_;
  std::string description_;
  Function function_;
  Setter setter_;
  ScriptValue constant_;
};

struct NamespaceEntry {
  std::string name;
  std::uint32_t flags = 0;
};

class ZEBSCRIPTING_API ScriptObjectDefinitionBase {
 public:
  using CreateFunction = std::function<ScriptObjectPtr()>;

  // The definition being filled by a DefineObject() call; null otherwise.
  // Set by the host while it builds definitions (under its build lock).
  static ScriptObjectDefinitionBase* sCurrent;

  ScriptObjectDefinitionBase(std::string className, std::string description, CreateFunction create);

  const std::string& GetClassName() const noexcept { return className_; }
  const std::string& GetDescription() const noexcept { return description_; }
  // Whether this is the definition of class `className` (a DefineObject that
  // also serves derived classes adds namespace entries only for its own).
  bool IsDefinitionOf(std::string_view className) const noexcept { return className_ == className; }

  // Adds a namespace entry, or changes the flags of the entry of that name.
  void AddOrModifyNamespace(const char* name, std::uint32_t flags);
  // Adds an item; an item of the same name and staticness is replaced.
  void AddProperty(ScriptItemDefinitionBase item);

  const std::vector<NamespaceEntry>& GetNamespaces() const noexcept { return namespaces_; }
  const std::vector<ScriptItemDefinitionBase>& GetItems() const noexcept { return items_; }
  // The first item of that name; null for none.
  const ScriptItemDefinitionBase* FindItem(std::string_view name) const noexcept;
  const ScriptItemDefinitionBase* GetConstructor() const noexcept;
  // False when DefineObject threw: the class has the items it had by then.
  bool IsComplete() const noexcept { return complete_; }

  // A new object of the class in context `contextHandle`, its constructor
  // item not run.
  ScriptObjectPtr CreateInstance(int contextHandle) const;

  // The built definition of a registered class; null for an unknown one.
  // Builds every registered class not yet built (once, thread-safely).
  static const ScriptObjectDefinitionBase* Find(std::string_view className);
  // Every registered class, built, in registration order.
  static std::vector<const ScriptObjectDefinitionBase*> GetAll();

  void MarkComplete(bool complete) noexcept { complete_ = complete; }

 private:
  std::string className_;
  std::string description_;
  CreateFunction create_;
  std::vector<NamespaceEntry> namespaces_;
  std::vector<ScriptItemDefinitionBase> items_;
  bool complete_ = false;
};

// ---------------------------------------------------------------------------
// Builders: an item bound to native functions, ready for AddProperty.
//
//   definition.AddProperty(Constructor<TickTimeObject>("Constructs a TickTime object"));
//   definition.AddProperty(Property("seconds", PropertyType<double>(""),
//       &TickTimeObject::GetSeconds, &TickTimeObject::SetSeconds, "...", kItemFlag_Host));
//   definition.AddProperty(Method("equals", PropertyType<bool>(), &TickTimeObject::Equals,
//       "...", kItemFlag_Host, ParameterType<ScriptObjectPtr>("TickTime")));
//   definition.AddProperty(StaticMethod("createWithValue", PropertyType<ScriptObjectPtr>(),
//       &FrameRateObject::CreateWithValue, "...", kItemFlag_Host, ParameterType<double>("")));
//
// Instance functions are members of the class C (const or not); the host
// checks that the receiver is a C and raises ParameterErrorException
// (kWrongType, index kReceiver) otherwise. Static functions are free or
// static functions whose first parameter is the calling context's handle.
// The result type R of a function may be a reference or a type convertible to
// the PropertyType's T.

namespace details {

template <class F>
struct MemberTraits;
template <class R, class C, class... A>
struct MemberTraits<R (C::*)(A...)> {
  using Class = C;
};
template <class R, class C, class... A>
struct MemberTraits<R (C::*)(A...) const> {
  using Class = C;
};
template <class R, class C, class... A>
struct MemberTraits<R (C::*)(A...) noexcept> {
  using Class = C;
};
template <class R, class C, class... A>
struct MemberTraits<R (C::*)(A...) const noexcept> {
  using Class = C;
};

// The receiver as a C, or ParameterErrorException.
template <class C>
C& Receiver(const ScriptCall& call) {
  ScriptObject* self = call.self;
  if (self != nullptr) {
    if (typeid(*self) == typeid(C)) return *static_cast<C*>(self);
    if (C* cast = dynamic_cast<C*>(self)) return *cast;
  }
  throw ParameterErrorException(ParameterErrorException::kWrongType,
                                ParameterErrorException::kReceiver,
                                "the receiver is not an object of this class");
}

template <class T>
TypeDescription Describe(const PropertyType<T>& type) {
  return type;
}
inline TypeDescription VoidType() {
  struct Void : TypeDescription {
    Void() : TypeDescription(ValueType::kVoid, {}, {}, false, {}) {}
  };
  return Void();
}

// Validates every parameter in order, then calls `call` with the values.
template <class Call, class... T, std::size_t... I>
decltype(auto) CallWithArguments(const Call& call, const std::tuple<ParameterType<T>...>& params,
                                 const ScriptArguments& arguments, std::index_sequence<I...>) {
  std::tuple<T...> values{std::get<I>(params).Validate(I, arguments)...};
  return call(std::move(std::get<I>(values))...);
}

template <class T, class R>
ScriptValue ResultToScript(R&& result) {
  return PropertyType<T>::ToScript(static_cast<const T&>(std::forward<R>(result)));
}

}  // namespace details

// A constructor without parameters: `new` makes a default object.
template <class C>
ScriptItemDefinitionBase Constructor(std::string description, std::uint32_t furtherFlags = 0) {
  ScriptItemDefinitionBase item(MakeConstructorFlags(furtherFlags), {}, details::VoidType(), {},
                                std::move(description));
  item.SetFunction([](const ScriptCall& call) {
    details::Receiver<C>(call);
    return ScriptValue();
  });
  return item;
}

// A constructor with parameters: `construct` is called on the new object with
// the validated arguments. A false result is reported as a refused
// construction (kOutOfRange).
template <class M, class... T>
ScriptItemDefinitionBase Constructor(M construct, std::string description,
                                     std::uint32_t furtherFlags, ParameterType<T>... parameters) {
  using C = typename details::MemberTraits<M>::Class;
  ScriptItemDefinitionBase item(MakeConstructorFlags(furtherFlags), {}, details::VoidType(),
                                {details::Describe<T>(parameters)...}, std::move(description));
  item.SetFunction([construct, params = std::make_tuple(parameters...)](const ScriptCall& call) {
    C& self = details::Receiver<C>(call);
    auto run = [&](auto&&... values) { return (self.*construct)(std::move(values)...); };
    using R = decltype(details::CallWithArguments(run, params, call.arguments,
                                                  std::index_sequence_for<T...>()));
    if constexpr (std::is_same_v<R, bool>) {
      if (!details::CallWithArguments(run, params, call.arguments,
                                      std::index_sequence_for<T...>())) {
        throw ParameterErrorException(ParameterErrorException::kOutOfRange, 0,
                                      "the constructor refused its arguments");
      }
    } else {
      details::CallWithArguments(run, params, call.arguments, std::index_sequence_for<T...>());
    }
    return ScriptValue();
  });
  return item;
}

// A read-only property (kind 1).
template <class T, class G>
ScriptItemDefinitionBase Property(std::string name, PropertyType<T> type, G getter,
                                  std::string description, std::uint32_t hostFlags,
                                  std::uint32_t furtherFlags = 0) {
  using C = typename details::MemberTraits<G>::Class;
  ScriptItemDefinitionBase item(
      MakeItemFlags(kItemFlag_ReadOnlyProperty, false, hostFlags, furtherFlags), std::move(name),
      type, {}, std::move(description));
  item.SetFunction([getter](const ScriptCall& call) {
    return details::ResultToScript<T>((details::Receiver<C>(call).*getter)());
  });
  return item;
}

// A read/write property (kind 2): `setter` takes the value and returns whether
// it was taken. `type` is the property's type; its name names the setter's
// parameter ("" in this library).
template <class T, class G, class S>
ScriptItemDefinitionBase Property(std::string name, PropertyType<T> type, G getter, S setter,
                                  std::string description, std::uint32_t hostFlags,
                                  std::uint32_t furtherFlags = 0) {
  using C = typename details::MemberTraits<G>::Class;
  ScriptItemDefinitionBase item(
      MakeItemFlags(kItemFlag_ReadWriteProperty, false, hostFlags, furtherFlags), std::move(name),
      type, {details::Describe<T>(type)}, std::move(description));
  item.SetFunction([getter](const ScriptCall& call) {
    return details::ResultToScript<T>((details::Receiver<C>(call).*getter)());
  });
  item.SetSetter([setter, type](const ScriptCall& call) {
    C& self = details::Receiver<C>(call);
    return static_cast<bool>((self.*setter)(type.Validate(0, call.arguments)));
  });
  return item;
}

// A static read-only property (kind 1 + 64): `getter(contextHandle)`.
template <class T, class R>
ScriptItemDefinitionBase StaticProperty(std::string name, PropertyType<T> type, R (*getter)(int),
                                        std::string description, std::uint32_t hostFlags,
                                        std::uint32_t furtherFlags = 0) {
  ScriptItemDefinitionBase item(
      MakeItemFlags(kItemFlag_ReadOnlyProperty, true, hostFlags, furtherFlags), std::move(name),
      type, {}, std::move(description));
  item.SetFunction([getter](const ScriptCall& call) {
    return details::ResultToScript<T>(getter(call.contextHandle));
  });
  return item;
}

// A method (kind 4).
template <class T, class M, class... P>
ScriptItemDefinitionBase Method(std::string name, PropertyType<T> result, M method,
                                std::string description, std::uint32_t hostFlags,
                                ParameterType<P>... parameters) {
  using C = typename details::MemberTraits<M>::Class;
  ScriptItemDefinitionBase item(MakeItemFlags(kItemFlag_Method, false, hostFlags), std::move(name),
                                result, {details::Describe<P>(parameters)...},
                                std::move(description));
  item.SetFunction([method, params = std::make_tuple(parameters...)](const ScriptCall& call) {
    C& self = details::Receiver<C>(call);
    auto run = [&](auto&&... values) -> decltype(auto) {
      return (self.*method)(std::move(values)...);
    };
    return details::ResultToScript<T>(
        details::CallWithArguments(run, params, call.arguments, std::index_sequence_for<P...>()));
  });
  return item;
}

// A static method (kind 4 + 64): `function(contextHandle, arguments...)`.
template <class T, class R, class... A, class... P>
ScriptItemDefinitionBase StaticMethod(std::string name, PropertyType<T> result,
                                      R (*function)(int, A...), std::string description,
                                      std::uint32_t hostFlags, ParameterType<P>... parameters) {
  static_assert(sizeof...(A) == sizeof...(P), "one ParameterType per parameter");
  ScriptItemDefinitionBase item(MakeItemFlags(kItemFlag_Method, true, hostFlags), std::move(name),
                                result, {details::Describe<P>(parameters)...},
                                std::move(description));
  item.SetFunction([function, params = std::make_tuple(parameters...)](const ScriptCall& call) {
    auto run = [&](auto&&... values) -> decltype(auto) {
      return function(call.contextHandle, std::move(values)...);
    };
    return details::ResultToScript<T>(
        details::CallWithArguments(run, params, call.arguments, std::index_sequence_for<P...>()));
  });
  return item;
}

// A constant (kind 0x101, static, read-only) with an integer or UTF-8 value.
ZEBSCRIPTING_API ScriptItemDefinitionBase Constant(std::string name, std::int64_t value,
                                                   std::string description,
                                                   std::uint32_t hostFlags);
ZEBSCRIPTING_API ScriptItemDefinitionBase Constant(std::string name,
                                                   const zebcore::UTF8String& value,
                                                   std::string description,
                                                   std::uint32_t hostFlags);

// The element count of an indexable object (kind 0x2001): script's `length`.
template <class T, class G>
ScriptItemDefinitionBase ElementCount(PropertyType<T> type, G getter, std::string description,
                                      std::uint32_t hostFlags) {
  using C = typename details::MemberTraits<G>::Class;
  ScriptItemDefinitionBase item(MakeItemFlags(kItemFlag_ElementCount, false, hostFlags), "length",
                                type, {}, std::move(description));
  item.SetFunction([getter](const ScriptCall& call) {
    return details::ResultToScript<T>((details::Receiver<C>(call).*getter)());
  });
  return item;
}

// The element getter of an indexable object (kind 0x4001): script's
// `object[i]` for every integer i (negative and out-of-range ones included)
// calls `getter(i)`; `index` converts i (an int parameter refuses an i beyond
// the int range).
template <class T, class I, class G>
ScriptItemDefinitionBase IndexedGetter(PropertyType<T> type, G getter, ParameterType<I> index,
                                       std::string description, std::uint32_t hostFlags) {
  using C = typename details::MemberTraits<G>::Class;
  ScriptItemDefinitionBase item(MakeItemFlags(kItemFlag_IndexedGetter, false, hostFlags), "[]",
                                type, {details::Describe<I>(index)}, std::move(description));
  item.SetFunction([getter, index](const ScriptCall& call) {
    C& self = details::Receiver<C>(call);
    return details::ResultToScript<T>((self.*getter)(index.Validate(0, call.arguments)));
  });
  return item;
}

}  // namespace definition
}  // namespace zebscripting
