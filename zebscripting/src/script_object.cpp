// Script values, script objects and script context handles.
#include <zebscripting/script_context.h>
#include <zebscripting/script_object.h>
#include <zebscripting/script_value.h>

#include <atomic>
#include <mutex>
#include <unordered_map>

namespace zebscripting {
namespace {

std::atomic<std::size_t>& LiveObjects() {
  static std::atomic<std::size_t> count{0};
  return count;
}

// Live contexts by handle.
struct ContextRegistry {
  std::mutex mutex;
  std::unordered_map<int, zebcore::utility::WeakPtr<ScriptContext>> contexts;
  int nextHandle = 1;
};

ContextRegistry& Contexts() {
  static ContextRegistry* const registry = new ContextRegistry();
  return *registry;
}

}  // namespace

ScriptValue::ScriptValue(ScriptObjectPtr object)
    : kind_(object ? Kind::kObject : Kind::kNull), object_(std::move(object)) {}

ScriptValue::ScriptValue(const ScriptValue& other)
    : kind_(other.kind_),
      bool_(other.bool_),
      number_(other.number_),
      object_(other.object_),
      payload_(other.payload_ ? new Payload(*other.payload_) : nullptr) {}

ScriptValue& ScriptValue::operator=(const ScriptValue& other) {
  if (this != &other) *this = ScriptValue(other);
  return *this;
}

const ScriptValue::Payload& ScriptValue::Empty() noexcept {
  static const Payload empty;
  return empty;
}

std::string ScriptValue::Describe() const {
  switch (kind_) {
    case Kind::kUndefined:
      return "undefined";
    case Kind::kNull:
      return "null";
    case Kind::kBool:
      return "boolean";
    case Kind::kNumber:
      return "number";
    case Kind::kString:
      return "string";
    case Kind::kObject:
      return std::string(object_->GetClassName()) + " object";
    case Kind::kArray:
      return "array";
    case Kind::kOther:
      return Data().other;
  }
  return "value";
}

const ScriptValue& ScriptArguments::Undefined() noexcept {
  static const ScriptValue undefined;
  return undefined;
}

ScriptObjectBase::~ScriptObjectBase() = default;

ScriptObject::ScriptObject(const char* name) : className_(name != nullptr ? name : "") {
  LiveObjects().fetch_add(1, std::memory_order_relaxed);
}

ScriptObject::~ScriptObject() { LiveObjects().fetch_sub(1, std::memory_order_relaxed); }

bool ScriptObject::IsEqual(const ScriptObjectPtr& other) const { return other.get() == this; }

std::uint64_t ScriptObject::Hash() const {
  return static_cast<std::uint64_t>(reinterpret_cast<std::uintptr_t>(this));
}

void ScriptObject::LockObject() noexcept {
  locks_.fetch_add(1, std::memory_order_acq_rel);
  AddRef();
}

void ScriptObject::UnlockObject() noexcept {
  int count = locks_.load(std::memory_order_acquire);
  while (count > 0) {
    if (locks_.compare_exchange_weak(count, count - 1, std::memory_order_acq_rel)) {
      Release();
      return;
    }
  }
}

std::size_t ScriptObject::LiveObjectCount() noexcept {
  return LiveObjects().load(std::memory_order_relaxed);
}

ParameterErrorException::~ParameterErrorException() = default;

ScriptContext::ScriptContext() {
  ContextRegistry& registry = Contexts();
  std::lock_guard<std::mutex> lock(registry.mutex);
  handle_ = registry.nextHandle++;
  registry.contexts.emplace(handle_, zebcore::utility::WeakPtr<ScriptContext>(this));
}

ScriptContext::~ScriptContext() {
  ContextRegistry& registry = Contexts();
  std::lock_guard<std::mutex> lock(registry.mutex);
  registry.contexts.erase(handle_);
}

boost::intrusive_ptr<ScriptContext> ScriptContext::FromHandle(int handle) {
  ContextRegistry& registry = Contexts();
  std::lock_guard<std::mutex> lock(registry.mutex);
  const auto found = registry.contexts.find(handle);
  return found != registry.contexts.end() ? found->second.Lock() : nullptr;
}

bool ScriptContext::Exists(int handle) {
  if (handle == 0) return true;
  ContextRegistry& registry = Contexts();
  std::lock_guard<std::mutex> lock(registry.mutex);
  const auto found = registry.contexts.find(handle);
  return found != registry.contexts.end() && !found->second.Expired();
}

}  // namespace zebscripting
