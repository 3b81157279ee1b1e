// AudioFormat
//
// A stream of uncompressed audio: the sample rate in hertz, the storage of one
// sample and the channel layout, one description per interleaved channel. The
// channel count is the size of the layout. A copyable value; no operation
// reports an error.
//
//   AudioFormat f = AudioFormat::CreateDefaultAudioFormat(6, 48000);
//   f.GetChannelCount();      // 6: L R C LFE Ls Rs
//   f.GetSampleAlignment();   // 24 bytes per sample frame (6 x 32-bit float)
#pragma once

#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/export.h>

#include <boost/operators.hpp>
#include <cstddef>
#include <cstdint>

namespace zebmediatypes {

// The storage of one sample. The values are codes, not bit depths. A
// default-constructed format holds 0, which is none of them.
enum AudioSampleType : std::uint32_t {
  kAudioSampleType_8BitUnsigned = 10,  // 8-bit unsigned integer, 1 byte
  kAudioSampleType_16BitInteger = 20,  // 16-bit signed integer, little endian, 2 bytes
  kAudioSampleType_24BitInteger = 30,  // 24-bit signed integer, little endian, packed, 3 bytes
  kAudioSampleType_32BitFloat = 40,    // 32-bit float in [-1.0, 1.0], 4 bytes
};

// The sample rate that means that no rate is known.
ZEBMEDIATYPES_API extern const int kAudioSampleRate_Invalid;  // -1

class ZEBMEDIATYPES_API AudioFormat : private boost::equality_comparable<AudioFormat> {
 public:
  // Rate 0, sample type 0, no channels.
  AudioFormat() = default;
  AudioFormat(const AudioFormat& other);
  AudioFormat(AudioFormat&& other) noexcept;
  // Copies, then swaps: a copy that fails leaves this format unchanged.
  AudioFormat& operator=(const AudioFormat& other);
  AudioFormat& operator=(AudioFormat&& other) noexcept;
  virtual ~AudioFormat();

  void swap(AudioFormat& other) noexcept;

  // Samples per second per channel. Any value is stored, 0 and negative ones
  // included.
  int GetSampleRate() const noexcept { return mSampleRate; }
  void SetSampleRate(int sampleRate) noexcept { mSampleRate = sampleRate; }

  // Any value is stored, also values that are none of the four types.
  AudioSampleType GetSampleType() const noexcept { return mSampleType; }
  void SetSampleType(AudioSampleType sampleType) noexcept { mSampleType = sampleType; }

  std::size_t GetChannelCount() const noexcept { return mChannelLayout.size(); }

  const AudioChannelLayout& GetChannelLayout() const noexcept { return mChannelLayout; }
  // Copies the layout into `layout` (nothing happens when it is this format's own).
  void GetChannelLayout(AudioChannelLayout& layout) const;
  void SetChannelLayout(const AudioChannelLayout& layout);

  // The description of channel `index`; a Discrete description when `index` is
  // not below the channel count.
  AudioChannelDescription GetChannelDescription(std::size_t index) const noexcept;

  // The position of the first channel with the label of `description`, or
  // GetChannelCount() when no channel carries it.
  std::size_t GetChannelIndex(const AudioChannelDescription& description) const noexcept;

  // Bytes of one sample frame (one sample of every channel): bytes per sample
  // times the channel count; 0 for a sample type that is none of the four. A
  // channel count above kAudioChannelCount_Max is reported through the
  // assertion service and counted as kAudioChannelCount_Max.
  int GetSampleAlignment() const;

  // Equal rates, equal sample types and layouts with the same labels in the
  // same order.
  friend ZEBMEDIATYPES_API bool operator==(const AudioFormat& a, const AudioFormat& b) noexcept;

  // 32-bit float samples at `sampleRate` with a layout chosen by count: 2
  // gives L R, 6 gives L R C LFE Ls Rs, any other count (0 included) that many
  // Discrete channels. A count above kAudioChannelCount_Max is reported through
  // the assertion service and clamped to it.
  static AudioFormat CreateDefaultAudioFormat(std::size_t channelCount, int sampleRate);
  // 32-bit float samples at `sampleRate` with a copy of `layout`.
  static AudioFormat CreateAudioFormat(const AudioChannelLayout& layout, int sampleRate);

 private:
  int mSampleRate = 0;
  AudioSampleType mSampleType = static_cast<AudioSampleType>(0);
  AudioChannelLayout mChannelLayout;
};

inline void swap(AudioFormat& a, AudioFormat& b) noexcept { a.swap(b); }

// Orders formats by sample rate, then by layout (label values compared
// lexicographically, a prefix first), then by sample type. Two formats are
// equivalent under it exactly when they are ==.
struct ZEBMEDIATYPES_API AudioFormatExactCompare {
  bool operator()(const AudioFormat& a, const AudioFormat& b) const noexcept;
};

// Orders formats by sample rate, then by channel count, then by sample type;
// labels are ignored (L R and two Discrete channels are equivalent).
struct ZEBMEDIATYPES_API AudioFormatSimpleCompare {
  bool operator()(const AudioFormat& a, const AudioFormat& b) const noexcept;
};

}  // namespace zebmediatypes
