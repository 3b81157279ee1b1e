// Script classes of the audio values.
#include <zebmediatypes/audio_descriptions.h>
#include <zebmediatypes/scripting/audio_constants.h>
#include <zebmediatypes/scripting/audio_objects.h>
#include <zebscripting/definition.h>
#include <zebscripting/factory.h>
#include <zebscripting/utils.h>

#include <algorithm>
#include <climits>
#include <string>
#include <utility>

#include "scripting/script_hash.h"

namespace zebmediatypes::scripting {
namespace {

using zebscripting::ParameterErrorException;
using zebscripting::ParameterType;
using zebscripting::PropertyType;
using zebscripting::ScriptCall;
using zebscripting::ScriptValue;
using zebscripting::definition::kItemFlag_Host;
using zebscripting::definition::kNamespaceFlag_Global;
using zebscripting::definition::ScriptObjectDefinitionBase;
namespace def = zebscripting::definition;

ScriptObjectDefinitionBase& Current() { return *ScriptObjectDefinitionBase::sCurrent; }

// Namespace entries of the four audio classes: "zebmediatypes" and a global of
// the class's own name.
void AddNamespaces(ScriptObjectDefinitionBase& definition, const char* className) {
  if (!definition.IsDefinitionOf(className)) return;
  definition.AddOrModifyNamespace("zebmediatypes", 0);
  definition.AddOrModifyNamespace(className, kNamespaceFlag_Global);
}

// The integers of an array argument, its length checked before any element is
// converted: more than kAudioChannelCount_Max elements is a parameter error.
std::vector<int> ReadChannelArray(const ScriptValue& value, std::size_t index) {
  if (value.IsArray() && value.GetElements().size() > kAudioChannelCount_Max) {
    throw ParameterErrorException(ParameterErrorException::kOutOfRange, index,
                                  "argument " + std::to_string(index + 1) + " has more than " +
                                      std::to_string(kAudioChannelCount_Max) + " channels");
  }
  return zebscripting::conversion::ToIntVector(value, index);
}

// A label value as script's signed 32-bit integer: 0xFFFFFFFF reads -1.
int LabelToInt(AudioChannelLabel label) noexcept {
  const auto value = static_cast<std::uint32_t>(label);
  return value <= static_cast<std::uint32_t>(INT_MAX) ? static_cast<int>(value)
                                                      : -static_cast<int>(~value) - 1;
}

AudioChannelLabel IntToLabel(int value) noexcept {
  return static_cast<AudioChannelLabel>(static_cast<std::uint32_t>(value));
}

void HashLayout(Fnv1aHash& hash, const AudioChannelLayout& layout) noexcept {
  hash.Add(layout.size(), 8);
  for (AudioChannelDescription channel : layout) {
    hash.Add(static_cast<std::uint32_t>(channel.label), 4);
  }
}

}  // namespace

// ---------------------------------------------------------------------------
// AudioChannelLayout

AudioChannelLayoutObject::AudioChannelLayoutObject() : ScriptObject(GetClassname()) {}

const char* AudioChannelLayoutObject::GetDescription() noexcept {
  return "AudioChannelLayout represents a channel layout with named channels proved as constants "
         "AUDIOCHANNELLABEL_ ... An AudioChannelLayout can be created using an Array of these "
         "constants or it could be created using one of the constants CHANNELLAYOUT_ ... to "
         "create a common layout.";
}

void AudioChannelLayoutObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  AddNamespaces(definition, GetClassname());
  using Self = AudioChannelLayoutObject;
  definition.AddProperty(def::ElementCount(PropertyType<int>(), &Self::GetLength,
                                           "Number of audio channels.", kItemFlag_Host));
  definition.AddProperty(def::IndexedGetter(PropertyType<int>(), &Self::GetByIndex,
                                            ParameterType<std::int64_t>("index"),
                                            "Returns an audio channel label.", kItemFlag_Host));
  definition.AddProperty(def::Property("description", PropertyType<zebcore::UTF16String>(),
                                       &Self::GetLayoutDescription,
                                       "Audio channel layout description", kItemFlag_Host));
  definition.AddProperty(def::StaticMethod(
      "label", PropertyType<zebcore::UTF16String>(), &Self::GetLabel,
      "Label string of a single audio channel label", kItemFlag_Host, ParameterType<int>("label")));
  definition.AddProperty(
      def::StaticMethod("createCommonAudioChannelLayout", PropertyType<ScriptObjectPtr>(),
                        &Self::CreateCommonChannelLayout, "Create a common audio channel layout.",
                        kItemFlag_Host, ParameterType<int>("layout")));
  // The labels are read here rather than by the parameter, so that the length
  // is checked before any element is converted.
  def::ScriptItemDefinitionBase create = def::StaticMethod(
      "createAudioChannelLayout", PropertyType<ScriptObjectPtr>(), &Self::CreateChannelLayout,
      "Create a audio channel layout.", kItemFlag_Host, ParameterType<std::vector<int>>("labels"));
  create.SetFunction([](const ScriptCall& call) {
    const ScriptValue& labels = call.arguments[0];
    if (labels.IsNullish()) zebscripting::conversion::ThrowMissing(0, "labels");
    return ScriptValue(CreateChannelLayout(call.contextHandle, ReadChannelArray(labels, 0)));
  });
  definition.AddProperty(std::move(create));
  for (const AudioChannelLabelConstant& constant : GetAudioChannelLabelConstants()) {
    definition.AddProperty(def::Constant(constant.name, static_cast<std::int64_t>(constant.label),
                                         constant.description, kItemFlag_Host));
  }
  const auto& catalogue = GetCommonAudioChannelLayouts();
  for (std::size_t i = 0; i < catalogue.size(); ++i) {
    definition.AddProperty(def::Constant(catalogue[i].name, static_cast<std::int64_t>(i),
                                         catalogue[i].description, kItemFlag_Host));
  }
}

void AudioChannelLayoutObject::Initialize(const std::vector<int>& labels) {
  if (initialized_) return;
  AudioChannelLayout layout;
  layout.reserve(labels.size());
  for (int label : labels) layout.emplace_back(IntToLabel(label));
  layout_.swap(layout);
  initialized_ = true;
}

void AudioChannelLayoutObject::Initialize(const AudioChannelLayout& layout) {
  if (initialized_) return;
  layout_ = layout;
  initialized_ = true;
}

void AudioChannelLayoutObject::SetAudioChannelLayout(const AudioChannelLayout& layout) {
  layout_ = layout;
}

bool AudioChannelLayoutObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const AudioChannelLayoutObject*>(other.get());
  return same != nullptr && same->layout_ == layout_;
}

std::uint64_t AudioChannelLayoutObject::Hash() const {
  Fnv1aHash hash;
  HashLayout(hash, layout_);
  return hash.Value();
}

int AudioChannelLayoutObject::GetLength() const noexcept {
  return static_cast<int>(std::min<std::size_t>(layout_.size(), INT_MAX));
}

int AudioChannelLayoutObject::GetByIndex(std::int64_t index) const noexcept {
  if (index < 0 || static_cast<std::uint64_t>(index) >= layout_.size()) return -1;
  return LabelToInt(layout_[static_cast<std::size_t>(index)].label);
}

zebcore::UTF16String AudioChannelLayoutObject::GetLayoutDescription() const {
  return AudioChannelLayoutDescription(layout_);
}

zebcore::UTF16String AudioChannelLayoutObject::GetLabel(int /*contextHandle*/, int label) {
  return AudioChannelLabelDescription(IntToLabel(label), false);
}

ScriptObjectPtr AudioChannelLayoutObject::CreateCommonChannelLayout(int contextHandle, int index) {
  const auto& catalogue = GetCommonAudioChannelLayouts();
  if (index < 0 || static_cast<std::size_t>(index) >= catalogue.size()) return nullptr;
  return CreateAudioChannelLayoutObject(catalogue[static_cast<std::size_t>(index)].factory(),
                                        contextHandle);
}

ScriptObjectPtr AudioChannelLayoutObject::CreateChannelLayout(int contextHandle,
                                                              const std::vector<int>& labels) {
  if (labels.empty()) return nullptr;
  return zebscripting::utils::CreateScriptObject(
      contextHandle, GetClassname(), [&labels](const ScriptObjectPtr& object) {
        static_cast<AudioChannelLayoutObject&>(*object).Initialize(labels);
      });
}

ScriptObjectPtr CreateAudioChannelLayoutObject(const AudioChannelLayout& layout,
                                               int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, AudioChannelLayoutObject::GetClassname(),
      [&layout](const ScriptObjectPtr& object) {
        static_cast<AudioChannelLayoutObject&>(*object).Initialize(layout);
      });
}

// ---------------------------------------------------------------------------
// AudioBusDescription

AudioBusDescriptionObject::AudioBusDescriptionObject() : ScriptObject(GetClassname()) {}

void AudioBusDescriptionObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  AddNamespaces(definition, GetClassname());
  using Self = AudioBusDescriptionObject;
  definition.AddProperty(def::Constructor<Self>("Construct an AudioBusDescription object"));
  definition.AddProperty(def::Property("name", PropertyType<zebcore::UTF16String>(""),
                                       &Self::GetName, &Self::SetName, "The name of this bus.",
                                       kItemFlag_Host));
  // No class in the setter's type: the setter itself refuses other objects.
  definition.AddProperty(
      def::Property("layout", PropertyType<ScriptObjectPtr>("AudioChannelLayout"), &Self::GetLayout,
                    &Self::SetLayout, "The channel layout of this bus.", kItemFlag_Host));
  definition.AddProperty(def::Property("type", PropertyType<unsigned int>(""), &Self::GetType,
                                       &Self::SetType, "The type of this bus.", kItemFlag_Host));
  definition.AddProperty(
      def::Constant("TYPE_MAIN", AudioBusDescription::Main, "Main bus", kItemFlag_Host));
  definition.AddProperty(def::Constant("TYPE_AUXILIARY", AudioBusDescription::Auxiliary,
                                       "Auxiliary bus", kItemFlag_Host));
}

void AudioBusDescriptionObject::Initialize(const AudioBusDescription& bus) {
  if (initialized_) return;
  bus_ = bus;
  initialized_ = true;
}

bool AudioBusDescriptionObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const AudioBusDescriptionObject*>(other.get());
  return same != nullptr && same->bus_ == bus_;
}

std::uint64_t AudioBusDescriptionObject::Hash() const {
  Fnv1aHash hash;
  const zebcore::UTF16String name = bus_.GetName();
  hash.Add(name.size(), 8);
  for (char16_t c : name) hash.Add(c, 2);
  HashLayout(hash, bus_.GetLayout());
  hash.Add(static_cast<std::uint32_t>(bus_.GetType()), 4);
  return hash.Value();
}

bool AudioBusDescriptionObject::SetName(const zebcore::UTF16String& name) {
  bus_.SetName(name);
  return true;
}

ScriptObjectPtr AudioBusDescriptionObject::GetLayout() const {
  return CreateAudioChannelLayoutObject(bus_.GetLayout(), GetContextHandle());
}

bool AudioBusDescriptionObject::SetLayout(const ScriptObjectPtr& layout) {
  const auto* source = dynamic_cast<const AudioChannelLayoutObject*>(layout.get());
  if (source == nullptr) return false;
  bus_.SetLayout(source->GetAudioChannelLayout());
  return true;
}

bool AudioBusDescriptionObject::SetType(unsigned int type) noexcept {
  bus_.SetType(static_cast<AudioBusDescription::Type>(type));
  return true;
}

// ---------------------------------------------------------------------------
// AudioChannelMap

AudioChannelMapObject::AudioChannelMapObject() : ScriptObject(GetClassname()) {}

void AudioChannelMapObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  AddNamespaces(definition, GetClassname());
  using Self = AudioChannelMapObject;
  // The constructor also takes an array of integers (ConstructFromMappings),
  // so it reads its argument itself.
  def::ScriptItemDefinitionBase constructor =
      def::Constructor(&Self::Construct, "Construct an AudioChannelMap object.", 0,
                       ParameterType<ScriptObjectPtr>("channelMap", "AudioChannelMap"));
  constructor.SetFunction([](const ScriptCall& call) {
    Self& self = def::details::Receiver<Self>(call);
    const ScriptValue& argument = call.arguments[0];
    if (argument.IsArray()) {
      self.ConstructFromMappings(ReadChannelArray(argument, 0));
    } else {
      self.Construct(ParameterType<ScriptObjectPtr>("channelMap", "AudioChannelMap")
                         .Validate(0, call.arguments));
    }
    return ScriptValue();
  });
  definition.AddProperty(std::move(constructor));
  definition.AddProperty(def::Constant("SOURCECHANNELINDEX_NOMATCH", kSourceChannelIndex_NoMatch,
                                       "No match", kItemFlag_Host));
  definition.AddProperty(def::Constant("SOURCECHANNELINDEX_OUTOFRANGE",
                                       kSourceChannelIndex_OutOfRange, "Out of range",
                                       kItemFlag_Host));
  definition.AddProperty(def::Property("channelCount", PropertyType<int>(), &Self::GetChannelCount,
                                       "Return the number of mapped channels.", kItemFlag_Host));
  definition.AddProperty(def::Method("getMapping", PropertyType<int>(), &Self::GetMapping,
                                     "Return the mapping of the channel at <index>.",
                                     kItemFlag_Host, ParameterType<int>("index")));
  definition.AddProperty(def::Method("setMapping", PropertyType<bool>(), &Self::SetMapping,
                                     "Set the mapping of the channel at <index>.", kItemFlag_Host,
                                     ParameterType<int>("index"), ParameterType<int>("mapping")));
}

bool AudioChannelMapObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const AudioChannelMapObject*>(other.get());
  return same != nullptr && same->map_ == map_;
}

std::uint64_t AudioChannelMapObject::Hash() const {
  Fnv1aHash hash;
  const int count = map_.GetNumberOfChannels();
  hash.Add(static_cast<std::uint32_t>(count), 4);
  for (int k = 0; k < count; ++k) hash.Add(static_cast<std::uint32_t>(map_[k]), 4);
  return hash.Value();
}

bool AudioChannelMapObject::Construct(const ScriptObjectPtr& channelMap) {
  if (!channelMap) {
    map_ = ChannelMap();
    return true;
  }
  const auto* source = dynamic_cast<const AudioChannelMapObject*>(channelMap.get());
  if (source == nullptr) {
    throw ParameterErrorException(ParameterErrorException::kWrongType, 0,
                                  "argument 1 is not an AudioChannelMap object");
  }
  map_ = source->map_;
  return true;
}

bool AudioChannelMapObject::ConstructFromMappings(const std::vector<int>& mappings) {
  if (mappings.size() > kAudioChannelCount_Max) return false;
  const int count = static_cast<int>(mappings.size());
  ChannelMap map(count);
  for (int k = 0; k < count; ++k) map.SetChannel(k, mappings[static_cast<std::size_t>(k)]);
  map_ = std::move(map);
  return true;
}

int AudioChannelMapObject::GetMapping(int index) const {
  if (index > map_.GetNumberOfChannels()) {
    throw ParameterErrorException(
        ParameterErrorException::kOutOfRange, 0,
        "index " + std::to_string(index) + " is greater than the channel count");
  }
  return map_[index];
}

bool AudioChannelMapObject::SetMapping(int index, int mapping) {
  const int count = map_.GetNumberOfChannels();
  if (index > count) {
    throw ParameterErrorException(
        ParameterErrorException::kOutOfRange, 0,
        "index " + std::to_string(index) + " is greater than the channel count");
  }
  if (index < 0 || index == count) return false;
  map_.SetChannel(index, mapping);
  return true;
}

// ---------------------------------------------------------------------------
// AudioFormat

namespace {

// Sample rates are int natively: larger unsigned values would turn negative.
constexpr unsigned int kMaxSampleRate = static_cast<unsigned int>(INT_MAX);

}  // namespace

AudioSampleType SampleTypeForBitDepth(unsigned int bitDepth) noexcept {
  if (bitDepth < 9) return kAudioSampleType_8BitUnsigned;
  if (bitDepth <= 16) return kAudioSampleType_16BitInteger;
  if (bitDepth <= 24) return kAudioSampleType_24BitInteger;
  return kAudioSampleType_32BitFloat;
}

unsigned int BitDepthForSampleType(AudioSampleType type) noexcept {
  switch (type) {
    case kAudioSampleType_8BitUnsigned:
      return 8;
    case kAudioSampleType_16BitInteger:
      return 16;
    case kAudioSampleType_24BitInteger:
      return 24;
    case kAudioSampleType_32BitFloat:
      return 32;
  }
  return 0;
}

AudioFormatObject::AudioFormatObject() : ScriptObject(GetClassname()) {}

AudioFormatObject::~AudioFormatObject() { ReleaseHeldLayout(); }

void AudioFormatObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  AddNamespaces(definition, GetClassname());
  using Self = AudioFormatObject;
  definition.AddProperty(
      def::Constructor(&Self::Construct, "Constructs a new AudioFormat object.", 0,
                       ParameterType<unsigned int>("samplerate", 44100u),
                       ParameterType<unsigned int>("bitDepth", 32u),
                       ParameterType<ScriptObjectPtr>("channelLayout", "AudioChannelLayout")));
  definition.AddProperty(def::Property("sampleRate", PropertyType<unsigned int>(""),
                                       &Self::GetSamplerate, &Self::SetSamplerate, "Samplerate",
                                       kItemFlag_Host));
  definition.AddProperty(def::Property(
      "bitDepth", PropertyType<unsigned int>(""), &Self::GetSampleType, &Self::SetSampleType,
      "Bit depth of a sample as well as its data format. Always normalized to 8 bit unsigned "
      "integer, 16 bit signed integer little endian, 24 bit signed integer little endian, packed "
      "or 32 bit floating point (range -1.0 to 1.0)",
      kItemFlag_Host));
  // No class in the setter's type: the setter itself refuses other objects.
  definition.AddProperty(def::Property(
      "channelLayout", PropertyType<ScriptObjectPtr>("AudioChannelLayout"), &Self::GetChannelLayout,
      &Self::SetChannelLayout, "Channel layout", kItemFlag_Host));
  struct SampleTypeConstant {
    const char* name;
    std::int64_t value;
    const char* description;
  };
  static constexpr SampleTypeConstant kSampleTypes[] = {
      {"SAMPLETYPE_8", 8, "8 bit unsigned integer"},
      {"SAMPLETYPE_16", 16, "16 bit signed integer"},
      {"SAMPLETYPE_24", 24, "24 bit signed integer"},
      {"SAMPLETYPE_32", 32, "32 bit floating point"},
  };
  for (const SampleTypeConstant& constant : kSampleTypes) {
    definition.AddProperty(
        def::Constant(constant.name, constant.value, constant.description, kItemFlag_Host));
  }
}

void AudioFormatObject::Initialize(const AudioFormat& format) {
  if (initialized_) return;
  initialized_ = true;
  format_ = format;
  HoldNewLayoutObject();
}

bool AudioFormatObject::Construct(unsigned int samplerate, unsigned int bitDepth,
                                  const ScriptObjectPtr& layout) {
  if (samplerate > kMaxSampleRate) {
    throw ParameterErrorException(
        ParameterErrorException::kOutOfRange, 0,
        "samplerate " + std::to_string(samplerate) + " is above 2147483647");
  }
  if (initialized_) return true;
  const auto* source = dynamic_cast<const AudioChannelLayoutObject*>(layout.get());
  if (layout && source == nullptr) {
    throw ParameterErrorException(ParameterErrorException::kWrongType, 2,
                                  "argument 3 is not an AudioChannelLayout object");
  }
  initialized_ = true;
  format_.SetSampleRate(static_cast<int>(samplerate));
  format_.SetSampleType(SampleTypeForBitDepth(bitDepth));
  format_.SetChannelLayout(source != nullptr ? source->GetAudioChannelLayout()
                                             : CreateStereoChannelLayout());
  HoldNewLayoutObject();
  return true;
}

void AudioFormatObject::HoldNewLayoutObject() {
  ScriptObjectPtr layout =
      CreateAudioChannelLayoutObject(format_.GetChannelLayout(), GetContextHandle());
  ReleaseHeldLayout();
  if (!layout) return;
  layout->LockObject();
  heldLayout_ = std::move(layout);
}

void AudioFormatObject::ReleaseHeldLayout() noexcept {
  if (!heldLayout_) return;
  heldLayout_->UnlockObject();
  heldLayout_.reset();
}

bool AudioFormatObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const AudioFormatObject*>(other.get());
  return same != nullptr && same->format_ == format_;
}

std::uint64_t AudioFormatObject::Hash() const {
  Fnv1aHash hash;
  hash.Add(static_cast<std::uint32_t>(format_.GetSampleRate()), 4);
  hash.Add(static_cast<std::uint32_t>(format_.GetSampleType()), 4);
  HashLayout(hash, format_.GetChannelLayout());
  return hash.Value();
}

unsigned int AudioFormatObject::GetSamplerate() const noexcept {
  return static_cast<unsigned int>(format_.GetSampleRate());
}

bool AudioFormatObject::SetSamplerate(unsigned int samplerate) noexcept {
  if (samplerate == 0 || samplerate > kMaxSampleRate) return false;
  format_.SetSampleRate(static_cast<int>(samplerate));
  return true;
}

unsigned int AudioFormatObject::GetSampleType() const noexcept {
  return BitDepthForSampleType(format_.GetSampleType());
}

bool AudioFormatObject::SetSampleType(unsigned int bitDepth) noexcept {
  format_.SetSampleType(SampleTypeForBitDepth(bitDepth));
  return true;
}

bool AudioFormatObject::SetChannelLayout(const ScriptObjectPtr& layout) {
  const auto* source = dynamic_cast<const AudioChannelLayoutObject*>(layout.get());
  if (source == nullptr) return false;
  // A copy first: `source` may be the held object itself.
  AudioChannelLayout labels = source->GetAudioChannelLayout();
  format_.SetChannelLayout(labels);
  if (heldLayout_) {
    static_cast<AudioChannelLayoutObject&>(*heldLayout_).SetAudioChannelLayout(labels);
  } else {
    HoldNewLayoutObject();
  }
  return true;
}

ScriptObjectPtr CreateAudioFormatObject(const AudioFormat& format, int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, AudioFormatObject::GetClassname(), [&format](const ScriptObjectPtr& object) {
        static_cast<AudioFormatObject&>(*object).Initialize(format);
      });
}

namespace {

using zebscripting::factory::ScriptObjectDefinitionInitiator;
using zebscripting::factory::ScriptObjectDefinitionRegistrar;

// The classes are registered with the host when the library loads.
const ScriptObjectDefinitionRegistrar kAudioChannelLayoutRegistrar(
    new ScriptObjectDefinitionInitiator<AudioChannelLayoutObject>());
const ScriptObjectDefinitionRegistrar kAudioBusDescriptionRegistrar(
    new ScriptObjectDefinitionInitiator<AudioBusDescriptionObject>());
const ScriptObjectDefinitionRegistrar kAudioChannelMapRegistrar(
    new ScriptObjectDefinitionInitiator<AudioChannelMapObject>());
const ScriptObjectDefinitionRegistrar kAudioFormatRegistrar(
    new ScriptObjectDefinitionInitiator<AudioFormatObject>());

}  // namespace
}  // namespace zebmediatypes::scripting
