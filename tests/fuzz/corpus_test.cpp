// The scripts that the fuzzer has kept.
#include "fuzz/scripted_call.hpp"
#include "reference/reference.hpp"
#include "support/called.hpp"

#include <gtest/gtest.h>

#include <fstream>
#include <set>
#include <string>
#include <vector>

namespace
{

/// A script a line, two hexadecimal digits a byte.
std::vector<std::vector<u8>> corpus()
{
    std::vector<std::vector<u8>> scripts;
    std::ifstream file(CORPUS);
    for (std::string line; std::getline(file, line);) {
        std::vector<u8>& script = scripts.emplace_back();
        for (std::size_t i = 0; i + 1 < line.size(); i += 2)
            script.push_back(static_cast<u8>(std::stoi(line.substr(i, 2), nullptr, 16)));
    }
    return scripts;
}

TEST(Corpus, LibraryAndReferenceAgree)
{
    for (const auto& script : corpus()) EXPECT_EQ(fuzz::checkScript(script).value_or(""), "");
}

TEST(Corpus, HasCallsOfAllExports)
{
    std::set<std::string_view> called;
    for (const auto& script : corpus()) called.insert(fuzz::subjectOf(script).entry->name);
    for (const catalog::Export& entry : catalog::exports()) EXPECT_TRUE(called.contains(entry.name)) << entry.name;
}

PyxStatus wrongLastColumn(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    const PyxStatus status = reference::pyxiRGBToYCbCr_8u_C3R(src, srcStep, dst, dstStep, roi);
    if (status == pyxOk) dst[3 * roi.width - 1] ^= 1;
    return status;
}

PyxStatus writesWithoutTests(const u8* src, int srcStep, u8* dst, int dstStep, RoiSize roi)
{
    if (src && dst) dst[0] ^= 1;
    return reference::pyxiRGBToYCbCr_8u_C3R(src, srcStep, dst, dstStep, roi);
}

/// How many of the scripts find something wrong with a function in the place of the library's.
template <auto function> int findings(const std::vector<std::vector<u8>>& scripts)
{
    const auto subject = support::substitute("pyxiRGBToYCbCr_8u_C3R", support::called<function>());
    int count = 0;
    for (const auto& script : scripts) count += fuzz::checkScript(subject, script).has_value();
    return count;
}

TEST(Corpus, FindsWhatIsWrong)
{
    std::vector<std::vector<u8>> scripts;
    for (int first = 0; first < 8; ++first) { // every eighth has faults
        for (u8 second = 0; second < 20; ++second) scripts.push_back({static_cast<u8>(first), second, 5, 5, 5});
    }
    EXPECT_EQ(findings<&reference::pyxiRGBToYCbCr_8u_C3R>(scripts), 0);
    EXPECT_EQ(findings<&wrongLastColumn>(scripts), 140);
    EXPECT_EQ(findings<&writesWithoutTests>(scripts), 20); // those of a wrong height
}

} // namespace
