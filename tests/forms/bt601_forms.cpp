#include "every_input.hpp"

#include "matrix/bt601_forms.hpp"

namespace
{

template <class Form> class Bt601Form : public testing::Test
{
};

using namespace pyxcc::matrix;
using Forms = testing::Types<FwdExact, FwdHigh, FwdRound>;

struct Names {
    template <class Form> static std::string GetName(int i) { return std::array{"fwdExact", "fwdHigh", "fwdRound"}[i]; }
};

TYPED_TEST_SUITE(Bt601Form, Forms, Names);

TYPED_TEST(Bt601Form, InstancesAgreeOnEveryInput) { forms::expectInstancesAgree(TypeParam{}); }

} // namespace
