// The console registry and output stream.

#include <zebcore/console.h>

namespace zebcore::console {

void ConsoleOutputStream::Write(std::u16string_view text) { out_ << string::UTF16toNarrow(text); }

// Never destroyed: a start-up registrar destroyed at exit (while started)
// unregisters its commands from its terminate function.
CommandRegistry& CommandRegistry::Get() {
  static CommandRegistry* const registry = new CommandRegistry;
  return *registry;
}

bool CommandRegistry::RegisterCommand(const UTF16String& name, const UTF16String& help,
                                      const CommandFactory& factory) {
  {
    std::lock_guard<std::mutex> lock(mutex_);
    if (commands_.count(name) != 0) return false;
  }
  // The factory runs outside the lock: it may use the registry itself.
  std::shared_ptr<Command> command = factory ? factory() : nullptr;
  if (!command) return false;
  std::lock_guard<std::mutex> lock(mutex_);
  return commands_.emplace(name, Registered{help, std::move(command)}).second;
}

std::shared_ptr<Command> CommandRegistry::UnregisterCommand(const UTF16String& name) {
  std::lock_guard<std::mutex> lock(mutex_);
  auto it = commands_.find(name);
  if (it == commands_.end()) return nullptr;
  std::shared_ptr<Command> command = std::move(it->second.command);
  commands_.erase(it);
  return command;
}

bool CommandRegistry::HasCommand(const UTF16String& name) const {
  std::lock_guard<std::mutex> lock(mutex_);
  return commands_.count(name) != 0;
}

std::vector<CommandRegistry::Entry> CommandRegistry::Commands() const {
  std::lock_guard<std::mutex> lock(mutex_);
  std::vector<Entry> entries;
  entries.reserve(commands_.size());
  for (const auto& [name, registered] : commands_) entries.push_back({name, registered.help});
  return entries;
}

bool CommandRegistry::Execute(const UTF16String& name, const UTF16String& arguments,
                              string::UTF16OStream& out) const {
  std::shared_ptr<Command> command;
  {
    std::lock_guard<std::mutex> lock(mutex_);
    auto it = commands_.find(name);
    if (it == commands_.end()) return false;
    command = it->second.command;
  }
  // Run outside the lock: the command may register or unregister commands.
  command->Execute(arguments, out);
  return true;
}

}  // namespace zebcore::console
