// CachedSerializer<T>: a two-way cache between values and their serialized text.
//
// One process-wide instance per type is the intended use. Each instance has its
// own (non-recursive) mutex; every operation takes it for its whole duration.
// T must be copyable and ordered by operator<.
#pragma once

#include <zebcore/string.h>

#include <map>
#include <mutex>
#include <optional>

namespace zebcore::serialization {

template <class T>
class CachedSerializer {
 public:
  // Enters the pair (text, value); an existing entry for either side is replaced.
  void Add(const UTF8String& text, const T& value) {
    std::lock_guard<std::mutex> lock(mutex_);
    EraseLocked(text, value);
    byText_.emplace(text, value);
    byValue_.emplace(value, text);
  }

  // The value cached for `text`, if any.
  std::optional<T> FindValue(const UTF8String& text) const {
    std::lock_guard<std::mutex> lock(mutex_);
    auto it = byText_.find(text);
    if (it == byText_.end()) return std::nullopt;
    return it->second;
  }

  // The text cached for `value`, if any.
  std::optional<UTF8String> FindText(const T& value) const {
    std::lock_guard<std::mutex> lock(mutex_);
    auto it = byValue_.find(value);
    if (it == byValue_.end()) return std::nullopt;
    return it->second;
  }

  // Removes every entry.
  void Clear() {
    std::lock_guard<std::mutex> lock(mutex_);
    byText_.clear();
    byValue_.clear();
  }

  std::size_t Size() const {
    std::lock_guard<std::mutex> lock(mutex_);
    return byText_.size();
  }

 private:
  void EraseLocked(const UTF8String& text, const T& value) {
    if (auto it = byText_.find(text); it != byText_.end()) {
      byValue_.erase(it->second);
      byText_.erase(it);
    }
    if (auto it = byValue_.find(value); it != byValue_.end()) {
      byText_.erase(it->second);
      byValue_.erase(it);
    }
  }

  mutable std::mutex mutex_;
  std::map<UTF8String, T> byText_;
  std::map<T, UTF8String> byValue_;
};

}  // namespace zebcore::serialization
