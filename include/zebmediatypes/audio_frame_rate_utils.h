// Native audio rates
//
// The audio engine runs at one of nine native sample rates, 8000 Hz to
// 96000 Hz. Material at any other rate is resampled to the rate chosen by
// FindBestNativeAudioRate(). Rates are FrameRate values: ticks per sample, so
// fewer ticks is a faster rate.
//
//   FindBestNativeAudioRate(FrameRate::FromFramesPerSecond(24000));
//       // kFrameRate_Audio48000, twice the rate
//   FindBestNativeAudioRate(FrameRate::FromFramesPerSecond(30000));
//       // kFrameRate_Audio32000, the next rate above
#pragma once

#include <zebcore/allocator.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/tick_time.h>

#include <functional>
#include <set>

namespace zebmediatypes {

using NativeFrameRateSet =
    std::set<FrameRate, std::less<FrameRate>, zebcore::allocator::STLAllocator<FrameRate>>;

// GetNativeFrameRates()
//
// The nine native rates: 8000, 11025, 16000, 22050, 32000, 44100, 48000, 88200
// and 96000 Hz. The set orders by tick count, so it iterates from 96000 Hz down
// to 8000 Hz. 192000 Hz is not native.
ZEBMEDIATYPES_API NativeFrameRateSet GetNativeFrameRates();

// FindBestNativeAudioRate()
//
// Always returns one of the nine native rates:
// - a native rate is returned as it is;
// - rates above 96000 Hz give 96000 Hz, except exactly 176400 Hz, which gives
//   88200 Hz;
// - otherwise the lowest native rate that is an exact whole multiple (at most
//   16 times) of the rate in whole hertz, when there is one, even far above it;
// - otherwise the next native rate above the rate (8000 Hz for anything slower).
// A rate of no value (kFrameRate_Invalid, or zero or negative ticks) is a
// contract breach: it is reported through the assertion service and gives
// 8000 Hz (kFrameRate_Invalid) or 96000 Hz (zero or negative ticks).
ZEBMEDIATYPES_API FrameRate FindBestNativeAudioRate(const FrameRate& rate);

}  // namespace zebmediatypes
