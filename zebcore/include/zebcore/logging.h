// Logging, tracing and usage events, each with a pluggable sink.
//
// Nothing here returns a result to act on: a record is handed to the sink that
// is installed, or dropped when there is none (logging and tracing are then
// disabled).
#pragma once

#include <zebcore/export.h>

#include <boost/any.hpp>
#include <boost/shared_ptr.hpp>
#include <exception>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace zebcore::logging {

// A structured log record: a message, named fields whose values are JSON
// values (int64, bool, UTF8String...), and where it came from.
struct LogRecord {
  std::string message;
  std::vector<std::pair<std::string, boost::any>> fields;
  std::string source;
  std::string function;
};

using LogSink = std::function<void(const LogRecord&)>;
// Installs the log sink (an empty function disables logging). Returns the old one.
ZEBCORE_API LogSink SetLogSink(LogSink sink);
ZEBCORE_API bool LoggingIsEnabled() noexcept;

// Hands the record to the log sink. When the trace category
// "zebcore.StructuredLogging" is enabled at level 4 the record is also traced
// as one line: the message, then ", <name>: <value as JSON text>" per field, then
// "\r\n".
ZEBCORE_API void Log(const LogRecord& record);

// Logs an exception caught in `context`; the record's message is the
// exception's what(), its source the context.
ZEBCORE_API void LogException(std::string_view context, const std::exception& error);
ZEBCORE_API void LogException(std::string_view context, std::string_view what);

using TraceSink = std::function<void(std::string_view category, int level, std::string_view text)>;
// Installs the trace sink and the highest level traced for every category.
ZEBCORE_API TraceSink SetTraceSink(TraceSink sink, int maxLevel);
ZEBCORE_API bool TraceEnabled(std::string_view category, int level) noexcept;
ZEBCORE_API void Trace(std::string_view category, int level, std::string_view text);

}  // namespace zebcore::logging

namespace zebcore::config {

// Usage events: (area, category, event) triples for product analytics.
class ZEBCORE_API UsageLogger {
 public:
  virtual ~UsageLogger() = default;
  virtual void LogEvent(std::string_view area, std::string_view category,
                        std::string_view event) = 0;

  // The installed logger, or null when the host installed none.
  static boost::shared_ptr<UsageLogger> Get();
  // Installs `logger` (null removes it). Returns the previous one.
  static boost::shared_ptr<UsageLogger> Set(boost::shared_ptr<UsageLogger> logger);
};

}  // namespace zebcore::config
