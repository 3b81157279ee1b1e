#include <zebcore/assert.h>
#include <zebcore/error.h>
#include <zebmediatypes/audio_frame_rate_utils.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <limits>

namespace zebmediatypes {
namespace {

constexpr const char* kSource = "AudioFrameRateUtils";
constexpr const char* kFunction = "zebmediatypes::FindBestNativeAudioRate";

// Ticks per sample of the native rates, slowest first: the named audio rates
// up to 96000 Hz.
constexpr auto kNativeTicks = [] {
  std::array<std::int64_t, 9> ticks{};
  for (std::size_t i = 0; i < ticks.size(); ++i) {
    ticks[i] = details::kAudioRateConstants[i].GetTicksPerFrame();
  }
  return ticks;
}();
static_assert(kNativeTicks.back() == kFrameRate_Audio96000.GetTicksPerFrame());

constexpr std::int64_t kSlowestNativeTicks = kNativeTicks[0];
constexpr std::int64_t kFastestNativeTicks = kNativeTicks.back();
// 176400 Hz, twice 88200 Hz: the one rate above 96000 Hz that maps to 88200 Hz.
constexpr std::int64_t kTwice88200Ticks = details::kTicksPerSecond / 176400;
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
  const auto hertz = static_cast<std::uint32_t>(static_cast<double>(details::kTicksPerSecond) /
                                                static_cast<double>(ticks));
  if (hertz != 0) {
    for (std::int64_t native : kNativeTicks) {
      if (native >= ticks) continue;
      const auto nativeHertz = static_cast<std::uint32_t>(details::kTicksPerSecond / native);
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
