#include "composition/shape_test_support.h"

#include <cmath>
#include <functional>
#include <limits>
#include <optional>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning {
namespace {

using namespace shape_testing;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

TEST_F(ShapesTest, ClassesAreRegisteredByProgIdAndAnswerTheirInterfaces) {
    const std::vector<ClassEntry> entries = ExclusionShapeClassEntries();
    ASSERT_EQ(entries.size(), 3u);
    const IID ownInterfaces[] = {IID_IShapeRectangle, IID_IShapeCircle, IID_IShapePolygon};
    for (std::size_t i = 0; i < entries.size(); ++i) {
        SCOPED_TRACE(entries[i].name);
        EXPECT_EQ(entries[i].name, std::string("Shape") + kKinds[i].name);
        EXPECT_EQ(entries[i].progId, "Beamweaver." + entries[i].name);
        EXPECT_EQ(entries[i].threading, ThreadingModel::Free);
        CLSID clsid{};
        ASSERT_EQ(CLSIDFromProgID(CComBSTR(entries[i].progId).View().data(), &clsid), S_OK);
        EXPECT_EQ(clsid, kKinds[i].clsid);

        auto shape = CreateInstance<IShape>(clsid);
        for (const IID& iid : {IID_IShape, IID_IPatternPointFilter, IDispatch::iid, ownInterfaces[i]}) {
            CComPtr<IUnknown> answer;
            EXPECT_EQ(shape->QueryInterface(iid, reinterpret_cast<void**>(&answer)), S_OK);
        }
        for (std::size_t other = 0; other < 3; ++other) {
            CComPtr<IUnknown> answer;
            if (other != i) {
                EXPECT_EQ(shape->QueryInterface(ownInterfaces[other], reinterpret_cast<void**>(&answer)),
                          E_NOINTERFACE);
            }
        }
        auto support = QueryAs<ISupportErrorInfo>(shape.Get());
        for (const IID& iid : {IID_IShape, IID_IPatternPointFilter, ownInterfaces[i]})
            EXPECT_EQ(support->InterfaceSupportsErrorInfo(iid), S_OK);
    }
}

TEST_F(ShapesTest, NewShapeHasIdentityMatrixAndFullDacRanges) {
    for (const ShapeKind& kind : kKinds) {
        SCOPED_TRACE(kind.name);
        auto shape = CreateInstance<IShape>(kind.clsid);
        EXPECT_EQ(MatrixOf(shape), TransformationMatrix{});
        EXPECT_EQ(RangeXOf(shape), (RangeInt{0, 65535}));
        EXPECT_EQ(RangeYOf(shape), (RangeInt{0, 65535}));
    }
}

// Any matrix is stored, a singular one too, and ranges are stored unchecked, even reversed.
TEST_F(ShapesTest, CommonPropertiesStoreWhatTheyAreGiven) {
    const TransformationMatrix singular{1.0, 2.0, 0.5, 2.0, 4.0, -0.5};
    for (const ShapeKind& kind : kKinds) {
        SCOPED_TRACE(kind.name);
        auto shape = CreateInstance<IShape>(kind.clsid);
        SetFrame(shape, singular, {100, -5}, {-70000, 70000});
        EXPECT_EQ(MatrixOf(shape), singular);
        EXPECT_EQ(RangeXOf(shape), (RangeInt{100, -5}));
        EXPECT_EQ(RangeYOf(shape), (RangeInt{-70000, 70000}));
    }
}

struct CommonFailureCase {
    const char* name;
    std::function<HRESULT(IShape*)> call;
    Failure expected;
};

TEST_F(ShapesTest, CommonPropertiesRefuseNullsWithTheirMessages) {
    const std::vector<CommonFailureCase> cases{
        {"MatrixPutNull",
         [](IShape* s) { return s->put_TransformationMatrix(nullptr); },
         {E_INVALIDARG, IID_IShape, u"TransformationMatrix object is null"}},
        {"MatrixGetNull",
         [](IShape* s) { return s->get_TransformationMatrix(nullptr); },
         {E_POINTER, {}, u""}},
        {"RangeXGetNull",
         [](IShape* s) { return s->get_DACRangeX(nullptr); },
         {E_INVALIDARG, IID_IShape, u"The output range object is null"}},
        {"RangeYGetNull",
         [](IShape* s) { return s->get_DACRangeY(nullptr); },
         {E_INVALIDARG, IID_IShape, u"The output range object is null"}},
        {"RangeXPutNull",
         [](IShape* s) { return s->put_DACRangeX(nullptr); },
         {E_INVALIDARG, IID_IShape, u"The range object is null"}},
        {"RangeYPutNull",
         [](IShape* s) { return s->put_DACRangeY(nullptr); },
         {E_INVALIDARG, IID_IShape, u"The range object is null"}},
        {"CloneNull",
         [](IShape* s) { return s->Clone(nullptr); },
         {E_INVALIDARG, IID_IShape, u"ppIShape object is null"}},
        {"CopyToNull",
         [](IShape* s) { return s->CopyTo(nullptr); },
         {E_INVALIDARG, IID_IShape, u"pIShape object is null"}},
        {"FilterListNull",
         [](IShape* s) { return QueryAs<IPatternPointFilter>(s)->FilterList(nullptr); },
         {E_INVALIDARG, IID_IPatternPointFilter, u"Null arguments supplied"}},
    };
    for (const ShapeKind& kind : kKinds) {
        auto shape = CreateInstance<IShape>(kind.clsid);
        for (const CommonFailureCase& c : cases) {
            SCOPED_TRACE(std::string(kind.name) + " " + c.name);
            ExpectFailure(c.call(shape), c.expected);
        }
        EXPECT_EQ(MatrixOf(shape), TransformationMatrix{});
        EXPECT_EQ(RangeXOf(shape), (RangeInt{0, 65535}));
    }
}

struct RectanglePutCase {
    const char* name;
    std::optional<RectangleFloat> value; // nothing: a null object
    const char16_t* message;
};

TEST_F(ShapesTest, RectanglePutRefusesWhatIsNotARelativeRectangleAndKeepsTheOldOne) {
    const RectangleFloat stored{0.1, 0.2, 0.3, 0.4};
    const std::vector<RectanglePutCase> cases{
        {"Null", std::nullopt, u"Rectangle object is null"},
        {"RightLeftOfLeft", RectangleFloat{0.5, 0.1, 0.4, 0.2}, u"Rectangle values not correct"},
        {"BottomAboveTop", RectangleFloat{0.1, 0.5, 0.2, 0.4}, u"Rectangle values not correct"},
        {"NegativeLeft", RectangleFloat{-0.1, 0.1, 0.2, 0.2}, u"Rectangle values not correct"},
        {"BottomBeyondField", RectangleFloat{0.1, 0.1, 0.2, 1.0000001}, u"Rectangle values not correct"},
        {"NotANumber", RectangleFloat{kNaN, 0.1, 0.2, 0.2}, u"Rectangle values not correct"},
    };
    auto shape = NewRectangle(stored);
    for (const RectanglePutCase& c : cases) {
        SCOPED_TRACE(c.name);
        CComPtr<IRectangleFloat> value = c.value ? CreateRectangleFloat(*c.value) : nullptr;
        ExpectFailure(shape->put_Rectangle(value), {E_INVALIDARG, IID_IShapeRectangle, c.message});
        EXPECT_EQ(RectangleOf(shape), stored);
    }
}

TEST_F(ShapesTest, RectangleOfZeroWidthAndTheWholeFieldAreAccepted) {
    auto shape = CreateInstance<IShapeRectangle>(CLSID_ShapeRectangle);
    EXPECT_EQ(RectangleOf(shape), RectangleFloat{});
    for (const RectangleFloat& r : {RectangleFloat{0.5, 0.1, 0.5, 0.9}, RectangleFloat{0.0, 0.0, 1.0, 1.0}}) {
        EXPECT_EQ(shape->put_Rectangle(CreateRectangleFloat(r)), S_OK);
        EXPECT_EQ(RectangleOf(shape), r);
    }
}

TEST_F(ShapesTest, CircleCenterIsReadAsACoordinateAndChecked) {
    auto shape = NewCircle({0.25, 0.75}, 0.0, 0.0);
    ExpectFailure(shape->put_Center(nullptr), {E_POINTER, IID_IShapeCircle, u"null ICoordinateFloat"});
    for (const coordinate<double>& bad :
         {coordinate<double>{0.5, 1.2}, coordinate<double>{-0.1, 0.5}, coordinate<double>{kNaN, 0.5}}) {
        ExpectFailure(shape->put_Center(CreateCoordinate(bad)),
                      {E_INVALIDARG, IID_IShapeCircle, u"Origin values not correct"});
    }
    EXPECT_EQ(CenterOf(shape), (coordinate<double>{0.25, 0.75}));
    EXPECT_EQ(shape->put_Center(CreateCoordinate({1.0, 0.0})), S_OK);
    EXPECT_EQ(CenterOf(shape), (coordinate<double>{1.0, 0.0}));
}

struct RadiusProperty {
    const char* name;
    HRESULT (IShapeCircle::*put)(double);
    HRESULT (IShapeCircle::*get)(double*);
    const char16_t* message;
};

TEST_F(ShapesTest, RadiiAcceptZeroToOneAndKeepTheOldValueOtherwise) {
    const RadiusProperty properties[] = {
        {"Inner", &IShapeCircle::put_InnerRadius, &IShapeCircle::get_InnerRadius,
         u"Inner radius value is not correct"},
        {"Outer", &IShapeCircle::put_OuterRadius, &IShapeCircle::get_OuterRadius,
         u"Outer radius value is not correct"},
    };
    auto shape = CreateInstance<IShapeCircle>(CLSID_ShapeCircle);
    for (const RadiusProperty& p : properties) {
        SCOPED_TRACE(p.name);
        double value = -1.0;
        EXPECT_EQ(((*shape).*p.get)(&value), S_OK);
        EXPECT_EQ(value, 0.0);
        EXPECT_EQ(((*shape).*p.get)(nullptr), E_POINTER);
        for (double good : {0.0, 1.0, 0.375}) {
            EXPECT_EQ(((*shape).*p.put)(good), S_OK);
            EXPECT_EQ(((*shape).*p.get)(&value), S_OK);
            EXPECT_EQ(value, good);
        }
        for (double bad : {-0.0001, 1.0001, kNaN}) {
            ExpectFailure(((*shape).*p.put)(bad), {E_INVALIDARG, IID_IShapeCircle, p.message});
            EXPECT_EQ(((*shape).*p.get)(&value), S_OK);
            EXPECT_EQ(value, 0.375);
        }
    }
}

// The triangle (0.1, 0.1), (0.5, 0.1), (0.1, 0.5) holds the points with x + y < 0.6, such as (0.15, 0.3);
// moving its last vertex to (0.5, 0.5) makes it the triangle with y < x, which holds (0.45, 0.3) instead.
TEST_F(ShapesTest, PolygonPointsAreCheckedThenAppendedOrReplaced) {
    auto shape = NewPolygon({{0.1, 0.1}, {0.5, 0.1}, {0.1, 0.5}});
    auto& polygon = Object<CShapePolygon>(shape);
    EXPECT_TRUE(polygon.Contains({0.15, 0.3}));

    const Failure nullPoint{E_INVALIDARG, IID_IShapePolygon, u"Point object is null"};
    const Failure badValues{E_INVALIDARG, IID_IShapePolygon, u"Point values not correct"};
    const Failure badIndex{E_INVALIDARG, IID_IShapePolygon, u"Index out of range"};
    const auto outside = CreateCoordinate({1.0000001, 0.5});
    const auto inside = CreateCoordinate({0.5, 0.5});
    ExpectFailure(shape->AddPoint(nullptr), nullPoint);
    ExpectFailure(shape->AddPoint(outside), badValues);
    ExpectFailure(shape->ModifyPoint(0, nullptr), nullPoint);
    ExpectFailure(shape->ModifyPoint(7, nullptr), nullPoint);
    ExpectFailure(shape->ModifyPoint(0, outside), badValues);
    ExpectFailure(shape->ModifyPoint(3, outside), badValues);
    ExpectFailure(shape->ModifyPoint(3, inside), badIndex); // index equal to the number of vertices
    ExpectFailure(shape->ModifyPoint(-1, inside), badIndex);
    EXPECT_TRUE(polygon.Contains({0.15, 0.3})) << "refused calls leave the vertices alone";

    EXPECT_EQ(shape->ModifyPoint(2, inside), S_OK);
    EXPECT_FALSE(polygon.Contains({0.15, 0.3}));
    EXPECT_TRUE(polygon.Contains({0.45, 0.3}));
}

struct ContainsCase {
    const char* name;
    coordinate<double> point;
    bool inside;
};

// Rectangle from (0.25, 0.5) to (0.75, 0.625); all values are exact in binary.
TEST_F(ShapesTest, RectangleContainsItsEdges) {
    auto shape = NewRectangle({0.25, 0.5, 0.75, 0.625});
    auto& rectangle = Object<CShapeRectangle>(shape);
    const ContainsCase cases[] = {
        {"Middle", {0.5, 0.5625}, true},
        {"TopLeftCorner", {0.25, 0.5}, true},
        {"BottomRightCorner", {0.75, 0.625}, true},
        {"RightEdge", {0.75, 0.55}, true},
        {"LeftEdge", {0.25, 0.6}, true},
        {"JustRightOfRightEdge", {std::nextafter(0.75, 1.0), 0.55}, false},
        {"JustAboveTopEdge", {0.5, std::nextafter(0.5, 0.0)}, false},
        {"FarOutside", {0.9, 0.9}, false},
    };
    for (const ContainsCase& c : cases)
        EXPECT_EQ(rectangle.Contains(c.point), c.inside) << c.name;
}

// Center (0.5, 0.5), radii 0.125 and 0.25: the rims are at distances that are exact in binary.
TEST_F(ShapesTest, CircleContainsBothRimsAndNotItsHole) {
    auto shape = NewCircle({0.5, 0.5}, 0.125, 0.25);
    auto& circle = Object<CShapeCircle>(shape);
    const ContainsCase cases[] = {
        {"OnOuterRimRight", {0.75, 0.5}, true},
        {"OnOuterRimTop", {0.5, 0.25}, true},
        {"OnInnerRimLeft", {0.375, 0.5}, true},
        {"InRing", {0.5, 0.3}, true},
        {"Center", {0.5, 0.5}, false},
        {"InHole", {0.55, 0.55}, false},
        {"JustOutsideOuterRim", {std::nextafter(0.75, 1.0), 0.5}, false},
        {"CornerOfBoundingBox", {0.7, 0.7}, false},
    };
    for (const ContainsCase& c : cases)
        EXPECT_EQ(circle.Contains(c.point), c.inside) << c.name;
}

TEST_F(ShapesTest, CircleWithInnerRadiusAboveOuterContainsNothing) {
    auto shape = NewCircle({0.5, 0.5}, 0.2, 0.1);
    auto& circle = Object<CShapeCircle>(shape);
    for (int i = 0; i <= 40; ++i)
        for (int j = 0; j <= 40; ++j)
            ASSERT_FALSE(circle.Contains({i / 40.0, j / 40.0})) << i << ", " << j;
}

// New shapes have zero geometry: the rectangle and the circle are the single point (0, 0).
TEST_F(ShapesTest, NewShapesContainAtMostTheOrigin) {
    auto rectangle = CreateInstance<IShapeRectangle>(CLSID_ShapeRectangle);
    auto circle = CreateInstance<IShapeCircle>(CLSID_ShapeCircle);
    auto polygon = CreateInstance<IShapePolygon>(CLSID_ShapePolygon);
    EXPECT_TRUE(Object<CShapeRectangle>(rectangle).Contains({0.0, 0.0}));
    EXPECT_FALSE(Object<CShapeRectangle>(rectangle).Contains({1e-12, 0.0}));
    EXPECT_TRUE(Object<CShapeCircle>(circle).Contains({0.0, 0.0}));
    EXPECT_FALSE(Object<CShapeCircle>(circle).Contains({0.0, 1e-12}));
    EXPECT_FALSE(Object<CShapePolygon>(polygon).Contains({0.0, 0.0}));
}

// A U opening upwards; the notch between its arms is outside.
TEST_F(ShapesTest, ConcavePolygonLeavesItsNotchOutside) {
    auto shape = NewPolygon(
        {{0.2, 0.2}, {0.4, 0.2}, {0.4, 0.6}, {0.6, 0.6}, {0.6, 0.2}, {0.8, 0.2}, {0.8, 0.8}, {0.2, 0.8}});
    auto& polygon = Object<CShapePolygon>(shape);
    const ContainsCase cases[] = {
        {"LeftArm", {0.3, 0.3}, true}, {"RightArm", {0.7, 0.4}, true},      {"Base", {0.5, 0.7}, true},
        {"Notch", {0.5, 0.3}, false},  {"NotchBottom", {0.5, 0.55}, false}, {"Outside", {0.9, 0.5}, false},
    };
    for (const ContainsCase& c : cases)
        EXPECT_EQ(polygon.Contains(c.point), c.inside) << c.name;
}

const TransformationMatrix kShifted{1.0, 0.0, 0.125, 0.0, 1.0, -0.25};

TEST_F(ShapesTest, CloneIsAnIndependentCopyOfTheSameKind) {
    auto rectangle = NewRectangle({0.25, 0.5, 0.75, 0.625});
    auto circle = NewCircle({0.25, 0.75}, 0.125, 0.5);
    auto polygon = NewPolygon({{0.1, 0.1}, {0.5, 0.1}, {0.1, 0.5}});
    const std::vector<CComPtr<IShape>> shapes{QueryAs<IShape>(rectangle.Get()), QueryAs<IShape>(circle.Get()),
                                              QueryAs<IShape>(polygon.Get())};
    std::vector<CComPtr<IShape>> clones;
    for (const auto& shape : shapes) {
        SetFrame(shape, kShifted, {10, 20}, {30, 40});
        CComPtr<IShape> clone;
        ASSERT_EQ(shape->Clone(&clone), S_OK);
        EXPECT_NE(clone.Get(), shape.Get());
        EXPECT_EQ(MatrixOf(clone), kShifted);
        EXPECT_EQ(RangeXOf(clone), (RangeInt{10, 20}));
        EXPECT_EQ(RangeYOf(clone), (RangeInt{30, 40}));
        SetFrame(clone, {}, {0, 1}, {0, 1});
        EXPECT_EQ(MatrixOf(shape), kShifted);
        clones.push_back(clone);
    }

    auto rectangleClone = QueryAs<IShapeRectangle>(clones[0].Get());
    ASSERT_TRUE(rectangleClone);
    EXPECT_EQ(RectangleOf(rectangleClone), (RectangleFloat{0.25, 0.5, 0.75, 0.625}));

    auto circleClone = QueryAs<IShapeCircle>(clones[1].Get());
    ASSERT_TRUE(circleClone);
    EXPECT_EQ(CenterOf(circleClone), (coordinate<double>{0.25, 0.75}));
    double inner = 0.0, outer = 0.0;
    EXPECT_EQ(circleClone->get_InnerRadius(&inner), S_OK);
    EXPECT_EQ(circleClone->get_OuterRadius(&outer), S_OK);
    EXPECT_EQ(inner, 0.125);
    EXPECT_EQ(outer, 0.5);

    auto polygonClone = QueryAs<IShapePolygon>(clones[2].Get());
    ASSERT_TRUE(polygonClone);
    EXPECT_TRUE(Object<CShapePolygon>(polygonClone).Contains({0.15, 0.3}));
    EXPECT_EQ(polygonClone->ModifyPoint(2, CreateCoordinate({0.5, 0.5})), S_OK);
    EXPECT_FALSE(Object<CShapePolygon>(polygonClone).Contains({0.15, 0.3}));
    EXPECT_TRUE(Object<CShapePolygon>(polygon).Contains({0.15, 0.3}));
}

// The common part is copied first, so a target of another kind has taken the matrix and the ranges
// when the class part fails; its own geometry stays as it was.
TEST_F(ShapesTest, CopyToAnotherKindFailsAfterCopyingMatrixAndRanges) {
    const char16_t* const notA[] = {u"pIShape object is not a rectangle", u"pIShape object is not a circle",
                                    u"pIShape object is not a polygon"};
    for (std::size_t source = 0; source < 3; ++source) {
        for (std::size_t target = 0; target < 3; ++target) {
            if (source == target)
                continue;
            SCOPED_TRACE(std::string(kKinds[source].name) + " to " + kKinds[target].name);
            auto from = CreateInstance<IShape>(kKinds[source].clsid);
            auto to = CreateInstance<IShape>(kKinds[target].clsid);
            SetFrame(from, kShifted, {10, 20}, {30, 40});
            ExpectFailure(from->CopyTo(to), {E_INVALIDARG, IID_IShape, notA[source]});
            EXPECT_EQ(MatrixOf(to), kShifted);
            EXPECT_EQ(RangeXOf(to), (RangeInt{10, 20}));
            EXPECT_EQ(RangeYOf(to), (RangeInt{30, 40}));
        }
    }
    auto circle = NewCircle({0.5, 0.5}, 0.0, 0.25);
    auto rectangle = NewRectangle({0.25, 0.25, 0.5, 0.5});
    ExpectFailure(QueryAs<IShape>(circle.Get())->CopyTo(QueryAs<IShape>(rectangle.Get())),
                  {E_INVALIDARG, IID_IShape, u"pIShape object is not a circle"});
    EXPECT_EQ(RectangleOf(rectangle), (RectangleFloat{0.25, 0.25, 0.5, 0.5}));
}

// Two disjoint triangles: after the copy the target's outline runs through both, so it contains the
// inside of each (the connecting edges are traversed there and back and cancel).
TEST_F(ShapesTest, PolygonCopyToAppendsToTheTargetsVertices) {
    auto target = NewPolygon({{0.1, 0.1}, {0.3, 0.1}, {0.1, 0.3}});
    auto source = NewPolygon({{0.6, 0.6}, {0.9, 0.6}, {0.6, 0.9}});
    ASSERT_EQ(QueryAs<IShape>(source.Get())->CopyTo(QueryAs<IShape>(target.Get())), S_OK);
    auto& copied = Object<CShapePolygon>(target);
    EXPECT_TRUE(copied.Contains({0.15, 0.15}));
    EXPECT_TRUE(copied.Contains({0.65, 0.65}));
    EXPECT_FALSE(copied.Contains({0.45, 0.2}));
}

TEST_F(ShapesTest, PolygonCopiedIntoItselfRunsItsOutlineTwice) {
    auto polygon = NewPolygon({{0.1, 0.1}, {0.5, 0.1}, {0.1, 0.5}});
    auto shape = QueryAs<IShape>(polygon.Get());
    ASSERT_EQ(shape->CopyTo(shape), S_OK);
    EXPECT_EQ(polygon->ModifyPoint(5, CreateCoordinate({0.1, 0.5})), S_OK) << "six vertices now";
    EXPECT_EQ(polygon->ModifyPoint(6, CreateCoordinate({0.1, 0.5})), E_INVALIDARG);
    TakeErrorReport();
    EXPECT_TRUE(Object<CShapePolygon>(polygon).Contains({0.2, 0.2}));
    EXPECT_FALSE(Object<CShapePolygon>(polygon).Contains({0.4, 0.4}));
}

} // namespace
} // namespace Norvane::Lumis::Scanning
