#include "test_objects.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <latch>
#include <mutex>
#include <thread>
#include <vector>

namespace platform_test {
namespace {

constexpr int kThreads = 8;
constexpr int kRounds = 20000;

// Runs body(index) on kThreads threads that start together, and waits for all of them.
template <class Body> void RunTogether(Body body) {
    std::latch start(kThreads);
    std::vector<std::thread> threads;
    for (int t = 0; t < kThreads; ++t)
        threads.emplace_back([&, t] {
            start.arrive_and_wait();
            body(t);
        });
    for (auto& thread : threads)
        thread.join();
}

TEST(ObjectThreads, ConcurrentReferencesDestroyTheObjectOnceOnWhicheverThreadReleasesLast) {
    const LONG start = ModuleLockCount();
    const int destroyed = CTestWidget::destroyed;
    // Every thread gets a reference of its own, and the creating reference is dropped before the threads
    // run, so the final release happens on the thread that finishes last.
    IUnknown* object = Norvane::CComObjectEx<CTestWidget>::CreateInstance<IUnknown>().Detach();
    for (int t = 0; t < kThreads; ++t)
        object->AddRef();
    object->Release();
    RunTogether([object](int) {
        for (int i = 0; i < kRounds; ++i) {
            object->AddRef();
            CComPtr<ITestPlain> plain = QueryAs<ITestPlain>(object);
            object->Release();
        }
        object->Release();
    });
    EXPECT_EQ(CTestWidget::destroyed, destroyed + 1);
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST(ObjectThreads, ConcurrentCreationThroughTheRegistryReturnsTheModuleToItsStart) {
    RegisterClasses({TestWidgetEntry()});
    const LONG start = ModuleLockCount();
    const int destroyed = CTestWidget::destroyed;
    constexpr int kObjects = 500;
    RunTogether([start](int) {
        for (int i = 0; i < kObjects; ++i) {
            CComPtr<ITestWidget> widget;
            ASSERT_EQ(CoCreateInstance(CLSID_TestWidget, nullptr, CLSCTX_ALL, IID_ITestWidget,
                                       reinterpret_cast<void**>(&widget)),
                      S_OK);
            EXPECT_GT(ModuleLockCount(), start);
        }
    });
    EXPECT_EQ(CTestWidget::destroyed, destroyed + kThreads * kObjects);
    EXPECT_EQ(ModuleLockCount(), start);
}

TEST(ObjectThreads, ErrorInformationStaysOnTheThreadThatSetIt) {
    SetErrorInfo(0, nullptr);
    ReportError(IID_ITestWidget, u"set on the main thread", E_FAIL);
    RunTogether([](int t) {
        CComPtr<IErrorInfo> info;
        EXPECT_EQ(GetErrorInfo(0, &info), S_FALSE);
        // Left behind when the thread ends; its slot releases it.
        ReportError(IID_ITestWidget, t % 2 ? u"odd worker" : u"even worker", E_FAIL);
    });
    CComPtr<IErrorInfo> info;
    ASSERT_EQ(GetErrorInfo(0, &info), S_OK);
    CComBSTR description;
    ASSERT_EQ(info->GetDescription(&description), S_OK);
    EXPECT_EQ(description.View(), u"set on the main thread");
}

TEST(ObjectThreads, ConcurrentNextHandsOutEveryElementExactlyOnce) {
    std::vector<std::u16string> items;
    for (int i = 0; i < 2000; ++i)
        items.push_back(u"item" + Utf8ToUtf16(std::to_string(i)));
    const auto list = Norvane::CComObjectEx<CTestList>::CreateInstance<ITestList>(items);
    CComPtr<IUnknown> unknown;
    ASSERT_EQ(list->get__NewEnum(&unknown), S_OK);
    const auto enumerator = QueryAs<IEnumVARIANT>(unknown.Get());

    std::mutex mutex;
    std::vector<std::u16string> seen;
    RunTogether([&](int) {
        for (;;) {
            VARIANT value[3];
            ULONG fetched = 0;
            const HRESULT hr = enumerator->Next(3, value, &fetched);
            std::lock_guard lock(mutex);
            for (ULONG i = 0; i < fetched; ++i) {
                seen.emplace_back(BstrView(value[i].bstrVal));
                VariantClear(&value[i]);
            }
            if (hr != S_OK)
                return;
        }
    });
    std::sort(seen.begin(), seen.end());
    std::sort(items.begin(), items.end());
    EXPECT_EQ(seen, items);
}

} // namespace
} // namespace platform_test
