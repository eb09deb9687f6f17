#include "comtypes/comtypes_registration.h"

#include "platform/dispatch_impl.h"

#include <beamweaver/comtypes.h>

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

namespace {

struct ValueClass {
    const char* name;
    CLSID clsid;
    IID iid;
};

const ValueClass kValueClasses[] = {
    {"CoordinateFloat", CLSID_CoordinateFloat, IID_ICoordinateFloat},
    {"RectangleFloat", CLSID_RectangleFloat, IID_IRectangleFloat},
    {"RectangleInt", CLSID_RectangleInt, IID_IRectangleInt},
    {"RangeInt", CLSID_RangeInt, IID_IRangeInt},
    {"Size2DInt", CLSID_Size2DInt, IID_ISize2DInt},
    {"TransformationMatrix2D", CLSID_TransformationMatrix2D, IID_ITransformationMatrix2D},
};

template <class I> CComPtr<I> Create(REFCLSID clsid) {
    CComPtr<I> object;
    EXPECT_EQ(CoCreateInstance(clsid, nullptr, CLSCTX_ALL, I::iid, reinterpret_cast<void**>(&object)), S_OK);
    return object;
}

class ComTypesTest : public ::testing::Test {
  protected:
    void SetUp() override { RegisterComTypesClasses(); }
};

class ValueClassTest : public ::testing::TestWithParam<ValueClass> {
  protected:
    void SetUp() override { RegisterComTypesClasses(); }
};

TEST_P(ValueClassTest, CreatedByClassIdentifierAnswersItsInterfaceAndDispatch) {
    CComPtr<IUnknown> object;
    ASSERT_EQ(CoCreateInstance(GetParam().clsid, nullptr, CLSCTX_ALL, GetParam().iid,
                               reinterpret_cast<void**>(&object)),
              S_OK);
    ASSERT_TRUE(object);
    EXPECT_TRUE(QueryAs<IDispatch>(object.Get()));
}

TEST_P(ValueClassTest, ProgIdNamesTheClassAndIsFreeThreaded) {
    const std::string progId = std::string("NorvaneComTypes.") + GetParam().name;
    CLSID clsid{};
    ASSERT_EQ(CLSIDFromProgID(Utf8ToUtf16(progId).c_str(), &clsid), S_OK);
    EXPECT_EQ(clsid, GetParam().clsid);

    const ClassEntry* entry = FindClassByName(progId + ".1");
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->name, GetParam().name);
    EXPECT_EQ(entry->threading, ThreadingModel::Free);
}

TEST_P(ValueClassTest, IsTheDefaultClassOfItsInterface) {
    const ClassEntry* entry = FindDefaultClass(GetParam().iid);
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->clsid, GetParam().clsid);
}

INSTANTIATE_TEST_SUITE_P(AllClasses, ValueClassTest, ::testing::ValuesIn(kValueClasses),
                         [](const auto& test) { return std::string(test.param.name); });

TEST_F(ComTypesTest, RegisteringTwiceKeepsOneWorkingEntry) {
    RegisterComTypesClasses();
    EXPECT_TRUE(Create<ICoordinateFloat>(CLSID_CoordinateFloat));
}

TEST_F(ComTypesTest, NewObjectsHoldZeroAndTheMatrixTheIdentity) {
    auto coordinate = Create<ICoordinateFloat>(CLSID_CoordinateFloat);
    double x = -1.0;
    ASSERT_EQ(coordinate->get_X(&x), S_OK);
    EXPECT_EQ(x, 0.0);

    auto matrix = Create<ITransformationMatrix2D>(CLSID_TransformationMatrix2D);
    double m[6] = {};
    matrix->get_M0(&m[0]);
    matrix->get_M1(&m[1]);
    matrix->get_M2(&m[2]);
    matrix->get_M3(&m[3]);
    matrix->get_M4(&m[4]);
    matrix->get_M5(&m[5]);
    EXPECT_EQ(m[0], 1.0);
    EXPECT_EQ(m[1], 0.0);
    EXPECT_EQ(m[2], 0.0);
    EXPECT_EQ(m[3], 0.0);
    EXPECT_EQ(m[4], 1.0);
    EXPECT_EQ(m[5], 0.0);
}

TEST_F(ComTypesTest, GettersRefuseANullOutPointer) {
    EXPECT_EQ(Create<ICoordinateFloat>(CLSID_CoordinateFloat)->get_Y(nullptr), E_POINTER);
    EXPECT_EQ(Create<IRectangleFloat>(CLSID_RectangleFloat)->get_Bottom(nullptr), E_POINTER);
    EXPECT_EQ(Create<IRectangleInt>(CLSID_RectangleInt)->get_Left(nullptr), E_POINTER);
    EXPECT_EQ(Create<IRangeInt>(CLSID_RangeInt)->get_Maximum(nullptr), E_POINTER);
    EXPECT_EQ(Create<ISize2DInt>(CLSID_Size2DInt)->get_Width(nullptr), E_POINTER);
    EXPECT_EQ(Create<ITransformationMatrix2D>(CLSID_TransformationMatrix2D)->get_M5(nullptr), E_POINTER);
}

TEST_F(ComTypesTest, AnyValueIsAccepted) {
    auto range = Create<IRangeInt>(CLSID_RangeInt);
    ASSERT_EQ(range->put_Minimum(std::numeric_limits<std::int32_t>::max()), S_OK);
    ASSERT_EQ(range->put_Maximum(std::numeric_limits<std::int32_t>::min()), S_OK);
    std::int32_t minimum = 0;
    std::int32_t maximum = 0;
    range->get_Minimum(&minimum);
    range->get_Maximum(&maximum);
    EXPECT_EQ(minimum, std::numeric_limits<std::int32_t>::max());
    EXPECT_EQ(maximum, std::numeric_limits<std::int32_t>::min());

    auto coordinate = Create<ICoordinateFloat>(CLSID_CoordinateFloat);
    ASSERT_EQ(coordinate->put_X(std::numeric_limits<double>::quiet_NaN()), S_OK);
    double x = 0.0;
    coordinate->get_X(&x);
    EXPECT_TRUE(std::isnan(x));
}

TEST_F(ComTypesTest, AutomationReachesThePropertiesByName) {
    auto coordinate = Create<ICoordinateFloat>(CLSID_CoordinateFloat);
    auto dispatch = QueryAs<IDispatch>(coordinate.Get());
    ASSERT_TRUE(dispatch);

    std::u16string xName = u"X";
    std::u16string yName = u"y"; // automation names ignore case
    LPOLESTR names[] = {xName.data(), yName.data()};
    DISPID x = DISPID_UNKNOWN;
    DISPID y = DISPID_UNKNOWN;
    ASSERT_EQ(dispatch->GetIDsOfNames(GUID_NULL, &names[0], 1, 0, &x), S_OK);
    ASSERT_EQ(dispatch->GetIDsOfNames(GUID_NULL, &names[1], 1, 0, &y), S_OK);

    CComVariant newX(0.25);
    DISPID putId = DISPID_PROPERTYPUT;
    DISPPARAMS put{&newX, &putId, 1, 1};
    ASSERT_EQ(dispatch->Invoke(x, GUID_NULL, 0, DISPATCH_PROPERTYPUT, &put, nullptr, nullptr, nullptr), S_OK);
    double stored = 0.0;
    coordinate->get_X(&stored);
    EXPECT_EQ(stored, 0.25);

    coordinate->put_Y(0.75);
    DISPPARAMS none{nullptr, nullptr, 0, 0};
    CComVariant result;
    ASSERT_EQ(dispatch->Invoke(y, GUID_NULL, 0, DISPATCH_PROPERTYGET, &none, &result, nullptr, nullptr),
              S_OK);
    EXPECT_EQ(result.vt, VT_R8);
    EXPECT_EQ(result.dblVal, 0.75);
}

TEST_F(ComTypesTest, UnregisteredClassesCannotBeCreated) {
    UnregisterClasses(ComTypesClassEntries());
    CComPtr<IUnknown> object;
    const HRESULT hr = CoCreateInstance(CLSID_RangeInt, nullptr, CLSCTX_ALL, IID_IRangeInt,
                                        reinterpret_cast<void**>(&object));
    RegisterComTypesClasses();
    EXPECT_EQ(hr, REGDB_E_CLASSNOTREG);
    EXPECT_TRUE(Create<IRangeInt>(CLSID_RangeInt));
}

} // namespace
