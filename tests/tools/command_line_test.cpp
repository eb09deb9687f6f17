#include "tools/command_line.h"

#include <gtest/gtest.h>

#include <sstream>
#include <vector>

namespace {

using namespace Norvane::Lumis::Scanning::Tool;

struct Parsed {
    CommandLine commandLine;
    std::string out;
    std::string err;
};

Parsed Parse(std::vector<const char*> arguments) {
    arguments.insert(arguments.begin(), "beamweaver");
    std::ostringstream out, err;
    CommandLine commandLine =
        ParseCommandLine(static_cast<int>(arguments.size()), arguments.data(), out, err);
    return {commandLine, out.str(), err.str()};
}

TEST(CommandLineTest, ReadsTheJobAndEveryOptionInEitherForm) {
    const Parsed parsed =
        Parse({"render", "--points", "p.csv", "job.json", "--stream=s.str", "--json", "--preview", "d.png"});
    ASSERT_TRUE(parsed.commandLine.render);
    const RenderOptions& options = *parsed.commandLine.render;
    EXPECT_EQ(options.jobPath, "job.json");
    EXPECT_TRUE(options.json);
    EXPECT_EQ(options.pointsPath, "p.csv");
    EXPECT_EQ(options.streamPath, "s.str");
    EXPECT_EQ(options.previewPath, "d.png");
}

TEST(CommandLineTest, WithoutArgumentsRenderRendersTheBuiltInExample) {
    const Parsed parsed = Parse({"render"});
    ASSERT_TRUE(parsed.commandLine.render);
    EXPECT_FALSE(parsed.commandLine.render->jobPath);
    EXPECT_FALSE(parsed.commandLine.render->json);
}

TEST(CommandLineTest, HelpIsPrintedAndExitsZero) {
    for (const auto& arguments :
         {std::vector<const char*>{"--help"}, std::vector<const char*>{"render", "-h"}}) {
        const Parsed parsed = Parse(arguments);
        EXPECT_FALSE(parsed.commandLine.render);
        EXPECT_EQ(parsed.commandLine.exitCode, kExitSuccess);
        EXPECT_NE(parsed.out.find("beamweaver render"), std::string::npos);
        EXPECT_EQ(parsed.err, "");
    }
}

struct Misuse {
    std::vector<const char*> arguments;
    const char* error;
};

class MisuseTest : public ::testing::TestWithParam<Misuse> {};

TEST_P(MisuseTest, ExitsTwoWithOneLine) {
    const Parsed parsed = Parse(GetParam().arguments);
    EXPECT_FALSE(parsed.commandLine.render);
    EXPECT_EQ(parsed.commandLine.exitCode, kExitBadInput);
    EXPECT_EQ(parsed.err, std::string(GetParam().error) + "\n");
}

INSTANTIATE_TEST_SUITE_P(
    Arguments, MisuseTest,
    ::testing::Values(
        Misuse{{}, "beamweaver: expected the command 'render' (see beamweaver --help)"},
        Misuse{{"draw"}, "beamweaver: expected the command 'render' (see beamweaver --help)"},
        Misuse{{"render", "--bogus"},
               "beamweaver render: unknown option --bogus (see beamweaver render --help)"},
        Misuse{{"render", "--points"},
               "beamweaver render: --points needs a file name (see beamweaver render --help)"},
        Misuse{{"render", "--stream="},
               "beamweaver render: --stream needs a file name (see beamweaver render --help)"},
        Misuse{{"render", "--preview", "a.png", "--preview", "b.png"},
               "beamweaver render: --preview is given twice (see beamweaver render --help)"},
        Misuse{
            {"render", "a.json", "b.json"},
            "beamweaver render: more than one job file: a.json and b.json (see beamweaver render --help)"}));

} // namespace
