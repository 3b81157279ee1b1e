// The JavaScript adapter: every registered script class exposed to the
// engine, one heap per JavaScriptContext. The only source that includes the
// engine's header.
//
// Layout of a heap:
//   - a base prototype with isEqual/toString and the finalizer every wrapper
//     inherits;
//   - per class: a prototype (instance accessors and methods, plus the static
//     items) whose prototype is the base, and a constructor function (static
//     items, constants) placed in the namespaces of the class;
//   - per native object pushed: a "holder" object whose hidden property holds
//     the native pointer, and for indexable classes a Proxy over the holder
//     that answers integer keys (the holder keeps its proxy, so a holder
//     waiting for its finalizer can still give it back).
// The identity map (native object -> holder) makes the same native object the
// same script object. Each map entry owns one native reference; the holder's
// finalizer drops both, and so does the context's destruction for whatever is
// left. Native code never sees an engine exception and the engine never sees a
// native one: items are engine-free and run inside try blocks, and errors are
// thrown into the engine only after the native frames are done.
#include <zebcore/logging.h>
#include <zebcore/string.h>
#include <zebscripting/definition.h>
#include <zebscripting/javascript.h>

#include <chrono>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <deque>
#include <exception>
#include <mutex>
#include <new>
#include <stdexcept>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "duktape.h"

#if !defined(DUK_USE_CPP_EXCEPTIONS) || !defined(DUK_USE_EXEC_TIMEOUT_CHECK)
#error "the engine must be configured by zebscripting's duk_config.h"
#endif

namespace zebscripting {

using definition::ItemKind;
using definition::ScriptItemDefinitionBase;
using definition::ScriptObjectDefinitionBase;

namespace {

constexpr const char kNativeKey[] = DUK_HIDDEN_SYMBOL("zebNative");
constexpr const char kProxyKey[] = DUK_HIDDEN_SYMBOL("zebProxy");
constexpr const char kStashPrototypes[] = "zebPrototypes";
// Arrays longer than this are not converted for native code.
constexpr duk_size_t kMaxArrayLength = 1u << 16;

struct ClassInfo {
  const ScriptObjectDefinitionBase* definition = nullptr;
  void* prototype = nullptr;  // kept reachable through the heap stash
  const ScriptItemDefinitionBase* constructor = nullptr;
  int indexedGetter = -1;  // index into Impl::items
  std::string label;       // "TickTime"
};

struct BoundItem {
  const ScriptItemDefinitionBase* item;
  std::string label;  // "TickTime.seconds", for error messages
};

// An error to throw into the engine once native frames are left.
struct PendingError {
  duk_errcode_t code = DUK_ERR_ERROR;
  std::string message;
};

}  // namespace

struct JavaScriptContext::Impl {
  JavaScriptContext* owner = nullptr;
  JavaScriptLimits limits;
  mutable std::recursive_mutex mutex;
  duk_context* ctx = nullptr;
  std::size_t used = 0;
  bool timing = false;
  std::chrono::steady_clock::time_point deadline;
  std::vector<ClassInfo> classes;
  std::unordered_map<std::string_view, std::size_t> classByName;
  std::vector<BoundItem> items;
  std::deque<NativeFunction> functions;                     // stable: a function may define another
  std::unordered_map<const ScriptObject*, void*> wrappers;  // native -> holder
  // Holder and proxy -> native: the receiver of an item call in one lookup.
  std::unordered_map<const void*, ScriptObject*> natives;
  void* basePrototype = nullptr;
  void* proxyHandler = nullptr;

  ~Impl();
};

namespace {

using Impl = JavaScriptContext::Impl;

// --- Memory: a capped allocator with a size header --------------------------

constexpr std::size_t kHeader = alignof(std::max_align_t);

void* Allocate(void* udata, duk_size_t size) {
  auto* impl = static_cast<Impl*>(udata);
  if (impl->limits.memoryBytes != 0 && size > impl->limits.memoryBytes - impl->used) return nullptr;
  auto* block = static_cast<unsigned char*>(std::malloc(size + kHeader));
  if (block == nullptr) return nullptr;
  std::memcpy(block, &size, sizeof(size));
  impl->used += size;
  return block + kHeader;
}

void Free(void* udata, void* pointer) {
  if (pointer == nullptr) return;
  auto* impl = static_cast<Impl*>(udata);
  unsigned char* block = static_cast<unsigned char*>(pointer) - kHeader;
  std::size_t size = 0;
  std::memcpy(&size, block, sizeof(size));
  impl->used -= size;
  std::free(block);
}

void* Reallocate(void* udata, void* pointer, duk_size_t size) {
  if (pointer == nullptr) return Allocate(udata, size);
  if (size == 0) {
    Free(udata, pointer);
    return nullptr;
  }
  auto* impl = static_cast<Impl*>(udata);
  unsigned char* block = static_cast<unsigned char*>(pointer) - kHeader;
  std::size_t old = 0;
  std::memcpy(&old, block, sizeof(old));
  if (size > old && impl->limits.memoryBytes != 0 &&
      size - old > impl->limits.memoryBytes - impl->used) {
    return nullptr;
  }
  auto* grown = static_cast<unsigned char*>(std::realloc(block, size + kHeader));
  if (grown == nullptr) return nullptr;
  std::memcpy(grown, &size, sizeof(size));
  impl->used = impl->used - old + size;
  return grown + kHeader;
}

Impl& GetImpl(duk_context* ctx) {
  duk_memory_functions functions;
  duk_get_memory_functions(ctx, &functions);
  return *static_cast<Impl*>(functions.udata);
}

// --- Strings: UTF-16 <-> the engine's extended UTF-8 -----------------------

// Each UTF-16 unit on its own (surrogates as 3-byte sequences), as the engine
// keeps strings, so that every unit survives.
void PushUTF16(duk_context* ctx, std::u16string_view text) {
  std::string bytes;
  bytes.reserve(text.size() * 3);
  for (char16_t unit : text) {
    const unsigned c = unit;
    if (c < 0x80) {
      bytes.push_back(static_cast<char>(c));
    } else if (c < 0x800) {
      bytes.push_back(static_cast<char>(0xC0 | (c >> 6)));
      bytes.push_back(static_cast<char>(0x80 | (c & 0x3F)));
    } else {
      bytes.push_back(static_cast<char>(0xE0 | (c >> 12)));
      bytes.push_back(static_cast<char>(0x80 | ((c >> 6) & 0x3F)));
      bytes.push_back(static_cast<char>(0x80 | (c & 0x3F)));
    }
  }
  duk_push_lstring(ctx, bytes.data(), bytes.size());
}

// The engine's bytes as UTF-16: 1- to 3-byte sequences give one unit (lone
// surrogates included), 4-byte ones a surrogate pair, anything else U+FFFD.
std::u16string DecodeEngineString(const char* data, std::size_t size) {
  std::u16string text;
  text.reserve(size);
  const auto* p = reinterpret_cast<const unsigned char*>(data);
  std::size_t i = 0;
  auto continuation = [&](std::size_t at) { return at < size && (p[at] & 0xC0) == 0x80; };
  while (i < size) {
    const unsigned char b = p[i];
    if (b < 0x80) {
      text.push_back(b);
      i += 1;
    } else if ((b & 0xE0) == 0xC0 && continuation(i + 1)) {
      text.push_back(static_cast<char16_t>(((b & 0x1Fu) << 6) | (p[i + 1] & 0x3Fu)));
      i += 2;
    } else if ((b & 0xF0) == 0xE0 && continuation(i + 1) && continuation(i + 2)) {
      text.push_back(static_cast<char16_t>(((b & 0x0Fu) << 12) | ((p[i + 1] & 0x3Fu) << 6) |
                                           (p[i + 2] & 0x3Fu)));
      i += 3;
    } else if ((b & 0xF8) == 0xF0 && continuation(i + 1) && continuation(i + 2) &&
               continuation(i + 3)) {
      const std::uint32_t c = ((b & 0x07u) << 18) | ((p[i + 1] & 0x3Fu) << 12) |
                              ((p[i + 2] & 0x3Fu) << 6) | (p[i + 3] & 0x3Fu);
      if (c >= 0x10000 && c <= 0x10FFFF) {
        text.push_back(static_cast<char16_t>(0xD800 + ((c - 0x10000) >> 10)));
        text.push_back(static_cast<char16_t>(0xDC00 + ((c - 0x10000) & 0x3FF)));
      } else {
        text.push_back(u'\uFFFD');
      }
      i += 4;
    } else {
      text.push_back(u'\uFFFD');
      i += 1;
    }
  }
  return text;
}

std::string ToUTF8Text(duk_context* ctx, duk_idx_t index) {
  duk_size_t size = 0;
  const char* data = duk_get_lstring(ctx, index, &size);
  const std::u16string wide = DecodeEngineString(data != nullptr ? data : "", size);
  return zebcore::string::UTF16toNarrow(wide);
}

// --- Errors -----------------------------------------------------------------

// Throws into the engine; the file and line are those of the calling script.
[[noreturn]] void Throw(duk_context* ctx, const PendingError& error) {
  duk_error_raw(ctx, error.code, nullptr, 0, "%s", error.message.c_str());
  std::abort();  // not reached: the engine throws
}

PendingError ErrorFromException(const std::string& label) {
  try {
    throw;
  } catch (const ParameterErrorException& error) {
    return {error.GetKind() == ParameterErrorException::kOutOfRange ? DUK_ERR_RANGE_ERROR
                                                                    : DUK_ERR_TYPE_ERROR,
            label + ": " + error.what()};
  } catch (const std::bad_alloc&) {
    return {DUK_ERR_RANGE_ERROR, label + ": out of memory"};
  } catch (const std::exception& error) {
    return {DUK_ERR_ERROR, label + ": " + error.what()};
  } catch (...) {
    return {DUK_ERR_ERROR, label + ": unknown native exception"};
  }
}

// --- Values -----------------------------------------------------------------

void PushValue(duk_context* ctx, Impl& impl, const ScriptValue& value);

void PushObject(duk_context* ctx, Impl& impl, ScriptObject* object) {
  if (object == nullptr) {
    duk_push_null(ctx);
    return;
  }
  const auto known = impl.wrappers.find(object);
  const auto cls = impl.classByName.find(object->GetClassName());
  const ClassInfo* info = cls != impl.classByName.end() ? &impl.classes[cls->second] : nullptr;
  const bool indexed = info != nullptr && info->indexedGetter >= 0;
  if (known != impl.wrappers.end()) {
    duk_push_heapptr(ctx, known->second);
    if (indexed) {
      duk_get_prop_literal(ctx, -1, kProxyKey);
      duk_remove(ctx, -2);
    }
    return;
  }
  duk_push_object(ctx);
  duk_push_heapptr(ctx, info != nullptr ? info->prototype : impl.basePrototype);
  duk_set_prototype(ctx, -2);
  duk_push_pointer(ctx, object);
  duk_put_prop_literal(ctx, -2, kNativeKey);
  if (indexed) {
    duk_dup(ctx, -1);  // target
    duk_push_heapptr(ctx, impl.proxyHandler);
    duk_push_proxy(ctx, 0);
    duk_dup(ctx, -1);
    duk_put_prop_literal(ctx, -3, kProxyKey);
  }
  void* const holder = duk_get_heapptr(ctx, indexed ? -2 : -1);
  impl.wrappers.emplace(object, holder);
  impl.natives.emplace(holder, object);
  if (indexed) impl.natives.emplace(duk_get_heapptr(ctx, -1), object);
  object->AddRef();
  if (indexed) duk_remove(ctx, -2);
}

ScriptValue GetValue(duk_context* ctx, Impl& impl, duk_idx_t index, int depth = 0) {
  switch (duk_get_type(ctx, index)) {
    case DUK_TYPE_NONE:
    case DUK_TYPE_UNDEFINED:
      return ScriptValue();
    case DUK_TYPE_NULL:
      return ScriptValue::Null();
    case DUK_TYPE_BOOLEAN:
      return ScriptValue(duk_get_boolean(ctx, index) != 0);
    case DUK_TYPE_NUMBER:
      return ScriptValue(static_cast<double>(duk_get_number(ctx, index)));
    case DUK_TYPE_STRING: {
      duk_size_t size = 0;
      const char* data = duk_get_lstring(ctx, index, &size);
      if (size > 0 && static_cast<unsigned char>(data[0]) >= 0x80 &&
          (static_cast<unsigned char>(data[0]) == 0xFF ||
           (static_cast<unsigned char>(data[0]) & 0xC0) == 0x80)) {
        return ScriptValue::Other("symbol");
      }
      return ScriptValue(DecodeEngineString(data, size));
    }
    case DUK_TYPE_OBJECT: {
      index = duk_require_normalize_index(ctx, index);
      const auto known = impl.natives.find(duk_get_heapptr(ctx, index));
      if (known != impl.natives.end()) return ScriptValue(ScriptObjectPtr(known->second));
      if (duk_is_function(ctx, index)) return ScriptValue::Other("function");
      if (duk_is_array(ctx, index)) {
        if (depth > 0) return ScriptValue::Other("nested array");
        const duk_size_t length = duk_get_length(ctx, index);
        if (length > kMaxArrayLength) return ScriptValue::Other("array too long");
        std::vector<ScriptValue> elements;
        elements.reserve(length);
        for (duk_size_t i = 0; i < length; ++i) {
          duk_get_prop_index(ctx, index, static_cast<duk_uarridx_t>(i));
          elements.push_back(GetValue(ctx, impl, -1, depth + 1));
          duk_pop(ctx);
        }
        return ScriptValue(std::move(elements));
      }
      duk_get_prop_literal(ctx, index, kNativeKey);
      auto* object = static_cast<ScriptObject*>(duk_get_pointer(ctx, -1));
      duk_pop(ctx);
      if (object != nullptr && impl.wrappers.count(object) != 0) {
        return ScriptValue(ScriptObjectPtr(object));
      }
      return ScriptValue::Other("object");
    }
    default:
      return ScriptValue::Other("value");
  }
}

void PushValue(duk_context* ctx, Impl& impl, const ScriptValue& value) {
  switch (value.GetKind()) {
    case ScriptValue::Kind::kUndefined:
    case ScriptValue::Kind::kOther:
      duk_push_undefined(ctx);
      return;
    case ScriptValue::Kind::kNull:
      duk_push_null(ctx);
      return;
    case ScriptValue::Kind::kBool:
      duk_push_boolean(ctx, value.GetBool() ? 1 : 0);
      return;
    case ScriptValue::Kind::kNumber:
      duk_push_number(ctx, value.GetNumber());
      return;
    case ScriptValue::Kind::kString:
      PushUTF16(ctx, value.GetString());
      return;
    case ScriptValue::Kind::kObject:
      PushObject(ctx, impl, value.GetObject().get());
      return;
    case ScriptValue::Kind::kArray: {
      const duk_idx_t array = duk_push_array(ctx);
      duk_uarridx_t i = 0;
      for (const ScriptValue& element : value.GetElements()) {
        PushValue(ctx, impl, element);
        duk_put_prop_index(ctx, array, i++);
      }
      return;
    }
  }
  duk_push_undefined(ctx);
}

// The native object of `this`, or a TypeError. A wrapper is found by its heap
// address; an object that merely inherits from one through its hidden key.
ScriptObject* ThisObject(duk_context* ctx, Impl& impl, const std::string& label) {
  duk_push_this(ctx);
  const auto known = impl.natives.find(duk_get_heapptr(ctx, -1));
  if (known != impl.natives.end()) {
    duk_pop(ctx);
    return known->second;
  }
  duk_get_prop_literal(ctx, -1, kNativeKey);
  auto* object = static_cast<ScriptObject*>(duk_get_pointer(ctx, -1));
  duk_pop_2(ctx);
  if (object == nullptr) {
    Throw(ctx, {DUK_ERR_TYPE_ERROR, label + ": the receiver is not a script object"});
  }
  return object;
}

std::vector<ScriptValue> Arguments(duk_context* ctx, Impl& impl) {
  const duk_idx_t count = duk_get_top(ctx);
  std::vector<ScriptValue> values;
  values.reserve(static_cast<std::size_t>(count));
  for (duk_idx_t i = 0; i < count; ++i) values.push_back(GetValue(ctx, impl, i));
  return values;
}

// --- Native functions the engine calls --------------------------------------

// Runs `call` (engine-free) and converts a native exception.
template <class F>
bool RunNative(const std::string& label, F&& call, PendingError& error) {
  try {
    call();
    return true;
  } catch (...) {
    error = ErrorFromException(label);
    return false;
  }
}

// The item behind the native function the engine is calling (its magic number).
const BoundItem& CurrentItem(duk_context* ctx, const Impl& impl) {
  return impl.items[static_cast<std::size_t>(duk_get_current_magic(ctx))];
}

// A call of `bound` from script: the calling context, and the receiver unless
// the item is static.
ScriptCall CallOf(duk_context* ctx, Impl& impl, const BoundItem& bound) {
  ScriptCall call;
  call.contextHandle = impl.owner->GetHandle();
  if (!bound.item->IsStatic()) call.self = ThisObject(ctx, impl, bound.label);
  return call;
}

// Runs `bound` and leaves its result on the value stack.
duk_ret_t InvokeAndPush(duk_context* ctx, Impl& impl, const BoundItem& bound,
                        const ScriptCall& call) {
  ScriptValue result;
  PendingError error;
  if (!RunNative(
          bound.label, [&] { result = bound.item->Invoke(call); }, error)) {
    Throw(ctx, error);
  }
  PushValue(ctx, impl, result);
  return 1;
}

duk_ret_t ItemGetter(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  const BoundItem& bound = CurrentItem(ctx, impl);
  return InvokeAndPush(ctx, impl, bound, CallOf(ctx, impl, bound));
}

duk_ret_t ItemSetter(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  const BoundItem& bound = CurrentItem(ctx, impl);
  if (!bound.item->HasSetter()) {
    Throw(ctx, {DUK_ERR_TYPE_ERROR, bound.label + " is read-only"});
  }
  ScriptCall call;
  call.contextHandle = impl.owner->GetHandle();
  call.self = ThisObject(ctx, impl, bound.label);
  const ScriptValue value = GetValue(ctx, impl, 0);
  call.arguments = ScriptArguments(&value, 1);
  bool taken = false;
  PendingError error;
  if (!RunNative(
          bound.label, [&] { taken = bound.item->Set(call); }, error))
    Throw(ctx, error);
  if (!taken) Throw(ctx, {DUK_ERR_RANGE_ERROR, bound.label + ": the value was refused"});
  return 0;
}

duk_ret_t ItemMethod(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  const BoundItem& bound = CurrentItem(ctx, impl);
  ScriptCall call = CallOf(ctx, impl, bound);
  const std::vector<ScriptValue> arguments = Arguments(ctx, impl);
  call.arguments = ScriptArguments(arguments);
  return InvokeAndPush(ctx, impl, bound, call);
}

duk_ret_t ClassConstructor(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  const ClassInfo& info = impl.classes[static_cast<std::size_t>(duk_get_current_magic(ctx))];
  if (duk_is_constructor_call(ctx) == 0) {
    Throw(ctx, {DUK_ERR_TYPE_ERROR, info.label + " must be called with new"});
  }
  if (info.constructor == nullptr) {
    Throw(ctx, {DUK_ERR_TYPE_ERROR, info.label + " cannot be constructed"});
  }
  const std::vector<ScriptValue> arguments = Arguments(ctx, impl);
  const std::string label = info.label + " constructor";
  ScriptObjectPtr object;
  PendingError error;
  const int handle = impl.owner->GetHandle();
  if (!RunNative(
          label,
          [&] {
            object = info.definition->CreateInstance(handle);
            if (!object) throw std::runtime_error("the object could not be made");
            ScriptCall call;
            call.contextHandle = handle;
            call.self = object.get();
            call.arguments = ScriptArguments(arguments);
            info.constructor->Invoke(call);
          },
          error)) {
    Throw(ctx, error);
  }
  PushObject(ctx, impl, object.get());
  return 1;
}

duk_ret_t BaseIsEqual(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  static const std::string label = "isEqual";
  ScriptObject* self = ThisObject(ctx, impl, label);
  const ScriptValue other = GetValue(ctx, impl, 0);
  bool equal = false;
  PendingError error;
  if (!RunNative(
          label, [&] { equal = self->IsEqual(other.GetObject()); }, error)) {
    Throw(ctx, error);
  }
  duk_push_boolean(ctx, equal ? 1 : 0);
  return 1;
}

duk_ret_t BaseToString(duk_context* ctx) {
  duk_push_this(ctx);
  duk_get_prop_literal(ctx, -1, kNativeKey);
  auto* object = static_cast<ScriptObject*>(duk_get_pointer(ctx, -1));
  const std::string text =
      std::string("[object ") + (object != nullptr ? object->GetClassName() : "Object") + "]";
  duk_push_lstring(ctx, text.data(), text.size());
  return 1;
}

// Called with (holder, heapDestruction); the prototypes have no native object.
duk_ret_t Finalize(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  duk_get_prop_literal(ctx, 0, kNativeKey);
  auto* object = static_cast<ScriptObject*>(duk_get_pointer(ctx, -1));
  duk_pop(ctx);
  if (object == nullptr) return 0;
  const auto known = impl.wrappers.find(object);
  if (known != impl.wrappers.end() && known->second == duk_get_heapptr(ctx, 0)) {
    impl.wrappers.erase(known);
    impl.natives.erase(duk_get_heapptr(ctx, 0));
    if (duk_get_prop_literal(ctx, 0, kProxyKey)) impl.natives.erase(duk_get_heapptr(ctx, -1));
    duk_pop(ctx);
    object->Release();
  }
  duk_push_pointer(ctx, nullptr);
  duk_put_prop_literal(ctx, 0, kNativeKey);
  return 0;
}

// A canonical integer key ("0", "-1", "42"; not "01", "1.0", "+1").
bool IndexFromKey(duk_context* ctx, duk_idx_t key, double& index) {
  if (duk_is_number(ctx, key)) {  // the engine passes array-index keys as numbers
    const double value = duk_get_number(ctx, key);
    if (std::trunc(value) != value) return false;
    index = value == 0 ? 0.0 : value;
    return true;
  }
  if (!duk_is_string(ctx, key)) return false;
  duk_size_t size = 0;
  const char* text = duk_get_lstring(ctx, key, &size);
  std::size_t at = 0;
  if (size > 0 && text[0] == '-') at = 1;
  if (at >= size || size - at > 20) return false;
  if (text[at] == '0' && size - at > 1) return false;
  if (text[at] == '0' && at == 1) return false;  // "-0"
  double value = 0;
  for (std::size_t i = at; i < size; ++i) {
    if (text[i] < '0' || text[i] > '9') return false;
    value = value * 10 + (text[i] - '0');
  }
  index = at == 1 ? -value : value;
  return true;
}

// Proxy get trap (target, key, receiver).
duk_ret_t ProxyGet(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  double index = 0;
  if (IndexFromKey(ctx, 1, index)) {
    duk_get_prop_literal(ctx, 0, kNativeKey);
    auto* object = static_cast<ScriptObject*>(duk_get_pointer(ctx, -1));
    duk_pop(ctx);
    const auto cls =
        object != nullptr ? impl.classByName.find(object->GetClassName()) : impl.classByName.end();
    if (cls != impl.classByName.end() && impl.classes[cls->second].indexedGetter >= 0) {
      const BoundItem& bound =
          impl.items[static_cast<std::size_t>(impl.classes[cls->second].indexedGetter)];
      const ScriptValue argument(index);
      ScriptCall call;
      call.contextHandle = impl.owner->GetHandle();
      call.self = object;
      call.arguments = ScriptArguments(&argument, 1);
      return InvokeAndPush(ctx, impl, bound, call);
    }
  }
  duk_dup(ctx, 1);
  duk_get_prop(ctx, 0);
  return 1;
}

duk_ret_t NativeCall(duk_context* ctx) {
  Impl& impl = GetImpl(ctx);
  const JavaScriptContext::NativeFunction& function =
      impl.functions[static_cast<std::size_t>(duk_get_current_magic(ctx))];
  const std::vector<ScriptValue> arguments = Arguments(ctx, impl);
  ScriptValue result;
  PendingError error;
  if (!RunNative(
          "native function", [&] { result = function(ScriptArguments(arguments)); }, error)) {
    Throw(ctx, error);
  }
  PushValue(ctx, impl, result);
  return 1;
}

// Returns its magic number.
duk_ret_t PlainNumber(duk_context* ctx) {
  duk_push_int(ctx, duk_get_current_magic(ctx));
  return 1;
}

// --- Building the classes of a heap -----------------------------------------

void PushFunction(duk_context* ctx, duk_c_function function, duk_idx_t nargs, std::size_t magic,
                  const std::string& name) {
  duk_push_c_function(ctx, function, nargs);
  duk_set_magic(ctx, -1, static_cast<duk_int_t>(magic));
  duk_push_literal(ctx, "name");
  duk_push_lstring(ctx, name.data(), name.size());
  duk_def_prop(ctx, -3, DUK_DEFPROP_HAVE_VALUE | DUK_DEFPROP_FORCE);
}

// Defines `name` on the object at `target` as an accessor of item `magic`.
void DefineAccessor(duk_context* ctx, duk_idx_t target, const std::string& name,
                    std::size_t magic) {
  duk_push_lstring(ctx, name.data(), name.size());
  PushFunction(ctx, ItemGetter, 0, magic, name);
  PushFunction(ctx, ItemSetter, 1, magic, name);
  duk_def_prop(ctx, target,
               DUK_DEFPROP_HAVE_GETTER | DUK_DEFPROP_HAVE_SETTER | DUK_DEFPROP_HAVE_ENUMERABLE |
                   DUK_DEFPROP_ENUMERABLE | DUK_DEFPROP_HAVE_CONFIGURABLE);
}

void DefineMethod(duk_context* ctx, duk_idx_t target, const std::string& name, std::size_t magic) {
  duk_push_lstring(ctx, name.data(), name.size());
  PushFunction(ctx, ItemMethod, DUK_VARARGS, magic, name);
  duk_def_prop(ctx, target,
               DUK_DEFPROP_HAVE_VALUE | DUK_DEFPROP_HAVE_WRITABLE | DUK_DEFPROP_HAVE_ENUMERABLE |
                   DUK_DEFPROP_HAVE_CONFIGURABLE);
}

void DefineConstant(duk_context* ctx, Impl& impl, duk_idx_t target, const std::string& name,
                    const ScriptValue& value) {
  duk_push_lstring(ctx, name.data(), name.size());
  PushValue(ctx, impl, value);
  duk_def_prop(ctx, target,
               DUK_DEFPROP_HAVE_VALUE | DUK_DEFPROP_HAVE_WRITABLE | DUK_DEFPROP_HAVE_ENUMERABLE |
                   DUK_DEFPROP_ENUMERABLE | DUK_DEFPROP_HAVE_CONFIGURABLE);
}

// The global object of namespace `name`, made when missing; left on the stack.
void PushNamespace(duk_context* ctx, const std::string& name) {
  duk_push_global_object(ctx);
  if (!duk_get_prop_lstring(ctx, -1, name.data(), name.size()) || !duk_is_object(ctx, -1)) {
    duk_pop(ctx);
    duk_push_object(ctx);
    duk_dup(ctx, -1);
    duk_put_prop_lstring(ctx, -3, name.data(), name.size());
  }
  duk_remove(ctx, -2);
}

duk_ret_t SetUpHeap(duk_context* ctx, void* udata) {
  Impl& impl = *static_cast<Impl*>(udata);
  // No script access to raw pointers or byte-level strings.
  duk_push_global_object(ctx);
  duk_del_prop_literal(ctx, -1, "Duktape");
  duk_pop(ctx);

  duk_push_heap_stash(ctx);
  const duk_idx_t stash = duk_get_top_index(ctx);
  duk_push_array(ctx);
  const duk_idx_t keep = duk_get_top_index(ctx);
  duk_uarridx_t kept = 0;

  // The base prototype.
  duk_push_object(ctx);
  const duk_idx_t base = duk_get_top_index(ctx);
  PushFunction(ctx, BaseIsEqual, 1, 0, "isEqual");
  duk_put_prop_literal(ctx, base, "isEqual");
  PushFunction(ctx, BaseToString, 0, 0, "toString");
  duk_put_prop_literal(ctx, base, "toString");
  duk_push_c_function(ctx, Finalize, 2);
  duk_set_finalizer(ctx, base);
  impl.basePrototype = duk_get_heapptr(ctx, base);
  duk_dup(ctx, base);
  duk_put_prop_index(ctx, keep, kept++);

  // The proxy handler of indexable classes.
  duk_push_object(ctx);
  PushFunction(ctx, ProxyGet, 3, 0, "get");
  duk_put_prop_literal(ctx, -2, "get");
  impl.proxyHandler = duk_get_heapptr(ctx, -1);
  duk_put_prop_index(ctx, keep, kept++);

  for (const ScriptObjectDefinitionBase* definition : ScriptObjectDefinitionBase::GetAll()) {
    if (definition == nullptr) continue;
    const std::size_t classIndex = impl.classes.size();
    impl.classes.emplace_back();
    impl.classes.back().definition = definition;
    impl.classes.back().label = definition->GetClassName();
    impl.classByName.emplace(definition->GetClassName(), classIndex);

    duk_push_object(ctx);
    const duk_idx_t prototype = duk_get_top_index(ctx);
    duk_dup(ctx, base);
    duk_set_prototype(ctx, prototype);
    PushFunction(ctx, ClassConstructor, DUK_VARARGS, classIndex, definition->GetClassName());
    const duk_idx_t constructor = duk_get_top_index(ctx);
    duk_push_literal(ctx, "prototype");
    duk_dup(ctx, prototype);
    duk_def_prop(ctx, constructor,
                 DUK_DEFPROP_HAVE_VALUE | DUK_DEFPROP_FORCE | DUK_DEFPROP_HAVE_WRITABLE |
                     DUK_DEFPROP_HAVE_CONFIGURABLE);
    duk_dup(ctx, constructor);
    duk_put_prop_literal(ctx, prototype, "constructor");

    for (const ScriptItemDefinitionBase& item : definition->GetItems()) {
      const std::size_t magic = impl.items.size();
      if (magic > 32767) break;  // the engine's magic is 16 bits
      const std::string label =
          definition->GetClassName() +
          (item.GetKind() == ItemKind::kIndexedGetter ? std::string("[]") : "." + item.GetName());
      switch (item.GetKind()) {
        case ItemKind::kConstructor:
          impl.classes[classIndex].constructor = &item;
          continue;
        case ItemKind::kConstant:
          DefineConstant(ctx, impl, constructor, item.GetName(), item.GetConstant());
          DefineConstant(ctx, impl, prototype, item.GetName(), item.GetConstant());
          continue;
        default:
          break;
      }
      impl.items.push_back({&item, label});
      switch (item.GetKind()) {
        case ItemKind::kReadOnlyProperty:
        case ItemKind::kReadWriteProperty:
          if (item.IsStatic()) DefineAccessor(ctx, constructor, item.GetName(), magic);
          DefineAccessor(ctx, prototype, item.GetName(), magic);
          break;
        case ItemKind::kMethod:
          if (item.IsStatic()) DefineMethod(ctx, constructor, item.GetName(), magic);
          DefineMethod(ctx, prototype, item.GetName(), magic);
          break;
        case ItemKind::kElementCount:
          DefineAccessor(ctx, prototype, "length", magic);
          break;
        case ItemKind::kIndexedGetter:
          impl.classes[classIndex].indexedGetter = static_cast<int>(magic);
          break;
        default:
          break;
      }
    }
    impl.classes[classIndex].prototype = duk_get_heapptr(ctx, prototype);
    duk_dup(ctx, prototype);
    duk_put_prop_index(ctx, keep, kept++);

    for (const definition::NamespaceEntry& entry : definition->GetNamespaces()) {
      if ((entry.flags & definition::kNamespaceFlag_Global) != 0) {
        duk_push_global_object(ctx);
        duk_dup(ctx, constructor);
        duk_put_prop_lstring(ctx, -2, entry.name.data(), entry.name.size());
        duk_pop(ctx);
      } else {
        PushNamespace(ctx, entry.name);
        duk_dup(ctx, constructor);
        duk_put_prop_lstring(ctx, -2, definition->GetClassName().data(),
                             definition->GetClassName().size());
        duk_pop(ctx);
      }
    }
    duk_pop_2(ctx);  // prototype, constructor
  }
  duk_dup(ctx, keep);
  duk_put_prop_literal(ctx, stash, kStashPrototypes);
  duk_pop_3(ctx);  // base, keep, stash
  return 0;
}

// Reads name, message, file and line of the thrown value at the top.
void ReadError(duk_context* ctx, JavaScriptResult& result) {
  if (duk_is_error(ctx, -1)) {
    duk_get_prop_literal(ctx, -1, "name");
    result.errorName = duk_is_string(ctx, -1) ? ToUTF8Text(ctx, -1) : "Error";
    duk_pop(ctx);
    duk_get_prop_literal(ctx, -1, "message");
    result.text = duk_is_string(ctx, -1) ? ToUTF8Text(ctx, -1) : std::string();
    duk_pop(ctx);
    duk_get_prop_literal(ctx, -1, "fileName");
    if (duk_is_string(ctx, -1)) result.fileName = ToUTF8Text(ctx, -1);
    duk_pop(ctx);
    duk_get_prop_literal(ctx, -1, "lineNumber");
    if (duk_is_number(ctx, -1)) {
      const double line = duk_get_number(ctx, -1);
      if (line >= 0 && line < 2147483647.0) result.lineNumber = static_cast<int>(line);
    }
    duk_pop(ctx);
  } else {
    result.errorName = "Error";
    duk_dup(ctx, -1);
    duk_safe_to_string(ctx, -1);
    result.text = "uncaught " + ToUTF8Text(ctx, -1);
    duk_pop(ctx);
  }
}

struct ResultReader {
  Impl* impl;
  JavaScriptResult* result;
};

// The completion value at index 0.
duk_ret_t ReadValue(duk_context* ctx, void* udata) {
  auto& reader = *static_cast<ResultReader*>(udata);
  reader.result->value = GetValue(ctx, *reader.impl, 0);
  duk_dup(ctx, 0);
  duk_safe_to_string(ctx, -1);
  reader.result->text = ToUTF8Text(ctx, -1);
  return 0;
}

// The thrown value at index 0.
duk_ret_t ReadErrorValue(duk_context* ctx, void* udata) {
  ReadError(ctx, *static_cast<ResultReader*>(udata)->result);
  return 0;
}

}  // namespace

JavaScriptContext::Impl::~Impl() {
  if (ctx != nullptr) {
    duk_destroy_heap(ctx);
    ctx = nullptr;
  }
  for (const auto& entry : wrappers) entry.first->Release();
  wrappers.clear();
}

JavaScriptContext::JavaScriptContext(JavaScriptLimits limits) : impl_(std::make_unique<Impl>()) {
  impl_->owner = this;
  impl_->limits = limits;
  impl_->ctx = duk_create_heap(Allocate, Reallocate, Free, impl_.get(), nullptr);
  if (impl_->ctx == nullptr) throw std::bad_alloc();
  if (duk_safe_call(impl_->ctx, SetUpHeap, impl_.get(), 0, 1) != DUK_EXEC_SUCCESS) {
    const std::string message = ToUTF8Text(impl_->ctx, -1);
    throw std::runtime_error("zebscripting: the script context could not be set up: " + message);
  }
  duk_pop(impl_->ctx);
}

// The last reference is gone, so no other thread can be inside.
JavaScriptContext::~JavaScriptContext() = default;

boost::intrusive_ptr<JavaScriptContext> JavaScriptContext::Create(JavaScriptLimits limits) {
  return boost::intrusive_ptr<JavaScriptContext>(new JavaScriptContext(limits));
}

JavaScriptResult JavaScriptContext::Evaluate(std::string_view source, std::string_view fileName) {
  std::lock_guard<std::recursive_mutex> lock(impl_->mutex);
  duk_context* ctx = impl_->ctx;
  JavaScriptResult result;
  const bool outer = !impl_->timing;
  if (outer && impl_->limits.timeoutSeconds > 0) {
    impl_->timing = true;
    impl_->deadline = std::chrono::steady_clock::now() +
                      std::chrono::duration_cast<std::chrono::steady_clock::duration>(
                          std::chrono::duration<double>(impl_->limits.timeoutSeconds));
  }
  duk_push_lstring(ctx, source.data(), source.size());
  duk_push_lstring(ctx, fileName.data(), fileName.size());
  duk_int_t status = duk_pcompile(ctx, 0);
  if (status == DUK_EXEC_SUCCESS) status = duk_pcall(ctx, 0);
  // Reading the outcome may run script (getters, toString), so it runs
  // protected and still under the time limit.
  ResultReader reader{impl_.get(), &result};
  if (status == DUK_EXEC_SUCCESS) {
    result.ok = true;
    if (duk_safe_call(ctx, ReadValue, &reader, 1, 1) != DUK_EXEC_SUCCESS) {
      result = JavaScriptResult();
      result.errorName = "RangeError";
      result.text = "the script's value could not be read";
    }
  } else if (duk_safe_call(ctx, ReadErrorValue, &reader, 1, 1) != DUK_EXEC_SUCCESS) {
    result.errorName = "Error";
    result.text = "the error could not be read";
  }
  duk_pop(ctx);
  if (outer) impl_->timing = false;
  return result;
}

void JavaScriptContext::DefineFunction(const char* name, NativeFunction function) {
  std::lock_guard<std::recursive_mutex> lock(impl_->mutex);
  duk_context* ctx = impl_->ctx;
  const std::size_t magic = impl_->functions.size();
  impl_->functions.push_back(std::move(function));
  duk_push_global_object(ctx);
  PushFunction(ctx, NativeCall, DUK_VARARGS, magic, name);
  duk_put_prop_string(ctx, -2, name);
  duk_pop(ctx);
}

void JavaScriptContext::DefineGlobal(const char* name, const ScriptValue& value) {
  std::lock_guard<std::recursive_mutex> lock(impl_->mutex);
  duk_context* ctx = impl_->ctx;
  duk_push_global_object(ctx);
  PushValue(ctx, *impl_, value);
  duk_put_prop_string(ctx, -2, name);
  duk_pop(ctx);
}

void JavaScriptContext::DefinePlainNumberFunction(const char* name, int value) {
  std::lock_guard<std::recursive_mutex> lock(impl_->mutex);
  duk_context* ctx = impl_->ctx;
  duk_push_global_object(ctx);
  duk_push_c_function(ctx, PlainNumber, 0);
  duk_set_magic(ctx, -1, value < -32768 ? -32768 : value > 32767 ? 32767 : value);
  duk_put_prop_string(ctx, -2, name);
  duk_pop(ctx);
}

void JavaScriptContext::CollectGarbage() {
  std::lock_guard<std::recursive_mutex> lock(impl_->mutex);
  // The second pass frees what the first one finalized.
  duk_gc(impl_->ctx, 0);
  duk_gc(impl_->ctx, 0);
}

std::size_t JavaScriptContext::WrapperCount() const {
  std::lock_guard<std::recursive_mutex> lock(impl_->mutex);
  return impl_->wrappers.size();
}

std::size_t JavaScriptContext::MemoryInUse() const {
  std::lock_guard<std::recursive_mutex> lock(impl_->mutex);
  return impl_->used;
}

}  // namespace zebscripting

duk_bool_t zebscripting_duk_exec_timeout_check(void* udata) {
  const auto* impl = static_cast<const zebscripting::JavaScriptContext::Impl*>(udata);
  return impl != nullptr && impl->timing && std::chrono::steady_clock::now() > impl->deadline;
}

void zebscripting_duk_fatal(void* /*udata*/, const char* message) {
  zebcore::logging::LogException("zebscripting: fatal engine error",
                                 message != nullptr ? message : "");
  std::abort();
}
