#include "commands/time_commands.h"

#include <gtest/gtest.h>
#include <zebcore/console.h>
#include <zebcore/stream.h>

#include <string>
#include <string_view>

namespace zebmediatypes::Commands {
namespace {

std::string Narrow(const zebcore::UTF16String& text) {
  std::string out;
  for (char16_t c : text) out += c < 0x80 ? static_cast<char>(c) : '?';
  return out;
}

zebcore::UTF16String Wide(std::string_view text) {
  zebcore::UTF16String out;
  for (char c : text) out += static_cast<char16_t>(static_cast<unsigned char>(c));
  return out;
}

// The commands registered for the length of a test.
class TimeCommandsTest : public ::testing::Test {
 protected:
  void SetUp() override { RegisterTimeCommands(); }
  void TearDown() override { UnregisterTimeCommands(); }

  static std::string Run(const char16_t* name, std::string_view arguments) {
    zebcore::string::oUTF16StringStream out;
    EXPECT_TRUE(zebcore::console::CommandRegistry::Get().Execute(name, Wide(arguments), out));
    return Narrow(out.str());
  }
};

struct Case {
  const char* arguments;
  const char* line;
};

TEST_F(TimeCommandsTest, RegistersBothCommandsWithTheirHelpAndUnregistersThem) {
  auto& registry = zebcore::console::CommandRegistry::Get();
  ASSERT_TRUE(registry.HasCommand(TimeToTimecode::kName));
  ASSERT_TRUE(registry.HasCommand(TimecodeToTime::kName));
  int found = 0;
  for (const auto& entry : registry.Commands()) {
    if (entry.name == TimeToTimecode::kName) {
      ++found;
      EXPECT_EQ(Narrow(entry.help),
                "zebmediatypes.TimeToTimecode [-s] <time> <source_fps> <display_fps> [-d]- This "
                "command will convert a time in frames to a timecode and print it. Time will be "
                "interpreted as seconds if -s is specified before the time. Time display will use "
                "drop frame if -d is specified after display_fps");
    } else if (entry.name == TimecodeToTime::kName) {
      ++found;
      EXPECT_EQ(Narrow(entry.help),
                "zebmediatypes.TimecodeToTime <timecode> <source_fps> <display_fps> [-d]- This "
                "command will convert a timecode string to a time in seconds and frames and print "
                "it. <timecode> should be in HH:MM:SS:FF format. Time display will use drop frame "
                "if -d is specified after display_fps");
    }
  }
  EXPECT_EQ(found, 2);
  UnregisterTimeCommands();
  EXPECT_FALSE(registry.HasCommand(TimeToTimecode::kName));
  EXPECT_FALSE(registry.HasCommand(TimecodeToTime::kName));
  RegisterTimeCommands();  // for TearDown
}

TEST_F(TimeCommandsTest, TimeToTimecodePrintsOneLine) {
  constexpr Case kCases[] = {
      {"30 29.97 29.97 -d",
       "Timecode at time 30 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps "
       "is: 00;00;01;00\n"},
      {"1800 29.97 29.97 -d",
       "Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps "
       "is: 00;01;00;02\n"},
      {"1800 29.97 29.97",
       "Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Non-Drop-Frame Timecode "
       "fps is: 00:01:00:00\n"},
      {"-s 1 25 25",
       "Timecode at time 1 in a 25 fps clip, displayed at 25 fps Timecode fps is: 00:00:01:00\n"},
      {"-S 1 25 25",
       "Timecode at time 1 in a 25 fps clip, displayed at 25 fps Timecode fps is: 00:00:01:00\n"},
      {"   1800   29.97  29.97   -D  ",
       "Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps "
       "is: 00;01;00;02\n"},
      {"48 23.976 25",
       "Timecode at time 48 in a 23.976 fps clip, displayed at 25 fps Timecode fps is: "
       "00:00:01:23\n"},
      {"1.9 25 25",  // frames are truncated
       "Timecode at time 1.9 in a 25 fps clip, displayed at 25 fps Timecode fps is: "
       "00:00:00:01\n"},
      {"30 0 0",
       "Timecode at time 30 in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: "
       "00;00;00;00\n"},
      {"",
       "Timecode at time  in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: "
       "00;00;00;00\n"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.arguments);
    EXPECT_EQ(Run(TimeToTimecode::kName, c.arguments), c.line);
  }
}

TEST_F(TimeCommandsTest, SecondsAreSnappedToTheNearestSourceFrame) {
  constexpr Case kCases[] = {
      {"-s 8.03 25 25",
       "Timecode at time 8.03 in a 25 fps clip, displayed at 25 fps Timecode fps is: "
       "00:00:08:01\n"},
      {"-s 1 23.98 23.98",
       "Timecode at time 1 in a 23.976 fps clip, displayed at 23.976 fps Timecode fps is: "
       "00:00:01:00\n"},
      {"-s 60.06 29.97 29.97 -d",
       "Timecode at time 60.06 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode "
       "fps is: 00;01;00;02\n"},
      {"-s 1 0 25",
       "Timecode at time 1 in a 0 fps clip, displayed at 25 fps Timecode fps is: 00:00:00:00\n"},
      {"-s abc 25 25",
       "Timecode at time abc in a 25 fps clip, displayed at 25 fps Timecode fps is: "
       "00:00:00:00\n"},
      // Beyond the time scale's +-100 hours the time is clamped (and hours wrap).
      {"-s 1e300 25 25",
       "Timecode at time 1e300 in a 25 fps clip, displayed at 25 fps Timecode fps is: "
       "04:00:00:00\n"},
      {"1e300 25 25",
       "Timecode at time 1e300 in a 25 fps clip, displayed at 25 fps Timecode fps is: "
       "04:00:00:00\n"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.arguments);
    EXPECT_EQ(Run(TimeToTimecode::kName, c.arguments), c.line);
  }
}

TEST_F(TimeCommandsTest, TimecodeToTimePrintsOneLine) {
  constexpr Case kCases[] = {
      {"00:00:01:00 25 25",
       "00:00:01:00 in a 25 fps clip, displayed at 25 fps Timecode fps is: 1 seconds (25 "
       "frames)\n"},
      {"00;01;00;02 29.97 29.97 -d",
       "00;01;00;02 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 60.06 "
       "seconds (1800 frames)\n"},
      {"1:2:3:4:5 25 25",
       "1:2:3:4:5 in a 25 fps clip, displayed at 25 fps Timecode fps is: INVALID\n"},
      // No source rate: a non-zero timecode has no time.
      {"00:00:01:00 0 0",
       "00:00:01:00 in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: "
       "INVALID\n"},
      {"-00:00:01:00 25 25",
       "-00:00:01:00 in a 25 fps clip, displayed at 25 fps Timecode fps is: -1 seconds (-25 "
       "frames)\n"},
      {"",
       " in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 0 seconds (0 "
       "frames)\n"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.arguments);
    EXPECT_EQ(Run(TimecodeToTime::kName, c.arguments), c.line);
  }
}

}  // namespace
}  // namespace zebmediatypes::Commands
