// Registration of the time console commands in the core console registry.
#pragma once

namespace zebmediatypes::Commands {

// Registers zebmediatypes.TimeToTimecode, then zebmediatypes.TimecodeToTime.
void RegisterTimeCommands();
// Unregisters zebmediatypes.TimecodeToTime, then zebmediatypes.TimeToTimecode.
void UnregisterTimeCommands();

}  // namespace zebmediatypes::Commands
