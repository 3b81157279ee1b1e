// Reads fuzzed JSON text as a TimeDisplay and as a TimeRange. A member of the
// wrong JSON type raises boost::bad_any_cast by contract; anything else must
// not escape, crash or leak. What is read is written and read again and must
// compare equal.
#include <zebcore/json.h>
#include <zebmediatypes/time_display.h>
#include <zebmediatypes/time_range.h>

#include <boost/any.hpp>
#include <cstddef>
#include <cstdint>

namespace media = zebmediatypes;
using zebcore::serialization::JSONConvert;

namespace {

template <class T>
void ReadWriteRead(const boost::any& value) {
  T first;
  try {
    first = JSONConvert<T>::FromJSON(value);
  } catch (const boost::bad_any_cast&) {
    return;
  }
  const T second = JSONConvert<T>::FromJSON(JSONConvert<T>::ToJSON(first));
  if (!(second == first)) __builtin_trap();
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const zebcore::serialization::JSONValue value = zebcore::serialization::JSONParse(data, size);
  const boost::any empty;
  const boost::any& json = value ? *value : empty;
  ReadWriteRead<media::TimeDisplay>(json);
  ReadWriteRead<media::TimeRange>(json);
  return 0;
}
