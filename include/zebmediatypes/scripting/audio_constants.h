// The script constants of "AudioChannelLayout": one per channel label and one
// per common layout.
//
// Both tables are process-wide, built once on first use and constant
// afterwards; safe to read from any thread. "AudioChannelLayout" defines its
// AUDIOCHANNELLABEL_ and CHANNELLAYOUT_ constants from them, in table order.
//
//   GetCommonAudioChannelLayouts()[4].name;        // "CHANNELLAYOUT_51"
//   GetCommonAudioChannelLayouts()[4].factory();   // L R C LFE Ls Rs
#pragma once

#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/export.h>

#include <array>
#include <cstddef>
#include <string>

namespace zebmediatypes::scripting {

// A label constant: its script name, the label (its value) and its description
// ("Front-Left").
struct AudioChannelLabelConstant {
  const char* name;
  AudioChannelLabel label;
  const char* description;
};

// Every label but AmbisonicsHOA, which has no constant.
inline constexpr std::size_t kAudioChannelLabelConstantCount = 37;

// The label constants in definition order (not label order: FRONTLEFTOFCENTER
// comes before BACKCENTER, TOPFRONTCENTER before TOPFRONTRIGHT).
ZEBMEDIATYPES_API const std::array<AudioChannelLabelConstant, kAudioChannelLabelConstantCount>&
GetAudioChannelLabelConstants() noexcept;

// The description of a label constant's label, or nullptr for a value that has
// no constant.
ZEBMEDIATYPES_API const char* GetAudioChannelLabelConstantDescription(
    AudioChannelLabel label) noexcept;

// A common layout: the script constant's name, the factory that builds the
// layout, and the description "<n> Channel Configuration" followed by a space
// and the label constant's description for each channel. The constant's value
// is the entry's index.
struct CommonAudioChannelLayout {
  const char* name;
  AudioChannelLayout (*factory)();
  std::string description;
};

inline constexpr std::size_t kCommonAudioChannelLayoutCount = 91;

// The catalogue: index i is the value of the constant CHANNELLAYOUT_... of
// entry i. Built on first use (every factory is called once, to write the
// descriptions).
ZEBMEDIATYPES_API const std::array<CommonAudioChannelLayout, kCommonAudioChannelLayoutCount>&
GetCommonAudioChannelLayouts();

}  // namespace zebmediatypes::scripting
