#include "support.hpp"

using namespace tool;
using namespace tool::testing;

namespace
{

TEST(Files, ReplaceWhatWasThere)
{
    const Folder folder;
    const fs::path path = folder / "file";
    writeFiles(std::vector<File>{{path, {1, 2, 3}}});
    writeFiles(std::vector<File>{{path, {4}}});
    EXPECT_EQ(readFile(path), Bytes{4});
    EXPECT_EQ(folder.count(), 1u);
}

TEST(Files, AreAllWrittenOrNone)
{
    const Folder folder;
    const std::vector<File> files = {{folder / "good", {1}}, {folder / "no/such/folder", {2}}};
    EXPECT_NE(failureOf([&] { writeFiles(files); }).find("no/such/folder: No such file"), std::string::npos);
    EXPECT_EQ(folder.count(), 0u);
}

TEST(Files, DoNotReplaceDirectories)
{
    const Folder folder;
    fs::create_directory(folder / "directory");
    EXPECT_NE(failureOf([&] { writeFiles(std::vector<File>{{folder / "directory", {1}}}); }), "");
    EXPECT_TRUE(fs::is_directory(folder / "directory"));
    EXPECT_EQ(folder.count(), 1u);
    EXPECT_NE(failureOf([&] { readFile(folder / "directory"); }).find("directory"), std::string::npos);
}

TEST(StagedDirectory, AppearsWhenItIsComplete)
{
    const Folder folder;
    {
        StagedDirectory staged(folder / "new/");
        staged.write("file", Bytes{1, 2});
        EXPECT_FALSE(fs::exists(folder / "new"));
        staged.commit();
    }
    EXPECT_EQ(readFile(folder / "new/file"), (Bytes{1, 2}));
    EXPECT_EQ(folder.count(), 1u);
}

TEST(StagedDirectory, LeavesNothingBehindIfItIsNotCompleted)
{
    const Folder folder;
    {
        const StagedDirectory staged(folder / "new");
        staged.write("file", Bytes{1});
    }
    EXPECT_EQ(folder.count(), 0u);
}

TEST(StagedDirectory, DoesNotTakeANameThatIsTaken)
{
    const Folder folder;
    writeFiles(std::vector<File>{{folder / "taken", {1}}});
    EXPECT_NE(failureOf([&] { StagedDirectory(folder / "taken"); }).find("exists already"), std::string::npos);
    EXPECT_NE(failureOf([&] { StagedDirectory(folder / "no/such"); }).find("No such file"), std::string::npos);
    EXPECT_EQ(folder.count(), 1u);
}

} // namespace
