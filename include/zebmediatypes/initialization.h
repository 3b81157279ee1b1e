// Starting and stopping the library.
//
// The host's start-up sequence starts the library once through the core
// start-up registry (registrar "zebmediatypes"), which also registers the
// console commands zebmediatypes.TimeToTimecode and zebmediatypes.TimecodeToTime;
// its shut-down sequence removes them and stops the library. Hosts may also
// call Initialize and Terminate directly, in balanced pairs: a start count
// pairs them, and the library stays started while any user remains.
//
// Any thread may call them; they take the lifecycle lock (recursive, waited for
// at most 60 s) and then the colour lock, never the other way round.
#pragma once

#include <zebmediatypes/export.h>

namespace zebmediatypes {

// Counts one more user. The first one installs the default colour space
// ("BT.709 RGB Full", a model space, not linearized) and enters it in the
// colour-space cache. If the lock cannot be had or the default cannot be
// installed, this is reported through the assertion service and the count is
// left as it was.
ZEBMEDIATYPES_API void Initialize() noexcept;

// Counts one user less; the last one empties the colour-space cache (the
// default colour space is then reported empty until something enters the
// cache again). A Terminate with no user left is reported through the
// assertion service and changes nothing.
ZEBMEDIATYPES_API void Terminate() noexcept;

}  // namespace zebmediatypes
