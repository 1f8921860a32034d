#include "test_card.hpp"

#include <algorithm>
#include <array>
#include <cmath>
#include <numbers>
#include <span>

namespace tool
{

namespace
{

struct Color {
    double r, g, b; // 0 to 1
};

Color mix(Color a, Color b, double t) { return {a.r + (b.r - a.r) * t, a.g + (b.g - a.g) * t, a.b + (b.b - a.b) * t}; }

/// A place within a panel: x and y from 0 to 1, and the pixel counted from the panel's corner.
struct Place {
    double x, y;
    int column, row;
    double width, height; // of the panel in pixels
};

template <std::size_t N> int choose(double t)
{
    return std::clamp(static_cast<int>(t * N), 0, static_cast<int>(N) - 1);
}

Color hue(double turn)
{
    const auto channel = [turn](double offset) {
        const double t = turn + offset - std::floor(turn + offset);
        return std::clamp(std::abs(t * 6 - 3) - 1, 0.0, 1.0);
    };
    return {channel(0), channel(2.0 / 3), channel(1.0 / 3)};
}

constexpr std::array<Color, 8> bars = {
    {{1, 1, 1}, {1, 1, 0}, {0, 1, 1}, {0, 1, 0}, {1, 0, 1}, {1, 0, 0}, {0, 0, 1}, {0, 0, 0}}};

constexpr std::array<Color, 12> skins = {{
    {1.00, 0.88, 0.80},
    {0.97, 0.82, 0.71},
    {0.94, 0.77, 0.64},
    {0.90, 0.70, 0.56},
    {0.85, 0.63, 0.48},
    {0.78, 0.56, 0.41},
    {0.70, 0.48, 0.34},
    {0.60, 0.40, 0.28},
    {0.49, 0.32, 0.22},
    {0.39, 0.25, 0.18},
    {0.29, 0.19, 0.14},
    {0.21, 0.14, 0.11},
}};

/// The full colours above their three quarters.
Color colorBars(Place at)
{
    const Color full = bars[choose<8>(at.x)];
    return at.y < 0.5 ? full : mix({0, 0, 0}, full, 0.75);
}

Color grayRamp(Place at)
{
    const double level = at.y < 0.5 ? at.x : choose<16>(at.x) / 15.0;
    return {level, level, level};
}

/// Every hue, from white over the full colour to black.
Color hueField(Place at)
{
    const Color full = hue(at.x);
    return at.y < 0.5 ? mix({1, 1, 1}, full, at.y * 2) : mix(full, {0, 0, 0}, at.y * 2 - 1);
}

Color primaryRamps(Place at)
{
    constexpr std::array<Color, 6> primaries = {{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}, {0, 1, 1}, {1, 0, 1}, {1, 1, 0}}};
    return mix({0, 0, 0}, primaries[choose<6>(at.y)], at.x);
}

/// Rings whose frequency grows outwards, up to a pixel black and a pixel white at the farther sides of the panel.
Color rings(Place at)
{
    const double dx = at.column + 0.5 - at.width / 2, dy = at.row + 0.5 - at.height / 2;
    const double phase = std::numbers::pi * (dx * dx + dy * dy) / std::max(at.width, at.height);
    const double level = 0.5 + 0.5 * std::cos(phase);
    return {level, level, level};
}

Color skinTones(Place at)
{
    return skins[static_cast<std::size_t>(choose<3>(at.y)) * 4 + static_cast<std::size_t>(choose<4>(at.x))];
}

/// Pairs of colours in patterns of one and two pixels.
Color chromaPatterns(Place at)
{
    constexpr std::array<std::array<Color, 2>, 4> pairs = {
        {{{{1, 0, 0}, {0, 0, 1}}}, {{{0, 1, 0}, {1, 0, 1}}}, {{{1, 0.5, 0}, {0, 0.5, 1}}}, {{{1, 1, 1}, {0, 0, 0}}}}};
    const auto& pair = pairs[static_cast<std::size_t>(choose<4>(at.x))];
    switch (choose<4>(at.y)) {
    case 0:
        return pair[at.column & 1];
    case 1:
        return pair[at.row & 1];
    case 2:
        return pair[at.column >> 1 & 1];
    default:
        return pair[(at.column ^ at.row) & 1];
    }
}

struct Panel {
    double left, top, right, bottom; // shares of the card
    Color (*draw)(Place);
};

constexpr Panel panels[] = {
    {0, 0, 1, 0.22, colorBars},         {0, 0.22, 1, 0.32, grayRamp}, {0, 0.32, 0.38, 0.66, hueField},
    {0, 0.66, 0.38, 1, primaryRamps},   {0.38, 0.32, 0.76, 1, rings}, {0.76, 0.32, 1, 0.66, skinTones},
    {0.76, 0.66, 1, 1, chromaPatterns},
};

Image drawn(RoiSize size, std::span<const Panel> panels)
{
    Image card(rgb(), size);
    for (const Panel& panel : panels) {
        const auto part = [](double share, int whole) { return static_cast<int>(std::lround(share * whole)); };
        const int left = part(panel.left, size.width), right = part(panel.right, size.width);
        const int top = part(panel.top, size.height), bottom = part(panel.bottom, size.height);
        const double width = right - left, height = bottom - top;
        for (int y = top; y < bottom; ++y) {
            u8* pixel = card.plane(0) + static_cast<std::ptrdiff_t>(y) * card.step(0) + std::ptrdiff_t{3} * left;
            for (int x = left; x < right; ++x) {
                const double u = (x - left + 0.5) / width, v = (y - top + 0.5) / height;
                const Color color = panel.draw({u, v, x - left, y - top, width, height});
                for (double level : {color.r, color.g, color.b}) *pixel++ = static_cast<u8>(std::lround(level * 255));
            }
        }
    }
    return card;
}

} // namespace

Image testCard(RoiSize size) { return drawn(size, panels); }

Image zonePlate(RoiSize size)
{
    constexpr Panel whole = {0, 0, 1, 1, rings};
    return drawn(size, {&whole, 1});
}

} // namespace tool
