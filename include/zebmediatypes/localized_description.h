// LocalizedDescription: the flag every description function takes.
#pragma once

namespace zebmediatypes {

// 1 asks for the text from the localizer (the host's translation, or the
// English default of its key); any other value asks for the plain built-in
// English text where the function has one.
using LocalizedDescription = int;

}  // namespace zebmediatypes
