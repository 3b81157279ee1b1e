// The time commands and timecode text used from several threads at once: the
// commands run through the shared console registry.
#include <gtest/gtest.h>
#include <zebcore/console.h>
#include <zebcore/stream.h>
#include <zebmediatypes/timecode.h>

#include <atomic>
#include <string>
#include <thread>
#include <vector>

#include "commands/time_commands.h"

namespace zebmediatypes {
namespace {

TEST(TimeCommands, RunFromSeveralThreadsGiveTheSameLines) {
  Commands::RegisterTimeCommands();
  auto& registry = zebcore::console::CommandRegistry::Get();
  const zebcore::UTF16String toTimecode = Commands::TimeToTimecode::kName;
  const zebcore::UTF16String toTime = Commands::TimecodeToTime::kName;
  const auto run = [&](const zebcore::UTF16String& name, const char16_t* arguments) {
    zebcore::string::oUTF16StringStream out;
    registry.Execute(name, arguments, out);
    return out.str();
  };
  const zebcore::UTF16String expectedTimecode = run(toTimecode, u"1800 29.97 29.97 -d");
  const zebcore::UTF16String expectedTime = run(toTime, u"00;01;00;02 29.97 29.97 -d");
  ASSERT_FALSE(expectedTimecode.empty() || expectedTime.empty());

  std::atomic<int> mismatches{0};
  std::vector<std::thread> threads;
  for (int t = 0; t < 4; ++t) {
    threads.emplace_back([&, t] {
      for (int i = 0; i < 200; ++i) {
        if (run(toTimecode, u"1800 29.97 29.97 -d") != expectedTimecode) ++mismatches;
        if (run(toTime, u"00;01;00;02 29.97 29.97 -d") != expectedTime) ++mismatches;
        const TickTime time(i * 7 + t, kFrameRate_Video59_94);
        const TimeDisplay display(kTimeDisplay_5994DropTimecode);
        const auto text = TimeToTimecode(time, kFrameRate_Video59_94, display);
        if (TimecodeToTime(text, kFrameRate_Video59_94, display) != time) ++mismatches;
      }
    });
  }
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(mismatches.load(), 0);
  Commands::UnregisterTimeCommands();
}

}  // namespace
}  // namespace zebmediatypes
