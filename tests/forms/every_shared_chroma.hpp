// Compares an inverse form over pixels that share their chroma with its scalar instance.
#pragma once

#include "every_input.hpp"
#include "frame/shared_chroma_forms.hpp"

namespace forms
{

/// 32 packed pixels with luma y, as one of three packings gives them.
template <class Form, class Chroma>
auto ofPackedPixels(const Form& form, int packing, int y, const Chroma& cb, const Chroma& cr)
{
    using namespace pyxcc::layouts;
    const bool chromaFirst = packing == 0, exchanged = packing == 2;
    std::array<u8, 64> pixels;
    for (int i = 0; i < 32; ++i) {
        pixels[2 * i + (chromaFirst ? 1 : 0)] = static_cast<u8>(y);
        pixels[2 * i + (chromaFirst ? 0 : 1)] = (i % 2 == 1) != exchanged ? cr[i / 2] : cb[i / 2];
    }
    if (packing == 0) return apply(form, ChromaFirst<Order::ofMemory>::load(pixels.data()));
    if (packing == 1) return apply(form, LumaFirst<Order::ofMemory>::load(pixels.data()));
    return apply(form, ChromaExchanged<LumaFirst<Order::ofMemory>>::load(pixels.data()));
}

/// All 2^24 triples, as pairs of rows and as rows by themselves, in planes and packed: 16 values of Cb, each shared by
/// two columns of both rows; Y in one row counts up as the blocks do, in the other it counts down.
template <class Form> void expectSharedInstancesAgree(const Form& form)
{
    using pyxcc::layouts::loadForPairs;
    using pyxcc::scalar::S16;
    using pyxcc::wide::U8;
    constexpr int pairs = U8::count / 2;
    std::array<u8, pairs> cb, cr;

    const auto expectRow = [&](const pyxcc::Three<U8>& row, int y) {
        const auto wide = outputsOf(row);
        for (int i = 0; i < U8::count; ++i) {
            const auto one = bytesOf(form(S16(y), S16(cb[i / 2]), S16(cr[i / 2])));
            for (std::size_t k = 0; k < one.size(); ++k) {
                ASSERT_EQ(int{wide[k][i]}, int{one[k]}) << "output " << k << " in column " << i << " of (" << y << ", "
                                                        << int{cb[i / 2]} << ", " << int{cr[i / 2]} << ")";
            }
        }
    };

    for (int y = 0; y < 256; ++y) {
        for (int crOfAll = 0; crOfAll < 256; ++crOfAll) {
            cr.fill(static_cast<u8>(crOfAll));
            for (int firstCb = 0; firstCb < 256; firstCb += pairs) {
                for (int i = 0; i < pairs; ++i) cb[i] = static_cast<u8>(firstCb + i);
                const pyxcc::Two chroma{loadForPairs<2>(cb.data()), loadForPairs<2>(cr.data())};
                const pyxcc::layouts::ChromaOfPairs<pyxcc::Two<U8>> pairOfRows{{U8(y), U8(255 - y)}, chroma};
                const auto rows = apply(form, pairOfRows);
                ASSERT_NO_FATAL_FAILURE(expectRow(rows.a, y));
                ASSERT_NO_FATAL_FAILURE(expectRow(rows.b, 255 - y));
                const pyxcc::layouts::ChromaOfPairs<U8> row{U8(y), chroma};
                ASSERT_NO_FATAL_FAILURE(expectRow(apply(form, row), y));
                ASSERT_NO_FATAL_FAILURE(expectRow(ofPackedPixels(form, (y + crOfAll) % 3, y, cb, cr), y));
            }
        }
    }
}

} // namespace forms
