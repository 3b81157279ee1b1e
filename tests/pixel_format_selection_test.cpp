#include <gtest/gtest.h>
#include <zebmediatypes/pixel_format_selection.h>

#include <climits>
#include <cstdint>

namespace zebmediatypes {
namespace {

using u128 = unsigned __int128;

constexpr RenderQuality kQualities[] = {kRenderQuality_Draft, kRenderQuality_Low,
                                        kRenderQuality_Medium, kRenderQuality_High,
                                        kRenderQuality_Max};

PixelFormatVector Formats(std::initializer_list<PixelFormat> formats) { return formats; }

u128 Half(u128 v) { return (v + 1) / 2; }

// The bytes a frame's planes need, from the layout alone (no padding): what
// every buffer of PixelFormatSize bytes must hold. 0 for DV.
u128 NeededFrameBytes(PixelFormat pf, int width, int height) {
  const PixelFormatProperties p = pf.properties;
  const u128 w = static_cast<u128>(width);
  const u128 h = static_cast<u128>(height);
  constexpr unsigned kComponentBytes[8] = {1, 2, 2, 2, 3, 4, 0, 0};
  const u128 bytes = kComponentBytes[p.depth()];
  if (p.IsDV()) return 0;
  if (p.subsampling() == kPixelFormatSubsampling_420) {
    return w * h * bytes + 2 * Half(w) * Half(h) * bytes;
  }
  if (p.subsampling() == kPixelFormatSubsampling_422) {
    if (p.interleaving() == kInterleavedChroma) return w * h * bytes + 2 * Half(w) * h * bytes;
    if (pf == kPixelFormat_V210_422_10u || pf == kPixelFormat_V210_422_10u_709 ||
        pf == kPixelFormat_V210_422_10u_709_FullRange) {
      return (w + 5) / 6 * 16 * h;
    }
    return 4 * bytes * Half(w) * h;  // two luma and two chroma samples per pair
  }
  if (pf == kPixelFormat_RGB_444_10u) return 4 * w * h;  // 10:10:10:2
  const u128 components = p.alpha() != kPixelFormatAlpha_None ? 4 : 3;
  return components * bytes * w * h;
}

TEST(PixelConversionCost, IdentityIsFreeAndEverythingElseCosts) {
  for (const PixelFormat* a = AllPixelFormatsBegin(); a != AllPixelFormatsEnd(); ++a) {
    for (const PixelFormat* b = AllPixelFormatsBegin(); b != AllPixelFormatsEnd(); ++b) {
      for (RenderQuality q : kQualities) {
        const int c = PixelConversionCost(a->properties, b->properties, q);
        if (a->properties == b->properties) {
          ASSERT_EQ(c, 0);
        } else {
          ASSERT_GE(c, 1);
          ASSERT_LE(c, 10000);
        }
        if (a->properties != b->properties && b->properties.packing() != 0) {
          ASSERT_EQ(c, 10000) << "to a compressed word";
        }
      }
    }
  }
}

TEST(PixelConversionCost, StaysInRangeForAnyWordsExhaustive) {
  // Every word with the reserved bits clear, from and to a few catalogue words.
  const PixelFormatProperties kOthers[] = {
      kPixelFormat_BGRA_4444_8u.properties, kPixelFormat_UYVY_422_8u.properties,
      kPixelFormat_NTSCDV25.properties, kPixelFormat_VUYA_4444_32f_709.properties};
  for (std::uint32_t word = 0; word < (1u << 23); ++word) {
    const PixelFormatProperties p(word);
    for (const PixelFormatProperties& other : kOthers) {
      for (RenderQuality q : {kRenderQuality_Draft, kRenderQuality_Max}) {
        const int to = PixelConversionCost(p, other, q);
        const int from = PixelConversionCost(other, p, q);
        ASSERT_GE(to, p == other ? 0 : 1) << word;
        ASSERT_LE(to, 10000) << word;
        ASSERT_GE(from, p == other ? 0 : 1) << word;
        ASSERT_LE(from, 10000) << word;
      }
    }
  }
}

TEST(PixelConversionCost, GoldenValues) {
  struct Case {
    PixelFormatProperties from;
    PixelFormatProperties to;
    RenderQuality quality;
    int cost;
  };
  const Case kCases[] = {
      {kPixelFormat_UYVY_422_8u.properties, kPixelFormat_UYVY_422_8u_709.properties,
       kRenderQuality_Draft, 2},
      {kPixelFormat_UYVY_422_8u.properties, kPixelFormat_UYVY_422_8u_709.properties,
       kRenderQuality_High, 11},
      {kPixelFormatProperties_Any, kPixelFormat_BGRA_4444_8u.properties, kRenderQuality_Draft,
       10000},
      {kPixelFormat_BGRA_4444_8u.properties, kPixelFormatProperties_Invalid, kRenderQuality_Draft,
       10000},
      {kPixelFormatProperties_Any, kPixelFormatProperties_Any, kRenderQuality_Draft, 10000},
      // 1, YUV to RGB +2, range +100, alpha gained +5.
      {kPixelFormat_UYVY_422_8u.properties, kPixelFormat_BGRA_4444_8u.properties,
       kRenderQuality_Draft, 108},
      // At high quality YUV to RGB of the same depth costs 100.
      {kPixelFormat_UYVY_422_8u.properties, kPixelFormat_BGRA_4444_8u.properties,
       kRenderQuality_High, 206},
      // 1, alpha gained +5; 4:2:2 to 4:4:4 costs nothing more.
      {kPixelFormat_UYVY_422_8u.properties, kPixelFormat_VUYA_4444_8u.properties,
       kRenderQuality_Draft, 6},
      // 1, alpha lost +25, to 4:2:2 +50.
      {kPixelFormat_VUYP_4444_8u.properties, kPixelFormat_UYVY_422_8u.properties,
       kRenderQuality_Draft, 76},
      // Depth lost: 5 - 0 = 5, times 10 at high quality; float +1.
      {kPixelFormat_BGRA_4444_32f.properties, kPixelFormat_BGRA_4444_8u.properties,
       kRenderQuality_Draft, 7},
      {kPixelFormat_BGRA_4444_32f.properties, kPixelFormat_BGRA_4444_8u.properties,
       kRenderQuality_Max, 52},
      // DV to its decompression target: 1, compressed source +1.
      {kPixelFormat_NTSCDV25.properties, kPixelFormat_UYVY_422_8u.properties, kRenderQuality_Draft,
       2},
      // DV to another 4:2:2 format: +50; to 4:4:4: +5 (plus alpha +5).
      {kPixelFormat_NTSCDV25.properties, kPixelFormat_YUYV_422_8u.properties, kRenderQuality_Draft,
       53},
      {kPixelFormat_NTSCDV25.properties, kPixelFormat_VUYA_4444_8u.properties, kRenderQuality_Draft,
       12},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.from.Word() << " -> " << c.to.Word() << " q" << c.quality);
    EXPECT_EQ(PixelConversionCost(c.from, c.to, c.quality), c.cost);
  }
}

TEST(Select4444PixelFormat, ProcessesEachFormatInAFourFourFourAlphaFormat) {
  struct Case {
    PixelFormat in;
    PixelFormat low;   // Draft and Low
    PixelFormat high;  // Medium and up
  };
  const Case kCases[] = {
      {kPixelFormat_BGRA_4444_8u, kPixelFormat_BGRA_4444_8u, kPixelFormat_BGRA_4444_8u},
      {kPixelFormat_UYVY_422_8u, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_8u},
      {kPixelFormat_YUYV_422_8u, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_8u},
      {kPixelFormat_UYVY_422_8u_709, kPixelFormat_VUYX_4444_8u_709, kPixelFormat_VUYX_4444_8u_709},
      {kPixelFormat_UYVY_422_32f, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_32f},
      {kPixelFormat_V210_422_10u_709_FullRange, kPixelFormat_BGRX_4444_8u,
       kPixelFormat_BGRX_4444_32f},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020, kPixelFormat_BGRX_4444_8u,
       kPixelFormat_BGRX_4444_32f},
      {kPixelFormat_NTSCDV25, kPixelFormat_VUYX_4444_8u, kPixelFormat_VUYX_4444_8u},
      {kPixelFormat_RGB_444_32f_Planar, kPixelFormat_Invalid, kPixelFormat_Invalid},
      {kPixelFormat_Any, kPixelFormat_Any, kPixelFormat_Any},
      {kPixelFormat_Invalid, kPixelFormat_Invalid, kPixelFormat_Invalid},
      // A 4444 word under the invalid name is still invalid.
      {PixelFormat(static_cast<PixelFormatName>(kPixelFormatFourCC_Invalid),
                   kPixelFormat_BGRA_4444_8u.properties),
       kPixelFormat_Invalid, kPixelFormat_Invalid},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.in.fourCC);
    EXPECT_EQ(Select4444PixelFormat(c.in, kRenderQuality_Draft), c.low);
    EXPECT_EQ(Select4444PixelFormat(c.in, kRenderQuality_Low), c.low);
    EXPECT_EQ(Select4444PixelFormat(c.in, kRenderQuality_Medium), c.high);
    EXPECT_EQ(Select4444PixelFormat(c.in, kRenderQuality_Max), c.high);
  }
}

TEST(Select4444PixelFormat, AlwaysGivesACatalogueAlphaFormatOrInvalid) {
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (RenderQuality q : kQualities) {
      SCOPED_TRACE(testing::Message() << pf->fourCC << " q" << q);
      const PixelFormat r = Select4444PixelFormat(*pf, q);
      if (r == kPixelFormat_Invalid) continue;
      EXPECT_EQ(PixelFormat(r.fourCC), r);
      EXPECT_EQ(r.properties.subsampling(), kPixelFormatSubsampling_444);
      EXPECT_NE(r.properties.alpha(), kPixelFormatAlpha_None);
      EXPECT_EQ(Select4444PixelFormat(r, q), r) << "a 4444 format is kept";
    }
  }
}

TEST(SelectSameBitDepthRGBPixelFormat, KeepsDepthAndAlpha) {
  struct Case {
    PixelFormat in;
    PixelFormat want;
  };
  const Case kCases[] = {
      {kPixelFormat_VUYA_4444_8u, kPixelFormat_BGRA_4444_8u},
      {kPixelFormat_VUYA_4444_32f, kPixelFormat_BGRA_4444_32f},
      {kPixelFormat_V210_422_10u, kPixelFormat_RGB_444_10u},
      {kPixelFormat_UYVY_422_8u, kPixelFormat_Invalid},
      {kPixelFormat_ARGB_4444_32f_Linear, kPixelFormat_ARGB_4444_32f_Linear},
      {kPixelFormat_Invalid, kPixelFormat_Invalid},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.in.fourCC);
    EXPECT_EQ(SelectSameBitDepthRGBPixelFormat(c.in), c.want);
  }
}

TEST(SelectDVDecompressionFormat, MapsEachDVFormatOntoItsTarget) {
  struct Case {
    PixelFormat in;
    PixelFormat want;
  };
  const Case kCases[] = {
      {kPixelFormat_NTSCDV25, kPixelFormat_UYVY_422_8u},
      {kPixelFormat_PALDV25, kPixelFormat_UYVY_422_8u},
      {kPixelFormat_NTSC_DV100_720p, kPixelFormat_YUYV_422_8u_709},
      {kPixelFormat_PAL_DV100_720p, kPixelFormat_YUYV_422_8u_709},
      {kPixelFormat_NTSC_DV100_1080i, kPixelFormat_YUYV_422_8u_709},
      {kPixelFormat_PAL_DV100_1080i, kPixelFormat_YUYV_422_8u_709},
      {kPixelFormat_NTSCDV50, kPixelFormat_YUYV_422_8u},
      {kPixelFormat_PALDV50, kPixelFormat_YUYV_422_8u},
      {kPixelFormat_BGRA_4444_8u, kPixelFormat_BGRA_4444_8u},
      {kPixelFormat_Any, kPixelFormat_Any},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.in.fourCC);
    EXPECT_EQ(SelectDVDecompressionFormat(c.in), c.want);
  }
}

TEST(SelectNearestPixelFormat, ChoosesTheCheapestAcceptedFormat) {
  const PixelFormat uyvy = kPixelFormat_UYVY_422_8u;
  const PixelFormat bgra = kPixelFormat_BGRA_4444_8u;
  const PixelFormat vuya = kPixelFormat_VUYA_4444_8u;
  const PixelFormat vuyp = kPixelFormat_VUYP_4444_8u;
  const PixelFormat any = kPixelFormat_Any;
  struct Case {
    const char* name;
    PixelFormatVector available;
    PixelFormat preferred;
    PixelFormatVector accepted;
    bool acceptPreferred;
    PixelFormat want;
  };
  const Case kCases[] = {
      {"empty accepted: first 4444 available", Formats({uyvy, bgra, vuya}), uyvy, {}, false, bgra},
      {"both empty", {}, uyvy, {}, false, kPixelFormat_Invalid},
      {"wildcard only: first 4444 available", Formats({uyvy, bgra}), uyvy, Formats({any}), false,
       bgra},
      {"wildcard, nothing 4444", Formats({uyvy}), bgra, Formats({any}), false, uyvy},
      {"preferred accepted", Formats({uyvy}), vuya, Formats({bgra, vuya}), true, vuya},
      {"preferred under a wildcard", Formats({uyvy}), vuya, Formats({any}), true, vuya},
      {"invalid preferred under a wildcard", Formats({uyvy}), kPixelFormat_Invalid, Formats({any}),
       true, uyvy},
      {"exact match in accepted order", Formats({bgra, uyvy}), vuya, Formats({uyvy, bgra}), false,
       uyvy},
      {"cheapest conversion", Formats({uyvy}), uyvy, Formats({bgra, vuya}), false, vuya},
      {"tie: what preferred converts to best", Formats({uyvy}), vuya, Formats({vuyp, vuya}), false,
       vuya},
      {"tie: earlier when preferred does not decide", Formats({uyvy}), vuyp, Formats({vuyp, vuya}),
       false, vuyp},
      {"wildcard: cheapest available", Formats({uyvy, vuya}), uyvy, Formats({any, vuyp}), false,
       vuya},
      {"nothing convertible: first 4444 accepted", Formats({kPixelFormat_Invalid}), uyvy,
       Formats({uyvy, bgra}), false, bgra},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    EXPECT_EQ(SelectNearestPixelFormat(c.available, c.preferred, c.accepted, kRenderQuality_Draft,
                                       c.acceptPreferred),
              c.want);
  }
}

TEST(SelectNearestPixelFormat, WildcardTieReturnsAnAvailableFormat) {
  // vuyp and vuya convert to uyvy at the same cost; uyvy (the preferred
  // format, accepted but not available) must not be handed back.
  const PixelFormatVector available =
      Formats({kPixelFormat_VUYP_4444_8u, kPixelFormat_VUYA_4444_8u});
  const PixelFormatVector accepted = Formats({kPixelFormat_Any, kPixelFormat_UYVY_422_8u});
  const PixelFormat r = SelectNearestPixelFormat(available, kPixelFormat_UYVY_422_8u, accepted,
                                                 kRenderQuality_Draft, false);
  EXPECT_EQ(r, kPixelFormat_VUYP_4444_8u);
  // With a preferred format that one candidate matches, the tie goes to it.
  EXPECT_EQ(SelectNearestPixelFormat(available, kPixelFormat_VUYA_4444_8u, accepted,
                                     kRenderQuality_Draft, false),
            kPixelFormat_VUYA_4444_8u);
}

TEST(SelectNearestSourcePixelFormat, ChoosesTheCheapestSource) {
  const PixelFormat deeper(MakePixelFormatName("_hi_"), PixelFormatProperties(0x080126));
  const PixelFormat shallower(MakePixelFormatName("_lo_"), PixelFormatProperties(0x080122));
  const PixelFormat custom(MakePixelFormatName("_cus"), kPixelFormat_BGRA_4444_8u.properties);
  struct Case {
    const char* name;
    PixelFormatVector available;
    PixelFormatProperties wanted;
    PixelFormat want;
  };
  const Case kCases[] = {
      {"any: first specific built-in kind",
       Formats({kPixelFormat_Any, custom, kPixelFormat_UYVY_422_8u}), kPixelFormatProperties_Any,
       kPixelFormat_UYVY_422_8u},
      {"any, none specific", Formats({kPixelFormat_Any}), kPixelFormatProperties_Any,
       kPixelFormat_Invalid},
      {"invalid wanted", Formats({kPixelFormat_BGRA_4444_8u}), kPixelFormatProperties_Invalid,
       kPixelFormat_Invalid},
      {"equal cost: lower depth wins", Formats({deeper, shallower}),
       kPixelFormat_BGRA_4444_15u.properties, shallower},
      {"equal cost: lower depth kept", Formats({shallower, deeper}),
       kPixelFormat_BGRA_4444_15u.properties, shallower},
      {"exact", Formats({kPixelFormat_BGRA_4444_8u, kPixelFormat_UYVY_422_8u}),
       kPixelFormat_UYVY_422_8u.properties, kPixelFormat_UYVY_422_8u},
      {"nothing convertible", Formats({kPixelFormat_Any}), kPixelFormat_UYVY_422_8u.properties,
       kPixelFormat_Invalid},
      {"empty", {}, kPixelFormat_UYVY_422_8u.properties, kPixelFormat_Invalid},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    EXPECT_EQ(SelectNearestSourcePixelFormat(c.available, c.wanted, kRenderQuality_Draft), c.want);
  }
}

TEST(UncompressedPixelFormatRowBytes, GoldenValues) {
  struct Case {
    PixelFormat format;
    int width;
    std::uint64_t bytes;
  };
  const Case kCases[] = {
      {kPixelFormat_ARGB_4444_32f_Planar, 480, 1920},
      {kPixelFormat_RGB_444_32f_Planar, 480, 1920},
      {kPixelFormat_BGRA_4444_8u, 480, 1920},
      {kPixelFormat_BGRA_4444_8u, 1, 64},
      {kPixelFormat_UYVY_422_8u, 480, 960},
      {kPixelFormat_UYVY_422_8u, 1, 16},
      {kPixelFormat_V210_422_10u, 480, 1280},
      {kPixelFormat_V210_422_10u, 1280, 3456},
      {kPixelFormat_Y210_422_10u_as16u_709, 480, 1920},
      {kPixelFormat_YUV_422_BiPlanar_10u_as16u, 480, 960},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, 480, 0},
      {kPixelFormat_NTSCDV25, 720, 0},
      {kPixelFormat_Any, 480, 0},
      {kPixelFormat_Invalid, 480, 0},
      {kPixelFormat_BGRA_4444_32f, INT_MAX, 34359738368u},  // no 32-bit wrap
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.format.fourCC << " w" << c.width);
    EXPECT_EQ(UncompressedPixelFormatRowBytes(c.format, c.width), c.bytes);
  }
}

TEST(PixelFormatSize, GoldenValues) {
  struct Case {
    PixelFormat format;
    int width;
    int height;
    std::uint64_t bytes;
  };
  const Case kCases[] = {
      {kPixelFormat_ARGB_4444_32f_Planar, 480, 360, 1920u * 360 * 4},
      {kPixelFormat_RGB_444_32f_Planar, 480, 360, 1920u * 360 * 3},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, 480, 360, 276992},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, 480, 360, 553984},
      {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, 480, 360, 295168},
      {kPixelFormat_UYVY_422_8u, 480, 360, 345600},
      {kPixelFormat_NTSCDV25, 720, 480, 120000},
      {kPixelFormat_NTSCDV25, 1920, 1080, 120000},
      {kPixelFormat_PAL_DV100_1080i, 1, 1, 576000},
      {kPixelFormat_Any, 480, 360, 0},
      {kPixelFormat_Invalid, 480, 360, 0},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.format.fourCC << " " << c.width << "x" << c.height);
    EXPECT_EQ(PixelFormatSize(c.format, c.width, c.height), c.bytes);
  }
}

TEST(PixelFormatSize, BiPlanar422SizeHoldsBothPlanesOfSixteenBitSamples) {
  // Two planes of 960-byte rows (480 16-bit luma samples; 240 chroma pairs).
  EXPECT_EQ(PixelFormatSize(kPixelFormat_YUV_422_BiPlanar_10u_as16u, 480, 360), 691200u);
  EXPECT_EQ(
      PixelFormatSize(kPixelFormat_YUV_422_BiPlanar_10u_as16u, 480, 360),
      2 * UncompressedPixelFormatRowBytes(kPixelFormat_YUV_422_BiPlanar_10u_as16u, 480) * 360);
}

TEST(PixelFormatSize, OddWidthChromaRowsCoverTheLastColumn) {
  // 257 pixels need 129 chroma samples a row, more than one 128-byte unit.
  EXPECT_EQ(PixelFormatSize(kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, 257, 32),
            32u * (384 + 256) + 256);
}

TEST(PixelFormatSize, FrameHoldsEveryPlaneRow) {
  struct Size {
    int width;
    int height;
  };
  constexpr Size kSizes[] = {{1, 1},       {2, 2},    {3, 3},       {479, 359},
                             {1921, 1081}, {257, 31}, {4096, 2160}, {16384, 16384}};
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    if (pf->properties.IsDV()) continue;
    for (const Size& s : kSizes) {
      SCOPED_TRACE(testing::Message() << pf->fourCC << " " << s.width << "x" << s.height);
      const std::uint64_t size = PixelFormatSize(*pf, s.width, s.height);
      EXPECT_GE(static_cast<u128>(size), NeededFrameBytes(*pf, s.width, s.height));
      const std::uint64_t row = UncompressedPixelFormatRowBytes(*pf, s.width);
      if (row != 0) {
        const auto planes = static_cast<u128>(GetNumberOfPlanes(*pf));
        const auto height = static_cast<u128>(s.height);
        EXPECT_GE(static_cast<u128>(size), static_cast<u128>(row) * planes * height);
        EXPECT_GE(static_cast<u128>(row) * planes * height,
                  NeededFrameBytes(*pf, s.width, s.height));
      }
    }
  }
}

TEST(PixelFormatSize, FrameHoldsEveryPlaneRowExhaustive) {
  constexpr int kHeights[] = {1, 2, 3, 31, 32, 33, 359, 1081};
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    if (pf->properties.IsDV()) continue;
    for (int width = 1; width <= 4100; ++width) {
      for (int height : kHeights) {
        ASSERT_GE(static_cast<u128>(PixelFormatSize(*pf, width, height)),
                  NeededFrameBytes(*pf, width, height))
            << pf->fourCC << " " << width << "x" << height;
      }
    }
  }
}

TEST(PixelFormatSize, ZeroAndNegativeDimensionsGiveZero) {
  struct Size {
    int width;
    int height;
  };
  constexpr Size kSizes[] = {{0, 0},    {0, 480},     {640, 0},           {-1, 480},
                             {640, -1}, {-640, -480}, {INT_MIN, INT_MIN}, {INT_MIN, 1}};
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (const Size& s : kSizes) {
      SCOPED_TRACE(testing::Message() << pf->fourCC << " " << s.width << "x" << s.height);
      EXPECT_EQ(PixelFormatSize(*pf, s.width, s.height), 0u);
      if (s.width <= 0) {
        EXPECT_EQ(UncompressedPixelFormatRowBytes(*pf, s.width), 0u);
      }
    }
  }
}

TEST(PixelFormatSize, HugeDimensionsGiveZeroOrEnough) {
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    SCOPED_TRACE(pf->fourCC);
    const std::uint64_t size = PixelFormatSize(*pf, INT_MAX, INT_MAX);
    if (size != 0 && !pf->properties.IsDV()) {
      EXPECT_GE(static_cast<u128>(size), NeededFrameBytes(*pf, INT_MAX, INT_MAX));
    }
  }
  // 16 bytes a pixel over 2^62 pixels does not fit 64 bits.
  EXPECT_EQ(PixelFormatSize(kPixelFormat_BGRA_4444_32f, INT_MAX, INT_MAX), 0u);
  EXPECT_EQ(PixelFormatSize(kPixelFormat_ARGB_4444_32f_Planar, INT_MAX, INT_MAX), 0u);
  // 2 bytes a pixel does, exactly.
  EXPECT_EQ(PixelFormatSize(kPixelFormat_UYVY_422_8u, INT_MAX, INT_MAX),
            4294967296u * static_cast<std::uint64_t>(INT_MAX));
}

TEST(FixedSizedFormatDimensions, SetsDVGeometryOnly) {
  struct Case {
    PixelFormat format;
    int width;
    int height;
  };
  const Case kCases[] = {
      {kPixelFormat_NTSCDV25, 720, 480},           {kPixelFormat_PALDV25, 720, 576},
      {kPixelFormat_NTSCDV50, 720, 480},           {kPixelFormat_PALDV50, 720, 576},
      {kPixelFormat_NTSC_DV100_720p, 960, 720},    {kPixelFormat_PAL_DV100_720p, 960, 720},
      {kPixelFormat_NTSC_DV100_1080i, 1280, 1080}, {kPixelFormat_PAL_DV100_1080i, 1440, 1080},
      {kPixelFormat_BGRA_4444_8u, 123, -4},        {kPixelFormat_Any, 123, -4},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.format.fourCC);
    int width = 123;
    int height = -4;
    FixedSizedFormatDimensions(c.format, width, height);
    EXPECT_EQ(width, c.width);
    EXPECT_EQ(height, c.height);
  }
}

TEST(IsRectValidForFormat, DVNeedsItsSizeAndAPermittedRatio) {
  struct Case {
    PixelFormat format;
    int width;
    int height;
    PixelAspectRatio par;
    bool valid;
  };
  const Case kCases[] = {
      {kPixelFormat_NTSCDV25, 720, 480, {10, 11}, true},
      {kPixelFormat_NTSCDV25, 720, 480, {40, 33}, true},
      {kPixelFormat_NTSCDV25, 720, 486, {10, 11}, false},
      {kPixelFormat_NTSCDV25, 720, 480, {1, 1}, false},
      {kPixelFormat_NTSCDV25, 720, 480, {648, 720}, false},
      {kPixelFormat_PALDV50, 720, 576, {1024, 702}, true},
      {kPixelFormat_NTSC_DV100_1080i, 1280, 1080, {3, 2}, true},
      {kPixelFormat_PAL_DV100_1080i, 1440, 1080, {4, 3}, true},
      {kPixelFormat_NTSC_DV100_720p, 960, 720, {1, 1}, true},
      {kPixelFormat_NTSC_DV100_720p, 960, 720, {0, 1}, false},
      {kPixelFormat_BGRA_4444_8u, -5, 0, {0, 0}, true},
      {kPixelFormat_Invalid, 1, 1, {7, 0}, true},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.format.fourCC << " " << c.width << "x" << c.height);
    EXPECT_EQ(IsRectValidForFormat(c.format, c.width, c.height, c.par), c.valid);
  }
}

}  // namespace
}  // namespace zebmediatypes
