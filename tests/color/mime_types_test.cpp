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
  EXPECT_EQ(gReadAtLoad, "video/mp4");
}

TEST(MimeTypes, CatalogueHoldsEachFamilyInOrderOnceEach) {
  constexpr std::pair<std::string_view, std::size_t> kFamilies[] = {
      {"application/", 31}, {"audio/", 168}, {"image/", 33}, {"text/", 56}, {"video/", 43}};
  std::size_t index = 0;
  for (const auto& [prefix, count] : kFamilies) {
    SCOPED_TRACE(prefix);
    for (std::size_t end = index + count; index < end && index < kMimeTypeCount; ++index)
      EXPECT_EQ(kMimeTypes[index].View().substr(0, prefix.size()), prefix);
  }
  EXPECT_EQ(index, kMimeTypeCount);
  std::set<std::string_view> texts;
  int withParameters = 0;
  for (const auto& type : kMimeTypes) {
    SCOPED_TRACE(type.c_str());
    const std::string_view text = type.View();
    EXPECT_TRUE(texts.insert(text).second);
    EXPECT_EQ(std::strlen(type.c_str()), type.size());
    // Parameters follow the semicolon after exactly one space.
    const auto semicolon = text.find(';');
    if (semicolon == std::string_view::npos) continue;
    ++withParameters;
    EXPECT_TRUE(text.substr(semicolon, 2) == "; " && text.substr(semicolon + 2, 1) != " ");
  }
  EXPECT_EQ(withParameters, 4);
}

}  // namespace
}  // namespace zebmediatypes
