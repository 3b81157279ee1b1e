#include <gtest/gtest.h>
#include <zebmediatypes/timecode.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>

namespace zebmediatypes {
namespace {

using Flags = zebcore::utility::Flags<unsigned int>;

std::string Narrow(const zebcore::UTF16String& text) {
  return std::string(text.begin(), text.end());
}

// TimecodeToTime of the UTF-8 text, checked against the UTF-16 reader and the
// Try reader (nullopt exactly where it gives kTime_Invalid).
TickTime Read(std::string_view text, FrameRate rate, TimeDisplay display, Flags flags = {}) {
  const TickTime time = TimecodeToTime(text, rate, display, flags);
  const zebcore::UTF16String wide = zebcore::string::UTF8to16(text);
  EXPECT_EQ(TimecodeToTime(zebcore::string::View(wide), rate, display, flags), time);
  EXPECT_EQ(TryTimecodeToTime(text, rate, display, flags).value_or(kTime_Invalid), time);
  return time;
}

constexpr TimeDisplay kDrop(kTimeDisplay_2997DropTimecode);
constexpr TimeDisplay kDrop5994(kTimeDisplay_5994DropTimecode);
constexpr TimeDisplay kNonDrop(kTimeDisplay_2997NonDropTimecode);
constexpr TimeDisplay k24(kTimeDisplay_24Timecode);
constexpr TimeDisplay k23976(kTimeDisplay_23976Timecode);
constexpr TimeDisplay kMs(kTimeDisplay_AudioMsTimecode);
constexpr TimeDisplay kSamples(kTimeDisplay_AudioSamplesTimecode);
constexpr TimeDisplay kFrames(kTimeDisplay_Frames);
constexpr TimeDisplay k35mm(kTimeDisplay_35mmFeetFrames);
constexpr FrameRate k2997 = kFrameRate_Video29_97;
constexpr FrameRate k5994 = kFrameRate_Video59_94;
constexpr FrameRate k24fps = kFrameRate_Video24;
constexpr FrameRate k96k = kFrameRate_Audio96000;
constexpr FrameRate k8k = kFrameRate_Audio8000;

TEST(TimeToTimecode, WritesTheLabelsOfTheDisplay) {
  constexpr unsigned kTrim = kTimecodeFlag_TrimLeadingZeros;
  constexpr unsigned kKeep = kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_KeepMinutes;
  constexpr unsigned kSign = kTimecodeFlag_ShowSign;
  constexpr FrameRate kMilli = kFrameRate_Milliseconds;
  struct Case {
    std::int64_t frames;
    FrameRate rate;
    TimeDisplay display;
    unsigned flags;
    const char* text;
  };
  const Case kCases[] = {
      // Drop-frame skips ;00 and ;01 (;00 to ;03 at 59.94) except every tenth minute.
      {1799, k2997, kDrop, 0, "00;00;59;29"},
      {1800, k2997, kDrop, 0, "00;01;00;02"},
      {17982, k2997, kDrop, 0, "00;10;00;00"},
      {2589408, k2997, kDrop, 0, "00;00;00;00"},
      {30, k2997, kDrop, kTimecodeFlag_ColonSeparators, "00:00:01:00"},
      {3600, k5994, kDrop5994, 0, "00;01;00;04"},
      // Media is counted in frames of the display.
      {90000, kFrameRate_Video25, k23976, 0, "01:02:30:00"},
      // The default display is the rate's own.
      {3600, k5994, TimeDisplay(), 0, "00;01;00;04"},
      // Audio media at a sample-rate constant is counted in display frames.
      {4000, k96k, k24, 0, "00:00:00:01"},
      {5765760, k96k, kDrop, 0, "00;01;00;02"},
      {48001, kFrameRate_Audio48000, kSamples, 0, "00:00:01:00001"},
      // Not in samples at 8000, 11025 and 16000 Hz either.
      {8000, k8k, k24, 0, "00:00:01:00"},
      // Flags, the frame count and feet and frames.
      {-24, k24fps, k24, kTrim | kSign, "-1:00"},
      {24, k24fps, k24, kTimecodeFlag_InclusiveEnd, "00:00:00:23"},
      {30, k2997, kDrop, kKeep, "0;01;00"},
      {1500, kMilli, kMs, kKeep, "0:01.500"},
      {-24, k24fps, k24, 0, "23:00:01:00"},  // unsigned negative: 23 - hours
      {35, k24fps, k35mm, 0, "2+03"},
      {-37, k24fps, k35mm, kSign, "-2+05"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Narrow(TimeToTimecode(TickTime(c.frames, c.rate), c.rate, c.display, c.flags)),
              c.text);
  }
}

TEST(TimeToTimecode, NoRateFormatsZeroFields) {
  for (FrameRate rate : {kFrameRate_Invalid, FrameRate(0), FrameRate(-5)}) {
    SCOPED_TRACE(rate.GetTicksPerFrame());
    for (unsigned flags : {0u, unsigned{kTimecodeFlag_InclusiveEnd}}) {
      EXPECT_EQ(Narrow(TimeToTimecode(-kTime_OneHour, rate, k24, flags)), "00:00:00:00");
      EXPECT_EQ(Narrow(TimeToTimecode(-kTime_OneHour, rate, kDrop, flags)), "00;00;00;00");
      EXPECT_EQ(Narrow(TimeToTimecode(kTime_OneHour, rate, k35mm, flags)), "0+00");
    }
  }
}

struct ReadCase {
  const char* text;
  FrameRate rate;
  TimeDisplay display;
  unsigned flags;
  TickTime time;
};

TEST(TimecodeToTime, ReadsAndCarriesFields) {
  constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();
  const auto at24 = [](std::int64_t frames) { return TickTime(frames, k24fps); };
  const TimeDisplay custom10 = TimeDisplay::CreateCustom(10);
  const FrameRate rate10 = FrameRate::FromFramesPerSecond(10);
  constexpr unsigned kInclusive = kTimecodeFlag_InclusiveEnd;
  const ReadCase kCases[] = {
      {"-00:00:01:00", k24fps, k24, 0, at24(-24)},
      {"", k24fps, k24, 0, kTime_Zero},
      {":102", k24fps, k24, 0, at24(102)},
      // A digit run is split from the right: as many frame digits as the
      // display's count needs, then two each of seconds, minutes and hours.
      {"100000", rate10, custom10, 0, TickTime(36000, rate10)},
      {"00;01;00;01", k2997, kDrop, 0, TickTime(1799, k2997)},
      {"00;01;00;04", k5994, kDrop5994, 0, TickTime(3600, k5994)},
      // The milliseconds field is a whole count, not a fraction.
      {"1.5", k8k, kMs, 0, TickTime(8040, k8k)},
      {"1.500", k8k, kMs, 0, TickTime(12000, k8k)},
      {"1000000000+00", kFrameRate_Milliseconds, k35mm, 0, kTime_OneSecond * 16000000},
      // Long fields carry into the day without overflow.
      {"00:00:00:9223372036854775807", k24fps, k24, 0, at24(kMax % (86400 * 24))},
      // The inclusive end moves forward one frame, whatever the sign.
      {"00:00:00:23", k24fps, k24, kInclusive, at24(24)},
      {"-0+05", k24fps, k35mm, kInclusive, at24(-4)},
      // Without a counting rate only zero reads; milliseconds need no rate.
      {"00:00:01.000", FrameRate(0), kMs, 0, kTime_OneSecond},
  };
  for (const ReadCase& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Read(c.text, c.rate, c.display, c.flags), c.time);
  }
}

TEST(TimecodeToTime, BadInputGivesInvalid) {
  struct Case {
    const char* text;
    FrameRate rate;
    TimeDisplay display;
  };
  const Case kCases[] = {
      {"-", k24fps, k24},
      {"1:2:3:4:5", k24fps, k24},
      {"1+2", k24fps, k24},
      {"\xef\xbc\x91", k24fps, k24},  // a full-width digit
      {"00:00:00:9223372036854775808", k24fps, k24},
      {"18446744073709551616:00:00:00", k24fps, k24},
      {"1:2", k24fps, kFrames},
      {"9223372036854775807", k24fps, kFrames},
      {"999999999999999999+00", k24fps, k35mm},
      // No counting rate for a non-zero count.
      {"00:00:01:00", kFrameRate_Invalid, kDrop},
      {"2+03", kFrameRate_Invalid, k35mm},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Read(c.text, c.rate, c.display), kTime_Invalid);
  }
}

TEST(TryTimecodeToTime, TextThatReadsAsTheInvalidTimeIsAValue) {
  constexpr FrameRate kMilli = kFrameRate_Milliseconds;
  EXPECT_EQ(TryTimecodeToTime("-400000000", kMilli, kFrames), kTime_Invalid);
  EXPECT_EQ(TryTimecodeToTime(u"-25000000+00", kMilli, k35mm), kTime_Invalid);
}

TEST(HMSFToTime, FramesCarryWithoutLimit) {
  const FrameRate one = FrameRate::FromFramesPerSecond(1);
  EXPECT_EQ(HMSFToTime(0, 0, 0, UINT64_MAX, false, one, TimeDisplay::CreateCustom(1)),
            TickTime(static_cast<std::int64_t>(UINT64_MAX % 86400), one));
}

// ---- Round trips ----

struct RoundTripCase {
  const char* name;
  FrameRate rate;
  TimeDisplay display;
  // Frames of `rate` per unit of the sweep (48 for milliseconds of 48 kHz).
  std::int64_t framesPerUnit;
};

const RoundTripCase kRoundTrips[] = {
    {"29.97 drop-frame", k2997, kDrop, 1},
    {"29.97 non-drop", k2997, kNonDrop, 1},
    {"59.94 drop-frame", k5994, kDrop5994, 1},
    {"23.976", kFrameRate_Video23_976, k23976, 1},
    {"24", k24fps, k24, 1},
    {"frames at 29.97", k2997, kFrames, 1},
    {"35 mm at 24", k24fps, k35mm, 1},
    {"samples at 48 kHz", kFrameRate_Audio48000, kSamples, 1},
    {"milliseconds", kFrameRate_Milliseconds, kMs, 1},
    // Only whole milliseconds read back; the inclusive end (a sample) does not.
    {"milliseconds of 48 kHz", kFrameRate_Audio48000, kMs, 48},
};

// The last unit of the sweep: just before +24 h, or before the drop-frame
// hours wrap at 24 (a labelled day is 2589408 frames at 29.97, not 2589410.6).
std::int64_t EndUnit(const RoundTripCase& c) {
  std::int64_t end = 24 * kTime_OneHour.GetTicks() / c.rate.GetTicksPerFrame();
  if (c.display == kDrop) end = 24 * 107892;
  if (c.display == kDrop5994) end = 24 * 215784;
  return end / c.framesPerUnit;
}

std::int64_t UnitsPerSecond(const RoundTripCase& c) {
  return kTime_OneSecond.GetTicks() / c.rate.GetTicksPerFrame() / c.framesPerUnit;
}

// Writes every unit in [first, last) by `stride` and reads it back, negative
// times with their sign; stops at the first that does not read back.
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
    // The hour around zero (two minutes of milliseconds, four seconds of samples).
    const std::int64_t around = (perSecond <= 60 ? 1800 : perSecond <= 1000 ? 60 : 2) * perSecond;
    for (Flags extra : {Flags(), Flags(kTimecodeFlag_InclusiveEnd)}) {
      if (extra.IsSet(kTimecodeFlag_InclusiveEnd) && c.framesPerUnit != 1) continue;
      Sweep(c, -around, around, 1, extra);
      Sweep(c, -3600 * perSecond, end, stride, extra);
    }
    Sweep(
        c, -3600 * perSecond, end, stride,
        kTimecodeFlag_TrimLeadingZeros | kTimecodeFlag_KeepMinutes | kTimecodeFlag_ColonSeparators);
    if (c.display.IsDropFrame()) {  // either side of every ten-minute boundary
      const std::int64_t tenMinutes = c.display == kDrop ? 17982 : 35964;
      for (std::int64_t b = -6 * tenMinutes; b < end; b += tenMinutes) {
        Sweep(c, b - 2 * perSecond, std::min(end, b + 70 * perSecond), 1);
      }
    }
  }
}

// Every frame of a day, in the optimized build; samples and milliseconds are
// more than a sweep can visit, so those take a prime stride after the first hour.
TEST(Timecode, EveryFrameOfTheDayRoundTripsExhaustive) {
  for (const RoundTripCase& c : kRoundTrips) {
    SCOPED_TRACE(c.name);
    const std::int64_t perSecond = UnitsPerSecond(c);
    const std::int64_t stride = perSecond >= 1000 ? 401 : 1;
    Sweep(c, -3600 * perSecond, 3600 * perSecond, 1);
    Sweep(c, 3600 * perSecond, EndUnit(c), stride);
    if (c.framesPerUnit == 1) {
      Sweep(c, -3600 * perSecond, EndUnit(c), stride, kTimecodeFlag_InclusiveEnd);
    }
  }
}

}  // namespace
}  // namespace zebmediatypes
