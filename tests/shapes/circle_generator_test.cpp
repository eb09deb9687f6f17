#include "shapes/circle_generator.h"

#include <gtest/gtest.h>

#include <cmath>

namespace Norvane::Lumis::Scanning {
namespace {

constexpr double kTwoPi = 6.283185307179586;

TEST(CircleGeneratorTest, StepExistsUpToTheDiameter) {
    // Pitch 1 on radius 0.5 is a half-turn chord: θ = π, n = floor(2 + 1.5) = 3, step 2π / 2.
    const auto halfTurn = RingAngularStep(1.0, 0.5);
    ASSERT_TRUE(halfTurn.has_value());
    EXPECT_DOUBLE_EQ(*halfTurn, kTwoPi / 2.0);
    EXPECT_FALSE(RingAngularStep(1.0001, 0.5).has_value());
    EXPECT_FALSE(RingAngularStep(0.001, 0.0).has_value());
    // Pitch 0.1 on radius 0.25: 2π / (2 asin(0.2)) = 15.60…, rounded to 16 angles.
    EXPECT_DOUBLE_EQ(*RingAngularStep(0.1, 0.25), kTwoPi / 16.0);
}

TEST(CircleGeneratorTest, RingCountCoversTheAnnulusAndIsAtLeastOne) {
    CircleGeometry geometry;
    EXPECT_EQ(CircleRingCount(geometry), 51.0); // floor((0.5 + 0.00001) / 0.01) + 1
    geometry.innerRadius = 0.5;
    EXPECT_EQ(CircleRingCount(geometry), 1.0);
    geometry.innerRadius = 0.9; // inner beyond outer
    EXPECT_EQ(CircleRingCount(geometry), 1.0);
}

TEST(CircleGeneratorTest, BlankingGroupNeverExceedsTheMaximumPerPoint) {
    struct Case {
        double total;
        double expected;
    };
    // Resolution 1, maximum 10 per point.
    const Case cases[] = {
        {0.5, 0.0},                   // below one tick: no group
        {10.0, 1.0},     {20.0, 2.0}, // one halving: 10 each
        {30.0, 3.0},                  // two halvings: 10 each
        {35.0, 4.0},                  // two halvings would leave 11.67 each: ceil(35 / 10) points
        {1000.0, 100.0},
    };
    for (const Case& c : cases) {
        const double count = BlankingGroupPointCount(c.total, 1.0, 10.0);
        EXPECT_EQ(count, c.expected) << c.total;
        if (count > 0.0) {
            EXPECT_LE(c.total / count, 10.0) << c.total;
        }
    }
}

TEST(CircleGeneratorTest, ModeFollowsFillStyleKindMultiPassAndScanType) {
    CircleGeometry geometry;
    EXPECT_EQ(ChooseCircleMode(geometry), CircleMode::InnerToOuter);
    geometry.circular.scanType = CircleScanType_OuterToInner;
    EXPECT_EQ(ChooseCircleMode(geometry), CircleMode::OuterToInner);
    geometry.multiPass = MultiPass_OneOrientation;
    EXPECT_EQ(ChooseCircleMode(geometry), CircleMode::BothPasses);
    geometry.fillStyle = FillStyle_Frame;
    EXPECT_EQ(ChooseCircleMode(geometry), CircleMode::Frame);
    geometry.circularKind = false;
    EXPECT_THROW(ChooseCircleMode(geometry), std::exception); // a frame has no rectangular mode
    geometry.fillStyle = FillStyle_Solid;
    EXPECT_EQ(ChooseCircleMode(geometry), CircleMode::Rectangular);
}

} // namespace
} // namespace Norvane::Lumis::Scanning
