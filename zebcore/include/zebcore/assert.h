// The assertion service.
//
// A contract breach is reported, never fatal: the report goes to the installed
// hook, or to standard error when there is none, and execution goes on with the
// caller's defined result. Tests capture reports with ScopedAssertionCapture.
//
//   zebcore::debug::ReportAssertion("false", "Attempt to divide by zero", "TickTime",
//                                   "zebmediatypes::TickTime::operator /", __LINE__);
#pragma once

#include <zebcore/export.h>

#include <functional>
#include <map>
#include <mutex>
#include <string>
#include <vector>

namespace zebcore::debug {

// A report: key -> text. These keys are always present.
using DebugDictionary = std::map<std::string, std::string>;
inline constexpr const char* kDebugExpression = "expression";
inline constexpr const char* kDebugMessage = "message";
inline constexpr const char* kDebugSource = "source";
inline constexpr const char* kDebugFunction = "function";
inline constexpr const char* kDebugLine = "line";

ZEBCORE_API DebugDictionary CreateDebugDictionary(const char* expression, const char* message,
                                                  const char* source, const char* function,
                                                  int line);

// Reports a breach. Null texts are taken as empty.
ZEBCORE_API void ReportAssertion(const DebugDictionary& report);
ZEBCORE_API void ReportAssertion(const char* expression, const char* message, const char* source,
                                 const char* function, int line);

// No debugger support on this platform: never attached, never breaks.
ZEBCORE_API bool IsDebuggerAttached() noexcept;
ZEBCORE_API bool BreakAfterAssertDialog(const DebugDictionary& report) noexcept;
ZEBCORE_API std::string GenerateStackTrace();

// Installs a hook for every report (replacing any other); an empty function
// restores the standard-error report. Returns the previous hook.
using AssertionHook = std::function<void(const DebugDictionary&)>;
ZEBCORE_API AssertionHook SetAssertionHook(AssertionHook hook);

// Captures the reports made while it lives (from any thread).
//
//   ScopedAssertionCapture capture;
//   (void)(kTime_OneSecond / 0);
//   EXPECT_EQ(capture.Count(), 1u);
class ZEBCORE_API ScopedAssertionCapture {
 public:
  ScopedAssertionCapture();
  ~ScopedAssertionCapture();
  ScopedAssertionCapture(const ScopedAssertionCapture&) = delete;
  ScopedAssertionCapture& operator=(const ScopedAssertionCapture&) = delete;

  std::size_t Count() const;
  std::vector<DebugDictionary> Reports() const;
  // The message of the last report, or "" when there is none.
  std::string LastMessage() const;
  void Clear();

 private:
  mutable std::mutex mutex_;
  std::vector<DebugDictionary> reports_;
  AssertionHook previous_;
};

}  // namespace zebcore::debug
