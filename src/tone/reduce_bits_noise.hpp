// What a call makes of noise: tables that depend on the amount, and a place in them for each pixel.
#pragma once

#include "frame/scratch.hpp"
#include "lanes/rows.hpp"
#include "layouts/avx2/columns.hpp"
#include "tone/noise_generator.hpp"

#include <memory>

namespace pyxcc::tone
{

struct FreeNoiseGenerator {
    void operator()(NoiseGeneratorU16* record) const { noiseGenFreeU16(record); }
    void operator()(NoiseGeneratorF32* record) const { noiseGenFreeF32(record); }
};

struct Noise {
    static constexpr int length = 1024;

    frame::Scratch<f32> amounts;
    frame::Scratch<u16> offsets;
    std::unique_ptr<NoiseGeneratorU16, FreeNoiseGenerator> offsetGenerator;
    std::unique_ptr<NoiseGeneratorF32, FreeNoiseGenerator> amountGenerator;

    /// Amounts between two bounds.
    PyxStatus make(f32 low, f32 high);

    /// Leaves what make() took to nobody.
    void abandon();

    /// The amount for column x of row y, the same for all channels.
    f32 at(int x, int y) const
    {
        const u32 column = static_cast<u32>(x), row = static_cast<u32>(y);
        return amounts[(offsets[column % length] + 2 * row + column) % length];
    }
};

/// The same amounts for rows that are taken in turn. From row to row each column goes on by two amounts: with the even
/// ones and the odd ones apart, those of a column lie in a row.
class NoiseByColumns
{
public:
    explicit NoiseByColumns(const Noise& noise);

    /// Those of four rows from `y` on and of eight columns from `x` on, which is below the length of the tables.
    PYXCC_INLINE Four<wide::F32> load(int x, int y) const
    {
        return layouts::loadColumns(amounts_ + static_cast<u32>(y) % half, placeOf_ + x);
    }

private:
    static constexpr int half = Noise::length / 2;
    static constexpr int whole = 2 * half + 4; ///< the half a second time, as a row begins anywhere, and rows at once

    f32 amounts_[2 * whole];     ///< the even ones, then the odd ones
    u16 placeOf_[Noise::length]; ///< in row 0
};

} // namespace pyxcc::tone
