#include "test_objects.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace platform_test {
namespace {

CComPtr<ITestList> NewList(std::vector<std::u16string> items) {
    return Norvane::CComObjectEx<CTestList>::CreateInstance<ITestList>(std::move(items));
}

CComPtr<IEnumVARIANT> EnumeratorOf(ITestList* list) {
    CComPtr<IUnknown> unknown;
    EXPECT_EQ(list->get__NewEnum(&unknown), S_OK);
    return QueryAs<IEnumVARIANT>(unknown.Get());
}

// Fetches up to count elements and joins them as "a,b", so a whole chunk reads as one expectation.
struct Fetch {
    HRESULT hr;
    ULONG fetched;
    std::u16string texts;
};

Fetch Next(IEnumVARIANT* enumerator, ULONG count) {
    std::vector<VARIANT> values(count);
    Fetch result{E_FAIL, 1000, u""};
    result.hr = enumerator->Next(count, values.data(), &result.fetched);
    for (ULONG i = 0; i < result.fetched && i < count; ++i) {
        if (i > 0)
            result.texts += u',';
        result.texts += values[i].vt == VT_BSTR ? BstrView(values[i].bstrVal) : u"?";
        VariantClear(&values[i]);
    }
    return result;
}

class EnumVariantTest : public ::testing::Test {
  protected:
    CComPtr<ITestList> list_ = NewList({u"a", u"b", u"c", u"d", u"e"});
    CComPtr<IEnumVARIANT> enumerator_ = EnumeratorOf(list_);
};

TEST_F(EnumVariantTest, NextHandsOutChunksUntilTheEnd) {
    const struct {
        ULONG count;
        HRESULT hr;
        ULONG fetched;
        const char16_t* texts;
    } steps[] = {
        {2, S_OK, 2, u"a,b"}, {2, S_OK, 2, u"c,d"}, {2, S_FALSE, 1, u"e"}, // one left of two asked
        {2, S_FALSE, 0, u""}, {0, S_OK, 0, u""},                           // nothing asked, all of it fetched
    };
    for (const auto& step : steps) {
        SCOPED_TRACE(testing::PrintToString(std::u16string(step.texts)));
        const Fetch f = Next(enumerator_, step.count);
        EXPECT_EQ(f.hr, step.hr);
        EXPECT_EQ(f.fetched, step.fetched);
        EXPECT_EQ(f.texts, step.texts);
    }
}

TEST_F(EnumVariantTest, SkipMovesOnAndReportsRunningPastTheEnd) {
    EXPECT_EQ(enumerator_->Skip(3), S_OK);
    EXPECT_EQ(Next(enumerator_, 1).texts, u"d");
    EXPECT_EQ(enumerator_->Skip(5), S_FALSE); // one left of five asked
    EXPECT_EQ(Next(enumerator_, 1).hr, S_FALSE);
    EXPECT_EQ(enumerator_->Skip(0), S_OK);
    EXPECT_EQ(enumerator_->Skip(1), S_FALSE);
}

TEST_F(EnumVariantTest, ResetStartsOver) {
    ASSERT_EQ(enumerator_->Skip(5), S_OK);
    ASSERT_EQ(enumerator_->Reset(), S_OK);
    const Fetch all = Next(enumerator_, 5);
    EXPECT_EQ(all.hr, S_OK);
    EXPECT_EQ(all.texts, u"a,b,c,d,e");
}

TEST_F(EnumVariantTest, CloneStartsAtTheSamePositionAndMovesOnItsOwn) {
    ASSERT_EQ(enumerator_->Skip(2), S_OK);
    CComPtr<IEnumVARIANT> clone;
    ASSERT_EQ(enumerator_->Clone(&clone), S_OK);
    ASSERT_TRUE(clone);
    EXPECT_NE(clone.Get(), enumerator_.Get());
    EXPECT_EQ(RefCountOf(clone), 1u);
    EXPECT_EQ(Next(clone, 2).texts, u"c,d");
    EXPECT_EQ(Next(enumerator_, 1).texts, u"c");
    ASSERT_EQ(enumerator_->Reset(), S_OK);
    EXPECT_EQ(Next(clone, 2).texts, u"e");
    EXPECT_EQ(enumerator_->Clone(nullptr), E_POINTER);
}

TEST_F(EnumVariantTest, WalksTheCurrentContents) {
    ASSERT_EQ(enumerator_->Skip(5), S_OK);
    ASSERT_EQ(list_->Add(CComBSTR("f")), S_OK);
    EXPECT_EQ(Next(enumerator_, 3).texts, u"f");
}

TEST_F(EnumVariantTest, EnumeratorKeepsItsOwnerAlive) {
    const int destroyed = CTestList::destroyed;
    CComPtr<IEnumVARIANT> clone;
    ASSERT_EQ(enumerator_->Clone(&clone), S_OK);
    list_.Release();
    enumerator_.Release();
    EXPECT_EQ(CTestList::destroyed, destroyed);
    EXPECT_EQ(Next(clone, 5).texts, u"a,b,c,d,e");
    clone.Release();
    EXPECT_EQ(CTestList::destroyed, destroyed + 1);
}

TEST_F(EnumVariantTest, CountsOnTheModuleAndAnswersItsInterfaces) {
    const LONG start = ModuleLockCount();
    {
        CComPtr<IEnumVARIANT> clone;
        ASSERT_EQ(enumerator_->Clone(&clone), S_OK);
        EXPECT_EQ(ModuleLockCount(), start + 1);
        EXPECT_EQ(QueryAs<IUnknown>(clone.Get()).Get(), static_cast<IUnknown*>(clone.Get()));
        EXPECT_FALSE(QueryAs<ITestList>(clone.Get()));
    }
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST_F(EnumVariantTest, FetchedCountMayBeOmittedForOneElementOnly) {
    CComVariant one;
    EXPECT_EQ(enumerator_->Next(1, &one, nullptr), S_OK);
    EXPECT_EQ(BstrView(one.bstrVal), u"a");
    VARIANT two[2];
    EXPECT_EQ(enumerator_->Next(2, two, nullptr), E_POINTER);
    ULONG fetched = 0;
    EXPECT_EQ(enumerator_->Next(1, nullptr, &fetched), E_POINTER);
    EXPECT_EQ(Next(enumerator_, 1).texts, u"b"); // refused calls did not move the position
}

// A copy that fails hands out nothing: the values copied before it are released (the address
// sanitizer reports them otherwise) and the position stays, so the failure can be retried past.
TEST(EnumVariantFailure, FailedCopyHandsOutNothingAndKeepsThePosition) {
    const auto list = NewList({u"a", u"b", u"", u"d"});
    const auto enumerator = EnumeratorOf(list);
    const Fetch failed = Next(enumerator, 4);
    EXPECT_EQ(failed.hr, E_INVALIDARG);
    EXPECT_EQ(failed.fetched, 0u);
    EXPECT_EQ(Next(enumerator, 2).texts, u"a,b");
    EXPECT_EQ(Next(enumerator, 1).hr, E_INVALIDARG);
    ASSERT_EQ(enumerator->Skip(1), S_OK);
    EXPECT_EQ(Next(enumerator, 1).texts, u"d");
}

TEST(EnumVariantFailure, EmptyContainerEndsAtOnce) {
    const auto list = NewList({});
    const auto enumerator = EnumeratorOf(list);
    const Fetch f = Next(enumerator, 3);
    EXPECT_EQ(f.hr, S_FALSE);
    EXPECT_EQ(f.fetched, 0u);
    EXPECT_EQ(enumerator->Skip(1), S_FALSE);
}

} // namespace
} // namespace platform_test
