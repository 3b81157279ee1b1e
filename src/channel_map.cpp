#include <zebmediatypes/channel_map.h>

#include <algorithm>
#include <iterator>
#include <limits>
#include <utility>

namespace zebmediatypes {
namespace {

using L = AudioChannelLabel;

// The labels of numbered channels when no layout is given, and the meaning of
// a label index.
constexpr AudioChannelLabel kDefaultLabelOrder[] = {
    L::FrontLeft,
    L::FrontRight,
    L::FrontCenter,
    L::LowFrequency,
    L::BackLeft,
    L::BackRight,
    L::FrontLeftOfCenter,
    L::FrontRightOfCenter,
    L::BackCenter,
    L::SideLeft,
    L::SideRight,
    L::TopCenter,
    L::TopFrontLeft,
    L::TopFrontCenter,
    L::TopFrontRight,
    L::TopBackLeft,
    L::TopBackCenter,
    L::TopBackRight,
    L::FrontLeftWide,
    L::FrontRightWide,
    L::LeftHeight,
    L::RightHeight,
    L::RearSurroundLeft,
    L::RearSurroundRight,
    L::LFE2,
    L::LeftTotal,
    L::RightTotal,
    L::AmbisonicsW,
    L::AmbisonicsX,
    L::AmbisonicsY,
    L::AmbisonicsZ,
    L::BottomFrontLeft,
    L::BottomFrontCenter,
    L::BottomFrontRight,
    L::ProximityLeft,
    L::ProximityRight,
};
static_assert(std::size(kDefaultLabelOrder) == kChannelMapDefaultLabelCount);

bool Carries(const AudioChannelLayout& labels, AudioChannelLabel label) noexcept {
  return std::any_of(labels.begin(), labels.end(),
                     [label](const AudioChannelDescription& d) { return d.label == label; });
}

AudioChannelLayout SingleLabel(AudioChannelLabel label) {
  return AudioChannelLayout(1, AudioChannelDescription(label));
}

}  // namespace

AudioChannelLabel GetChannelMapDefaultLabel(int index) noexcept {
  if (index < 0 || index >= kChannelMapDefaultLabelCount) return kChannelMapUnknownLabel;
  return kDefaultLabelOrder[index];
}

ChannelMap::ChannelMap(int channelCount) {
  if (channelCount <= 0) return;
  const auto count = static_cast<std::size_t>(channelCount);
  mChannelLabels.reserve(count);
  for (int k = 0; k < channelCount; ++k) {
    mChannelLabels.push_back(SingleLabel(GetChannelMapDefaultLabel(k)));
  }
  mMappings.assign(count, -1);
}

ChannelMap::ChannelMap(AudioChannelLayout layout) {
  mChannelLabels.reserve(layout.size());
  for (const AudioChannelDescription& d : layout) mChannelLabels.push_back(SingleLabel(d.label));
  mMappings.assign(layout.size(), -1);
}

ChannelMap::~ChannelMap() = default;

ChannelMap ChannelMap::CreateDefaultChannelMap(int channelCount) {
  ChannelMap map;
  switch (channelCount) {
    case 1:
      map = ChannelMap(CreateMonoChannelLayout());
      break;
    case 2:
      map = ChannelMap(CreateStereoChannelLayout());
      break;
    case 6:
      map = ChannelMap(CreateBroadcast51ChannelLayout());
      break;
    default:
      map = ChannelMap(channelCount);
      break;
  }
  for (std::size_t k = 0; k < map.mMappings.size(); ++k) map.mMappings[k] = static_cast<int>(k);
  return map;
}

int ChannelMap::operator[](int k) const noexcept {
  if (k < 0 || k >= GetNumberOfChannels()) return -1;
  return mMappings[static_cast<std::size_t>(k)];
}

void ChannelMap::SetChannel(int k, int mapping) noexcept {
  if (k < 0 || k >= GetNumberOfChannels()) return;
  mMappings[static_cast<std::size_t>(k)] = mapping;
}

int ChannelMap::Find(int mapping) const noexcept {
  const auto it = std::find(mMappings.begin(), mMappings.end(), mapping);
  return it == mMappings.end() ? -1 : static_cast<int>(it - mMappings.begin());
}

AudioChannelLayout ChannelMap::GetChannelLayout(int k) const {
  if (k < 0 || k >= GetNumberOfChannels()) return {};
  return mChannelLabels[static_cast<std::size_t>(k)];
}

void ChannelMap::SetChannelLayout(int k, const AudioChannelLayout& labels) {
  if (k < 0 || k >= GetNumberOfChannels()) return;
  mChannelLabels[static_cast<std::size_t>(k)] = labels;
}

void ChannelMap::AddChannel(const AudioChannelLayout& labels, int mapping) {
  mChannelLabels.push_back(labels);
  try {
    mMappings.push_back(mapping);
  } catch (...) {
    mChannelLabels.pop_back();
    throw;
  }
}

int ChannelMap::GetNumberOfAssignments() const noexcept {
  // Each routed channel counts its own labels, wherever it is routed to.
  std::size_t count = 0;
  for (std::size_t k = 0; k < mMappings.size(); ++k) {
    if (mMappings[k] >= 0) count += mChannelLabels[k].size();
  }
  return static_cast<int>(std::min<std::size_t>(count, std::numeric_limits<int>::max()));
}

int ChannelMap::GetSourceChannelIndexForChannelLabel(AudioChannelLabel label) const noexcept {
  for (std::size_t k = 0; k < mMappings.size(); ++k) {
    if (Carries(mChannelLabels[k], label)) return mMappings[k];
  }
  return kSourceChannelIndex_NoMatch;
}

int ChannelMap::GetSourceChannelIndexForChannelLabelIndex(int labelIndex) const noexcept {
  if (labelIndex < 0 || labelIndex >= kChannelMapDefaultLabelCount) {
    return kSourceChannelIndex_OutOfRange;
  }
  return GetSourceChannelIndexForChannelLabel(kDefaultLabelOrder[labelIndex]);
}

void ChannelMap::SetDeviceChannelIndexForChannelLabel(AudioChannelLabel label, int deviceIndex) {
  const int source = GetSourceChannelIndexForChannelLabel(label);
  for (std::size_t k = 0; k < mMappings.size(); ++k) {
    if (mMappings[k] != source) continue;
    AudioChannelLayout& labels = mChannelLabels[k];
    const auto it =
        std::find_if(labels.begin(), labels.end(),
                     [label](const AudioChannelDescription& d) { return d.label == label; });
    if (it == labels.end()) continue;
    labels.erase(it);
    if (labels.empty()) {
      mChannelLabels.erase(mChannelLabels.begin() + static_cast<std::ptrdiff_t>(k));
      mMappings.erase(mMappings.begin() + static_cast<std::ptrdiff_t>(k));
    }
    break;
  }
  if (deviceIndex < 0) return;
  const int target = Find(deviceIndex);
  if (target >= 0) {
    AudioChannelLayout& labels = mChannelLabels[static_cast<std::size_t>(target)];
    if (!Carries(labels, label)) labels.push_back(AudioChannelDescription(label));
    return;
  }
  AddChannel(SingleLabel(label), deviceIndex);
}

bool operator==(const ChannelMap& a, const ChannelMap& b) {
  return a.mMappings == b.mMappings && a.mChannelLabels == b.mChannelLabels;
}

bool ChannelMap::IsMappingEqual(const ChannelMap& other) const noexcept {
  return mMappings == other.mMappings;
}

}  // namespace zebmediatypes
