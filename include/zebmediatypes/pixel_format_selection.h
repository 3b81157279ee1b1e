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

#include <array>
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

// PixelFormatPlane
//
// One plane of a frame in its buffer: the byte offset of its first row, its
// row stride in bytes (which holds every sample of the row; the rest is
// padding) and its number of rows.
struct PixelFormatPlane {
  std::uint64_t offset = 0;
  std::uint64_t rowBytes = 0;
  std::uint64_t rows = 0;
};

// The planes of a frame in buffer order: planes[0] to planes[count - 1] are
// used, the others stay zero. count is 0 where the frame has no whole planes.
struct PixelFormatPlaneLayout {
  int count = 0;
  std::array<PixelFormatPlane, 4> planes{};
};

// GetPixelFormatPlaneLayout()
//
// Where each plane of a `width` x `height` frame lies in a buffer of
// PixelFormatSize(pf, width, height) bytes. The first plane starts at offset 0;
// each later one starts at or after the end of the one before (offset +
// rowBytes * rows), and the last ends within the buffer. By family:
//   - one-plane formats (packed 4:4:4, packed 4:2:2, V210, Y210, 10-bit RGB):
//     `height` rows of UncompressedPixelFormatRowBytes(pf, width) bytes;
//   - planar 4:4:4 (ARGB and RGB 32f planar): one such plane per component,
//     back to back, in the order of the name (A, R, G, B or R, G, B);
//   - 4:2:2 biplanar (P210: 16-bit samples): a luma plane of `height` rows,
//     then a plane of `height` rows of Cb Cr pairs, both with a stride of
//     UncompressedPixelFormatRowBytes(pf, width) bytes;
//   - 4:2:0 biplanar (NV12, and the YVU rows, whose pairs hold Cr first): a
//     luma plane of `height` rows, then directly after it a plane of
//     (height + 1) / 2 rows of chroma pairs, both with a stride of `width`
//     rounded up to 128 bytes (P010: 16-bit samples, so twice `width` rounded
//     up to even, then rounded up to 128 bytes); the buffer holds one spare
//     row of that stride after the chroma plane;
//   - 4:2:0 planar (the YV12 family): Y, then V (Cr), then U (Cb). The luma
//     stride is `width` rounded up to 128 bytes, the chroma stride
//     (width + 1) / 2 rounded up to 128. The buffer reserves H rows of luma
//     and H / 2 rows of each chroma plane, H being `height` rounded up to 32,
//     so V starts at H * luma stride and U H / 2 chroma rows after V; the
//     planes themselves have `height` and (height + 1) / 2 rows. One spare
//     chroma row follows the reserved U rows.
// Field- and frame-picture 4:2:0 formats share their layout. count is 0 for DV
// and other compressed packings, for words that are not specific
// (kPixelFormat_Any, kPixelFormat_Invalid), for a width or height of 0 or
// less, wherever PixelFormatSize() is 0 (the size does not fit 64 bits, or the
// format has no known layout), and for custom 4:2:0 or biplanar words of a
// depth these layouts do not provide for.
//
//   const PixelFormat nv12 = kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709;
//   GetPixelFormatPlaneLayout(nv12, 1920, 1080);  // {0, 1920, 1080}, {2073600, 1920, 540}
ZEBMEDIATYPES_API PixelFormatPlaneLayout GetPixelFormatPlaneLayout(PixelFormat pf, int width,
                                                                   int height) noexcept;

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
