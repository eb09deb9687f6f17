#include "shapes/pattern_polygon.h"
#include "shapes/polygon_classes.h"

#include "core/point_buffer_view.h"
#include "core/scan_strategy_conversions.h"
#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <beamweaver/shapes.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

// Defaults throughout unless a test says otherwise: alignment 16384..49152 (span 32768), resolution
// 2.5e-8 s, lead-in of one pre-blanking point (40 ticks, 0x02) and one asymmetry point (2 ticks, 0x00),
// one post-blanking point (40 ticks, 0x02). With pitch 0.125 a line step is 4096 DAC steps and relative
// x lies at DAC 16384 + 32768 * x.

std::optional<std::u16string> TakeErrorDescription(REFIID iid) {
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK)
        return std::nullopt;
    GUID guid{};
    CComBSTR description;
    info->GetGUID(&guid);
    info->GetDescription(&description);
    EXPECT_EQ(guid, iid);
    return std::u16string(description.View());
}

class RecordingVisitor : public CComObjectRootBase, public IPatternShapeVisitor {
  public:
    using Interfaces = InterfaceMap<IPatternShapeVisitor>;

    HRESULT VisitPatternPolygon(IPatternPolygon* pattern) override {
        visited = pattern;
        return S_FALSE;
    }
    HRESULT VisitPatternRectangle(IPatternRectangle*) override { return E_NOTIMPL; }
    HRESULT VisitPatternLine(IPatternLine*) override { return E_NOTIMPL; }
    HRESULT VisitPatternSpot(IPatternSpot*) override { return E_NOTIMPL; }
    HRESULT VisitPatternCircle(IPatternCircle*) override { return E_NOTIMPL; }
    HRESULT VisitPatternRegularCrossSection(IPatternRegularCrossSection*) override { return E_NOTIMPL; }
    HRESULT VisitPatternMultiPassCrossSection(IPatternMultiPassCrossSection*) override { return E_NOTIMPL; }
    HRESULT VisitPatternStreamFile(IPatternStreamFile*) override { return E_NOTIMPL; }
    HRESULT VisitPatternBitmapFile(IPatternBitmapFile*) override { return E_NOTIMPL; }
    HRESULT VisitBeamweaverCollection(IBeamweaverCollection*) override { return E_NOTIMPL; }

    CComPtr<IPatternPolygon> visited;
};

std::vector<PatternPoint> RenderedPoints(IPattern* pattern) {
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(pattern->Render(&definition), S_OK);
    if (!definition)
        return {};
    CComPtr<ISubPatternCollection> collection;
    CComPtr<ISubPattern> subPattern;
    CComPtr<IPatternPointList> list;
    CheckResult(definition->get_SubPatternCollection(&collection));
    CheckResult(collection->Item(0, &subPattern));
    CheckResult(subPattern->get_PointList(&list));
    const auto points = PointBufferView(list).Points();
    return {points.begin(), points.end()};
}

constexpr std::uint16_t Dac(double x) {
    return static_cast<std::uint16_t>(16384 + 32768 * x);
}

class PolygonTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComponents();
        RegisterClasses(PolygonClassEntries());
        polygon_ = NewPolygon();
        SetErrorInfo(0, nullptr);
    }

    static CComPtr<IPatternPolygon> NewPolygon() {
        return CreateInstance<IPatternPolygon>(CLSID_PatternPolygon);
    }

    static void AddPoints(IPatternPolygon* polygon, const std::vector<coordinate<double>>& vertices) {
        for (const coordinate<double>& vertex : vertices)
            CheckResult(polygon->AddPoint(CreateCoordinate(vertex)));
    }

    static void PutStrategy(IPatternPolygon* polygon, void (*change)(RectangularStrategy&)) {
        RectangularStrategy strategy;
        strategy.pitchX = 0.125;
        strategy.pitchY = 0.125;
        change(strategy);
        CheckResult(polygon->put_ScanStrategy(MakeScanStrategyRectangular(strategy)));
    }

    // The triangle with its apex on top and a horizontal bottom edge: 7 lines of 7, 6, 5, 4, 3, 2 and 1
    // points at pitch 0.125, N = 28.
    static void MakeTriangle(IPatternPolygon* polygon) {
        AddPoints(polygon, {{0.125, 0.125}, {0.875, 0.125}, {0.5, 0.875}});
        PutStrategy(polygon, [](RectangularStrategy&) {});
    }

    std::u16string ValidationDescription() {
        CComPtr<IPatternValidationResult> result;
        EXPECT_EQ(polygon_->Validate(&result), S_OK);
        CComBSTR description;
        result->get_Description(&description);
        return std::u16string(description.View());
    }

    double LoopTime(IPatternPolygon* polygon) {
        double time = 0.0;
        EXPECT_EQ(polygon->GetLoopTime(&time), S_OK);
        return time;
    }

    CComPtr<IPatternPolygon> polygon_;
};

TEST_F(PolygonTest, CreatedByProgIdEmptyAndNotValid) {
    CLSID clsid{};
    ASSERT_EQ(CLSIDFromProgID(u"Beamweaver.PatternPolygon", &clsid), S_OK);
    EXPECT_EQ(clsid, CLSID_PatternPolygon);
    double begin = 0.0, end = 0.0;
    polygon_->get_BeginDwellTime(&begin);
    polygon_->get_EndDwellTime(&end);
    EXPECT_EQ(begin, 1e-6);
    EXPECT_EQ(end, 1e-6);
    CComPtr<IScanStrategyRectangular> strategy;
    ASSERT_EQ(polygon_->get_ScanStrategy(&strategy), S_OK);
    EXPECT_EQ(ReadScanStrategyRectangular(strategy), RectangularStrategy{});
    VARIANT_BOOL exclusion = VARIANT_TRUE;
    ASSERT_EQ(QueryAs<IExcludablePatternShape>(polygon_.Get())->get_IsExclusion(&exclusion), S_OK);
    EXPECT_EQ(exclusion, VARIANT_FALSE);
    EXPECT_TRUE(QueryAs<IExclusionAwarePattern>(polygon_.Get()));
    EXPECT_EQ(ValidationDescription(), u"Polygon must contain at least 3 points. ");
}

TEST_F(PolygonTest, TwoVerticesFailValidationAndRender) {
    AddPoints(polygon_, {{0.1, 0.1}, {0.9, 0.9}});
    EXPECT_EQ(ValidationDescription(), u"Polygon must contain at least 3 points. ");
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(polygon_->Render(&definition), E_INVALIDARG);
    EXPECT_EQ(TakeErrorDescription(IID_IExclusionAwarePattern), u"Polygon must contain at least 3 points. ");
}

TEST_F(PolygonTest, RefusedVerticesCarryTheirMessageAndChangeNothing) {
    MakeTriangle(polygon_);
    const auto before = RenderedPoints(polygon_);
    const auto check = [&](HRESULT hr, const std::u16string& message) {
        EXPECT_EQ(hr, E_INVALIDARG);
        EXPECT_EQ(TakeErrorDescription(IID_IPatternPolygon), message);
    };
    check(polygon_->AddPoint(nullptr), u"Point object is null");
    check(polygon_->AddPoint(CreateCoordinate({1.5, 0.5})), u"Point values not correct");
    check(polygon_->ModifyPoint(0, nullptr), u"Point object is null");
    check(polygon_->ModifyPoint(0, CreateCoordinate({0.5, -0.1})), u"Point values not correct");
    check(polygon_->ModifyPoint(3, CreateCoordinate({0.5, 0.5})), u"Index out of range");
    check(polygon_->ModifyPoint(-1, CreateCoordinate({0.5, 0.5})), u"Index out of range");
    EXPECT_EQ(RenderedPoints(polygon_), before);

    // The apex moved down to y = 0.625 leaves 5 lines whose widths (0.625 - y) * 1.5 are 0.75, 0.5625,
    // 0.375 and 0.1875 below the apex: 7 + 5 + 4 + 2 points plus the apex, 19.
    ASSERT_EQ(polygon_->ModifyPoint(2, CreateCoordinate({0.5, 0.625})), S_OK);
    EXPECT_EQ(RenderedPoints(polygon_).size(), 2u + 19u + 1u);
}

TEST_F(PolygonTest, TriangleRendersBottomEdgeAcrossAndTheApexAsOnePoint) {
    MakeTriangle(polygon_);
    const auto points = RenderedPoints(polygon_);
    ASSERT_EQ(points.size(), 2u + 28u + 1u);
    EXPECT_EQ(points[0], MakePoint(Dac(0.125), Dac(0.125), 40, PointFlag_Blank));
    EXPECT_EQ(points[2], MakePoint(Dac(0.125), Dac(0.125), 40, PointFlag_Acquire));
    EXPECT_EQ(points[8], MakePoint(Dac(0.875), Dac(0.125), 40, PointFlag_Acquire));
    EXPECT_EQ(points[29], MakePoint(Dac(0.5), Dac(0.875), 40, PointFlag_Acquire));
    EXPECT_EQ(points[30], MakePoint(Dac(0.5), Dac(0.875), 40, PointFlag_Blank));

    CComPtr<IRectangleInt> box;
    ASSERT_EQ(polygon_->GetDacBoundingBox(&box), S_OK);
    EXPECT_EQ(ReadRectangleInt(box), (RectangleInt{Dac(0.125), Dac(0.125), Dac(0.875), Dac(0.875)}));
    double effective = 0.0;
    ASSERT_EQ(polygon_->GetEffectiveLoopTime(&effective), S_OK);
    EXPECT_NEAR(effective, 28 * 1e-6, 1e-15);
}

TEST_F(PolygonTest, ExclusionRendersEveryPatternPointBlank) {
    MakeTriangle(polygon_);
    ASSERT_EQ(QueryAs<IExcludablePatternShape>(polygon_.Get())->put_IsExclusion(VARIANT_TRUE), S_OK);
    const auto points = RenderedPoints(polygon_);
    ASSERT_EQ(points.size(), 31u);
    EXPECT_EQ(points[1].flags, 0);
    for (std::size_t i = 2; i < points.size(); ++i)
        EXPECT_EQ(points[i].flags, PointFlag_Blank) << "point " << i;
}

TEST_F(PolygonTest, StrategyRefusalsKeepTheStoredStrategy) {
    MakeTriangle(polygon_);
    EXPECT_EQ(polygon_->put_ScanStrategy(nullptr), E_INVALIDARG);
    EXPECT_EQ(TakeErrorDescription(IID_IPatternPolygon), u"ScanStrategy object is null");
    for (const double pitch : {0.0, 1.0, -0.1}) {
        RectangularStrategy refused;
        refused.pitchY = pitch;
        EXPECT_EQ(polygon_->put_ScanStrategy(MakeScanStrategyRectangular(refused)), E_INVALIDARG) << pitch;
    }
    CComPtr<IScanStrategyRectangular> strategy;
    ASSERT_EQ(polygon_->get_ScanStrategy(&strategy), S_OK);
    EXPECT_EQ(ReadScanStrategyRectangular(strategy).pitchY, 0.125);
}

TEST_F(PolygonTest, UnknownOrientationFailsRenderAndLoopTimeAsUnexpected) {
    MakeTriangle(polygon_);
    PutStrategy(polygon_, [](RectangularStrategy& s) { s.orientation = static_cast<ScanOrientation>(2); });
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(polygon_->Render(&definition), E_UNEXPECTED);
    double time = 0.0;
    EXPECT_EQ(polygon_->GetEffectiveLoopTime(&time), E_UNEXPECTED);
    EXPECT_EQ(polygon_->GetLoopTime(&time), E_UNEXPECTED);
}

TEST_F(PolygonTest, AllOrientationsIsFourPassesInLoopTime) {
    MakeTriangle(polygon_);
    const double onePass = LoopTime(polygon_);
    PutStrategy(polygon_, [](RectangularStrategy& s) { s.multiPass = MultiPass_AllOrientations; });
    EXPECT_DOUBLE_EQ(LoopTime(polygon_), 4 * onePass);
    // Vertical lines at x = 0.125 ... 0.875 cut the triangle in 1 (touching corner), 3, 5, 7 (through the
    // apex, which is ordinary there), 5, 3 and 1 points: 25. Two horizontal passes of 28, two vertical ones
    // of 25, each with its own three framing points.
    EXPECT_EQ(RenderedPoints(polygon_).size(), 2u * 28u + 2u * 25u + 4u * 3u);
}

TEST_F(PolygonTest, ExclusionPolygonJoinsItsZoneAndCutsItsAreaOutOfARectangle) {
    // The exclusion covers x <= 0.5 (DAC 32768). Of the default rectangle grid's columns 16392 + c * 3276,
    // c = 5 (32772) and beyond lie outside it: 6 columns x 11 rows = 66 exposing points remain.
    AddPoints(polygon_, {{0.0, 0.0}, {0.5, 0.0}, {0.5, 1.0}, {0.0, 1.0}});
    auto excludable = QueryAs<IExcludablePatternShape>(polygon_.Get());
    CComPtr<IShape> shape;
    ASSERT_EQ(excludable->get_Shape(&shape), S_OK);
    CComPtr<IExclusionZone> zone = CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    const auto contains = [&] {
        VARIANT_BOOL contained = VARIANT_FALSE;
        EXPECT_EQ(zone->ContainsShape(shape, &contained), S_OK);
        return contained != VARIANT_FALSE;
    };
    ASSERT_EQ(QueryAs<IExclusionAwarePattern>(polygon_.Get())->SetExclusionZone(zone), S_OK);
    EXPECT_FALSE(contains());
    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_TRUE), S_OK);
    EXPECT_TRUE(contains());

    auto rectangle = CreateInstance<IPatternRectangle>(CLSID_PatternRectangle);
    ASSERT_EQ(QueryAs<IExclusionAwarePattern>(rectangle.Get())->SetExclusionZone(zone), S_OK);
    const auto points = RenderedPoints(rectangle);
    const auto exposing = std::count_if(points.begin(), points.end(),
                                        [](const PatternPoint& p) { return p.flags == PointFlag_Acquire; });
    EXPECT_EQ(exposing, 66);

    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_FALSE), S_OK);
    EXPECT_FALSE(contains());
}

TEST_F(PolygonTest, CopyToAppendsTheVerticesAfterTheTargetsOwn) {
    MakeTriangle(polygon_);
    ASSERT_EQ(polygon_->put_EndDwellTime(3e-6), S_OK);
    auto cloneable = QueryAs<ICloneablePattern>(polygon_.Get());

    CComPtr<IPattern> clone;
    ASSERT_EQ(cloneable->Clone(&clone), S_OK);
    EXPECT_EQ(RenderedPoints(clone), RenderedPoints(polygon_));

    auto target = NewPolygon();
    AddPoints(target, {{0.25, 0.25}});
    ASSERT_EQ(cloneable->CopyTo(target), S_OK);
    // One own vertex plus three copied: index 3 exists, 4 does not.
    EXPECT_EQ(target->ModifyPoint(3, CreateCoordinate({0.5, 0.875})), S_OK);
    EXPECT_EQ(target->ModifyPoint(4, CreateCoordinate({0.5, 0.875})), E_INVALIDARG);
    double end = 0.0;
    target->get_EndDwellTime(&end);
    EXPECT_EQ(end, 3e-6);

    EXPECT_EQ(cloneable->CopyTo(nullptr), E_INVALIDARG);
    EXPECT_EQ(TakeErrorDescription(IID_ICloneablePattern), u"pIPattern object is null");
    EXPECT_EQ(cloneable->CopyTo(CreateInstance<IPattern>(CLSID_PatternLine)), E_NOINTERFACE);
}

TEST_F(PolygonTest, AcceptHandsThePolygonToItsVisitorMethod) {
    auto visitor = CComObjectEx<RecordingVisitor>::CreateInstance<IPatternShapeVisitor>();
    EXPECT_EQ(polygon_->Accept(visitor), S_FALSE);
    EXPECT_EQ(static_cast<RecordingVisitor*>(visitor.Get())->visited.Get(), polygon_.Get());
    EXPECT_EQ(polygon_->Accept(nullptr), E_POINTER);
}

} // namespace
} // namespace Norvane::Lumis::Scanning
