// Start-up registration.
//
// A library takes part in the host's start-up by owning one
// InitializerRegistrar, built by a static initializer when the library loads.
// The host calls StartUp() once when it starts, which calls every registered
// initialize function in registration order (a registrar whose named
// dependencies are registered waits until they have started), and ShutDown()
// when it stops, which calls the terminate functions of those that started, in
// reverse order of starting. A registrar destroyed while started (its library
// unloads) is terminated first. The functions are called without any registry
// lock held, so they may use every other service, but they must not call
// StartUp or ShutDown themselves.
#pragma once

#include <zebcore/export.h>

#include <cstddef>

namespace zebcore::config {

enum EInitializerContextFlags : unsigned int {
  kInitializerContext_None = 0,
  kInitializerContext_Core = 1,
  kInitializerContext_Media = 2,
  kInitializerContext_UserInterface = 4,
};

// The name of a registrar that must start before this one; null for none.
struct InitializerDependency {
  const char* name = nullptr;
};
inline constexpr std::size_t kMaxInitializerDependencies = 16;

class ZEBCORE_API InitializerRegistrar {
 public:
  using InitializeFunction = bool (*)();
  using TerminateFunction = void (*)();

  InitializerRegistrar(const char* name, EInitializerContextFlags context,
                       InitializeFunction initialize, TerminateFunction terminate,
                       TerminateFunction unused,
                       const InitializerDependency (&dependencies)[kMaxInitializerDependencies]);
  ~InitializerRegistrar();
  InitializerRegistrar(const InitializerRegistrar&) = delete;
  InitializerRegistrar& operator=(const InitializerRegistrar&) = delete;

  const char* Name() const noexcept { return name_; }
  EInitializerContextFlags Context() const noexcept { return context_; }

 private:
  friend bool StartUp();
  friend void ShutDown();

  const char* name_;
  EInitializerContextFlags context_;
  InitializeFunction initialize_;
  TerminateFunction terminate_;
  const char* dependencies_[kMaxInitializerDependencies] = {};
  bool started_ = false;
};

// Calls every registered initialize function not yet started, in registration
// order. True when all of them returned true. A registrar whose initialize
// function returns false (or is null) is not started, is not terminated, and is
// tried again by the next StartUp; so is one whose dependency did not start.
ZEBCORE_API bool StartUp();
// Calls the terminate function of every started registrar, newest first.
ZEBCORE_API void ShutDown();

}  // namespace zebcore::config
