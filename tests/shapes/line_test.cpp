#include "shapes/pattern_line.h"
#include "shapes/shape_classes.h"

#include "comtypes/comtypes_registration.h"
#include "core/point_buffer_view.h"
#include "core/rendering_classes.h"
#include "dwellmap/dwellmap_registration.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include "common/error_info_probe.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <optional>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();

using Norvane::testing::TakePublishedErrorInfo;

// Takes the thread's error information out of its slot; nothing when there is none.
auto TakeErrorReport() { return TakePublishedErrorInfo(); }

void ExpectError(REFIID iid, const std::u16string& description) {
    const auto report = TakeErrorReport();
    ASSERT_TRUE(report.has_value());
    EXPECT_EQ(report->guid, iid);
    EXPECT_EQ(report->description, description);
}

class RecordingVisitor : public CComObjectRootBase, public IPatternShapeVisitor {
  public:
    using Interfaces = InterfaceMap<IPatternShapeVisitor>;

    HRESULT VisitPatternRectangle(IPatternRectangle*) override { return E_NOTIMPL; }
    HRESULT VisitPatternLine(IPatternLine* pattern) override {
        visited = pattern;
        return S_FALSE;
    }
    HRESULT VisitPatternSpot(IPatternSpot*) override { return E_NOTIMPL; }
    HRESULT VisitPatternCircle(IPatternCircle*) override { return E_NOTIMPL; }
    HRESULT VisitPatternPolygon(IPatternPolygon*) override { return E_NOTIMPL; }
    HRESULT VisitPatternRegularCrossSection(IPatternRegularCrossSection*) override { return E_NOTIMPL; }
    HRESULT VisitPatternMultiPassCrossSection(IPatternMultiPassCrossSection*) override { return E_NOTIMPL; }
    HRESULT VisitPatternStreamFile(IPatternStreamFile*) override { return E_NOTIMPL; }
    HRESULT VisitPatternBitmapFile(IPatternBitmapFile*) override { return E_NOTIMPL; }
    HRESULT VisitBeamweaverCollection(IBeamweaverCollection*) override { return E_NOTIMPL; }

    CComPtr<IPatternLine> visited;
};

class LineTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComTypesClasses();
        RegisterDwellmapClasses();
        RegisterClasses(RenderingClassEntries());
        RegisterClasses(ShapeClassEntries());
        line_ = CreateInstance<IPatternLine>(CLSID_PatternLine);
        SetErrorInfo(0, nullptr);
    }

    static CComPtr<IPatternLine> NewLine() { return CreateInstance<IPatternLine>(CLSID_PatternLine); }

    static std::vector<PatternPoint> RenderedPoints(IPattern* pattern) {
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

    void SetTargetResolution(double resolution) {
        CComPtr<IPatternRenderingProperties> properties;
        ASSERT_EQ(line_->get_RenderingProperties(&properties), S_OK);
        ASSERT_EQ(properties->put_TargetDwellTimeResolution(resolution), S_OK);
        ASSERT_EQ(line_->put_RenderingProperties(properties), S_OK);
    }

    coordinate<double> Begin() {
        CComPtr<ICoordinateFloat> value;
        EXPECT_EQ(line_->get_Begin(&value), S_OK);
        return ReadCoordinate(value);
    }

    double Pitch() {
        double value = 0.0;
        EXPECT_EQ(line_->get_Pitch(&value), S_OK);
        return value;
    }

    CComPtr<IPatternLine> line_;
};

TEST_F(LineTest, CreatedByProgIdWithTheDefaultProperties) {
    CLSID clsid{};
    ASSERT_EQ(CLSIDFromProgID(u"Beamweaver.PatternLine", &clsid), S_OK);
    EXPECT_EQ(clsid, CLSID_PatternLine);
    GUID classId{};
    ASSERT_EQ(line_->ClassID(&classId), S_OK);
    EXPECT_EQ(classId, CLSID_PatternLine);

    EXPECT_EQ(Begin(), (coordinate<double>{0.0, 0.0}));
    CComPtr<ICoordinateFloat> end;
    ASSERT_EQ(line_->get_End(&end), S_OK);
    EXPECT_EQ(ReadCoordinate(end), (coordinate<double>{1.0, 1.0}));
    double begin = 0.0, finish = 0.0, minimum = 0.0, maximum = 0.0;
    line_->get_BeginDwellTime(&begin);
    line_->get_EndDwellTime(&finish);
    line_->GetMinDwellTime(&minimum);
    line_->GetMaxDwellTime(&maximum);
    EXPECT_EQ(begin, 1e-6);
    EXPECT_EQ(finish, 1e-6);
    EXPECT_EQ(minimum, 1e-6);
    EXPECT_EQ(maximum, 1e-6);
    EXPECT_EQ(Pitch(), 0.1);
    ScanDirection direction = ScanDirection_Reverse;
    MultiPass multiPass = MultiPass_AllOrientations;
    line_->get_ScanDirection(&direction);
    line_->get_MultiPass(&multiPass);
    EXPECT_EQ(direction, ScanDirection_Forward);
    EXPECT_EQ(multiPass, MultiPass_None);
    CComPtr<ITransformationMatrix2D> matrix;
    ASSERT_EQ(line_->get_TransformationMatrix(&matrix), S_OK);
    EXPECT_EQ(ReadMatrix(matrix), TransformationMatrix{});

    EXPECT_TRUE(QueryAs<IExclusionAwarePattern>(line_.Get()));
    EXPECT_TRUE(QueryAs<ICloneablePattern>(line_.Get()));
    auto errorInfo = QueryAs<ISupportErrorInfo>(line_.Get());
    ASSERT_TRUE(errorInfo);
    EXPECT_EQ(errorInfo->InterfaceSupportsErrorInfo(IID_IPatternLine), S_OK);
    EXPECT_EQ(errorInfo->InterfaceSupportsErrorInfo(IID_IPattern), S_OK);
}

TEST_F(LineTest, RendersTheDefaultDiagonalWithBlanking) {
    // N = 15 points from 16714 by 2317 to 49152 on both axes (45 degrees, sX = trunc(2317.05)), 40 ticks
    // each; one pre-blanking point of 40 ticks (0x02), one asymmetry point of 2 ticks (0x00), one
    // post-blanking point of 40 ticks (0x02) at the last point.
    CComPtr<IScanDefinition> definition;
    ASSERT_EQ(line_->Render(&definition), S_OK);
    std::uint32_t updatePoints = 0;
    definition->get_AcquisitionUpdatePoints(&updatePoints);
    EXPECT_EQ(updatePoints, 16666u); // trunc((1/60) / 1e-6)

    const auto points = RenderedPoints(line_);
    ASSERT_EQ(points.size(), 18u);
    EXPECT_EQ(points[0], MakePoint(16714, 16714, 40, PointFlag_Blank));
    EXPECT_EQ(points[1], MakePoint(16714, 16714, 2, 0));
    EXPECT_EQ(points[2], MakePoint(16714, 16714, 40, PointFlag_Acquire));
    EXPECT_EQ(points[9], MakePoint(16714 + 7 * 2317, 16714 + 7 * 2317, 40, PointFlag_Acquire));
    EXPECT_EQ(points[16], MakePoint(49152, 49152, 40, PointFlag_Acquire));
    EXPECT_EQ(points[17], MakePoint(49152, 49152, 40, PointFlag_Blank));
}

TEST_F(LineTest, DwellRampAndReturnPassAreRendered) {
    // (0, 0.5) to (0.2, 0.5): N = 3, steps of trunc(3276.8) = 3276 from DAC 16384 + 6553 = 22937 back;
    // dwell 1e-6 -> 3e-6 at r = 2.5e-8 gives 40, 80, 120; the return pass plays them backwards.
    ASSERT_EQ(line_->put_Begin(CreateCoordinate({0.0, 0.5})), S_OK);
    ASSERT_EQ(line_->put_End(CreateCoordinate({0.2, 0.5})), S_OK);
    ASSERT_EQ(line_->put_EndDwellTime(3e-6), S_OK);
    ASSERT_EQ(line_->put_MultiPass(MultiPass_OneOrientation), S_OK);
    const auto points = RenderedPoints(line_);
    ASSERT_EQ(points.size(), 9u);
    const std::uint16_t x0 = 22937 - 2 * 3276;
    EXPECT_EQ(points[2], MakePoint(x0, 32768, 40, PointFlag_Acquire));
    EXPECT_EQ(points[3], MakePoint(x0 + 3276, 32768, 80, PointFlag_Acquire));
    EXPECT_EQ(points[4], MakePoint(22937, 32768, 120, PointFlag_Acquire));
    EXPECT_EQ(points[5], points[4]);
    EXPECT_EQ(points[6], points[3]);
    EXPECT_EQ(points[7], points[2]);
    EXPECT_EQ(points[8], MakePoint(x0, 32768, 40, PointFlag_Blank));
}

TEST_F(LineTest, RefusedPlainValuesKeepTheStoredOnesWithoutAMessage) {
    for (double pitch : {0.0, 1.0, -0.1, kNaN, kInfinity}) {
        EXPECT_EQ(line_->put_Pitch(pitch), E_INVALIDARG) << pitch;
        EXPECT_EQ(Pitch(), 0.1);
    }
    for (double dwell : {0.0, -1.0, kNaN, kInfinity}) {
        EXPECT_EQ(line_->put_BeginDwellTime(dwell), E_INVALIDARG) << dwell;
        EXPECT_EQ(line_->put_EndDwellTime(dwell), E_INVALIDARG) << dwell;
        double begin = 0.0, end = 0.0;
        line_->get_BeginDwellTime(&begin);
        line_->get_EndDwellTime(&end);
        EXPECT_EQ(begin, 1e-6);
        EXPECT_EQ(end, 1e-6);
    }
    ASSERT_EQ(line_->put_MultiPass(MultiPass_OneOrientation), S_OK);
    for (auto value : {MultiPass_AllOrientations, MultiPass{3}, MultiPass{-1}}) {
        EXPECT_EQ(line_->put_MultiPass(value), E_INVALIDARG) << value;
        MultiPass stored = MultiPass_None;
        line_->get_MultiPass(&stored);
        EXPECT_EQ(stored, MultiPass_OneOrientation);
    }
    EXPECT_FALSE(TakeErrorReport().has_value());

    EXPECT_EQ(line_->put_Pitch(0.999), S_OK);
    EXPECT_EQ(Pitch(), 0.999);
    EXPECT_EQ(line_->put_ScanDirection(ScanDirection{7}), S_OK);
    ScanDirection direction = ScanDirection_Forward;
    line_->get_ScanDirection(&direction);
    EXPECT_EQ(direction, 7);
}

TEST_F(LineTest, RefusedObjectValuesCarryTheirMessageAndKeepTheStoredOnes) {
    struct Case {
        const char* name;
        HRESULT (*put)(IPatternLine*);
        std::u16string message;
    };
    const Case cases[] = {
        {"begin outside",
         [](IPatternLine* l) {
             return l->put_Begin(CreateCoordinate({1.0000001, 0.5}));
         },
         u"Begin values not correct"},
        {"begin null", [](IPatternLine* l) { return l->put_Begin(nullptr); }, u"Begin object is null"},
        {"end outside",
         [](IPatternLine* l) {
             return l->put_End(CreateCoordinate({0.5, -0.1}));
         },
         u"End values not correct"},
        {"end null", [](IPatternLine* l) { return l->put_End(nullptr); }, u"End object is null"},
        {"matrix null", [](IPatternLine* l) { return l->put_TransformationMatrix(nullptr); },
         u"TransformationMatrix object is null"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(c.put(line_), E_INVALIDARG);
        ExpectError(IID_IPatternLine, c.message);
    }
    EXPECT_EQ(Begin(), (coordinate<double>{0.0, 0.0}));
    CComPtr<ICoordinateFloat> end;
    line_->get_End(&end);
    EXPECT_EQ(ReadCoordinate(end), (coordinate<double>{1.0, 1.0}));

    EXPECT_EQ(line_->put_Begin(CreateCoordinate({1.0, 1.0})), S_OK); // bounds are inclusive
    EXPECT_EQ(Begin(), (coordinate<double>{1.0, 1.0}));
}

TEST_F(LineTest, LoopTimeDoublesOnlyTheEffectivePartForAReturnPass) {
    // E = 15 x (1e-6 + 1e-6) / 2 = 1.5e-5; loop = (1e-6 + 5e-8) + E * k + 1e-6.
    double effective = 0.0, loop = 0.0;
    ASSERT_EQ(line_->GetEffectiveLoopTime(&effective), S_OK);
    ASSERT_EQ(line_->GetLoopTime(&loop), S_OK);
    EXPECT_DOUBLE_EQ(effective, 1.5e-5);
    EXPECT_DOUBLE_EQ(loop, 1.705e-5);

    ASSERT_EQ(line_->put_MultiPass(MultiPass_OneOrientation), S_OK);
    ASSERT_EQ(line_->GetEffectiveLoopTime(&effective), S_OK);
    ASSERT_EQ(line_->GetLoopTime(&loop), S_OK);
    EXPECT_DOUBLE_EQ(effective, 1.5e-5);
    EXPECT_DOUBLE_EQ(loop, 3.205e-5);
}

TEST_F(LineTest, DwellTimesBelowTheResolutionMakeThePatternInvalid) {
    // Target 2e-6 s is coarser than the resolution any dwell here needs, so it becomes the resolution.
    struct Case {
        double endDwellTime;
        std::u16string description;
    };
    const Case cases[] = {
        {1e-6, u"BeginDwellTime out of range. EndDwellTime out of range. "},
        {3e-6, u"BeginDwellTime out of range. "},
    };
    SetTargetResolution(2e-6);
    for (const Case& c : cases) {
        ASSERT_EQ(line_->put_EndDwellTime(c.endDwellTime), S_OK);
        CComPtr<IPatternValidationResult> result;
        ASSERT_EQ(line_->Validate(&result), S_OK);
        VARIANT_BOOL valid = VARIANT_TRUE;
        CComBSTR description;
        result->get_Valid(&valid);
        result->get_Description(&description);
        EXPECT_EQ(valid, VARIANT_FALSE);
        EXPECT_EQ(std::u16string(description.View()), c.description);

        CComPtr<IScanDefinition> definition;
        EXPECT_EQ(line_->Render(&definition), E_INVALIDARG);
        EXPECT_FALSE(definition);
        ExpectError(IID_IExclusionAwarePattern, c.description);
        double time = 0.0;
        EXPECT_EQ(line_->GetLoopTime(&time), E_INVALIDARG);
        ExpectError(IID_IPatternLine, c.description);
        EXPECT_EQ(line_->GetEffectiveLoopTime(&time), E_INVALIDARG);
        ExpectError(IID_IPatternLine, c.description);
    }
}

TEST_F(LineTest, TranslationPastTheFieldEdgeClampsInsteadOfWrapping) {
    // Shift by 0.75 in X: DAC X' = 16384 + 32768 (x + 0.75), beyond 65535 for x >= 0.75 (DAC 40960), so
    // forward points 11..14 (16714 + i 2317 >= 40960) stand at 65535 rather than wrapping to small values
    // (the anchor would wrap to 73728 - 65536 = 8192). The first point 16714 moves to 41290. Y is unchanged.
    ASSERT_EQ(line_->put_TransformationMatrix(CreateMatrix({1.0, 0.0, 0.75, 0.0, 1.0, 0.0})), S_OK);
    const auto points = RenderedPoints(line_);
    ASSERT_EQ(points.size(), 18u);
    EXPECT_EQ(points[2].x, 41290);
    for (std::size_t i = 11; i < 15; ++i) {
        EXPECT_EQ(points[2 + i].x, 65535) << "point " << i;
        EXPECT_EQ(points[2 + i].y, 16714 + i * 2317) << "point " << i;
    }
    EXPECT_EQ(points[17], MakePoint(65535, 49152, 40, PointFlag_Blank));
}

TEST_F(LineTest, DacBoundingBoxTransformsTheTwoOrderedCorners) {
    // Begin (0.75, 0.25), End (0.25, 0.5): corners (0.25, 0.25) and (0.75, 0.5).
    ASSERT_EQ(line_->put_Begin(CreateCoordinate({0.75, 0.25})), S_OK);
    ASSERT_EQ(line_->put_End(CreateCoordinate({0.25, 0.5})), S_OK);
    CComPtr<IRectangleInt> box;
    ASSERT_EQ(line_->GetDacBoundingBox(&box), S_OK);
    EXPECT_EQ(ReadRectangleInt(box), (RectangleInt{24576, 24576, 40960, 32768}));

    // Mirrored x' = 0.9 - x: the corners go to x 0.65 (DAC 37683) and 0.15 (DAC 21299) and are reordered.
    ASSERT_EQ(line_->put_TransformationMatrix(CreateMatrix({-1.0, 0.0, 0.9, 0.0, 1.0, 0.0})), S_OK);
    box.Release();
    ASSERT_EQ(line_->GetDacBoundingBox(&box), S_OK);
    EXPECT_EQ(ReadRectangleInt(box), (RectangleInt{21299, 24576, 37683, 32768}));
}

void SetEveryProperty(IPatternLine* line) {
    CheckResult(line->put_Begin(CreateCoordinate({0.1, 0.2})));
    CheckResult(line->put_End(CreateCoordinate({0.7, 0.9})));
    CheckResult(line->put_BeginDwellTime(2e-6));
    CheckResult(line->put_EndDwellTime(5e-6));
    CheckResult(line->put_Pitch(0.05));
    CheckResult(line->put_ScanDirection(ScanDirection_Reverse));
    CheckResult(line->put_TransformationMatrix(CreateMatrix({0.9, 0.1, 0.02, -0.1, 0.9, 0.03})));
    CheckResult(line->put_MultiPass(MultiPass_OneOrientation));
    CheckResult(line->put_AcquisitionUpdateInterval(0.5));
    CheckResult(line->put_EnableGatePulse(VARIANT_TRUE));
    CheckResult(line->put_ScanSynchronizationSource(ScanSynchronizationSource_External));
    CComPtr<IPatternRenderingProperties> properties;
    CheckResult(line->get_RenderingProperties(&properties));
    CheckResult(properties->put_PreBlankingTime(3e-6));
    CheckResult(line->put_RenderingProperties(properties));
}

void ExpectEveryPropertySet(IPatternLine* line) {
    CComPtr<ICoordinateFloat> begin, end;
    CComPtr<ITransformationMatrix2D> matrix;
    CComPtr<IPatternRenderingProperties> properties;
    double beginDwell = 0.0, endDwell = 0.0, pitch = 0.0, interval = 0.0, preBlanking = 0.0;
    ScanDirection direction = ScanDirection_Forward;
    MultiPass multiPass = MultiPass_None;
    VARIANT_BOOL gatePulse = VARIANT_FALSE;
    ScanSynchronizationSource source = ScanSynchronizationSource_None;
    CheckResult(line->get_Begin(&begin));
    CheckResult(line->get_End(&end));
    CheckResult(line->get_BeginDwellTime(&beginDwell));
    CheckResult(line->get_EndDwellTime(&endDwell));
    CheckResult(line->get_Pitch(&pitch));
    CheckResult(line->get_ScanDirection(&direction));
    CheckResult(line->get_TransformationMatrix(&matrix));
    CheckResult(line->get_MultiPass(&multiPass));
    CheckResult(line->get_AcquisitionUpdateInterval(&interval));
    CheckResult(line->get_EnableGatePulse(&gatePulse));
    CheckResult(line->get_ScanSynchronizationSource(&source));
    CheckResult(line->get_RenderingProperties(&properties));
    CheckResult(properties->get_PreBlankingTime(&preBlanking));
    EXPECT_EQ(ReadCoordinate(begin), (coordinate<double>{0.1, 0.2}));
    EXPECT_EQ(ReadCoordinate(end), (coordinate<double>{0.7, 0.9}));
    EXPECT_EQ(beginDwell, 2e-6);
    EXPECT_EQ(endDwell, 5e-6);
    EXPECT_EQ(pitch, 0.05);
    EXPECT_EQ(direction, ScanDirection_Reverse);
    EXPECT_EQ(ReadMatrix(matrix), (TransformationMatrix{0.9, 0.1, 0.02, -0.1, 0.9, 0.03}));
    EXPECT_EQ(multiPass, MultiPass_OneOrientation);
    EXPECT_EQ(interval, 0.5);
    EXPECT_EQ(gatePulse, VARIANT_TRUE);
    EXPECT_EQ(source, ScanSynchronizationSource_External);
    EXPECT_EQ(preBlanking, 3e-6);
}

TEST_F(LineTest, CloneAndCopyToCopyEveryProperty) {
    SetEveryProperty(line_);
    auto cloneable = QueryAs<ICloneablePattern>(line_.Get());

    CComPtr<IPattern> clone;
    ASSERT_EQ(cloneable->Clone(&clone), S_OK);
    auto clonedLine = QueryAs<IPatternLine>(clone.Get());
    ASSERT_TRUE(clonedLine);
    EXPECT_NE(clonedLine.Get(), line_.Get());
    ExpectEveryPropertySet(clonedLine);
    EXPECT_EQ(RenderedPoints(clone), RenderedPoints(line_));

    auto target = NewLine();
    ASSERT_EQ(cloneable->CopyTo(target), S_OK);
    ExpectEveryPropertySet(target);
}

TEST_F(LineTest, CopyToWithoutATargetIsRefused) {
    EXPECT_EQ(QueryAs<ICloneablePattern>(line_.Get())->CopyTo(nullptr), E_INVALIDARG);
    ExpectError(IID_ICloneablePattern, u"pIPattern object is null");
}

TEST_F(LineTest, AutomationReachesPropertiesAndRenderByName) {
    auto dispatch = QueryAs<IDispatch>(line_.Get());
    ASSERT_TRUE(dispatch);
    std::u16string pitchName = u"Pitch";
    std::u16string renderName = u"Render";
    LPOLESTR names[] = {pitchName.data(), renderName.data()};
    DISPID pitch = DISPID_UNKNOWN;
    DISPID render = DISPID_UNKNOWN;
    ASSERT_EQ(dispatch->GetIDsOfNames(GUID_NULL, &names[0], 1, 0, &pitch), S_OK);
    ASSERT_EQ(dispatch->GetIDsOfNames(GUID_NULL, &names[1], 1, 0, &render), S_OK);

    CComVariant value(0.25);
    DISPID putId = DISPID_PROPERTYPUT;
    DISPPARAMS put{&value, &putId, 1, 1};
    ASSERT_EQ(dispatch->Invoke(pitch, GUID_NULL, 0, DISPATCH_PROPERTYPUT, &put, nullptr, nullptr, nullptr),
              S_OK);
    EXPECT_EQ(Pitch(), 0.25);

    DISPPARAMS none{nullptr, nullptr, 0, 0};
    CComVariant result;
    ASSERT_EQ(dispatch->Invoke(render, GUID_NULL, 0, DISPATCH_METHOD, &none, &result, nullptr, nullptr),
              S_OK);
    ASSERT_EQ(result.vt, VT_DISPATCH);
    EXPECT_TRUE(QueryAs<IScanDefinition>(result.pdispVal));
}

TEST_F(LineTest, AcceptHandsTheLineToItsVisitorMethod) {
    auto visitor = CComObjectEx<RecordingVisitor>::CreateInstance<IPatternShapeVisitor>();
    EXPECT_EQ(line_->Accept(visitor), S_FALSE);
    EXPECT_EQ(static_cast<RecordingVisitor*>(visitor.Get())->visited.Get(), line_.Get());
    EXPECT_EQ(line_->Accept(nullptr), E_POINTER);
}

} // namespace
} // namespace Norvane::Lumis::Scanning
