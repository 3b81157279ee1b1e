// Reads arbitrary bytes as a colour-space text. Whatever the input, the result
// is written and read back to itself with the same identifier.
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/initialization.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  // A start and stop per input keeps the colour-space cache from growing
  // without bound over a long run.
  zebmediatypes::Initialize();
  const zebcore::UTF8String text(data, size);
  const zebmediatypes::color::ColorSpace space =
      zebmediatypes::color::ColorSpaceFromSerializedString(text);
  const zebcore::UTF8String written = space.ToSerializedString();
  const zebmediatypes::color::ColorSpace back =
      zebmediatypes::color::ColorSpaceFromSerializedString(written);
  // The rewritten text is stable, and every field comes back; only a name
  // holding invalid UTF-8 may differ (it is written with U+FFFD).
  if (back.ToSerializedString() != written) std::abort();
  if (back.baseProfileType != space.baseProfileType ||
      back.colorSpaceLinearized != space.colorSpaceLinearized) {
    std::abort();
  }
  if (back.baseColorProfile.colorProfileName == space.baseColorProfile.colorProfileName &&
      (back != space || back.ToGuid() != space.ToGuid())) {
    std::abort();
  }
  zebmediatypes::Terminate();
  return 0;
}
