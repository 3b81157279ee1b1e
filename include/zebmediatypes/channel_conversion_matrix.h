// Channel conversion matrices: routing and down-mix.
//
// A conversion matrix says how to form each channel of a destination layout
// from the channels of a source layout: entry [j][i] is the gain applied to
// source channel i when forming destination channel j. There is one row per
// destination channel and one entry per source channel, in layout order.
// Routing gains are 0.0 or 1/n for a whole number n >= 1; down-mix gains are
// any linear amplitude factors.
//
//   ChannelConversionMatrix m;
//   ComputeChannelConversionMatrix(CreateStereoChannelLayout(), Create51ChannelLayout(), m);
//   // L [1 0], R [0 1], C [0.5 0.5], LFE [0 0], Ls [1 0], Rs [0 1]
//   ComputeDownmixMatrix(Create51ChannelLayout(), CreateStereoChannelLayout(), m);
//   // L [0.414 0 0.293 0 0.293 0], R [0 0.414 0.293 0 0 0.293]
#pragma once

#include <zebcore/allocator.h>
#include <zebmediatypes/audio_channel_layout.h>
#include <zebmediatypes/export.h>

#include <cstddef>
#include <vector>

namespace zebmediatypes {

// One destination channel: one gain per source channel.
using ChannelConversionMatrixRow = std::vector<double, zebcore::allocator::STLAllocator<double>>;

// One row per destination channel.
using ChannelConversionMatrix =
    std::vector<ChannelConversionMatrixRow,
                zebcore::allocator::STLAllocator<ChannelConversionMatrixRow>>;

// ComputeChannelConversionMatrix()
//
// Replaces `result` with the routing matrix from `source` to `destination`.
// It routes; it does not try to keep loudness or to fold in every source
// channel.
//
// When neither layout has exactly one channel and either carries no label other
// than Discrete, the result is the identity (see below). Otherwise each
// destination channel, in order, is fed by:
//   - the first source channel with the same label, at 1.0;
//   - for a labelled destination channel without one, the source channels
//     nearest to it on a coarse speaker grid (x left-right, y below-above,
//     z behind-front), sharing 1.0 equally. Low-frequency channels (LFE, LFE2)
//     and Discrete channels take no part in this: an LFE is fed from its own
//     label only, and a destination LFE the source lacks stays silent;
//   - for a Discrete destination channel, the source's Discrete channel of the
//     same ordinal (the k-th Discrete of each), else nothing;
//   - from a one-channel source, whenever the source or the destination channel
//     is Discrete, that channel at 1.0 (a mono source feeds every discrete or
//     matching channel);
//   - for a one-channel destination left unfed: all source channels equally
//     when it is Discrete (1/6 each from 5.1, LFE included); otherwise the
//     source's Discrete channels equally, when it has any.
// An empty destination gives an empty matrix. Labels that are unknown values
// sit at the grid centre, like Discrete. `result` is replaced only once the new
// matrix is complete; when it already has the right shape its storage is
// reused and no memory is allocated.
ZEBMEDIATYPES_API void ComputeChannelConversionMatrix(const AudioChannelLayout& source,
                                                      const AudioChannelLayout& destination,
                                                      ChannelConversionMatrix& result);

// DownmixLevels
//
// The gains of a down-mix as linear amplitude factors (0.7071067811865476 is
// -3 dB). A level that is NaN or infinite counts as 0; a negative one inverts
// the phase of what it carries.
struct DownmixLevels {
  double center = 0.7071067811865476;    // -3 dB
  double surround = 0.7071067811865476;  // -3 dB
  double lfe = 0.0;                      // the LFE is left out unless asked for
  bool normalize = true;                 // no destination channel can exceed full scale
};

// ComputeDownmixMatrix()
//
// Replaces `result` with a loudness-aware down-mix from `source` to
// `destination`, a matrix of the same shape as ComputeChannelConversionMatrix's.
// Unlike the routing matrix it folds every source channel the destination lacks
// into the nearest channels it has, in the usual broadcast manner (ITU-R
// BS.775): the centre into left and right, the surrounds into the fronts.
//
// The down-mix applies when all of these hold:
//   - the destination has no more channels than the source, and at least one;
//   - every channel of both layouts is one of L R C LFE Ls Rs Cs Lc Rc Lsd Rsd
//     Rls Rrs, where a one-channel Discrete layout (mono) counts as C;
//   - no label appears twice in a layout, and each left label has its right
//     partner in the same layout (L R, Ls Rs, Lc Rc, Lsd Rsd, Rls Rrs);
//   - the destination has a front: L and R, or C.
// Otherwise (an up-mix, Discrete or ambisonic channels, heights, wides, LFE2,
// Lt Rt and the other labels without a standard fold, lopsided layouts) the
// result is ComputeChannelConversionMatrix(source, destination) and `levels`
// is not used.
//
// Gains, with s = levels.surround and r = 0.7071067811865476 (-3 dB). Into a
// pair, a left channel feeds the left member, a right one the right member and
// a centre one both. A channel present on both sides passes at 1.0. A source
// channel the destination lacks goes to the first target the destination has:
//   C      L R at levels.center (at r when the source has no L R)
//   L R    C at r each; the source C then reaches C at levels.center * sqrt(2)
//   Lc Rc  L R at 1.0;  C at r
//   Cs     Ls Rs at r;  Lsd Rsd at r;  L R at s * r;  C at s * r
//   Ls Rs  Cs at r;  Lsd Rsd at r (1.0 when the source has no Lsd Rsd);
//          L R at s;  C at s * r
//   Lsd Rsd  Ls Rs at r (1.0 when the source has no Ls Rs);  Cs at r;
//          L R at s;  C at s * r
//   Rls Rrs  Ls Rs, then Cs, then Lsd Rsd: at r when the source also has Ls Rs
//          or Lsd Rsd, else at 1.0 (Cs always at r);  L R at s;  C at s * r
//   LFE    C at levels.lfe;  L R at levels.lfe * r
// These are the gains of libswresample's swr_build_matrix2 with no matrix
// encoding, for every layout it shares with this one (Rls Rrs it lacks).
//
// With levels.normalize, when some row's sum of absolute gains exceeds 1.0,
// every gain is divided by the largest such sum: one factor for the whole
// matrix, so the balance between destination channels is kept: 5.1 into
// L R C LFE Lsd Rsd keeps 1.0 everywhere, while L R C LFE Ls Rs Lsd Rsd into
// 5.1 scales every gain, the LFE's too, by 1 / (1 + r).
//
// Pure; safe from any thread. Like ComputeChannelConversionMatrix, `result` is
// replaced only once the new matrix is complete, and its storage is reused when
// it already has the right shape.
ZEBMEDIATYPES_API void ComputeDownmixMatrix(const AudioChannelLayout& source,
                                            const AudioChannelLayout& destination,
                                            ChannelConversionMatrix& result,
                                            const DownmixLevels& levels = {});

// CreateIdentityChannelConversionMatrix()
//
// Replaces `result` with `destinationCount` rows of `sourceCount` zeros, with
// entry [k][k] set to 1.0 for every k below both counts. A destination count of
// 0 gives an empty matrix.
ZEBMEDIATYPES_API void CreateIdentityChannelConversionMatrix(std::size_t sourceCount,
                                                             std::size_t destinationCount,
                                                             ChannelConversionMatrix& result);

}  // namespace zebmediatypes
