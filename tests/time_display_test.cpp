#include <gtest/gtest.h>
#include <zebcore/json.h>
#include <zebcore/localizer.h>
#include <zebcore/logging.h>
#include <zebmediatypes/time_display.h>

#include <sstream>
#include <tuple>
#include <utility>
#include <vector>

namespace zebmediatypes {
namespace {

std::string Utf8(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

// Every standard display, in type-code order.
// clang-format off
constexpr TimeDisplayType kStandardTypes[] = {
    kTimeDisplay_24Timecode, kTimeDisplay_25Timecode, kTimeDisplay_2997DropTimecode, kTimeDisplay_2997NonDropTimecode,
    kTimeDisplay_30Timecode, kTimeDisplay_50Timecode, kTimeDisplay_5994DropTimecode, kTimeDisplay_5994NonDropTimecode,
    kTimeDisplay_60Timecode, kTimeDisplay_Frames, kTimeDisplay_23976Timecode, kTimeDisplay_16mmFeetFrames,
    kTimeDisplay_35mmFeetFrames, kTimeDisplay_48Timecode, kTimeDisplay_11988Timecode, kTimeDisplay_14985Timecode,
    kTimeDisplay_AudioSamplesTimecode, kTimeDisplay_AudioMsTimecode};
// clang-format on

TimeDisplay ReadJSON(const char* text) {
  const auto parsed = zebcore::serialization::JSONParse(zebcore::string::ToUTF8String(text));
  if (!parsed) throw std::runtime_error(text);
  return zebcore::serialization::JSONConvert<TimeDisplay>::FromJSON(*parsed);
}

TEST(TimeDisplay, OrderingIsStrictAndConsistent) {
  // Displays that share a count (24 and 23.976, a custom 24 and 24 timecode, a
  // custom 1000 and milliseconds) still differ.
  std::vector<TimeDisplay> ordered(std::begin(kStandardTypes), std::end(kStandardTypes));
  for (unsigned fps : {1u, 24u, 1000u, 1001u}) ordered.push_back(TimeDisplay::CreateCustom(fps));
  ordered.emplace_back(kTimeDisplay_Invalid);
  for (std::size_t i = 0; i < ordered.size(); ++i) {
    for (std::size_t j = 0; j < ordered.size(); ++j) {
      const TimeDisplay a = ordered[i], b = ordered[j];
      EXPECT_EQ(std::make_tuple(a == b, a < b, a <= b), std::make_tuple(i == j, i < j, i <= j))
          << i << " " << j;
    }
  }
}

TEST(TimeDisplay, CustomCountIsAtLeastOneAndAMissingCountLogsAWarning) {
  std::vector<std::string> logged;
  auto previous = zebcore::logging::SetLogSink(
      [&logged](const zebcore::logging::LogRecord& r) { logged.push_back(r.message); });
  TimeDisplay display(kTimeDisplay_CustomFrameRateTimecode);
  zebcore::logging::SetLogSink(previous);
  EXPECT_EQ(logged,
            std::vector<std::string>{
                "WARNING: A custom TimeDisplay was created without a frame rate; using default"});
  EXPECT_EQ(display, TimeDisplay::CreateCustom(30));
  display = TimeDisplay::CreateCustom(12);
  display.SetType(kTimeDisplay_25Timecode);
  EXPECT_EQ(display.GetCustomFramesPerSecond(), 30u);
  display.SetCustomFramesPerSecond(0);
  EXPECT_EQ(display, TimeDisplay::CreateCustom(30));
  EXPECT_EQ(TimeDisplay::CreateCustom(0), TimeDisplay::CreateCustom(30));
  EXPECT_EQ(TimeDisplay::Create(kTimeDisplay_CustomFrameRateTimecode, kFrameRate_Video25),
            TimeDisplay(kTimeDisplay_25Timecode));
  EXPECT_EQ(TimeDisplay::Create(kTimeDisplay_CustomFrameRateTimecode, kFrameRate_Video100),
            TimeDisplay::CreateCustom(100));
}

TEST(TimeDisplay, PerDisplayProperties) {
  const FrameRate kMedia = FrameRate(12345), kNone = kFrameRate_Invalid;
  // display fps, nominal rate, drop, drop applicable, hmsf, audio, frames per foot, frame width.
  // The other fixed-rate displays take the path of 25; their counts show in the timecode tests.
  using Props = std::tuple<std::int64_t, FrameRate, bool, bool, bool, bool, int, int>;
  // clang-format off
  const std::pair<TimeDisplayType, Props> kCases[] = {
      {kTimeDisplay_25Timecode, {25, kFrameRate_Video25, false, false, true, false, 0, 2}},
      {kTimeDisplay_2997DropTimecode, {30, kFrameRate_Video29_97, true, true, true, false, 0, 2}},
      {kTimeDisplay_2997NonDropTimecode, {30, kFrameRate_Video29_97, false, true, true, false, 0, 2}},
      {kTimeDisplay_5994DropTimecode, {60, kFrameRate_Video59_94, true, true, true, false, 0, 2}},
      {kTimeDisplay_5994NonDropTimecode, {60, kFrameRate_Video59_94, false, true, true, false, 0, 2}},
      {kTimeDisplay_Frames, {30, kMedia, false, false, false, false, 0, 2}},
      {kTimeDisplay_16mmFeetFrames, {30, kMedia, false, false, false, false, 40, 2}},
      {kTimeDisplay_35mmFeetFrames, {30, kMedia, false, false, false, false, 16, 2}},
      {kTimeDisplay_11988Timecode, {12, kFrameRate_Video11_988, false, false, true, false, 0, 2}},
      {kTimeDisplay_14985Timecode, {15, kFrameRate_Video14_985, false, false, true, false, 0, 2}},
      {kTimeDisplay_AudioSamplesTimecode, {30, kMedia, false, false, true, true, 0, 2}},
      {kTimeDisplay_AudioMsTimecode, {1000, kFrameRate_Milliseconds, false, false, true, true, 0, 3}},
      {kTimeDisplay_Invalid, {30, kNone, false, false, false, false, 0, 2}},
      {TimeDisplayType(150), {30, kNone, false, false, true, false, 0, 2}},
  };
  // clang-format on
  for (const auto& [type, props] : kCases) {
    const TimeDisplay d(type);
    const FrameRate nominal = GetFrameRateForTimeDisplay(d, kMedia);
    const Props actual(d.GetDisplayFramesPerSecond(), nominal, IsTimeDisplayDropFrame(d),
                       IsDropFrameApplicableForTimeDisplay(d), IsHMSFTimeDisplay(d, false),
                       IsTimeDisplayFormatAudio(d), GetFramesPerFoot(d),
                       GetTimeDisplayFrameStringWidth(d));
    EXPECT_EQ(actual, props) << type;
    EXPECT_EQ(IsFeetFramesDisplay(d), GetFramesPerFoot(d) != 0) << type;
    EXPECT_EQ(d.HasFramesPerSecond(), nominal != kMedia) << type;
  }
  EXPECT_TRUE(IsHMSFTimeDisplay(TimeDisplay(kTimeDisplay_Frames), true));
  EXPECT_TRUE(IsHMSFTimeDisplay(TimeDisplay::CreateCustom(12), false));
  EXPECT_EQ(GetFrameRateForTimeDisplay(TimeDisplay::CreateCustom(12), kMedia),
            FrameRate(21168000000));
}

TEST(TimeDisplay, FrameStringWidthIsTheDigitsOfTheLastFrame) {
  // clang-format off
  const std::pair<unsigned, int> kCustom[] = {{1, 1}, {2, 1}, {10, 1}, {11, 2}, {100, 2}, {101, 3}, {4294967295u, 10}};
  // clang-format on
  for (const auto& [fps, width] : kCustom) {
    EXPECT_EQ(GetTimeDisplayFrameStringWidth(TimeDisplay::CreateCustom(fps)), width) << fps;
  }
  const TimeDisplay kSamples(kTimeDisplay_AudioSamplesTimecode);
  EXPECT_EQ(GetTimeDisplayFrameStringWidth(kSamples, kFrameRate_Audio48000), 5);
  EXPECT_EQ(GetTimeDisplayFrameStringWidth(kSamples, kFrameRate_Invalid), 1);
}

TEST(TimeDisplay, DisplayFramesPerSecondFromTheMediaRateIsAtLeastOne) {
  // 0.25 fps rounds to 0 and is raised to 1; no rate counts as 0 fps.
  // clang-format off
  const std::pair<FrameRate, std::int64_t> kCases[] = {
      {kFrameRate_Video29_97, 30}, {kFrameRate_Video23_976, 24}, {kFrameRate_Audio48000, 48000}, {FrameRate(1), 254016000000},
      {kFrameRate_Invalid, 1}, {FrameRate(0), 1}, {FrameRate(-5), 1}, {FrameRate(254016000000 * 4), 1}};
  // clang-format on
  for (const auto& [rate, fps] : kCases) {
    for (TimeDisplayType t : {kTimeDisplay_Frames, kTimeDisplay_16mmFeetFrames,
                              kTimeDisplay_35mmFeetFrames, kTimeDisplay_AudioSamplesTimecode}) {
      EXPECT_EQ(TimeDisplay(t).GetDisplayFramesPerSecond(rate), fps) << rate.GetTicksPerFrame();
    }
    EXPECT_EQ(TimeDisplay(kTimeDisplay_25Timecode).GetDisplayFramesPerSecond(rate), 25);
  }
}

TEST(TimeDisplay, DisplayForARate) {
  const TimeDisplay kDrop(kTimeDisplay_2997DropTimecode), kFrames(kTimeDisplay_Frames);
  const TimeDisplay k35mm(kTimeDisplay_35mmFeetFrames), kCustom1 = TimeDisplay::CreateCustom(1);
  // 8 kHz is no audio rate here; no rate falls back to the given type.
  // clang-format off
  const std::tuple<FrameRate, bool, bool, TimeDisplay> kCases[] = {
      {kFrameRate_Video29_97, false, false, TimeDisplay(kTimeDisplay_2997NonDropTimecode)}, {kFrameRate_Video59_94, true, false, TimeDisplay(kTimeDisplay_5994DropTimecode)},
      {kFrameRate_Video25, true, false, TimeDisplay(kTimeDisplay_25Timecode)}, {kFrameRate_Video11_988, false, false, TimeDisplay(kTimeDisplay_11988Timecode)},
      {kFrameRate_Audio48000, false, false, TimeDisplay(kTimeDisplay_AudioSamplesTimecode)}, {kFrameRate_Audio8000, false, false, TimeDisplay::CreateCustom(8000)},
      {kFrameRate_Milliseconds, false, true, TimeDisplay(kTimeDisplay_AudioMsTimecode)}, {kFrameRate_Milliseconds, false, false, TimeDisplay::CreateCustom(1000)},
      {kFrameRate_Video119_88, false, false, TimeDisplay::CreateCustom(120)}, {kFrameRate_Invalid, false, false, kDrop}, {FrameRate(0), false, false, kCustom1},
  };
  // clang-format on
  for (const auto& [rate, drop, ms, expected] : kCases) {
    EXPECT_EQ(GetTimeDisplayForFrameRate(rate, drop, false, kDrop.GetType(), ms), expected)
        << rate.GetTicksPerFrame() << " " << drop << ms;
  }
  EXPECT_EQ(GetTimeDisplayForFrameRate(kFrameRate_Invalid, false, false,
                                       kTimeDisplay_CustomFrameRateTimecode, false),
            kCustom1);
  // For durations: frames and feet+frames stay unless timecode is forced.
  // clang-format off
  const std::tuple<FrameRate, TimeDisplay, bool, TimeDisplay> kDurations[] = {
      {kFrameRate_Video25, kFrames, false, kFrames}, {kFrameRate_Video25, k35mm, false, k35mm}, {kFrameRate_Video25, kFrames, true, TimeDisplay(kTimeDisplay_25Timecode)},
      {kFrameRate_Video29_97, TimeDisplay(kTimeDisplay_AudioSamplesTimecode), false, TimeDisplay(kTimeDisplay_2997NonDropTimecode)},
      {kFrameRate_Video29_97, kDrop, false, kDrop}, {kFrameRate_Invalid, TimeDisplay(), false, kDrop}};
  // clang-format on
  for (const auto& [rate, display, force, expected] : kDurations) {
    EXPECT_EQ(GetDurationTimeDisplay(rate, display, force), expected) << rate.GetTicksPerFrame();
  }
}

TEST(TimeDisplay, JSONRoundTripAndOlderAndBadForms) {
  std::vector<TimeDisplay> displays(std::begin(kStandardTypes), std::end(kStandardTypes));
  displays.emplace_back();
  for (unsigned fps : {1u, 12u, 4294967295u}) displays.push_back(TimeDisplay::CreateCustom(fps));
  for (TimeDisplay d : displays) {
    EXPECT_EQ(ReadJSON(zebcore::string::ToStdString(zebcore::serialization::ToJSONText(d)).c_str()),
              d)
        << d.GetType();
  }
  EXPECT_EQ(zebcore::string::ToStdString(
                zebcore::serialization::ToJSONText(TimeDisplay::CreateCustom(12))),
            R"({"fps":12,"type":998})");
  const TimeDisplay kCustom30 = TimeDisplay::CreateCustom(30), kNone;
  // A bare type code is the older form; an out-of-range count is the default.
  // clang-format off
  const std::pair<const char*, TimeDisplay> kCases[] = {
      {"104", TimeDisplay(kTimeDisplay_30Timecode)}, {R"({"type":101,"fps":12})", TimeDisplay(kTimeDisplay_25Timecode)},
      {R"({"type":998})", kCustom30}, {R"({"type":998,"fps":0})", kCustom30}, {R"({"type":998,"fps":-1})", kCustom30},
      {R"({"type":998,"fps":4294967296})", kCustom30}, {R"({"type":4294967396})", kNone},
      {R"("102")", kNone}, {"[102]", kNone}, {"true", kNone}, {"1.5", kNone}};
  // clang-format on
  for (const auto& [text, expected] : kCases) EXPECT_EQ(ReadJSON(text), expected) << text;
  EXPECT_EQ(ReadJSON("{}").GetType(), TimeDisplayType(0));
  for (const char* bad :
       {R"({"type":"102"})", R"({"type":102,"fps":"12"})", R"({"type":1.5})", R"({"type":null})"}) {
    EXPECT_THROW(ReadJSON(bad), boost::bad_any_cast) << bad;
  }
}

TEST(TimeDisplay, TextFormsAndDescriptions) {
  std::ostringstream narrow;
  narrow << TimeDisplay(kTimeDisplay_2997DropTimecode);
  zebcore::string::oUTF16StringStream wide;
  wide << TimeDisplay::CreateCustom(12);
  EXPECT_EQ(narrow.str() + " " + Utf8(wide.str()), "102.00 998.00");
  // clang-format off
  const std::tuple<TimeDisplay, const char*, const char*> kCases[] = {
      {TimeDisplay(kTimeDisplay_2997DropTimecode), "29.97 fps Drop-Frame", "29.97 fps Drop-Frame Timecode"},
      {TimeDisplay(kTimeDisplay_35mmFeetFrames), "Feet + Frames 35 mm", "Feet + Frames 35 mm"}, {TimeDisplay::CreateCustom(12), "Custom fps", "12 fps Timecode"},
      {TimeDisplay(kTimeDisplay_Invalid), "", ""}, {TimeDisplay(116u), "", ""}};
  // clang-format on
  for (const auto& [display, plain, localized] : kCases) {  // forms 0 and 2 are the plain one
    EXPECT_EQ(Utf8(TimeDisplayDescription(display, 0)), plain);
    EXPECT_EQ(Utf8(TimeDisplayDescription(display, 2)), plain);
    EXPECT_EQ(Utf8(TimeDisplayDescription(display, 1)), localized);
  }
  for (TimeDisplayType t : kStandardTypes) {
    EXPECT_FALSE(TimeDisplayDescription(TimeDisplay(t), 0).empty()) << t;
  }
}

TEST(TimeDisplay, DescriptionsUseInstalledTranslations) {
  auto& localizer = zebcore::config::Localizer::Get();
  localizer.InstallTranslations({{"$$$/zebmediatypes/TimeDisplay/Custom", u"@0 i/s"},
                                 {"$$$/zebmediatypes/FrameRateFormat/Audio", u"@0 Hz"}});
  EXPECT_EQ(Utf8(TimeDisplayDescription(TimeDisplay::CreateCustom(12), 1)), "12 i/s");
  EXPECT_EQ(Utf8(FrameRateDescription(kFrameRate_Audio48000)), "48000 Hz");
  localizer.ClearTranslations();
}

TEST(FrameRate, DescriptionsCountSamplesOnlyAtAudioRates) {
  // clang-format off
  const std::pair<FrameRate, const char*> kCases[] = {
      {kFrameRate_Video29_97, "29.97fps"}, {kFrameRate_Video23_976, "23.976fps"}, {kFrameRate_Video25, "25fps"},
      {kFrameRate_Audio8000, "8000Hz"}, {kFrameRate_Audio48000, "48000Hz"}, {FrameRate(31752001), "8000fps"},
      {kFrameRate_Invalid, "0fps"}, {FrameRate(0), "0fps"}};
  // clang-format on
  for (const auto& [rate, text] : kCases) EXPECT_EQ(Utf8(FrameRateDescription(rate)), text);
}

}  // namespace
}  // namespace zebmediatypes
