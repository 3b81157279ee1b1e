// zebmediatypes-console: runs the library's console commands.
//
//   zebmediatypes-console <command> [arguments...]   runs one command
//   zebmediatypes-console                             reads command lines from
//                                                     standard input until end
//                                                     of input or "quit"
//   zebmediatypes-console help | --help
//
// Exit status: 0 on success, 2 for an unknown command or bad usage (in the
// reading mode: when any line named an unknown command).
#include <unistd.h>
#include <zebcore/console.h>
#include <zebcore/initializer.h>
#include <zebcore/string.h>

#include <cstdio>
#include <iostream>
#include <string>
#include <string_view>

#include "commands/time_commands.h"

namespace {

constexpr int kExitSuccess = 0;
constexpr int kExitUsage = 2;

constexpr const char* kUsage =
    "usage: zebmediatypes-console [<command> [arguments...]]\n"
    "\n"
    "Runs one of the library's console commands and prints its output. With no\n"
    "command, reads one command line at a time from standard input until the end\n"
    "of input or the line \"quit\".\n"
    "\n"
    "  help        lists the registered commands with their help texts\n"
    "  --help      prints this text\n"
    "\n"
    "Example:\n"
    "  zebmediatypes-console zebmediatypes.TimeToTimecode 1800 29.97 29.97 -d\n"
    "\n"
    "Exit status: 0 on success, 2 for an unknown command or bad usage.\n";

// Starts the library the way a host does and stops it again at the end. The
// library's start-up registers its commands; should a build lack that
// registrar, the time commands are registered here and removed again.
class LibrarySession {
 public:
  LibrarySession() {
    zebcore::config::StartUp();
    auto& registry = zebcore::console::CommandRegistry::Get();
    if (!registry.HasCommand(zebmediatypes::Commands::TimeToTimecode::kName)) {
      zebmediatypes::Commands::RegisterTimeCommands();
      registeredHere_ = true;
    }
  }
  ~LibrarySession() {
    if (registeredHere_) zebmediatypes::Commands::UnregisterTimeCommands();
    zebcore::config::ShutDown();
  }
  LibrarySession(const LibrarySession&) = delete;
  LibrarySession& operator=(const LibrarySession&) = delete;

 private:
  bool registeredHere_ = false;
};

void PrintHelp(zebcore::string::UTF16OStream& out) {
  for (const auto& entry : zebcore::console::CommandRegistry::Get().Commands()) {
    out << entry.name << u"\n    " << entry.help << u"\n";
  }
  out.Flush();
}

// Runs `name` with `arguments`; false (and a line on standard error) when no
// such command is registered.
bool Run(const std::string& name, const std::string& arguments,
         zebcore::string::UTF16OStream& out) {
  if (name == "help") {
    PrintHelp(out);
    return true;
  }
  if (!zebcore::console::CommandRegistry::Get().Execute(
          zebcore::string::UTF8to16(name), zebcore::string::UTF8to16(arguments), out)) {
    std::cerr << "zebmediatypes-console: unknown command '" << name
              << "' (\"help\" lists the commands)" << std::endl;
    return false;
  }
  return true;
}

std::string_view Trim(std::string_view s) {
  const auto blank = [](char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n'; };
  while (!s.empty() && blank(s.front())) s.remove_prefix(1);
  while (!s.empty() && blank(s.back())) s.remove_suffix(1);
  return s;
}

int ReadCommands(zebcore::string::UTF16OStream& out) {
  const bool interactive = isatty(STDIN_FILENO) != 0;
  int status = kExitSuccess;
  std::string line;
  for (;;) {
    if (interactive) std::cout << "> " << std::flush;
    if (!std::getline(std::cin, line)) break;
    const std::string_view text = Trim(line);
    if (text.empty()) continue;
    if (text == "quit") break;
    const std::size_t space = text.find_first_of(" \t");
    const std::string name(text.substr(0, space));
    const std::string arguments(space == std::string_view::npos ? std::string_view()
                                                                : Trim(text.substr(space)));
    if (!Run(name, arguments, out)) status = kExitUsage;
  }
  if (interactive) std::cout << std::endl;
  return status;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc > 1) {
    const std::string_view first = argv[1];
    if (first == "--help" || first == "-h") {
      std::cout << kUsage;
      return kExitSuccess;
    }
    if (first.size() > 1 && first[0] == '-') {
      std::cerr << "zebmediatypes-console: unknown option '" << first << "' (see --help)"
                << std::endl;
      return kExitUsage;
    }
  }
  LibrarySession session;
  zebcore::console::ConsoleOutputStream out(std::cout);
  if (argc == 1) return ReadCommands(out);

  std::string arguments;
  for (int i = 2; i < argc; ++i) {
    if (i > 2) arguments += ' ';
    arguments += argv[i];
  }
  return Run(argv[1], arguments, out) ? kExitSuccess : kExitUsage;
}
