#include "tool_test_support.h"

#include "tools/job_file.h"
#include "tools/tool_error.h"

#include <beamweaver/pattern.h>
#include <beamweaver/shapes.h>

#include <gtest/gtest.h>

namespace {

using namespace Norvane::Lumis::Scanning::Tool;
using ToolTest::SmallLineJob;

class JobFileTest : public ::testing::Test {
  protected:
    void SetUp() override { ToolTest::RegisterLibrary(); }
};

template <class I> CComPtr<I> Applied(const char* job) {
    CComPtr<I> object = QueryAs<I>(ApplyJob(ParseJob(job, "job.json")).object.Get());
    EXPECT_TRUE(object);
    return object;
}

struct Range {
    std::int32_t minimum;
    std::int32_t maximum;
    double slewRate;
};

Range AlignmentOf(IPatternRenderingProperties& properties, bool x) {
    CComPtr<IPatternAlignments> alignment;
    EXPECT_EQ(x ? properties.get_PatternAlignmentsX(&alignment)
                : properties.get_PatternAlignmentsY(&alignment),
              S_OK);
    CComPtr<IRangeInt> range;
    EXPECT_EQ(alignment->get_Range(&range), S_OK);
    Range result{};
    range->get_Minimum(&result.minimum);
    range->get_Maximum(&result.maximum);
    alignment->get_SlewRate(&result.slewRate);
    return result;
}

TEST_F(JobFileTest, ClassIsFoundByCoclassNameOrProgIdAndReportedByItsRegisteredName) {
    EXPECT_EQ(ApplyJob(Json::parse(R"({"class": "PatternLine"})")).className, "PatternLine");
    EXPECT_EQ(ApplyJob(Json::parse(R"({"class": "Beamweaver.PatternLine"})")).className, "PatternLine");
}

TEST_F(JobFileTest, NestedObjectsStartFromTheCurrentValueAndArraysSetPropertiesInInterfaceOrder) {
    const auto properties = Applied<IPatternRenderingProperties>(R"({
        "class": "Beamweaver.PatternRenderingProperties", "PreBlankingTime": 3e-6,
        "PatternAlignmentsX": { "SlewRate": 2e11 },
        "PatternAlignmentsY": [[100, 200], 5e10] })");
    double preBlanking = 0.0;
    properties->get_PreBlankingTime(&preBlanking);
    EXPECT_EQ(preBlanking, 3e-6);
    // X keeps the default range 16384..49152 because only its slew rate was given.
    const Range x = AlignmentOf(*properties, true);
    EXPECT_EQ(x.minimum, 16384);
    EXPECT_EQ(x.maximum, 49152);
    EXPECT_EQ(x.slewRate, 2e11);
    // Y as an array: IScanAlignments' Range, then SlewRate; the range itself as [minimum, maximum].
    const Range y = AlignmentOf(*properties, false);
    EXPECT_EQ(y.minimum, 100);
    EXPECT_EQ(y.maximum, 200);
    EXPECT_EQ(y.slewRate, 5e10);
}

TEST_F(JobFileTest, GeometryArraysFillTheValueObjectsFieldByField) {
    const auto line = Applied<IPatternLine>(
        R"({"class": "PatternLine", "Begin": [0.25, 0.75], "TransformationMatrix": [1, 2, 3, 4, 5, 6]})");
    CComPtr<ICoordinateFloat> begin;
    ASSERT_EQ(line->get_Begin(&begin), S_OK);
    double x = 0.0, y = 0.0;
    begin->get_X(&x);
    begin->get_Y(&y);
    EXPECT_EQ(x, 0.25);
    EXPECT_EQ(y, 0.75);
    CComPtr<ITransformationMatrix2D> matrix;
    ASSERT_EQ(line->get_TransformationMatrix(&matrix), S_OK);
    double m2 = 0.0, m5 = 0.0;
    matrix->get_M2(&m2);
    matrix->get_M5(&m5);
    EXPECT_EQ(m2, 3.0);
    EXPECT_EQ(m5, 6.0);
}

TEST_F(JobFileTest, KeysApplyInFileOrderWhateverTheirCase) {
    const auto line = Applied<IPatternLine>(R"({"class": "PatternLine", "pitch": 0.5, "PITCH": 0.25})");
    double pitch = 0.0;
    line->get_Pitch(&pitch);
    EXPECT_EQ(pitch, 0.25);
}

TEST_F(JobFileTest, OneArgumentMethodIsCalledOncePerElementUntilOneFails) {
    const Json job = Json::parse(R"({"class": "PatternPointList", "SetCount": [5, 3000000000]})");
    try {
        ApplyJob(job);
        FAIL() << "a count above the list's limit must be refused";
    } catch (const ToolError& error) {
        EXPECT_STREQ(error.what(), "SetCount[1]: value refused (0x80070057)");
    }
    const auto list = Applied<IPatternPointList>(R"({"class": "PatternPointList", "SetCount": [5, 3]})");
    std::int32_t count = 0;
    list->GetCount(&count);
    EXPECT_EQ(count, 3);
}

struct BadJob {
    const char* job;
    const char* message;
};

class BadJobTest : public ::testing::TestWithParam<BadJob> {
  protected:
    void SetUp() override { ToolTest::RegisterLibrary(); }
};

TEST_P(BadJobTest, NamesTheJsonPathAndTheReason) {
    try {
        ApplyJob(ParseJob(GetParam().job, "job.json"));
        FAIL() << "accepted: " << GetParam().job;
    } catch (const ToolError& error) {
        EXPECT_EQ(std::string(error.what()), GetParam().message);
    }
}

INSTANTIATE_TEST_SUITE_P(
    Jobs, BadJobTest,
    ::testing::Values(
        BadJob{R"({"Pitch": 0.1})", "class: missing: a job names the class of the object to create"},
        BadJob{R"({"class": 5})", "class: expected a class name or ProgID string"},
        BadJob{R"({"class": "PatternLinee"})", "class: unknown class \"PatternLinee\""},
        BadJob{R"({"class": "PatternLine", "Pitchh": 0.1})",
               "Pitchh: unknown property or method of IPatternLine"},
        BadJob{R"({"class": "SubPatternCollection", "TotalPointCount": 1})",
               "TotalPointCount: read-only property of ISubPatternCollection"},
        BadJob{R"({"class": "PatternLine", "Pitch": "fine"})",
               "Pitch: value of the wrong type, expected a number (0x80020005)"},
        BadJob{R"({"class": "PatternLine", "Pitch": [0.1]})",
               "Pitch: value of the wrong type, expected a number"},
        BadJob{R"({"class": "PatternLine", "MultiPass": 0.5})",
               "MultiPass: value of the wrong type, expected an integer (0x80020005)"},
        BadJob{R"({"class": "PatternLine", "MultiPass": 1e12})",
               "MultiPass: value out of range (0x8002000A)"},
        BadJob{R"({"class": "PatternLine", "Pitch": 1.0})", "Pitch: value refused (0x80070057)"},
        BadJob{R"({"class": "PatternLine", "Begin": [1.5, 0.2]})",
               "Begin: Begin values not correct (0x80070057)"},
        BadJob{R"({"class": "PatternLine", "Begin": null})", "Begin: Begin object is null (0x80070057)"},
        BadJob{R"({"class": "PatternLine", "Begin": [0.1]})", "Begin: expected 2 values (X, Y), got 1"},
        BadJob{R"({"class": "PatternLine", "Begin": ["a", 0.1]})",
               "Begin[0]: value of the wrong type, expected a number (0x80020005)"},
        BadJob{
            R"({"class": "PatternLine", "Begin": 0.1})",
            "Begin: value of the wrong type, expected an object, an array of its property values, or null"},
        BadJob{
            R"({"class": "PatternLine", "RenderingProperties": {"PatternAlignmentsX": {"Range": [70000, 1]}}})",
            "RenderingProperties.PatternAlignmentsX.Range: Range values not correct (0x80070057)"},
        BadJob{R"({"class": "PatternLine", "RenderingProperties": {"PreBlankingTime": -1}})",
               "RenderingProperties.PreBlankingTime: value refused (0x80070057)"},
        BadJob{R"({"class": "PatternLine", "RenderingProperties": {"class": "CoordinateFloat"}})",
               "RenderingProperties.class: CoordinateFloat is not of the type this member takes"},
        BadJob{R"({"class": "PatternPointList", "SetCount": 5})",
               "SetCount: expected an array with one argument per call"},
        BadJob{R"({"class": "PatternLine", "Render": []})",
               "Render: the method takes 0 arguments; a job calls only methods that take one"}));

struct MalformedJob {
    const char* text;
    const char* messageStart;
};

class MalformedJobTest : public ::testing::TestWithParam<MalformedJob> {};

TEST_P(MalformedJobTest, IsRefusedBeforeAnythingIsCreated) {
    try {
        ParseJob(GetParam().text, "job.json");
        FAIL() << "accepted: " << GetParam().text;
    } catch (const ToolError& error) {
        EXPECT_EQ(std::string(error.what()).rfind(GetParam().messageStart, 0), 0u) << error.what();
    }
}

INSTANTIATE_TEST_SUITE_P(
    Texts, MalformedJobTest,
    ::testing::Values(
        MalformedJob{R"({"class": "PatternLine",)", "job.json: malformed JSON: parse error at line 1"},
        MalformedJob{"", "job.json: malformed JSON: parse error at line 1"},
        // Too large for a double: the parser reports it apart from syntax errors.
        MalformedJob{R"({"class": "PatternLine", "Pitch": 1e400})",
                     "job.json: malformed JSON: number overflow parsing '1e400'"},
        MalformedJob{R"([{"class": "PatternLine"}])",
                     "job.json: malformed job: a job is one JSON object with a \"class\" key"},
        MalformedJob{R"({"class": "PatternLine", "RenderingProperties": {"PreBlankingTime": 1,
                                       "PreBlankingTime": 2}})",
                     "job.json: malformed job: the key \"PreBlankingTime\" appears twice in one object"}));

TEST(JobJsonTest, TheSameKeyInSeparateObjectsIsNoDuplicate) {
    const Json job =
        ParseJob(R"({"class": "PatternLine", "A": {"SlewRate": 1}, "B": [{"SlewRate": 2}, {"SlewRate": 3}]})",
                 "job.json");
    EXPECT_EQ(job["B"][1]["SlewRate"], 3);
}

TEST(JobJsonTest, KeysKeepTheirFileOrder) {
    const Json job =
        ParseJob(R"({"class": "PatternLine", "Pitch": 0.1, "End": [1, 1], "Begin": [0, 0]})", "job.json");
    std::vector<std::string> keys;
    for (const auto& item : job.items())
        keys.push_back(item.key());
    EXPECT_EQ(keys, (std::vector<std::string>{"class", "Pitch", "End", "Begin"}));
}

TEST(JobJsonTest, AnUnreadableFileIsNamed) {
    ToolTest::TemporaryDirectory directory;
    const std::string missing = (directory / "missing.json").string();
    try {
        ReadJobFile(missing);
        FAIL();
    } catch (const ToolError& error) {
        EXPECT_EQ(std::string(error.what()),
                  missing + ": cannot read the job file: No such file or directory");
    }
}

} // namespace
