// Colour records, their texts and identifiers, the caches and RGBA.
#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/localizer.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/color/rgba.h>
#include <zebmediatypes/initialization.h>

#include <array>
#include <cstdint>
#include <cstring>
#include <numeric>
#include <random>
#include <set>
#include <string>
#include <type_traits>
#include <vector>

#include "color/color_test_support.h"

namespace zebmediatypes::color {
namespace {

using testing::DefaultSpace;
using testing::MakeSpace;
using testing::U8;
using zebcore::string::ToStdString;
using zebcore::utility::Guid;
using Bytes = std::vector<unsigned char>;

// Keeps the library started (default colour space installed) for a test.
struct ScopedStart {
  ScopedStart() { Initialize(); }
  ~ScopedStart() { Terminate(); }
};

std::string Text(const ColorSpace& space) { return ToStdString(space.ToSerializedString()); }
std::string Text(const ColorManagementSettings& s) { return ToStdString(s.ToSerializedString()); }
ColorSpace ReadSpace(std::string_view text) { return ColorSpaceFromSerializedString(U8(text)); }
ColorManagementSettings ReadSettings(std::string_view text) {
  return ColorManagementSettingsFromSerializedString(U8(text));
}
ColorSpace WithBytes(ColorSpace space, const Bytes& bytes) {
  auto block = zebcore::allocator::RecycledMemory::Create(bytes.size());
  if (!bytes.empty()) std::memcpy(block->GetData(), bytes.data(), bytes.size());
  space.baseColorProfile.colorProfileData = std::move(block);
  return space;
}
ColorManagementSettings Settings(std::uint32_t luminance, std::uint32_t method,
                                 std::string_view file, std::uint32_t system, bool toneMap) {
  return ColorManagementSettings(static_cast<GraphicsWhiteLuminance>(luminance),
                                 static_cast<LUTInterpolationMethod>(method), U8(file),
                                 static_cast<ColorManagementSystem>(system), toneMap);
}

// ---------------------------------------------------------------------------
// Records and identifiers.

TEST(ColorSpace, PredicatesAndTypeStringFollowTheType) {
  const std::pair<std::uint32_t, const char*> kCases[] = {
      {0, ""}, {1, "tagged"}, {2, "icc"}, {3, "ocio"}, {4, ""}, {5, ""}, {0xFFFFFFFFu, ""}};
  for (const auto& [type, typeString] : kCases) {
    SCOPED_TRACE(type);
    const ColorSpace space = MakeSpace("", type);
    EXPECT_EQ(space.IsModel(), type == 1);
    EXPECT_EQ(space.IsICC(), type == 2);
    EXPECT_EQ(space.IsOCIO(), type == 3);
    EXPECT_EQ(space.IsNonColorManaged(), type == 4);
    EXPECT_EQ(ToStdString(space.GetColorSpaceTypeString()), typeString);
    // An empty profile is an empty space with no identifier, whatever the type.
    EXPECT_TRUE(space.empty() && space.ToGuid().IsNull() && space.cachedGuid.IsNull());
  }
}

TEST(ColorProfile, IdentifiersHashTheContentInOrder) {
  Bytes twenty(20);
  std::iota(twenty.begin(), twenty.end(), 0);
  const std::pair<ColorSpace, const char*> kCases[] = {
      {MakeSpace("BT.709 RGB Full"), "66801ad4-51fb-bf29-22ff-6a4972f6139d"},
      {WithBytes(MakeSpace("sRGB"), {0, 1, 2, 3, 255}), "ab4786a5-4302-fc9f-586c-896ed5378299"},
      {WithBytes(MakeSpace(""), twenty), "ae32e2b8-c4de-c297-8261-bac56c8c1830"},
      {ColorSpace(), "00000000-0000-0000-0000-000000000000"},
  };
  for (const auto& [space, guid] : kCases) {
    EXPECT_EQ(space.baseColorProfile.ToGuid().ToString(), guid);
  }
  // A zero-byte block hashes like no block, yet it is written, so the value
  // differs, and on its own it makes a profile that is not empty.
  EXPECT_EQ(WithBytes(MakeSpace("P3"), {}).baseColorProfile.ToGuid(),
            MakeSpace("P3").baseColorProfile.ToGuid());
  EXPECT_NE(WithBytes(MakeSpace("P3"), {}), MakeSpace("P3"));
  const ColorProfile blockOnly = WithBytes(ColorSpace(), {}).baseColorProfile;
  EXPECT_FALSE(blockOnly.empty() || blockOnly.ToGuid().IsNull());
}

TEST(ColorSpace, EachFieldChangesTheGuid) {
  const ColorSpace base = DefaultSpace();
  std::set<Guid> seen = {base.ToGuid()};
  for (const ColorSpace& variant :
       {MakeSpace("BT.709 RGB Limited", 1), WithBytes(DefaultSpace(), {7}),
        MakeSpace("BT.709 RGB Full", 2), MakeSpace("BT.709 RGB Full", 1, true)}) {
    SCOPED_TRACE(Text(variant));
    EXPECT_NE(variant, base);
    EXPECT_TRUE(seen.insert(variant.ToGuid()).second);
  }
}

TEST(ColorSpace, MemoKeepsTheFirstIdentifierUntilCleared) {
  ColorSpace space = DefaultSpace();
  const Guid first = space.ToGuid();
  space.baseProfileType = kColorSpaceType_ICC;
  EXPECT_EQ(space.ToGuid(), first);
  EXPECT_EQ(ColorSpace(space).cachedGuid, first);  // copies keep the memo
  space.cachedGuid = Guid();
  EXPECT_NE(space.ToGuid(), first);
}

TEST(ColorSpace, OrderingIsStrictWeakAndAgreesWithEquality) {
  // clang-format off
  const std::vector<ColorSpace> values = {
      ColorSpace(), MakeSpace("a"), MakeSpace("a", 1), MakeSpace("a", 1, true), MakeSpace("b"),
      MakeSpace("", 4), WithBytes(MakeSpace("a"), {}), WithBytes(MakeSpace("a"), {0}), WithBytes(MakeSpace("a"), {1})};
  // clang-format on
  for (std::size_t i = 0; i < values.size(); ++i) {
    for (std::size_t j = 0; j < values.size(); ++j) {
      SCOPED_TRACE(i * 100 + j);
      const ColorSpace &a = values[i], &b = values[j];
      EXPECT_EQ(a == b, i == j);
      EXPECT_EQ(!(a < b) && !(b < a), a == b);
      for (const ColorSpace& c : values) EXPECT_FALSE(a < b && b < c && !(a < c));
    }
  }
}

TEST(ColorManagementSettings, IsValidOnlyForKnownLuminances) {
  for (std::uint32_t nits : {0u, 99u, 100u, 203u, 250u, 300u, 0xFFFFFFFFu}) {
    SCOPED_TRACE(nits);
    EXPECT_EQ(Settings(nits, 1, "x", 1, true).IsValid(), nits == 100 || nits == 203 || nits == 300);
  }
}

TEST(ColorDescriptions, PlainAndLocalizedTexts) {
  auto& localizer = zebcore::config::Localizer::Get();
  localizer.ClearTranslations();
  // clang-format off
  struct Case { std::uint32_t value; int localized; const char16_t* system; const char16_t* lut; };
  constexpr Case kCases[] = {
      {0, 1, u"Korvo color managed", u"Trilinear"},
      {1, 0, u"OCIO color managed", u"Tetrahedral"},
      {1, 2, u"OCIO color managed", u"Tetrahedral"},
      {1, 1, u"OCIO color managed", u"Tetrahedral (requires GPU acceleration)"},
      {2, 1, u"", u""},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.value * 10 + static_cast<std::uint32_t>(c.localized));
    EXPECT_EQ(GetColorManagementSystemDescription(static_cast<ColorManagementSystem>(c.value),
                                                  c.localized),
              c.system);
    EXPECT_EQ(GetLUTInterpolationMethodDescription(static_cast<LUTInterpolationMethod>(c.value),
                                                   c.localized),
              c.lut);
  }
  localizer.InstallTranslations(
      {{"$$$/zebmediatypes/LUTInterpolationMethod/TriLinear", u"Trilinéaire"}});
  EXPECT_EQ(GetLUTInterpolationMethodDescription(kLUTInterpolationMethod_TriLinear, 1),
            u"Trilinéaire");
  EXPECT_EQ(GetLUTInterpolationMethodDescription(kLUTInterpolationMethod_TriLinear, 0),
            u"Trilinear");
  localizer.ClearTranslations();
  // clang-format off
  const std::pair<std::uint32_t, const char16_t*> kLuminances[] = {
      {100, u"100 (63% HLG, 51% PQ)"}, {203, u"203 (75% HLG, 58% PQ)"}, {300, u"300 (81% HLG, 62% PQ)"}, {250, u""}};
  // clang-format on
  for (const auto& [nits, text] : kLuminances) {
    EXPECT_EQ(GetGraphicsWhiteLuminanceDescription(static_cast<GraphicsWhiteLuminance>(nits)),
              text);
  }
  EXPECT_EQ(GetColorSpaceDescription(MakeSpace("Rec. 2020 \xE2\x80\x94 PQ", 3)),
            u"Rec. 2020 \u2014 PQ");
}

// ---------------------------------------------------------------------------
// Texts.

TEST(ColorSpace, GoldenTextsAndIdentifiers) {
  const ColorSpace icc = WithBytes(MakeSpace("sRGB", 2, true), {0, 1, 2, 3, 255});
  // clang-format off
  struct Case { ColorSpace space; const char* text; const char* guid; };
  const Case kCases[] = {
      {ColorSpace(), "{}", "00000000-0000-0000-0000-000000000000"},
      {MakeSpace("", 0xFFFFFFFFu), R"({"baseProfileType":4294967295})", "00000000-0000-0000-0000-000000000000"},
      {DefaultSpace(), R"({"baseColorProfile":{"colorProfileName":"BT.709 RGB Full"},"baseProfileType":1})",
       "7dd30e4d-f1da-79cb-adb4-da901cf3a9a7"},
      {icc, R"({"baseColorProfile":{"colorProfileData":"AAECA/8=","colorProfileName":"sRGB"},)"
            R"("baseProfileType":2,"colorSpaceLinearized":true})", "ed5f92fb-72d4-7af2-8f31-0d98f53704e3"},
      {WithBytes(ColorSpace(), {}), R"({"baseColorProfile":{"colorProfileData":""}})", nullptr},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Text(c.space), c.text);
    EXPECT_EQ(ReadSpace(c.text), c.space);
    if (c.guid != nullptr) {
      EXPECT_EQ(c.space.ToGuid().ToString(), c.guid);
    }
  }
  // Identifying the space fills the profile's memo too.
  EXPECT_FALSE(icc.ToGuid().IsNull());
  EXPECT_EQ(icc.baseColorProfile.cachedGuid.ToString(), "ab4786a5-4302-fc9f-586c-896ed5378299");
}

TEST(ColorManagementSettings, GoldenTextsAndIdentifiers) {
  // Rows differ in content, so each has its own identifier.
  // clang-format off
  struct Case { ColorManagementSettings settings; const char* text; const char* guid; };
  const Case kCases[] = {
      {ColorManagementSettings(), "{}", "a685ebe6-9f49-d9d9-eb17-888aac58a401"},
      {Settings(203, 0, "", 0, false), R"({"graphicsWhiteLuminance":203})", nullptr},
      {Settings(100, 1, "", 0, false), R"({"lutInterpolationMethod":1})", nullptr},
      {Settings(100, 0, "", 1, false), R"({"colorManagementSystem":1})", nullptr},
      {Settings(100, 0, "", 0, true), R"({"autoToneMapEnabled":true})", nullptr},
      {Settings(100, 0, "/cfg/a \"b\".ocio", 0, false), R"({"ocioConfigurationFile":"/cfg/a \"b\".ocio"})", nullptr},
      {Settings(203, 1, "/cfg/a.ocio", 1, true),
       R"({"autoToneMapEnabled":true,"colorManagementSystem":1,"graphicsWhiteLuminance":203,)"
       R"("lutInterpolationMethod":1,"ocioConfigurationFile":"/cfg/a.ocio"})", "2f2bfb5c-4380-1f70-21aa-de6003134fe4"},
  };
  // clang-format on
  std::set<Guid> seen;
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Text(c.settings), c.text);
    EXPECT_EQ(ReadSettings(c.text), c.settings);
    EXPECT_TRUE(seen.insert(c.settings.ToGuid()).second);
    if (c.guid != nullptr) {
      EXPECT_EQ(c.settings.ToGuid().ToString(), c.guid);
    }
  }
  // Members given their default values identify as the defaults.
  EXPECT_EQ(Settings(100, 0, "", 0, false).ToGuid(), ColorManagementSettings().ToGuid());
}

TEST(ColorSpace, ReadsEachMemberByItsRule) {
  const ScopedStart started;
  const ColorSpace kFails = DefaultSpace();  // a read that fails gives the default
  // clang-format off
  const std::pair<const char*, ColorSpace> kCases[] = {
      {"{}", ColorSpace()},
      {R"({"baseColorProfile":{"colorProfileName":"N"}})", MakeSpace("N")},
      {R"({"baseColorProfile":{"colorProfileName":12}})", ColorSpace()},
      {R"({"baseColorProfile":{}})", ColorSpace()},
      {R"({"baseColorProfile":{"colorProfileData":7}})", WithBytes(ColorSpace(), {})},  // read as ""
      {R"({"baseColorProfile":"N"})", kFails},
      {R"({"baseColorProfile":null})", kFails},
      {R"({"baseProfileType":3})", MakeSpace("", 3)},
      {R"({"baseProfileType":-2147483648})", MakeSpace("", 0x80000000u)},
      {R"({"baseProfileType":4294967295})", MakeSpace("", 0xFFFFFFFFu)},
      {R"({"baseProfileType":"1"})", kFails},
      {R"({"baseProfileType":1.0})", kFails},
      {R"({"colorSpaceLinearized":"true"})", MakeSpace("", 0, true)},
      {R"({"colorSpaceLinearized":"false"})", ColorSpace()},
      {R"({"colorSpaceLinearized":"TRUE"})", kFails},
      {R"({"colorSpaceLinearized":0.5})", kFails},
      {R"({"unknown":1,"baseProfileType":2})", MakeSpace("", 2)},
      // The wrapper is read through, whatever follows it; one holding no value
      // leaves the outer object (no members known); any other value fails.
      {R"({"SerializerWrappedObject":{"baseColorProfile":{"colorProfileName":"N"}}})", MakeSpace("N")},
      {" \n{\"SerializerWrappedObject\":{\"baseProfileType\":3},\"baseProfileType\":1}", MakeSpace("", 3)},
      {R"({"SerializerWrappedObject":null})", ColorSpace()},
      {R"({"SerializerWrappedObject":3})", kFails},
  };
  // clang-format on
  for (const auto& [text, expected] : kCases) {
    SCOPED_TRACE(text);
    testing::ScopedUsageLogger logger;
    EXPECT_EQ(ReadSpace(text), expected);
    EXPECT_EQ(logger.Events().size(), expected == kFails ? 1u : 0u);
  }
}

TEST(ColorSpace, UndecodableProfileDataFailsTheRead) {
  const ScopedStart started;
  for (const char* data : {R"("AAECA/8")", R"("AA*CA/8=")", R"("A===")"}) {
    SCOPED_TRACE(data);
    testing::ScopedUsageLogger logger;
    EXPECT_EQ(ReadSpace(std::string(R"({"baseColorProfile":{"colorProfileData":)") + data + "}}"),
              DefaultSpace());
    EXPECT_EQ(
        logger.Events(),
        std::vector<std::string>{"ColorSpace/Serialization/ColorSpaceFromSerializedStringFailed"});
  }
}

TEST(ColorSpace, IntegerWiderThanThirtyTwoBitsFailsTheRead) {
  const ScopedStart started;
  // 4294967496 is 2^32 + 200: keeping its low half would read 200.
  for (const char* value : {"4294967496", "4294967296", "-2147483649", "-4294967295",
                            "9223372036854775807", "18446744073709551615"}) {
    SCOPED_TRACE(value);
    EXPECT_EQ(ReadSpace(std::string(R"({"baseProfileType":)") + value + "}"), DefaultSpace());
    for (const char* key :
         {"graphicsWhiteLuminance", "lutInterpolationMethod", "colorManagementSystem"}) {
      EXPECT_EQ(ReadSettings(std::string("{\"") + key + "\":" + value + "}"),
                ColorManagementSettings());
    }
  }
}

TEST(ColorManagementSettings, BooleanGivenAsAnyIntegerCounts) {
  const ScopedStart started;
  // clang-format off
  const std::pair<const char*, bool> kCases[] = {
      {"1", true}, {"0", false}, {"-7", true}, {"4294967296", true}, {"18446744073709551615", true}};
  // clang-format on
  for (const auto& [value, expected] : kCases) {
    SCOPED_TRACE(value);
    EXPECT_EQ(ReadSettings(std::string(R"({"autoToneMapEnabled":)") + value + "}"),
              Settings(100, 0, "", 0, expected));
    EXPECT_EQ(ReadSpace(std::string(R"({"colorSpaceLinearized":)") + value + "}"),
              MakeSpace("", 0, expected));
  }
}

TEST(ColorManagementSettings, ReadsEachMemberByItsRule) {
  const ColorManagementSettings kFails;  // a read that fails gives the defaults
  // clang-format off
  const std::pair<const char*, ColorManagementSettings> kCases[] = {
      {R"({"graphicsWhiteLuminance":203,"autoToneMapEnabled":"true"})", Settings(203, 0, "", 0, true)},
      {R"({"graphicsWhiteLuminance":203,"autoToneMapEnabled":"yes"})", kFails},
      {R"({"autoToneMapEnabled":[]})", kFails},
      {R"({"graphicsWhiteLuminance":250,"lutInterpolationMethod":1})", Settings(250, 1, "", 0, false)},
      {R"({"graphicsWhiteLuminance":203,"lutInterpolationMethod":"1"})", kFails},
      {R"({"colorManagementSystem":1,"ocioConfigurationFile":"/a.ocio"})", Settings(100, 0, "/a.ocio", 1, false)},
      {R"({"colorManagementSystem":-1.5})", kFails},
      {R"({"ocioConfigurationFile":{"a":1},"graphicsWhiteLuminance":300})", Settings(300, 0, "", 0, false)},
      {R"({"SerializerWrappedObject":{"graphicsWhiteLuminance":203,"autoToneMapEnabled":true}})", Settings(203, 0, "", 0, true)},
  };
  // clang-format on
  for (const auto& [text, expected] : kCases) EXPECT_EQ(ReadSettings(text), expected) << text;
}

TEST(ColorSerialization, BadInputGivesTheDefaultRecords) {
  const ScopedStart started;
  std::string deep;
  for (int i = 0; i < 100000; ++i) deep += R"({"baseColorProfile":)";
  // clang-format off
  const std::string kTexts[] = {
      "", "not json", "{", R"({"baseColorProfile":{"colorProfileName":"BT.709)",
      R"({"baseProfileType":1,})", R"({"baseProfileType":1}{})", "[]", "[203]", "null",
      R"("{}")", "true", "203", R"({"baseProfileType":1e999})",
      R"({"graphicsWhiteLuminance":123456789012345678901234567890})",
      R"({"baseProfileType":123456789012345678901234567890})",
      "{\"baseColorProfile\":{\"colorProfileName\":\"\xFF\xFE\"}}x", deep, std::string(200000, '['),
  };
  // clang-format on
  for (const std::string& text : kTexts) {
    SCOPED_TRACE(text.substr(0, 60));
    EXPECT_EQ(ReadSpace(text), DefaultSpace());
    EXPECT_EQ(ReadSettings(text), ColorManagementSettings());
  }
}

TEST(ColorSpace, InvalidUtf8NameIsWrittenAsReplacementCharacters) {
  const ScopedStart started;
  for (const std::string name : {"\xFF", "\xC3", "\xED\xA0\x80", "ok\xE2\x82", "\xC0\xAF"}) {
    SCOPED_TRACE(name.size());
    // The text stays valid JSON: the bad bytes become U+FFFD, the rest of the
    // record is kept.
    const ColorSpace space = MakeSpace(name, 2, true);
    const auto repaired =
        zebcore::string::UTF16to8(zebcore::string::View(zebcore::string::UTF8to16(U8(name))));
    EXPECT_EQ(ColorSpaceFromSerializedString(space.ToSerializedString()),
              MakeSpace(ToStdString(repaired), 2, true));
    // Read: the bytes are taken as they stand or the read fails.
    const ColorSpace read =
        ReadSpace(R"({"baseColorProfile":{"colorProfileName":")" + name + "\"}}");
    EXPECT_TRUE(read == MakeSpace(name) || read == DefaultSpace()) << Text(read);
  }
}

TEST(ColorSpace, EveryRecordRoundTripsWithItsGuid) {
  std::mt19937 random(20261206);
  for (const char* name : {"", "BT.709 RGB Full", "\"quoted\" \\ slash", "tab\tnew\nline",
                           "caf\xC3\xA9 \xE2\x80\x94 \xF0\x9F\x8E\xA8"}) {
    for (std::uint32_t type : {0u, 1u, 2u, 3u, 4u, 5u, 0x7FFFFFFFu, 0x80000000u, 0xFFFFFFFFu}) {
      for (bool linear : {false, true}) {
        for (int size = -1; size < 40; size += 7) {  // -1: no profile bytes at all
          Bytes bytes(size < 0 ? 0u : static_cast<std::size_t>(size));
          for (unsigned char& b : bytes) b = static_cast<unsigned char>(random());
          const ColorSpace plain = MakeSpace(name, type, linear);
          const ColorSpace space = size < 0 ? plain : WithBytes(plain, bytes);
          SCOPED_TRACE(Text(space));
          const ColorSpace back = ColorSpaceFromSerializedString(space.ToSerializedString());
          EXPECT_EQ(back, space);
          EXPECT_EQ(back.ToGuid(), space.ToGuid());
        }
      }
    }
  }
}

TEST(ColorManagementSettings, EveryRecordRoundTripsWithItsGuid) {
  const std::uint32_t kValues[] = {0, 1, 100, 203, 300, 0xFFFFFFFFu};
  for (std::uint32_t luminance : kValues) {
    for (std::uint32_t method : kValues) {
      for (std::uint32_t system : kValues) {
        for (const char* file : {"", "/opt/aces/config.ocio", "C:\\cfg\\\"x\".ocio"}) {
          for (bool toneMap : {false, true}) {
            const ColorManagementSettings s = Settings(luminance, method, file, system, toneMap);
            SCOPED_TRACE(Text(s));
            const auto back = ColorManagementSettingsFromSerializedString(s.ToSerializedString());
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
  EXPECT_EQ(RetrieveColorSpaceFromCache(id), first);
  EXPECT_EQ(RetrieveColorSpaceFromCache(id).cachedGuid, id);
  EXPECT_TRUE(AddColorSpaceToCache(ColorSpace()).IsNull());
  EXPECT_EQ(RetrieveColorSpaceFromCache(Guid()), ColorSpace());
  EXPECT_EQ(RetrieveColorSpaceFromCache(MakeSpace("never added").ToGuid()), ColorSpace());
  // Reading a text enters its result; a failed read enters the default colour
  // space, which is there already.
  const ColorSpace read = ReadSpace(R"({"baseColorProfile":{"colorProfileName":"entered"}})");
  EXPECT_EQ(RetrieveColorSpaceFromCache(read.cachedGuid), MakeSpace("entered"));
  EXPECT_EQ(ReadSpace("{").cachedGuid, DefaultSpace().ToGuid());
}

TEST(ColorSpaceCache, LockTimeoutRunsNothingAndReports) {
  const ScopedStart started;
  const ColorSpace space = MakeSpace("locked-out", 3);
  {
    const testing::ColorLockHolder holder;
    zebcore::debug::ScopedAssertionCapture capture;
    ColorSpace copy = space;
    EXPECT_TRUE(AddColorSpaceToCache(copy).IsNull());
    EXPECT_TRUE(copy.cachedGuid.IsNull());  // the body did not run
    EXPECT_EQ(RetrieveColorSpaceFromCache(space.ToGuid()), ColorSpace());
    EXPECT_EQ(GetDefaultColorSpace(), ColorSpace());
    SetDefaultColorSpace(MakeSpace("not installed"));
    EXPECT_EQ(capture.Count(), 4u);
  }
  // Nothing was entered or replaced while the lock was out of reach.
  EXPECT_EQ(RetrieveColorSpaceFromCache(space.ToGuid()), ColorSpace());
  EXPECT_EQ(GetDefaultColorSpace(), DefaultSpace());
}

TEST(SerializationCache, ClearAllEmptiesBothCaches) {
  auto& profiles = SerializationCache::GetColorProfileCache();
  auto& spaces = SerializationCache::GetColorSpaceCache();
  const ColorSpace space = MakeSpace("text-cached", 2);
  spaces.Add(space.ToSerializedString(), space);
  profiles.Add(U8(R"({"colorProfileName":"text-cached"})"), space.baseColorProfile);
  EXPECT_EQ(spaces.FindValue(space.ToSerializedString()), space);
  EXPECT_EQ(spaces.FindText(space), space.ToSerializedString());
  SerializationCache::ClearAll();
  EXPECT_EQ(profiles.Size() + spaces.Size(), 0u);
}

// ---------------------------------------------------------------------------
// RGBA.

TEST(RGBA, KeepsComponentsAsGivenAndStoresBlueBeforeGreen) {
  static_assert(std::is_trivially_copyable_v<RGBA> && sizeof(RGBA) == 4 * sizeof(float));
  static_assert(RGBA().Red() == 0.0f && RGBA().Blue() == 0.0f && RGBA().Alpha() == 1.0f);
  RGBA set;
  set.SetRed(-0.5f);
  set.SetGreen(2.0f);
  set.SetBlue(1e30f);
  set.SetAlpha(7.0f);
  using Floats = std::array<float, 4>;
  for (const RGBA& v : {RGBA(-0.5f, 2.0f, 1e30f, 7.0f), set}) {
    EXPECT_EQ((Floats{v.Red(), v.Green(), v.Blue(), v.Alpha()}),
              (Floats{-0.5f, 2.0f, 1e30f, 7.0f}));
    Floats stored;
    std::memcpy(stored.data(), &v, sizeof stored);
    EXPECT_EQ(stored, (Floats{-0.5f, 1e30f, 2.0f, 7.0f}));
  }
}

}  // namespace
}  // namespace zebmediatypes::color
