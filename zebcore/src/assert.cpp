// The assertion service: reports go to the installed hook or to standard error.

#include <execinfo.h>
#include <zebcore/assert.h>

#include <cstdio>
#include <cstdlib>
#include <memory>

namespace zebcore::debug {
namespace {

// The hook is called while this (recursive) mutex is held, so replacing it
// waits for reports in flight, and a capture never receives a report after it
// is gone. A hook may itself report.
struct HookState {
  std::recursive_mutex mutex;
  AssertionHook hook;
};

// Never destroyed: reports may come from static destructors at exit.
HookState& Hooks() {
  static HookState* const state = new HookState;
  return *state;
}

std::string Text(const DebugDictionary& report, const char* key) {
  auto it = report.find(key);
  return it == report.end() ? std::string() : it->second;
}

}  // namespace

DebugDictionary CreateDebugDictionary(const char* expression, const char* message,
                                      const char* source, const char* function, int line) {
  return DebugDictionary{{kDebugExpression, expression ? expression : ""},
                         {kDebugMessage, message ? message : ""},
                         {kDebugSource, source ? source : ""},
                         {kDebugFunction, function ? function : ""},
                         {kDebugLine, std::to_string(line)}};
}

void ReportAssertion(const DebugDictionary& report) {
  HookState& state = Hooks();
  std::lock_guard<std::recursive_mutex> lock(state.mutex);
  if (state.hook) {
    state.hook(report);
    return;
  }
  const std::string text = "ASSERT: " + Text(report, kDebugMessage) + " (" +
                           Text(report, kDebugExpression) + ") in " + Text(report, kDebugFunction) +
                           " [" + Text(report, kDebugSource) + ":" + Text(report, kDebugLine) +
                           "]\n";
  std::fwrite(text.data(), 1, text.size(), stderr);
  std::fflush(stderr);
}

void ReportAssertion(const char* expression, const char* message, const char* source,
                     const char* function, int line) {
  ReportAssertion(CreateDebugDictionary(expression, message, source, function, line));
}

bool IsDebuggerAttached() noexcept { return false; }

bool BreakAfterAssertDialog(const DebugDictionary&) noexcept { return false; }

std::string GenerateStackTrace() {
  void* frames[64];
  const int count = ::backtrace(frames, 64);
  if (count <= 0) return {};
  std::unique_ptr<char*, decltype(&std::free)> symbols(::backtrace_symbols(frames, count),
                                                       &std::free);
  if (!symbols) return {};
  std::string out;
  for (int i = 0; i < count; ++i) {
    out += symbols.get()[i];
    out += '\n';
  }
  return out;
}

AssertionHook SetAssertionHook(AssertionHook hook) {
  HookState& state = Hooks();
  std::lock_guard<std::recursive_mutex> lock(state.mutex);
  std::swap(state.hook, hook);
  return hook;
}

ScopedAssertionCapture::ScopedAssertionCapture() {
  previous_ = SetAssertionHook([this](const DebugDictionary& report) {
    std::lock_guard<std::mutex> lock(mutex_);
    reports_.push_back(report);
  });
}

ScopedAssertionCapture::~ScopedAssertionCapture() { SetAssertionHook(std::move(previous_)); }

std::size_t ScopedAssertionCapture::Count() const {
  std::lock_guard<std::mutex> lock(mutex_);
  return reports_.size();
}

std::vector<DebugDictionary> ScopedAssertionCapture::Reports() const {
  std::lock_guard<std::mutex> lock(mutex_);
  return reports_;
}

std::string ScopedAssertionCapture::LastMessage() const {
  std::lock_guard<std::mutex> lock(mutex_);
  return reports_.empty() ? std::string() : Text(reports_.back(), kDebugMessage);
}

void ScopedAssertionCapture::Clear() {
  std::lock_guard<std::mutex> lock(mutex_);
  reports_.clear();
}

}  // namespace zebcore::debug
