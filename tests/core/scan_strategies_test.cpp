#include "core/scan_strategy_conversions.h"
#include "core/strategy_classes.h"
#include "module/create_instance.h"
#include "platform/dispatch.h"
#include "platform/error_info.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <stdexcept>
#include <string>

namespace {

using namespace Norvane::Lumis::Scanning;

class ScanStrategiesTest : public ::testing::Test {
  protected:
    void SetUp() override { RegisterClasses(StrategyClassEntries()); }
};

// Every field away from its default, to show each one travels on its own.
constexpr RasterStrategy kRaster{ScanOrientation_Vertical, ScanDirection_Reverse, ScanDirection_Forward,
                                 ScanType_Serpentine};
constexpr RectangularStrategy kRectangular{0.25,
                                           0.5,
                                           ScanOrientation_Vertical,
                                           ScanDirection_Forward,
                                           ScanDirection_Reverse,
                                           FillStyle_Frame,
                                           ScanType_Serpentine,
                                           MultiPass_AllOrientations};
constexpr CircularStrategy kCircular{0.002, 0.03, FillStyle_Frame, CircleScanType_OuterToInner,
                                     MultiPass_OneOrientation};

// --- Defaults and creation -------------------------------------------------------------------------

TEST_F(ScanStrategiesTest, RecordDefaultsAreTheDocumentedValues) {
    EXPECT_EQ(RasterStrategy{},
              (RasterStrategy{ScanOrientation(0), ScanDirection(0), ScanDirection(0), ScanType(0)}));
    EXPECT_EQ(RectangularStrategy{},
              (RectangularStrategy{0.1, 0.1, ScanOrientation(0), ScanDirection(0), ScanDirection(0),
                                   FillStyle(0), ScanType(0), MultiPass(0)}));
    EXPECT_EQ(CircularStrategy{},
              (CircularStrategy{0.001, 0.01, FillStyle(0), CircleScanType(0), MultiPass(0)}));
}

TEST_F(ScanStrategiesTest, ObjectsCreatedByClassIdStartFromTheDefaults) {
    using Norvane::CreateInstance;
    EXPECT_EQ(ReadScanStrategyRaster(CreateInstance<IScanStrategyRaster>(CLSID_ScanStrategyRaster)),
              RasterStrategy{});
    EXPECT_EQ(
        ReadScanStrategyRectangular(CreateInstance<IScanStrategyRectangular>(CLSID_ScanStrategyRectangular)),
        RectangularStrategy{});
    EXPECT_EQ(ReadScanStrategyCircular(CreateInstance<IScanStrategyCircular>(CLSID_ScanStrategyCircular)),
              CircularStrategy{});
}

TEST_F(ScanStrategiesTest, EveryClassIsCreatedByItsProgIdAsAScanStrategyWithoutErrorInfo) {
    const struct {
        const char16_t* progId;
        CLSID clsid;
        IID iid;
    } cases[] = {
        {u"Beamweaver.ScanStrategyRaster", CLSID_ScanStrategyRaster, IID_IScanStrategyRaster},
        {u"Beamweaver.ScanStrategyRectangular", CLSID_ScanStrategyRectangular, IID_IScanStrategyRectangular},
        {u"Beamweaver.ScanStrategyCircular", CLSID_ScanStrategyCircular, IID_IScanStrategyCircular},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(std::string(c.progId, c.progId + std::char_traits<char16_t>::length(c.progId)));
        CLSID clsid{};
        ASSERT_EQ(CLSIDFromProgID(c.progId, &clsid), S_OK);
        EXPECT_TRUE(clsid == c.clsid);
        EXPECT_EQ(FindClass(clsid)->threading, ThreadingModel::Free);
        CComPtr<IScanStrategy> strategy;
        ASSERT_EQ(CoCreateInstance(clsid, nullptr, CLSCTX_ALL, IID_IScanStrategy,
                                   reinterpret_cast<void**>(&strategy)),
                  S_OK);
        CComPtr<IUnknown> kind;
        EXPECT_EQ(strategy->QueryInterface(c.iid, reinterpret_cast<void**>(&kind)), S_OK);
        EXPECT_FALSE(QueryAs<ISupportErrorInfo>(strategy.Get()));
    }
}

// --- Unchecked setters and null out pointers -------------------------------------------------------

TEST_F(ScanStrategiesTest, RectangularSettersKeepValuesOnlyPatternsRefuse) {
    auto strategy = MakeScanStrategyRectangular({});
    EXPECT_EQ(strategy->put_PitchX(-0.5), S_OK);
    EXPECT_EQ(strategy->put_PitchY(0.0), S_OK);
    EXPECT_EQ(strategy->put_LineScanOrientation(ScanOrientation(2)), S_OK);
    EXPECT_EQ(strategy->put_LineScanDirection(ScanDirection(-1)), S_OK);
    EXPECT_EQ(strategy->put_FrameScanDirection(ScanDirection(3)), S_OK);
    EXPECT_EQ(strategy->put_FillStyle(FillStyle(7)), S_OK);
    EXPECT_EQ(strategy->put_ScanType(ScanType(4)), S_OK);
    EXPECT_EQ(strategy->put_MultiPass(MultiPass(9)), S_OK);
    EXPECT_EQ(ReadScanStrategyRectangular(strategy),
              (RectangularStrategy{-0.5, 0.0, ScanOrientation(2), ScanDirection(-1), ScanDirection(3),
                                   FillStyle(7), ScanType(4), MultiPass(9)}));
}

TEST_F(ScanStrategiesTest, RasterAndCircularSettersKeepOutOfRangeValues) {
    auto raster = MakeScanStrategyRaster({});
    EXPECT_EQ(raster->put_LineScanOrientation(ScanOrientation(5)), S_OK);
    EXPECT_EQ(raster->put_LineScanDirection(ScanDirection(6)), S_OK);
    EXPECT_EQ(raster->put_FrameScanDirection(ScanDirection(-7)), S_OK);
    EXPECT_EQ(raster->put_ScanType(ScanType(8)), S_OK);
    EXPECT_EQ(ReadScanStrategyRaster(raster),
              (RasterStrategy{ScanOrientation(5), ScanDirection(6), ScanDirection(-7), ScanType(8)}));

    auto circular = MakeScanStrategyCircular({});
    EXPECT_EQ(circular->put_PitchT(-1.0), S_OK);
    EXPECT_EQ(circular->put_PitchR(0.0), S_OK);
    EXPECT_EQ(circular->put_FillStyle(FillStyle(7)), S_OK);
    EXPECT_EQ(circular->put_ScanType(CircleScanType(3)), S_OK);
    EXPECT_EQ(circular->put_MultiPass(MultiPass(9)), S_OK);
    EXPECT_EQ(ReadScanStrategyCircular(circular),
              (CircularStrategy{-1.0, 0.0, FillStyle(7), CircleScanType(3), MultiPass(9)}));
}

TEST_F(ScanStrategiesTest, EveryGetterRefusesANullOutPointer) {
    auto raster = MakeScanStrategyRaster({});
    auto rectangular = MakeScanStrategyRectangular({});
    auto circular = MakeScanStrategyCircular({});
    const struct {
        const char* name;
        std::function<HRESULT()> call;
    } cases[] = {
        {"Raster.LineScanOrientation", [&] { return raster->get_LineScanOrientation(nullptr); }},
        {"Raster.LineScanDirection", [&] { return raster->get_LineScanDirection(nullptr); }},
        {"Raster.FrameScanDirection", [&] { return raster->get_FrameScanDirection(nullptr); }},
        {"Raster.ScanType", [&] { return raster->get_ScanType(nullptr); }},
        {"Rectangular.LineScanOrientation", [&] { return rectangular->get_LineScanOrientation(nullptr); }},
        {"Rectangular.LineScanDirection", [&] { return rectangular->get_LineScanDirection(nullptr); }},
        {"Rectangular.FrameScanDirection", [&] { return rectangular->get_FrameScanDirection(nullptr); }},
        {"Rectangular.ScanType", [&] { return rectangular->get_ScanType(nullptr); }},
        {"Rectangular.PitchX", [&] { return rectangular->get_PitchX(nullptr); }},
        {"Rectangular.PitchY", [&] { return rectangular->get_PitchY(nullptr); }},
        {"Rectangular.FillStyle", [&] { return rectangular->get_FillStyle(nullptr); }},
        {"Rectangular.MultiPass", [&] { return rectangular->get_MultiPass(nullptr); }},
        {"Circular.PitchT", [&] { return circular->get_PitchT(nullptr); }},
        {"Circular.PitchR", [&] { return circular->get_PitchR(nullptr); }},
        {"Circular.FillStyle", [&] { return circular->get_FillStyle(nullptr); }},
        {"Circular.ScanType", [&] { return circular->get_ScanType(nullptr); }},
        {"Circular.MultiPass", [&] { return circular->get_MultiPass(nullptr); }},
    };
    for (const auto& c : cases)
        EXPECT_EQ(c.call(), E_POINTER) << c.name;
}

// --- Conversions -----------------------------------------------------------------------------------

TEST_F(ScanStrategiesTest, MadeObjectsReadBackAsTheRecordTheyWereMadeFrom) {
    EXPECT_EQ(ReadScanStrategyRaster(MakeScanStrategyRaster(kRaster)), kRaster);
    EXPECT_EQ(ReadScanStrategyRectangular(MakeScanStrategyRectangular(kRectangular)), kRectangular);
    EXPECT_EQ(ReadScanStrategyCircular(MakeScanStrategyCircular(kCircular)), kCircular);
}

TEST_F(ScanStrategiesTest, ReadingANullStrategyFailsWithInvalidArgument) {
    const std::function<void()> reads[] = {
        [] { ReadScanStrategyRaster(nullptr); },
        [] { ReadScanStrategyRectangular(nullptr); },
        [] { ReadScanStrategyCircular(nullptr); },
    };
    for (const auto& read : reads) {
        try {
            read();
            ADD_FAILURE() << "no exception";
        } catch (const std::invalid_argument& error) {
            EXPECT_STREQ(error.what(), "ScanStrategy object is null");
        }
    }
}

// --- Automation ------------------------------------------------------------------------------------

DISPID IdOf(IDispatch* object, const char16_t* name) {
    LPOLESTR names[] = {const_cast<LPOLESTR>(name)};
    DISPID id = DISPID_UNKNOWN;
    EXPECT_EQ(object->GetIDsOfNames(GUID_NULL, names, 1, 0, &id), S_OK) << "no member";
    return id;
}

HRESULT PutByName(IDispatch* object, const char16_t* name, CComVariant argument) {
    DISPID named = DISPID_PROPERTYPUT;
    DISPPARAMS params{&argument, &named, 1, 1};
    return object->Invoke(IdOf(object, name), GUID_NULL, 0, DISPATCH_PROPERTYPUT, &params, nullptr, nullptr,
                          nullptr);
}

CComVariant GetByName(IDispatch* object, const char16_t* name) {
    DISPPARAMS none{nullptr, nullptr, 0, 0};
    CComVariant result;
    EXPECT_EQ(object->Invoke(IdOf(object, name), GUID_NULL, 0, DISPATCH_PROPERTYGET, &none, &result, nullptr,
                             nullptr),
              S_OK);
    return result;
}

TEST_F(ScanStrategiesTest, RectangularPropertiesAreSetAndReadByNameThroughAutomation) {
    auto strategy = Norvane::CreateInstance<IScanStrategyRectangular>(CLSID_ScanStrategyRectangular);
    auto dispatch = QueryAs<IDispatch>(strategy.Get());
    ASSERT_TRUE(dispatch);

    EXPECT_EQ(PutByName(dispatch, u"PitchX", CComVariant(0.25)), S_OK);
    EXPECT_EQ(PutByName(dispatch, u"FillStyle", CComVariant(std::int32_t{1})), S_OK);

    const CComVariant pitchX = GetByName(dispatch, u"PitchX");
    EXPECT_EQ(pitchX.vt, VT_R8);
    EXPECT_EQ(pitchX.dblVal, 0.25);
    RectangularStrategy expected;
    expected.pitchX = 0.25;
    expected.fillStyle = FillStyle_Frame;
    EXPECT_EQ(ReadScanStrategyRectangular(strategy), expected);
}

} // namespace
