// Test helpers: layouts written as abbreviation text ("L R C LFE Ls Rs"), and
// every named layout factory with the channel order its name promises.
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
// 119, 127 to 143. In layout text "*" is Discrete, "?" the unknown value
// 0xFFFFFFFF and "#125" the raw value 125.
// clang-format off
inline constexpr std::string_view kAbbreviations[] = {
    "*", "L", "R", "C", "LFE", "Ls", "Rs", "Cs", "Lc", "Rc", "Lsd", "Rsd", "Ts", "Vhl", "Vhr", "Vhc",
    "Tbl", "Tbr", "Tbc", "Lw", "Rw", "Tsl", "Tsr", "Rls", "Rrs", "LFE2", "Lt", "Rt", "W", "X", "Y",
    "Z", "Bfl", "Bfc", "Bfr", "Pl", "Pr", "HOA"};
// clang-format on
static_assert(std::size(kAbbreviations) == kAudioChannelLabelCount);
inline constexpr auto kUnknownLabel = static_cast<AudioChannelLabel>(0xFFFFFFFFu);

constexpr std::uint32_t KnownLabelValue(std::size_t index) {
  return index == 0 ? 0u : static_cast<std::uint32_t>(index <= 20 ? 99 + index : 106 + index);
}

inline AudioChannelLabel ParseLabel(std::string_view word) {
  if (word == "?") return kUnknownLabel;
  if (word[0] == '#') return AudioChannelLabel(std::stoul(std::string(word.substr(1))));
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
  return "#" + std::to_string(value);
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
  const char* order;  // nullptr where the name Create_A_B_..._ChannelLayout spells it (ZMT_SPELLED)
};

inline std::string PromisedOrder(const NamedLayout& named) {
  if (named.order != nullptr) return named.order;
  const std::string_view name = named.name;
  std::string order(name.substr(7, name.size() - 7 - 14));
  std::replace(order.begin(), order.end(), '_', ' ');
  return order;
}

// clang-format off
#define ZMT_LAYOUT(factory, order) NamedLayout{#factory, &factory, order}
#define ZMT_SPELLED(order) NamedLayout{"Create_" #order "_ChannelLayout", &Create_##order##_ChannelLayout, nullptr}
inline const NamedLayout kNamedLayouts[] = {
    ZMT_LAYOUT(CreateMonoChannelLayout, "*"), ZMT_LAYOUT(CreateStereoChannelLayout, "L R"),
    ZMT_LAYOUT(CreateMatrixStereoChannelLayout, "Lt Rt"), ZMT_SPELLED(Ls_Rs), ZMT_SPELLED(Lc_Rc), ZMT_SPELLED(Lsd_Rsd),
    ZMT_SPELLED(C_LFE), ZMT_SPELLED(Vhl_Vhr), ZMT_SPELLED(Tsl_Tsr), ZMT_SPELLED(Tbl_Tbr), ZMT_SPELLED(Bfl_Bfr), ZMT_SPELLED(L_R_C),
    ZMT_SPELLED(C_L_R), ZMT_SPELLED(L_C_R), ZMT_SPELLED(L_R_Cs), ZMT_SPELLED(L_R_LFE),
    ZMT_LAYOUT(CreateQuadraphonicChannelLayout, "L R Ls Rs"), ZMT_LAYOUT(CreateAmbisonicsBFormatChannelLayout, "W X Y Z"),
    ZMT_SPELLED(L_R_C_Cs), ZMT_SPELLED(C_L_R_Cs), ZMT_SPELLED(L_C_R_Cs), ZMT_SPELLED(L_R_LFE_Cs), ZMT_SPELLED(L_R_Cs_LFE),
    ZMT_SPELLED(L_R_C_LFE), ZMT_SPELLED(L_C_R_LFE), ZMT_LAYOUT(CreatePentagonalChannelLayout, "L R Ls Rs C"),
    ZMT_SPELLED(L_R_Ls_Rs_C), ZMT_SPELLED(L_R_C_Ls_Rs), ZMT_SPELLED(L_C_R_Ls_Rs), ZMT_SPELLED(C_L_R_Ls_Rs),
    ZMT_SPELLED(L_R_LFE_Ls_Rs), ZMT_SPELLED(L_R_C_LFE_Cs), ZMT_SPELLED(L_C_R_Cs_LFE), ZMT_SPELLED(L_R_Ls_Rs_LFE),
    ZMT_LAYOUT(CreateBroadcast51ChannelLayout, "L R C LFE Ls Rs"), ZMT_LAYOUT(Create51ChannelLayout, "L R C LFE Ls Rs"),
    ZMT_LAYOUT(CreateLegacy51ChannelLayout, "L R Ls Rs C LFE"), ZMT_LAYOUT(CreateHexagonalChannelLayout, "L R Ls Rs C Cs"),
    ZMT_SPELLED(L_C_R_Ls_Rs_LFE), ZMT_SPELLED(C_L_R_Ls_Rs_LFE), ZMT_SPELLED(C_L_R_Ls_Rs_Cs), ZMT_SPELLED(L_R_C_Ls_Rs_Cs),
    ZMT_SPELLED(L_R_Ls_Rs_Lsd_Rsd), ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Cs), ZMT_SPELLED(L_R_LFE_Ls_Rs_Lsd_Rsd),
    ZMT_SPELLED(L_R_Ls_Rs_C_Rls_Rrs), ZMT_SPELLED(L_R_Ls_Rs_C_Lc_Rc), ZMT_SPELLED(L_R_C_Ls_Rs_Lc_Rc),
    ZMT_SPELLED(C_L_R_Ls_Rs_Cs_LFE), ZMT_SPELLED(C_L_R_Ls_Rs_Rls_Rrs), ZMT_SPELLED(L_R_C_Ls_Rs_Lsd_Rsd),
    ZMT_LAYOUT(Create7_1ChannelLayout, "L R C LFE Ls Rs Lc Rc"), ZMT_LAYOUT(Create7_1MpegChannelLayout, "C Lc Rc L R Ls Rs LFE"),
    ZMT_LAYOUT(Create7_1ItuChannelLayout, "L R C LFE Ls Rs Rls Rrs"),
    ZMT_LAYOUT(Create7_1EMagicChannelLayout, "L R Ls Rs C LFE Lc Rc"), ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Lsd_Rsd),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Pl_Pr), ZMT_LAYOUT(CreateSmpteDtvChannelLayout, "L R C LFE Ls Rs Lt Rt"),
    ZMT_LAYOUT(CreateOctagonalChannelLayout, "L R Ls Rs C Cs Lsd Rsd"), ZMT_SPELLED(C_L_R_Ls_Rs_Rls_Rrs_Cs),
    ZMT_SPELLED(L_R_C_Ls_Rs_Lc_Rc_Cs), ZMT_SPELLED(L_R_C_Ls_Rs_Cs_Lsd_Rsd),
    ZMT_LAYOUT(CreateCubeChannelLayout, "L R Ls Rs Vhl Vhr Tbl Tbr"),
    ZMT_LAYOUT(Create_VST_7_1_Cine_Top_Center_Layout, "L R C LFE Ls Rs Cs Ts"),
    ZMT_LAYOUT(Create_VST_7_1_Cine_Center_High_Layout, "L R C LFE Ls Rs Cs Vhc"),
    ZMT_LAYOUT(Create_VST_7_1_Cine_Front_High_Layout, "L R C LFE Ls Rs Vhl Vhr"),
    ZMT_LAYOUT(Create_VST_7_1_Cine_Side_High_Layout, "L R C LFE Ls Rs Tsl Tsr"), ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Lc_Rc_Cs),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd), ZMT_SPELLED(L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc), ZMT_SPELLED(L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr), ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr),
    ZMT_SPELLED(L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr), ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr),
    ZMT_SPELLED(L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr),
    ZMT_LAYOUT(CreateVST10_2ChannelLayout, "L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2"),
    ZMT_SPELLED(L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr),
    ZMT_LAYOUT(Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
    ZMT_LAYOUT(CreateVST10_2_PlusChannelLayout, "L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2"),
    ZMT_LAYOUT(Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"),
    ZMT_LAYOUT(CreateSMPTEDigitalCinema1Channel, "* * C * * * * * * * * * * * * *"),
    ZMT_LAYOUT(CreateSMPTEDigitalCinema2Channel, "Lt Rt * * * * * * * * * * * * * *"),
    ZMT_LAYOUT(CreateSMPTEDigitalCinema4Channel, "L R C * Cs * * * * * * * * * * *"),
    ZMT_LAYOUT(CreateSMPTEDigitalCinema6Channel, "L R C LFE Ls Rs * * * * * * * * * *"),
    ZMT_LAYOUT(CreateSMPTEDigitalCinema7Channel, "L R C LFE Ls Rs * * Cs * * * * * * *"),
    ZMT_LAYOUT(CreateSMPTEDigitalCinema8Channel, "L R C LFE Ls Rs Lc Rc * * * * * * * *"),
    ZMT_LAYOUT(CreateSMPTEDigitalCinema9Channel, "L R C LFE Ls Rs Lc Rc Cs * * * * * * *"),
};
// clang-format on
#undef ZMT_LAYOUT
#undef ZMT_SPELLED
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
