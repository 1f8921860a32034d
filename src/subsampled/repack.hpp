// Conversions that move chroma by an index rule and copy luma.
#pragma once

#include "frame/checks.hpp"
#include "frame/plane_service.hpp"
#include "frame/row_driver.hpp"
#include "frame/sample_forms.hpp"
#include "layouts/avx2/stream.hpp"
#include "layouts/images.hpp"
#include "subsampled/index_rules.hpp"

#include <cstdint>
#include <type_traits>

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

template <class Image> inline constexpr bool isPacked = false;
template <layouts::First order, class Byte, layouts::Stores stores>
inline constexpr bool isPacked<layouts::Packed<order, Byte, stores>> = true;

template <int Columns, class Image> auto whole(const Image& image)
{
    if constexpr (isPacked<Image>) {
        return image;
    } else {
        return LumaAndChromaOf<Columns, Image>{image};
    }
}

/// Takes a source to packed rows past the cache, where that can be done throughout: a large image by whole blocks at
/// multiples of their registers. Planes, which are several targets at a time, are slower that way.
template <class Rule, layouts::First order, class EachStep>
bool streamToPacked(int samples, int steps, const layouts::Packed<order, u8>& target, const EachStep& eachStep)
{
    const std::size_t bytes = 2 * static_cast<std::size_t>(samples) * Rule::columns * steps * Rule::rows;
    const bool aligned =
        (reinterpret_cast<std::uintptr_t>(target.first) | static_cast<std::size_t>(target.step)) % 32 == 0;
    if (!aligned || samples % blockSamples != 0 || steps < 1 || !frame::fillsHalfTheCache(bytes)) return false;
    eachStep(layouts::Packed<order, u8, layouts::Stores::streamed>{target.first, target.step});
    layouts::fenceStreams();
    return true;
}

/// Between images with a plane of luma.
template <class Source, class Target> void copyLuma(const Source& source, const Target& target, int width, int height)
{
    frame::copyPlane8u(source.first[0], static_cast<int>(source.step[0]), target.first[0],
                       static_cast<int>(target.step[0]), width, height);
}

/// Sizes off the rule's block are rounded down.
template <class Rule, class Source, class Target>
PyxStatus repack(RoiSize roi, const Source& source, const Target& target)
{
    const int samples = roi.width / Rule::columns, steps = roi.height / Rule::rows;
    const auto eachStep = [&](const auto& from, const auto& to) {
        for (int j = 0; j < steps; ++j) Rule::step(j, samples, from, to);
    };
    if constexpr (isPacked<Source> || isPacked<Target>) {
        const auto from = whole<Rule::sourceColumns>(source);
        if constexpr (isPacked<Target>) {
            if (streamToPacked<Rule>(samples, steps, target, [&](const auto& to) { eachStep(from, to); })) return pyxOk;
        }
        eachStep(from, whole<Rule::targetColumns>(target));
    } else {
        copyLuma(source, target, samples * Rule::columns, steps * Rule::rows);
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
