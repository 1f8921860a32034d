// The forms of conversions that filter samples along their columns: bytes of several rows in, one out.
#pragma once

#include "lanes/lanes.hpp"

namespace pyxcc::subsampled
{

/// Half a row below `row`, by the taps -1, 9, 9, -1 over 16.
struct FourTaps {
    template <class Sample>
    PYXCC_INLINE Sample operator()(const Sample& row, const Sample& below, const Sample& above,
                                   const Sample& second) const
    {
        return exactMean<4, 8, 9, 9, -1, -1>(row, below, above, second);
    }
};

/// The mean of two rows with these weights over their sum, 1 << Shift, rounded.
template <int Shift, int WeightOfUpper, int WeightOfLower> struct Between {
    template <class Sample> PYXCC_INLINE Sample operator()(const Sample& upper, const Sample& lower) const
    {
        return exactMean<Shift, 1 << (Shift - 1), WeightOfUpper, WeightOfLower>(upper, lower);
    }
};

/// Half a row below the upper one.
using HalfWay = Between<1, 1, 1>;

/// 1, 2, 1 over 4 as rounded means of rounded means.
struct Smoothed {
    template <class Sample>
    PYXCC_INLINE Sample operator()(const Sample& above, const Sample& row, const Sample& below) const
    {
        return avgUp(avgUp(above, row), avgUp(row, below));
    }
};

/// The same in a first or last row, its one neighbour standing for the missing one: 3, 1 over 4.
struct SmoothedAtEdge {
    template <class Sample> PYXCC_INLINE Sample operator()(const Sample& row, const Sample& beside) const
    {
        return avgUp(row, avgUp(row, beside));
    }
};

/// 3, 1 over 4 with a whole step for rounding, which raises a flat area by 1.
struct RaisedAtEdge {
    template <class Sample> PYXCC_INLINE Sample operator()(const Sample& row, const Sample& beside) const
    {
        return exactMean<2, 4, 3, 1>(row, beside);
    }
};

} // namespace pyxcc::subsampled
