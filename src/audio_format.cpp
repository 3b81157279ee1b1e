#include <zebcore/assert.h>
#include <zebmediatypes/audio_format.h>

#include <algorithm>
#include <utility>

namespace zebmediatypes {

const int kAudioSampleRate_Invalid = -1;

namespace {

constexpr const char* kSource = "AudioFormat";

// Bytes of one sample of `type`, 0 for a value that is none of the four types.
constexpr int BytesPerSample(AudioSampleType type) noexcept {
  switch (type) {
    case kAudioSampleType_8BitUnsigned:
      return 1;
    case kAudioSampleType_16BitInteger:
      return 2;
    case kAudioSampleType_24BitInteger:
      return 3;
    case kAudioSampleType_32BitFloat:
      return 4;
  }
  return 0;
}

// `count`, or kAudioChannelCount_Max (reported) when it is larger.
std::size_t CheckedChannelCount(std::size_t count, const char* function, int line) {
  if (count <= kAudioChannelCount_Max) return count;
  zebcore::debug::ReportAssertion("channelCount <= kAudioChannelCount_Max",
                                  "Channel count out of range; clamped", kSource, function, line);
  return kAudioChannelCount_Max;
}

}  // namespace

AudioFormat::AudioFormat(const AudioFormat& other) = default;
AudioFormat::AudioFormat(AudioFormat&& other) noexcept = default;
AudioFormat::~AudioFormat() = default;

AudioFormat& AudioFormat::operator=(const AudioFormat& other) {
  if (this != &other) {
    AudioFormat copy(other);
    swap(copy);
  }
  return *this;
}

AudioFormat& AudioFormat::operator=(AudioFormat&& other) noexcept {
  swap(other);
  return *this;
}

void AudioFormat::swap(AudioFormat& other) noexcept {
  std::swap(mSampleRate, other.mSampleRate);
  std::swap(mSampleType, other.mSampleType);
  mChannelLayout.swap(other.mChannelLayout);
}

void AudioFormat::GetChannelLayout(AudioChannelLayout& layout) const {
  if (&layout != &mChannelLayout) layout = mChannelLayout;
}

void AudioFormat::SetChannelLayout(const AudioChannelLayout& layout) {
  if (&layout != &mChannelLayout) mChannelLayout = layout;
}

AudioChannelDescription AudioFormat::GetChannelDescription(std::size_t index) const noexcept {
  if (index < mChannelLayout.size()) return mChannelLayout[index];
  return AudioChannelDescription(AudioChannelLabel::Discrete);
}

std::size_t AudioFormat::GetChannelIndex(
    const AudioChannelDescription& description) const noexcept {
  return static_cast<std::size_t>(
      std::find(mChannelLayout.begin(), mChannelLayout.end(), description) -
      mChannelLayout.begin());
}

int AudioFormat::GetSampleAlignment() const {
  const int bytes = BytesPerSample(mSampleType);
  if (bytes == 0) return 0;
  const std::size_t count = CheckedChannelCount(
      mChannelLayout.size(), "zebmediatypes::AudioFormat::GetSampleAlignment", __LINE__);
  return bytes * static_cast<int>(count);
}

bool operator==(const AudioFormat& a, const AudioFormat& b) noexcept {
  return a.mSampleRate == b.mSampleRate && a.mSampleType == b.mSampleType &&
         a.mChannelLayout == b.mChannelLayout;
}

AudioFormat AudioFormat::CreateDefaultAudioFormat(std::size_t channelCount, int sampleRate) {
  const std::size_t count = CheckedChannelCount(
      channelCount, "zebmediatypes::AudioFormat::CreateDefaultAudioFormat", __LINE__);
  AudioFormat format;
  format.mSampleRate = sampleRate;
  format.mSampleType = kAudioSampleType_32BitFloat;
  if (count == 2) {
    format.mChannelLayout = CreateStereoChannelLayout();
  } else if (count == 6) {
    format.mChannelLayout = CreateBroadcast51ChannelLayout();
  } else {
    format.mChannelLayout.assign(count, AudioChannelDescription(AudioChannelLabel::Discrete));
  }
  return format;
}

AudioFormat AudioFormat::CreateAudioFormat(const AudioChannelLayout& layout, int sampleRate) {
  AudioFormat format;
  format.mSampleRate = sampleRate;
  format.mSampleType = kAudioSampleType_32BitFloat;
  format.mChannelLayout = layout;
  return format;
}

namespace {

// Label values compared lexicographically; a proper prefix orders first.
bool LayoutLess(const AudioChannelLayout& a, const AudioChannelLayout& b) noexcept {
  return std::lexicographical_compare(
      a.begin(), a.end(), b.begin(), b.end(),
      [](const AudioChannelDescription& x, const AudioChannelDescription& y) {
        return static_cast<std::uint32_t>(x.label) < static_cast<std::uint32_t>(y.label);
      });
}

}  // namespace

bool AudioFormatExactCompare::operator()(const AudioFormat& a,
                                         const AudioFormat& b) const noexcept {
  if (a.GetSampleRate() != b.GetSampleRate()) return a.GetSampleRate() < b.GetSampleRate();
  const AudioChannelLayout& la = a.GetChannelLayout();
  const AudioChannelLayout& lb = b.GetChannelLayout();
  if (LayoutLess(la, lb)) return true;
  if (LayoutLess(lb, la)) return false;
  return a.GetSampleType() < b.GetSampleType();
}

bool AudioFormatSimpleCompare::operator()(const AudioFormat& a,
                                          const AudioFormat& b) const noexcept {
  if (a.GetSampleRate() != b.GetSampleRate()) return a.GetSampleRate() < b.GetSampleRate();
  if (a.GetChannelCount() != b.GetChannelCount()) return a.GetChannelCount() < b.GetChannelCount();
  return a.GetSampleType() < b.GetSampleType();
}

}  // namespace zebmediatypes
