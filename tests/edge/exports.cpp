// The export surface, read from the library's file: what programs can link to.
#include "catalog.hpp"
#include "support/exported_names.hpp"

#include <gtest/gtest.h>

#include <string>
#include <vector>

TEST(Exports, AreTheVersionQueryAndTheCatalogue)
{
    std::vector<std::string> expected = {"pyxccGetLibVersion"};
    for (const catalog::Export& entry : catalog::exports()) expected.emplace_back(entry.name);
    const auto found = support::exportedNames(reinterpret_cast<const void*>(&pyxccGetLibVersion));
    EXPECT_EQ(support::difference(expected, found), "");
}

TEST(Exports, AreListedInStrictAlphabeticalOrder)
{
    const auto exports = catalog::exports();
    ASSERT_FALSE(exports.empty());
    EXPECT_GT(exports.front().name, "pyxccGetLibVersion");
    for (std::size_t i = 1; i < exports.size(); ++i) EXPECT_LT(exports[i - 1].name, exports[i].name);
}
