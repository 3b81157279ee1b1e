#include <zebcore/allocator.h>
#include <zebcore/assert.h>
#include <zebmediatypes/pixel_format.h>

#include <array>
#include <boost/thread/locks.hpp>
#include <boost/thread/mutex.hpp>
#include <cstdint>
#include <functional>
#include <iterator>
#include <map>

#include "pixel_format_catalogue.h"

namespace zebmediatypes {
namespace details {
namespace {

// One row per built-in format, in catalogue order.
constexpr PixelFormatEntry kBuiltInPixelFormats[] = {
    {kPixelFormat_VUYA_4444_8u, "VUYA_4444_8u"},
    {kPixelFormat_VUYP_4444_8u, "VUYP_4444_8u"},
    {kPixelFormat_VUYX_4444_8u, "VUYX_4444_8u"},
    {kPixelFormat_VUYA_4444_8u_709, "VUYA_4444_8u_709"},
    {kPixelFormat_VUYP_4444_8u_709, "VUYP_4444_8u_709"},
    {kPixelFormat_VUYX_4444_8u_709, "VUYX_4444_8u_709"},
    {kPixelFormat_VUYA_4444_15u, "VUYA_4444_15u"},
    {kPixelFormat_VUYP_4444_15u, "VUYP_4444_15u"},
    {kPixelFormat_VUYX_4444_15u, "VUYX_4444_15u"},
    {kPixelFormat_VUYA_4444_32f, "VUYA_4444_32f"},
    {kPixelFormat_VUYP_4444_32f, "VUYP_4444_32f"},
    {kPixelFormat_VUYX_4444_32f, "VUYX_4444_32f"},
    {kPixelFormat_VUYA_4444_32f_709, "VUYA_4444_32f_709"},
    {kPixelFormat_VUYP_4444_32f_709, "VUYP_4444_32f_709"},
    {kPixelFormat_VUYX_4444_32f_709, "VUYX_4444_32f_709"},
    {kPixelFormat_BGRA_4444_8u, "BGRA_4444_8u"},
    {kPixelFormat_BGRP_4444_8u, "BGRP_4444_8u"},
    {kPixelFormat_BGRX_4444_8u, "BGRX_4444_8u"},
    {kPixelFormat_BGRA_4444_15u, "BGRA_4444_15u"},
    {kPixelFormat_BGRP_4444_15u, "BGRP_4444_15u"},
    {kPixelFormat_BGRX_4444_15u, "BGRX_4444_15u"},
    {kPixelFormat_BGRA_4444_32f, "BGRA_4444_32f"},
    {kPixelFormat_BGRP_4444_32f, "BGRP_4444_32f"},
    {kPixelFormat_BGRX_4444_32f, "BGRX_4444_32f"},
    {kPixelFormat_BGRA_4444_32f_Linear, "BGRA_4444_32f_Linear"},
    {kPixelFormat_BGRP_4444_32f_Linear, "BGRP_4444_32f_Linear"},
    {kPixelFormat_BGRX_4444_32f_Linear, "BGRX_4444_32f_Linear"},
    {kPixelFormat_ARGB_4444_8u, "ARGB_4444_8u"},
    {kPixelFormat_PRGB_4444_8u, "PRGB_4444_8u"},
    {kPixelFormat_XRGB_4444_8u, "XRGB_4444_8u"},
    {kPixelFormat_ARGB_4444_15u, "ARGB_4444_15u"},
    {kPixelFormat_PRGB_4444_15u, "PRGB_4444_15u"},
    {kPixelFormat_XRGB_4444_15u, "XRGB_4444_15u"},
    {kPixelFormat_ARGB_4444_32f, "ARGB_4444_32f"},
    {kPixelFormat_PRGB_4444_32f, "PRGB_4444_32f"},
    {kPixelFormat_XRGB_4444_32f, "XRGB_4444_32f"},
    {kPixelFormat_ARGB_4444_32f_Linear, "ARGB_4444_32f_Linear"},
    {kPixelFormat_PRGB_4444_32f_Linear, "PRGB_4444_32f_Linear"},
    {kPixelFormat_XRGB_4444_32f_Linear, "XRGB_4444_32f_Linear"},
    {kPixelFormat_ARGB_4444_32f_Planar, "ARGB_4444_32f_Planar"},
    {kPixelFormat_RGB_444_32f_Planar, "RGB_444_32f_Planar"},
    {kPixelFormat_RGB_444_10u, "RGB_444_10u"},
    {kPixelFormat_UYVY_422_8u, "UYVY_422_8u"},
    {kPixelFormat_UYVY_422_8u_709, "UYVY_422_8u_709"},
    {kPixelFormat_YUYV_422_8u, "YUYV_422_8u"},
    {kPixelFormat_YUYV_422_8u_709, "YUYV_422_8u_709"},
    {kPixelFormat_UYVY_422_32f, "UYVY_422_32f"},
    {kPixelFormat_UYVY_422_32f_709, "UYVY_422_32f_709"},
    {kPixelFormat_YUYV_422_32f, "YUYV_422_32f"},
    {kPixelFormat_YUYV_422_32f_709, "YUYV_422_32f_709"},
    {kPixelFormat_V210_422_10u, "V210_422_10u"},
    {kPixelFormat_V210_422_10u_709, "V210_422_10u_709"},
    {kPixelFormat_V210_422_10u_709_FullRange, nullptr},
    {kPixelFormat_NTSCDV25, "NTSCDV25"},
    {kPixelFormat_PALDV25, "PALDV25"},
    {kPixelFormat_NTSCDV50, "NTSCDV50"},
    {kPixelFormat_PALDV50, "PALDV50"},
    {kPixelFormat_NTSC_DV100_720p, "NTSC_DV100_720p"},
    {kPixelFormat_PAL_DV100_720p, "PAL_DV100_720p"},
    {kPixelFormat_NTSC_DV100_1080i, "NTSC_DV100_1080i"},
    {kPixelFormat_PAL_DV100_1080i, "PAL_DV100_1080i"},
    {kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601, "YUV_420_MPEG2_FIELD"},
    {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, "YUV_420_MPEG2_FRAME"},
    {kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_601_FullRange,
     "YUV_420_MPEG2_FIELD_FullRange"},
    {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601_FullRange,
     "YUV_420_MPEG2_FRAME_FullRange"},
    {kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709, "YUV_420_MPEG2_FIELD_709"},
    {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709, "YUV_420_MPEG2_FRAME_709"},
    {kPixelFormat_YUV_420_MPEG2_FIELD_PICTURE_PLANAR_8u_709_FullRange,
     "YUV_420_MPEG2_FIELD_FullRange_709"},
    {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_709_FullRange,
     "YUV_420_MPEG2_FRAME_FullRange_709"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601, "YUV_420_MPEG4_FIELD"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601, "YUV_420_MPEG4_FRAME"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_601_FullRange,
     "YUV_420_MPEG4_FIELD_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_601_FullRange,
     "YUV_420_MPEG4_FRAME_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709, "YUV_420_MPEG4_FIELD_709"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709, "YUV_420_MPEG4_FRAME_709"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_PLANAR_8u_709_FullRange,
     "YUV_420_MPEG4_FIELD_FullRange_709"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_PLANAR_8u_709_FullRange,
     "YUV_420_MPEG4_FRAME_FullRange_709"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601, "NV12_MPEG4_FIELD"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601, "NV12_MPEG4_FRAME"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601_FullRange,
     "NV12_MPEG4_FIELD_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601_FullRange,
     "NV12_MPEG4_FRAME_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709, "NV12_MPEG4_FIELD_709"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, "NV12_MPEG4_FRAME_709"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709_FullRange,
     "NV12_MPEG4_FIELD_709_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709_FullRange,
     "NV12_MPEG4_FRAME_709_FullRange"},
    {kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601, "YVU_420_BIPLANAR_MPEG4_FIELD"},
    {kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601, "YVU_420_BIPLANAR_MPEG4_FRAME"},
    {kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_601_FullRange,
     "YVU_420_BIPLANAR_MPEG4_FIELD_FullRange"},
    {kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_601_FullRange,
     "YVU_420_BIPLANAR_MPEG4_FRAME_FullRange"},
    {kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709, "YVU_420_BIPLANAR_MPEG4_FIELD_709"},
    {kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, "YVU_420_BIPLANAR_MPEG4_FRAME_709"},
    {kPixelFormat_YVU_420_MPEG4_FIELD_PICTURE_BIPLANAR_8u_709_FullRange,
     "YVU_420_BIPLANAR_MPEG4_FIELD_709_FullRange"},
    {kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709_FullRange,
     "YVU_420_BIPLANAR_MPEG4_FRAME_709_FullRange"},
    {kPixelFormat_YUV_422_BiPlanar_10u_as16u, "P210_422_BIPLANAR_10"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_709, "P010_MPEG4_FIELD_709"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, "P010_MPEG4_FRAME_709"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_709_FullRange,
     "P010_MPEG4_FIELD_709_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709_FullRange,
     "P010_MPEG4_FRAME_709_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020, "P010_MPEG4_FIELD_2020"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020, "P010_MPEG4_FRAME_2020"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_FullRange,
     "P010_MPEG4_FIELD_2020_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_FullRange,
     "P010_MPEG4_FRAME_2020_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR, "P010_MPEG4_FIELD_HDR"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR, "P010_MPEG4_FRAME_HDR"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_FullRange,
     "P010_MPEG4_FIELD_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_FullRange,
     "P010_MPEG4_FRAME_FullRange"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG,
     "P010_MPEG4_FIELD_HDR_HLG"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG,
     "P010_MPEG4_FRAME_HDR_HLG"},
    {kPixelFormat_YUV_420_MPEG4_FIELD_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG_FullRange,
     "P010_MPEG4_FIELD_FullRange_HLG"},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_2020_HDR_HLG_FullRange,
     "P010_MPEG4_FRAME_FullRange_HLG"},
    {kPixelFormat_Y210_422_10u_as16u_709, nullptr},
    {kPixelFormat_Y210_422_10u_as16u_709_FullRange, nullptr},
};
static_assert(std::size(kBuiltInPixelFormats) == kBuiltInPixelFormatCount);

// Open-addressing hash indexes over the catalogue, built at compile time.
// A slot holds a row number + 1 (0 = empty). Rows are inserted in catalogue
// order and a key already present is not inserted again, so a lookup finds
// the first row of a key, as a scan in catalogue order would.
constexpr std::size_t kIndexSlots = 256;  // more than twice the rows: short probes
using HashIndex = std::array<std::uint8_t, kIndexSlots>;

constexpr std::size_t Slot(std::uint32_t key) noexcept {
  return static_cast<std::size_t>((key * 0x9E3779B1u) >> 24);
}

constexpr std::uint32_t NameKey(const PixelFormatEntry& e) noexcept { return e.format.fourCC; }
constexpr std::uint32_t WordKey(const PixelFormatEntry& e) noexcept {
  return e.format.properties.Word();
}

template <class Key>
constexpr HashIndex BuildIndex(Key key) {
  HashIndex index{};
  for (std::size_t row = 0; row < kBuiltInPixelFormatCount; ++row) {
    const std::uint32_t k = key(kBuiltInPixelFormats[row]);
    std::size_t slot = Slot(k);
    bool present = false;
    while (index[slot] != 0 && !present) {
      present = key(kBuiltInPixelFormats[index[slot] - 1]) == k;
      if (!present) slot = (slot + 1) % kIndexSlots;
    }
    if (!present) index[slot] = static_cast<std::uint8_t>(row + 1);
  }
  return index;
}

constexpr HashIndex kIndexByName = BuildIndex(NameKey);
constexpr HashIndex kIndexByWord = BuildIndex(WordKey);

// The first row (in catalogue order) whose key is `k`, or null. Terminates:
// the index always has empty slots.
template <class Key>
const PixelFormatEntry* FindFirst(const HashIndex& index, Key key, std::uint32_t k) noexcept {
  for (std::size_t slot = Slot(k);; slot = (slot + 1) % kIndexSlots) {
    const std::uint8_t row = index[slot];
    if (row == 0) return nullptr;
    if (key(kBuiltInPixelFormats[row - 1]) == k) return &kBuiltInPixelFormats[row - 1];
  }
}

constexpr std::size_t FilledSlots(const HashIndex& index) {
  std::size_t filled = 0;
  for (std::uint8_t row : index) filled += row != 0 ? 1 : 0;
  return filled;
}

// The formats alone, contiguous, for AllPixelFormatsBegin/End.
constexpr std::array<PixelFormat, kBuiltInPixelFormatCount> CatalogueFormats() {
  std::array<PixelFormat, kBuiltInPixelFormatCount> formats{};
  for (std::size_t i = 0; i < formats.size(); ++i) formats[i] = kBuiltInPixelFormats[i].format;
  return formats;
}
constexpr std::array<PixelFormat, kBuiltInPixelFormatCount> kCatalogue = CatalogueFormats();

constexpr bool CatalogueFactsHold() {
  for (const PixelFormatEntry& e : kBuiltInPixelFormats) {
    const std::uint32_t name = e.format.fourCC;
    if (!e.format.properties.IsSpecific()) return false;
    if (name == kPixelFormatFourCC_Any || name == kPixelFormatFourCC_Invalid) return false;
    if (IsCustomPixelFormatName(name)) return false;
  }
  // Names are unique; properties words are unique but for the four HLG rows,
  // which share the HDR rows' words.
  return FilledSlots(kIndexByName) == kBuiltInPixelFormatCount &&
         FilledSlots(kIndexByWord) == kBuiltInPixelFormatCount - 4;
}
static_assert(CatalogueFactsHold());

// The custom registry, created on first use and never destroyed before exit.
struct CustomRegistry {
  using Map = std::map<
      std::uint32_t, PixelFormatProperties, std::less<std::uint32_t>,
      zebcore::allocator::STLAllocator<std::pair<const std::uint32_t, PixelFormatProperties>>>;
  boost::mutex mutex;
  Map entries;
};

CustomRegistry& Registry() {
  static CustomRegistry registry;
  return registry;
}

}  // namespace

const PixelFormatEntry* FindBuiltInPixelFormat(std::uint32_t name) noexcept {
  return FindFirst(kIndexByName, NameKey, name);
}

}  // namespace details

PixelFormatProperties LookupPropertiesForName(PixelFormatName name) {
  if (name == kPixelFormatFourCC_Any) return kPixelFormatProperties_Any;
  if (name == kPixelFormatFourCC_Invalid) return kPixelFormatProperties_Invalid;
  if (IsCustomPixelFormatName(name)) {
    details::CustomRegistry& registry = details::Registry();
    boost::lock_guard<boost::mutex> lock(registry.mutex);
    const auto it = registry.entries.find(name);
    return it == registry.entries.end() ? kPixelFormatProperties_Invalid : it->second;
  }
  const details::PixelFormatEntry* e = details::FindBuiltInPixelFormat(name);
  return e != nullptr ? e->format.properties : kPixelFormatProperties_Invalid;
}

PixelFormatName GuessNameForProperties(PixelFormatProperties p) noexcept {
  if (p.validity() == kPixelFormatValidity_Any) {
    return static_cast<PixelFormatName>(kPixelFormatFourCC_Any);
  }
  const auto invalid = static_cast<PixelFormatName>(kPixelFormatFourCC_Invalid);
  if (p.validity() == kPixelFormatValidity_Invalid || p.packing() == kPixelFormatPacking_None) {
    return invalid;
  }
  const details::PixelFormatEntry* e =
      details::FindFirst(details::kIndexByWord, details::WordKey, p.Word());
  return e != nullptr ? e->format.fourCC : invalid;
}

PixelFormat::PixelFormat(PixelFormatProperties p) noexcept {
  const PixelFormatName name = GuessNameForProperties(p);
  if (name == kPixelFormatFourCC_Invalid) {
    *this = kPixelFormat_Invalid;
  } else if (name == kPixelFormatFourCC_Any) {
    *this = kPixelFormat_Any;
  } else {
    fourCC = name;
    properties = p.SetValidity(kPixelFormatValidity_Specific);
  }
}

const PixelFormat* AllPixelFormatsBegin() noexcept { return details::kCatalogue.data(); }
const PixelFormat* AllPixelFormatsEnd() noexcept {
  return details::kCatalogue.data() + details::kCatalogue.size();
}

void RegisterCustomPixelFormatProperties(unsigned int fourCC, PixelFormatProperties p) {
  if (!IsCustomPixelFormatName(fourCC)) {
    zebcore::debug::ReportAssertion(
        "IsCustomPixelFormatName(fourCC)",
        "A custom pixel format's FourCC must begin with '@' or '_'; the format was not registered",
        "PixelFormat", "zebmediatypes::RegisterCustomPixelFormatProperties", __LINE__);
    return;
  }
  details::CustomRegistry& registry = details::Registry();
  boost::lock_guard<boost::mutex> lock(registry.mutex);
  registry.entries.insert_or_assign(fourCC, p);
}

unsigned int FindCustomPixelFormatByProperties(PixelFormatProperties p) {
  details::CustomRegistry& registry = details::Registry();
  boost::lock_guard<boost::mutex> lock(registry.mutex);
  for (const auto& [fourCC, word] : registry.entries) {
    if (word == p) return fourCC;
  }
  return kPixelFormatFourCC_Invalid;
}

}  // namespace zebmediatypes
