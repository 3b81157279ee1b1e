// Channel conversion matrices.
//
// A conversion matrix says how to form each channel of a destination layout
// from the channels of a source layout: entry [j][i] is the gain applied to
// source channel i when forming destination channel j. There is one row per
// destination channel and one entry per source channel, in layout order. Gains
// are 0.0 or 1/n for a whole number n >= 1.
//
//   ChannelConversionMatrix m;
//   ComputeChannelConversionMatrix(CreateStereoChannelLayout(), Create51ChannelLayout(), m);
//   // L [1 0], R [0 1], C [0.5 0.5], LFE [0 0], Ls [1 0], Rs [0 1]
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

// CreateIdentityChannelConversionMatrix()
//
// Replaces `result` with `destinationCount` rows of `sourceCount` zeros, with
// entry [k][k] set to 1.0 for every k below both counts. A destination count of
// 0 gives an empty matrix.
ZEBMEDIATYPES_API void CreateIdentityChannelConversionMatrix(std::size_t sourceCount,
                                                             std::size_t destinationCount,
                                                             ChannelConversionMatrix& result);

}  // namespace zebmediatypes
