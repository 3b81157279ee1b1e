// The colour family's process-wide state, shared by the colour sources and the
// lifecycle. Not part of the public API.
#pragma once

#include <zebcore/mutex.h>
#include <zebmediatypes/color/color_space.h>
#include <zebmediatypes/export.h>

namespace zebmediatypes::details {

// The colour lock over the colour-space cache and the default colour space.
// Recursive; taken after the lifecycle lock, never before it. Exported for the
// tests that hold it to check what a timed-out wait does.
ZEBMEDIATYPES_API zebcore::threads::RecursiveMutex& ColorLock();

// The wait limit of the colour and lifecycle locks, 60000 ms unless a test
// shortens it. Returns the previous limit.
ZEBMEDIATYPES_API unsigned int SetLockWaitMilliseconds(unsigned int milliseconds) noexcept;
unsigned int LockWaitMilliseconds() noexcept;

// SetDefaultColorSpace that says whether it could do its work.
bool InstallDefaultColorSpace(const color::ColorSpace& space) noexcept;

// Removes every entry of the colour-space cache under the colour lock. False
// when the lock could not be had (the cache is then left as it is).
bool ClearColorSpaceCache() noexcept;

// Reports a lock that could not be had within the wait limit.
void ReportLockTimeout(const char* lockName, const char* function, int line) noexcept;

}  // namespace zebmediatypes::details
