#include <zebcore/localizer.h>
#include <zebcore/string.h>
#include <zebmediatypes/video_descriptions.h>

#include <iterator>
#include <ostream>
#include <string_view>

#include "pixel_format_catalogue.h"

namespace zebmediatypes {
namespace {

using zebcore::UTF16String;

UTF16String Localize(std::string_view key) {
  return zebcore::config::Localizer::Get().Localize(key);
}

UTF16String Ascii(std::string_view text) { return zebcore::string::AsciiToUTF16(text); }

// The four characters of a 32-bit code, highest byte first.
UTF16String FourCCText(std::uint32_t code) {
  char text[4];
  for (int i = 0; i < 4; ++i) {
    const auto byte = static_cast<unsigned char>(code >> (24 - 8 * i));
    text[i] = byte < 32 ? ' ' : byte >= 128 ? '?' : static_cast<char>(byte);
  }
  return zebcore::string::UTF8to16(std::string_view(text, 4));
}

// "BGRA 4444", "YUV 422", "VUYX".
UTF16String ComponentsAndSampling(PixelFormatProperties p) {
  std::string text = p.isYUV() ? (p.swapped() ? "YUV" : "VUY") : (p.swapped() ? "RGB" : "BGR");
  constexpr char kAlphaLetters[8] = {0, 'A', 'P', 'X', 0, 0, 0, 0};
  if (const char letter = kAlphaLetters[p.alpha()]) {
    text.insert(p.swapped() ? text.begin() : text.end(), letter);
  }
  switch (p.subsampling()) {
    case kPixelFormatSubsampling_444:
      text += " 4444";
      break;
    case kPixelFormatSubsampling_422:
      text += " 422";
      break;
    default:
      break;
  }
  return Ascii(text);
}

UTF16String PackingHead(PixelFormatProperties p, std::uint32_t fourCC) {
  constexpr const char* kDVNames[] = {"NTSC DV",
                                      "PAL DV",
                                      "NTSC DV 100 (720p)",
                                      "PAL DV 100 (720p)",
                                      "NTSC DV 100 (1080i)",
                                      "PAL DV 100 (1080i)",
                                      "NTSC DV 50",
                                      "PAL DV 50"};
  static_assert(std::size(kDVNames) == 8);
  constexpr const char* k420Keys[] = {
      "$$$/zebmediatypes/PixelFormat/MPEG2Field=YUV 420 MPEG2 Field",
      "$$$/zebmediatypes/PixelFormat/MPEG2Frame=YUV 420 MPEG2 Frame",
      "$$$/zebmediatypes/PixelFormat/MPEG4Field=YUV 420 MPEG4 Field",
      "$$$/zebmediatypes/PixelFormat/MPEG4Frame=YUV 420 MPEG4 Frame",
      "$$$/zebmediatypes/PixelFormat/MPEG4FieldBiPlanar=YUV 420 MPEG4 Field BiPlanar",
      "$$$/zebmediatypes/PixelFormat/MPEG4FrameBiPlanar=YUV 420 MPEG4 Frame BiPlanar"};
  static_assert(std::size(k420Keys) == 6);

  const PixelFormatPacking packing = p.packing();
  if (packing == kPixelFormatPacking_Uncompressed) return ComponentsAndSampling(p);
  if (packing <= kPixelFormatPacking_PALDV50) return Ascii(kDVNames[packing - 1]);
  if (packing <= kPixelFormatPacking_MPEG4BiPlanarFrame) {
    return Localize(k420Keys[packing - kPixelFormatPacking_MPEG2PlanarField]);
  }
  return zebcore::string::ReplaceInString(
      Localize("$$$/zebmediatypes/PixelFormat/UnknownCompressed=Unknown Compressed Pixel "
               "Format (@0)"),
      FourCCText(fourCC));
}

}  // namespace

UTF16String PixelFormatDescription(PixelFormat pf) {
  const PixelFormatProperties p = pf.properties;
  if (p.validity() == kPixelFormatValidity_Any) {
    return Localize("$$$/zebmediatypes/PixelFormat/Any=Any Pixel Format");
  }
  if (IsCustomPixelFormatName(pf.fourCC)) {
    return zebcore::string::ReplaceInString(
        Localize("$$$/zebmediatypes/PixelFormat/Custom=Custom Pixel Format (@0)"),
        FourCCText(pf.fourCC));
  }
  if (p.validity() == kPixelFormatValidity_Invalid) {
    return Localize("$$$/zebmediatypes/PixelFormat/Unknown=Unknown Pixel Format");
  }

  UTF16String text = PackingHead(p, pf.fourCC);
  const bool layoutIsKnown = p.packing() == kPixelFormatPacking_Uncompressed ||
                             (p.isYUV() && p.packing() >= kPixelFormatPacking_MPEG2PlanarField &&
                              p.packing() <= kPixelFormatPacking_MPEG4BiPlanarFrame &&
                              p.subsampling() == kPixelFormatSubsampling_420);
  if (!layoutIsKnown) return text;

  constexpr const char* kDepths[8] = {"8", "10", "15", "16", "24", "32", "", ""};
  constexpr const char* kPrimaries[4] = {"601", "709", "2020", "2020 HDR"};
  text += u' ';
  text += Ascii(kDepths[p.depth()]);
  text += p.isFloat() ? u'f' : u'u';
  if (p.isYUV()) {
    text += u' ';
    text += Ascii(kPrimaries[p.primaries()]);
  }
  if (p.linear()) {
    text += u' ';
    text += Localize("$$$/zebmediatypes/PixelFormat/Linear=Linear");
  }
  if (!p.videoRange()) {
    text += u' ';
    text += Localize("$$$/zebmediatypes/PixelFormat/FullRange=Full Range");
  }
  return text;
}

std::ostream& operator<<(std::ostream& out, const PixelFormat& pf) {
  return out << zebcore::string::UTF16toNarrow(zebcore::string::View(PixelFormatDescription(pf)));
}

zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out,
                                          const PixelFormat& pf) {
  return out << PixelFormatDescription(pf);
}

zebcore::UTF8String GetFourCCDescriptiveName(PixelFormatName name) {
  const details::PixelFormatEntry* e = details::FindBuiltInPixelFormat(name);
  const char* text = e != nullptr && e->descriptiveName != nullptr ? e->descriptiveName : "Invalid";
  return zebcore::string::ToUTF8String(text);
}

UTF16String AlphaDescription(const AlphaChannel& alpha) {
  switch (alpha) {
    case kAlphaChannel_Straight:
      return Localize("$$$/zebmediatypes/AlphaChannel/Straight=Straight Alpha");
    case kAlphaChannel_Premultiplied:
      return Localize("$$$/zebmediatypes/AlphaChannel/Premultiplied=Premultiplied Alpha");
    default:
      return Localize("$$$/zebmediatypes/AlphaChannel/None=None");
  }
}

UTF16String FieldTypeDescription(FieldType type, LocalizedDescription localized) {
  struct Row {
    FieldType type;
    const char* key;
    const char* english;
  };
  constexpr Row kRows[] = {
      {kFieldType_Progressive, "$$$/zebmediatypes/FieldType/NoFields=No Fields (Progressive Scan)",
       "Progressive Scan"},
      {kFieldType_UpperFirst, "$$$/zebmediatypes/FieldType/UpperFirst=Upper Field First",
       "Upper Field First"},
      {kFieldType_LowerFirst, "$$$/zebmediatypes/FieldType/LowerFirst=Lower Field First",
       "Lower Field First"},
      {kFieldType_UnknownDominance,
       "$$$/zebmediatypes/FieldType/UnknownDominance=Fields (Unknown Dominance)",
       "Unknown Dominance"},
      {kFieldType_Any, "$$$/zebmediatypes/FieldType/Any=Any Field Order", "Any Field Order"},
      {kFieldType_Unknown, "$$$/zebmediatypes/FieldType/Invald=Field Presence Unknown",
       "Field Presence Unknown"},
  };
  static_assert(std::size(kRows) == 6);
  for (const Row& row : kRows) {
    if (row.type == type) return localized == 1 ? Localize(row.key) : Ascii(row.english);
  }
  return {};
}

UTF16String PixelAspectRatioDescription(PixelAspectRatio r) {
  struct Row {
    PixelAspectRatio ratio;
    const char* key;
  };
  constexpr Row kRows[] = {
      {kPixelAspectRatio_Square,
       "$$$/zebmediatypes/PixelAspectRatioFormat/Square=Square Pixels (@0)"},
      {kPixelAspectRatio_DVNTSC, "$$$/zebmediatypes/PixelAspectRatioFormat/D1NTSC=D1/DV NTSC (@0)"},
      {kPixelAspectRatio_DVNTSCWide,
       "$$$/zebmediatypes/PixelAspectRatioFormat/D1NTSCWideScreen=D1/DV NTSC Widescreen 16:9 "
       "(@0)"},
      {kPixelAspectRatio_DVPAL, "$$$/zebmediatypes/PixelAspectRatioFormat/D1PAL=D1/DV PAL (@0)"},
      {kPixelAspectRatio_DVPALWide,
       "$$$/zebmediatypes/PixelAspectRatioFormat/D1PALWide=D1/DV PAL Widescreen 16:9 (@0)"},
      {kPixelAspectRatio_Anamorphic,
       "$$$/zebmediatypes/PixelAspectRatioFormat/Anamorphic=Anamorphic 2:1 (@0)"},
      {kPixelAspectRatio_HDAnamorphic1080,
       "$$$/zebmediatypes/PixelAspectRatioFormat/HDAnamorphic1080=HD Anamorphic 1080 (@0)"},
      {kPixelAspectRatio_DVCProHD,
       "$$$/zebmediatypes/PixelAspectRatioFormat/DVCProHD=DVCPRO HD (@0)"},
  };
  static_assert(std::size(kRows) == 8);
  const char* key = "$$$/zebmediatypes/PixelAspectRatioFormat/Other=Other Aspect Ratio (@0)";
  for (const Row& row : kRows) {
    if (r == row.ratio) {
      key = row.key;
      break;
    }
  }
  return zebcore::string::ReplaceInString(Localize(key), r.GetDisplayString());
}

UTF16String VideoFrameSizeDescription(zebcore::geom::RectT<int> rect, PixelAspectRatio r) {
  const UTF16String width = Ascii(std::to_string(rect.width));
  const UTF16String height = Ascii(std::to_string(rect.height));
  if (r == kPixelAspectRatio_Unknown) {
    return zebcore::string::ReplaceInString(
        Localize("$$$/zebmediatypes/VideoFrameSizeFormat=@0w @1h"), width, height);
  }
  return zebcore::string::ReplaceInString(
      Localize("$$$/zebmediatypes/VideoFrameSizeFormatPAR=@0w @1h (@2)"), width, height,
      r.GetDisplayString());
}

UTF16String RenderQualityDescription(RenderQuality quality) {
  constexpr const char* kKeys[] = {
      "$$$/zebmediatypes/RenderQuality/Draft=Draft", "$$$/zebmediatypes/RenderQuality/Low=Low",
      "$$$/zebmediatypes/RenderQuality/Medium=Medium", "$$$/zebmediatypes/RenderQuality/High=High",
      "$$$/zebmediatypes/RenderQuality/Max=Max"};
  static_assert(std::size(kKeys) == kRenderQuality_Max);
  if (quality < kRenderQuality_Draft || quality > kRenderQuality_Max) return {};
  return Localize(kKeys[quality - kRenderQuality_Draft]);
}

namespace {

// Codes lo..hi (inclusive) and their family, searched in order.
struct CodecFamilyRow {
  std::uint32_t lo;
  std::uint32_t hi;
  const char* family;
};

constexpr CodecFamilyRow Code(std::uint32_t code, const char* family) {
  return {code, code, family};
}

constexpr CodecFamilyRow kCodecFamilies[] = {
    Code(0x4156646E, "DNxHD"),
    Code(0x41566468, "DNxHR"),
    {0x68647631, 0x68647639, "HDV"},
    Code(0x68647661, "HDV"),
    Code(0x61703468, "ProRes"),
    Code(0x61703478, "ProRes"),
    Code(0x61706368, "ProRes"),
    Code(0x6170636E, "ProRes"),
    Code(0x6170636F, "ProRes"),
    Code(0x61706373, "ProRes"),
    Code(0x61707268, "ProRes RAW"),
    Code(0x6170726E, "ProRes RAW"),
    Code(0x78643539, "XDCAM HD"),
    {0x78643561, 0x78643566, "XDCAM HD"},
    Code(0x78646832, "XDCAM HD"),
    Code(0x78646864, "XDCAM HD"),
    {0x78647631, 0x78647639, "XDCAM HD"},
    Code(0x78647661, "XDCAM HD"),
    Code(0x58434558, "XDCAM EX"),
    {0x78647662, 0x78647666, "XDCAM EX"},
    Code(0x30357664, "DV"),
    Code(0x31687664, "DV"),
    Code(0x32357664, "DV"),
    Code(0x64737632, "DV"),
    Code(0x64737664, "DV"),
    Code(0x6473766E, "DV"),
    Code(0x64737670, "DV"),
    Code(0x6476356E, "DV"),
    Code(0x64763570, "DV"),
    Code(0x64766320, "DV"),
    Code(0x64766370, "DV"),
    Code(0x64767070, "DV"),
    Code(0x64766832, "DVCPRO HD"),
    Code(0x64766833, "DVCPRO HD"),
    Code(0x64766835, "DVCPRO HD"),
    Code(0x64766836, "DVCPRO HD"),
    Code(0x64766870, "DVCPRO HD"),
    Code(0x64766871, "DVCPRO HD"),
    Code(0x64766E31, "DVCPRO HD"),
    Code(0x64766E35, "DVCPRO HD"),
    Code(0x64766E37, "DVCPRO HD"),
    Code(0x64767031, "DVCPRO HD"),
    Code(0x64767035, "DVCPRO HD"),
    Code(0x64767037, "DVCPRO HD"),
    Code(0x53524157, "Sony RAW"),
    Code(0x584F434E, "Sony XOCN"),
    Code(0x52454443, "REDCODE RAW"),
    Code(0x41525249, "ARRIRAW"),
    Code(0x61693132, "AVC-Intra"),
    Code(0x61693133, "AVC-Intra"),
    Code(0x61693135, "AVC-Intra"),
    Code(0x61693136, "AVC-Intra"),
    Code(0x61693170, "AVC-Intra"),
    Code(0x61693171, "AVC-Intra"),
    Code(0x61693532, "AVC-Intra"),
    Code(0x61693533, "AVC-Intra"),
    Code(0x61693535, "AVC-Intra"),
    Code(0x61693536, "AVC-Intra"),
    Code(0x61693570, "AVC-Intra"),
    Code(0x61693571, "AVC-Intra"),
    Code(0x61766369, "AVC-Intra"),
    Code(0x42524157, "Blackmagic RAW"),
    Code(0x43524157, "Canon RAW"),
    Code(0x43464844, "Cineform"),
    Code(0x6A706567, "JPEG"),
    Code(0x6A703263, "JPEG 2000"),
    Code(0x706E6720, "PNG"),
    Code(0x74696666, "TIFF"),
    Code(0x6D6A7067, "Motion JPEG"),
    Code(0x4D504731, "MPEG 1"),
    Code(0x4D504547, "MPEG 2"),
    Code(0x4D504734, "MPEG 4"),
    Code(0x61766331, "H.264"),
    Code(0x48323634, "H.264"),
    Code(0x48455643, "HEVC"),
    Code(0x44505820, "Cineon / DPX"),
    Code(0x41473137, "AVC Long GOP"),
    Code(0x41473174, "AVC Long GOP"),
    Code(0x41473537, "AVC Long GOP"),
    Code(0x41473574, "AVC Long GOP"),
    Code(0x61763130, "AVC Long GOP"),
    Code(0x61766C30, "AVC Long GOP"),
    Code(0x61766C32, "AVC Long GOP"),
    Code(0x30313276, "Uncompressed YUV"),
    Code(0x32595559, "Uncompressed YUV"),
    Code(0x33595559, "Uncompressed YUV"),
    Code(0x55595659, "Uncompressed YUV"),
    Code(0x59555632, "Uncompressed YUV"),
    Code(0x59563132, "Uncompressed YUV"),
    Code(0x59565955, "Uncompressed YUV"),
    Code(0x76323130, "Uncompressed YUV"),
    Code(0x79767975, "Uncompressed YUV"),
    Code(0x61616320, "AAC"),
    Code(0x41414320, "AAC"),
    Code(0x31366265, "Uncompressed (PCM)"),
    Code(0x31366C65, "Uncompressed (PCM)"),
    Code(0x32336C66, "Uncompressed (PCM)"),
    Code(0x32336E69, "Uncompressed (PCM)"),
    Code(0x34326E69, "Uncompressed (PCM)"),
    Code(0x34366C66, "Uncompressed (PCM)"),
    Code(0x50434D20, "Uncompressed (PCM)"),
    Code(0x666C3332, "Uncompressed (PCM)"),
    Code(0x666C3634, "Uncompressed (PCM)"),
    Code(0x696E3234, "Uncompressed (PCM)"),
    Code(0x696E3332, "Uncompressed (PCM)"),
    Code(0x6C70636D, "Uncompressed (PCM)"),
    Code(0x70636D20, "Uncompressed (PCM)"),
    Code(0x72617720, "Uncompressed (PCM)"),
    Code(0x74776F73, "Uncompressed (PCM)"),
    Code(0x2E6D7031, "MPEG Audio"),
    Code(0x2E6D7032, "MPEG Audio"),
    Code(0x2E6D7033, "MPEG Audio"),
    Code(0x6D703120, "MPEG Audio"),
    Code(0x6D703220, "MPEG Audio"),
    Code(0x6D703461, "MPEG Audio"),
    Code(0x61632D33, "Dolby Digital"),
    Code(0x65632D33, "Dolby Digital Plus"),
    Code(0x616C6163, "Apple Lossless"),
    Code(0x696D6134, "IMA 4:1 ADPCM"),
    Code(0x4D414333, "MACE 3:1"),
    Code(0x4D414336, "MACE 6:1"),
    Code(0x756C6177, "Mu-Law PCM"),
    Code(0x616C6177, "A-Law PCM"),
    Code(0x6170636D, "ADPCM"),
    Code(0x776D6120, "Windows Media Audio"),
    Code(0x77617663, "WAVE compressed"),
};
static_assert(std::size(kCodecFamilies) == 126);

}  // namespace

std::string GetCodecFamilyName(unsigned int code) {
  for (const CodecFamilyRow& row : kCodecFamilies) {
    if (code >= row.lo && code <= row.hi) return row.family;
  }
  return "unknown";
}

}  // namespace zebmediatypes
