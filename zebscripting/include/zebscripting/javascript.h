// JavaScriptContext: a script context that runs JavaScript (ECMAScript 5.1 with
// parts of later editions) and exposes every registered script class to it.
//
// What script sees:
//   - a global object per namespace entry with flags 0 (`zebmediatypes`)
//     holding each class under its class name (`zebmediatypes.TickTime`); an
//     entry with flags 0x10000 also makes the class a global of that name;
//   - a class with a constructor item is constructible with `new` (calling it
//     without `new`, or constructing a class without one, is a TypeError);
//   - properties are accessors on the class's prototype, methods functions;
//     static items and constants (read-only) are on the class and reachable
//     from its instances too; the element count is `length` and the indexed
//     getter answers `object[i]` for every integer i;
//   - every script object has `isEqual(other)` (ScriptObject::IsEqual); the
//     same native object is the same script object while script can reach it;
//   - a native null object is `null`; `null`/`undefined` for an object
//     parameter is a missing argument;
//   - a refused write throws RangeError and leaves the value;
//     ParameterErrorException becomes TypeError or RangeError, any other
//     native exception an Error with its message; the message names the class
//     and item, and the error's file and line are those of the calling script.
//
// One engine heap per context. The heap has a memory cap (allocations past it
// fail, and the script gets a RangeError) and each Evaluate a time limit (a
// script still running after it gets a RangeError it cannot catch for long:
// the check repeats). Each wrapper holds one reference to its native object,
// released when the wrapper is collected or the context destroyed.
//
// Thread safety: every member function takes the context's own lock, so one
// context may be used from several threads, one at a time; separate contexts
// run in parallel.
#pragma once

#include <zebscripting/export.h>
#include <zebscripting/script_context.h>
#include <zebscripting/script_value.h>

#include <boost/intrusive_ptr.hpp>
#include <cstddef>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace zebscripting {

struct JavaScriptLimits {
  std::size_t memoryBytes = std::size_t{256} << 20;  // heap cap; 0 for none
  double timeoutSeconds = 30.0;                      // per Evaluate; 0 for none
};

// The outcome of one Evaluate.
struct JavaScriptResult {
  bool ok = false;
  ScriptValue value;      // the completion value when ok
  std::string text;       // String(value) when ok; the error's message otherwise
  std::string errorName;  // "TypeError", "RangeError", "SyntaxError", "Error"...
  std::string fileName;   // where the error was thrown, when known
  int lineNumber = 0;     // 0 when unknown
};

class ZEBSCRIPTING_API JavaScriptContext final : public ScriptContext {
 public:
  // A native function callable from script; its exceptions become script
  // errors as for items.
  using NativeFunction = std::function<ScriptValue(const ScriptArguments&)>;

  static boost::intrusive_ptr<JavaScriptContext> Create(JavaScriptLimits limits = {});

  // Compiles and runs `source` (UTF-8) as a program named `fileName`.
  JavaScriptResult Evaluate(std::string_view source, std::string_view fileName);

  // Defines a global function or value.
  void DefineFunction(const char* name, NativeFunction function);
  void DefineGlobal(const char* name, const ScriptValue& value);
  // Defines a global function that returns `value` (-32768 to 32767, clamped)
  // straight from the engine, without the host's argument and result
  // conversions: the engine's own cost of a native call, for comparisons.
  void DefinePlainNumberFunction(const char* name, int value);

  // Runs a full garbage collection (finalizing unreachable wrappers).
  void CollectGarbage();
  // Native objects that have a wrapper in this context now.
  std::size_t WrapperCount() const;
  // Bytes the heap holds now.
  std::size_t MemoryInUse() const;

  ~JavaScriptContext() override;

  struct Impl;

 private:
  explicit JavaScriptContext(JavaScriptLimits limits);
  std::unique_ptr<Impl> impl_;
};

}  // namespace zebscripting
