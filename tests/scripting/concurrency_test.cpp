// Script contexts and threads: separate contexts run in parallel; one context
// is shared through its lock.
#include <gtest/gtest.h>
#include <zebmediatypes/scripting/time_objects.h>
#include <zebscripting/zebscripting.h>

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

}  // namespace
