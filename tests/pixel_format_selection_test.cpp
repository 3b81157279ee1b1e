#include <gtest/gtest.h>
#include <zebmediatypes/pixel_format_selection.h>

#include <array>
#include <climits>
#include <cstddef>
#include <cstdint>
#include <sstream>
#include <string>
#include <utility>

extern "C" {
#include <libavutil/imgutils.h>
}

namespace zebmediatypes {
namespace {

using u128 = unsigned __int128;

constexpr RenderQuality kQualities[] = {kRenderQuality_Draft, kRenderQuality_Low,
                                        kRenderQuality_Medium, kRenderQuality_High,
                                        kRenderQuality_Max};
constexpr PixelFormat kUYVY = kPixelFormat_UYVY_422_8u;
constexpr PixelFormat kYUYV = kPixelFormat_YUYV_422_8u;
constexpr PixelFormat kYUYV709 = kPixelFormat_YUYV_422_8u_709;
constexpr PixelFormat kBGRA = kPixelFormat_BGRA_4444_8u;
constexpr PixelFormat kVUYA = kPixelFormat_VUYA_4444_8u;
constexpr PixelFormat kVUYP = kPixelFormat_VUYP_4444_8u;
constexpr PixelFormat kAny = kPixelFormat_Any;
constexpr PixelFormat kInvalid = kPixelFormat_Invalid;
constexpr PixelFormat kYV12 = kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;
constexpr PixelFormat kNV12 = kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709;
constexpr PixelFormat kP010 = kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709;
constexpr PixelFormat kP210 = kPixelFormat_YUV_422_BiPlanar_10u_as16u;

u128 Half(u128 v) { return (v + 1) / 2; }

// The planes of a frame from the layout alone (no padding), in buffer order:
// the bytes of the samples of one row, and the rows. None for DV.
struct NeededPlanes {
  std::size_t count = 0;
  // Each plane's row bytes and rows.
  std::array<std::pair<u128, u128>, 4> planes{};
  void Add(u128 rowBytes, u128 rows) { planes[count++] = {rowBytes, rows}; }
};

NeededPlanes NeededPlanesOf(PixelFormat pf, int width, int height) {
  const PixelFormatProperties p = pf.properties;
  const u128 w = static_cast<u128>(width), h = static_cast<u128>(height);
  // The bytes of one sample, by depth.
  const u128 bytes = std::array<unsigned, 8>{1, 2, 2, 2, 3, 4, 0, 0}[p.depth()];
  NeededPlanes needed;
  if (p.IsDV()) return needed;
  if (p.subsampling() == kPixelFormatSubsampling_420) {
    needed.Add(w * bytes, h);
    if (p.packing() >= kPixelFormatPacking_MPEG4BiPlanarField) {
      // chroma pairs
      needed.Add(2 * Half(w) * bytes, Half(h));
    } else {
      // V
      needed.Add(Half(w) * bytes, Half(h));
      // U
      needed.Add(Half(w) * bytes, Half(h));
    }
  } else if (p.subsampling() == kPixelFormatSubsampling_422) {
    if (p.interleaving() == kInterleavedChroma) {
      needed.Add(w * bytes, h);
      needed.Add(2 * Half(w) * bytes, h);
    } else if (GetBytesPerPixel(pf) == 0) {
      // v210: 6 pixels in 16 bytes
      needed.Add((w + 5) / 6 * 16, h);
    } else {
      // two luma and two chroma samples a pair
      needed.Add(4 * bytes * Half(w), h);
    }
  } else if (pf == kPixelFormat_RGB_444_10u) {
    // 10:10:10:2
    needed.Add(4 * w, h);
  } else if (p.interleaving() == kPlanar) {
    for (int i = 0; i < GetNumberOfPlanes(pf); ++i) needed.Add(w * bytes, h);
  } else {
    needed.Add((p.alpha() != kPixelFormatAlpha_None ? 4u : 3u) * bytes * w, h);
  }
  return needed;
}

// "offset:rowBytes x rows" for each plane.
std::string Describe(const PixelFormatPlaneLayout& layout) {
  std::ostringstream text;
  for (std::size_t i = 0; i < static_cast<std::size_t>(layout.count); ++i) {
    const PixelFormatPlane& plane = layout.planes[i];
    text << (i == 0 ? "" : " ") << plane.offset << ":" << plane.rowBytes << "x" << plane.rows;
  }
  return text.str();
}

// The frame holds its planes: none and a size of 0 for a width or height of 0
// or less; otherwise PixelFormatSize is 0 only where the planes themselves
// come near 2^64 bytes, and the planes lie in order from offset 0 without
// overlapping, within PixelFormatSize, each stride holding its row, a
// one-plane stride being the format's row bytes.
testing::AssertionResult FrameHoldsItsPlanes(PixelFormat pf, int width, int height) {
  const PixelFormatPlaneLayout layout = GetPixelFormatPlaneLayout(pf, width, height);
  const u128 size = PixelFormatSize(pf, width, height);
  const std::uint64_t firstRowBytes = UncompressedPixelFormatRowBytes(pf, width);
  const bool positive = width > 0 && height > 0;
  NeededPlanes needed = positive ? NeededPlanesOf(pf, width, height) : NeededPlanes{};
  u128 neededBytes = 0;
  for (const auto& [rowBytes, rows] : needed.planes) neededBytes += rowBytes * rows;
  bool holds = positive ? size != 0 || neededBytes > (u128{1} << 63)
                        : size == 0 && (width > 0 || firstRowBytes == 0);
  if (size == 0) needed = {};
  holds = holds && static_cast<std::size_t>(layout.count) == needed.count;
  u128 end = 0;
  for (std::size_t i = 0; i < layout.planes.size(); ++i) {
    const PixelFormatPlane& plane = layout.planes[i];
    const auto [rowBytes, rows] = needed.planes[i];
    const bool used = i < needed.count;
    holds =
        holds && plane.rows == rows &&
        (used ? plane.offset >= end && (i > 0 || plane.offset == 0) && plane.rowBytes >= rowBytes
              : plane.offset == 0 && plane.rowBytes == 0);
    if (used) end = plane.offset + u128{plane.rowBytes} * plane.rows;
  }
  holds = holds && end <= size &&
          (layout.count == 0 ||
           (firstRowBytes == 0 ? layout.count > 1 : layout.planes[0].rowBytes == firstRowBytes));
  if (holds) return testing::AssertionSuccess();
  return testing::AssertionFailure()
         << pf.fourCC << " " << width << "x" << height << ": " << Describe(layout) << " in "
         << static_cast<std::uint64_t>(size);
}

// Sizes from one pixel to the limits of int, odd ones included, and bad ones.
constexpr int kSizes[][2] = {{1, 1},
                             {2, 2},
                             {3, 3},
                             {479, 359},
                             {1921, 1081},
                             {257, 31},
                             {4096, 2160},
                             {16384, 16384},
                             {INT_MAX, 1},
                             {1, INT_MAX},
                             {INT_MAX, INT_MAX},
                             {0, 480},
                             {640, -1},
                             {INT_MIN, INT_MIN}};

TEST(PixelFormatPlaneLayout, EveryFormatHoldsItsPlanes) {
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (const auto& [width, height] : kSizes) EXPECT_TRUE(FrameHoldsItsPlanes(*pf, width, height));
  }
}

TEST(PixelFormatPlaneLayout, EveryFormatHoldsItsPlanesExhaustive) {
  constexpr int kHeights[] = {1, 2, 3, 31, 32, 33, 359, 1081};
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (int width = 1; width <= 4100; ++width) {
      for (int height : kHeights) ASSERT_TRUE(FrameHoldsItsPlanes(*pf, width, height));
    }
  }
}

TEST(PixelFormatSize, GoldenRowBytesAndSizes) {
  struct Case {
    PixelFormat format;
    int width, height;
    std::uint64_t rowBytes, size;
  };
  const Case kCases[] = {
      // rows padded to 64 bytes
      {kBGRA, 1, 1, 64, 64},
      // 4:2:2 rows to 16
      {kUYVY, 1, 1, 16, 16},
      {kPixelFormat_V210_422_10u, 1280, 1, 3456, 3456},
      // two planes of 16-bit samples
      {kP210, 480, 360, 960, 691200},
      // 129 chroma samples need two units
      {kYV12, 257, 32, 0, 32u * (384 + 256) + 256},
      // no 32-bit wrap
      {kPixelFormat_BGRA_4444_32f, INT_MAX, 1, 34359738368u, 34359738368u},
      // just fits 64 bits
      {kUYVY, INT_MAX, INT_MAX, 4294967296u, 4294967296u * INT_MAX},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.format.fourCC << " " << c.width);
    EXPECT_EQ(UncompressedPixelFormatRowBytes(c.format, c.width), c.rowBytes);
    EXPECT_EQ(PixelFormatSize(c.format, c.width, c.height), c.size);
  }
}

// A custom word: `pf` at another depth.
PixelFormat WithDepth(PixelFormat pf, PixelFormatDepth depth) {
  pf.properties.SetDepth(depth);
  return pf;
}

TEST(PixelFormatPlaneLayout, GoldenLayouts) {
  struct Case {
    PixelFormat format;
    int width, height;
    const char* planes;
  };
  const Case kCases[] = {
      // V, U after 64, 32 rows
      {kYV12, 257, 33, "0:384x33 24576:256x17 32768:256x17"},
      {kNV12, 3, 3, "0:128x3 384:128x2"},
      // 33 pairs of 16-bit samples
      {kP010, 65, 1, "0:256x1 256:256x1"},
      // samples wider than the strides
      {WithDepth(kYV12, kPixelFormatDepth_16), 480, 360, ""},
      {WithDepth(kP210, kPixelFormatDepth_32), 480, 360, ""},
  };
  for (const Case& c : kCases) {
    EXPECT_EQ(Describe(GetPixelFormatPlaneLayout(c.format, c.width, c.height)), c.planes)
        << c.format.fourCC;
  }
}

TEST(PixelFormatPlaneLayout, HoldsTheAVUtilImageAndItsRows) {
  // yv12 holds V before U; the two chroma planes have the same shape.
  const std::pair<PixelFormat, AVPixelFormat> kCases[] = {
      {kYV12, AV_PIX_FMT_YUV420P}, {kNV12, AV_PIX_FMT_NV12},
      {kP010, AV_PIX_FMT_P010LE},  {kP210, AV_PIX_FMT_P210LE},
      {kUYVY, AV_PIX_FMT_UYVY422}, {kPixelFormat_Y210_422_10u_as16u_709, AV_PIX_FMT_Y210LE},
      {kBGRA, AV_PIX_FMT_BGRA},    {kPixelFormat_ARGB_4444_32f_Planar, AV_PIX_FMT_GBRAPF32LE},
  };
  constexpr int kPeerSizes[][2] = {{1, 1}, {3, 3}, {1921, 1081}, {257, 31}};
  for (const auto& [format, peer] : kCases) {
    for (const auto& [width, height] : kPeerSizes) {
      SCOPED_TRACE(testing::Message() << format.fourCC << " " << width << "x" << height);
      int lineSizes[4] = {};
      ASSERT_GE(av_image_fill_linesizes(lineSizes, peer, width), 0);
      const ptrdiff_t strides[4] = {lineSizes[0], lineSizes[1], lineSizes[2], lineSizes[3]};
      std::size_t planeBytes[4] = {};
      ASSERT_GE(av_image_fill_plane_sizes(planeBytes, peer, height, strides), 0);
      const int frameBytes = av_image_get_buffer_size(peer, width, height, 1);
      EXPECT_GE(PixelFormatSize(format, width, height), static_cast<std::uint64_t>(frameBytes));
      const PixelFormatPlaneLayout layout = GetPixelFormatPlaneLayout(format, width, height);
      int peerCount = 0;
      while (peerCount < 4 && lineSizes[peerCount] > 0) ++peerCount;
      ASSERT_EQ(layout.count, peerCount) << Describe(layout);
      for (std::size_t i = 0; i < static_cast<std::size_t>(peerCount); ++i) {
        const auto peerStride = static_cast<std::uint64_t>(lineSizes[i]);
        EXPECT_GE(layout.planes[i].rowBytes, peerStride) << i;
        EXPECT_EQ(layout.planes[i].rows, planeBytes[i] / peerStride) << i;
      }
    }
  }
}

TEST(PixelConversionCost, IdentityIsFreeAndEverythingElseCosts) {
  for (const PixelFormat* a = AllPixelFormatsBegin(); a != AllPixelFormatsEnd(); ++a) {
    for (const PixelFormat* b = AllPixelFormatsBegin(); b != AllPixelFormatsEnd(); ++b) {
      for (RenderQuality q : kQualities) {
        const int c = PixelConversionCost(a->properties, b->properties, q);
        const bool same = a->properties == b->properties;
        // Any change costs at least 1; a change to a compressed word is impossible.
        const int least = same ? 0 : b->properties.packing() != 0 ? 10000 : 1;
        ASSERT_TRUE(c >= least && c <= (same ? 0 : 10000)) << a->fourCC << " " << b->fourCC;
      }
    }
  }
}

TEST(PixelConversionCost, GoldenValues) {
  const PixelFormatProperties uyvy = kUYVY.properties, dv = kPixelFormat_NTSCDV25.properties;
  const PixelFormatProperties bgra32f = kPixelFormat_BGRA_4444_32f.properties;
  struct Case {
    PixelFormatProperties from, to;
    RenderQuality quality;
    int cost;
  };
  // 1 for any change, plus a penalty for each loss.
  const Case kCases[] = {
      // to RGB +2, range +100, alpha +5
      {uyvy, kBGRA.properties, kRenderQuality_Draft, 108},
      // to RGB of the same depth +100
      {uyvy, kBGRA.properties, kRenderQuality_High, 206},
      // depth lost counts ten times
      {bgra32f, kBGRA.properties, kRenderQuality_Medium, 52},
      // compressed +1, not its target +50
      {dv, kYUYV.properties, kRenderQuality_Draft, 53},
  };
  for (const Case& c : kCases) {
    EXPECT_EQ(PixelConversionCost(c.from, c.to, c.quality), c.cost)
        << c.from.Word() << " -> " << c.to.Word() << " q" << c.quality;
  }
}

TEST(Select4444PixelFormat, ProcessesEachFormatInAFourFourFourAlphaFormat) {
  const PixelFormat bgrx = kPixelFormat_BGRX_4444_8u, bgrx32f = kPixelFormat_BGRX_4444_32f;
  struct Case {
    PixelFormat in;
    // at Draft and Low
    PixelFormat low;
    // at Medium and up
    PixelFormat high;
  };
  const Case kCases[] = {
      {kYUYV, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_8u},
      {kPixelFormat_UYVY_422_32f, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_32f},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020, bgrx, bgrx32f},
      // 4444, named badf
      {PixelFormat(kInvalid.fourCC, kBGRA.properties), kInvalid, kInvalid},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.in.fourCC);
    for (RenderQuality q : kQualities) {
      EXPECT_EQ(Select4444PixelFormat(c.in, q), q <= kRenderQuality_Low ? c.low : c.high) << q;
    }
  }
}

TEST(Select4444PixelFormat, AlwaysGivesACatalogueAlphaFormatOrInvalid) {
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (RenderQuality q : kQualities) {
      SCOPED_TRACE(testing::Message() << pf->fourCC << " q" << q);
      const PixelFormat r = Select4444PixelFormat(*pf, q);
      if (r == kInvalid) continue;
      EXPECT_TRUE(PixelFormat(r.fourCC) == r && r.properties.alpha() != kPixelFormatAlpha_None &&
                  r.properties.subsampling() == kPixelFormatSubsampling_444);
      EXPECT_EQ(Select4444PixelFormat(r, q), r) << "a 4444 format is kept";
    }
  }
}

TEST(SelectSameBitDepthRGBPixelFormat, KeepsDepthAndAlpha) {
  const std::pair<PixelFormat, PixelFormat> kCases[] = {
      {kPixelFormat_VUYA_4444_32f, kPixelFormat_BGRA_4444_32f},
      {kPixelFormat_V210_422_10u, kPixelFormat_RGB_444_10u},
      {kUYVY, kInvalid},
  };
  for (const auto& [in, want] : kCases) EXPECT_EQ(SelectSameBitDepthRGBPixelFormat(in), want);
}

TEST(DVPixelFormat, FixedGeometrySizeRatiosAndDecompressionTarget) {
  struct Case {
    PixelFormat format;
    int width, height;
    std::uint64_t size;
    PixelAspectRatio ratio, wide;
    PixelFormat target;
  };
  const Case kCases[] = {
      {kPixelFormat_NTSCDV25, 720, 480, 120000, {10, 11}, {40, 33}, kUYVY},
      {kPixelFormat_PALDV25, 720, 576, 144000, {768, 702}, {1024, 702}, kUYVY},
      {kPixelFormat_NTSCDV50, 720, 480, 240000, {10, 11}, {40, 33}, kYUYV},
      {kPixelFormat_PALDV50, 720, 576, 288000, {768, 702}, {1024, 702}, kYUYV},
      {kPixelFormat_NTSC_DV100_720p, 960, 720, 240000, {1, 1}, {1, 1}, kYUYV709},
      {kPixelFormat_PAL_DV100_720p, 960, 720, 288000, {1, 1}, {1, 1}, kYUYV709},
      {kPixelFormat_NTSC_DV100_1080i, 1280, 1080, 480000, {3, 2}, {3, 2}, kYUYV709},
      {kPixelFormat_PAL_DV100_1080i, 1440, 1080, 576000, {4, 3}, {1920, 1440}, kYUYV709},
  };
  for (const auto& [format, width, height, size, ratio, wide, target] : kCases) {
    SCOPED_TRACE(format.fourCC);
    int w = 0, h = 0;
    FixedSizedFormatDimensions(format, w, h);
    EXPECT_TRUE(w == width && h == height && PixelFormatSize(format, 1, 1) == size);
    EXPECT_EQ(SelectDVDecompressionFormat(format), target);
    // Only its own size with a permitted ratio is valid.
    EXPECT_TRUE(IsRectValidForFormat(format, w, h, ratio) &&
                IsRectValidForFormat(format, w, h, wide) &&
                !IsRectValidForFormat(format, w - 1, h, ratio));
  }
  // Other formats have no fixed geometry.
  EXPECT_TRUE(IsRectValidForFormat(kBGRA, -5, 0, {7, 0}));
}

TEST(SelectNearestPixelFormat, ChoosesTheCheapestAcceptedFormat) {
  struct Case {
    const char* name;
    PixelFormatVector available;
    PixelFormat preferred;
    PixelFormatVector accepted;
    bool acceptPreferred;
    PixelFormat want;
  };
  const Case kCases[] = {
      {"empty accepted: first 4444 available", {kUYVY, kBGRA, kVUYA}, kUYVY, {}, false, kBGRA},
      {"preferred accepted", {kUYVY}, kVUYA, {kBGRA, kVUYA}, true, kVUYA},
      {"preferred under a wildcard", {kUYVY}, kVUYA, {kAny}, true, kVUYA},
      {"cheapest conversion", {kUYVY}, kUYVY, {kBGRA, kVUYA}, false, kVUYA},
      {"tie: preferred converts best", {kUYVY}, kVUYA, {kVUYP, kVUYA}, false, kVUYA},
      {"tie: else the earlier", {kUYVY}, kVUYP, {kVUYP, kVUYA}, false, kVUYP},
      // The preferred uyvy is accepted but not available: never handed back.
      {"wildcard tie: an available one", {kVUYP, kVUYA}, kUYVY, {kAny, kUYVY}, false, kVUYP},
      {"wildcard tie: the preferred one", {kVUYP, kVUYA}, kVUYA, {kAny, kUYVY}, false, kVUYA},
      {"nothing convertible: first 4444 accepted", {kInvalid}, kUYVY, {kUYVY, kBGRA}, false, kBGRA},
  };
  for (const Case& c : kCases) {
    const PixelFormat got = SelectNearestPixelFormat(c.available, c.preferred, c.accepted,
                                                     kRenderQuality_Draft, c.acceptPreferred);
    EXPECT_EQ(got, c.want) << c.name;
  }
}

TEST(SelectNearestSourcePixelFormat, ChoosesTheCheapestSource) {
  const PixelFormat deeper(MakePixelFormatName("_hi_"), PixelFormatProperties(0x080126));
  const PixelFormat shallower(MakePixelFormatName("_lo_"), PixelFormatProperties(0x080122));
  const PixelFormat custom(MakePixelFormatName("_cus"), kBGRA.properties);
  const PixelFormatProperties bgra15 = kPixelFormat_BGRA_4444_15u.properties;
  struct Case {
    const char* name;
    PixelFormatVector available;
    PixelFormatProperties wanted;
    PixelFormat want;
  };
  const Case kCases[] = {
      {"any: first specific built-in", {kAny, custom, kUYVY}, kAny.properties, kUYVY},
      {"equal cost: lower depth wins", {deeper, shallower}, bgra15, shallower},
      {"equal cost: lower depth kept", {shallower, deeper}, bgra15, shallower},
  };
  for (const Case& c : kCases) {
    EXPECT_EQ(SelectNearestSourcePixelFormat(c.available, c.wanted, kRenderQuality_Draft), c.want)
        << c.name;
  }
}

}  // namespace
}  // namespace zebmediatypes
