// The time console commands:
//
//   zebmediatypes.TimeToTimecode [-s] <time> <source_fps> <display_fps> [-d]
//   zebmediatypes.TimecodeToTime <timecode> <source_fps> <display_fps> [-d]
//
// Each prints one line on the console's stream. Rates are read as numbers and
// matched to the named rates (29.97 is exactly 30000/1001); the display is the
// standard one for display_fps, drop-frame with -d. Text that is not a number
// reads as 0; a rate of 0 is no rate (every time is then 0 frames and the
// display falls back to 29.97 drop-frame). The commands never fail.
#pragma once

#include <zebcore/console.h>
#include <zebmediatypes/export.h>

namespace zebmediatypes::Commands {

class ZEBMEDIATYPES_API TimeToTimecode final : public zebcore::console::Command {
 public:
  static constexpr const char16_t* kName = u"zebmediatypes.TimeToTimecode";
  static const char16_t* const kHelp;
  void Execute(const zebcore::UTF16String& arguments, zebcore::string::UTF16OStream& out) override;
};

class ZEBMEDIATYPES_API TimecodeToTime final : public zebcore::console::Command {
 public:
  static constexpr const char16_t* kName = u"zebmediatypes.TimecodeToTime";
  static const char16_t* const kHelp;
  void Execute(const zebcore::UTF16String& arguments, zebcore::string::UTF16OStream& out) override;
};

// Registers zebmediatypes.TimeToTimecode, then zebmediatypes.TimecodeToTime, in
// zebcore::console::CommandRegistry. A name already taken is left as it is.
ZEBMEDIATYPES_API void RegisterTimeCommands();
// Unregisters zebmediatypes.TimecodeToTime, then zebmediatypes.TimeToTimecode.
ZEBMEDIATYPES_API void UnregisterTimeCommands();

}  // namespace zebmediatypes::Commands
