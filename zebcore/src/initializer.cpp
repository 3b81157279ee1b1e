// The start-up registry.

#include <zebcore/initializer.h>

#include <algorithm>
#include <cstring>
#include <mutex>
#include <vector>

namespace zebcore::config {
namespace {

struct Registry {
  std::mutex mutex;
  std::vector<InitializerRegistrar*> registered;  // registration order
  std::vector<InitializerRegistrar*> started;     // start order
};

// Never destroyed: registrars of other libraries leave it from their own
// static destructors, in an order nobody controls.
Registry& TheRegistry() {
  static Registry* const registry = new Registry;
  return *registry;
}

}  // namespace

InitializerRegistrar::InitializerRegistrar(
    const char* name, EInitializerContextFlags context, InitializeFunction initialize,
    TerminateFunction terminate, TerminateFunction /*unused*/,
    const InitializerDependency (&dependencies)[kMaxInitializerDependencies])
    : name_(name ? name : ""), context_(context), initialize_(initialize), terminate_(terminate) {
  for (std::size_t i = 0; i < kMaxInitializerDependencies; ++i) {
    dependencies_[i] = dependencies[i].name;
  }
  Registry& registry = TheRegistry();
  std::lock_guard<std::mutex> lock(registry.mutex);
  registry.registered.push_back(this);
}

InitializerRegistrar::~InitializerRegistrar() {
  bool wasStarted = false;
  {
    Registry& registry = TheRegistry();
    std::lock_guard<std::mutex> lock(registry.mutex);
    auto& r = registry.registered;
    r.erase(std::remove(r.begin(), r.end(), this), r.end());
    auto& s = registry.started;
    s.erase(std::remove(s.begin(), s.end(), this), s.end());
    wasStarted = started_;
    started_ = false;
  }
  if (wasStarted && terminate_) terminate_();
}

bool StartUp() {
  Registry& registry = TheRegistry();
  bool allStarted = true;
  std::vector<InitializerRegistrar*> tried;
  for (;;) {
    InitializerRegistrar* next = nullptr;
    {
      std::lock_guard<std::mutex> lock(registry.mutex);
      auto isStarted = [&](const char* name) {
        for (InitializerRegistrar* r : registry.registered) {
          if (std::strcmp(r->name_, name) == 0) return r->started_;
        }
        return true;  // not registered here: nothing to wait for
      };
      for (InitializerRegistrar* r : registry.registered) {
        if (r->started_ || std::find(tried.begin(), tried.end(), r) != tried.end()) continue;
        bool ready = true;
        for (const char* dependency : r->dependencies_) {
          if (dependency != nullptr && *dependency != '\0' && !isStarted(dependency)) {
            ready = false;
          }
        }
        if (ready) {
          next = r;
          break;
        }
      }
      if (next == nullptr) {
        // What is left waits on a dependency that did not start (or a cycle).
        for (InitializerRegistrar* r : registry.registered) {
          if (!r->started_) allStarted = false;
        }
        return allStarted;
      }
      tried.push_back(next);
    }
    const bool ok = next->initialize_ != nullptr && next->initialize_();
    std::lock_guard<std::mutex> lock(registry.mutex);
    // It may have been destroyed meanwhile (its library unloaded).
    if (std::find(registry.registered.begin(), registry.registered.end(), next) ==
        registry.registered.end()) {
      continue;
    }
    if (ok) {
      next->started_ = true;
      registry.started.push_back(next);
    } else {
      allStarted = false;
    }
  }
}

void ShutDown() {
  Registry& registry = TheRegistry();
  for (;;) {
    InitializerRegistrar::TerminateFunction terminate = nullptr;
    {
      std::lock_guard<std::mutex> lock(registry.mutex);
      if (registry.started.empty()) return;
      InitializerRegistrar* last = registry.started.back();
      registry.started.pop_back();
      last->started_ = false;
      terminate = last->terminate_;
    }
    if (terminate) terminate();
  }
}

}  // namespace zebcore::config
