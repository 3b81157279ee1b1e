// Colour texts (JSON), the colour-space cache, the default colour space and
// the serialized-text caches.
#include <zebcore/assert.h>
#include <zebcore/binary_text.h>
#include <zebcore/json.h>
#include <zebcore/logging.h>
#include <zebcore/mutex.h>
#include <zebmediatypes/color/color_serialization.h>

#include <atomic>
#include <boost/any.hpp>
#include <cstdint>
#include <cstring>
#include <limits>
#include <map>
#include <optional>
#include <string_view>
#include <vector>

#include "color/color_state.h"

namespace zebmediatypes {
namespace {

using zebcore::UTF8String;
using zebcore::serialization::JSONObject;
using zebcore::serialization::JSONValue;
using zebcore::utility::Guid;

constexpr std::string_view kWrapperKey = "SerializerWrappedObject";
constexpr std::string_view kBaseColorProfileKey = "baseColorProfile";
constexpr std::string_view kBaseProfileTypeKey = "baseProfileType";
constexpr std::string_view kColorSpaceLinearizedKey = "colorSpaceLinearized";
constexpr std::string_view kColorProfileNameKey = "colorProfileName";
constexpr std::string_view kColorProfileDataKey = "colorProfileData";
constexpr std::string_view kGraphicsWhiteLuminanceKey = "graphicsWhiteLuminance";
constexpr std::string_view kLUTInterpolationMethodKey = "lutInterpolationMethod";
constexpr std::string_view kColorManagementSystemKey = "colorManagementSystem";
constexpr std::string_view kOCIOConfigurationFileKey = "ocioConfigurationFile";
constexpr std::string_view kAutoToneMapEnabledKey = "autoToneMapEnabled";

// ---------------------------------------------------------------------------
// Process-wide state. Built on first use and never destroyed, so that the
// start-up registrar's terminate function, which may run from a static
// destructor at unload, still finds it.

struct ColorState {
  zebcore::threads::RecursiveMutex lock{nullptr};
  std::map<Guid, color::ColorSpace, std::less<Guid>,
           zebcore::allocator::STLAllocator<std::pair<const Guid, color::ColorSpace>>>
      cache;
  color::ColorSpace defaultSpace;
};

ColorState& State() {
  static ColorState* const state = new ColorState();
  return *state;
}

std::atomic<unsigned int>& LockWait() {
  static std::atomic<unsigned int> wait{60000};
  return wait;
}

void LogUsageEvent(std::string_view event) noexcept {
  try {
    if (auto logger = zebcore::config::UsageLogger::Get()) {
      logger->LogEvent("ColorSpace", "Serialization", event);
    }
  } catch (...) {
    // A logger that fails must not turn a handled failure into a thrown one.
  }
}

// ---------------------------------------------------------------------------
// Reading member values. Each returns false when the value makes the read fail.

// An integer from -2^31 to 2^32-1, kept as its low 32 bits. Anything wider
// would lose its high half silently, so it fails.
bool ReadUInt32(const boost::any& value, std::uint32_t& out) noexcept {
  if (const auto* signedValue = boost::any_cast<std::int64_t>(&value)) {
    if (*signedValue < std::numeric_limits<std::int32_t>::min() ||
        *signedValue > static_cast<std::int64_t>(std::numeric_limits<std::uint32_t>::max())) {
      return false;
    }
    out = static_cast<std::uint32_t>(static_cast<std::uint64_t>(*signedValue));
    return true;
  }
  if (const auto* unsignedValue = boost::any_cast<std::uint64_t>(&value)) {
    if (*unsignedValue > std::numeric_limits<std::uint32_t>::max()) return false;
    out = static_cast<std::uint32_t>(*unsignedValue);
    return true;
  }
  return false;
}

bool ReadBool(const boost::any& value, bool& out) noexcept {
  if (const auto* b = boost::any_cast<bool>(&value)) {
    out = *b;
    return true;
  }
  if (const auto* i = boost::any_cast<std::int64_t>(&value)) {
    out = *i != 0;
    return true;
  }
  if (const auto* u = boost::any_cast<std::uint64_t>(&value)) {
    out = *u != 0;
    return true;
  }
  if (const auto* s = boost::any_cast<UTF8String>(&value)) {
    const std::string_view text = zebcore::string::View(*s);
    if (text == "true") {
      out = true;
      return true;
    }
    if (text == "false") {
      out = false;
      return true;
    }
  }
  return false;
}

// A string is taken as it is; a value of any other kind reads as empty.
UTF8String ReadString(const boost::any& value) {
  if (const auto* s = boost::any_cast<UTF8String>(&value)) return *s;
  return {};
}

// The member `key` of `object`, or null when absent. Objects read here are
// small; a scan spares building a key string for each lookup.
const JSONValue* MemberSlot(const JSONObject& object, std::string_view key) noexcept {
  for (const auto& [name, value] : object) {
    if (zebcore::string::View(name) == key) return value ? &value : nullptr;
  }
  return nullptr;
}

const boost::any* Member(const JSONObject& object, std::string_view key) noexcept {
  const JSONValue* slot = MemberSlot(object, key);
  return slot == nullptr ? nullptr : slot->get();
}

template <class Enum>
bool ReadEnumMember(const JSONObject& object, std::string_view key, Enum& field) noexcept {
  const boost::any* value = Member(object, key);
  if (value == nullptr) return true;
  std::uint32_t bits = 0;
  if (!ReadUInt32(*value, bits)) return false;
  field = static_cast<Enum>(bits);
  return true;
}

bool ReadBoolMember(const JSONObject& object, std::string_view key, bool& field) noexcept {
  const boost::any* value = Member(object, key);
  return value == nullptr || ReadBool(*value, field);
}

// Parses the text (with its terminating zero, as the core reader expects) and
// unwraps a "SerializerWrappedObject". Null unless there is an object to read.
JSONValue ParseDocument(const UTF8String& text) {
  JSONValue document = zebcore::serialization::JSONParse(text.c_str(), text.size() + 1);
  if (!document) return nullptr;
  if (const auto* outer = boost::any_cast<JSONObject>(document.get())) {
    const JSONValue* wrapped = MemberSlot(*outer, kWrapperKey);
    if (wrapped != nullptr && !(*wrapped)->empty()) {
      JSONValue inner = *wrapped;  // keeps the value alive past the outer document
      document = std::move(inner);
    }
  }
  if (boost::any_cast<JSONObject>(document.get()) == nullptr) return nullptr;
  return document;
}

bool ReadProfile(const JSONObject& object, ColorProfile& profile) {
  if (const boost::any* name = Member(object, kColorProfileNameKey)) {
    profile.colorProfileName = ReadString(*name);
  }
  if (const boost::any* data = Member(object, kColorProfileDataKey)) {
    // A value that is not a string reads as empty text: a block of 0 bytes.
    static const UTF8String kNoText;
    const auto* encoded = boost::any_cast<UTF8String>(data);
    std::vector<unsigned char> bytes;
    if (!zebcore::utility::DecodeBinaryDataFromUTF8String(encoded ? *encoded : kNoText, bytes)) {
      return false;  // corrupt profile bytes are never kept
    }
    auto block = zebcore::allocator::RecycledMemory::Create(0);
    unsigned char* target = block->Allocate(bytes.size());
    if (!bytes.empty()) std::memcpy(target, bytes.data(), bytes.size());
    profile.colorProfileData = std::move(block);
  }
  return true;
}

std::optional<color::ColorSpace> ReadColorSpace(const UTF8String& text) {
  const JSONValue document = ParseDocument(text);
  if (!document) return std::nullopt;
  const JSONObject& object = *boost::any_cast<JSONObject>(document.get());
  color::ColorSpace space;
  if (const boost::any* profile = Member(object, kBaseColorProfileKey)) {
    const auto* profileObject = boost::any_cast<JSONObject>(profile);
    if (profileObject == nullptr || !ReadProfile(*profileObject, space.baseColorProfile)) {
      return std::nullopt;
    }
  }
  if (!ReadEnumMember(object, kBaseProfileTypeKey, space.baseProfileType) ||
      !ReadBoolMember(object, kColorSpaceLinearizedKey, space.colorSpaceLinearized)) {
    return std::nullopt;
  }
  return space;
}

// ---------------------------------------------------------------------------
// Writing.

void AddMember(boost::any& object, std::string_view key, boost::any value) {
  zebcore::serialization::AddToObject(object, key, std::move(value), false);
}

boost::any UnsignedValue(std::uint32_t field) { return static_cast<std::uint64_t>(field); }

UTF8String WriteColorSpace(const color::ColorSpace& space) {
  boost::any object = JSONObject();
  const ColorProfile& base = space.baseColorProfile;
  if (!base.empty()) {
    boost::any profile = JSONObject();
    if (!base.colorProfileName.empty())
      AddMember(profile, kColorProfileNameKey, base.colorProfileName);
    if (base.colorProfileData) {
      const unsigned char* data = base.colorProfileData->GetData();
      const std::size_t size = data == nullptr ? 0 : base.colorProfileData->GetSize();
      AddMember(profile, kColorProfileDataKey,
                zebcore::utility::EncodeBinaryDataToUTF8String(data, size));
    }
    AddMember(object, kBaseColorProfileKey, std::move(profile));
  }
  if (space.baseProfileType != color::kColorSpaceType_None) {
    AddMember(object, kBaseProfileTypeKey, UnsignedValue(space.baseProfileType));
  }
  if (space.colorSpaceLinearized) AddMember(object, kColorSpaceLinearizedKey, true);
  return zebcore::serialization::GetJSONUTF8String(object, false);
}

// Holds the colour lock for a scope. A wait that runs out is reported for
// `function`; the caller then skips its work and returns its empty result.
class ColorLockGuard {
 public:
  ColorLockGuard(const char* function, int line)
      : guard_(State().lock, nullptr, details::LockWaitMilliseconds()) {
    if (!guard_) details::ReportLockTimeout("colour lock", function, line);
  }
  explicit operator bool() const noexcept { return guard_.Held(); }

 private:
  zebcore::threads::RecursiveLockGuard guard_;
};

}  // namespace

// ---------------------------------------------------------------------------

namespace details {

zebcore::threads::RecursiveMutex& ColorLock() { return State().lock; }

unsigned int SetLockWaitMilliseconds(unsigned int milliseconds) noexcept {
  return LockWait().exchange(milliseconds);
}

unsigned int LockWaitMilliseconds() noexcept { return LockWait().load(); }

void ReportLockTimeout(const char* lockName, const char* function, int line) noexcept {
  try {
    zebcore::debug::ReportAssertion(lockName, "Lock not had within its wait limit; nothing done",
                                    __FILE__, function, line);
  } catch (...) {
  }
}

bool InstallDefaultColorSpace(const color::ColorSpace& space) noexcept {
  try {
    ColorState& state = State();
    const ColorLockGuard guard("zebmediatypes::color::SetDefaultColorSpace", __LINE__);
    if (!guard) return false;
    state.defaultSpace = space;
    color::AddColorSpaceToCache(space);  // cannot time out: the lock is held already
    return true;
  } catch (...) {
    return false;
  }
}

bool ClearColorSpaceCache() noexcept {
  ColorState& state = State();
  const ColorLockGuard guard("zebmediatypes::Terminate", __LINE__);
  if (!guard) return false;
  state.cache.clear();
  return true;
}

}  // namespace details

namespace color {

UTF8String ColorSpace::ToSerializedString() const noexcept {
  try {
    return WriteColorSpace(*this);
  } catch (...) {
    LogUsageEvent("ColorSpaceToSerializedStringFailed");
  }
  // The default colour space's text, tried once; "{}" if that fails too.
  try {
    return WriteColorSpace(GetDefaultColorSpace());
  } catch (...) {
    return zebcore::string::ToUTF8String("{}");
  }
}

UTF8String ColorManagementSettings::ToSerializedString() const noexcept {
  try {
    boost::any object = JSONObject();
    if (graphicsWhiteLuminance_ != kGraphicsWhiteLuminance_100) {
      AddMember(object, kGraphicsWhiteLuminanceKey, UnsignedValue(graphicsWhiteLuminance_));
    }
    if (lutInterpolationMethod_ != kLUTInterpolationMethod_TriLinear) {
      AddMember(object, kLUTInterpolationMethodKey, UnsignedValue(lutInterpolationMethod_));
    }
    if (colorManagementSystem_ != kColorManagementSystem_Korvo) {
      AddMember(object, kColorManagementSystemKey, UnsignedValue(colorManagementSystem_));
    }
    if (!ocioConfigurationFile_.empty()) {
      AddMember(object, kOCIOConfigurationFileKey, ocioConfigurationFile_);
    }
    if (autoToneMapEnabled_) AddMember(object, kAutoToneMapEnabledKey, true);
    return zebcore::serialization::GetJSONUTF8String(object, false);
  } catch (...) {
    return {};
  }
}

std::optional<ColorSpace> TryColorSpaceFromSerializedString(const UTF8String& text) noexcept {
  std::optional<ColorSpace> result;
  try {
    result = ReadColorSpace(text);
  } catch (...) {
    return std::nullopt;
  }
  if (result) {
    try {
      AddColorSpaceToCache(*result);
    } catch (...) {
      // The result stands even when it could not be entered in the cache.
    }
  }
  return result;
}

ColorSpace ColorSpaceFromSerializedString(const UTF8String& text) noexcept {
  if (std::optional<ColorSpace> read = TryColorSpaceFromSerializedString(text)) {
    return std::move(*read);
  }
  LogUsageEvent("ColorSpaceFromSerializedStringFailed");
  ColorSpace result;
  try {
    result = GetDefaultColorSpace();
  } catch (...) {
    result = ColorSpace();
  }
  try {
    AddColorSpaceToCache(result);
  } catch (...) {
    // The default stands even when it could not be entered in the cache.
  }
  return result;
}

std::optional<ColorManagementSettings> TryColorManagementSettingsFromSerializedString(
    const UTF8String& text) noexcept {
  try {
    const JSONValue document = ParseDocument(text);
    if (!document) return std::nullopt;
    const JSONObject& object = *boost::any_cast<JSONObject>(document.get());
    GraphicsWhiteLuminance luminance = kGraphicsWhiteLuminance_100;
    LUTInterpolationMethod method = kLUTInterpolationMethod_TriLinear;
    ColorManagementSystem system = kColorManagementSystem_Korvo;
    UTF8String file;
    bool toneMap = false;
    if (!ReadEnumMember(object, kGraphicsWhiteLuminanceKey, luminance) ||
        !ReadEnumMember(object, kLUTInterpolationMethodKey, method) ||
        !ReadEnumMember(object, kColorManagementSystemKey, system)) {
      return std::nullopt;
    }
    if (const boost::any* value = Member(object, kOCIOConfigurationFileKey)) {
      file = ReadString(*value);
    }
    if (!ReadBoolMember(object, kAutoToneMapEnabledKey, toneMap)) return std::nullopt;
    return ColorManagementSettings(luminance, method, file, system, toneMap);
  } catch (...) {
    return std::nullopt;
  }
}

ColorManagementSettings ColorManagementSettingsFromSerializedString(
    const UTF8String& text) noexcept {
  if (std::optional<ColorManagementSettings> read =
          TryColorManagementSettingsFromSerializedString(text)) {
    return std::move(*read);
  }
  return {};
}

Guid AddColorSpaceToCache(const ColorSpace& space) {
  ColorState& state = State();
  const ColorLockGuard guard("zebmediatypes::color::AddColorSpaceToCache", __LINE__);
  if (!guard) return Guid();
  const Guid id = space.ToGuid();
  state.cache.try_emplace(id, space);
  return id;
}

ColorSpace RetrieveColorSpaceFromCache(const Guid& id) {
  if (id.IsNull()) return ColorSpace();
  ColorState& state = State();
  const ColorLockGuard guard("zebmediatypes::color::RetrieveColorSpaceFromCache", __LINE__);
  if (!guard) return ColorSpace();
  const auto it = state.cache.find(id);
  return it == state.cache.end() ? ColorSpace() : it->second;
}

ColorSpace GetDefaultColorSpace() {
  ColorState& state = State();
  const ColorLockGuard guard("zebmediatypes::color::GetDefaultColorSpace", __LINE__);
  if (!guard) return ColorSpace();
  return state.cache.empty() ? ColorSpace() : state.defaultSpace;
}

void SetDefaultColorSpace(const ColorSpace& space) { details::InstallDefaultColorSpace(space); }

}  // namespace color

namespace SerializationCache {

zebcore::serialization::CachedSerializer<ColorProfile>& GetColorProfileCache() {
  static auto* const cache = new zebcore::serialization::CachedSerializer<ColorProfile>();
  return *cache;
}

zebcore::serialization::CachedSerializer<color::ColorSpace>& GetColorSpaceCache() {
  static auto* const cache = new zebcore::serialization::CachedSerializer<color::ColorSpace>();
  return *cache;
}

void ClearAll() {
  GetColorProfileCache().Clear();
  GetColorSpaceCache().Clear();
}

}  // namespace SerializationCache
}  // namespace zebmediatypes
