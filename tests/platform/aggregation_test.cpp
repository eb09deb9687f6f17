#include "automation_client.h"
#include "test_objects.h"

#include <gtest/gtest.h>

namespace platform_test {
namespace {

inline constexpr IID IID_ITestOuter = MakeGuid("5A0C1E34-7B2D-4F11-9C3A-1B2C3D4E5F20");

#define ITestOuter_MEMBERS(X) X(METHOD, Touch, ())
BW_INTERFACE(ITestOuter, IUnknown, ITestOuter_MEMBERS);

// An outer object written by hand, as a client of the platform would: it answers ITestOuter itself and
// hands every other query to the inner object it aggregates.
class COuter final : public ITestOuter {
  public:
    static COuter* New() { return new COuter(); }

    HRESULT QueryInterface(REFIID riid, void** out) override {
        if (out == nullptr)
            return E_POINTER;
        if (riid == IUnknown::iid || riid == IID_ITestOuter) {
            *out = static_cast<ITestOuter*>(this);
            AddRef();
            return S_OK;
        }
        if (inner_)
            return inner_->QueryInterface(riid, out);
        *out = nullptr;
        return E_NOINTERFACE;
    }
    ULONG AddRef() override { return ++refs_; }
    ULONG Release() override {
        const ULONG left = --refs_;
        if (left == 0)
            delete this;
        return left;
    }
    HRESULT Touch() override { return S_OK; }

    HRESULT Aggregate(REFIID riid) {
        return ComCreator<CTestWidget>::CreateInstance(Identity(), riid, reinterpret_cast<void**>(&inner_));
    }
    IUnknown* Identity() { return static_cast<ITestOuter*>(this); }
    IUnknown* Inner() const { return inner_; }
    ULONG References() const { return refs_; }

  private:
    COuter() = default;
    ~COuter() = default;

    ULONG refs_ = 1;
    CComPtr<IUnknown> inner_;
};

// Holds the one reference the outer object is created with.
struct OuterReference {
    COuter* outer = COuter::New();
    ~OuterReference() { outer->Release(); }
};

TEST(Aggregation, InnerCreatedForIUnknownSucceedsAndCountsOnTheModule) {
    const LONG start = ModuleLockCount();
    const int alive = CTestWidget::alive;
    {
        OuterReference ref;
        ASSERT_EQ(ref.outer->Aggregate(IUnknown::iid), S_OK);
        ASSERT_NE(ref.outer->Inner(), nullptr);
        EXPECT_NE(ref.outer->Inner(), ref.outer->Identity());
        EXPECT_EQ(CTestWidget::alive, alive + 1);
        EXPECT_EQ(ModuleLockCount(), start + 1);
        EXPECT_EQ(ref.outer->References(), 1u); // creating the inner object leaves the outer count alone
    }
    EXPECT_EQ(CTestWidget::alive, alive);
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST(Aggregation, AnyOtherInterfaceIsRefusedWithNothingBuilt) {
    const LONG start = ModuleLockCount();
    const int alive = CTestWidget::alive;
    OuterReference ref;
    const IID asked[] = {IID_ITestWidget, IDispatch::iid, IID_ITestPlain, IID_ITestUnlisted};
    for (const IID& riid : asked) {
        void* out = &out;
        EXPECT_EQ(ComCreator<CTestWidget>::CreateInstance(ref.outer->Identity(), riid, &out),
                  CLASS_E_NOAGGREGATION);
        EXPECT_EQ(out, nullptr);
    }
    EXPECT_EQ(ref.outer->Aggregate(IID_ITestWidget), CLASS_E_NOAGGREGATION);
    EXPECT_EQ(ref.outer->Inner(), nullptr);
    EXPECT_EQ(CTestWidget::alive, alive);
    EXPECT_EQ(ModuleLockCount(), start);
    EXPECT_EQ(ref.outer->References(), 1u);
}

TEST(Aggregation, InnerInterfacesDelegateIdentityAndCountsToTheOuter) {
    OuterReference ref;
    ASSERT_EQ(ref.outer->Aggregate(IUnknown::iid), S_OK);

    CComPtr<ITestWidget> widget = QueryAs<ITestWidget>(ref.outer->Identity());
    ASSERT_TRUE(widget);
    EXPECT_EQ(ref.outer->References(), 2u);
    EXPECT_EQ(widget->AddRef(), 3u);
    EXPECT_EQ(widget->Release(), 2u);
    EXPECT_EQ(RefCountOf(ref.outer->Inner()), 1u); // the inner object's own count is untouched

    // Asked through an inner interface, IUnknown is the outer identity and the outer's own interface
    // answers: the aggregate is one object.
    EXPECT_EQ(QueryAs<IUnknown>(widget.Get()).Get(), ref.outer->Identity());
    EXPECT_TRUE(QueryAs<ITestOuter>(widget.Get()));
    EXPECT_EQ(QueryAs<ITestPlain>(widget.Get()).Get(), QueryAs<ITestPlain>(ref.outer->Identity()).Get());
    EXPECT_FALSE(QueryAs<ITestUnlisted>(widget.Get()));

    std::int32_t id = -1;
    EXPECT_EQ(QueryAs<ITestPlain>(widget.Get())->Ping(&id), S_OK);
    EXPECT_EQ(id, 0);
}

TEST(Aggregation, NonDelegatingUnknownAnswersForTheInnerAndControlsItsLifetime) {
    const int destroyed = CTestWidget::destroyed;
    {
        OuterReference ref;
        ASSERT_EQ(ref.outer->Aggregate(IUnknown::iid), S_OK);
        IUnknown* inner = ref.outer->Inner();
        EXPECT_EQ(QueryAs<IUnknown>(inner).Get(), inner);

        void* out = &out;
        EXPECT_EQ(inner->QueryInterface(IID_ITestOuter, &out), E_NOINTERFACE);
        EXPECT_EQ(out, nullptr);

        {
            // The interfaces the inner object hands out hold the outer object, not the inner one.
            CComPtr<ITestWidget> widget = QueryAs<ITestWidget>(inner);
            ASSERT_TRUE(widget);
            EXPECT_EQ(RefCountOf(inner), 1u);
            EXPECT_EQ(ref.outer->References(), 2u);
        }
        EXPECT_EQ(CTestWidget::destroyed, destroyed);
    }
    // The outer object's destruction released the inner one's only reference.
    EXPECT_EQ(CTestWidget::destroyed, destroyed + 1);
}

TEST(Aggregation, AutomationThroughTheInnerObjectReachesItsMembers) {
    OuterReference ref;
    ASSERT_EQ(ref.outer->Aggregate(IUnknown::iid), S_OK);
    CComPtr<IDispatch> dispatch = QueryAs<IDispatch>(ref.outer->Identity());
    ASSERT_TRUE(dispatch);
    CComVariant result;
    ASSERT_EQ(AutomationClient(dispatch).Call(u"Scale", DISPATCH_METHOD, {CComVariant(2.0), CComVariant(3)},
                                              &result),
              S_OK);
    EXPECT_EQ(result.dblVal, 6.0); // 2.0 * 3
}

} // namespace
} // namespace platform_test
