// The pixel-format constants of "PixelFormat".
#include <zebmediatypes/scripting/pixel_format_constants.h>

namespace zebmediatypes::scripting {
namespace {

constexpr std::array<PixelFormatConstant, kPixelFormatConstantCount> kConstants{{
    {"PIXELFORMAT_VUYA_4444_8U", kPixelFormat_VUYA_4444_8u, "VUYA_4444_8u - Alpha, 601 Primaries"},
    {"PIXELFORMAT_VUYP_4444_8U", kPixelFormat_VUYP_4444_8u,
     "VUYP_4444_8u - Premultiplied Alpha, 601 Primaries"},
    {"PIXELFORMAT_VUYX_4444_8U", kPixelFormat_VUYX_4444_8u,
     "VUYX_4444_8u - Alpha ignored/opaque, 601 Primaries"},
    {"PIXELFORMAT_VUYA_4444_8U_709", kPixelFormat_VUYA_4444_8u_709,
     "VUYA_4444_8u_709 - Alpha, 709 Primaries"},
    {"PIXELFORMAT_VUYP_4444_8U_709", kPixelFormat_VUYP_4444_8u_709,
     "VUYP_4444_8u_709 - Premultiplied Alpha, 709 Primaries"},
    {"PIXELFORMAT_VUYX_4444_8U_709", kPixelFormat_VUYX_4444_8u_709,
     "VUYX_4444_8u_709 - Alpha ignored/opaque, 709 Primaries"},
    {"PIXELFORMAT_VUYA_4444_15U", kPixelFormat_VUYA_4444_15u, "VUYA_4444_15u - Alpha"},
    {"PIXELFORMAT_VUYP_4444_15U", kPixelFormat_VUYP_4444_15u,
     "VUYA_4444_15u - Premultiplied Alpha"},
    {"PIXELFORMAT_VUYX_4444_15U", kPixelFormat_VUYX_4444_15u,
     "VUYX_4444_15u - Alpha ignored/opaque"},
    {"PIXELFORMAT_VUYA_4444_32F", kPixelFormat_VUYA_4444_32f,
     "VUYA_4444_32f - Alpha, 601 Primaries"},
    {"PIXELFORMAT_VUYP_4444_32F", kPixelFormat_VUYP_4444_32f,
     "VUYA_4444_32f - Premultiplied Alpha, 601 Primaries"},
    {"PIXELFORMAT_VUYX_4444_32F", kPixelFormat_VUYX_4444_32f,
     "VUYX_4444_32f - Alpha ignored/opaque, 601 Primaries"},
    {"PIXELFORMAT_VUYA_4444_32F_709", kPixelFormat_VUYA_4444_32f_709,
     "VUYA_4444_32f_709 - Alpha, 709 Primaries"},
    {"PIXELFORMAT_VUYP_4444_32F_709", kPixelFormat_VUYP_4444_32f_709,
     "VUYA_4444_32f_709 - Premultiplied Alpha, 709 Primaries"},
    {"PIXELFORMAT_VUYX_4444_32F_709", kPixelFormat_VUYX_4444_32f_709,
     "VUYX_4444_32f_709 - Alpha ignored/opaque, 709 Primaries"},
    {"PIXELFORMAT_BGRA_4444_8U", kPixelFormat_BGRA_4444_8u, "BGRA_4444_8u - Alpha"},
    {"PIXELFORMAT_BGRP_4444_8U", kPixelFormat_BGRP_4444_8u, "BGRP_4444_8u - Premultiplied Alpha"},
    {"PIXELFORMAT_BGRX_4444_8U", kPixelFormat_BGRX_4444_8u, "BGRX_4444_8u - Alpha ignored/opaque"},
    {"PIXELFORMAT_BGRA_4444_15U", kPixelFormat_BGRA_4444_15u, "BGRA_4444_15u - Alpha"},
    {"PIXELFORMAT_BGRP_4444_15U", kPixelFormat_BGRP_4444_15u,
     "BGRP_4444_15u -\tPremultiplied Alpha"},
    {"PIXELFORMAT_BGRX_4444_15U", kPixelFormat_BGRX_4444_15u,
     "BGRX_4444_15u -\tAlpha ignored/opaque"},
    {"PIXELFORMAT_BGRA_4444_32F", kPixelFormat_BGRA_4444_32f, "BGRA_4444_32f - Alpha"},
    {"PIXELFORMAT_BGRP_4444_32F", kPixelFormat_BGRP_4444_32f,
     "BGRP_4444_32f - Premultiplied Alpha"},
    {"PIXELFORMAT_BGRX_4444_32F", kPixelFormat_BGRX_4444_32f,
     "BGRX_4444_32f - Alpha ignored/opaque"},
    {"PIXELFORMAT_BGRA_4444_32F_LINEAR", kPixelFormat_BGRA_4444_32f_Linear,
     "BGRA_4444_32f_Linear - Alpha"},
    {"PIXELFORMAT_BGRP_4444_32F_LINEAR", kPixelFormat_BGRP_4444_32f_Linear,
     "BGRP_4444_32f_Linear - Premultiplied Alpha"},
    {"PIXELFORMAT_BGRX_4444_32F_LINEAR", kPixelFormat_BGRX_4444_32f_Linear,
     "BGRX_4444_32f_Linear - Alpha ignored/opaque"},
    {"PIXELFORMAT_UYVY_422_8U", kPixelFormat_UYVY_422_8u, "UYVY_422_8u - 601 Primaries"},
    {"PIXELFORMAT_UYVY_422_8U_709", kPixelFormat_UYVY_422_8u_709,
     "UYVY_422_8u_709 - 709 Primaries"},
    {"PIXELFORMAT_YUYV_422_8U", kPixelFormat_YUYV_422_8u, "YUYV_422_8u - 601 Primaries"},
    {"PIXELFORMAT_YUYV_422_8U_709", kPixelFormat_YUYV_422_8u_709,
     "YUYV_422_8u_709 - 709 Primaries"},
    {"PIXELFORMAT_UYVY_422_32F", kPixelFormat_UYVY_422_32f, "UYVY_422_32f - 601 Primaries"},
    {"PIXELFORMAT_UYVY_422_32F_709", kPixelFormat_UYVY_422_32f_709,
     "UYVY_422_32f_709 - 709 Primaries"},
    {"PIXELFORMAT_YUYV_422_32F", kPixelFormat_YUYV_422_32f, "YUYV_422_32f - 601 Primaries"},
    {"PIXELFORMAT_YUYV_422_32F_709", kPixelFormat_YUYV_422_32f_709,
     "YUYV_422_32f_709 - 709 Primaries"},
    {"PIXELFORMAT_V210_422_10U", kPixelFormat_V210_422_10u, "V210_422_10u - 601 Primaries"},
    {"PIXELFORMAT_V210_422_10U_709", kPixelFormat_V210_422_10u_709,
     "V210_422_10u_709 - 709 Primaries"},
}};

}  // namespace

const std::array<PixelFormatConstant, kPixelFormatConstantCount>&
GetPixelFormatConstants() noexcept {
  return kConstants;
}

std::string PixelFormatFourCCText(PixelFormatName name) {
  std::string text(4, ' ');
  for (unsigned int i = 0; i < 4; ++i) {
    const auto byte =
        static_cast<unsigned char>((static_cast<std::uint32_t>(name) >> (8 * i)) & 0xFFu);
    if (byte >= 128) {
      text[i] = '?';
    } else if (byte >= 32) {
      text[i] = static_cast<char>(byte);
    }
  }
  return text;
}

}  // namespace zebmediatypes::scripting
