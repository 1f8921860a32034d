#include "reference/yuv_subsampled.hpp"

#include "reference/arguments.hpp"
#include "reference/primitives.hpp"
#include "reference/subsampled.hpp"
#include "reference/yuv.hpp"

#include <cstdint>
#include <vector>

namespace reference
{

namespace
{

using Pixels = std::vector<Triple<u8>>;

/// The sums of the samples of some pixels.
Triple<s32> sumsOf(const Pixels& block)
{
    Triple<s32> sums = {0, 0, 0};
    for (const Triple<u8>& pixel : block) {
        for (int k = 0; k < 3; ++k) sums[k] += pixel[k];
    }
    return sums;
}

struct UV {
    u8 u, v;
};

/// The arithmetic of a pixel's luma, and of the chroma of the pixels that share it.
struct Forward {
    u8 (*luma)(Triple<u8> rgb);
    UV (*chroma)(const Pixels& block);
};

// In 16-bit lanes.

s32 round15(Triple<u8> rgb)
{
    return mulRound15(rgb[0] * 128, 4899) + mulRound15(rgb[1] * 128, 9617) + mulRound15(rgb[2] * 128, 1868);
}

u8 lumaRound(Triple<u8> rgb) { return sat8(round15(rgb) >> 6); }

s32 round15(const Pixels& block)
{
    s32 sum = 0;
    for (const Triple<u8>& pixel : block) sum += round15(pixel);
    return sum;
}

UV chromaRound(s32 t, s32 red, s32 blue)
{
    return {sat8((mulRound15(blue - t, 8061) >> 6) + 128), sat8((mulRound15(red - t, 14369) >> 6) + 128)};
}

UV chromaRoundFour(const Pixels& block)
{
    const Triple<s32> sums = sumsOf(block);
    return chromaRound(round15(block) >> 1, sums[0] * 32, sums[2] * 32);
}

UV chromaRoundTwo(const Pixels& block)
{
    const Triple<s32> sums = sumsOf(block);
    return chromaRound(round15(block), sums[0] * 64, sums[2] * 64);
}

constexpr Forward yuv420Round = {lumaRound, chromaRoundFour};
constexpr Forward yuv422Round = {lumaRound, chromaRoundTwo};

// In 32 bits, with weights of 14, 15 and 16 bits. What is weighted is a pixel or the sums of a block.

s32 weighted14(Triple<s32> rgb) { return 4899 * rgb[0] + 9617 * rgb[1] + 1868 * rgb[2]; }

s32 weighted15(Triple<s32> rgb) { return 9798 * rgb[0] + 19235 * rgb[1] + 3736 * rgb[2]; }

s32 weighted16(Triple<s32> rgb) { return 19595 * rgb[0] + 38470 * rgb[1] + 7471 * rgb[2]; }

Triple<s32> widened(Triple<u8> rgb) { return {rgb[0], rgb[1], rgb[2]}; }

u8 lumaExact14(Triple<u8> rgb) { return low8(weighted14(widened(rgb)) >> 14); }

UV chromaExact14(const Pixels& block)
{
    const Triple<s32> sums = sumsOf(block);
    const s32 s = weighted14(sums);
    return {
        low8((((sums[2] * 16384 - s) >> 14) * 8061 >> 16) - 128),
        sat8((((sums[0] * 16384 - s) >> 14) * 14369 >> 16) + 128),
    };
}

u8 lumaExact16(Triple<u8> rgb) { return low8(weighted16(widened(rgb)) >> 16); }

u8 lumaExact32768(Triple<u8> rgb) { return low8((weighted16(widened(rgb)) + 32768) >> 16); }

/// The differences are taken to whole numbers, and with the second shift to those of one pixel.
UV chromaExact(const Pixels& block, s32 rounding, int shift)
{
    const Triple<s32> sums = sumsOf(block);
    const s32 s = weighted16(sums);
    return {
        low8((((sums[2] * 65536 - s + rounding) >> 16) * 32244 >> shift) - 128),
        sat8((((sums[0] * 65536 - s + rounding) >> 16) * 57475 >> shift) + 128),
    };
}

UV chromaExact16(const Pixels& block) { return chromaExact(block, 0x1ffff, 18); }

UV chromaExact32768(const Pixels& block) { return chromaExact(block, 32768, 17); }

UV chromaExact65535(const Pixels& block) { return chromaExact(block, 65535, 17); }

UV chromaExactOne(const Pixels& pixel) { return chromaExact(pixel, 32768, 16); }

constexpr Forward yuv420Exact14 = {lumaExact14, chromaExact14};
constexpr Forward yuv420Exact16 = {lumaExact16, chromaExact16};
constexpr Forward yuv422Exact32768 = {lumaExact32768, chromaExact32768};
constexpr Forward yuv422Exact65535 = {lumaExact16, chromaExact65535};
constexpr Forward yuv422OddExact = {lumaExact32768, chromaExactOne};

u8 lumaOdd15(Triple<u8> rgb) { return low8(weighted15(widened(rgb)) >> 15); }

UV chromaOdd15(const Pixels& pixel)
{
    const Triple<s32> rgb = sumsOf(pixel);
    const s32 s = weighted15(rgb);
    return {
        low8((((rgb[2] * 32768 - s + 16383) >> 15) * 16121 >> 15) - 128),
        sat8((((rgb[0] * 32768 - s + 32767) >> 15) * 28737 >> 15) + 128),
    };
}

UV chromaOddFloor15(const Pixels& pixel)
{
    const Triple<s32> rgb = sumsOf(pixel);
    const s32 s = weighted15(rgb);
    return {
        low8((((rgb[2] * 32768 - s) >> 15) * 16121 >> 15) - 128),
        sat8((((rgb[0] * 32768 - s) >> 15) * 28737 >> 15) + 128),
    };
}

constexpr Forward yuv422Odd15 = {lumaOdd15, chromaOdd15};
constexpr Forward yuv422OddFloor15 = {lumaOdd15, chromaOddFloor15};

/// The whole blocks of the region; those that begin within the first `wideColumns` columns take the wide form.
void toBlocks(const Image<const u8>& rgb, const Image<u8>& yuv, RoiSize roi, Block block, int wideColumns,
              const Forward& wide, const Forward& tail)
{
    for (int row = 0; row < roi.height / block.rows; ++row) {
        for (int column = 0; column < roi.width / block.columns; ++column) {
            const Forward& form = column * block.columns < wideColumns ? wide : tail;
            Pixels pixels;
            for (int i = 0; i < block.rows; ++i) {
                for (int j = 0; j < block.columns; ++j) {
                    const int y = row * block.rows + i, x = column * block.columns + j;
                    pixels.push_back(pixelOf(rgb, y, x));
                    yuv[0].set(y, x, form.luma(pixels.back()));
                }
            }
            const UV chroma = form.chroma(pixels);
            yuv[1].set(row, column, chroma.u);
            yuv[2].set(row, column, chroma.v);
        }
    }
}

// A last odd column or row is left out where chroma is shared in both directions.

PyxStatus planar420(const Image<const u8>& rgb, const Image<u8>& yuv, RoiSize roi, const Forward& form)
{
    toBlocks(rgb, yuv, roi, block420, 0, form, form);
    return statusOf(roi, block420);
}

/// Quadruples of pairs take the wide form.
PyxStatus rounded420(const Image<const u8>& rgb, const Image<u8>& yuv, RoiSize roi)
{
    const int pairs = roi.width / 2;
    toBlocks(rgb, yuv, roi, block420, 2 * (pairs & ~3), yuv420Round, yuv420Exact14);
    return statusOf(roi, block420);
}

/// A last odd pixel, with chroma of its own.
void toLastOdd(const Image<const u8>& rgb, const Image<u8>& yuv, RoiSize roi, const Forward& form)
{
    if (roi.width % 2 == 0) return;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        const Triple<u8> pixel = pixelOf(rgb, row, column);
        const UV chroma = form.chroma({pixel});
        yuv[0].set(row, column, form.luma(pixel));
        yuv[1].set(row, column / 2, chroma.u);
        yuv[2].set(row, column / 2, chroma.v);
    }
}

PyxStatus rounded422(const Image<const u8>& rgb, const Image<u8>& yuv, RoiSize roi)
{
    toBlocks(rgb, yuv, roi, block422, roi.width & ~15, yuv422Round, yuv422Exact65535);
    toLastOdd(rgb, yuv, roi, yuv422Odd15);
    return pyxOk;
}

PyxStatus exact422(const Image<const u8>& rgb, const Image<u8>& yuv, RoiSize roi)
{
    toBlocks(rgb, yuv, roi, block422, 0, yuv422Exact65535, yuv422Exact65535);
    toLastOdd(rgb, yuv, roi, yuv422OddFloor15);
    return pyxOk;
}

PyxStatus from420(const Image<const u8>& yuv, const Image<u8>& rgb, RoiSize roi, int wideColumns, InverseForm wide,
                  InverseForm tail)
{
    fromSubsampled(yuv, rgb, wholeBlocks(roi, block420), block420, wideColumns, wide, tail);
    return statusOf(roi, block420);
}

PyxStatus from420(const Image<const u8>& yuv, const Image<u8>& rgb, RoiSize roi, InverseForm form)
{
    return from420(yuv, rgb, roi, 0, form, form);
}

/// A last odd pixel has chroma of its own.
PyxStatus from422(const Image<const u8>& yuv, const Image<u8>& rgb, RoiSize roi, int wideColumns, InverseForm wide,
                  InverseForm tail, InverseForm odd)
{
    fromSubsampled(yuv, rgb, wholeBlocks(roi, block422), block422, wideColumns, wide, tail);
    if (roi.width % 2 == 0) return pyxOk;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        convertPixel(yuv, rgb, row, column, {row, column / 2, column / 2}, odd);
    }
    return pyxOk;
}

PyxStatus planarFrom422(const Image<const u8>& yuv, const Image<u8>& rgb, RoiSize roi)
{
    return from422(yuv, rgb, roi, roi.width & ~15, yuvInvHigh4, yuvInvExactD, yuv422OddInv13);
}

PyxStatus interleavedFrom422(const Image<const u8>& yuv, const Image<u8>& rgb, RoiSize roi)
{
    return from422(yuv, rgb, roi, roi.width & ~15, yuvInvHigh4, yuvInvExactD, yuvInvExactD);
}

/// The steps of Y, U and V in a tightly packed image.
struct PlaneSteps {
    int steps[3];
};

PlaneSteps tight420(RoiSize roi) { return {{roi.width, roi.width / 2, roi.width / 2}}; }

PlaneSteps tight422(RoiSize roi)
{
    const int chroma = roi.width / 2 + (roi.width & 1);
    return {{roi.width, chroma, chroma}};
}

/// A tightly packed image with shared chroma in a row is taken as one row, if it is not small and pairs do not reach
/// across its rows. So the forms go by the place in the whole image.
RoiSize oneRowIfLarge(RoiSize roi)
{
    const bool large = std::int64_t{roi.width} * roi.height >= 256;
    return large && roi.width % 2 == 0 ? RoiSize{roi.width * roi.height, 1} : roi;
}

} // namespace

PyxStatus pyxiRGBToYUV420_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    return rounded420(interleaved(src, srcStep, 3), planar(dst, dstStep), roi);
}

PyxStatus pyxiRGBToYUV420_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    return rounded420(interleaved(src, 3 * roi.width, 3), planar(dst, tight420(roi).steps), roi);
}

PyxStatus pyxiRGBToYUV420_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], const int dstStep[3],
                                 RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return planar420(planar(src, srcStep), planar(dst, dstStep), roi, yuv420Exact16);
}

PyxStatus pyxiRGBToYUV420_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return planar420(planar(src, roi.width), planar(dst, tight420(roi).steps), roi, yuv420Exact16);
}

PyxStatus pyxiBGRToYUV420_8u_AC4P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    return planar420(reversed(interleaved(src, srcStep, 4)), planar(dst, dstStep), roi, yuv420Exact16);
}

// A last odd pixel has no place for its V.
PyxStatus pyxiRGBToYUV422_8u_C3C2R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = interleaved(src, srcStep, 3);
    const auto target = packedYCbCr(dst, dstStep);
    toBlocks(source, target, roi, block422, 0, yuv422Exact32768, yuv422Exact32768);
    if (roi.width % 2 == 0) return pyxOk;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        const Triple<u8> pixel = pixelOf(source, row, column);
        target[0].set(row, column, yuv422OddExact.luma(pixel));
        target[1].set(row, column / 2, yuv422OddExact.chroma({pixel}).u);
    }
    return pyxOk;
}

PyxStatus pyxiRGBToYUV422_8u_C3P3R(const u8* src, int srcStep, u8* const dst[3], const int dstStep[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    return rounded422(interleaved(src, srcStep, 3), planar(dst, dstStep), roi);
}

PyxStatus pyxiRGBToYUV422_8u_C3P3(const u8* src, u8* const dst[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(dst)) return pyxErrNullPtr;
    const auto source = interleaved(src, 3 * roi.width, 3);
    return rounded422(source, planar(dst, tight422(roi).steps), oneRowIfLarge(roi));
}

PyxStatus pyxiRGBToYUV422_8u_P3R(const u8* const src[3], int srcStep, u8* const dst[3], const int dstStep[3],
                                 RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return exact422(planar(src, srcStep), planar(dst, dstStep), roi);
}

PyxStatus pyxiRGBToYUV422_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return exact422(planar(src, roi.width), planar(dst, tight422(roi).steps), oneRowIfLarge(roi));
}

PyxStatus pyxiYUV420ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], int dstStep,
                                 RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return from420(planar(src, srcStep), planar(dst, dstStep), roi, yuvInvExactD);
}

PyxStatus pyxiYUV420ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return from420(planar(src, tight420(roi).steps), planar(dst, roi.width), roi, yuvInvExactD);
}

PyxStatus pyxiYUV420ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    return from420(planar(src, srcStep), interleaved(dst, dstStep, 3), roi, yuvInvHigh4);
}

PyxStatus pyxiYUV420ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    return from420(planar(src, tight420(roi).steps), interleaved(dst, 3 * roi.width, 3), roi, yuvInvHigh4);
}

PyxStatus pyxiYUV420ToBGR_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 2, 2)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    return from420(planar(src, srcStep), reversed(interleaved(dst, dstStep, 3)), roi, yuvInvHigh4x);
}

PyxStatus pyxiYUV420ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = interleaved(dst, dstStep, 4);
    fill(target[3], wholeBlocks(roi, block420), u8{0});
    return from420(planar(src, srcStep), target, roi, roi.width & ~15, yuvInvHigh8, yuvInvExactC);
}

// The V of a last odd pixel is that of the pair before, or zero where there is none.
PyxStatus pyxiYUV422ToRGB_8u_C2C3R(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    const auto source = packedYCbCr(src, srcStep);
    const auto target = interleaved(dst, dstStep, 3);
    fromSubsampled(source, target, wholeBlocks(roi, block422), block422, roi.width & ~15, yuvInvHigh4, yuvInvExactC);
    if (roi.width % 2 == 0) return pyxOk;
    const int column = roi.width - 1;
    for (int row = 0; row < roi.height; ++row) {
        const u8 v = column == 0 ? u8{128} : source[2].get(row, column / 2 - 1);
        const Triple<u8> rgb = yuvInvExactC({source[0].get(row, column), source[1].get(row, column / 2), v});
        for (int k = 0; k < 3; ++k) target[k].set(row, column, rgb[k]);
    }
    return pyxOk;
}

PyxStatus pyxiYUV422ToRGB_8u_P3R(const u8* const src[3], const int srcStep[3], u8* const dst[3], int dstStep,
                                 RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return planarFrom422(planar(src, srcStep), planar(dst, dstStep), roi);
}

PyxStatus pyxiYUV422ToRGB_8u_P3(const u8* const src[3], u8* const dst[3], RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src) || anyPlaneNull(dst)) return pyxErrNullPtr;
    return planarFrom422(planar(src, tight422(roi).steps), planar(dst, roi.width), oneRowIfLarge(roi));
}

PyxStatus pyxiYUV422ToRGB_8u_P3C3R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    return interleavedFrom422(planar(src, srcStep), interleaved(dst, dstStep, 3), roi);
}

PyxStatus pyxiYUV422ToRGB_8u_P3C3(const u8* const src[3], u8* dst, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = interleaved(dst, 3 * roi.width, 3);
    return interleavedFrom422(planar(src, tight422(roi).steps), target, oneRowIfLarge(roi));
}

PyxStatus pyxiYUV422ToRGB_8u_P3AC4R(const u8* const src[3], const int srcStep[3], u8* dst, int dstStep, RoiSize roi)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1)) return pyxErrSize;
    if (anyPlaneNull(src)) return pyxErrNullPtr;
    const auto target = interleaved(dst, dstStep, 4);
    fill(target[3], roi, u8{0});
    return from422(planar(src, srcStep), target, roi, roi.width & ~3, yuvInvHigh8, yuvInvExactD, yuvInvExactD);
}

} // namespace reference
