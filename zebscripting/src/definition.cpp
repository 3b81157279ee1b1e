// Class definitions, the registry of script classes and the object factory.
#include <zebcore/logging.h>
#include <zebscripting/definition.h>
#include <zebscripting/factory.h>
#include <zebscripting/script_context.h>
#include <zebscripting/utils.h>

#include <exception>
#include <memory>
#include <mutex>
#include <string>
#include <unordered_map>
#include <vector>

namespace zebscripting {
namespace definition {

ScriptObjectDefinitionBase* ScriptObjectDefinitionBase::sCurrent = nullptr;

namespace {

struct RegisteredClass {
  boost::intrusive_ptr<factory::ScriptObjectDefinitionInitiatorBase> initiator;
  std::unique_ptr<ScriptObjectDefinitionBase> definition;  // null until built
};

// The registered classes in registration order. Definitions of classes
// unregistered later are kept (retired) so that pointers handed out stay valid.
struct Registry {
  std::recursive_mutex mutex;
  std::vector<RegisteredClass> classes;
  std::unordered_map<std::string, const ScriptObjectDefinitionBase*> byName;
  std::vector<std::unique_ptr<ScriptObjectDefinitionBase>> retired;
};

Registry& GetRegistry() {
  static Registry* const registry = new Registry();
  return *registry;
}

// Builds every class not built yet. The registry lock is held.
void BuildPending(Registry& registry) {
  for (RegisteredClass& entry : registry.classes) {
    if (entry.definition) continue;
    const factory::ScriptObjectDefinitionInitiatorBase* initiator = entry.initiator.get();
    auto definition = std::make_unique<ScriptObjectDefinitionBase>(
        initiator->GetClassName(), initiator->GetDescription(),
        [initiator] { return initiator->CreateInstance(); });
    ScriptObjectDefinitionBase* const previous = ScriptObjectDefinitionBase::sCurrent;
    ScriptObjectDefinitionBase::sCurrent = definition.get();
    try {
      initiator->DefineObject();
      definition->MarkComplete(true);
    } catch (const std::exception& error) {
      zebcore::logging::LogException(
          std::string("zebscripting: defining class ") + initiator->GetClassName(), error);
    } catch (...) {
      zebcore::logging::LogException(
          std::string("zebscripting: defining class ") + initiator->GetClassName(),
          "unknown exception");
    }
    ScriptObjectDefinitionBase::sCurrent = previous;
    registry.byName[definition->GetClassName()] = definition.get();
    entry.definition = std::move(definition);
  }
}

}  // namespace

ScriptItemDefinitionBase::ScriptItemDefinitionBase(std::uint32_t flags, std::string name,
                                                   const TypeDescription& type,
                                                   std::vector<TypeDescription> parameters,
                                                   std::string description)
    : flags_(flags),
      name_(std::move(name)),
      type_(type),
      parameters_(std::move(parameters)),
      description_(std::move(description)) {}

ScriptObjectDefinitionBase::ScriptObjectDefinitionBase(std::string className,
                                                       std::string description,
                                                       CreateFunction create)
    : className_(std::move(className)),
      description_(std::move(description)),
      create_(std::move(create)) {}

void ScriptObjectDefinitionBase::AddOrModifyNamespace(const char* name, std::uint32_t flags) {
  const std::string key = name != nullptr ? name : "";
  for (NamespaceEntry& entry : namespaces_) {
    if (entry.name == key) {
      entry.flags = flags;
      return;
    }
  }
  namespaces_.push_back({key, flags});
}

void ScriptObjectDefinitionBase::AddProperty(ScriptItemDefinitionBase item) {
  for (ScriptItemDefinitionBase& existing : items_) {
    if (existing.GetName() == item.GetName() && existing.IsStatic() == item.IsStatic() &&
        existing.GetKind() == item.GetKind()) {
      existing = std::move(item);
      return;
    }
  }
  items_.push_back(std::move(item));
}

const ScriptItemDefinitionBase* ScriptObjectDefinitionBase::FindItem(
    std::string_view name) const noexcept {
  for (const ScriptItemDefinitionBase& item : items_) {
    if (item.GetName() == name) return &item;
  }
  return nullptr;
}

const ScriptItemDefinitionBase* ScriptObjectDefinitionBase::GetConstructor() const noexcept {
  for (const ScriptItemDefinitionBase& item : items_) {
    if (item.GetKind() == ItemKind::kConstructor) return &item;
  }
  return nullptr;
}

ScriptObjectPtr ScriptObjectDefinitionBase::CreateInstance(int contextHandle) const {
  ScriptObjectPtr object = create_();
  if (object) object->SetContextHandle(contextHandle);
  return object;
}

const ScriptObjectDefinitionBase* ScriptObjectDefinitionBase::Find(std::string_view className) {
  Registry& registry = GetRegistry();
  std::lock_guard<std::recursive_mutex> lock(registry.mutex);
  BuildPending(registry);
  const auto found = registry.byName.find(std::string(className));
  return found != registry.byName.end() ? found->second : nullptr;
}

std::vector<const ScriptObjectDefinitionBase*> ScriptObjectDefinitionBase::GetAll() {
  Registry& registry = GetRegistry();
  std::lock_guard<std::recursive_mutex> lock(registry.mutex);
  BuildPending(registry);
  std::vector<const ScriptObjectDefinitionBase*> all;
  all.reserve(registry.classes.size());
  for (const RegisteredClass& entry : registry.classes) all.push_back(entry.definition.get());
  return all;
}

ScriptItemDefinitionBase Constant(std::string name, std::int64_t value, std::string description,
                                  std::uint32_t hostFlags) {
  ScriptItemDefinitionBase item(MakeItemFlags(kItemFlag_Constant, false, hostFlags),
                                std::move(name), PropertyType<std::int64_t>(), {},
                                std::move(description));
  item.SetConstant(PropertyType<std::int64_t>::ToScript(value));
  return item;
}

ScriptItemDefinitionBase Constant(std::string name, const zebcore::UTF8String& value,
                                  std::string description, std::uint32_t hostFlags) {
  ScriptItemDefinitionBase item(MakeItemFlags(kItemFlag_Constant, false, hostFlags),
                                std::move(name), PropertyType<zebcore::UTF8String>(), {},
                                std::move(description));
  item.SetConstant(PropertyType<zebcore::UTF8String>::ToScript(value));
  return item;
}

}  // namespace definition

namespace factory {

ScriptObjectDefinitionInitiatorBase::~ScriptObjectDefinitionInitiatorBase() = default;

ScriptObjectDefinitionRegistrar::ScriptObjectDefinitionRegistrar(
    boost::intrusive_ptr<ScriptObjectDefinitionInitiatorBase> initiator)
    : initiator_(std::move(initiator)) {
  if (!initiator_) return;
  definition::Registry& registry = definition::GetRegistry();
  std::lock_guard<std::recursive_mutex> lock(registry.mutex);
  const std::string name = initiator_->GetClassName();
  for (const definition::RegisteredClass& entry : registry.classes) {
    if (name == entry.initiator->GetClassName()) {
      zebcore::logging::LogException("zebscripting: registering class " + name,
                                     "a class of that name is registered already");
      return;
    }
  }
  registry.classes.push_back({initiator_, nullptr});
  registered_ = true;
}

ScriptObjectDefinitionRegistrar::~ScriptObjectDefinitionRegistrar() {
  if (!registered_) return;
  definition::Registry& registry = definition::GetRegistry();
  std::lock_guard<std::recursive_mutex> lock(registry.mutex);
  for (auto entry = registry.classes.begin(); entry != registry.classes.end(); ++entry) {
    if (entry->initiator != initiator_) continue;
    if (entry->definition) {
      registry.byName.erase(entry->definition->GetClassName());
      registry.retired.push_back(std::move(entry->definition));
    }
    registry.classes.erase(entry);
    return;
  }
}

}  // namespace factory

namespace utils {

ScriptObjectPtr CreateScriptObject(int contextHandle, const char* className,
                                   const std::function<void(const ScriptObjectPtr&)>& initializer) {
  const definition::ScriptObjectDefinitionBase* definition =
      definition::ScriptObjectDefinitionBase::Find(className != nullptr ? className : "");
  if (definition == nullptr) {
    zebcore::logging::LogException(
        "zebscripting::utils::CreateScriptObject",
        std::string("no script class ") + (className != nullptr ? className : "(null)"));
    return nullptr;
  }
  if (!ScriptContext::Exists(contextHandle)) return nullptr;
  ScriptObjectPtr object = definition->CreateInstance(contextHandle);
  if (object && initializer) initializer(object);
  return object;
}

}  // namespace utils
}  // namespace zebscripting
