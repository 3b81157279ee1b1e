#include "commands/time_commands.h"

#include <gtest/gtest.h>
#include <zebcore/console.h>
#include <zebcore/stream.h>

#include <cstddef>
#include <string>

namespace zebmediatypes::Commands {
namespace {

struct Case {
  const char* arguments;
  const char* line;
};

// The commands registered for the length of a test.
class TimeCommandsTest : public ::testing::Test {
 protected:
  void SetUp() override { RegisterTimeCommands(); }
  void TearDown() override { UnregisterTimeCommands(); }

  template <std::size_t N>
  static void ExpectLines(const char16_t* name, const Case (&cases)[N]) {
    for (const Case& c : cases) {
      SCOPED_TRACE(c.arguments);
      const std::string arguments(c.arguments);
      zebcore::string::oUTF16StringStream out;
      EXPECT_TRUE(zebcore::console::CommandRegistry::Get().Execute(
          name, zebcore::UTF16String(arguments.begin(), arguments.end()), out));
      const zebcore::UTF16String line = out.str();
      EXPECT_EQ(std::string(line.begin(), line.end()), c.line);
    }
  }
};

TEST_F(TimeCommandsTest, RegisterAndUnregisterBothCommands) {
  auto& registry = zebcore::console::CommandRegistry::Get();
  EXPECT_TRUE(registry.HasCommand(TimeToTimecode::kName) &&
              registry.HasCommand(TimecodeToTime::kName));
  UnregisterTimeCommands();
  EXPECT_FALSE(registry.HasCommand(TimeToTimecode::kName) ||
               registry.HasCommand(TimecodeToTime::kName));
  RegisterTimeCommands();  // for TearDown
}

TEST_F(TimeCommandsTest, TimeToTimecodePrintsOneLine) {
  // clang-format off
  constexpr Case kCases[] = {
      {"30 29.97 29.97 -d", "Timecode at time 30 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;00;01;00\n"},
      {"1800 29.97 29.97 -d", "Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;01;00;02\n"},
      {"1800 29.97 29.97", "Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Non-Drop-Frame Timecode fps is: 00:01:00:00\n"},
      {"-s 1 25 25", "Timecode at time 1 in a 25 fps clip, displayed at 25 fps Timecode fps is: 00:00:01:00\n"},
      {"-S 1 25 25", "Timecode at time 1 in a 25 fps clip, displayed at 25 fps Timecode fps is: 00:00:01:00\n"},
      {"   1800   29.97  29.97   -D  ", "Timecode at time 1800 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;01;00;02\n"},
      {"48 23.976 25", "Timecode at time 48 in a 23.976 fps clip, displayed at 25 fps Timecode fps is: 00:00:01:23\n"},
      {"1.9 25 25", "Timecode at time 1.9 in a 25 fps clip, displayed at 25 fps Timecode fps is: 00:00:00:01\n"},  // truncated
      {"30 0 0", "Timecode at time 30 in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;00;00;00\n"},
      {"", "Timecode at time  in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;00;00;00\n"},
  };
  // clang-format on
  ExpectLines(TimeToTimecode::kName, kCases);
}

TEST_F(TimeCommandsTest, SecondsAreSnappedToTheNearestSourceFrame) {
  // clang-format off
  constexpr Case kCases[] = {
      {"-s 8.03 25 25", "Timecode at time 8.03 in a 25 fps clip, displayed at 25 fps Timecode fps is: 00:00:08:01\n"},
      {"-s 1 23.98 23.98", "Timecode at time 1 in a 23.976 fps clip, displayed at 23.976 fps Timecode fps is: 00:00:01:00\n"},
      {"-s 60.06 29.97 29.97 -d", "Timecode at time 60.06 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 00;01;00;02\n"},
      {"-s 1 0 25", "Timecode at time 1 in a 0 fps clip, displayed at 25 fps Timecode fps is: 00:00:00:00\n"},
      {"-s abc 25 25", "Timecode at time abc in a 25 fps clip, displayed at 25 fps Timecode fps is: 00:00:00:00\n"},
      // Beyond the time scale's +-100 hours the time is clamped (and hours wrap).
      {"-s 1e300 25 25", "Timecode at time 1e300 in a 25 fps clip, displayed at 25 fps Timecode fps is: 04:00:00:00\n"},
      {"1e300 25 25", "Timecode at time 1e300 in a 25 fps clip, displayed at 25 fps Timecode fps is: 04:00:00:00\n"},
  };
  // clang-format on
  ExpectLines(TimeToTimecode::kName, kCases);
}

TEST_F(TimeCommandsTest, TimecodeToTimePrintsOneLine) {
  // clang-format off
  constexpr Case kCases[] = {
      {"00:00:01:00 25 25", "00:00:01:00 in a 25 fps clip, displayed at 25 fps Timecode fps is: 1 seconds (25 frames)\n"},
      {"00;01;00;02 29.97 29.97 -d", "00;01;00;02 in a 29.97 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 60.06 seconds (1800 frames)\n"},
      {"1:2:3:4:5 25 25", "1:2:3:4:5 in a 25 fps clip, displayed at 25 fps Timecode fps is: INVALID\n"},
      // No source rate: a non-zero timecode has no time.
      {"00:00:01:00 0 0", "00:00:01:00 in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: INVALID\n"},
      {"-00:00:01:00 25 25", "-00:00:01:00 in a 25 fps clip, displayed at 25 fps Timecode fps is: -1 seconds (-25 frames)\n"},
      {"", " in a 0 fps clip, displayed at 29.97 fps Drop-Frame Timecode fps is: 0 seconds (0 frames)\n"},
  };
  // clang-format on
  ExpectLines(TimecodeToTime::kName, kCases);
}

}  // namespace
}  // namespace zebmediatypes::Commands
