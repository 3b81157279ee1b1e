// The script constants of "PixelFormat": one string constant per supported
// pixel format, whose value is the format's FourCC text.
//
//   PixelFormatFourCCText(kPixelFormat_YUYV_422_8u);   // "yuy2"
#pragma once

#include <zebmediatypes/export.h>
#include <zebmediatypes/pixel_format.h>

#include <array>
#include <cstddef>
#include <string>

namespace zebmediatypes::scripting {

// A constant: its script name, the pixel format it stands for and its
// description.
struct PixelFormatConstant {
  const char* name;
  PixelFormat format;
  const char* description;
};

inline constexpr std::size_t kPixelFormatConstantCount = 37;

// The constants in definition order. Constant data; safe from any thread.
ZEBMEDIATYPES_API const std::array<PixelFormatConstant, kPixelFormatConstantCount>&
GetPixelFormatConstants() noexcept;

// The four characters of a FourCC, lowest byte first; a byte below 32 is shown
// as a space and a byte of 128 or more as '?'.
ZEBMEDIATYPES_API std::string PixelFormatFourCCText(PixelFormatName name);

}  // namespace zebmediatypes::scripting
