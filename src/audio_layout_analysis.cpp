// Label pairing and the layout comparison, remapping and relabelling functions.
#include <zebmediatypes/audio_channel_layout.h>

#include <algorithm>
#include <array>
#include <iterator>
#include <limits>
#include <utility>

namespace zebmediatypes {
namespace {

using Label = AudioChannelLabel;

struct LabelPair {
  Label first;
  Label second;
};

constexpr LabelPair kLeftRightPairs[] = {
    {Label::FrontLeft, Label::FrontRight},
    {Label::LowFrequency, Label::LFE2},
    {Label::BackLeft, Label::BackRight},
    {Label::FrontLeftOfCenter, Label::FrontRightOfCenter},
    {Label::SideLeft, Label::SideRight},
    {Label::TopFrontLeft, Label::TopFrontRight},
    {Label::TopBackLeft, Label::TopBackRight},
    {Label::FrontLeftWide, Label::FrontRightWide},
    {Label::LeftHeight, Label::RightHeight},
    {Label::RearSurroundLeft, Label::RearSurroundRight},
    {Label::LeftTotal, Label::RightTotal},
    {Label::BottomFrontLeft, Label::BottomFrontRight},
    {Label::ProximityLeft, Label::ProximityRight},
};
static_assert(std::size(kLeftRightPairs) == 13);

constexpr LabelPair kFrontBackPairs[] = {
    {Label::FrontLeft, Label::BackLeft},
    {Label::FrontRight, Label::BackRight},
    {Label::FrontCenter, Label::BackCenter},
    {Label::FrontLeftOfCenter, Label::RearSurroundLeft},
    {Label::FrontRightOfCenter, Label::RearSurroundRight},
    {Label::TopFrontLeft, Label::TopBackLeft},
    {Label::TopFrontRight, Label::TopBackRight},
    {Label::TopFrontCenter, Label::TopBackCenter},
};
static_assert(std::size(kFrontBackPairs) == 8);

constexpr LabelPair kTopMiddlePairs[] = {
    {Label::FrontLeft, Label::TopFrontLeft},     {Label::FrontRight, Label::TopFrontRight},
    {Label::FrontCenter, Label::TopFrontCenter}, {Label::BackLeft, Label::TopBackLeft},
    {Label::BackRight, Label::TopBackRight},     {Label::BackCenter, Label::TopBackCenter},
};
static_assert(std::size(kTopMiddlePairs) == 6);

constexpr LabelPair kTopBottomPairs[] = {
    {Label::TopFrontLeft, Label::BottomFrontLeft},
    {Label::TopFrontRight, Label::BottomFrontRight},
    {Label::TopFrontCenter, Label::BottomFrontCenter},
};
static_assert(std::size(kTopBottomPairs) == 3);

constexpr LabelPair kBottomMiddlePairs[] = {
    {Label::FrontLeft, Label::BottomFrontLeft},
    {Label::FrontRight, Label::BottomFrontRight},
    {Label::FrontCenter, Label::BottomFrontCenter},
};
static_assert(std::size(kBottomMiddlePairs) == 3);

// The partner of `label` in either direction of a pair table, or Discrete.
template <std::size_t kCount>
constexpr Label PartnerIn(const LabelPair (&pairs)[kCount], Label label) noexcept {
  for (const LabelPair& pair : pairs) {
    if (pair.first == label) return pair.second;
    if (pair.second == label) return pair.first;
  }
  return Label::Discrete;
}

// Every label appears at most once in a table, so each pairing is symmetric.
template <std::size_t kCount>
constexpr bool EachLabelOnce(const LabelPair (&pairs)[kCount]) {
  for (std::size_t i = 0; i < kCount; ++i) {
    for (std::size_t j = 0; j < kCount; ++j) {
      const Label a[] = {pairs[i].first, pairs[i].second};
      for (Label label : a) {
        if (label == Label::Discrete) return false;
        if (j != i && (pairs[j].first == label || pairs[j].second == label)) return false;
      }
    }
  }
  return true;
}
static_assert(EachLabelOnce(kLeftRightPairs) && EachLabelOnce(kFrontBackPairs) &&
              EachLabelOnce(kTopMiddlePairs) && EachLabelOnce(kTopBottomPairs) &&
              EachLabelOnce(kBottomMiddlePairs));

constexpr std::size_t kNoDestination = std::numeric_limits<std::size_t>::max();

}  // namespace

AudioChannelLabel LeftRightPair(AudioChannelLabel label) noexcept {
  return PartnerIn(kLeftRightPairs, label);
}

AudioChannelLabel FrontBackPair(AudioChannelLabel label) noexcept {
  return PartnerIn(kFrontBackPairs, label);
}

AudioChannelLabel TopMiddlePair(AudioChannelLabel label) noexcept {
  return PartnerIn(kTopMiddlePairs, label);
}

AudioChannelLabel TopBottomPair(AudioChannelLabel label) noexcept {
  return PartnerIn(kTopBottomPairs, label);
}

AudioChannelLabel BottomMiddlePair(AudioChannelLabel label) noexcept {
  return PartnerIn(kBottomMiddlePairs, label);
}

bool IsStereoPair(AudioChannelLabel a, AudioChannelLabel b) noexcept {
  return a != Label::Discrete && b != Label::Discrete && LeftRightPair(a) == b;
}

bool ContainsSameChannelsIgnoreOrder(const AudioChannelLayout& a, const AudioChannelLayout& b) {
  if (a.size() != b.size()) return false;
  // Common layouts are sorted on the stack; only large ones are copied to the heap.
  constexpr std::size_t kOnStack = 32;
  if (a.size() <= kOnStack) {
    std::array<AudioChannelDescription, kOnStack> sortedA;
    std::array<AudioChannelDescription, kOnStack> sortedB;
    const auto endA = std::copy(a.begin(), a.end(), sortedA.begin());
    const auto endB = std::copy(b.begin(), b.end(), sortedB.begin());
    std::sort(sortedA.begin(), endA);
    std::sort(sortedB.begin(), endB);
    return std::equal(sortedA.begin(), endA, sortedB.begin());
  }
  AudioChannelLayout sortedA = a;
  AudioChannelLayout sortedB = b;
  std::sort(sortedA.begin(), sortedA.end());
  std::sort(sortedB.begin(), sortedB.end());
  return sortedA == sortedB;
}

void NormalizeChannelOrder(AudioChannelLayout& layout) noexcept {
  std::sort(layout.begin(), layout.end());
}

bool RemapChannelOrdering(const AudioChannelLayout& source, const AudioChannelLayout& destination,
                          std::vector<std::size_t>& mapping) {
  if (destination.empty()) {
    mapping.clear();
    return true;
  }
  if (source.size() != destination.size()) return false;

  std::vector<std::size_t> sourceDiscrete;
  for (std::size_t i = 0; i < source.size(); ++i) {
    if (source[i].label == Label::Discrete) sourceDiscrete.push_back(i);
  }

  std::vector<std::size_t> result;
  result.reserve(destination.size());
  std::size_t destinationDiscrete = 0;
  for (AudioChannelDescription channel : destination) {
    if (channel.label == Label::Discrete) {
      if (destinationDiscrete >= sourceDiscrete.size()) return false;
      result.push_back(sourceDiscrete[destinationDiscrete++]);
      continue;
    }
    const auto match = std::find(source.begin(), source.end(), channel);
    if (match == source.end()) return false;
    result.push_back(static_cast<std::size_t>(match - source.begin()));
  }
  mapping = std::move(result);
  return true;
}

bool RemapChannelLabelOrdering(const AudioChannelLayout& source,
                               const AudioChannelLayout& destination,
                               std::vector<std::size_t>& mapping) {
  if (source.empty() || destination.empty()) return false;

  std::vector<std::size_t> result(source.size(), kNoDestination);
  std::vector<bool> taken(destination.size(), false);
  std::vector<std::size_t> setAside;
  for (std::size_t i = 0; i < source.size(); ++i) {
    std::size_t j = 0;
    while (j < destination.size() && (taken[j] || destination[j] != source[i])) ++j;
    if (j < destination.size()) {
      taken[j] = true;
      result[i] = j;
    } else {
      setAside.push_back(i);
    }
  }

  // The left-over source channels fold into the first destination channel that
  // no label claimed; the index is not marked taken, so they all share it.
  const auto firstFree = std::find(taken.begin(), taken.end(), false);
  if (firstFree != taken.end()) {
    const auto fill = static_cast<std::size_t>(firstFree - taken.begin());
    for (std::size_t i : setAside) result[i] = fill;
  }
  mapping = std::move(result);
  return true;
}

bool ReplaceDiscreteLabelsWithDestinationLayoutLabels(const AudioChannelLayout& source,
                                                      const AudioChannelLayout& destination,
                                                      AudioChannelLayout& result) {
  AudioChannelLayout working = source;
  const auto isDiscrete = [](AudioChannelDescription channel) {
    return channel.label == Label::Discrete;
  };
  auto position = std::find_if(working.begin(), working.end(), isDiscrete);
  bool wrote = false;
  for (AudioChannelDescription channel : destination) {
    if (position == working.end()) break;
    if (std::find(working.begin(), working.end(), channel) != working.end()) continue;
    *position = channel;
    wrote = true;
    position = std::find_if(std::next(position), working.end(), isDiscrete);
  }
  if (!wrote) return false;
  result = std::move(working);
  return true;
}

}  // namespace zebmediatypes
