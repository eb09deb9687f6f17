#include "shapes/polygon_generator.h"

#include "module/hresult_exception.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

// Alignment 0..1024 on both axes, so that every vertex and pitch below is a whole number of DAC steps:
// relative x lies at DAC 1024 * x, pitch 0.125 is 128 steps, the tolerance is 1/1024. Resolution 2.5e-8 s,
// lead-in of two points and post-blanking of one (the defaults).
class PolygonGeneratorTest : public ::testing::Test {
  protected:
    void SetUp() override {
        PatternRenderingSettings settings = pattern_.GetRenderingSettings();
        settings.alignmentX.range = {0, 1024};
        settings.alignmentY.range = {0, 1024};
        pattern_.SetRenderingSettings(settings);
    }

    std::vector<PatternPoint> Write(const PolygonGeometry& geometry, std::uint8_t flags = PointFlag_Acquire) {
        std::vector<PatternPoint> points(static_cast<std::size_t>(PolygonListPointCount(geometry, pattern_)));
        WritePolygonPoints(points, geometry, pattern_, flags);
        return points;
    }

    PolygonPass Pass(const PolygonGeometry& geometry, PolygonPassSetting setting = {}) {
        return LayOutPolygonPass(geometry, pattern_, setting);
    }

    CPattern pattern_{ScanDeviceConfig{}};
};

constexpr double kPitch = 0.125;
constexpr double kTolerance = 1.0 / 1024;

PolygonGeometry WithPitch(std::vector<coordinate<double>> vertices) {
    PolygonGeometry geometry;
    geometry.vertices = std::move(vertices);
    geometry.strategy.pitchX = kPitch;
    geometry.strategy.pitchY = kPitch;
    return geometry;
}

// Apex on top, horizontal bottom edge. Lines at y = 0.125 + k * 0.125 (k = 0..6); the width at y is
// 0.875 - y, so the lines hold 7, 6, 5, 4, 3, 2 points and the apex 1: N = 28.
PolygonGeometry Triangle() {
    return WithPitch({{0.125, 0.125}, {0.875, 0.125}, {0.5, 0.875}});
}

// A U: a notch from the top down to y = 0.375 between x = 0.375 and 0.625. Lines above the notch bottom are
// cut four times: x = 0.125, 0.375, 0.625, 0.875.
PolygonGeometry ConcaveU() {
    return WithPitch({{0.125, 0.125},
                      {0.875, 0.125},
                      {0.875, 0.875},
                      {0.625, 0.875},
                      {0.625, 0.375},
                      {0.375, 0.375},
                      {0.375, 0.875},
                      {0.125, 0.875}});
}

bool SameRun(const PointRun& run, DacPosition start, DacStep step, std::int32_t count) {
    return run.start == start && run.step.x == step.x && run.step.y == step.y && run.count == count;
}

TEST_F(PolygonGeneratorTest, ApexOnlyTouchesTheTopLineAndTheBottomEdgeGivesBothEnds) {
    const PolygonGeometry triangle = Triangle();
    const auto apex = FindLineCrossings(triangle.vertices, 0.875, kTolerance, false);
    ASSERT_EQ(apex.size(), 1u);
    EXPECT_EQ(apex[0].position, 0.5);
    EXPECT_TRUE(apex[0].touching);

    // V0 adds both ends of the horizontal edge; V1, whose previous edge is that horizontal edge, adds none.
    const auto bottom = FindLineCrossings(triangle.vertices, 0.125, kTolerance, false);
    ASSERT_EQ(bottom.size(), 2u);
    EXPECT_EQ(bottom[0].position, 0.125);
    EXPECT_EQ(bottom[1].position, 0.875);
    EXPECT_FALSE(bottom[0].touching || bottom[1].touching);
}

TEST_F(PolygonGeneratorTest, TriangleLinesFromTheBottomEdgeUpToTheApex) {
    const PolygonPass pass = Pass(Triangle());
    ASSERT_EQ(pass.lines.size(), 7u);
    EXPECT_EQ(pass.pointCount, 28);
    // Bottom: 7 points anchored at 0.875 -> 896, first 896 - 6 * 128 = 128, on DAC y 128.
    ASSERT_EQ(pass.lines[0].runs.size(), 1u);
    EXPECT_TRUE(SameRun(pass.lines[0].runs[0], {128, 128}, {128.0, 0.0}, 7));
    // y = 0.5: crossings 0.3125 and 0.6875, trunc(0.375 / 0.125) + 1 = 4 points ending at 704.
    EXPECT_TRUE(SameRun(pass.lines[3].runs[0], {320, 512}, {128.0, 0.0}, 4));
    // Apex: one point at (512, 896).
    EXPECT_TRUE(SameRun(pass.lines[6].runs[0], {512, 896}, {0.0, 0.0}, 1));
}

TEST_F(PolygonGeneratorTest, ReversedFrameStartsOnTheLowEdgeAndReversedLinesStartOnTheRight) {
    PolygonGeometry triangle = Triangle();
    triangle.strategy.lineDirection = ScanDirection_Reverse;
    const PolygonPass pass = Pass(triangle, {ScanOrientation_Horizontal, true});
    // First line on maxY: the apex; last on minY: 7 points from 896 down by 128.
    EXPECT_TRUE(SameRun(pass.lines.front().runs[0], {512, 896}, {0.0, 0.0}, 1));
    EXPECT_TRUE(SameRun(pass.lines.back().runs[0], {896, 128}, {-128.0, 0.0}, 7));
}

TEST_F(PolygonGeneratorTest, ConcaveLineHoldsTwoSegmentsEachAnchoredOnItsRightEnd) {
    PolygonGeometry shape = ConcaveU();
    shape.strategy.scanType = ScanType_Serpentine;
    const PolygonPass pass = Pass(shape);
    // Segments before line 3 (y = 0.5): 1 + 1 + 2 = 4, so line 3 starts forward again.
    const PolygonScanLine& line = pass.lines[3];
    ASSERT_EQ(line.runs.size(), 2u);
    EXPECT_TRUE(SameRun(line.runs[0], {128, 512}, {128.0, 0.0}, 3));
    EXPECT_TRUE(SameRun(line.runs[1], {896, 512}, {-128.0, 0.0}, 3));

    shape.strategy.scanType = ScanType_Raster;
    const PolygonScanLine raster = Pass(shape).lines[3];
    EXPECT_TRUE(SameRun(raster.runs[1], {640, 512}, {128.0, 0.0}, 3));
}

TEST_F(PolygonGeneratorTest, PairingTableForTouchingVertices) {
    struct Case {
        std::vector<LineCrossing> crossings;
        std::vector<InsideSpan> spans;
    };
    const std::vector<Case> cases{
        {{{0.5, true}}, {{0.5, 0.5, true}}},
        {{{0.1, false}, {0.2, true}, {0.3, false}}, {{0.1, 0.3, false}}},
        {{{0.1, false}, {0.2, true}}, {{0.1, 0.2, false}}},
        {{{0.1, true}, {0.2, false}, {0.3, false}}, {{0.1, 0.1, true}, {0.2, 0.3, false}}},
        {{{0.1, false}, {0.2, false}, {0.3, false}}, {{0.1, 0.2, false}}},
        {{{0.1, false}}, {}},
    };
    for (std::size_t i = 0; i < cases.size(); ++i) {
        const auto spans = PairCrossings(cases[i].crossings);
        ASSERT_EQ(spans.size(), cases[i].spans.size()) << "case " << i;
        for (std::size_t j = 0; j < spans.size(); ++j) {
            EXPECT_EQ(spans[j].from, cases[i].spans[j].from) << "case " << i;
            EXPECT_EQ(spans[j].to, cases[i].spans[j].to) << "case " << i;
            EXPECT_EQ(spans[j].touching, cases[i].spans[j].touching) << "case " << i;
        }
    }
}

TEST_F(PolygonGeneratorTest, DwellStepsOncePerLineByTheIncrementOfThePassCount) {
    // d0 = 1e-6 / 2.5e-8 = 40; End - Begin = 67.5 ticks over N - 1 = 27 gives 2.5 ticks per line:
    // trunc(40 + 2.5k) = 40, 42, 45, 47, 50, 52, 55.
    PolygonGeometry triangle = Triangle();
    triangle.endDwellTime = 1e-6 + 67.5 * 2.5e-8;
    const auto points = Write(triangle);
    ASSERT_EQ(points.size(), 2u + 28u + 1u);
    const std::vector<std::uint16_t> expected{40, 42, 45, 47, 50, 52, 55};
    const std::vector<std::size_t> firstOfLine{2, 9, 15, 20, 24, 27, 29};
    for (std::size_t k = 0; k < expected.size(); ++k)
        EXPECT_EQ(points[firstOfLine[k]].dwell, expected[k]) << "line " << k;
    EXPECT_EQ(points[29], MakePoint(512, 896, 55, PointFlag_Acquire));
}

TEST_F(PolygonGeneratorTest, AllOrientationsWritesFourPassesEachWithItsOwnLeadIn) {
    PolygonGeometry triangle = Triangle();
    triangle.strategy.multiPass = MultiPass_AllOrientations;
    const std::vector<PolygonPassSetting> settings = PolygonFillPasses(triangle.strategy);
    ASSERT_EQ(settings.size(), 4u);
    const auto points = Write(triangle, PointFlag_Blank);
    std::size_t at = 0;
    for (const PolygonPassSetting& setting : settings) {
        const auto count = static_cast<std::size_t>(Pass(triangle, setting).pointCount);
        const PatternPoint& first = points[at + 2];
        const PatternPoint& last = points[at + 2 + count - 1];
        EXPECT_EQ(points[at], MakePoint(first.x, first.y, 40, PointFlag_Blank));
        EXPECT_EQ(points[at + 1], MakePoint(first.x, first.y, 2, 0));
        EXPECT_EQ(points[at + 2 + count], MakePoint(last.x, last.y, 40, PointFlag_Blank));
        at += 2 + count + 1;
    }
    EXPECT_EQ(at, points.size());
    EXPECT_EQ(PolygonPassCount(triangle.strategy), 4);
}

TEST_F(PolygonGeneratorTest, OutlineEdgesEndExactlyOnTheirEndVertices) {
    // Square edges of 0.75: floor(0.75 / 0.125) = 6 points each, stepping 128, the last on the end vertex.
    PolygonGeometry square = WithPitch({{0.125, 0.125}, {0.875, 0.125}, {0.875, 0.875}, {0.125, 0.875}});
    square.strategy.fillStyle = FillStyle_Frame;
    const auto points = Write(square);
    ASSERT_EQ(points.size(), 2u + 24u + 1u);
    EXPECT_EQ(points[0], MakePoint(256, 128, 40, PointFlag_Blank));
    EXPECT_EQ(points[2], MakePoint(256, 128, 40, PointFlag_Acquire));
    EXPECT_EQ(points[7], MakePoint(896, 128, 40, PointFlag_Acquire));
    EXPECT_EQ(points[8], MakePoint(896, 256, 40, PointFlag_Acquire));
    EXPECT_EQ(points[25], MakePoint(128, 128, 40, PointFlag_Acquire));
    EXPECT_EQ(points[26], MakePoint(128, 128, 40, PointFlag_Blank));
    // Loop time: 24 points of 40 ticks.
    EXPECT_DOUBLE_EQ(PolygonEffectiveLoopTime(square, pattern_), 24 * 40 * 2.5e-8);
}

TEST_F(PolygonGeneratorTest, FillLoopTimeCountsLinesFromTheLowEdge) {
    // Per line from the bottom 7, 6, 5, 4, 3, 2, 1 points; Begin = End = 1e-6: 28 * 1e-6.
    EXPECT_NEAR(PolygonEffectiveLoopTime(Triangle(), pattern_), 28e-6, 1e-15);
}

TEST_F(PolygonGeneratorTest, UnknownOrientationOrMultiPassAndTooFewPointsAreUnexpected) {
    const auto expectUnexpected = [&](const PolygonGeometry& geometry, const std::string& message) {
        try {
            PolygonListPointCount(geometry, pattern_);
            ADD_FAILURE() << message;
        } catch (const HResultException& error) {
            EXPECT_EQ(error.Error(), E_UNEXPECTED);
            EXPECT_TRUE(std::string(error.what()).ends_with(message)) << error.what();
        }
    };
    PolygonGeometry triangle = Triangle();
    triangle.strategy.orientation = static_cast<ScanOrientation>(2);
    expectUnexpected(triangle, "LineScanOrientation out of range");
    triangle = Triangle();
    triangle.strategy.multiPass = static_cast<MultiPass>(7);
    expectUnexpected(triangle, "MultiPass out of range");
    // A sliver within one line: only its apex on the single line y = 0.5625.
    expectUnexpected(WithPitch({{0.5, 0.5}, {0.5625, 0.5}, {0.53125, 0.5625}}),
                     "PolygonPatternPointCount < 2");
}

TEST_F(PolygonGeneratorTest, ValidationListsEveryProblem) {
    PolygonGeometry geometry = WithPitch({{0.1, 0.1}, {0.2, 0.2}});
    geometry.beginDwellTime = 1e-9;
    geometry.strategy.pitchX = 1e-4;
    EXPECT_EQ(PolygonValidationProblems(geometry, pattern_),
              "Polygon must contain at least 3 points. BeginDwellTime out of range. PitchX out of range. ");
    EXPECT_EQ(PolygonValidationProblems(Triangle(), pattern_), "");
}

} // namespace
} // namespace Norvane::Lumis::Scanning
