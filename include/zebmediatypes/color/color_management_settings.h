// ColorManagementSettings
//
// How a document or sequence is colour managed: the graphics white luminance,
// the lookup-table interpolation, the colour management system with its
// OpenColorIO configuration file, and automatic tone mapping. Read through the
// getters; tone mapping is the only field that can be changed in place.
//
//   ColorManagementSettings s(kGraphicsWhiteLuminance_203);
//   s.IsValid();               // true
//   s.ToSerializedString();    // {"graphicsWhiteLuminance":203}
#pragma once

#include <zebcore/guid.h>
#include <zebcore/string.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/localized_description.h>

#include <boost/operators.hpp>
#include <cstdint>

namespace zebmediatypes {

namespace color {

// The fields hold any 32-bit value; the operations say what they do with
// values outside these lists.
enum GraphicsWhiteLuminance : std::uint32_t {
  kGraphicsWhiteLuminance_100 = 100,  // nits (default)
  kGraphicsWhiteLuminance_203 = 203,
  kGraphicsWhiteLuminance_300 = 300,
};

enum LUTInterpolationMethod : std::uint32_t {
  kLUTInterpolationMethod_TriLinear = 0,  // default
  kLUTInterpolationMethod_Tetrahedral = 1,
};

enum ColorManagementSystem : std::uint32_t {
  kColorManagementSystem_Korvo = 0,  // the family's own colour management (default)
  kColorManagementSystem_OCIO = 1,   // through an OpenColorIO configuration
};

struct ZEBMEDIATYPES_API ColorManagementSettings : boost::totally_ordered<ColorManagementSettings> {
 public:
  ColorManagementSettings() = default;
  explicit ColorManagementSettings(GraphicsWhiteLuminance luminance) noexcept
      : graphicsWhiteLuminance_(luminance) {}
  explicit ColorManagementSettings(LUTInterpolationMethod method) noexcept
      : lutInterpolationMethod_(method) {}
  ColorManagementSettings(GraphicsWhiteLuminance luminance, LUTInterpolationMethod method,
                          const zebcore::UTF8String& ocioConfigurationFile,
                          ColorManagementSystem system, bool autoToneMapEnabled)
      : graphicsWhiteLuminance_(luminance),
        lutInterpolationMethod_(method),
        ocioConfigurationFile_(ocioConfigurationFile),
        colorManagementSystem_(system),
        autoToneMapEnabled_(autoToneMapEnabled) {}

  GraphicsWhiteLuminance GetGraphicsWhiteLuminance() const noexcept {
    return graphicsWhiteLuminance_;
  }
  LUTInterpolationMethod GetLUTInterpolationMethod() const noexcept {
    return lutInterpolationMethod_;
  }
  // The path of the OpenColorIO configuration file (UTF-8), as a copy.
  zebcore::UTF8String GetOCIOConfigurationFile() const { return ocioConfigurationFile_; }
  ColorManagementSystem GetColorManagementSystem() const noexcept { return colorManagementSystem_; }
  bool GetAutoToneMapEnabled() const noexcept { return autoToneMapEnabled_; }
  void SetAutoToneMapEnabled(bool enabled) noexcept { autoToneMapEnabled_ = enabled; }

  // True when the luminance is 100, 203 or 300; no other field is examined.
  bool IsValid() const noexcept;

  // The content identifier, computed on every call (no memo): the Murmur3
  // hash of "ColorManagementSettings", the luminance and the interpolation
  // method (4 bytes each, little-endian), then the file path if not empty, the
  // system if not 0 (4 bytes) and the tone-mapping flag if true (1 byte).
  zebcore::utility::Guid ToGuid() const;

  // The JSON text form: "graphicsWhiteLuminance", "lutInterpolationMethod",
  // "colorManagementSystem", "ocioConfigurationFile" and "autoToneMapEnabled",
  // each only when not at its default; the defaults are "{}". Never throws: an
  // empty string when the text cannot be made.
  zebcore::UTF8String ToSerializedString() const noexcept;

  // Compare every field in field order.
  friend ZEBMEDIATYPES_API bool operator==(const ColorManagementSettings& a,
                                           const ColorManagementSettings& b) noexcept;
  friend ZEBMEDIATYPES_API bool operator<(const ColorManagementSettings& a,
                                          const ColorManagementSettings& b) noexcept;

 private:
  GraphicsWhiteLuminance graphicsWhiteLuminance_ = kGraphicsWhiteLuminance_100;
  LUTInterpolationMethod lutInterpolationMethod_ = kLUTInterpolationMethod_TriLinear;
  zebcore::UTF8String ocioConfigurationFile_;
  ColorManagementSystem colorManagementSystem_ = kColorManagementSystem_Korvo;
  bool autoToneMapEnabled_ = false;
};

}  // namespace color

// "Korvo color managed" for 0, "OCIO color managed" for 1 (localized when
// `localized` is 1); an empty string for any other system.
ZEBMEDIATYPES_API zebcore::UTF16String GetColorManagementSystemDescription(
    color::ColorManagementSystem system, LocalizedDescription localized);

// "Trilinear" for 0 and "Tetrahedral" for 1. The localized text (`localized`
// 1) of the tetrahedral method defaults to "Tetrahedral (requires GPU
// acceleration)". An empty string for any other method.
ZEBMEDIATYPES_API zebcore::UTF16String GetLUTInterpolationMethodDescription(
    color::LUTInterpolationMethod method, LocalizedDescription localized);

// Never localized: "100 (63% HLG, 51% PQ)", "203 (75% HLG, 58% PQ)" or
// "300 (81% HLG, 62% PQ)"; an empty string for any other luminance.
ZEBMEDIATYPES_API zebcore::UTF16String GetGraphicsWhiteLuminanceDescription(
    color::GraphicsWhiteLuminance luminance);

}  // namespace zebmediatypes
