// Reading colour texts, the colour-space cache, the default colour space and
// the serialized-text caches.
//
// Reading rules (both text forms): the text may also be an object whose member
// "SerializerWrappedObject" holds the object to read. Absent members keep their
// defaults. Integer members take a JSON integer from -2147483648 to 4294967295
// (its low 32 bits); any other integer or kind fails the read. Boolean members
// take true/false, any JSON integer (non-zero is true) or exactly the strings
// "true" and "false"; anything else fails the read. String members of another
// kind read as empty. "colorProfileData" must be base64 text; text that does
// not decode fails the read. A failed read gives nothing of what it read.
//
// The colour-space cache maps identifiers (ColorSpace::ToGuid) to spaces. It
// only grows while the library is started: the last Terminate() empties it.
// Every function here may be called from any thread. The colour lock that
// guards the cache and the default colour space is waited for at most 60 s;
// a call that cannot have it reports through the assertion service and gives
// its empty result (an empty ColorSpace, the null Guid) without doing anything.
#pragma once

#include <zebcore/cached_serializer.h>
#include <zebcore/guid.h>
#include <zebcore/string.h>
#include <zebmediatypes/color/color_management_settings.h>
#include <zebmediatypes/color/color_profile.h>
#include <zebmediatypes/color/color_space.h>
#include <zebmediatypes/export.h>

#include <optional>

namespace zebmediatypes {
namespace color {

// Reads a colour-space text and enters the result in the colour-space cache
// (its memo is filled). Text that does not read gives GetDefaultColorSpace()
// and logs the usage event "ColorSpace", "Serialization",
// "ColorSpaceFromSerializedStringFailed". Never throws.
ZEBMEDIATYPES_API ColorSpace
ColorSpaceFromSerializedString(const zebcore::UTF8String& text) noexcept;

// Reads a settings text; text that does not read gives the default settings.
// Never throws.
ZEBMEDIATYPES_API ColorManagementSettings
ColorManagementSettingsFromSerializedString(const zebcore::UTF8String& text) noexcept;

// The readers above, saying when they failed: std::nullopt exactly where they
// fall back to the default (no usage event is logged then); otherwise the
// value they give. A colour space read is entered in the cache as above.
// Never throw.
ZEBMEDIATYPES_API std::optional<ColorSpace> TryColorSpaceFromSerializedString(
    const zebcore::UTF8String& text) noexcept;
ZEBMEDIATYPES_API std::optional<ColorManagementSettings>
TryColorManagementSettingsFromSerializedString(const zebcore::UTF8String& text) noexcept;

// Enters `space` under its identifier, unless an entry is there already (the
// first one stays), and returns the identifier. Fills the caller's memo. An
// empty space is entered under the null Guid.
ZEBMEDIATYPES_API zebcore::utility::Guid AddColorSpaceToCache(const ColorSpace& space);

// A copy of the space entered under `id`, memo included; an empty ColorSpace
// for the null Guid and for identifiers not in the cache.
ZEBMEDIATYPES_API ColorSpace RetrieveColorSpaceFromCache(const zebcore::utility::Guid& id);

// The default colour space while the cache holds anything, else an empty
// ColorSpace (so: empty before the first Initialize and after the last
// Terminate).
ZEBMEDIATYPES_API ColorSpace GetDefaultColorSpace();

// Stores a copy of `space` (memo included) as the default and enters it in the
// cache.
ZEBMEDIATYPES_API void SetDefaultColorSpace(const ColorSpace& space);

}  // namespace color

// The two process-wide serialized-text caches. The library never fills them;
// callers do. Each has its own lock; they are emptied only by ClearAll().
namespace SerializationCache {

ZEBMEDIATYPES_API zebcore::serialization::CachedSerializer<ColorProfile>& GetColorProfileCache();
ZEBMEDIATYPES_API zebcore::serialization::CachedSerializer<color::ColorSpace>& GetColorSpaceCache();
// Empties the profile cache, then the colour-space cache.
ZEBMEDIATYPES_API void ClearAll();

}  // namespace SerializationCache
}  // namespace zebmediatypes
