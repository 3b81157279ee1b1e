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

// clang-format off
constexpr RenderQuality kQualities[] = {kRenderQuality_Draft, kRenderQuality_Low, kRenderQuality_Medium, kRenderQuality_High, kRenderQuality_Max};
constexpr PixelFormat kUYVY = kPixelFormat_UYVY_422_8u, kYUYV = kPixelFormat_YUYV_422_8u, kBGRA = kPixelFormat_BGRA_4444_8u;
constexpr PixelFormat kVUYA = kPixelFormat_VUYA_4444_8u, kVUYP = kPixelFormat_VUYP_4444_8u, kVUYX = kPixelFormat_VUYX_4444_8u;
constexpr PixelFormat kAny = kPixelFormat_Any, kInvalid = kPixelFormat_Invalid;
// clang-format on

u128 Half(u128 v) { return (v + 1) / 2; }

// The planes of a frame from the layout alone (no padding), in buffer order:
// the bytes of the samples of one row, and the rows. None for DV.
struct NeededPlanes {
  std::size_t count = 0;
  std::array<std::pair<u128, u128>, 4> planes{};  // row bytes, rows
  void Add(u128 rowBytes, u128 rows) { planes[count++] = {rowBytes, rows}; }
};

NeededPlanes NeededPlanesOf(PixelFormat pf, int width, int height) {
  const PixelFormatProperties p = pf.properties;
  const u128 w = static_cast<u128>(width), h = static_cast<u128>(height);
  const u128 bytes = std::array<unsigned, 8>{1, 2, 2, 2, 3, 4, 0, 0}[p.depth()];  // per component
  NeededPlanes needed;
  if (p.IsDV()) return needed;
  if (p.subsampling() == kPixelFormatSubsampling_420) {
    needed.Add(w * bytes, h);
    if (p.packing() >= kPixelFormatPacking_MPEG4BiPlanarField) {
      needed.Add(2 * Half(w) * bytes, Half(h));  // chroma pairs
    } else {
      needed.Add(Half(w) * bytes, Half(h));  // V
      needed.Add(Half(w) * bytes, Half(h));  // U
    }
  } else if (p.subsampling() == kPixelFormatSubsampling_422) {
    if (p.interleaving() == kInterleavedChroma) {
      needed.Add(w * bytes, h);
      needed.Add(2 * Half(w) * bytes, h);
    } else if (GetBytesPerPixel(pf) == 0) {
      needed.Add((w + 5) / 6 * 16, h);  // v210: 6 pixels in 16 bytes
    } else {
      needed.Add(4 * bytes * Half(w), h);  // two luma and two chroma samples per pair
    }
  } else if (pf == kPixelFormat_RGB_444_10u) {
    needed.Add(4 * w, h);  // 10:10:10:2
  } else if (p.interleaving() == kPlanar) {
    for (int i = 0; i < GetNumberOfPlanes(pf); ++i) needed.Add(w * bytes, h);
  } else {
    needed.Add((p.alpha() != kPixelFormatAlpha_None ? 4u : 3u) * bytes * w, h);
  }
  return needed;
}

// What every buffer of PixelFormatSize bytes must hold. 0 for DV.
u128 NeededFrameBytes(PixelFormat pf, int width, int height) {
  const NeededPlanes needed = NeededPlanesOf(pf, width, height);
  u128 bytes = 0;
  for (std::size_t i = 0; i < needed.count; ++i) {
    bytes += needed.planes[i].first * needed.planes[i].second;
  }
  return bytes;
}

// Sizes from one pixel to the limits of int, odd ones included.
constexpr int kSizes[][2] = {
    {1, 1},       {2, 2},         {3, 3},       {479, 359},   {1921, 1081},      {257, 31},
    {4096, 2160}, {16384, 16384}, {INT_MAX, 1}, {1, INT_MAX}, {INT_MAX, INT_MAX}};

// A custom word: `pf` at another depth.
PixelFormat WithDepth(PixelFormat pf, PixelFormatDepth depth) {
  pf.properties.SetDepth(depth);
  return pf;
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

// The planes are the frame's: in order from offset 0 without overlapping,
// within PixelFormatSize, each stride holding its row, a one-plane stride being
// the format's row bytes, and none where there is no frame to lay out.
testing::AssertionResult LayoutHolds(PixelFormat pf, int width, int height) {
  const PixelFormatPlaneLayout layout = GetPixelFormatPlaneLayout(pf, width, height);
  const u128 size = PixelFormatSize(pf, width, height);
  NeededPlanes needed = NeededPlanesOf(pf, width, height);
  if (size == 0) needed = {};
  bool holds = static_cast<std::size_t>(layout.count) == needed.count;
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
  const std::uint64_t firstRowBytes = UncompressedPixelFormatRowBytes(pf, width);
  holds = holds && end <= size &&
          (layout.count == 0 ||
           (firstRowBytes == 0 ? layout.count > 1 : layout.planes[0].rowBytes == firstRowBytes));
  if (holds) return testing::AssertionSuccess();
  return testing::AssertionFailure()
         << pf.fourCC << " " << width << "x" << height << ": " << Describe(layout) << " in "
         << static_cast<std::uint64_t>(size);
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

TEST(PixelConversionCost, StaysInRangeForAnyWordsExhaustive) {
  // Every word with the reserved bits clear, from and to a few catalogue words.
  for (std::uint32_t word = 0; word < (1u << 23); ++word) {
    const PixelFormatProperties p(word);
    for (const PixelFormat& other : {kPixelFormat_BGRA_4444_8u, kPixelFormat_UYVY_422_8u,
                                     kPixelFormat_NTSCDV25, kPixelFormat_VUYA_4444_32f_709}) {
      const int least = p == other.properties ? 0 : 1;
      for (RenderQuality q : {kRenderQuality_Draft, kRenderQuality_Max}) {
        for (int c : {PixelConversionCost(p, other.properties, q),
                      PixelConversionCost(other.properties, p, q)})
          ASSERT_TRUE(c >= least && c <= 10000) << word;
      }
    }
  }
}

TEST(PixelConversionCost, GoldenValues) {
  // clang-format off
  const PixelFormatProperties uyvy = kUYVY.properties, bgra = kBGRA.properties, vuya = kVUYA.properties, any = kAny.properties;
  const PixelFormatProperties bgra32f = kPixelFormat_BGRA_4444_32f.properties, dv = kPixelFormat_NTSCDV25.properties;
  const PixelFormatProperties uyvy709 = kPixelFormat_UYVY_422_8u_709.properties;
  struct Case { PixelFormatProperties from, to; RenderQuality quality; int cost; };
  const Case kCases[] = {
      {uyvy, uyvy709, kRenderQuality_Draft, 2}, {uyvy, uyvy709, kRenderQuality_High, 11},
      {any, bgra, kRenderQuality_Draft, 10000}, {any, any, kRenderQuality_Draft, 10000},
      {bgra, kPixelFormatProperties_Invalid, kRenderQuality_Draft, 10000},
      // 1, YUV to RGB +2, range +100, alpha gained +5; at High YUV to RGB of the same depth costs 100
      {uyvy, bgra, kRenderQuality_Draft, 108}, {uyvy, bgra, kRenderQuality_High, 206},
      // alpha gained +5, 4:2:2 to 4:4:4 is free; alpha lost +25, to 4:2:2 +50
      {uyvy, vuya, kRenderQuality_Draft, 6}, {kVUYP.properties, uyvy, kRenderQuality_Draft, 76},
      // depth lost 5 - 0, float +1; at Max depth lost counts ten times
      {bgra32f, bgra, kRenderQuality_Draft, 7}, {bgra32f, bgra, kRenderQuality_Max, 52},
      // compressed source +1; to another 4:2:2 format +50; to 4:4:4 +5, alpha +5
      {dv, uyvy, kRenderQuality_Draft, 2}, {dv, kYUYV.properties, kRenderQuality_Draft, 53}, {dv, vuya, kRenderQuality_Draft, 12},
  };
  // clang-format on
  for (const Case& c : kCases)
    EXPECT_EQ(PixelConversionCost(c.from, c.to, c.quality), c.cost)
        << c.from.Word() << " -> " << c.to.Word() << " q" << c.quality;
}

TEST(Select4444PixelFormat, ProcessesEachFormatInAFourFourFourAlphaFormat) {
  const PixelFormat bgrx = kPixelFormat_BGRX_4444_8u, bgrx32f = kPixelFormat_BGRX_4444_32f;
  // clang-format off
  struct Case { PixelFormat in, low, high; };  // low: Draft and Low; high: Medium and up
  const Case kCases[] = {
      {kBGRA, kBGRA, kBGRA}, {kUYVY, kVUYX, kVUYX}, {kYUYV, kVUYX, kVUYX}, {kAny, kAny, kAny},
      {kPixelFormat_UYVY_422_8u_709, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_VUYX_4444_8u_709},
      {kPixelFormat_UYVY_422_32f, kVUYX, kPixelFormat_VUYX_4444_32f}, {kPixelFormat_V210_422_10u_709_FullRange, bgrx, bgrx32f},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020, bgrx, bgrx32f},
      {kPixelFormat_NTSCDV25, kVUYX, kVUYX}, {kPixelFormat_RGB_444_32f_Planar, kInvalid, kInvalid}, {kInvalid, kInvalid, kInvalid},
      {PixelFormat(kInvalid.fourCC, kBGRA.properties), kInvalid, kInvalid},  // a 4444 word named badf
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.in.fourCC);
    for (RenderQuality q : kQualities)
      EXPECT_EQ(Select4444PixelFormat(c.in, q), q <= kRenderQuality_Low ? c.low : c.high) << q;
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
  // clang-format off
  const PixelFormat kCases[][2] = {
      {kVUYA, kBGRA}, {kPixelFormat_VUYA_4444_32f, kPixelFormat_BGRA_4444_32f}, {kUYVY, kInvalid},
      {kPixelFormat_V210_422_10u, kPixelFormat_RGB_444_10u}, {kPixelFormat_NTSCDV25, kInvalid},
      {kPixelFormat_ARGB_4444_32f_Linear, kPixelFormat_ARGB_4444_32f_Linear}, {kAny, kAny}, {kInvalid, kInvalid},
  };
  // clang-format on
  for (const auto& [in, want] : kCases)
    EXPECT_EQ(SelectSameBitDepthRGBPixelFormat(in), want) << in.fourCC;
}

TEST(DVPixelFormat, FixedGeometrySizeRatiosAndDecompressionTarget) {
  const PixelFormat yuyv709 = kPixelFormat_YUYV_422_8u_709;
  // clang-format off
  struct Case { PixelFormat format; int width, height; std::uint64_t size; PixelAspectRatio ratio, wide; PixelFormat target; };
  const Case kCases[] = {
      {kPixelFormat_NTSCDV25, 720, 480, 120000, {10, 11}, {40, 33}, kUYVY},
      {kPixelFormat_PALDV25, 720, 576, 144000, {768, 702}, {1024, 702}, kUYVY},
      {kPixelFormat_NTSCDV50, 720, 480, 240000, {10, 11}, {40, 33}, kYUYV},
      {kPixelFormat_PALDV50, 720, 576, 288000, {768, 702}, {1024, 702}, kYUYV},
      {kPixelFormat_NTSC_DV100_720p, 960, 720, 240000, {1, 1}, {1, 1}, yuyv709},
      {kPixelFormat_PAL_DV100_720p, 960, 720, 288000, {1, 1}, {1, 1}, yuyv709},
      {kPixelFormat_NTSC_DV100_1080i, 1280, 1080, 480000, {3, 2}, {3, 2}, yuyv709},
      {kPixelFormat_PAL_DV100_1080i, 1440, 1080, 576000, {4, 3}, {1920, 1440}, yuyv709},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.format.fourCC);
    int width = 123, height = -4;
    FixedSizedFormatDimensions(c.format, width, height);
    EXPECT_EQ(std::make_pair(width, height), std::make_pair(c.width, c.height));
    EXPECT_EQ(SelectDVDecompressionFormat(c.format), c.target);
    // A DV frame has a fixed size whatever dimensions are asked for.
    EXPECT_EQ(PixelFormatSize(c.format, c.width, c.height), c.size);
    EXPECT_EQ(PixelFormatSize(c.format, 1, 1), c.size);
    EXPECT_EQ(UncompressedPixelFormatRowBytes(c.format, c.width), 0u);
    // Only its own size with a permitted ratio is valid; a legacy 9:10 never is.
    const auto valid = [&](int w, int h, PixelAspectRatio r) {
      return IsRectValidForFormat(c.format, w, h, r);
    };
    EXPECT_TRUE(valid(c.width, c.height, c.ratio) && valid(c.width, c.height, c.wide));
    EXPECT_FALSE(valid(c.width, c.height + 6, c.ratio) || valid(c.width - 1, c.height, c.ratio));
    EXPECT_FALSE(valid(c.width, c.height, {648, 720}) ||
                 valid(c.width, c.height, kPixelAspectRatio_Any));
  }
  // Other formats have no fixed geometry: anything goes and nothing changes.
  for (const PixelFormat& pf : {kBGRA, kAny, kInvalid}) {
    int width = 123, height = -4;
    FixedSizedFormatDimensions(pf, width, height);
    EXPECT_TRUE(width == 123 && height == -4);
    EXPECT_EQ(SelectDVDecompressionFormat(pf), pf);
    EXPECT_TRUE(IsRectValidForFormat(pf, -5, 0, {7, 0}));
  }
}

TEST(SelectNearestPixelFormat, ChoosesTheCheapestAcceptedFormat) {
  // clang-format off
  struct Case { const char* name; PixelFormatVector available; PixelFormat preferred; PixelFormatVector accepted; bool acceptPreferred; PixelFormat want; };
  const Case kCases[] = {
      {"empty accepted: first 4444 available", {kUYVY, kBGRA, kVUYA}, kUYVY, {}, false, kBGRA}, {"both empty", {}, kUYVY, {}, false, kInvalid},
      {"wildcard only: first 4444 available", {kUYVY, kBGRA}, kUYVY, {kAny}, false, kBGRA}, {"wildcard, nothing 4444", {kUYVY}, kBGRA, {kAny}, false, kUYVY},
      {"preferred accepted", {kUYVY}, kVUYA, {kBGRA, kVUYA}, true, kVUYA}, {"preferred under a wildcard", {kUYVY}, kVUYA, {kAny}, true, kVUYA},
      {"invalid preferred under a wildcard", {kUYVY}, kInvalid, {kAny}, true, kUYVY}, {"cheapest conversion", {kUYVY}, kUYVY, {kBGRA, kVUYA}, false, kVUYA},
      {"exact match in accepted order", {kBGRA, kUYVY}, kVUYA, {kUYVY, kBGRA}, false, kUYVY}, {"wildcard: cheapest available", {kUYVY, kVUYA}, kUYVY, {kAny, kVUYP}, false, kVUYA},
      {"tie: preferred converts best", {kUYVY}, kVUYA, {kVUYP, kVUYA}, false, kVUYA}, {"tie: else the earlier", {kUYVY}, kVUYP, {kVUYP, kVUYA}, false, kVUYP},
      {"nothing convertible: first 4444 accepted", {kInvalid}, kUYVY, {kUYVY, kBGRA}, false, kBGRA},
  };
  // clang-format on
  for (const Case& c : kCases) {
    const PixelFormat got = SelectNearestPixelFormat(c.available, c.preferred, c.accepted,
                                                     kRenderQuality_Draft, c.acceptPreferred);
    EXPECT_EQ(got, c.want) << c.name;
  }
}

TEST(SelectNearestPixelFormat, WildcardTieReturnsAnAvailableFormat) {
  // vuyp and vuya convert to uyvy at the same cost; uyvy (the preferred
  // format, accepted but not available) must not be handed back. A candidate
  // that matches the preferred format wins the tie.
  const auto nearest = [](PixelFormat preferred) {
    return SelectNearestPixelFormat({kVUYP, kVUYA}, preferred, {kAny, kUYVY}, kRenderQuality_Draft,
                                    false);
  };
  EXPECT_EQ(std::make_pair(nearest(kUYVY), nearest(kVUYA)), std::make_pair(kVUYP, kVUYA));
}

TEST(SelectNearestSourcePixelFormat, ChoosesTheCheapestSource) {
  const PixelFormat deeper(MakePixelFormatName("_hi_"), PixelFormatProperties(0x080126));
  const PixelFormat shallower(MakePixelFormatName("_lo_"), PixelFormatProperties(0x080122));
  const PixelFormat custom(MakePixelFormatName("_cus"), kBGRA.properties);
  const PixelFormatProperties bgra15 = kPixelFormat_BGRA_4444_15u.properties;
  // clang-format off
  struct Case { const char* name; PixelFormatVector available; PixelFormatProperties wanted; PixelFormat want; };
  const Case kCases[] = {
      {"any: first specific built-in kind", {kAny, custom, kUYVY}, kAny.properties, kUYVY}, {"any, none specific", {kAny}, kAny.properties, kInvalid},
      {"empty", {}, kUYVY.properties, kInvalid}, {"invalid wanted", {kBGRA}, kInvalid.properties, kInvalid},
      {"equal cost: lower depth wins", {deeper, shallower}, bgra15, shallower}, {"equal cost: lower depth kept", {shallower, deeper}, bgra15, shallower},
      {"exact", {kBGRA, kUYVY}, kUYVY.properties, kUYVY}, {"nothing convertible", {kAny}, kUYVY.properties, kInvalid},
  };
  // clang-format on
  for (const Case& c : kCases)
    EXPECT_EQ(SelectNearestSourcePixelFormat(c.available, c.wanted, kRenderQuality_Draft), c.want)
        << c.name;
}

TEST(PixelFormatSize, GoldenRowBytesAndSizes) {
  // clang-format off
  struct Case { PixelFormat format; int width, height; std::uint64_t rowBytes, size; };
  const Case kCases[] = {
      {kPixelFormat_ARGB_4444_32f_Planar, 480, 360, 1920, 1920u * 360 * 4}, {kPixelFormat_RGB_444_32f_Planar, 480, 360, 1920, 1920u * 360 * 3},
      {kBGRA, 480, 360, 1920, 1920u * 360}, {kBGRA, 1, 1, 64, 64}, {kUYVY, 480, 360, 960, 345600}, {kUYVY, 1, 1, 16, 16},  // rows are padded
      {kPixelFormat_V210_422_10u, 480, 1, 1280, 1280}, {kPixelFormat_V210_422_10u, 1280, 1, 3456, 3456}, {kPixelFormat_Y210_422_10u_as16u_709, 480, 1, 1920, 1920},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, 480, 360, 0, 276992},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, 480, 360, 0, 553984},
      {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, 480, 360, 0, 295168},
      {kAny, 480, 360, 0, 0}, {kInvalid, 480, 360, 0, 0}, {kPixelFormat_BGRA_4444_32f, INT_MAX, 1, 34359738368u, 34359738368u},  // no 32-bit wrap
  };
  // clang-format on
  for (const Case& c : kCases) {
    EXPECT_EQ(std::make_pair(UncompressedPixelFormatRowBytes(c.format, c.width),
                             PixelFormatSize(c.format, c.width, c.height)),
              std::make_pair(c.rowBytes, c.size))
        << c.format.fourCC << " " << c.width << "x" << c.height;
  }
}

TEST(PixelFormatSize, BiPlanar422SizeHoldsBothPlanesOfSixteenBitSamples) {
  // Two planes of 960-byte rows (480 16-bit luma samples; 240 chroma pairs).
  const PixelFormat p210 = kPixelFormat_YUV_422_BiPlanar_10u_as16u;
  EXPECT_EQ(UncompressedPixelFormatRowBytes(p210, 480), 960u);
  EXPECT_EQ(PixelFormatSize(p210, 480, 360), 691200u);
}

TEST(PixelFormatSize, OddWidthChromaRowsCoverTheLastColumn) {
  // 257 pixels need 129 chroma samples a row, more than one 128-byte unit.
  EXPECT_EQ(PixelFormatSize(kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, 257, 32),
            32u * (384 + 256) + 256);
}

TEST(PixelFormatSize, FrameHoldsEveryPlaneRow) {
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    if (pf->properties.IsDV()) continue;
    for (const auto& [width, height] : kSizes) {
      SCOPED_TRACE(testing::Message() << pf->fourCC << " " << width << "x" << height);
      const u128 size = PixelFormatSize(*pf, width, height);
      const u128 needed = NeededFrameBytes(*pf, width, height);
      // 0 (overflow) only where the planes themselves come near 2^64 bytes.
      EXPECT_TRUE(size >= needed || (size == 0 && needed > (u128{1} << 63)))
          << static_cast<double>(needed);
      const u128 rows = u128{UncompressedPixelFormatRowBytes(*pf, width)} *
                        static_cast<u128>(GetNumberOfPlanes(*pf)) * static_cast<u128>(height);
      EXPECT_TRUE(rows == 0 || size == 0 || (size >= rows && rows >= needed));
    }
  }
  // 2 bytes a pixel over 2^62 pixels still fits 64 bits, exactly (16 bytes give 0 above).
  EXPECT_EQ(PixelFormatSize(kUYVY, INT_MAX, INT_MAX), 4294967296u * INT_MAX);
}

TEST(PixelFormatSize, FrameHoldsEveryPlaneRowExhaustive) {
  constexpr int kHeights[] = {1, 2, 3, 31, 32, 33, 359, 1081};
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    if (pf->properties.IsDV()) continue;
    for (int width = 1; width <= 4100; ++width) {
      for (int height : kHeights) {
        ASSERT_GE(u128{PixelFormatSize(*pf, width, height)}, NeededFrameBytes(*pf, width, height))
            << pf->fourCC << " " << width << "x" << height;
        ASSERT_TRUE(LayoutHolds(*pf, width, height));
      }
    }
  }
}

TEST(PixelFormatSize, ZeroAndNegativeDimensionsGiveZero) {
  // clang-format off
  constexpr int kBadSizes[][2] = {{0, 0}, {0, 480}, {640, 0}, {-1, 480}, {640, -1}, {-640, -480}, {INT_MIN, INT_MIN}, {INT_MIN, 1}};
  // clang-format on
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (const auto& [width, height] : kBadSizes) {
      SCOPED_TRACE(testing::Message() << pf->fourCC << " " << width << "x" << height);
      EXPECT_EQ(PixelFormatSize(*pf, width, height), 0u);
      EXPECT_EQ(GetPixelFormatPlaneLayout(*pf, width, height).count, 0);
      EXPECT_TRUE(width > 0 || UncompressedPixelFormatRowBytes(*pf, width) == 0);
    }
  }
}

TEST(PixelFormatPlaneLayout, PlanesLieInOrderWithinTheFrameAndHoldTheirRows) {
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (const auto& [width, height] : kSizes) EXPECT_TRUE(LayoutHolds(*pf, width, height));
  }
}

TEST(PixelFormatPlaneLayout, GoldenLayouts) {
  const PixelFormat yv12 = kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601;
  const PixelFormat nv12 = kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709;
  const PixelFormat p010 = kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709;
  struct Case {
    PixelFormat format;
    int width, height;
    const char* planes;
  };
  const Case kCases[] = {
      {yv12, 257, 33, "0:384x33 24576:256x17 32768:256x17"},  // V, U after 64, 32 rows
      {nv12, 3, 3, "0:128x3 384:128x2"},
      {p010, 65, 1, "0:256x1 256:256x1"},  // 33 pairs of 16-bit samples
      {kAny, 480, 360, ""},
      {kInvalid, 480, 360, ""},
      {WithDepth(yv12, kPixelFormatDepth_16), 480, 360, ""},  // samples wider than the strides
      {WithDepth(nv12, kPixelFormatDepth_32), 480, 360, ""},
      {WithDepth(kPixelFormat_YUV_422_BiPlanar_10u_as16u, kPixelFormatDepth_32), 480, 360, ""},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.format.fourCC << " " << c.width << "x" << c.height);
    EXPECT_EQ(Describe(GetPixelFormatPlaneLayout(c.format, c.width, c.height)), c.planes);
  }
}

TEST(PixelFormatPlaneLayout, StridesHoldTheAVUtilRowsAndRowsMatch) {
  struct Case {
    PixelFormat format;
    AVPixelFormat peer;
  };
  // yv12 holds V before U; the two chroma planes have the same shape.
  const Case kCases[] = {
      {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, AV_PIX_FMT_YUV420P},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, AV_PIX_FMT_NV12},
      {kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, AV_PIX_FMT_NV21},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, AV_PIX_FMT_P010LE},
      {kPixelFormat_YUV_422_BiPlanar_10u_as16u, AV_PIX_FMT_P210LE},
      {kPixelFormat_UYVY_422_8u, AV_PIX_FMT_UYVY422},
      {kPixelFormat_YUYV_422_8u_709, AV_PIX_FMT_YUYV422},
      {kPixelFormat_Y210_422_10u_as16u_709, AV_PIX_FMT_Y210LE},
      {kPixelFormat_BGRA_4444_8u, AV_PIX_FMT_BGRA},
      {kPixelFormat_ARGB_4444_8u, AV_PIX_FMT_ARGB},
      {kPixelFormat_BGRA_4444_15u, AV_PIX_FMT_BGRA64LE},
      {kPixelFormat_RGB_444_10u, AV_PIX_FMT_X2RGB10LE},
      {kPixelFormat_ARGB_4444_32f_Planar, AV_PIX_FMT_GBRAPF32LE},
      {kPixelFormat_RGB_444_32f_Planar, AV_PIX_FMT_GBRPF32LE},
  };
  constexpr int kPeerSizes[][2] = {{1, 1},     {2, 2},       {3, 3},    {5, 7},
                                   {479, 359}, {1921, 1081}, {257, 31}, {4096, 2160}};
  for (const Case& c : kCases) {
    for (const auto& [width, height] : kPeerSizes) {
      SCOPED_TRACE(testing::Message() << c.format.fourCC << " " << width << "x" << height);
      int lineSizes[4] = {};
      ASSERT_GE(av_image_fill_linesizes(lineSizes, c.peer, width), 0);
      const ptrdiff_t strides[4] = {lineSizes[0], lineSizes[1], lineSizes[2], lineSizes[3]};
      std::size_t planeBytes[4] = {};
      ASSERT_GE(av_image_fill_plane_sizes(planeBytes, c.peer, height, strides), 0);
      const PixelFormatPlaneLayout layout = GetPixelFormatPlaneLayout(c.format, width, height);
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

}  // namespace
}  // namespace zebmediatypes
