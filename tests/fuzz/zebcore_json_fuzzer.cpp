// Fuzzes the JSON reader: any bytes give null or a value whose printed text
// reads back and prints the same.

#include <zebcore/json.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  using namespace zebcore::serialization;
  const JSONValue value = JSONParse(data, size);
  if (!value) return 0;
  const zebcore::UTF8String text = GetJSONUTF8String(*value, false);
  const JSONValue again = JSONParse(text);
  if (!again || GetJSONUTF8String(*again, false) != text) std::abort();
  const JSONValue pretty = JSONParse(GetJSONUTF8String(*value, true));
  if (!pretty || GetJSONUTF8String(*pretty, false) != text) std::abort();
  return 0;
}
