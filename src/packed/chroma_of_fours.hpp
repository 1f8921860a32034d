// BT.601 chroma of the sums over four columns of a row.
#pragma once

#include "layouts/avx2/sums_of_fours.hpp"
#include "subsampled/rgb_to_ycbcr_forms.hpp"

namespace pyxcc::packed
{

/// The exact form of four pixels, for sums that stand as fours.
struct ChromaOfFours {
    template <class Sum> PYXCC_INLINE auto operator()(const Sum& R, const Sum& G, const Sum& B) const
    {
        constexpr int shift = 18, addend = 1025 << (shift - 3);
        constexpr auto cb = matrix::bt601Chroma.cb, cr = matrix::bt601Chroma.cr;
        return Two{sat8(exactSumOfFours<shift, addend, cb.r, cb.g, cb.b>(R, G, B)),
                   sat8(exactSumOfFours<shift, addend, cr.r, cr.g, cr.b>(R, G, B))};
    }
};

} // namespace pyxcc::packed
