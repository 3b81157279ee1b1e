#include <zebcore/assert.h>
#include <zebcore/error.h>
#include <zebmediatypes/audio_frame_rate_utils.h>

#include <cstdint>
#include <iterator>
#include <limits>

namespace zebmediatypes {
namespace {

constexpr const char* kSource = "AudioFrameRateUtils";
constexpr const char* kFunction = "zebmediatypes::FindBestNativeAudioRate";

constexpr std::int64_t kTicksPerSecond = 254016000000;

// Ticks per sample of the native rates, slowest first.
constexpr std::int64_t kNativeTicks[] = {
    31752000,  // 8000 Hz
    23040000,  // 11025 Hz
    15876000,  // 16000 Hz
    11520000,  // 22050 Hz
    7938000,   // 32000 Hz
    5760000,   // 44100 Hz
    5292000,   // 48000 Hz
    2880000,   // 88200 Hz
    2646000,   // 96000 Hz
};
static_assert(std::size(kNativeTicks) == 9);

constexpr std::int64_t kSlowestNativeTicks = kNativeTicks[0];
constexpr std::int64_t kFastestNativeTicks = kNativeTicks[std::size(kNativeTicks) - 1];
// 176400 Hz, twice 88200 Hz: the one rate above 96000 Hz that maps to 88200 Hz.
constexpr std::int64_t kTwice88200Ticks = kTicksPerSecond / 176400;
// The highest multiple of a rate that the whole-multiple search accepts.
constexpr std::uint32_t kMaxRateMultiple = 16;

constexpr bool IsNativeTicks(std::int64_t ticks) noexcept {
  for (std::int64_t native : kNativeTicks) {
    if (native == ticks) return true;
  }
  return false;
}

bool IsNativeAudioRate(const FrameRate& rate) noexcept {
  return IsNativeTicks(rate.GetTicksPerFrame());
}

FrameRate ChooseNativeRate(std::int64_t ticks) noexcept {
  // The requested rate in whole hertz; ticks lie in (kFastestNativeTicks, max)
  // here, so the quotient is below 96000 and fits 32 bits.
  const auto hertz =
      static_cast<std::uint32_t>(static_cast<double>(kTicksPerSecond) / static_cast<double>(ticks));
  if (hertz != 0) {
    for (std::int64_t native : kNativeTicks) {
      if (native >= ticks) continue;
      const auto nativeHertz = static_cast<std::uint32_t>(kTicksPerSecond / native);
      if (nativeHertz % hertz == 0 && nativeHertz / hertz <= kMaxRateMultiple) {
        return FrameRate(native);
      }
    }
  }
  if (ticks > kSlowestNativeTicks) return FrameRate(kSlowestNativeTicks);
  // Strictly between two neighbours: the first native rate faster than it.
  for (std::int64_t native : kNativeTicks) {
    if (native < ticks) return FrameRate(native);
  }
  return FrameRate(kFastestNativeTicks);
}

}  // namespace

NativeFrameRateSet GetNativeFrameRates() {
  NativeFrameRateSet rates;
  for (std::int64_t native : kNativeTicks) rates.insert(FrameRate(native));
  return rates;
}

FrameRate FindBestNativeAudioRate(const FrameRate& rate) {
  const std::int64_t ticks = rate.GetTicksPerFrame();
  if (IsNativeTicks(ticks)) return rate;
  if (ticks < kFastestNativeTicks) {
    if (ticks <= 0) {
      zebcore::debug::ReportAssertion("rate > 0", "A sample rate needs a positive tick count",
                                      kSource, kFunction, __LINE__);
    }
    return FrameRate(ticks == kTwice88200Ticks ? kNativeTicks[7] : kFastestNativeTicks);
  }
  if (ticks == std::numeric_limits<std::int64_t>::max()) {
    zebcore::debug::ReportAssertion("rate != kFrameRate_Invalid", "No sample rate was given",
                                    kSource, kFunction, __LINE__);
    return FrameRate(kSlowestNativeTicks);
  }
  const FrameRate bestNativeRate = ChooseNativeRate(ticks);
  if (!IsNativeAudioRate(bestNativeRate)) {
    zebcore::debug::ReportAssertion("IsNativeAudioRate(bestNativeRate)",
                                    "The chosen rate is not native", kSource, kFunction, __LINE__);
    zebcore::config::ThrowError(zebcore::config::kInputContractViolation);
  }
  return bestNativeRate;
}

}  // namespace zebmediatypes
