// Channel labels, the named layouts and the generic factories.
#include <zebcore/assert.h>
#include <zebmediatypes/audio_channel_layout.h>

#include <algorithm>
#include <array>
#include <initializer_list>
#include <iterator>
#include <string_view>

namespace zebmediatypes {
namespace {

// Every label, in ascending value order.
constexpr AudioChannelLabel kAllLabels[] = {
    AudioChannelLabel::Discrete,          AudioChannelLabel::FrontLeft,
    AudioChannelLabel::FrontRight,        AudioChannelLabel::FrontCenter,
    AudioChannelLabel::LowFrequency,      AudioChannelLabel::BackLeft,
    AudioChannelLabel::BackRight,         AudioChannelLabel::BackCenter,
    AudioChannelLabel::FrontLeftOfCenter, AudioChannelLabel::FrontRightOfCenter,
    AudioChannelLabel::SideLeft,          AudioChannelLabel::SideRight,
    AudioChannelLabel::TopCenter,         AudioChannelLabel::TopFrontLeft,
    AudioChannelLabel::TopFrontRight,     AudioChannelLabel::TopFrontCenter,
    AudioChannelLabel::TopBackLeft,       AudioChannelLabel::TopBackRight,
    AudioChannelLabel::TopBackCenter,     AudioChannelLabel::FrontLeftWide,
    AudioChannelLabel::FrontRightWide,    AudioChannelLabel::LeftHeight,
    AudioChannelLabel::RightHeight,       AudioChannelLabel::RearSurroundLeft,
    AudioChannelLabel::RearSurroundRight, AudioChannelLabel::LFE2,
    AudioChannelLabel::LeftTotal,         AudioChannelLabel::RightTotal,
    AudioChannelLabel::AmbisonicsW,       AudioChannelLabel::AmbisonicsX,
    AudioChannelLabel::AmbisonicsY,       AudioChannelLabel::AmbisonicsZ,
    AudioChannelLabel::BottomFrontLeft,   AudioChannelLabel::BottomFrontCenter,
    AudioChannelLabel::BottomFrontRight,  AudioChannelLabel::ProximityLeft,
    AudioChannelLabel::ProximityRight,    AudioChannelLabel::AmbisonicsHOA,
};
static_assert(std::size(kAllLabels) == kAudioChannelLabelCount);

constexpr bool LabelIndexMatchesTable() {
  for (std::size_t i = 0; i < std::size(kAllLabels); ++i) {
    if (AudioChannelLabelIndex(kAllLabels[i]) != i) return false;
  }
  return true;
}
static_assert(LabelIndexMatchesTable(), "AudioChannelLabelIndex disagrees with the label list");

// The short names the layout rows are written in.
namespace short_names {
constexpr AudioChannelLabel Discrete = AudioChannelLabel::Discrete;
constexpr AudioChannelLabel L = AudioChannelLabel::FrontLeft;
constexpr AudioChannelLabel R = AudioChannelLabel::FrontRight;
constexpr AudioChannelLabel C = AudioChannelLabel::FrontCenter;
constexpr AudioChannelLabel LFE = AudioChannelLabel::LowFrequency;
constexpr AudioChannelLabel Ls = AudioChannelLabel::BackLeft;
constexpr AudioChannelLabel Rs = AudioChannelLabel::BackRight;
constexpr AudioChannelLabel Cs = AudioChannelLabel::BackCenter;
constexpr AudioChannelLabel Lc = AudioChannelLabel::FrontLeftOfCenter;
constexpr AudioChannelLabel Rc = AudioChannelLabel::FrontRightOfCenter;
constexpr AudioChannelLabel Lsd = AudioChannelLabel::SideLeft;
constexpr AudioChannelLabel Rsd = AudioChannelLabel::SideRight;
constexpr AudioChannelLabel Ts = AudioChannelLabel::TopCenter;
constexpr AudioChannelLabel Vhl = AudioChannelLabel::TopFrontLeft;
constexpr AudioChannelLabel Vhr = AudioChannelLabel::TopFrontRight;
constexpr AudioChannelLabel Vhc = AudioChannelLabel::TopFrontCenter;
constexpr AudioChannelLabel Tbl = AudioChannelLabel::TopBackLeft;
constexpr AudioChannelLabel Tbr = AudioChannelLabel::TopBackRight;
constexpr AudioChannelLabel Tbc = AudioChannelLabel::TopBackCenter;
constexpr AudioChannelLabel Tsl = AudioChannelLabel::LeftHeight;
constexpr AudioChannelLabel Tsr = AudioChannelLabel::RightHeight;
constexpr AudioChannelLabel Rls = AudioChannelLabel::RearSurroundLeft;
constexpr AudioChannelLabel Rrs = AudioChannelLabel::RearSurroundRight;
constexpr AudioChannelLabel LFE2 = AudioChannelLabel::LFE2;
constexpr AudioChannelLabel Lt = AudioChannelLabel::LeftTotal;
constexpr AudioChannelLabel Rt = AudioChannelLabel::RightTotal;
constexpr AudioChannelLabel W = AudioChannelLabel::AmbisonicsW;
constexpr AudioChannelLabel X = AudioChannelLabel::AmbisonicsX;
constexpr AudioChannelLabel Y = AudioChannelLabel::AmbisonicsY;
constexpr AudioChannelLabel Z = AudioChannelLabel::AmbisonicsZ;
constexpr AudioChannelLabel Bfc = AudioChannelLabel::BottomFrontCenter;
constexpr AudioChannelLabel Bfl = AudioChannelLabel::BottomFrontLeft;
constexpr AudioChannelLabel Bfr = AudioChannelLabel::BottomFrontRight;
constexpr AudioChannelLabel Pl = AudioChannelLabel::ProximityLeft;
constexpr AudioChannelLabel Pr = AudioChannelLabel::ProximityRight;
}  // namespace short_names

constexpr std::size_t kMaxNamedLayoutSize = 16;

// One named layout: the factory that returns it and its channels in order.
struct LayoutRow {
  std::string_view factory;
  std::array<AudioChannelLabel, kMaxNamedLayoutSize> labels{};
  std::size_t count = 0;
};

// A row of `labels`, padded with Discrete channels up to `size` when that is
// larger.
constexpr LayoutRow Row(std::string_view factory, std::initializer_list<AudioChannelLabel> labels,
                        std::size_t size = 0) {
  LayoutRow row{factory, {}, std::max(labels.size(), size)};
  std::size_t i = 0;
  for (AudioChannelLabel label : labels) row.labels[i++] = label;
  return row;
}

namespace rows {
using namespace short_names;

constexpr LayoutRow kNamedLayouts[] = {
    Row("CreateMonoChannelLayout", {Discrete}),
    Row("CreateStereoChannelLayout", {L, R}),
    Row("CreateMatrixStereoChannelLayout", {Lt, Rt}),
    Row("Create_Ls_Rs_ChannelLayout", {Ls, Rs}),
    Row("Create_Lc_Rc_ChannelLayout", {Lc, Rc}),
    Row("Create_Lsd_Rsd_ChannelLayout", {Lsd, Rsd}),
    Row("Create_C_LFE_ChannelLayout", {C, LFE}),
    Row("Create_Vhl_Vhr_ChannelLayout", {Vhl, Vhr}),
    Row("Create_Tsl_Tsr_ChannelLayout", {Tsl, Tsr}),
    Row("Create_Tbl_Tbr_ChannelLayout", {Tbl, Tbr}),
    Row("Create_Bfl_Bfr_ChannelLayout", {Bfl, Bfr}),
    Row("Create_L_R_C_ChannelLayout", {L, R, C}),
    Row("Create_C_L_R_ChannelLayout", {C, L, R}),
    Row("Create_L_C_R_ChannelLayout", {L, C, R}),
    Row("Create_L_R_Cs_ChannelLayout", {L, R, Cs}),
    Row("Create_L_R_LFE_ChannelLayout", {L, R, LFE}),
    Row("CreateQuadraphonicChannelLayout", {L, R, Ls, Rs}),
    Row("CreateAmbisonicsBFormatChannelLayout", {W, X, Y, Z}),
    Row("Create_L_R_C_Cs_ChannelLayout", {L, R, C, Cs}),
    Row("Create_C_L_R_Cs_ChannelLayout", {C, L, R, Cs}),
    Row("Create_L_C_R_Cs_ChannelLayout", {L, C, R, Cs}),
    Row("Create_L_R_LFE_Cs_ChannelLayout", {L, R, LFE, Cs}),
    Row("Create_L_R_Cs_LFE_ChannelLayout", {L, R, Cs, LFE}),
    Row("Create_L_R_C_LFE_ChannelLayout", {L, R, C, LFE}),
    Row("Create_L_C_R_LFE_ChannelLayout", {L, C, R, LFE}),
    Row("CreatePentagonalChannelLayout", {L, R, Ls, Rs, C}),
    Row("Create_L_R_Ls_Rs_C_ChannelLayout", {L, R, Ls, Rs, C}),
    Row("Create_L_R_C_Ls_Rs_ChannelLayout", {L, R, C, Ls, Rs}),
    Row("Create_L_C_R_Ls_Rs_ChannelLayout", {L, C, R, Ls, Rs}),
    Row("Create_C_L_R_Ls_Rs_ChannelLayout", {C, L, R, Ls, Rs}),
    Row("Create_L_R_LFE_Ls_Rs_ChannelLayout", {L, R, LFE, Ls, Rs}),
    Row("Create_L_R_C_LFE_Cs_ChannelLayout", {L, R, C, LFE, Cs}),
    Row("Create_L_C_R_Cs_LFE_ChannelLayout", {L, C, R, Cs, LFE}),
    Row("Create_L_R_Ls_Rs_LFE_ChannelLayout", {L, R, Ls, Rs, LFE}),
    Row("CreateBroadcast51ChannelLayout", {L, R, C, LFE, Ls, Rs}),
    Row("Create51ChannelLayout", {L, R, C, LFE, Ls, Rs}),
    Row("CreateLegacy51ChannelLayout", {L, R, Ls, Rs, C, LFE}),
    Row("CreateHexagonalChannelLayout", {L, R, Ls, Rs, C, Cs}),
    Row("Create_L_C_R_Ls_Rs_LFE_ChannelLayout", {L, C, R, Ls, Rs, LFE}),
    Row("Create_C_L_R_Ls_Rs_LFE_ChannelLayout", {C, L, R, Ls, Rs, LFE}),
    Row("Create_C_L_R_Ls_Rs_Cs_ChannelLayout", {C, L, R, Ls, Rs, Cs}),
    Row("Create_L_R_C_Ls_Rs_Cs_ChannelLayout", {L, R, C, Ls, Rs, Cs}),
    Row("Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout", {L, R, Ls, Rs, Lsd, Rsd}),
    Row("Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout", {L, R, C, LFE, Ls, Rs, Cs}),
    Row("Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout", {L, R, LFE, Ls, Rs, Lsd, Rsd}),
    Row("Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout", {L, R, Ls, Rs, C, Rls, Rrs}),
    Row("Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout", {L, R, Ls, Rs, C, Lc, Rc}),
    Row("Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout", {L, R, C, Ls, Rs, Lc, Rc}),
    Row("Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout", {C, L, R, Ls, Rs, Cs, LFE}),
    Row("Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout", {C, L, R, Ls, Rs, Rls, Rrs}),
    Row("Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout", {L, R, C, Ls, Rs, Lsd, Rsd}),
    Row("Create7_1ChannelLayout", {L, R, C, LFE, Ls, Rs, Lc, Rc}),
    Row("Create7_1MpegChannelLayout", {C, Lc, Rc, L, R, Ls, Rs, LFE}),
    Row("Create7_1ItuChannelLayout", {L, R, C, LFE, Ls, Rs, Rls, Rrs}),
    Row("Create7_1EMagicChannelLayout", {L, R, Ls, Rs, C, LFE, Lc, Rc}),
    Row("Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout", {L, R, C, LFE, Ls, Rs, Lsd, Rsd}),
    Row("Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout", {L, R, C, LFE, Ls, Rs, Pl, Pr}),
    Row("CreateSmpteDtvChannelLayout", {L, R, C, LFE, Ls, Rs, Lt, Rt}),
    Row("CreateOctagonalChannelLayout", {L, R, Ls, Rs, C, Cs, Lsd, Rsd}),
    Row("Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout", {C, L, R, Ls, Rs, Rls, Rrs, Cs}),
    Row("Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout", {L, R, C, Ls, Rs, Lc, Rc, Cs}),
    Row("Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout", {L, R, C, Ls, Rs, Cs, Lsd, Rsd}),
    Row("CreateCubeChannelLayout", {L, R, Ls, Rs, Vhl, Vhr, Tbl, Tbr}),
    Row("Create_VST_7_1_Cine_Top_Center_Layout", {L, R, C, LFE, Ls, Rs, Cs, Ts}),
    Row("Create_VST_7_1_Cine_Center_High_Layout", {L, R, C, LFE, Ls, Rs, Cs, Vhc}),
    Row("Create_VST_7_1_Cine_Front_High_Layout", {L, R, C, LFE, Ls, Rs, Vhl, Vhr}),
    Row("Create_VST_7_1_Cine_Side_High_Layout", {L, R, C, LFE, Ls, Rs, Tsl, Tsr}),
    Row("Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout", {L, R, C, LFE, Ls, Rs, Lc, Rc, Cs}),
    Row("Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout", {L, R, C, LFE, Ls, Rs, Cs, Lsd, Rsd}),
    Row("Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout",
        {L, R, LFE, Ls, Rs, Vhl, Vhc, Vhr, Bfc}),
    Row("Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout", {L, R, C, Ls, Rs, Vhl, Vhr, Tbl, Tbr}),
    Row("Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout",
        {L, R, C, LFE, Ls, Rs, Vhl, Vhr, Tbl, Tbr}),
    Row("Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout",
        {L, R, C, LFE, Ls, Rs, Lsd, Rsd, Tsl, Tsr}),
    Row("Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout",
        {L, R, C, Ls, Rs, Ts, Vhl, Vhr, Tbl, Tbr}),
    Row("Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout",
        {L, R, C, LFE, Ls, Rs, Ts, Vhl, Vhr, Tbl, Tbr}),
    Row("Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
        {L, R, C, Ls, Rs, Ts, Vhl, Vhc, Vhr, Tbl, Tbr}),
    Row("CreateVST10_2ChannelLayout", {L, R, C, LFE, Ls, Rs, Vhl, Vhc, Vhr, Tbl, Tbr, LFE2}),
    Row("Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
        {L, R, C, LFE, Ls, Rs, Ts, Vhl, Vhc, Vhr, Tbl, Tbr}),
    Row("Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
        {L, R, C, Ls, Rs, Cs, Ts, Vhl, Vhc, Vhr, Tbl, Tbc, Tbr}),
    Row("CreateVST10_2_PlusChannelLayout",
        {L, R, C, LFE, Ls, Rs, Lc, Rc, Vhl, Vhc, Vhr, Tbl, Tbr, LFE2}),
    Row("Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout",
        {L, R, C, LFE, Ls, Rs, Cs, Ts, Vhl, Vhc, Vhr, Tbl, Tbc, Tbr}),
    Row("CreateSMPTEDigitalCinema1Channel", {Discrete, Discrete, C}, 16),
    Row("CreateSMPTEDigitalCinema2Channel", {Lt, Rt}, 16),
    Row("CreateSMPTEDigitalCinema4Channel", {L, R, C, Discrete, Cs}, 16),
    Row("CreateSMPTEDigitalCinema6Channel", {L, R, C, LFE, Ls, Rs}, 16),
    Row("CreateSMPTEDigitalCinema7Channel", {L, R, C, LFE, Ls, Rs, Discrete, Discrete, Cs}, 16),
    Row("CreateSMPTEDigitalCinema8Channel", {L, R, C, LFE, Ls, Rs, Lc, Rc}, 16),
    Row("CreateSMPTEDigitalCinema9Channel", {L, R, C, LFE, Ls, Rs, Lc, Rc, Cs}, 16),
};
static_assert(std::size(kNamedLayouts) == kNamedAudioChannelLayoutCount);

}  // namespace rows

using rows::kNamedLayouts;

constexpr bool RowsFitTheirArrays() {
  for (const LayoutRow& row : kNamedLayouts) {
    if (row.count == 0 || row.count > kMaxNamedLayoutSize) return false;
  }
  return true;
}
static_assert(RowsFitTheirArrays());

// The row of the named factory, or the table size when there is none.
constexpr std::size_t RowOf(std::string_view factory) {
  for (std::size_t i = 0; i < std::size(kNamedLayouts); ++i) {
    if (kNamedLayouts[i].factory == factory) return i;
  }
  return std::size(kNamedLayouts);
}

template <std::size_t kRow>
AudioChannelLayout LayoutFromRow() {
  static_assert(kRow < std::size(kNamedLayouts), "the factory has no row");
  const LayoutRow& row = kNamedLayouts[kRow];
  return AudioChannelLayout(row.labels.begin(),
                            row.labels.begin() + static_cast<std::ptrdiff_t>(row.count));
}

std::size_t ClampChannelCount(std::size_t channelCount, const char* function) {
  if (channelCount <= kAudioChannelCount_Max) return channelCount;
  zebcore::debug::ReportAssertion("channelCount <= kAudioChannelCount_Max",
                                  "Channel count above the largest supported count; clamped",
                                  "AudioChannelLayout", function, __LINE__);
  return kAudioChannelCount_Max;
}

}  // namespace

AudioChannelLayout CreateMonoChannelLayout() {
  return LayoutFromRow<RowOf("CreateMonoChannelLayout")>();
}
AudioChannelLayout CreateStereoChannelLayout() {
  return LayoutFromRow<RowOf("CreateStereoChannelLayout")>();
}
AudioChannelLayout CreateMatrixStereoChannelLayout() {
  return LayoutFromRow<RowOf("CreateMatrixStereoChannelLayout")>();
}
AudioChannelLayout Create_Ls_Rs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_Ls_Rs_ChannelLayout")>();
}
AudioChannelLayout Create_Lc_Rc_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_Lc_Rc_ChannelLayout")>();
}
AudioChannelLayout Create_Lsd_Rsd_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_Lsd_Rsd_ChannelLayout")>();
}
AudioChannelLayout Create_C_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_LFE_ChannelLayout")>();
}
AudioChannelLayout Create_Vhl_Vhr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_Vhl_Vhr_ChannelLayout")>();
}
AudioChannelLayout Create_Tsl_Tsr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_Tsl_Tsr_ChannelLayout")>();
}
AudioChannelLayout Create_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout Create_Bfl_Bfr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_Bfl_Bfr_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_ChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_ChannelLayout")>();
}
AudioChannelLayout Create_L_C_R_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_C_R_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_LFE_ChannelLayout")>();
}
AudioChannelLayout CreateQuadraphonicChannelLayout() {
  return LayoutFromRow<RowOf("CreateQuadraphonicChannelLayout")>();
}
AudioChannelLayout CreateAmbisonicsBFormatChannelLayout() {
  return LayoutFromRow<RowOf("CreateAmbisonicsBFormatChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_C_R_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_C_R_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_LFE_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_LFE_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_Cs_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_Cs_LFE_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_ChannelLayout")>();
}
AudioChannelLayout Create_L_C_R_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_C_R_LFE_ChannelLayout")>();
}
AudioChannelLayout CreatePentagonalChannelLayout() {
  return LayoutFromRow<RowOf("CreatePentagonalChannelLayout")>();
}
AudioChannelLayout Create_L_R_Ls_Rs_C_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_Ls_Rs_C_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_ChannelLayout")>();
}
AudioChannelLayout Create_L_C_R_Ls_Rs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_C_R_Ls_Rs_ChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_Ls_Rs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_Ls_Rs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_LFE_Ls_Rs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_LFE_Ls_Rs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_C_R_Cs_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_C_R_Cs_LFE_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_Ls_Rs_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_Ls_Rs_LFE_ChannelLayout")>();
}
AudioChannelLayout CreateBroadcast51ChannelLayout() {
  return LayoutFromRow<RowOf("CreateBroadcast51ChannelLayout")>();
}
AudioChannelLayout Create51ChannelLayout() {
  return LayoutFromRow<RowOf("Create51ChannelLayout")>();
}
AudioChannelLayout CreateLegacy51ChannelLayout() {
  return LayoutFromRow<RowOf("CreateLegacy51ChannelLayout")>();
}
AudioChannelLayout CreateHexagonalChannelLayout() {
  return LayoutFromRow<RowOf("CreateHexagonalChannelLayout")>();
}
AudioChannelLayout Create_L_C_R_Ls_Rs_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_C_R_Ls_Rs_LFE_ChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_Ls_Rs_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_Ls_Rs_LFE_ChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_Ls_Rs_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout")>();
}
AudioChannelLayout Create7_1ChannelLayout() {
  return LayoutFromRow<RowOf("Create7_1ChannelLayout")>();
}
AudioChannelLayout Create7_1MpegChannelLayout() {
  return LayoutFromRow<RowOf("Create7_1MpegChannelLayout")>();
}
AudioChannelLayout Create7_1ItuChannelLayout() {
  return LayoutFromRow<RowOf("Create7_1ItuChannelLayout")>();
}
AudioChannelLayout Create7_1EMagicChannelLayout() {
  return LayoutFromRow<RowOf("Create7_1EMagicChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout")>();
}
AudioChannelLayout CreateSmpteDtvChannelLayout() {
  return LayoutFromRow<RowOf("CreateSmpteDtvChannelLayout")>();
}
AudioChannelLayout CreateOctagonalChannelLayout() {
  return LayoutFromRow<RowOf("CreateOctagonalChannelLayout")>();
}
AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout")>();
}
AudioChannelLayout CreateCubeChannelLayout() {
  return LayoutFromRow<RowOf("CreateCubeChannelLayout")>();
}
AudioChannelLayout Create_VST_7_1_Cine_Top_Center_Layout() {
  return LayoutFromRow<RowOf("Create_VST_7_1_Cine_Top_Center_Layout")>();
}
AudioChannelLayout Create_VST_7_1_Cine_Center_High_Layout() {
  return LayoutFromRow<RowOf("Create_VST_7_1_Cine_Center_High_Layout")>();
}
AudioChannelLayout Create_VST_7_1_Cine_Front_High_Layout() {
  return LayoutFromRow<RowOf("Create_VST_7_1_Cine_Front_High_Layout")>();
}
AudioChannelLayout Create_VST_7_1_Cine_Side_High_Layout() {
  return LayoutFromRow<RowOf("Create_VST_7_1_Cine_Side_High_Layout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout CreateVST10_2ChannelLayout() {
  return LayoutFromRow<RowOf("CreateVST10_2ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout CreateVST10_2_PlusChannelLayout() {
  return LayoutFromRow<RowOf("CreateVST10_2_PlusChannelLayout")>();
}
AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout() {
  return LayoutFromRow<RowOf("Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout")>();
}
AudioChannelLayout CreateSMPTEDigitalCinema1Channel() {
  return LayoutFromRow<RowOf("CreateSMPTEDigitalCinema1Channel")>();
}
AudioChannelLayout CreateSMPTEDigitalCinema2Channel() {
  return LayoutFromRow<RowOf("CreateSMPTEDigitalCinema2Channel")>();
}
AudioChannelLayout CreateSMPTEDigitalCinema4Channel() {
  return LayoutFromRow<RowOf("CreateSMPTEDigitalCinema4Channel")>();
}
AudioChannelLayout CreateSMPTEDigitalCinema6Channel() {
  return LayoutFromRow<RowOf("CreateSMPTEDigitalCinema6Channel")>();
}
AudioChannelLayout CreateSMPTEDigitalCinema7Channel() {
  return LayoutFromRow<RowOf("CreateSMPTEDigitalCinema7Channel")>();
}
AudioChannelLayout CreateSMPTEDigitalCinema8Channel() {
  return LayoutFromRow<RowOf("CreateSMPTEDigitalCinema8Channel")>();
}
AudioChannelLayout CreateSMPTEDigitalCinema9Channel() {
  return LayoutFromRow<RowOf("CreateSMPTEDigitalCinema9Channel")>();
}

AudioChannelLayout CreateMultichannelLayout(int channelCount) {
  if (channelCount <= 0) return {};
  const std::size_t count = ClampChannelCount(static_cast<std::size_t>(channelCount),
                                              "zebmediatypes::CreateMultichannelLayout");
  return AudioChannelLayout(count, AudioChannelDescription(AudioChannelLabel::Discrete));
}

AudioChannelLayout CreateMultichannelLayoutWithDefaultLabels(std::size_t channelCount) {
  const std::size_t count =
      ClampChannelCount(channelCount, "zebmediatypes::CreateMultichannelLayoutWithDefaultLabels");
  switch (count) {
    case 1:
      return CreateMonoChannelLayout();
    case 2:
      return CreateStereoChannelLayout();
    case 4:
      return CreateQuadraphonicChannelLayout();
    case 6:
      return CreateBroadcast51ChannelLayout();
    case 8:
      return Create7_1ItuChannelLayout();
    default:
      return CreateMultichannelLayout(static_cast<int>(count));
  }
}

std::size_t GetChannelCount(const AudioChannelLayoutList& layouts) noexcept {
  std::size_t count = 0;
  for (const AudioChannelLayout& layout : layouts) count += layout.size();
  return count;
}

const AudioChannelDescriptionSet& GetSupportedAudioChannelDescriptions() {
  static const AudioChannelDescriptionSet supported(std::begin(kAllLabels), std::end(kAllLabels));
  return supported;
}

bool HasChannelLabel(const AudioChannelLayout& layout, AudioChannelLabel label) noexcept {
  return std::find(layout.begin(), layout.end(), AudioChannelDescription(label)) != layout.end();
}

bool HasChannelLabeling(const AudioChannelLayout& layout) noexcept {
  return std::any_of(layout.begin(), layout.end(), [](AudioChannelDescription channel) {
    return channel.label != AudioChannelLabel::Discrete;
  });
}

bool HasLFEChannel(const AudioChannelLayout& layout) noexcept {
  return HasChannelLabel(layout, AudioChannelLabel::LowFrequency);
}

}  // namespace zebmediatypes
