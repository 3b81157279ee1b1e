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

namespace media = zebmediatypes;

namespace {

const media::TimeDisplay kDisplays[] = {
    media::TimeDisplay(media::kTimeDisplay_24Timecode),
    media::TimeDisplay(media::kTimeDisplay_25Timecode),
    media::TimeDisplay(media::kTimeDisplay_2997DropTimecode),
    media::TimeDisplay(media::kTimeDisplay_2997NonDropTimecode),
    media::TimeDisplay(media::kTimeDisplay_30Timecode),
    media::TimeDisplay(media::kTimeDisplay_50Timecode),
    media::TimeDisplay(media::kTimeDisplay_5994DropTimecode),
    media::TimeDisplay(media::kTimeDisplay_5994NonDropTimecode),
    media::TimeDisplay(media::kTimeDisplay_60Timecode),
    media::TimeDisplay(media::kTimeDisplay_Frames),
    media::TimeDisplay(media::kTimeDisplay_23976Timecode),
    media::TimeDisplay(media::kTimeDisplay_16mmFeetFrames),
    media::TimeDisplay(media::kTimeDisplay_35mmFeetFrames),
    media::TimeDisplay(media::kTimeDisplay_48Timecode),
    media::TimeDisplay(media::kTimeDisplay_11988Timecode),
    media::TimeDisplay(media::kTimeDisplay_14985Timecode),
    media::TimeDisplay(media::kTimeDisplay_AudioSamplesTimecode),
    media::TimeDisplay(media::kTimeDisplay_AudioMsTimecode),
    media::TimeDisplay::CreateCustom(1),
    media::TimeDisplay::CreateCustom(10),
    media::TimeDisplay::CreateCustom(101),
    media::TimeDisplay::CreateCustom(1000000),
    media::TimeDisplay::CreateCustom(4294967295u),
    media::TimeDisplay(),
    media::TimeDisplay(150u),
};

const media::FrameRate kRates[] = {
    media::kFrameRate_Video11_988,   media::kFrameRate_Video14_985,
    media::kFrameRate_Video23_976,   media::kFrameRate_Video24,
    media::kFrameRate_Video25,       media::kFrameRate_Video29_97,
    media::kFrameRate_Video30,       media::kFrameRate_Video48,
    media::kFrameRate_Video50,       media::kFrameRate_Video59_94,
    media::kFrameRate_Video60,       media::kFrameRate_Video100,
    media::kFrameRate_Video119_88,   media::kFrameRate_Milliseconds,
    media::kFrameRate_Audio8000,     media::kFrameRate_Audio44100,
    media::kFrameRate_Audio48000,    media::kFrameRate_Audio192000,
    media::kFrameRate_Invalid,       media::FrameRate(0),
    media::FrameRate(-10584000000),  media::FrameRate(1),
    media::FrameRate(INT64_MAX - 1),
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size < 3) return 0;
  const media::TimeDisplay display = kDisplays[data[0] % std::size(kDisplays)];
  const media::FrameRate rate = kRates[data[1] % std::size(kRates)];
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
