// The label constants and the common-layout catalogue of "AudioChannelLayout".
#include <zebmediatypes/scripting/audio_constants.h>

#include <iterator>
#include <utility>

namespace zebmediatypes::scripting {
namespace {

constexpr std::array<AudioChannelLabelConstant, kAudioChannelLabelConstantCount> kLabelConstants{{
    {"AUDIOCHANNELLABEL_DISCRETE", AudioChannelLabel::Discrete, "Discrete"},
    {"AUDIOCHANNELLABEL_FRONTLEFT", AudioChannelLabel::FrontLeft, "Front-Left"},
    {"AUDIOCHANNELLABEL_FRONTRIGHT", AudioChannelLabel::FrontRight, "Front-Right"},
    {"AUDIOCHANNELLABEL_FRONTCENTER", AudioChannelLabel::FrontCenter, "Front-Center"},
    {"AUDIOCHANNELLABEL_LOWFREQUENCY", AudioChannelLabel::LowFrequency, "Low-Frequency"},
    {"AUDIOCHANNELLABEL_BACKLEFT", AudioChannelLabel::BackLeft, "Back-Left"},
    {"AUDIOCHANNELLABEL_BACKRIGHT", AudioChannelLabel::BackRight, "Back-Right"},
    {"AUDIOCHANNELLABEL_FRONTLEFTOFCENTER", AudioChannelLabel::FrontLeftOfCenter,
     "Front-Left-Of-Center"},
    {"AUDIOCHANNELLABEL_FRONTRIGHTOFCENTER", AudioChannelLabel::FrontRightOfCenter,
     "Front-Right-Of-Center"},
    {"AUDIOCHANNELLABEL_BACKCENTER", AudioChannelLabel::BackCenter, "Back-Center"},
    {"AUDIOCHANNELLABEL_SIDELEFT", AudioChannelLabel::SideLeft, "Side-Left"},
    {"AUDIOCHANNELLABEL_SIDERIGHT", AudioChannelLabel::SideRight, "Side-Right"},
    {"AUDIOCHANNELLABEL_TOPCENTER", AudioChannelLabel::TopCenter, "Top-Center"},
    {"AUDIOCHANNELLABEL_TOPFRONTLEFT", AudioChannelLabel::TopFrontLeft, "Top-Front-Left"},
    {"AUDIOCHANNELLABEL_TOPFRONTCENTER", AudioChannelLabel::TopFrontCenter, "Top-Front-Center"},
    {"AUDIOCHANNELLABEL_TOPFRONTRIGHT", AudioChannelLabel::TopFrontRight, "Top-Front-Right"},
    {"AUDIOCHANNELLABEL_TOPBACKLEFT", AudioChannelLabel::TopBackLeft, "Top-Back-Left"},
    {"AUDIOCHANNELLABEL_TOPBACKCENTER", AudioChannelLabel::TopBackCenter, "Top-Back-Center"},
    {"AUDIOCHANNELLABEL_TOPBACKRIGHT", AudioChannelLabel::TopBackRight, "Top-Back-Right"},
    {"AUDIOCHANNELLABEL_FRONTLEFTWIDE", AudioChannelLabel::FrontLeftWide, "Front-Left-Wide"},
    {"AUDIOCHANNELLABEL_FRONTRIGHTWIDE", AudioChannelLabel::FrontRightWide, "Front-Right-Wide"},
    {"AUDIOCHANNELLABEL_LEFTHEIGHT", AudioChannelLabel::LeftHeight, "Left-Height"},
    {"AUDIOCHANNELLABEL_RIGHTHEIGHT", AudioChannelLabel::RightHeight, "Right-Height"},
    {"AUDIOCHANNELLABEL_REARSURROUNDLEFT", AudioChannelLabel::RearSurroundLeft,
     "Rear-Surround-Left"},
    {"AUDIOCHANNELLABEL_REARSURROUNDRIGHT", AudioChannelLabel::RearSurroundRight,
     "Rear-Surround-Right"},
    {"AUDIOCHANNELLABEL_LFE2", AudioChannelLabel::LFE2, "LFE2"},
    {"AUDIOCHANNELLABEL_LEFTTOTAL", AudioChannelLabel::LeftTotal, "Left-Total"},
    {"AUDIOCHANNELLABEL_RIGHTTOTAL", AudioChannelLabel::RightTotal, "Right-Total"},
    {"AUDIOCHANNELLABEL_AMBISONIC_W", AudioChannelLabel::AmbisonicsW, "Ambisonic-W"},
    {"AUDIOCHANNELLABEL_AMBISONIC_X", AudioChannelLabel::AmbisonicsX, "Ambisonic-X"},
    {"AUDIOCHANNELLABEL_AMBISONIC_Y", AudioChannelLabel::AmbisonicsY, "Ambisonic-Y"},
    {"AUDIOCHANNELLABEL_AMBISONIC_Z", AudioChannelLabel::AmbisonicsZ, "Ambisonic-Z"},
    {"AUDIOCHANNELLABEL_BOTTOMFRONTLEFT", AudioChannelLabel::BottomFrontLeft, "Bottom-Front-Left"},
    {"AUDIOCHANNELLABEL_BOTTOMFRONTCENTER", AudioChannelLabel::BottomFrontCenter,
     "Bottom-Front-Center"},
    {"AUDIOCHANNELLABEL_BOTTOMFRONTRIGHT", AudioChannelLabel::BottomFrontRight,
     "Bottom-Front-Right"},
    {"AUDIOCHANNELLABEL_PROXIMITYLEFT", AudioChannelLabel::ProximityLeft, "Proximity-Left"},
    {"AUDIOCHANNELLABEL_PROXIMITYRIGHT", AudioChannelLabel::ProximityRight, "Proximity-Right"},
}};

struct CatalogueRow {
  const char* name;
  AudioChannelLayout (*factory)();
};

// Three rows have no named factory: their lambdas pass the channel count.
constexpr CatalogueRow kCatalogueRows[] = {
    {"CHANNELLAYOUT_MONO", CreateMonoChannelLayout},
    {"CHANNELLAYOUT_STEREO", CreateStereoChannelLayout},
    {"CHANNELLAYOUT_LEGACY51", CreateLegacy51ChannelLayout},
    {"CHANNELLAYOUT_BROADCAST51", CreateBroadcast51ChannelLayout},
    {"CHANNELLAYOUT_51", Create51ChannelLayout},
    {"CHANNELLAYOUT_MATRIXSTEREO", CreateMatrixStereoChannelLayout},
    {"CHANNELLAYOUT_LS_RS", Create_Ls_Rs_ChannelLayout},
    {"CHANNELLAYOUT_LC_RC", Create_Lc_Rc_ChannelLayout},
    {"CHANNELLAYOUT_LSD_RSD", Create_Lsd_Rsd_ChannelLayout},
    {"CHANNELLAYOUT_C_LFE", Create_C_LFE_ChannelLayout},
    {"CHANNELLAYOUT_VHL_VHR", Create_Vhl_Vhr_ChannelLayout},
    {"CHANNELLAYOUT_TSL_TSR", Create_Tsl_Tsr_ChannelLayout},
    {"CHANNELLAYOUT_TBL_TBR", Create_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_BFL_BFR", Create_Bfl_Bfr_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C", Create_L_R_C_ChannelLayout},
    {"CHANNELLAYOUT_C_L_R", Create_C_L_R_ChannelLayout},
    {"CHANNELLAYOUT_L_C_R", Create_L_C_R_ChannelLayout},
    {"CHANNELLAYOUT_L_R_CS", Create_L_R_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LFE", Create_L_R_LFE_ChannelLayout},
    {"CHANNELLAYOUT_4_DISCRETE_CHANNELS", +[] { return CreateMultichannelLayout(4); }},
    {"CHANNELLAYOUT_QUADRAPHONIC", CreateQuadraphonicChannelLayout},
    {"CHANNELLAYOUT_L_R_C_CS", Create_L_R_C_Cs_ChannelLayout},
    {"CHANNELLAYOUT_C_L_R_CS", Create_C_L_R_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_C_R_CS", Create_L_C_R_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LFE_CS", Create_L_R_LFE_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_CS_LFE", Create_L_R_Cs_LFE_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE", Create_L_R_C_LFE_ChannelLayout},
    {"CHANNELLAYOUT_L_C_R_LFE", Create_L_C_R_LFE_ChannelLayout},
    {"CHANNELLAYOUT_AMBISONICSBFORMAT", CreateAmbisonicsBFormatChannelLayout},
    {"CHANNELLAYOUT_PENTAGONAL", CreatePentagonalChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS", Create_L_R_C_Ls_Rs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LS_RS_C", CreatePentagonalChannelLayout},
    {"CHANNELLAYOUT_L_C_R_LS_RS", Create_L_C_R_Ls_Rs_ChannelLayout},
    {"CHANNELLAYOUT_C_L_R_LS_RS", Create_C_L_R_Ls_Rs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LFE_LS_RS", Create_L_R_LFE_Ls_Rs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_CS", Create_L_R_C_LFE_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_C_R_CS_LFE", Create_L_C_R_Cs_LFE_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LS_RS_LFE", Create_L_R_Ls_Rs_LFE_ChannelLayout},
    {"CHANNELLAYOUT_L_C_R_LS_RS_LFE", Create_L_C_R_Ls_Rs_LFE_ChannelLayout},
    {"CHANNELLAYOUT_C_L_R_LS_RS_LFE", Create_C_L_R_Ls_Rs_LFE_ChannelLayout},
    {"CHANNELLAYOUT_C_L_R_LS_RS_CS", Create_C_L_R_Ls_Rs_Cs_ChannelLayout},
    {"CHANNELLAYOUT_HEXAGONAL", CreateHexagonalChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_CS", Create_L_R_C_Ls_Rs_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LS_RS_LSD_RSD", Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_CS", Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LFE_LS_RS_LSD_RSD", Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LS_RS_C_RLS_RRS", Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LS_RS_C_LC_RC", Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_LC_RC", Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout},
    {"CHANNELLAYOUT_C_L_R_LS_RS_CS_LFE", Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout},
    {"CHANNELLAYOUT_C_L_R_LS_RS_RLS_RRS", Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_LSD_RSD", Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout},
    {"CHANNELLAYOUT_8_DISCRETE_CHANNELS", +[] { return CreateMultichannelLayout(8); }},
    {"CHANNELLAYOUT_7_1", Create7_1ChannelLayout},
    {"CHANNELLAYOUT_7_1MPEG", Create7_1MpegChannelLayout},
    {"CHANNELLAYOUT_7_1ITU", Create7_1ItuChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_LSD_RSD", Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_PL_PR", Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout},
    {"CHANNELLAYOUT_7_1EMAGIC", Create7_1EMagicChannelLayout},
    {"CHANNELLAYOUT_SMPTEDTV", CreateSmpteDtvChannelLayout},
    {"CHANNELLAYOUT_OCTAGONAL", CreateOctagonalChannelLayout},
    {"CHANNELLAYOUT_C_L_R_LS_RS_RLS_RRS_CS", Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_LC_RC_CS", Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_CS_LSD_RSD", Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout},
    {"CHANNELLAYOUT_CUBE", CreateCubeChannelLayout},
    {"CHANNELLAYOUT_VST_7_1_CINE_TOP_CENTER", Create_VST_7_1_Cine_Top_Center_Layout},
    {"CHANNELLAYOUT_VST_7_1_CINE_CENTER_HIGH", Create_VST_7_1_Cine_Center_High_Layout},
    {"CHANNELLAYOUT_VST_7_1_CINE_FRONT_HIGH", Create_VST_7_1_Cine_Front_High_Layout},
    {"CHANNELLAYOUT_VST_7_1_CINE_SIDE_HIGH", Create_VST_7_1_Cine_Side_High_Layout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_LC_RC_CS", Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_CS_LSD_RSD", Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout},
    {"CHANNELLAYOUT_L_R_LFE_LS_RS_VHL_VHC_VHR_BFC",
     Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_VHL_VHR_TBL_TBR", Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_VHL_VHR_TBL_TBR",
     Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_LSD_RSD_TSL_TSR",
     Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_TS_VHL_VHR_TBL_TBR",
     Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_TS_VHL_VHR_TBL_TBR",
     Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_TS_VHL_VHC_VHR_TBL_TBR",
     Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_VST10_2", CreateVST10_2ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_TS_VHL_VHC_VHR_TBL_TBR",
     Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LS_RS_CS_TS_VHL_VHC_VHR_TBL_TBR",
     Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_VST10_2_PLUS", CreateVST10_2_PlusChannelLayout},
    {"CHANNELLAYOUT_L_R_C_LFE_LS_RS_CS_TS_VHL_VHC_VHR_TBL_TBR",
     Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout},
    {"CHANNELLAYOUT_SMPTEDIGITALCINEMA1", CreateSMPTEDigitalCinema1Channel},
    {"CHANNELLAYOUT_SMPTEDIGITALCINEMA2", CreateSMPTEDigitalCinema2Channel},
    {"CHANNELLAYOUT_SMPTEDIGITALCINEMA4", CreateSMPTEDigitalCinema4Channel},
    {"CHANNELLAYOUT_SMPTEDIGITALCINEMA6", CreateSMPTEDigitalCinema6Channel},
    {"CHANNELLAYOUT_SMPTEDIGITALCINEMA7", CreateSMPTEDigitalCinema7Channel},
    {"CHANNELLAYOUT_SMPTEDIGITALCINEMA8", CreateSMPTEDigitalCinema8Channel},
    {"CHANNELLAYOUT_SMPTEDIGITALCINEMA9", CreateSMPTEDigitalCinema9Channel},
    {"CHANNELLAYOUT_32_DISCRETE_CHANNELS", +[] { return CreateMultichannelLayout(32); }},
};
static_assert(std::size(kCatalogueRows) == kCommonAudioChannelLayoutCount);

constexpr std::size_t kBroadcast51Row = 3;

std::string DescribeLayout(const AudioChannelLayout& layout) {
  std::string text = std::to_string(layout.size()) + " Channel Configuration";
  for (AudioChannelDescription channel : layout) {
    const char* label = GetAudioChannelLabelConstantDescription(channel.label);
    text += ' ';
    text += label != nullptr ? label : "";
  }
  return text;
}

}  // namespace

const std::array<AudioChannelLabelConstant, kAudioChannelLabelConstantCount>&
GetAudioChannelLabelConstants() noexcept {
  return kLabelConstants;
}

const char* GetAudioChannelLabelConstantDescription(AudioChannelLabel label) noexcept {
  for (const AudioChannelLabelConstant& constant : kLabelConstants) {
    if (constant.label == label) return constant.description;
  }
  return nullptr;
}

const std::array<CommonAudioChannelLayout, kCommonAudioChannelLayoutCount>&
GetCommonAudioChannelLayouts() {
  static const std::array<CommonAudioChannelLayout, kCommonAudioChannelLayoutCount> catalogue = [] {
    std::array<CommonAudioChannelLayout, kCommonAudioChannelLayoutCount> rows;
    for (std::size_t i = 0; i < rows.size(); ++i) {
      const CatalogueRow& row = kCatalogueRows[i];
      rows[i] = {row.name, row.factory, DescribeLayout(row.factory())};
    }
    // The broadcast 5.1 entry has always carried a second space after its
    // first label; scripts that match the text rely on it.
    rows[kBroadcast51Row].description =
        "6 Channel Configuration Front-Left  Front-Right Front-Center Low-Frequency "
        "Back-Left Back-Right";
    return rows;
  }();
  return catalogue;
}

}  // namespace zebmediatypes::scripting
