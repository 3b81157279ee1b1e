#include <gtest/gtest.h>
#include <zebcore/json.h>
#include <zebcore/localizer.h>
#include <zebcore/logging.h>
#include <zebmediatypes/time_display.h>

#include <sstream>
#include <vector>

namespace zebmediatypes {
namespace {

std::string Utf8(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

constexpr TimeDisplayType kStandardTypes[] = {
    kTimeDisplay_24Timecode,           kTimeDisplay_25Timecode,
    kTimeDisplay_2997DropTimecode,     kTimeDisplay_2997NonDropTimecode,
    kTimeDisplay_30Timecode,           kTimeDisplay_50Timecode,
    kTimeDisplay_5994DropTimecode,     kTimeDisplay_5994NonDropTimecode,
    kTimeDisplay_60Timecode,           kTimeDisplay_Frames,
    kTimeDisplay_23976Timecode,        kTimeDisplay_16mmFeetFrames,
    kTimeDisplay_35mmFeetFrames,       kTimeDisplay_48Timecode,
    kTimeDisplay_11988Timecode,        kTimeDisplay_14985Timecode,
    kTimeDisplay_AudioSamplesTimecode, kTimeDisplay_AudioMsTimecode,
};

TEST(TimeDisplay, DefaultIsInvalidAtThirty) {
  const TimeDisplay display;
  EXPECT_EQ(display, TimeDisplay(kTimeDisplay_Invalid));
  EXPECT_EQ(display.GetType(), kTimeDisplay_Invalid);
  EXPECT_EQ(display.GetDisplayFramesPerSecond(), 30);
  EXPECT_EQ(display.GetCustomFramesPerSecond(), 30u);
  EXPECT_TRUE(TimeDisplayDescription(display, 0).empty());
  EXPECT_TRUE(TimeDisplayDescription(display, 1).empty());
  EXPECT_EQ(GetFrameRateForTimeDisplay(display, kFrameRate_Video25), kFrameRate_Invalid);
  EXPECT_TRUE(std::is_trivially_copyable_v<TimeDisplay>);
}

TEST(TimeDisplay, DisplaysThatShareACountStillDiffer) {
  EXPECT_NE(TimeDisplay(kTimeDisplay_24Timecode), TimeDisplay::CreateCustom(24));
  EXPECT_NE(TimeDisplay(kTimeDisplay_AudioMsTimecode), TimeDisplay::CreateCustom(1000));
  EXPECT_NE(TimeDisplay(kTimeDisplay_24Timecode), TimeDisplay(kTimeDisplay_23976Timecode));
  EXPECT_EQ(TimeDisplay(kTimeDisplay_24Timecode).GetDisplayFramesPerSecond(),
            TimeDisplay(kTimeDisplay_23976Timecode).GetDisplayFramesPerSecond());
  EXPECT_EQ(TimeDisplay::CreateCustom(12), TimeDisplay::CreateCustom(12));
  EXPECT_EQ(TimeDisplay(104u), TimeDisplay(kTimeDisplay_30Timecode));
}

TEST(TimeDisplay, OrderingIsStrictAndConsistent) {
  std::vector<TimeDisplay> ordered;
  for (TimeDisplayType t : kStandardTypes) {
    if (t != kTimeDisplay_AudioSamplesTimecode && t != kTimeDisplay_AudioMsTimecode) {
      ordered.emplace_back(t);
    }
  }
  // 100..115 by code; the table lists 109..112 in code order too.
  ordered.emplace_back(kTimeDisplay_AudioSamplesTimecode);
  ordered.emplace_back(kTimeDisplay_AudioMsTimecode);
  for (unsigned fps : {1u, 24u, 120u, 1000u, 1001u, 10001u}) {
    ordered.push_back(TimeDisplay::CreateCustom(fps));
  }
  ordered.emplace_back(kTimeDisplay_Invalid);
  for (std::size_t i = 0; i < ordered.size(); ++i) {
    for (std::size_t j = 0; j < ordered.size(); ++j) {
      SCOPED_TRACE(testing::Message() << i << " " << j);
      const TimeDisplay a = ordered[i], b = ordered[j];
      EXPECT_EQ(a == b, i == j);
      EXPECT_EQ(a != b, i != j);
      EXPECT_EQ(a < b, i < j);
      EXPECT_EQ(a <= b, i <= j);
      EXPECT_EQ(a > b, i > j);
      EXPECT_EQ(a >= b, i >= j);
    }
  }
}

TEST(TimeDisplay, CustomCountRules) {
  EXPECT_EQ(TimeDisplay::CreateCustom(0).GetCustomFramesPerSecond(), 30u);
  TimeDisplay display = TimeDisplay::CreateCustom(12);
  display.SetType(kTimeDisplay_25Timecode);
  EXPECT_EQ(display.GetCustomFramesPerSecond(), 30u);
  EXPECT_EQ(display, TimeDisplay(kTimeDisplay_25Timecode));
  display.SetCustomFramesPerSecond(0);  // timecode needs at least one frame a second
  EXPECT_TRUE(display.IsCustom());
  EXPECT_EQ(display.GetCustomFramesPerSecond(), 30u);
  display.SetCustomFramesPerSecond(48);
  EXPECT_EQ(display.GetDisplayFramesPerSecond(), 48);
  EXPECT_EQ(TimeDisplay::Create(kTimeDisplay_CustomFrameRateTimecode, kFrameRate_Video25),
            TimeDisplay(kTimeDisplay_25Timecode));
  EXPECT_EQ(TimeDisplay::Create(kTimeDisplay_CustomFrameRateTimecode, kFrameRate_Video100),
            TimeDisplay::CreateCustom(100));
  EXPECT_EQ(TimeDisplay::Create(kTimeDisplay_Frames, kFrameRate_Video100),
            TimeDisplay(kTimeDisplay_Frames));
}

TEST(TimeDisplay, CustomWithoutCountLogsAWarning) {
  std::vector<zebcore::logging::LogRecord> records;
  auto previous = zebcore::logging::SetLogSink(
      [&records](const zebcore::logging::LogRecord& r) { records.push_back(r); });
  const TimeDisplay display(kTimeDisplay_CustomFrameRateTimecode);
  zebcore::logging::SetLogSink(previous);
  EXPECT_EQ(display.GetCustomFramesPerSecond(), 30u);
  ASSERT_EQ(records.size(), 1u);
  EXPECT_EQ(records[0].message,
            "WARNING: A custom TimeDisplay was created without a frame rate; using default");
  EXPECT_EQ(records[0].source, "TimeDisplay");
  EXPECT_EQ(records[0].function, "zebmediatypes::TimeDisplay::TimeDisplay");
  ASSERT_EQ(records[0].fields.size(), 2u);
  EXPECT_EQ(records[0].fields[0].first, "Default rate");
  EXPECT_EQ(records[0].fields[1].first, "expression");
}

TEST(TimeDisplay, PerDisplayProperties) {
  struct Case {
    TimeDisplayType type;
    std::int64_t fps;
    FrameRate nominal;  // kFrameRate_Invalid: the media rate
    bool drop, dropApplicable, hmsf, audio;
    int framesPerFoot;
  };
  const FrameRate kMedia = FrameRate(12345);
  const Case kCases[] = {
      {kTimeDisplay_24Timecode, 24, kFrameRate_Video24, false, false, true, false, 0},
      {kTimeDisplay_25Timecode, 25, kFrameRate_Video25, false, false, true, false, 0},
      {kTimeDisplay_2997DropTimecode, 30, kFrameRate_Video29_97, true, true, true, false, 0},
      {kTimeDisplay_2997NonDropTimecode, 30, kFrameRate_Video29_97, false, true, true, false, 0},
      {kTimeDisplay_30Timecode, 30, kFrameRate_Video30, false, false, true, false, 0},
      {kTimeDisplay_50Timecode, 50, kFrameRate_Video50, false, false, true, false, 0},
      {kTimeDisplay_5994DropTimecode, 60, kFrameRate_Video59_94, true, true, true, false, 0},
      {kTimeDisplay_5994NonDropTimecode, 60, kFrameRate_Video59_94, false, true, true, false, 0},
      {kTimeDisplay_60Timecode, 60, kFrameRate_Video60, false, false, true, false, 0},
      {kTimeDisplay_Frames, 30, kMedia, false, false, false, false, 0},
      {kTimeDisplay_23976Timecode, 24, kFrameRate_Video23_976, false, false, true, false, 0},
      {kTimeDisplay_16mmFeetFrames, 30, kMedia, false, false, false, false, 40},
      {kTimeDisplay_35mmFeetFrames, 30, kMedia, false, false, false, false, 16},
      {kTimeDisplay_48Timecode, 48, kFrameRate_Video48, false, false, true, false, 0},
      {kTimeDisplay_11988Timecode, 12, kFrameRate_Video11_988, false, false, true, false, 0},
      {kTimeDisplay_14985Timecode, 15, kFrameRate_Video14_985, false, false, true, false, 0},
      {kTimeDisplay_AudioSamplesTimecode, 30, kMedia, false, false, true, true, 0},
      {kTimeDisplay_AudioMsTimecode, 1000, kFrameRate_Milliseconds, false, false, true, true, 0},
      {kTimeDisplay_Invalid, 30, kFrameRate_Invalid, false, false, false, false, 0},
      {TimeDisplayType(150), 30, kFrameRate_Invalid, false, false, true, false, 0},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(static_cast<int>(c.type));
    const TimeDisplay d(c.type);
    EXPECT_EQ(d.GetDisplayFramesPerSecond(), c.fps);
    EXPECT_EQ(GetFrameRateForTimeDisplay(d, kMedia), c.nominal);
    EXPECT_EQ(d.IsDropFrame(), c.drop);
    EXPECT_EQ(IsTimeDisplayDropFrame(d), c.drop);
    EXPECT_EQ(IsDropFrameApplicableForTimeDisplay(d), c.dropApplicable);
    EXPECT_EQ(IsHMSFTimeDisplay(d, false), c.hmsf);
    EXPECT_EQ(IsTimeDisplayFormatAudio(d), c.audio);
    EXPECT_EQ(GetFramesPerFoot(d), c.framesPerFoot);
    EXPECT_EQ(IsFeetFramesDisplay(d), c.framesPerFoot != 0);
    EXPECT_EQ(d.HasFramesPerSecond(), c.nominal != kMedia);
  }
  EXPECT_TRUE(IsHMSFTimeDisplay(TimeDisplay(kTimeDisplay_Frames), true));
  EXPECT_TRUE(IsHMSFTimeDisplay(TimeDisplay::CreateCustom(12), false));
  EXPECT_EQ(GetFrameRateForTimeDisplay(TimeDisplay::CreateCustom(12), kMedia).GetTicksPerFrame(),
            21168000000);
}

TEST(TimeDisplay, DisplayFramesPerSecondFromTheMediaRate) {
  struct Case {
    FrameRate rate;
    std::int64_t fps;
  };
  const Case kCases[] = {
      {kFrameRate_Video29_97, 30},
      {kFrameRate_Video23_976, 24},
      {kFrameRate_Audio48000, 48000},
      {kFrameRate_Invalid, 1},
      {FrameRate(0), 1},
      {FrameRate(-5), 1},
      {FrameRate(254016000000 * 4), 1},  // 0.25 fps rounds to 0, raised to 1
      {FrameRate(1), 254016000000},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.rate.GetTicksPerFrame());
    for (TimeDisplayType t : {kTimeDisplay_Frames, kTimeDisplay_16mmFeetFrames,
                              kTimeDisplay_35mmFeetFrames, kTimeDisplay_AudioSamplesTimecode}) {
      EXPECT_EQ(TimeDisplay(t).GetDisplayFramesPerSecond(c.rate), c.fps);
    }
    EXPECT_EQ(TimeDisplay(kTimeDisplay_25Timecode).GetDisplayFramesPerSecond(c.rate), 25);
  }
}

TEST(TimeDisplay, GetTimeDisplayForFrameRate) {
  struct Case {
    const char* label;
    FrameRate rate;
    bool drop;
    TimeDisplayType fallback;
    bool ms;
    TimeDisplay expected;
  };
  const TimeDisplayType kDF = kTimeDisplay_2997DropTimecode;
  const Case kCases[] = {
      {"29.97 non-drop", kFrameRate_Video29_97, false, kDF, false,
       TimeDisplay(kTimeDisplay_2997NonDropTimecode)},
      {"29.97 drop", kFrameRate_Video29_97, true, kDF, false, TimeDisplay(kDF)},
      {"59.94 drop", kFrameRate_Video59_94, true, kDF, false,
       TimeDisplay(kTimeDisplay_5994DropTimecode)},
      {"25 drop asked", kFrameRate_Video25, true, kDF, false, TimeDisplay(kTimeDisplay_25Timecode)},
      {"11.988", kFrameRate_Video11_988, false, kDF, false,
       TimeDisplay(kTimeDisplay_11988Timecode)},
      {"48", kFrameRate_Video48, false, kDF, false, TimeDisplay(kTimeDisplay_48Timecode)},
      {"48 kHz", kFrameRate_Audio48000, false, kDF, false,
       TimeDisplay(kTimeDisplay_AudioSamplesTimecode)},
      {"8 kHz is not an audio rate here", kFrameRate_Audio8000, false, kDF, false,
       TimeDisplay::CreateCustom(8000)},
      {"ms allowed", kFrameRate_Milliseconds, false, kDF, true,
       TimeDisplay(kTimeDisplay_AudioMsTimecode)},
      {"ms not allowed", kFrameRate_Milliseconds, false, kDF, false,
       TimeDisplay::CreateCustom(1000)},
      {"100", kFrameRate_Video100, false, kDF, false, TimeDisplay::CreateCustom(100)},
      {"119.88", kFrameRate_Video119_88, false, kDF, false, TimeDisplay::CreateCustom(120)},
      {"invalid, fallback 102", kFrameRate_Invalid, false, kDF, false, TimeDisplay(kDF)},
      {"invalid, fallback custom", kFrameRate_Invalid, false, kTimeDisplay_CustomFrameRateTimecode,
       false, TimeDisplay::CreateCustom(1)},
      {"zero ticks", FrameRate(0), false, kDF, false, TimeDisplay::CreateCustom(1)},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.label);
    EXPECT_EQ(GetTimeDisplayForFrameRate(c.rate, c.drop, true, c.fallback, c.ms), c.expected);
    EXPECT_EQ(GetTimeDisplayForFrameRate(c.rate, c.drop, false, c.fallback, c.ms), c.expected);
  }
}

TEST(TimeDisplay, GetDurationTimeDisplay) {
  const TimeDisplay kFrames(kTimeDisplay_Frames);
  const TimeDisplay k35mm(kTimeDisplay_35mmFeetFrames);
  EXPECT_EQ(GetDurationTimeDisplay(kFrameRate_Video25, kFrames, false), kFrames);
  EXPECT_EQ(GetDurationTimeDisplay(kFrameRate_Video25, k35mm, false), k35mm);
  EXPECT_EQ(GetDurationTimeDisplay(kFrameRate_Video25, kFrames, true),
            TimeDisplay(kTimeDisplay_25Timecode));
  EXPECT_EQ(GetDurationTimeDisplay(kFrameRate_Video29_97,
                                   TimeDisplay(kTimeDisplay_AudioSamplesTimecode), false),
            TimeDisplay(kTimeDisplay_2997NonDropTimecode));
  EXPECT_EQ(GetDurationTimeDisplay(kFrameRate_Video29_97,
                                   TimeDisplay(kTimeDisplay_2997DropTimecode), false),
            TimeDisplay(kTimeDisplay_2997DropTimecode));
  EXPECT_EQ(GetDurationTimeDisplay(kFrameRate_Invalid, TimeDisplay(), false),
            TimeDisplay(kTimeDisplay_2997DropTimecode));
}

TEST(TimeDisplay, FrameStringWidth) {
  struct Case {
    TimeDisplay display;
    int width;
  };
  const Case kCases[] = {
      {TimeDisplay(kTimeDisplay_24Timecode), 2},
      {TimeDisplay(kTimeDisplay_25Timecode), 2},
      {TimeDisplay(kTimeDisplay_2997DropTimecode), 2},
      {TimeDisplay(kTimeDisplay_60Timecode), 2},
      {TimeDisplay(kTimeDisplay_11988Timecode), 2},
      {TimeDisplay(kTimeDisplay_AudioMsTimecode), 3},
      {TimeDisplay::CreateCustom(1), 1},
      {TimeDisplay::CreateCustom(2), 1},
      {TimeDisplay::CreateCustom(10), 1},
      {TimeDisplay::CreateCustom(11), 2},
      {TimeDisplay::CreateCustom(100), 2},
      {TimeDisplay::CreateCustom(101), 3},
      {TimeDisplay::CreateCustom(4294967295u), 10},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.display.GetDisplayFramesPerSecond());
    EXPECT_EQ(GetTimeDisplayFrameStringWidth(c.display), c.width);
  }
  for (TimeDisplayType t : kStandardTypes) {
    SCOPED_TRACE(static_cast<int>(t));
    if (t == kTimeDisplay_AudioMsTimecode) continue;
    EXPECT_EQ(GetTimeDisplayFrameStringWidth(TimeDisplay(t)), 2);
  }
  const TimeDisplay kSamples(kTimeDisplay_AudioSamplesTimecode);
  EXPECT_EQ(GetTimeDisplayFrameStringWidth(kSamples, kFrameRate_Audio48000), 5);
  EXPECT_EQ(GetTimeDisplayFrameStringWidth(kSamples, kFrameRate_Invalid), 1);
}

TEST(TimeDisplay, JSONRoundTrip) {
  using zebcore::serialization::JSONConvert;
  std::vector<TimeDisplay> displays;
  for (TimeDisplayType t : kStandardTypes) displays.emplace_back(t);
  displays.emplace_back();
  for (unsigned fps : {1u, 12u, 100u, 1000u, 4294967295u}) {
    displays.push_back(TimeDisplay::CreateCustom(fps));
  }
  for (TimeDisplay d : displays) {
    SCOPED_TRACE(static_cast<int>(d.GetType()));
    const auto parsed = zebcore::serialization::JSONParse(zebcore::serialization::ToJSONText(d));
    ASSERT_TRUE(parsed);
    EXPECT_EQ(JSONConvert<TimeDisplay>::FromJSON(*parsed), d);
  }
  EXPECT_EQ(zebcore::string::ToStdString(
                zebcore::serialization::ToJSONText(TimeDisplay(kTimeDisplay_2997DropTimecode))),
            R"({"type":102})");
  EXPECT_EQ(zebcore::string::ToStdString(
                zebcore::serialization::ToJSONText(TimeDisplay::CreateCustom(12))),
            R"({"fps":12,"type":998})");
}

TEST(TimeDisplay, JSONReadsOlderAndBadForms) {
  using zebcore::serialization::JSONConvert;
  auto read = [](const char* text) {
    const auto parsed = zebcore::serialization::JSONParse(zebcore::string::ToUTF8String(text));
    if (!parsed) throw std::runtime_error("unparsed test input");
    return JSONConvert<TimeDisplay>::FromJSON(*parsed);
  };
  struct Case {
    const char* text;
    TimeDisplay expected;
  };
  const Case kCases[] = {
      {"104", TimeDisplay(kTimeDisplay_30Timecode)},
      {R"({"type":998})", TimeDisplay::CreateCustom(30)},
      {R"({"type":998,"fps":0})", TimeDisplay::CreateCustom(30)},
      {R"({"type":998,"fps":-1})", TimeDisplay::CreateCustom(30)},
      {R"({"type":998,"fps":4294967296})", TimeDisplay::CreateCustom(30)},
      {R"({"type":101,"fps":12})", TimeDisplay(kTimeDisplay_25Timecode)},
      {R"({"type":4294967396})", TimeDisplay()},
      {R"("102")", TimeDisplay()},
      {"[102]", TimeDisplay()},
      {"true", TimeDisplay()},
      {"1.5", TimeDisplay()},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(read(c.text), c.expected);
  }
  EXPECT_EQ(read("{}").GetType(), TimeDisplayType(0));
  for (const char* bad :
       {R"({"type":"102"})", R"({"type":102,"fps":"12"})", R"({"type":1.5})", R"({"type":null})"}) {
    SCOPED_TRACE(bad);
    EXPECT_THROW(read(bad), boost::bad_any_cast);
  }
}

TEST(TimeDisplay, TextForms) {
  std::ostringstream narrow;
  narrow << TimeDisplay(kTimeDisplay_2997DropTimecode);
  EXPECT_EQ(narrow.str(), "102.00");
  zebcore::string::oUTF16StringStream wide;
  wide << TimeDisplay::CreateCustom(12);
  EXPECT_EQ(Utf8(wide.str()), "998.00");
}

TEST(TimeDisplay, Descriptions) {
  struct Case {
    TimeDisplay display;
    const char* plain;
    const char* localized;
  };
  const Case kCases[] = {
      {TimeDisplay(kTimeDisplay_2997DropTimecode), "29.97 fps Drop-Frame",
       "29.97 fps Drop-Frame Timecode"},
      {TimeDisplay(kTimeDisplay_24Timecode), "24 fps", "24 fps Timecode"},
      {TimeDisplay(kTimeDisplay_35mmFeetFrames), "Feet + Frames 35 mm", "Feet + Frames 35 mm"},
      {TimeDisplay(kTimeDisplay_AudioMsTimecode), "Milliseconds", "Milliseconds"},
      {TimeDisplay::CreateCustom(12), "Custom fps", "12 fps Timecode"},
      {TimeDisplay(kTimeDisplay_Invalid), "", ""},
      {TimeDisplay(116u), "", ""},
      {TimeDisplay(1000u), "", ""},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.plain);
    EXPECT_EQ(Utf8(TimeDisplayDescription(c.display, 0)), c.plain);
    EXPECT_EQ(Utf8(TimeDisplayDescription(c.display, 2)), c.plain);
    EXPECT_EQ(Utf8(TimeDisplayDescription(c.display, 1)), c.localized);
  }
  for (TimeDisplayType t : kStandardTypes) {
    SCOPED_TRACE(static_cast<int>(t));
    EXPECT_FALSE(TimeDisplayDescription(TimeDisplay(t), 0).empty());
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

TEST(FrameRate, Descriptions) {
  struct Case {
    FrameRate rate;
    const char* text;
  };
  const Case kCases[] = {
      {kFrameRate_Video29_97, "29.97fps"}, {kFrameRate_Video23_976, "23.976fps"},
      {kFrameRate_Video25, "25fps"},       {kFrameRate_Audio8000, "8000Hz"},
      {kFrameRate_Audio48000, "48000Hz"},  {FrameRate(31752001), "8000fps"},
      {kFrameRate_Invalid, "0fps"},        {FrameRate(0), "0fps"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Utf8(FrameRateDescription(c.rate)), c.text);
  }
}

}  // namespace
}  // namespace zebmediatypes
