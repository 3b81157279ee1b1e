// ThrowError.

#include <zebcore/error.h>
#include <zebcore/localizer.h>

namespace zebcore::config {

void ThrowError(std::string_view key) {
  const std::string message = string::UTF16toNarrow(string::View(Localizer::Get().Localize(key)));
  throw Error(std::string(key), message);
}

}  // namespace zebcore::config
