// The forms of pixels that share their chroma: luma over all pixels, chroma over sums of 1, 2 and 4 pixels.
#include "chroma_of_sums.hpp"
#include "every_input.hpp"

#include "subsampled/bt709_forward_forms.hpp"
#include "subsampled/rgb_to_ycbcr_forms.hpp"

namespace
{

using namespace pyxcc::subsampled;
using forms::OfPixels;

template <class Form> class SharedChromaLuma : public testing::Test
{
};

using LumaForms =
    testing::Types<LumaExact601, LumaExactOdd, LumaHigh7, LumaHigh8, LumaRound601, LumaRoundPlain,
                   bt709::LumaExactStudio, bt709::LumaHighStudio, bt709::LumaExactHdtv, bt709::LumaHighHdtv>;

struct LumaNames {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"exact",      "exactOdd",    "high7",      "high8",     "round",
                          "roundPlain", "exactStudio", "highStudio", "exactHdtv", "highHdtv"}[i];
    }
};

TYPED_TEST_SUITE(SharedChromaLuma, LumaForms, LumaNames);

TYPED_TEST(SharedChromaLuma, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(TypeParam{}); }

template <class Case> class SharedChroma : public testing::Test
{
};

using ChromaForms =
    testing::Types<OfPixels<ChromaHighS<32>, 4>, OfPixels<ChromaHighS<64>, 2>, OfPixels<ChromaHighU4, 4>,
                   OfPixels<ChromaHighU2, 2>, OfPixels<ChromaRound4, 4>, OfPixels<ChromaRoundPlain4, 4>,
                   OfPixels<ChromaEighth<4>, 4>, OfPixels<ChromaEighth<2>, 2>, OfPixels<ChromaEighth<1>, 1>,
                   OfPixels<ChromaNearest<2>, 2>, OfPixels<ChromaNearest<1>, 1>, OfPixels<bt709::ChromaExactStudio, 4>,
                   OfPixels<bt709::ChromaHighU, 4>, OfPixels<bt709::ChromaHighS, 4>,
                   OfPixels<bt709::ChromaExactHdtv, 4>, OfPixels<bt709::ChromaLoneHdtv, 1>,
                   OfPixels<bt709::ChromaHighHdtv<32>, 4>, OfPixels<bt709::ChromaHighHdtv<64>, 2>>;

struct ChromaNames {
    template <class Case> static std::string GetName(int i)
    {
        return std::array{"highS32",     "highS64",     "highU4",    "highU2",   "round4",    "roundPlain4",
                          "eighth4",     "eighth2",     "eighth1",   "nearest2", "nearest1",  "exactStudio",
                          "highUStudio", "highSStudio", "exactHdtv", "loneHdtv", "highHdtv4", "highHdtv2"}[i];
    }
};

TYPED_TEST_SUITE(SharedChroma, ChromaForms, ChromaNames);

TYPED_TEST(SharedChroma, InstancesAgreeOnSums) { TypeParam::expectInstancesAgreeOnSums(); }

} // namespace
