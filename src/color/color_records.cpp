// Colour records: identifiers, comparisons, predicates and display strings.
#include <zebcore/guid.h>
#include <zebcore/localizer.h>
#include <zebcore/string.h>
#include <zebmediatypes/color/color_management_settings.h>
#include <zebmediatypes/color/color_profile.h>
#include <zebmediatypes/color/color_space.h>

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <tuple>

namespace zebmediatypes {
namespace {

using zebcore::utility::Guid;
using zebcore::utility::Murmur3MixerState;
using zebcore::utility::UpdateHashState;

void FeedText(Murmur3MixerState& state, std::string_view text) noexcept {
  UpdateHashState(state, text.data(), text.size());
}

// A 32-bit value as 4 little-endian bytes, whatever the host's byte order.
void FeedUInt32(Murmur3MixerState& state, std::uint32_t value) noexcept {
  const unsigned char bytes[4] = {
      static_cast<unsigned char>(value), static_cast<unsigned char>(value >> 8),
      static_cast<unsigned char>(value >> 16), static_cast<unsigned char>(value >> 24)};
  UpdateHashState(state, bytes, sizeof bytes);
}

void FeedBool(Murmur3MixerState& state, bool value) noexcept {
  const unsigned char byte = value ? 1 : 0;
  UpdateHashState(state, &byte, 1);
}

// The bytes of a profile block as a view; empty for no block or 0 bytes.
std::basic_string_view<unsigned char> BlockBytes(
    const std::shared_ptr<zebcore::allocator::RecycledMemory>& block) noexcept {
  if (!block || block->GetData() == nullptr || block->GetSize() == 0) return {};
  return {block->GetData(), block->GetSize()};
}

}  // namespace

bool ColorProfile::empty() const noexcept { return !colorProfileData && colorProfileName.empty(); }

Guid ColorProfile::ToGuid() const {
  if (empty()) return Guid();
  if (!cachedGuid.IsNull()) return cachedGuid;
  Murmur3MixerState state;
  FeedText(state, "ZEBColorProfile");
  if (!colorProfileName.empty()) {
    UpdateHashState(state, colorProfileName.data(), colorProfileName.size());
  }
  const auto bytes = BlockBytes(colorProfileData);
  if (!bytes.empty()) UpdateHashState(state, bytes.data(), bytes.size());
  cachedGuid = zebcore::utility::GetHashResult(state);
  return cachedGuid;
}

bool operator==(const ColorProfile& a, const ColorProfile& b) noexcept {
  return a.colorProfileName == b.colorProfileName &&
         static_cast<bool>(a.colorProfileData) == static_cast<bool>(b.colorProfileData) &&
         BlockBytes(a.colorProfileData) == BlockBytes(b.colorProfileData);
}

bool operator<(const ColorProfile& a, const ColorProfile& b) noexcept {
  if (a.colorProfileName != b.colorProfileName) return a.colorProfileName < b.colorProfileName;
  const bool aHasBlock = static_cast<bool>(a.colorProfileData);
  const bool bHasBlock = static_cast<bool>(b.colorProfileData);
  if (aHasBlock != bHasBlock) return bHasBlock;
  return BlockBytes(a.colorProfileData) < BlockBytes(b.colorProfileData);
}

namespace color {

const zebcore::UTF8String& ColorSpace::GetColorSpaceTypeString() const noexcept {
  static const zebcore::UTF8String kTagged = zebcore::string::ToUTF8String("tagged");
  static const zebcore::UTF8String kICC = zebcore::string::ToUTF8String("icc");
  static const zebcore::UTF8String kOCIO = zebcore::string::ToUTF8String("ocio");
  static const zebcore::UTF8String kNone;
  switch (baseProfileType) {
    case kColorSpaceType_Model:
      return kTagged;
    case kColorSpaceType_ICC:
      return kICC;
    case kColorSpaceType_OCIO:
      return kOCIO;
    default:
      return kNone;
  }
}

Guid ColorSpace::ToGuid() const {
  if (empty()) return Guid();
  if (!cachedGuid.IsNull()) return cachedGuid;
  Murmur3MixerState state;
  FeedText(state, "ZEBColorSpace");
  const Guid::Bytes profile = baseColorProfile.ToGuid().GuidToBytes();
  UpdateHashState(state, profile.data(), profile.size());
  FeedUInt32(state, baseProfileType);
  FeedBool(state, colorSpaceLinearized);
  cachedGuid = zebcore::utility::GetHashResult(state);
  return cachedGuid;
}

bool operator==(const ColorSpace& a, const ColorSpace& b) noexcept {
  return a.baseProfileType == b.baseProfileType &&
         a.colorSpaceLinearized == b.colorSpaceLinearized &&
         a.baseColorProfile == b.baseColorProfile;
}

bool operator<(const ColorSpace& a, const ColorSpace& b) noexcept {
  if (a.baseColorProfile != b.baseColorProfile) return a.baseColorProfile < b.baseColorProfile;
  return std::tie(a.baseProfileType, a.colorSpaceLinearized) <
         std::tie(b.baseProfileType, b.colorSpaceLinearized);
}

bool ColorManagementSettings::IsValid() const noexcept {
  switch (graphicsWhiteLuminance_) {
    case kGraphicsWhiteLuminance_100:
    case kGraphicsWhiteLuminance_203:
    case kGraphicsWhiteLuminance_300:
      return true;
    default:
      return false;
  }
}

Guid ColorManagementSettings::ToGuid() const {
  Murmur3MixerState state;
  FeedText(state, "ColorManagementSettings");
  FeedUInt32(state, graphicsWhiteLuminance_);
  FeedUInt32(state, lutInterpolationMethod_);
  if (!ocioConfigurationFile_.empty()) {
    UpdateHashState(state, ocioConfigurationFile_.data(), ocioConfigurationFile_.size());
  }
  if (colorManagementSystem_ != kColorManagementSystem_Korvo) {
    FeedUInt32(state, colorManagementSystem_);
  }
  if (autoToneMapEnabled_) FeedBool(state, true);
  return zebcore::utility::GetHashResult(state);
}

bool operator==(const ColorManagementSettings& a, const ColorManagementSettings& b) noexcept {
  return a.graphicsWhiteLuminance_ == b.graphicsWhiteLuminance_ &&
         a.lutInterpolationMethod_ == b.lutInterpolationMethod_ &&
         a.colorManagementSystem_ == b.colorManagementSystem_ &&
         a.autoToneMapEnabled_ == b.autoToneMapEnabled_ &&
         a.ocioConfigurationFile_ == b.ocioConfigurationFile_;
}

bool operator<(const ColorManagementSettings& a, const ColorManagementSettings& b) noexcept {
  return std::tie(a.graphicsWhiteLuminance_, a.lutInterpolationMethod_, a.ocioConfigurationFile_,
                  a.colorManagementSystem_, a.autoToneMapEnabled_) <
         std::tie(b.graphicsWhiteLuminance_, b.lutInterpolationMethod_, b.ocioConfigurationFile_,
                  b.colorManagementSystem_, b.autoToneMapEnabled_);
}

}  // namespace color

namespace {

struct DescriptionEntry {
  std::uint32_t value;
  const char* localizationKey;
  const char* plainText;
};

constexpr DescriptionEntry kColorManagementSystemDescriptions[] = {
    {color::kColorManagementSystem_Korvo,
     "$$$/zebmediatypes/ColorManagementSystem/Korvo=Korvo color managed", "Korvo color managed"},
    {color::kColorManagementSystem_OCIO,
     "$$$/zebmediatypes/ColorManagementSystem/OCIO=OCIO color managed", "OCIO color managed"},
};
static_assert(std::size(kColorManagementSystemDescriptions) == 2);

constexpr DescriptionEntry kLUTInterpolationMethodDescriptions[] = {
    {color::kLUTInterpolationMethod_TriLinear,
     "$$$/zebmediatypes/LUTInterpolationMethod/TriLinear=Trilinear", "Trilinear"},
    {color::kLUTInterpolationMethod_Tetrahedral,
     "$$$/zebmediatypes/LUTInterpolationMethod/Tetrahedral=Tetrahedral (requires GPU "
     "acceleration)",
     "Tetrahedral"},
};
static_assert(std::size(kLUTInterpolationMethodDescriptions) == 2);

struct LuminanceText {
  std::uint32_t nits;
  const char* text;
};
constexpr LuminanceText kGraphicsWhiteLuminanceDescriptions[] = {
    {color::kGraphicsWhiteLuminance_100, "100 (63% HLG, 51% PQ)"},
    {color::kGraphicsWhiteLuminance_203, "203 (75% HLG, 58% PQ)"},
    {color::kGraphicsWhiteLuminance_300, "300 (81% HLG, 62% PQ)"},
};
static_assert(std::size(kGraphicsWhiteLuminanceDescriptions) == 3);

template <std::size_t N>
zebcore::UTF16String Describe(const DescriptionEntry (&table)[N], std::uint32_t value,
                              LocalizedDescription localized) {
  for (const DescriptionEntry& entry : table) {
    if (entry.value != value) continue;
    if (localized == 1) return zebcore::config::Localizer::Get().Localize(entry.localizationKey);
    return zebcore::string::AsciiToUTF16(entry.plainText);
  }
  return {};
}

}  // namespace

zebcore::UTF16String GetColorManagementSystemDescription(color::ColorManagementSystem system,
                                                         LocalizedDescription localized) {
  return Describe(kColorManagementSystemDescriptions, system, localized);
}

zebcore::UTF16String GetLUTInterpolationMethodDescription(color::LUTInterpolationMethod method,
                                                          LocalizedDescription localized) {
  return Describe(kLUTInterpolationMethodDescriptions, method, localized);
}

zebcore::UTF16String GetGraphicsWhiteLuminanceDescription(color::GraphicsWhiteLuminance luminance) {
  for (const LuminanceText& entry : kGraphicsWhiteLuminanceDescriptions) {
    if (entry.nits == luminance) return zebcore::string::AsciiToUTF16(entry.text);
  }
  return {};
}

zebcore::UTF16String GetColorSpaceDescription(const color::ColorSpace& space) {
  return zebcore::string::UTF8to16(space.baseColorProfile.colorProfileName);
}

}  // namespace zebmediatypes
