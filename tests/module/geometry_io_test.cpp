#include "module/geometry_io.h"

#include "comtypes/comtypes_registration.h"
#include "module/hresult_exception.h"
#include "module/rectangle_int_impl.h"
#include "module/size_int.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <limits>
#include <stdexcept>
#include <string>

namespace {

using namespace Norvane::Lumis;
using Norvane::HResultException;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

class GeometryIoTest : public ::testing::Test {
  protected:
    void SetUp() override { RegisterComTypesClasses(); }
};

// ---- readers -----------------------------------------------------------------------------------------

struct NullRead {
    const char* interfaceName;
    std::function<void()> read;
    HRESULT hr;
};

class NullReadTest : public ::testing::TestWithParam<NullRead> {};

TEST_P(NullReadTest, GivesItsHresultAndNamesTheInterface) {
    try {
        GetParam().read();
        FAIL() << "no exception";
    } catch (const HResultException& e) {
        EXPECT_EQ(e.Error(), GetParam().hr);
        EXPECT_EQ(e.Description(), u"null " + Utf8ToUtf16(GetParam().interfaceName));
    }
}

// Sizes and float rectangles are refused as invalid arguments, every other value as a null pointer.
INSTANTIATE_TEST_SUITE_P(
    AllReaders, NullReadTest,
    ::testing::Values(NullRead{"ISize2DInt", [] { ReadSize(nullptr); }, E_INVALIDARG},
                      NullRead{"IRectangleFloat", [] { ReadRectangleFloat(nullptr); }, E_INVALIDARG},
                      NullRead{"IRectangleInt", [] { ReadRectangleInt(nullptr); }, E_POINTER},
                      NullRead{"IRangeInt", [] { ReadRange(nullptr); }, E_POINTER},
                      NullRead{"ICoordinateFloat", [] { ReadCoordinate(nullptr); }, E_POINTER},
                      NullRead{"ITransformationMatrix2D", [] { ReadMatrix(nullptr); }, E_POINTER}),
    [](const auto& test) { return std::string(test.param.interfaceName); });

// Every field gets a different value, so a swapped getter or setter shows.
TEST_F(GeometryIoTest, CoordinateRoundTrip) {
    const coordinate<double> value{0.25, -3.5};
    EXPECT_EQ(ReadCoordinate(CreateCoordinate(value)), value);
}

TEST_F(GeometryIoTest, FloatRectangleRoundTrip) {
    const RectangleFloat value{0.1, 0.2, 0.3, 0.4};
    EXPECT_EQ(ReadRectangleFloat(CreateRectangleFloat(value)), value);
}

TEST_F(GeometryIoTest, IntegerRectangleRoundTrip) {
    const RectangleInt value{-1, 2, std::numeric_limits<std::int32_t>::max(),
                             std::numeric_limits<std::int32_t>::min()};
    EXPECT_EQ(ReadRectangleInt(CreateRectangleInt(value)), value);
}

TEST_F(GeometryIoTest, RangeRoundTrip) {
    const RangeInt value{16384, 49152};
    EXPECT_EQ(ReadRange(CreateRange(value)), value);
}

TEST_F(GeometryIoTest, SizeRoundTrip) {
    const SizeInt value{640, 480};
    EXPECT_EQ(ReadSize(CreateSize(value)), value);
}

TEST_F(GeometryIoTest, MatrixRoundTrip) {
    const TransformationMatrix value{1.5, 2.5, 3.5, 4.5, 5.5, 6.5};
    EXPECT_EQ(ReadMatrix(CreateMatrix(value)), value);
}

// A coordinate whose Y property fails, for the errors of a callee.
class FailingCoordinate : public CComObjectRootBase, public IDispatchImpl<ICoordinateFloat> {
  public:
    using Interfaces = InterfaceMap<ICoordinateFloat>;

    HRESULT get_X(double* value) override {
        *value = 0.5;
        return S_OK;
    }
    HRESULT put_X(double) override { return S_OK; }
    HRESULT get_Y(double*) override { return E_NOTIMPL; }
    HRESULT put_Y(double) override { return E_NOTIMPL; }
};

TEST(FailingCalleeTest, ReaderPassesOnTheGetterResult) {
    auto object = Norvane::CComObjectEx<FailingCoordinate>::CreateInstance<ICoordinateFloat>();
    try {
        ReadCoordinate(object);
        FAIL() << "no exception";
    } catch (const HResultException& e) {
        EXPECT_EQ(e.Error(), E_NOTIMPL);
    }
}

// The failing class stands in for the coordinate class; the half-set object is released (the leak
// checker of the sanitizer build would report it otherwise).
TEST(FailingCalleeTest, CreatorPassesOnTheSetterResult) {
    RegisterClasses({{CLSID_CoordinateFloat, "CoordinateFloat", "NorvaneComTypes.CoordinateFloat",
                      ThreadingModel::Free, &ComCreator<FailingCoordinate>::CreateInstance<>}});
    HRESULT hr = S_OK;
    try {
        CreateCoordinate({0.5, 0.5});
    } catch (const HResultException& e) {
        hr = e.Error();
    }
    RegisterComTypesClasses();
    EXPECT_EQ(hr, E_NOTIMPL);
}

// ---- creation failures ---------------------------------------------------------------------------

struct FailedCreation {
    const char* name;
    std::function<void()> create;
    const char* clsidText;
};

// Runs with the value classes unregistered and registers them again afterwards.
class FailedCreationTest : public ::testing::TestWithParam<FailedCreation> {
  protected:
    void SetUp() override { UnregisterClasses(ComTypesClassEntries()); }
    void TearDown() override { RegisterComTypesClasses(); }
};

TEST_P(FailedCreationTest, CarriesTheCreationResultAndTheClassIdentifier) {
    try {
        GetParam().create();
        FAIL() << "no exception";
    } catch (const HResultException& e) {
        EXPECT_EQ(e.Error(), REGDB_E_CLASSNOTREG);
        const std::string expected = std::string("CoCreateInstance(") + GetParam().clsidText + ")";
        EXPECT_NE(std::string(e.what()).find(expected), std::string::npos) << e.what();
    }
}

INSTANTIATE_TEST_SUITE_P(
    AllCreators, FailedCreationTest,
    ::testing::Values(
        FailedCreation{"Coordinate", [] { CreateCoordinate({}); }, "{40DD0D08-DAF0-40ED-9F3D-3A5E84823F7F}"},
        FailedCreation{"RectangleFloat", [] { CreateRectangleFloat({}); },
                       "{7C501DC9-328E-4F3B-AAC8-543D91709D67}"},
        FailedCreation{"RectangleInt", [] { CreateRectangleInt({}); },
                       "{A6F675B0-803F-40AE-A4E3-60D89F92B5DF}"},
        FailedCreation{"Range", [] { CreateRange({}); }, "{96DE4772-75A0-4A11-AF23-3A04A2DEA03D}"},
        FailedCreation{"Size", [] { CreateSize({}); }, "{CF088B0B-1867-4C53-8DAF-6BA0268CDFBC}"},
        FailedCreation{"Matrix", [] { CreateMatrix({}); }, "{A2C05F96-E0DC-4C77-B819-56FD1AF851BB}"}),
    [](const auto& test) { return std::string(test.param.name); });

// ---- matrix inversion ----------------------------------------------------------------------------

// (a ∘ b)(p) = a(b(p)).
TransformationMatrix Compose(const TransformationMatrix& a, const TransformationMatrix& b) {
    return {a.m0 * b.m0 + a.m1 * b.m3, a.m0 * b.m1 + a.m1 * b.m4, a.m0 * b.m2 + a.m1 * b.m5 + a.m2,
            a.m3 * b.m0 + a.m4 * b.m3, a.m3 * b.m1 + a.m4 * b.m4, a.m3 * b.m2 + a.m4 * b.m5 + a.m5};
}

TEST(InvertMatrixTest, IdentityIsItsOwnInverse) {
    EXPECT_EQ(InvertMatrix(TransformationMatrix{}), TransformationMatrix{});
}

// det = 0·0 − 2·(−2) = 4: i0 = 0/4, i1 = −2/4, i2 = (3·2 − 1·0)/4, i3 = 2/4, i4 = 0/4, i5 = (−2·1 − 0·3)/4.
TEST(InvertMatrixTest, RotationWithScaleAndShift) {
    const TransformationMatrix m{0.0, 2.0, 1.0, -2.0, 0.0, 3.0};
    const TransformationMatrix inverse = InvertMatrix(m);
    EXPECT_EQ(inverse, (TransformationMatrix{0.0, -0.5, 1.5, 0.5, 0.0, -0.5}));
    EXPECT_EQ(Compose(m, inverse), TransformationMatrix{});
    EXPECT_EQ(Compose(inverse, m), TransformationMatrix{});
}

// det = 2·1 − 1·1 = 1, a shear with a negative translation.
TEST(InvertMatrixTest, ShearComposesToIdentity) {
    const TransformationMatrix m{2.0, 1.0, 3.0, 1.0, 1.0, -1.0};
    EXPECT_EQ(InvertMatrix(m), (TransformationMatrix{1.0, -1.0, -4.0, -1.0, 2.0, 5.0}));
    EXPECT_EQ(Compose(m, InvertMatrix(m)), TransformationMatrix{});
}

TEST(InvertMatrixTest, MatricesWithoutInverseOverflow) {
    const TransformationMatrix cases[] = {
        {1.0, 2.0, 5.0, 2.0, 4.0, 7.0},   // m0·m4 = m1·m3 = 4
        {0.0, 0.0, 1.0, 0.0, 0.0, 1.0},   // no linear part
        {kNaN, 0.0, 0.0, 0.0, 1.0, 0.0},  // the determinant is not a number
        {0.5, 0.0, 1e308, 0.0, 1.0, 0.0}, // the inverse shift −1e308/0.5 is beyond the largest double
    };
    for (const auto& m : cases) {
        try {
            InvertMatrix(m);
            ADD_FAILURE() << "no exception for m0 = " << m.m0 << ", m2 = " << m.m2;
        } catch (const std::overflow_error& e) {
            EXPECT_STREQ(e.what(), "matrix inverse does not exist");
        }
    }
}

// ---- relative checks -----------------------------------------------------------------------------

template <class F> std::string InvalidArgumentMessage(F&& call) {
    try {
        call();
    } catch (const std::invalid_argument& e) {
        return e.what();
    }
    return "no exception";
}

struct RelativeCoordinate {
    coordinate<double> value;
    bool inside;
};

class RelativeCoordinateTest : public ::testing::TestWithParam<RelativeCoordinate> {
  protected:
    void SetUp() override { RegisterComTypesClasses(); }
};

TEST_P(RelativeCoordinateTest, BoundsAreInclusive) {
    auto object = CreateCoordinate(GetParam().value);
    if (GetParam().inside)
        EXPECT_EQ(ReadRelativeCoordinate(object, "Begin"), GetParam().value);
    else
        EXPECT_EQ(InvalidArgumentMessage([&] { ReadRelativeCoordinate(object, "Begin"); }),
                  "Begin values not correct");
}

INSTANTIATE_TEST_SUITE_P(Cases, RelativeCoordinateTest,
                         ::testing::Values(RelativeCoordinate{{0.0, 0.0}, true},
                                           RelativeCoordinate{{1.0, 1.0}, true},
                                           RelativeCoordinate{{1.0000001, 0.5}, false},
                                           RelativeCoordinate{{0.5, -1e-12}, false},
                                           RelativeCoordinate{{0.5, kNaN}, false}));

TEST(RelativeCheckTest, NullObjectsNameTheProperty) {
    EXPECT_EQ(InvalidArgumentMessage([] { ReadRelativeCoordinate(nullptr, "Point"); }),
              "Point object is null");
    EXPECT_EQ(InvalidArgumentMessage([] { ReadRelativeRectangle(nullptr); }), "Rectangle object is null");
    EXPECT_EQ(InvalidArgumentMessage([] { ReadMatrixProperty(nullptr, "TransformationMatrix"); }),
              "TransformationMatrix object is null");
}

struct RelativeRectangle {
    RectangleFloat value;
    bool inside;
};

class RelativeRectangleTest : public ::testing::TestWithParam<RelativeRectangle> {
  protected:
    void SetUp() override { RegisterComTypesClasses(); }
};

TEST_P(RelativeRectangleTest, CornersInOrderInsideTheField) {
    auto object = CreateRectangleFloat(GetParam().value);
    if (GetParam().inside)
        EXPECT_EQ(ReadRelativeRectangle(object), GetParam().value);
    else
        EXPECT_EQ(InvalidArgumentMessage([&] { ReadRelativeRectangle(object); }),
                  "Rectangle values not correct");
}

INSTANTIATE_TEST_SUITE_P(Cases, RelativeRectangleTest,
                         ::testing::Values(RelativeRectangle{{0.0, 0.0, 1.0, 1.0}, true},
                                           RelativeRectangle{{0.5, 0.2, 0.5, 0.8}, true},   // left = right
                                           RelativeRectangle{{0.2, 0.5, 0.8, 0.5}, true},   // top = bottom
                                           RelativeRectangle{{0.6, 0.2, 0.5, 0.8}, false},  // right < left
                                           RelativeRectangle{{0.2, 0.6, 0.8, 0.5}, false},  // bottom < top
                                           RelativeRectangle{{-0.1, 0.2, 0.5, 0.8}, false}, // left < 0
                                           RelativeRectangle{{0.2, 0.2, 1.1, 0.8}, false},  // right > 1
                                           RelativeRectangle{{0.2, 0.2, 0.5, kNaN}, false}));

TEST_F(GeometryIoTest, MatrixPropertyReadsTheSixCoefficients) {
    const TransformationMatrix value{1.0, 2.0, 3.0, 4.0, 5.0, 6.0};
    EXPECT_EQ(ReadMatrixProperty(CreateMatrix(value), "TransformationMatrix"), value);
}

// ---- value objects the library hands out itself -----------------------------------------------------

TEST(SizeIntTest, HoldsACopyAndStoresAnyValue) {
    auto size = Common::CreateSizeInt({640, 480});
    std::int32_t width = 0;
    std::int32_t height = 0;
    ASSERT_EQ(size->get_Width(&width), S_OK);
    ASSERT_EQ(size->get_Height(&height), S_OK);
    EXPECT_EQ(width, 640);
    EXPECT_EQ(height, 480);

    ASSERT_EQ(size->put_Width(-7), S_OK);
    ASSERT_EQ(size->put_Height(9), S_OK);
    size->get_Width(&width);
    size->get_Height(&height);
    EXPECT_EQ(width, -7);
    EXPECT_EQ(height, 9);

    EXPECT_EQ(size->get_Width(nullptr), E_POINTER);
    EXPECT_EQ(size->get_Height(nullptr), E_POINTER);
    EXPECT_TRUE(QueryAs<IDispatch>(size.Get()));
}

TEST(RectangleIntImplTest, HoldsACopyInFieldOrder) {
    auto rectangle = Common::CreateRectangleIntImpl({1, 2, 3, 4});
    EXPECT_EQ(ReadRectangleInt(rectangle), (RectangleInt{1, 2, 3, 4}));

    ASSERT_EQ(rectangle->put_Left(10), S_OK);
    ASSERT_EQ(rectangle->put_Top(20), S_OK);
    ASSERT_EQ(rectangle->put_Right(30), S_OK);
    ASSERT_EQ(rectangle->put_Bottom(40), S_OK);
    EXPECT_EQ(ReadRectangleInt(rectangle), (RectangleInt{10, 20, 30, 40}));

    EXPECT_EQ(rectangle->get_Left(nullptr), E_POINTER);
    EXPECT_EQ(rectangle->get_Bottom(nullptr), E_POINTER);
}

} // namespace
