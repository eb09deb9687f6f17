#include "common/error_info_probe.h"
#include "module/method_guard.h"

#include <beamweaver/identifiers.h>

#include <gtest/gtest.h>

#include <stdexcept>

namespace Norvane {
namespace {

using testing::SetThreadErrorDescription;
using testing::TakePublishedErrorInfo;

class GuardedTest : public ::testing::Test {
  protected:
    ObjectMutex mutex_;
    int out_ = 0;
    bool ran_ = false;
};

TEST_F(GuardedTest, NullOutPointerGivesEPointerWithoutRunningAndWithoutErrorInfo) {
    SetThreadErrorDescription(u"earlier");
    int* const nothing = nullptr;
    const auto body = [this] { ran_ = true; };
    EXPECT_EQ(Guarded(IID_IPattern, nothing, body), E_POINTER);
    EXPECT_EQ(Guarded(IID_IPattern, mutex_, nothing, body), E_POINTER);
    EXPECT_FALSE(ran_);
    // An earlier description must not pass for this call's reason.
    EXPECT_FALSE(TakePublishedErrorInfo().has_value());
}

TEST_F(GuardedTest, VoidBodiesGiveSOk) {
    EXPECT_EQ(Guarded(IID_IPattern, [this] { out_ = 1; }), S_OK);
    EXPECT_EQ(Guarded(IID_IPattern, mutex_, [this] { out_ = 2; }), S_OK);
    EXPECT_EQ(Guarded(IID_IPattern, &out_, [this] { out_ = 3; }), S_OK);
    EXPECT_EQ(Guarded(IID_IPattern, mutex_, &out_, [this] { out_ = 4; }), S_OK);
    EXPECT_EQ(out_, 4);
}

TEST_F(GuardedTest, ReturnedCodesPassWithoutErrorInfoEvenAfterAnEarlierFailure) {
    SetThreadErrorDescription(u"earlier");
    EXPECT_EQ(Guarded(IID_IPattern, [] { return S_FALSE; }), S_FALSE);
    EXPECT_EQ(Guarded(IID_IPattern, mutex_, &out_, [] { return E_INVALIDARG; }), E_INVALIDARG);
    EXPECT_FALSE(TakePublishedErrorInfo().has_value());
}

TEST_F(GuardedTest, ThrowingBodyReturnsTheTranslationForItsInterface) {
    const HRESULT hr = Guarded(IID_IExclusionZone, mutex_, &out_,
                               []() -> HRESULT { throw std::invalid_argument("Shape object is null"); });
    EXPECT_EQ(hr, E_INVALIDARG);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IExclusionZone);
    EXPECT_EQ(info->description, u"Shape object is null");
    EXPECT_TRUE(info->source.empty());
}

TEST_F(GuardedTest, LockIsRecursiveForCallsIntoTheSameObject) {
    const HRESULT hr = Guarded(IID_IPattern, mutex_,
                               [this] { return Guarded(IID_IPattern, mutex_, [this] { ran_ = true; }); });
    EXPECT_EQ(hr, S_OK);
    EXPECT_TRUE(ran_);
}

} // namespace
} // namespace Norvane
