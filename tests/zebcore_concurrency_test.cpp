// zebcore services used from several threads at once.

#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/console.h>
#include <zebcore/localizer.h>
#include <zebcore/logging.h>
#include <zebcore/mutex.h>

#include <atomic>
#include <functional>
#include <string>
#include <thread>
#include <vector>

namespace {

using zebcore::UTF16String;
using zebcore::threads::RecursiveLockGuard;
using zebcore::threads::RecursiveMutex;

void RunThreads(int count, const std::function<void()>& body) {
  std::vector<std::thread> threads;
  for (int t = 0; t < count; ++t) threads.emplace_back(body);
  for (auto& t : threads) t.join();
}

TEST(RecursiveMutex, LockTimesOutAndUnlockIsRefusedWhileAnotherThreadHoldsIt) {
  RecursiveMutex mutex("held");
  ASSERT_TRUE(mutex.Lock("holder", 0));
  std::vector<std::string> traced;
  zebcore::logging::SetTraceSink(
      [&](std::string_view, int, std::string_view text) { traced.emplace_back(text); }, 1);
  zebcore::debug::ScopedAssertionCapture capture;
  RunThreads(1, [&] {
    EXPECT_FALSE(mutex.Lock("waiter", 20));
    EXPECT_FALSE(RecursiveLockGuard(mutex, "guard", 0));
    mutex.Unlock();  // not the holder: reported, still held
    EXPECT_FALSE(mutex.Lock("intruder", 10));
  });
  zebcore::logging::SetTraceSink({}, 0);
  EXPECT_EQ(capture.Count(), 1u);
  ASSERT_EQ(traced.size(), 3u);  // each timeout names the waiter and the mutex
  EXPECT_TRUE(traced[0].find("waiter") != std::string::npos &&
              traced[0].find("held") != std::string::npos)
      << traced[0];
  mutex.Unlock();
  RunThreads(1, [&] {
    EXPECT_TRUE(mutex.Lock("after", 1000));  // free again
    mutex.Unlock();
  });
}

TEST(RecursiveMutex, SerializesHolders) {
  RecursiveMutex mutex;
  long counter = 0;
  RunThreads(4, [&] {
    for (int i = 0; i < 1000; ++i) {
      RecursiveLockGuard outer(mutex, "outer", 60000);
      RecursiveLockGuard inner(mutex, "inner", 60000);
      ++counter;
    }
  });
  EXPECT_EQ(counter, 4000);
}

TEST(ScopedAssertionCapture, CapturesReportsFromOtherThreads) {
  zebcore::debug::ScopedAssertionCapture capture;
  RunThreads(4, [] {
    for (int i = 0; i < 100; ++i) zebcore::debug::ReportAssertion("x", "from a thread", "", "", 1);
  });
  EXPECT_EQ(capture.Count(), 400u);
  EXPECT_EQ(capture.LastMessage(), "from a thread");
}

class Nop final : public zebcore::console::Command {
 public:
  void Execute(const UTF16String&, zebcore::string::UTF16OStream& out) override { out << u"."; }
};

TEST(CommandRegistry, StaysConsistentUnderConcurrentUse) {
  auto& registry = zebcore::console::CommandRegistry::Get();
  std::atomic<int> registered{0};
  RunThreads(4, [&] {
    for (int i = 0; i < 200; ++i) {
      // Every thread races for the same few names.
      const UTF16String name =
          u"zebcore.race." + UTF16String(1, static_cast<char16_t>(u'a' + i % 5));
      registered += registry.RegisterCommand(name, u"", [] { return std::make_shared<Nop>(); });
      zebcore::string::oUTF16StringStream out;
      registry.Execute(name, u"", out);
      if (registry.UnregisterCommand(name)) --registered;
      (void)registry.Commands();
    }
  });
  EXPECT_EQ(registered.load(), 0);
  for (const auto& entry : registry.Commands())
    EXPECT_NE(entry.name.rfind(u"zebcore.race.", 0), 0u);
}

TEST(Localizer, ReadsWhileTranslationsChange) {
  auto& localizer = zebcore::config::Localizer::Get();
  std::atomic<bool> stop{false};
  std::thread writer([&] {
    for (int i = 0; i < 200; ++i) {
      localizer.InstallTranslations({{"$$$/a/b", u"T"}});
      localizer.ClearTranslations();
    }
    stop = true;
  });
  while (!stop) {
    const UTF16String text = localizer.Localize("$$$/a/b=D");
    EXPECT_TRUE(text == UTF16String(u"T") || text == UTF16String(u"D"));
  }
  writer.join();
}

}  // namespace
