// The forms of conversions that filter samples along their columns.
#pragma once

#include "frame/column_forms.hpp"
#include "lanes/lanes.hpp"

namespace pyxcc::subsampled
{

/// Two rows for one: the row itself, and one half a row below it by the taps -1, 9, 9, -1 over 16.
struct FourTaps : frame::OnColumns {
    template <class Sample>
    PYXCC_INLINE auto operator()(const Sample& above, const Sample& row, const Sample& below,
                                 const Sample& second) const
    {
        return Two{row, exactMean<4, 8, 9, 9, -1, -1>(row, below, above, second)};
    }
};

/// Two rows of a field for one, of the row and those above and below it in its field. Chroma lies a quarter of a row of
/// the frame above the middle of two rows in the one field and below it in the other, so that one is the mirror image
/// of the other.
struct TopFieldDoubled : frame::OnColumns {
    template <class Sample>
    PYXCC_INLINE auto operator()(const Sample& above, const Sample& row, const Sample& below) const
    {
        return Two{exactMean<3, 4, 1, 7>(above, row), exactMean<3, 4, 5, 3>(row, below)};
    }
};

struct BottomFieldDoubled : frame::OnColumns {
    template <class Sample>
    PYXCC_INLINE auto operator()(const Sample& above, const Sample& row, const Sample& below) const
    {
        return Two{exactMean<3, 4, 3, 5>(above, row), exactMean<3, 4, 7, 1>(row, below)};
    }
};

/// One row of a field for two.
struct TopFieldHalved : frame::OnColumns {
    template <class Sample> PYXCC_INLINE auto operator()(const Sample& upper, const Sample& lower) const
    {
        return exactMean<2, 2, 3, 1>(upper, lower);
    }
};

struct BottomFieldHalved : frame::OnColumns {
    template <class Sample> PYXCC_INLINE auto operator()(const Sample& upper, const Sample& lower) const
    {
        return exactMean<2, 2, 1, 3>(upper, lower);
    }
};

/// 1, 2, 1 over 4 as rounded means of rounded means.
struct Smoothed : frame::OnColumns {
    template <class Sample>
    PYXCC_INLINE auto operator()(const Sample& above, const Sample& row, const Sample& below) const
    {
        return avgUp(avgUp(above, row), avgUp(row, below));
    }
};

/// The same in a first or last row, its one neighbour standing for the missing one: 3, 1 over 4.
struct SmoothedAtEdge : frame::OnColumns {
    template <class Sample> PYXCC_INLINE auto operator()(const Sample& row, const Sample& beside) const
    {
        return avgUp(row, avgUp(row, beside));
    }
};

/// 3, 1 over 4 with a whole step for rounding, which raises a flat area by 1.
struct RaisedAtEdge : frame::OnColumns {
    template <class Sample> PYXCC_INLINE auto operator()(const Sample& row, const Sample& beside) const
    {
        return exactMean<2, 4, 3, 1>(row, beside);
    }
};

/// Half a row below the upper one.
struct Between : frame::OnColumns {
    template <class Sample> PYXCC_INLINE auto operator()(const Sample& upper, const Sample& lower) const
    {
        return avgUp(upper, lower);
    }
};

} // namespace pyxcc::subsampled
