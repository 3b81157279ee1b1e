#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/localizer.h>
#include <zebmediatypes/audio_descriptions.h>

#include <algorithm>
#include <cstdint>
#include <string>
#include <utility>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;
using zebcore::UTF16String;

std::string Narrow(const UTF16String& text) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(text));
}

struct TextCase {
  UTF16String text;
  const char* expected;
};

void ExpectTexts(const std::vector<TextCase>& cases) {
  for (const TextCase& c : cases) {
    SCOPED_TRACE(c.expected);
    EXPECT_EQ(Narrow(c.text), c.expected);
  }
}

TEST(AudioChannelLabelDescription, GivesTheEnglishDefaults) {
  struct Case {
    AudioChannelLabel label;
    const char *description, *mnemonic, *abbreviation;
  };
  // clang-format off
  const Case kCases[] = {
      {L::Discrete, "Mono", "&Mono", "*"},
      {L::LowFrequency, "Low Frequency Effects", "Low Fre&quency Effects", "LFE"},
      {L::BackLeft, "Left Surround", "L&eft Surround", "Ls"},
      {L::TopFrontCenter, "Vertical Height Center", "Vertical Height &Center", "Vhc"},
      {L::LFE2, "Low Frequency Effects 2", "Low Frequency Effects &2", "LFE2"},
      {L::AmbisonicsHOA, "Higher Order Ambisonics", "Higher Order &Ambisonics", "*"},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(static_cast<std::uint32_t>(c.label));
    EXPECT_EQ(Narrow(AudioChannelLabelDescription(c.label, false)), c.description);
    EXPECT_EQ(Narrow(AudioChannelLabelDescription(c.label, true)), c.mnemonic);
    EXPECT_EQ(Narrow(AudioChannelLabelAbbreviations(c.label)), c.abbreviation);
  }
  EXPECT_EQ(Narrow(AudioChannelLabelAbbreviationsUnlocalized(L::AmbisonicsHOA)), "");
  EXPECT_EQ(Narrow(AudioChannelLabelAbbreviationsUnlocalized(L::Discrete)), "*");
}

TEST(AudioChannelLabelDescription, EveryLabelHasTextsAndOneAccessKey) {
  for (const AudioChannelDescription& d : GetSupportedAudioChannelDescriptions()) {
    SCOPED_TRACE(static_cast<std::uint32_t>(d.label));
    const std::string description = Narrow(AudioChannelLabelDescription(d.label, false));
    std::string mnemonic = Narrow(AudioChannelLabelDescription(d.label, true));
    ASSERT_FALSE(description.empty());
    ASSERT_EQ(std::count(mnemonic.begin(), mnemonic.end(), '&'), 1);
    EXPECT_EQ(mnemonic.erase(mnemonic.find('&'), 1), description);
    EXPECT_FALSE(AudioChannelLabelAbbreviations(d.label).empty());
    if (d.label != L::AmbisonicsHOA) {
      EXPECT_EQ(AudioChannelLabelAbbreviations(d.label),
                AudioChannelLabelAbbreviationsUnlocalized(d.label));
    }
  }
}

TEST(AudioChannelLabelDescription, UnknownValuesGiveEmptyTexts) {
  for (std::uint32_t value : {1u, 99u, 120u, 125u, 126u, 144u, 1000u, 0x7FFFFFFFu, 0xFFFFFFFFu}) {
    SCOPED_TRACE(value);
    const auto label = static_cast<AudioChannelLabel>(value);
    EXPECT_TRUE(AudioChannelLabelDescription(label, false).empty());
    EXPECT_TRUE(AudioChannelLabelDescription(label, true).empty());
    EXPECT_TRUE(AudioChannelLabelAbbreviations(label).empty());
    EXPECT_TRUE(AudioChannelLabelAbbreviationsUnlocalized(label).empty());
  }
}

TEST(AudioDescriptions, EnglishDefaultsNameLayoutsStreamsAndChannels) {
  const AudioChannelLayout stereo = CreateStereoChannelLayout(), mono = CreateMonoChannelLayout();
  const AudioChannelLayout fiveOne = CreateBroadcast51ChannelLayout();
  const AudioChannelLayout discrete = CreateMultichannelLayout(2);
  const ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  // clang-format off
  ExpectTexts({
      {AudioChannelLayoutDescription({}), "0 Channels"},
      {AudioChannelLayoutDescription(mono), "Mono"},
      {AudioChannelLayoutDescription(discrete), "2 Channels"},
      {AudioChannelLayoutDescription(stereo), "Stereo"},
      {AudioChannelLayoutDescription({L::FrontRight, L::FrontLeft}), "2 Channels (R L)"},
      {AudioChannelLayoutDescription(CreateMatrixStereoChannelLayout()), "2 Channels (Lt Rt)"},
      {AudioChannelLayoutDescription({L::FrontCenter}), "1 Channel (C)"},
      {AudioChannelLayoutDescription({L::FrontLeft, L::Discrete, L::FrontRight}), "3 Channels (L * R)"},
      {AudioChannelLayoutDescription(fiveOne), "5.1 (L, R, C, LFE, Ls, Rs)"},
      {AudioChannelLayoutDescription(CreateLegacy51ChannelLayout()), "5.1 (L, R, Ls, Rs, C, LFE)"},
      {AudioChannelLayoutDescription(CreateHexagonalChannelLayout()), "6 Channels (L R Ls Rs C Cs)"},
      {AudioChannelLayoutDescription(CreateSmpteDtvChannelLayout()), "SMPTE DTV (L R C LFE Ls Rs Lt Rt)"},
      {AudioChannelLayoutDescription(Create7_1ItuChannelLayout()), "8 Channels (L R C LFE Ls Rs Rls Rrs)"},
      {AudioChannelLayoutDescription(CreateVST10_2ChannelLayout()), "12 Channels (L R C LFE Ls Rs Vhl...)"},
      {AudioChannelLayoutDescription({kChannelMapUnknownLabel, L::FrontLeft}), "2 Channels ( L)"},
      {AudioChannelLayoutDescriptionUnlocalized(fiveOne), "L,R,C,LFE,Ls,Rs,"},
      {AudioChannelLayoutDescriptionUnlocalized({}), ""},
      {AudioChannelConfigurationDescription({}), "(No Audio Streams)"},
      {AudioChannelConfigurationDescription({stereo}), "Stereo"},
      {AudioChannelConfigurationDescription({stereo, stereo}), "2 x Stereo"},
      {AudioChannelConfigurationDescription({fiveOne, stereo}), "5.1 (L, R, C, LFE, Ls, Rs) + Stereo"},
      {AudioChannelConfigurationDescription({stereo, mono, stereo}), "3 Audio Streams"},
      {AudioChannelConfigurationDescription({stereo, stereo, mono}), "3 Audio Streams"},
      {GetChannelMappingLabels(map, 3, stereo), "L, R, _"},
      {GetChannelMappingLabels(map, 3, {L::FrontLeft}), "L, ?, _"},
      {GetChannelMappingLabels(map, 3, discrete), "1, 2, _"},
      {GetChannelMappingLabels(map, 0, stereo), ""},
      {GetChannelName(discrete, 1, true), "2"},
      {GetChannelName(discrete, 1, false), "Mono"},
      {GetChannelName(discrete, 2, true), ""},
      {GetChannelName(stereo, 0, true), "Left"},
      {GetChannelName({}, 0xFFFFFFFFu, true), ""},
      {GetAmbisonicsAudioChannelLabelDescription(0, false), "Ambisonic ACN 0"},
      {GetAmbisonicsAudioChannelLabelDescription(15, true), "AMB15"},
      {GetAmbisonicsAudioChannelLabelDescription(SIZE_MAX, true), "AMB18446744073709551615"},
  });
  // clang-format on
}

TEST(GetChannelMappingLabels, HugeChannelCountIsReportedAndClamped) {
  zebcore::debug::ScopedAssertionCapture capture;
  const UTF16String text = GetChannelMappingLabels(ChannelMap::CreateDefaultChannelMap(2),
                                                   0xFFFFFFFFu, CreateStereoChannelLayout());
  EXPECT_EQ(capture.Count(), 1u);
  EXPECT_EQ(static_cast<std::size_t>(std::count(text.begin(), text.end(), u'_')),
            kAudioChannelCount_Max - 2);
}

// Installs `translations` for the life of the object.
struct ScopedTranslations {
  explicit ScopedTranslations(zebcore::config::Localizer::Translations translations) {
    zebcore::config::Localizer::Get().InstallTranslations(std::move(translations));
  }
  ~ScopedTranslations() { zebcore::config::Localizer::Get().ClearTranslations(); }
};

TEST(AudioDescriptions, LayoutAndStreamTextsComeFromTheirKeys) {
  const std::string p = "$$$/zebmediatypes/",
                    t = p + "AudioChannelLayout/kChannelConfigurationNameTemplate_";
  // clang-format off
  const ScopedTranslations translations({
      {p + "AudioChannelLayout/Mono", u"mono"},
      {p + "AudioChannelLayout/Stereo", u"stereo"},
      {p + "AudioChannelLayout/NChannels", u"n@0"},
      {t + "1", u"t1 @0"},
      {t + "3", u"t3 @0@1@2"},
      {p + "kChannelConfigurationNameTemplate_51", u"t51 @0@5"},
      {t + "6", u"t6 @0@5"},
      {p + "SmpteDtv", u"dtv @7"},
      {t + "8", u"t8 @7"},
      {t + "N", u"tN @0 @7 @8"},
      {p + "AudioChannelConfiguration/Empty", u"none"},
      {p + "AudioChannelConfiguration/NMatchingStreams", u"@1*@0"},
      {p + "AudioChannelConfiguration/TwoStreams", u"@1&@0"},
      {p + "AudioChannelConfiguration/NAudioStreams", u"s@0"},
      {p + "AmbisonicsChannelName", u"acn@0"},
      {p + "AmbisonicsAbbreviatedChannelName", u"amb@0"},
      {p + "ChannelMapDelimiter", u"|"},
      {p + "AudioChannelLabelAbbreviations/Rrs", u"rrs"},
  });
  const AudioChannelLayout stereo = CreateStereoChannelLayout();
  ExpectTexts({
      {AudioChannelLayoutDescription(CreateMonoChannelLayout()), "mono"},
      {AudioChannelLayoutDescription(stereo), "stereo"},
      {AudioChannelLayoutDescription(CreateMultichannelLayout(3)), "n3"},
      {AudioChannelLayoutDescription({L::FrontCenter}), "t1 C"},
      {AudioChannelLayoutDescription(Create_L_R_C_ChannelLayout()), "t3 LRC"},
      {AudioChannelLayoutDescription(CreateLegacy51ChannelLayout()), "t51 LLFE"},
      {AudioChannelLayoutDescription(CreateHexagonalChannelLayout()), "t6 LCs"},
      {AudioChannelLayoutDescription(CreateSmpteDtvChannelLayout()), "dtv Rt"},
      {AudioChannelLayoutDescription(Create7_1ItuChannelLayout()), "t8 rrs"},
      {AudioChannelLayoutDescription(CreateVST10_2ChannelLayout()), "tN 12 Vhl "},
      {AudioChannelConfigurationDescription({}), "none"},
      {AudioChannelConfigurationDescription({stereo, stereo}), "stereo*2"},
      {AudioChannelConfigurationDescription({stereo, CreateMonoChannelLayout()}), "mono&stereo"},
      {AudioChannelConfigurationDescription({stereo, stereo, {}}), "s3"},
      {GetAmbisonicsAudioChannelLabelDescription(4, false), "acn4"},
      {GetAmbisonicsAudioChannelLabelDescription(4, true), "amb4"},
      {GetChannelMappingLabels(ChannelMap::CreateDefaultChannelMap(2), 3, stereo), "L|R|_"},
  });
  // clang-format on
}

TEST(AudioDescriptions, LabelTextsComeFromKeysNamedAfterTheLabel) {
  struct Case {
    AudioChannelLabel label;
    const char *name, *abbreviation;  // abbreviation null where it is not localized
  };
  // clang-format off
  const Case kCases[] = {
      {L::Discrete, "Discrete", nullptr},          {L::FrontLeft, "FrontLeft", "L"},
      {L::TopFrontRight, "TopFrontRight", "Vhr"},  {L::TopFrontCenter, "TopFrontCenter", "Vhc"},
      {L::LeftHeight, "LeftHeight", "Tsl"},        {L::LFE2, "LFE2", "LFE2"},
      {L::ProximityRight, "ProximityRight", "Pr"}, {L::AmbisonicsHOA, "AmbisonicsHOA", nullptr},
  };
  // clang-format on
  const std::string p = "$$$/zebmediatypes/AudioChannelLabel";
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    zebcore::config::Localizer::Translations translations = {
        {p + "/" + c.name, u"description"}, {p + "Mnemonic/" + c.name, u"&mnemonic"}};
    if (c.abbreviation != nullptr)
      translations[p + "Abbreviations/" + c.abbreviation] = u"abbreviation";
    const ScopedTranslations installed(std::move(translations));
    EXPECT_EQ(Narrow(AudioChannelLabelDescription(c.label, false)), "description");
    EXPECT_EQ(Narrow(AudioChannelLabelDescription(c.label, true)), "&mnemonic");
    EXPECT_EQ(Narrow(AudioChannelLabelAbbreviations(c.label)),
              c.abbreviation != nullptr ? "abbreviation" : "*");
    EXPECT_NE(Narrow(AudioChannelLabelAbbreviationsUnlocalized(c.label)), "abbreviation");
  }
}

}  // namespace
}  // namespace zebmediatypes
