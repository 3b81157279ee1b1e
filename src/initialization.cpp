// The library lifecycle: the start count, Initialize/Terminate and the
// start-up registrar.
#include <zebcore/assert.h>
#include <zebcore/initializer.h>
#include <zebcore/mutex.h>
#include <zebcore/string.h>
#include <zebmediatypes/color/color_space.h>
#include <zebmediatypes/initialization.h>

#include <cstdint>
#include <limits>

#include "color/color_state.h"
#include "commands/time_commands.h"

namespace zebmediatypes {
namespace {

// The lifecycle lock and the start count it guards. Built on first use and
// never destroyed: the registrar's terminate function may run from a static
// destructor at unload.
struct LifecycleState {
  zebcore::threads::RecursiveMutex lock{nullptr};
  std::uint32_t startCount = 0;
};

LifecycleState& Lifecycle() {
  static LifecycleState* const state = new LifecycleState();
  return *state;
}

void Report(const char* expression, const char* message, const char* function, int line) noexcept {
  try {
    zebcore::debug::ReportAssertion(expression, message, __FILE__, function, line);
  } catch (...) {
  }
}

color::ColorSpace MakeDefaultColorSpace() {
  color::ColorSpace space;
  space.baseColorProfile.colorProfileName = zebcore::string::ToUTF8String("BT.709 RGB Full");
  space.baseProfileType = color::kColorSpaceType_Model;
  space.colorSpaceLinearized = false;
  return space;
}

// Initialize that says whether the library is started for this caller.
bool StartOneUser() noexcept {
  LifecycleState& state = Lifecycle();
  zebcore::threads::RecursiveLockGuard guard(state.lock, "zebmediatypes::Initialize",
                                             details::LockWaitMilliseconds());
  if (!guard) {
    details::ReportLockTimeout("lifecycle lock", "zebmediatypes::Initialize", __LINE__);
    return false;
  }
  if (state.startCount == std::numeric_limits<std::uint32_t>::max()) {
    Report("startCount < max", "Too many users of the library", "zebmediatypes::Initialize",
           __LINE__);
    return false;
  }
  if (state.startCount == 0) {
    bool installed = false;
    try {
      installed = details::InstallDefaultColorSpace(MakeDefaultColorSpace());
    } catch (...) {
    }
    if (!installed) {
      Report("installed", "The default colour space could not be installed",
             "zebmediatypes::Initialize", __LINE__);
      return false;
    }
  }
  ++state.startCount;
  return true;
}

void StopOneUser() noexcept {
  LifecycleState& state = Lifecycle();
  zebcore::threads::RecursiveLockGuard guard(state.lock, "zebmediatypes::Terminate",
                                             details::LockWaitMilliseconds());
  if (!guard) {
    details::ReportLockTimeout("lifecycle lock", "zebmediatypes::Terminate", __LINE__);
    return;
  }
  if (state.startCount == 0) {
    Report("startCount > 0", "Terminate without a matching Initialize", "zebmediatypes::Terminate",
           __LINE__);
    return;
  }
  --state.startCount;
  if (state.startCount == 0) details::ClearColorSpaceCache();
}

bool RegistrarInitialize() {
  if (!StartOneUser()) return false;
  Commands::RegisterTimeCommands();
  return true;
}

void RegistrarTerminate() {
  Commands::UnregisterTimeCommands();
  StopOneUser();
}

constexpr zebcore::config::InitializerDependency
    kNoDependencies[zebcore::config::kMaxInitializerDependencies] = {};

// Joins the host's start-up and shut-down sequences when the library loads.
const zebcore::config::InitializerRegistrar gRegistrar("zebmediatypes",
                                                       zebcore::config::kInitializerContext_Media,
                                                       &RegistrarInitialize, &RegistrarTerminate,
                                                       nullptr, kNoDependencies);

}  // namespace

void Initialize() noexcept { (void)StartOneUser(); }

void Terminate() noexcept { StopOneUser(); }

}  // namespace zebmediatypes
