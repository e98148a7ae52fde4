#include "Files.h"
#include "Failure.h"
#include "Program.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

using namespace curvelab;
namespace fs = std::filesystem;

TEST(StagedFile, AppearsWithItsCommit)
{
    const TemporaryFolder folder;
    const fs::path target = folder.Path() / "out.txt";
    StagedFile file(target.string(), "whole");
    EXPECT_FALSE(fs::exists(target));
    file.Commit();
    EXPECT_EQ(ContentOf(target), "whole");
    EXPECT_EQ(folder.Names(), std::vector<std::string>{"out.txt"});
}

TEST(StagedFile, LeavesNothingWithoutOne)
{
    const TemporaryFolder folder;
    const std::string target = folder.Write("out.txt", "old");
    {
        const StagedFile file(target, "new");
    }
    EXPECT_EQ(ContentOf(target), "old");
    EXPECT_EQ(folder.Names(), std::vector<std::string>{"out.txt"});
}

TEST(StagedFile, WritesThroughALink)
{
    const TemporaryFolder folder;
    const std::string target = folder.Write("real.txt", "old");
    fs::create_symlink("real.txt", folder.Path() / "link.txt");
    StagedFile((folder.Path() / "link.txt").string(), "new").Commit();
    EXPECT_TRUE(fs::is_symlink(folder.Path() / "link.txt"));
    EXPECT_EQ(ContentOf(target), "new");
}

TEST(StagedFile, DoesNotReplaceADevice)
{
    StagedFile("/dev/null", "gone").Commit();
    struct stat status = {};
    ASSERT_EQ(::stat("/dev/null", &status), 0);
    EXPECT_TRUE(S_ISCHR(status.st_mode));
}

TEST(StagedFile, NamesWhatCannotBeWritten)
{
    const TemporaryFolder folder;
    const std::string missing = (folder.Path() / "missing" / "out.txt").string();
    try {
        const StagedFile file(missing, "x");
        ADD_FAILURE() << "written into a folder that does not exist";
    } catch (const Failure& failure) {
        EXPECT_EQ(std::string(failure.what()), missing + ": cannot be written: No such file or directory");
    }
    EXPECT_THROW(StagedFile(folder.Path().string(), "x"), Failure);
    EXPECT_TRUE(folder.Names().empty());
}

TEST(ReadFile, NamesWhatCannotBeRead)
{
    const TemporaryFolder folder;
    EXPECT_EQ(ReadFile(folder.Write("a", std::string("a\0b", 3))), std::string("a\0b", 3));
    EXPECT_THROW(static_cast<void>(ReadFile((folder.Path() / "b").string())), Failure);
    EXPECT_THROW(static_cast<void>(ReadFile(folder.Path().string())), Failure);
}
