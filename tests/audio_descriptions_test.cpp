#include <gtest/gtest.h>
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

AudioChannelLayout Layout(std::initializer_list<AudioChannelLabel> labels) {
  AudioChannelLayout layout;
  for (AudioChannelLabel label : labels) layout.push_back(label);
  return layout;
}

TEST(AudioChannelLabelDescription, GivesTheEnglishDefaults) {
  struct Case {
    AudioChannelLabel label;
    const char* description;
    const char* mnemonic;
    const char* abbreviation;
  };
  const Case kCases[] = {
      {L::Discrete, "Mono", "&Mono", "*"},
      {L::LowFrequency, "Low Frequency Effects", "Low Fre&quency Effects", "LFE"},
      {L::BackLeft, "Left Surround", "L&eft Surround", "Ls"},
      {L::TopFrontCenter, "Vertical Height Center", "Vertical Height &Center", "Vhc"},
      {L::LFE2, "Low Frequency Effects 2", "Low Frequency Effects &2", "LFE2"},
      {L::AmbisonicsHOA, "Higher Order Ambisonics", "Higher Order &Ambisonics", "*"},
  };
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
    mnemonic.erase(mnemonic.find('&'), 1);
    EXPECT_EQ(mnemonic, description);
    EXPECT_FALSE(AudioChannelLabelAbbreviations(d.label).empty());
    if (d.label != L::AmbisonicsHOA) {
      EXPECT_EQ(AudioChannelLabelAbbreviations(d.label),
                AudioChannelLabelAbbreviationsUnlocalized(d.label));
    }
  }
}

TEST(AudioChannelLabelDescription, UnknownValuesGiveEmptyTexts) {
  constexpr std::uint32_t kUnknown[] = {1, 99, 120, 125, 126, 144, 1000, 0x7FFFFFFF, 0xFFFFFFFF};
  for (std::uint32_t value : kUnknown) {
    SCOPED_TRACE(value);
    const auto label = static_cast<AudioChannelLabel>(value);
    EXPECT_TRUE(AudioChannelLabelDescription(label, false).empty());
    EXPECT_TRUE(AudioChannelLabelDescription(label, true).empty());
    EXPECT_TRUE(AudioChannelLabelAbbreviations(label).empty());
    EXPECT_TRUE(AudioChannelLabelAbbreviationsUnlocalized(label).empty());
  }
}

TEST(AudioChannelLayoutDescription, NamesCommonLayoutsAndListsTheOthers) {
  struct Case {
    AudioChannelLayout layout;
    const char* text;
  };
  const Case kCases[] = {
      {{}, "0 Channels"},
      {CreateMonoChannelLayout(), "Mono"},
      {CreateMultichannelLayout(2), "2 Channels"},
      {CreateStereoChannelLayout(), "Stereo"},
      {Layout({L::FrontRight, L::FrontLeft}), "2 Channels (R L)"},
      {CreateMatrixStereoChannelLayout(), "2 Channels (Lt Rt)"},
      {Layout({L::FrontCenter}), "1 Channel (C)"},
      {Layout({L::FrontLeft, L::Discrete, L::FrontRight}), "3 Channels (L * R)"},
      {CreateBroadcast51ChannelLayout(), "5.1 (L, R, C, LFE, Ls, Rs)"},
      {CreateLegacy51ChannelLayout(), "5.1 (L, R, Ls, Rs, C, LFE)"},
      {CreateHexagonalChannelLayout(), "6 Channels (L R Ls Rs C Cs)"},
      {CreateSmpteDtvChannelLayout(), "SMPTE DTV (L R C LFE Ls Rs Lt Rt)"},
      {Layout({L::FrontRight, L::FrontLeft, L::FrontCenter, L::LowFrequency, L::BackLeft,
               L::BackRight, L::LeftTotal, L::RightTotal}),
       "8 Channels (R L C LFE Ls Rs Lt Rt)"},
      {Create7_1ItuChannelLayout(), "8 Channels (L R C LFE Ls Rs Rls Rrs)"},
      {CreateVST10_2ChannelLayout(), "12 Channels (L R C LFE Ls Rs Vhl...)"},
      {CreateSMPTEDigitalCinema6Channel(), "16 Channels (L R C LFE Ls Rs *...)"},
      {Layout({static_cast<L>(0xFFFFFFFFu), L::FrontLeft}), "2 Channels ( L)"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Narrow(AudioChannelLayoutDescription(c.layout)), c.text);
  }
  EXPECT_EQ(Narrow(AudioChannelLayoutDescriptionUnlocalized(CreateBroadcast51ChannelLayout())),
            "L,R,C,LFE,Ls,Rs,");
  EXPECT_EQ(Narrow(AudioChannelLayoutDescriptionUnlocalized({})), "");
}

TEST(AudioChannelConfigurationDescription, DescribesTheStreamsOfAnItem) {
  const AudioChannelLayout stereo = CreateStereoChannelLayout();
  const AudioChannelLayout mono = CreateMonoChannelLayout();
  const AudioChannelLayout fiveOne = CreateBroadcast51ChannelLayout();
  struct Case {
    AudioChannelLayoutList layouts;
    const char* text;
  };
  const Case kCases[] = {
      {{}, "(No Audio Streams)"},
      {{stereo}, "Stereo"},
      {{stereo, stereo}, "2 x Stereo"},
      {{fiveOne, stereo}, "5.1 (L, R, C, LFE, Ls, Rs) + Stereo"},
      {{stereo, mono, stereo}, "3 Audio Streams"},
      {{stereo, stereo, mono}, "3 Audio Streams"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Narrow(AudioChannelConfigurationDescription(c.layouts)), c.text);
  }
}

TEST(GetChannelMappingLabels, ShowsWhatIsRoutedToEachNumberedChannel) {
  const ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  struct Case {
    unsigned int count;
    AudioChannelLayout layout;
    const char* text;
  };
  const Case kCases[] = {
      {3, CreateStereoChannelLayout(), "L, R, _"}, {3, Layout({L::FrontLeft}), "L, ?, _"},
      {3, CreateMultichannelLayout(2), "1, 2, _"}, {1, CreateStereoChannelLayout(), "L"},
      {0, CreateStereoChannelLayout(), ""},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Narrow(GetChannelMappingLabels(map, c.count, c.layout)), c.text);
  }
}

TEST(GetChannelName, NumbersDiscreteChannelsFromOne) {
  const AudioChannelLayout discrete = CreateMultichannelLayout(2);
  EXPECT_EQ(Narrow(GetChannelName(discrete, 1, true)), "2");
  EXPECT_EQ(Narrow(GetChannelName(discrete, 1, false)), "Mono");
  EXPECT_EQ(Narrow(GetChannelName(discrete, 2, true)), "");
  EXPECT_EQ(Narrow(GetChannelName(CreateStereoChannelLayout(), 0, true)), "Left");
  EXPECT_EQ(Narrow(GetChannelName({}, 0xFFFFFFFFu, true)), "");
}

TEST(GetAmbisonicsAudioChannelLabelDescription, WritesTheIndexAsGiven) {
  EXPECT_EQ(Narrow(GetAmbisonicsAudioChannelLabelDescription(0, false)), "Ambisonic ACN 0");
  EXPECT_EQ(Narrow(GetAmbisonicsAudioChannelLabelDescription(3, false)), "Ambisonic ACN 3");
  EXPECT_EQ(Narrow(GetAmbisonicsAudioChannelLabelDescription(15, true)), "AMB15");
  EXPECT_EQ(Narrow(GetAmbisonicsAudioChannelLabelDescription(SIZE_MAX, true)),
            "AMB18446744073709551615");
}

// Installs `translations` for the life of the object.
class ScopedTranslations {
 public:
  explicit ScopedTranslations(zebcore::config::Localizer::Translations translations) {
    zebcore::config::Localizer::Get().InstallTranslations(std::move(translations));
  }
  ~ScopedTranslations() { zebcore::config::Localizer::Get().ClearTranslations(); }
};

TEST(AudioDescriptions, LayoutAndStreamTextsComeFromTheirKeys) {
  const std::string p = "$$$/zebmediatypes/";
  const ScopedTranslations translations({
      {p + "AudioChannelLayout/Mono", u"mono"},
      {p + "AudioChannelLayout/Stereo", u"stereo"},
      {p + "AudioChannelLayout/NChannels", u"n@0"},
      {p + "AudioChannelLayout/kChannelConfigurationNameTemplate_1", u"t1 @0"},
      {p + "AudioChannelLayout/kChannelConfigurationNameTemplate_3", u"t3 @0@1@2"},
      {p + "kChannelConfigurationNameTemplate_51", u"t51 @0@5"},
      {p + "AudioChannelLayout/kChannelConfigurationNameTemplate_6", u"t6 @0@5"},
      {p + "SmpteDtv", u"dtv @7"},
      {p + "AudioChannelLayout/kChannelConfigurationNameTemplate_8", u"t8 @7"},
      {p + "AudioChannelLayout/kChannelConfigurationNameTemplate_N", u"tN @0 @7 @8"},
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
  struct Case {
    UTF16String text;
    const char* expected;
  };
  const Case kCases[] = {
      {AudioChannelLayoutDescription(CreateMonoChannelLayout()), "mono"},
      {AudioChannelLayoutDescription(stereo), "stereo"},
      {AudioChannelLayoutDescription(CreateMultichannelLayout(3)), "n3"},
      {AudioChannelLayoutDescription(Layout({L::FrontCenter})), "t1 C"},
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
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.expected);
    EXPECT_EQ(Narrow(c.text), c.expected);
  }
}

TEST(AudioDescriptions, LabelTextsComeFromKeysNamedAfterTheLabel) {
  struct Case {
    AudioChannelLabel label;
    const char* name;
    const char* abbreviation;  // null where it is not localized
  };
  const Case kCases[] = {
      {L::Discrete, "Discrete", nullptr},          {L::FrontLeft, "FrontLeft", "L"},
      {L::TopFrontRight, "TopFrontRight", "Vhr"},  {L::TopFrontCenter, "TopFrontCenter", "Vhc"},
      {L::LeftHeight, "LeftHeight", "Tsl"},        {L::LFE2, "LFE2", "LFE2"},
      {L::ProximityRight, "ProximityRight", "Pr"}, {L::AmbisonicsHOA, "AmbisonicsHOA", nullptr},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    zebcore::config::Localizer::Translations translations = {
        {std::string("$$$/zebmediatypes/AudioChannelLabel/") + c.name, u"description"},
        {std::string("$$$/zebmediatypes/AudioChannelLabelMnemonic/") + c.name, u"&mnemonic"}};
    if (c.abbreviation != nullptr) {
      translations[std::string("$$$/zebmediatypes/AudioChannelLabelAbbreviations/") +
                   c.abbreviation] = u"abbreviation";
    }
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
