#include "shapes/pattern_rectangle.h"
#include "shapes/shape_classes.h"

#include "core/point_buffer_view.h"
#include "core/scan_strategy_conversions.h"
#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <optional>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

// Defaults throughout unless a test says otherwise: alignment 16384..49152 (span 32768), resolution
// 2.5e-8 s, one pre-blanking point (40 ticks, 0x02), one asymmetry point (2 ticks, 0x00), one post-blanking
// point (40 ticks, 0x02). Pitch 0.1: sx = sy = trunc(3276.8) = 3276, kx = ky = trunc(32768 / 3276) = 10,
// 11 x 11 = 121 pattern points, first row at X 49152 - 10 * 3276 = 16392.

struct ErrorReport {
    GUID guid{};
    std::u16string description;
};

std::optional<ErrorReport> TakeErrorReport() {
    CComPtr<IErrorInfo> info;
    if (GetErrorInfo(0, &info) != S_OK)
        return std::nullopt;
    ErrorReport report;
    CComBSTR description;
    info->GetGUID(&report.guid);
    info->GetDescription(&description);
    report.description = description.View();
    return report;
}

void ExpectError(REFIID iid, const std::u16string& description) {
    const auto report = TakeErrorReport();
    ASSERT_TRUE(report.has_value());
    EXPECT_EQ(report->guid, iid);
    EXPECT_EQ(report->description, description);
}

class RecordingVisitor : public CComObjectRootBase, public IPatternShapeVisitor {
  public:
    using Interfaces = InterfaceMap<IPatternShapeVisitor>;

    HRESULT VisitPatternRectangle(IPatternRectangle* pattern) override {
        visited = pattern;
        return S_FALSE;
    }
    HRESULT VisitPatternLine(IPatternLine*) override { return E_NOTIMPL; }
    HRESULT VisitPatternSpot(IPatternSpot*) override { return E_NOTIMPL; }
    HRESULT VisitPatternCircle(IPatternCircle*) override { return E_NOTIMPL; }
    HRESULT VisitPatternPolygon(IPatternPolygon*) override { return E_NOTIMPL; }
    HRESULT VisitPatternRegularCrossSection(IPatternRegularCrossSection*) override { return E_NOTIMPL; }
    HRESULT VisitPatternMultiPassCrossSection(IPatternMultiPassCrossSection*) override { return E_NOTIMPL; }
    HRESULT VisitPatternStreamFile(IPatternStreamFile*) override { return E_NOTIMPL; }
    HRESULT VisitPatternBitmapFile(IPatternBitmapFile*) override { return E_NOTIMPL; }
    HRESULT VisitBeamweaverCollection(IBeamweaverCollection*) override { return E_NOTIMPL; }

    CComPtr<IPatternRectangle> visited;
};

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

class RectangleTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComponents();
        rectangle_ = NewRectangle();
        SetErrorInfo(0, nullptr);
    }

    static CComPtr<IPatternRectangle> NewRectangle() {
        return CreateInstance<IPatternRectangle>(CLSID_PatternRectangle);
    }

    RectangularStrategy Strategy() {
        CComPtr<IScanStrategyRectangular> strategy;
        EXPECT_EQ(rectangle_->get_ScanStrategy(&strategy), S_OK);
        return ReadScanStrategyRectangular(strategy);
    }

    HRESULT PutStrategy(const RectangularStrategy& strategy) {
        return rectangle_->put_ScanStrategy(MakeScanStrategyRectangular(strategy));
    }

    void PutStrategyChange(void (*change)(RectangularStrategy&)) {
        RectangularStrategy strategy;
        change(strategy);
        ASSERT_EQ(PutStrategy(strategy), S_OK);
    }

    void SetTargetResolution(double resolution) {
        CComPtr<IPatternRenderingProperties> properties;
        ASSERT_EQ(rectangle_->get_RenderingProperties(&properties), S_OK);
        ASSERT_EQ(properties->put_TargetDwellTimeResolution(resolution), S_OK);
        ASSERT_EQ(rectangle_->put_RenderingProperties(properties), S_OK);
    }

    double LoopTime() {
        double time = 0.0;
        EXPECT_EQ(rectangle_->GetLoopTime(&time), S_OK);
        return time;
    }

    double EffectiveLoopTime() {
        double time = 0.0;
        EXPECT_EQ(rectangle_->GetEffectiveLoopTime(&time), S_OK);
        return time;
    }

    CComPtr<IShapeRectangle> Shape(IPatternRectangle* pattern) {
        CComPtr<IShape> shape;
        EXPECT_EQ(QueryAs<IExcludablePatternShape>(pattern)->get_Shape(&shape), S_OK);
        return QueryAs<IShapeRectangle>(shape.Get());
    }

    CComPtr<IPatternRectangle> rectangle_;
};

TEST_F(RectangleTest, CreatedByProgIdWithTheDefaultProperties) {
    CLSID clsid{};
    ASSERT_EQ(CLSIDFromProgID(u"Beamweaver.PatternRectangle", &clsid), S_OK);
    EXPECT_EQ(clsid, CLSID_PatternRectangle);
    GUID classId{};
    ASSERT_EQ(rectangle_->ClassID(&classId), S_OK);
    EXPECT_EQ(classId, CLSID_PatternRectangle);

    CComPtr<IRectangleFloat> area;
    ASSERT_EQ(rectangle_->get_Rectangle(&area), S_OK);
    EXPECT_EQ(ReadRectangleFloat(area), (RectangleFloat{0.0, 0.0, 1.0, 1.0}));
    double begin = 0.0, end = 0.0, minimum = 0.0, maximum = 0.0;
    rectangle_->get_BeginDwellTime(&begin);
    rectangle_->get_EndDwellTime(&end);
    EXPECT_EQ(begin, 1e-6);
    EXPECT_EQ(end, 1e-6);
    ASSERT_EQ(rectangle_->put_EndDwellTime(3e-6), S_OK);
    rectangle_->GetMinDwellTime(&minimum);
    rectangle_->GetMaxDwellTime(&maximum);
    EXPECT_EQ(minimum, 1e-6);
    EXPECT_EQ(maximum, 3e-6);
    EXPECT_EQ(Strategy(), RectangularStrategy{});
    CComPtr<ITransformationMatrix2D> matrix;
    ASSERT_EQ(rectangle_->get_TransformationMatrix(&matrix), S_OK);
    EXPECT_EQ(ReadMatrix(matrix), TransformationMatrix{});
    VARIANT_BOOL exclusion = VARIANT_TRUE;
    ASSERT_EQ(QueryAs<IExcludablePatternShape>(rectangle_.Get())->get_IsExclusion(&exclusion), S_OK);
    EXPECT_EQ(exclusion, VARIANT_FALSE);
    EXPECT_TRUE(QueryAs<IExclusionAwarePattern>(rectangle_.Get()));
}

TEST_F(RectangleTest, RendersTheDefaultGridWithBlanking) {
    CComPtr<IScanDefinition> definition;
    ASSERT_EQ(rectangle_->Render(&definition), S_OK);
    std::uint32_t updatePoints = 0, gateTicks = 99;
    definition->get_AcquisitionUpdatePoints(&updatePoints);
    definition->get_GatePulseIdleTicks(&gateTicks);
    EXPECT_EQ(updatePoints, 16666u); // trunc((1/60) / ((1e-6 + 1e-6) * 0.5))
    EXPECT_EQ(gateTicks, 0u);

    const auto points = PointsOf(definition);
    ASSERT_EQ(points.size(), 2u + 121u + 1u);
    EXPECT_EQ(points[0], MakePoint(16392, 16392, 40, PointFlag_Blank));
    EXPECT_EQ(points[1], MakePoint(16392, 16392, 2, 0));
    EXPECT_EQ(points[2], MakePoint(16392, 16392, 40, PointFlag_Acquire));
    EXPECT_EQ(points[12], MakePoint(49152, 16392, 40, PointFlag_Acquire)); // 16392 + 10 * 3276
    EXPECT_EQ(points[13], MakePoint(16392, 19668, 40, PointFlag_Acquire)); // second row
    EXPECT_EQ(points[122], MakePoint(49152, 49152, 40, PointFlag_Acquire));
    EXPECT_EQ(points[123], MakePoint(49152, 49152, 40, PointFlag_Blank));
}

TEST_F(RectangleTest, RefusedPlainValuesKeepTheStoredOnes) {
    constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
    constexpr double kInfinity = std::numeric_limits<double>::infinity();
    for (double refused : {0.0, -1e-6, kNaN, kInfinity}) {
        EXPECT_EQ(rectangle_->put_BeginDwellTime(refused), E_INVALIDARG) << refused;
        EXPECT_EQ(rectangle_->put_EndDwellTime(refused), E_INVALIDARG) << refused;
    }
    double begin = 0.0, end = 0.0;
    rectangle_->get_BeginDwellTime(&begin);
    rectangle_->get_EndDwellTime(&end);
    EXPECT_EQ(begin, 1e-6);
    EXPECT_EQ(end, 1e-6);

    // Pitches must lie strictly between 0 and 1 on both axes.
    for (double pitch : {1.0, 0.0, -0.1, kNaN}) {
        RectangularStrategy strategy;
        strategy.pitchX = pitch;
        strategy.scanType = ScanType_Serpentine;
        EXPECT_EQ(PutStrategy(strategy), E_INVALIDARG) << pitch;
        strategy.pitchX = 0.2;
        strategy.pitchY = pitch;
        EXPECT_EQ(PutStrategy(strategy), E_INVALIDARG) << pitch;
    }
    EXPECT_EQ(Strategy(), RectangularStrategy{});
}

TEST_F(RectangleTest, RefusedObjectValuesCarryTheirMessageAndKeepTheStoredOnes) {
    ASSERT_EQ(rectangle_->put_Rectangle(CreateRectangleFloat({0.1, 0.2, 0.3, 0.4})), S_OK);
    // Outside the field on the left, past the right edge, inverted in X, inverted in Y.
    const RectangleFloat refused[] = {
        {-0.1, 0.0, 0.5, 0.5}, {0.0, 0.0, 1.1, 0.5}, {0.6, 0.0, 0.5, 0.5}, {0.0, 0.6, 0.5, 0.5}};
    for (const RectangleFloat& value : refused) {
        EXPECT_EQ(rectangle_->put_Rectangle(CreateRectangleFloat(value)), E_INVALIDARG);
        ExpectError(IID_IPatternRectangle, u"Rectangle values not correct");
    }
    EXPECT_EQ(rectangle_->put_Rectangle(nullptr), E_INVALIDARG);
    ExpectError(IID_IPatternRectangle, u"Rectangle object is null");
    CComPtr<IRectangleFloat> area;
    ASSERT_EQ(rectangle_->get_Rectangle(&area), S_OK);
    EXPECT_EQ(ReadRectangleFloat(area), (RectangleFloat{0.1, 0.2, 0.3, 0.4}));

    EXPECT_EQ(rectangle_->put_TransformationMatrix(nullptr), E_INVALIDARG);
    ExpectError(IID_IPatternRectangle, u"TransformationMatrix object is null");

    PutStrategyChange([](RectangularStrategy& s) { s.pitchX = 0.05; });
    EXPECT_EQ(rectangle_->put_ScanStrategy(nullptr), E_INVALIDARG);
    ExpectError(IID_IPatternRectangle, u"ScanStrategy object is null");
    EXPECT_EQ(Strategy().pitchX, 0.05);
}

TEST_F(RectangleTest, StrategyIsCopiedInAndOut) {
    CComPtr<IScanStrategyRectangular> given = MakeScanStrategyRectangular({});
    ASSERT_EQ(given->put_PitchY(0.25), S_OK);
    ASSERT_EQ(rectangle_->put_ScanStrategy(given), S_OK);
    ASSERT_EQ(given->put_PitchY(0.5), S_OK);
    EXPECT_EQ(Strategy().pitchY, 0.25);

    CComPtr<IScanStrategyRectangular> taken;
    ASSERT_EQ(rectangle_->get_ScanStrategy(&taken), S_OK);
    ASSERT_EQ(taken->put_PitchY(0.75), S_OK);
    EXPECT_EQ(Strategy().pitchY, 0.25);
}

TEST_F(RectangleTest, EnumerationsOutsideTheirRangeRenderAsOneSolidPass) {
    const auto plain = RenderedPoints(rectangle_);
    const double plainLoopTime = LoopTime();
    PutStrategyChange([](RectangularStrategy& s) {
        s.fillStyle = static_cast<FillStyle>(7);
        s.multiPass = static_cast<MultiPass>(-3);
    });
    EXPECT_EQ(Strategy().fillStyle, static_cast<FillStyle>(7));
    EXPECT_EQ(RenderedPoints(rectangle_), plain);
    EXPECT_EQ(LoopTime(), plainLoopTime);
}

TEST_F(RectangleTest, PassesMultiplyPointsAndLoopTimeButNotTheEffectiveLoopTime) {
    // E = 121 * 1e-6; one pass T = (1e-6 + 5e-8) + E + 1e-6 = 1.2305e-4 s.
    const double effective = 121 * 1e-6;
    const double pass = (1e-6 + 5e-8) + effective + 1e-6;
    EXPECT_DOUBLE_EQ(EffectiveLoopTime(), effective);
    EXPECT_DOUBLE_EQ(LoopTime(), pass);

    PutStrategyChange([](RectangularStrategy& s) { s.multiPass = MultiPass_OneOrientation; });
    EXPECT_EQ(RenderedPoints(rectangle_).size(), 2u * 124u);
    EXPECT_DOUBLE_EQ(EffectiveLoopTime(), effective);
    EXPECT_DOUBLE_EQ(LoopTime(), 2 * pass);

    PutStrategyChange([](RectangularStrategy& s) { s.multiPass = MultiPass_AllOrientations; });
    EXPECT_EQ(RenderedPoints(rectangle_).size(), 4u * 124u);
    EXPECT_DOUBLE_EQ(LoopTime(), 4 * pass);
}

TEST_F(RectangleTest, FrameIsOnePassOfItsOutline) {
    // Outline (10 + 10) * 2 = 40 points: E = 40 * mean dwell (1e-6 + 3e-6) / 2.
    ASSERT_EQ(rectangle_->put_EndDwellTime(3e-6), S_OK);
    PutStrategyChange([](RectangularStrategy& s) {
        s.fillStyle = FillStyle_Frame;
        s.multiPass = MultiPass_AllOrientations;
    });
    EXPECT_EQ(RenderedPoints(rectangle_).size(), 2u + 40u + 1u);
    EXPECT_DOUBLE_EQ(EffectiveLoopTime(), 40 * 2e-6);
    EXPECT_DOUBLE_EQ(LoopTime(), (1e-6 + 5e-8) + 40 * 2e-6 + 1e-6);
}

TEST_F(RectangleTest, DwellRampAndSerpentineReachTheRenderedPoints) {
    // Ramp 40 -> 80 ticks over 11 rows (+4 per row); the serpentine second row runs from 49152 back.
    ASSERT_EQ(rectangle_->put_EndDwellTime(2e-6), S_OK);
    PutStrategyChange([](RectangularStrategy& s) { s.scanType = ScanType_Serpentine; });
    const auto points = RenderedPoints(rectangle_);
    EXPECT_EQ(points[13], MakePoint(49152, 19668, 44, PointFlag_Acquire));
    EXPECT_EQ(points[23], MakePoint(16392, 19668, 44, PointFlag_Acquire));
    EXPECT_EQ(points[122].dwell, 80);
}

TEST_F(RectangleTest, ValidationReportsDwellTimesAndThenPitchesBelowOneDacStep) {
    // Pitch 1e-5 of a 32768 span is 0.33 DAC steps. A target resolution of 2e-6 s is coarser than both
    // dwell times.
    struct Case {
        double targetResolution;
        RectangularStrategy strategy;
        std::u16string description;
    };
    const Case cases[] = {
        {2.5e-8, {.pitchX = 1e-5}, u"PitchX out of range. "},
        {2.5e-8, {.pitchY = 1e-5}, u"PitchY out of range. "},
        {2e-6,
         {.pitchX = 1e-5, .pitchY = 1e-5},
         u"BeginDwellTime out of range. EndDwellTime out of range. PitchX out of range. PitchY out of "
         u"range. "},
    };
    for (const Case& c : cases) {
        SetTargetResolution(c.targetResolution);
        ASSERT_EQ(PutStrategy(c.strategy), S_OK);
        CComPtr<IPatternValidationResult> result;
        ASSERT_EQ(rectangle_->Validate(&result), S_OK);
        VARIANT_BOOL valid = VARIANT_TRUE;
        CComBSTR description;
        result->get_Valid(&valid);
        result->get_Description(&description);
        EXPECT_EQ(valid, VARIANT_FALSE);
        EXPECT_EQ(std::u16string(description.View()), c.description);

        CComPtr<IScanDefinition> definition;
        EXPECT_EQ(rectangle_->Render(&definition), E_INVALIDARG);
        EXPECT_FALSE(definition);
        ExpectError(IID_IExclusionAwarePattern, c.description);
        double time = 0.0;
        EXPECT_EQ(rectangle_->GetLoopTime(&time), E_INVALIDARG);
        ExpectError(IID_IPatternRectangle, c.description);
        EXPECT_EQ(rectangle_->GetEffectiveLoopTime(&time), E_INVALIDARG);
        ExpectError(IID_IPatternRectangle, c.description);
    }

    SetTargetResolution(2.5e-8);
    ASSERT_EQ(PutStrategy({}), S_OK);
    CComPtr<IPatternValidationResult> result;
    ASSERT_EQ(rectangle_->Validate(&result), S_OK);
    CComBSTR description;
    result->get_Description(&description);
    EXPECT_EQ(std::u16string(description.View()), u"");
}

TEST_F(RectangleTest, ExclusionMarksEveryPatternPointBlankButNotTheAsymmetryPoint) {
    ASSERT_EQ(QueryAs<IExcludablePatternShape>(rectangle_.Get())->put_IsExclusion(VARIANT_TRUE), S_OK);
    const auto points = RenderedPoints(rectangle_);
    ASSERT_EQ(points.size(), 124u);
    EXPECT_EQ(points[0].flags, PointFlag_Blank);
    EXPECT_EQ(points[1].flags, 0);
    for (std::size_t i = 2; i < 123; ++i)
        EXPECT_EQ(points[i].flags, PointFlag_Blank) << i;
    EXPECT_EQ(points[123].flags, PointFlag_Blank);
}

TEST_F(RectangleTest, DacBoundingBoxCoversAllFourTransformedCorners) {
    CComPtr<IRectangleInt> box;
    ASSERT_EQ(rectangle_->GetDacBoundingBox(&box), S_OK);
    EXPECT_EQ(ReadRectangleInt(box), (RectangleInt{16384, 16384, 49152, 49152}));

    // (0.2, 0.2)-(0.4, 0.4) turned 45 degrees (c = s = 0.70711) and moved by 0.5 in X: corners
    // (0.5, 0.28284), (0.64142, 0.42426), (0.5, 0.56569), (0.35858, 0.42426). DAC 16384 + 32768 v:
    // x 16384 + 11749.9 = 28133 .. 16384 + 21018.1 = 37402, y 16384 + 9268.2 = 25652 .. 16384 + 18536.4 =
    // 34920.
    const double c = std::sqrt(0.5);
    ASSERT_EQ(rectangle_->put_Rectangle(CreateRectangleFloat({0.2, 0.2, 0.4, 0.4})), S_OK);
    ASSERT_EQ(rectangle_->put_TransformationMatrix(CreateMatrix({c, -c, 0.5, c, c, 0.0})), S_OK);
    box.Release();
    ASSERT_EQ(rectangle_->GetDacBoundingBox(&box), S_OK);
    EXPECT_EQ(ReadRectangleInt(box), (RectangleInt{28133, 25652, 37402, 34920}));
}

TEST_F(RectangleTest, MatrixMapsEveryRenderedPointThroughRelativeCoordinates) {
    // Ten degrees about the origin, moved by 0.2 in X: each point goes x = (X - 16384) / 32768, then
    // x' = c x - s y + 0.2, y' = s x + c y, then X' = trunc(16384 + 32768 x') held within 0..65535; dwell and
    // flags stay.
    const auto plain = RenderedPoints(rectangle_);
    const double angle = 10.0 * std::acos(-1.0) / 180.0;
    const double c = std::cos(angle);
    const double s = std::sin(angle);
    ASSERT_EQ(rectangle_->put_TransformationMatrix(CreateMatrix({c, -s, 0.2, s, c, 0.0})), S_OK);
    const auto turned = RenderedPoints(rectangle_);
    ASSERT_EQ(turned.size(), plain.size());
    for (std::size_t i = 0; i < plain.size(); ++i) {
        const double x = (plain[i].x - 16384.0) / 32768.0;
        const double y = (plain[i].y - 16384.0) / 32768.0;
        const PatternPoint expected =
            MakePoint(ClampToDac(16384.0 + 32768.0 * (c * x + -s * y + 0.2)),
                      ClampToDac(16384.0 + 32768.0 * (s * x + c * y + 0.0)), plain[i].dwell, plain[i].flags);
        EXPECT_EQ(turned[i], expected) << "point " << i;
    }
}

TEST_F(RectangleTest, ExclusionShapeFollowsGeometryMatrixAndAlignments) {
    const CComPtr<IShapeRectangle> shape = Shape(rectangle_);
    ASSERT_TRUE(shape);
    const auto shapeRange = [&](bool x) {
        CComPtr<IRangeInt> range;
        EXPECT_EQ(x ? shape->get_DACRangeX(&range) : shape->get_DACRangeY(&range), S_OK);
        return ReadRange(range);
    };
    EXPECT_EQ(shapeRange(true), (RangeInt{16384, 49152}));

    ASSERT_EQ(rectangle_->put_Rectangle(CreateRectangleFloat({0.1, 0.2, 0.3, 0.4})), S_OK);
    ASSERT_EQ(rectangle_->put_TransformationMatrix(CreateMatrix({1.0, 0.0, 0.1, 0.0, 1.0, 0.2})), S_OK);
    CComPtr<IPatternRenderingProperties> properties;
    CComPtr<IPatternAlignments> alignments;
    ASSERT_EQ(rectangle_->get_RenderingProperties(&properties), S_OK);
    ASSERT_EQ(properties->get_PatternAlignmentsY(&alignments), S_OK);
    ASSERT_EQ(alignments->put_Range(CreateRange({1000, 60000})), S_OK);
    ASSERT_EQ(properties->put_PatternAlignmentsY(alignments), S_OK);
    ASSERT_EQ(rectangle_->put_RenderingProperties(properties), S_OK);

    CComPtr<IRectangleFloat> area;
    CComPtr<ITransformationMatrix2D> matrix;
    ASSERT_EQ(shape->get_Rectangle(&area), S_OK);
    ASSERT_EQ(shape->get_TransformationMatrix(&matrix), S_OK);
    EXPECT_EQ(ReadRectangleFloat(area), (RectangleFloat{0.1, 0.2, 0.3, 0.4}));
    EXPECT_EQ(ReadMatrix(matrix), (TransformationMatrix{1.0, 0.0, 0.1, 0.0, 1.0, 0.2}));
    EXPECT_EQ(shapeRange(true), (RangeInt{16384, 49152}));
    EXPECT_EQ(shapeRange(false), (RangeInt{1000, 60000}));
}

TEST_F(RectangleTest, ExclusionPatternRegistersItsShapeWithItsZone) {
    auto excludable = QueryAs<IExcludablePatternShape>(rectangle_.Get());
    auto aware = QueryAs<IExclusionAwarePattern>(rectangle_.Get());
    CComPtr<IShape> shape;
    ASSERT_EQ(excludable->get_Shape(&shape), S_OK);
    CComPtr<IExclusionZone> zone = CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    const auto contains = [&] {
        VARIANT_BOOL contained = VARIANT_FALSE;
        EXPECT_EQ(zone->ContainsShape(shape, &contained), S_OK);
        return contained != VARIANT_FALSE;
    };

    // Not an exclusion: the zone stays empty.
    ASSERT_EQ(aware->SetExclusionZone(zone), S_OK);
    EXPECT_FALSE(contains());
    // Marking it adds the shape once, however often it is marked.
    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_TRUE), S_OK);
    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_TRUE), S_OK);
    ASSERT_EQ(zone->RemoveShape(shape), S_OK);
    EXPECT_FALSE(contains());
    // Unmarking takes it out; clearing the zone takes it out too.
    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_TRUE), S_OK);
    EXPECT_TRUE(contains());
    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_FALSE), S_OK);
    EXPECT_FALSE(contains());
    ASSERT_EQ(excludable->put_IsExclusion(VARIANT_TRUE), S_OK);
    ASSERT_EQ(aware->ClearExclusionZone(), S_OK);
    EXPECT_FALSE(contains());
    // Set on a pattern already marked: added.
    ASSERT_EQ(aware->SetExclusionZone(zone), S_OK);
    EXPECT_TRUE(contains());
}

TEST_F(RectangleTest, ZoneOfAnExclusionRectangleCutsItsAreaOutOfAnotherRectangle) {
    // The exclusion covers x <= 0.5 (DAC 32768). Of the default grid's columns 16392 + c * 3276, c = 5
    // (32772) and beyond lie outside it: 6 columns x 11 rows = 66 exposing points remain.
    auto hole = NewRectangle();
    ASSERT_EQ(hole->put_Rectangle(CreateRectangleFloat({0.0, 0.0, 0.5, 1.0})), S_OK);
    ASSERT_EQ(QueryAs<IExcludablePatternShape>(hole.Get())->put_IsExclusion(VARIANT_TRUE), S_OK);
    CComPtr<IExclusionZone> zone = CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    ASSERT_EQ(QueryAs<IExclusionAwarePattern>(hole.Get())->SetExclusionZone(zone), S_OK);
    ASSERT_EQ(QueryAs<IExclusionAwarePattern>(rectangle_.Get())->SetExclusionZone(zone), S_OK);

    const auto points = RenderedPoints(rectangle_);
    const auto exposing = std::count_if(points.begin(), points.end(),
                                        [](const PatternPoint& p) { return p.flags == PointFlag_Acquire; });
    EXPECT_EQ(exposing, 66);
    for (const PatternPoint& p : points)
        EXPECT_TRUE(p.flags != PointFlag_Acquire || p.x > 32768) << "exposing point at x " << p.x;
}

void SetEveryProperty(IPatternRectangle* rectangle) {
    CheckResult(rectangle->put_Rectangle(CreateRectangleFloat({0.1, 0.2, 0.7, 0.9})));
    CheckResult(rectangle->put_BeginDwellTime(2e-6));
    CheckResult(rectangle->put_EndDwellTime(5e-6));
    const RectangularStrategy strategy{0.05,
                                       0.07,
                                       ScanOrientation_Vertical,
                                       ScanDirection_Reverse,
                                       ScanDirection_Reverse,
                                       FillStyle_Solid,
                                       ScanType_Serpentine,
                                       MultiPass_OneOrientation};
    CheckResult(rectangle->put_ScanStrategy(MakeScanStrategyRectangular(strategy)));
    CheckResult(rectangle->put_TransformationMatrix(CreateMatrix({0.9, 0.1, 0.02, -0.1, 0.9, 0.03})));
    CheckResult(rectangle->put_AcquisitionUpdateInterval(0.5));
    CheckResult(rectangle->put_EnableGatePulse(VARIANT_TRUE));
    CComPtr<IPatternRenderingProperties> properties;
    CheckResult(rectangle->get_RenderingProperties(&properties));
    CheckResult(properties->put_PreBlankingTime(3e-6));
    CheckResult(rectangle->put_RenderingProperties(properties));
    CheckResult(QueryAs<IExcludablePatternShape>(rectangle)->put_IsExclusion(VARIANT_TRUE));
}

void ExpectEveryPropertySet(IPatternRectangle* rectangle) {
    CComPtr<IRectangleFloat> area;
    CComPtr<IScanStrategyRectangular> strategy;
    CComPtr<ITransformationMatrix2D> matrix;
    CComPtr<IPatternRenderingProperties> properties;
    double beginDwell = 0.0, endDwell = 0.0, interval = 0.0, preBlanking = 0.0;
    VARIANT_BOOL gatePulse = VARIANT_FALSE, exclusion = VARIANT_TRUE;
    CheckResult(rectangle->get_Rectangle(&area));
    CheckResult(rectangle->get_BeginDwellTime(&beginDwell));
    CheckResult(rectangle->get_EndDwellTime(&endDwell));
    CheckResult(rectangle->get_ScanStrategy(&strategy));
    CheckResult(rectangle->get_TransformationMatrix(&matrix));
    CheckResult(rectangle->get_AcquisitionUpdateInterval(&interval));
    CheckResult(rectangle->get_EnableGatePulse(&gatePulse));
    CheckResult(rectangle->get_RenderingProperties(&properties));
    CheckResult(properties->get_PreBlankingTime(&preBlanking));
    CheckResult(QueryAs<IExcludablePatternShape>(rectangle)->get_IsExclusion(&exclusion));
    EXPECT_EQ(ReadRectangleFloat(area), (RectangleFloat{0.1, 0.2, 0.7, 0.9}));
    EXPECT_EQ(beginDwell, 2e-6);
    EXPECT_EQ(endDwell, 5e-6);
    const RectangularStrategy copied = ReadScanStrategyRectangular(strategy);
    EXPECT_EQ(copied.pitchY, 0.07);
    EXPECT_EQ(copied.orientation, ScanOrientation_Vertical);
    EXPECT_EQ(copied.multiPass, MultiPass_OneOrientation);
    EXPECT_EQ(ReadMatrix(matrix), (TransformationMatrix{0.9, 0.1, 0.02, -0.1, 0.9, 0.03}));
    EXPECT_EQ(interval, 0.5);
    EXPECT_EQ(gatePulse, VARIANT_TRUE);
    EXPECT_EQ(preBlanking, 3e-6);
    EXPECT_EQ(exclusion, VARIANT_FALSE); // not copied
}

TEST_F(RectangleTest, CloneAndCopyToCopyEveryPropertyButTheExclusionMark) {
    SetEveryProperty(rectangle_);
    auto cloneable = QueryAs<ICloneablePattern>(rectangle_.Get());

    CComPtr<IPattern> clone;
    ASSERT_EQ(cloneable->Clone(&clone), S_OK);
    auto cloned = QueryAs<IPatternRectangle>(clone.Get());
    ASSERT_TRUE(cloned);
    EXPECT_NE(cloned.Get(), rectangle_.Get());
    ExpectEveryPropertySet(cloned);
    EXPECT_NE(Shape(cloned).Get(), Shape(rectangle_).Get());

    auto target = NewRectangle();
    ASSERT_EQ(cloneable->CopyTo(target), S_OK);
    ExpectEveryPropertySet(target);
    // With the mark set on the copy too, it renders exactly as the original.
    ASSERT_EQ(QueryAs<IExcludablePatternShape>(target.Get())->put_IsExclusion(VARIANT_TRUE), S_OK);
    EXPECT_EQ(RenderedPoints(target), RenderedPoints(rectangle_));
}

TEST_F(RectangleTest, CopyToRefusesAMissingOrForeignTarget) {
    auto cloneable = QueryAs<ICloneablePattern>(rectangle_.Get());
    EXPECT_EQ(cloneable->CopyTo(nullptr), E_INVALIDARG);
    ExpectError(IID_ICloneablePattern, u"pIPattern object is null");
    auto line = CreateInstance<IPattern>(CLSID_PatternLine);
    EXPECT_EQ(cloneable->CopyTo(line), E_NOINTERFACE);
}

TEST_F(RectangleTest, AcceptHandsTheRectangleToItsVisitorMethod) {
    auto visitor = CComObjectEx<RecordingVisitor>::CreateInstance<IPatternShapeVisitor>();
    EXPECT_EQ(rectangle_->Accept(visitor), S_FALSE);
    EXPECT_EQ(static_cast<RecordingVisitor*>(visitor.Get())->visited.Get(), rectangle_.Get());
    EXPECT_EQ(rectangle_->Accept(nullptr), E_POINTER);
}

} // namespace
} // namespace Norvane::Lumis::Scanning
