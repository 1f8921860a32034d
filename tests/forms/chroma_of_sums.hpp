// Compares the vector instance of a chroma form with its scalar one.
#pragma once

#include "every_input.hpp"
#include "layouts/avx2/chroma.hpp"

#include <random>

namespace forms
{

/// 16 pixels' or blocks' sums of R, of G and of B.
using SumsOf16 = std::array<std::array<s16, 16>, 3>;

inline pyxcc::wide::S16 loadWords(const std::array<s16, 16>& words)
{
    return pyxcc::wide::S16(pyxcc::layouts::loadSamples<pyxcc::wide::S16>(reinterpret_cast<const u8*>(words.data())));
}

template <class Form> void expectInstancesAgree(const Form& form, const SumsOf16& sums)
{
    using pyxcc::scalar::S16;
    const auto& [r, g, b] = sums;
    std::array<u8, 16> cb, cr;
    pyxcc::layouts::storeApart<2>(cb.data(), cr.data(),
                                  pyxcc::layouts::narrowPairs(form(loadWords(r), loadWords(g), loadWords(b))));
    for (int i = 0; i < 16; ++i) {
        const auto one = bytesOf(form(S16(r[i]), S16(g[i]), S16(b[i])));
        const bool same = cb[i] == one[0] && cr[i] == one[1];
        ASSERT_TRUE(same) << "of the sums (" << r[i] << ", " << g[i] << ", " << b[i] << ") a register makes ("
                          << int{cb[i]} << ", " << int{cr[i]} << "), one value (" << int{one[0]} << ", " << int{one[1]}
                          << ")";
    }
}

/// Sums of `pixels` pixels: each plane of two channels with the third at its least, in the middle and at its most,
/// which takes every term of a form through all its values and every sum to its ends, and a million in between.
template <class Form> void expectInstancesAgreeOnSums(const Form& form, int pixels)
{
    const int most = 255 * pixels;
    SumsOf16 sums;
    for (int fixed = 0; fixed < 3; ++fixed) {
        auto &first = sums[(fixed + 1) % 3], &second = sums[(fixed + 2) % 3];
        for (const int third : {0, most / 2, most}) {
            sums[fixed].fill(static_cast<s16>(third));
            for (int x = 0; x <= most; ++x) {
                first.fill(static_cast<s16>(x));
                for (int y = 0; y <= most; y += 16) {
                    for (int i = 0; i < 16; ++i) second[i] = static_cast<s16>(std::min(y + i, most));
                    ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, sums));
                }
            }
        }
    }
    std::mt19937 random(709);
    std::uniform_int_distribution<int> sum(0, most);
    for (int block = 0; block < 1 << 16; ++block) {
        for (auto& channel : sums) {
            for (s16& word : channel) word = static_cast<s16>(sum(random));
        }
        ASSERT_NO_FATAL_FAILURE(expectInstancesAgree(form, sums));
    }
}

/// A chroma form and how many pixels its sums are of.
template <class ChromaForm, int Pixels> struct OfPixels {
    using Form = ChromaForm;
    static constexpr int pixels = Pixels;

    static void expectInstancesAgreeOnSums() { forms::expectInstancesAgreeOnSums(Form{}, pixels); }
};

} // namespace forms
