#include "composition/polygon_containment.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <numbers>
#include <ostream>
#include <random>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

using Vertices = std::vector<coordinate<double>>;

// A U opening upwards: arms from x 0.2 to 0.4 and 0.6 to 0.8, the notch between them down to y 0.6,
// the base from y 0.6 to 0.8.
const Vertices kU{{0.2, 0.2}, {0.4, 0.2}, {0.4, 0.6}, {0.6, 0.6},
                  {0.6, 0.2}, {0.8, 0.2}, {0.8, 0.8}, {0.2, 0.8}};

// A diamond whose left and right corners lie on the horizontal line y = 0.5.
const Vertices kDiamond{{0.5, 0.1}, {0.9, 0.5}, {0.5, 0.9}, {0.1, 0.5}};

// An axis-aligned square with horizontal edges at y 0.25 and 0.75, given clockwise on screen.
const Vertices kSquare{{0.25, 0.25}, {0.75, 0.25}, {0.75, 0.75}, {0.25, 0.75}};

Vertices Reversed(Vertices vertices) {
    std::reverse(vertices.begin(), vertices.end());
    return vertices;
}

struct ContainmentCase {
    std::string name;
    Vertices polygon;
    coordinate<double> point;
    bool inside;
};

void PrintTo(const ContainmentCase& c, std::ostream* os) {
    *os << c.name;
}

class PolygonContainmentCases : public ::testing::TestWithParam<ContainmentCase> {};

TEST_P(PolygonContainmentCases, DecidesInsideOrOutside) {
    const ContainmentCase& c = GetParam();
    EXPECT_EQ(PolygonContains(c.polygon, c.point), c.inside);
    EXPECT_EQ(PolygonContains(Reversed(c.polygon), c.point), c.inside) << "the other orientation";
}

INSTANTIATE_TEST_SUITE_P(
    Polygons, PolygonContainmentCases,
    ::testing::Values(
        ContainmentCase{"EmptyPolygonContainsNothing", {}, {0.5, 0.5}, false},
        ContainmentCase{"SingleVertexContainsNothing", {{0.5, 0.5}}, {0.5, 0.5}, false},
        ContainmentCase{"TwoVerticesEncloseNoArea", {{0.1, 0.1}, {0.9, 0.9}}, {0.6, 0.5}, false},
        ContainmentCase{"ULeftArm", kU, {0.3, 0.3}, true}, ContainmentCase{"URightArm", kU, {0.7, 0.3}, true},
        ContainmentCase{"UBase", kU, {0.5, 0.7}, true},
        ContainmentCase{"UNotchIsOutside", kU, {0.5, 0.3}, false},
        ContainmentCase{"UNotchJustAboveBaseIsOutside", kU, {0.5, 0.59}, false},
        ContainmentCase{"LeftOfU", kU, {0.1, 0.3}, false}, ContainmentCase{"BelowU", kU, {0.5, 0.9}, false},
        // The ray from these points runs through the diamond's corner vertices.
        ContainmentCase{"RayThroughRightCornerFromInside", kDiamond, {0.3, 0.5}, true},
        ContainmentCase{"RayThroughBothCornersFromOutside", kDiamond, {0.05, 0.5}, false},
        ContainmentCase{"RightOfDiamondOnCornerLine", kDiamond, {0.95, 0.5}, false},
        // In line with the square's horizontal edges: the edges along the ray count nothing, so only
        // the vertical edges decide.
        ContainmentCase{"LeftOfSquareInLineWithTopEdge", kSquare, {0.1, 0.25}, false},
        ContainmentCase{"LeftOfSquareInLineWithBottomEdge", kSquare, {0.1, 0.75}, false},
        ContainmentCase{"RightOfSquareInLineWithTopEdge", kSquare, {0.9, 0.25}, false},
        ContainmentCase{"InsideSquare", kSquare, {0.5, 0.5}, true},
        // The U's notch bottom is a horizontal edge on y 0.6 between the arms' inner edges.
        ContainmentCase{"LeftOfUInLineWithNotchBottom", kU, {0.1, 0.6}, false},
        ContainmentCase{"InLeftArmInLineWithNotchBottom", kU, {0.3, 0.6}, true}),
    [](const ::testing::TestParamInfo<ContainmentCase>& param) { return param.param.name; });

// A bow tie crossing itself at (0.5, 0.5): both lobes are enclosed once (with opposite signs).
TEST(PolygonContainment, SelfCrossingOutlineEnclosesBothLobes) {
    const Vertices bowTie{{0.1, 0.1}, {0.9, 0.9}, {0.9, 0.1}, {0.1, 0.9}};
    EXPECT_TRUE(PolygonContains(bowTie, {0.2, 0.5}));
    EXPECT_TRUE(PolygonContains(bowTie, {0.8, 0.5}));
    EXPECT_FALSE(PolygonContains(bowTie, {0.5, 0.2}));
    EXPECT_FALSE(PolygonContains(bowTie, {0.5, 0.8}));
}

// A square run around twice winds twice; the point is still inside.
TEST(PolygonContainment, OutlineRunTwiceStillEnclosesItsInside) {
    Vertices twice = kSquare;
    twice.insert(twice.end(), kSquare.begin(), kSquare.end());
    EXPECT_TRUE(PolygonContains(twice, {0.5, 0.5}));
    EXPECT_FALSE(PolygonContains(twice, {0.1, 0.5}));
}

// Reference: the winding number as the sum of the angles each edge subtends at the point, divided by a
// full turn. Slow and independent of any ray, so vertices and edges on the ray's line cannot mislead it.
int WindingByAngles(const Vertices& polygon, coordinate<double> p) {
    double total = 0.0;
    for (std::size_t i = 0; i < polygon.size(); ++i) {
        const auto& a = polygon[i];
        const auto& b = polygon[(i + 1) % polygon.size()];
        const double ax = a.x - p.x, ay = a.y - p.y, bx = b.x - p.x, by = b.y - p.y;
        total += std::atan2(ax * by - ay * bx, ax * bx + ay * by);
    }
    return static_cast<int>(std::lround(total / (2.0 * std::numbers::pi)));
}

double DistanceToSegment(coordinate<double> p, coordinate<double> a, coordinate<double> b) {
    const double dx = b.x - a.x, dy = b.y - a.y;
    const double lengthSquared = dx * dx + dy * dy;
    const double t = lengthSquared == 0.0
                         ? 0.0
                         : std::clamp(((p.x - a.x) * dx + (p.y - a.y) * dy) / lengthSquared, 0.0, 1.0);
    return std::hypot(p.x - (a.x + t * dx), p.y - (a.y + t * dy));
}

bool NearOutline(const Vertices& polygon, coordinate<double> p) {
    for (std::size_t i = 0; i < polygon.size(); ++i)
        if (DistanceToSegment(p, polygon[i], polygon[(i + 1) % polygon.size()]) < 1e-9)
            return true;
    return false;
}

// Vertices on a coarse grid of eighths, so that horizontal edges, collinear vertices and vertices on the
// test point's line are common; polygons may be concave and cross themselves.
Vertices RandomGridPolygon(std::mt19937& random) {
    std::uniform_int_distribution<int> count(3, 10);
    std::uniform_int_distribution<int> step(0, 8);
    Vertices polygon(static_cast<std::size_t>(count(random)));
    for (auto& vertex : polygon)
        vertex = {step(random) / 8.0, step(random) / 8.0};
    return polygon;
}

// Half of the points lie on a grid line (the line of some vertices and horizontal edges), the others
// anywhere.
coordinate<double> RandomPoint(std::mt19937& random) {
    std::uniform_real_distribution<double> anywhere(-0.1, 1.1);
    std::uniform_int_distribution<int> step(0, 8);
    std::bernoulli_distribution onGridLine(0.5);
    const double x = anywhere(random);
    return {x, onGridLine(random) ? step(random) / 8.0 : anywhere(random)};
}

TEST(PolygonContainment, AgreesWithAngleSumWindingAwayFromTheOutline) {
    std::mt19937 random(20240517);
    int compared = 0;
    for (int polygonIndex = 0; polygonIndex < 400; ++polygonIndex) {
        const Vertices polygon = RandomGridPolygon(random);
        for (int pointIndex = 0; pointIndex < 100; ++pointIndex) {
            const coordinate<double> p = RandomPoint(random);
            if (NearOutline(polygon, p))
                continue;
            ++compared;
            ASSERT_EQ(PolygonContains(polygon, p), WindingByAngles(polygon, p) != 0)
                << "polygon " << polygonIndex << " point (" << p.x << ", " << p.y << ")";
        }
    }
    EXPECT_GT(compared, 30000);
}

} // namespace
} // namespace Norvane::Lumis::Scanning
