#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/localizer.h>
#include <zebmediatypes/audio_descriptions.h>

#include <algorithm>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;
using zebcore::UTF16String;

std::string Narrow(const UTF16String& text) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(text));
}

// Each row: a text and what it must read.
void ExpectTexts(const std::vector<std::pair<UTF16String, const char*>>& rows) {
  for (const auto& [text, expected] : rows) EXPECT_EQ(Narrow(text), expected);
}

// The description is the mnemonic without its one '&'.
TEST(AudioChannelLabelDescription, EveryLabelHasTextsAndOneAccessKey) {
  for (const AudioChannelDescription& d : GetSupportedAudioChannelDescriptions()) {
    SCOPED_TRACE(static_cast<std::uint32_t>(d.label));
    const std::string description = Narrow(AudioChannelLabelDescription(d.label, false));
    std::string mnemonic = Narrow(AudioChannelLabelDescription(d.label, true));
    ASSERT_EQ(std::count(mnemonic.begin(), mnemonic.end(), '&'), 1);
    EXPECT_EQ(mnemonic.erase(mnemonic.find('&'), 1), description);
    EXPECT_FALSE(description.empty() || AudioChannelLabelAbbreviations(d.label).empty());
  }
  const auto unknown = static_cast<AudioChannelLabel>(126);
  EXPECT_EQ(Narrow(AudioChannelLabelDescription(unknown, false) +
                   AudioChannelLabelAbbreviations(unknown)),
            "");
}

TEST(AudioDescriptions, EnglishDefaultsNameLayoutsStreamsAndChannels) {
  ExpectTexts({
      {AudioChannelLayoutDescription(CreateLegacy51ChannelLayout()), "5.1 (L, R, Ls, Rs, C, LFE)"},
      {AudioChannelConfigurationDescription(
           {CreateBroadcast51ChannelLayout(), CreateStereoChannelLayout()}),
       "5.1 (L, R, C, LFE, Ls, Rs) + Stereo"},
      {GetChannelMappingLabels(ChannelMap::CreateDefaultChannelMap(2), 3, {L::FrontLeft}),
       "L, ?, _"},
  });
  // A huge channel count is reported and clamped.
  zebcore::debug::ScopedAssertionCapture capture;
  const UTF16String text = GetChannelMappingLabels(ChannelMap::CreateDefaultChannelMap(2),
                                                   0xFFFFFFFFu, CreateStereoChannelLayout());
  EXPECT_EQ(capture.Count(), 1u);
  EXPECT_EQ(text.size(), 3 * kAudioChannelCount_Max - 2);
}

// Installs `translations` for the life of the object.
struct ScopedTranslations {
  explicit ScopedTranslations(zebcore::config::Localizer::Translations translations) {
    zebcore::config::Localizer::Get().InstallTranslations(std::move(translations));
  }
  ~ScopedTranslations() { zebcore::config::Localizer::Get().ClearTranslations(); }
};

TEST(AudioDescriptions, EveryTextComesFromItsKey) {
  const std::string p = "$$$/zebmediatypes/";
  const std::string l = p + "AudioChannelLayout/";
  const std::string t = l + "kChannelConfigurationNameTemplate_";
  const std::string n = p + "AudioChannelConfiguration/";
  const ScopedTranslations translations({
      {l + "Stereo", u"stereo"},
      {t + "N", u"tN @0 @7 @8"},
      {p + "kChannelConfigurationNameTemplate_51", u"t51 @0@5"},
      {n + "NMatchingStreams", u"@1*@0"},
      {n + "TwoStreams", u"@1&@0"},
      {p + "ChannelMapDelimiter", u"|"},
      {p + "AudioChannelLabelAbbreviations/Rrs", u"rrs"},
      {p + "AudioChannelLabel/TopFrontCenter", u"top"},
      {p + "AudioChannelLabelMnemonic/TopFrontCenter", u"&top"},
  });
  const AudioChannelLayout stereo = CreateStereoChannelLayout();
  ExpectTexts({
      {AudioChannelLabelDescription(L::TopFrontCenter, false), "top"},
      {AudioChannelLabelDescription(L::TopFrontCenter, true), "&top"},
      {AudioChannelLabelAbbreviations(L::RearSurroundRight), "rrs"},
      {AudioChannelLayoutDescription(CreateLegacy51ChannelLayout()), "t51 LLFE"},
      {AudioChannelLayoutDescription(CreateVST10_2ChannelLayout()), "tN 12 Vhl "},
      {AudioChannelConfigurationDescription({stereo, stereo}), "stereo*2"},
      {AudioChannelConfigurationDescription({stereo, CreateMonoChannelLayout()}), "Mono&stereo"},
      {GetChannelMappingLabels(ChannelMap::CreateDefaultChannelMap(2), 3, stereo), "L|R|_"},
  });
}

}  // namespace
}  // namespace zebmediatypes
