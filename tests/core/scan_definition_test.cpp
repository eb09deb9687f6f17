#include "core/scan_definition_factory.h"

#include "comtypes/comtypes_registration.h"
#include "dwellmap/dwellmap_registration.h"
#include "module/create_instance.h"
#include "platform/dispatch_impl.h"

#include <gtest/gtest.h>

#include <functional>
#include <stdexcept>
#include <string>

namespace {

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

constexpr ScanSynchronizationSource kSource = ScanSynchronizationSource_External;
constexpr std::uint32_t kGateTicks = 40;
constexpr std::uint32_t kAcquisitionPoints = 123456;
constexpr SizeInt kImageSize{768, 512};
constexpr RectangleInt kSelectedArea{-3, 10, 700, 500};

class ScanDefinitionTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComTypesClasses();
        RegisterDwellmapClasses();
        collection_ = Norvane::CreateInstance<ISubPatternCollection>(CLSID_SubPatternCollection);
    }

    // The collection's reference count, read through the counts AddRef and Release return.
    ULONG CollectionReferences() const {
        collection_->AddRef();
        return collection_->Release();
    }

    // Distinct values per field, so a getter that reads the wrong field fails.
    CComPtr<IScanDefinition> MakeRaster() const {
        return CreateRasterScanDefinition(collection_, kSource, kGateTicks, kAcquisitionPoints, kImageSize, 2,
                                          3, 4, 5, 6, kSelectedArea);
    }

    CComPtr<IScanDefinition> MakePattern(bool allowNavigation, bool blankBetween) const {
        return CreatePatternScanDefinition(collection_, kSource, kGateTicks, kAcquisitionPoints,
                                           allowNavigation, blankBetween);
    }

    CComPtr<ISubPatternCollection> collection_;
};

void ExpectSharedValues(IScanDefinition* definition) {
    ScanSynchronizationSource source = ScanSynchronizationSource_None;
    std::uint32_t gate = 0;
    std::uint32_t acquisition = 0;
    EXPECT_EQ(definition->get_ScanSynchronizationSource(&source), S_OK);
    EXPECT_EQ(definition->get_GatePulseIdleTicks(&gate), S_OK);
    EXPECT_EQ(definition->get_AcquisitionUpdatePoints(&acquisition), S_OK);
    EXPECT_EQ(source, kSource);
    EXPECT_EQ(gate, kGateTicks);
    EXPECT_EQ(acquisition, kAcquisitionPoints);
}

struct SwitchCase {
    bool allowNavigation;
    bool blankBetween;
};

class PatternSwitchesTest : public ScanDefinitionTest, public ::testing::WithParamInterface<SwitchCase> {};

TEST_P(PatternSwitchesTest, GettersReturnTheValuesGivenAtCreation) {
    auto definition = QueryAs<IPatternScanDefinition>(
        MakePattern(GetParam().allowNavigation, GetParam().blankBetween).Get());
    ASSERT_TRUE(definition);
    ExpectSharedValues(definition);

    VARIANT_BOOL allow = VARIANT_BOOL(1);
    VARIANT_BOOL blank = VARIANT_BOOL(1);
    EXPECT_EQ(definition->get_AllowSubPatternNavigation(&allow), S_OK);
    EXPECT_EQ(definition->get_BlankBeamBetweenSubPatterns(&blank), S_OK);
    EXPECT_EQ(allow, ToVariantBool(GetParam().allowNavigation));
    EXPECT_EQ(blank, ToVariantBool(GetParam().blankBetween));
}

INSTANTIATE_TEST_SUITE_P(BothSwitchesEachWay, PatternSwitchesTest,
                         ::testing::Values(SwitchCase{false, false}, SwitchCase{true, false},
                                           SwitchCase{false, true}, SwitchCase{true, true}));

TEST_F(ScanDefinitionTest, RasterGettersReturnTheValuesGivenAtCreation) {
    auto definition = QueryAs<IRasterScanDefinition>(MakeRaster().Get());
    ASSERT_TRUE(definition);
    ExpectSharedValues(definition);

    std::int32_t interlace = 0, scanType = 0, orientation = 0, lineDirection = 0, frameDirection = 0;
    EXPECT_EQ(definition->get_LineInterlace(&interlace), S_OK);
    EXPECT_EQ(definition->get_ScanType(&scanType), S_OK);
    EXPECT_EQ(definition->get_LineScanOrientation(&orientation), S_OK);
    EXPECT_EQ(definition->get_LineScanDirection(&lineDirection), S_OK);
    EXPECT_EQ(definition->get_FrameScanDirection(&frameDirection), S_OK);
    EXPECT_EQ(interlace, 2);
    EXPECT_EQ(scanType, 3);
    EXPECT_EQ(orientation, 4);
    EXPECT_EQ(lineDirection, 5);
    EXPECT_EQ(frameDirection, 6);
}

TEST_F(ScanDefinitionTest, ImageSizeIsANewObjectOnEveryCall) {
    auto definition = QueryAs<IRasterScanDefinition>(MakeRaster().Get());
    CComPtr<ISizeInt> first;
    CComPtr<ISizeInt> second;
    ASSERT_EQ(definition->get_ImageSize(&first), S_OK);
    ASSERT_EQ(definition->get_ImageSize(&second), S_OK);
    EXPECT_NE(QueryAs<IUnknown>(first.Get()).Get(), QueryAs<IUnknown>(second.Get()).Get());

    // Changing a handed-out copy leaves the stored size alone.
    ASSERT_EQ(first->put_Width(1), S_OK);
    std::int32_t width = 0, height = 0;
    EXPECT_EQ(second->get_Width(&width), S_OK);
    EXPECT_EQ(second->get_Height(&height), S_OK);
    EXPECT_EQ(width, kImageSize.width);
    EXPECT_EQ(height, kImageSize.height);
}

TEST_F(ScanDefinitionTest, SelectedAreaIsANewObjectOnEveryCall) {
    auto definition = QueryAs<IRasterScanDefinition>(MakeRaster().Get());
    CComPtr<IRectangleInt> first;
    CComPtr<IRectangleInt> second;
    ASSERT_EQ(definition->get_SelectedArea(&first), S_OK);
    ASSERT_EQ(definition->get_SelectedArea(&second), S_OK);
    EXPECT_NE(QueryAs<IUnknown>(first.Get()).Get(), QueryAs<IUnknown>(second.Get()).Get());

    ASSERT_EQ(first->put_Left(99), S_OK);
    RectangleInt read;
    EXPECT_EQ(second->get_Left(&read.left), S_OK);
    EXPECT_EQ(second->get_Top(&read.top), S_OK);
    EXPECT_EQ(second->get_Right(&read.right), S_OK);
    EXPECT_EQ(second->get_Bottom(&read.bottom), S_OK);
    EXPECT_EQ(read, kSelectedArea);
}

TEST_F(ScanDefinitionTest, EachDefinitionHoldsOneReferenceToItsCollection) {
    const ULONG before = CollectionReferences();
    {
        auto pattern = MakePattern(false, false);
        auto raster = MakeRaster();
        EXPECT_EQ(CollectionReferences(), before + 2);
    }
    EXPECT_EQ(CollectionReferences(), before);
}

TEST_F(ScanDefinitionTest, CollectionGetterHandsOutTheStoredCollectionWithANewReference) {
    auto definition = MakePattern(false, false);
    const ULONG held = CollectionReferences();
    ISubPatternCollection* returned = nullptr;
    ASSERT_EQ(definition->get_SubPatternCollection(&returned), S_OK);
    EXPECT_EQ(returned, collection_.Get());
    EXPECT_EQ(CollectionReferences(), held + 1);
    returned->Release();
}

TEST_F(ScanDefinitionTest, CollectionOutlivesTheDefinitionForItsHolders) {
    CComPtr<ISubPatternCollection> fromDefinition;
    {
        auto definition = MakeRaster();
        ASSERT_EQ(definition->get_SubPatternCollection(&fromDefinition), S_OK);
    }
    collection_.Release();
    std::int32_t count = -1;
    EXPECT_EQ(fromDefinition->get_Count(&count), S_OK);
    EXPECT_EQ(count, 0);
}

TEST_F(ScanDefinitionTest, PatternDefinitionAnswersOnlyItsOwnInterfaces) {
    auto definition = MakePattern(false, false);
    EXPECT_TRUE(QueryAs<IPatternScanDefinition>(definition.Get()));
    EXPECT_TRUE(QueryAs<IDispatch>(definition.Get()));
    EXPECT_FALSE(QueryAs<IRasterScanDefinition>(definition.Get()));
    EXPECT_FALSE(QueryAs<ISupportErrorInfo>(definition.Get()));
}

TEST_F(ScanDefinitionTest, RasterDefinitionAnswersOnlyItsOwnInterfaces) {
    auto definition = MakeRaster();
    EXPECT_TRUE(QueryAs<IRasterScanDefinition>(definition.Get()));
    EXPECT_TRUE(QueryAs<IDispatch>(definition.Get()));
    EXPECT_FALSE(QueryAs<IPatternScanDefinition>(definition.Get()));
    EXPECT_FALSE(QueryAs<ISupportErrorInfo>(definition.Get()));
}

TEST_F(ScanDefinitionTest, NullCollectionIsRefused) {
    EXPECT_THROW(CreatePatternScanDefinition(nullptr, kSource, 0, 0, false, false), std::invalid_argument);
    EXPECT_THROW(CreateRasterScanDefinition(nullptr, kSource, 0, 0, kImageSize, 0, 0, 0, 0, 0, kSelectedArea),
                 std::invalid_argument);
}

TEST_F(ScanDefinitionTest, EveryGetterRefusesANullOutPointer) {
    auto pattern = QueryAs<IPatternScanDefinition>(MakePattern(true, true).Get());
    auto raster = QueryAs<IRasterScanDefinition>(MakeRaster().Get());
    struct Case {
        const char* name;
        std::function<HRESULT()> call;
    };
    const Case cases[] = {
        {"SubPatternCollection", [&] { return pattern->get_SubPatternCollection(nullptr); }},
        {"ScanSynchronizationSource", [&] { return pattern->get_ScanSynchronizationSource(nullptr); }},
        {"GatePulseIdleTicks", [&] { return pattern->get_GatePulseIdleTicks(nullptr); }},
        {"AcquisitionUpdatePoints", [&] { return pattern->get_AcquisitionUpdatePoints(nullptr); }},
        {"AllowSubPatternNavigation", [&] { return pattern->get_AllowSubPatternNavigation(nullptr); }},
        {"BlankBeamBetweenSubPatterns", [&] { return pattern->get_BlankBeamBetweenSubPatterns(nullptr); }},
        {"raster SubPatternCollection", [&] { return raster->get_SubPatternCollection(nullptr); }},
        {"ImageSize", [&] { return raster->get_ImageSize(nullptr); }},
        {"LineInterlace", [&] { return raster->get_LineInterlace(nullptr); }},
        {"ScanType", [&] { return raster->get_ScanType(nullptr); }},
        {"LineScanOrientation", [&] { return raster->get_LineScanOrientation(nullptr); }},
        {"LineScanDirection", [&] { return raster->get_LineScanDirection(nullptr); }},
        {"FrameScanDirection", [&] { return raster->get_FrameScanDirection(nullptr); }},
        {"SelectedArea", [&] { return raster->get_SelectedArea(nullptr); }},
    };
    for (const auto& c : cases)
        EXPECT_EQ(c.call(), E_POINTER) << c.name;
}

TEST_F(ScanDefinitionTest, AutomationReadsSharedValuesByName) {
    auto dispatch = QueryAs<IDispatch>(MakeRaster().Get());
    ASSERT_TRUE(dispatch);
    std::u16string name = u"GatePulseIdleTicks";
    LPOLESTR names[] = {name.data()};
    DISPID id = DISPID_UNKNOWN;
    ASSERT_EQ(dispatch->GetIDsOfNames(GUID_NULL, names, 1, 0, &id), S_OK);

    DISPPARAMS none{nullptr, nullptr, 0, 0};
    CComVariant result;
    ASSERT_EQ(dispatch->Invoke(id, GUID_NULL, 0, DISPATCH_PROPERTYGET, &none, &result, nullptr, nullptr),
              S_OK);
    EXPECT_EQ(result.vt, VT_UI4);
    EXPECT_EQ(result.ulVal, kGateTicks);
}

} // namespace
