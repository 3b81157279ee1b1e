// Colour records, their texts and identifiers, the caches and RGBA.
#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/localizer.h>
#include <zebcore/mutex.h>
#include <zebmediatypes/color/color_management_settings.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/color/color_space.h>
#include <zebmediatypes/color/rgba.h>
#include <zebmediatypes/initialization.h>

#include <condition_variable>
#include <cstdint>
#include <cstring>
#include <mutex>
#include <random>
#include <set>
#include <string>
#include <thread>
#include <type_traits>
#include <vector>

#include "color/color_state.h"
#include "color/color_test_support.h"

namespace zebmediatypes::color {
namespace {

using testing::Block;
using testing::DefaultSpace;
using testing::MakeSpace;
using testing::Narrow;
using testing::U8;
using zebcore::utility::Guid;

// Keeps the library started (default colour space installed) for a test.
class ScopedStart {
 public:
  ScopedStart() { Initialize(); }
  ~ScopedStart() { Terminate(); }
  ScopedStart(const ScopedStart&) = delete;
  ScopedStart& operator=(const ScopedStart&) = delete;
};

std::string Text(const ColorSpace& space) { return Narrow(space.ToSerializedString()); }
std::string Text(const ColorManagementSettings& s) { return Narrow(s.ToSerializedString()); }
ColorSpace ReadSpace(std::string_view text) { return ColorSpaceFromSerializedString(U8(text)); }
ColorManagementSettings ReadSettings(std::string_view text) {
  return ColorManagementSettingsFromSerializedString(U8(text));
}

// ---------------------------------------------------------------------------
// Records.

TEST(ColorSpace, PredicatesAndTypeStringFollowTheType) {
  struct Case {
    std::uint32_t type;
    bool model, icc, ocio, nonManaged;
    const char* typeString;
  };
  constexpr Case kCases[] = {
      {0, false, false, false, false, ""},
      {1, true, false, false, false, "tagged"},
      {2, false, true, false, false, "icc"},
      {3, false, false, true, false, "ocio"},
      {4, false, false, false, true, ""},
      {5, false, false, false, false, ""},
      {0xFFFFFFFFu, false, false, false, false, ""},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.type);
    const ColorSpace space = MakeSpace("", c.type);
    EXPECT_EQ(space.IsModel(), c.model);
    EXPECT_EQ(space.IsICC(), c.icc);
    EXPECT_EQ(space.IsOCIO(), c.ocio);
    EXPECT_EQ(space.IsNonColorManaged(), c.nonManaged);
    EXPECT_EQ(Narrow(space.GetColorSpaceTypeString()), c.typeString);
    // An empty profile is an empty space with no identifier, whatever the type.
    EXPECT_TRUE(space.empty());
    EXPECT_TRUE(space.ToGuid().IsNull());
    EXPECT_TRUE(space.cachedGuid.IsNull());
  }
}

TEST(ColorProfile, IdentifiersHashTheContentInOrder) {
  struct Case {
    const char* label;
    ColorProfile profile;
    const char* guid;
  };
  ColorProfile named;
  named.colorProfileName = U8("BT.709 RGB Full");
  ColorProfile withBytes;
  withBytes.colorProfileName = U8("sRGB");
  withBytes.colorProfileData = Block({0, 1, 2, 3, 255});
  ColorProfile bytesOnly;
  bytesOnly.colorProfileData =
      Block({0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17, 18, 19});
  const Case kCases[] = {
      {"name", named, "66801ad4-51fb-bf29-22ff-6a4972f6139d"},
      {"name and bytes", withBytes, "ab4786a5-4302-fc9f-586c-896ed5378299"},
      {"bytes only", bytesOnly, "ae32e2b8-c4de-c297-8261-bac56c8c1830"},
      {"empty", ColorProfile(), "00000000-0000-0000-0000-000000000000"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    EXPECT_EQ(c.profile.ToGuid().ToString(), c.guid);
  }
}

TEST(ColorProfile, ZeroByteBlockHashesLikeNoBlockButIsNotEmpty) {
  ColorProfile plain;
  plain.colorProfileName = U8("P3");
  ColorProfile zeroBytes = plain;
  zeroBytes.colorProfileData = Block({});
  EXPECT_FALSE(zeroBytes.empty());
  EXPECT_EQ(zeroBytes.ToGuid(), plain.ToGuid());
  // They are written differently, so they are different values.
  EXPECT_NE(zeroBytes, plain);

  ColorProfile blockOnly;
  blockOnly.colorProfileData = Block({});
  EXPECT_FALSE(blockOnly.empty());
  EXPECT_FALSE(blockOnly.ToGuid().IsNull());
}

TEST(ColorSpace, IdentifiersHashProfileTypeAndFlag) {
  ColorSpace icc = MakeSpace("sRGB", 2, true);
  icc.baseColorProfile.colorProfileData = Block({0, 1, 2, 3, 255});
  EXPECT_EQ(DefaultSpace().ToGuid().ToString(), "7dd30e4d-f1da-79cb-adb4-da901cf3a9a7");
  EXPECT_EQ(icc.ToGuid().ToString(), "ed5f92fb-72d4-7af2-8f31-0d98f53704e3");
  // Identifying the space fills the profile's memo too.
  EXPECT_EQ(icc.baseColorProfile.cachedGuid.ToString(), "ab4786a5-4302-fc9f-586c-896ed5378299");
}

TEST(ColorSpace, EachFieldChangesTheGuid) {
  const ColorSpace base = DefaultSpace();
  struct Case {
    const char* label;
    ColorSpace space;
  };
  ColorSpace otherName = base;
  otherName.baseColorProfile.colorProfileName = U8("BT.709 RGB Limited");
  ColorSpace withBytes = base;
  withBytes.baseColorProfile.colorProfileData = Block({7});
  ColorSpace icc = base;
  icc.baseProfileType = kColorSpaceType_ICC;
  ColorSpace linear = base;
  linear.colorSpaceLinearized = true;
  const Case kCases[] = {
      {"name", otherName}, {"bytes", withBytes}, {"type", icc}, {"linearized", linear}};
  std::set<Guid> seen = {base.ToGuid()};
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    EXPECT_NE(c.space, base);
    EXPECT_TRUE(seen.insert(c.space.ToGuid()).second);
  }
  // Separately built records with the same content agree.
  EXPECT_EQ(MakeSpace("BT.709 RGB Full", 1).ToGuid(), base.ToGuid());
}

TEST(ColorSpace, MemoKeepsTheFirstIdentifierUntilCleared) {
  ColorSpace space = DefaultSpace();
  const Guid first = space.ToGuid();
  space.baseProfileType = kColorSpaceType_ICC;
  EXPECT_EQ(space.ToGuid(), first);
  const ColorSpace copy = space;
  EXPECT_EQ(copy.cachedGuid, first);
  space.cachedGuid = Guid();
  EXPECT_NE(space.ToGuid(), first);
  ColorSpace moved = std::move(space);
  EXPECT_NE(moved.cachedGuid, first);
}

TEST(ColorSpace, OrderingIsStrictWeakAndAgreesWithEquality) {
  std::vector<ColorSpace> values = {ColorSpace(),      MakeSpace("a"),
                                    MakeSpace("a", 1), MakeSpace("a", 1, true),
                                    MakeSpace("b"),    MakeSpace("", 4)};
  ColorSpace zero = MakeSpace("a");
  zero.baseColorProfile.colorProfileData = Block({});
  ColorSpace bytes = MakeSpace("a");
  bytes.baseColorProfile.colorProfileData = Block({0});
  ColorSpace bigger = MakeSpace("a");
  bigger.baseColorProfile.colorProfileData = Block({1});
  values.insert(values.end(), {zero, bytes, bigger});
  for (std::size_t i = 0; i < values.size(); ++i) {
    for (std::size_t j = 0; j < values.size(); ++j) {
      SCOPED_TRACE(i * 100 + j);
      const ColorSpace& a = values[i];
      const ColorSpace& b = values[j];
      EXPECT_EQ(a == b, i == j);
      EXPECT_EQ(!(a < b) && !(b < a), a == b);
      EXPECT_FALSE(a < b && b < a);
      for (const ColorSpace& c : values) {
        EXPECT_FALSE(a < b && b < c && !(a < c));
      }
    }
  }
}

TEST(ColorManagementSettings, IdentifiersHashTheFieldsThatAreSet) {
  const ColorManagementSettings defaults;
  EXPECT_EQ(defaults.ToGuid().ToString(), "a685ebe6-9f49-d9d9-eb17-888aac58a401");
  EXPECT_EQ(ColorManagementSettings(kGraphicsWhiteLuminance_100, kLUTInterpolationMethod_TriLinear,
                                    {}, kColorManagementSystem_Korvo, false)
                .ToGuid(),
            defaults.ToGuid());
  const ColorManagementSettings all(kGraphicsWhiteLuminance_203,
                                    kLUTInterpolationMethod_Tetrahedral, U8("/cfg/a.ocio"),
                                    kColorManagementSystem_OCIO, true);
  EXPECT_EQ(all.ToGuid().ToString(), "2f2bfb5c-4380-1f70-21aa-de6003134fe4");

  ColorManagementSettings toneMapped;
  toneMapped.SetAutoToneMapEnabled(true);
  const ColorManagementSettings kVariants[] = {
      ColorManagementSettings(kGraphicsWhiteLuminance_203),
      ColorManagementSettings(kLUTInterpolationMethod_Tetrahedral),
      ColorManagementSettings(kGraphicsWhiteLuminance_100, kLUTInterpolationMethod_TriLinear,
                              U8("f"), kColorManagementSystem_Korvo, false),
      ColorManagementSettings(kGraphicsWhiteLuminance_100, kLUTInterpolationMethod_TriLinear, {},
                              kColorManagementSystem_OCIO, false),
      toneMapped,
  };
  std::set<Guid> seen = {defaults.ToGuid()};
  for (const ColorManagementSettings& s : kVariants) {
    SCOPED_TRACE(Text(s));
    EXPECT_NE(s, defaults);
    EXPECT_TRUE(seen.insert(s.ToGuid()).second);
  }
}

TEST(ColorManagementSettings, IsValidOnlyForKnownLuminances) {
  struct Case {
    std::uint32_t nits;
    bool valid;
  };
  constexpr Case kCases[] = {{0, false},   {99, false}, {100, true},         {203, true},
                             {250, false}, {300, true}, {0xFFFFFFFFu, false}};
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.nits);
    const ColorManagementSettings s(static_cast<GraphicsWhiteLuminance>(c.nits),
                                    kLUTInterpolationMethod_Tetrahedral, U8("x"),
                                    kColorManagementSystem_OCIO, true);
    EXPECT_EQ(s.IsValid(), c.valid);
  }
}

TEST(ColorDescriptions, PlainAndLocalizedTexts) {
  using zebcore::string::AsciiToUTF16;
  zebcore::config::Localizer::Get().ClearTranslations();
  struct Case {
    std::uint32_t value;
    int localized;
    const char* system;
    const char* lut;
  };
  constexpr Case kCases[] = {
      {0, 0, "Korvo color managed", "Trilinear"},
      {0, 1, "Korvo color managed", "Trilinear"},
      {1, 0, "OCIO color managed", "Tetrahedral"},
      {1, 2, "OCIO color managed", "Tetrahedral"},
      {1, 1, "OCIO color managed", "Tetrahedral (requires GPU acceleration)"},
      {2, 1, "", ""},
      {2, 0, "", ""},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.value * 10 + static_cast<std::uint32_t>(c.localized));
    EXPECT_EQ(GetColorManagementSystemDescription(static_cast<ColorManagementSystem>(c.value),
                                                  c.localized),
              AsciiToUTF16(c.system));
    EXPECT_EQ(GetLUTInterpolationMethodDescription(static_cast<LUTInterpolationMethod>(c.value),
                                                   c.localized),
              AsciiToUTF16(c.lut));
  }
  zebcore::config::Localizer::Get().InstallTranslations(
      {{"$$$/zebmediatypes/LUTInterpolationMethod/TriLinear", u"Trilinéaire"}});
  EXPECT_EQ(GetLUTInterpolationMethodDescription(kLUTInterpolationMethod_TriLinear, 1),
            zebcore::UTF16String(u"Trilinéaire"));
  EXPECT_EQ(GetLUTInterpolationMethodDescription(kLUTInterpolationMethod_TriLinear, 0),
            AsciiToUTF16("Trilinear"));
  zebcore::config::Localizer::Get().ClearTranslations();

  struct Luminance {
    std::uint32_t nits;
    const char* text;
  };
  constexpr Luminance kLuminances[] = {{100, "100 (63% HLG, 51% PQ)"},
                                       {203, "203 (75% HLG, 58% PQ)"},
                                       {300, "300 (81% HLG, 62% PQ)"},
                                       {0, ""},
                                       {250, ""}};
  for (const Luminance& l : kLuminances) {
    SCOPED_TRACE(l.nits);
    EXPECT_EQ(GetGraphicsWhiteLuminanceDescription(static_cast<GraphicsWhiteLuminance>(l.nits)),
              AsciiToUTF16(l.text));
  }
  EXPECT_EQ(GetColorSpaceDescription(MakeSpace("Rec. 2020 \xE2\x80\x94 PQ", 3)),
            zebcore::UTF16String(u"Rec. 2020 \u2014 PQ"));
}

// ---------------------------------------------------------------------------
// Texts.

TEST(ColorSpace, WritesGoldenTexts) {
  ColorSpace everything = MakeSpace("sRGB", 0xFFFFFFFFu, true);
  everything.baseColorProfile.colorProfileData = Block({0, 1, 2, 3, 255});
  ColorSpace zeroBytes;
  zeroBytes.baseColorProfile.colorProfileData = Block({});
  struct Case {
    const char* label;
    ColorSpace space;
    const char* text;
  };
  const Case kCases[] = {
      {"empty", ColorSpace(), "{}"},
      {"empty but typed", MakeSpace("", 4), "{\"baseProfileType\":4}"},
      {"default", DefaultSpace(),
       "{\"baseColorProfile\":{\"colorProfileName\":\"BT.709 RGB Full\"},\"baseProfileType\":1}"},
      {"everything", everything,
       "{\"baseColorProfile\":{\"colorProfileData\":\"AAECA/8=\",\"colorProfileName\":\"sRGB\"},"
       "\"baseProfileType\":4294967295,\"colorSpaceLinearized\":true}"},
      {"zero bytes", zeroBytes, "{\"baseColorProfile\":{\"colorProfileData\":\"\"}}"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    EXPECT_EQ(Text(c.space), c.text);
  }
}

TEST(ColorManagementSettings, WritesGoldenTexts) {
  struct Case {
    ColorManagementSettings settings;
    const char* text;
  };
  const Case kCases[] = {
      {ColorManagementSettings(), "{}"},
      {ColorManagementSettings(kGraphicsWhiteLuminance_203), "{\"graphicsWhiteLuminance\":203}"},
      {ColorManagementSettings(kLUTInterpolationMethod_Tetrahedral),
       "{\"lutInterpolationMethod\":1}"},
      {ColorManagementSettings(kGraphicsWhiteLuminance_300, kLUTInterpolationMethod_Tetrahedral,
                               U8("/cfg/a \"b\".ocio"), kColorManagementSystem_OCIO, true),
       "{\"autoToneMapEnabled\":true,\"colorManagementSystem\":1,\"graphicsWhiteLuminance\":300,"
       "\"lutInterpolationMethod\":1,\"ocioConfigurationFile\":\"/cfg/a \\\"b\\\".ocio\"}"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Text(c.settings), c.text);
  }
}

TEST(ColorSpace, ReadsEachMemberByItsRule) {
  const ScopedStart started;
  struct Case {
    const char* text;
    bool reads;  // false: the read fails and gives the default colour space
    const char* name;
    std::uint32_t type;
    bool linearized;
  };
  constexpr Case kCases[] = {
      {"{}", true, "", 0, false},
      {"{\"baseColorProfile\":{\"colorProfileName\":\"N\"}}", true, "N", 0, false},
      {"{\"baseColorProfile\":{\"colorProfileName\":12}}", true, "", 0, false},
      {"{\"baseColorProfile\":{\"colorProfileName\":null}}", true, "", 0, false},
      {"{\"baseColorProfile\":{\"colorProfileName\":[\"N\"]}}", true, "", 0, false},
      {"{\"baseColorProfile\":{}}", true, "", 0, false},
      {"{\"baseColorProfile\":\"N\"}", false, "", 0, false},
      {"{\"baseColorProfile\":[]}", false, "", 0, false},
      {"{\"baseColorProfile\":null}", false, "", 0, false},
      {"{\"baseProfileType\":3}", true, "", 3, false},
      {"{\"baseProfileType\":-1}", true, "", 0xFFFFFFFFu, false},
      {"{\"baseProfileType\":-2147483648}", true, "", 0x80000000u, false},
      {"{\"baseProfileType\":4294967295}", true, "", 0xFFFFFFFFu, false},
      {"{\"baseProfileType\":4294967296}", false, "", 0, false},
      {"{\"baseProfileType\":-2147483649}", false, "", 0, false},
      {"{\"baseProfileType\":18446744073709551615}", false, "", 0, false},
      {"{\"baseProfileType\":\"1\"}", false, "", 0, false},
      {"{\"baseProfileType\":1.0}", false, "", 0, false},
      {"{\"baseProfileType\":true}", false, "", 0, false},
      {"{\"baseProfileType\":null}", false, "", 0, false},
      {"{\"colorSpaceLinearized\":true}", true, "", 0, true},
      {"{\"colorSpaceLinearized\":false}", true, "", 0, false},
      {"{\"colorSpaceLinearized\":0}", true, "", 0, false},
      {"{\"colorSpaceLinearized\":\"true\"}", true, "", 0, true},
      {"{\"colorSpaceLinearized\":\"false\"}", true, "", 0, false},
      {"{\"colorSpaceLinearized\":\"TRUE\"}", false, "", 0, false},
      {"{\"colorSpaceLinearized\":\"1\"}", false, "", 0, false},
      {"{\"colorSpaceLinearized\":0.5}", false, "", 0, false},
      {"{\"colorSpaceLinearized\":null}", false, "", 0, false},
      {"{\"unknown\":1,\"baseProfileType\":2}", true, "", 2, false},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    testing::ScopedUsageLogger logger;
    const ColorSpace space = ReadSpace(c.text);
    if (!c.reads) {
      EXPECT_EQ(space, DefaultSpace());
      EXPECT_EQ(logger.Events(),
                std::vector<std::string>{
                    "ColorSpace/Serialization/ColorSpaceFromSerializedStringFailed"});
      continue;
    }
    EXPECT_TRUE(logger.Events().empty());
    EXPECT_EQ(Narrow(space.baseColorProfile.colorProfileName), c.name);
    EXPECT_EQ(space.baseColorProfile.colorProfileData, nullptr);
    EXPECT_EQ(static_cast<std::uint32_t>(space.baseProfileType), c.type);
    EXPECT_EQ(space.colorSpaceLinearized, c.linearized);
  }
}

TEST(ColorSpace, UndecodableProfileDataFailsTheRead) {
  const ScopedStart started;
  struct Case {
    const char* data;
    bool reads;
    std::vector<unsigned char> bytes;
  };
  const Case kCases[] = {
      {"\"AAECA/8=\"", true, {0, 1, 2, 3, 255}},
      {"\"\"", true, {}},
      {"7", true, {}},  // not a string: read as empty text, so 0 bytes
      {"\"AAECA/8\"", false, {}},
      {"\"AA*CA/8=\"", false, {}},
      {"\"A===\"", false, {}},
      {"\"@@@@\"", false, {}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.data);
    const ColorSpace space = ReadSpace(std::string("{\"baseColorProfile\":{\"colorProfileData\":") +
                                       c.data + "},\"baseProfileType\":2}");
    if (!c.reads) {
      EXPECT_EQ(space, DefaultSpace());
      continue;
    }
    ASSERT_NE(space.baseColorProfile.colorProfileData, nullptr);
    const auto& block = *space.baseColorProfile.colorProfileData;
    EXPECT_EQ(std::vector<unsigned char>(block.GetData(), block.GetData() + block.GetSize()),
              c.bytes);
    EXPECT_TRUE(space.IsICC());
  }
}

TEST(ColorSpace, IntegerWiderThanThirtyTwoBitsFailsTheRead) {
  const ScopedStart started;
  // 4294967496 is 2^32 + 200: keeping its low half would read type 200.
  for (const char* text : {"{\"baseProfileType\":4294967496}", "{\"baseProfileType\":-4294967295}",
                           "{\"baseProfileType\":9223372036854775807}"}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(ReadSpace(text), DefaultSpace());
  }
  EXPECT_EQ(ReadSettings("{\"graphicsWhiteLuminance\":4294967496}"), ColorManagementSettings());
  EXPECT_EQ(ReadSettings("{\"lutInterpolationMethod\":4294967297}"), ColorManagementSettings());
}

TEST(ColorManagementSettings, BooleanGivenAsAnyIntegerCounts) {
  const ScopedStart started;
  struct Case {
    const char* value;
    bool expected;
  };
  constexpr Case kCases[] = {{"1", true},
                             {"0", false},
                             {"-7", true},
                             {"4294967296", true},
                             {"18446744073709551615", true}};
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.value);
    ColorManagementSettings expected;
    expected.SetAutoToneMapEnabled(c.expected);
    EXPECT_EQ(ReadSettings(std::string("{\"autoToneMapEnabled\":") + c.value + "}"), expected);
    EXPECT_EQ(ReadSpace(std::string("{\"colorSpaceLinearized\":") + c.value + "}"),
              MakeSpace("", 0, c.expected));
  }
}

TEST(ColorManagementSettings, ReadsEachMemberByItsRule) {
  struct Case {
    const char* text;
    bool reads;
    ColorManagementSettings expected;
  };
  const ColorManagementSettings kDefaults;
  ColorManagementSettings toneMapped203(kGraphicsWhiteLuminance_203);
  toneMapped203.SetAutoToneMapEnabled(true);
  ColorManagementSettings toneMapped;
  toneMapped.SetAutoToneMapEnabled(true);
  const Case kCases[] = {
      {"{}", true, kDefaults},
      {"{\"graphicsWhiteLuminance\":203,\"autoToneMapEnabled\":\"true\"}", true, toneMapped203},
      {"{\"graphicsWhiteLuminance\":203,\"autoToneMapEnabled\":\"yes\"}", false, kDefaults},
      {"{\"autoToneMapEnabled\":0}", true, kDefaults},
      {"{\"autoToneMapEnabled\":[]}", false, kDefaults},
      {"{\"lutInterpolationMethod\":1}", true,
       ColorManagementSettings(kLUTInterpolationMethod_Tetrahedral)},
      {"{\"graphicsWhiteLuminance\":250}", true,
       ColorManagementSettings(static_cast<GraphicsWhiteLuminance>(250))},
      {"{\"graphicsWhiteLuminance\":203,\"lutInterpolationMethod\":\"1\"}", false, kDefaults},
      {"{\"colorManagementSystem\":1,\"ocioConfigurationFile\":\"/a.ocio\"}", true,
       ColorManagementSettings(kGraphicsWhiteLuminance_100, kLUTInterpolationMethod_TriLinear,
                               U8("/a.ocio"), kColorManagementSystem_OCIO, false)},
      {"{\"colorManagementSystem\":-1.5}", false, kDefaults},
      {"{\"ocioConfigurationFile\":{\"a\":1},\"graphicsWhiteLuminance\":300}", true,
       ColorManagementSettings(kGraphicsWhiteLuminance_300)},
      {"{\"SerializerWrappedObject\":{\"graphicsWhiteLuminance\":203,\"autoToneMapEnabled\":"
       "true}}",
       true, toneMapped203},
      {"[203]", false, kDefaults},
      {"203", false, kDefaults},
      {"not json", false, kDefaults},
      {"", false, kDefaults},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(ReadSettings(c.text), c.expected);
  }
}

TEST(ColorSpace, WrappedTextsReadTheSame) {
  const ScopedStart started;
  const char* kTexts[] = {
      "{}",
      "{\"baseColorProfile\":{\"colorProfileName\":\"BT.2020\"},\"baseProfileType\":1}",
      ("{\"baseColorProfile\":{\"colorProfileData\":\"AAECA/8=\",\"colorProfileName\":\"sRGB\"},"
       "\"baseProfileType\":2,\"colorSpaceLinearized\":true}"),
  };
  for (const char* text : kTexts) {
    SCOPED_TRACE(text);
    const ColorSpace plain = ReadSpace(text);
    EXPECT_EQ(ReadSpace(std::string("{\"SerializerWrappedObject\":") + text + "}"), plain);
    EXPECT_EQ(ReadSpace(std::string(" \n{\"SerializerWrappedObject\":") + text + ",\"x\":1}"),
              plain);
  }
  // A wrapper holding no value is read as the object itself: no members known.
  EXPECT_EQ(ReadSpace("{\"SerializerWrappedObject\":null}"), ColorSpace());
  // A wrapper holding something other than an object fails the read.
  EXPECT_EQ(ReadSpace("{\"SerializerWrappedObject\":3}"), DefaultSpace());
}

TEST(ColorSpace, BadInputGivesTheDefaultColorSpace) {
  const ScopedStart started;
  std::string deep;
  for (int i = 0; i < 100000; ++i) deep += "{\"baseColorProfile\":";
  std::string deepArrays(200000, '[');
  const std::string kTexts[] = {
      "",
      "not json",
      "{",
      "{\"baseColorProfile\":{\"colorProfileName\":\"BT.709",
      "{\"baseProfileType\":1,}",
      "{\"baseProfileType\":1}{}",
      "[]",
      "null",
      "\"{}\"",
      "true",
      "{\"baseProfileType\":1e999}",
      "{\"baseProfileType\":123456789012345678901234567890}",
      "{\"baseColorProfile\":{\"colorProfileName\":\"\xFF\xFE\"}}x",
      deep,
      deepArrays,
  };
  for (const std::string& text : kTexts) {
    SCOPED_TRACE(text.substr(0, 60));
    EXPECT_EQ(ReadSpace(text), DefaultSpace());
  }
}

TEST(ColorSpace, InvalidUtf8NameIsWrittenAsReplacementCharacters) {
  const ScopedStart started;
  const std::string kNames[] = {"\xFF", "\xC3", "\xED\xA0\x80", "ok\xE2\x82", "\xC0\xAF"};
  for (const std::string& name : kNames) {
    SCOPED_TRACE(name.size());
    // The text stays valid JSON: the bad bytes become U+FFFD, the rest of the
    // record is kept.
    const ColorSpace space = MakeSpace(name, 2, true);
    const ColorSpace back = ColorSpaceFromSerializedString(space.ToSerializedString());
    const zebcore::UTF8String repaired =
        zebcore::string::UTF16to8(zebcore::string::View(zebcore::string::UTF8to16(U8(name))));
    EXPECT_EQ(back, MakeSpace(testing::Narrow(repaired), 2, true)) << Text(space);
    // Read: the bytes are taken as they stand or the read fails.
    const ColorSpace read =
        ReadSpace("{\"baseColorProfile\":{\"colorProfileName\":\"" + name + "\"}}");
    EXPECT_TRUE(read == MakeSpace(name) || read == DefaultSpace()) << Text(read);
  }
}

TEST(ColorSpace, EveryRecordRoundTripsWithItsGuid) {
  std::mt19937 random(20261206);
  const std::uint32_t kTypes[] = {0, 1, 2, 3, 4, 5, 0x7FFFFFFFu, 0x80000000u, 0xFFFFFFFFu};
  const char* kNames[] = {"",
                          "BT.709 RGB Full",
                          "Display P3",
                          "\"quoted\" \\ slash",
                          "tab\tnew\nline",
                          "caf\xC3\xA9 \xE2\x80\x94 \xF0\x9F\x8E\xA8"};
  int checked = 0;
  for (const char* name : kNames) {
    for (std::uint32_t type : kTypes) {
      for (int linear = 0; linear < 2; ++linear) {
        for (int bytes = -1; bytes < 40; bytes += 7) {
          ColorSpace space = MakeSpace(name, type, linear == 1);
          if (bytes >= 0) {
            std::vector<unsigned char> data(static_cast<std::size_t>(bytes));
            for (unsigned char& b : data) b = static_cast<unsigned char>(random());
            space.baseColorProfile.colorProfileData = Block(data);
          }
          SCOPED_TRACE(Text(space));
          const ColorSpace back = ColorSpaceFromSerializedString(space.ToSerializedString());
          EXPECT_EQ(back, space);
          EXPECT_EQ(back.ToGuid(), space.ToGuid());
          EXPECT_EQ(Text(back), Text(space));
          ++checked;
        }
      }
    }
  }
  EXPECT_EQ(checked, 6 * 9 * 2 * 6);
}

TEST(ColorManagementSettings, EveryRecordRoundTripsWithItsGuid) {
  const std::uint32_t kValues[] = {0, 1, 100, 203, 300, 0xFFFFFFFFu};
  const char* kFiles[] = {"", "/opt/aces/config.ocio", "C:\\cfg\\\"x\".ocio"};
  for (std::uint32_t luminance : kValues) {
    for (std::uint32_t method : kValues) {
      for (std::uint32_t system : kValues) {
        for (const char* file : kFiles) {
          for (int tone = 0; tone < 2; ++tone) {
            const ColorManagementSettings s(static_cast<GraphicsWhiteLuminance>(luminance),
                                            static_cast<LUTInterpolationMethod>(method), U8(file),
                                            static_cast<ColorManagementSystem>(system), tone == 1);
            SCOPED_TRACE(Text(s));
            const ColorManagementSettings back =
                ColorManagementSettingsFromSerializedString(s.ToSerializedString());
            EXPECT_EQ(back, s);
            EXPECT_EQ(back.ToGuid(), s.ToGuid());
          }
        }
      }
    }
  }
}

// ---------------------------------------------------------------------------
// Caches.

TEST(ColorSpaceCache, FirstEntryUnderAnIdentifierStays) {
  const ScopedStart started;
  ColorSpace first = MakeSpace("cache-first", 1);
  const Guid id = AddColorSpaceToCache(first);
  EXPECT_EQ(id, first.ToGuid());
  EXPECT_EQ(first.cachedGuid, id);  // the caller's memo is filled
  ColorSpace changed = first;       // same memo, so the same identifier
  changed.colorSpaceLinearized = true;
  EXPECT_EQ(AddColorSpaceToCache(changed), id);
  const ColorSpace kept = RetrieveColorSpaceFromCache(id);
  EXPECT_EQ(kept, first);
  EXPECT_EQ(kept.cachedGuid, id);

  EXPECT_TRUE(AddColorSpaceToCache(ColorSpace()).IsNull());
  EXPECT_EQ(RetrieveColorSpaceFromCache(Guid()), ColorSpace());
  EXPECT_EQ(RetrieveColorSpaceFromCache(MakeSpace("never added").ToGuid()), ColorSpace());
}

TEST(ColorSpaceCache, ReadingATextEntersItsResult) {
  const ScopedStart started;
  const ColorSpace read = ReadSpace("{\"baseColorProfile\":{\"colorProfileName\":\"entered\"}}");
  EXPECT_FALSE(read.cachedGuid.IsNull());
  EXPECT_EQ(RetrieveColorSpaceFromCache(read.cachedGuid), MakeSpace("entered"));
  // A failed read enters the default colour space, which is there already.
  const ColorSpace failed = ReadSpace("{");
  EXPECT_EQ(failed.cachedGuid, DefaultSpace().ToGuid());
}

TEST(ColorSpaceCache, LockTimeoutRunsNothingAndReports) {
  const ScopedStart started;
  const ColorSpace space = MakeSpace("locked-out", 3);
  const unsigned int previousWait = details::SetLockWaitMilliseconds(20);
  std::mutex m;
  std::condition_variable cv;
  bool held = false;
  bool release = false;
  std::thread holder([&] {
    auto& lock = details::ColorLock();
    const bool locked = lock.Lock(nullptr, 5000);
    EXPECT_TRUE(locked);
    {
      std::unique_lock<std::mutex> guard(m);
      held = true;
      cv.notify_all();
      cv.wait(guard, [&] { return release; });
    }
    if (locked) lock.Unlock();
  });
  {
    std::unique_lock<std::mutex> guard(m);
    cv.wait(guard, [&] { return held; });
  }
  {
    zebcore::debug::ScopedAssertionCapture capture;
    ColorSpace copy = space;
    EXPECT_TRUE(AddColorSpaceToCache(copy).IsNull());
    EXPECT_TRUE(copy.cachedGuid.IsNull());  // the body did not run
    EXPECT_EQ(RetrieveColorSpaceFromCache(space.ToGuid()), ColorSpace());
    EXPECT_EQ(GetDefaultColorSpace(), ColorSpace());
    SetDefaultColorSpace(MakeSpace("not installed"));
    EXPECT_EQ(capture.Count(), 4u);
  }
  {
    std::lock_guard<std::mutex> guard(m);
    release = true;
    cv.notify_all();
  }
  holder.join();
  details::SetLockWaitMilliseconds(previousWait);
  // Nothing was entered or replaced while the lock was out of reach.
  EXPECT_EQ(RetrieveColorSpaceFromCache(space.ToGuid()), ColorSpace());
  EXPECT_EQ(GetDefaultColorSpace(), DefaultSpace());
}

TEST(SerializationCache, ClearAllEmptiesBothCaches) {
  auto& profiles = SerializationCache::GetColorProfileCache();
  auto& spaces = SerializationCache::GetColorSpaceCache();
  EXPECT_EQ(&profiles, &SerializationCache::GetColorProfileCache());
  const ColorSpace space = MakeSpace("text-cached", 2);
  spaces.Add(space.ToSerializedString(), space);
  profiles.Add(U8("{\"colorProfileName\":\"text-cached\"}"), space.baseColorProfile);
  EXPECT_EQ(spaces.FindValue(space.ToSerializedString()), space);
  EXPECT_EQ(spaces.FindText(space), space.ToSerializedString());
  SerializationCache::ClearAll();
  EXPECT_EQ(profiles.Size(), 0u);
  EXPECT_EQ(spaces.Size(), 0u);
}

// ---------------------------------------------------------------------------
// RGBA.

TEST(RGBA, StoresComponentsAsGiven) {
  static_assert(std::is_trivially_copyable_v<RGBA>);
  static_assert(sizeof(RGBA) == 4 * sizeof(float));
  constexpr RGBA kBlack;
  static_assert(kBlack.Red() == 0.0f && kBlack.Green() == 0.0f && kBlack.Blue() == 0.0f &&
                kBlack.Alpha() == 1.0f);
  struct Case {
    float r, g, b, a;
  };
  constexpr Case kCases[] = {
      {0.9f, 0.5f, 0.4f, 1.0f}, {-0.5f, 2.0f, 1e30f, -0.0f}, {0.1f, 0.2f, 0.3f, 0.4f}};
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.r);
    const RGBA built(c.r, c.g, c.b, c.a);
    RGBA set;
    set.SetRed(c.r);
    set.SetGreen(c.g);
    set.SetBlue(c.b);
    set.SetAlpha(c.a);
    for (const RGBA& v : {built, set}) {
      EXPECT_EQ(v.Red(), c.r);
      EXPECT_EQ(v.Green(), c.g);
      EXPECT_EQ(v.Blue(), c.b);
      EXPECT_EQ(v.Alpha(), c.a);
    }
  }
}

TEST(RGBA, StoresBlueBeforeGreen) {
  const RGBA c(1.0f, 2.0f, 3.0f, 4.0f);
  float raw[4];
  std::memcpy(raw, &c, sizeof raw);
  EXPECT_EQ(raw[0], 1.0f);
  EXPECT_EQ(raw[1], 3.0f);
  EXPECT_EQ(raw[2], 2.0f);
  EXPECT_EQ(raw[3], 4.0f);
}

}  // namespace
}  // namespace zebmediatypes::color
