// UTF-16 text streams.
//
// libstdc++ cannot format numbers into a std::basic_ostream<char16_t> (its
// num_put facet is missing and it throws bad_cast), so the family's wide streams
// are small classes of their own: numbers are formatted narrow, with the C
// locale and the default stream formatting (six significant digits for
// doubles), and widened.
#pragma once

#include <zebcore/export.h>
#include <zebcore/string.h>

#include <cstdint>
#include <string>
#include <string_view>

namespace zebcore::string {

// An output stream of UTF-16 text. Subclasses say where the text goes.
class ZEBCORE_API UTF16OStream {
 public:
  virtual ~UTF16OStream() = default;

  UTF16OStream& operator<<(std::u16string_view text) {
    Write(text);
    return *this;
  }
  UTF16OStream& operator<<(const UTF16String& text) {
    Write(View(text));
    return *this;
  }
  // A null pointer writes nothing.
  UTF16OStream& operator<<(const char16_t* text) {
    if (text) Write(std::u16string_view(text));
    return *this;
  }
  UTF16OStream& operator<<(char16_t c) {
    Write(std::u16string_view(&c, 1));
    return *this;
  }
  // A narrow character is a character, not a number: ' ' writes a space. Bytes
  // above 0x7F (parts of a UTF-8 sequence) become U+FFFD.
  UTF16OStream& operator<<(char c) {
    const auto b = static_cast<unsigned char>(c);
    return *this << (b < 0x80 ? static_cast<char16_t>(b) : u'\uFFFD');
  }
  // Narrow text is taken as UTF-8.
  UTF16OStream& operator<<(std::string_view utf8);
  UTF16OStream& operator<<(const char* utf8) {
    return utf8 ? *this << std::string_view(utf8) : *this;
  }
  UTF16OStream& operator<<(const std::string& utf8) { return *this << std::string_view(utf8); }
  UTF16OStream& operator<<(int v) { return *this << static_cast<long long>(v); }
  UTF16OStream& operator<<(unsigned int v) { return *this << static_cast<unsigned long long>(v); }
  UTF16OStream& operator<<(long v) { return *this << static_cast<long long>(v); }
  UTF16OStream& operator<<(unsigned long v) { return *this << static_cast<unsigned long long>(v); }
  UTF16OStream& operator<<(long long v);
  UTF16OStream& operator<<(unsigned long long v);
  UTF16OStream& operator<<(double v);
  UTF16OStream& operator<<(bool v) = delete;  // say what a bool means in words
  // Manipulators: `out << endl` writes "\n" and flushes.
  UTF16OStream& operator<<(UTF16OStream& (*manip)(UTF16OStream&)) { return manip(*this); }

  virtual void Flush() {}

 protected:
  virtual void Write(std::u16string_view text) = 0;
};

ZEBCORE_API UTF16OStream& endl(UTF16OStream& out);
ZEBCORE_API UTF16OStream& flush(UTF16OStream& out);

// Collects what is written; str() gives it back.
class ZEBCORE_API oUTF16StringStream final : public UTF16OStream {
 public:
  const UTF16String& str() const noexcept { return text_; }
  void str(UTF16String text) { text_ = std::move(text); }

 protected:
  void Write(std::u16string_view text) override { text_.append(text.data(), text.size()); }

 private:
  UTF16String text_;
};

// Reads white-space separated tokens and numbers from UTF-16 text. A failed
// read sets the failure state, leaves the target unchanged and makes every
// later read fail too, like a standard stream.
class ZEBCORE_API iUTF16StringStream {
 public:
  explicit iUTF16StringStream(UTF16String text) : text_(std::move(text)) {}

  iUTF16StringStream& operator>>(UTF16String& token);
  iUTF16StringStream& operator>>(double& value);
  iUTF16StringStream& operator>>(std::int64_t& value);

  explicit operator bool() const noexcept { return !failed_; }
  bool eof() const noexcept { return pos_ >= text_.size(); }
  // The text that has not been read yet.
  std::u16string_view rest() const noexcept {
    return std::u16string_view(text_).substr(pos_ < text_.size() ? pos_ : text_.size());
  }

 private:
  bool NextToken(UTF16String& token);

  UTF16String text_;
  std::size_t pos_ = 0;
  bool failed_ = false;
};

}  // namespace zebcore::string
