// Helpers shared by the colour test binaries.
#pragma once

#include <zebcore/allocator.h>
#include <zebcore/guid.h>
#include <zebcore/logging.h>
#include <zebcore/string.h>
#include <zebmediatypes/color/color_management_settings.h>
#include <zebmediatypes/color/color_space.h>

#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>
#include <cstring>
#include <initializer_list>
#include <memory>
#include <mutex>
#include <ostream>
#include <string>
#include <string_view>
#include <vector>

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
inline std::string Narrow(const zebcore::UTF8String& text) {
  return zebcore::string::ToStdString(text);
}

inline std::shared_ptr<zebcore::allocator::RecycledMemory> Block(
    const std::vector<unsigned char>& bytes) {
  auto block = zebcore::allocator::RecycledMemory::Create(0);
  unsigned char* data = block->Allocate(bytes.size());
  if (!bytes.empty()) std::memcpy(data, bytes.data(), bytes.size());
  return block;
}

inline color::ColorSpace MakeSpace(std::string_view name, std::uint32_t type = 0,
                                   bool linearized = false) {
  color::ColorSpace space;
  space.baseColorProfile.colorProfileName = U8(name);
  space.baseProfileType = static_cast<color::ColorSpaceType>(type);
  space.colorSpaceLinearized = linearized;
  return space;
}

inline color::ColorSpace DefaultSpace() { return MakeSpace("BT.709 RGB Full", 1); }

// Records usage events while installed.
class RecordingUsageLogger final : public zebcore::config::UsageLogger {
 public:
  void LogEvent(std::string_view area, std::string_view category, std::string_view event) override {
    std::lock_guard<std::mutex> lock(mutex_);
    events_.push_back(std::string(area) + "/" + std::string(category) + "/" + std::string(event));
  }
  std::vector<std::string> Events() const {
    std::lock_guard<std::mutex> lock(mutex_);
    return events_;
  }

 private:
  mutable std::mutex mutex_;
  std::vector<std::string> events_;
};

class ScopedUsageLogger {
 public:
  ScopedUsageLogger() : logger_(boost::make_shared<RecordingUsageLogger>()) {
    previous_ = zebcore::config::UsageLogger::Set(logger_);
  }
  ~ScopedUsageLogger() { zebcore::config::UsageLogger::Set(previous_); }
  ScopedUsageLogger(const ScopedUsageLogger&) = delete;
  ScopedUsageLogger& operator=(const ScopedUsageLogger&) = delete;
  std::vector<std::string> Events() const { return logger_->Events(); }

 private:
  boost::shared_ptr<RecordingUsageLogger> logger_;
  boost::shared_ptr<zebcore::config::UsageLogger> previous_;
};

}  // namespace zebmediatypes::testing
