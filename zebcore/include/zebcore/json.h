// JSON values and text.
//
// A JSON document is a `JSONValue`, a std::shared_ptr<boost::any> that holds one
// of:
//   JSONObject    (object: UTF-8 key -> value, ordered by key)
//   JSONArray     (array)
//   std::int64_t  (an integer that fits; negative integers always)
//   std::uint64_t (a non-negative integer above INT64_MAX)
//   double        (a number with a fraction or an exponent)
//   bool
//   UTF8String    (string)
//   nothing       (JSON null: an empty boost::any)
//
// JSON text is untrusted input: JSONParse never throws and never recurses on the
// input; it returns null for text that is not one well-formed JSON document,
// that nests deeper than kMaxJSONDepth, that holds an integer outside the 64-bit
// ranges or a number outside the double range.
#pragma once

#include <zebcore/export.h>
#include <zebcore/string.h>

#include <boost/any.hpp>
#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <vector>

namespace zebcore::serialization {

using JSONValue = std::shared_ptr<boost::any>;
using JSONObject = std::map<UTF8String, JSONValue, std::less<UTF8String>,
                            allocator::STLAllocator<std::pair<const UTF8String, JSONValue>>>;
using JSONArray = std::vector<JSONValue, allocator::STLAllocator<JSONValue>>;

inline constexpr std::size_t kMaxJSONDepth = 128;

// Parses `count` bytes at `bytes`. A terminating zero byte inside the range
// ends the text (callers may pass the length plus one). Null on any failure.
// A key that appears twice in an object keeps its last value.
ZEBCORE_API JSONValue JSONParse(const unsigned char* bytes, std::size_t count);
ZEBCORE_API JSONValue JSONParse(const UTF8String& text);

// Prints `value` as JSON text: members in key order, no white space unless
// `pretty` is true (then two-space indents). Integers are exact; a double is
// written in its shortest form that reads back to the same bits, always with a
// '.' or an exponent; NaN and infinities print null. Strings are escaped, and
// invalid UTF-8 in them is written as U+FFFD. Besides the types above, int,
// unsigned int, long long, unsigned long long, float, std::string and a nested
// JSONValue print as their JSON forms; any other type prints null. Containers
// nested deeper than kMaxJSONDepth (or a value that contains itself) print null
// there and are reported as a contract breach.
ZEBCORE_API UTF8String GetJSONUTF8String(const boost::any& value, bool pretty);

// Adds `key` -> `value` to `object`, which must hold a JSONObject (if it is
// empty it becomes one). An existing member is replaced only when `replace` is
// true. Returns whether the member was stored.
ZEBCORE_API bool AddToObject(boost::any& object, const UTF8String& key, boost::any value,
                             bool replace);
ZEBCORE_API bool AddToObject(boost::any& object, std::string_view key, boost::any value,
                             bool replace);

// Whether `object` holds a JSONObject with member `key`.
ZEBCORE_API bool ObjectHasProperty(const boost::any& object, std::string_view key);

// The member `key` of `object`, or null when `object` is not an object or has
// no such member.
ZEBCORE_API JSONValue GetVariantInObject(const boost::any& object, std::string_view key);

// Reads an integer member value: true and `out` set when `value` holds an
// int64, a uint64 that fits in int64, an int or an unsigned int; otherwise
// false and `out` unchanged.
ZEBCORE_API bool GetJSONInt64(const boost::any& value, std::int64_t& out) noexcept;

// The JSON form of a type, specialized next to the type:
//
//   template <> struct JSONConvert<MyType> {
//     static boost::any ToJSON(const MyType&);
//     static MyType FromJSON(const boost::any&);
//   };
template <class T>
struct JSONConvert;

template <class T>
UTF8String ToJSONText(const T& value) {
  return GetJSONUTF8String(JSONConvert<T>::ToJSON(value), false);
}

}  // namespace zebcore::serialization
