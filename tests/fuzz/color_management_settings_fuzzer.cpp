// Reads arbitrary bytes as a colour-management-settings text. Whatever the
// input, the result is written and read back to itself with the same
// identifier.
#include <zebmediatypes/color/color_serialization.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const zebcore::UTF8String text(data, size);
  const auto settings = zebmediatypes::color::ColorManagementSettingsFromSerializedString(text);
  const zebcore::UTF8String written = settings.ToSerializedString();
  const auto back = zebmediatypes::color::ColorManagementSettingsFromSerializedString(written);
  if (back.ToSerializedString() != written) std::abort();
  if (back.GetOCIOConfigurationFile() == settings.GetOCIOConfigurationFile() &&
      (back != settings || back.ToGuid() != settings.ToGuid())) {
    std::abort();
  }
  return 0;
}
