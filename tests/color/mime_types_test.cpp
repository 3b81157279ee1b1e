// MIME type constants.
#include <gtest/gtest.h>
#include <zebmediatypes/mime_types.h>

#include <cstring>
#include <set>
#include <string>
#include <string_view>

namespace zebmediatypes {
namespace {

// Read before any test runs, from a static initializer of this file: the
// constants must already hold their texts.
const std::string gReadAtLoad = kMimeType_Video_MP4.ToString();

TEST(MimeTypes, ExistBeforeStaticInitializersRun) {
  static_assert(kMimeType_Audio_MP3.View() == std::string_view("audio/mp3"));
  EXPECT_EQ(gReadAtLoad, std::string(kMimeType_Video_MP4.c_str()));
  EXPECT_FALSE(gReadAtLoad.empty());
}

TEST(MimeTypes, CatalogueHoldsEachFamilyInOrder) {
  struct Family {
    const char* prefix;
    std::size_t count;
  };
  constexpr Family kFamilies[] = {
      {"application/", 31}, {"audio/", 168}, {"image/", 33}, {"text/", 56}, {"video/", 43}};
  std::size_t index = 0;
  for (const Family& f : kFamilies) {
    SCOPED_TRACE(f.prefix);
    for (std::size_t i = 0; i < f.count; ++i, ++index) {
      ASSERT_LT(index, kMimeTypeCount);
      EXPECT_EQ(kMimeTypes[index].View().substr(0, std::strlen(f.prefix)), f.prefix)
          << kMimeTypes[index].c_str();
    }
  }
  EXPECT_EQ(index, kMimeTypeCount);
  std::set<std::string_view> texts;
  for (const auto& type : kMimeTypes) {
    EXPECT_TRUE(texts.insert(type.View()).second) << type.c_str();
    EXPECT_EQ(std::strlen(type.c_str()), type.size());
  }
}

TEST(MimeTypes, TextsAreKeptExactly) {
  struct Case {
    zebcore::utility::ImmutableString constant;
    const char* text;
  };
  const Case kCases[] = {
      {kMimeType_Application_7Zip, "application/x-7z-compressed"},
      {kMimeType_Application_OctetStream, "application/octet-stream"},
      {kMimeType_Audio_MP3, "audio/mp3"},
      {kMimeType_Audio_MP3_, "audio/x-mp3"},
      {kMimeType_Audio_MP3________, "audio/x-mpeg3"},
      {kMimeType_Audio_RealAudio_, "audio/application/x-pn-realaudio"},
      {kMimeType_Audio_TrueAudio1, "audio/tta; version=\"1\""},
      {kMimeType_Audio_TrueAudio2, "audio/tta; version=\"2\""},
      {kMimeType_Audio_VndRNRealaudio3, "audio/vnd.rn-realaudio; version=\"3\""},
      {kMimeType_Audio_VndDolbyPL2, "audio/vnd.dolby.pl2"},
      {kMimeType_Video_MP4, "video/mp4"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(c.constant.View(), c.text);
  }
}

TEST(MimeTypes, ParametersKeepOneSpaceAfterTheSemicolon) {
  int withParameters = 0;
  for (const auto& type : kMimeTypes) {
    const std::string_view text = type.View();
    const auto semicolon = text.find(';');
    if (semicolon == std::string_view::npos) continue;
    SCOPED_TRACE(type.c_str());
    ++withParameters;
    ASSERT_LT(semicolon + 2, text.size());
    EXPECT_EQ(text[semicolon + 1], ' ');
    EXPECT_NE(text[semicolon + 2], ' ');
  }
  EXPECT_EQ(withParameters, 4);
}

}  // namespace
}  // namespace zebmediatypes
