// Shared pieces of the exclusion shape tests: reading back error information, the shape kinds, and a
// fixture that registers the classes and creates, sets and reads shapes.
#pragma once

#include "composition/exclusion_shape_classes.h"
#include "composition/shape_circle.h"
#include "composition/shape_polygon.h"
#include "composition/shape_rectangle.h"

#include "module/class_table.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <vector>

namespace Norvane::Lumis::Scanning::shape_testing {

struct ErrorReport {
    GUID guid{};
    std::u16string description;
};

// Takes the thread's error information out of its slot; nothing when there is none.
inline std::optional<ErrorReport> TakeErrorReport() {
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

// A failed call: its HRESULT, and the interface and message of its error information (no message: the
// call must leave no error information).
struct Failure {
    HRESULT hr;
    GUID iid{};
    std::u16string message;
};

inline void ExpectFailure(HRESULT actual, const Failure& expected) {
    EXPECT_EQ(actual, expected.hr);
    const auto report = TakeErrorReport();
    if (expected.message.empty()) {
        EXPECT_FALSE(report.has_value());
        return;
    }
    ASSERT_TRUE(report.has_value());
    EXPECT_EQ(report->guid, expected.iid);
    EXPECT_EQ(report->description, expected.message);
}

struct ShapeKind {
    const char* name;
    CLSID clsid;
};

inline const ShapeKind kKinds[] = {
    {"Rectangle", CLSID_ShapeRectangle}, {"Circle", CLSID_ShapeCircle}, {"Polygon", CLSID_ShapePolygon}};

class ShapesTest : public ::testing::Test {
  protected:
    void SetUp() override {
        RegisterComponents();
        RegisterClasses(ExclusionShapeClassEntries());
        SetErrorInfo(0, nullptr);
    }

    // The C++ object behind a shape created by class identifier, for its containment test.
    template <class T, class I> static T& Object(const CComPtr<I>& shape) {
        return *static_cast<T*>(shape.Get());
    }

    static CComPtr<IShapeRectangle> NewRectangle(const RectangleFloat& r) {
        auto shape = CreateInstance<IShapeRectangle>(CLSID_ShapeRectangle);
        EXPECT_EQ(shape->put_Rectangle(CreateRectangleFloat(r)), S_OK);
        return shape;
    }
    static CComPtr<IShapeCircle> NewCircle(coordinate<double> center, double inner, double outer) {
        auto shape = CreateInstance<IShapeCircle>(CLSID_ShapeCircle);
        EXPECT_EQ(shape->put_Center(CreateCoordinate(center)), S_OK);
        EXPECT_EQ(shape->put_InnerRadius(inner), S_OK);
        EXPECT_EQ(shape->put_OuterRadius(outer), S_OK);
        return shape;
    }
    static CComPtr<IShapePolygon> NewPolygon(const std::vector<coordinate<double>>& vertices) {
        auto shape = CreateInstance<IShapePolygon>(CLSID_ShapePolygon);
        for (const auto& vertex : vertices)
            EXPECT_EQ(shape->AddPoint(CreateCoordinate(vertex)), S_OK);
        return shape;
    }

    static TransformationMatrix MatrixOf(IShape* shape) {
        CComPtr<ITransformationMatrix2D> matrix;
        EXPECT_EQ(shape->get_TransformationMatrix(&matrix), S_OK);
        return ReadMatrix(matrix);
    }
    static RangeInt RangeXOf(IShape* shape) {
        CComPtr<IRangeInt> range;
        EXPECT_EQ(shape->get_DACRangeX(&range), S_OK);
        return ReadRange(range);
    }
    static RangeInt RangeYOf(IShape* shape) {
        CComPtr<IRangeInt> range;
        EXPECT_EQ(shape->get_DACRangeY(&range), S_OK);
        return ReadRange(range);
    }
    static void SetFrame(IShape* shape, const TransformationMatrix& matrix, RangeInt x, RangeInt y) {
        EXPECT_EQ(shape->put_TransformationMatrix(CreateMatrix(matrix)), S_OK);
        EXPECT_EQ(shape->put_DACRangeX(CreateRange(x)), S_OK);
        EXPECT_EQ(shape->put_DACRangeY(CreateRange(y)), S_OK);
    }
    static RectangleFloat RectangleOf(IShapeRectangle* shape) {
        CComPtr<IRectangleFloat> rectangle;
        EXPECT_EQ(shape->get_Rectangle(&rectangle), S_OK);
        return ReadRectangleFloat(rectangle);
    }
    static coordinate<double> CenterOf(IShapeCircle* shape) {
        CComPtr<ICoordinateFloat> center;
        EXPECT_EQ(shape->get_Center(&center), S_OK);
        return ReadCoordinate(center);
    }
};

} // namespace Norvane::Lumis::Scanning::shape_testing
