// Script contexts and threads: separate contexts run in parallel; one context
// is shared through its lock; the held layout of "AudioFormat" is locked and
// unlocked from a thread that has no script context.
#include <gtest/gtest.h>
#include <zebmediatypes/scripting/audio_objects.h>
#include <zebmediatypes/scripting/time_objects.h>
#include <zebscripting/zebscripting.h>

#include <atomic>
#include <string>
#include <thread>
#include <vector>

namespace {

using zebscripting::JavaScriptContext;

constexpr const char* kWork =
    "var T = zebmediatypes.TickTime, r = zebmediatypes.FrameRate.createWithValue(25), sum = 0;"
    "for (var i = 0; i < 200; ++i) { var t = new T(); t.ticksNumber = i * 10160640000;"
    "  sum += t.alignToFrame(r).ticksNumber / 10160640000 + T.TIME_ZERO.ticksNumber; }"
    "sum";

TEST(ScriptConcurrency, ContextsOfTheirOwnRunInParallel) {
  const std::size_t before = zebscripting::ScriptObject::LiveObjectCount();
  std::vector<std::string> results(2);
  std::vector<std::thread> threads;
  for (std::size_t t = 0; t < results.size(); ++t) {
    threads.emplace_back([&results, t] {
      const auto context = JavaScriptContext::Create();
      for (int round = 0; round < 3; ++round) results[t] = context->Evaluate(kWork, "work.js").text;
    });
  }
  for (std::thread& thread : threads) thread.join();
  EXPECT_EQ(results[0], "19900");
  EXPECT_EQ(results[1], "19900");
  EXPECT_EQ(zebscripting::ScriptObject::LiveObjectCount(), before);
}

TEST(ScriptConcurrency, OneContextIsSharedThroughItsLock) {
  const auto context = JavaScriptContext::Create();
  context->Evaluate("var count = 0; var kept = [];", "setup.js");
  const int handle = context->GetHandle();
  auto work = [&context, handle] {
    for (int i = 0; i < 100; ++i) {
      context->Evaluate("count++; kept.push(new zebmediatypes.TickTime());", "count.js");
      const auto time = zebmediatypes::scripting::CreateTickTimeObject({}, handle);
      time->LockObject();
      time->UnlockObject();
      context->CollectGarbage();
      (void)context->WrapperCount();
    }
  };
  std::thread other(work);
  work();
  other.join();
  EXPECT_EQ(context->Evaluate("count + ' ' + kept.length", "check.js").text, "200 200");
}

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

TEST(ScriptConcurrency, HeldLayoutLocksFromAnyThread) {
  zebscripting::ScriptObjectPtr held;
  {
    const auto context = JavaScriptContext::Create();
    const zebscripting::ScriptObjectPtr format =
        context->Evaluate("var format = new AudioFormat(48000, 24); format", "setup.js")
            .value.GetObject();
    ASSERT_TRUE(format);
    held = static_cast<zebmediatypes::scripting::AudioFormatObject&>(*format).GetChannelLayout();
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
