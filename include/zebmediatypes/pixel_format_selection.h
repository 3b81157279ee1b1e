// Pixel format selection and buffer sizing.
//
// Which format a producer and a consumer should meet on (a cost metric and the
// selections built on it), how many bytes a row and a frame of a format take,
// and the fixed geometry of the DV formats. Pure functions; no state.
//
//   PixelFormatSize(kPixelFormat_UYVY_422_8u, 1920, 1080);   // 4147200
#pragma once

#include <zebcore/allocator.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/pixel_aspect_ratio.h>
#include <zebmediatypes/pixel_format.h>
#include <zebmediatypes/render_quality.h>

#include <cstdint>
#include <vector>

namespace zebmediatypes {

using PixelFormatVector = std::vector<PixelFormat, zebcore::allocator::STLAllocator<PixelFormat>>;

// The cost of every conversion that cannot be made, and the cap of every cost.
inline constexpr int kPixelConversionCost_Impossible = 10000;

// PixelConversionCost()
//
// How lossy and how expensive it is to turn `from` into `to` at `quality`: 0
// for identical words, 10000 when either word is not specific or has packing
// 15, otherwise a positive penalty capped at 10000. Converting to a DV or 4:2:0
// word always costs 10000. Losing precision, alpha, range or chroma costs more
// at Medium quality and above.
ZEBMEDIATYPES_API int PixelConversionCost(const PixelFormatProperties& from,
                                          const PixelFormatProperties& to,
                                          RenderQuality quality) noexcept;

// The catalogue's 4:4:4 format with an alpha slot in which to process `pf`:
// `pf` itself when it already is one; deeper formats go to 32-bit float from
// Medium up and to 8-bit below; full-range and Rec. 2020 YUV are processed as
// Rec. 709 RGB. kPixelFormat_Invalid when no catalogue row fits (for example
// planar RGB without alpha); kPixelFormat_Any maps to itself.
ZEBMEDIATYPES_API PixelFormat Select4444PixelFormat(PixelFormat pf, RenderQuality quality) noexcept;

// The packed 4:2:2 format a DV format decompresses to (UYVY 8u for DV25, YUYV
// 8u for DV50, YUYV 8u 709 for DV100); any other format is returned unchanged.
ZEBMEDIATYPES_API PixelFormat SelectDVDecompressionFormat(PixelFormat pf) noexcept;

// The full-range Rec. 709 RGB catalogue format of the same depth, alpha and
// interleaving, or kPixelFormat_Invalid.
ZEBMEDIATYPES_API PixelFormat SelectSameBitDepthRGBPixelFormat(PixelFormat pf) noexcept;

// SelectNearestPixelFormat()
//
// The format of `accepted` (or, when `accepted` holds kPixelFormat_Any, of
// `available`) that `available` converts to most cheaply; ties go to the
// candidate `preferred` converts to most cheaply, then to the earlier one.
// With `acceptPreferred`, `preferred` wins outright when it is accepted. When
// nothing can be costed the first 4:4:4 format with alpha, else the first
// specific non-custom format, of `available` (for an empty or wildcard
// `accepted`) or of `accepted` is taken; kPixelFormat_Invalid when none.
ZEBMEDIATYPES_API PixelFormat SelectNearestPixelFormat(const PixelFormatVector& available,
                                                       PixelFormat preferred,
                                                       const PixelFormatVector& accepted,
                                                       RenderQuality quality,
                                                       bool acceptPreferred) noexcept;

// The element of `available` that converts most cheaply to `wanted` (on equal
// cost the one of lower depth, then the earlier one). For an any-word the
// first specific non-custom element; kPixelFormat_Invalid for an invalid word
// or when nothing can be converted.
ZEBMEDIATYPES_API PixelFormat SelectNearestSourcePixelFormat(const PixelFormatVector& available,
                                                             PixelFormatProperties wanted,
                                                             RenderQuality quality) noexcept;

// UncompressedPixelFormatRowBytes()
//
// Bytes of one row of the first plane `width` pixels wide: V210-style packed
// 10-bit 4:2:2 in groups of six pixels (16 bytes) padded to 128 bytes; other
// 4:2:2 formats padded to 16 bytes with room for an odd last pixel; other
// uncompressed formats padded to 64 bytes. 0 for a width of 0 or less, for
// words that are not specific and for 4:2:0 and DV formats.
ZEBMEDIATYPES_API std::uint64_t UncompressedPixelFormatRowBytes(PixelFormat pf, int width) noexcept;

// PixelFormatSize()
//
// Bytes of a whole frame: every plane's rows, chroma planes of odd sizes
// rounded up, so that a buffer of this size holds the frame. DV formats have
// their fixed frame size. 0 when the width or height is 0 or less, when the
// size does not fit 64 bits, for words that are not specific and for formats
// with no known layout.
ZEBMEDIATYPES_API std::uint64_t PixelFormatSize(PixelFormat pf, int width, int height) noexcept;

// For a DV format, sets `width` and `height` to its fixed frame size (720x480,
// 720x576, 960x720, 1280x1080 or 1440x1080); otherwise leaves both unchanged.
ZEBMEDIATYPES_API void FixedSizedFormatDimensions(PixelFormat pf, int& width, int& height) noexcept;

// True for every format that is not DV; for a DV format, true exactly when the
// size is its fixed size and `par` equals (tolerantly) a ratio it permits.
ZEBMEDIATYPES_API bool IsRectValidForFormat(PixelFormat pf, int width, int height,
                                            PixelAspectRatio par) noexcept;

// Bytes reserved in front of a video frame for its header: always 128.
constexpr unsigned int GetVideoFrameHeaderPaddedSize() noexcept { return 128; }

}  // namespace zebmediatypes
