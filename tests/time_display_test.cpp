#include <gtest/gtest.h>
#include <zebcore/json.h>
#include <zebcore/localizer.h>
#include <zebcore/logging.h>
#include <zebmediatypes/time_display.h>

#include <stdexcept>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

namespace zebmediatypes {
namespace {

std::string Utf8(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

// Every standard display in type-code order, then custom ones and the default.
std::vector<TimeDisplay> AllDisplays() {
  std::vector<TimeDisplay> displays;
  for (int code = kTimeDisplay_24Timecode; code <= kTimeDisplay_14985Timecode; ++code) {
    displays.emplace_back(TimeDisplayType(code));
  }
  displays.emplace_back(kTimeDisplay_AudioSamplesTimecode);
  displays.emplace_back(kTimeDisplay_AudioMsTimecode);
  for (unsigned fps : {1u, 24u, 1000u, 4294967295u}) {
    displays.push_back(TimeDisplay::CreateCustom(fps));
  }
  displays.emplace_back();
  return displays;
}

TimeDisplay ReadJSON(const std::string& text) {
  const auto parsed = zebcore::serialization::JSONParse(zebcore::string::ToUTF8String(text));
  if (!parsed) throw std::runtime_error(text);
  return zebcore::serialization::JSONConvert<TimeDisplay>::FromJSON(*parsed);
}

TEST(TimeDisplay, EveryDisplayOrdersStrictlyRoundTripsAndHasConsistentProperties) {
  // Displays that share a count (24 and 23.976, a custom 24 and 24 timecode, a
  // custom 1000 and milliseconds) still differ.
  const std::vector<TimeDisplay> all = AllDisplays();
  const FrameRate kMedia(12345);
  for (std::size_t i = 0; i < all.size(); ++i) {
    const TimeDisplay d = all[i];
    SCOPED_TRACE(d.GetType());
    for (std::size_t j = 0; j < all.size(); ++j) {
      EXPECT_EQ(std::make_tuple(d == all[j], d < all[j]), std::make_tuple(i == j, i < j)) << j;
    }
    EXPECT_EQ(ReadJSON(zebcore::string::ToStdString(zebcore::serialization::ToJSONText(d))), d);
    EXPECT_EQ(d.HasFramesPerSecond(), GetFrameRateForTimeDisplay(d, kMedia) != kMedia);
    EXPECT_EQ(IsFeetFramesDisplay(d), GetFramesPerFoot(d) != 0);
    EXPECT_LE(IsTimeDisplayDropFrame(d), IsDropFrameApplicableForTimeDisplay(d));
    EXPECT_EQ(TimeDisplayDescription(d, 0).empty(), d == TimeDisplay());
  }
}

TEST(TimeDisplay, AMissingCustomCountIsThirtyAndLogsAWarning) {
  std::vector<std::string> logged;
  auto previous = zebcore::logging::SetLogSink(
      [&logged](const zebcore::logging::LogRecord& r) { logged.push_back(r.message); });
  TimeDisplay display(kTimeDisplay_CustomFrameRateTimecode);
  zebcore::logging::SetLogSink(previous);
  EXPECT_EQ(logged,
            std::vector<std::string>{
                "WARNING: A custom TimeDisplay was created without a frame rate; using default"});
  EXPECT_EQ(display, TimeDisplay::CreateCustom(30));
}

TEST(TimeDisplay, FrameStringWidthIsTheDigitsOfTheLastFrame) {
  for (unsigned fps : {1u, 10u, 11u, 101u, 1000u, 4294967295u}) {
    const auto digits = static_cast<int>(std::to_string(fps > 1 ? fps - 1 : 1).size());
    EXPECT_EQ(GetTimeDisplayFrameStringWidth(TimeDisplay::CreateCustom(fps)), digits) << fps;
  }
  // Counted at the media rate.
  const TimeDisplay kSamples(kTimeDisplay_AudioSamplesTimecode);
  EXPECT_EQ(GetTimeDisplayFrameStringWidth(kSamples, kFrameRate_Audio48000), 5);
}

TEST(TimeDisplay, DisplayForARate) {
  const TimeDisplay kDrop(kTimeDisplay_2997DropTimecode);
  // 8 kHz is no audio rate here; no rate falls back to the given type.
  const std::pair<FrameRate, TimeDisplay> kCases[] = {
      {kFrameRate_Video29_97, TimeDisplay(kTimeDisplay_2997NonDropTimecode)},
      {kFrameRate_Audio8000, TimeDisplay::CreateCustom(8000)},
      {kFrameRate_Invalid, kDrop},
  };
  for (const auto& [rate, expected] : kCases) {
    EXPECT_EQ(GetTimeDisplayForFrameRate(rate, false, false, kDrop.GetType(), false), expected)
        << rate.GetTicksPerFrame();
  }
}

TEST(TimeDisplay, JSONFormsOlderAndBad) {
  EXPECT_EQ(zebcore::string::ToStdString(
                zebcore::serialization::ToJSONText(TimeDisplay::CreateCustom(12))),
            R"({"fps":12,"type":998})");
  // An out-of-range count is the default count; a string is no display.
  const std::pair<const char*, TimeDisplay> kCases[] = {
      {R"({"type":998,"fps":4294967296})", TimeDisplay::CreateCustom(30)},
      {R"("102")", TimeDisplay()},
  };
  for (const auto& [text, expected] : kCases) EXPECT_EQ(ReadJSON(text), expected) << text;
  for (const char* bad : {R"({"type":"102"})", R"({"type":102,"fps":"12"})"}) {
    EXPECT_THROW(ReadJSON(bad), boost::bad_any_cast) << bad;
  }
}

TEST(TimeDisplay, DescriptionsUseInstalledTranslations) {
  const TimeDisplay kCustom = TimeDisplay::CreateCustom(12);
  EXPECT_EQ(Utf8(FrameRateDescription(FrameRate(31752001))), "8000fps");  // no audio rate
  auto& localizer = zebcore::config::Localizer::Get();
  localizer.InstallTranslations({{"$$$/zebmediatypes/TimeDisplay/Custom", u"@0 i/s"},
                                 {"$$$/zebmediatypes/FrameRateFormat/Audio", u"@0 Hz"}});
  EXPECT_EQ(Utf8(TimeDisplayDescription(kCustom, 1)), "12 i/s");
  EXPECT_EQ(Utf8(FrameRateDescription(kFrameRate_Audio48000)), "48000 Hz");
  localizer.ClearTranslations();
}

}  // namespace
}  // namespace zebmediatypes
