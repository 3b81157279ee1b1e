// The console: commands that a person types, by name.
//
// A command is an object with an Execute operation that receives the argument
// text and the console's output stream. The registry owns one shared object per
// registered name; it is thread-safe.
#pragma once

#include <zebcore/export.h>
#include <zebcore/stream.h>
#include <zebcore/string.h>

#include <functional>
#include <map>
#include <memory>
#include <mutex>
#include <ostream>
#include <utility>
#include <vector>

namespace zebcore::console {

// The console's output stream: UTF-16 text written to a narrow stream as UTF-8.
class ZEBCORE_API ConsoleOutputStream final : public string::UTF16OStream {
 public:
  explicit ConsoleOutputStream(std::ostream& out) : out_(out) {}
  void Flush() override { out_.flush(); }

 protected:
  void Write(std::u16string_view text) override;

 private:
  std::ostream& out_;
};

class ZEBCORE_API Command {
 public:
  virtual ~Command() = default;
  // Runs the command on `arguments` (the text after the name), writing to `out`.
  virtual void Execute(const UTF16String& arguments, string::UTF16OStream& out) = 0;
};

using CommandFactory = std::function<std::shared_ptr<Command>()>;

class ZEBCORE_API CommandRegistry {
 public:
  struct Entry {
    UTF16String name;
    UTF16String help;
  };

  static CommandRegistry& Get();

  // Creates the command with `factory` and registers it. False (and nothing
  // stored) when the name is taken, or the factory gives no object.
  bool RegisterCommand(const UTF16String& name, const UTF16String& help,
                       const CommandFactory& factory);
  // Removes the command and hands back the registry's reference to it (null
  // when there is no such command).
  std::shared_ptr<Command> UnregisterCommand(const UTF16String& name);

  bool HasCommand(const UTF16String& name) const;
  // The registered commands, ordered by name.
  std::vector<Entry> Commands() const;
  // Runs the named command. False when there is no such command.
  bool Execute(const UTF16String& name, const UTF16String& arguments,
               string::UTF16OStream& out) const;

 private:
  CommandRegistry() = default;
  struct Registered {
    UTF16String help;
    std::shared_ptr<Command> command;
  };
  mutable std::mutex mutex_;
  std::map<UTF16String, Registered> commands_;
};

}  // namespace zebcore::console
