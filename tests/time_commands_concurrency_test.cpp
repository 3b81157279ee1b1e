// The time commands and timecode text used from several threads at once: the
// commands run through the shared console registry.
#include <gtest/gtest.h>
#include <zebcore/console.h>
#include <zebcore/stream.h>
#include <zebmediatypes/timecode.h>

#include <atomic>
#include <thread>
#include <vector>

#include "commands/time_commands.h"

namespace zebmediatypes {
namespace {

zebcore::UTF16String Execute(const char16_t* name, const char16_t* arguments) {
  zebcore::string::oUTF16StringStream out;
  zebcore::console::CommandRegistry::Get().Execute(name, arguments, out);
  return out.str();
}

TEST(TimeCommands, RunFromSeveralThreadsGiveTheSameLines) {
  Commands::RegisterTimeCommands();
  const zebcore::UTF16String timecode =
      Execute(Commands::TimeToTimecode::kName, u"1800 29.97 29.97 -d");
  const zebcore::UTF16String time =
      Execute(Commands::TimecodeToTime::kName, u"00;01;00;02 29.97 29.97 -d");
  ASSERT_FALSE(timecode.empty() || time.empty());
  std::atomic<int> mismatches{0};
  std::vector<std::thread> threads;
  for (int t = 0; t < 4; ++t) {
    threads.emplace_back([&, t] {
      const TimeDisplay display(kTimeDisplay_5994DropTimecode);
      for (int i = 0; i < 200; ++i) {
        mismatches += Execute(Commands::TimeToTimecode::kName, u"1800 29.97 29.97 -d") != timecode;
        mismatches +=
            Execute(Commands::TimecodeToTime::kName, u"00;01;00;02 29.97 29.97 -d") != time;
        const TickTime start(i * 7 + t, kFrameRate_Video59_94);
        const auto text = TimeToTimecode(start, kFrameRate_Video59_94, display);
        mismatches += TimecodeToTime(text, kFrameRate_Video59_94, display) != start;
      }
    });
  }
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(mismatches.load(), 0);
  Commands::UnregisterTimeCommands();
  EXPECT_TRUE(Execute(Commands::TimeToTimecode::kName, u"1 25 25").empty());  // unregistered
  EXPECT_TRUE(Execute(Commands::TimecodeToTime::kName, u"1 25 25").empty());
}

}  // namespace
}  // namespace zebmediatypes
