// Symbol visibility for libzebcore.so: the library is built with hidden
// visibility, and ZEBCORE_API marks what it exports.
#pragma once

#define ZEBCORE_API __attribute__((visibility("default")))
