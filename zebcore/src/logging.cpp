// Logging, tracing and the usage logger.

#include <zebcore/json.h>
#include <zebcore/logging.h>

#include <mutex>

namespace zebcore::logging {
namespace {

constexpr std::string_view kStructuredLoggingCategory = "zebcore.StructuredLogging";
constexpr int kStructuredLoggingLevel = 4;

// Sinks are copied out under the mutex and called outside it, so a sink may
// log, trace or install another sink.
struct Sinks {
  std::mutex mutex;
  LogSink log;
  TraceSink trace;
  int maxLevel = 0;
};

// Never destroyed, so records from static destructors at exit are safe.
Sinks& State() {
  static Sinks* const sinks = new Sinks;
  return *sinks;
}

std::string StructuredLine(const LogRecord& record) {
  std::string line = record.message;
  for (const auto& [name, value] : record.fields) {
    line += ", ";
    line += name;
    line += ": ";
    line += string::ToStdString(serialization::GetJSONUTF8String(value, false));
  }
  line += "\r\n";
  return line;
}

}  // namespace

LogSink SetLogSink(LogSink sink) {
  Sinks& state = State();
  std::lock_guard<std::mutex> lock(state.mutex);
  std::swap(state.log, sink);
  return sink;
}

bool LoggingIsEnabled() noexcept {
  Sinks& state = State();
  std::lock_guard<std::mutex> lock(state.mutex);
  return static_cast<bool>(state.log);
}

void Log(const LogRecord& record) {
  LogSink sink;
  {
    Sinks& state = State();
    std::lock_guard<std::mutex> lock(state.mutex);
    sink = state.log;
  }
  if (sink) sink(record);
  if (TraceEnabled(kStructuredLoggingCategory, kStructuredLoggingLevel)) {
    Trace(kStructuredLoggingCategory, kStructuredLoggingLevel, StructuredLine(record));
  }
}

void LogException(std::string_view context, const std::exception& error) {
  LogException(context, std::string_view(error.what()));
}

void LogException(std::string_view context, std::string_view what) {
  LogRecord record;
  record.message = std::string(what);
  record.source = std::string(context);
  Log(record);
}

TraceSink SetTraceSink(TraceSink sink, int maxLevel) {
  Sinks& state = State();
  std::lock_guard<std::mutex> lock(state.mutex);
  std::swap(state.trace, sink);
  state.maxLevel = maxLevel;
  return sink;
}

bool TraceEnabled(std::string_view, int level) noexcept {
  Sinks& state = State();
  std::lock_guard<std::mutex> lock(state.mutex);
  return state.trace && level <= state.maxLevel;
}

void Trace(std::string_view category, int level, std::string_view text) {
  TraceSink sink;
  {
    Sinks& state = State();
    std::lock_guard<std::mutex> lock(state.mutex);
    if (!state.trace || level > state.maxLevel) return;
    sink = state.trace;
  }
  sink(category, level, text);
}

}  // namespace zebcore::logging

namespace zebcore::config {
namespace {

struct UsageState {
  std::mutex mutex;
  boost::shared_ptr<UsageLogger> logger;
};

UsageState& Usage() {
  static UsageState* const state = new UsageState;
  return *state;
}

}  // namespace

boost::shared_ptr<UsageLogger> UsageLogger::Get() {
  UsageState& state = Usage();
  std::lock_guard<std::mutex> lock(state.mutex);
  return state.logger;
}

boost::shared_ptr<UsageLogger> UsageLogger::Set(boost::shared_ptr<UsageLogger> logger) {
  UsageState& state = Usage();
  std::lock_guard<std::mutex> lock(state.mutex);
  state.logger.swap(logger);
  return logger;
}

}  // namespace zebcore::config
