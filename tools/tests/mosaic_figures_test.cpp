// The figures that compare both conversions of mosaics.
#include "mosaic_figures.hpp"
#include "support.hpp"
#include "test_card.hpp"

#include <cmath>

namespace
{

using namespace tool;
using namespace tool::testing;

// One sample in six is 51 off, a fifth of the range: the mean square is 1 / 150 of the peak's.
TEST(Psnr, IsThePeakAgainstTheMeanSquare)
{
    const Image a = imageOf(rgb(), {2, 1}, {0, 0, 0, 100, 100, 100}),
                b = imageOf(rgb(), {2, 1}, {0, 51, 0, 100, 100, 100});
    EXPECT_NEAR(psnr(a, b), 10 * std::log10(150), 1e-9);
    EXPECT_TRUE(std::isinf(psnr(a, a)));
}

TEST(MosaicFigures, AreAPartOfThePictureAndOfAZonePlate)
{
    const auto figures = mosaicFigures(testCard({96, 64}));
    ASSERT_EQ(figures.size(), 6U);
    EXPECT_EQ(figures[0].image.size().width, 3 * 96);
    EXPECT_EQ(figures[0].image.size().height, 3 * 64);
    EXPECT_EQ(figures[1].caption.rfind("In one pass: ", 0), 0U);
    EXPECT_EQ(figures[5].caption.rfind("By homogeneity: ", 0), 0U);
}

TEST(MosaicFigures, OneColourComesBackAsItIs)
{
    Image picture(rgb("C4"), {16, 12});
    for (int y = 0; y < 12; ++y) std::fill_n(picture.plane(0) + y * picture.step(0), 64, u8{90});
    const auto figures = mosaicFigures(picture);
    EXPECT_EQ(figures[1].caption, "In one pass: the picture itself");
    EXPECT_EQ(figures[2].caption, "By homogeneity: the picture itself");
}

TEST(MosaicFigures, AreNoneOfASmallPicture) { EXPECT_TRUE(mosaicFigures(testCard({5, 64})).empty()); }

} // namespace
