#include "test_objects.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

namespace platform_test {
namespace {

// Every identifier the widget answers, with the interface it is reached through.
struct Answer {
    const char* label;
    IID iid;
};
const Answer kWidgetAnswers[] = {
    {"IUnknown", IUnknown::iid},
    {"IDispatch (base of the dual interface)", IDispatch::iid},
    {"ITestShape (base of the listed ITestWidget)", IID_ITestShape},
    {"ITestWidget", IID_ITestWidget},
    {"ITestPlain", IID_ITestPlain},
    {"ISupportErrorInfo", ISupportErrorInfo::iid},
};

CComPtr<IUnknown> NewWidget() {
    return Norvane::CComObjectEx<CTestWidget>::CreateInstance<IUnknown>();
}

void* Query(IUnknown* object, REFIID riid) {
    void* out = nullptr;
    if (object->QueryInterface(riid, &out) == S_OK)
        static_cast<IUnknown*>(out)->Release();
    return out;
}

class QueryInterfaceTest : public ::testing::TestWithParam<Answer> {};

TEST_P(QueryInterfaceTest, AnswersAndLeadsBackToTheSameIdentity) {
    const auto identity = NewWidget();
    void* raw = nullptr;
    ASSERT_EQ(identity->QueryInterface(GetParam().iid, &raw), S_OK);
    CComPtr<IUnknown> answered;
    answered.Attach(static_cast<IUnknown*>(raw));
    EXPECT_EQ(Query(answered, IUnknown::iid), identity.Get());
    // Symmetric and transitive: from the answered interface every other one is reachable, and each
    // is the same pointer whichever interface it was asked from.
    for (const Answer& other : kWidgetAnswers) {
        SCOPED_TRACE(other.label);
        void* fromAnswered = Query(answered, other.iid);
        EXPECT_NE(fromAnswered, nullptr);
        EXPECT_EQ(fromAnswered, Query(identity, other.iid));
    }
}

INSTANTIATE_TEST_SUITE_P(Widget, QueryInterfaceTest, ::testing::ValuesIn(kWidgetAnswers),
                         [](const auto& test) { return std::to_string(test.index); });

TEST(QueryInterface, UnlistedInterfaceIsRefusedWithNullOut) {
    const auto widget = NewWidget();
    void* out = &out;
    EXPECT_EQ(widget->QueryInterface(IID_ITestUnlisted, &out), E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    out = &out;
    EXPECT_EQ(widget->QueryInterface(IClassFactory::iid, &out), E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(RefCountOf(widget), 1u);
}

TEST(QueryInterface, NullOutPointerIsRefused) {
    const auto widget = NewWidget();
    EXPECT_EQ(widget->QueryInterface(IID_ITestWidget, nullptr), E_POINTER);
}

TEST(ReferenceCount, EachReferenceCountsOnceAndTheLastReleaseDestroys) {
    const int destroyedBefore = CTestWidget::destroyed;
    IUnknown* widget = NewWidget().Detach();
    EXPECT_EQ(widget->AddRef(), 2u);
    ITestPlain* plain = nullptr;
    ASSERT_EQ(widget->QueryInterface(IID_ITestPlain, reinterpret_cast<void**>(&plain)), S_OK);
    EXPECT_EQ(plain->AddRef(), 4u); // interfaces share the object's one count
    EXPECT_EQ(plain->Release(), 3u);
    EXPECT_EQ(plain->Release(), 2u);
    EXPECT_EQ(widget->Release(), 1u);
    EXPECT_EQ(CTestWidget::destroyed, destroyedBefore);
    EXPECT_EQ(widget->Release(), 0u);
    EXPECT_EQ(CTestWidget::destroyed, destroyedBefore + 1);
}

TEST(ModuleLock, CountsLiveObjectsAndReturnsToItsStart) {
    const LONG start = ModuleLockCount();
    {
        const auto first = NewWidget();
        EXPECT_EQ(ModuleLockCount(), start + 1);
        const auto second = NewWidget();
        EXPECT_EQ(ModuleLockCount(), start + 2);
        EXPECT_GT(ModuleLockCount(), 0);
    }
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST(InternalCreation, PassesConstructorArguments) {
    const auto widget = Norvane::CComObjectEx<CTestWidget>::CreateInstance<ITestShape>(7, u"Seven");
    std::int32_t id = 0;
    ASSERT_EQ(widget->get_Id(&id), S_OK);
    EXPECT_EQ(id, 7);
    CComBSTR name;
    ASSERT_EQ(widget->get_Name(&name), S_OK);
    EXPECT_EQ(name.View(), u"Seven");
    EXPECT_EQ(RefCountOf(widget), 1u);
}

TEST(InternalCreation, UnansweredInterfaceThrowsAndLeavesNothing) {
    const LONG start = ModuleLockCount();
    const int alive = CTestWidget::alive;
    try {
        Norvane::CComObjectEx<CTestWidget>::CreateInstance<ITestUnlisted>();
        FAIL() << "creation through an unlisted interface succeeded";
    } catch (const ComError& e) {
        EXPECT_EQ(e.Error(), E_NOINTERFACE);
    }
    EXPECT_EQ(CTestWidget::alive, alive);
    EXPECT_EQ(ModuleLockCount(), start);
}

// A constructor that throws after its members have allocated: the members are destroyed, the object's
// memory is freed (a leak would fail the address-sanitizer run) and the module was never counted.
class CThrowingConstructor : public CComObjectRootBase,
                             public ITestPlain,
                             public InstanceCounter<CThrowingConstructor> {
  public:
    using Interfaces = InterfaceMap<ITestPlain>;

    explicit CThrowingConstructor(bool fail) : buffer_(1000, 'x') {
        if (fail)
            throw std::invalid_argument("Rectangle values not correct");
    }
    HRESULT Ping(std::int32_t* value) override {
        *value = static_cast<std::int32_t>(buffer_.size());
        return S_OK;
    }

  private:
    std::string buffer_;
};

TEST(InternalCreation, ThrowingConstructorPassesTheExceptionAndLeavesNothing) {
    const LONG start = ModuleLockCount();
    EXPECT_THROW(Norvane::CComObjectEx<CThrowingConstructor>::CreateInstance<ITestPlain>(true),
                 std::invalid_argument);
    EXPECT_EQ(CThrowingConstructor::alive, 0);
    EXPECT_EQ(ModuleLockCount(), start);

    const auto built = Norvane::CComObjectEx<CThrowingConstructor>::CreateInstance<ITestPlain>(false);
    std::int32_t size = 0;
    ASSERT_EQ(built->Ping(&size), S_OK);
    EXPECT_EQ(size, 1000);
    EXPECT_EQ(ModuleLockCount(), start + 1);
}

// FinalConstruct runs on the counted object; its failure destroys the object, with FinalRelease.
class CFailingFinalConstruct : public CComObjectRootBase,
                               public ITestPlain,
                               public InstanceCounter<CFailingFinalConstruct> {
  public:
    using Interfaces = InterfaceMap<ITestPlain>;

    HRESULT FinalConstruct() {
        referencesDuringFinalConstruct = RefCountOf(static_cast<ITestPlain*>(this));
        return E_OUTOFMEMORY;
    }
    void FinalRelease() { ++finalReleases; }
    HRESULT Ping(std::int32_t*) override { return E_NOTIMPL; }

    inline static ULONG referencesDuringFinalConstruct = 0;
    inline static int finalReleases = 0;
};

TEST(FinalConstruct, FailureDestroysTheObjectAndReturnsTheFailure) {
    const LONG start = ModuleLockCount();
    const int destroyed = CFailingFinalConstruct::destroyed;
    const int finalReleases = CFailingFinalConstruct::finalReleases;
    void* out = &out;
    EXPECT_EQ(ComCreator<CFailingFinalConstruct>::CreateInstance(nullptr, IID_ITestPlain, &out),
              E_OUTOFMEMORY);
    EXPECT_EQ(out, nullptr);
    // Held at one reference, so a FinalConstruct that hands itself around cannot destroy itself.
    EXPECT_EQ(CFailingFinalConstruct::referencesDuringFinalConstruct, 1u);
    EXPECT_EQ(CFailingFinalConstruct::alive, 0);
    EXPECT_EQ(CFailingFinalConstruct::destroyed, destroyed + 1);
    EXPECT_EQ(CFailingFinalConstruct::finalReleases, finalReleases + 1);
    EXPECT_EQ(ModuleLockCount(), start);

    EXPECT_THROW(Norvane::CComObjectEx<CFailingFinalConstruct>::CreateInstance<ITestPlain>(), ComError);
    EXPECT_EQ(CFailingFinalConstruct::alive, 0);
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST(ComCreator, NullOutPointerIsRefused) {
    EXPECT_EQ(ComCreator<CTestWidget>::CreateInstance(nullptr, IID_ITestWidget, nullptr), E_POINTER);
}

} // namespace
} // namespace platform_test
