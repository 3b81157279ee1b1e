#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/pixel_format.h>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <string>
#include <type_traits>

namespace zebmediatypes {
namespace {

struct NamedRow {
  PixelFormat format;
  const char* suffix;
  const char* fourCC;
};

#define ROW(suffix, fourCC) \
  NamedRow { kPixelFormat_##suffix, #suffix, fourCC }

// The catalogue as its constants name it, in catalogue order.
const NamedRow kRows[] = {
    ROW(VUYA_4444_8u, "vuya"),
    ROW(VUYP_4444_8u, "vuyp"),
    ROW(VUYX_4444_8u, "vuyx"),
    ROW(VUYA_4444_8u_709, "VUYA"),
    ROW(VUYP_4444_8u_709, "vup7"),
    ROW(VUYX_4444_8u_709, "vux7"),
    ROW(VUYA_4444_15u, "Vuya"),
    ROW(VUYP_4444_15u, "Vuyp"),
    ROW(VUYX_4444_15u, "Vuyx"),
    ROW(VUYA_4444_32f, "VUya"),
    ROW(VUYP_4444_32f, "VUyp"),
    ROW(VUYX_4444_32f, "VUyx"),
    ROW(VUYA_4444_32f_709, "vUYa"),
    ROW(VUYP_4444_32f_709, "VUp7"),
    ROW(VUYX_4444_32f_709, "VUx7"),
    ROW(BGRA_4444_8u, "bgra"),
    ROW(BGRP_4444_8u, "bgrp"),
    ROW(BGRX_4444_8u, "bgrx"),
    ROW(BGRA_4444_15u, "Bgra"),
    ROW(BGRP_4444_15u, "Bgrp"),
    ROW(BGRX_4444_15u, "Bgrx"),
    ROW(BGRA_4444_32f, "BGra"),
    ROW(BGRP_4444_32f, "BGrp"),
    ROW(BGRX_4444_32f, "BGrx"),
    ROW(BGRA_4444_32f_Linear, "BGaL"),
    ROW(BGRP_4444_32f_Linear, "BGpL"),
    ROW(BGRX_4444_32f_Linear, "BGxL"),
    ROW(ARGB_4444_8u, "argb"),
    ROW(PRGB_4444_8u, "prgb"),
    ROW(XRGB_4444_8u, "xrgb"),
    ROW(ARGB_4444_15u, "Argb"),
    ROW(PRGB_4444_15u, "Prgb"),
    ROW(XRGB_4444_15u, "Xrgb"),
    ROW(ARGB_4444_32f, "ARgb"),
    ROW(PRGB_4444_32f, "PRgb"),
    ROW(XRGB_4444_32f, "XRgb"),
    ROW(ARGB_4444_32f_Linear, "ARgL"),
    ROW(PRGB_4444_32f_Linear, "PRgL"),
    ROW(XRGB_4444_32f_Linear, "XRgL"),
    ROW(ARGB_4444_32f_Planar, "ARgP"),
    ROW(RGB_444_32f_Planar, "RGBP"),
    ROW(RGB_444_10u, "RGB1"),
    ROW(UYVY_422_8u, "uyvy"),
    ROW(UYVY_422_8u_709, "uyv7"),
    ROW(YUYV_422_8u, "yuy2"),
    ROW(YUYV_422_8u_709, "yuy3"),
    ROW(UYVY_422_32f, "UYvy"),
    ROW(UYVY_422_32f_709, "UYv7"),
    ROW(YUYV_422_32f, "YUy2"),
    ROW(YUYV_422_32f_709, "YUy3"),
    ROW(V210_422_10u, "v210"),
    ROW(V210_422_10u_709, "v211"),
    ROW(V210_422_10u_709_FullRange, "v21f"),
    ROW(NTSCDV25, "dvn2"),
    ROW(PALDV25, "dvp2"),
    ROW(NTSCDV50, "dvn5"),
    ROW(PALDV50, "dvp5"),
    ROW(NTSC_DV100_720p, "dvn7"),
    ROW(PAL_DV100_720p, "dvp7"),
    ROW(NTSC_DV100_1080i, "dvn1"),
    ROW(PAL_DV100_1080i, "dvp1"),
    ROW(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601, "yvi2"),
    ROW(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, "yv12"),
    ROW(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange, "yvif"),
    ROW(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange, "yv1f"),
    ROW(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709, "yvi7"),
    ROW(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709, "yv17"),
    ROW(YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange, "yviF"),
    ROW(YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange, "yv1F"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601, "Yvi2"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601, "Yv12"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange, "Yvif"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange, "Yv1f"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709, "Yvi7"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709, "Yv17"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange, "YviF"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange, "Yv1F"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601, "nvi3"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601, "nv13"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601_FullRange, "nvi1"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601_FullRange, "nv11"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709, "nvi2"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, "nv12"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709_FullRange, "nvi0"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709_FullRange, "nv10"),
    ROW(YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601, "Nvi3"),
    ROW(YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601, "Nv13"),
    ROW(YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601_FullRange, "Nvi1"),
    ROW(YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601_FullRange, "Nv11"),
    ROW(YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709, "Nvi2"),
    ROW(YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, "Nv12"),
    ROW(YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709_FullRange, "Nvi0"),
    ROW(YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709_FullRange, "Nv10"),
    ROW(YUV_422_BiPlanar_10u_as16u, "Nv16"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_709, "p0i0"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, "p010"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_709_FullRange, "p0if"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709_FullRange, "p01f"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020, "P0i0"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020, "P010"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_FullRange, "P0if"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_FullRange, "P01f"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR, "POi0"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR, "PO10"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_FullRange, "POif"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_FullRange, "PO1f"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG, "Phl0"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG, "PHL0"),
    ROW(YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG_FullRange, "Phlf"),
    ROW(YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG_FullRange, "PHLf"),
    ROW(Y210_422_10u_as16u_709, "y210"),
    ROW(Y210_422_10u_as16u_709_FullRange, "y21f"),
};
#undef ROW

PixelFormatName Name(const char* text) {
  return MakePixelFormatName(text[0], text[1], text[2], text[3]);
}

bool Has(const std::string& s, const char* part) { return s.find(part) != std::string::npos; }
bool StartsWith(const std::string& s, const char* part) { return s.rfind(part, 0) == 0; }

// The fields a format's constant name states, read from the name alone.
struct StatedFields {
  bool isYUV = false;
  unsigned depth = 0;
  bool isFloat = false;
  unsigned primaries = 0;
  bool videoRange = false;
  unsigned alpha = 0;
  unsigned subsampling = 0;
  bool swapped = false;
  bool linear = false;
  unsigned packing = 0;
  unsigned interleaving = 0;
};

unsigned AlphaLetter(char c) { return c == 'A' ? 1 : c == 'P' ? 2 : c == 'X' ? 3 : 0; }

StatedFields FieldsFromName(const std::string& s) {
  StatedFields f;
  const char* kDVNames[] = {"NTSCDV25",       "PALDV25",          "NTSC_DV100_720p",
                            "PAL_DV100_720p", "NTSC_DV100_1080i", "PAL_DV100_1080i",
                            "NTSCDV50",       "PALDV50"};
  for (unsigned i = 0; i < std::size(kDVNames); ++i) {
    if (s == kDVNames[i]) {
      f.isYUV = true;
      f.videoRange = true;
      f.subsampling = 2;
      f.packing = i + 1;
      f.primaries = Has(s, "DV100") ? 1 : 0;
      return f;
    }
  }
  f.isYUV = StartsWith(s, "VUY") || StartsWith(s, "UYVY") || StartsWith(s, "YUYV") ||
            StartsWith(s, "V210") || StartsWith(s, "YUV") || StartsWith(s, "YVU") ||
            StartsWith(s, "Y210");
  if (Has(s, "_10u")) f.depth = 1;
  if (Has(s, "_15u")) f.depth = 2;
  if (Has(s, "_32f")) {
    f.depth = 5;
    f.isFloat = true;
  }
  f.primaries = Has(s, "2020_HDR") ? 3 : Has(s, "2020") ? 2 : Has(s, "709") ? 1 : f.isYUV ? 0 : 1;
  f.videoRange = f.isYUV && !Has(s, "FullRange");
  if (StartsWith(s, "ARGB") || StartsWith(s, "PRGB") || StartsWith(s, "XRGB")) {
    f.alpha = AlphaLetter(s[0]);
    f.swapped = true;
  } else if (StartsWith(s, "VUY") || StartsWith(s, "BGR")) {
    f.alpha = AlphaLetter(s[3]);
  }
  // The 16-bit-container 4:2:2 formats carry an alpha slot that is never used.
  if (Has(s, "_422") && Has(s, "10u_as16u")) f.alpha = 3;
  if (StartsWith(s, "YUYV") || StartsWith(s, "YVU") || StartsWith(s, "RGB_444_32f")) {
    f.swapped = true;
  }
  f.subsampling = Has(s, "_422") ? 1 : Has(s, "_420") ? 3 : 0;
  f.linear = Has(s, "_Linear");
  const char* kPackings[] = {"MPEG2_FIELD_PICTURE_PLANAR",   "MPEG2_FRAME_PICTURE_PLANAR",
                             "MPEG4_FIELD_PICTURE_PLANAR",   "MPEG4_FRAME_PICTURE_PLANAR",
                             "MPEG4_FIELD_PICTURE_BIPLANAR", "MPEG4_FRAME_PICTURE_BIPLANAR"};
  for (unsigned i = 0; i < std::size(kPackings); ++i) {
    if (Has(s, kPackings[i])) f.packing = 9 + i;
  }
  f.interleaving = Has(s, "_Planar") ? 2 : Has(s, "_BiPlanar") ? 1 : 0;
  return f;
}

TEST(PixelFormat, IsAnEightByteValue) {
  static_assert(std::is_trivially_copyable_v<PixelFormat>);
  static_assert(sizeof(PixelFormat) == 8);
  static_assert(PixelFormat() == kPixelFormat_Invalid);
  static_assert(MakePixelFormatName("badf") == 0x66646162u);
}

TEST(PixelFormatCatalogue, HoldsTheBuiltInFormatsInOrder) {
  ASSERT_EQ(AllPixelFormatsEnd() - AllPixelFormatsBegin(), static_cast<std::ptrdiff_t>(112));
  ASSERT_EQ(std::size(kRows), 112u);
  for (std::size_t i = 0; i < std::size(kRows); ++i) {
    SCOPED_TRACE(kRows[i].suffix);
    EXPECT_EQ(AllPixelFormatsBegin()[i], kRows[i].format);
    EXPECT_EQ(kRows[i].format.fourCC, Name(kRows[i].fourCC));
    EXPECT_TRUE(kRows[i].format.properties.IsSpecific());
  }
}

TEST(PixelFormatProperties, EveryRowDecodesToTheFieldsItsNameStates) {
  for (const NamedRow& row : kRows) {
    SCOPED_TRACE(row.suffix);
    const PixelFormatProperties p = row.format.properties;
    StatedFields want = FieldsFromName(row.suffix);
    // The one RGB row whose word keeps the unswapped (BGR) order.
    if (std::string(row.suffix) == "RGB_444_10u") want.swapped = false;
    // The 4:2:2 biplanar row is Rec. 709 though its name does not say so.
    if (std::string(row.suffix) == "YUV_422_BiPlanar_10u_as16u") want.primaries = 1;
    EXPECT_EQ(p.isYUV(), want.isYUV);
    EXPECT_EQ(p.depth(), want.depth);
    EXPECT_EQ(p.isFloat(), want.isFloat);
    EXPECT_EQ(p.primaries(), want.primaries);
    EXPECT_EQ(p.videoRange(), want.videoRange);
    EXPECT_EQ(p.alpha(), want.alpha);
    EXPECT_EQ(p.subsampling(), want.subsampling);
    EXPECT_EQ(p.swapped(), want.swapped);
    EXPECT_EQ(p.linear(), want.linear);
    EXPECT_EQ(p.packing(), want.packing);
    EXPECT_EQ(p.validity(), kPixelFormatValidity_Specific);
    EXPECT_EQ(p.interleaving(), want.interleaving);
    EXPECT_EQ(p.Word() >> 23, 0u);
  }
}

TEST(PixelFormatProperties, SettersChangeOnlyTheirField) {
  const PixelFormatProperties base(0x00080881);  // uyvy
  struct Case {
    const char* name;
    PixelFormatProperties changed;
    std::uint32_t word;
  };
  const Case kCases[] = {
      {"isYUV", PixelFormatProperties(base).SetIsYUV(false), 0x00080880},
      {"depth", PixelFormatProperties(base).SetDepth(5), 0x0008088B},
      {"depth masked", PixelFormatProperties(base).SetDepth(9), 0x00080883},
      {"alpha", PixelFormatProperties(base).SetAlpha(3), 0x00080B81},
      {"packing", PixelFormatProperties(base).SetPacking(15), 0x000F8881},
      {"validity", PixelFormatProperties(base).SetValidity(2), 0x00100881},
      {"interleaving", PixelFormatProperties(base).SetInterleaving(2), 0x00480881},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    EXPECT_EQ(c.changed.Word(), c.word);
  }
}

TEST(LookupPropertiesForName, FindsCatalogueRowsAndRejectsOthers) {
  struct Case {
    std::uint32_t name;
    std::uint32_t word;
  };
  const Case kCases[] = {
      {0, 0x00178000},
      {kPixelFormatFourCC_Invalid, 0x00078000},
      {Name("vuya"), 0x080181},
      {Name("PO10"), 0x0F18E3},
      {Name("PHL0"), 0x0F18E3},
      {Name("y21f"), 0x080B23},
      {Name("zzzz"), 0x00078000},  // unknown
      {Name("VUYa"), 0x00078000},  // case matters
      {Name("_nop"), 0x00078000},  // custom, never registered
      {Name("@nop"), 0x00078000},
      {0xFFFFFFFFu, 0x00078000},
      {1, 0x00078000},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    EXPECT_EQ(LookupPropertiesForName(static_cast<PixelFormatName>(c.name)).Word(), c.word);
  }
}

TEST(GuessNameForProperties, FindsTheFirstRowOfAWord) {
  struct Case {
    std::uint32_t word;
    std::uint32_t name;
  };
  const Case kCases[] = {
      {0x0E98E3, Name("POi0")},  // shared with Phl0: the earlier row wins
      {0x0F1863, Name("PO1f")},  // shared with PHLf
      {0x00178000, 0},
      {0x00100000, 0},  // validity 2 whatever else is set
      {0x00078000, kPixelFormatFourCC_Invalid},
      {0x00000000, kPixelFormatFourCC_Invalid},  // validity 0
      {0x000F8881, kPixelFormatFourCC_Invalid},  // uyvy with packing 15
      {0x00180881, kPixelFormatFourCC_Invalid},  // uyvy with validity 3
      {0x00080981, kPixelFormatFourCC_Invalid},  // uyvy with straight alpha
      {0x00880881, kPixelFormatFourCC_Invalid},  // uyvy with a reserved bit
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.word);
    EXPECT_EQ(GuessNameForProperties(PixelFormatProperties(c.word)), c.name);
  }
}

TEST(PixelFormat, NameAndPropertiesRoundTripOverTheCatalogue) {
  for (std::size_t i = 0; i < std::size(kRows); ++i) {
    const NamedRow& row = kRows[i];
    SCOPED_TRACE(row.suffix);
    EXPECT_EQ(PixelFormat(row.format.fourCC), row.format);
    const PixelFormat fromWord(row.format.properties);
    if (Has(row.suffix, "HLG")) {
      // The word cannot tell HLG from HDR: it resolves to the HDR row four
      // rows earlier.
      EXPECT_EQ(fromWord, kRows[i - 4].format);
      EXPECT_TRUE(Has(kRows[i - 4].suffix, "HDR"));
    } else {
      EXPECT_EQ(fromWord, row.format);
    }
  }
}

TEST(PixelFormat, FromPropertiesGivesARowAnyOrInvalid) {
  struct Case {
    std::uint32_t word;
    PixelFormat want;
  };
  const Case kCases[] = {
      {0x00178000, kPixelFormat_Any},
      {0x00100000, kPixelFormat_Any},
      {0x00078000, kPixelFormat_Invalid},
      {0x00080981, kPixelFormat_Invalid},
      {0x0F18E3, kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.word);
    EXPECT_EQ(PixelFormat(PixelFormatProperties(c.word)), c.want);
  }
}

TEST(CustomPixelFormatRegistry, LatestRegistrationWins) {
  const auto name = Name("_reg");
  EXPECT_EQ(LookupPropertiesForName(name), kPixelFormatProperties_Invalid);
  RegisterCustomPixelFormatProperties(name, kPixelFormat_BGRA_4444_8u.properties);
  EXPECT_EQ(LookupPropertiesForName(name), kPixelFormat_BGRA_4444_8u.properties);
  RegisterCustomPixelFormatProperties(name, PixelFormatProperties(0x00000123));
  EXPECT_EQ(LookupPropertiesForName(name).Word(), 0x00000123u);
  EXPECT_EQ(LookupPropertiesForName(Name("@reg")), kPixelFormatProperties_Invalid);
}

TEST(CustomPixelFormatRegistry, FindReturnsTheSmallestFourCCOfAWord) {
  const PixelFormatProperties word(0x00012345);
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), kPixelFormatFourCC_Invalid);
  RegisterCustomPixelFormatProperties(Name("_zzz"), word);
  RegisterCustomPixelFormatProperties(Name("@zzz"), word);
  RegisterCustomPixelFormatProperties(Name("_aaa"), word);
  // "_aaa" is 0x6161615F, the smallest of the three as a number.
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), Name("_aaa"));
  // The catalogue is not searched.
  EXPECT_EQ(FindCustomPixelFormatByProperties(kPixelFormat_UYVY_422_8u.properties),
            kPixelFormatFourCC_Invalid);
}

TEST(CustomPixelFormatRegistry, CustomWordsDoNotBuildACustomFormat) {
  const auto name = Name("_cpf");
  RegisterCustomPixelFormatProperties(name, PixelFormatProperties(0x00080981));
  EXPECT_EQ(PixelFormat(name).properties.Word(), 0x00080981u);
  EXPECT_EQ(PixelFormat(PixelFormatProperties(0x00080981)), kPixelFormat_Invalid);
  RegisterCustomPixelFormatProperties(Name("_cp2"), kPixelFormat_UYVY_422_8u.properties);
  EXPECT_EQ(PixelFormat(kPixelFormat_UYVY_422_8u.properties), kPixelFormat_UYVY_422_8u);
}

TEST(CustomPixelFormatRegistry, NonCustomFourCCIsReportedAndNotStored) {
  const PixelFormatProperties word(0x00054321);
  zebcore::debug::ScopedAssertionCapture capture;
  RegisterCustomPixelFormatProperties(Name("xreg"), word);
  RegisterCustomPixelFormatProperties(Name("bgra"), word);
  RegisterCustomPixelFormatProperties(0, word);
  EXPECT_EQ(capture.Count(), 3u);
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), kPixelFormatFourCC_Invalid);
  EXPECT_EQ(LookupPropertiesForName(Name("bgra")), kPixelFormat_BGRA_4444_8u.properties);
}

TEST(PixelFormatLayout, InterleavingPlanesAndBytesPerPixel) {
  struct Case {
    PixelFormat format;
    Interleaving interleaving;
    int planes;
    int bytesPerPixel;
  };
  const Case kCases[] = {
      {kPixelFormat_YUV_422_BiPlanar_10u_as16u, kInterleavedChroma, 2, 2},
      {kPixelFormat_ARGB_4444_32f_Planar, kPlanar, 4, 4},
      {kPixelFormat_RGB_444_32f_Planar, kPlanar, 3, 4},
      {kPixelFormat_BGRA_4444_8u, kInterleaved, 1, 4},
      {kPixelFormat_BGRA_4444_15u, kInterleaved, 1, 8},
      {kPixelFormat_BGRA_4444_32f, kInterleaved, 1, 16},
      {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, kInterleaved, 1, 0},
      {kPixelFormat_UYVY_422_8u, kInterleaved, 1, 2},
      {kPixelFormat_UYVY_422_32f, kInterleaved, 1, 8},
      {kPixelFormat_Y210_422_10u_as16u_709, kInterleaved, 1, 4},
      {kPixelFormat_RGB_444_10u, kInterleaved, 1, 4},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, kInterleaved, 1, 4},
      {kPixelFormat_V210_422_10u, kInterleaved, 1, 0},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, kInterleaved, 1, 0},
      {kPixelFormat_NTSCDV25, kInterleaved, 1, 0},
      {kPixelFormat_Any, kInterleaved, 1, 0},
      {kPixelFormat_Invalid, kInterleaved, 1, 0},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.format.fourCC);
    EXPECT_EQ(GetInterleavingType(c.format), c.interleaving);
    EXPECT_EQ(GetNumberOfPlanes(c.format), c.planes);
    EXPECT_EQ(GetBytesPerPixel(c.format), c.bytesPerPixel);
  }
}

TEST(PixelFormatLayout, OnlyThreeRowsAreNotInterleaved) {
  int notInterleaved = 0;
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    if (GetInterleavingType(*pf) != kInterleaved) ++notInterleaved;
  }
  EXPECT_EQ(notInterleaved, 3);
}

TEST(TranslateFourCC, MapsCodecAliasesOntoTheirFamily) {
  struct Case {
    unsigned int code;
    unsigned int want;
  };
  constexpr Case kCases[] = {
      {0x63766130, 0x63766130}, {0x63766131, 0x61766369},
      {0x63766133, 0x61766369}, {0x63766134, 0x61766369},
      {0x63766135, 0x63766135}, {0x4D435054, 0x4D504547},
      {0x61766331, 0x61766331}, {0, 0},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.code);
    EXPECT_EQ(TranslateFourCC(c.code), c.want);
  }
}

}  // namespace
}  // namespace zebmediatypes
