// JSON text <-> the boost::any value model.
//
// Parsing runs nlohmann-json's SAX parser (which keeps its own explicit stack,
// so deep input cannot exhaust ours) and builds the values directly; printing is
// our own, so the text is fixed: compact, members in key order, integers exact,
// doubles in their shortest round-trip form.

#include <zebcore/assert.h>
#include <zebcore/json.h>

#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>
#include <nlohmann/json.hpp>
#include <string>

#include "utf_internal.h"

namespace zebcore::serialization {
namespace {

UTF8String ToUTF8(const std::string& s) {
  return UTF8String(reinterpret_cast<const unsigned char*>(s.data()), s.size());
}

// Builds the value model from SAX events. Any refusal (depth, an integer that
// does not fit, a non-finite number, a parse error) stops the parse.
class ValueBuilder final : public nlohmann::json_sax<nlohmann::json> {
 public:
  JSONValue TakeRoot() { return std::move(root_); }

  bool null() override { return Add(boost::any()); }
  bool boolean(bool val) override { return Add(val); }
  bool number_integer(number_integer_t val) override { return Add(static_cast<std::int64_t>(val)); }
  bool number_unsigned(number_unsigned_t val) override {
    if (val <= static_cast<std::uint64_t>(std::numeric_limits<std::int64_t>::max())) {
      return Add(static_cast<std::int64_t>(val));
    }
    return Add(static_cast<std::uint64_t>(val));
  }
  bool number_float(number_float_t val, const string_t& raw) override {
    // An integer literal too large for 64 bits arrives here as a double.
    if (raw.find_first_of(".eE") == string_t::npos) return false;
    if (!std::isfinite(val)) return false;
    return Add(static_cast<double>(val));
  }
  bool string(string_t& val) override { return Add(ToUTF8(val)); }
  bool binary(binary_t&) override { return false; }

  bool start_object(std::size_t) override { return Open(JSONObject()); }
  bool key(string_t& val) override {
    stack_.back().key = ToUTF8(val);
    return true;
  }
  bool end_object() override { return Close(); }
  bool start_array(std::size_t) override { return Open(JSONArray()); }
  bool end_array() override { return Close(); }

  bool parse_error(std::size_t, const std::string&, const nlohmann::detail::exception&) override {
    return false;
  }

 private:
  struct Frame {
    boost::any* container;
    bool isObject;
    UTF8String key;
  };

  boost::any* Insert(JSONValue value) {
    boost::any* stored = value.get();
    if (stack_.empty()) {
      root_ = std::move(value);
    } else if (Frame& top = stack_.back(); top.isObject) {
      // A repeated key keeps the last value.
      (*boost::any_cast<JSONObject>(top.container))[top.key] = std::move(value);
    } else {
      boost::any_cast<JSONArray>(top.container)->push_back(std::move(value));
    }
    return stored;
  }

  bool Add(boost::any value) {
    Insert(std::make_shared<boost::any>(std::move(value)));
    return true;
  }

  bool Open(boost::any container) {
    if (stack_.size() >= kMaxJSONDepth) return false;
    const bool isObject = container.type() == typeid(JSONObject);
    boost::any* stored = Insert(std::make_shared<boost::any>(std::move(container)));
    stack_.push_back(Frame{stored, isObject, {}});
    return true;
  }

  bool Close() {
    stack_.pop_back();
    return true;
  }

  JSONValue root_;
  std::vector<Frame> stack_;
};

// ---- printing ----

constexpr char kHex[] = "0123456789abcdef";

// The letter after '\\' for characters JSON escapes by name; 0 for the others.
constexpr char NamedEscape(unsigned char c) noexcept {
  switch (c) {
    case '"':
      return '"';
    case '\\':
      return '\\';
    case '\b':
      return 'b';
    case '\f':
      return 'f';
    case '\n':
      return 'n';
    case '\r':
      return 'r';
    case '\t':
      return 't';
    default:
      return 0;
  }
}

void AppendString(UTF8String& out, const unsigned char* p, std::size_t n) {
  out.push_back('"');
  std::size_t i = 0;
  while (i < n) {
    const unsigned char c = p[i];
    if (c >= 0x80) {
      // Invalid UTF-8 is written as U+FFFD, so the text is always valid JSON.
      const string::detail::DecodeResult r = string::detail::DecodeUTF8(p + i, n - i);
      if (r.valid) {
        out.append(p + i, r.length);
      } else {
        string::detail::AppendUTF8(out, r.codePoint);
      }
      i += r.length;
      continue;
    }
    if (const char named = NamedEscape(c)) {
      const unsigned char escape[2] = {'\\', static_cast<unsigned char>(named)};
      out.append(escape, 2);
    } else if (c < 0x20) {
      const unsigned char escape[6] = {'\\',
                                       'u',
                                       '0',
                                       '0',
                                       static_cast<unsigned char>(kHex[c >> 4]),
                                       static_cast<unsigned char>(kHex[c & 0xF])};
      out.append(escape, 6);
    } else {
      out.push_back(c);
    }
    ++i;
  }
  out.push_back('"');
}

void AppendAscii(UTF8String& out, std::string_view text) {
  out.append(reinterpret_cast<const unsigned char*>(text.data()), text.size());
}

template <class Integer>
void AppendInteger(UTF8String& out, Integer value) {
  std::array<char, 24> buffer;
  const auto r = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
  AppendAscii(out,
              std::string_view(buffer.data(), static_cast<std::size_t>(r.ptr - buffer.data())));
}

void AppendDouble(UTF8String& out, double value) {
  if (!std::isfinite(value)) {  // JSON has no form for these
    AppendAscii(out, "null");
    return;
  }
  std::array<char, 32> buffer;
  const auto r = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value);
  std::string_view text(buffer.data(), static_cast<std::size_t>(r.ptr - buffer.data()));
  AppendAscii(out, text);
  // Keep it a double when read back: "25" would come back as an integer.
  if (text.find_first_of(".e") == std::string_view::npos) AppendAscii(out, ".0");
}

void Newline(UTF8String& out, bool pretty, std::size_t depth) {
  if (!pretty) return;
  out.push_back('\n');
  out.append(2 * depth, ' ');
}

void AppendValue(UTF8String& out, const boost::any& value, bool pretty, std::size_t depth) {
  const std::type_info& type = value.type();
  const bool nests =
      type == typeid(JSONObject) || type == typeid(JSONArray) || type == typeid(JSONValue);
  if (nests && depth >= kMaxJSONDepth) {
    // Deeper than any text that would be read back (or a value that contains
    // itself): the text stays readable, the deep part becomes null.
    debug::ReportAssertion("depth < kMaxJSONDepth", "JSON value nested too deeply to print",
                           __FILE__, "zebcore::serialization::GetJSONUTF8String", __LINE__);
    AppendAscii(out, "null");
    return;
  }
  if (value.empty()) {
    AppendAscii(out, "null");
  } else if (type == typeid(JSONObject)) {
    const auto& object = *boost::any_cast<JSONObject>(&value);
    out.push_back('{');
    bool first = true;
    for (const auto& [key, member] : object) {
      if (!first) out.push_back(',');
      first = false;
      Newline(out, pretty, depth + 1);
      AppendString(out, key.data(), key.size());
      out.push_back(':');
      if (pretty) out.push_back(' ');
      if (member) {
        AppendValue(out, *member, pretty, depth + 1);
      } else {
        AppendAscii(out, "null");
      }
    }
    if (!object.empty()) Newline(out, pretty, depth);
    out.push_back('}');
  } else if (type == typeid(JSONArray)) {
    const auto& array = *boost::any_cast<JSONArray>(&value);
    out.push_back('[');
    bool first = true;
    for (const auto& element : array) {
      if (!first) out.push_back(',');
      first = false;
      Newline(out, pretty, depth + 1);
      if (element) {
        AppendValue(out, *element, pretty, depth + 1);
      } else {
        AppendAscii(out, "null");
      }
    }
    if (!array.empty()) Newline(out, pretty, depth);
    out.push_back(']');
  } else if (type == typeid(JSONValue)) {
    const auto& inner = *boost::any_cast<JSONValue>(&value);
    if (inner) {
      AppendValue(out, *inner, pretty, depth + 1);  // counted, so a self-reference ends
    } else {
      AppendAscii(out, "null");
    }
  } else if (type == typeid(std::int64_t)) {
    AppendInteger(out, boost::any_cast<std::int64_t>(value));
  } else if (type == typeid(std::uint64_t)) {
    AppendInteger(out, boost::any_cast<std::uint64_t>(value));
  } else if (type == typeid(int)) {
    AppendInteger(out, boost::any_cast<int>(value));
  } else if (type == typeid(unsigned int)) {
    AppendInteger(out, boost::any_cast<unsigned int>(value));
  } else if (type == typeid(long long)) {
    AppendInteger(out, boost::any_cast<long long>(value));
  } else if (type == typeid(unsigned long long)) {
    AppendInteger(out, boost::any_cast<unsigned long long>(value));
  } else if (type == typeid(double)) {
    AppendDouble(out, boost::any_cast<double>(value));
  } else if (type == typeid(float)) {
    AppendDouble(out, static_cast<double>(boost::any_cast<float>(value)));
  } else if (type == typeid(bool)) {
    AppendAscii(out, boost::any_cast<bool>(value) ? "true" : "false");
  } else if (type == typeid(UTF8String)) {
    const auto& s = *boost::any_cast<UTF8String>(&value);
    AppendString(out, s.data(), s.size());
  } else if (type == typeid(std::string)) {
    const auto& s = *boost::any_cast<std::string>(&value);
    AppendString(out, reinterpret_cast<const unsigned char*>(s.data()), s.size());
  } else {
    AppendAscii(out, "null");
  }
}

}  // namespace

JSONValue JSONParse(const unsigned char* bytes, std::size_t count) {
  if (bytes == nullptr || count == 0) return nullptr;
  if (const void* zero = std::memchr(bytes, 0, count)) {
    count = static_cast<std::size_t>(static_cast<const unsigned char*>(zero) - bytes);
  }
  try {
    ValueBuilder builder;
    const char* first = reinterpret_cast<const char*>(bytes);
    const bool ok = nlohmann::json::sax_parse(first, first + count, &builder,
                                              nlohmann::json::input_format_t::json, true);
    if (!ok) return nullptr;
    return builder.TakeRoot();
  } catch (...) {  // out of memory, or anything else: not a document
    return nullptr;
  }
}

JSONValue JSONParse(const UTF8String& text) { return JSONParse(text.data(), text.size()); }

UTF8String GetJSONUTF8String(const boost::any& value, bool pretty) {
  UTF8String out;
  AppendValue(out, value, pretty, 0);
  return out;
}

bool AddToObject(boost::any& object, const UTF8String& key, boost::any value, bool replace) {
  if (object.empty()) object = JSONObject();
  auto* members = boost::any_cast<JSONObject>(&object);
  if (members == nullptr) {
    debug::ReportAssertion("object holds a JSONObject", "AddToObject on a value that is no object",
                           __FILE__, "zebcore::serialization::AddToObject", __LINE__);
    return false;
  }
  auto it = members->find(key);
  if (it != members->end()) {
    if (!replace) return false;
    it->second = std::make_shared<boost::any>(std::move(value));
    return true;
  }
  members->emplace(key, std::make_shared<boost::any>(std::move(value)));
  return true;
}

bool AddToObject(boost::any& object, std::string_view key, boost::any value, bool replace) {
  return AddToObject(object, string::ToUTF8String(key), std::move(value), replace);
}

bool ObjectHasProperty(const boost::any& object, std::string_view key) {
  const auto* members = boost::any_cast<JSONObject>(&object);
  return members != nullptr && members->count(string::ToUTF8String(key)) != 0;
}

JSONValue GetVariantInObject(const boost::any& object, std::string_view key) {
  const auto* members = boost::any_cast<JSONObject>(&object);
  if (members == nullptr) return nullptr;
  auto it = members->find(string::ToUTF8String(key));
  return it == members->end() ? nullptr : it->second;
}

bool GetJSONInt64(const boost::any& value, std::int64_t& out) noexcept {
  if (const auto* i = boost::any_cast<std::int64_t>(&value)) {
    out = *i;
    return true;
  }
  if (const auto* u = boost::any_cast<std::uint64_t>(&value)) {
    if (*u > static_cast<std::uint64_t>(std::numeric_limits<std::int64_t>::max())) return false;
    out = static_cast<std::int64_t>(*u);
    return true;
  }
  if (const auto* i = boost::any_cast<int>(&value)) {
    out = *i;
    return true;
  }
  if (const auto* u = boost::any_cast<unsigned int>(&value)) {
    out = *u;
    return true;
  }
  return false;
}

}  // namespace zebcore::serialization
