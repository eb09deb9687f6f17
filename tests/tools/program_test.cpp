// Runs the built program as a user does.
#include "tool_test_support.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <sys/wait.h>

namespace {

using ToolTest::Json;
using ToolTest::ReadFile;
using ToolTest::TemporaryDirectory;

struct RunResult {
    int exitCode;
    std::string out;
    std::string err;
};

RunResult RunProgram(const TemporaryDirectory& directory, const std::string& arguments) {
    const auto out = directory / "stdout.txt";
    const auto err = directory / "stderr.txt";
    const std::string command = std::string("'") + BW_TOOL_PATH + "' " + arguments + " >'" + out.string() +
                                "' 2>'" + err.string() + "'";
    const int status = std::system(command.c_str());
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, ReadFile(out), ReadFile(err)};
}

TEST(ProgramTest, JsonReportOfTheBuiltInExample) {
    TemporaryDirectory directory;
    const RunResult run = RunProgram(directory, "render --json");
    ASSERT_EQ(run.exitCode, 0) << run.err;
    const Json report = Json::parse(run.out);
    EXPECT_EQ(report["class"], "PatternLine");
    EXPECT_EQ(report["valid"], true);
    EXPECT_GT(report["point_count"].get<int>(), 1000) << "1001 line points plus lead-in and post-blanking";
}

TEST(ProgramTest, ABadJobExitsTwoWithOneLineOnStandardError) {
    TemporaryDirectory directory;
    ToolTest::WriteFile(directory / "job.json", R"({"class": "PatternLine", "Pitch": 2})");
    const RunResult run = RunProgram(directory, "render '" + (directory / "job.json").string() +
                                                    "' --points '" + (directory / "p.csv").string() + "'");
    EXPECT_EQ(run.exitCode, 2);
    EXPECT_EQ(run.out, "");
    EXPECT_EQ(run.err, "Pitch: value refused (0x80070057)\n");
    EXPECT_FALSE(std::filesystem::exists(directory / "p.csv"));
}

TEST(ProgramTest, HelpExplainsJobsOutputsAndExitStatus) {
    TemporaryDirectory directory;
    const RunResult run = RunProgram(directory, "render --help");
    EXPECT_EQ(run.exitCode, 0);
    for (const char* topic : {"JOB", "--json", "--points", "--stream", "--preview", "Job file:", "\"class\"",
                              "Exit status:", "value refused (0x80070057)"})
        EXPECT_NE(run.out.find(topic), std::string::npos) << topic;
}

TEST(ProgramTest, AUsageErrorExitsTwo) {
    TemporaryDirectory directory;
    EXPECT_EQ(RunProgram(directory, "render --bogus").exitCode, 2);
    EXPECT_EQ(RunProgram(directory, "").exitCode, 2);
}

} // namespace
