// Localizer
//
// User-visible texts are asked for by key: "$$$/path=Default", a path, '=' and
// the English default. The host installs translations (path -> text); a key
// whose path has no translation gives its default, and a key with no '=' gives
// an empty text.
//
//   UTF16String s = Localizer::Get().Localize("$$$/zebmediatypes/RenderQuality/Draft=Draft");
#pragma once

#include <zebcore/export.h>
#include <zebcore/string.h>

#include <map>
#include <shared_mutex>
#include <string>
#include <string_view>

namespace zebcore::config {

class ZEBCORE_API Localizer {
 public:
  using Translations = std::map<std::string, UTF16String, std::less<>>;

  // The process-wide localizer.
  static Localizer& Get();

  // The translation of the key's path, or the default after the first '='.
  UTF16String Localize(std::string_view key) const;

  // Replaces the installed translations (keys are paths without "=Default").
  void InstallTranslations(Translations translations);
  void ClearTranslations();

 private:
  Localizer() = default;

  mutable std::shared_mutex mutex_;
  Translations translations_;
};

}  // namespace zebcore::config
