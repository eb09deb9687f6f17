#include "core/point_buffer_view.h"
#include "module/geometry_io.h"
#include "support/test_pattern.h"

#include <gtest/gtest.h>

#include <vector>

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;
using namespace Norvane::Lumis::Scanning::Testing;

namespace {

class RenderPipelineTest : public ::testing::Test {
protected:
    void SetUp() override {
        RegisterTestComponents();
        pattern = MakeTestPattern(&object);
    }

    CComPtr<ISubPatternCollection> Collection(IScanDefinition* definition) {
        CComPtr<ISubPatternCollection> collection;
        EXPECT_EQ(definition->get_SubPatternCollection(&collection), S_OK);
        return collection;
    }

    std::vector<PatternPoint> PointsOf(IScanDefinition* definition) {
        CComPtr<ISubPattern> sub;
        EXPECT_EQ(Collection(definition)->Item(0, &sub), S_OK);
        CComPtr<IPatternPointList> list;
        EXPECT_EQ(sub->get_PointList(&list), S_OK);
        PointBufferView view(list);
        return {view.Points().begin(), view.Points().end()};
    }

    CComPtr<IPatternShape> pattern;
    CTestPattern* object = nullptr;
};

// Three points at relative (0,0), (0.5,0.5), (1,1) with 1e-6 s dwell at 2.5e-8 s: 40 ticks each.
TEST_F(RenderPipelineTest, OneSubPatternWithLeadInPointsAndPostBlanking) {
    CComPtr<IScanDefinition> definition;
    ASSERT_EQ(pattern->Render(&definition), S_OK);
    const std::vector<PatternPoint> expected{
        MakePoint(16384, 16384, 40, PointFlag_Blank), // pre-blanking at the first point
        MakePoint(16384, 16384, 2, 0),                // start asymmetry
        MakePoint(16384, 16384, 40, PointFlag_Acquire),
        MakePoint(32768, 32768, 40, PointFlag_Acquire),
        MakePoint(49152, 49152, 40, PointFlag_Acquire),
        MakePoint(49152, 49152, 40, PointFlag_Blank), // post-blanking at the last point
    };
    EXPECT_EQ(PointsOf(definition), expected);

    CComPtr<ISubPatternCollection> collection = Collection(definition);
    std::int32_t count = 0;
    collection->get_Count(&count);
    EXPECT_EQ(count, 1);
    CComPtr<ISubPattern> sub;
    collection->Item(0, &sub);
    std::uint16_t offsetX = 1, offsetY = 1;
    std::uint32_t repeat = 0;
    sub->get_OffsetX(&offsetX);
    sub->get_OffsetY(&offsetY);
    sub->get_RepeatCount(&repeat);
    EXPECT_EQ(offsetX, 0);
    EXPECT_EQ(offsetY, 0);
    EXPECT_EQ(repeat, 1u);
    double resolution = 0;
    collection->get_DwellTimeResolution(&resolution);
    EXPECT_DOUBLE_EQ(resolution, 2.5e-8);
    CComPtr<IRectangleInt> field;
    ASSERT_EQ(collection->get_FieldOfView(&field), S_OK);
    EXPECT_EQ(ReadRectangleInt(field), (RectangleInt{16384, 16384, 49152, 49152}));
}

TEST_F(RenderPipelineTest, GatePulseTicksOnlyWhenEnabledAndAcquisitionPointsFromMeanDwell) {
    CComPtr<IScanDefinition> definition;
    ASSERT_EQ(pattern->Render(&definition), S_OK);
    std::uint32_t gate = 99, acquisition = 0;
    definition->get_GatePulseIdleTicks(&gate);
    definition->get_AcquisitionUpdatePoints(&acquisition);
    EXPECT_EQ(gate, 0u);
    EXPECT_EQ(acquisition, 16666u); // trunc((1/60) / 1e-6)

    pattern->put_EnableGatePulse(VARIANT_TRUE);
    definition.Release();
    ASSERT_EQ(pattern->Render(&definition), S_OK);
    definition->get_GatePulseIdleTicks(&gate);
    EXPECT_EQ(gate, 48u); // ceil(1.2e-6 / 2.5e-8)
}

TEST_F(RenderPipelineTest, MatrixTransformsEveryRenderedPoint) {
    // A quarter of the field to the right, about the origin.
    object->SetTransformationMatrix({1, 0, 0.25, 0, 1, 0});
    CComPtr<IScanDefinition> definition;
    ASSERT_EQ(pattern->Render(&definition), S_OK);
    const auto points = PointsOf(definition);
    EXPECT_EQ(points[2], MakePoint(24576, 16384, 40, PointFlag_Acquire)); // 16384 + 8192
    EXPECT_EQ(points[4], MakePoint(57344, 49152, 40, PointFlag_Acquire));
}

TEST_F(RenderPipelineTest, FilterShortensTheListInPlace) {
    CComPtr<IPatternPointFilter> filter;
    ASSERT_EQ(ComCreator<CTestFilter>::CreateInstance(nullptr, IPatternPointFilter::iid,
                                                      reinterpret_cast<void**>(&filter), std::uint16_t{40000}),
              S_OK);
    CComPtr<IExclusionAwarePattern> aware;
    ASSERT_EQ(pattern.QueryInterface(&aware), S_OK);
    CComPtr<IScanDefinition> definition;
    ASSERT_EQ(aware->RenderWithExclusion(filter, &definition), S_OK);
    const auto points = PointsOf(definition);
    ASSERT_EQ(points.size(), 5u); // the exposing point at 49152 is gone
    EXPECT_EQ(points[3], MakePoint(32768, 32768, 40, PointFlag_Acquire));
    EXPECT_EQ(points[4], MakePoint(49152, 49152, 40, PointFlag_Blank));
}

TEST_F(RenderPipelineTest, InvalidPatternFailsWithItsDescription) {
    object->SetDwellTime(1e-8); // below the 2.5e-8 s resolution
    CComPtr<IScanDefinition> definition;
    EXPECT_EQ(pattern->Render(&definition), E_INVALIDARG);
    EXPECT_EQ(definition.Get(), nullptr);
    CComPtr<IErrorInfo> info;
    ASSERT_EQ(GetErrorInfo(0, &info), S_OK);
    CComBSTR description;
    info->GetDescription(&description);
    EXPECT_EQ(description.View(), u"DwellTime out of range. ");
}

TEST_F(RenderPipelineTest, RenderingPropertiesGetterHandsOutACopy) {
    CComPtr<IPatternRenderingProperties> properties;
    ASSERT_EQ(pattern->get_RenderingProperties(&properties), S_OK);
    ASSERT_EQ(properties->put_PreBlankingTime(5e-6), S_OK);
    CComPtr<IScanDefinition> definition;
    ASSERT_EQ(pattern->Render(&definition), S_OK);
    EXPECT_EQ(PointsOf(definition)[0].dwell, 40); // unchanged until put back

    ASSERT_EQ(pattern->put_RenderingProperties(properties), S_OK);
    definition.Release();
    ASSERT_EQ(pattern->Render(&definition), S_OK);
    EXPECT_EQ(PointsOf(definition)[0].dwell, 200); // 5e-6 / 2.5e-8
}

TEST_F(RenderPipelineTest, NullRenderingPropertiesAreRefusedWithTheirMessage) {
    EXPECT_EQ(pattern->put_RenderingProperties(nullptr), E_INVALIDARG);
    CComPtr<IErrorInfo> info;
    ASSERT_EQ(GetErrorInfo(0, &info), S_OK);
    CComBSTR description;
    info->GetDescription(&description);
    EXPECT_EQ(description.View(), u"null IPatternRenderingProperties");
}

TEST_F(RenderPipelineTest, GenericMembersStoreWhatTheyAreGiven) {
    EXPECT_EQ(pattern->put_AcquisitionUpdateInterval(-2.0), S_OK);
    double interval = 0;
    pattern->get_AcquisitionUpdateInterval(&interval);
    EXPECT_EQ(interval, -2.0);
    EXPECT_EQ(pattern->put_EnableGatePulse(VARIANT_BOOL(5)), S_OK);
    VARIANT_BOOL gate = VARIANT_FALSE;
    pattern->get_EnableGatePulse(&gate);
    EXPECT_EQ(gate, VARIANT_TRUE);
    GUID clsid{};
    pattern->ClassID(&clsid);
    EXPECT_EQ(clsid, CLSID_TestPattern);
    EXPECT_EQ(pattern->GetDwellTimeResolution(nullptr), E_POINTER);
    EXPECT_EQ(pattern->get_AcquisitionUpdateInterval(nullptr), E_POINTER);
}

TEST(PointsPerIntervalTest, SaturatesInsteadOfWrapping) {
    EXPECT_EQ(PointsPerInterval(1.0 / 60.0, 1e-6), 16666u);
    EXPECT_EQ(PointsPerInterval(-1.0, 1e-6), 0u);
    EXPECT_EQ(PointsPerInterval(1e6, 1e-9), 4294967295u);
    EXPECT_EQ(PointsPerInterval(1.0, 0.0), 4294967295u);
}

} // namespace
