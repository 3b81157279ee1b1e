// The library lifecycle: the start count, the default colour space and the
// start-up registrar. The binary starts with the library stopped.
#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/console.h>
#include <zebcore/initializer.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/initialization.h>

#include <condition_variable>
#include <mutex>
#include <thread>

#include "color/color_state.h"
#include "color/color_test_support.h"

namespace zebmediatypes {
namespace {

using color::ColorSpace;
using testing::DefaultSpace;
using testing::MakeSpace;

bool CommandPresent() {
  return zebcore::console::CommandRegistry::Get().HasCommand(u"zebmediatypes.TimeToTimecode");
}

// Whether the library is stopped: a Terminate is then refused and reported.
bool IsStopped() {
  zebcore::debug::ScopedAssertionCapture capture;
  Terminate();
  if (capture.Count() == 1) return true;
  Initialize();  // it was started: give the user back
  return false;
}

TEST(Lifecycle, DefaultColorSpaceIsInstalledAndHiddenAfterTheLastTerminate) {
  ASSERT_TRUE(IsStopped());
  EXPECT_EQ(color::GetDefaultColorSpace(), ColorSpace());
  Initialize();
  const ColorSpace installed = color::GetDefaultColorSpace();
  EXPECT_EQ(installed, DefaultSpace());
  EXPECT_EQ(color::RetrieveColorSpaceFromCache(DefaultSpace().ToGuid()), DefaultSpace());
  Terminate();
  EXPECT_EQ(color::GetDefaultColorSpace(), ColorSpace());
  EXPECT_EQ(color::RetrieveColorSpaceFromCache(DefaultSpace().ToGuid()), ColorSpace());
  // The kept default shows again as soon as the cache holds anything.
  color::AddColorSpaceToCache(MakeSpace("after-stop"));
  EXPECT_EQ(color::GetDefaultColorSpace(), DefaultSpace());
  Initialize();
  Terminate();
  EXPECT_EQ(color::GetDefaultColorSpace(), ColorSpace());
}

TEST(Lifecycle, NestedStartsKeepTheCacheUntilTheLastTerminate) {
  ASSERT_TRUE(IsStopped());
  Initialize();
  Initialize();
  const ColorSpace entry = MakeSpace("nested", 2);
  const auto id = color::AddColorSpaceToCache(entry);
  Terminate();
  EXPECT_EQ(color::RetrieveColorSpaceFromCache(id), entry);
  EXPECT_EQ(color::GetDefaultColorSpace(), DefaultSpace());
  Terminate();
  EXPECT_EQ(color::RetrieveColorSpaceFromCache(id), ColorSpace());
  EXPECT_TRUE(IsStopped());
}

TEST(Lifecycle, LaterInitializeKeepsTheCallersDefault) {
  ASSERT_TRUE(IsStopped());
  Initialize();
  const ColorSpace mine = MakeSpace("Display P3", 2, true);
  color::SetDefaultColorSpace(mine);
  Initialize();
  EXPECT_EQ(color::GetDefaultColorSpace(), mine);
  Terminate();
  Terminate();
  // A first start installs the library's default anew.
  Initialize();
  EXPECT_EQ(color::GetDefaultColorSpace(), DefaultSpace());
  Terminate();
}

TEST(Lifecycle, UnbalancedTerminateIsReportedAndDoesNotWrap) {
  ASSERT_TRUE(IsStopped());
  zebcore::debug::ScopedAssertionCapture capture;
  Terminate();
  Terminate();
  EXPECT_EQ(capture.Count(), 2u);
  // The count stayed at 0: one start and one stop bring the library up and down.
  Initialize();
  EXPECT_EQ(color::GetDefaultColorSpace(), DefaultSpace());
  Terminate();
  EXPECT_EQ(color::GetDefaultColorSpace(), ColorSpace());
  EXPECT_EQ(capture.Count(), 2u);
}

TEST(Lifecycle, CommandsArePresentOnlyWhileStarted) {
  ASSERT_TRUE(IsStopped());
  EXPECT_FALSE(CommandPresent());
  ASSERT_TRUE(zebcore::config::StartUp());
  const bool present = CommandPresent();
  EXPECT_EQ(color::GetDefaultColorSpace(), DefaultSpace());
  zebcore::config::ShutDown();
  EXPECT_FALSE(CommandPresent());
  EXPECT_TRUE(IsStopped());
  if (!present) GTEST_SKIP() << "the time console commands are not built into this library";
}

// Holds the colour lock from another thread while it lives.
class ColorLockHolder {
 public:
  ColorLockHolder() : thread_([this] { Run(); }) {
    std::unique_lock<std::mutex> guard(mutex_);
    changed_.wait(guard, [this] { return held_; });
  }
  ~ColorLockHolder() {
    {
      std::lock_guard<std::mutex> guard(mutex_);
      release_ = true;
    }
    changed_.notify_all();
    thread_.join();
  }
  ColorLockHolder(const ColorLockHolder&) = delete;
  ColorLockHolder& operator=(const ColorLockHolder&) = delete;

 private:
  void Run() {
    const bool locked = details::ColorLock().Lock(nullptr, 5000);
    std::unique_lock<std::mutex> guard(mutex_);
    held_ = true;
    changed_.notify_all();
    changed_.wait(guard, [this] { return release_; });
    if (locked) details::ColorLock().Unlock();
  }
  std::mutex mutex_;
  std::condition_variable changed_;
  bool held_ = false;
  bool release_ = false;
  std::thread thread_;
};

TEST(Lifecycle, FailedStartLeavesTheCountAndRegistersNothing) {
  ASSERT_TRUE(IsStopped());
  const unsigned int previousWait = details::SetLockWaitMilliseconds(20);
  {
    zebcore::debug::ScopedAssertionCapture capture;
    const ColorLockHolder holder;
    Initialize();  // cannot install the default colour space
    EXPECT_FALSE(zebcore::config::StartUp());
    EXPECT_FALSE(CommandPresent());
    EXPECT_GE(capture.Count(), 2u);
  }
  details::SetLockWaitMilliseconds(previousWait);
  zebcore::config::ShutDown();
  EXPECT_TRUE(IsStopped());
  EXPECT_EQ(color::GetDefaultColorSpace(), ColorSpace());
}

}  // namespace
}  // namespace zebmediatypes
