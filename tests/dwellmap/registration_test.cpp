#include "dwellmap/dwellmap_registration.h"
#include "dwellmap_test_support.h"

#include <gtest/gtest.h>

#include <string>

using namespace dwellmap_test;

namespace {

class DwellmapRegistration : public ::testing::Test {
  protected:
    void SetUp() override { RegisterDwellmapClasses(); }
};

template <class I> CComPtr<I> Create(REFCLSID clsid) {
    CComPtr<I> object;
    EXPECT_EQ(CoCreateInstance(clsid, nullptr, CLSCTX_ALL, I::iid, reinterpret_cast<void**>(&object)), S_OK);
    return object;
}

DISPID IdOf(IDispatch* object, std::u16string name) {
    LPOLESTR names[] = {name.data()};
    DISPID id = DISPID_UNKNOWN;
    EXPECT_EQ(object->GetIDsOfNames(GUID_NULL, names, 1, 0, &id), S_OK);
    return id;
}

} // namespace

TEST_F(DwellmapRegistration, CreatesAPointListByIdentifierAndProgId) {
    auto list = Create<IPatternPointList>(CLSID_PatternPointList);
    ASSERT_TRUE(list);
    EXPECT_TRUE(QueryAs<IPatternPointListCount>(list.Get()));
    EXPECT_TRUE(QueryAs<IDispatch>(list.Get()));
    CLSID clsid{};
    ASSERT_EQ(CLSIDFromProgID(u"Dwellmap.PatternPointList", &clsid), S_OK);
    EXPECT_EQ(clsid, CLSID_PatternPointList);
    EXPECT_EQ(FindClass(CLSID_PatternPointList)->threading, ThreadingModel::Free);
}

TEST_F(DwellmapRegistration, CreatesASubPatternCollectionByIdentifierAndProgId) {
    EXPECT_TRUE(Create<ISubPatternCollection>(CLSID_SubPatternCollection));
    CLSID clsid{};
    ASSERT_EQ(CLSIDFromProgID(u"Dwellmap.SubPatternCollection", &clsid), S_OK);
    EXPECT_EQ(clsid, CLSID_SubPatternCollection);
    EXPECT_EQ(FindClass(CLSID_SubPatternCollection)->threading, ThreadingModel::Free);
}

TEST_F(DwellmapRegistration, ACollectionAnswersItsMembersByName) {
    auto collection = Create<ISubPatternCollection>(CLSID_SubPatternCollection);
    ASSERT_TRUE(collection);
    ASSERT_EQ(collection->Add(ListOf(PointsWithDwells({6, 2})), 0, 11, 22, 1), S_OK);
    ASSERT_EQ(collection->Add(ListOf(PointsWithDwells({9})), 0, 33, 44, 1), S_OK);
    auto dispatch = QueryAs<IDispatch>(collection.Get());
    ASSERT_TRUE(dispatch);

    DISPPARAMS noArguments{nullptr, nullptr, 0, 0};
    CComVariant count;
    ASSERT_EQ(dispatch->Invoke(IdOf(dispatch, u"count"), GUID_NULL, 0, DISPATCH_PROPERTYGET, &noArguments,
                               &count, nullptr, nullptr),
              S_OK);
    EXPECT_EQ(count.vt, VT_I4);
    EXPECT_EQ(count.lVal, 2);

    CComVariant maximum;
    ASSERT_EQ(dispatch->Invoke(IdOf(dispatch, u"MaximumDwellTicks"), GUID_NULL, 0, DISPATCH_PROPERTYGET,
                               &noArguments, &maximum, nullptr, nullptr),
              S_OK);
    EXPECT_EQ(maximum.vt, VT_UI2);
    EXPECT_EQ(maximum.uiVal, 9);

    CComVariant index(std::int32_t{1});
    DISPPARAMS oneArgument{&index, nullptr, 1, 0};
    CComVariant item;
    ASSERT_EQ(dispatch->Invoke(IdOf(dispatch, u"Item"), GUID_NULL, 0, DISPATCH_METHOD, &oneArgument, &item,
                               nullptr, nullptr),
              S_OK);
    ASSERT_EQ(item.vt, VT_DISPATCH);
    auto subPattern = QueryAs<ISubPattern>(item.pdispVal);
    ASSERT_TRUE(subPattern);
    std::uint16_t offsetY = 0;
    ASSERT_EQ(subPattern->get_OffsetY(&offsetY), S_OK);
    EXPECT_EQ(offsetY, 44);
}
