// Reads fuzzed text as timecode over every display and a set of media rates
// (no rate, a zero and a negative rate among them), and writes fuzzed times.
//
// Input: byte 0 picks the display, byte 1 the rate, byte 2 the flags; bit 0x80
// of byte 2 makes the rest UTF-16 code units (two bytes each) instead of one
// character a byte. For writing, the first 8 bytes of the rest are a tick count.
//
// What must hold: nothing crashes or overflows, and whatever is written for a
// time of ordinary range reads back as some time (never kTime_Invalid).
#include <zebmediatypes/timecode.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <iterator>
#include <optional>
#include <vector>

namespace media = zebmediatypes;

namespace {

// Byte 0 picks the display: 0 to 17 a standard one by code (24 fps timecode
// to 14.985, then audio samples and milliseconds), 18 the default, 19 a code
// that names none, 20 to 127 custom counts 1 to 108, and above that counts of
// up to 2^32 - 1.
media::TimeDisplay PickDisplay(unsigned b) {
  if (b < 16) return media::TimeDisplay(media::TimeDisplayType(media::kTimeDisplay_24Timecode + b));
  if (b < 18)
    return media::TimeDisplay(
        media::TimeDisplayType(media::kTimeDisplay_AudioSamplesTimecode + b - 16));
  if (b == 18) return media::TimeDisplay();
  if (b == 19) return media::TimeDisplay(150u);
  return media::TimeDisplay::CreateCustom(b < 128 ? b - 19 : 4294967295u / (256 - b));
}

// The video rates, milliseconds, the audio rate constants, no rate, a zero and
// a negative rate, and the extremes.
std::vector<media::FrameRate> MakeRates() {
  std::vector<media::FrameRate> rates;
  for (double fps : {11.988, 14.985, 23.976, 24.0, 25.0, 29.97, 30.0, 48.0, 50.0, 59.94, 60.0,
                     100.0, 119.88, 1000.0}) {
    rates.push_back(media::MatchedFrameRateFromFloat(fps));
  }
  rates.insert(rates.end(), std::begin(media::details::kAudioRateConstants),
               std::end(media::details::kAudioRateConstants));
  for (std::int64_t ticks :
       {INT64_MAX, std::int64_t{0}, std::int64_t{-10584000000}, std::int64_t{1}, INT64_MAX - 1}) {
    rates.emplace_back(ticks);
  }
  return rates;
}

const std::vector<media::FrameRate> kRates = MakeRates();

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size < 3) return 0;
  const media::TimeDisplay display = PickDisplay(data[0]);
  const media::FrameRate rate = kRates[data[1] % kRates.size()];
  const unsigned flags = data[2] & 0x3F;
  const bool utf16 = (data[2] & 0x80) != 0;
  data += 3;
  size -= 3;

  std::u16string text;
  if (utf16) {
    for (std::size_t i = 0; i + 1 < size; i += 2) {
      text += static_cast<char16_t>(data[i] | (data[i + 1] << 8));
    }
  } else {
    for (std::size_t i = 0; i < size; ++i) text += static_cast<char16_t>(data[i]);
  }
  // The Try reader fails exactly where the plain one gives kTime_Invalid, and
  // the UTF-8 form of the same text reads alike.
  const std::optional<media::TickTime> read = media::TryTimecodeToTime(text, rate, display, flags);
  if (read.value_or(media::kTime_Invalid) != media::TimecodeToTime(text, rate, display, flags)) {
    __builtin_trap();
  }
  const zebcore::UTF8String utf8 = zebcore::string::UTF16to8(text);
  if (media::TryTimecodeToTime(zebcore::string::View(utf8), rate, display, flags) != read) {
    __builtin_trap();
  }

  std::int64_t ticks = 0;
  std::memcpy(&ticks, data, size < sizeof ticks ? size : sizeof ticks);
  const zebcore::UTF16String written =
      media::TimeToTimecode(media::TickTime(ticks), rate, display, flags);
  // For times nearer zero than kTime_Invalid (400000 s, far beyond the
  // +-100 hours the library produces), rates of at most 2^61 ticks a frame, and
  // displays whose labelled day fits in 2^62 ticks, nothing leaves 64 bits and
  // what is read lies nearer zero than kTime_Invalid too: the text must read.
  const media::FrameRate nominal = media::GetFrameRateForTimeDisplay(display, rate);
  const double longestFrame =
      static_cast<double>(std::max(rate.IsValid() ? rate.GetTicksPerFrame() : 0,
                                   nominal.IsValid() ? nominal.GetTicksPerFrame() : 0));
  const double labelledDay =
      86400.0 * static_cast<double>(display.GetDisplayFramesPerSecond(rate)) * longestFrame;
  constexpr double kLimit = 4611686018427387904.0;  // 2^62
  const std::int64_t bound = -media::kTime_Invalid.GetTicks();
  const bool inRange = ticks > -bound && ticks < bound &&
                       (rate.GetTicksPerFrame() <= (std::int64_t{1} << 61) || !rate.IsValid()) &&
                       labelledDay <= kLimit;
  if (inRange && media::TimecodeToTime(written, rate, display, flags) == media::kTime_Invalid) {
    __builtin_trap();
  }
  return 0;
}
