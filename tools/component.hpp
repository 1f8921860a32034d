// One component of an image as a grid of numbers, whatever the layout.
#pragma once

#include "image.hpp"

namespace tool
{

using catalog::Range;

/// What an integer can hold; 0 to 1 for a float.
Range rangeOf(catalog::Element element);

template <class Byte> class ComponentOf
{
public:
    using Element = catalog::Element;

    RoiSize size; ///< chroma has fewer columns and rows than luma
    Range range;  ///< black to white, where the model fixes it; else what the element can hold

    double at(int x, int y) const;
    void set(int x, int y, double value) const requires(!std::is_const_v<Byte>);

    Byte* base;
    int step;
    int stride; // bytes from one sample to the next
    Element element;
    int shift = 0; // of a bit field
    int bits = 0;  // of a bit field; 0 for a whole sample
};

using Component = ComponentOf<u8>;
using ConstComponent = ComponentOf<const u8>;

/// The component at that position of componentsOf().
Component component(Image& image, int index);
ConstComponent component(const Image& image, int index);

/// Sets the fourth samples to their largest value, so that they read as opaque.
void makeOpaque(Image& image);

} // namespace tool
