// The forms of RGB and full-range YUV with shared chroma, besides those of full resolution.
#pragma once

#include "matrix/yuv_forms.hpp"
#include "subsampled/shared_chroma.hpp"

namespace pyxcc::subsampled
{

using namespace matrix;

/// Rounded products, luma in sixty-fourths of a step, which chroma of `Pixels` pixels is the difference to. Luma itself
/// truncates them.
template <int Pixels> struct YuvRound {
    static_assert(Pixels == 2 || Pixels == 4);

    template <class Word> static PYXCC_INLINE auto fine(const Word& R, const Word& G, const Word& B)
    {
        return mulRound15(R << 7, 4899) + mulRound15(G << 7, 9617) + mulRound15(B << 7, 1868);
    }

    template <class Fine> static PYXCC_INLINE auto luma(const Fine& y) { return sat8(y >> 6); }

    template <class Sum, class Fine> static PYXCC_INLINE auto chroma(const Sum& R, const Sum& B, const Fine& sumOfLuma)
    {
        // The sums of four need 16 bits without a sign.
        const auto y = Pixels == 4 ? asS16(asU16(sumOfLuma) >> 1) : sumOfLuma;
        constexpr int bits = Pixels == 4 ? 5 : 6;
        return Two{sat8((mulRound15((B << bits) - y, 8061) + 128 * 64) >> 6),
                   sat8((mulRound15((R << bits) - y, 14369) + 128 * 64) >> 6)};
    }
};

/// Luma with weights of 14 bits, and of 15; those of 15 bits are one too many in all.
using YuvLumaFloor14 = LumaExact<Weights{4 * 4899, 4 * 9617, 4 * 1868}, 0>;
using YuvLumaFloor15 = LumaExact<Weights{2 * 9798, 2 * 19235, 2 * 3736}, 0>;

/// Exact differences to the luma of 4, 2 and 1 pixels, each with its addends.
using YuvChroma14 = ChromaOfDifferences<Weights{4899, 9617, 1868}, 14, Two{0, 0}, DifferenceWeights{8061, 14369}, 16>;
using YuvChroma16 = ChromaOfDifferences<yuvLuma, 16, Two{0x1ffff, 0x1ffff}, yuvDifferences, 18>;
using YuvChroma32768 = ChromaOfDifferences<yuvLuma, 16, Two{32768, 32768}, yuvDifferences, 17>;
using YuvChroma65535 = ChromaOfDifferences<yuvLuma, 16, Two{65535, 65535}, yuvDifferences, 17>;
using YuvChromaAlone = ChromaOfDifferences<yuvLuma, 16, Two{32768, 32768}, yuvDifferences, 16>;
template <int AddendU, int AddendV>
using YuvChroma15 = ChromaOfDifferences<Weights{9798, 19235, 3736}, 15, Two{AddendU, AddendV},
                                        DifferenceWeights{2 * 16121, 2 * 28737}, 16>;

inline constexpr YuvRound<4> yuv420Round;
inline constexpr YuvRound<2> yuv422Round;
inline constexpr auto yuv420Exact14 = pairs(YuvLumaFloor14{}, YuvChroma14{});
inline constexpr auto yuv420Exact16 = pairs(YuvLumaFloor{}, YuvChroma16{});
inline constexpr auto yuv422Exact32768 = pairs(YuvLumaNearest{}, YuvChroma32768{});
inline constexpr auto yuv422Exact65535 = pairs(YuvLumaFloor{}, YuvChroma65535{});

/// A lone last pixel: in a packed row, and in planes from interleaved and from planar sources.
inline constexpr auto yuv422Alone = pairs(YuvLumaNearest{}, YuvChromaAlone{});
inline constexpr auto yuv422Odd15 = pairs(YuvLumaFloor15{}, YuvChroma15<16383, 32767>{});
inline constexpr auto yuv422OddFloor15 = pairs(YuvLumaFloor15{}, YuvChroma15<0, 0>{});

/// And back, in planes: 8192ths of a step.
using Yuv422OddInv13 = YuvInvExact<HighWeights{8 * 9338, -8 * 3227, -8 * 4759, 8 * 16645}, 0, 0, 0>;
inline constexpr Yuv422OddInv13 yuv422OddInv13;

} // namespace pyxcc::subsampled
