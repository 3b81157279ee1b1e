// Compile-time checks of the MIME catalogue: the texts are distinct and 7-bit
// ASCII, so that peers comparing them can never confuse two formats.
#include <zebmediatypes/mime_types.h>

#include <cstddef>
#include <string_view>

namespace zebmediatypes {
namespace {

constexpr bool AllTextsDistinct() {
  for (std::size_t i = 0; i < kMimeTypeCount; ++i) {
    for (std::size_t j = i + 1; j < kMimeTypeCount; ++j) {
      if (kMimeTypes[i].View() == kMimeTypes[j].View()) return false;
    }
  }
  return true;
}

constexpr bool AllTextsAscii() {
  for (const auto& type : kMimeTypes) {
    for (char c : type.View()) {
      if (static_cast<unsigned char>(c) < 0x20 || static_cast<unsigned char>(c) > 0x7E) {
        return false;
      }
    }
  }
  return true;
}

static_assert(AllTextsDistinct());
static_assert(AllTextsAscii());

}  // namespace
}  // namespace zebmediatypes
