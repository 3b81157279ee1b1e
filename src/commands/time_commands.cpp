#include "commands/time_commands.h"

namespace zebmediatypes::Commands {

void RegisterTimeCommands() {}
void UnregisterTimeCommands() {}

}  // namespace zebmediatypes::Commands
