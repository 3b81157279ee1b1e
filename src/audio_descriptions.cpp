#include <zebcore/localizer.h>
#include <zebmediatypes/audio_descriptions.h>

#include <array>
#include <cstdint>
#include <cstdio>
#include <iterator>
#include <limits>
#include <string_view>

namespace zebmediatypes {
namespace {

using zebcore::UTF16String;
using zebcore::string::AsciiToUTF16;
using zebcore::string::ReplaceInString;

// The texts of one label: its localizer keys and its fixed abbreviation.
struct LabelTexts {
  std::uint32_t value;
  const char* descriptionKey;
  const char* mnemonicKey;
  const char* abbreviationKey;  // null where the abbreviation is not localized
  const char* abbreviation;     // the fixed abbreviation; "" where there is none
};

#define ZMT_LABEL_KEYS(name, description, mnemonic)             \
  "$$$/zebmediatypes/AudioChannelLabel/" #name "=" description, \
      "$$$/zebmediatypes/AudioChannelLabelMnemonic/" #name "=" mnemonic
#define ZMT_LABEL(value, name, description, mnemonic, abbreviation)                        \
  LabelTexts {                                                                             \
    value, ZMT_LABEL_KEYS(name, description, mnemonic),                                    \
        "$$$/zebmediatypes/AudioChannelLabelAbbreviations/" abbreviation "=" abbreviation, \
        abbreviation                                                                       \
  }

// One row per label, in label order: 0, then 100 to 119, then 127 to 143.
constexpr LabelTexts kLabelTexts[] = {
    LabelTexts{0, ZMT_LABEL_KEYS(Discrete, "Mono", "&Mono"), nullptr, "*"},
    ZMT_LABEL(100, FrontLeft, "Left", "&Left", "L"),
    ZMT_LABEL(101, FrontRight, "Right", "&Right", "R"),
    ZMT_LABEL(102, FrontCenter, "Center", "&Center", "C"),
    ZMT_LABEL(103, LowFrequency, "Low Frequency Effects", "Low Fre&quency Effects", "LFE"),
    ZMT_LABEL(104, BackLeft, "Left Surround", "L&eft Surround", "Ls"),
    ZMT_LABEL(105, BackRight, "Right Surround", "Ri&ght Surround", "Rs"),
    ZMT_LABEL(106, BackCenter, "Center Surround", "Ce&nter Surround", "Cs"),
    ZMT_LABEL(107, FrontLeftOfCenter, "Left Center", "&Left Center", "Lc"),
    ZMT_LABEL(108, FrontRightOfCenter, "Right Center", "&Right Center", "Rc"),
    ZMT_LABEL(109, SideLeft, "Left Surround Direct", "Left Surround &Direct", "Lsd"),
    ZMT_LABEL(110, SideRight, "Right Surround Direct", "Right Surround &Direct", "Rsd"),
    ZMT_LABEL(111, TopCenter, "Top Center Surround", "Top Center S&urround", "Ts"),
    ZMT_LABEL(112, TopFrontLeft, "Vertical Height Left", "Vertical Height &Left", "Vhl"),
    ZMT_LABEL(113, TopFrontRight, "Vertical Height Right", "Vertical Height &Right", "Vhr"),
    ZMT_LABEL(114, TopFrontCenter, "Vertical Height Center", "Vertical Height &Center", "Vhc"),
    ZMT_LABEL(115, TopBackLeft, "Top Back Left", "Top Back L&eft", "Tbl"),
    ZMT_LABEL(116, TopBackRight, "Top Back Right", "Top Back Ri&ght", "Tbr"),
    ZMT_LABEL(117, TopBackCenter, "Top Back Center", "Top Back &Center", "Tbc"),
    ZMT_LABEL(118, FrontLeftWide, "Left Wide", "Left W&ide", "Lw"),
    ZMT_LABEL(119, FrontRightWide, "Right Wide", "Right Wi&de", "Rw"),
    ZMT_LABEL(127, LeftHeight, "Top Side Left", "Top Side Le&ft", "Tsl"),
    ZMT_LABEL(128, RightHeight, "Top Side Right", "Top Side Rig&ht", "Tsr"),
    ZMT_LABEL(129, RearSurroundLeft, "Rear Surround Left", "Rear Surround &Left", "Rls"),
    ZMT_LABEL(130, RearSurroundRight, "Rear Surround Right", "Rear Surround &Right", "Rrs"),
    ZMT_LABEL(131, LFE2, "Low Frequency Effects 2", "Low Frequency Effects &2", "LFE2"),
    ZMT_LABEL(132, LeftTotal, "Left Total", "Left &Total", "Lt"),
    ZMT_LABEL(133, RightTotal, "Right Total", "Right T&otal", "Rt"),
    ZMT_LABEL(134, AmbisonicsW, "Ambisonics W", "Ambisonics &W", "W"),
    ZMT_LABEL(135, AmbisonicsX, "Ambisonics X", "Ambisonics &X", "X"),
    ZMT_LABEL(136, AmbisonicsY, "Ambisonics Y", "Ambisonics &Y", "Y"),
    ZMT_LABEL(137, AmbisonicsZ, "Ambisonics Z", "Ambisonics &Z", "Z"),
    ZMT_LABEL(138, BottomFrontLeft, "Bottom Front Left", "&Bottom Front Left", "Bfl"),
    ZMT_LABEL(139, BottomFrontCenter, "Bottom Front Center", "B&ottom Front Center", "Bfc"),
    ZMT_LABEL(140, BottomFrontRight, "Bottom Front Right", "Bo&ttom Front Right", "Bfr"),
    ZMT_LABEL(141, ProximityLeft, "Proximity Left", "&Proximity Left", "Pl"),
    ZMT_LABEL(142, ProximityRight, "Proximity Right", "Pro&ximity Right", "Pr"),
    LabelTexts{143,
               ZMT_LABEL_KEYS(AmbisonicsHOA, "Higher Order Ambisonics", "Higher Order &Ambisonics"),
               nullptr, ""},
};
static_assert(std::size(kLabelTexts) == kAudioChannelLabelCount);

#undef ZMT_LABEL
#undef ZMT_LABEL_KEYS

// The row of `label`, or null when the value is no label.
constexpr const LabelTexts* FindLabelTexts(AudioChannelLabel label) noexcept {
  const std::size_t index = AudioChannelLabelIndex(label);
  return index < std::size(kLabelTexts) ? &kLabelTexts[index] : nullptr;
}

constexpr bool RowsFollowLabelValues() {
  for (std::size_t i = 0; i < std::size(kLabelTexts); ++i) {
    if (AudioChannelLabelIndex(static_cast<AudioChannelLabel>(kLabelTexts[i].value)) != i) {
      return false;
    }
  }
  return true;
}
static_assert(RowsFollowLabelValues());

constexpr const char* kMonoKey = "$$$/zebmediatypes/AudioChannelLayout/Mono=Mono";
constexpr const char* kStereoKey = "$$$/zebmediatypes/AudioChannelLayout/Stereo=Stereo";
constexpr const char* kNChannelsKey = "$$$/zebmediatypes/AudioChannelLayout/NChannels=@0 Channels";
constexpr const char* k51Key =
    "$$$/zebmediatypes/kChannelConfigurationNameTemplate_51=5.1 (@0, @1, @2, @3, @4, @5)";
constexpr const char* kSmpteDtvKey =
    "$$$/zebmediatypes/SmpteDtv=SMPTE DTV (@0 @1 @2 @3 @4 @5 @6 @7)";
constexpr const char* kManyChannelsKey =
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_N="
    "@0 Channels (@1 @2 @3 @4 @5 @6 @7...)";
// Templates by channel count, 1 to 8 (row 0 unused).
constexpr const char* kCountTemplateKeys[] = {
    nullptr,
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_1=1 Channel (@0)",
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_2="
    "2 Channels (@0 @1)",
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_3="
    "3 Channels (@0 @1 @2)",
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_4="
    "4 Channels (@0 @1 @2 @3)",
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_5="
    "5 Channels (@0 @1 @2 @3 @4)",
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_6="
    "6 Channels (@0 @1 @2 @3 @4 @5)",
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_7="
    "7 Channels (@0 @1 @2 @3 @4 @5 @6)",
    "$$$/zebmediatypes/AudioChannelLayout/kChannelConfigurationNameTemplate_8="
    "8 Channels (@0 @1 @2 @3 @4 @5 @6 @7)",
};
static_assert(std::size(kCountTemplateKeys) == 9);
// The channels listed by the template for nine or more channels.
constexpr std::size_t kManyChannelsListed = 7;

constexpr const char* kNoStreamsKey =
    "$$$/zebmediatypes/AudioChannelConfiguration/Empty=(No Audio Streams)";
constexpr const char* kMatchingStreamsKey =
    "$$$/zebmediatypes/AudioChannelConfiguration/NMatchingStreams=@0 x @1";
constexpr const char* kTwoStreamsKey =
    "$$$/zebmediatypes/AudioChannelConfiguration/TwoStreams=@0 + @1";
constexpr const char* kNStreamsKey =
    "$$$/zebmediatypes/AudioChannelConfiguration/NAudioStreams=@0 Audio Streams";
constexpr const char* kAmbisonicsKey = "$$$/zebmediatypes/AmbisonicsChannelName=Ambisonic ACN @0";
constexpr const char* kAmbisonicsAbbreviatedKey =
    "$$$/zebmediatypes/AmbisonicsAbbreviatedChannelName=AMB@0";
constexpr const char* kDelimiterKey = "$$$/zebmediatypes/ChannelMapDelimiter=, ";

UTF16String Localize(const char* key) { return zebcore::config::Localizer::Get().Localize(key); }

UTF16String UnsignedText(unsigned long long value) {
  char text[24];
  const int length = std::snprintf(text, sizeof text, "%llu", value);
  return AsciiToUTF16(std::string_view(text, static_cast<std::size_t>(length)));
}

UTF16String IntText(int value) {
  char text[16];
  const int length = std::snprintf(text, sizeof text, "%i", value);
  return AsciiToUTF16(std::string_view(text, static_cast<std::size_t>(length)));
}

// Fills the slots @first... of `key`'s text with the abbreviations of the
// first channels of `layout`; slots before `first` take `lead`.
UTF16String FillWithAbbreviations(const char* key, const AudioChannelLayout& layout,
                                  std::size_t first = 0, const UTF16String& lead = {}) {
  std::array<UTF16String, 10> slots;
  if (first > 0) slots[0] = lead;
  for (std::size_t i = first, c = 0; i < slots.size() && c < layout.size(); ++i, ++c) {
    slots[i] = AudioChannelLabelAbbreviations(layout[c].label);
    if (first > 0 && c + 1 == kManyChannelsListed) break;
  }
  return ReplaceInString(Localize(key), slots[0], slots[1], slots[2], slots[3], slots[4], slots[5],
                         slots[6], slots[7], slots[8], slots[9]);
}

}  // namespace

UTF16String AudioChannelLabelDescription(AudioChannelLabel label, bool mnemonic) {
  const LabelTexts* texts = FindLabelTexts(label);
  if (texts == nullptr) return {};
  return Localize(mnemonic ? texts->mnemonicKey : texts->descriptionKey);
}

UTF16String AudioChannelLabelAbbreviations(AudioChannelLabel label) {
  const LabelTexts* texts = FindLabelTexts(label);
  if (texts == nullptr) return {};
  if (texts->abbreviationKey == nullptr) return u"*";  // Discrete and AmbisonicsHOA
  return Localize(texts->abbreviationKey);
}

UTF16String AudioChannelLabelAbbreviationsUnlocalized(AudioChannelLabel label) {
  const LabelTexts* texts = FindLabelTexts(label);
  if (texts == nullptr) return {};
  return AsciiToUTF16(texts->abbreviation);
}

UTF16String GetAmbisonicsAudioChannelLabelDescription(std::size_t index, bool abbreviated) {
  return ReplaceInString(Localize(abbreviated ? kAmbisonicsAbbreviatedKey : kAmbisonicsKey),
                         UnsignedText(index));
}

UTF16String AudioChannelLayoutDescription(const AudioChannelLayout& layout) {
  const std::size_t count = layout.size();
  if (!HasChannelLabeling(layout)) {
    if (count == 1) return Localize(kMonoKey);
    return ReplaceInString(Localize(kNChannelsKey), UnsignedText(count));
  }
  // The named layouts, built once.
  static const AudioChannelLayout kStereo = CreateStereoChannelLayout();
  static const AudioChannelLayout kSurround51 = CreateBroadcast51ChannelLayout();
  static const AudioChannelLayout kSmpteDtv = CreateSmpteDtvChannelLayout();
  switch (count) {
    case 2:
      if (layout == kStereo) return Localize(kStereoKey);
      break;
    case 6:
      if (ContainsSameChannelsIgnoreOrder(layout, kSurround51)) {
        return FillWithAbbreviations(k51Key, layout);
      }
      break;
    case 8:
      if (layout == kSmpteDtv) return FillWithAbbreviations(kSmpteDtvKey, layout);
      break;
    default:
      break;
  }
  if (count < std::size(kCountTemplateKeys)) {
    return FillWithAbbreviations(kCountTemplateKeys[count], layout);
  }
  return FillWithAbbreviations(kManyChannelsKey, layout, 1, UnsignedText(count));
}

UTF16String AudioChannelLayoutDescriptionUnlocalized(const AudioChannelLayout& layout) {
  UTF16String text;
  for (const AudioChannelDescription& d : layout) {
    text += AudioChannelLabelAbbreviationsUnlocalized(d.label);
    text += u',';
  }
  return text;
}

UTF16String AudioChannelConfigurationDescription(const AudioChannelLayoutList& layouts) {
  const std::size_t count = layouts.size();
  if (count == 0) return Localize(kNoStreamsKey);
  if (count == 1) return AudioChannelLayoutDescription(layouts[0]);
  bool allEqual = true;
  for (std::size_t i = 1; i < count && allEqual; ++i) allEqual = layouts[i] == layouts[i - 1];
  if (allEqual) {
    return ReplaceInString(Localize(kMatchingStreamsKey), UnsignedText(count),
                           AudioChannelLayoutDescription(layouts[0]));
  }
  if (count == 2) {
    return ReplaceInString(Localize(kTwoStreamsKey), AudioChannelLayoutDescription(layouts[0]),
                           AudioChannelLayoutDescription(layouts[1]));
  }
  return ReplaceInString(Localize(kNStreamsKey), UnsignedText(count));
}

UTF16String GetChannelMappingLabels(const ChannelMap& map, unsigned int channelCount,
                                    const AudioChannelLayout& layout) {
  UTF16String text;
  if (channelCount == 0) return text;
  const UTF16String delimiter = Localize(kDelimiterKey);
  for (unsigned int c = 0; c < channelCount; ++c) {
    if (c > 0) text += delimiter;
    // Mappings are int: a numbered channel beyond their range has nothing routed to it.
    const int j = c <= static_cast<unsigned int>(std::numeric_limits<int>::max())
                      ? map.Find(static_cast<int>(c))
                      : -1;
    if (j < 0) {
      text += u'_';
    } else if (static_cast<std::size_t>(j) >= layout.size()) {
      text += u'?';
    } else {
      const AudioChannelLabel label = layout[static_cast<std::size_t>(j)].label;
      text += label == AudioChannelLabel::Discrete ? IntText(j + 1)
                                                   : AudioChannelLabelAbbreviations(label);
    }
  }
  return text;
}

UTF16String GetChannelName(const AudioChannelLayout& layout, unsigned int index,
                           bool numberDiscreteChannels) {
  if (index >= layout.size()) return {};
  const AudioChannelLabel label = layout[index].label;
  if (label == AudioChannelLabel::Discrete && numberDiscreteChannels) {
    return UnsignedText(static_cast<unsigned long long>(index) + 1);
  }
  return AudioChannelLabelDescription(label, false);
}

}  // namespace zebmediatypes
