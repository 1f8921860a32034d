// The inverse forms of all matrices, with chroma of each pixel's own and with shared chroma.
#include "every_input.hpp"
#include "every_shared_chroma.hpp"

#include "matrix/bt601_forms.hpp"
#include "packed/inverse_forms.hpp"
#include "subsampled/bt709_inverse_forms.hpp"

namespace
{

using namespace pyxcc::matrix;
using pyxcc::packed::InvHighE;
using pyxcc::packed::YuvInvHighPacked;
using namespace pyxcc::subsampled::bt709;

using Forms = testing::Types<InvExactA, InvExactB, InvExactC, InvExactD, InvExactE, InvExactF, InvHighA, InvHighB,
                             InvHighC, InvHighD, Inv3A, Inv3B, Inv3C, Inv3D, InvExactStudio, InvHighStudio<0>,
                             InvHighStudio<4>, InvExactHdtv, InvHighHdtv, InvHighE, YuvInvHighPacked>;

struct Names {
    template <class Form> static std::string GetName(int i)
    {
        return std::array{"invExactA",   "invExactB", "invExactC",       "invExactD",   "invExactE",   "invExactF",
                          "invHighA",    "invHighB",  "invHighC",        "invHighD",    "inv3A",       "inv3B",
                          "inv3C",       "inv3D",     "inv709Exact",     "inv709High0", "inv709High4", "invHdtvExact",
                          "invHdtvHigh", "invHighE",  "yuvInvHighPacked"}[i];
    }
};

template <class Form> class InverseForm : public testing::Test
{
};

TYPED_TEST_SUITE(InverseForm, Forms, Names);

TYPED_TEST(InverseForm, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(TypeParam{}); }

TYPED_TEST(InverseForm, InstancesAgreeOnSharedChroma) { forms::expectSharedInstancesAgree(TypeParam{}); }

} // namespace
