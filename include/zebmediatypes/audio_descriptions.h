// Audio descriptions
//
// Display texts for channel labels, channel layouts, multi-stream
// configurations and channel routings, such as "Left Surround",
// "5.1 (L, R, C, LFE, Ls, Rs)", "2 x Stereo" or "L, R, _". Every text a user
// reads comes from the localizer under a key "$$$/zebmediatypes/...=Default";
// without a translation the English default is used. Functions marked
// unlocalized return fixed ASCII text. None fails on any input: labels that
// are not in the enumeration give empty texts (or "*" where stated).
//
//   AudioChannelLayoutDescription(CreateBroadcast51ChannelLayout());
//       // u"5.1 (L, R, C, LFE, Ls, Rs)"
//   AudioChannelConfigurationDescription({stereo, stereo});   // u"2 x Stereo"
#pragma once

#include <zebcore/string.h>
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/channel_map.h>
#include <zebmediatypes/export.h>

#include <cstddef>

namespace zebmediatypes {

// The label's description ("Left Surround"), or with `mnemonic` its menu text
// with '&' before the access key ("L&eft Surround"). Empty for values that are
// no label.
ZEBMEDIATYPES_API zebcore::UTF16String AudioChannelLabelDescription(AudioChannelLabel label,
                                                                    bool mnemonic);

// The label's localized abbreviation ("Ls"); "*" for Discrete and
// AmbisonicsHOA; empty for values that are no label.
ZEBMEDIATYPES_API zebcore::UTF16String AudioChannelLabelAbbreviations(AudioChannelLabel label);

// The label's fixed abbreviation; "*" for Discrete; empty for AmbisonicsHOA
// and for values that are no label.
ZEBMEDIATYPES_API zebcore::UTF16String AudioChannelLabelAbbreviationsUnlocalized(
    AudioChannelLabel label);

// "Ambisonic ACN <index>", or "AMB<index>" when `abbreviated`; the index is
// written as given.
ZEBMEDIATYPES_API zebcore::UTF16String GetAmbisonicsAudioChannelLabelDescription(std::size_t index,
                                                                                 bool abbreviated);

// "Mono", "Stereo", "<n> Channels" for unlabelled layouts (an empty layout is
// "0 Channels"), "1 Channel (C)", "5.1 (L, R, C, LFE, Ls, Rs)" for the 5.1
// channels in any order, "SMPTE DTV (...)" for exactly that layout, and
// "<n> Channels (...)" otherwise; from 9 channels only the first seven
// abbreviations are listed, followed by "...". Discrete channels show as "*".
ZEBMEDIATYPES_API zebcore::UTF16String AudioChannelLayoutDescription(
    const AudioChannelLayout& layout);

// Each channel's fixed abbreviation followed by a comma: L R gives "L,R,".
ZEBMEDIATYPES_API zebcore::UTF16String AudioChannelLayoutDescriptionUnlocalized(
    const AudioChannelLayout& layout);

// The audio streams of one item, one layout per stream: "(No Audio Streams)",
// the one layout's description, "<n> x <description>" when all are equal,
// "<first> + <second>" for two that differ, "<n> Audio Streams" otherwise.
ZEBMEDIATYPES_API zebcore::UTF16String AudioChannelConfigurationDescription(
    const AudioChannelLayoutList& layouts);

// For each numbered channel c in [0, channelCount), which channel j of
// `layout` `map` routes to it (the first map channel mapped to c): "_" when
// none, "?" when j is not a channel of `layout`, j + 1 for a Discrete channel,
// otherwise the label's abbreviation; joined with ", ". Empty for a count of 0.
ZEBMEDIATYPES_API zebcore::UTF16String GetChannelMappingLabels(const ChannelMap& map,
                                                               unsigned int channelCount,
                                                               const AudioChannelLayout& layout);

// The name of channel `index` of `layout`: empty when `index` is not below its
// size; index + 1 in decimal for a Discrete channel when
// `numberDiscreteChannels`; otherwise AudioChannelLabelDescription(label, false).
ZEBMEDIATYPES_API zebcore::UTF16String GetChannelName(const AudioChannelLayout& layout,
                                                      unsigned int index,
                                                      bool numberDiscreteChannels);

}  // namespace zebmediatypes
