// The library lifecycle: the start count, the default colour space and the
// start-up registrar. The binary starts with the library stopped.
#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/console.h>
#include <zebcore/initializer.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/initialization.h>

#include "color/color_test_support.h"

namespace zebmediatypes {
namespace {

using color::ColorSpace;
using color::GetDefaultColorSpace;
using testing::DefaultSpace;
using testing::MakeSpace;

bool CommandsPresent() {
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
  Initialize();
  EXPECT_EQ(GetDefaultColorSpace(), DefaultSpace());
  Terminate();
  EXPECT_EQ(GetDefaultColorSpace(), ColorSpace());
  // The kept default shows again as soon as the cache holds anything.
  color::AddColorSpaceToCache(MakeSpace("after-stop"));
  EXPECT_EQ(GetDefaultColorSpace(), DefaultSpace());
  Initialize();
  Terminate();
  EXPECT_EQ(GetDefaultColorSpace(), ColorSpace());
}

TEST(Lifecycle, NestedStartsKeepTheCacheAndTheCallersDefaultUntilTheLastTerminate) {
  ASSERT_TRUE(IsStopped());
  Initialize();
  const ColorSpace mine = MakeSpace("Display P3", 2, true);
  color::SetDefaultColorSpace(mine);
  Initialize();
  const auto id = color::AddColorSpaceToCache(MakeSpace("nested", 2));
  EXPECT_EQ(GetDefaultColorSpace(), mine);
  Terminate();
  EXPECT_EQ(color::RetrieveColorSpaceFromCache(id), MakeSpace("nested", 2));
  EXPECT_EQ(GetDefaultColorSpace(), mine);
  Terminate();
  EXPECT_EQ(color::RetrieveColorSpaceFromCache(id), ColorSpace());
  EXPECT_TRUE(IsStopped());
  // A first start installs the library's default anew.
  Initialize();
  EXPECT_EQ(GetDefaultColorSpace(), DefaultSpace());
  Terminate();
}

TEST(Lifecycle, UnbalancedTerminateIsReportedAndDoesNotWrap) {
  ASSERT_TRUE(IsStopped());
  zebcore::debug::ScopedAssertionCapture capture;
  for (int i = 0; i < 2; ++i) Terminate();
  EXPECT_EQ(capture.Count(), 2u);
  // The count stayed at 0: one start and one stop bring the library up and down.
  Initialize();
  EXPECT_EQ(GetDefaultColorSpace(), DefaultSpace());
  Terminate();
  EXPECT_EQ(GetDefaultColorSpace(), ColorSpace());
  EXPECT_EQ(capture.Count(), 2u);
}

TEST(Lifecycle, FailedStartLeavesTheCountAndRegistersNothing) {
  ASSERT_TRUE(IsStopped());
  {
    zebcore::debug::ScopedAssertionCapture capture;
    const testing::ColorLockHolder holder;
    Initialize();  // cannot install the default colour space
    EXPECT_FALSE(zebcore::config::StartUp());
    EXPECT_FALSE(CommandsPresent());
    EXPECT_GE(capture.Count(), 2u);
  }
  zebcore::config::ShutDown();
  EXPECT_TRUE(IsStopped());
  EXPECT_EQ(GetDefaultColorSpace(), ColorSpace());
}

}  // namespace
}  // namespace zebmediatypes
