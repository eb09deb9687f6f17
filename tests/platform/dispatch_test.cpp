#include "automation_client.h"
#include "test_objects.h"

#include <gtest/gtest.h>

#include <vector>

namespace platform_test {
namespace {

class DispatchTest : public ::testing::Test {
  protected:
    CComPtr<ITestWidget> widget_ =
        Norvane::CComObjectEx<CTestWidget>::CreateInstance<ITestWidget>(5, u"Five");
    AutomationClient client_{widget_};
};

// Identifiers count from 1 over the chain, root interface first, in declaration order:
// ITestShape's Width, Name, Id, then ITestWidget's Small, Count, Partner, Scale, Fail.
TEST_F(DispatchTest, NamesMapToStableIdentifiersIgnoringCase) {
    const struct {
        const char16_t* name;
        DISPID id;
    } cases[] = {
        {u"Width", 1}, {u"width", 1}, {u"WIDTH", 1},   {u"Name", 2},  {u"Id", 3},   {u"Small", 4},
        {u"sMALL", 4}, {u"Count", 5}, {u"Partner", 6}, {u"Scale", 7}, {u"fail", 8},
    };
    const auto other = Norvane::CComObjectEx<CTestWidget>::CreateInstance<ITestWidget>();
    for (const auto& c : cases) {
        SCOPED_TRACE(testing::PrintToString(std::u16string(c.name)));
        EXPECT_EQ(client_.IdOf(c.name), c.id);
        EXPECT_EQ(AutomationClient(other).IdOf(c.name), c.id);
    }
}

TEST_F(DispatchTest, UnknownNameIsRefused) {
    std::u16string name = u"Height";
    LPOLESTR names[] = {name.data()};
    DISPID id = 0;
    EXPECT_EQ(widget_->GetIDsOfNames(GUID_NULL, names, 1, 0, &id), DISP_E_UNKNOWNNAME);
    EXPECT_EQ(id, DISPID_UNKNOWN);
    EXPECT_EQ(client_.Call(u"Height", DISPATCH_PROPERTYGET, {}), DISP_E_UNKNOWNNAME);
}

TEST_F(DispatchTest, NamedArgumentNamesAreUnknown) {
    std::u16string method = u"Scale";
    std::u16string argument = u"factor";
    LPOLESTR names[] = {method.data(), argument.data()};
    DISPID ids[2] = {0, 0};
    EXPECT_EQ(widget_->GetIDsOfNames(GUID_NULL, names, 2, 0, ids), DISP_E_UNKNOWNNAME);
    EXPECT_EQ(ids[0], 7);
    EXPECT_EQ(ids[1], DISPID_UNKNOWN);
}

TEST_F(DispatchTest, PropertyGetReturnsTheStoredValue) {
    ASSERT_EQ(widget_->put_Width(2.5), S_OK);
    CComVariant width;
    ASSERT_EQ(client_.Get(u"Width", width), S_OK);
    EXPECT_EQ(width.vt, VT_R8);
    EXPECT_EQ(width.dblVal, 2.5);

    CComVariant name;
    ASSERT_EQ(client_.Get(u"Name", name), S_OK);
    ASSERT_EQ(name.vt, VT_BSTR);
    EXPECT_EQ(BstrView(name.bstrVal), u"Five");

    CComVariant id;
    ASSERT_EQ(client_.Get(u"Id", id), S_OK);
    EXPECT_EQ(id.vt, VT_I4);
    EXPECT_EQ(id.lVal, 5);
}

TEST_F(DispatchTest, PropertyPutStoresTheConvertedValue) {
    ASSERT_EQ(client_.Put(u"Width", CComVariant(std::int32_t{3})), S_OK); // an integer is a valid double
    double width = 0.0;
    ASSERT_EQ(widget_->get_Width(&width), S_OK);
    EXPECT_EQ(width, 3.0);

    ASSERT_EQ(client_.Put(u"Name", CComVariant(u"Circle")), S_OK);
    CComBSTR name;
    ASSERT_EQ(widget_->get_Name(&name), S_OK);
    EXPECT_EQ(name.View(), u"Circle");

    ASSERT_EQ(client_.Put(u"Partner", CComVariant(static_cast<IUnknown*>(widget_.Get()))), S_OK);
    CComPtr<ITestPlain> partner;
    ASSERT_EQ(widget_->get_Partner(&partner), S_OK);
    EXPECT_EQ(partner.Get(), QueryAs<ITestPlain>(widget_.Get()).Get());
    ASSERT_EQ(widget_->put_Partner(nullptr), S_OK); // breaks the reference cycle
}

TEST_F(DispatchTest, ReadOnlyPropertyCannotBePut) {
    EXPECT_EQ(client_.Put(u"Id", CComVariant(std::int32_t{9})), DISP_E_MEMBERNOTFOUND);
}

TEST_F(DispatchTest, MethodTakesItsInputsInDeclarationOrderAndReturnsItsResult) {
    CComVariant result;
    ASSERT_EQ(
        client_.Call(u"Scale", DISPATCH_METHOD, {CComVariant(1.5), CComVariant(std::int32_t{4})}, &result),
        S_OK);
    EXPECT_EQ(result.vt, VT_R8);
    EXPECT_EQ(result.dblVal, 6.0); // 1.5 * 4
}

TEST_F(DispatchTest, UnknownIdentifierIsRefused) {
    DISPPARAMS none{nullptr, nullptr, 0, 0};
    EXPECT_EQ(widget_->Invoke(99, GUID_NULL, 0, DISPATCH_PROPERTYGET, &none, nullptr, nullptr, nullptr),
              DISP_E_MEMBERNOTFOUND);
    EXPECT_EQ(widget_->Invoke(0, GUID_NULL, 0, DISPATCH_PROPERTYGET, &none, nullptr, nullptr, nullptr),
              DISP_E_MEMBERNOTFOUND);
}

// Conversions refuse values that would change on the way in; the stored value stays as it was and the
// failing argument is reported by its position in the call record (last argument at 0).
struct ConversionCase {
    const char* label;
    const char16_t* member;
    WORD flags;
    std::vector<CComVariant> args;
    HRESULT expected;
    UINT argumentError;
};

class ConversionTest : public DispatchTest, public ::testing::WithParamInterface<ConversionCase> {};

TEST_P(ConversionTest, RefusesOrAcceptsAsTheTypesRequire) {
    const ConversionCase& c = GetParam();
    ASSERT_EQ(widget_->put_Small(11), S_OK);
    UINT argumentError = 1000;
    CComVariant result;
    EXPECT_EQ(client_.Call(c.member, c.flags, c.args, &result, nullptr, &argumentError), c.expected);
    if (FAILED(c.expected)) {
        EXPECT_EQ(argumentError, c.argumentError);
        std::int16_t small = 0;
        ASSERT_EQ(widget_->get_Small(&small), S_OK);
        EXPECT_EQ(small, 11);
    }
}

const ConversionCase kConversions[] = {
    {"string for a double",
     u"Scale",
     DISPATCH_METHOD,
     {CComVariant(u"abc"), CComVariant(std::int32_t{2})},
     DISP_E_TYPEMISMATCH,
     1},
    {"string for an int32",
     u"Scale",
     DISPATCH_METHOD,
     {CComVariant(1.0), CComVariant(u"2")},
     DISP_E_TYPEMISMATCH,
     0},
    {"2.5 for an int32",
     u"Scale",
     DISPATCH_METHOD,
     {CComVariant(1.0), CComVariant(2.5)},
     DISP_E_TYPEMISMATCH,
     0},
    {"whole 3.0 for an int32", u"Scale", DISPATCH_METHOD, {CComVariant(1.0), CComVariant(3.0)}, S_OK, 0},
    {"boolean for a double",
     u"Scale",
     DISPATCH_METHOD,
     {CComVariant(true), CComVariant(std::int32_t{2})},
     DISP_E_TYPEMISMATCH,
     1},
    {"32767 is the largest int16",
     u"Small",
     DISPATCH_PROPERTYPUT,
     {CComVariant(std::int32_t{32767})},
     S_OK,
     0},
    {"-32768 is the smallest int16",
     u"Small",
     DISPATCH_PROPERTYPUT,
     {CComVariant(std::int32_t{-32768})},
     S_OK,
     0},
    {"32768 overflows int16",
     u"Small",
     DISPATCH_PROPERTYPUT,
     {CComVariant(std::int32_t{32768})},
     DISP_E_OVERFLOW,
     0},
    {"40000 overflows int16",
     u"Small",
     DISPATCH_PROPERTYPUT,
     {CComVariant(std::int32_t{40000})},
     DISP_E_OVERFLOW,
     0},
    {"-32769 overflows int16",
     u"Small",
     DISPATCH_PROPERTYPUT,
     {CComVariant(std::int32_t{-32769})},
     DISP_E_OVERFLOW,
     0},
    {"whole 1e10 overflows int16", u"Small", DISPATCH_PROPERTYPUT, {CComVariant(1e10)}, DISP_E_OVERFLOW, 0},
    {"string for an object", u"Partner", DISPATCH_PROPERTYPUT, {CComVariant(u"x")}, DISP_E_TYPEMISMATCH, 0},
    {"one argument for two", u"Scale", DISPATCH_METHOD, {CComVariant(1.0)}, DISP_E_BADPARAMCOUNT, 1000},
    {"three arguments for two",
     u"Scale",
     DISPATCH_METHOD,
     {CComVariant(1.0), CComVariant(std::int32_t{2}), CComVariant(std::int32_t{3})},
     DISP_E_BADPARAMCOUNT,
     1000},
    {"argument for a property get",
     u"Width",
     DISPATCH_PROPERTYGET,
     {CComVariant(1.0)},
     DISP_E_BADPARAMCOUNT,
     1000},
};

INSTANTIATE_TEST_SUITE_P(Dispatch, ConversionTest, ::testing::ValuesIn(kConversions),
                         [](const auto& test) { return std::to_string(test.index); });

TEST_F(DispatchTest, UnsignedBeyondInt32Overflows) {
    CComVariant large;
    large.vt = VT_UI4;
    large.ulVal = 0x80000000u; // 2147483648, one more than the largest int32
    UINT argumentError = 1000;
    EXPECT_EQ(client_.Put(u"Count", large, &argumentError), DISP_E_OVERFLOW);
    EXPECT_EQ(argumentError, 0u);
}

TEST_F(DispatchTest, ObjectWithoutTheParameterInterfaceIsAMismatch) {
    CComPtr<ICreateErrorInfo> unrelated;
    ASSERT_EQ(CreateErrorInfo(&unrelated), S_OK);
    EXPECT_EQ(client_.Put(u"Partner", CComVariant(static_cast<IUnknown*>(unrelated.Get()))),
              DISP_E_TYPEMISMATCH);
}

TEST_F(DispatchTest, FailureWithExceptionRecordCarriesTheMethodsErrorInformation) {
    EXCEPINFO exception{};
    const HRESULT hr = client_.Call(u"Fail", DISPATCH_METHOD, {CComVariant(u"Width values not correct")},
                                    nullptr, &exception);
    EXPECT_EQ(hr, DISP_E_EXCEPTION);
    EXPECT_EQ(exception.scode, E_INVALIDARG);
    EXPECT_EQ(BstrView(exception.bstrDescription), u"Width values not correct");
    EXPECT_EQ(BstrView(exception.bstrSource), u"PlatformTest");
    ClearExcepInfo(&exception);
    EXPECT_EQ(exception.bstrDescription, nullptr);
    // The record took the error information over.
    CComPtr<IErrorInfo> left;
    EXPECT_EQ(GetErrorInfo(0, &left), S_FALSE);
}

TEST_F(DispatchTest, FailureWithoutExceptionRecordReturnsTheMethodsResult) {
    EXPECT_EQ(client_.Call(u"Fail", DISPATCH_METHOD, {CComVariant(u"Pitch values not correct")}),
              E_INVALIDARG);
    CComPtr<IErrorInfo> info;
    ASSERT_EQ(GetErrorInfo(0, &info), S_OK);
    CComBSTR description;
    ASSERT_EQ(info->GetDescription(&description), S_OK);
    EXPECT_EQ(description.View(), u"Pitch values not correct");
}

TEST_F(DispatchTest, TypeInformationDescribesTheInterfaceChain) {
    UINT count = 0;
    ASSERT_EQ(widget_->GetTypeInfoCount(&count), S_OK);
    EXPECT_EQ(count, 1u);
    ITypeInfo* none = nullptr;
    EXPECT_EQ(widget_->GetTypeInfo(1, 0, &none), DISP_E_BADINDEX);

    CComPtr<ITypeInfo> info;
    ASSERT_EQ(widget_->GetTypeInfo(0, 0, &info), S_OK);
    const InterfaceDescription* description = nullptr;
    ASSERT_EQ(info->GetInterfaceDescription(&description), S_OK);
    EXPECT_STREQ(description->name, "ITestWidget");
    EXPECT_EQ(*description->iid, IID_ITestWidget);
    ASSERT_NE(description->base, nullptr);
    EXPECT_STREQ(description->base()->name, "ITestShape");
    EXPECT_EQ(description->base()->base, nullptr);

    const struct {
        const char* name;
        MemberKind kind;
        std::vector<VARTYPE> params;
        VARTYPE result;
    } expected[] = {
        {"Small", MemberKind::PropertyGet, {}, VT_I2},
        {"Small", MemberKind::PropertyPut, {VT_I2}, VT_EMPTY},
        {"Count", MemberKind::PropertyGet, {}, VT_I4},
        {"Count", MemberKind::PropertyPut, {VT_I4}, VT_EMPTY},
        {"Partner", MemberKind::PropertyGet, {}, VT_UNKNOWN},
        {"Partner", MemberKind::PropertyPut, {VT_UNKNOWN}, VT_EMPTY},
        {"Scale", MemberKind::Method, {VT_R8, VT_I4}, VT_R8},
        {"Fail", MemberKind::Method, {VT_BSTR}, VT_EMPTY},
    };
    ASSERT_EQ(description->members.size(), std::size(expected));
    for (std::size_t i = 0; i < std::size(expected); ++i) {
        const MemberDescription& m = description->members[i];
        SCOPED_TRACE(m.name);
        EXPECT_STREQ(m.name, expected[i].name);
        EXPECT_EQ(m.kind, expected[i].kind);
        std::vector<VARTYPE> params;
        for (const ParamType& p : m.params)
            params.push_back(p.vt);
        EXPECT_EQ(params, expected[i].params);
        EXPECT_EQ(m.result.vt, expected[i].result);
    }
    // Interface-typed members name their interface.
    ASSERT_NE(description->members[4].result.iid, nullptr);
    EXPECT_EQ(*description->members[4].result.iid, IID_ITestPlain);
}

} // namespace
} // namespace platform_test
