#include "core/pattern_base.h"

#include "module/hresult_exception.h"
#include "support/test_pattern.h"

#include <gtest/gtest.h>

#include <cmath>
#include <vector>

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

namespace {

// Default alignments: 16384..49152 on both axes, a span of 32768 DAC steps.
class PatternBaseTest : public ::testing::Test {
protected:
    CPattern pattern{ScanDeviceConfig{}};
    std::vector<PatternPoint> points = std::vector<PatternPoint>(16);
};

struct ResolutionCase {
    const char* name;
    double maxDwell;
    double target;
    double expected;
};

class ResolutionTest : public ::testing::TestWithParam<ResolutionCase> {};

TEST_P(ResolutionTest, PicksSmallestPowerOfTwoOfTheUnitNeverFinerThanTarget) {
    CPattern pattern{ScanDeviceConfig{}};
    PatternRenderingSettings settings;
    settings.targetDwellTimeResolution = GetParam().target;
    pattern.SetRenderingSettings(settings);
    pattern.UpdateDwellTimeResolution(GetParam().maxDwell);
    EXPECT_DOUBLE_EQ(pattern.GetDwellTimeResolution(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(
    Rules, ResolutionTest,
    ::testing::Values(
        // 1e-3 / (4095 * 2.5e-8) = 9.77 -> log2 3.29 -> k = 4 -> 2.5e-8 * 16
        ResolutionCase{"OneMillisecond", 1e-3, 2.5e-8, 4e-7},
        // ratio 0.98 fits one unit: k = 0
        ResolutionCase{"FitsTheUnit", 1e-4, 2.5e-8, 2.5e-8},
        ResolutionCase{"Zero", 0.0, 2.5e-8, 2.5e-8}, ResolutionCase{"Negative", -1.0, 2.5e-8, 2.5e-8},
        ResolutionCase{"NotANumber", std::nan(""), 2.5e-8, 2.5e-8},
        // the unit would do, but the target is coarser
        ResolutionCase{"TargetCoarser", 1e-6, 1e-7, 1e-7}),
    [](const auto& param) { return std::string(param.param.name); });

TEST_F(PatternBaseTest, DefaultLeadInIsOneBlankOf40TicksThenOneAsymmetryPointOf2Ticks) {
    // 1e-6 s / 2.5e-8 s = 40 ticks, below 4095: one point; 5e-8 / 2.5e-8 = 2 ticks.
    const std::int32_t next = pattern.AddLeadInPoints(points, {100, 200}, 0);
    ASSERT_EQ(next, 2);
    EXPECT_EQ(points[0], MakePoint(100, 200, 40, PointFlag_Blank));
    EXPECT_EQ(points[1], MakePoint(100, 200, 2, 0));
    EXPECT_EQ(pattern.AddPostBlankingPoints(points, {7, 8}, next), 3);
    EXPECT_EQ(points[2], MakePoint(7, 8, 40, PointFlag_Blank));
}

TEST_F(PatternBaseTest, LongPreBlankingIsSplitIntoEqualTruncatedPoints) {
    PatternRenderingSettings settings;
    settings.preBlankingTime = 2.5e-4; // 10000 ticks > 4095: ceil(2.5e-4 / 1.02375e-4) = 3 points
    pattern.SetRenderingSettings(settings);
    ASSERT_EQ(pattern.GetPreBlankingPointCount(), 3);
    ASSERT_EQ(pattern.GetLeadInPointCount(), 4);
    pattern.AddLeadInPoints(points, {1, 1}, 0);
    for (int i = 0; i < 3; ++i) EXPECT_EQ(points[i].dwell, 3333) << i; // trunc(10000 / 3)
}

TEST_F(PatternBaseTest, PreBlankingShorterThanResolutionEmitsNoLeadInButStillCountsInTime) {
    PatternRenderingSettings settings;
    settings.preBlankingTime = 1e-8;
    pattern.SetRenderingSettings(settings);
    EXPECT_EQ(pattern.GetPreBlankingPointCount(), 0);
    EXPECT_EQ(pattern.GetLeadInPointCount(), 0); // no asymmetry point without pre-blanking
    EXPECT_DOUBLE_EQ(pattern.GetPreBlankingTotalTime(), 1e-8 + 5e-8);
}

TEST_F(PatternBaseTest, GatePulseIdleTicksRoundUpAndAreAtLeastOne) {
    EXPECT_EQ(pattern.GetGatePulseIdleTicks(), 48); // 1.2e-6 / 2.5e-8
    PatternRenderingSettings settings;
    settings.gatePulseIdleTime = 0.0;
    pattern.SetRenderingSettings(settings);
    EXPECT_EQ(pattern.GetGatePulseIdleTicks(), 1);
}

TEST_F(PatternBaseTest, AddPointsAccumulatesFractionalStepsByRepeatedAddition) {
    const PointRunEnd end = pattern.AddPoints(points, {100, 10}, {0.5, 2.0}, 4, 9, PointFlag_Acquire, 3);
    EXPECT_EQ(points[3], MakePoint(100, 10, 9, 1));
    EXPECT_EQ(points[4], MakePoint(100, 12, 9, 1)); // 100.5 truncates to 100
    EXPECT_EQ(points[5], MakePoint(101, 14, 9, 1));
    EXPECT_EQ(points[6], MakePoint(101, 16, 9, 1));
    EXPECT_EQ(end.endPosition, (DacPosition{102, 18})); // one step beyond the last point
    EXPECT_EQ(end.nextIndex, 7);
}

TEST_F(PatternBaseTest, AddPointsWithCountZeroTouchesNothing) {
    std::vector<PatternPoint> none;
    const PointRunEnd end = pattern.AddPoints(none, {5, 6}, {1.0, 1.0}, 0, 1, 1, 4);
    EXPECT_EQ(end.endPosition, (DacPosition{5, 6}));
    EXPECT_EQ(end.nextIndex, 4);
}

TEST_F(PatternBaseTest, AddPointsRefusesNegativeCountIndexOrRunPastTheEnd) {
    for (auto [count, index] : {std::pair{-1, 0}, std::pair{1, -1}, std::pair{17, 0}, std::pair{2, 15}}) {
        try {
            pattern.AddPoints(points, {0, 0}, {}, count, 1, 1, index);
            ADD_FAILURE() << count << "," << index;
        } catch (const Norvane::HResultException& e) {
            EXPECT_EQ(e.Error(), E_INVALIDARG);
            EXPECT_EQ(e.Description(), u"Invalid arguments.");
        }
    }
}

TEST_F(PatternBaseTest, PositionsPastTheFieldClampToItsEdgeInsteadOfWrapping) {
    pattern.AddPoints(points, {65530, 5}, {4.0, -4.0}, 3, 1, 1, 0);
    EXPECT_EQ(points[1], MakePoint(65534, 1, 1, 1));
    EXPECT_EQ(points[2], MakePoint(65535, 0, 1, 1)); // 65538 and -3 would wrap to 2 and 65533
}

TEST_F(PatternBaseTest, NearIdentityMatrixLeavesPointsExactlyAsGenerated) {
    points[0] = MakePoint(16392, 20000, 5, 1);
    pattern.SetTransformationMatrix({1.0 + 5e-10, 5e-10, 5e-10, -5e-10, 1.0 - 5e-10, 5e-10});
    EXPECT_FALSE(pattern.HasTransformation());
    pattern.TransformPoints({}, std::span(points).first(1));
    EXPECT_EQ(points[0], MakePoint(16392, 20000, 5, 1));
}

TEST_F(PatternBaseTest, TranslationByAFractionOfAStepRequantizesByTruncation) {
    // -0.25 DAC step: 16392 -> 16391.75 -> 16391; dwell and flags stay.
    points[0] = MakePoint(16392, 16400, 5, 3);
    pattern.SetTransformationMatrix({1, 0, -0.25 / 32768, 0, 1, 0});
    pattern.TransformPoints({}, std::span(points).first(1));
    EXPECT_EQ(points[0], MakePoint(16391, 16400, 5, 3));
}

TEST_F(PatternBaseTest, TranslationPastEitherEdgeClamps) {
    // A whole field to the right: 49152 -> 81920 clamps to 65535; a whole field up: 16384 -> -16384 clamps to 0.
    points[0] = MakePoint(49152, 16384, 1, 1);
    pattern.SetTransformationMatrix({1, 0, 1.0, 0, 1, -1.0});
    pattern.TransformPoints({}, std::span(points).first(1));
    EXPECT_EQ(points[0], MakePoint(65535, 0, 1, 1));
}

TEST_F(PatternBaseTest, RotationAboutACenter) {
    // 90 degrees about (0.5, 0.5): relative (1, 0.5) -> (0.5, 1); DAC (49152, 32768) -> (32768, 49152).
    points[0] = MakePoint(49152, 32768, 1, 1);
    pattern.SetTransformationMatrix({0, -1, 0, 1, 0, 0});
    pattern.TransformPoints({0.5, 0.5}, std::span(points).first(1));
    EXPECT_EQ(points[0], MakePoint(32768, 49152, 1, 1));
}

TEST_F(PatternBaseTest, OffsetPointsTransformAtTheirAbsolutePositionAndKeepTheirOffset) {
    // Stored 100 + offset 16384 = absolute 16484; one whole step right -> 16485; stored back minus offset -> 101.
    points[0] = MakePoint(100, 16384, 1, 1);
    pattern.SetTransformationMatrix({1, 0, 1.0 / 32768, 0, 1, 0});
    pattern.TransformPoints({}, std::span(points).first(1), {16384, 0});
    EXPECT_EQ(points[0], MakePoint(101, 16384, 1, 1));
}

TEST_F(PatternBaseTest, RelativeAndDacConversionsTruncateTowardZero) {
    EXPECT_EQ(pattern.RelativeToDac(0.0, 1.0), (DacPosition{16384, 49152}));
    EXPECT_EQ(pattern.RelativeToDac(0.5, 0.00001), (DacPosition{32768, 16384})); // 16384.33 -> 16384
    EXPECT_EQ(pattern.RelativeToDacSpanX(0.1), 3276);                           // 3276.8
    EXPECT_DOUBLE_EQ(pattern.QuantizeRelativeX(0.1), 3276.0 / 32768.0);
    EXPECT_DOUBLE_EQ(pattern.DacToRelative(32768, 16384).x, 0.5);
}

TEST_F(PatternBaseTest, BoundingBoxOfNoPointsIsTheStartValue) {
    EXPECT_EQ(CPattern::GetPointsBoundingBox({}), (RectangleFloat{65535.0, 65535.0, 0.0, 0.0}));
    const std::vector<coordinate<double>> some{{0.2, 0.9}, {0.7, 0.1}};
    EXPECT_EQ(CPattern::GetPointsBoundingBox(some), (RectangleFloat{0.2, 0.1, 0.7, 0.9}));
}

TEST_F(PatternBaseTest, DwellTicksSaturateInsteadOfWrapping) {
    EXPECT_EQ(ToDwellTicks(65536.0), 65535);
    EXPECT_EQ(ToDwellTicks(-3.0), 0);
    EXPECT_EQ(ToDwellTicks(std::nan("")), 0);
    EXPECT_EQ(ToDwellTicks(40.9), 40);
}

} // namespace
