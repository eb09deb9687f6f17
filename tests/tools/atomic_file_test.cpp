#include "tool_test_support.h"

#include "tools/atomic_file.h"
#include "tools/tool_error.h"

#include <gtest/gtest.h>

#include <sys/stat.h>

namespace {

using namespace Norvane::Lumis::Scanning::Tool;
using ToolTest::ReadFile;
using ToolTest::TemporaryDirectory;

TEST(PendingFileTest, TheTargetAppearsOnlyOnCommitAndNothingElseStays) {
    TemporaryDirectory directory;
    const auto target = directory / "points.csv";
    PendingFile file(target, "--points");
    file.Stream() << "sub,repeat\n";
    file.Close();
    EXPECT_FALSE(std::filesystem::exists(target));
    file.Commit();
    EXPECT_EQ(ReadFile(target), "sub,repeat\n");
    EXPECT_EQ(directory.Entries(), std::vector<std::string>{"points.csv"});
}

TEST(PendingFileTest, AFileNeverCommittedLeavesNoTraceAndAnEarlierFileUntouched) {
    TemporaryDirectory directory;
    const auto target = directory / "picture.png";
    ToolTest::WriteFile(target, "earlier");
    {
        PendingFile file(target, "--preview");
        file.Stream() << "half";
    }
    EXPECT_EQ(directory.Entries(), std::vector<std::string>{"picture.png"});
    EXPECT_EQ(ReadFile(target), "earlier");
}

TEST(PendingFileTest, CommitReplacesAnEarlierFile) {
    TemporaryDirectory directory;
    const auto target = directory / "scan.str";
    ToolTest::WriteFile(target, "earlier");
    PendingFile file(target, "--stream");
    file.Stream() << "s16,25ns,dac\n";
    file.Close();
    file.Commit();
    EXPECT_EQ(ReadFile(target), "s16,25ns,dac\n");
}

TEST(PendingFileTest, ANewFileGetsThePermissionsTheUmaskAllows) {
    TemporaryDirectory directory;
    const mode_t previous = umask(022);
    {
        PendingFile file(directory / "a.csv", "--points");
        file.Close();
        file.Commit();
    }
    umask(previous);
    using std::filesystem::perms;
    EXPECT_EQ(std::filesystem::status(directory / "a.csv").permissions(),
              perms::owner_read | perms::owner_write | perms::group_read | perms::others_read);
}

TEST(PendingFileTest, ATargetThatCannotBeWrittenIsNamedWithTheOption) {
    TemporaryDirectory directory;
    const auto inMissingDirectory = directory / "missing" / "a.csv";
    try {
        PendingFile file(inMissingDirectory, "--points");
        FAIL();
    } catch (const ToolError& error) {
        EXPECT_EQ(std::string(error.what()), "--points " + inMissingDirectory.string() +
                                                 ": cannot create the file: No such file or directory");
    }
    try {
        PendingFile file(directory.Path(), "--preview");
        FAIL();
    } catch (const ToolError& error) {
        EXPECT_EQ(std::string(error.what()),
                  "--preview " + directory.Path().string() + ": it names a directory");
    }
    EXPECT_TRUE(directory.Entries().empty());
}

} // namespace
