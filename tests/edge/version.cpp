// The version record.
#include "pyxcc/version.h"

#include <gtest/gtest.h>

#include <cstring>

TEST(Version, IsTheSameRecordOnEveryCall)
{
    const LibVersion* first = pyxccGetLibVersion();
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(pyxccGetLibVersion(), first);
}

TEST(Version, TargetCodeIsTwoLettersAndTwoZeros)
{
    EXPECT_EQ(std::memcmp(pyxccGetLibVersion()->targetCode, "q7\0\0", 4), 0);
}

TEST(Version, TellsTheRelease)
{
    const LibVersion& version = *pyxccGetLibVersion();
    EXPECT_EQ(version.major, 8);
    EXPECT_EQ(version.minor, 2);
    EXPECT_EQ(version.update, 1);
    EXPECT_EQ(version.revision, 44077);
    EXPECT_STREQ(version.nameText, "pyxCC AVX2 (q7)");
    EXPECT_STREQ(version.versionText, "8.2.1 (r44077)");
    EXPECT_STREQ(version.buildDateText, "Oct  9 2014");
}
