// Video descriptions: pixel formats, alpha, field order, aspect ratios, frame
// sizes, render quality and codec families as text.
//
// Localizable texts come from the core localizer (its translation of the key,
// else the English default); a few texts are fixed English. Unknown values
// give an empty string or a neutral text, never an error.
//
//   PixelFormatDescription(kPixelFormat_BGRA_4444_8u);   // u"BGRA 4444 8u Full Range"
//   GetCodecFamilyName(0x61766331);                      // "H.264" (avc1)
#pragma once

#include <zebcore/geom.h>
#include <zebcore/stream.h>
#include <zebcore/string.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/localized_description.h>
#include <zebmediatypes/pixel_aspect_ratio.h>
#include <zebmediatypes/pixel_format.h>
#include <zebmediatypes/render_quality.h>

#include <cstdint>
#include <iosfwd>
#include <string>

namespace zebmediatypes {

enum FieldType : std::int32_t {
  kFieldType_Unknown = -1,     // field presence unknown
  kFieldType_Progressive = 0,  // no fields
  kFieldType_UpperFirst = 1,
  kFieldType_LowerFirst = 2,
  kFieldType_UnknownDominance = 3,
  kFieldType_Any = 4,
};

enum AlphaChannel : std::int32_t {
  kAlphaChannel_None = 0,  // and every value other than 1 and 2
  kAlphaChannel_Straight = 1,
  kAlphaChannel_Premultiplied = 2,
};

// PixelFormatDescription()
//
// "Any Pixel Format", "Custom Pixel Format (cba_)" for a custom name, "Unknown
// Pixel Format" for an invalid word; otherwise the layout in words: components
// and sampling ("BGRA 4444", "YUV 422"), or the packing's name ("NTSC DV",
// "YUV 420 MPEG4 Frame BiPlanar"), then depth and type ("8u", "32f"), the
// primaries of YUV formats, "Linear" and "Full Range" where they apply.
// A FourCC is shown highest byte first, control bytes as spaces and bytes of
// 128 or more as '?'.
ZEBMEDIATYPES_API zebcore::UTF16String PixelFormatDescription(PixelFormat pf);

// The description, as UTF-8 or UTF-16.
ZEBMEDIATYPES_API std::ostream& operator<<(std::ostream& out, const PixelFormat& pf);
ZEBMEDIATYPES_API zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out,
                                                            const PixelFormat& pf);

// The catalogue's fixed name for a built-in FourCC ("NV12_MPEG4_FRAME_709"
// for nv12); "Invalid" for other names and for v21f, y210 and y21f.
ZEBMEDIATYPES_API zebcore::UTF8String GetFourCCDescriptiveName(PixelFormatName name);

// "Straight Alpha", "Premultiplied Alpha" or "None".
ZEBMEDIATYPES_API zebcore::UTF16String AlphaDescription(const AlphaChannel& alpha);

// The field order in words (localized or fixed English); empty for values
// other than -1 to 4.
ZEBMEDIATYPES_API zebcore::UTF16String FieldTypeDescription(FieldType type,
                                                            LocalizedDescription localized);

// The ratio's name and value: "Square Pixels (1.0)", "D1/DV NTSC (0.9091)",
// ..., "Other Aspect Ratio (1.2346)".
ZEBMEDIATYPES_API zebcore::UTF16String PixelAspectRatioDescription(PixelAspectRatio r);

// "720w 480h (0.9091)"; "720w 480h" when the ratio's numerator is 0 (unknown
// or any). The rectangle's position is not shown.
ZEBMEDIATYPES_API zebcore::UTF16String VideoFrameSizeDescription(zebcore::geom::RectT<int> rect,
                                                                 PixelAspectRatio r);

// "Draft", "Low", "Medium", "High" or "Max"; empty for other values.
ZEBMEDIATYPES_API zebcore::UTF16String RenderQualityDescription(RenderQuality quality);

// The family of a codec FourCC (first character in the highest byte, avc1 is
// 0x61766331): "H.264", "ProRes", "DV", ...; "unknown" for other codes. Exact
// values only: translate cva1-cva4 and MCPT with TranslateFourCC first.
ZEBMEDIATYPES_API std::string GetCodecFamilyName(unsigned int code);

}  // namespace zebmediatypes
