#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/pixel_format.h>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <string>
#include <tuple>
#include <utility>

namespace zebmediatypes {
namespace {

struct NamedFormat {
  PixelFormat format;
  const char* name;  // the constant's name without its kPixelFormat_ prefix
};

// The built-in constants in catalogue order, by name only: what each word
// holds is read back from the name (WordFromName) rather than restated here.
#define N(s) \
  NamedFormat { kPixelFormat_##s, #s }
#define APX(pre, post) N(pre##A##post), N(pre##P##post), N(pre##X##post)
#define FF(pre, post) N(pre##_FIELD_PICTURE_##post), N(pre##_FRAME_PICTURE_##post)
// clang-format off
constexpr NamedFormat kFormats[] = {
    APX(VUY, _4444_8u), APX(VUY, _4444_8u_709), APX(VUY, _4444_15u), APX(VUY, _4444_32f), APX(VUY, _4444_32f_709), APX(BGR, _4444_8u),
    APX(BGR, _4444_15u), APX(BGR, _4444_32f), APX(BGR, _4444_32f_Linear), APX(, RGB_4444_8u), APX(, RGB_4444_15u), APX(, RGB_4444_32f),
    APX(, RGB_4444_32f_Linear), N(ARGB_4444_32f_Planar), N(RGB_444_32f_Planar), N(RGB_444_10u), N(UYVY_422_8u), N(UYVY_422_8u_709),
    N(YUYV_422_8u), N(YUYV_422_8u_709), N(UYVY_422_32f), N(UYVY_422_32f_709), N(YUYV_422_32f), N(YUYV_422_32f_709),
    N(V210_422_10u), N(V210_422_10u_709), N(V210_422_10u_709_FullRange), N(NTSCDV25), N(PALDV25), N(NTSCDV50), N(PALDV50),
    N(NTSC_DV100_720p), N(PAL_DV100_720p), N(NTSC_DV100_1080i), N(PAL_DV100_1080i),
    FF(YUV_420_MPEG2, PLANAR_8u_601), FF(YUV_420_MPEG2, PLANAR_8u_601_FullRange), FF(YUV_420_MPEG2, PLANAR_8u_709),
    FF(YUV_420_MPEG2, PLANAR_8u_709_FullRange), FF(YUV_420_MPEG4, PLANAR_8u_601), FF(YUV_420_MPEG4, PLANAR_8u_601_FullRange),
    FF(YUV_420_MPEG4, PLANAR_8u_709), FF(YUV_420_MPEG4, PLANAR_8u_709_FullRange), FF(YUV_420_MPEG4, BIPLANAR_8u_601),
    FF(YUV_420_MPEG4, BIPLANAR_8u_601_FullRange), FF(YUV_420_MPEG4, BIPLANAR_8u_709), FF(YUV_420_MPEG4, BIPLANAR_8u_709_FullRange),
    FF(YVU_420_MPEG4, BIPLANAR_8u_601), FF(YVU_420_MPEG4, BIPLANAR_8u_601_FullRange), FF(YVU_420_MPEG4, BIPLANAR_8u_709),
    FF(YVU_420_MPEG4, BIPLANAR_8u_709_FullRange),
    N(YUV_422_BiPlanar_10u_as16u),
    FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_709), FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_709_FullRange), FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_2020),
    FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_2020_FullRange), FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_2020_HDR),
    FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_2020_HDR_FullRange), FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_2020_HDR_HLG),
    FF(YUV_420_MPEG4, BIPLANAR_10u_as16u_2020_HDR_HLG_FullRange),
    N(Y210_422_10u_as16u_709), N(Y210_422_10u_as16u_709_FullRange),
};
// clang-format on
#undef FF
#undef APX
#undef N
static_assert(std::size(kFormats) == 112);

// Their FourCCs in the same order: names that stored files and peers rely on.
// clang-format off
constexpr char kFourCCs[] =
    "vuyavuypvuyxVUYAvup7vux7VuyaVuypVuyxVUyaVUypVUyxvUYaVUp7VUx7bgrabgrpbgrxBgraBgrpBgrxBGraBGrpBGrxBGaLBGpLBGxLargb"
    "prgbxrgbArgbPrgbXrgbARgbPRgbXRgbARgLPRgLXRgLARgPRGBPRGB1uyvyuyv7yuy2yuy3UYvyUYv7YUy2YUy3v210v211v21fdvn2dvp2dvn5"
    "dvp5dvn7dvp7dvn1dvp1yvi2yv12yvifyv1fyvi7yv17yviFyv1FYvi2Yv12YvifYv1fYvi7Yv17YviFYv1Fnvi3nv13nvi1nv11nvi2nv12nvi0"
    "nv10Nvi3Nv13Nvi1Nv11Nvi2Nv12Nvi0Nv10Nv16p0i0p010p0ifp01fP0i0P010P0ifP01fPOi0PO10POifPO1fPhl0PHL0PhlfPHLfy210y21f";
// clang-format on
static_assert(sizeof(kFourCCs) == 4 * 112 + 1);

bool Has(const std::string& s, const char* part) { return s.find(part) != std::string::npos; }
bool StartsWith(const std::string& s, const char* part) { return s.rfind(part, 0) == 0; }

// The properties word a constant's name states, read from the name alone.
PixelFormatProperties WordFromName(const std::string& s) {
  PixelFormatProperties p(0);
  p.SetValidity(kPixelFormatValidity_Specific);
  if (Has(s, "DV")) {
    const unsigned packing = Has(s, "DV25") ? 1 : Has(s, "720p") ? 3 : Has(s, "1080i") ? 5 : 7;
    p.SetIsYUV(true).SetVideoRange(true).SetSubsampling(kPixelFormatSubsampling_DV);
    return p.SetPacking(packing + (StartsWith(s, "PAL") ? 1 : 0)).SetPrimaries(Has(s, "DV100"));
  }
  const bool yuv = !Has(s, "RGB") && !StartsWith(s, "BGR");
  p.SetIsYUV(yuv).SetVideoRange(yuv && !Has(s, "FullRange")).SetLinear(Has(s, "_Linear"));
  p.SetDepth(Has(s, "_10u") ? 1 : Has(s, "_15u") ? 2 : Has(s, "_32f") ? 5 : 0);
  p.SetIsFloat(Has(s, "_32f"));
  // The 4:2:2 biplanar format is Rec. 709 though its name does not say so.
  const bool is709 = Has(s, "709") || !yuv || StartsWith(s, "YUV_422_BiPlanar");
  p.SetPrimaries(Has(s, "2020_HDR") ? 3 : Has(s, "2020") ? 2 : is709 ? 1 : 0);
  const char letter = Has(s, "RGB_4444") ? s[0] : s[3];  // ARGB..., VUYA..., BGRA...
  p.SetAlpha(letter == 'A' ? 1 : letter == 'P' ? 2 : letter == 'X' ? 3 : 0);
  // The 16-bit-container 4:2:2 formats carry an alpha slot that is never used.
  if (Has(s, "_422") && Has(s, "10u_as16u")) p.SetAlpha(kPixelFormatAlpha_Ignored);
  p.SetSubsampling(Has(s, "_422") ? 1 : Has(s, "_420") ? 3 : 0);
  p.SetSwapped((Has(s, "RGB") && !Has(s, "_10u")) || StartsWith(s, "YUYV") || StartsWith(s, "YVU"));
  if (Has(s, "_PICTURE_"))
    p.SetPacking(9 + (Has(s, "MPEG4") ? 2 : 0) + (Has(s, "BIPLANAR") ? 2 : 0) + Has(s, "FRAME"));
  p.SetInterleaving(Has(s, "_Planar") ? 2 : Has(s, "_BiPlanar") ? 1 : 0);
  return p;
}

TEST(PixelFormatCatalogue, EveryFormatDecodesToTheFieldsItsNameStatesAndRoundTrips) {
  ASSERT_EQ(AllPixelFormatsEnd() - AllPixelFormatsBegin(), std::ptrdiff_t{112});
  for (std::size_t i = 0; i < std::size(kFormats); ++i) {
    const PixelFormat& pf = kFormats[i].format;
    SCOPED_TRACE(kFormats[i].name);
    EXPECT_EQ(AllPixelFormatsBegin()[i], pf) << "catalogue order";
    const char* fourCC = kFourCCs + 4 * i;
    EXPECT_EQ(pf.fourCC, MakePixelFormatName(fourCC[0], fourCC[1], fourCC[2], fourCC[3]));
    EXPECT_EQ(pf.properties.Word(), WordFromName(kFormats[i].name).Word());
    EXPECT_EQ(PixelFormat(pf.fourCC), pf);
    // The word cannot tell HLG from HDR: an HLG row resolves to the HDR row four rows earlier.
    EXPECT_EQ(PixelFormat(pf.properties),
              Has(kFormats[i].name, "HLG") ? kFormats[i - 4].format : pf);
  }
}

TEST(LookupPropertiesForName, FindsCatalogueRowsAndRejectsOthers) {
  // clang-format off
  const std::pair<std::uint32_t, std::uint32_t> kCases[] = {
      {0, 0x00178000}, {kPixelFormatFourCC_Invalid, 0x00078000}, {MakePixelFormatName("PHL0"), 0x0F18E3}, {0xFFFFFFFFu, 0x00078000},
      {MakePixelFormatName("VUYa"), 0x00078000}, {MakePixelFormatName("_nop"), 0x00078000}, {MakePixelFormatName("@nop"), 0x00078000},  // case; not registered
  };
  // clang-format on
  for (const auto& [name, word] : kCases)
    EXPECT_EQ(LookupPropertiesForName(static_cast<PixelFormatName>(name)).Word(), word) << name;
}

TEST(GuessNameForProperties, WildcardAndMalformedWords) {
  const PixelFormat invalid = kPixelFormat_Invalid;
  // The format is also what PixelFormat(word) builds.
  // clang-format off
  const std::pair<std::uint32_t, PixelFormat> kCases[] = {
      {0x00178000, kPixelFormat_Any}, {0x00100000, kPixelFormat_Any}, {0x00078000, invalid}, {0x00000000, invalid},  // validity 2; 0
      {0x000F8881, invalid}, {0x00180881, invalid}, {0x00080981, invalid}, {0x00880881, invalid},  // uyvy: packing 15, validity 3, straight alpha, reserved bit
  };
  // clang-format on
  for (const auto& [word, format] : kCases) {
    SCOPED_TRACE(word);
    EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(word)), format.fourCC);
    EXPECT_EQ(PixelFormat(PixelFormatProperties(word)), format);
  }
}

// The first catalogue row whose field equals `key`, by a plain scan in catalogue order.
template <class Field>
const PixelFormat* Scan(std::uint32_t key, Field field) {
  return std::find_if(AllPixelFormatsBegin(), AllPixelFormatsEnd(),
                      [&](const PixelFormat& pf) { return field(pf) == key; });
}

TEST(LookupPropertiesForName, AgreesWithAScanInCatalogueOrder) {
  // Every catalogue name with one of its bytes replaced by every value.
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (unsigned shift = 0; shift < 32; shift += 8) {
      for (std::uint32_t byte = 0; byte < 256; ++byte) {
        const std::uint32_t name = (pf->fourCC & ~(0xFFu << shift)) | byte << shift;
        const PixelFormat* row = Scan(name, [](const PixelFormat& f) { return f.fourCC; });
        if (name == 0 || name == kPixelFormatFourCC_Invalid || IsCustomPixelFormatName(name))
          continue;
        const PixelFormatProperties want =
            row != AllPixelFormatsEnd() ? row->properties : kPixelFormatProperties_Invalid;
        ASSERT_EQ(LookupPropertiesForName(static_cast<PixelFormatName>(name)), want) << name;
      }
    }
  }
}

TEST(GuessNameForProperties, AgreesWithAScanInCatalogueOrderExhaustive) {
  // Every word with the reserved bits clear.
  for (std::uint32_t word = 0; word < (1u << 23); ++word) {
    const PixelFormatProperties p(word);
    std::uint32_t want = kPixelFormatFourCC_Invalid;
    if (p.validity() == kPixelFormatValidity_Any) {
      want = kPixelFormatFourCC_Any;
    } else if (p.validity() != kPixelFormatValidity_Invalid &&
               p.packing() != kPixelFormatPacking_None) {
      const PixelFormat* row = Scan(word, [](const PixelFormat& f) { return f.properties.Word(); });
      if (row != AllPixelFormatsEnd()) want = row->fourCC;
    }
    ASSERT_EQ(GuessNameForProperties(p), want) << word;
  }
}

TEST(CustomPixelFormatRegistry, LatestRegistrationWinsAndOnlyCustomWordsAreFound) {
  const auto name = MakePixelFormatName("_reg");
  EXPECT_EQ(LookupPropertiesForName(name), kPixelFormatProperties_Invalid);
  RegisterCustomPixelFormatProperties(name, kPixelFormat_BGRA_4444_8u.properties);
  RegisterCustomPixelFormatProperties(name, PixelFormatProperties(0x00080981));
  EXPECT_EQ(PixelFormat(name).properties.Word(), 0x00080981u);
  EXPECT_EQ(LookupPropertiesForName(MakePixelFormatName("@reg")), kPixelFormatProperties_Invalid);
  // A custom word does not build a format from its word, and a custom row
  // sharing a built-in word does not displace the built-in row.
  EXPECT_EQ(PixelFormat(PixelFormatProperties(0x00080981)), kPixelFormat_Invalid);
  RegisterCustomPixelFormatProperties(MakePixelFormatName("_cp2"),
                                      kPixelFormat_YUYV_422_8u.properties);
  EXPECT_EQ(PixelFormat(kPixelFormat_YUYV_422_8u.properties), kPixelFormat_YUYV_422_8u);
}

TEST(CustomPixelFormatRegistry, FindReturnsTheSmallestFourCCOfAWord) {
  const PixelFormatProperties word(0x00012345);
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), kPixelFormatFourCC_Invalid);
  for (const char* n : {"_zzz", "@zzz", "_aaa"})
    RegisterCustomPixelFormatProperties(MakePixelFormatName(n[0], n[1], n[2], n[3]), word);
  // "_aaa" is 0x6161615F, the smallest of the three as a number.
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), MakePixelFormatName("_aaa"));
  // The catalogue is not searched.
  EXPECT_EQ(FindCustomPixelFormatByProperties(kPixelFormat_UYVY_422_8u.properties),
            kPixelFormatFourCC_Invalid);
}

TEST(CustomPixelFormatRegistry, NonCustomFourCCIsReportedAndNotStored) {
  const PixelFormatProperties word(0x00054321);
  zebcore::debug::ScopedAssertionCapture capture;
  for (const char* n : {"xreg", "bgra", "\0\0\0\0"})
    RegisterCustomPixelFormatProperties(MakePixelFormatName(n[0], n[1], n[2], n[3]), word);
  EXPECT_EQ(capture.Count(), 3u);
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), kPixelFormatFourCC_Invalid);
  EXPECT_EQ(LookupPropertiesForName(MakePixelFormatName("bgra")),
            kPixelFormat_BGRA_4444_8u.properties);
}

TEST(PixelFormatLayout, InterleavingPlanesAndBytesPerPixel) {
  // clang-format off
  struct Case { PixelFormat format; Interleaving interleaving; int planes, bytesPerPixel; };
  const Case kCases[] = {
      {kPixelFormat_YUV_422_BiPlanar_10u_as16u, kInterleavedChroma, 2, 2}, {kPixelFormat_ARGB_4444_32f_Planar, kPlanar, 4, 4},
      {kPixelFormat_RGB_444_32f_Planar, kPlanar, 3, 4}, {kPixelFormat_BGRA_4444_8u, kInterleaved, 1, 4}, {kPixelFormat_BGRA_4444_15u, kInterleaved, 1, 8},
      {kPixelFormat_BGRA_4444_32f, kInterleaved, 1, 16}, {kPixelFormat_UYVY_422_8u, kInterleaved, 1, 2}, {kPixelFormat_UYVY_422_32f, kInterleaved, 1, 8},
      {kPixelFormat_Y210_422_10u_as16u_709, kInterleaved, 1, 4}, {kPixelFormat_RGB_444_10u, kInterleaved, 1, 4},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, kInterleaved, 1, 4},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, kInterleaved, 1, 0},
      {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, kInterleaved, 1, 0}, {kPixelFormat_V210_422_10u, kInterleaved, 1, 0},
      {kPixelFormat_NTSCDV25, kInterleaved, 1, 0}, {kPixelFormat_Any, kInterleaved, 1, 0}, {kPixelFormat_Invalid, kInterleaved, 1, 0},
  };
  // clang-format on
  for (const Case& c : kCases)
    EXPECT_EQ(std::make_tuple(GetInterleavingType(c.format), GetNumberOfPlanes(c.format),
                              GetBytesPerPixel(c.format)),
              std::make_tuple(c.interleaving, c.planes, c.bytesPerPixel))
        << c.format.fourCC;
}

TEST(TranslateFourCC, MapsCodecAliasesOntoTheirFamily) {
  // cva0 and cva5 lie just outside the alias range.
  // clang-format off
  const unsigned int kCases[][2] = {{0x63766130, 0x63766130}, {0x63766131, 0x61766369}, {0x63766134, 0x61766369},
                                    {0x63766135, 0x63766135}, {0x4D435054, 0x4D504547}, {0, 0}};
  // clang-format on
  for (const auto& [in, out] : kCases) EXPECT_EQ(TranslateFourCC(in), out) << in;
}

}  // namespace
}  // namespace zebmediatypes
