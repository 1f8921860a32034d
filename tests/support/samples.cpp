#include "support/samples.hpp"

#include <cmath>
#include <cstring>
#include <limits>
#include <utility>

namespace support
{

using catalog::Element;
using catalog::Range;

namespace
{

/// Calls `visit` with a value of the element's type.
template <class Visit> auto withType(Element element, Visit visit)
{
    switch (element) {
    case Element::s8:
        return visit(s8{});
    case Element::u16:
        return visit(u16{});
    case Element::s16:
        return visit(s16{});
    case Element::u32:
        return visit(u32{});
    case Element::s32:
        return visit(s32{});
    case Element::f32:
        return visit(f32{});
    case Element::f64:
        return visit(f64{});
    case Element::u8:
    case Element::bit:
        break;
    }
    return visit(u8{});
}

/// Makes the samples of a plane, one after the other.
class Generator
{
public:
    Generator(Range limits, Pattern pattern, Random& random)
        : limits_(limits), pattern_(pattern), random_(random), value_(random.real(limits.low, limits.high)),
          rise_((limits.high - limits.low) / random.between(3, 255))
    {
    }

    double next()
    {
        switch (pattern_) {
        case Pattern::extremes:
            return random_.oneIn(2) ? limits_.low : limits_.high;
        case Pattern::flat:
            return value_;
        case Pattern::ramp:
            value_ += rise_;
            if (value_ > limits_.high) value_ = limits_.low;
            return value_;
        case Pattern::random:
        case Pattern::gray:
        case Pattern::bytes:
            break;
        }
        return random_.real(limits_.low, limits_.high);
    }

private:
    Range limits_;
    Pattern pattern_;
    Random& random_;
    double value_;
    double rise_;
};

bool isFloat(Element element) { return element == Element::f32 || element == Element::f64; }

void fillPlane(const Plane& plane, int samplesAPixel, Range range, Pattern pattern, Random& random)
{
    const auto [shape, element, step, low, high] = plane.geometry();
    const Range limits = limitsOf(element, range);
    const int size = catalog::sizeOf(element);
    const int repeat = pattern == Pattern::gray ? samplesAPixel : 1;
    Generator generator(limits, pattern, random);
    double value = 0;
    for (int y = 0; y < shape.rows; ++y) {
        const auto row = plane.row(y);
        if (pattern == Pattern::bytes) {
            random.read(row);
            continue;
        }
        for (int x = 0; x < shape.rowBytes / size; ++x) {
            if (x % repeat == 0) value = generator.next();
            store(element, row.data() + x * size, isFloat(element) ? value : std::round(value));
        }
    }
}

} // namespace

std::string_view nameOf(Pattern pattern)
{
    constexpr std::string_view names[] = {"random", "extremes", "ramp", "flat", "gray", "any"};
    return names[static_cast<int>(pattern)];
}

void fillBytes(Image& image, Random& random)
{
    for (Plane& plane : image) random.fill(plane.all());
}

void fillSamples(Image& image, const catalog::Side& side, Range range, Pattern pattern, Random& random)
{
    fillBytes(image, random);
    const Random start = random;
    for (const Plane& plane : image) {
        if (pattern == Pattern::gray) random = start; // the same samples in every plane
        fillPlane(plane, side.samples, range, pattern, random);
    }
}

Range limitsOf(Element element, Range range)
{
    if (range.low < range.high) return range;
    if (isFloat(element)) return {0, 1};
    return withType(element, []<class T>(T) -> Range {
        return {static_cast<double>(std::numeric_limits<T>::lowest()),
                static_cast<double>(std::numeric_limits<T>::max())};
    });
}

void store(Element element, u8* at, double number)
{
    withType(element, [=]<class T>(T) {
        const T sample = static_cast<T>(number);
        std::memcpy(at, &sample, sizeof sample);
    });
}

double load(Element element, const u8* at)
{
    return withType(element, [=]<class T>(T sample) {
        std::memcpy(&sample, at, sizeof sample);
        return static_cast<double>(sample);
    });
}

} // namespace support
