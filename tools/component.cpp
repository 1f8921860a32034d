#include "component.hpp"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstring>
#include <limits>

namespace tool
{

namespace
{

using catalog::Element;

/// Calls `work` with a zero of the element's C type.
template <class Work> decltype(auto) withType(Element element, Work work)
{
    switch (element) {
    case Element::s8:
        return work(s8{});
    case Element::u16:
        return work(u16{});
    case Element::u32:
        return work(u32{});
    case Element::s16:
        return work(s16{});
    case Element::s32:
        return work(s32{});
    case Element::f32:
        return work(f32{});
    case Element::f64:
        return work(f64{});
    default:
        return work(u8{});
    }
}

template <class T> T load(const u8* at)
{
    T value;
    std::memcpy(&value, at, sizeof value);
    return value;
}

template <class T> T nearest(double value)
{
    if constexpr (std::is_floating_point_v<T>) {
        return static_cast<T>(value);
    } else {
        const double low = std::numeric_limits<T>::min(), high = std::numeric_limits<T>::max();
        if (!(value > low)) return static_cast<T>(low); // also what is not a number
        return value < high ? static_cast<T>(std::floor(value + 0.5)) : static_cast<T>(high);
    }
}

struct Field {
    int shift, bits;
};

/// The fields of a packed pixel from the low bits up: "565", "555" or "444".
Field fieldOf(const catalog::Side& side, int index)
{
    const std::string widths = side.model.substr(side.model.size() - 3);
    Field field{0, widths[index] - '0'};
    for (int below = 0; below < index; ++below) field.shift += widths[below] - '0';
    return field;
}

struct Place {
    int plane;
    int first;   // samples in front of the first one
    int stride;  // samples from one to the next
    bool shared; // at the resolution of chroma
};

Place placeOf(const catalog::Side& side, int index)
{
    switch (side.arrangement) {
    case catalog::Arrangement::planar:
        return {index, 0, 1, index == 1 || index == 2};
    case catalog::Arrangement::semiPlanar:
        return index == 0 ? Place{0, 0, 1, false} : Place{1, index - 1, 2, true};
    default:
        break;
    }
    if (isPacked(side)) return {0, 0, 1, false};
    if (side.layout != "C2") return {0, index, side.samples, false};
    // Y0 C Y1 C, or C Y0 C Y1
    const bool chromaFirst = componentsOf(side)[0] != "Y";
    if (componentsOf(side)[index] == "Y") return {0, index, 2, false};
    constexpr std::array chromaBehind = {0, 1, 3}, chromaAhead = {0, 1, 2};
    return {0, chromaFirst ? chromaAhead[index] : chromaBehind[index], 4, true};
}

template <class Byte, class AnyImage> ComponentOf<Byte> view(AnyImage& image, int index)
{
    const catalog::Side& side = image.side();
    const Place place = placeOf(side, index);
    const int sampleBytes = catalog::sizeOf(side.element);
    ComponentOf<Byte> result;
    result.size = image.size();
    if (place.shared) {
        // A block that the picture fills in part still has its sample.
        result.size.width = (result.size.width + (1 << side.chromaX) - 1) >> side.chromaX;
        result.size.height = (result.size.height + (1 << side.chromaY) - 1) >> side.chromaY;
    }
    result.base = image.plane(place.plane) + static_cast<std::ptrdiff_t>(place.first) * sampleBytes;
    result.step = image.step(place.plane);
    result.stride = place.stride * sampleBytes;
    result.element = side.element;
    result.range = rangeOf(side.element);
    if (isPacked(side)) {
        const Field field = fieldOf(side, index);
        result.shift = field.shift;
        result.bits = field.bits;
        result.range = {0, static_cast<double>((1 << field.bits) - 1)};
    } else if (side.model == "SBGR") {
        result.range = {0, 255}; // 8-bit colours with room for a sign
    }
    return result;
}

} // namespace

Range rangeOf(Element element)
{
    if (element == Element::bit) return {0, 1};
    return withType(element, [](auto zero) -> Range {
        using T = decltype(zero);
        if constexpr (std::is_floating_point_v<T>) return {0, 1};
        return {static_cast<double>(std::numeric_limits<T>::min()), static_cast<double>(std::numeric_limits<T>::max())};
    });
}

template <class Byte> double ComponentOf<Byte>::at(int x, int y) const
{
    const u8* row = base + static_cast<std::ptrdiff_t>(y) * step;
    if (element == Element::bit) return row[x >> 3] >> (7 - (x & 7)) & 1;
    const u8* sample = row + static_cast<std::ptrdiff_t>(x) * stride;
    if (bits != 0) return load<u16>(sample) >> shift & ((1 << bits) - 1);
    return withType(element, [sample](auto zero) { return static_cast<double>(load<decltype(zero)>(sample)); });
}

template <class Byte> void ComponentOf<Byte>::set(int x, int y, double value) const requires(!std::is_const_v<Byte>)
{
    u8* row = base + static_cast<std::ptrdiff_t>(y) * step;
    if (element == Element::bit) {
        const u8 mask = static_cast<u8>(0x80 >> (x & 7));
        row[x >> 3] = static_cast<u8>(value >= 0.5 ? row[x >> 3] | mask : row[x >> 3] & ~mask);
        return;
    }
    u8* sample = row + static_cast<std::ptrdiff_t>(x) * stride;
    if (bits != 0) {
        const int mask = (1 << bits) - 1;
        const int field = std::min<int>(nearest<u16>(value), mask);
        const u16 pixel = static_cast<u16>((load<u16>(sample) & ~(mask << shift)) | field << shift);
        std::memcpy(sample, &pixel, sizeof pixel);
        return;
    }
    withType(element, [sample, value](auto zero) {
        const auto stored = nearest<decltype(zero)>(value);
        std::memcpy(sample, &stored, sizeof stored);
    });
}

template double ComponentOf<const u8>::at(int x, int y) const;
template class ComponentOf<u8>;

Component component(Image& image, int index) { return view<u8>(image, index); }

ConstComponent component(const Image& image, int index) { return view<const u8>(image, index); }

void makeOpaque(Image& image)
{
    if (componentsOf(image.side()).size() != 4) return;
    const Component alpha = component(image, 3);
    for (int y = 0; y < alpha.size.height; ++y) {
        for (int x = 0; x < alpha.size.width; ++x) alpha.set(x, y, alpha.range.high);
    }
}

} // namespace tool
