// Symbol visibility for libzebscripting.so: the library is built with hidden
// visibility, and ZEBSCRIPTING_API marks what it exports.
#pragma once

#define ZEBSCRIPTING_API __attribute__((visibility("default")))
