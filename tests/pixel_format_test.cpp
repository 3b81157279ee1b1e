#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/pixel_format.h>

#include <algorithm>
#include <cctype>
#include <cstdint>
#include <iterator>
#include <string>
#include <utility>

namespace zebmediatypes {
namespace {

// The first catalogue row whose field equals `key`, by a plain scan in catalogue order.
template <class Field>
const PixelFormat* Scan(std::uint32_t key, Field field) {
  return std::find_if(AllPixelFormatsBegin(), AllPixelFormatsEnd(),
                      [&](const PixelFormat& pf) { return field(pf) == key; });
}
std::uint32_t Name(const PixelFormat& pf) { return pf.fourCC; }
std::uint32_t Word(const PixelFormat& pf) { return pf.properties.Word(); }

TEST(PixelFormatCatalogue, EveryRowHasAPrintableNameAndRoundTrips) {
  ASSERT_EQ(AllPixelFormatsEnd() - AllPixelFormatsBegin(), std::ptrdiff_t{112});
  int sharedWords = 0;
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    SCOPED_TRACE(pf->fourCC);
    for (unsigned shift = 0; shift < 32; shift += 8) {
      EXPECT_TRUE(std::isalnum(static_cast<int>(pf->fourCC >> shift & 0xFF)));
    }
    EXPECT_TRUE(pf->properties.IsSpecific() && Word(*pf) < (1u << 23));
    EXPECT_EQ(PixelFormat(pf->fourCC), *pf);
    // A word names its first row.
    const PixelFormat* first = Scan(Word(*pf), Word);
    EXPECT_EQ(PixelFormat(pf->properties), *first);
    sharedWords += first != pf;
  }
  // Each HLG row shares its word with an HDR row.
  EXPECT_EQ(sharedWords, 4);
}

TEST(LookupPropertiesForName, AgreesWithAScanInCatalogueOrder) {
  // The wildcard, "badf" and an unregistered custom name first.
  const std::pair<PixelFormatName, PixelFormatProperties> kSpecialNames[] = {
      {static_cast<PixelFormatName>(0), kPixelFormatProperties_Any},
      {static_cast<PixelFormatName>(kPixelFormatFourCC_Invalid), kPixelFormatProperties_Invalid},
      {MakePixelFormatName("_nop"), kPixelFormatProperties_Invalid},
  };
  for (const auto& [name, word] : kSpecialNames) EXPECT_EQ(LookupPropertiesForName(name), word);
  // Every catalogue name with one of its bytes replaced by every value.
  for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
    for (unsigned shift = 0; shift < 32; shift += 8) {
      for (std::uint32_t byte = 0; byte < 256; ++byte) {
        const std::uint32_t name = (pf->fourCC & ~(0xFFu << shift)) | byte << shift;
        const PixelFormat* row = Scan(name, Name);
        if (name == kPixelFormatFourCC_Invalid || IsCustomPixelFormatName(name)) continue;
        const PixelFormatProperties want =
            row != AllPixelFormatsEnd() ? row->properties : kPixelFormatProperties_Invalid;
        ASSERT_EQ(LookupPropertiesForName(static_cast<PixelFormatName>(name)), want) << name;
      }
    }
  }
}

TEST(GuessNameForProperties, WildcardAndMalformedWords) {
  // PixelFormat(word) builds the format named by GuessNameForProperties.
  const std::pair<std::uint32_t, PixelFormat> kCases[] = {
      {0x00100000, kPixelFormat_Any},
      {0x00078000, kPixelFormat_Invalid},
      // uyvy with validity 3
      {0x00180881, kPixelFormat_Invalid},
      // uyvy with a reserved bit set
      {0x00880881, kPixelFormat_Invalid},
  };
  for (const auto& [word, format] : kCases) {
    EXPECT_EQ(PixelFormat(PixelFormatProperties(word)), format) << word;
  }
}

TEST(CustomPixelFormatRegistry, LatestRegistrationWinsAndOnlyCustomNamesAreStored) {
  const auto name = MakePixelFormatName("_reg");
  RegisterCustomPixelFormatProperties(name, kPixelFormat_BGRA_4444_8u.properties);
  RegisterCustomPixelFormatProperties(name, PixelFormatProperties(0x00080981));
  EXPECT_EQ(LookupPropertiesForName(name).Word(), 0x00080981u);
  EXPECT_EQ(LookupPropertiesForName(MakePixelFormatName("@reg")), kPixelFormatProperties_Invalid);
  // A custom word builds no format from its word.
  EXPECT_EQ(PixelFormat(PixelFormatProperties(0x00080981)), kPixelFormat_Invalid);
  // A name that is not custom could never be looked up: reported, not stored.
  zebcore::debug::ScopedAssertionCapture capture;
  RegisterCustomPixelFormatProperties(MakePixelFormatName("bgra"), PixelFormatProperties(0x5432));
  EXPECT_EQ(capture.Count(), 1u);
  EXPECT_EQ(LookupPropertiesForName(MakePixelFormatName("bgra")),
            kPixelFormat_BGRA_4444_8u.properties);
}

TEST(CustomPixelFormatRegistry, FindReturnsTheSmallestFourCCOfAWord) {
  const PixelFormatProperties word(0x00012345);
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), kPixelFormatFourCC_Invalid);
  for (const char* n : {"_zzz", "@zzz", "_aaa"}) {
    RegisterCustomPixelFormatProperties(MakePixelFormatName(n[0], n[1], n[2], n[3]), word);
  }
  // "_aaa" is 0x6161615F, the smallest of the three as a number.
  EXPECT_EQ(FindCustomPixelFormatByProperties(word), MakePixelFormatName("_aaa"));
  // The catalogue is not searched.
  EXPECT_EQ(FindCustomPixelFormatByProperties(kPixelFormat_UYVY_422_8u.properties),
            kPixelFormatFourCC_Invalid);
}

TEST(PixelFormatLayout, PlanesAndBytesPerPixel) {
  struct Case {
    PixelFormat format;
    int planes;
    int bytesPerPixel;
  };
  const Case kCases[] = {
      {kPixelFormat_RGB_444_32f_Planar, 3, 4},
      {kPixelFormat_UYVY_422_32f, 1, 8},
      {kPixelFormat_Y210_422_10u_as16u_709, 1, 4},
      {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, 1, 4},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.format.fourCC);
    EXPECT_EQ(GetNumberOfPlanes(c.format), c.planes);
    EXPECT_EQ(GetBytesPerPixel(c.format), c.bytesPerPixel);
  }
}

TEST(TranslateFourCC, MapsCodecAliasesOntoTheirFamily) {
  const std::pair<unsigned int, unsigned int> kCases[] = {
      // cva0, below the alias range
      {0x63766130, 0x63766130},
      // cva1 to avci
      {0x63766131, 0x61766369},
      // cva4 to avci
      {0x63766134, 0x61766369},
      // cva5, above the range
      {0x63766135, 0x63766135},
      // MCPT to MPEG
      {0x4D435054, 0x4D504547},
  };
  for (const auto& [in, out] : kCases) EXPECT_EQ(TranslateFourCC(in), out) << in;
}

}  // namespace
}  // namespace zebmediatypes
