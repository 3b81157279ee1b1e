#include <zebmediatypes/pixel_format_selection.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <iterator>

namespace zebmediatypes {
namespace {

// The fixed geometry of a DV packing and the format it decompresses to.
struct DVGeometry {
  PixelFormatPacking packing;
  int width;
  int height;
  std::uint64_t bytesPerFrame;
  PixelAspectRatio permitted[2];
  int permittedCount;
  PixelFormat decompressed;
};

constexpr DVGeometry kDVGeometry[] = {
    {kPixelFormatPacking_NTSCDV25,
     720,
     480,
     120000,
     {kPixelAspectRatio_DVNTSC, kPixelAspectRatio_DVNTSCWide},
     2,
     kPixelFormat_UYVY_422_8u},
    {kPixelFormatPacking_PALDV25,
     720,
     576,
     144000,
     {kPixelAspectRatio_DVPAL, kPixelAspectRatio_DVPALWide},
     2,
     kPixelFormat_UYVY_422_8u},
    {kPixelFormatPacking_NTSCDV100_720p,
     960,
     720,
     240000,
     {kPixelAspectRatio_Square, kPixelAspectRatio_Square},
     1,
     kPixelFormat_YUYV_422_8u_709},
    {kPixelFormatPacking_PALDV100_720p,
     960,
     720,
     288000,
     {kPixelAspectRatio_Square, kPixelAspectRatio_Square},
     1,
     kPixelFormat_YUYV_422_8u_709},
    {kPixelFormatPacking_NTSCDV100_1080i,
     1280,
     1080,
     480000,
     {kPixelAspectRatio_DVCProHD, kPixelAspectRatio_DVCProHD},
     1,
     kPixelFormat_YUYV_422_8u_709},
    {kPixelFormatPacking_PALDV100_1080i,
     1440,
     1080,
     576000,
     {kPixelAspectRatio_HDAnamorphic1080, kPixelAspectRatio_HDAnamorphic1080},
     1,
     kPixelFormat_YUYV_422_8u_709},
    {kPixelFormatPacking_NTSCDV50,
     720,
     480,
     240000,
     {kPixelAspectRatio_DVNTSC, kPixelAspectRatio_DVNTSCWide},
     2,
     kPixelFormat_YUYV_422_8u},
    {kPixelFormatPacking_PALDV50,
     720,
     576,
     288000,
     {kPixelAspectRatio_DVPAL, kPixelAspectRatio_DVPALWide},
     2,
     kPixelFormat_YUYV_422_8u},
};
static_assert(std::size(kDVGeometry) == 8);

constexpr bool DVGeometryIsIndexedByPacking() {
  for (std::size_t i = 0; i < std::size(kDVGeometry); ++i) {
    if (kDVGeometry[i].packing != i + 1) return false;
  }
  return true;
}
static_assert(DVGeometryIsIndexedByPacking());

// The geometry of a DV word, or null.
const DVGeometry* FindDVGeometry(PixelFormatProperties p) noexcept {
  return p.IsDV() ? &kDVGeometry[p.packing() - 1] : nullptr;
}

constexpr bool IsHighQuality(RenderQuality quality) noexcept {
  return quality >= kRenderQuality_Medium;
}

constexpr bool HasRealAlpha(PixelFormatAlpha a) noexcept {
  return a == kPixelFormatAlpha_Straight || a == kPixelFormatAlpha_Premultiplied;
}

constexpr bool Is4444(PixelFormatProperties p) noexcept {
  return p.IsSpecific() && p.subsampling() == kPixelFormatSubsampling_444 &&
         p.alpha() != kPixelFormatAlpha_None;
}

constexpr bool IsCustomOrSpecific(const PixelFormat& pf) noexcept {
  return IsCustomPixelFormatName(pf.fourCC) || pf.properties.IsSpecific();
}

constexpr bool IsSpecificNonCustom(const PixelFormat& pf) noexcept {
  return !IsCustomPixelFormatName(pf.fourCC) && pf.properties.IsSpecific();
}

bool Contains(const PixelFormatVector& list, const PixelFormat& pf) noexcept {
  return std::find(list.begin(), list.end(), pf) != list.end();
}

// The first 4444 element of `list`, else its first specific non-custom
// element, else kPixelFormat_Invalid.
PixelFormat FirstFallback(const PixelFormatVector& list) noexcept {
  for (const PixelFormat& pf : list) {
    if (Is4444(pf.properties)) return pf;
  }
  for (const PixelFormat& pf : list) {
    if (IsSpecificNonCustom(pf)) return pf;
  }
  return kPixelFormat_Invalid;
}

// A catalogue format from a properties word, or kPixelFormat_Invalid.
PixelFormat CatalogueFormatFor(PixelFormatProperties p) noexcept {
  const PixelFormat pf(p);
  if (pf.fourCC == kPixelFormatFourCC_Invalid ||
      pf.properties.validity() == kPixelFormatValidity_Invalid) {
    return kPixelFormat_Invalid;
  }
  return pf;
}

constexpr std::uint64_t RoundUp(std::uint64_t value, std::uint64_t multiple) noexcept {
  return (value + multiple - 1) / multiple * multiple;
}

// a * b * c, or 0 when the product does not fit 64 bits.
std::uint64_t ProductOrZero(std::uint64_t a, std::uint64_t b, std::uint64_t c = 1) noexcept {
  std::uint64_t ab = 0;
  std::uint64_t abc = 0;
  if (__builtin_mul_overflow(a, b, &ab) || __builtin_mul_overflow(ab, c, &abc)) return 0;
  return abc;
}

constexpr bool IsV210Layout(PixelFormatProperties p) noexcept {
  return p.packing() == kPixelFormatPacking_Uncompressed && p.isYUV() &&
         p.depth() == kPixelFormatDepth_10 && !p.isFloat() &&
         p.subsampling() == kPixelFormatSubsampling_422 && p.interleaving() == kInterleaved &&
         p.alpha() == kPixelFormatAlpha_None;
}

constexpr bool IsBiPlanar420Packing(PixelFormatPacking packing) noexcept {
  return packing == kPixelFormatPacking_MPEG4BiPlanarField ||
         packing == kPixelFormatPacking_MPEG4BiPlanarFrame;
}

constexpr bool IsPlanar420Packing(PixelFormatPacking packing) noexcept {
  return packing >= kPixelFormatPacking_MPEG2PlanarField &&
         packing <= kPixelFormatPacking_MPEG4PlanarFrame;
}

// Row bytes for a positive width.
std::uint64_t RowBytes(PixelFormat pf, std::uint64_t width) noexcept {
  const PixelFormatProperties p = pf.properties;
  if (!p.IsSpecific()) return 0;
  if (IsV210Layout(p)) return RoundUp((width + 5) / 6 * 16, 128);
  const auto bytesPerPixel = static_cast<std::uint64_t>(GetBytesPerPixel(pf));
  if (p.subsampling() == kPixelFormatSubsampling_422) {
    // A chroma pair covers two pixels: an odd last pixel needs a whole pair.
    return RoundUp(bytesPerPixel * RoundUp(width, 2), 16);
  }
  if (p.packing() == kPixelFormatPacking_Uncompressed) return RoundUp(bytesPerPixel * width, 64);
  return 0;
}

// Where LayOutFrame puts the planes: PixelFormatSize wants none of them (and
// is as fast as if they were never worked out), GetPixelFormatPlaneLayout all.
struct NoPlanes {
  void Add(std::uint64_t, std::uint64_t, std::uint64_t) noexcept {}
};
struct Planes {
  void Add(std::uint64_t offset, std::uint64_t rowBytes, std::uint64_t rows) noexcept {
    layout.planes[static_cast<std::size_t>(layout.count++)] = {offset, rowBytes, rows};
  }
  PixelFormatPlaneLayout layout;
};

// The bytes of a frame, and its planes added to `planes`.
// The size is 0 for a width or height of 0 or less, when it does not fit 64
// bits, and for formats with no known layout; the planes are then meaningless.
// DV frames have their fixed size and no planes; so do 4:2:0 and 4:2:2
// biplanar words of depths their size rule does not provide for (no catalogue
// row has one).
template <typename Sink>
std::uint64_t LayOutFrame(PixelFormat pf, int width, int height, Sink& planes) noexcept {
  if (width <= 0 || height <= 0) return 0;
  const PixelFormatProperties p = pf.properties;
  const auto w = static_cast<std::uint64_t>(width);
  const auto h = static_cast<std::uint64_t>(height);

  if (const DVGeometry* dv = FindDVGeometry(p)) return dv->bytesPerFrame;

  if (p.isYUV()) {
    // Luma rows, then half as many chroma rows (rounded up), plus one spare row.
    const std::uint64_t chromaRows = (h + 1) / 2;
    const std::uint64_t rows420 = h + chromaRows + 1;
    if (IsBiPlanar420Packing(p.packing()) && p.subsampling() == kPixelFormatSubsampling_420) {
      // 10-bit words hold 16-bit samples; the chroma row of an odd width holds a whole pair.
      const bool wide = p.depth() == kPixelFormatDepth_10;
      const std::uint64_t stride = wide ? RoundUp(2 * RoundUp(w, 2), 128) : RoundUp(w, 128);
      if (wide || p.depth() == kPixelFormatDepth_8) {
        planes.Add(0, stride, h);
        planes.Add(stride * h, stride, chromaRows);
      }
      return ProductOrZero(rows420, stride);
    }
    if (p.subsampling() == kPixelFormatSubsampling_422 && p.interleaving() == kInterleavedChroma) {
      // A luma plane and a plane of chroma pairs, each row as wide as the
      // format's row bytes, which hold samples of up to 16 bits.
      const std::uint64_t row = RowBytes(pf, w);
      const auto count = static_cast<std::uint64_t>(GetNumberOfPlanes(pf));
      for (std::uint64_t i = 0; i < count && p.depth() <= kPixelFormatDepth_16; ++i) {
        planes.Add(i * row * h, row, h);
      }
      return ProductOrZero(count, row, h);
    }
    if (IsPlanar420Packing(p.packing()) && p.subsampling() == kPixelFormatSubsampling_420) {
      // Y, then the V and U planes of half width (rounded up), each given half
      // the padded height's rows, then one spare chroma row.
      const std::uint64_t stride = RoundUp(w, 128);
      const std::uint64_t chromaStride = RoundUp((w + 1) / 2, 128);
      const std::uint64_t paddedHeight = RoundUp(h, 32);
      if (p.depth() == kPixelFormatDepth_8) {
        const std::uint64_t v = paddedHeight * stride;
        planes.Add(0, stride, h);
        planes.Add(v, chromaStride, chromaRows);
        planes.Add(v + paddedHeight / 2 * chromaStride, chromaStride, chromaRows);
      }
      const std::uint64_t size = ProductOrZero(paddedHeight, stride + chromaStride);
      return size == 0 ? 0 : size + chromaStride;
    }
  }
  if (!p.IsSpecific() || p.packing() != kPixelFormatPacking_Uncompressed) return 0;
  const std::uint64_t row = RowBytes(pf, w);
  const auto count =
      p.interleaving() == kPlanar ? static_cast<std::uint64_t>(GetNumberOfPlanes(pf)) : 1;
  for (std::uint64_t i = 0; i < count; ++i) planes.Add(i * row * h, row, h);
  return ProductOrZero(row, count, h);
}

}  // namespace

int PixelConversionCost(const PixelFormatProperties& from, const PixelFormatProperties& to,
                        RenderQuality quality) noexcept {
  const PixelFormatProperties f = from;
  const PixelFormatProperties t = to;
  if (!f.IsSpecific() || !t.IsSpecific() || f.packing() == kPixelFormatPacking_None ||
      t.packing() == kPixelFormatPacking_None) {
    return kPixelConversionCost_Impossible;
  }
  if (f == t) return 0;
  const bool hq = IsHighQuality(quality);
  const int fromDepth = static_cast<int>(f.depth());
  const int toDepth = static_cast<int>(t.depth());

  int c = 1;
  if (f.packing() != kPixelFormatPacking_Uncompressed) c += 1;
  // A compressed destination is chosen only when nothing else is possible.
  if (t.packing() != kPixelFormatPacking_Uncompressed) c += kPixelConversionCost_Impossible;

  if (f.isYUV() != t.isYUV()) {
    if (t.depth() == kPixelFormatDepth_32) {
      c += 1;
    } else if (hq) {
      c += (!f.isYUV() && toDepth >= fromDepth) ? 2 : 100;
    } else {
      c += 2;
    }
  }
  if (f.isYUV() && t.isYUV() && f.primaries() != t.primaries()) {
    c += (hq && t.depth() != kPixelFormatDepth_32) ? 10 : 1;
  }
  if (f.videoRange() != t.videoRange()) c += 100;
  if (fromDepth > toDepth) {
    c += (fromDepth - toDepth) * (hq ? 10 : 1);
  } else if (fromDepth < toDepth) {
    c += toDepth - fromDepth;
  }
  if (f.alpha() != t.alpha()) {
    if (HasRealAlpha(f.alpha())) {
      c += HasRealAlpha(t.alpha()) ? 1 : 25;
    } else {
      c += HasRealAlpha(t.alpha()) ? 5 : 1;
    }
  }
  if (f.swapped() != t.swapped()) c += 1;
  if (f.linear() != t.linear()) c += 1;
  if (f.isFloat() != t.isFloat()) c += 1;

  if (f.subsampling() != t.subsampling()) {
    const DVGeometry* dv = FindDVGeometry(f);
    if (dv == nullptr) {
      if (t.subsampling() != kPixelFormatSubsampling_444) c += 50;
    } else if (t != dv->decompressed.properties) {
      c += t.subsampling() != kPixelFormatSubsampling_444 ? 50 : 5;
    }
  }
  return std::min(c, kPixelConversionCost_Impossible);
}

PixelFormat Select4444PixelFormat(PixelFormat pf, RenderQuality quality) noexcept {
  PixelFormatProperties p = pf.properties;
  if (Is4444(p)) return pf.fourCC == kPixelFormatFourCC_Invalid ? kPixelFormat_Invalid : pf;

  p.SetSubsampling(kPixelFormatSubsampling_444).SetPacking(kPixelFormatPacking_Uncompressed);
  if (p.alpha() == kPixelFormatAlpha_None) p.SetAlpha(kPixelFormatAlpha_Ignored);
  if (p.depth() != kPixelFormatDepth_8 || p.isFloat()) {
    if (IsHighQuality(quality)) {
      p.SetDepth(kPixelFormatDepth_32).SetIsFloat(true);
    } else {
      p.SetDepth(kPixelFormatDepth_8).SetIsFloat(false);
    }
  }
  // Full-range YUV is processed as RGB.
  if (!p.videoRange()) p.SetIsYUV(false);
  if (p.primaries() == kPixelFormatPrimaries_2020 ||
      p.primaries() == kPixelFormatPrimaries_2020HDR) {
    // Wide-gamut input is processed as full-range Rec. 709 RGB.
    p.SetIsYUV(false).SetVideoRange(false).SetPrimaries(kPixelFormatPrimaries_709);
  } else if (p.isYUV()) {
    p.SetSwapped(false);
  } else {
    p.SetPrimaries(kPixelFormatPrimaries_709);
  }
  return CatalogueFormatFor(p);
}

PixelFormat SelectDVDecompressionFormat(PixelFormat pf) noexcept {
  const DVGeometry* dv = FindDVGeometry(pf.properties);
  return dv != nullptr ? dv->decompressed : pf;
}

PixelFormat SelectSameBitDepthRGBPixelFormat(PixelFormat pf) noexcept {
  PixelFormatProperties p = pf.properties;
  p.SetIsYUV(false)
      .SetVideoRange(false)
      .SetSubsampling(kPixelFormatSubsampling_444)
      .SetPacking(kPixelFormatPacking_Uncompressed)
      .SetPrimaries(kPixelFormatPrimaries_709);
  return CatalogueFormatFor(p);
}

PixelFormat SelectNearestPixelFormat(const PixelFormatVector& available, PixelFormat preferred,
                                     const PixelFormatVector& accepted, RenderQuality quality,
                                     bool acceptPreferred) noexcept {
  const bool acceptsAny = Contains(accepted, kPixelFormat_Any);
  if (acceptPreferred) {
    if (Contains(accepted, preferred)) return preferred;
    if (acceptsAny && preferred != kPixelFormat_Invalid) return preferred;
  }
  for (const PixelFormat& b : accepted) {
    if (IsCustomOrSpecific(b) && Contains(available, b)) return b;
  }

  PixelFormat result = kPixelFormat_Invalid;
  int best = kPixelConversionCost_Impossible;
  int second = kPixelConversionCost_Impossible;
  for (const PixelFormat& a : available) {
    for (const PixelFormat& b : accepted) {
      const int c = PixelConversionCost(a.properties, b.properties, quality);
      // With a wildcard in `accepted` the candidates are the available formats
      // themselves; otherwise the accepted ones.
      const PixelFormat& candidate = acceptsAny ? a : b;
      if (c < best) {
        result = candidate;
        best = c;
        second = PixelConversionCost(preferred.properties, candidate.properties, quality);
      } else if (c == best && c < kPixelConversionCost_Impossible) {
        const int s = PixelConversionCost(preferred.properties, candidate.properties, quality);
        if (s < second) {
          result = candidate;
          second = s;
        }
      }
    }
  }

  if (accepted.empty() || (result == kPixelFormat_Invalid && acceptsAny)) {
    const PixelFormat fallback = FirstFallback(available);
    if (fallback != kPixelFormat_Invalid) return fallback;
  }
  if (result == kPixelFormat_Invalid) result = FirstFallback(accepted);
  return result;
}

PixelFormat SelectNearestSourcePixelFormat(const PixelFormatVector& available,
                                           PixelFormatProperties wanted,
                                           RenderQuality quality) noexcept {
  if (wanted.validity() == kPixelFormatValidity_Invalid) return kPixelFormat_Invalid;
  if (wanted.validity() == kPixelFormatValidity_Any) {
    for (const PixelFormat& a : available) {
      if (IsSpecificNonCustom(a)) return a;
    }
    return kPixelFormat_Invalid;
  }
  PixelFormat best = kPixelFormat_Invalid;
  int bestCost = kPixelConversionCost_Impossible;
  for (const PixelFormat& a : available) {
    const int c = PixelConversionCost(a.properties, wanted, quality);
    if (c < bestCost || (c == bestCost && c < kPixelConversionCost_Impossible &&
                         a.properties.depth() < best.properties.depth())) {
      best = a;
      bestCost = c;
    }
  }
  return best;
}

std::uint64_t UncompressedPixelFormatRowBytes(PixelFormat pf, int width) noexcept {
  if (width <= 0) return 0;
  return RowBytes(pf, static_cast<std::uint64_t>(width));
}

std::uint64_t PixelFormatSize(PixelFormat pf, int width, int height) noexcept {
  NoPlanes none;
  return LayOutFrame(pf, width, height, none);
}

PixelFormatPlaneLayout GetPixelFormatPlaneLayout(PixelFormat pf, int width, int height) noexcept {
  Planes planes;
  if (!pf.properties.IsSpecific() || LayOutFrame(pf, width, height, planes) == 0) return {};
  return planes.layout;
}

void FixedSizedFormatDimensions(PixelFormat pf, int& width, int& height) noexcept {
  if (const DVGeometry* dv = FindDVGeometry(pf.properties)) {
    width = dv->width;
    height = dv->height;
  }
}

bool IsRectValidForFormat(PixelFormat pf, int width, int height, PixelAspectRatio par) noexcept {
  const DVGeometry* dv = FindDVGeometry(pf.properties);
  if (dv == nullptr) return true;
  if (width != dv->width || height != dv->height) return false;
  for (int i = 0; i < dv->permittedCount; ++i) {
    if (par == dv->permitted[i]) return true;
  }
  return false;
}

}  // namespace zebmediatypes
