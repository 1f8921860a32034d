#include "reference/gamma_curves.hpp"

#include "reference/rounding.hpp"

#include <cmath>

namespace reference
{

namespace
{

constexpr f64 inverseSlope = 0.2222222222222222;
constexpr f64 inverseExponent = 2.2222222222222223;
/// One unit in the last place away from 1 / 1.099.
constexpr f64 inverseFactor = 0.9099181073703366;
/// 1 / 65535.
constexpr f64 unit16u = 1.5259021896696422e-5;

/// The power branches, of x from black at 0 to white at 1.
f64 fwdPower(f64 x) { return std::fma(std::pow(x, 0.45), 1.099, -0.099); }
f64 invPower(f64 x) { return std::pow((x + 0.099) * inverseFactor, inverseExponent); }

/// The rounding of 16-bit results. The sum is narrowed before it is cut, so that a y just below a half may reach the
/// next integer, which then stays if it is even.
u16 rounded16u(f64 y)
{
    const f32 z = static_cast<f32>(0.5 + y);
    s32 t = static_cast<s32>(z);
    if (t % 2 != 0 && z == static_cast<f32>(t)) t = t - 1;
    return static_cast<u16>(t);
}

} // namespace

// The 8-bit curves are tables of the library, so that their values do not follow the rounding mode of the caller.
u8 gammaFwd8u(u8 v)
{
    const RoundToNearest mode;
    const f64 x = v / 255.0;
    const f64 y = x < 0.018 ? 4.5 * v : (1.099 * std::pow(x, 0.45) - 0.099) * 255.0;
    return static_cast<u8>(std::nearbyint(y));
}

u8 gammaInv8u(u8 v)
{
    const RoundToNearest mode;
    const f64 x = v / 255.0;
    const f64 y = x < 0.0812 ? v / 4.5 : std::pow((x + 0.099) / 1.099, 1.0 / 0.45) * 255.0;
    return static_cast<u8>(std::nearbyint(y));
}

u16 gammaFwd16u(u16 v)
{
    const f64 x = unit16u * v;
    const f64 y = 0.018 > x ? v * 4.5 : fwdPower(x) * 65535.0;
    return rounded16u(y);
}

u16 gammaInv16u(u16 v)
{
    const f64 x = unit16u * v;
    const f64 y = 0.0812 > x ? v * inverseSlope : invPower(x) * 65535.0;
    return rounded16u(y);
}

f32 gammaFwd32f(f32 s, GammaBounds bounds)
{
    const f64 range = bounds.vMax - bounds.vMin;
    const f64 d = s - bounds.vMin;
    const f64 x = (1.0 / range) * d;
    const f64 r = 0.018 > x ? std::fma(d, 4.5, f64{bounds.vMin}) : std::fma(fwdPower(x), range, f64{bounds.vMin});
    return static_cast<f32>(r);
}

f32 gammaInv32f(f32 s, GammaBounds bounds)
{
    const f64 range = bounds.vMax - bounds.vMin;
    const f64 d = s - bounds.vMin;
    const f64 x = (1.0 / range) * d;
    const f64 r =
        0.0812 > x ? std::fma(d, inverseSlope, f64{bounds.vMin}) : std::fma(invPower(x), range, f64{bounds.vMin});
    return static_cast<f32>(r);
}

} // namespace reference
