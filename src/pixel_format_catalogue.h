// The built-in pixel format catalogue, shared by the video sources.
#pragma once

#include <zebmediatypes/pixel_format.h>

#include <cstddef>

namespace zebmediatypes::details {

struct PixelFormatEntry {
  PixelFormat format;
  const char* descriptiveName;  // null where the name has no descriptive text
};

inline constexpr std::size_t kBuiltInPixelFormatCount = 112;

// The row of `name`, or null.
const PixelFormatEntry* FindBuiltInPixelFormat(std::uint32_t name) noexcept;

}  // namespace zebmediatypes::details
