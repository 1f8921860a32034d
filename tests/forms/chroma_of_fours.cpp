// Chroma of the sums of four columns against the scalar form of four pixels.
#include "packed/chroma_of_fours.hpp"

#include <gtest/gtest.h>

#include <array>
#include <random>

namespace
{

using pyxcc::scalar::S16;
using pyxcc::wide::U8;
using Channel = std::array<u8, U8::count>;
using Sums = pyxcc::layouts::Sums<4, U8>;

Sums sumsOf(const Channel& channel) { return Sums(pyxcc::layouts::loadSamples(channel.data())); }

S16 sumOf(const Channel& channel, int four)
{
    const u8* first = &channel[4 * four];
    return first[0] + first[1] + first[2] + first[3];
}

void expectScalarForm(const Channel& r, const Channel& g, const Channel& b)
{
    std::array<u8, U8::count / 4> cb, cr;
    const auto chroma = pyxcc::packed::ChromaOfFours{}(sumsOf(r), sumsOf(g), sumsOf(b));
    pyxcc::layouts::storeApart<4>(cb.data(), cr.data(), pyxcc::layouts::narrowPairs(chroma));
    for (int i = 0; i < U8::count / 4; ++i) {
        const auto one = pyxcc::subsampled::chromaEighth<4>(sumOf(r, i), sumOf(g, i), sumOf(b, i));
        ASSERT_EQ(int{cb[i]}, int{one.a.v}) << "Cb of four " << i;
        ASSERT_EQ(int{cr[i]}, int{one.b.v}) << "Cr of four " << i;
    }
}

TEST(ChromaOfFours, IsTheScalarFormAtTheEndsOfTheSums)
{
    for (const u8 r : {0, 255}) {
        for (const u8 g : {0, 255}) {
            for (const u8 b : {0, 255}) {
                Channel ofR, ofG, ofB;
                ofR.fill(r);
                ofG.fill(g);
                ofB.fill(b);
                ASSERT_NO_FATAL_FAILURE(expectScalarForm(ofR, ofG, ofB));
            }
        }
    }
}

TEST(ChromaOfFours, IsTheScalarFormOfRandomSamples)
{
    std::mt19937 random(411);
    std::uniform_int_distribution<int> sample(0, 255);
    Channel r, g, b;
    for (int block = 0; block < 1 << 16; ++block) {
        for (Channel* channel : {&r, &g, &b}) {
            for (u8& x : *channel) x = static_cast<u8>(sample(random));
        }
        ASSERT_NO_FATAL_FAILURE(expectScalarForm(r, g, b));
    }
}

} // namespace
