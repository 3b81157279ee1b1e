// ColorSpace
//
// A colour space: a base profile, the kind of space it is and whether it is
// linearized. A plain record: read and set the fields directly. Its JSON text
// form and the process-wide colour-space cache are in color_serialization.h.
//
//   ColorSpace s;
//   s.baseColorProfile.colorProfileName = zebcore::string::ToUTF8String("BT.709 RGB Full");
//   s.baseProfileType = kColorSpaceType_Model;
//   s.IsModel();                    // true
//   s.GetColorSpaceTypeString();    // "tagged"
#pragma once

#include <zebcore/guid.h>
#include <zebcore/string.h>
#include <zebmediatypes/color/color_profile.h>
#include <zebmediatypes/export.h>

#include <boost/operators.hpp>
#include <cstdint>

namespace zebmediatypes {
namespace color {

// The kind of a colour space. The field holds any 32-bit value; values other
// than these answer false to every Is...() predicate and give no type string.
enum ColorSpaceType : std::uint32_t {
  kColorSpaceType_None = 0,             // not set (default)
  kColorSpaceType_Model = 1,            // described by a model: a tagged, named space
  kColorSpaceType_ICC = 2,              // given by an ICC profile
  kColorSpaceType_OCIO = 3,             // a space of an OpenColorIO configuration
  kColorSpaceType_NonColorManaged = 4,  // media that is not colour managed
};

struct ZEBMEDIATYPES_API ColorSpace : boost::totally_ordered<ColorSpace> {
  ColorProfile baseColorProfile;
  ColorSpaceType baseProfileType = kColorSpaceType_None;
  bool colorSpaceLinearized = false;
  // The memo of ToGuid(), with the same rules as ColorProfile::cachedGuid.
  mutable zebcore::utility::Guid cachedGuid;

  // True when the base profile is empty, whatever the type and the flag hold.
  bool empty() const noexcept { return baseColorProfile.empty(); }

  bool IsModel() const noexcept { return baseProfileType == kColorSpaceType_Model; }
  bool IsICC() const noexcept { return baseProfileType == kColorSpaceType_ICC; }
  bool IsOCIO() const noexcept { return baseProfileType == kColorSpaceType_OCIO; }
  bool IsNonColorManaged() const noexcept {
    return baseProfileType == kColorSpaceType_NonColorManaged;
  }

  // "tagged" for a model space, "icc" for ICC, "ocio" for OCIO; an empty string
  // for every other type (none and non-colour-managed included). The strings
  // live as long as the process.
  const zebcore::UTF8String& GetColorSpaceTypeString() const noexcept;

  // The content identifier: the null Guid for an empty space (memo left
  // alone); else the memo if set; else the Murmur3 hash of "ZEBColorSpace", the
  // 16 bytes of baseColorProfile.ToGuid(), the type (4 bytes, little-endian)
  // and the linearized flag (1 byte), stored in the memo. Also fills the
  // profile's memo. Not to be called on one object from two threads at once.
  zebcore::utility::Guid ToGuid() const;

  // The JSON text form: an object with "baseColorProfile" (when the profile is
  // not empty), "baseProfileType" (when not 0) and "colorSpaceLinearized" (when
  // true); an empty space is "{}". Never throws: if the text cannot be made,
  // the text of the default colour space is given instead (and "{}" if that
  // cannot be made either); the failure is logged as a usage event.
  zebcore::UTF8String ToSerializedString() const noexcept;

  // Compare the profile, then the type, then the flag; the memo takes no part.
  friend ZEBMEDIATYPES_API bool operator==(const ColorSpace& a, const ColorSpace& b) noexcept;
  friend ZEBMEDIATYPES_API bool operator<(const ColorSpace& a, const ColorSpace& b) noexcept;
};

}  // namespace color

// The space's profile name in UTF-16 (invalid UTF-8 becomes U+FFFD); nothing
// else of the space is shown.
ZEBMEDIATYPES_API zebcore::UTF16String GetColorSpaceDescription(const color::ColorSpace& space);

}  // namespace zebmediatypes
