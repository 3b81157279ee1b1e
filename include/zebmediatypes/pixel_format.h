// Pixel formats: a FourCC name plus a packed properties word.
//
// A `PixelFormat` tags every video frame with how its pixels are laid out. Its
// name is a FourCC with the first character in the lowest byte (so the bytes
// read as the name in little-endian memory); names beginning with '@' or '_'
// are custom formats, whose properties come from a process-wide registry. The
// properties word packs the layout field by field (see PixelFormatProperties).
//
//   PixelFormat f(MakePixelFormatName("bgra"));   // == kPixelFormat_BGRA_4444_8u
//   GetBytesPerPixel(f);                          // 4
#pragma once

#include <zebmediatypes/export.h>

#include <cstdint>

namespace zebmediatypes {

// PixelFormatName
//
// A FourCC: character 1 in bits 0-7, character 2 in bits 8-15, character 3 in
// bits 16-23, character 4 in bits 24-31.
enum PixelFormatName : std::uint32_t {};

// The name of four characters, the first in the lowest byte.
constexpr PixelFormatName MakePixelFormatName(char c1, char c2, char c3, char c4) noexcept {
  return static_cast<PixelFormatName>(
      static_cast<std::uint32_t>(static_cast<unsigned char>(c1)) |
      static_cast<std::uint32_t>(static_cast<unsigned char>(c2)) << 8 |
      static_cast<std::uint32_t>(static_cast<unsigned char>(c3)) << 16 |
      static_cast<std::uint32_t>(static_cast<unsigned char>(c4)) << 24);
}
constexpr PixelFormatName MakePixelFormatName(const char (&text)[5]) noexcept {
  return MakePixelFormatName(text[0], text[1], text[2], text[3]);
}

// The wildcard name (matches any format) and the name of no format ("badf").
inline constexpr unsigned int kPixelFormatFourCC_Any = 0;
inline constexpr unsigned int kPixelFormatFourCC_Invalid = MakePixelFormatName("badf");

// True when the name's first character is '@' or '_': a custom format.
constexpr bool IsCustomPixelFormatName(std::uint32_t name) noexcept {
  return (name & 0xFFu) == '@' || (name & 0xFFu) == '_';
}

// Values of the properties word's fields.
enum PixelFormatDepth : std::uint32_t {
  kPixelFormatDepth_8 = 0,
  kPixelFormatDepth_10 = 1,
  kPixelFormatDepth_16Container = 2,  // the "15u" formats: 15 bits in 16
  kPixelFormatDepth_16 = 3,
  kPixelFormatDepth_24 = 4,
  kPixelFormatDepth_32 = 5,  // with isFloat in every 32f format
};
enum PixelFormatPrimaries : std::uint32_t {
  kPixelFormatPrimaries_601 = 0,
  kPixelFormatPrimaries_709 = 1,
  kPixelFormatPrimaries_2020 = 2,
  kPixelFormatPrimaries_2020HDR = 3,
};
enum PixelFormatAlpha : std::uint32_t {
  kPixelFormatAlpha_None = 0,
  kPixelFormatAlpha_Straight = 1,       // A
  kPixelFormatAlpha_Premultiplied = 2,  // P
  kPixelFormatAlpha_Ignored = 3,        // X: a slot that is present but opaque
};
enum PixelFormatSubsampling : std::uint32_t {
  kPixelFormatSubsampling_444 = 0,
  kPixelFormatSubsampling_422 = 1,
  kPixelFormatSubsampling_DV = 2,  // only with the DV packings
  kPixelFormatSubsampling_420 = 3,
};
enum PixelFormatPacking : std::uint32_t {
  kPixelFormatPacking_Uncompressed = 0,
  kPixelFormatPacking_NTSCDV25 = 1,
  kPixelFormatPacking_PALDV25 = 2,
  kPixelFormatPacking_NTSCDV100_720p = 3,
  kPixelFormatPacking_PALDV100_720p = 4,
  kPixelFormatPacking_NTSCDV100_1080i = 5,
  kPixelFormatPacking_PALDV100_1080i = 6,
  kPixelFormatPacking_NTSCDV50 = 7,
  kPixelFormatPacking_PALDV50 = 8,
  kPixelFormatPacking_MPEG2PlanarField = 9,
  kPixelFormatPacking_MPEG2PlanarFrame = 10,
  kPixelFormatPacking_MPEG4PlanarField = 11,
  kPixelFormatPacking_MPEG4PlanarFrame = 12,
  kPixelFormatPacking_MPEG4BiPlanarField = 13,
  kPixelFormatPacking_MPEG4BiPlanarFrame = 14,
  kPixelFormatPacking_None = 15,  // only in the Any and Invalid words
};
enum PixelFormatValidity : std::uint32_t {
  kPixelFormatValidity_Invalid = 0,
  kPixelFormatValidity_Specific = 1,
  kPixelFormatValidity_Any = 2,
  // 3 is never produced and matches nothing.
};
enum Interleaving : std::uint32_t {
  kInterleaved = 0,        // all components in one plane
  kInterleavedChroma = 1,  // a luma plane plus one plane of chroma pairs
  kPlanar = 2,             // one plane per component
};

// PixelFormatProperties
//
// One 32-bit word, bit 0 the least significant:
//   bit 0 isYUV, bits 1-3 depth, bit 4 isFloat, bits 5-6 primaries,
//   bit 7 videoRange (1 = narrow range), bits 8-10 alpha, bits 11-12 subsampling,
//   bit 13 swapped (ARGB for BGRA, YUYV for UYVY, Cr first), bit 14 linear,
//   bits 15-18 packing, bits 19-20 validity, bits 21-22 interleaving, the rest 0.
// Two words are equal when all 32 bits are. Setters mask the value to the
// field's width and leave the other fields alone. Trivially copyable.
class PixelFormatProperties {
 public:
  // The invalid word (validity 0, packing 15).
  constexpr PixelFormatProperties() noexcept = default;
  constexpr explicit PixelFormatProperties(std::uint32_t word) noexcept : word_(word) {}

  constexpr std::uint32_t Word() const noexcept { return word_; }

  constexpr bool isYUV() const noexcept { return Field(0, 1) != 0; }
  constexpr PixelFormatDepth depth() const noexcept {
    return static_cast<PixelFormatDepth>(Field(1, 3));
  }
  constexpr bool isFloat() const noexcept { return Field(4, 1) != 0; }
  constexpr PixelFormatPrimaries primaries() const noexcept {
    return static_cast<PixelFormatPrimaries>(Field(5, 2));
  }
  constexpr bool videoRange() const noexcept { return Field(7, 1) != 0; }
  constexpr PixelFormatAlpha alpha() const noexcept {
    return static_cast<PixelFormatAlpha>(Field(8, 3));
  }
  constexpr PixelFormatSubsampling subsampling() const noexcept {
    return static_cast<PixelFormatSubsampling>(Field(11, 2));
  }
  constexpr bool swapped() const noexcept { return Field(13, 1) != 0; }
  constexpr bool linear() const noexcept { return Field(14, 1) != 0; }
  constexpr PixelFormatPacking packing() const noexcept {
    return static_cast<PixelFormatPacking>(Field(15, 4));
  }
  constexpr PixelFormatValidity validity() const noexcept {
    return static_cast<PixelFormatValidity>(Field(19, 2));
  }
  constexpr Interleaving interleaving() const noexcept {
    return static_cast<Interleaving>(Field(21, 2));
  }

  // validity is kPixelFormatValidity_Specific.
  constexpr bool IsSpecific() const noexcept { return validity() == kPixelFormatValidity_Specific; }
  // packing is one of the eight DV packings.
  constexpr bool IsDV() const noexcept { return packing() >= 1 && packing() <= 8; }

  constexpr PixelFormatProperties& SetIsYUV(bool v) noexcept { return SetField(0, 1, v); }
  constexpr PixelFormatProperties& SetDepth(std::uint32_t v) noexcept { return SetField(1, 3, v); }
  constexpr PixelFormatProperties& SetIsFloat(bool v) noexcept { return SetField(4, 1, v); }
  constexpr PixelFormatProperties& SetPrimaries(std::uint32_t v) noexcept {
    return SetField(5, 2, v);
  }
  constexpr PixelFormatProperties& SetVideoRange(bool v) noexcept { return SetField(7, 1, v); }
  constexpr PixelFormatProperties& SetAlpha(std::uint32_t v) noexcept { return SetField(8, 3, v); }
  constexpr PixelFormatProperties& SetSubsampling(std::uint32_t v) noexcept {
    return SetField(11, 2, v);
  }
  constexpr PixelFormatProperties& SetSwapped(bool v) noexcept { return SetField(13, 1, v); }
  constexpr PixelFormatProperties& SetLinear(bool v) noexcept { return SetField(14, 1, v); }
  constexpr PixelFormatProperties& SetPacking(std::uint32_t v) noexcept {
    return SetField(15, 4, v);
  }
  constexpr PixelFormatProperties& SetValidity(std::uint32_t v) noexcept {
    return SetField(19, 2, v);
  }
  constexpr PixelFormatProperties& SetInterleaving(std::uint32_t v) noexcept {
    return SetField(21, 2, v);
  }

  friend constexpr bool operator==(PixelFormatProperties a, PixelFormatProperties b) noexcept {
    return a.word_ == b.word_;
  }
  friend constexpr bool operator!=(PixelFormatProperties a, PixelFormatProperties b) noexcept {
    return a.word_ != b.word_;
  }

 private:
  constexpr std::uint32_t Field(unsigned shift, unsigned bits) const noexcept {
    return (word_ >> shift) & ((1u << bits) - 1u);
  }
  constexpr PixelFormatProperties& SetField(unsigned shift, unsigned bits,
                                            std::uint32_t v) noexcept {
    const std::uint32_t mask = ((1u << bits) - 1u) << shift;
    word_ = (word_ & ~mask) | ((v << shift) & mask);
    return *this;
  }

  std::uint32_t word_ = 0x00078000u;
};

inline constexpr PixelFormatProperties kPixelFormatProperties_Invalid{0x00078000u};
inline constexpr PixelFormatProperties kPixelFormatProperties_Any{0x00178000u};

// PixelFormatProperties for a name: 0 gives kPixelFormatProperties_Any; "badf"
// gives kPixelFormatProperties_Invalid; a custom name ('@' or '_' first) gives
// the registered word or kPixelFormatProperties_Invalid; any other name gives
// the properties of the first catalogue row of that name, or
// kPixelFormatProperties_Invalid. Takes the registry lock for custom names only.
ZEBMEDIATYPES_API PixelFormatProperties LookupPropertiesForName(PixelFormatName name);

// The name for a properties word: kPixelFormatFourCC_Any when validity is 2;
// "badf" when validity is 0 or packing is 15; otherwise the name of the first
// catalogue row whose word equals `p` in all 32 bits, or "badf". The custom
// registry is not consulted. Rows that share a word (the HLG rows share the
// HDR rows' words) resolve to the earlier row.
ZEBMEDIATYPES_API PixelFormatName GuessNameForProperties(PixelFormatProperties p) noexcept;

// PixelFormat
//
// A name and its properties word; 8 bytes, trivially copyable. Equal when both
// fields are equal.
struct PixelFormat {
  // kPixelFormat_Invalid.
  constexpr PixelFormat() noexcept = default;
  constexpr PixelFormat(PixelFormatName name, PixelFormatProperties props) noexcept
      : fourCC(name), properties(props) {}
  // The name with LookupPropertiesForName(name).
  explicit PixelFormat(PixelFormatName name)
      : fourCC(name), properties(LookupPropertiesForName(name)) {}
  // A catalogue row, kPixelFormat_Any or kPixelFormat_Invalid: the row named by
  // GuessNameForProperties(p) with `p` (validity forced to 1), { 0, Any } for an
  // any-word and { badf, Invalid } when no row matches.
  ZEBMEDIATYPES_API explicit PixelFormat(PixelFormatProperties p) noexcept;

  friend constexpr bool operator==(const PixelFormat& a, const PixelFormat& b) noexcept {
    return a.fourCC == b.fourCC && a.properties == b.properties;
  }
  friend constexpr bool operator!=(const PixelFormat& a, const PixelFormat& b) noexcept {
    return !(a == b);
  }

  PixelFormatName fourCC = static_cast<PixelFormatName>(kPixelFormatFourCC_Invalid);
  PixelFormatProperties properties = kPixelFormatProperties_Invalid;
};

inline constexpr PixelFormat kPixelFormat_Invalid{
    static_cast<PixelFormatName>(kPixelFormatFourCC_Invalid), kPixelFormatProperties_Invalid};
inline constexpr PixelFormat kPixelFormat_Any{static_cast<PixelFormatName>(kPixelFormatFourCC_Any),
                                              kPixelFormatProperties_Any};

// The built-in formats, in catalogue order.
inline constexpr PixelFormat kPixelFormat_VUYA_4444_8u{MakePixelFormatName("vuya"),
                                                       PixelFormatProperties(0x00080181)};
inline constexpr PixelFormat kPixelFormat_VUYP_4444_8u{MakePixelFormatName("vuyp"),
                                                       PixelFormatProperties(0x00080281)};
inline constexpr PixelFormat kPixelFormat_VUYX_4444_8u{MakePixelFormatName("vuyx"),
                                                       PixelFormatProperties(0x00080381)};
inline constexpr PixelFormat kPixelFormat_VUYA_4444_8u_709{MakePixelFormatName("VUYA"),
                                                           PixelFormatProperties(0x000801A1)};
inline constexpr PixelFormat kPixelFormat_VUYP_4444_8u_709{MakePixelFormatName("vup7"),
                                                           PixelFormatProperties(0x000802A1)};
inline constexpr PixelFormat kPixelFormat_VUYX_4444_8u_709{MakePixelFormatName("vux7"),
                                                           PixelFormatProperties(0x000803A1)};
inline constexpr PixelFormat kPixelFormat_VUYA_4444_15u{MakePixelFormatName("Vuya"),
                                                        PixelFormatProperties(0x00080185)};
inline constexpr PixelFormat kPixelFormat_VUYP_4444_15u{MakePixelFormatName("Vuyp"),
                                                        PixelFormatProperties(0x00080285)};
inline constexpr PixelFormat kPixelFormat_VUYX_4444_15u{MakePixelFormatName("Vuyx"),
                                                        PixelFormatProperties(0x00080385)};
inline constexpr PixelFormat kPixelFormat_VUYA_4444_32f{MakePixelFormatName("VUya"),
                                                        PixelFormatProperties(0x0008019B)};
inline constexpr PixelFormat kPixelFormat_VUYP_4444_32f{MakePixelFormatName("VUyp"),
                                                        PixelFormatProperties(0x0008029B)};
inline constexpr PixelFormat kPixelFormat_VUYX_4444_32f{MakePixelFormatName("VUyx"),
                                                        PixelFormatProperties(0x0008039B)};
inline constexpr PixelFormat kPixelFormat_VUYA_4444_32f_709{MakePixelFormatName("vUYa"),
                                                            PixelFormatProperties(0x000801BB)};
inline constexpr PixelFormat kPixelFormat_VUYP_4444_32f_709{MakePixelFormatName("VUp7"),
                                                            PixelFormatProperties(0x000802BB)};
inline constexpr PixelFormat kPixelFormat_VUYX_4444_32f_709{MakePixelFormatName("VUx7"),
                                                            PixelFormatProperties(0x000803BB)};
inline constexpr PixelFormat kPixelFormat_BGRA_4444_8u{MakePixelFormatName("bgra"),
                                                       PixelFormatProperties(0x00080120)};
inline constexpr PixelFormat kPixelFormat_BGRP_4444_8u{MakePixelFormatName("bgrp"),
                                                       PixelFormatProperties(0x00080220)};
inline constexpr PixelFormat kPixelFormat_BGRX_4444_8u{MakePixelFormatName("bgrx"),
                                                       PixelFormatProperties(0x00080320)};
inline constexpr PixelFormat kPixelFormat_BGRA_4444_15u{MakePixelFormatName("Bgra"),
                                                        PixelFormatProperties(0x00080124)};
inline constexpr PixelFormat kPixelFormat_BGRP_4444_15u{MakePixelFormatName("Bgrp"),
                                                        PixelFormatProperties(0x00080224)};
inline constexpr PixelFormat kPixelFormat_BGRX_4444_15u{MakePixelFormatName("Bgrx"),
                                                        PixelFormatProperties(0x00080324)};
inline constexpr PixelFormat kPixelFormat_BGRA_4444_32f{MakePixelFormatName("BGra"),
                                                        PixelFormatProperties(0x0008013A)};
inline constexpr PixelFormat kPixelFormat_BGRP_4444_32f{MakePixelFormatName("BGrp"),
                                                        PixelFormatProperties(0x0008023A)};
inline constexpr PixelFormat kPixelFormat_BGRX_4444_32f{MakePixelFormatName("BGrx"),
                                                        PixelFormatProperties(0x0008033A)};
inline constexpr PixelFormat kPixelFormat_BGRA_4444_32f_Linear{MakePixelFormatName("BGaL"),
                                                               PixelFormatProperties(0x0008413A)};
inline constexpr PixelFormat kPixelFormat_BGRP_4444_32f_Linear{MakePixelFormatName("BGpL"),
                                                               PixelFormatProperties(0x0008423A)};
inline constexpr PixelFormat kPixelFormat_BGRX_4444_32f_Linear{MakePixelFormatName("BGxL"),
                                                               PixelFormatProperties(0x0008433A)};
inline constexpr PixelFormat kPixelFormat_ARGB_4444_8u{MakePixelFormatName("argb"),
                                                       PixelFormatProperties(0x00082120)};
inline constexpr PixelFormat kPixelFormat_PRGB_4444_8u{MakePixelFormatName("prgb"),
                                                       PixelFormatProperties(0x00082220)};
inline constexpr PixelFormat kPixelFormat_XRGB_4444_8u{MakePixelFormatName("xrgb"),
                                                       PixelFormatProperties(0x00082320)};
inline constexpr PixelFormat kPixelFormat_ARGB_4444_15u{MakePixelFormatName("Argb"),
                                                        PixelFormatProperties(0x00082124)};
inline constexpr PixelFormat kPixelFormat_PRGB_4444_15u{MakePixelFormatName("Prgb"),
                                                        PixelFormatProperties(0x00082224)};
inline constexpr PixelFormat kPixelFormat_XRGB_4444_15u{MakePixelFormatName("Xrgb"),
                                                        PixelFormatProperties(0x00082324)};
inline constexpr PixelFormat kPixelFormat_ARGB_4444_32f{MakePixelFormatName("ARgb"),
                                                        PixelFormatProperties(0x0008213A)};
inline constexpr PixelFormat kPixelFormat_PRGB_4444_32f{MakePixelFormatName("PRgb"),
                                                        PixelFormatProperties(0x0008223A)};
inline constexpr PixelFormat kPixelFormat_XRGB_4444_32f{MakePixelFormatName("XRgb"),
                                                        PixelFormatProperties(0x0008233A)};
inline constexpr PixelFormat kPixelFormat_ARGB_4444_32f_Linear{MakePixelFormatName("ARgL"),
                                                               PixelFormatProperties(0x0008613A)};
inline constexpr PixelFormat kPixelFormat_PRGB_4444_32f_Linear{MakePixelFormatName("PRgL"),
                                                               PixelFormatProperties(0x0008623A)};
inline constexpr PixelFormat kPixelFormat_XRGB_4444_32f_Linear{MakePixelFormatName("XRgL"),
                                                               PixelFormatProperties(0x0008633A)};
inline constexpr PixelFormat kPixelFormat_ARGB_4444_32f_Planar{MakePixelFormatName("ARgP"),
                                                               PixelFormatProperties(0x0048213A)};
inline constexpr PixelFormat kPixelFormat_RGB_444_32f_Planar{MakePixelFormatName("RGBP"),
                                                             PixelFormatProperties(0x0048203A)};
inline constexpr PixelFormat kPixelFormat_RGB_444_10u{MakePixelFormatName("RGB1"),
                                                      PixelFormatProperties(0x00080022)};
inline constexpr PixelFormat kPixelFormat_UYVY_422_8u{MakePixelFormatName("uyvy"),
                                                      PixelFormatProperties(0x00080881)};
inline constexpr PixelFormat kPixelFormat_UYVY_422_8u_709{MakePixelFormatName("uyv7"),
                                                          PixelFormatProperties(0x000808A1)};
inline constexpr PixelFormat kPixelFormat_YUYV_422_8u{MakePixelFormatName("yuy2"),
                                                      PixelFormatProperties(0x00082881)};
inline constexpr PixelFormat kPixelFormat_YUYV_422_8u_709{MakePixelFormatName("yuy3"),
                                                          PixelFormatProperties(0x000828A1)};
inline constexpr PixelFormat kPixelFormat_UYVY_422_32f{MakePixelFormatName("UYvy"),
                                                       PixelFormatProperties(0x0008089B)};
inline constexpr PixelFormat kPixelFormat_UYVY_422_32f_709{MakePixelFormatName("UYv7"),
                                                           PixelFormatProperties(0x000808BB)};
inline constexpr PixelFormat kPixelFormat_YUYV_422_32f{MakePixelFormatName("YUy2"),
                                                       PixelFormatProperties(0x0008289B)};
inline constexpr PixelFormat kPixelFormat_YUYV_422_32f_709{MakePixelFormatName("YUy3"),
                                                           PixelFormatProperties(0x000828BB)};
inline constexpr PixelFormat kPixelFormat_V210_422_10u{MakePixelFormatName("v210"),
                                                       PixelFormatProperties(0x00080883)};
inline constexpr PixelFormat kPixelFormat_V210_422_10u_709{MakePixelFormatName("v211"),
                                                           PixelFormatProperties(0x000808A3)};
inline constexpr PixelFormat kPixelFormat_V210_422_10u_709_FullRange{
    MakePixelFormatName("v21f"), PixelFormatProperties(0x00080823)};
inline constexpr PixelFormat kPixelFormat_NTSCDV25{MakePixelFormatName("dvn2"),
                                                   PixelFormatProperties(0x00089081)};
inline constexpr PixelFormat kPixelFormat_PALDV25{MakePixelFormatName("dvp2"),
                                                  PixelFormatProperties(0x00091081)};
inline constexpr PixelFormat kPixelFormat_NTSCDV50{MakePixelFormatName("dvn5"),
                                                   PixelFormatProperties(0x000B9081)};
inline constexpr PixelFormat kPixelFormat_PALDV50{MakePixelFormatName("dvp5"),
                                                  PixelFormatProperties(0x000C1081)};
inline constexpr PixelFormat kPixelFormat_NTSC_DV100_720p{MakePixelFormatName("dvn7"),
                                                          PixelFormatProperties(0x000990A1)};
inline constexpr PixelFormat kPixelFormat_PAL_DV100_720p{MakePixelFormatName("dvp7"),
                                                         PixelFormatProperties(0x000A10A1)};
inline constexpr PixelFormat kPixelFormat_NTSC_DV100_1080i{MakePixelFormatName("dvn1"),
                                                           PixelFormatProperties(0x000A90A1)};
inline constexpr PixelFormat kPixelFormat_PAL_DV100_1080i{MakePixelFormatName("dvp1"),
                                                          PixelFormatProperties(0x000B10A1)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601{
    MakePixelFormatName("yvi2"), PixelFormatProperties(0x000C9881)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601{
    MakePixelFormatName("yv12"), PixelFormatProperties(0x000D1881)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange{
    MakePixelFormatName("yvif"), PixelFormatProperties(0x000C9801)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange{
    MakePixelFormatName("yv1f"), PixelFormatProperties(0x000D1801)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709{
    MakePixelFormatName("yvi7"), PixelFormatProperties(0x000C98A1)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709{
    MakePixelFormatName("yv17"), PixelFormatProperties(0x000D18A1)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange{
    MakePixelFormatName("yviF"), PixelFormatProperties(0x000C9821)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange{
    MakePixelFormatName("yv1F"), PixelFormatProperties(0x000D1821)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601{
    MakePixelFormatName("Yvi2"), PixelFormatProperties(0x000D9881)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601{
    MakePixelFormatName("Yv12"), PixelFormatProperties(0x000E1881)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange{
    MakePixelFormatName("Yvif"), PixelFormatProperties(0x000D9801)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange{
    MakePixelFormatName("Yv1f"), PixelFormatProperties(0x000E1801)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709{
    MakePixelFormatName("Yvi7"), PixelFormatProperties(0x000D98A1)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709{
    MakePixelFormatName("Yv17"), PixelFormatProperties(0x000E18A1)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange{
    MakePixelFormatName("YviF"), PixelFormatProperties(0x000D9821)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange{
    MakePixelFormatName("Yv1F"), PixelFormatProperties(0x000E1821)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601{
    MakePixelFormatName("nvi3"), PixelFormatProperties(0x000E9881)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601{
    MakePixelFormatName("nv13"), PixelFormatProperties(0x000F1881)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601_FullRange{
    MakePixelFormatName("nvi1"), PixelFormatProperties(0x000E9801)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601_FullRange{
    MakePixelFormatName("nv11"), PixelFormatProperties(0x000F1801)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709{
    MakePixelFormatName("nvi2"), PixelFormatProperties(0x000E98A1)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709{
    MakePixelFormatName("nv12"), PixelFormatProperties(0x000F18A1)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709_FullRange{
    MakePixelFormatName("nvi0"), PixelFormatProperties(0x000E9821)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709_FullRange{
    MakePixelFormatName("nv10"), PixelFormatProperties(0x000F1821)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601{
    MakePixelFormatName("Nvi3"), PixelFormatProperties(0x000EB881)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601{
    MakePixelFormatName("Nv13"), PixelFormatProperties(0x000F3881)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601_FullRange{
    MakePixelFormatName("Nvi1"), PixelFormatProperties(0x000EB801)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601_FullRange{
    MakePixelFormatName("Nv11"), PixelFormatProperties(0x000F3801)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709{
    MakePixelFormatName("Nvi2"), PixelFormatProperties(0x000EB8A1)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709{
    MakePixelFormatName("Nv12"), PixelFormatProperties(0x000F38A1)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709_FullRange{
    MakePixelFormatName("Nvi0"), PixelFormatProperties(0x000EB821)};
inline constexpr PixelFormat kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709_FullRange{
    MakePixelFormatName("Nv10"), PixelFormatProperties(0x000F3821)};
inline constexpr PixelFormat kPixelFormat_YUV_422_BiPlanar_10u_as16u{
    MakePixelFormatName("Nv16"), PixelFormatProperties(0x00280BA3)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_709{
    MakePixelFormatName("p0i0"), PixelFormatProperties(0x000E98A3)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709{
    MakePixelFormatName("p010"), PixelFormatProperties(0x000F18A3)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_709_FullRange{
        MakePixelFormatName("p0if"), PixelFormatProperties(0x000E9823)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709_FullRange{
        MakePixelFormatName("p01f"), PixelFormatProperties(0x000F1823)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020{
    MakePixelFormatName("P0i0"), PixelFormatProperties(0x000E98C3)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020{
    MakePixelFormatName("P010"), PixelFormatProperties(0x000F18C3)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_FullRange{
        MakePixelFormatName("P0if"), PixelFormatProperties(0x000E9843)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_FullRange{
        MakePixelFormatName("P01f"), PixelFormatProperties(0x000F1843)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR{
    MakePixelFormatName("POi0"), PixelFormatProperties(0x000E98E3)};
inline constexpr PixelFormat kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR{
    MakePixelFormatName("PO10"), PixelFormatProperties(0x000F18E3)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_FullRange{
        MakePixelFormatName("POif"), PixelFormatProperties(0x000E9863)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_FullRange{
        MakePixelFormatName("PO1f"), PixelFormatProperties(0x000F1863)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG{
        MakePixelFormatName("Phl0"), PixelFormatProperties(0x000E98E3)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG{
        MakePixelFormatName("PHL0"), PixelFormatProperties(0x000F18E3)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG_FullRange{
        MakePixelFormatName("Phlf"), PixelFormatProperties(0x000E9863)};
inline constexpr PixelFormat
    kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG_FullRange{
        MakePixelFormatName("PHLf"), PixelFormatProperties(0x000F1863)};
inline constexpr PixelFormat kPixelFormat_Y210_422_10u_as16u_709{MakePixelFormatName("y210"),
                                                                 PixelFormatProperties(0x00080BA3)};
inline constexpr PixelFormat kPixelFormat_Y210_422_10u_as16u_709_FullRange{
    MakePixelFormatName("y21f"), PixelFormatProperties(0x00080B23)};

// The catalogue: 112 formats in the order above (the order every search by
// name or properties finds its first match in). Immutable for the life of the
// library.
ZEBMEDIATYPES_API const PixelFormat* AllPixelFormatsBegin() noexcept;
ZEBMEDIATYPES_API const PixelFormat* AllPixelFormatsEnd() noexcept;

// The custom registry: FourCC -> properties word, process-wide, guarded by its
// own lock; entries are never removed.
//
// RegisterCustomPixelFormatProperties() stores `p` under `fourCC`, replacing an
// earlier entry. A FourCC that is not custom ('@' or '_' first) could never be
// looked up: it is reported as a contract breach and not stored. Throws
// std::bad_alloc when memory runs out (the registry is then unchanged).
ZEBMEDIATYPES_API void RegisterCustomPixelFormatProperties(unsigned int fourCC,
                                                           PixelFormatProperties p);
// The numerically smallest registered FourCC whose word equals `p`, or "badf".
ZEBMEDIATYPES_API unsigned int FindCustomPixelFormatByProperties(PixelFormatProperties p);

// The interleaving field.
constexpr Interleaving GetInterleavingType(PixelFormat pf) noexcept {
  return pf.properties.interleaving();
}

// Planes of a frame: planar words have 4 (specific, 4:4:4, with alpha), 3
// (specific, 4:4:4, no alpha) or 1; chroma-interleaved words 2; the rest 1.
constexpr int GetNumberOfPlanes(PixelFormat pf) noexcept {
  const PixelFormatProperties p = pf.properties;
  switch (p.interleaving()) {
    case kPlanar:
      if (p.IsSpecific() && p.subsampling() == kPixelFormatSubsampling_444) {
        return p.alpha() != kPixelFormatAlpha_None ? 4 : 3;
      }
      return 1;
    case kInterleavedChroma:
      return 2;
    default:
      return 1;
  }
}

// Bytes of one pixel of the first plane as the row rules count it, by the first
// rule that applies, b being the bits of a component (8, 10, 16, 16, 24, 32 by
// depth; 0 for words that are not specific):
//   - planar words: b / 8, one component of one plane (ARgP, RGBP: 4);
//   - 4:4:4 with an alpha slot: 4 * b / 8 (bgra 4, Bgra 8, BGra 16);
//   - 4:2:2: 2 for chroma-interleaved YUV (P210's 16-bit luma sample); else
//     2 * b / 8 (uyvy 2, UYvy 8); at 10 bits, 4 with an ignored-alpha slot
//     (Y210) and 0 without one (V210: six pixels in 16 bytes);
//   - any other 10-bit word: 4. That is RGB1, and also the 10-bit 4:2:0 P010
//     family, although its luma samples take 2 bytes;
//   - 4:4:4 without alpha: 3 * b / 8.
// 0 for the 8-bit 4:2:0 formats (NV12, YV12), for DV and for the rest. The
// strides of every plane come from GetPixelFormatPlaneLayout()
// (pixel_format_selection.h).
constexpr int GetBytesPerPixel(PixelFormat pf) noexcept {
  const PixelFormatProperties p = pf.properties;
  constexpr int kBits[8] = {8, 10, 16, 16, 24, 32, 0, 0};
  const int b = p.IsSpecific() ? kBits[p.depth()] : 0;
  if (p.interleaving() == kPlanar) return b / 8;
  if (p.IsSpecific() && p.subsampling() == kPixelFormatSubsampling_444 &&
      p.alpha() != kPixelFormatAlpha_None) {
    return 4 * b / 8;
  }
  if (p.IsSpecific() && p.subsampling() == kPixelFormatSubsampling_422) {
    if (p.isYUV() && p.interleaving() == kInterleavedChroma) return 2;
    if (b != 10) return 2 * b / 8;
    return p.alpha() == kPixelFormatAlpha_Ignored ? 4 : 0;
  }
  if (b == 10) return 4;
  if (p.IsSpecific() && p.subsampling() == kPixelFormatSubsampling_444 &&
      p.alpha() == kPixelFormatAlpha_None) {
    return 3 * b / 8;
  }
  return 0;
}

// Codec FourCCs (first character in the highest byte) onto their family's
// name: cva1 to cva4 become avci, MCPT becomes MPEG; others are unchanged.
constexpr unsigned int TranslateFourCC(unsigned int code) noexcept {
  if (code >= 0x63766131u && code <= 0x63766134u) return 0x61766369u;
  if (code == 0x4D435054u) return 0x4D504547u;
  return code;
}

}  // namespace zebmediatypes
