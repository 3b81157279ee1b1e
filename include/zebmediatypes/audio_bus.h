// AudioBusDescription
//
// An audio bus of a processing component (a main input, a side chain): a
// display name, the bus's channel layout and whether it is a main or an
// auxiliary bus. Hosts decide whether components connect by comparing layouts
// only (IsEquivalent, AreAudioBusDescriptionsEquivalent).
//
//   auto bus = AudioBusDescription::CreateStereo(u"Side chain", AudioBusDescription::Auxiliary);
//   bus.GetChannelCount();   // 2: L R
#pragma once

#include <zebcore/string.h>
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/export.h>

#include <cstddef>
#include <cstdint>
#include <vector>

namespace zebmediatypes {

class ZEBMEDIATYPES_API AudioBusDescription {
 public:
  enum Type : std::uint32_t {
    Main = 0,       // "Main bus"
    Auxiliary = 1,  // "Auxiliary bus"
  };

  // An empty name, no channels, Main.
  AudioBusDescription() = default;
  AudioBusDescription(zebcore::UTF16String name, const AudioChannelLayout& layout, Type type);
  AudioBusDescription(const AudioBusDescription&) = default;
  AudioBusDescription(AudioBusDescription&&) noexcept = default;
  // Copies, then swaps: a copy that fails leaves this bus unchanged.
  AudioBusDescription& operator=(const AudioBusDescription& other);
  AudioBusDescription& operator=(AudioBusDescription&& other) noexcept;
  ~AudioBusDescription() = default;

  void swap(AudioBusDescription& other) noexcept;

  zebcore::UTF16String GetName() const { return mName; }
  void SetName(const zebcore::UTF16String& name) { mName = name; }

  const AudioChannelLayout& GetLayout() const noexcept { return mLayout; }
  void SetLayout(const AudioChannelLayout& layout) { mLayout = layout; }

  // Any value is stored, also values that are neither Main nor Auxiliary.
  Type GetType() const noexcept { return mType; }
  void SetType(Type type) noexcept { mType = type; }

  std::size_t GetChannelCount() const noexcept { return mLayout.size(); }

  // Buses of one Discrete channel, L R, L R C LFE Ls Rs, and L R C LFE Ls Rs
  // Lc Rc (not the ITU 7.1 order).
  static AudioBusDescription CreateMono(const zebcore::UTF16String& name, Type type);
  static AudioBusDescription CreateStereo(const zebcore::UTF16String& name, Type type);
  static AudioBusDescription CreateSurround51(const zebcore::UTF16String& name, Type type);
  static AudioBusDescription CreateSurround71(const zebcore::UTF16String& name, Type type);

  // Same name, same labels in the same order, same type.
  friend ZEBMEDIATYPES_API bool operator==(const AudioBusDescription& a,
                                           const AudioBusDescription& b);
  friend bool operator!=(const AudioBusDescription& a, const AudioBusDescription& b) {
    return !(a == b);
  }

  // Ignores names and types: with `compareLabels` the layouts must hold the
  // same labels in the same order, without it the same channel count.
  bool IsEquivalent(const AudioBusDescription& other, bool compareLabels) const noexcept;

 private:
  zebcore::UTF16String mName;
  AudioChannelLayout mLayout;
  Type mType = Main;
};

inline void swap(AudioBusDescription& a, AudioBusDescription& b) noexcept { a.swap(b); }

using AudioBusDescriptionVector = std::vector<AudioBusDescription>;

// True when both lists have the same length and the buses at each position are
// IsEquivalent(other, compareLabels). Two empty lists are equivalent.
ZEBMEDIATYPES_API bool AreAudioBusDescriptionsEquivalent(const AudioBusDescriptionVector& a,
                                                         const AudioBusDescriptionVector& b,
                                                         bool compareLabels);

}  // namespace zebmediatypes
