// Script classes of the audio values: "AudioChannelLayout",
// "AudioBusDescription", "AudioChannelMap" and "AudioFormat", in the script
// namespace "zebmediatypes" (each also a global of its own name).
//
// Every item is defined with the host flag 0x80000; static items (flag 64)
// belong to the class. Script sees, for example:
//
//   var layout = AudioChannelLayout.createCommonAudioChannelLayout(
//       AudioChannelLayout.CHANNELLAYOUT_51);
//   layout.length;                                   // 6
//   layout[3];                                       // 103, AUDIOCHANNELLABEL_LOWFREQUENCY
//   var format = new AudioFormat(48000, 24, layout);
//   format.channelLayout === format.channelLayout;   // true: the held layout object
//   new AudioChannelMap([0, 1, -1]).channelCount;    // 3
//
// Writes that a setter refuses (returns false) leave the value as it was; the
// host reports them to script as a RangeError. Objects the items make are made
// in the calling script context ("layout" of a bus: in the bus's context).
//
// Equality and hashing: each class compares its wrapped value (IsEqual: an
// object of the same class whose value is equal) and hashes exactly the parts
// that equality compares, so that equal objects always hash alike.
#pragma once

#include <zebcore/string.h>
#include <zebmediatypes/audio_bus.h>
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/audio_format.h>
#include <zebmediatypes/channel_map.h>
#include <zebmediatypes/export.h>
#include <zebscripting/script_object.h>

#include <cstdint>
#include <vector>

namespace zebmediatypes::scripting {

using zebscripting::ScriptObjectPtr;

// "AudioChannelLayout": a channel layout (a sequence of 32-bit label values),
// empty at first. No script constructor.
//
// Items, in order: the element count (`length`); the element getter
// (`layout[i]`: the label value, -1 for an index outside [0, length)); the
// read-only "description" (AudioChannelLayoutDescription); static "label"(value)
// (AudioChannelLabelDescription, not mnemonic); static
// "createCommonAudioChannelLayout"(index) (null for an index outside [0, 91));
// static "createAudioChannelLayout"(labels) (null for an empty array; more
// than kAudioChannelCount_Max labels is a parameter error; values that are no
// label are kept); the 37 AUDIOCHANNELLABEL_ constants and the 91
// CHANNELLAYOUT_ constants (audio_constants.h).
class ZEBMEDIATYPES_API AudioChannelLayoutObject : public zebscripting::ScriptObject {
 public:
  AudioChannelLayoutObject();
  static const char* GetClassname() noexcept { return "AudioChannelLayout"; }
  static const char* GetDescription() noexcept;
  static void DefineObject();

  // Take effect on the first call only (the object is then initialized).
  // Label integers are taken as 32-bit label values (-1 is 0xFFFFFFFF).
  void Initialize(const std::vector<int>& labels);
  void Initialize(const AudioChannelLayout& layout);
  // Replaces the labels, initialized or not.
  void SetAudioChannelLayout(const AudioChannelLayout& layout);
  const AudioChannelLayout& GetAudioChannelLayout() const noexcept { return layout_; }

  // True for an "AudioChannelLayout" object with the same labels in order.
  bool IsEqual(const ScriptObjectPtr& other) const override;
  // 64-bit FNV-1a over the count and each label value.
  std::uint64_t Hash() const override;

  // The channel count (at most INT_MAX).
  int GetLength() const noexcept;
  // The label value of channel `index` as a signed 32-bit integer, -1 outside
  // [0, count) (any 64-bit index: `layout[2 ** 40]` reads -1 too).
  int GetByIndex(std::int64_t index) const noexcept;
  zebcore::UTF16String GetLayoutDescription() const;

  static zebcore::UTF16String GetLabel(int contextHandle, int label);
  static ScriptObjectPtr CreateCommonChannelLayout(int contextHandle, int index);
  // Null for an empty array. The caller checks the count (the script item
  // refuses more than kAudioChannelCount_Max labels before reading them).
  static ScriptObjectPtr CreateChannelLayout(int contextHandle, const std::vector<int>& labels);

 private:
  bool initialized_ = false;
  AudioChannelLayout layout_;
};

// "AudioBusDescription": one AudioBusDescription, default at first.
//
// Items: constructor; "name" (text); "layout" (each read a new
// "AudioChannelLayout" object holding a copy; a write takes the labels of an
// "AudioChannelLayout" object and refuses anything else, null included);
// "type" (unsigned, unchecked); the constants TYPE_MAIN 0, TYPE_AUXILIARY 1.
class ZEBMEDIATYPES_API AudioBusDescriptionObject : public zebscripting::ScriptObject {
 public:
  AudioBusDescriptionObject();
  static const char* GetClassname() noexcept { return "AudioBusDescription"; }
  static const char* GetDescription() noexcept {
    return "AudioBusDescription represents a named audio channel layout.";
  }
  static void DefineObject();

  // Takes effect on the first call only.
  void Initialize(const AudioBusDescription& bus);
  const AudioBusDescription& GetBusDescription() const noexcept { return bus_; }

  // True for an "AudioBusDescription" object whose bus is == (name, labels,
  // type).
  bool IsEqual(const ScriptObjectPtr& other) const override;
  // FNV-1a over the name, the labels and the type.
  std::uint64_t Hash() const override;

  zebcore::UTF16String GetName() const { return bus_.GetName(); }
  bool SetName(const zebcore::UTF16String& name);
  ScriptObjectPtr GetLayout() const;
  bool SetLayout(const ScriptObjectPtr& layout);
  unsigned int GetType() const noexcept { return bus_.GetType(); }
  bool SetType(unsigned int type) noexcept;

 private:
  bool initialized_ = false;
  AudioBusDescription bus_;
};

// "AudioChannelMap": one ChannelMap, empty at first.
//
// Items: constructor(channelMap) (none: an empty map; an "AudioChannelMap"
// object: a copy of its map; an array of integers: ConstructFromMappings); the
// constants SOURCECHANNELINDEX_NOMATCH -1 and SOURCECHANNELINDEX_OUTOFRANGE -2;
// the read-only "channelCount"; "getMapping"(index) and
// "setMapping"(index, mapping). An index greater than the channel count is a
// parameter error; "getMapping" gives -1 for a negative index or one equal to
// the count, where "setMapping" sets nothing and returns false.
class ZEBMEDIATYPES_API AudioChannelMapObject : public zebscripting::ScriptObject {
 public:
  AudioChannelMapObject();
  static const char* GetClassname() noexcept { return "AudioChannelMap"; }
  static const char* GetDescription() noexcept {
    return "AudioChannelMap represents a channel map.";
  }
  static void DefineObject();

  void Initialize(const ChannelMap& map) { map_ = map; }
  const ChannelMap& GetChannelMap() const noexcept { return map_; }

  // True for an "AudioChannelMap" object whose map is == (labels and mappings).
  bool IsEqual(const ScriptObjectPtr& other) const override;
  // FNV-1a over the channel count and the mappings (labels left out: maps
  // that are == have equal mappings, so they still hash alike).
  std::uint64_t Hash() const override;

  // No object: an empty map; an "AudioChannelMap" object: a copy of its map;
  // another object is a parameter error.
  bool Construct(const ScriptObjectPtr& channelMap);
  // A ChannelMap of mappings.size() channels (default labels) with channel i
  // mapped to mappings[i]. Refused (false, map unchanged) above
  // kAudioChannelCount_Max channels.
  bool ConstructFromMappings(const std::vector<int>& mappings);

  int GetChannelCount() const noexcept { return map_.GetNumberOfChannels(); }
  int GetMapping(int index) const;
  bool SetMapping(int index, int mapping);

 private:
  ChannelMap map_;
};

// "AudioFormat": one AudioFormat (default at first) and a held
// "AudioChannelLayout" object mirroring its layout.
//
// Items: constructor(samplerate = 44100, bitDepth = 32, channelLayout = none,
// which means stereo); "sampleRate" (0 and values above 2^31 - 1 refused);
// "bitDepth" (8, 16, 24 or 32: below 9 -> 8-bit unsigned, 9 to 16 -> 16-bit,
// 17 to 24 -> 24-bit, above -> 32-bit float; other sample types read 0);
// "channelLayout" (the held object, the same on every read; a write takes the
// labels of an "AudioChannelLayout" object, the held object included, and
// refuses anything else, null included); the constants SAMPLETYPE_8 ... 32.
//
// The held object is locked (ScriptObject::LockObject) while held, and
// unlocked and released when it is replaced or this object is destroyed. When
// no object can be made (the context is gone), none is held and
// "channelLayout" reads null; a later write makes one.
class ZEBMEDIATYPES_API AudioFormatObject : public zebscripting::ScriptObject {
 public:
  AudioFormatObject();
  ~AudioFormatObject() override;
  static const char* GetClassname() noexcept { return "AudioFormat"; }
  static const char* GetDescription() noexcept {
    return "AudioFormat describes the format in the form of the sample rate, the bit depth and "
           "the channel layout.";
  }
  static void DefineObject();

  // Takes effect on the first call only (and not after the constructor):
  // copies the format, then makes, locks and holds its layout object.
  void Initialize(const AudioFormat& format);
  const AudioFormat& GetAudioFormat() const noexcept { return format_; }

  // True for an "AudioFormat" object whose format is ==.
  bool IsEqual(const ScriptObjectPtr& other) const override;
  // FNV-1a over the rate, the sample type and the labels.
  std::uint64_t Hash() const override;

  // The script constructor; effective once. A sample rate above 2^31 - 1 is a
  // parameter error; a layout object of another class is refused by the host.
  bool Construct(unsigned int samplerate, unsigned int bitDepth, const ScriptObjectPtr& layout);

  // The rate as unsigned (a negative native rate reads as its 32-bit pattern).
  unsigned int GetSamplerate() const noexcept;
  bool SetSamplerate(unsigned int samplerate) noexcept;
  unsigned int GetSampleType() const noexcept;
  bool SetSampleType(unsigned int bitDepth) noexcept;
  // The held layout object; null when none could be made.
  ScriptObjectPtr GetChannelLayout() const { return heldLayout_; }
  bool SetChannelLayout(const ScriptObjectPtr& layout);

 private:
  // Makes a new layout object holding the format's layout in this object's
  // context, locks and holds it; the previous one is unlocked and released.
  void HoldNewLayoutObject();
  void ReleaseHeldLayout() noexcept;

  bool initialized_ = false;
  AudioFormat format_;
  ScriptObjectPtr heldLayout_;
};

// The sample type for a bit depth, as the "bitDepth" write maps it, and the
// bit depth a sample type reads as (0 for a value that is none of the four).
ZEBMEDIATYPES_API AudioSampleType SampleTypeForBitDepth(unsigned int bitDepth) noexcept;
ZEBMEDIATYPES_API unsigned int BitDepthForSampleType(AudioSampleType type) noexcept;

// Factories: a new object of the class in script context `contextHandle`;
// null when none can be made there.
ZEBMEDIATYPES_API ScriptObjectPtr CreateAudioChannelLayoutObject(const AudioChannelLayout& layout,
                                                                 int contextHandle);
ZEBMEDIATYPES_API ScriptObjectPtr CreateAudioFormatObject(const AudioFormat& format,
                                                          int contextHandle);

}  // namespace zebmediatypes::scripting
