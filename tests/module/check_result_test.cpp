#include "common/error_info_probe.h"
#include "module/error_reporting.h"
#include "module/method_guard.h"

#include <beamweaver/identifiers.h>

#include <gtest/gtest.h>

#include <stdexcept>

namespace Norvane {
namespace {

using testing::SetThreadErrorDescription;
using testing::TakePublishedErrorInfo;

// A method of another component that fails with E_FAIL and leaves the description "X".
HRESULT FailingCallee() {
    return Guarded(IID_IPatternPointList, [] { throw HResultException(E_FAIL, "X"); });
}

HResultException CaughtFrom(HRESULT hr, const std::string& description = {}) {
    try {
        CheckResult(hr, description);
    } catch (const HResultException& e) {
        return e;
    }
    ADD_FAILURE() << "CheckResult did not throw";
    return HResultException(S_OK);
}

TEST(CheckResult, SuccessCodesPassThroughAndLeaveErrorInfo) {
    SetThreadErrorDescription(u"earlier");
    EXPECT_EQ(CheckResult(S_OK), S_OK);
    EXPECT_EQ(CheckResult(S_FALSE), S_FALSE);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->description, u"earlier");
}

TEST(CheckResult, FailureCarriesTheCalleesDescriptionAndTakesItFromTheThread) {
    const HResultException e = CaughtFrom(FailingCallee());
    EXPECT_EQ(e.Error(), E_FAIL);
    EXPECT_EQ(e.Description(), u"X");
    EXPECT_TRUE(e.Source().empty());
    EXPECT_FALSE(TakePublishedErrorInfo().has_value());
}

TEST(CheckResult, FailureWithoutErrorInfoHasEmptyFields) {
    const HResultException e = CaughtFrom(E_NOINTERFACE);
    EXPECT_EQ(e.Error(), E_NOINTERFACE);
    EXPECT_TRUE(e.Description().empty());
    EXPECT_TRUE(e.Source().empty());
}

TEST(CheckResult, CallersDescriptionTakesPrecedence) {
    SetThreadErrorDescription(u"X");
    const HResultException e = CaughtFrom(E_FAIL, "caller's words");
    EXPECT_EQ(e.Description(), u"caller's words");
}

TEST(CheckResult, CalleeFailureReachesTheClientThroughTheOuterBoundary) {
    const HRESULT hr = Guarded(IID_IPatternRectangle, [] { CheckResult(FailingCallee()); });
    EXPECT_EQ(hr, E_FAIL);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IPatternRectangle);
    EXPECT_EQ(info->description, u"X");
}

} // namespace
} // namespace Norvane
