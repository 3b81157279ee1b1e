// Symbol visibility for libzebmediatypes.so: the library is built with hidden
// visibility; ZEBMEDIATYPES_API marks the public API.
#pragma once

#define ZEBMEDIATYPES_API __attribute__((visibility("default")))
