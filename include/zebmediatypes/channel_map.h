// ChannelMap
//
// Routes labelled channels to numbered channels of another stream, typically
// the outputs of an audio device. Channel k of the map carries a list of labels
// (normally one) and the index of the channel it is mapped to, -1 when it is
// not routed. Indices are int; an index is valid when it is 0 or more and below
// GetNumberOfChannels(). Invalid indices give -1, -2, an empty layout or no
// change, as stated below; nothing throws except on allocation failure.
//
//   ChannelMap map = ChannelMap::CreateDefaultChannelMap(2);   // {L}->0, {R}->1
//   map.GetSourceChannelIndexForChannelLabel(AudioChannelLabel::FrontRight);   // 1
//   map.SetDeviceChannelIndexForChannelLabel(AudioChannelLabel::FrontLeft, 1); // {R, L}->1
#pragma once

#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/export.h>

#include <boost/operators.hpp>
#include <vector>

namespace zebmediatypes {

// Results of the source-index lookups.
inline constexpr int kSourceChannelIndex_NoMatch = -1;
inline constexpr int kSourceChannelIndex_OutOfRange = -2;

// The label that ChannelMap(int) gives channels from kChannelMapDefaultLabelCount
// up: no label of the enumeration, so every label lookup treats it as unknown.
inline constexpr AudioChannelLabel kChannelMapUnknownLabel =
    static_cast<AudioChannelLabel>(0xFFFFFFFFu);

// The number of labels in the default label order.
inline constexpr int kChannelMapDefaultLabelCount = 36;

// The label at `index` of the default label order (FrontLeft, FrontRight,
// FrontCenter, LowFrequency, BackLeft, BackRight, FrontLeftOfCenter, ...,
// ProximityRight), or kChannelMapUnknownLabel when `index` is not in [0, 36).
ZEBMEDIATYPES_API AudioChannelLabel GetChannelMapDefaultLabel(int index) noexcept;

class ZEBMEDIATYPES_API ChannelMap : private boost::equality_comparable<ChannelMap> {
 public:
  ChannelMap() = default;
  // `channelCount` unrouted channels (none when it is 0 or negative); channel k
  // carries the label at index k of the default order, kChannelMapUnknownLabel
  // from 36 up.
  explicit ChannelMap(int channelCount);
  // One unrouted channel per channel of `layout`, carrying its label.
  explicit ChannelMap(AudioChannelLayout layout);
  ChannelMap(const ChannelMap&) = default;
  ChannelMap(ChannelMap&&) noexcept = default;
  ChannelMap& operator=(const ChannelMap&) = default;
  ChannelMap& operator=(ChannelMap&&) noexcept = default;
  virtual ~ChannelMap();

  // Mono for 1, L R for 2, L R C LFE Ls Rs for 6, ChannelMap(channelCount)
  // otherwise; channel k is mapped to k. 0 or less gives an empty map.
  static ChannelMap CreateDefaultChannelMap(int channelCount);

  int GetNumberOfChannels() const noexcept { return static_cast<int>(mMappings.size()); }

  // The mapping of channel k, or -1 when k is not valid.
  int operator[](int k) const noexcept;
  // Sets the mapping of channel k; nothing happens when k is not valid.
  void SetChannel(int k, int mapping) noexcept;
  // The first channel mapped to `mapping`, or -1.
  int Find(int mapping) const noexcept;

  // A copy of the labels of channel k; empty when k is not valid.
  AudioChannelLayout GetChannelLayout(int k) const;
  // Replaces the labels of channel k; nothing happens when k is not valid.
  void SetChannelLayout(int k, const AudioChannelLayout& labels);
  // Appends a channel with a copy of `labels` mapped to `mapping`.
  void AddChannel(const AudioChannelLayout& labels, int mapping);

  // The number of labels carried by routed channels (mapping 0 or more). For
  // an identity routing this is the total number of labels.
  int GetNumberOfAssignments() const noexcept;

  // The mapping of the first channel carrying `label`; -1 when no channel
  // carries it, or when that channel is unrouted.
  int GetSourceChannelIndexForChannelLabel(AudioChannelLabel label) const noexcept;
  // The same for the label at `labelIndex` of the default order; -2 when
  // `labelIndex` is not in [0, 36).
  int GetSourceChannelIndexForChannelLabelIndex(int labelIndex) const noexcept;

  // Moves `label` to the channel mapped to `deviceIndex`: removes it from the
  // channel that routes it now (removing that channel when no label is left),
  // then, when `deviceIndex` is 0 or more, adds it to the first channel mapped
  // to `deviceIndex` (unless it is there already) or appends a new channel
  // {label} -> deviceIndex. A negative `deviceIndex` only unroutes the label.
  void SetDeviceChannelIndexForChannelLabel(AudioChannelLabel label, int deviceIndex);

  // Same channels with the same labels in order and the same mappings.
  friend ZEBMEDIATYPES_API bool operator==(const ChannelMap& a, const ChannelMap& b);
  // Same mappings; labels are not compared.
  bool IsMappingEqual(const ChannelMap& other) const noexcept;

 private:
  std::vector<AudioChannelLayout> mChannelLabels;  // parallel to mMappings
  std::vector<int> mMappings;
};

}  // namespace zebmediatypes
