// The process-wide localizer.

#include <zebcore/localizer.h>

#include <mutex>

namespace zebcore::config {

// Never destroyed: a library that unloads at exit may still ask for texts.
Localizer& Localizer::Get() {
  static Localizer* const instance = new Localizer;
  return *instance;
}

UTF16String Localizer::Localize(std::string_view key) const {
  const std::size_t equals = key.find('=');
  if (equals == std::string_view::npos) return {};
  const std::string_view path = key.substr(0, equals);
  {
    std::shared_lock<std::shared_mutex> lock(mutex_);
    if (auto it = translations_.find(path); it != translations_.end()) return it->second;
  }
  return string::UTF8to16(key.substr(equals + 1));
}

void Localizer::InstallTranslations(Translations translations) {
  std::unique_lock<std::shared_mutex> lock(mutex_);
  translations_.swap(translations);
}

void Localizer::ClearTranslations() {
  Translations old;
  std::unique_lock<std::shared_mutex> lock(mutex_);
  translations_.swap(old);
}

}  // namespace zebcore::config
