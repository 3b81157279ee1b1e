// Helpers shared by the colour test binaries.
#pragma once

#include <zebcore/allocator.h>
#include <zebcore/logging.h>
#include <zebcore/string.h>
#include <zebmediatypes/color/color_management_settings.h>
#include <zebmediatypes/color/color_space.h>

#include <boost/make_shared.hpp>
#include <future>
#include <ostream>
#include <string>
#include <string_view>
#include <thread>
#include <vector>

#include "color/color_state.h"

namespace zebmediatypes::color {

// Test failures show records by their text.
inline void PrintTo(const ColorSpace& space, std::ostream* out) {
  *out << zebcore::string::ToStdString(space.ToSerializedString());
}
inline void PrintTo(const ColorManagementSettings& settings, std::ostream* out) {
  *out << zebcore::string::ToStdString(settings.ToSerializedString());
}

}  // namespace zebmediatypes::color

namespace zebmediatypes::testing {

inline zebcore::UTF8String U8(std::string_view text) { return zebcore::string::ToUTF8String(text); }

inline color::ColorSpace MakeSpace(std::string_view name, std::uint32_t type = 0,
                                   bool linearized = false) {
  color::ColorSpace space;
  space.baseColorProfile.colorProfileName = U8(name);
  space.baseProfileType = static_cast<color::ColorSpaceType>(type);
  space.colorSpaceLinearized = linearized;
  return space;
}

inline color::ColorSpace DefaultSpace() { return MakeSpace("BT.709 RGB Full", 1); }

// Records the usage events logged on this thread while it lives.
class ScopedUsageLogger {
  struct Recorder final : zebcore::config::UsageLogger {
    void LogEvent(std::string_view area, std::string_view kind, std::string_view event) override {
      events.push_back(std::string(area) + "/" + std::string(kind) + "/" + std::string(event));
    }
    std::vector<std::string> events;
  };
  boost::shared_ptr<Recorder> recorder_ = boost::make_shared<Recorder>();
  boost::shared_ptr<zebcore::config::UsageLogger> previous_ =
      zebcore::config::UsageLogger::Set(recorder_);

 public:
  ~ScopedUsageLogger() { zebcore::config::UsageLogger::Set(previous_); }
  const std::vector<std::string>& Events() const { return recorder_->events; }
};

// Holds the colour lock from another thread while it lives, with the wait
// limit cut to 20 ms so that every other taker times out quickly.
class ColorLockHolder {
  unsigned int previousWait_ = details::SetLockWaitMilliseconds(20);
  std::promise<void> held_, release_;
  std::future<void> heldFuture_ = held_.get_future(), released_ = release_.get_future();
  std::thread thread_{[this] {
    const bool locked = details::ColorLock().Lock(nullptr, 5000);
    held_.set_value();
    released_.wait();
    if (locked) details::ColorLock().Unlock();
  }};

 public:
  ColorLockHolder() { heldFuture_.wait(); }
  ~ColorLockHolder() {
    release_.set_value();
    thread_.join();
    details::SetLockWaitMilliseconds(previousWait_);
  }
};

}  // namespace zebmediatypes::testing
