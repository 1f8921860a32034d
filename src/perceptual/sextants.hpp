// Which channel is the greatest, the least and the one between them, by the sextant of a hue.
#pragma once

#include "perceptual/hue_scale.hpp"

#include <array>

namespace pyxcc::perceptual
{

/// The sextants in which a channel is the greatest, or the middle one, as masks; it is the least otherwise. What begins
/// behind the last sextant is still as in that one.
struct Course {
    std::array<u8, 16> greatest, middle;

    template <class Samples>
    PYXCC_INLINE Samples operator()(const Samples& sextant, const Samples& high, const Samples& mid,
                                    const Samples& low) const
    {
        return where(lookUp(greatest, sextant), high, where(lookUp(middle, sextant), mid, low));
    }
};

inline constexpr Course courseOfR = {{255, 0, 0, 0, 0, 255, 255}, {0, 255, 0, 0, 255}};
inline constexpr Course courseOfG = {{0, 255, 255}, {255, 0, 0, 255}};
inline constexpr Course courseOfB = {{0, 0, 0, 255, 255}, {0, 0, 255, 0, 0, 255}};

template <class Samples>
PYXCC_INLINE Three<Samples> bySextant(const Samples& sextant, const Samples& high, const Samples& mid,
                                      const Samples& low)
{
    return {courseOfR(sextant, high, mid, low), courseOfG(sextant, high, mid, low), courseOfB(sextant, high, mid, low)};
}

} // namespace pyxcc::perceptual
