// Binary data as text: standard base64 (RFC 4648, with '=' padding).
#pragma once

#include <zebcore/export.h>
#include <zebcore/string.h>

#include <cstddef>
#include <vector>

namespace zebcore::utility {

ZEBCORE_API UTF8String EncodeBinaryDataToUTF8String(const unsigned char* data, std::size_t size);

// Decodes `text` into `out` (replacing its contents). Returns false for text
// that is not base64 (a character outside the alphabet, a bad length or bad
// padding); `out` then holds the bytes of the complete groups before the fault.
ZEBCORE_API bool DecodeBinaryDataFromUTF8String(const UTF8String& text,
                                                std::vector<unsigned char>& out);

}  // namespace zebcore::utility
