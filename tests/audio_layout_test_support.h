// Test helpers: layouts written as abbreviation text ("L R C LFE Ls Rs"), and
// every named layout factory.
#pragma once

#include <zebmediatypes/audio_channel_layout.h>

#include <cstdint>
#include <iterator>
#include <sstream>
#include <stdexcept>
#include <string>
#include <string_view>

namespace zebmediatypes::testing {

struct LabelName {
  const char* abbreviation;
  AudioChannelLabel label;
};

// The abbreviations layouts are written in; "*" is Discrete, "?" an unknown
// value (0xFFFFFFFF) and "#125" the raw value 125.
inline constexpr LabelName kLabelNames[] = {
    {"*", AudioChannelLabel::Discrete},
    {"L", AudioChannelLabel::FrontLeft},
    {"R", AudioChannelLabel::FrontRight},
    {"C", AudioChannelLabel::FrontCenter},
    {"LFE", AudioChannelLabel::LowFrequency},
    {"Ls", AudioChannelLabel::BackLeft},
    {"Rs", AudioChannelLabel::BackRight},
    {"Cs", AudioChannelLabel::BackCenter},
    {"Lc", AudioChannelLabel::FrontLeftOfCenter},
    {"Rc", AudioChannelLabel::FrontRightOfCenter},
    {"Lsd", AudioChannelLabel::SideLeft},
    {"Rsd", AudioChannelLabel::SideRight},
    {"Ts", AudioChannelLabel::TopCenter},
    {"Vhl", AudioChannelLabel::TopFrontLeft},
    {"Vhr", AudioChannelLabel::TopFrontRight},
    {"Vhc", AudioChannelLabel::TopFrontCenter},
    {"Tbl", AudioChannelLabel::TopBackLeft},
    {"Tbr", AudioChannelLabel::TopBackRight},
    {"Tbc", AudioChannelLabel::TopBackCenter},
    {"Lw", AudioChannelLabel::FrontLeftWide},
    {"Rw", AudioChannelLabel::FrontRightWide},
    {"Tsl", AudioChannelLabel::LeftHeight},
    {"Tsr", AudioChannelLabel::RightHeight},
    {"Rls", AudioChannelLabel::RearSurroundLeft},
    {"Rrs", AudioChannelLabel::RearSurroundRight},
    {"LFE2", AudioChannelLabel::LFE2},
    {"Lt", AudioChannelLabel::LeftTotal},
    {"Rt", AudioChannelLabel::RightTotal},
    {"W", AudioChannelLabel::AmbisonicsW},
    {"X", AudioChannelLabel::AmbisonicsX},
    {"Y", AudioChannelLabel::AmbisonicsY},
    {"Z", AudioChannelLabel::AmbisonicsZ},
    {"Bfl", AudioChannelLabel::BottomFrontLeft},
    {"Bfc", AudioChannelLabel::BottomFrontCenter},
    {"Bfr", AudioChannelLabel::BottomFrontRight},
    {"Pl", AudioChannelLabel::ProximityLeft},
    {"Pr", AudioChannelLabel::ProximityRight},
    {"HOA", AudioChannelLabel::AmbisonicsHOA},
    {"?", static_cast<AudioChannelLabel>(0xFFFFFFFFu)},
};

inline AudioChannelLabel ParseLabel(std::string_view word) {
  if (!word.empty() && word[0] == '#') {
    return static_cast<AudioChannelLabel>(std::stoul(std::string(word.substr(1))));
  }
  for (const LabelName& name : kLabelNames) {
    if (word == name.abbreviation) return name.label;
  }
  throw std::invalid_argument("unknown abbreviation " + std::string(word));
}

// "L R C" -> {FrontLeft, FrontRight, FrontCenter}; "" -> empty.
inline AudioChannelLayout ParseLayout(std::string_view text) {
  AudioChannelLayout layout;
  std::istringstream words{std::string(text)};
  std::string word;
  while (words >> word) layout.push_back(ParseLabel(word));
  return layout;
}

inline std::string LabelText(AudioChannelLabel label) {
  for (const LabelName& name : kLabelNames) {
    if (name.label == label) return name.abbreviation;
  }
  return "#" + std::to_string(static_cast<std::uint32_t>(label));
}

inline std::string LayoutText(const AudioChannelLayout& layout) {
  std::string text;
  for (AudioChannelDescription channel : layout) {
    if (!text.empty()) text += ' ';
    text += LabelText(channel.label);
  }
  return text;
}

struct NamedLayout {
  const char* name;
  AudioChannelLayout (*create)();
  const char* order;  // as the name promises, "*" for Discrete
};

inline const NamedLayout kNamedLayouts[] = {
    {"CreateMonoChannelLayout", &CreateMonoChannelLayout, "*"},
    {"CreateStereoChannelLayout", &CreateStereoChannelLayout, "L R"},
    {"CreateMatrixStereoChannelLayout", &CreateMatrixStereoChannelLayout, "Lt Rt"},
    {"Create_Ls_Rs_ChannelLayout", &Create_Ls_Rs_ChannelLayout, "Ls Rs"},
    {"Create_Lc_Rc_ChannelLayout", &Create_Lc_Rc_ChannelLayout, "Lc Rc"},
    {"Create_Lsd_Rsd_ChannelLayout", &Create_Lsd_Rsd_ChannelLayout, "Lsd Rsd"},
    {"Create_C_LFE_ChannelLayout", &Create_C_LFE_ChannelLayout, "C LFE"},
    {"Create_Vhl_Vhr_ChannelLayout", &Create_Vhl_Vhr_ChannelLayout, "Vhl Vhr"},
    {"Create_Tsl_Tsr_ChannelLayout", &Create_Tsl_Tsr_ChannelLayout, "Tsl Tsr"},
    {"Create_Tbl_Tbr_ChannelLayout", &Create_Tbl_Tbr_ChannelLayout, "Tbl Tbr"},
    {"Create_Bfl_Bfr_ChannelLayout", &Create_Bfl_Bfr_ChannelLayout, "Bfl Bfr"},
    {"Create_L_R_C_ChannelLayout", &Create_L_R_C_ChannelLayout, "L R C"},
    {"Create_C_L_R_ChannelLayout", &Create_C_L_R_ChannelLayout, "C L R"},
    {"Create_L_C_R_ChannelLayout", &Create_L_C_R_ChannelLayout, "L C R"},
    {"Create_L_R_Cs_ChannelLayout", &Create_L_R_Cs_ChannelLayout, "L R Cs"},
    {"Create_L_R_LFE_ChannelLayout", &Create_L_R_LFE_ChannelLayout, "L R LFE"},
    {"CreateQuadraphonicChannelLayout", &CreateQuadraphonicChannelLayout, "L R Ls Rs"},
    {"CreateAmbisonicsBFormatChannelLayout", &CreateAmbisonicsBFormatChannelLayout, "W X Y Z"},
    {"Create_L_R_C_Cs_ChannelLayout", &Create_L_R_C_Cs_ChannelLayout, "L R C Cs"},
    {"Create_C_L_R_Cs_ChannelLayout", &Create_C_L_R_Cs_ChannelLayout, "C L R Cs"},
    {"Create_L_C_R_Cs_ChannelLayout", &Create_L_C_R_Cs_ChannelLayout, "L C R Cs"},
    {"Create_L_R_LFE_Cs_ChannelLayout", &Create_L_R_LFE_Cs_ChannelLayout, "L R LFE Cs"},
    {"Create_L_R_Cs_LFE_ChannelLayout", &Create_L_R_Cs_LFE_ChannelLayout, "L R Cs LFE"},
    {"Create_L_R_C_LFE_ChannelLayout", &Create_L_R_C_LFE_ChannelLayout, "L R C LFE"},
    {"Create_L_C_R_LFE_ChannelLayout", &Create_L_C_R_LFE_ChannelLayout, "L C R LFE"},
    {"CreatePentagonalChannelLayout", &CreatePentagonalChannelLayout, "L R Ls Rs C"},
    {"Create_L_R_Ls_Rs_C_ChannelLayout", &Create_L_R_Ls_Rs_C_ChannelLayout, "L R Ls Rs C"},
    {"Create_L_R_C_Ls_Rs_ChannelLayout", &Create_L_R_C_Ls_Rs_ChannelLayout, "L R C Ls Rs"},
    {"Create_L_C_R_Ls_Rs_ChannelLayout", &Create_L_C_R_Ls_Rs_ChannelLayout, "L C R Ls Rs"},
    {"Create_C_L_R_Ls_Rs_ChannelLayout", &Create_C_L_R_Ls_Rs_ChannelLayout, "C L R Ls Rs"},
    {"Create_L_R_LFE_Ls_Rs_ChannelLayout", &Create_L_R_LFE_Ls_Rs_ChannelLayout, "L R LFE Ls Rs"},
    {"Create_L_R_C_LFE_Cs_ChannelLayout", &Create_L_R_C_LFE_Cs_ChannelLayout, "L R C LFE Cs"},
    {"Create_L_C_R_Cs_LFE_ChannelLayout", &Create_L_C_R_Cs_LFE_ChannelLayout, "L C R Cs LFE"},
    {"Create_L_R_Ls_Rs_LFE_ChannelLayout", &Create_L_R_Ls_Rs_LFE_ChannelLayout, "L R Ls Rs LFE"},
    {"CreateBroadcast51ChannelLayout", &CreateBroadcast51ChannelLayout, "L R C LFE Ls Rs"},
    {"Create51ChannelLayout", &Create51ChannelLayout, "L R C LFE Ls Rs"},
    {"CreateLegacy51ChannelLayout", &CreateLegacy51ChannelLayout, "L R Ls Rs C LFE"},
    {"CreateHexagonalChannelLayout", &CreateHexagonalChannelLayout, "L R Ls Rs C Cs"},
    {"Create_L_C_R_Ls_Rs_LFE_ChannelLayout", &Create_L_C_R_Ls_Rs_LFE_ChannelLayout,
     "L C R Ls Rs LFE"},
    {"Create_C_L_R_Ls_Rs_LFE_ChannelLayout", &Create_C_L_R_Ls_Rs_LFE_ChannelLayout,
     "C L R Ls Rs LFE"},
    {"Create_C_L_R_Ls_Rs_Cs_ChannelLayout", &Create_C_L_R_Ls_Rs_Cs_ChannelLayout, "C L R Ls Rs Cs"},
    {"Create_L_R_C_Ls_Rs_Cs_ChannelLayout", &Create_L_R_C_Ls_Rs_Cs_ChannelLayout, "L R C Ls Rs Cs"},
    {"Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout", &Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout,
     "L R Ls Rs Lsd Rsd"},
    {"Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout", &Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout,
     "L R C LFE Ls Rs Cs"},
    {"Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout", &Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout,
     "L R LFE Ls Rs Lsd Rsd"},
    {"Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout", &Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout,
     "L R Ls Rs C Rls Rrs"},
    {"Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout", &Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout,
     "L R Ls Rs C Lc Rc"},
    {"Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout", &Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout,
     "L R C Ls Rs Lc Rc"},
    {"Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout", &Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout,
     "C L R Ls Rs Cs LFE"},
    {"Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout", &Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout,
     "C L R Ls Rs Rls Rrs"},
    {"Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout", &Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout,
     "L R C Ls Rs Lsd Rsd"},
    {"Create7_1ChannelLayout", &Create7_1ChannelLayout, "L R C LFE Ls Rs Lc Rc"},
    {"Create7_1MpegChannelLayout", &Create7_1MpegChannelLayout, "C Lc Rc L R Ls Rs LFE"},
    {"Create7_1ItuChannelLayout", &Create7_1ItuChannelLayout, "L R C LFE Ls Rs Rls Rrs"},
    {"Create7_1EMagicChannelLayout", &Create7_1EMagicChannelLayout, "L R Ls Rs C LFE Lc Rc"},
    {"Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout", &Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout,
     "L R C LFE Ls Rs Lsd Rsd"},
    {"Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout", &Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout,
     "L R C LFE Ls Rs Pl Pr"},
    {"CreateSmpteDtvChannelLayout", &CreateSmpteDtvChannelLayout, "L R C LFE Ls Rs Lt Rt"},
    {"CreateOctagonalChannelLayout", &CreateOctagonalChannelLayout, "L R Ls Rs C Cs Lsd Rsd"},
    {"Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout", &Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout,
     "C L R Ls Rs Rls Rrs Cs"},
    {"Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout", &Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout,
     "L R C Ls Rs Lc Rc Cs"},
    {"Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout", &Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout,
     "L R C Ls Rs Cs Lsd Rsd"},
    {"CreateCubeChannelLayout", &CreateCubeChannelLayout, "L R Ls Rs Vhl Vhr Tbl Tbr"},
    {"Create_VST_7_1_Cine_Top_Center_Layout", &Create_VST_7_1_Cine_Top_Center_Layout,
     "L R C LFE Ls Rs Cs Ts"},
    {"Create_VST_7_1_Cine_Center_High_Layout", &Create_VST_7_1_Cine_Center_High_Layout,
     "L R C LFE Ls Rs Cs Vhc"},
    {"Create_VST_7_1_Cine_Front_High_Layout", &Create_VST_7_1_Cine_Front_High_Layout,
     "L R C LFE Ls Rs Vhl Vhr"},
    {"Create_VST_7_1_Cine_Side_High_Layout", &Create_VST_7_1_Cine_Side_High_Layout,
     "L R C LFE Ls Rs Tsl Tsr"},
    {"Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout",
     &Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout, "L R C LFE Ls Rs Lc Rc Cs"},
    {"Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout",
     &Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout, "L R C LFE Ls Rs Cs Lsd Rsd"},
    {"Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout",
     &Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout, "L R LFE Ls Rs Vhl Vhc Vhr Bfc"},
    {"Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Vhl Vhr Tbl Tbr"},
    {"Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout, "L R C LFE Ls Rs Vhl Vhr Tbl Tbr"},
    {"Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout",
     &Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout, "L R C LFE Ls Rs Lsd Rsd Tsl Tsr"},
    {"Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout, "L R C Ls Rs Ts Vhl Vhr Tbl Tbr"},
    {"Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout,
     "L R C LFE Ls Rs Ts Vhl Vhr Tbl Tbr"},
    {"Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout,
     "L R C Ls Rs Ts Vhl Vhc Vhr Tbl Tbr"},
    {"CreateVST10_2ChannelLayout", &CreateVST10_2ChannelLayout,
     "L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2"},
    {"Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout,
     "L R C LFE Ls Rs Ts Vhl Vhc Vhr Tbl Tbr"},
    {"Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout,
     "L R C Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"},
    {"CreateVST10_2_PlusChannelLayout", &CreateVST10_2_PlusChannelLayout,
     "L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2"},
    {"Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
     &Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout,
     "L R C LFE Ls Rs Cs Ts Vhl Vhc Vhr Tbl Tbc Tbr"},
    {"CreateSMPTEDigitalCinema1Channel", &CreateSMPTEDigitalCinema1Channel,
     "* * C * * * * * * * * * * * * *"},
    {"CreateSMPTEDigitalCinema2Channel", &CreateSMPTEDigitalCinema2Channel,
     "Lt Rt * * * * * * * * * * * * * *"},
    {"CreateSMPTEDigitalCinema4Channel", &CreateSMPTEDigitalCinema4Channel,
     "L R C * Cs * * * * * * * * * * *"},
    {"CreateSMPTEDigitalCinema6Channel", &CreateSMPTEDigitalCinema6Channel,
     "L R C LFE Ls Rs * * * * * * * * * *"},
    {"CreateSMPTEDigitalCinema7Channel", &CreateSMPTEDigitalCinema7Channel,
     "L R C LFE Ls Rs * * Cs * * * * * * *"},
    {"CreateSMPTEDigitalCinema8Channel", &CreateSMPTEDigitalCinema8Channel,
     "L R C LFE Ls Rs Lc Rc * * * * * * * *"},
    {"CreateSMPTEDigitalCinema9Channel", &CreateSMPTEDigitalCinema9Channel,
     "L R C LFE Ls Rs Lc Rc Cs * * * * * * *"},
};
static_assert(std::size(kNamedLayouts) == kNamedAudioChannelLayoutCount);

}  // namespace zebmediatypes::testing
