#include <gtest/gtest.h>
#include <zebmediatypes/ratio_time.h>
#include <zebmediatypes/timecode.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

namespace zebmediatypes {
namespace {

using Flags = zebcore::utility::Flags<unsigned int>;

std::string Narrow(const zebcore::UTF16String& text) {
  std::string out;
  for (char16_t c : text) out += c < 0x80 ? static_cast<char>(c) : '?';
  return out;
}

std::u16string Wide(std::string_view text) {
  std::u16string out;
  for (char c : text) out += static_cast<char16_t>(static_cast<unsigned char>(c));
  return out;
}

std::string Format(std::int64_t frames, FrameRate rate, TimeDisplay display, Flags flags = {}) {
  return Narrow(TimeToTimecode(TickTime(frames, rate), rate, display, flags));
}

TickTime Parse(std::string_view text, FrameRate rate, TimeDisplay display, Flags flags = {}) {
  return TimecodeToTime(Wide(text), rate, display, flags);
}

const TimeDisplay kDrop2997(kTimeDisplay_2997DropTimecode);
const TimeDisplay kNonDrop2997(kTimeDisplay_2997NonDropTimecode);
const TimeDisplay k24(kTimeDisplay_24Timecode);
const TimeDisplay k23976(kTimeDisplay_23976Timecode);
const TimeDisplay kMs(kTimeDisplay_AudioMsTimecode);
const TimeDisplay kFrames(kTimeDisplay_Frames);
const TimeDisplay k35mm(kTimeDisplay_35mmFeetFrames);
const TimeDisplay k16mm(kTimeDisplay_16mmFeetFrames);

TEST(TimeToTimecode, DropFrameSkipsTwoLabelsExceptEveryTenthMinute) {
  struct Case {
    std::int64_t frame;
    const char* text;
  };
  constexpr Case kCases[] = {
      {0, "00;00;00;00"},       {1, "00;00;00;01"},      {29, "00;00;00;29"},
      {30, "00;00;01;00"},      {1799, "00;00;59;29"},   {1800, "00;01;00;02"},
      {3597, "00;01;59;29"},    {3598, "00;02;00;02"},   {17981, "00;09;59;29"},
      {17982, "00;10;00;00"},   {17983, "00;10;00;01"},  {19782, "00;11;00;02"},
      {107891, "00;59;59;29"},  {107892, "01;00;00;00"}, {2589407, "23;59;59;29"},
      {2589408, "00;00;00;00"},  // the 24-hour wrap
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.frame);
    EXPECT_EQ(Format(c.frame, kFrameRate_Video29_97, kDrop2997), c.text);
  }
  EXPECT_EQ(Format(30, kFrameRate_Video29_97, kDrop2997, kTimecodeFlag_ColonSeparators),
            "00:00:01:00");
  EXPECT_EQ(Format(3600, kFrameRate_Video59_94, TimeDisplay(kTimeDisplay_5994DropTimecode)),
            "00;01;00;04");
}

TEST(TimeToTimecode, AudioMediaIsCountedInDisplayFrames) {
  struct Case {
    FrameRate rate;
    TimeDisplay display;
    std::int64_t samples;
    const char* text;
  };
  const FrameRate k96 = kFrameRate_Audio96000;
  const FrameRate k8 = kFrameRate_Audio8000;
  const FrameRate k192 = kFrameRate_Audio192000;
  const Case kCases[] = {
      {k96, k24, 0, "00:00:00:00"},
      {k96, k24, 3999, "00:00:00:00"},
      {k96, k24, 4000, "00:00:00:01"},
      {k96, k24, 4001, "00:00:00:01"},
      {k96, k24, 8000, "00:00:00:02"},
      {k96, k24, 95999, "00:00:00:23"},
      {k96, k24, 96000, "00:00:01:00"},
      {k96, k23976, 4003, "00:00:00:00"},
      {k96, k23976, 4004, "00:00:00:01"},
      {k96, k23976, 96095, "00:00:00:23"},
      {k96, k23976, 96096, "00:00:01:00"},
      {k96, kDrop2997, 1, "00;00;00;00"},
      {k96, kDrop2997, 3204, "00;00;00;01"},
      {k96, kDrop2997, 16016, "00;00;00;05"},
      {k96, kDrop2997, 96095, "00;00;00;29"},
      {k96, kDrop2997, 96096, "00;00;01;00"},
      {k96, kDrop2997, 5765760, "00;01;00;02"},
      {k96, kDrop2997, 57599943, "00;10;00;00"},
      {k8, kMs, 7, "00:00:00.000"},
      {k8, kMs, 8, "00:00:00.001"},
      {k8, kMs, 7999, "00:00:00.999"},
      {k8, kMs, 8001, "00:00:01.000"},
      {k8, kMs, 8008, "00:00:01.001"},
      {k192, kMs, 191, "00:00:00.000"},
      {k192, kMs, 192, "00:00:00.001"},
      {k192, kMs, 191999, "00:00:00.999"},
      {k192, kMs, 192192, "00:00:01.001"},
      {kFrameRate_Audio48000, TimeDisplay(kTimeDisplay_AudioSamplesTimecode), 48001,
       "00:00:01:00001"},
      // 8000, 11025 and 16000 Hz are counted in display frames like the others.
      {k8, k24, 8000, "00:00:01:00"},
      {kFrameRate_Audio11025, k24, 11025, "00:00:01:00"},
      {kFrameRate_Audio16000, TimeDisplay(kTimeDisplay_25Timecode), 16000 * 61, "00:01:01:00"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.samples);
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Format(c.samples, c.rate, c.display), c.text);
  }
}

TEST(TimeToTimecode, MediaFramesAreLabelledAtTheDisplayCount) {
  struct Case {
    std::int64_t frames;
    FrameRate rate;
    TimeDisplayType display;
    const char* text;
  };
  constexpr Case kCases[] = {
      {90000, kFrameRate_Video25, kTimeDisplay_23976Timecode, "01:02:30:00"},
      {90000, kFrameRate_Video25, kTimeDisplay_24Timecode, "01:02:30:00"},
      {90000, kFrameRate_Video25, kTimeDisplay_2997NonDropTimecode, "00:50:00:00"},
      {90000, kFrameRate_Video25, kTimeDisplay_30Timecode, "00:50:00:00"},
      {90000, kFrameRate_Video25, kTimeDisplay_48Timecode, "00:31:15:00"},
      {90000, kFrameRate_Video25, kTimeDisplay_50Timecode, "00:30:00:00"},
      {90000, kFrameRate_Video25, kTimeDisplay_5994NonDropTimecode, "00:25:00:00"},
      {90000, kFrameRate_Video25, kTimeDisplay_60Timecode, "00:25:00:00"},
      {108000, kFrameRate_Video29_97, kTimeDisplay_24Timecode, "01:15:00:00"},
      {108000, kFrameRate_Video30, kTimeDisplay_23976Timecode, "01:15:00:00"},
      {108000, kFrameRate_Video30, kTimeDisplay_25Timecode, "01:12:00:00"},
      {108000, kFrameRate_Video29_97, kTimeDisplay_48Timecode, "00:37:30:00"},
      {108000, kFrameRate_Video30, kTimeDisplay_50Timecode, "00:36:00:00"},
      {108000, kFrameRate_Video29_97, kTimeDisplay_5994NonDropTimecode, "00:30:00:00"},
      {108000, kFrameRate_Video30, kTimeDisplay_60Timecode, "00:30:00:00"},
      {86400, kFrameRate_Video23_976, kTimeDisplay_25Timecode, "00:57:36:00"},
      {86400, kFrameRate_Video23_976, kTimeDisplay_2997NonDropTimecode, "00:48:00:00"},
      {86400, kFrameRate_Video23_976, kTimeDisplay_30Timecode, "00:48:00:00"},
      {86400, kFrameRate_Video23_976, kTimeDisplay_48Timecode, "00:30:00:00"},
      {25 * 3600 * 24, kFrameRate_Video24, kTimeDisplay_24Timecode, "01:00:00:00"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    SCOPED_TRACE(static_cast<int>(c.display));
    EXPECT_EQ(Format(c.frames, c.rate, TimeDisplay(c.display)), c.text);
  }
  EXPECT_EQ(Format(60, kFrameRate_Video24, TimeDisplay::CreateCustom(1)), "00:01:00:0");
  EXPECT_EQ(Format(1440, kFrameRate_Video24, TimeDisplay::CreateCustom(1)), "00:24:00:0");
}

TEST(TimeToTimecode, StyleFlags) {
  struct Case {
    std::int64_t frames;
    unsigned flags;
    const char* text;
  };
  constexpr unsigned kTrim = kTimecodeFlag_TrimLeadingZeros;
  constexpr unsigned kKeep = kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_KeepMinutes;
  constexpr Case kCases[] = {
      {24, kTimecodeFlag_OmitHours, "00:01:00"},
      {0, kTrim, "0:00"},
      {24, kTrim, "1:00"},
      {24, kTrim | kTimecodeFlag_ShowSign, "+1:00"},
      {-24, kTrim | kTimecodeFlag_ShowSign, "-1:00"},
      {24, kTimecodeFlag_InclusiveEnd, "00:00:00:23"},
      {24, kKeep, "0:01:00"},
      {1440, kKeep, "1:00:00"},
      {14400, kKeep, "10:00:00"},
      {24 * 3600, kTrim, "1:00:00:00"},
      {24 * 3605, kTrim, "1:00:05:00"},
      {24 * 605, kTrim, "10:05:00"},
      {24, kTimecodeFlag_ShowSign, "+00:00:01:00"},
      {0, kTimecodeFlag_ShowSign, "00:00:00:00"},
      {-24, 0, "23:00:01:00"},  // unsigned negative: 23 - hours
      {24 * 3600 * 25, kTimecodeFlag_OmitHours, "00:00:00"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Format(c.frames, kFrameRate_Video24, k24, c.flags), c.text);
  }
}

TEST(TimeToTimecode, TrimmedMillisecondsWidenWithTheFieldSeparator) {
  const Flags keep = kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_KeepMinutes;
  EXPECT_EQ(Format(1500, kFrameRate_Milliseconds, kMs, keep), "0:01.500");
  EXPECT_EQ(Format(15500, kFrameRate_Milliseconds, kMs, keep), "0:15.500");
  EXPECT_EQ(Format(1500, kFrameRate_Milliseconds, kMs, kTimecodeFlag_TrimLeadingZeros), "1.500");
  EXPECT_EQ(Parse("0:01.500", kFrameRate_Milliseconds, kMs),
            TickTime(1500, kFrameRate_Milliseconds));
  EXPECT_EQ(Format(30, kFrameRate_Video29_97, kDrop2997, keep), "0;01;00");
}

TEST(TimeToTimecode, OtherDisplays) {
  struct Case {
    std::int64_t frames;
    TimeDisplay display;
    unsigned flags;
    const char* text;
  };
  const Case kCases[] = {
      {100, kFrames, 0, "100"},
      {-3, kFrames, 0, "-3"},
      {100, kFrames, kTimecodeFlag_ShowSign, "+100"},
      {-3, kFrames, kTimecodeFlag_ShowSign, "-3"},
      {35, k35mm, 0, "2+03"},
      {40, k16mm, 0, "1+00"},
      {-5, k35mm, 0, "-0+05"},
      {-37, k35mm, kTimecodeFlag_ShowSign, "-2+05"},
      {35, k35mm, kTimecodeFlag_ShowSign, "+2+03"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Format(c.frames, kFrameRate_Video24, c.display, c.flags), c.text);
  }
}

TEST(TimeToTimecode, DefaultDisplayIsTheStandardDisplayOfTheRate) {
  EXPECT_EQ(Format(1800, kFrameRate_Video29_97, TimeDisplay()), "00;01;00;02");
  EXPECT_EQ(Format(3600, kFrameRate_Video59_94, TimeDisplay()), "00;01;00;04");
  EXPECT_EQ(Format(25, kFrameRate_Video25, TimeDisplay()), "00:00:01:00");
  EXPECT_EQ(Format(48000, kFrameRate_Audio48000, TimeDisplay()), "00:00:01:00000");
  // A code that names no display is the default display too.
  EXPECT_EQ(Format(1800, kFrameRate_Video29_97, TimeDisplay(150u)), "00;01;00;02");
}

TEST(TimeToTimecode, NoRateFormatsZeroFields) {
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-5)}) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    for (unsigned flags : {0u, unsigned{kTimecodeFlag_InclusiveEnd}}) {
      EXPECT_EQ(Narrow(TimeToTimecode(kTime_OneHour, rate, k24, flags)), "00:00:00:00");
      EXPECT_EQ(Narrow(TimeToTimecode(-kTime_OneHour, rate, k24, flags)), "00:00:00:00");
      EXPECT_EQ(Narrow(TimeToTimecode(-kTime_OneHour, rate, kDrop2997, flags)), "00;00;00;00");
      EXPECT_EQ(Narrow(TimeToTimecode(kTime_OneHour, rate, kFrames, flags)), "0");
      EXPECT_EQ(Narrow(TimeToTimecode(kTime_OneHour, rate, k35mm, flags)), "0+00");
    }
  }
}

TEST(TimeToHMSF, GivesTheFieldsOfTheText) {
  unsigned h = 9, m = 9, s = 9;
  std::uint64_t f = 9;
  bool negative = false;
  TimeToHMSF(h, m, s, f, negative, TickTime(-(3600 + 61) * 24 - 5, kFrameRate_Video24),
             kFrameRate_Video24, k24);
  EXPECT_EQ((std::vector<std::uint64_t>{h, m, s, f}), (std::vector<std::uint64_t>{1, 1, 1, 5}));
  EXPECT_TRUE(negative);
  TimeToHMSF(h, m, s, f, negative, TickTime(-3, kFrameRate_Video24), kFrameRate_Video24, kFrames);
  EXPECT_EQ((std::vector<std::uint64_t>{h, m, s, f}),
            (std::vector<std::uint64_t>{0, 0, 0, static_cast<std::uint64_t>(-3)}));
  EXPECT_TRUE(negative);
}

// ---- Reading ----

TEST(TimecodeToTime, ReadsAndCarriesFields) {
  struct Case {
    const char* text;
    std::int64_t frames;
  };
  constexpr Case kCases[] = {
      {"00:00:00:24", 24},
      {"00:00:00:25", 25},
      {"00:00:00:48", 48},
      {"00:00:00:100", 100},
      {"00:00:60:00", 1440},
      {"00:00:120:00", 2880},
      {"00:00:3600:00", 86400},
      {"00:60:00:00", 86400},
      {"00:120:00:00", 172800},
      {"24:00:00:00", 0},
      {"24000000", 0},
      {"24", 24},
      {"100", 24},
      {"1:00", 24},
      {"1;01", 25},
      {"1.02", 26},
      {"+100", 24},
      {"-101", -25},
      {":102", 102},
      {"1000", 240},
      {"10000", 1440},
      {"100000", 14400},
      {"1000000", 86400},
      {"10000000", 864000},
      {"", 0},
      {"1::", 1440},
      {"::5", 5},
      {"-00:00:01:00", -24},
      {"25:00:00:00", 86400},
      {"1:2:3", 1491},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Parse(c.text, kFrameRate_Video24, k24), TickTime(c.frames, kFrameRate_Video24));
  }
}

TEST(TimecodeToTime, ReadsOtherRatesAndDisplays) {
  struct Case {
    const char* text;
    FrameRate rate;
    TimeDisplay display;
    std::int64_t frames;
  };
  const FrameRate k96 = kFrameRate_Audio96000;
  const Case kCases[] = {
      {"00:00:00:30", kFrameRate_Video29_97, kNonDrop2997, 30},
      {"00:00:00:30", kFrameRate_Video29_97, kDrop2997, 30},
      {"00;00;00;60", kFrameRate_Video29_97, kDrop2997, 60},
      {"00;01;00;00", kFrameRate_Video29_97, kDrop2997, 1800},
      {"00;01;00;01", kFrameRate_Video29_97, kDrop2997, 1799},
      {"00;01;00;02", kFrameRate_Video29_97, kDrop2997, 1800},
      {"00;10;00;00", kFrameRate_Video29_97, kDrop2997, 17982},
      {"00:00:00:24", kFrameRate_Video23_976, k24, 24},
      {"00:00:00:30", kFrameRate_Video23_976, kDrop2997, 30},
      {"00:00:01:00", kFrameRate_Video23_976, TimeDisplay(kTimeDisplay_25Timecode), 25},
      {"10", FrameRate::FromFramesPerSecond(5), TimeDisplay::CreateCustom(5), 5},
      {"100", FrameRate::FromFramesPerSecond(95), TimeDisplay::CreateCustom(95), 95},
      {"1000", FrameRate::FromFramesPerSecond(995), TimeDisplay::CreateCustom(995), 995},
      {"10000", FrameRate::FromFramesPerSecond(9995), TimeDisplay::CreateCustom(9995), 9995},
      {"10", FrameRate::FromFramesPerSecond(10), TimeDisplay::CreateCustom(10), 10},
      {"100", FrameRate::FromFramesPerSecond(100), TimeDisplay::CreateCustom(100), 100},
      {"1000", FrameRate::FromFramesPerSecond(1000), TimeDisplay::CreateCustom(1000), 1000},
      {"1000000", FrameRate::FromFramesPerSecond(1000000), TimeDisplay::CreateCustom(1000000),
       1000000},
      {"1000", FrameRate::FromFramesPerSecond(10), TimeDisplay::CreateCustom(10), 600},
      {"100000", FrameRate::FromFramesPerSecond(10), TimeDisplay::CreateCustom(10), 36000},
      {"00:00:00:01", k96, k24, 4000},
      {"00:00:00:01", k96, k23976, 4004},
      {"00;01;00;02", k96, kDrop2997, 5765760},
      {"00:00:00.001", kFrameRate_Audio8000, kMs, 8},
      {"00:00:00.001", kFrameRate_Audio192000, kMs, 192},
      {"00:00:01.001", kFrameRate_Audio8000, kMs, 8008},
      {"00:00:01.001", kFrameRate_Audio192000, kMs, 192192},
      {"00:00:01:00", kFrameRate_Audio8000, k24, 8000},
      {"2+03", kFrameRate_Video24, k35mm, 35},
      {"203", kFrameRate_Video24, k35mm, 35},
      {"-0+05", kFrameRate_Video24, k35mm, -5},
      {"1:05", kFrameRate_Video24, k16mm, 45},
      {"+5", kFrameRate_Video24, k16mm, 5},
      {"1203", kFrameRate_Video24, k35mm, 195},
      {"2+", kFrameRate_Video24, k35mm, 32},
      {"1000000000+00", kFrameRate_Milliseconds, k35mm, 16000000000},  // beyond 32 bits
      {"-1800", kFrameRate_Video29_97, kFrames, -1800},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    SCOPED_TRACE(static_cast<int>(c.display.GetType()));
    EXPECT_EQ(Parse(c.text, c.rate, c.display), TickTime(c.frames, c.rate));
  }
}

TEST(TimecodeToTime, BadInputGivesInvalid) {
  struct Case {
    const char* text;
    TimeDisplay display;
  };
  const Case kCases[] = {
      {"-", k24},
      {"+", k24},
      {":", k24},
      {"-:", k24},
      {"+;", k24},
      {"12a", k24},
      {"a12", k24},
      {"1:2:3:4:5", k24},
      {"1:2:3:4:", k24},
      {"1::2::3", k24},
      {" 12", k24},
      {"12 ", k24},
      {"1 2", k24},
      {"1,2", k24},
      {"1/2", k24},
      {"1+2", k24},
      {"1-2", k24},
      {"--1", k24},
      {"+-1", k24},
      {"-+1", k24},
      {"1:-2", k24},
      {"1:+2", k24},
      {"1-", k24},
      {"\xef\xbc\x91", k24},  // bytes of a full-width digit, each a character
      {"99999999999999999999", k24},
      {"9223372036854775808", k24},
      {"00:00:00:9223372036854775808", k24},
      {"18446744073709551616:00:00:00", k24},
      {"1:2", kFrames},
      {"1;2", kFrames},
      {"12x", kFrames},
      {"9223372036854775807", kFrames},  // the ticks would not fit in 64 bits
      {"1+2+3", k35mm},
      {"1:2:3", k35mm},
      {"1+2.", k35mm},
      {"abc", k35mm},
      {"+", k35mm},
      {"-", k35mm},
      {"x+y", k35mm},
      {"99999999999999999999", k35mm},
      {"999999999999999999+00", k35mm},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Parse(c.text, kFrameRate_Video24, c.display), kTime_Invalid);
  }
}

TEST(TimecodeToTime, EverySeparatorReads) {
  const TickTime expected((((1 * 60) + 2) * 60 + 3) * 24 + 4, kFrameRate_Video24);
  for (const char* text :
       {"01:02:03:04", "01;02;03;04", "01.02.03.04", "01:02;03.04", "01.02:03;04", "1;2.3:4"}) {
    SCOPED_TRACE(text);
    EXPECT_EQ(Parse(text, kFrameRate_Video24, k24), expected);
  }
}

TEST(TimecodeToTime, LongFieldsCarryWithoutOverflow) {
  // The largest digit run that fits wraps into the day like any other.
  constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();
  constexpr std::int64_t kDay = 86400 * 24;
  EXPECT_EQ(Parse("00:00:00:9223372036854775807", kFrameRate_Video24, k24),
            TickTime(kMax % kDay, kFrameRate_Video24));
  EXPECT_EQ(Parse("9223372036854775807:00:00:00", kFrameRate_Video24, k24),
            TickTime((kMax % 24) * 3600 * 24, kFrameRate_Video24));
  // Seconds beyond 32 bits are carried, not cut to 32 bits.
  EXPECT_EQ(Parse("00:00:4294967296:00", kFrameRate_Video24, k24),
            TickTime((4294967296 % 86400) * 24, kFrameRate_Video24));
  EXPECT_EQ(HMSFToTime(0, 0, 0, std::numeric_limits<std::uint64_t>::max(), false,
                       FrameRate::FromFramesPerSecond(1), TimeDisplay::CreateCustom(1)),
            TickTime(static_cast<std::int64_t>(std::numeric_limits<std::uint64_t>::max() % 86400),
                     FrameRate::FromFramesPerSecond(1)));
}

TEST(TimecodeToTime, NoCountingRateGivesInvalidForANonZeroCount) {
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-1)}) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    EXPECT_EQ(Parse("00:00:01:00", rate, kDrop2997), kTime_Invalid);
    EXPECT_EQ(Parse("00:00:01:00", rate, k24), kTime_Invalid);
    EXPECT_EQ(Parse("5", rate, kFrames), kTime_Invalid);
    EXPECT_EQ(Parse("2+03", rate, k35mm), kTime_Invalid);
    EXPECT_EQ(Parse("00:00:00:00", rate, k24), kTime_Zero);
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
  const Case kCases[] = {
      {"00:00:00:23", k24, 24}, {"-00:00:00:01", k24, 0}, {"-00:00:01:00", k24, -23},
      {"23", kFrames, 24},      {"-1", kFrames, 0},       {"-5", kFrames, -4},
      {"1+07", k35mm, 24},      {"-0+01", k35mm, 0},      {"-0+05", k35mm, -4},
      {"0+00", k35mm, 1},       {":23", k24, 24},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Parse(c.text, kFrameRate_Video24, c.display, kTimecodeFlag_InclusiveEnd),
              TickTime(c.frames, kFrameRate_Video24));
  }
}

TEST(TimecodeToTime, RatioTimeOfAnUnreadableTextIsTheRatioOfInvalid) {
  EXPECT_EQ(TimecodeToRatioTime(u"12a", kFrameRate_Video24, k24), TimeToRatioTime(kTime_Invalid));
  EXPECT_EQ(TimecodeToRatioTime(u"00;00;01;00", kFrameRate_Video29_97, kDrop2997),
            boost::rational<std::int64_t>(1001, 1000));
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

// The inclusive end moves by one frame of the media; only where that is one
// unit of the display does the moved time read back.
bool InclusiveEndReadsBack(const RoundTripCase& c) { return c.framesPerUnit == 1; }

std::vector<RoundTripCase> RoundTripCases() {
  return {
      {"29.97 drop-frame", kFrameRate_Video29_97, kDrop2997, 1},
      {"29.97 non-drop", kFrameRate_Video29_97, kNonDrop2997, 1},
      {"59.94 drop-frame", kFrameRate_Video59_94, TimeDisplay(kTimeDisplay_5994DropTimecode), 1},
      {"59.94 non-drop", kFrameRate_Video59_94, TimeDisplay(kTimeDisplay_5994NonDropTimecode), 1},
      {"23.976", kFrameRate_Video23_976, k23976, 1},
      {"24", kFrameRate_Video24, k24, 1},
      {"25", kFrameRate_Video25, TimeDisplay(kTimeDisplay_25Timecode), 1},
      {"30", kFrameRate_Video30, TimeDisplay(kTimeDisplay_30Timecode), 1},
      {"50", kFrameRate_Video50, TimeDisplay(kTimeDisplay_50Timecode), 1},
      {"60", kFrameRate_Video60, TimeDisplay(kTimeDisplay_60Timecode), 1},
      {"frames at 29.97", kFrameRate_Video29_97, kFrames, 1},
      {"35 mm at 24", kFrameRate_Video24, k35mm, 1},
      {"16 mm at 24", kFrameRate_Video24, k16mm, 1},
      {"samples at 48 kHz", kFrameRate_Audio48000, TimeDisplay(kTimeDisplay_AudioSamplesTimecode),
       1},
      {"milliseconds", kFrameRate_Milliseconds, kMs, 1},
      // A millisecond holds 48 samples: only whole milliseconds read back.
      {"milliseconds of 48 kHz", kFrameRate_Audio48000, kMs, 48},
  };
}

// The last unit of the sweep: just before +24 h, or, when the display's hours
// wrap at 24 before real time does (the 1000/1001 rates count more frames in a
// labelled day than in 24 h of time for drop-frame), just before the wrap.
std::int64_t EndUnit(const RoundTripCase& c) {
  const std::int64_t day = 24 * kTime_OneHour.GetTicks() / c.rate.GetTicksPerFrame();
  const TimeDisplayType type = c.display.GetType();
  std::int64_t labelDay = day;  // frame counts and film do not wrap; milliseconds wrap with time
  if (c.display.IsDropFrame()) {
    labelDay = type == kTimeDisplay_2997DropTimecode ? 24 * 107892 : 24 * 215784;
  } else if (type != kTimeDisplay_Frames && type != kTimeDisplay_35mmFeetFrames &&
             type != kTimeDisplay_16mmFeetFrames && type != kTimeDisplay_AudioMsTimecode) {
    labelDay = 86400 * c.display.GetDisplayFramesPerSecond(c.rate);
  }
  return std::min(day, labelDay) / c.framesPerUnit;
}

// Formats unit u of the case and reads it back; a message when it does not
// give the same time.
std::string RoundTrip(const RoundTripCase& c, std::int64_t unit, Flags extra) {
  const TickTime time(unit * c.framesPerUnit, c.rate);
  // Negative times read back when written with their sign; the inclusive end
  // writes the frame before the time.
  const std::int64_t written = extra.IsSet(kTimecodeFlag_InclusiveEnd) ? unit - 1 : unit;
  const Flags flags = written < 0 ? Flags(extra.Value() | kTimecodeFlag_ShowSign) : extra;
  const zebcore::UTF16String text = TimeToTimecode(time, c.rate, c.display, flags);
  const TickTime back =
      TimecodeToTime(std::u16string_view(text.data(), text.size()), c.rate, c.display, flags);
  if (back == time) return {};
  return std::string(c.name) + ": unit " + std::to_string(unit) + " wrote \"" + Narrow(text) +
         "\", read " + std::to_string(back.GetTicks()) + " ticks";
}

// Sweeps [first, last) by `stride`; stops at the first failure.
void Sweep(const RoundTripCase& c, std::int64_t first, std::int64_t last, std::int64_t stride,
           Flags extra = {}) {
  for (std::int64_t u = first; u < last; u += stride) {
    const std::string failure = RoundTrip(c, u, extra);
    if (!failure.empty()) {
      ADD_FAILURE() << failure;
      return;
    }
  }
}

std::int64_t UnitsPerSecond(const RoundTripCase& c) {
  return kTime_OneSecond.GetTicks() / c.rate.GetTicksPerFrame() / c.framesPerUnit;
}

TEST(Timecode, FormatAndReadAreInversesAroundZeroBoundariesAndAcrossTheDay) {
  for (const RoundTripCase& c : RoundTripCases()) {
    SCOPED_TRACE(c.name);
    const std::int64_t perSecond = UnitsPerSecond(c);
    const std::int64_t end = EndUnit(c);
    // The hour around zero; for milliseconds the two minutes, for samples the
    // four seconds around it.
    const std::int64_t aroundSeconds = perSecond <= 60 ? 1800 : perSecond <= 1000 ? 60 : 2;
    const std::int64_t around = aroundSeconds * perSecond;
    for (Flags extra : {Flags(), Flags(kTimecodeFlag_InclusiveEnd)}) {
      if (extra.IsSet(kTimecodeFlag_InclusiveEnd) && !InclusiveEndReadsBack(c)) continue;
      Sweep(c, -around, around, 1, extra);
      // A prime stride across [-1 h, +24 h).
      Sweep(c, -3600 * perSecond, end, perSecond > 1000 ? 1000003 : 997, extra);
    }
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
  for (const RoundTripCase& c : RoundTripCases()) {
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

TEST(Timecode, DropFrameWrapAtTheEndOfTheLabelledDayReadsAsTheStartOfTheDay) {
  // 24 h of 29.97 fps time holds 2589410 frames, the labelled day 2589408: the
  // last two frames wrap to the first labels and read back as them.
  for (std::int64_t frame : {2589408, 2589409}) {
    SCOPED_TRACE(frame);
    const zebcore::UTF16String text =
        TimeToTimecode(TickTime(frame, kFrameRate_Video29_97), kFrameRate_Video29_97, kDrop2997);
    EXPECT_EQ(TimecodeToTime(text, kFrameRate_Video29_97, kDrop2997),
              TickTime(frame - 2589408, kFrameRate_Video29_97));
  }
}

}  // namespace
}  // namespace zebmediatypes
