#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/localizer.h>
#include <zebmediatypes/audio_descriptions.h>

#include <algorithm>
#include <cstdint>
#include <string>
#include <tuple>
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

// Short names for the functions under test, so that table rows stay short.
UTF16String Mn(AudioChannelLabel label) { return AudioChannelLabelDescription(label, true); }
UTF16String Ab(AudioChannelLabel label) { return AudioChannelLabelAbbreviations(label); }
UTF16String D(const AudioChannelLayout& layout) { return AudioChannelLayoutDescription(layout); }
UTF16String S(const AudioChannelLayoutList& l) { return AudioChannelConfigurationDescription(l); }
UTF16String A(std::size_t n, bool abbr) {
  return GetAmbisonicsAudioChannelLabelDescription(n, abbr);
}

TEST(AudioChannelLabelDescription, EveryLabelHasTextsAndOneAccessKey) {
  for (const AudioChannelDescription& d : GetSupportedAudioChannelDescriptions()) {
    SCOPED_TRACE(static_cast<std::uint32_t>(d.label));
    const std::string description = Narrow(AudioChannelLabelDescription(d.label, false));
    std::string mnemonic = Narrow(Mn(d.label));
    ASSERT_FALSE(description.empty());
    ASSERT_EQ(std::count(mnemonic.begin(), mnemonic.end(), '&'), 1);
    EXPECT_EQ(mnemonic.erase(mnemonic.find('&'), 1), description);
    EXPECT_FALSE(Ab(d.label).empty());
    if (d.label != L::AmbisonicsHOA) {
      EXPECT_EQ(Ab(d.label), AudioChannelLabelAbbreviationsUnlocalized(d.label));
    }
  }
}

TEST(AudioChannelLabelDescription, UnknownValuesGiveEmptyTexts) {
  for (std::uint32_t value : {1u, 99u, 120u, 125u, 126u, 144u, 1000u, 0x7FFFFFFFu, 0xFFFFFFFFu}) {
    SCOPED_TRACE(value);
    const auto label = static_cast<AudioChannelLabel>(value);
    EXPECT_EQ(Narrow(AudioChannelLabelDescription(label, false) + Mn(label) + Ab(label) +
                     AudioChannelLabelAbbreviationsUnlocalized(label)),
              "");
  }
}

TEST(AudioDescriptions, EnglishDefaultsNameLabelsLayoutsStreamsAndChannels) {
  const AudioChannelLayout stereo = CreateStereoChannelLayout(), mono = CreateMonoChannelLayout();
  const AudioChannelLayout fiveOne = CreateBroadcast51ChannelLayout();
  const AudioChannelLayout discrete = CreateMultichannelLayout(2);
  const ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);
  const auto M = [&map](unsigned int count, const AudioChannelLayout& layout) {
    return GetChannelMappingLabels(map, count, layout);
  };
  // clang-format off
  ExpectTexts({
      // The description is the mnemonic without its '&' (checked for every label above).
      {Mn(L::Discrete), "&Mono"},                      {Ab(L::Discrete), "*"},
      {Mn(L::BackLeft), "L&eft Surround"},             {Ab(L::BackLeft), "Ls"},
      {Mn(L::LowFrequency), "Low Fre&quency Effects"}, {Ab(L::LowFrequency), "LFE"},
      {Mn(L::LFE2), "Low Frequency Effects &2"},       {Ab(L::LFE2), "LFE2"},
      {Mn(L::TopFrontCenter), "Vertical Height &Center"}, {Ab(L::TopFrontCenter), "Vhc"},
      {Mn(L::AmbisonicsHOA), "Higher Order &Ambisonics"}, {Ab(L::AmbisonicsHOA), "*"},
      {AudioChannelLabelAbbreviationsUnlocalized(L::AmbisonicsHOA), ""},
      {D({}), "0 Channels"},                    {D(mono), "Mono"},
      {D(discrete), "2 Channels"},              {D(stereo), "Stereo"},
      {D({L::FrontCenter}), "1 Channel (C)"},
      {D({L::FrontRight, L::FrontLeft}), "2 Channels (R L)"},
      {D(CreateMatrixStereoChannelLayout()), "2 Channels (Lt Rt)"},
      {D({L::FrontLeft, L::Discrete, L::FrontRight}), "3 Channels (L * R)"},
      {D({kChannelMapUnknownLabel, L::FrontLeft}), "2 Channels ( L)"},
      {D(fiveOne), "5.1 (L, R, C, LFE, Ls, Rs)"},
      {D(CreateLegacy51ChannelLayout()), "5.1 (L, R, Ls, Rs, C, LFE)"},
      {D(CreateHexagonalChannelLayout()), "6 Channels (L R Ls Rs C Cs)"},
      {D(CreateSmpteDtvChannelLayout()), "SMPTE DTV (L R C LFE Ls Rs Lt Rt)"},
      {D(Create7_1ItuChannelLayout()), "8 Channels (L R C LFE Ls Rs Rls Rrs)"},
      {D(CreateVST10_2ChannelLayout()), "12 Channels (L R C LFE Ls Rs Vhl...)"},
      {AudioChannelLayoutDescriptionUnlocalized(fiveOne), "L,R,C,LFE,Ls,Rs,"},
      {AudioChannelLayoutDescriptionUnlocalized({}), ""},
      {S({}), "(No Audio Streams)"},            {S({stereo, stereo}), "2 x Stereo"},
      {S({stereo}), "Stereo"},                  {S({stereo, mono, stereo}), "3 Audio Streams"},
      {S({fiveOne, stereo}), "5.1 (L, R, C, LFE, Ls, Rs) + Stereo"},
      {S({stereo, stereo, mono}), "3 Audio Streams"},
      {M(3, stereo), "L, R, _"},                {M(3, {L::FrontLeft}), "L, ?, _"},
      {M(3, discrete), "1, 2, _"},              {M(0, stereo), ""},
      {GetChannelName(discrete, 1, true), "2"}, {GetChannelName(discrete, 1, false), "Mono"},
      {GetChannelName(discrete, 2, true), ""},  {GetChannelName(stereo, 0, true), "Left"},
      {GetChannelName({}, 0xFFFFFFFFu, true), ""},
      {A(0, false), "Ambisonic ACN 0"},         {A(15, true), "AMB15"},
      {A(SIZE_MAX, true), "AMB18446744073709551615"},
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
  const std::string p = "$$$/zebmediatypes/", l = p + "AudioChannelLayout/",
                    t = l + "kChannelConfigurationNameTemplate_",
                    n = p + "AudioChannelConfiguration/";
  // clang-format off
  const ScopedTranslations translations({
      {l + "Mono", u"mono"},            {l + "Stereo", u"stereo"},      {l + "NChannels", u"n@0"},
      {t + "1", u"t1 @0"},              {t + "3", u"t3 @0@1@2"},        {t + "6", u"t6 @0@5"},
      {t + "8", u"t8 @7"},              {t + "N", u"tN @0 @7 @8"},      {p + "SmpteDtv", u"dtv @7"},
      {p + "kChannelConfigurationNameTemplate_51", u"t51 @0@5"},
      {n + "Empty", u"none"},           {n + "NMatchingStreams", u"@1*@0"},
      {n + "TwoStreams", u"@1&@0"},     {n + "NAudioStreams", u"s@0"},
      {p + "AmbisonicsChannelName", u"acn@0"},
      {p + "AmbisonicsAbbreviatedChannelName", u"amb@0"},
      {p + "ChannelMapDelimiter", u"|"},
      {p + "AudioChannelLabelAbbreviations/Rrs", u"rrs"},
  });
  const AudioChannelLayout stereo = CreateStereoChannelLayout(), mono = CreateMonoChannelLayout();
  ExpectTexts({
      {D(mono), "mono"},                             {D(stereo), "stereo"},
      {D(CreateMultichannelLayout(3)), "n3"},        {D({L::FrontCenter}), "t1 C"},
      {D(Create_L_R_C_ChannelLayout()), "t3 LRC"},   {D(CreateLegacy51ChannelLayout()), "t51 LLFE"},
      {D(CreateHexagonalChannelLayout()), "t6 LCs"}, {D(CreateSmpteDtvChannelLayout()), "dtv Rt"},
      {D(Create7_1ItuChannelLayout()), "t8 rrs"},   {D(CreateVST10_2ChannelLayout()), "tN 12 Vhl "},
      {S({}), "none"},                               {S({stereo, stereo}), "stereo*2"},
      {S({stereo, mono}), "mono&stereo"},            {S({stereo, stereo, {}}), "s3"},
      {A(4, false), "acn4"},                         {A(4, true), "amb4"},
      {GetChannelMappingLabels(ChannelMap::CreateDefaultChannelMap(2), 3, stereo), "L|R|_"},
  });
  // clang-format on
}

TEST(AudioDescriptions, LabelTextsComeFromKeysNamedAfterTheLabel) {
  // Label, its name in keys, and its abbreviation (null where that is not localized).
  // clang-format off
  const std::tuple<AudioChannelLabel, const char*, const char*> kCases[] = {
      {L::Discrete, "Discrete", nullptr},          {L::FrontLeft, "FrontLeft", "L"},
      {L::TopFrontRight, "TopFrontRight", "Vhr"},  {L::TopFrontCenter, "TopFrontCenter", "Vhc"},
      {L::LeftHeight, "LeftHeight", "Tsl"},        {L::LFE2, "LFE2", "LFE2"},
      {L::ProximityRight, "ProximityRight", "Pr"}, {L::AmbisonicsHOA, "AmbisonicsHOA", nullptr},
  };
  // clang-format on
  const std::string p = "$$$/zebmediatypes/AudioChannelLabel";
  for (const auto& [label, name, abbreviation] : kCases) {
    SCOPED_TRACE(name);
    zebcore::config::Localizer::Translations translations = {
        {p + "/" + name, u"description"}, {p + "Mnemonic/" + name, u"&mnemonic"}};
    if (abbreviation != nullptr)
      translations[p + "Abbreviations/" + abbreviation] = u"abbreviation";
    const ScopedTranslations installed(std::move(translations));
    EXPECT_EQ(Narrow(AudioChannelLabelDescription(label, false)), "description");
    EXPECT_EQ(Narrow(Mn(label)), "&mnemonic");
    EXPECT_EQ(Narrow(Ab(label)), abbreviation != nullptr ? "abbreviation" : "*");
    EXPECT_NE(Narrow(AudioChannelLabelAbbreviationsUnlocalized(label)), "abbreviation");
  }
}

}  // namespace
}  // namespace zebmediatypes
