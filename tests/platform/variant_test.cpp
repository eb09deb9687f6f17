#include "test_objects.h"

#include <gtest/gtest.h>

namespace platform_test {
namespace {

CComPtr<ITestWidget> NewWidget() {
    return Norvane::CComObjectEx<CTestWidget>::CreateInstance<ITestWidget>();
}

TEST(Variant, CopyOfAnObjectAddsOneReferenceAndClearTakesItBack) {
    auto widget = NewWidget();
    ASSERT_EQ(RefCountOf(widget), 1u);
    {
        CComVariant held(static_cast<IUnknown*>(widget.Get()));
        EXPECT_EQ(held.vt, VT_UNKNOWN);
        EXPECT_EQ(RefCountOf(widget), 2u);

        VARIANT copy;
        VariantInit(&copy);
        ASSERT_EQ(VariantCopy(&copy, &held), S_OK);
        EXPECT_EQ(copy.punkVal, held.punkVal);
        EXPECT_EQ(RefCountOf(widget), 3u);
        ASSERT_EQ(VariantClear(&copy), S_OK);
        EXPECT_EQ(copy.vt, VT_EMPTY);
        EXPECT_EQ(RefCountOf(widget), 2u);
    }
    EXPECT_EQ(RefCountOf(widget), 1u);
}

TEST(Variant, DerivedDualInterfaceIsHeldAsDispatch) {
    auto widget = NewWidget();
    CComVariant held(widget.Get());
    EXPECT_EQ(held.vt, VT_DISPATCH);
    EXPECT_EQ(RefCountOf(widget), 2u);
}

TEST(Variant, CopyIntoAnOccupiedVariantReleasesWhatItHeld) {
    auto first = NewWidget();
    auto second = NewWidget();
    CComVariant destination(static_cast<IUnknown*>(first.Get()));
    const CComVariant source(static_cast<IUnknown*>(second.Get()));
    ASSERT_EQ(VariantCopy(&destination, &source), S_OK);
    EXPECT_EQ(RefCountOf(first), 1u);
    EXPECT_EQ(RefCountOf(second), 3u); // ours, source's and destination's
    EXPECT_EQ(VariantCopy(&destination, &destination), S_OK);
    EXPECT_EQ(RefCountOf(second), 3u);
}

TEST(Variant, StringsAreCopiedDeeply) {
    const CComVariant source(std::u16string_view(u"Line"));
    CComVariant copy(source);
    ASSERT_EQ(copy.vt, VT_BSTR);
    EXPECT_NE(copy.bstrVal, source.bstrVal);
    EXPECT_EQ(BstrView(copy.bstrVal), u"Line");
}

TEST(Variant, MoveAndAssignmentTransferOwnership) {
    auto widget = NewWidget();
    CComVariant a(static_cast<IUnknown*>(widget.Get()));
    CComVariant b(std::move(a));
    EXPECT_EQ(a.vt, VT_EMPTY);
    EXPECT_EQ(RefCountOf(widget), 2u);
    CComVariant c;
    c = b;
    EXPECT_EQ(RefCountOf(widget), 3u);
    c = CComVariant(1.5);
    EXPECT_EQ(RefCountOf(widget), 2u);
    VARIANT raw;
    b.Detach(&raw);
    EXPECT_EQ(b.vt, VT_EMPTY);
    EXPECT_EQ(RefCountOf(widget), 2u);
    VariantClear(&raw);
    EXPECT_EQ(RefCountOf(widget), 1u);
}

TEST(Variant, ConstructorsChooseTheValueType) {
    BSTR text = SysAllocString(u"Spot");
    struct Case {
        const char* label;
        CComVariant value;
        VARTYPE vt;
    };
    const Case cases[] = {
        {"double", CComVariant(2.5), VT_R8},
        {"int32", CComVariant(std::int32_t{-7}), VT_I4},
        {"bool", CComVariant(true), VT_BOOL},
        {"string literal", CComVariant(u"Spot"), VT_BSTR},
        {"BSTR", CComVariant(text), VT_BSTR},
        {"string view", CComVariant(std::u16string_view(u"Spot")), VT_BSTR},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.label);
        EXPECT_EQ(c.value.vt, c.vt);
        if (c.vt == VT_BSTR) {
            EXPECT_EQ(BstrView(c.value.bstrVal), u"Spot");
            EXPECT_NE(c.value.bstrVal, text);
        }
    }
    EXPECT_EQ(cases[2].value.boolVal, VARIANT_TRUE);
    SysFreeString(text);
}

TEST(Variant, ClearOfNullIsRefusedAndOfEmptyIsHarmless) {
    EXPECT_EQ(VariantClear(nullptr), E_POINTER);
    CComVariant empty;
    EXPECT_EQ(VariantClear(&empty), S_OK);
    EXPECT_EQ(VariantCopy(nullptr, &empty), E_POINTER);
}

} // namespace
} // namespace platform_test
