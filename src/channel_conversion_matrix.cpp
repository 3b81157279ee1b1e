// The channel conversion matrix and its speaker grid, and the down-mix.
#include <zebmediatypes/channel_conversion_matrix.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <initializer_list>
#include <iterator>
#include <limits>
#include <utility>

namespace zebmediatypes {
namespace {

using Label = AudioChannelLabel;

// A speaker position: x negative left, y negative below listener height,
// z negative behind the listener.
struct GridPoint {
  int x;
  int y;
  int z;
};

// The speaker grid, one point per label in ascending label order (the order of
// AudioChannelLabelIndex). Labels without a position sit at the centre.
constexpr GridPoint kSpeakerGrid[] = {
    {0, 0, 0},    // Discrete
    {-2, 0, 2},   // FrontLeft
    {2, 0, 2},    // FrontRight
    {0, 0, 2},    // FrontCenter
    {0, 0, 0},    // LowFrequency
    {-2, 0, -2},  // BackLeft
    {2, 0, -2},   // BackRight
    {0, 0, -2},   // BackCenter
    {-1, 0, 2},   // FrontLeftOfCenter
    {1, 0, 2},    // FrontRightOfCenter
    {-2, 0, 0},   // SideLeft
    {2, 0, 0},    // SideRight
    {0, 2, 0},    // TopCenter
    {-2, 2, 2},   // TopFrontLeft
    {2, 2, 2},    // TopFrontRight
    {0, 2, 2},    // TopFrontCenter
    {-2, 2, -2},  // TopBackLeft
    {2, 2, -2},   // TopBackRight
    {0, 2, -2},   // TopBackCenter
    {-2, 0, 2},   // FrontLeftWide
    {2, 0, 2},    // FrontRightWide
    {-2, 2, 0},   // LeftHeight
    {2, 2, 0},    // RightHeight
    {-2, 0, -2},  // RearSurroundLeft
    {2, 0, -2},   // RearSurroundRight
    {0, 0, 0},    // LFE2
    {-2, 0, 0},   // LeftTotal
    {2, 0, 0},    // RightTotal
    {0, 0, 0},    // AmbisonicsW
    {-2, 0, 0},   // AmbisonicsX
    {0, 2, 0},    // AmbisonicsY
    {0, 0, 2},    // AmbisonicsZ
    {-2, -2, 2},  // BottomFrontLeft
    {0, -2, 2},   // BottomFrontCenter
    {2, -2, 2},   // BottomFrontRight
    {-1, 0, 0},   // ProximityLeft
    {1, 0, 0},    // ProximityRight
    {0, 0, 0},    // AmbisonicsHOA
};
static_assert(std::size(kSpeakerGrid) == kAudioChannelLabelCount);

constexpr GridPoint PositionOf(Label label) noexcept {
  const std::size_t index = AudioChannelLabelIndex(label);
  return index < kAudioChannelLabelCount ? kSpeakerGrid[index] : GridPoint{0, 0, 0};
}

// Nearness is compared on squared grid distances. The distances are square
// roots of whole numbers no larger than 48, so two of them are equal exactly
// when the squares are, and unequal ones differ by far more than rounding.
constexpr int SquaredDistance(Label a, Label b) noexcept {
  const GridPoint p = PositionOf(a);
  const GridPoint q = PositionOf(b);
  return (p.x - q.x) * (p.x - q.x) + (p.y - q.y) * (p.y - q.y) + (p.z - q.z) * (p.z - q.z);
}

constexpr bool IsLowFrequency(Label label) noexcept {
  return label == Label::LowFrequency || label == Label::LFE2;
}

// Whether a source channel may feed a destination channel by nearness.
constexpr bool TakesPartInNearness(Label label) noexcept {
  return label != Label::Discrete && !IsLowFrequency(label);
}

constexpr std::size_t kNone = std::numeric_limits<std::size_t>::max();

bool HasShape(const ChannelConversionMatrix& matrix, std::size_t rows, std::size_t columns) {
  if (matrix.size() != rows) return false;
  for (const ChannelConversionMatrixRow& row : matrix) {
    if (row.size() != columns) return false;
  }
  return true;
}

// Fills `row` (already sized to the source, all zeros) for the destination
// channel `target`; `discreteOrdinal` counts the Discrete destination channels
// up to and including this one.
void RouteChannel(const AudioChannelLayout& source, std::size_t destinationSize, Label target,
                  std::size_t discreteOrdinal, ChannelConversionMatrixRow& row) {
  const std::size_t sourceSize = source.size();
  const bool targetIsDiscrete = target == Label::Discrete;

  // The scan stops at the first source channel that decides alone.
  std::size_t single = kNone;
  std::size_t sourceDiscrete = 0;
  int best = std::numeric_limits<int>::max();
  for (std::size_t i = 0; i < sourceSize; ++i) {
    const Label label = source[i].label;
    if (label == Label::Discrete) {
      ++sourceDiscrete;
      if (sourceSize == 1 || (targetIsDiscrete && sourceDiscrete == discreteOrdinal)) {
        single = i;
        break;
      }
    } else if (label == target) {
      single = i;
      break;
    } else if (sourceSize == 1 && targetIsDiscrete) {
      // A labelled mono source feeds a Discrete channel as a Discrete one
      // would; otherwise a multichannel Discrete destination would stay silent.
      single = i;
      break;
    } else if (TakesPartInNearness(label) && TakesPartInNearness(target)) {
      const int distance = SquaredDistance(label, target);
      if (distance < best) best = distance;
    }
  }

  if (single != kNone) {
    row[single] = 1.0;
    return;
  }
  if (best != std::numeric_limits<int>::max()) {
    std::size_t count = 0;
    for (std::size_t i = 0; i < sourceSize; ++i) {
      const Label label = source[i].label;
      count += TakesPartInNearness(label) && SquaredDistance(label, target) == best;
    }
    const double gain = 1.0 / static_cast<double>(count);
    for (std::size_t i = 0; i < sourceSize; ++i) {
      const Label label = source[i].label;
      if (TakesPartInNearness(label) && SquaredDistance(label, target) == best) row[i] = gain;
    }
    return;
  }
  if (destinationSize != 1 || sourceSize == 0) return;
  if (targetIsDiscrete) {
    // A mono mix-down of everything.
    const double gain = 1.0 / static_cast<double>(sourceSize);
    for (double& entry : row) entry = gain;
    return;
  }
  if (sourceDiscrete != 0) {
    // Discrete channels into one labelled channel: share it equally rather
    // than leave it silent.
    const double gain = 1.0 / static_cast<double>(sourceDiscrete);
    for (std::size_t i = 0; i < sourceSize; ++i) {
      if (source[i].label == Label::Discrete) row[i] = gain;
    }
  }
}

void FillIdentity(ChannelConversionMatrix& matrix) noexcept {
  for (std::size_t k = 0; k < matrix.size(); ++k) {
    ChannelConversionMatrixRow& row = matrix[k];
    std::fill(row.begin(), row.end(), 0.0);
    if (k < row.size()) row[k] = 1.0;
  }
}

// Calls `fill` on a matrix of `rows` x `columns` zeros and makes it the result.
// A result of that shape already is filled in place, which cannot fail;
// otherwise a new matrix is built and swapped in once complete.
template <class Fill>
void ReplaceResult(ChannelConversionMatrix& result, std::size_t rows, std::size_t columns,
                   Fill fill) {
  if (HasShape(result, rows, columns)) {
    for (ChannelConversionMatrixRow& row : result) std::fill(row.begin(), row.end(), 0.0);
    fill(result);
    return;
  }
  ChannelConversionMatrix fresh(rows, ChannelConversionMatrixRow(columns, 0.0));
  fill(fresh);
  result.swap(fresh);
}

// The down-mix works on the speakers that have a standard fold. Each pair is
// left member then right member, so a pair is named by its left speaker.
enum Speaker : std::size_t {
  kL,
  kR,
  kC,
  kLfe,
  kLs,
  kRs,
  kCs,
  kLc,
  kRc,
  kLsd,
  kRsd,
  kRls,
  kRrs,
  kSpeakerCount
};

static_assert(kR == kL + 1 && kRs == kLs + 1 && kRc == kLc + 1 && kRsd == kLsd + 1 &&
              kRrs == kRls + 1);

constexpr Speaker SpeakerOf(Label label) noexcept {
  switch (label) {
    case Label::FrontLeft:
      return kL;
    case Label::FrontRight:
      return kR;
    case Label::FrontCenter:
      return kC;
    case Label::LowFrequency:
      return kLfe;
    case Label::BackLeft:
      return kLs;
    case Label::BackRight:
      return kRs;
    case Label::BackCenter:
      return kCs;
    case Label::FrontLeftOfCenter:
      return kLc;
    case Label::FrontRightOfCenter:
      return kRc;
    case Label::SideLeft:
      return kLsd;
    case Label::SideRight:
      return kRsd;
    case Label::RearSurroundLeft:
      return kRls;
    case Label::RearSurroundRight:
      return kRrs;
    default:
      return kSpeakerCount;
  }
}

constexpr bool IsLeft(Speaker s) noexcept {
  return s == kL || s == kLs || s == kLc || s == kLsd || s == kRls;
}
constexpr bool IsRight(Speaker s) noexcept {
  return s == kR || s == kRs || s == kRc || s == kRsd || s == kRrs;
}

// Where each speaker sits in a layout (kNone when absent).
class SpeakerMap {
 public:
  // False when the layout has a channel without a standard fold, a repeated
  // label or a left speaker without its right partner (or the reverse).
  bool Build(const AudioChannelLayout& layout) noexcept {
    index_.fill(kNone);
    if (layout.size() == 1 && layout[0].label == Label::Discrete) {
      index_[kC] = 0;  // mono
      return true;
    }
    for (std::size_t i = 0; i < layout.size(); ++i) {
      const Speaker s = SpeakerOf(layout[i].label);
      if (s == kSpeakerCount || index_[s] != kNone) return false;
      index_[s] = i;
    }
    for (std::size_t s = 0; s < kSpeakerCount; ++s) {
      if (IsLeft(Speaker(s)) && Has(Speaker(s)) != Has(Speaker(s + 1))) return false;
    }
    return true;
  }
  bool Has(Speaker s) const noexcept { return index_[s] != kNone; }
  std::size_t operator[](std::size_t s) const noexcept { return index_[s]; }

 private:
  std::array<std::size_t, kSpeakerCount> index_{};
};

constexpr double kMinus3dB = 0.7071067811865476;
constexpr double kSqrt2 = 1.4142135623730951;

double Level(double level) noexcept { return std::isfinite(level) ? level : 0.0; }

// The down-mix gains by speaker, [destination][source].
class DownmixGains {
 public:
  DownmixGains(const SpeakerMap& source, const SpeakerMap& destination,
               const DownmixLevels& levels) noexcept
      : from_(source), to_(destination) {
    const double center = Level(levels.center);
    const double surround = Level(levels.surround);
    const double lfe = Level(levels.lfe);
    for (std::size_t k = 0; k < kSpeakerCount; ++k) {
      if (from_.Has(Speaker(k)) && to_.Has(Speaker(k))) gains_[k][k] = 1.0;
    }
    for (std::size_t k = 0; k < kSpeakerCount; ++k) {
      const auto s = Speaker(k);
      if (!from_.Has(s) || to_.Has(s)) continue;
      switch (s) {
        case kC:
          Add(kL, s, from_.Has(kL) ? center : kMinus3dB);
          break;
        case kL:
        case kR:
          Add(kC, s, kMinus3dB);
          if (from_.Has(kC)) gains_[kC][kC] = center * kSqrt2;
          break;
        case kLc:
        case kRc:
          if (to_.Has(kL)) {
            Add(kL, s, 1.0);
          } else {
            Add(kC, s, kMinus3dB);
          }
          break;
        case kCs:
          if (!AddToFirst({kLs, kLsd}, s, kMinus3dB)) Front(s, surround * kMinus3dB, surround);
          break;
        case kLs:
        case kRs:
          if (to_.Has(kCs)) {
            Add(kCs, s, kMinus3dB);
          } else if (!AddToFirst({kLsd}, s, from_.Has(kLsd) ? kMinus3dB : 1.0)) {
            Front(s, surround, surround);
          }
          break;
        case kLsd:
        case kRsd:
          if (to_.Has(kLs)) {
            Add(kLs, s, from_.Has(kLs) ? kMinus3dB : 1.0);
          } else if (!AddToFirst({kCs}, s, kMinus3dB)) {
            Front(s, surround, surround);
          }
          break;
        case kRls:
        case kRrs: {
          const double gain = from_.Has(kLs) || from_.Has(kLsd) ? kMinus3dB : 1.0;
          if (!AddToFirst({kLs}, s, gain) && !AddToFirst({kCs}, s, kMinus3dB) &&
              !AddToFirst({kLsd}, s, gain)) {
            Front(s, surround, surround);
          }
          break;
        }
        case kLfe:
          if (to_.Has(kC)) {
            Add(kC, s, lfe);
          } else {
            Add(kL, s, lfe * kMinus3dB);
          }
          break;
        case kSpeakerCount:
          break;
      }
    }
  }

  double operator()(std::size_t destination, std::size_t source) const noexcept {
    return gains_[destination][source];
  }

 private:
  // Into `target`, a pair named by its left speaker or a single speaker.
  void Add(Speaker target, Speaker s, double gain) noexcept {
    if (!IsLeft(target)) {
      gains_[target][s] += gain;
      return;
    }
    if (!IsRight(s)) gains_[target][s] += gain;
    if (!IsLeft(s)) gains_[target + 1][s] += gain;
  }

  // Into the first of `targets` the destination has; false when it has none.
  bool AddToFirst(std::initializer_list<Speaker> targets, Speaker s, double gain) noexcept {
    for (Speaker target : targets) {
      if (to_.Has(target)) {
        Add(target, s, gain);
        return true;
      }
    }
    return false;
  }

  // Into the front: the pair when the destination has it, else the centre at
  // -3 dB more.
  void Front(Speaker s, double pairGain, double centreGain) noexcept {
    if (to_.Has(kL)) {
      Add(kL, s, pairGain);
    } else {
      Add(kC, s, centreGain * kMinus3dB);
    }
  }

  const SpeakerMap& from_;
  const SpeakerMap& to_;
  std::array<std::array<double, kSpeakerCount>, kSpeakerCount> gains_{};
};

}  // namespace

void CreateIdentityChannelConversionMatrix(std::size_t sourceCount, std::size_t destinationCount,
                                           ChannelConversionMatrix& result) {
  ReplaceResult(result, destinationCount, sourceCount, FillIdentity);
}

void ComputeChannelConversionMatrix(const AudioChannelLayout& source,
                                    const AudioChannelLayout& destination,
                                    ChannelConversionMatrix& result) {
  if (source.size() != 1 && destination.size() != 1 &&
      (!HasChannelLabeling(source) || !HasChannelLabeling(destination))) {
    CreateIdentityChannelConversionMatrix(source.size(), destination.size(), result);
    return;
  }
  ReplaceResult(result, destination.size(), source.size(), [&](ChannelConversionMatrix& matrix) {
    std::size_t discreteOrdinal = 0;
    for (std::size_t j = 0; j < destination.size(); ++j) {
      const Label target = destination[j].label;
      discreteOrdinal += target == Label::Discrete;
      RouteChannel(source, destination.size(), target, discreteOrdinal, matrix[j]);
    }
  });
}

void ComputeDownmixMatrix(const AudioChannelLayout& source, const AudioChannelLayout& destination,
                          ChannelConversionMatrix& result, const DownmixLevels& levels) {
  SpeakerMap from;
  SpeakerMap to;
  if (destination.empty() || destination.size() > source.size() || !from.Build(source) ||
      !to.Build(destination) || !(to.Has(kL) || to.Has(kC))) {
    ComputeChannelConversionMatrix(source, destination, result);
    return;
  }
  const DownmixGains gains(from, to, levels);
  ReplaceResult(result, destination.size(), source.size(), [&](ChannelConversionMatrix& matrix) {
    double largest = 0.0;
    for (std::size_t d = 0; d < kSpeakerCount; ++d) {
      if (!to.Has(Speaker(d))) continue;
      ChannelConversionMatrixRow& row = matrix[to[d]];
      double sum = 0.0;
      for (std::size_t s = 0; s < kSpeakerCount; ++s) {
        if (!from.Has(Speaker(s))) continue;
        row[from[s]] = gains(d, s);
        sum += std::fabs(gains(d, s));
      }
      largest = std::max(largest, sum);
    }
    if (!levels.normalize || !(largest > 1.0)) return;
    for (ChannelConversionMatrixRow& row : matrix) {
      for (double& gain : row) gain /= largest;
    }
  });
}

}  // namespace zebmediatypes
