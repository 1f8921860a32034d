// Chroma moved from one grid of samples to another by index, with no arithmetic on it. Luma is copied.
#pragma once

#include "reference/subsampled.hpp"

namespace reference
{

struct ChromaIndex {
    int row, column;
};

/// The sample of the source that becomes sample (row, column) of the target.
using IndexRule = ChromaIndex (*)(int row, int column);

/// How a repack goes over its region: in whole blocks of `worked`, with the target's chroma in blocks of `target`.
struct Regrid {
    IndexRule rule;
    Block worked, target;
};

extern const Regrid sameGrid420;
extern const Regrid sameGrid422;
extern const Regrid sameGrid411;
extern const Regrid rowDouble; ///< 4:2:0 to 4:2:2
extern const Regrid rowSkip;   ///< 4:2:2 to 4:2:0
extern const Regrid colDouble; ///< 4:1:1 to 4:2:2
extern const Regrid colSkip;   ///< 4:2:2 to 4:1:1
extern const Regrid rowFold;   ///< 4:1:1 to 4:2:0
extern const Regrid rowUnfold; ///< 4:2:0 to 4:1:1

/// What makes no whole block is neither read nor written.
void repack(const Image<const u8>& src, const Image<u8>& dst, RoiSize roi, const Regrid& regrid);

/// Copies the samples of one channel.
void copyChannel(const Channel<const u8>& src, const Channel<u8>& dst, RoiSize size);

/// Planes of Y, Cr and Cb, of which each chroma plane is walked with the other's step.
Image<const u8> planarYCrCbOfCrossedSteps(const u8* const* planes, const int* steps);

} // namespace reference
