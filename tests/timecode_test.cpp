#include <gtest/gtest.h>
#include <zebmediatypes/timecode.h>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <limits>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace zebmediatypes {
namespace {

using Flags = zebcore::utility::Flags<unsigned int>;

std::string Narrow(const zebcore::UTF16String& text) {
  return std::string(text.begin(), text.end());
}
std::u16string Wide(std::string_view text) {
  std::u16string out;
  for (char c : text) out += static_cast<char16_t>(static_cast<unsigned char>(c));
  return out;
}

std::string Format(std::int64_t frames, FrameRate rate, TimeDisplay display, Flags flags = {}) {
  return Narrow(TimeToTimecode(TickTime(frames, rate), rate, display, flags));
}
// Reads through TimecodeToTime and checks that the UTF-8 reader and both Try
// readers agree with it: nullopt exactly where it gives kTime_Invalid.
TickTime Parse(std::string_view text, FrameRate rate, TimeDisplay display, Flags flags = {}) {
  const TickTime time = TimecodeToTime(Wide(text), rate, display, flags);
  EXPECT_EQ(TimecodeToTime(text, rate, display, flags), time);
  const std::optional<TickTime> wide = TryTimecodeToTime(Wide(text), rate, display, flags);
  const std::optional<TickTime> utf8 = TryTimecodeToTime(text, rate, display, flags);
  EXPECT_EQ(wide.has_value(), time != kTime_Invalid);
  EXPECT_EQ(wide.value_or(kTime_Invalid), time);
  EXPECT_EQ(utf8, wide);
  return time;
}

constexpr TimeDisplay kDrop(kTimeDisplay_2997DropTimecode);
constexpr TimeDisplay kDrop5994(kTimeDisplay_5994DropTimecode);
constexpr TimeDisplay kNonDrop(kTimeDisplay_2997NonDropTimecode);
constexpr TimeDisplay k24(kTimeDisplay_24Timecode);
constexpr TimeDisplay k25(kTimeDisplay_25Timecode);
constexpr TimeDisplay k23976(kTimeDisplay_23976Timecode);
constexpr TimeDisplay kMs(kTimeDisplay_AudioMsTimecode);
constexpr TimeDisplay kSamples(kTimeDisplay_AudioSamplesTimecode);
constexpr TimeDisplay kFrames(kTimeDisplay_Frames);
constexpr TimeDisplay k35mm(kTimeDisplay_35mmFeetFrames);
constexpr TimeDisplay k16mm(kTimeDisplay_16mmFeetFrames);
constexpr FrameRate k96k = kFrameRate_Audio96000;
constexpr FrameRate k8k = kFrameRate_Audio8000;

TEST(TimeToTimecode, DropFrameSkipsTwoLabelsExceptEveryTenthMinute) {
  struct Case {
    std::int64_t frame;
    const char* text;
  };
  // clang-format off
  constexpr Case kCases[] = {
      {0, "00;00;00;00"}, {29, "00;00;00;29"}, {30, "00;00;01;00"}, {1799, "00;00;59;29"},
      {1800, "00;01;00;02"}, {3597, "00;01;59;29"}, {3598, "00;02;00;02"}, {17981, "00;09;59;29"},
      {17982, "00;10;00;00"}, {17983, "00;10;00;01"}, {19782, "00;11;00;02"}, {107891, "00;59;59;29"},
      {107892, "01;00;00;00"}, {2589407, "23;59;59;29"}, {2589408, "00;00;00;00"},  // the 24-hour wrap
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.frame);
    EXPECT_EQ(Format(c.frame, kFrameRate_Video29_97, kDrop), c.text);
  }
  EXPECT_EQ(Format(30, kFrameRate_Video29_97, kDrop, kTimecodeFlag_ColonSeparators), "00:00:01:00");
  EXPECT_EQ(Format(3600, kFrameRate_Video59_94, kDrop5994), "00;01;00;04");
}

TEST(TimeToTimecode, MediaIsCountedInFramesOfTheDisplay) {
  struct Case {
    FrameRate rate;
    TimeDisplay display;
    std::int64_t count;
    const char* text;
  };
  constexpr FrameRate k25fps = kFrameRate_Video25;
  constexpr FrameRate k23 = kFrameRate_Video23_976;
  // clang-format off
  constexpr Case kCases[] = {
      {k25fps, k23976, 90000, "01:02:30:00"}, {k25fps, kNonDrop, 90000, "00:50:00:00"},
      {k25fps, TimeDisplay(kTimeDisplay_48Timecode), 90000, "00:31:15:00"},
      {k25fps, TimeDisplay(kTimeDisplay_5994NonDropTimecode), 90000, "00:25:00:00"},
      {kFrameRate_Video29_97, k24, 108000, "01:15:00:00"}, {kFrameRate_Video30, k25, 108000, "01:12:00:00"},
      {kFrameRate_Video30, TimeDisplay(kTimeDisplay_50Timecode), 108000, "00:36:00:00"},
      {k23, k25, 86400, "00:57:36:00"}, {k23, kNonDrop, 86400, "00:48:00:00"},
      {kFrameRate_Video24, k24, 25 * 3600 * 24, "01:00:00:00"},  // hours wrap at 24
      {kFrameRate_Video24, TimeDisplay::CreateCustom(1), 60, "00:01:00:0"},
      // The default display, and a code that names none, is the rate's standard display.
      {kFrameRate_Video29_97, TimeDisplay(), 1800, "00;01;00;02"}, {kFrameRate_Video59_94, TimeDisplay(), 3600, "00;01;00;04"},
      {k25fps, TimeDisplay(), 25, "00:00:01:00"}, {kFrameRate_Audio48000, TimeDisplay(), 48000, "00:00:01:00000"},
      {kFrameRate_Video29_97, TimeDisplay(150u), 1800, "00;01;00;02"},
      // Audio media at a sample-rate constant is counted in display frames.
      {k96k, k24, 3999, "00:00:00:00"}, {k96k, k24, 4000, "00:00:00:01"}, {k96k, k24, 96000, "00:00:01:00"},
      {k96k, k23976, 4003, "00:00:00:00"}, {k96k, k23976, 4004, "00:00:00:01"}, {k96k, k23976, 96096, "00:00:01:00"},
      {k96k, kDrop, 3204, "00;00;00;01"}, {k96k, kDrop, 96095, "00;00;00;29"}, {k96k, kDrop, 5765760, "00;01;00;02"},
      {k96k, kDrop, 57599943, "00;10;00;00"}, {k8k, kMs, 7, "00:00:00.000"}, {k8k, kMs, 8, "00:00:00.001"},
      {k8k, kMs, 8008, "00:00:01.001"}, {kFrameRate_Audio192000, kMs, 191999, "00:00:00.999"},
      {kFrameRate_Audio48000, kSamples, 48001, "00:00:01:00001"},
      // 8000, 11025 and 16000 Hz too, not in samples: 1 s of 8000 Hz is not "00:05:33:08".
      {k8k, k24, 8000, "00:00:01:00"}, {kFrameRate_Audio11025, k24, 11025, "00:00:01:00"},
      {kFrameRate_Audio16000, k25, 16000 * 61, "00:01:01:00"},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Format(c.count, c.rate, c.display), c.text);
  }
}

TEST(TimeToTimecode, FlagsAndCountDisplaysAt24Fps) {
  struct Case {
    std::int64_t frames;
    TimeDisplay display;
    unsigned flags;
    const char* text;
  };
  constexpr unsigned kTrim = kTimecodeFlag_TrimLeadingZeros;
  constexpr unsigned kKeep = kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_KeepMinutes;
  constexpr unsigned kSign = kTimecodeFlag_ShowSign;
  // clang-format off
  constexpr Case kCases[] = {
      {24, k24, kTimecodeFlag_OmitHours, "00:01:00"}, {24 * 3600 * 25, k24, kTimecodeFlag_OmitHours, "00:00:00"},
      {0, k24, kTrim, "0:00"}, {24, k24, kTrim, "1:00"}, {24 * 3605, k24, kTrim, "1:00:05:00"}, {24 * 605, k24, kTrim, "10:05:00"},
      {24, k24, kTrim | kSign, "+1:00"}, {-24, k24, kTrim | kSign, "-1:00"}, {24, k24, kTimecodeFlag_InclusiveEnd, "00:00:00:23"},
      {24, k24, kKeep, "0:01:00"}, {1440, k24, kKeep, "1:00:00"}, {14400, k24, kKeep, "10:00:00"},
      {24, k24, kSign, "+00:00:01:00"}, {0, k24, kSign, "00:00:00:00"},
      {-24, k24, 0, "23:00:01:00"},  // unsigned negative: 23 - hours
      {100, kFrames, 0, "100"}, {-3, kFrames, 0, "-3"}, {100, kFrames, kSign, "+100"}, {-3, kFrames, kSign, "-3"},
      {35, k35mm, 0, "2+03"}, {40, k16mm, 0, "1+00"}, {-5, k35mm, 0, "-0+05"}, {-37, k35mm, kSign, "-2+05"}, {35, k35mm, kSign, "+2+03"},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Format(c.frames, kFrameRate_Video24, c.display, c.flags), c.text);
  }
}

TEST(TimeToTimecode, TrimmedMillisecondsWidenWithTheFieldSeparator) {
  const Flags keep = kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_KeepMinutes;
  EXPECT_EQ(Format(1500, kFrameRate_Milliseconds, kMs, keep), "0:01.500");
  EXPECT_EQ(Format(15500, kFrameRate_Milliseconds, kMs, keep), "0:15.500");
  EXPECT_EQ(Format(1500, kFrameRate_Milliseconds, kMs, kTimecodeFlag_TrimLeadingZeros), "1.500");
  EXPECT_EQ(Parse("0:01.500", kFrameRate_Milliseconds, kMs),
            TickTime(1500, kFrameRate_Milliseconds));
  EXPECT_EQ(Format(30, kFrameRate_Video29_97, kDrop, keep), "0;01;00");
}

TEST(TimeToTimecode, NoRateFormatsZeroFields) {
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-5)}) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    for (unsigned flags : {0u, unsigned{kTimecodeFlag_InclusiveEnd}}) {
      EXPECT_EQ(Narrow(TimeToTimecode(kTime_OneHour, rate, k24, flags)), "00:00:00:00");
      EXPECT_EQ(Narrow(TimeToTimecode(-kTime_OneHour, rate, k24, flags)), "00:00:00:00");
      EXPECT_EQ(Narrow(TimeToTimecode(-kTime_OneHour, rate, kDrop, flags)), "00;00;00;00");
      EXPECT_EQ(Narrow(TimeToTimecode(kTime_OneHour, rate, kFrames, flags)), "0");
      EXPECT_EQ(Narrow(TimeToTimecode(kTime_OneHour, rate, k35mm, flags)), "0+00");
    }
  }
}

// ---- Reading ----

TEST(TimecodeToTime, ReadsAndCarriesFields) {
  struct Case {
    const char* text;
    FrameRate rate;
    TimeDisplay display;
    std::int64_t frames;
  };
  constexpr FrameRate k29 = kFrameRate_Video29_97;
  constexpr FrameRate k24fps = kFrameRate_Video24;
  const auto custom = [](std::int64_t fps) { return FrameRate::FromFramesPerSecond(fps); };
  // clang-format off
  const Case kCases[] = {
      {"00:00:00:25", k24fps, k24, 25}, {"00:00:00:100", k24fps, k24, 100}, {"00:00:60:00", k24fps, k24, 1440},
      {"00:00:3600:00", k24fps, k24, 86400}, {"00:120:00:00", k24fps, k24, 172800}, {"24:00:00:00", k24fps, k24, 0},
      {"25:00:00:00", k24fps, k24, 86400}, {"1:00", k24fps, k24, 24}, {"1;01", k24fps, k24, 25}, {"1.02", k24fps, k24, 26},
      {"1:2:3", k24fps, k24, 1491}, {"1;2.3:4", k24fps, k24, 89356}, {"01.02:03;04", k24fps, k24, 89356},
      {"+100", k24fps, k24, 24}, {"-00:00:01:00", k24fps, k24, -24}, {"", k24fps, k24, 0}, {"1::", k24fps, k24, 1440},
      {"::5", k24fps, k24, 5}, {":102", k24fps, k24, 102}, {"-1800", k29, kFrames, -1800},
      // A digit run is split from the right: as many frame digits as the
      // display's count needs, then two each of seconds, minutes and hours.
      {"24", k24fps, k24, 24}, {"100", k24fps, k24, 24}, {"-101", k24fps, k24, -25}, {"1000", k24fps, k24, 240},
      {"100000", k24fps, k24, 14400}, {"10000000", k24fps, k24, 864000}, {"24000000", k24fps, k24, 0},
      {"10", custom(5), TimeDisplay::CreateCustom(5), 5}, {"10", custom(10), TimeDisplay::CreateCustom(10), 10},
      {"100", custom(95), TimeDisplay::CreateCustom(95), 95}, {"100", custom(100), TimeDisplay::CreateCustom(100), 100},
      {"1000000", custom(1000000), TimeDisplay::CreateCustom(1000000), 1000000},
      {"100000", custom(10), TimeDisplay::CreateCustom(10), 36000},
      {"00:00:00:30", k29, kNonDrop, 30}, {"00;00;00;60", k29, kDrop, 60}, {"00;01;00;00", k29, kDrop, 1800},
      {"00;01;00;01", k29, kDrop, 1799}, {"00;01;00;02", k29, kDrop, 1800}, {"00;10;00;00", k29, kDrop, 17982},
      {"00:00:00:30", kFrameRate_Video23_976, kDrop, 30}, {"00:00:01:00", kFrameRate_Video23_976, k25, 25},
      {"00:00:00:01", k96k, k24, 4000}, {"00:00:00:01", k96k, k23976, 4004}, {"00;01;00;02", k96k, kDrop, 5765760},
      {"00:00:00.001", k8k, kMs, 8}, {"00:00:01.001", kFrameRate_Audio192000, kMs, 192192}, {"00:00:01:00", k8k, k24, 8000},
      {"2+03", k24fps, k35mm, 35}, {"203", k24fps, k35mm, 35}, {"-0+05", k24fps, k35mm, -5}, {"1:05", k24fps, k16mm, 45},
      {"+5", k24fps, k16mm, 5}, {"1203", k24fps, k35mm, 195}, {"2+", k24fps, k35mm, 32},
      {"1000000000+00", kFrameRate_Milliseconds, k35mm, 16000000000},  // beyond 32 bits
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    SCOPED_TRACE(static_cast<int>(c.display.GetType()));
    EXPECT_EQ(Parse(c.text, c.rate, c.display), TickTime(c.frames, c.rate));
  }
}

TEST(TimecodeToTime, BadInputGivesInvalid) {
  struct Case {
    TimeDisplay display;
    std::vector<const char*> texts;
  };
  // clang-format off
  const Case kCases[] = {
      {k24, {"-", "+", ":", "-:", "+;", "12a", "a12", "1:2:3:4:5", "1:2:3:4:", "1::2::3", " 12", "12 ", "1 2",
             "1,2", "1/2", "1+2", "1-2", "--1", "+-1", "-+1", "1:-2", "1:+2", "1-",
             "\xef\xbc\x91",  // the bytes of a full-width digit, a character each
             "99999999999999999999", "9223372036854775808", "00:00:00:9223372036854775808",
             "18446744073709551616:00:00:00"}},
      // In the frame count: any separator, and a count whose ticks do not fit.
      {kFrames, {"1:2", "1;2", "1.2", "12x", "9223372036854775807"}},
      {k35mm, {"1+2+3", "1:2:3", "1+2.", "abc", "+", "-", "x+y", "99999999999999999999", "999999999999999999+00"}},
  };
  // clang-format on
  for (const Case& c : kCases) {
    for (const char* text : c.texts) {
      SCOPED_TRACE(text);
      EXPECT_EQ(Parse(text, kFrameRate_Video24, c.display), kTime_Invalid);
    }
  }
}

TEST(TryTimecodeToTime, TextThatReadsAsTheInvalidTimeIsAValue) {
  constexpr FrameRate kMilli = kFrameRate_Milliseconds;
  struct Case {
    const char* text;
    FrameRate rate;
    TimeDisplay display;
  };
  const Case kCases[] = {
      {"-400000000", kMilli, kFrames},
      {"-400000", FrameRate::FromFramesPerSecond(1), kFrames},
      {"-25000000+00", kMilli, k35mm},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(TryTimecodeToTime(c.text, c.rate, c.display), kTime_Invalid);
    EXPECT_EQ(TryTimecodeToTime(Wide(c.text), c.rate, c.display), kTime_Invalid);
  }
  EXPECT_EQ(TryTimecodeToTime("-400000001", kMilli, kFrames), kTime_Invalid - TickTime(1, kMilli));
}

TEST(TimecodeToTime, MillisecondsFieldIsAWholeCount) {
  EXPECT_EQ(Parse("1.5", k8k, kMs), kTime_OneSecond + TickTime(5, kFrameRate_Milliseconds));
  EXPECT_EQ(Parse("1.500", k8k, kMs), kTime_OneSecond * 1.5);
}

TEST(TimecodeToTime, LongFieldsCarryWithoutOverflow) {
  // The largest digit run that fits wraps into the day like any other.
  constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();
  constexpr std::uint64_t kUMax = std::numeric_limits<std::uint64_t>::max();
  constexpr FrameRate k1 = FrameRate::FromFramesPerSecond(1);
  EXPECT_EQ(Parse("00:00:00:9223372036854775807", kFrameRate_Video24, k24),
            TickTime(kMax % (86400 * 24), kFrameRate_Video24));
  EXPECT_EQ(Parse("9223372036854775807:00:00:00", kFrameRate_Video24, k24),
            TickTime((kMax % 24) * 3600 * 24, kFrameRate_Video24));
  // Seconds beyond 32 bits are carried, not cut to 32 bits.
  EXPECT_EQ(Parse("00:00:4294967296:00", kFrameRate_Video24, k24),
            TickTime((4294967296 % 86400) * 24, kFrameRate_Video24));
  EXPECT_EQ(HMSFToTime(0, 0, 0, kUMax, false, k1, TimeDisplay::CreateCustom(1)),
            TickTime(static_cast<std::int64_t>(kUMax % 86400), k1));
}

TEST(TimecodeToTime, NoCountingRateGivesInvalidForANonZeroCount) {
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-1)}) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    EXPECT_EQ(Parse("00:00:01:00", rate, kDrop), kTime_Invalid);
    EXPECT_EQ(Parse("00:00:01:00", rate, k24), kTime_Invalid);
    EXPECT_EQ(Parse("5", rate, kFrames), kTime_Invalid);
    EXPECT_EQ(Parse("2+03", rate, k35mm), kTime_Invalid);
    EXPECT_EQ(Parse("00:00:00:00", rate, k24, kTimecodeFlag_InclusiveEnd), kTime_Zero);
    EXPECT_EQ(Parse("0", rate, kFrames, kTimecodeFlag_InclusiveEnd), kTime_Zero);
    // Milliseconds do not depend on the media rate.
    EXPECT_EQ(Parse("00:00:01.000", rate, kMs), kTime_OneSecond);
  }
}

TEST(TimecodeToTime, InclusiveEndMovesForwardOneFrameWhateverTheSign) {
  struct Case {
    const char* text;
    TimeDisplay display;
    std::int64_t frames;
  };
  // clang-format off
  constexpr Case kCases[] = {
      {"00:00:00:23", k24, 24}, {"-00:00:00:01", k24, 0}, {"-00:00:01:00", k24, -23}, {":23", k24, 24},
      {"23", kFrames, 24}, {"-1", kFrames, 0}, {"-5", kFrames, -4},
      {"1+07", k35mm, 24}, {"-0+01", k35mm, 0}, {"-0+05", k35mm, -4}, {"0+00", k35mm, 1},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Parse(c.text, kFrameRate_Video24, c.display, kTimecodeFlag_InclusiveEnd),
              TickTime(c.frames, kFrameRate_Video24));
  }
}

// ---- Round trips ----

struct RoundTripCase {
  const char* name;
  FrameRate rate;
  TimeDisplay display;
  // Frames of `rate` per unit of the sweep (1, or 48 for milliseconds of
  // 48 kHz audio); the sweep visits times of whole units.
  std::int64_t framesPerUnit;
};

// clang-format off
constexpr RoundTripCase kRoundTrips[] = {
    {"29.97 drop-frame", kFrameRate_Video29_97, kDrop, 1}, {"29.97 non-drop", kFrameRate_Video29_97, kNonDrop, 1},
    {"59.94 drop-frame", kFrameRate_Video59_94, kDrop5994, 1},
    {"59.94 non-drop", kFrameRate_Video59_94, TimeDisplay(kTimeDisplay_5994NonDropTimecode), 1},
    {"23.976", kFrameRate_Video23_976, k23976, 1}, {"24", kFrameRate_Video24, k24, 1}, {"25", kFrameRate_Video25, k25, 1},
    {"30", kFrameRate_Video30, TimeDisplay(kTimeDisplay_30Timecode), 1},
    {"50", kFrameRate_Video50, TimeDisplay(kTimeDisplay_50Timecode), 1},
    {"60", kFrameRate_Video60, TimeDisplay(kTimeDisplay_60Timecode), 1},
    {"frames at 29.97", kFrameRate_Video29_97, kFrames, 1}, {"35 mm at 24", kFrameRate_Video24, k35mm, 1},
    {"16 mm at 24", kFrameRate_Video24, k16mm, 1}, {"samples at 48 kHz", kFrameRate_Audio48000, kSamples, 1},
    {"milliseconds", kFrameRate_Milliseconds, kMs, 1},
    // A millisecond holds 48 samples: only whole milliseconds read back, and
    // the inclusive end (one sample) does not.
    {"milliseconds of 48 kHz", kFrameRate_Audio48000, kMs, 48},
};
// clang-format on
static_assert(std::size(kRoundTrips) == 16);

// The last unit of the sweep: just before +24 h, or, in drop-frame, just
// before the hours wrap at 24 (a labelled day holds 2589408 frames at 29.97,
// 24 h of time 2589410.6).
std::int64_t EndUnit(const RoundTripCase& c) {
  std::int64_t end = 24 * kTime_OneHour.GetTicks() / c.rate.GetTicksPerFrame();
  if (c.display.IsDropFrame()) {
    end = std::min<std::int64_t>(
        end, c.display.GetType() == kTimeDisplay_2997DropTimecode ? 24 * 107892 : 24 * 215784);
  }
  return end / c.framesPerUnit;
}

std::int64_t UnitsPerSecond(const RoundTripCase& c) {
  return kTime_OneSecond.GetTicks() / c.rate.GetTicksPerFrame() / c.framesPerUnit;
}

// Formats every unit in [first, last) by `stride` and reads it back; stops at
// the first time that does not read back. Negative times are written with
// their sign; the inclusive end writes the frame before the time.
void Sweep(const RoundTripCase& c, std::int64_t first, std::int64_t last, std::int64_t stride,
           Flags extra = {}) {
  const std::int64_t signFrom = extra.IsSet(kTimecodeFlag_InclusiveEnd) ? 1 : 0;
  for (std::int64_t u = first; u < last; u += stride) {
    const TickTime time(u * c.framesPerUnit, c.rate);
    const Flags flags = u < signFrom ? Flags(extra.Value() | kTimecodeFlag_ShowSign) : extra;
    const zebcore::UTF16String text = TimeToTimecode(time, c.rate, c.display, flags);
    const TickTime back = TimecodeToTime(text, c.rate, c.display, flags);
    if (back != time) {
      ADD_FAILURE() << c.name << ": unit " << u << " wrote \"" << Narrow(text) << "\", read "
                    << back.GetTicks();
      return;
    }
  }
}

TEST(Timecode, FormatAndReadAreInversesAroundZeroBoundariesAndAcrossTheDay) {
  for (const RoundTripCase& c : kRoundTrips) {
    SCOPED_TRACE(c.name);
    const std::int64_t perSecond = UnitsPerSecond(c);
    const std::int64_t end = EndUnit(c);
    const std::int64_t stride = perSecond > 1000 ? 1000003 : 997;  // prime
    // The hour around zero; for milliseconds the two minutes, for samples the
    // four seconds around it.
    const std::int64_t around = (perSecond <= 60 ? 1800 : perSecond <= 1000 ? 60 : 2) * perSecond;
    for (Flags extra : {Flags(), Flags(kTimecodeFlag_InclusiveEnd)}) {
      if (extra.IsSet(kTimecodeFlag_InclusiveEnd) && c.framesPerUnit != 1) continue;
      Sweep(c, -around, around, 1, extra);
      Sweep(c, -3600 * perSecond, end, stride, extra);  // across [-1 h, +24 h)
    }
    // Trimmed and widened texts with colons read back too.
    Sweep(
        c, -3600 * perSecond, end, stride,
        kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_KeepMinutes | kTimecodeFlag_ColonSeparators);
    // Either side of every drop-frame ten-minute boundary.
    if (c.display.IsDropFrame()) {
      const std::int64_t tenMinutes =
          c.display.GetType() == kTimeDisplay_2997DropTimecode ? 17982 : 35964;
      for (std::int64_t b = -6 * tenMinutes; b < end; b += tenMinutes) {
        Sweep(c, b - 2 * perSecond, std::min(end, b + 70 * perSecond), 1);
      }
    }
  }
}

TEST(Timecode, EveryFrameOfTheDayRoundTripsExhaustive) {
  for (const RoundTripCase& c : kRoundTrips) {
    SCOPED_TRACE(c.name);
    const std::int64_t perSecond = UnitsPerSecond(c);
    // Every sample (or millisecond) of a day is more than a sweep can visit:
    // those cases visit every unit of the hour either side of zero and a small
    // prime stride after it.
    if (perSecond >= 1000) {
      Sweep(c, -3600 * perSecond, 3600 * perSecond, 1);
      Sweep(c, 3600 * perSecond, EndUnit(c), 401);
    } else {
      Sweep(c, -3600 * perSecond, EndUnit(c), 1);
      Sweep(c, -3600 * perSecond, EndUnit(c), 1, kTimecodeFlag_InclusiveEnd);
    }
  }
}

}  // namespace
}  // namespace zebmediatypes
