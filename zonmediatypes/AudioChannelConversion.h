#pragma once

/// \file
/// How channels of one layout feed those of another: matrices of gains, and orderings.
///
///     ChannelConversionMatrix matrix;
///     ComputeChannelConversionMatrix(CreateBroadcast51ChannelLayout(), CreateStereoChannelLayout(), matrix);
///     // L takes L and R takes R; centre, LFE and surrounds are routed nowhere

#include "zoncore/SmallBlocks.h"
#include "zonmediatypes/AudioChannelLabel.h"
#include "zonmediatypes/Export.h"

#include <cstddef>

namespace zonmediatypes
{

// ---- Matrices --------------------------------------------------------------------------------------------------------

/// Linear gains (1.0 is unity): a row for each destination channel, in it a gain for each source channel.
using ChannelConversionMatrix
	= zoncore::utility::SmallBlockAllocator::vector<zoncore::utility::SmallBlockAllocator::vector<double>>;

/// For each destination channel the index of the source channel that feeds it.
using ChannelOrdering = zoncore::utility::SmallBlockAllocator::vector<std::size_t>;

/// Feeds each destination channel from the source channel of the same index; what is left over on either side is silent.
/// Without destination channels the matrix is empty.
ZONMEDIATYPES_API void CreateIdentityChannelConversionMatrix(
	std::size_t inSourceChannelCount, std::size_t inDestinationChannelCount, ChannelConversionMatrix& outMatrix);

/// The matrix that routes inSource into inDestination by label, in time and memory in proportion to the product of the
/// channel counts. Each destination channel takes what the first line that fits it says:
///
/// | destination channel                                | takes                                                        |
/// |----------------------------------------------------|--------------------------------------------------------------|
/// | any, where the source is a single `Discrete` one   | that one at full gain, LFE included                          |
/// | with a label that the source has, too              | the first source channel of that label                       |
/// | with a speaker: a label but LFE and LFE2           | the nearest speakers of the source, in equal shares (1, 1/2) |
/// | the k-th `Discrete` one                            | the k-th `Discrete` source channel                           |
/// | `Discrete`, and the only one                       | all source channels in equal shares, LFE included            |
/// | every other                                        | nothing                                                      |
///
/// Where a layout is empty or all `Discrete`, and neither has exactly one channel, the matrix is the identity.
///
/// | from            | to              | gives                                                                           |
/// |-----------------|-----------------|---------------------------------------------------------------------------------|
/// | L R             | L R C LFE Ls Rs | L to L and Ls, R to R and Rs, half of each to C, nothing to LFE                 |
/// | L R C LFE Ls Rs | L R             | L and R; the others are dropped, unreported: the matrix does not fold down      |
/// | `Discrete` one  | L LFE           | the same channel twice                                                          |
/// | L R             | `Discrete` one  | half of each                                                                    |
/// | `Discrete` two  | L               | silence, as C into two `Discrete` ones                                          |
///
/// Speakers stand on a grid of -2 ... 2 from left to right, from below to above ear level and from back to front: L at
/// (-2, 0, 2), Lc (-1, 0, 2), Lsd (-2, 0, 0), Pl (-1, 0, 0), Ls (-2, 0, -2); Vhl, Tsl and Tbl 2 above L, Lsd and Ls, and Bfl 2
/// below L. The right mirrors the left, centres stand between them. Lw shares the place of L, Rls that of Ls, Lt that of Lsd;
/// X, Y and Z have those of Lsd, Ts and C. W and numbers that name no label are at (0, 0, 0). Distances are Euclidean.
ZONMEDIATYPES_API void ComputeChannelConversionMatrix(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, ChannelConversionMatrix& outMatrix);

// ---- Orderings and labels --------------------------------------------------------------------------------------------
//
// Both take time and memory as sorting the channels does.

/// Finds for each destination channel the first source channel of the same label; the k-th `Discrete` one takes the k-th
/// `Discrete` source channel. False, and outOrdering untouched, when the layouts differ in size or a channel finds none;
/// but an empty destination succeeds with an empty ordering whatever the source holds. A destination that repeats a label
/// takes the same source channel each time: the ordering need not be a permutation.
ZONMEDIATYPES_API bool RemapChannelOrdering(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, ChannelOrdering& outOrdering);

/// Gives the `Discrete` channels of inSource, in order, those labels of inDestination that it does not carry yet, each
/// once; its other channels stay as they are. False, and outLayout untouched, when no channel received a label. outLayout
/// may be one of the inputs.
ZONMEDIATYPES_API bool ReplaceDiscreteLabelsWithDestinationLayoutLabels(
	const AudioChannelLayout& inSource, const AudioChannelLayout& inDestination, AudioChannelLayout& outLayout);

}   // namespace zonmediatypes
