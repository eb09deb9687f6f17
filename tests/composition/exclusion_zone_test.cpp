#include "common/error_info_probe.h"
#include "composition/exclusion_shape_classes.h"
#include "composition/exclusion_zone_classes.h"
#include "core/point_buffer_view.h"
#include "dwellmap/pattern_point_list.h"
#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/exclusion.h>
#include <beamweaver/pattern.h>

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;
using Norvane::testing::TakePublishedErrorInfo;

namespace {

using CallLog = std::vector<std::string>;

// A shape that only has a name: it is no point filter. Clone makes a shape named "<name>'".
class CNamedShape : public CComObjectRootBase, public IDispatchImpl<IShape> {
  public:
    using Interfaces = InterfaceMap<IShape>;

    CNamedShape(std::string name, std::shared_ptr<CallLog> log)
        : name_(std::move(name)), log_(std::move(log)) {}

    HRESULT get_TransformationMatrix(ITransformationMatrix2D**) override { return E_NOTIMPL; }
    HRESULT put_TransformationMatrix(ITransformationMatrix2D*) override { return E_NOTIMPL; }
    HRESULT get_DACRangeX(IRangeInt**) override { return E_NOTIMPL; }
    HRESULT put_DACRangeX(IRangeInt*) override { return E_NOTIMPL; }
    HRESULT get_DACRangeY(IRangeInt**) override { return E_NOTIMPL; }
    HRESULT put_DACRangeY(IRangeInt*) override { return E_NOTIMPL; }
    HRESULT Clone(IShape** clone) override {
        *clone = Norvane::CComObjectEx<CNamedShape>::CreateInstance<IShape>(name_ + "'", log_).Detach();
        return S_OK;
    }
    HRESULT CopyTo(IShape*) override { return E_NOTIMPL; }

  protected:
    std::string name_;
    std::shared_ptr<CallLog> log_;
};

// A point filter that records each call in the log ("A" or "A@3,4" with offsets) and answers result;
// a failure comes with the description "<name> failed".
class CLoggingShape : public CNamedShape, public IPatternPointFilter {
  public:
    using Interfaces = InterfaceMap<IShape, IPatternPointFilter>;

    CLoggingShape(std::string name, std::shared_ptr<CallLog> log, HRESULT result = S_OK)
        : CNamedShape(std::move(name), std::move(log)), result_(result) {}

    HRESULT Clone(IShape** clone) override {
        *clone =
            Norvane::CComObjectEx<CLoggingShape>::CreateInstance<IShape>(name_ + "'", log_, result_).Detach();
        return S_OK;
    }
    HRESULT FilterList(IPatternPointList*) override { return Record(name_); }
    HRESULT FilterListWithOffset(IPatternPointList*, std::uint16_t offsetX, std::uint16_t offsetY) override {
        return Record(name_ + "@" + std::to_string(offsetX) + "," + std::to_string(offsetY));
    }

  private:
    HRESULT Record(const std::string& call) {
        log_->push_back(call);
        if (FAILED(result_))
            Norvane::testing::SetThreadErrorDescription(u"shape failed");
        return result_;
    }

    HRESULT result_;
};

class CTestPatternShape : public CComObjectRootBase, public IExcludablePatternShape {
  public:
    using Interfaces = InterfaceMap<IExcludablePatternShape>;

    explicit CTestPatternShape(IShape* shape) : shape_(shape) {}

    HRESULT get_IsExclusion(VARIANT_BOOL* value) override {
        *value = VARIANT_FALSE;
        return S_OK;
    }
    HRESULT put_IsExclusion(VARIANT_BOOL) override { return S_OK; }
    HRESULT get_Shape(IShape** shape) override { return shape_.CopyTo(shape); }

  private:
    CComPtr<IShape> shape_;
};

class ExclusionZoneTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComponents();
        RegisterClasses(ExclusionZoneClassEntries());
        RegisterClasses(ExclusionShapeClassEntries());
        zone = Norvane::CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    }

    CComPtr<IShape> Filtering(const std::string& name, HRESULT result = S_OK) {
        return Norvane::CComObjectEx<CLoggingShape>::CreateInstance<IShape>(name, log, result);
    }
    CComPtr<IShape> NotFiltering(const std::string& name) {
        return Norvane::CComObjectEx<CNamedShape>::CreateInstance<IShape>(name, log);
    }

    // The shapes of a zone, in order, as the calls of one filter pass record them.
    CallLog FilterCalls(IExclusionZone* of) {
        log->clear();
        EXPECT_EQ(QueryAs<IPatternPointFilter>(of)->FilterList(nullptr), S_OK);
        return *log;
    }

    bool Contains(IShape* shape) {
        VARIANT_BOOL contained = VARIANT_FALSE;
        EXPECT_EQ(zone->ContainsShape(shape, &contained), S_OK);
        return contained == VARIANT_TRUE;
    }

    static CComPtr<IPatternPointList> MakeList(const std::vector<PatternPoint>& points) {
        auto list =
            Norvane::CComObjectEx<Norvane::Dwellmap::CPatternPointList>::CreateInstance<IPatternPointList>();
        EXPECT_EQ(list->SetCount(static_cast<std::uint32_t>(points.size())), S_OK);
        const PointBufferView view(list);
        std::copy(points.begin(), points.end(), view.Points().begin());
        return list;
    }

    static std::vector<PatternPoint> PointsOf(IPatternPointList* list) {
        const PointBufferView view(list);
        return {view.Points().begin(), view.Points().end()};
    }

    std::shared_ptr<CallLog> log = std::make_shared<CallLog>();
    CComPtr<IExclusionZone> zone;
};

TEST_F(ExclusionZoneTest, ShapesFilterInInsertionOrderAndNonFiltersAreSkipped) {
    ASSERT_EQ(zone->AddShape(Filtering("A")), S_OK);
    ASSERT_EQ(zone->AddShape(NotFiltering("P")), S_OK);
    ASSERT_EQ(zone->AddShape(Filtering("B")), S_OK);
    EXPECT_EQ(FilterCalls(zone), (CallLog{"A", "B"}));

    log->clear();
    EXPECT_EQ(QueryAs<IPatternPointFilter>(zone.Get())->FilterListWithOffset(nullptr, 3, 65535), S_OK);
    EXPECT_EQ(*log, (CallLog{"A@3,65535", "B@3,65535"}));
}

TEST_F(ExclusionZoneTest, FailingShapeStopsTheLoopWithItsResult) {
    constexpr HRESULT kShapeFailure = static_cast<HRESULT>(0x80041234);
    zone->AddShape(Filtering("A"));
    zone->AddShape(Filtering("F", kShapeFailure));
    zone->AddShape(Filtering("B"));
    log->clear();
    EXPECT_EQ(QueryAs<IPatternPointFilter>(zone.Get())->FilterListWithOffset(nullptr, 0, 0), kShapeFailure);
    EXPECT_EQ(*log, (CallLog{"A@0,0", "F@0,0"}));
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IPatternPointFilter);
    EXPECT_EQ(info->description, u"shape failed");
}

TEST_F(ExclusionZoneTest, EmptyZoneLeavesTheListUnchanged) {
    const std::vector<PatternPoint> points{MakePoint(1, 2, 40, PointFlag_Blank), MakePoint(1, 2, 2, 0),
                                           MakePoint(1, 2, 7, PointFlag_Acquire), MakePoint(9, 9, 5, 0x30)};
    const auto list = MakeList(points);
    EXPECT_EQ(QueryAs<IPatternPointFilter>(zone.Get())->FilterListWithOffset(list, 100, 200), S_OK);
    EXPECT_EQ(PointsOf(list), points);
}

TEST_F(ExclusionZoneTest, ContainsShapeComparesReferencesNotCopies) {
    const auto shape = Filtering("A");
    zone->AddShape(shape);
    CComPtr<IShape> clone;
    ASSERT_EQ(shape->Clone(&clone), S_OK);
    EXPECT_TRUE(Contains(shape));
    EXPECT_FALSE(Contains(clone));
}

TEST_F(ExclusionZoneTest, RemoveShapeRemovesOnlyTheFirstEntry) {
    const auto a = Filtering("A");
    zone->AddShape(a);
    zone->AddShape(Filtering("B"));
    zone->AddShape(a);
    ASSERT_EQ(zone->RemoveShape(a), S_OK);
    EXPECT_EQ(FilterCalls(zone), (CallLog{"B", "A"}));
    EXPECT_TRUE(Contains(a));
    ASSERT_EQ(zone->RemoveShape(a), S_OK);
    EXPECT_FALSE(Contains(a));
    EXPECT_EQ(zone->RemoveShape(a), S_OK); // not held: nothing happens
    EXPECT_EQ(FilterCalls(zone), (CallLog{"B"}));
}

TEST_F(ExclusionZoneTest, ClearReleasesEveryShape) {
    zone->AddShape(Filtering("A"));
    zone->AddShape(Filtering("B"));
    ASSERT_EQ(zone->Clear(), S_OK);
    EXPECT_TRUE(FilterCalls(zone).empty());
}

TEST_F(ExclusionZoneTest, AddShapeFromPatternShapeAddsItsShapeWhateverIsExclusion) {
    const auto shape = Filtering("A");
    const auto pattern =
        Norvane::CComObjectEx<CTestPatternShape>::CreateInstance<IExcludablePatternShape>(shape.Get());
    ASSERT_EQ(zone->AddShapeFromPatternShape(pattern), S_OK);
    EXPECT_TRUE(Contains(shape));

    // A pattern without a shape gives the shape check's message.
    const auto empty = Norvane::CComObjectEx<CTestPatternShape>::CreateInstance<IExcludablePatternShape>(
        static_cast<IShape*>(nullptr));
    EXPECT_EQ(zone->AddShapeFromPatternShape(empty), E_INVALIDARG);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->description, u"Shape object is null");
}

TEST_F(ExclusionZoneTest, CopyToAppendsClonesToTheTargetsShapes) {
    zone->AddShape(Filtering("A"));
    zone->AddShape(NotFiltering("P"));
    zone->AddShape(Filtering("B"));
    const auto target = Norvane::CreateInstance<IExclusionZone>(CLSID_ExclusionZone);
    target->AddShape(Filtering("X"));
    ASSERT_EQ(zone->CopyTo(target), S_OK);
    EXPECT_EQ(FilterCalls(target), (CallLog{"X", "A'", "B'"}));
    EXPECT_EQ(FilterCalls(zone), (CallLog{"A", "B"}));
}

TEST_F(ExclusionZoneTest, CopyToItselfAppendsClonesOfTheShapesHeldBefore) {
    zone->AddShape(Filtering("A"));
    zone->AddShape(Filtering("B"));
    ASSERT_EQ(zone->CopyTo(zone), S_OK);
    EXPECT_EQ(FilterCalls(zone), (CallLog{"A", "B", "A'", "B'"}));
}

TEST_F(ExclusionZoneTest, CloneIsIndependent) {
    const auto a = Filtering("A");
    zone->AddShape(a);
    CComPtr<IExclusionZone> clone;
    ASSERT_EQ(zone->Clone(&clone), S_OK);
    ASSERT_TRUE(clone);
    EXPECT_NE(clone.Get(), zone.Get());
    clone->AddShape(Filtering("B"));
    EXPECT_EQ(FilterCalls(clone), (CallLog{"A'", "B"}));
    EXPECT_EQ(FilterCalls(zone), (CallLog{"A"}));
    VARIANT_BOOL contained = VARIANT_TRUE;
    clone->ContainsShape(a, &contained);
    EXPECT_EQ(contained, VARIANT_FALSE);
}

struct NullCase {
    std::string name;
    HRESULT (*call)(IExclusionZone*);
    const char16_t* message;
};

class ExclusionZoneNullTest : public ExclusionZoneTest, public ::testing::WithParamInterface<NullCase> {};

TEST_P(ExclusionZoneNullTest, RefusedWithMessageAgainstTheZoneInterface) {
    zone->AddShape(Filtering("A"));
    EXPECT_EQ(GetParam().call(zone), E_INVALIDARG);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IExclusionZone);
    EXPECT_EQ(info->description, GetParam().message);
    EXPECT_EQ(FilterCalls(zone), (CallLog{"A"})); // the zone is as it was
}

INSTANTIATE_TEST_SUITE_P(
    Cases, ExclusionZoneNullTest,
    ::testing::Values(NullCase{"AddShape", [](IExclusionZone* z) { return z->AddShape(nullptr); },
                               u"Shape object is null"},
                      NullCase{"RemoveShape", [](IExclusionZone* z) { return z->RemoveShape(nullptr); },
                               u"Shape object is null"},
                      NullCase{"ContainsShape",
                               [](IExclusionZone* z) {
                                   VARIANT_BOOL contained = VARIANT_FALSE;
                                   return z->ContainsShape(nullptr, &contained);
                               },
                               u"Shape object is null"},
                      NullCase{"AddShapeFromPatternShape",
                               [](IExclusionZone* z) { return z->AddShapeFromPatternShape(nullptr); },
                               u"PatternShape object is null"},
                      NullCase{"CopyTo", [](IExclusionZone* z) { return z->CopyTo(nullptr); },
                               u"pIExclusionZone object is null"}),
    [](const ::testing::TestParamInfo<NullCase>& param) { return param.param.name; });

TEST_F(ExclusionZoneTest, NullOutPointersGiveEPointerWithoutErrorInformation) {
    EXPECT_EQ(zone->ContainsShape(Filtering("A"), nullptr), E_POINTER);
    EXPECT_FALSE(TakePublishedErrorInfo().has_value());
    EXPECT_EQ(zone->Clone(nullptr), E_POINTER);
    EXPECT_FALSE(TakePublishedErrorInfo().has_value());
}

TEST_F(ExclusionZoneTest, InterfacesAndErrorSupport) {
    const auto support = QueryAs<ISupportErrorInfo>(zone.Get());
    ASSERT_TRUE(support);
    EXPECT_EQ(support->InterfaceSupportsErrorInfo(IID_IExclusionZone), S_OK);
    EXPECT_TRUE(QueryAs<IDispatch>(zone.Get()));
    EXPECT_TRUE(QueryAs<IPatternPointFilter>(zone.Get()));
}

// End to end with a real rectangle shape on the default 0..65535 field: the band 0.4..0.6 in x removes
// the middle point (32768 / 65535 ≈ 0.50001); the others are kept with the lead-in and post-blanking
// points in place. A clone of the zone filters the same way.
TEST_F(ExclusionZoneTest, RectangleShapeCutsAHole) {
    const auto rectangle = Norvane::CreateInstance<IShapeRectangle>(CLSID_ShapeRectangle);
    ASSERT_EQ(rectangle->put_Rectangle(
                  CreateRectangleFloat({.left = 0.4, .top = 0.0, .right = 0.6, .bottom = 1.0})),
              S_OK);
    ASSERT_EQ(zone->AddShape(rectangle), S_OK);
    CComPtr<IExclusionZone> clone;
    ASSERT_EQ(zone->Clone(&clone), S_OK);
    const std::vector<PatternPoint> rendering{
        MakePoint(0, 100, 40, PointFlag_Blank),       MakePoint(0, 100, 2, 0),
        MakePoint(0, 100, 40, PointFlag_Acquire),     MakePoint(32768, 100, 40, PointFlag_Acquire),
        MakePoint(65535, 100, 40, PointFlag_Acquire), MakePoint(65535, 100, 40, PointFlag_Blank)};
    const std::vector<PatternPoint> expected{rendering[0], rendering[1], rendering[2], rendering[4],
                                             rendering[5]};
    for (IExclusionZone* filter : {zone.Get(), clone.Get()}) {
        const auto list = MakeList(rendering);
        ASSERT_EQ(QueryAs<IPatternPointFilter>(filter)->FilterList(list), S_OK);
        EXPECT_EQ(PointsOf(list), expected);
    }
}

} // namespace
