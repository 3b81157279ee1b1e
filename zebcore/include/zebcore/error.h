// ThrowError: raises the family's exception with a localized message.
#pragma once

#include <zebcore/export.h>

#include <stdexcept>
#include <string>
#include <string_view>

namespace zebcore::config {

// The family's exception. what() is the localized message as UTF-8.
class ZEBCORE_API Error : public std::runtime_error {
 public:
  Error(std::string key, const std::string& message)
      : std::runtime_error(message), key_(std::move(key)) {}
  const std::string& Key() const noexcept { return key_; }

 private:
  std::string key_;
};

inline constexpr const char* kInputContractViolation =
    "$$$/zebcore/utility/Error/Contract/InputContractViolation="
    "An input contract violation has occurred!";

// Throws Error with the localized text of `key` ("$$$/path=Default").
[[noreturn]] ZEBCORE_API void ThrowError(std::string_view key);

}  // namespace zebcore::config
