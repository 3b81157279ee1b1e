// The held layout of "AudioFormat" under threads: its lock is taken and
// dropped from a thread that has no script context while script writes the
// format's layout, and a second context builds formats in parallel.
#include <gtest/gtest.h>
#include <zebmediatypes/scripting/audio_objects.h>
#include <zebscripting/javascript.h>

#include <atomic>
#include <string>
#include <thread>

namespace zebmediatypes::scripting {
namespace {

using zebscripting::JavaScriptContext;

void RunLayoutWrites(JavaScriptContext& context, const char* format, int count) {
  for (int i = 0; i < count; ++i) {
    const std::string source =
        std::string(format) +
        ".channelLayout = AudioChannelLayout.createCommonAudioChannelLayout(" +
        std::to_string(i % 91) + "); " + format + ".channelLayout.length";
    const zebscripting::JavaScriptResult result = context.Evaluate(source, "writes.js");
    ASSERT_TRUE(result.ok) << result.errorName << ": " << result.text;
  }
}

TEST(AudioFormatObject, HeldLayoutLocksFromAnyThread) {
  ScriptObjectPtr held;
  {
    const auto context = JavaScriptContext::Create();
    const ScriptObjectPtr format =
        context->Evaluate("var format = new AudioFormat(48000, 24); format", "setup.js")
            .value.GetObject();
    ASSERT_TRUE(format);
    held = static_cast<AudioFormatObject&>(*format).GetChannelLayout();
    ASSERT_TRUE(held);

    std::atomic<bool> done{false};
    std::thread locker([&] {
      while (!done.load()) {
        held->LockObject();
        held->UnlockObject();
      }
    });
    std::thread other([] {
      const auto second = JavaScriptContext::Create();
      ASSERT_TRUE(second->Evaluate("var f = new AudioFormat(); f", "setup.js").ok);
      RunLayoutWrites(*second, "f", 200);
    });
    RunLayoutWrites(*context, "format", 200);
    done.store(true);
    locker.join();
    other.join();
    EXPECT_TRUE(held->IsLocked());
  }
  // The format went with its context, and unlocked what it held.
  EXPECT_FALSE(held->IsLocked());
}

}  // namespace
}  // namespace zebmediatypes::scripting
