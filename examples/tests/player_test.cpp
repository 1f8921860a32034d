#include "program.hpp"

namespace
{

using Player = example::Program;

// It fails by itself if bands make another picture than one call.
TEST_F(Player, BandsMakeTheSamePicture)
{
    for (const auto* const arguments : {"", "640 360 1", "642 358 3", "70 6 8", "2 2 4"}) {
        const std::string out = run(std::string("bin/player ") + arguments);
        EXPECT_EQ(status, 0) << arguments << ": " << errors;
        EXPECT_NE(out.find("ms a frame\nthe pictures are equal\n"), std::string::npos) << out;
    }
}

TEST_F(Player, Failures)
{
    for (const auto* const arguments : {"641 360", "640 0", "640 360 0"}) {
        run(std::string("bin/player ") + arguments);
        EXPECT_EQ(status, 1) << arguments;
        EXPECT_NE(errors.find("usage: player"), std::string::npos) << arguments;
    }
}

} // namespace
