#include "common/error_info_probe.h"
#include "module/byte_text.h"
#include "module/error_reporting.h"
#include "module/win32_error.h"

#include <beamweaver/identifiers.h>

#include <gtest/gtest.h>

#include <array>
#include <latch>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace Norvane {
namespace {

using testing::PublishedErrorInfo;
using testing::TakePublishedErrorInfo;
using testing::ThrowAndTranslate;

struct ThreadOutcome {
    HRESULT hr = S_OK;
    std::u16string description;
    GUID guid{};
};

// Each thread throws a different kind of exception so that every thread needs the chain at once.
HRESULT ThrowKindForThread(std::size_t index) {
    switch (index % 3) {
    case 0:
        return ThrowAndTranslate(std::invalid_argument("thread " + std::to_string(index)), IID_IPattern);
    case 1:
        return ThrowAndTranslate(win32_error(5, "thread " + std::to_string(index)), IID_IPattern);
    default:
        return ThrowAndTranslate(HResultException(E_NOTIMPL, "thread " + std::to_string(index)),
                                 IID_IPattern);
    }
}

// Must stay the first translation of the test process: the chain is built by whichever thread comes
// first while the others wait for it.
TEST(ErrorReportingThreads, ConcurrentFirstTranslationsAreSafeAndCorrect) {
    constexpr std::size_t kThreads = 6;
    std::array<ThreadOutcome, kThreads> outcomes;
    std::latch start(kThreads);
    std::vector<std::thread> threads;
    for (std::size_t i = 0; i < kThreads; ++i) {
        threads.emplace_back([&, i] {
            start.arrive_and_wait();
            outcomes[i].hr = ThrowKindForThread(i);
            if (const auto info = TakePublishedErrorInfo()) {
                outcomes[i].description = info->description;
                outcomes[i].guid = info->guid;
            }
        });
    }
    for (auto& thread : threads)
        thread.join();

    // invalid_argument -> E_INVALIDARG; win32 code 5 -> 0x80070005; HResultException unchanged.
    const std::array<HRESULT, 3> expected{E_INVALIDARG, MakeHResult(0x80070005u), E_NOTIMPL};
    for (std::size_t i = 0; i < kThreads; ++i) {
        EXPECT_EQ(outcomes[i].hr, expected[i % 3]) << "thread " << i;
        EXPECT_EQ(outcomes[i].description, WidenBytes("thread " + std::to_string(i)));
        EXPECT_EQ(outcomes[i].guid, IID_IPattern);
    }
}

TEST(ErrorReportingThreads, ErrorInfoIsVisibleOnlyOnTheTranslatingThread) {
    ASSERT_EQ(ThrowAndTranslate(std::out_of_range("index"), IID_IExclusionZone), E_INVALIDARG);

    bool otherThreadSawInfo = true;
    std::thread([&] { otherThreadSawInfo = TakePublishedErrorInfo().has_value(); }).join();
    EXPECT_FALSE(otherThreadSawInfo);

    const std::optional<PublishedErrorInfo> info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IExclusionZone);
    EXPECT_EQ(info->description, u"index");
}

} // namespace
} // namespace Norvane
