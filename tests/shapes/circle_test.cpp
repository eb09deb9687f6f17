#include "shapes/circle_classes.h"
#include "shapes/pattern_circle.h"
#include "shapes/pattern_rectangle.h"

#include "core/point_buffer_view.h"
#include "core/scan_strategy_conversions.h"
#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <limits>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

// Defaults throughout unless a test says otherwise: alignment 16384..49152 (span 32768), resolution
// 2.5e-8 s, one pre-blanking point (40 ticks, 0x02), one asymmetry point (2 ticks, 0x00), one post-blanking
// point (40 ticks, 0x02); so the mode's points lie at [2, size − 1). Centre (0.5, 0.5) is DAC 32768.
constexpr std::size_t kLeadIn = 2;

std::u16string ErrorDescription() {
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK)
        return {};
    CComBSTR description;
    info->GetDescription(&description);
    return std::u16string(description.View());
}

std::vector<PatternPoint> PointsOf(IScanDefinition* definition) {
    CComPtr<ISubPatternCollection> collection;
    CComPtr<ISubPattern> subPattern;
    CComPtr<IPatternPointList> list;
    CheckResult(definition->get_SubPatternCollection(&collection));
    CheckResult(collection->Item(0, &subPattern));
    CheckResult(subPattern->get_PointList(&list));
    const auto points = PointBufferView(list).Points();
    return {points.begin(), points.end()};
}

std::vector<PatternPoint> RenderedPoints(IPattern* pattern) {
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(pattern->Render(&definition), S_OK);
    return definition ? PointsOf(definition) : std::vector<PatternPoint>{};
}

// The points between the lead-in and the post-blanking point.
std::vector<PatternPoint> ModePoints(IPattern* pattern) {
    const auto points = RenderedPoints(pattern);
    if (points.size() < kLeadIn + 1)
        return {};
    return {points.begin() + kLeadIn, points.end() - 1};
}

double DacDistance(const PatternPoint& p, double cx, double cy) {
    return std::hypot(p.x - cx, p.y - cy);
}

CComPtr<IScanStrategy> RectangularStrategyObject(double pitch) {
    RectangularStrategy strategy;
    strategy.pitchX = pitch;
    strategy.pitchY = pitch;
    strategy.scanType = ScanType_Serpentine;
    return QueryAs<IScanStrategy>(MakeScanStrategyRectangular(strategy).Get());
}

CComPtr<IScanStrategy> CircularStrategyObject(const CircularStrategy& strategy) {
    return QueryAs<IScanStrategy>(MakeScanStrategyCircular(strategy).Get());
}

class CircleTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComponents();
        RegisterClasses(CircleClassEntries());
        circle_ = CreateInstance<IPatternCircle>(CLSID_PatternCircle);
        SetErrorInfo(0, nullptr);
    }

    CComPtr<IScanStrategy> Strategy() {
        CComPtr<IScanStrategy> strategy;
        EXPECT_EQ(circle_->get_ScanStrategy(&strategy), S_OK);
        return strategy;
    }

    double EffectiveLoopTime() {
        double time = 0.0;
        EXPECT_EQ(circle_->GetEffectiveLoopTime(&time), S_OK);
        return time;
    }

    CComPtr<IPatternCircle> circle_;
};

TEST_F(CircleTest, CreatedByProgIdWithTheDefaultProperties) {
    CLSID clsid{};
    ASSERT_EQ(CLSIDFromProgID(u"Beamweaver.PatternCircle", &clsid), S_OK);
    EXPECT_EQ(clsid, CLSID_PatternCircle);
    CComPtr<ICoordinateFloat> center;
    ASSERT_EQ(circle_->get_Center(&center), S_OK);
    EXPECT_EQ(ReadCoordinate(center), (coordinate<double>{0.5, 0.5}));
    double inner = -1.0, outer = -1.0, blanking = -1.0;
    circle_->get_InnerRadius(&inner);
    circle_->get_OuterRadius(&outer);
    circle_->get_InnerCircleBlankingTime(&blanking);
    EXPECT_EQ(inner, 0.0);
    EXPECT_EQ(outer, 0.5);
    EXPECT_EQ(blanking, 1e-6);
    auto circular = QueryAs<IScanStrategyCircular>(Strategy().Get());
    ASSERT_TRUE(circular);
    EXPECT_EQ(ReadScanStrategyCircular(circular), CircularStrategy{});
    EXPECT_TRUE(QueryAs<IExclusionAwarePattern>(circle_.Get()));
    EXPECT_TRUE(QueryAs<ICloneablePattern>(circle_.Get()));
}

TEST_F(CircleTest, DefaultRendersFiftyOneRingsFromTheCentreOutToHalfTheField) {
    const auto points = ModePoints(circle_);
    ASSERT_FALSE(points.empty());
    // Ring 0 has radius 0.5 − 50 × 0.01 ≈ 0: the centre point with the inner dwell (1e-6 / 2.5e-8 = 40).
    EXPECT_EQ(points.front(), MakePoint(32768, 32768, 40, PointFlag_Acquire));
    // The last ring lies on radius 0.5 = 16384 DAC steps; it closes on its own first point.
    const auto lastRingSize =
        static_cast<std::size_t>(1 + std::trunc(6.283185307179586 / *RingAngularStep(0.001, 0.5)));
    ASSERT_GT(points.size(), lastRingSize);
    for (std::size_t i = points.size() - lastRingSize; i < points.size(); ++i)
        EXPECT_NEAR(DacDistance(points[i], 32768, 32768), 16384.0, 1.5) << i;
    EXPECT_EQ(points[points.size() - lastRingSize].x, points.back().x);
    EXPECT_EQ(points[points.size() - lastRingSize].y, points.back().y);
    for (const PatternPoint& p : points)
        EXPECT_LE(DacDistance(p, 32768, 32768), 16385.5);
    // 51 rings: the centre point and fifty rings, the n-th of radius n × 0.01.
    double expected = 1.0;
    for (int n = 1; n <= 50; ++n)
        expected += 1 + std::trunc(6.283185307179586 / *RingAngularStep(0.001, 0.5 - (50 - n) * 0.01));
    EXPECT_EQ(static_cast<double>(points.size()), expected);
}

TEST_F(CircleTest, SingleRingCarriesTheAnchorDwellWhileTheLoopTimeUsesTheOther) {
    ASSERT_EQ(circle_->put_InnerRadius(0.3), S_OK);
    ASSERT_EQ(circle_->put_OuterRadius(0.3), S_OK);
    ASSERT_EQ(circle_->put_InnerDwellTime(1e-6), S_OK); // 40 ticks
    ASSERT_EQ(circle_->put_OuterDwellTime(2e-6), S_OK); // 80 ticks
    CircularStrategy strategy;
    strategy.pitchT = 0.1;
    ASSERT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(strategy)), S_OK);
    // Pitch 0.1 on radius 0.3: 2π / (2 asin(1/6)) = 18.79…, so 19 angles and 20 points.
    const auto outward = ModePoints(circle_);
    ASSERT_EQ(outward.size(), 20u);
    for (const PatternPoint& p : outward)
        EXPECT_EQ(p.dwell, 40);
    EXPECT_NEAR(EffectiveLoopTime(), 20 * 2e-6, 1e-15);

    strategy.scanType = CircleScanType_OuterToInner;
    ASSERT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(strategy)), S_OK);
    const auto inward = ModePoints(circle_);
    ASSERT_EQ(inward.size(), 20u);
    for (const PatternPoint& p : inward)
        EXPECT_EQ(p.dwell, 80);
    EXPECT_NEAR(EffectiveLoopTime(), 20 * 1e-6, 1e-15);
}

TEST_F(CircleTest, RectangularModeWithoutHoleStartsWithTheSingleTopPoint) {
    ASSERT_EQ(circle_->put_ScanStrategy(RectangularStrategyObject(0.1)), S_OK);
    const auto points = RenderedPoints(circle_);
    ASSERT_GT(points.size(), kLeadIn + 1);
    EXPECT_EQ(points[0], MakePoint(32768, 16384, 40, PointFlag_Blank)); // (0.5, 0.5 − 0.5)
    EXPECT_EQ(points[kLeadIn], MakePoint(32768, 16384, 40, PointFlag_Acquire));
    EXPECT_TRUE(std::none_of(points.begin() + kLeadIn, points.end() - 1,
                             [](const PatternPoint& p) { return p.flags != PointFlag_Acquire; }));
    // The centre line (k = 5) runs over the whole diameter: 11 points, 3277 DAC steps apart (0.1 × 32768).
    const auto onCentreLine = std::count_if(points.begin() + kLeadIn, points.end() - 1,
                                            [](const PatternPoint& p) { return p.y == 32768; });
    EXPECT_EQ(onCentreLine, 11);
}

TEST_F(CircleTest, LinesCrossingTheHoleJumpItBlankedUnlessTheBlankingTimeIsZero) {
    // Radius 0.25 hole, pitch 0.1: lines at y = −0.2 … 0.2 (five) cross it, each with two groups of one
    // blanked point (1e-6 s is far below the maximum dwell per point).
    ASSERT_EQ(circle_->put_InnerRadius(0.25), S_OK);
    ASSERT_EQ(circle_->put_ScanStrategy(RectangularStrategyObject(0.1)), S_OK);
    const auto blanked = [](const std::vector<PatternPoint>& points) {
        return std::count_if(points.begin(), points.end(),
                             [](const PatternPoint& p) { return p.flags == PointFlag_Blank; });
    };
    const auto withGroups = ModePoints(circle_);
    EXPECT_EQ(blanked(withGroups), 10);
    for (const PatternPoint& p : withGroups) {
        if (p.flags == PointFlag_Acquire) {
            EXPECT_GE(DacDistance(p, 32768, 32768), 0.25 * 32768 - 1.0);
        }
    }
    ASSERT_EQ(circle_->put_InnerCircleBlankingTime(0.0), S_OK);
    const auto withoutGroups = ModePoints(circle_);
    EXPECT_EQ(blanked(withoutGroups), 0);
    EXPECT_EQ(withoutGroups.size() + 10, withGroups.size());
}

TEST_F(CircleTest, LongBlankingTimeIsSplitSoNoPointExceedsTheMaximumDwell) {
    // Maximum per point M = 4095 × 2.5e-8 s. T = 3.5 M: two halvings leave T / 3 > M, so ceil(3.5) = 4
    // points of trunc(3.5 × 4095 / 4) = 3583 ticks in each of the ten groups of the five hole lines.
    ASSERT_EQ(circle_->put_InnerRadius(0.25), S_OK);
    ASSERT_EQ(circle_->put_ScanStrategy(RectangularStrategyObject(0.1)), S_OK);
    ASSERT_EQ(circle_->put_InnerCircleBlankingTime(3.5 * 4095 * 2.5e-8), S_OK);
    const auto points = ModePoints(circle_);
    std::vector<PatternPoint> blanked;
    std::copy_if(points.begin(), points.end(), std::back_inserter(blanked),
                 [](const PatternPoint& p) { return p.flags == PointFlag_Blank; });
    ASSERT_EQ(blanked.size(), 40u);
    for (const PatternPoint& p : blanked)
        EXPECT_EQ(p.dwell, 3583);
}

TEST_F(CircleTest, OneOrientationScansOutwardThenInwardAndCountsBothPasses) {
    ASSERT_EQ(circle_->put_InnerRadius(0.2), S_OK);
    ASSERT_EQ(circle_->put_OuterRadius(0.3), S_OK);
    CircularStrategy strategy;
    strategy.pitchT = 0.05;
    strategy.pitchR = 0.05; // rings at 0.2, 0.25, 0.3
    const auto pointsFor = [&](const CircularStrategy& value) {
        EXPECT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(value)), S_OK);
        return ModePoints(circle_);
    };
    const auto outward = pointsFor(strategy);
    strategy.scanType = CircleScanType_OuterToInner;
    const auto inward = pointsFor(strategy);
    strategy.multiPass = MultiPass_OneOrientation;
    const auto both = pointsFor(strategy);
    ASSERT_EQ(both.size(), outward.size() + inward.size());
    EXPECT_TRUE(std::equal(outward.begin(), outward.end(), both.begin()));
    EXPECT_TRUE(
        std::equal(inward.begin(), inward.end(), both.begin() + static_cast<std::ptrdiff_t>(outward.size())));
    EXPECT_NEAR(DacDistance(outward.back(), 32768, 32768), 0.3 * 32768, 1.5);
    EXPECT_NEAR(DacDistance(inward.back(), 32768, 32768), 0.2 * 32768, 1.5);
}

TEST_F(CircleTest, RefusedStrategyStillSwitchesTheKindButKeepsTheValues) {
    ASSERT_EQ(circle_->put_ScanStrategy(RectangularStrategyObject(0.2)), S_OK);
    CircularStrategy wide;
    wide.pitchT = 1.0;
    EXPECT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(wide)), E_INVALIDARG);
    auto circular = QueryAs<IScanStrategyCircular>(Strategy().Get());
    ASSERT_TRUE(circular);
    EXPECT_EQ(ReadScanStrategyCircular(circular), CircularStrategy{});

    RectangularStrategy raster; // ScanType 0 is refused
    EXPECT_EQ(circle_->put_ScanStrategy(QueryAs<IScanStrategy>(MakeScanStrategyRectangular(raster).Get())),
              E_NOTIMPL);
    auto rectangular = QueryAs<IScanStrategyRectangular>(Strategy().Get());
    ASSERT_TRUE(rectangular);
    EXPECT_EQ(ReadScanStrategyRectangular(rectangular).pitchX, 0.2);
}

TEST_F(CircleTest, FrameLeftUnderTheRectangularKindValidatesButHasNoModeToRender) {
    CircularStrategy frame;
    frame.fillStyle = FillStyle_Frame;
    ASSERT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(frame)), S_OK);
    RectangularStrategy raster; // refused (ScanType 0), yet the kind becomes rectangular
    ASSERT_EQ(circle_->put_ScanStrategy(QueryAs<IScanStrategy>(MakeScanStrategyRectangular(raster).Get())),
              E_NOTIMPL);
    CComPtr<IPatternValidationResult> result;
    ASSERT_EQ(circle_->Validate(&result), S_OK);
    VARIANT_BOOL valid = VARIANT_FALSE;
    result->get_Valid(&valid);
    EXPECT_EQ(valid, VARIANT_TRUE);
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(circle_->Render(&definition), E_UNEXPECTED);
}

TEST_F(CircleTest, RefusedInputsLeaveTheStoredValues) {
    SetErrorInfo(0, nullptr);
    EXPECT_EQ(circle_->put_ScanStrategy(nullptr), E_INVALIDARG);
    EXPECT_EQ(ErrorDescription(), u"ScanStrategy object is null");
    EXPECT_TRUE(QueryAs<IScanStrategyCircular>(Strategy().Get()));
    EXPECT_EQ(circle_->Accept(nullptr), E_POINTER);
    EXPECT_EQ(circle_->put_Center(nullptr), E_POINTER);
    EXPECT_EQ(ErrorDescription(), u"null ICoordinateFloat");
    EXPECT_EQ(circle_->put_Center(CreateCoordinate({1.5, 0.5})), E_INVALIDARG);
    EXPECT_EQ(ErrorDescription(), u"Origin values not correct");
    for (double bad :
         {0.0, -1e-6, std::numeric_limits<double>::quiet_NaN(), std::numeric_limits<double>::infinity()}) {
        EXPECT_EQ(circle_->put_InnerDwellTime(bad), E_INVALIDARG) << bad;
        EXPECT_EQ(circle_->put_OuterDwellTime(bad), E_INVALIDARG) << bad;
    }
    EXPECT_EQ(circle_->put_OuterRadius(1.01), E_INVALIDARG);
    EXPECT_EQ(circle_->put_InnerRadius(-0.01), E_INVALIDARG);
    EXPECT_EQ(circle_->put_InnerCircleBlankingTime(-1e-9), E_INVALIDARG);
    double inner = 0.0, outer = 0.0, radius = 0.0;
    circle_->get_InnerDwellTime(&inner);
    circle_->get_OuterDwellTime(&outer);
    circle_->get_OuterRadius(&radius);
    EXPECT_EQ(inner, 1e-6);
    EXPECT_EQ(outer, 1e-6);
    EXPECT_EQ(radius, 0.5);
}

TEST_F(CircleTest, RingCountBeyondThirtyTwoBitsFailsValidation) {
    CircularStrategy fine;
    fine.pitchR = 1e-12; // 5e11 rings
    ASSERT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(fine)), S_OK);
    CComPtr<IPatternValidationResult> result;
    ASSERT_EQ(circle_->Validate(&result), S_OK);
    VARIANT_BOOL valid = VARIANT_TRUE;
    result->get_Valid(&valid);
    EXPECT_EQ(valid, VARIANT_FALSE);
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(circle_->Render(&definition), E_INVALIDARG);
}

TEST_F(CircleTest, CircularScanFormWritesTheRingOnceWithWholeAngles) {
    struct Case {
        std::int32_t requested;
        std::size_t written;
    };
    // 100 and 4 requested points round the ring to 99 and 3 whole angles; 36 stays.
    for (const Case c : {Case{36, 36}, Case{100, 99}, Case{4, 3}}) {
        auto ring = CreateCircularScanPattern({0.5, 0.5}, 0.25, c.requested, 1e-6);
        const auto points = ModePoints(ring);
        EXPECT_EQ(points.size(), c.written) << c.requested;
        for (const PatternPoint& p : points)
            EXPECT_NEAR(DacDistance(p, 32768, 32768), 8192.0, 1.5);
    }
    auto tooFew = CreateCircularScanPattern({0.5, 0.5}, 0.25, 3, 1e-6);
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(tooFew->Render(&definition), E_INVALIDARG);
}

TEST_F(CircleTest, FrameWithOneOrientationCountsItsSingleRingOnce) {
    CircularStrategy frame;
    frame.pitchT = 0.1;
    frame.fillStyle = FillStyle_Frame;
    frame.multiPass = MultiPass_OneOrientation;
    ASSERT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(frame)), S_OK);
    // 2π / (2 asin(0.1)) = 31.35…: 31 angles on radius 0.5, 31 points of 1e-6 s.
    EXPECT_EQ(ModePoints(circle_).size(), 31u);
    double twoPassLoop = 0.0, onePassLoop = 0.0;
    ASSERT_EQ(circle_->GetLoopTime(&twoPassLoop), S_OK);
    frame.multiPass = MultiPass_None;
    ASSERT_EQ(circle_->put_ScanStrategy(CircularStrategyObject(frame)), S_OK);
    ASSERT_EQ(circle_->GetLoopTime(&onePassLoop), S_OK);
    EXPECT_EQ(twoPassLoop, onePassLoop);
    EXPECT_NEAR(EffectiveLoopTime(), 31 * 1e-6, 1e-15);
}

TEST_F(CircleTest, ExclusionCircleRendersBlankedAndCutsItsDiscOutOfARectangle) {
    auto excludable = QueryAs<IExcludablePatternShape>(circle_.Get());
    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_TRUE), S_OK);
    const auto own = ModePoints(circle_);
    EXPECT_TRUE(std::all_of(own.begin(), own.end(),
                            [](const PatternPoint& p) { return p.flags == PointFlag_Blank; }));

    ASSERT_EQ(circle_->put_OuterRadius(0.3), S_OK);
    CComPtr<IExclusionZone> zone = CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    ASSERT_EQ(QueryAs<IExclusionAwarePattern>(circle_.Get())->SetExclusionZone(zone), S_OK);
    CComPtr<IShape> shape;
    ASSERT_EQ(excludable->get_Shape(&shape), S_OK);
    VARIANT_BOOL contained = VARIANT_FALSE;
    ASSERT_EQ(zone->ContainsShape(shape, &contained), S_OK);
    EXPECT_EQ(contained, VARIANT_TRUE);

    auto rectangle = CreateInstance<IPatternRectangle>(CLSID_PatternRectangle);
    ASSERT_EQ(QueryAs<IExclusionAwarePattern>(rectangle.Get())->SetExclusionZone(zone), S_OK);
    const auto points = RenderedPoints(rectangle);
    // The default 11 × 11 grid spans the field; the disc of radius 0.3 (9830 DAC) holds some of it.
    const auto exposing = std::count_if(points.begin(), points.end(),
                                        [](const PatternPoint& p) { return p.flags == PointFlag_Acquire; });
    EXPECT_GT(exposing, 0);
    EXPECT_LT(exposing, 121);
    for (const PatternPoint& p : points) {
        if (p.flags == PointFlag_Acquire) {
            EXPECT_GT(DacDistance(p, 32768, 32768), 0.3 * 32768 - 1.0) << p.x << "," << p.y;
        }
    }

    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_FALSE), S_OK);
    ASSERT_EQ(zone->ContainsShape(shape, &contained), S_OK);
    EXPECT_EQ(contained, VARIANT_FALSE);
}

TEST_F(CircleTest, CloneCopiesGeometryAndStrategyButNotTheExclusionMark) {
    ASSERT_EQ(circle_->put_Center(CreateCoordinate({0.4, 0.6})), S_OK);
    ASSERT_EQ(circle_->put_InnerRadius(0.1), S_OK);
    ASSERT_EQ(circle_->put_OuterDwellTime(3e-6), S_OK);
    ASSERT_EQ(circle_->put_InnerCircleBlankingTime(2e-6), S_OK);
    ASSERT_EQ(circle_->put_ScanStrategy(RectangularStrategyObject(0.05)), S_OK);
    ASSERT_EQ(QueryAs<IExcludablePatternShape>(circle_.Get())->put_IsExclusion(VARIANT_TRUE), S_OK);
    CComPtr<IPattern> clone;
    ASSERT_EQ(QueryAs<ICloneablePattern>(circle_.Get())->Clone(&clone), S_OK);
    auto copy = QueryAs<IPatternCircle>(clone.Get());
    ASSERT_TRUE(copy);
    CComPtr<ICoordinateFloat> center;
    copy->get_Center(&center);
    EXPECT_EQ(ReadCoordinate(center), (coordinate<double>{0.4, 0.6}));
    double inner = 0.0, outerDwell = 0.0, blanking = 0.0;
    copy->get_InnerRadius(&inner);
    copy->get_OuterDwellTime(&outerDwell);
    copy->get_InnerCircleBlankingTime(&blanking);
    EXPECT_EQ(inner, 0.1);
    EXPECT_EQ(outerDwell, 3e-6);
    EXPECT_EQ(blanking, 2e-6);
    CComPtr<IScanStrategy> strategy;
    copy->get_ScanStrategy(&strategy);
    auto rectangular = QueryAs<IScanStrategyRectangular>(strategy.Get());
    ASSERT_TRUE(rectangular);
    EXPECT_EQ(ReadScanStrategyRectangular(rectangular).pitchX, 0.05);
    VARIANT_BOOL exclusion = VARIANT_TRUE;
    QueryAs<IExcludablePatternShape>(copy.Get())->get_IsExclusion(&exclusion);
    EXPECT_EQ(exclusion, VARIANT_FALSE);
}

} // namespace
} // namespace Norvane::Lumis::Scanning
