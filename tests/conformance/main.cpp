#include "conformance/suites.hpp"
#include "support/each_export.hpp"

#include <gtest/gtest.h>

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    support::testEachExport("Values", conformance::checkValues);
    support::testEachExport("Guards", conformance::checkGuards);
    support::testEachExport("Faults", conformance::checkFaults);
    support::testEachExport("Rounding", conformance::checkRounding);
    return RUN_ALL_TESTS();
}
