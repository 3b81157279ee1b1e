#include <gtest/gtest.h>
#include <zebcore/localizer.h>
#include <zebmediatypes/pixel_format_selection.h>
#include <zebmediatypes/video_descriptions.h>

#include <array>
#include <sstream>
#include <string>
#include <utility>

namespace zebmediatypes {
namespace {

std::string Text(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

TEST(PixelFormatDescription, NamesTheLayoutInWords) {
  // clang-format off
  const std::pair<PixelFormat, const char*> kCases[] = {
      {kPixelFormat_BGRA_4444_8u, "BGRA 4444 8u Full Range"}, {kPixelFormat_VUYA_4444_8u, "VUYA 4444 8u 601"},
      {kPixelFormat_VUYA_4444_8u_709, "VUYA 4444 8u 709"}, {kPixelFormat_UYVY_422_8u, "VUY 422 8u 601"},
      {kPixelFormat_YUYV_422_8u, "YUV 422 8u 601"}, {kPixelFormat_ARGB_4444_8u, "ARGB 4444 8u Full Range"},
      {kPixelFormat_PRGB_4444_15u, "PRGB 4444 15u Full Range"}, {kPixelFormat_RGB_444_10u, "BGR 4444 10u Full Range"},
      {kPixelFormat_RGB_444_32f_Planar, "RGB 4444 32f Full Range"}, {kPixelFormat_BGRA_4444_32f_Linear, "BGRA 4444 32f Linear Full Range"},
      {kPixelFormat_V210_422_10u_709_FullRange, "VUY 422 10u 709 Full Range"}, {kPixelFormat_YUV_422_BiPlanar_10u_as16u, "VUYX 422 10u 709"},
      {kPixelFormat_NTSCDV25, "NTSC DV"}, {kPixelFormat_PAL_DV100_1080i, "PAL DV 100 (1080i)"}, {kPixelFormat_PALDV50, "PAL DV 50"},
      {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, "YUV 420 MPEG2 Frame 8u 601"},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709_FullRange, "YUV 420 MPEG4 Frame BiPlanar 8u 709 Full Range"},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR, "YUV 420 MPEG4 Frame BiPlanar 10u 2020 HDR"},
      {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601, "YUV 420 MPEG4 Field 8u 601"},
      {kPixelFormat_Any, "Any Pixel Format"}, {kPixelFormat_Invalid, "Unknown Pixel Format"},
      {PixelFormat(MakePixelFormatName("_abc"), kPixelFormat_BGRA_4444_8u.properties), "Custom Pixel Format (cba_)"},
      {PixelFormat(MakePixelFormatName("@\x01\x80z"), kPixelFormatProperties_Invalid), "Custom Pixel Format (z? @)"},
      {PixelFormat(MakePixelFormatName("qqqq"), PixelFormatProperties(0x000F8001)), "Unknown Compressed Pixel Format (qqqq)"},
  };
  // clang-format on
  for (const auto& [format, text] : kCases) {
    SCOPED_TRACE(text);
    std::ostringstream narrow;
    zebcore::string::oUTF16StringStream wide;
    narrow << format;
    wide << format;
    EXPECT_EQ((std::array{Text(PixelFormatDescription(format)), narrow.str(), Text(wide.str())}),
              (std::array<std::string, 3>{text, text, text}));
  }
}

TEST(PixelFormatDescription, EveryCatalogueRowHasATidyDescription) {
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    const std::string text = Text(PixelFormatDescription(*pf));
    EXPECT_TRUE(!text.empty() && text.back() != ' ' && text.find("  ") == std::string::npos &&
                text.find("Unknown") == std::string::npos)
        << pf->fourCC << " " << text;
  }
}

TEST(PixelFormatDescription, UsesTheLocalizer) {
  zebcore::config::Localizer::Get().InstallTranslations(
      {{"$$$/zebmediatypes/PixelFormat/FullRange", u"Plein"}});
  const std::string text = Text(PixelFormatDescription(kPixelFormat_BGRA_4444_8u));
  zebcore::config::Localizer::Get().ClearTranslations();
  EXPECT_EQ(text, "BGRA 4444 8u Plein");
}

TEST(GetFourCCDescriptiveName, GivesTheCatalogueNameOrInvalid) {
  // clang-format off
  const std::pair<const char*, const char*> kCases[] = {
      {"nv12", "NV12_MPEG4_FRAME_709"}, {"Nv16", "P210_422_BIPLANAR_10"}, {"POi0", "P010_MPEG4_FIELD_HDR"}, {"vuya", "VUYA_4444_8u"},
      {"Phl0", "P010_MPEG4_FIELD_HDR_HLG"}, {"PHLf", "P010_MPEG4_FRAME_FullRange_HLG"}, {"v21f", "Invalid"}, {"y210", "Invalid"},
      {"y21f", "Invalid"}, {"zzzz", "Invalid"}, {"_abc", "Invalid"}, {"badf", "Invalid"}, {"\0\0\0\0", "Invalid"},
  };
  // clang-format on
  for (const auto& [n, text] : kCases) {
    const std::string got = zebcore::string::ToStdString(
        GetFourCCDescriptiveName(MakePixelFormatName(n[0], n[1], n[2], n[3])));
    EXPECT_EQ(got, text) << n;
  }
}

TEST(AlphaDescription, NamesStraightAndPremultiplied) {
  const std::pair<int, const char*> kCases[] = {
      {1, "Straight Alpha"}, {2, "Premultiplied Alpha"}, {0, "None"}, {3, "None"}, {-1, "None"}};
  for (const auto& [alpha, text] : kCases)
    EXPECT_EQ(Text(AlphaDescription(static_cast<AlphaChannel>(alpha))), text) << text;
}

TEST(FieldTypeDescription, LocalizedAndFixedTexts) {
  // clang-format off
  struct Case { int type; const char* localized; const char* fixed; };
  const Case kCases[] = {
      {0, "No Fields (Progressive Scan)", "Progressive Scan"}, {1, "Upper Field First", "Upper Field First"}, {2, "Lower Field First", "Lower Field First"},
      {3, "Fields (Unknown Dominance)", "Unknown Dominance"}, {4, "Any Field Order", "Any Field Order"},
      {-1, "Field Presence Unknown", "Field Presence Unknown"}, {5, "", ""}, {7, "", ""}, {-2, "", ""},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.type);
    const auto type = static_cast<FieldType>(c.type);
    EXPECT_EQ((std::array{Text(FieldTypeDescription(type, 1)), Text(FieldTypeDescription(type, 0)),
                          Text(FieldTypeDescription(type, 2))}),
              (std::array<std::string, 3>{c.localized, c.fixed, c.fixed}));
  }
}

TEST(PixelAspectRatioDescription, NamesTheKnownRatios) {
  // clang-format off
  const std::pair<PixelAspectRatio, const char*> kCases[] = {
      {{1, 1}, "Square Pixels (1.0)"}, {{10, 11}, "D1/DV NTSC (0.9091)"}, {{40, 33}, "D1/DV NTSC Widescreen 16:9 (1.2121)"},
      {{768, 702}, "D1/DV PAL (1.0940)"}, {{1024, 702}, "D1/DV PAL Widescreen 16:9 (1.4587)"}, {{2, 1}, "Anamorphic 2:1 (2.0)"},
      {{4, 3}, "HD Anamorphic 1080 (1.3333)"}, {{3, 2}, "DVCPRO HD (1.5)"}, {{9, 10}, "Other Aspect Ratio (0.9000)"},
      {{648, 720}, "Other Aspect Ratio (0.9000)"}, {{0, 1}, "Other Aspect Ratio (0.0000)"},
  };
  // clang-format on
  for (const auto& [r, text] : kCases)
    EXPECT_EQ(Text(PixelAspectRatioDescription(r)), text) << text;
}

TEST(VideoFrameSizeDescription, ShowsTheRatioWhenKnown) {
  // clang-format off
  struct Case { zebcore::geom::RectT<int> rect; PixelAspectRatio r; const char* text; };
  const Case kCases[] = {
      {{10, 10, 720, 480}, kPixelAspectRatio_DVNTSC, "720w 480h (0.9091)"}, {{10, 10, 720, 480}, kPixelAspectRatio_Any, "720w 480h"},
      {{10, 10, 720, 480}, kPixelAspectRatio_Unknown, "720w 480h"}, {{0, 0, -1, 0}, kPixelAspectRatio_Square, "-1w 0h (1.0)"},
  };
  // clang-format on
  for (const Case& c : kCases)
    EXPECT_EQ(Text(VideoFrameSizeDescription(c.rect, c.r)), c.text) << c.text;
}

TEST(RenderQualityDescription, NamesTheFiveQualities) {
  const char* kTexts[] = {"", "", "Draft", "Low", "Medium", "High", "Max", ""};  // from -1
  for (int q = -1; q <= 6; ++q)
    EXPECT_EQ(Text(RenderQualityDescription(static_cast<RenderQuality>(q))), kTexts[q + 1]) << q;
}

TEST(GetCodecFamilyName, MatchesExactCodes) {
  // clang-format off
  const std::pair<unsigned int, const char*> kCases[] = {
      {0x61766331, "H.264"}, {0x48323634, "H.264"}, {0x63766131, "unknown"}, {0, "unknown"}, {0xFFFFFFFF, "unknown"}, {0x4156646E, "DNxHD"},
      {0x68647631, "HDV"}, {0x68647639, "HDV"}, {0x68647630, "unknown"}, {0x68647661, "HDV"}, {0x68647662, "unknown"}, {0x78643561, "XDCAM HD"},
      {0x78643566, "XDCAM HD"}, {0x78643567, "unknown"}, {0x78647639, "XDCAM HD"}, {0x78647661, "XDCAM HD"}, {0x78647662, "XDCAM EX"},
      {0x78647666, "XDCAM EX"}, {0x78647667, "unknown"}, {0x30357664, "DV"}, {0x64766320, "DV"}, {0x64766E31, "DVCPRO HD"}, {0x706E6720, "PNG"},
      {0x61766369, "AVC-Intra"}, {0x4D504547, "MPEG 2"}, {0x44505820, "Cineon / DPX"}, {0x76323130, "Uncompressed YUV"}, {0x41414320, "AAC"},
      {0x74776F73, "Uncompressed (PCM)"}, {0x6D703461, "MPEG Audio"}, {0x65632D33, "Dolby Digital Plus"}, {0x77617663, "WAVE compressed"},
      {0x61707268, "ProRes RAW"}, {0x6170636E, "ProRes"},
      {TranslateFourCC(0x63766131), "AVC-Intra"}, {TranslateFourCC(0x4D435054), "MPEG 2"},  // aliases
  };
  // clang-format on
  for (const auto& [code, family] : kCases) EXPECT_EQ(GetCodecFamilyName(code), family) << code;
}

}  // namespace
}  // namespace zebmediatypes
