// Audio channel labels and layouts.
//
// A channel layout is an ordered sequence of channel descriptions, one per
// channel: element i names the speaker position that channel i of interleaved
// audio feeds. This header has the label vocabulary, the named layouts (whose
// factory names spell their channel order), the generic factories, the small
// queries, and the analysis functions that pair labels and match, reorder or
// relabel layouts.
//
//   AudioChannelLayout layout = Create51ChannelLayout();   // L R C LFE Ls Rs
//   HasLFEChannel(layout);                                  // true
//   LeftRightPair(AudioChannelLabel::BackLeft);             // BackRight
#pragma once

#include <zebcore/allocator.h>
#include <zebmediatypes/export.h>

#include <cstddef>
#include <cstdint>
#include <set>
#include <vector>

namespace zebmediatypes {

class AudioFormat;

// AudioChannelLabel
//
// The speaker position a channel feeds, held in 32 bits. The values are part of
// the interface (scripts and stored data see them) and are not contiguous:
// 0, 100 to 119 and 127 to 143, 38 labels in all. Any other value (1 to 99,
// 120 to 126, 144 and up, 0xFFFFFFFF for "no label") is an unknown value: it can
// be stored and carried through layouts unchanged, but has no name, no pair, no
// abbreviation and no speaker position.
enum class AudioChannelLabel : std::uint32_t {
  Discrete = 0,  // no position; a one-channel layout of it is mono
  FrontLeft = 100,
  FrontRight = 101,
  FrontCenter = 102,
  LowFrequency = 103,
  BackLeft = 104,    // left surround
  BackRight = 105,   // right surround
  BackCenter = 106,  // centre surround
  FrontLeftOfCenter = 107,
  FrontRightOfCenter = 108,
  SideLeft = 109,   // left surround direct
  SideRight = 110,  // right surround direct
  TopCenter = 111,
  TopFrontLeft = 112,  // vertical height left
  TopFrontRight = 113,
  TopFrontCenter = 114,
  TopBackLeft = 115,
  TopBackRight = 116,
  TopBackCenter = 117,
  FrontLeftWide = 118,
  FrontRightWide = 119,
  LeftHeight = 127,   // top side left
  RightHeight = 128,  // top side right
  RearSurroundLeft = 129,
  RearSurroundRight = 130,
  LFE2 = 131,       // second low-frequency effects
  LeftTotal = 132,  // matrix-encoded stereo
  RightTotal = 133,
  AmbisonicsW = 134,  // first-order ambisonics
  AmbisonicsX = 135,
  AmbisonicsY = 136,
  AmbisonicsZ = 137,
  BottomFrontLeft = 138,
  BottomFrontCenter = 139,
  BottomFrontRight = 140,
  ProximityLeft = 141,
  ProximityRight = 142,
  AmbisonicsHOA = 143,  // a channel of a higher-order ambisonic layout
};

// The number of labels: Discrete, 100 to 119 and 127 to 143.
inline constexpr std::size_t kAudioChannelLabelCount = 38;

// The position of `label` in ascending label order (Discrete is 0,
// AmbisonicsHOA is 37), or kAudioChannelLabelCount for an unknown value.
constexpr std::size_t AudioChannelLabelIndex(AudioChannelLabel label) noexcept {
  const auto value = static_cast<std::uint32_t>(label);
  if (value == 0) return 0;
  if (value >= 100 && value <= 119) return value - 99;
  if (value >= 127 && value <= 143) return value - 106;
  return kAudioChannelLabelCount;
}

// True for the 38 labels, false for every other value.
constexpr bool IsKnownAudioChannelLabel(AudioChannelLabel label) noexcept {
  return AudioChannelLabelIndex(label) < kAudioChannelLabelCount;
}

// The largest channel count the library builds layouts and formats for. A
// larger requested count is a contract breach: it is reported through the
// assertion service and clamped to this value.
inline constexpr std::size_t kAudioChannelCount_Max = 1024;

// AudioChannelDescription
//
// The description of one channel: its label. Trivially copyable; equal when the
// labels are equal, ordered by label value.
struct AudioChannelDescription {
  constexpr AudioChannelDescription() noexcept = default;
  // Implicit: a label is a complete description.
  constexpr AudioChannelDescription(AudioChannelLabel channelLabel) noexcept  // NOLINT
      : label(channelLabel) {}

  AudioChannelLabel label = AudioChannelLabel::Discrete;

  friend constexpr bool operator==(AudioChannelDescription a, AudioChannelDescription b) noexcept {
    return a.label == b.label;
  }
  friend constexpr bool operator!=(AudioChannelDescription a, AudioChannelDescription b) noexcept {
    return !(a == b);
  }
  friend constexpr bool operator<(AudioChannelDescription a, AudioChannelDescription b) noexcept {
    return a.label < b.label;
  }
  friend constexpr bool operator>(AudioChannelDescription a, AudioChannelDescription b) noexcept {
    return b < a;
  }
  friend constexpr bool operator<=(AudioChannelDescription a, AudioChannelDescription b) noexcept {
    return !(b < a);
  }
  friend constexpr bool operator>=(AudioChannelDescription a, AudioChannelDescription b) noexcept {
    return !(a < b);
  }
};

// A channel layout: element i describes channel i. It may be empty and may hold
// a label more than once.
using AudioChannelLayout =
    std::vector<AudioChannelDescription, zebcore::allocator::STLAllocator<AudioChannelDescription>>;

// One layout per stream of a multi-stream item.
using AudioChannelLayoutList =
    std::vector<AudioChannelLayout, zebcore::allocator::STLAllocator<AudioChannelLayout>>;

// The set of the 38 supported descriptions, in label order.
using AudioChannelDescriptionSet = std::set<AudioChannelDescription>;

// Named layouts. Each returns a new layout whose channel order is the one its
// name spells, abbreviations as in AudioChannelLabelAbbreviationsUnlocalized
// (L R C LFE Ls Rs Cs Lc Rc Lsd Rsd Ts Vhl Vhr Vhc Tbl Tbr Tbc Lw Rw Tsl Tsr Rls
// Rrs LFE2 Lt Rt W X Y Z Bfl Bfc Bfr Pl Pr). The order is the contract: callers
// interleave samples by it. Orders that the name does not spell:
//   Mono: Discrete.            Stereo: L R.              MatrixStereo: Lt Rt.
//   Quadraphonic: L R Ls Rs.   AmbisonicsBFormat: W X Y Z.
//   Pentagonal: L R Ls Rs C (as Create_L_R_Ls_Rs_C_ChannelLayout).
//   Broadcast51 and 51: L R C LFE Ls Rs.   Legacy51: L R Ls Rs C LFE.
//   Hexagonal: L R Ls Rs C Cs.  Octagonal: L R Ls Rs C Cs Lsd Rsd.
//   7_1: L R C LFE Ls Rs Lc Rc.  7_1Mpeg: C Lc Rc L R Ls Rs LFE.
//   7_1Itu: L R C LFE Ls Rs Rls Rrs.  7_1EMagic: L R Ls Rs C LFE Lc Rc.
//   SmpteDtv: L R C LFE Ls Rs Lt Rt.  Cube: L R Ls Rs Vhl Vhr Tbl Tbr.
//   VST_7_1_Cine_*: L R C LFE Ls Rs then Cs Ts / Cs Vhc / Vhl Vhr / Tsl Tsr
//     for Top_Center / Center_High / Front_High / Side_High.
//   VST10_2: L R C LFE Ls Rs Vhl Vhc Vhr Tbl Tbr LFE2.
//   VST10_2_Plus: L R C LFE Ls Rs Lc Rc Vhl Vhc Vhr Tbl Tbr LFE2.
//   The 13- and 14-channel layouts ending in _Ts_Vhl_Vhc_Vhr_Tbl_Tbr carry a Tbc
//     between Tbl and Tbr as well.
//   SMPTEDigitalCinema<N>Channel: 16 channels, the rest Discrete after
//     1: Discrete Discrete C.   2: Lt Rt.   4: L R C Discrete Cs.
//     6: L R C LFE Ls Rs.       7: L R C LFE Ls Rs Discrete Discrete Cs.
//     8: L R C LFE Ls Rs Lc Rc. 9: L R C LFE Ls Rs Lc Rc Cs.
ZEBMEDIATYPES_API AudioChannelLayout CreateMonoChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateStereoChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateMatrixStereoChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_Ls_Rs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_Lc_Rc_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_Lsd_Rsd_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_Vhl_Vhr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_Tsl_Tsr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_Bfl_Bfr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_C_R_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateQuadraphonicChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateAmbisonicsBFormatChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_C_R_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_Cs_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_C_R_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreatePentagonalChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_C_R_Ls_Rs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_C_R_Cs_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateBroadcast51ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create51ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateLegacy51ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateHexagonalChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_C_R_Ls_Rs_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_Lsd_Rsd_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_Rls_Rrs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_Ls_Rs_C_Lc_Rc_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Cs_LFE_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lsd_Rsd_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create7_1ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create7_1MpegChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create7_1ItuChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create7_1EMagicChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Pl_Pr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateSmpteDtvChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateOctagonalChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_C_L_R_Ls_Rs_Rls_Rrs_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Lc_Rc_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateCubeChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Top_Center_Layout();
ZEBMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Center_High_Layout();
ZEBMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Front_High_Layout();
ZEBMEDIATYPES_API AudioChannelLayout Create_VST_7_1_Cine_Side_High_Layout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lc_Rc_Cs_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Cs_Lsd_Rsd_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_LFE_Ls_Rs_Vhl_Vhc_Vhr_Bfc_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_Tsl_Tsr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateVST10_2ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_LFE_Ls_Rs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout Create_L_R_C_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateVST10_2_PlusChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout
Create_L_R_C_LFE_Ls_Rs_Cs_Ts_Vhl_Vhc_Vhr_Tbl_Tbr_ChannelLayout();
ZEBMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema1Channel();
ZEBMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema2Channel();
ZEBMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema4Channel();
ZEBMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema6Channel();
ZEBMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema7Channel();
ZEBMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema8Channel();
ZEBMEDIATYPES_API AudioChannelLayout CreateSMPTEDigitalCinema9Channel();

// The number of named layouts above.
inline constexpr std::size_t kNamedAudioChannelLayoutCount = 88;

// `channelCount` Discrete channels; a negative count gives an empty layout, and
// a count above kAudioChannelCount_Max is reported and clamped.
ZEBMEDIATYPES_API AudioChannelLayout CreateMultichannelLayout(int channelCount);

// A labelled layout for the common counts: 1 mono (Discrete), 2 L R,
// 4 quadraphonic, 6 broadcast 5.1, 8 ITU 7.1 (L R C LFE Ls Rs Rls Rrs); any
// other count gives that many Discrete channels (0 an empty layout). A count
// above kAudioChannelCount_Max is reported and clamped.
ZEBMEDIATYPES_API AudioChannelLayout
CreateMultichannelLayoutWithDefaultLabels(std::size_t channelCount);

// The total channel count of a list of layouts; 0 for an empty list.
ZEBMEDIATYPES_API std::size_t GetChannelCount(const AudioChannelLayoutList& layouts) noexcept;

// The 38 supported descriptions. Built on first use, constant afterwards; safe
// to read from any thread.
ZEBMEDIATYPES_API const AudioChannelDescriptionSet& GetSupportedAudioChannelDescriptions();

// True when some channel carries `label`.
ZEBMEDIATYPES_API bool HasChannelLabel(const AudioChannelLayout& layout,
                                       AudioChannelLabel label) noexcept;

// True when some channel carries a label other than Discrete (unknown values
// count as labels).
ZEBMEDIATYPES_API bool HasChannelLabeling(const AudioChannelLayout& layout) noexcept;

// True when some channel carries LowFrequency; LFE2 alone does not count.
ZEBMEDIATYPES_API bool HasLFEChannel(const AudioChannelLayout& layout) noexcept;

// Label pairs. Each returns the partner of `label`, or Discrete when it has
// none (unknown values included). Every pairing is symmetric.
//
// LeftRightPair: the mirror image across the centre line (L-R, Ls-Rs, Lc-Rc,
// Lsd-Rsd, Vhl-Vhr, Tbl-Tbr, Lw-Rw, Tsl-Tsr, Rls-Rrs, Lt-Rt, Bfl-Bfr, Pl-Pr) and
// the two low-frequency channels (LFE-LFE2). Centre and ambisonic labels have
// no partner.
ZEBMEDIATYPES_API AudioChannelLabel LeftRightPair(AudioChannelLabel label) noexcept;
// FrontBackPair: the same side front against back (L-Ls, R-Rs, C-Cs, Lc-Rls,
// Rc-Rrs, Vhl-Tbl, Vhr-Tbr, Vhc-Tbc).
ZEBMEDIATYPES_API AudioChannelLabel FrontBackPair(AudioChannelLabel label) noexcept;
// TopMiddlePair: a listener-height label against the one above it (L-Vhl,
// R-Vhr, C-Vhc, Ls-Tbl, Rs-Tbr, Cs-Tbc).
ZEBMEDIATYPES_API AudioChannelLabel TopMiddlePair(AudioChannelLabel label) noexcept;
// TopBottomPair: a top-front label against the bottom-front one below it
// (Vhl-Bfl, Vhr-Bfr, Vhc-Bfc).
ZEBMEDIATYPES_API AudioChannelLabel TopBottomPair(AudioChannelLabel label) noexcept;
// BottomMiddlePair: a listener-height front label against the bottom-front one
// below it (L-Bfl, R-Bfr, C-Bfc).
ZEBMEDIATYPES_API AudioChannelLabel BottomMiddlePair(AudioChannelLabel label) noexcept;

// True when neither label is Discrete and they are each other's LeftRightPair
// (LowFrequency with LFE2 included). Symmetric.
ZEBMEDIATYPES_API bool IsStereoPair(AudioChannelLabel a, AudioChannelLabel b) noexcept;

// True when the layouts hold the same labels with the same multiplicities in
// any order. Two empty layouts give true.
ZEBMEDIATYPES_API bool ContainsSameChannelsIgnoreOrder(const AudioChannelLayout& a,
                                                       const AudioChannelLayout& b);

// Sorts the channels into ascending label order, keeping repeated labels
// (R L L becomes L L R). The caller reorders any sample data to match. The
// format overload leaves the sample rate and type untouched.
ZEBMEDIATYPES_API void NormalizeChannelOrder(AudioChannelLayout& layout) noexcept;
ZEBMEDIATYPES_API void NormalizeChannelOrder(AudioFormat& format);

// RemapChannelOrdering()
//
// For layouts of equal size, fills `mapping` with one entry per destination
// channel: the index of the source channel carrying the same speaker. A
// labelled destination channel takes the first source channel with its label
// (so repeated destination labels share one source index); the k-th Discrete
// destination channel takes the k-th Discrete source channel. An empty
// destination succeeds with an empty mapping whatever the source holds.
// Returns false, leaving `mapping` exactly as it was, when the sizes differ or
// some destination channel has no source.
//
//   L R C LFE Ls Rs -> L R Ls Rs C LFE   gives 0 1 4 5 2 3
ZEBMEDIATYPES_API bool RemapChannelOrdering(const AudioChannelLayout& source,
                                            const AudioChannelLayout& destination,
                                            std::vector<std::size_t>& mapping);

// RemapChannelLabelOrdering()
//
// For layouts of any sizes, fills `mapping` with one entry per source channel:
// the destination index it goes to. Each source channel first takes the lowest
// destination index with its label not taken by an earlier source channel
// (Discrete matches Discrete). The source channels left over then all take the
// lowest destination index that no label match took, so several of them may
// fold into one destination channel; when every destination index was taken
// they get SIZE_MAX (no destination). Returns false, leaving `mapping`
// unchanged, when either layout is empty.
//
//   L R C -> R L       gives 1 0 SIZE_MAX
//   C LFE -> L R       gives 0 0
ZEBMEDIATYPES_API bool RemapChannelLabelOrdering(const AudioChannelLayout& source,
                                                 const AudioChannelLayout& destination,
                                                 std::vector<std::size_t>& mapping);

// ReplaceDiscreteLabelsWithDestinationLayoutLabels()
//
// Copies `source` and writes into its Discrete channels, in order, the labels of
// `destination` (in destination order) that the copy does not yet carry.
// Returns true and replaces `result` when at least one label was written;
// otherwise returns false and leaves `result` unchanged.
//
//   Discrete Discrete, L R  gives L R        L Discrete, L R  gives L R
ZEBMEDIATYPES_API bool ReplaceDiscreteLabelsWithDestinationLayoutLabels(
    const AudioChannelLayout& source, const AudioChannelLayout& destination,
    AudioChannelLayout& result);

}  // namespace zebmediatypes
