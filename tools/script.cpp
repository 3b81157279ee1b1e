// zebmediatypes-script: runs JavaScript against the library's script classes.
//
//   zebmediatypes-script [options] FILE.js [args...]   runs a file
//   zebmediatypes-script [options] -e CODE [args...]   runs a string
//   zebmediatypes-script [options]                     interactive prompt
//
// Exit status: 0 when the script ran to its end, 1 for an uncaught script
// error (one line on standard error: FILE:LINE: ErrorName: message), 2 for bad
// usage or an unreadable file.
#include <unistd.h>
#include <zebcore/initializer.h>
#include <zebcore/string.h>
#include <zebscripting/javascript.h>

#include <cerrno>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <sstream>
#include <string>
#include <vector>

namespace {

constexpr int kExitSuccess = 0;
constexpr int kExitScriptError = 1;
constexpr int kExitUsage = 2;
constexpr double kDefaultTimeoutSeconds = 60.0;
constexpr double kDefaultMemoryMegabytes = 256.0;

constexpr const char* kUsage =
    "usage: zebmediatypes-script [--timeout SECONDS] [--memory MB] [FILE.js | -e CODE] "
    "[args...]\n"
    "\n"
    "Runs JavaScript with the library's script classes (zebmediatypes.TickTime,\n"
    "zebmediatypes.FrameRate, ...). print(...) writes its arguments joined by spaces\n"
    "and a line end; scriptArgs holds the arguments after the file or code. With no\n"
    "file and no -e, reads one line of script at a time and prints its value.\n"
    "\n"
    "  --timeout SECONDS  stop a script that runs longer (default 60; 0: no limit)\n"
    "  --memory MB        cap the script heap (default 256; 0: no cap)\n"
    "  --help             print this text\n"
    "\n"
    "Exit status: 0 when the script ran to its end, 1 for an uncaught script error,\n"
    "2 for bad usage.\n";

// The print function: the arguments through String(), joined by spaces.
constexpr const char* kPrelude =
    "(function (global) {\n"
    "  var write = global.__zebWrite;\n"
    "  delete global.__zebWrite;\n"
    "  global.print = function () {\n"
    "    write(Array.prototype.map.call(arguments, String).join(' '));\n"
    "  };\n"
    "})(this);\n";

// Starts the library the way a host does and stops it at the end.
class LibrarySession {
 public:
  LibrarySession() { zebcore::config::StartUp(); }
  ~LibrarySession() { zebcore::config::ShutDown(); }
  LibrarySession(const LibrarySession&) = delete;
  LibrarySession& operator=(const LibrarySession&) = delete;
};

bool ReadNumber(const char* text, double& value) {
  if (text == nullptr) return false;
  char* end = nullptr;
  errno = 0;
  const double number = std::strtod(text, &end);
  if (end == text || *end != '\0' || errno != 0 || !(number >= 0) || number > 1e9) return false;
  value = number;
  return true;
}

void ReportError(const zebscripting::JavaScriptResult& result, const std::string& fallbackFile) {
  const std::string file = result.fileName.empty() ? fallbackFile : result.fileName;
  std::cerr << file << ":" << result.lineNumber << ": " << result.errorName << ": " << result.text
            << "\n";
}

zebscripting::ScriptValue ToScriptString(const std::string& text) {
  const zebcore::UTF16String wide = zebcore::string::UTF8to16(text);
  return zebscripting::ScriptValue(std::u16string(wide.begin(), wide.end()));
}

int Interactive(zebscripting::JavaScriptContext& context) {
  const bool prompt = isatty(STDIN_FILENO) != 0;
  std::string line;
  while (true) {
    if (prompt) std::cout << "> " << std::flush;
    if (!std::getline(std::cin, line)) break;
    if (line.empty()) continue;
    const zebscripting::JavaScriptResult result = context.Evaluate(line, "<stdin>");
    if (!result.ok) {
      ReportError(result, "<stdin>");
    } else if (!result.value.IsUndefined()) {
      std::cout << result.text << "\n";
    }
  }
  if (prompt) std::cout << "\n";
  return kExitSuccess;
}

}  // namespace

int main(int argc, char** argv) {
  zebscripting::JavaScriptLimits limits;
  limits.timeoutSeconds = kDefaultTimeoutSeconds;
  double megabytes = kDefaultMemoryMegabytes;
  std::string file;
  std::string code;
  bool haveCode = false;
  int at = 1;
  for (; at < argc; ++at) {
    const std::string option = argv[at];
    if (option == "--help" || option == "-h") {
      std::cout << kUsage;
      return kExitSuccess;
    }
    if (option == "--timeout" || option == "--memory") {
      double value = 0;
      if (at + 1 >= argc || !ReadNumber(argv[at + 1], value)) {
        std::cerr << "zebmediatypes-script: " << option << " needs a number\n" << kUsage;
        return kExitUsage;
      }
      (option == "--timeout" ? limits.timeoutSeconds : megabytes) = value;
      ++at;
      continue;
    }
    if (option == "-e") {
      if (at + 1 >= argc) {
        std::cerr << "zebmediatypes-script: -e needs code\n" << kUsage;
        return kExitUsage;
      }
      code = argv[at + 1];
      haveCode = true;
      at += 2;
      break;
    }
    if (option.size() > 1 && option[0] == '-') {
      std::cerr << "zebmediatypes-script: unknown option " << option << "\n" << kUsage;
      return kExitUsage;
    }
    file = option;
    ++at;
    break;
  }
  limits.memoryBytes = static_cast<std::size_t>(megabytes * 1024.0 * 1024.0);

  std::string fileName = "<code>";
  if (!haveCode && !file.empty()) {
    std::ifstream in(file, std::ios::binary);
    if (!in) {
      std::cerr << "zebmediatypes-script: cannot read " << file << "\n";
      return kExitUsage;
    }
    std::ostringstream text;
    text << in.rdbuf();
    code = text.str();
    haveCode = true;
    fileName = file;
  }

  LibrarySession session;
  boost::intrusive_ptr<zebscripting::JavaScriptContext> context;
  try {
    context = zebscripting::JavaScriptContext::Create(limits);
  } catch (const std::exception& error) {
    std::cerr << "zebmediatypes-script: " << error.what() << "\n";
    return kExitUsage;
  }
  context->DefineFunction("__zebWrite", [](const zebscripting::ScriptArguments& arguments) {
    const zebscripting::ScriptValue& text = arguments[0];
    std::cout << zebcore::string::UTF16toNarrow(text.GetString()) << "\n";
    return zebscripting::ScriptValue();
  });
  std::vector<zebscripting::ScriptValue> scriptArgs;
  for (; at < argc; ++at) scriptArgs.push_back(ToScriptString(argv[at]));
  context->DefineGlobal("scriptArgs", zebscripting::ScriptValue(std::move(scriptArgs)));
  const zebscripting::JavaScriptResult prelude = context->Evaluate(kPrelude, "<prelude>");
  if (!prelude.ok) {
    ReportError(prelude, "<prelude>");
    return kExitScriptError;
  }

  int status = kExitSuccess;
  if (!haveCode) {
    status = Interactive(*context);
  } else {
    const zebscripting::JavaScriptResult result = context->Evaluate(code, fileName);
    if (!result.ok) {
      ReportError(result, fileName);
      status = kExitScriptError;
    }
  }
  std::cout.flush();
  context.reset();
  return status;
}
