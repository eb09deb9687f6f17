#include "comtypes/comtypes_registration.h"
#include "core/rendering_classes.h"
#include "core/rendering_conversions.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"
#include "module/hresult_exception.h"
#include "platform/dispatch.h"
#include "platform/error_info.h"

#include "common/error_info_probe.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

using Norvane::testing::TakePublishedErrorInfo;

// Takes the thread's error information out of its slot; nothing when there is none.
auto TakeErrorReport() { return TakePublishedErrorInfo(); }

void ClearErrorReport() {
    SetErrorInfo(0, nullptr);
}

// Expects a failure with the message reported against riid.
void ExpectReported(HRESULT hr, HRESULT expected, REFIID riid, const std::u16string& description) {
    EXPECT_EQ(hr, expected);
    const auto report = TakeErrorReport();
    ASSERT_TRUE(report.has_value());
    EXPECT_TRUE(report->guid == riid);
    EXPECT_EQ(report->description, description);
}

class RenderingPropertiesTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComTypesClasses();
        RegisterClasses(RenderingClassEntries());
        ClearErrorReport();
    }
};

// --- Creation -------------------------------------------------------------------------------------

TEST_F(RenderingPropertiesTest, ClassesCreatedByClassIdStartFromTheRecordDefaults) {
    auto patternAlignments = Norvane::CreateInstance<IPatternAlignments>(CLSID_PatternAlignments);
    EXPECT_EQ(ReadPatternAlignments(patternAlignments, "PatternAlignments"), PatternAlignment{});
    auto rasterAlignments = Norvane::CreateInstance<IRasterAlignments>(CLSID_RasterAlignments);
    EXPECT_EQ(ReadRasterAlignments(rasterAlignments, "RasterAlignments"), RasterAlignment{});
    auto pattern = Norvane::CreateInstance<IPatternRenderingProperties>(CLSID_PatternRenderingProperties);
    EXPECT_EQ(ReadPatternRenderingProperties(pattern), PatternRenderingSettings{});
    auto raster = Norvane::CreateInstance<IRasterRenderingProperties>(CLSID_RasterRenderingProperties);
    EXPECT_EQ(ReadRasterRenderingProperties(raster), RasterRenderingSettings{});
}

TEST_F(RenderingPropertiesTest, RecordDefaultsAreTheDocumentedValues) {
    const PatternRenderingSettings pattern;
    EXPECT_EQ(pattern.targetDwellTimeResolution, 2.5e-8);
    EXPECT_EQ(pattern.gatePulseIdleTime, 1.2e-6);
    EXPECT_EQ(pattern.preBlankingTime, 1e-6);
    EXPECT_EQ(pattern.postBlankingTime, 1e-6);
    EXPECT_EQ(pattern.patternStartAsymmetryTime, 5e-8);
    EXPECT_EQ(pattern.generationStrategy, GenerationStrategy_UseAlignments);
    EXPECT_EQ(pattern.alignmentY.range, (RangeInt{16384, 49152}));
    EXPECT_EQ(pattern.alignmentY.slewRate, 1.5e11);
    const RasterRenderingSettings raster;
    EXPECT_EQ(raster.mainsLockPeriod, 0.02);
    EXPECT_EQ(raster.alignmentX, (RasterAlignment{{16384, 49152}, 1.5e11, 0.0, 0.0, 0.0, 0.0, 0.0}));
}

TEST_F(RenderingPropertiesTest, EveryClassIsRegisteredFreeThreadedUnderItsProgId) {
    for (const char* name : {"PatternAlignments", "RasterAlignments", "PatternRenderingProperties",
                             "RasterRenderingProperties"}) {
        SCOPED_TRACE(name);
        const ClassEntry* entry = FindClassByName(std::string("Beamweaver.") + name);
        ASSERT_NE(entry, nullptr);
        EXPECT_EQ(entry->name, name);
        EXPECT_EQ(entry->threading, ThreadingModel::Free);
        CComPtr<IDispatch> object;
        EXPECT_EQ(entry->create(nullptr, IDispatch::iid, reinterpret_cast<void**>(&object)), S_OK);
        EXPECT_TRUE(object);
    }
}

TEST_F(RenderingPropertiesTest, ValueObjectsDoNotAnswerSupportErrorInfo) {
    auto properties = MakePatternRenderingProperties({});
    EXPECT_FALSE(QueryAs<ISupportErrorInfo>(properties.Get()));
    auto alignments = MakeRasterAlignments({});
    EXPECT_FALSE(QueryAs<ISupportErrorInfo>(alignments.Get()));
    EXPECT_TRUE(QueryAs<IScanAlignments>(alignments.Get()));
}

// --- Plain-value setters --------------------------------------------------------------------------

template <class I> struct PutCase {
    const char* name;
    HRESULT (I::*put)(double);
    HRESULT (I::*get)(double*);
    double value;
    bool accepted;
};

// A refused value gives E_INVALIDARG without error information and keeps the old value.
template <class I> void ExpectPutChecks(I* object, const std::vector<PutCase<I>>& cases) {
    for (const auto& c : cases) {
        SCOPED_TRACE(std::string(c.name) + " = " + std::to_string(c.value));
        double before = 0.0;
        ASSERT_EQ((object->*c.get)(&before), S_OK);
        EXPECT_EQ((object->*c.put)(c.value), c.accepted ? S_OK : E_INVALIDARG);
        EXPECT_FALSE(TakeErrorReport().has_value());
        double after = 0.0;
        ASSERT_EQ((object->*c.get)(&after), S_OK);
        EXPECT_EQ(after, c.accepted ? c.value : before);
    }
}

TEST_F(RenderingPropertiesTest, PatternAlignmentsSlewRateMustBePositive) {
    using I = IPatternAlignments;
    ExpectPutChecks<I>(MakePatternAlignments({}),
                       {
                           {"SlewRate", &I::put_SlewRate, &I::get_SlewRate, 2e9, true},
                           {"SlewRate", &I::put_SlewRate, &I::get_SlewRate, 0.0, false},
                           {"SlewRate", &I::put_SlewRate, &I::get_SlewRate, -1.0, false},
                           {"SlewRate", &I::put_SlewRate, &I::get_SlewRate, kNaN, false},
                       });
}

TEST_F(RenderingPropertiesTest, RasterAlignmentsTimesMustNotBeNegative) {
    using I = IRasterAlignments;
    ExpectPutChecks<I>(
        MakeRasterAlignments({}),
        {
            {"SlewRate", &I::put_SlewRate, &I::get_SlewRate, 0.0, false},
            {"SlewRate", &I::put_SlewRate, &I::get_SlewRate, 3e10, true},
            {"ScanSync", &I::put_ScanSync, &I::get_ScanSync, 1e-6, true},
            {"ScanSync", &I::put_ScanSync, &I::get_ScanSync, -1e-9, false},
            {"ScanSync", &I::put_ScanSync, &I::get_ScanSync, 0.0, true},
            {"PreScan", &I::put_PreScan, &I::get_PreScan, 2e-6, true},
            {"PreScan", &I::put_PreScan, &I::get_PreScan, -2e-6, false},
            {"AcquisitionWaitTime", &I::put_AcquisitionWaitTime, &I::get_AcquisitionWaitTime, 3e-6, true},
            {"AcquisitionWaitTime", &I::put_AcquisitionWaitTime, &I::get_AcquisitionWaitTime, -3e-6, false},
            {"AcquisitionDelay", &I::put_AcquisitionDelay, &I::get_AcquisitionDelay, 4e-6, true},
            {"AcquisitionDelay", &I::put_AcquisitionDelay, &I::get_AcquisitionDelay, kNaN, false},
            {"PreFlyback", &I::put_PreFlyback, &I::get_PreFlyback, 5e-6, true},
            {"PreFlyback", &I::put_PreFlyback, &I::get_PreFlyback, -5e-6, false},
        });
}

TEST_F(RenderingPropertiesTest, PatternRenderingPropertiesCheckEachTime) {
    using I = IPatternRenderingProperties;
    ExpectPutChecks<I>(
        MakePatternRenderingProperties({}),
        {
            {"TargetDwellTimeResolution", &I::put_TargetDwellTimeResolution,
             &I::get_TargetDwellTimeResolution, 1e-7, true},
            {"TargetDwellTimeResolution", &I::put_TargetDwellTimeResolution,
             &I::get_TargetDwellTimeResolution, 0.0, false},
            {"TargetDwellTimeResolution", &I::put_TargetDwellTimeResolution,
             &I::get_TargetDwellTimeResolution, -1e-7, false},
            {"GatePulseIdleTime", &I::put_GatePulseIdleTime, &I::get_GatePulseIdleTime, 0.0, true},
            {"GatePulseIdleTime", &I::put_GatePulseIdleTime, &I::get_GatePulseIdleTime, -1e-9, false},
            {"PreBlankingTime", &I::put_PreBlankingTime, &I::get_PreBlankingTime, 0.0, true},
            {"PreBlankingTime", &I::put_PreBlankingTime, &I::get_PreBlankingTime, -1e-6, false},
            {"PostBlankingTime", &I::put_PostBlankingTime, &I::get_PostBlankingTime, 3e-6, true},
            {"PostBlankingTime", &I::put_PostBlankingTime, &I::get_PostBlankingTime, kNaN, false},
            {"PatternStartAsymmetryTime", &I::put_PatternStartAsymmetryTime,
             &I::get_PatternStartAsymmetryTime, 0.0, true},
            {"PatternStartAsymmetryTime", &I::put_PatternStartAsymmetryTime,
             &I::get_PatternStartAsymmetryTime, -5e-8, false},
        });
}

TEST_F(RenderingPropertiesTest, RasterRenderingPropertiesStoreAnyValue) {
    using I = IRasterRenderingProperties;
    ExpectPutChecks<I>(
        MakeRasterRenderingProperties({}),
        {
            {"TargetDwellTimeResolution", &I::put_TargetDwellTimeResolution,
             &I::get_TargetDwellTimeResolution, -1e-7, true},
            {"GatePulseIdleTime", &I::put_GatePulseIdleTime, &I::get_GatePulseIdleTime, -2e-6, true},
            {"MainsLockPeriod", &I::put_MainsLockPeriod, &I::get_MainsLockPeriod, 0.0, true},
            {"MainsLockPeriod", &I::put_MainsLockPeriod, &I::get_MainsLockPeriod, -0.02, true},
        });
}

TEST_F(RenderingPropertiesTest, GenerationStrategyStoresValuesOutsideTheEnumeration) {
    auto properties = MakePatternRenderingProperties({});
    EXPECT_EQ(properties->put_GenerationStrategy(static_cast<GenerationStrategy>(7)), S_OK);
    GenerationStrategy strategy = GenerationStrategy_UseAlignments;
    EXPECT_EQ(properties->get_GenerationStrategy(&strategy), S_OK);
    EXPECT_EQ(strategy, 7);
}

TEST_F(RenderingPropertiesTest, GettersRefuseNullOutPointers) {
    auto properties = MakePatternRenderingProperties({});
    EXPECT_EQ(properties->get_PreBlankingTime(nullptr), E_POINTER);
    EXPECT_EQ(properties->get_PatternAlignmentsX(nullptr), E_POINTER);
    auto alignments = MakeRasterAlignments({});
    EXPECT_EQ(alignments->get_Range(nullptr), E_POINTER);
    EXPECT_EQ(alignments->get_PreFlyback(nullptr), E_POINTER);
}

// --- Range ----------------------------------------------------------------------------------------

struct RangeCase {
    RangeInt range;
    bool patternAccepts;
    bool rasterAccepts;
};

// Both kinds: minimum >= 0 and minimum <= maximum; pattern alignments also refuse equal ends.
const RangeCase kRangeCases[] = {
    {{0, 1}, true, true},       {{100, 100}, false, true},
    {{0, 0}, false, true},      {{-1, 10}, false, false},
    {{10, 5}, false, false},    {{0, 65535}, true, true},
    {{-20, -10}, false, false}, {{2147483647, 2147483647}, false, true},
};

// A refused range fails with "Range values not correct" reported against riid and keeps the old range.
template <class I> void ExpectRangeCheck(I* alignments, const RangeInt& range, bool accepted) {
    const RangeInt before{1000, 2000};
    ASSERT_EQ(alignments->put_Range(CreateRange(before)), S_OK);
    const HRESULT hr = alignments->put_Range(CreateRange(range));
    if (accepted)
        EXPECT_EQ(hr, S_OK);
    else
        ExpectReported(hr, E_INVALIDARG, I::iid, u"Range values not correct");
    CComPtr<IRangeInt> stored;
    ASSERT_EQ(alignments->get_Range(&stored), S_OK);
    EXPECT_EQ(ReadRange(stored), accepted ? range : before);
}

TEST_F(RenderingPropertiesTest, RangeChecksDifferOnlyInEqualEnds) {
    auto pattern = MakePatternAlignments({});
    auto raster = MakeRasterAlignments({});
    for (const auto& c : kRangeCases) {
        SCOPED_TRACE(std::to_string(c.range.minimum) + ".." + std::to_string(c.range.maximum));
        ExpectRangeCheck<IPatternAlignments>(pattern, c.range, c.patternAccepts);
        ExpectRangeCheck<IRasterAlignments>(raster, c.range, c.rasterAccepts);
    }
}

TEST_F(RenderingPropertiesTest, NullRangeFailsAsReadingANullRangeAndKeepsTheRange) {
    auto alignments = MakePatternAlignments({{10, 20}, 1e9});
    ExpectReported(alignments->put_Range(nullptr), E_POINTER, IID_IPatternAlignments, u"null IRangeInt");
    EXPECT_EQ(ReadPatternAlignments(alignments, "X").range, (RangeInt{10, 20}));
}

TEST_F(RenderingPropertiesTest, RangeGetterReturnsANewObjectEachTime) {
    auto alignments = MakePatternAlignments({});
    CComPtr<IRangeInt> first;
    CComPtr<IRangeInt> second;
    ASSERT_EQ(alignments->get_Range(&first), S_OK);
    ASSERT_EQ(alignments->get_Range(&second), S_OK);
    EXPECT_NE(first.Get(), second.Get());
    ASSERT_EQ(first->put_Minimum(0), S_OK);
    EXPECT_EQ(ReadRange(second), (RangeInt{16384, 49152}));
    EXPECT_EQ(ReadPatternAlignments(alignments, "X").range, (RangeInt{16384, 49152}));
}

// --- Alignment-valued properties ------------------------------------------------------------------

TEST_F(RenderingPropertiesTest, PatternAlignmentsPutStoresACopyOfOneAxis) {
    auto properties = MakePatternRenderingProperties({});
    auto alignments = MakePatternAlignments({{100, 200}, 3e9});
    ASSERT_EQ(properties->put_PatternAlignmentsX(alignments), S_OK);
    ASSERT_EQ(alignments->put_SlewRate(4e9), S_OK);

    const PatternRenderingSettings read = ReadPatternRenderingProperties(properties);
    EXPECT_EQ(read.alignmentX, (PatternAlignment{{100, 200}, 3e9}));
    EXPECT_EQ(read.alignmentY, PatternAlignment{});
}

TEST_F(RenderingPropertiesTest, ChangingAGottenPatternAlignmentChangesNothingUntilPutBack) {
    auto properties = MakePatternRenderingProperties({});
    CComPtr<IPatternAlignments> x;
    ASSERT_EQ(properties->get_PatternAlignmentsX(&x), S_OK);
    ASSERT_EQ(x->put_SlewRate(2e11), S_OK);
    EXPECT_EQ(ReadPatternRenderingProperties(properties).alignmentX.slewRate, 1.5e11);

    ASSERT_EQ(properties->put_PatternAlignmentsX(x), S_OK);
    EXPECT_EQ(ReadPatternRenderingProperties(properties).alignmentX.slewRate, 2e11);
}

TEST_F(RenderingPropertiesTest, ChangingAGottenRasterAlignmentChangesNothingUntilPutBack) {
    auto properties = MakeRasterRenderingProperties({});
    CComPtr<IRasterAlignments> y;
    ASSERT_EQ(properties->get_RasterAlignmentsY(&y), S_OK);
    ASSERT_EQ(y->put_PreFlyback(1e-3), S_OK);
    EXPECT_EQ(ReadRasterRenderingProperties(properties).alignmentY.preFlyback, 0.0);

    ASSERT_EQ(properties->put_RasterAlignmentsY(y), S_OK);
    const RasterRenderingSettings read = ReadRasterRenderingProperties(properties);
    EXPECT_EQ(read.alignmentY.preFlyback, 1e-3);
    EXPECT_EQ(read.alignmentX, RasterAlignment{});
}

TEST_F(RenderingPropertiesTest, NullAlignmentObjectIsRefusedWithThePropertyNameAndKeepsTheValue) {
    const PatternAlignment patternAxis{{1, 2}, 5.0};
    auto pattern = MakePatternRenderingProperties(
        {1e-7, 0, 0, 0, 0, GenerationStrategy_UseAlignments, patternAxis, patternAxis});
    ExpectReported(pattern->put_PatternAlignmentsX(nullptr), E_INVALIDARG, IID_IPatternRenderingProperties,
                   u"PatternAlignmentsX object is null");
    ExpectReported(pattern->put_PatternAlignmentsY(nullptr), E_INVALIDARG, IID_IPatternRenderingProperties,
                   u"PatternAlignmentsY object is null");
    EXPECT_EQ(ReadPatternRenderingProperties(pattern).alignmentX, patternAxis);
    EXPECT_EQ(ReadPatternRenderingProperties(pattern).alignmentY, patternAxis);

    const RasterAlignment rasterAxis{{3, 3}, 6.0, 1.0, 2.0, 3.0, 4.0, 5.0};
    auto raster = MakeRasterRenderingProperties({1e-7, 0, 0, rasterAxis, rasterAxis});
    ExpectReported(raster->put_RasterAlignmentsX(nullptr), E_INVALIDARG, IID_IRasterRenderingProperties,
                   u"RasterAlignmentsX object is null");
    ExpectReported(raster->put_RasterAlignmentsY(nullptr), E_INVALIDARG, IID_IRasterRenderingProperties,
                   u"RasterAlignmentsY object is null");
    EXPECT_EQ(ReadRasterRenderingProperties(raster).alignmentX, rasterAxis);
    EXPECT_EQ(ReadRasterRenderingProperties(raster).alignmentY, rasterAxis);
}

// --- Conversions ----------------------------------------------------------------------------------

// Every field distinct, so a value read into the wrong field shows.
const PatternRenderingSettings kDistinctPatternSettings{
    1e-7, 2e-6, 3e-6, 4e-6, 5e-8, GenerationStrategy_DoNotUseAlignments, {{1, 2}, 7e9}, {{3, 4}, 8e9}};
const RasterRenderingSettings kDistinctRasterSettings{1e-7,
                                                      2e-6,
                                                      0.0166,
                                                      {{1, 2}, 7e9, 1e-6, 2e-6, 3e-6, 4e-6, 5e-6},
                                                      {{3, 3}, 8e9, 6e-6, 7e-6, 8e-6, 9e-6, 10e-6}};

TEST_F(RenderingPropertiesTest, PatternSettingsRoundTripThroughTheObject) {
    auto properties = MakePatternRenderingProperties(kDistinctPatternSettings);
    EXPECT_EQ(ReadPatternRenderingProperties(properties), kDistinctPatternSettings);
}

TEST_F(RenderingPropertiesTest, RasterSettingsRoundTripThroughTheObject) {
    auto properties = MakeRasterRenderingProperties(kDistinctRasterSettings);
    EXPECT_EQ(ReadRasterRenderingProperties(properties), kDistinctRasterSettings);
}

TEST_F(RenderingPropertiesTest, MadeObjectsAreIndependentCopies) {
    PatternRenderingSettings settings = kDistinctPatternSettings;
    auto first = MakePatternRenderingProperties(settings);
    settings.preBlankingTime = 9e-6;
    auto second = MakePatternRenderingProperties(settings);
    ASSERT_EQ(second->put_PostBlankingTime(0.0), S_OK);
    EXPECT_EQ(ReadPatternRenderingProperties(first), kDistinctPatternSettings);
}

TEST_F(RenderingPropertiesTest, ObjectsCreatedByClassIdReadLikeMadeOnesAfterTheSamePuts) {
    auto properties = Norvane::CreateInstance<IPatternRenderingProperties>(CLSID_PatternRenderingProperties);
    const auto& s = kDistinctPatternSettings;
    ASSERT_EQ(properties->put_TargetDwellTimeResolution(s.targetDwellTimeResolution), S_OK);
    ASSERT_EQ(properties->put_GatePulseIdleTime(s.gatePulseIdleTime), S_OK);
    ASSERT_EQ(properties->put_PreBlankingTime(s.preBlankingTime), S_OK);
    ASSERT_EQ(properties->put_PostBlankingTime(s.postBlankingTime), S_OK);
    ASSERT_EQ(properties->put_PatternStartAsymmetryTime(s.patternStartAsymmetryTime), S_OK);
    ASSERT_EQ(properties->put_GenerationStrategy(s.generationStrategy), S_OK);
    ASSERT_EQ(properties->put_PatternAlignmentsX(MakePatternAlignments(s.alignmentX)), S_OK);
    ASSERT_EQ(properties->put_PatternAlignmentsY(MakePatternAlignments(s.alignmentY)), S_OK);
    EXPECT_EQ(ReadPatternRenderingProperties(properties), s);
}

TEST_F(RenderingPropertiesTest, AlignmentRecordsRoundTrip) {
    const PatternAlignment pattern{{5, 6}, 1e10};
    EXPECT_EQ(ReadPatternAlignments(MakePatternAlignments(pattern), "X"), pattern);
    const RasterAlignment raster = kDistinctRasterSettings.alignmentY;
    EXPECT_EQ(ReadRasterAlignments(MakeRasterAlignments(raster), "X"), raster);
}

TEST_F(RenderingPropertiesTest, ReadingNullPatternPropertiesFailsWithInvalidArgument) {
    try {
        ReadPatternRenderingProperties(nullptr);
        FAIL() << "no exception";
    } catch (const Norvane::HResultException& error) {
        EXPECT_EQ(error.Error(), E_INVALIDARG);
        EXPECT_EQ(error.Description(), u"null IPatternRenderingProperties");
    }
}

TEST_F(RenderingPropertiesTest, ReadingNullRasterPropertiesFailsWithInvalidArgument) {
    try {
        ReadRasterRenderingProperties(nullptr);
        FAIL() << "no exception";
    } catch (const std::invalid_argument& error) {
        EXPECT_STREQ(error.what(), "null IRasterRenderingProperties");
    }
}

TEST_F(RenderingPropertiesTest, ReadingNullAlignmentsNamesTheProperty) {
    try {
        ReadRasterAlignments(nullptr, "RasterAlignmentsY");
        FAIL() << "no exception";
    } catch (const std::invalid_argument& error) {
        EXPECT_STREQ(error.what(), "RasterAlignmentsY object is null");
    }
}

// --- Automation -----------------------------------------------------------------------------------

// Puts a double by name through IDispatch; the exception record, if any, is left in exception.
HRESULT PutByName(IDispatch* object, const char16_t* name, double value, EXCEPINFO& exception) {
    LPOLESTR names[] = {const_cast<LPOLESTR>(name)};
    DISPID id = DISPID_UNKNOWN;
    const HRESULT lookUp = object->GetIDsOfNames(GUID_NULL, names, 1, 0, &id);
    if (FAILED(lookUp))
        return lookUp;
    CComVariant argument(value);
    DISPID named = DISPID_PROPERTYPUT;
    DISPPARAMS params{&argument, &named, 1, 1};
    UINT argumentError = 0;
    return object->Invoke(id, GUID_NULL, 0, DISPATCH_PROPERTYPUT, &params, nullptr, &exception,
                          &argumentError);
}

TEST_F(RenderingPropertiesTest, PreBlankingTimeIsSetByNameThroughAutomation) {
    auto properties = Norvane::CreateInstance<IPatternRenderingProperties>(CLSID_PatternRenderingProperties);
    auto dispatch = QueryAs<IDispatch>(properties.Get());
    ASSERT_TRUE(dispatch);

    EXCEPINFO exception{};
    EXPECT_EQ(PutByName(dispatch, u"PreBlankingTime", 2.5e-6, exception), S_OK);
    EXPECT_EQ(ReadPatternRenderingProperties(properties).preBlankingTime, 2.5e-6);

    EXPECT_EQ(PutByName(dispatch, u"PreBlankingTime", -1.0, exception), DISP_E_EXCEPTION);
    EXPECT_EQ(exception.scode, E_INVALIDARG);
    ClearExcepInfo(&exception);
    EXPECT_EQ(ReadPatternRenderingProperties(properties).preBlankingTime, 2.5e-6);
}

} // namespace
