// Conversions that move chroma by an index rule and copy luma.
#pragma once

#include "frame/checks.hpp"
#include "frame/plane_service.hpp"
#include "frame/row_driver.hpp"
#include "frame/sample_forms.hpp"
#include "layouts/images.hpp"
#include "subsampled/index_rules.hpp"

namespace pyxcc::subsampled
{

// Views of an image, as the rules take them.

/// Chroma by itself, where luma is copied apart.
template <class Image> struct ChromaOf {
    Image image;

    PYXCC_INLINE auto row(int, int j) const { return image.chroma(j); }
};

/// Luma and chroma, where the other side is packed.
template <int Columns, class Image> struct LumaAndChromaOf {
    Image image;

    PYXCC_INLINE auto row(int y, int j) const
    {
        return layouts::BesideLumaRow<Columns, std::remove_pointer_t<decltype(image.luma(y))>,
                                      decltype(image.chroma(j))>{image.luma(y), image.chroma(j)};
    }
    PYXCC_INLINE auto luma(int y) const
    {
        return layouts::LumaRow<std::remove_pointer_t<decltype(image.luma(y))>>{image.luma(y)};
    }
};

template <layouts::First order, class Byte> struct PackedRowsOf {
    layouts::Packed<order, Byte> image;

    PYXCC_INLINE auto row(int y, int) const { return image.row(y); }
};

template <int Columns, class Image> auto whole(const Image& image) { return LumaAndChromaOf<Columns, Image>{image}; }
template <int Columns, layouts::First order, class Byte> auto whole(const layouts::Packed<order, Byte>& image)
{
    return PackedRowsOf<order, Byte>{image};
}

template <class Image> inline constexpr bool isPacked = false;
template <layouts::First order, class Byte> inline constexpr bool isPacked<layouts::Packed<order, Byte>> = true;

/// Sizes off the rule's block are rounded down.
template <class Rule, class Source, class Target>
PyxStatus repack(RoiSize roi, const Source& source, const Target& target)
{
    const int samples = roi.width / Rule::columns, steps = roi.height / Rule::rows;
    const auto eachStep = [&](const auto& from, const auto& to) {
        for (int j = 0; j < steps; ++j) Rule::step(j, samples, from, to);
    };
    if constexpr (isPacked<Source> || isPacked<Target>) {
        eachStep(whole<Rule::sourceColumns>(source), whole<Rule::targetColumns>(target));
    } else {
        frame::copyPlane8u(source.first[0], static_cast<int>(source.step[0]), target.first[0],
                           static_cast<int>(target.step[0]), samples * Rule::columns, steps * Rule::rows);
        eachStep(ChromaOf<Source>{source}, ChromaOf<Target>{target});
    }
    return pyxOk;
}

/// Packed rows to packed rows: byte `Places` of every four at places 0, 1 and so on of them. Fours are whole.
template <int... Places> struct FoursRearranged : frame::OnSamples {
    PYXCC_INLINE auto operator()(const Several<wide::U8, 1>& x) const
    {
        return several(layouts::foursRearranged<Places...>(x.part[0]));
    }
};

template <int... Places> PyxStatus rearrangeFours(RoiSize roi, const u8* src, int srcStep, u8* dst, int dstStep)
{
    return frame::eachRow({roi.width / 2 * 4, roi.height}, layouts::asItLies<1>(src, srcStep),
                          layouts::asItLies<1>(dst, dstStep), frame::everyPixel(FoursRearranged<Places...>{}));
}

} // namespace pyxcc::subsampled
