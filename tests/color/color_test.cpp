// Colour records, their texts and identifiers, the caches and RGBA.
#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/color/rgba.h>
#include <zebmediatypes/initialization.h>

#include <array>
#include <cstdint>
#include <cstring>
#include <numeric>
#include <random>
#include <set>
#include <type_traits>

#include "color/color_test_support.h"

namespace zebmediatypes::color {
namespace {

using testing::DefaultSpace;
using testing::MakeSpace;
using testing::U8;
using zebcore::string::ToStdString;
using zebcore::utility::Guid;
using Bytes = std::vector<unsigned char>;

// The library stays started (default colour space installed) for every test.
class LibraryStarted : public ::testing::Environment {
  void SetUp() override { Initialize(); }
  void TearDown() override { Terminate(); }
};
const auto* const kStarted = ::testing::AddGlobalTestEnvironment(new LibraryStarted);

std::string Text(const ColorSpace& space) { return ToStdString(space.ToSerializedString()); }
// An object of one member, its value given as JSON text.
std::string Json(std::string_view key, std::string_view value) {
  return "{\"" + std::string(key) + "\":" + std::string(value) + "}";
}
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

TEST(ColorProfile, IdentifiersHashTheContentInOrder) {
  const auto id = [](const ColorSpace& s) { return s.baseColorProfile.ToGuid().ToString(); };
  Bytes twenty(20);
  std::iota(twenty.begin(), twenty.end(), 0);
  EXPECT_EQ(id(MakeSpace("BT.709 RGB Full")), "66801ad4-51fb-bf29-22ff-6a4972f6139d");
  EXPECT_EQ(id(WithBytes(ColorSpace(), twenty)), "ae32e2b8-c4de-c297-8261-bac56c8c1830");
  EXPECT_EQ(id(ColorSpace()), "00000000-0000-0000-0000-000000000000");
  // A zero-byte block hashes like no block (on its own it still makes a
  // profile that is not empty, see the golden texts).
  EXPECT_EQ(id(WithBytes(MakeSpace("P3"), {})), id(MakeSpace("P3")));
}

TEST(ColorSpace, OrderingIsStrictWeakAndAgreesWithEquality) {
  const std::vector<ColorSpace> values = {
      ColorSpace(),
      MakeSpace("a"),
      MakeSpace("a", 1),
      MakeSpace("a", 1, true),
      MakeSpace("b"),
      MakeSpace("", 4),
      WithBytes(MakeSpace("a"), {}),
      WithBytes(MakeSpace("a"), {0}),
      WithBytes(MakeSpace("a"), {1}),
  };
  for (std::size_t i = 0; i < values.size(); ++i)
    for (std::size_t j = 0; j < values.size(); ++j) {
      SCOPED_TRACE(i * 100 + j);
      const ColorSpace &a = values[i], &b = values[j];
      EXPECT_EQ(a == b, i == j);
      EXPECT_EQ(!(a < b) && !(b < a), a == b);
      for (const ColorSpace& c : values) EXPECT_FALSE(a < b && b < c && !(a < c));
    }
}

// ---------------------------------------------------------------------------
// Texts.

TEST(ColorSpace, GoldenTextsAndIdentifiers) {
  const ColorSpace icc = WithBytes(MakeSpace("sRGB", 2, true), {0, 1, 2, 3, 255});
  struct Case {
    ColorSpace space;
    const char* text;
    const char* guid;
  };
  const Case kCases[] = {
      {ColorSpace(), "{}", "00000000-0000-0000-0000-000000000000"},
      {MakeSpace("", 0xFFFFFFFFu), R"({"baseProfileType":4294967295})",
       "00000000-0000-0000-0000-000000000000"},
      {DefaultSpace(),
       R"({"baseColorProfile":{"colorProfileName":"BT.709 RGB Full"},"baseProfileType":1})",
       "7dd30e4d-f1da-79cb-adb4-da901cf3a9a7"},
      {icc,
       R"({"baseColorProfile":{"colorProfileData":"AAECA/8=","colorProfileName":"sRGB"},)"
       R"("baseProfileType":2,"colorSpaceLinearized":true})",
       "ed5f92fb-72d4-7af2-8f31-0d98f53704e3"},
      // A block of zero bytes alone makes a space that is not empty.
      {WithBytes(ColorSpace(), {}), R"({"baseColorProfile":{"colorProfileData":""}})",
       "122284d0-efb4-3cf0-ed6a-3e4f48225fa7"},
  };
  for (const Case& c : kCases) {
    EXPECT_EQ(Text(c.space), c.text);
    EXPECT_EQ(TryColorSpaceFromSerializedString(U8(c.text)), c.space);
    EXPECT_EQ(c.space.ToGuid().ToString(), c.guid);
  }
  // Identifying the space fills the profile's memo too.
  EXPECT_FALSE(icc.ToGuid().IsNull());
  EXPECT_EQ(icc.baseColorProfile.cachedGuid.ToString(), "ab4786a5-4302-fc9f-586c-896ed5378299");
}

TEST(ColorManagementSettings, GoldenTextsAndIdentifiers) {
  struct Case {
    ColorManagementSettings settings;
    const char* text;
    const char* guid;
  };
  const Case kCases[] = {
      {ColorManagementSettings(), "{}", "a685ebe6-9f49-d9d9-eb17-888aac58a401"},
      {Settings(100, 0, "/cfg/a \"b\".ocio", 0, false),
       R"({"ocioConfigurationFile":"/cfg/a \"b\".ocio"})", "1e5c4462-30ca-9753-7cba-ee3ad9aa80c8"},
      {Settings(203, 1, "/cfg/a.ocio", 1, true),
       R"({"autoToneMapEnabled":true,"colorManagementSystem":1,"graphicsWhiteLuminance":203,)"
       R"("lutInterpolationMethod":1,"ocioConfigurationFile":"/cfg/a.ocio"})",
       "2f2bfb5c-4380-1f70-21aa-de6003134fe4"},
  };
  for (const Case& c : kCases) {
    EXPECT_EQ(ToStdString(c.settings.ToSerializedString()), c.text);
    EXPECT_EQ(TryColorManagementSettingsFromSerializedString(U8(c.text)), c.settings);
    EXPECT_EQ(c.settings.ToGuid().ToString(), c.guid);
  }
}

TEST(ColorSpace, ReadsEachMemberByItsRule) {
  const ColorSpace kFails = DefaultSpace();  // a read that fails gives the default
  const std::pair<const char*, ColorSpace> kCases[] = {
      {R"({"baseColorProfile":{}})", ColorSpace()},
      {R"({"baseColorProfile":{"colorProfileName":12}})", ColorSpace()},
      {R"({"baseColorProfile":{"colorProfileData":7}})",
       WithBytes(ColorSpace(), {})},  // read as ""
      {R"({"unknown":1,"baseProfileType":2})", MakeSpace("", 2)},
      {R"({"baseProfileType":-2147483648})", MakeSpace("", 0x80000000u)},
      {R"({"colorSpaceLinearized":"true"})", MakeSpace("", 0, true)},
      {R"({"colorSpaceLinearized":"false"})", ColorSpace()},
      {R"({"baseColorProfile":"N"})", kFails},
      {R"({"baseProfileType":"1"})", kFails},
      {R"({"baseProfileType":1.0})", kFails},
      {R"({"colorSpaceLinearized":"TRUE"})", kFails},
      // The wrapper is read through, whatever follows it; one holding no value
      // leaves the outer object (no members known); any other value fails.
      {R"({"SerializerWrappedObject":{"baseColorProfile":{"colorProfileName":"N"}}})",
       MakeSpace("N")},
      {" \n{\"SerializerWrappedObject\":{\"baseProfileType\":3},\"baseProfileType\":1}",
       MakeSpace("", 3)},
      {R"({"SerializerWrappedObject":null})", ColorSpace()},
      {R"({"SerializerWrappedObject":3})", kFails},
  };
  for (const auto& [text, expected] : kCases) {
    SCOPED_TRACE(text);
    testing::ScopedUsageLogger logger;
    EXPECT_EQ(ReadSpace(text), expected);
    EXPECT_EQ(logger.Events().size(), expected == kFails ? 1u : 0u);
    EXPECT_EQ(TryColorSpaceFromSerializedString(U8(text)).has_value(), expected != kFails);
  }
}

TEST(ColorSpace, UndecodableProfileDataFailsTheRead) {
  for (const char* data : {R"("AAECA/8")", R"("AA*CA/8=")", R"("A===")"}) {
    SCOPED_TRACE(data);
    EXPECT_EQ(ReadSpace(Json("baseColorProfile", Json("colorProfileData", data))), DefaultSpace());
  }
}

TEST(ColorSerialization, IntegerWiderThanThirtyTwoBitsFailsTheRead) {
  // 4294967496 is 2^32 + 200: keeping its low half would read 200.
  for (const char* value : {"4294967496", "-2147483649", "18446744073709551615"}) {
    SCOPED_TRACE(value);
    EXPECT_EQ(ReadSpace(Json("baseProfileType", value)), DefaultSpace());
    EXPECT_EQ(ReadSettings(Json("graphicsWhiteLuminance", value)), ColorManagementSettings());
  }
}

TEST(ColorSerialization, BooleanGivenAsAnyIntegerCounts) {
  for (const char* value : {"-7", "4294967296", "18446744073709551615"}) {
    SCOPED_TRACE(value);
    EXPECT_EQ(ReadSettings(Json("autoToneMapEnabled", value)), Settings(100, 0, "", 0, true));
    EXPECT_EQ(ReadSpace(Json("colorSpaceLinearized", value)), MakeSpace("", 0, true));
  }
}

TEST(ColorManagementSettings, ReadsEachMemberByItsRule) {
  const ColorManagementSettings kFails;  // a read that fails gives the defaults
  const std::pair<const char*, ColorManagementSettings> kCases[] = {
      {R"({"graphicsWhiteLuminance":203,"autoToneMapEnabled":"true"})",
       Settings(203, 0, "", 0, true)},
      {R"({"graphicsWhiteLuminance":203,"autoToneMapEnabled":"yes"})", kFails},
      {R"({"autoToneMapEnabled":[]})", kFails},
      {R"({"graphicsWhiteLuminance":203,"lutInterpolationMethod":"1"})", kFails},
      {R"({"colorManagementSystem":-1.5})", kFails},
      {R"({"ocioConfigurationFile":{"a":1},"graphicsWhiteLuminance":300})",
       Settings(300, 0, "", 0, false)},
      {R"({"SerializerWrappedObject":{"graphicsWhiteLuminance":203,"autoToneMapEnabled":true}})",
       Settings(203, 0, "", 0, true)},
  };
  for (const auto& [text, expected] : kCases) {
    SCOPED_TRACE(text);
    EXPECT_EQ(ReadSettings(text), expected);
    EXPECT_EQ(TryColorManagementSettingsFromSerializedString(U8(text)).has_value(),
              !(expected == kFails));
  }
}

TEST(ColorSerialization, BadInputGivesTheDefaultRecords) {
  std::string deep;
  for (int i = 0; i < 100000; ++i) deep += R"({"baseColorProfile":)";
  const std::string kTexts[] = {
      "",
      "not json",
      R"({"baseColorProfile":{"colorProfileName":"BT.709)",
      R"({"baseProfileType":1}{})",
      "[203]",
      "null",
      R"({"baseProfileType":1e999})",
      deep,
  };
  for (const std::string& text : kTexts) {
    SCOPED_TRACE(text.substr(0, 60));
    EXPECT_EQ(ReadSpace(text), DefaultSpace());
    EXPECT_EQ(ReadSettings(text), ColorManagementSettings());
  }
}

TEST(ColorSpace, InvalidUtf8NameIsWrittenAsReplacementCharacters) {
  // Written, the text stays valid JSON: the bad bytes become U+FFFD, the rest
  // of the record is kept.
  EXPECT_EQ(ReadSpace(Text(MakeSpace("ok\xE2\x82", 2, true))),
            MakeSpace("ok\xEF\xBF\xBD", 2, true));
  EXPECT_EQ(ReadSpace(Text(MakeSpace("\xC0\xAF"))), MakeSpace("\xEF\xBF\xBD\xEF\xBF\xBD"));
}

// Records that differ in content also differ in their identifiers (a record
// with an empty profile has none).
TEST(ColorSpace, EveryRecordRoundTripsWithItsOwnGuid) {
  std::mt19937 random(20261206);
  std::set<Guid> seen;
  for (const char* name : {"", "BT.709 RGB Full", "\"quoted\" \\ slash", "tab\tnew\nline",
                           "caf\xC3\xA9 \xE2\x80\x94 \xF0\x9F\x8E\xA8"})
    for (std::uint32_t type : {0u, 1u, 2u, 3u, 4u, 5u, 0x7FFFFFFFu, 0x80000000u, 0xFFFFFFFFu})
      for (bool linear : {false, true})
        for (int size = -1; size < 40; size += 7) {  // -1: no profile bytes at all
          Bytes bytes(size < 0 ? 0u : static_cast<std::size_t>(size));
          for (unsigned char& b : bytes) b = static_cast<unsigned char>(random());
          const ColorSpace plain = MakeSpace(name, type, linear);
          const ColorSpace space = size < 0 ? plain : WithBytes(plain, bytes);
          const ColorSpace back = ColorSpaceFromSerializedString(space.ToSerializedString());
          EXPECT_EQ(std::pair(back, back.ToGuid()), std::pair(space, space.ToGuid()));
          EXPECT_TRUE(space.empty() || seen.insert(space.ToGuid()).second) << Text(space);
        }
}

TEST(ColorManagementSettings, EveryRecordRoundTripsWithItsOwnGuid) {
  const std::uint32_t kValues[] = {0, 1, 100, 203, 300, 0xFFFFFFFFu};
  std::set<Guid> seen;
  for (std::uint32_t luminance : kValues)
    for (std::uint32_t method : kValues)
      for (std::uint32_t system : kValues)
        for (const char* file : {"", "/opt/aces/config.ocio", "C:\\cfg\\\"x\".ocio"})
          for (bool toneMap : {false, true}) {
            const ColorManagementSettings s = Settings(luminance, method, file, system, toneMap);
            const auto back = ColorManagementSettingsFromSerializedString(s.ToSerializedString());
            EXPECT_EQ(std::pair(back, back.ToGuid()), std::pair(s, s.ToGuid()));
            EXPECT_TRUE(seen.insert(s.ToGuid()).second);
          }
}

// ---------------------------------------------------------------------------
// Caches.

TEST(ColorSpaceCache, FirstEntryUnderAnIdentifierStays) {
  ColorSpace first = MakeSpace("cache-first", 1);
  const Guid id = AddColorSpaceToCache(first);
  EXPECT_EQ(id, first.ToGuid());
  EXPECT_EQ(first.cachedGuid, id);  // the caller's memo is filled
  ColorSpace changed = first;       // same memo, so the same identifier
  changed.colorSpaceLinearized = true;
  EXPECT_EQ(AddColorSpaceToCache(changed), id);
  EXPECT_EQ(RetrieveColorSpaceFromCache(id), first);
  EXPECT_TRUE(AddColorSpaceToCache(ColorSpace()).IsNull());
  EXPECT_EQ(RetrieveColorSpaceFromCache(MakeSpace("never added").ToGuid()), ColorSpace());
  // Reading a text enters its result; a failed read enters the default colour
  // space, which is there already.
  const ColorSpace read = ReadSpace(R"({"baseColorProfile":{"colorProfileName":"entered"}})");
  EXPECT_EQ(RetrieveColorSpaceFromCache(read.cachedGuid), MakeSpace("entered"));
  EXPECT_EQ(ReadSpace("{").cachedGuid, DefaultSpace().ToGuid());
}

TEST(ColorSpaceCache, LockTimeoutRunsNothingAndReports) {
  ColorSpace space = MakeSpace("locked-out", 3);
  {
    const testing::ColorLockHolder holder;
    zebcore::debug::ScopedAssertionCapture capture;
    EXPECT_TRUE(AddColorSpaceToCache(space).IsNull());
    EXPECT_TRUE(space.cachedGuid.IsNull());  // the body did not run
    EXPECT_EQ(RetrieveColorSpaceFromCache(space.ToGuid()), ColorSpace());
    EXPECT_EQ(GetDefaultColorSpace(), ColorSpace());
    SetDefaultColorSpace(MakeSpace("not installed"));
    EXPECT_EQ(capture.Count(), 4u);
  }
  // Nothing was entered or replaced while the lock was out of reach.
  EXPECT_EQ(RetrieveColorSpaceFromCache(space.ToGuid()), ColorSpace());
  EXPECT_EQ(GetDefaultColorSpace(), DefaultSpace());
}

// ---------------------------------------------------------------------------
// RGBA.

TEST(RGBA, KeepsComponentsAsGivenAndStoresBlueBeforeGreen) {
  static_assert(std::is_trivially_copyable_v<RGBA> && sizeof(RGBA) == 4 * sizeof(float));
  constexpr RGBA v(-0.5f, 2.0f, 1e30f, 7.0f);
  std::array<float, 4> stored;
  std::memcpy(stored.data(), &v, sizeof stored);
  EXPECT_EQ(stored, (std::array{-0.5f, 1e30f, 2.0f, 7.0f}));
}

}  // namespace
}  // namespace zebmediatypes::color
