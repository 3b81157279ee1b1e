// Ratio times: conversions between ticks and exact fractions of a second,
// legacy time-scale correction and 2:3 pulldown frame mapping.
#include <zebcore/assert.h>
#include <zebcore/rational.h>
#include <zebmediatypes/ratio_time.h>

#include <cmath>
#include <iterator>
#include <limits>
#include <numeric>

namespace zebmediatypes {

namespace {

constexpr std::int64_t kTicksPerSecond = details::kTicksPerSecond;
constexpr std::int64_t kLegacyScaleUnit = 2997;
constexpr std::int64_t kCorrectionNumerator = 999999;
constexpr std::int64_t kCorrectionDenominator = 1000000;
constexpr std::int64_t kLegacyLimit = 2147483646;

using Wide = __int128;

std::uint64_t Magnitude(std::int64_t v) noexcept {
  return v < 0 ? std::uint64_t{0} - static_cast<std::uint64_t>(v) : static_cast<std::uint64_t>(v);
}

// num/den in lowest terms with a positive denominator; den != 0. Reduced here
// first so that the rational's own normalisation never negates INT64_MIN.
RatioTime MakeRatio(std::int64_t num, std::int64_t den) {
  const std::uint64_t g = std::gcd(Magnitude(num), Magnitude(den));
  if (g > 1) {
    num = static_cast<std::int64_t>(static_cast<Wide>(num) / static_cast<Wide>(g));
    den = static_cast<std::int64_t>(static_cast<Wide>(den) / static_cast<Wide>(g));
  }
  if (den < 0 && den != std::numeric_limits<std::int64_t>::min() &&
      num != std::numeric_limits<std::int64_t>::min()) {
    num = -num;
    den = -den;
  }
  return RatioTime(num, den);
}

bool FitsInt64(Wide v) noexcept {
  return v >= std::numeric_limits<std::int64_t>::min() &&
         v <= std::numeric_limits<std::int64_t>::max();
}

using WideUnsigned = unsigned __int128;

// A fraction close to n/d (d > 0) whose terms fit in int64: n/d itself when
// it fits, otherwise its last continued-fraction convergent that does.
RatioTime ClosestRatio(Wide n, Wide d) noexcept {
  const bool negative = n < 0;
  WideUnsigned num = negative ? static_cast<WideUnsigned>(-n) : static_cast<WideUnsigned>(n);
  WideUnsigned den = static_cast<WideUnsigned>(d);
  constexpr WideUnsigned kLimit =
      static_cast<WideUnsigned>(std::numeric_limits<std::int64_t>::max());
  // Convergents h/k: h(-1) = 1, k(-1) = 0; h(-2) = 0, k(-2) = 1.
  WideUnsigned h1 = 1, k1 = 0, h2 = 0, k2 = 1;
  WideUnsigned bestH = 0, bestK = 1;
  while (den != 0) {
    const WideUnsigned a = num / den;
    if ((h1 != 0 && a > (kLimit - h2) / h1) || (k1 != 0 && a > (kLimit - k2) / k1)) break;
    const WideUnsigned h = a * h1 + h2;
    const WideUnsigned k = a * k1 + k2;
    bestH = h;
    bestK = k;
    h2 = h1;
    k2 = k1;
    h1 = h;
    k1 = k;
    const WideUnsigned rest = num - a * den;
    num = den;
    den = rest;
  }
  const std::int64_t top = static_cast<std::int64_t>(bestH);
  return RatioTime(negative ? -top : top, static_cast<std::int64_t>(bestK));
}

// r * 999999/1000000 with cross-cancellation, exact in 128-bit (the terms of a
// reduced 64-bit fraction times those of the factor always fit). A product
// whose terms do not fit in 64 bits gives a close 64-bit fraction.
RatioTime CorrectWide(std::int64_t num, std::int64_t den) noexcept {
  const std::int64_t g1 = static_cast<std::int64_t>(
      std::gcd(Magnitude(num), static_cast<std::uint64_t>(kCorrectionDenominator)));
  const std::int64_t g2 = static_cast<std::int64_t>(
      std::gcd(static_cast<std::uint64_t>(kCorrectionNumerator), Magnitude(den)));
  const Wide n = static_cast<Wide>(num / g1) * (kCorrectionNumerator / g2);
  const Wide d = static_cast<Wide>(den / g2) * (kCorrectionDenominator / g1);
  if (FitsInt64(n) && FitsInt64(d)) {
    return MakeRatio(static_cast<std::int64_t>(n), static_cast<std::int64_t>(d));
  }
  return ClosestRatio(n, d);
}

}  // namespace

RatioTime TimeToRatioTime(TickTime time) noexcept {
  return MakeRatio(time.GetTicks(), kTicksPerSecond);
}

TickTime RatioTimeToTime(RatioTime ratio) noexcept {
  const double x =
      (static_cast<double>(kTicksPerSecond) / static_cast<double>(ratio.denominator())) *
      static_cast<double>(ratio.numerator());
  double rounded;
  if (x > 0) {
    rounded = std::trunc(x + 0.5);
  } else {
    const double up = x + 0.5;
    rounded = std::trunc(up == std::floor(up) ? x : x - 0.5);
  }
  // NaN fails both comparisons.
  if (!(rounded >= -9223372036854775808.0 && rounded < 9223372036854775808.0)) {
    return kTime_Invalid;
  }
  return TickTime(static_cast<std::int64_t>(rounded));
}

RatioTime FrameRateToRatio(FrameRate rate) {
  if (rate == kFrameRate_Invalid) return RatioTime(0, 1);
  if (rate.GetTicksPerFrame() == 0) throw boost::bad_rational();
  return MakeRatio(kTicksPerSecond, rate.GetTicksPerFrame());
}

RatioTime LegacyRatioTimeToRatioTime(LegacyRatioTime ratio) noexcept {
  return RatioTime(ratio.numerator(), ratio.denominator());
}

LegacyRatioTime RatioTimeToLegacyRatioTime(RatioTime ratio) noexcept {
  const std::int64_t num = ratio.numerator();
  const std::int64_t den = ratio.denominator();
  if (num >= -kLegacyLimit && num <= kLegacyLimit && den <= kLegacyLimit) {
    return LegacyRatioTime(static_cast<int>(num), static_cast<int>(den));
  }
  return zebcore::utility::RationalApproximation(static_cast<double>(num) /
                                                 static_cast<double>(den));
}

bool IsLegacyTimeScale(std::int64_t scale) noexcept { return scale % kLegacyScaleUnit == 0; }

LegacyRatioTime CorrectLegacyRatioTimeAtTimeScale(LegacyRatioTime ratio,
                                                  std::int64_t scale) noexcept {
  if (!IsLegacyTimeScale(scale)) return ratio;
  return RatioTimeToLegacyRatioTime(CorrectWide(ratio.numerator(), ratio.denominator()));
}

RatioTime CorrectLegacyRatioTimeAtTimeScale(RatioTime ratio, std::int64_t scale) noexcept {
  if (!IsLegacyTimeScale(scale)) return ratio;
  return CorrectWide(ratio.numerator(), ratio.denominator());
}

namespace {

struct CadenceInfo {
  int phase;
  bool reportsSplitFrames;
};

// Indexed by cadence 0 to 10; every other value is taken as 0.
constexpr CadenceInfo kCadences[] = {
    {0, true},  {1, true},  {2, true},  {3, true},  {4, true},  {0, true},
    {4, false}, {0, false}, {1, false}, {2, false}, {3, false},
};
static_assert(std::size(kCadences) == 11);

// For each phase, the position (0 to 4) inside a group of five stream frames of
// film frames 0 to 3 of a group of four.
constexpr int kPulldownPositions[5][4] = {
    {0, 1, 3, 4}, {0, 2, 3, 4}, {1, 2, 3, 4}, {0, 1, 2, 3}, {0, 1, 2, 4},
};
static_assert(std::size(kPulldownPositions) == 5);

}  // namespace

TickTime MapPulldownFrameTo2997Frame(TickTime time, FrameRate rate, PulldownCadence cadence,
                                     bool& isSplitFrame) noexcept {
  isSplitFrame = false;
  if (!rate.IsValid()) return kTime_Invalid;

  // Film runs at four fifths of the stream rate: its frames last 5/4 as long.
  const Wide filmTicks = static_cast<Wide>(rate.GetTicksPerFrame()) * 5 / 4;
  const FrameRate filmRate =
      FitsInt64(filmTicks) ? FrameRate(static_cast<std::int64_t>(filmTicks)) : kFrameRate_Invalid;

  int filmFrame = time.ToFrame32(filmRate);
  if (filmFrame < 0) {
    zebcore::debug::ReportAssertion(
        "filmFrame >= 0", "A pulldown frame before zero was mapped; using frame 0", "RatioTime",
        "zebmediatypes::MapPulldownFrameTo2997Frame", __LINE__);
    filmFrame = 0;
  }

  const int cadenceIndex = static_cast<int>(cadence);
  const CadenceInfo info =
      cadenceIndex >= 0 && cadenceIndex < static_cast<int>(std::size(kCadences))
          ? kCadences[cadenceIndex]
          : kCadences[0];

  const int position = kPulldownPositions[info.phase][filmFrame % 4];
  const std::int64_t frame = position + 5 * static_cast<std::int64_t>(filmFrame / 4);
  if (info.reportsSplitFrames && frame >= 1) isSplitFrame = (position + info.phase) % 5 == 3;
  return TickTime(frame, rate);
}

}  // namespace zebmediatypes
