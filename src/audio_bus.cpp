#include <zebmediatypes/audio_bus.h>

#include <utility>

namespace zebmediatypes {

AudioBusDescription::AudioBusDescription(zebcore::UTF16String name,
                                         const AudioChannelLayout& layout, Type type)
    : mName(std::move(name)), mLayout(layout), mType(type) {}

AudioBusDescription& AudioBusDescription::operator=(const AudioBusDescription& other) {
  if (this != &other) {
    AudioBusDescription copy(other);
    swap(copy);
  }
  return *this;
}

AudioBusDescription& AudioBusDescription::operator=(AudioBusDescription&& other) noexcept {
  swap(other);
  return *this;
}

void AudioBusDescription::swap(AudioBusDescription& other) noexcept {
  mName.swap(other.mName);
  mLayout.swap(other.mLayout);
  std::swap(mType, other.mType);
}

AudioBusDescription AudioBusDescription::CreateMono(const zebcore::UTF16String& name, Type type) {
  return AudioBusDescription(name, CreateMonoChannelLayout(), type);
}

AudioBusDescription AudioBusDescription::CreateStereo(const zebcore::UTF16String& name, Type type) {
  return AudioBusDescription(name, CreateStereoChannelLayout(), type);
}

AudioBusDescription AudioBusDescription::CreateSurround51(const zebcore::UTF16String& name,
                                                          Type type) {
  return AudioBusDescription(name, CreateBroadcast51ChannelLayout(), type);
}

AudioBusDescription AudioBusDescription::CreateSurround71(const zebcore::UTF16String& name,
                                                          Type type) {
  return AudioBusDescription(name, Create7_1ChannelLayout(), type);
}

bool operator==(const AudioBusDescription& a, const AudioBusDescription& b) {
  return a.mName == b.mName && a.mLayout == b.mLayout && a.mType == b.mType;
}

bool AudioBusDescription::IsEquivalent(const AudioBusDescription& other,
                                       bool compareLabels) const noexcept {
  return compareLabels ? mLayout == other.mLayout : mLayout.size() == other.mLayout.size();
}

bool AreAudioBusDescriptionsEquivalent(const AudioBusDescriptionVector& a,
                                       const AudioBusDescriptionVector& b, bool compareLabels) {
  if (a.size() != b.size()) return false;
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (!a[i].IsEquivalent(b[i], compareLabels)) return false;
  }
  return true;
}

}  // namespace zebmediatypes
