#include <gtest/gtest.h>
#include <zebmediatypes/video_descriptions.h>

#include <cstdint>
#include <set>
#include <sstream>
#include <string>
#include <utility>

namespace zebmediatypes {
namespace {

std::string Text(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

TEST(PixelFormatDescription, NamesTheLayoutInWords) {
  const std::pair<PixelFormat, const char*> kCases[] = {
      {kPixelFormat_VUYA_4444_8u_709, "VUYA 4444 8u 709"},
      {kPixelFormat_YUYV_422_8u, "YUV 422 8u 601"},
      {kPixelFormat_BGRA_4444_32f_Linear, "BGRA 4444 32f Linear Full Range"},
      {kPixelFormat_YUV_422_BiPlanar_10u_as16u, "VUYX 422 10u 709"},
      {kPixelFormat_PAL_DV100_1080i, "PAL DV 100 (1080i)"},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR,
       "YUV 420 MPEG4 Frame BiPlanar 10u 2020 HDR"},
      {PixelFormat(MakePixelFormatName("@\x01\x80z"), kPixelFormat_BGRA_4444_8u.properties),
       "Custom Pixel Format (z? @)"},
      {PixelFormat(MakePixelFormatName("qqqq"), PixelFormatProperties(0x000F8001)),
       "Unknown Compressed Pixel Format (qqqq)"},
  };
  for (const auto& [format, text] : kCases) {
    std::ostringstream narrow;
    zebcore::string::oUTF16StringStream wide;
    narrow << format;
    wide << format;
    EXPECT_EQ(narrow.str(), text);
    EXPECT_EQ(wide.str(), PixelFormatDescription(format));
    EXPECT_EQ(Text(PixelFormatDescription(format)), text);
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

std::string DescriptiveName(std::uint32_t name) {
  return zebcore::string::ToStdString(GetFourCCDescriptiveName(static_cast<PixelFormatName>(name)));
}

TEST(GetFourCCDescriptiveName, EveryCatalogueRowButThreeHasItsOwnName) {
  std::set<std::string> names;
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    names.insert(DescriptiveName(pf->fourCC));
  }
  // v21f, y210 and y21f have no name of their own: they share "Invalid".
  EXPECT_TRUE(names.size() == 110 && names.count("Invalid") == 1);
  // A row found by its name, though its word is an HDR row's.
  EXPECT_EQ(DescriptiveName(MakePixelFormatName("Phl0")), "P010_MPEG4_FIELD_HDR_HLG");
}

TEST(VideoDescriptions, NameKnownValuesAndLeaveOthersEmpty) {
  const std::pair<zebcore::UTF16String, const char*> kCases[] = {
      {AlphaDescription(kAlphaChannel_Premultiplied), "Premultiplied Alpha"},
      {FieldTypeDescription(kFieldType_Progressive, 1), "No Fields (Progressive Scan)"},
      // not localized
      {FieldTypeDescription(kFieldType_Progressive, 2), "Progressive Scan"},
      {PixelAspectRatioDescription({1920, 1440}), "HD Anamorphic 1080 (1.3333)"},
      {PixelAspectRatioDescription({648, 720}), "Other Aspect Ratio (0.9000)"},
      {VideoFrameSizeDescription({10, 10, 720, 480}, kPixelAspectRatio_DVNTSC),
       "720w 480h (0.9091)"},
      {RenderQualityDescription(static_cast<RenderQuality>(6)), ""},
  };
  for (const auto& [got, text] : kCases) EXPECT_EQ(Text(got), text);
}

TEST(GetCodecFamilyName, MatchesExactCodesAndRanges) {
  const std::pair<unsigned int, const char*> kCases[] = {
      // hdv0, below the HDV range
      {0x68647630, "unknown"},
      // hdv9, its top
      {0x68647639, "HDV"},
      // cva1
      {TranslateFourCC(0x63766131), "AVC-Intra"},
  };
  for (const auto& [code, family] : kCases) EXPECT_EQ(GetCodecFamilyName(code), family) << code;
}

}  // namespace
}  // namespace zebmediatypes
