#include "support/each_export.hpp"

#include <gtest/gtest.h>

namespace support
{

namespace
{

class ExportTest : public testing::Test
{
public:
    ExportTest(const Subject& subject, Check check) : subject_(subject), check_(check) {}

    void TestBody() override
    {
        if (const auto text = check_(subject_)) FAIL() << *text;
    }

private:
    const Subject& subject_;
    Check check_;
};

} // namespace

void testEachExport(const char* suite, Check check)
{
    for (const Subject& subject : subjects()) {
        testing::RegisterTest(suite, std::string(subject.entry->name).c_str(), nullptr, nullptr, __FILE__, __LINE__,
                              [&subject, check]() -> testing::Test* { return new ExportTest(subject, check); });
    }
}

} // namespace support
