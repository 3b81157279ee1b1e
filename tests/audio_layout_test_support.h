// Test helpers: layouts written as abbreviation text ("L R C LFE Ls Rs"), and
// every named layout factory.
#pragma once

#include <gtest/gtest.h>
#include <zebmediatypes/audio_channel_layout.h>

#include <algorithm>
#include <cstdint>
#include <iterator>
#include <sstream>
#include <stdexcept>
#include <string>
#include <string_view>

namespace zebmediatypes::testing {

// The abbreviations of the known labels in ascending value order: 0, 100 to
// 119, 127 to 143. In layout text "*" is Discrete and "?" the unknown value
// 0xFFFFFFFF; other values print as numbers.
inline constexpr std::string_view kAbbreviations[] = {
    "*",   "L",   "R",   "C",   "LFE", "Ls",  "Rs",  "Cs",  "Lc",  "Rc",  "Lsd", "Rsd", "Ts",
    "Vhl", "Vhr", "Vhc", "Tbl", "Tbr", "Tbc", "Lw",  "Rw",  "Tsl", "Tsr", "Rls", "Rrs", "LFE2",
    "Lt",  "Rt",  "W",   "X",   "Y",   "Z",   "Bfl", "Bfc", "Bfr", "Pl",  "Pr",  "HOA"};
static_assert(std::size(kAbbreviations) == kAudioChannelLabelCount);
inline constexpr auto kUnknownLabel = static_cast<AudioChannelLabel>(0xFFFFFFFFu);

constexpr std::uint32_t KnownLabelValue(std::size_t index) {
  return index == 0 ? 0u : static_cast<std::uint32_t>(index <= 20 ? 99 + index : 106 + index);
}

inline AudioChannelLabel ParseLabel(std::string_view word) {
  if (word == "?") return kUnknownLabel;
  const auto* found = std::find(std::begin(kAbbreviations), std::end(kAbbreviations), word);
  if (found == std::end(kAbbreviations)) throw std::invalid_argument(std::string(word));
  return AudioChannelLabel(KnownLabelValue(static_cast<std::size_t>(found - kAbbreviations)));
}

inline std::string LabelText(AudioChannelLabel label) {
  const auto value = static_cast<std::uint32_t>(label);
  if (label == kUnknownLabel) return "?";
  for (std::size_t k = 0; k < std::size(kAbbreviations); ++k) {
    if (value == KnownLabelValue(k)) return std::string(kAbbreviations[k]);
  }
  return std::to_string(value);
}

// "L R C" -> {FrontLeft, FrontRight, FrontCenter}; "" -> empty.
inline AudioChannelLayout ParseLayout(std::string_view text) {
  AudioChannelLayout layout;
  std::istringstream words{std::string(text)};
  for (std::string word; words >> word;) layout.push_back(ParseLabel(word));
  return layout;
}

inline std::string LayoutText(const AudioChannelLayout& layout) {
  std::string text;
  for (AudioChannelDescription c : layout) text += (text.empty() ? "" : " ") + LabelText(c.label);
  return text;
}

struct NamedLayout {
  const char* name;
  AudioChannelLayout (*create)();
  const char* spelled;  // "A_B" for Create_A_B_ChannelLayout, else nullptr
};

#define ZMT_NAMED(factory) \
  NamedLayout { #factory, &factory, nullptr }
#define ZMT_SPELLED(order) \
  NamedLayout { "Create_" #order "_ChannelLayout", &Create_##order##_ChannelLayout, #order }
inline const NamedLayout kNamedLayouts[] = {
    ZMT_NAMED(CreateMonoChannelLayout),
    ZMT_NAMED(CreateStereoChannelLayout),
    ZMT_NAMED(CreateMatrixStereoChannelLayout),
    ZMT_SPELLED(Ls_Rs),
    ZMT_SPELLED(Lc_Rc),
    ZMT_SPELLED(Lsd_Rsd),
    ZMT_SPELLED(C_LFE),
    ZMT_SPELLED(Vhl_Vhr),
    ZMT_SPELLED(Tsl_Tsr),
    ZMT_SPELLED(Tbl_Tbr),
    ZMT_SPELLED(Bfl_Bfr),
    ZMT_SPELLED(L_R_C),
    ZMT_SPELLED(C_L_R),
    ZMT_SPELLED(L_C_R),
    ZMT_SPELLED(L_R_Cs),
    ZMT_SPELLED(L_R_LFE),
    ZMT_NAMED(CreateQuadraphonicChannelLayout),
    ZMT_NAMED(CreateAmbisonicsBFormatChannelLayout),
    ZMT_SPELLED(L_R_C_Cs),
    ZMT_SPELLED(C_L_R_Cs),
    ZMT_SPELLED(L_C_R_Cs),
    ZMT_SPELLED(L_R_LFE_Cs),
    ZMT_SPELLED(L_R_Cs_LFE),
    ZMT_SPELLED(L_R_C_LFE),
    ZMT_SPELLED(L_C_R_LFE),
    ZMT_NAMED(CreatePentagonalChannelLayout),
    ZMT_SPELLED(L_R_Ls_Rs_C),
    ZMT_SPELLED(L_R_C_Ls_Rs),
    ZMT_SPELLED(L_C_R_Ls_Rs),
    ZMT_SPELLED(C_L_R_Ls_Rs),
    ZMT_SPELLED(L_R_LFE_Ls_Rs),
    ZMT_SPELLED(L_R_C_LFE_Cs),
    ZMT_SPELLED(L_C_R_Cs_LFE),
    ZMT_SPELLED(L_R_Ls_Rs_LFE),
    ZMT_NAMED(CreateBroadcast51ChannelLayout),
    ZMT_NAMED(Create51ChannelLayout),
    ZMT_NAMED(CreateLegacy51ChannelLayout),
    ZMT_NAMED(CreateHexagonalChannelLayout),
    ZMT_SPELLED(L_C_R_Ls_Rs_LFE),
    ZMT_SPELLED(C_L_R_Ls_Rs_LFE),
    ZMT_SPELLED(C_L_R_Ls_Rs_Cs),
    ZMT_SPELLED(L_R_C_Ls_Rs_Cs),
    ZMT_SPELLED(L_R_Ls_Rs_Lsd_Rsd),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Cs),
    ZMT_SPELLED(L_R_LFE_Ls_Rs_Lsd_Rsd),
    ZMT_SPELLED(L_R_Ls_Rs_C_Rls_Rrs),
    ZMT_SPELLED(L_R_Ls_Rs_C_Lc_Rc),
    ZMT_SPELLED(L_R_C_Ls_Rs_Lc_Rc),
    ZMT_SPELLED(C_L_R_Ls_Rs_Cs_LFE),
    ZMT_SPELLED(C_L_R_Ls_Rs_Rls_Rrs),
    ZMT_SPELLED(L_R_C_Ls_Rs_Lsd_Rsd),
    ZMT_NAMED(Create7_1ChannelLayout),
    ZMT_NAMED(Create7_1MpegChannelLayout),
    ZMT_NAMED(Create7_1ItuChannelLayout),
    ZMT_NAMED(Create7_1EMagicChannelLayout),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Lsd_Rsd),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Pl_Pr),
    ZMT_NAMED(CreateSmpteDtvChannelLayout),
    ZMT_NAMED(CreateOctagonalChannelLayout),
    ZMT_SPELLED(C_L_R_Ls_Rs_Rls_Rrs_Cs),
    ZMT_SPELLED(L_R_C_Ls_Rs_Lc_Rc_Cs),
    ZMT_SPELLED(L_R_C_Ls_Rs_Cs_Lsd_Rsd),
    ZMT_NAMED(CreateCubeChannelLayout),
    ZMT_NAMED(Create_VST_7_1_Cine_Top_Center_Layout),
    ZMT_NAMED(Create_VST_7_1_Cine_Center_High_Layout),
    ZMT_NAMED(Create_VST_7_1_Cine_Front_High_Layout),
    ZMT_NAMED(Create_VST_7_1_Cine_Side_High_Layout),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Lc_Rc_Cs),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd),
    ZMT_SPELLED(L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc),
    ZMT_SPELLED(L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr),
    ZMT_SPELLED(L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr),
    ZMT_SPELLED(L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr),
    ZMT_NAMED(CreateVST10_2ChannelLayout),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr),
    ZMT_NAMED(Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout),
    ZMT_NAMED(CreateVST10_2_PlusChannelLayout),
    ZMT_NAMED(Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout),
    ZMT_NAMED(CreateSMPTEDigitalCinema1Channel),
    ZMT_NAMED(CreateSMPTEDigitalCinema2Channel),
    ZMT_NAMED(CreateSMPTEDigitalCinema4Channel),
    ZMT_NAMED(CreateSMPTEDigitalCinema6Channel),
    ZMT_NAMED(CreateSMPTEDigitalCinema7Channel),
    ZMT_NAMED(CreateSMPTEDigitalCinema8Channel),
    ZMT_NAMED(CreateSMPTEDigitalCinema9Channel),
};
#undef ZMT_SPELLED
#undef ZMT_NAMED
static_assert(std::size(kNamedLayouts) == kNamedAudioChannelLayoutCount);

// Calls check(source, destination) for every ordered pair of named layouts.
template <typename Check>
void ForEachPairOfNamedLayouts(Check check) {
  for (const NamedLayout& from : kNamedLayouts) {
    const AudioChannelLayout source = from.create();
    for (const NamedLayout& to : kNamedLayouts) {
      SCOPED_TRACE(std::string(from.name) + " -> " + to.name);
      check(source, to.create());
    }
  }
}

}  // namespace zebmediatypes::testing
