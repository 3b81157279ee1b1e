// The channel conversion matrix and its speaker grid.
#include <zebmediatypes/channel_conversion_matrix.h>

#include <algorithm>
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

}  // namespace zebmediatypes
