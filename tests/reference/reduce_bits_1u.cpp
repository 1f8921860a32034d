#include "reference/reduce_bits_1u.hpp"

#include "reference/arguments.hpp"
#include "reference/error_rows.hpp"
#include "reference/image.hpp"

#include <algorithm>

namespace reference
{

namespace
{

/// Rows of bits, the high bit of a byte first. Only the low three bits of the offset count.
class BitImage
{
public:
    BitImage(u8* dst, int dstStep, s32 bitOffset) : bytes_(dst, dstStep, 1), offset_(bitOffset & 7) {}

    void set(int row, int column, bool bit) const
    {
        const int place = offset_ + column;
        const int mask = 0x80 >> (place % 8);
        const u8 former = bytes_.get(row, place / 8);
        bytes_.set(row, place / 8, static_cast<u8>(bit ? former | mask : former & ~mask));
    }

private:
    Channel<u8> bytes_;
    int offset_;
};

void diffuse(const Channel<const u8>& src, const BitImage& dst, RoiSize roi, u8 threshold)
{
    auto rows = errorRows<s32>(roi.width);
    for (int y = 0; y < roi.height; ++y) {
        auto& [c, p1, p2] = rows;
        for (int x = 0; x < roi.width; ++x) {
            const s32 twos = p2[x - 1] + p2[x + 1] + p1[x - 2] + p1[x + 2];
            const s32 ones = p2[x - 2] + p2[x + 2];
            const s32 fours = p2[x] + p1[x - 1] + p1[x + 1] + c[x - 2];
            const s32 eights = p1[x] + c[x - 1];
            const s32 sum = ones + 8 * eights + 4 * fours + 2 * twos;
            const s32 w = (src.get(y, x) << 13) + sum * 23;
            const bool bit = w > threshold * 8192;
            dst.set(y, x, bit);
            c[x] = (w >> 10) - (bit ? 2047 : 0);
        }
        std::rotate(rows.begin(), rows.end() - 1, rows.end());
    }
}

} // namespace

PyxStatus pyxiReduceBits_8u1u_C1R(const u8* src, int srcStep, u8* dst, int dstStep, s32 dstBitOffset, RoiSize roi, s32,
                                  s32, s32 ditherType, u8 threshold)
{
    if (anyNull(src, dst)) return pyxErrNullPtr;
    if (isSmaller(roi, 1, 1) || dstBitOffset < 0) return pyxErrSize;
    if (ditherType != 0 && ditherType != 3) return pyxErrDitherType;

    const Channel<const u8> source(src, srcStep, 1);
    const BitImage target(dst, dstStep, dstBitOffset);
    if (ditherType == 3) {
        diffuse(source, target, roi, threshold);
        return pyxOk;
    }
    for (int y = 0; y < roi.height; ++y) {
        for (int x = 0; x < roi.width; ++x) target.set(y, x, source.get(y, x) > threshold);
    }
    return pyxOk;
}

} // namespace reference
