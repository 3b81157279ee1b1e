// zebmediatypes-console: runs the library's console commands.
//
//   zebmediatypes-console <command> [arguments...]   runs one command
//   zebmediatypes-console                             reads command lines from
//                                                     standard input until end
//                                                     of input or "quit"
//   zebmediatypes-console help | --help
//
// Exit status: 0 on success, 2 for an unknown command or bad usage (an empty
// argument or one holding a blank; in the reading mode: when any line named an
// unknown command).
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
constexpr std::string_view kBlanks = " \t\n\v\f\r";

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
    "Arguments are passed on joined by blanks, so none may be empty or hold a\n"
    "blank.\n"
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

constexpr std::size_t kHelpWidth = 80;
constexpr std::u16string_view kHelpIndent = u"    ";

// `text` broken at blanks into indented lines of at most kHelpWidth columns (a
// longer word stands on a line of its own).
void PrintWrapped(std::u16string_view text, zebcore::string::UTF16OStream& out) {
  std::size_t column = 0;
  while (!text.empty()) {
    const std::size_t start = text.find_first_not_of(u' ');
    if (start == std::u16string_view::npos) break;
    text.remove_prefix(start);
    const std::u16string_view word = text.substr(0, text.find(u' '));
    text.remove_prefix(word.size());
    if (column != 0 && column + 1 + word.size() > kHelpWidth) {
      out << u"\n";
      column = 0;
    }
    out << (column == 0 ? kHelpIndent : u" ") << word;
    column += (column == 0 ? kHelpIndent.size() : 1) + word.size();
  }
  out << u"\n";
}

// Each command's name, then its help text wrapped: a help text that starts with
// the command's usage ("<usage>- <description>") gets the usage on a line of its
// own.
void PrintHelp(zebcore::string::UTF16OStream& out) {
  for (const auto& entry : zebcore::console::CommandRegistry::Get().Commands()) {
    std::u16string_view help = zebcore::string::View(entry.help);
    out << entry.name << u"\n";
    const std::size_t dash = help.find(u"- ");
    if (dash != std::u16string_view::npos && dash > 0 && help[dash - 1] != u' ') {
      PrintWrapped(help.substr(0, dash), out);
      help.remove_prefix(dash + 2);
    }
    PrintWrapped(help, out);
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
  // The command line reaches a command as one text with its arguments joined
  // by blanks, so an argument that is empty or holds a blank cannot be carried.
  for (int i = 1; i < argc; ++i) {
    const std::string_view argument = argv[i];
    const bool empty = argument.empty();
    if (empty || argument.find_first_of(kBlanks) != std::string_view::npos) {
      std::cerr << "zebmediatypes-console: argument " << i
                << (empty ? " is empty" : " holds a blank")
                << " (arguments are joined by blanks, see --help)" << std::endl;
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
