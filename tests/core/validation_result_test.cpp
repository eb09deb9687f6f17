#include "core/validation.h"

#include "module/hresult_exception.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

namespace {

using namespace Norvane::Lumis::Scanning;

std::u16string DescriptionOf(IPatternValidationResult* result) {
    CComBSTR description;
    EXPECT_EQ(result->get_Description(&description), S_OK);
    return std::u16string(description.View());
}

VARIANT_BOOL ValidOf(IPatternValidationResult* result) {
    VARIANT_BOOL valid = VARIANT_BOOL(1);
    EXPECT_EQ(result->get_Valid(&valid), S_OK);
    return valid;
}

TEST(ValidationResultTest, ValidResultSaysOk) {
    auto result = MakeValidResult();
    EXPECT_EQ(ValidOf(result), VARIANT_TRUE);
    EXPECT_EQ(DescriptionOf(result), u"OK");
}

TEST(ValidationResultTest, InvalidResultKeepsItsDescription) {
    auto result = MakeValidationResult(false, u"DwellTime out of range. PitchX out of range. ");
    EXPECT_EQ(ValidOf(result), VARIANT_FALSE);
    EXPECT_EQ(DescriptionOf(result), u"DwellTime out of range. PitchX out of range. ");
}

TEST(ValidationResultTest, NullDescriptionComesOutAsNullString) {
    auto result = MakeValidationResult(true, std::nullopt);
    OLECHAR stale[] = u"stale";
    BSTR description = stale; // must be overwritten
    EXPECT_EQ(result->get_Description(&description), S_OK);
    EXPECT_EQ(description, nullptr);
    EXPECT_EQ(SysStringLen(description), 0u);
}

TEST(ValidationResultTest, EmptyDescriptionStaysDistinctFromNull) {
    auto result = MakeValidationResult(true, u"");
    CComBSTR description;
    ASSERT_EQ(result->get_Description(&description), S_OK);
    EXPECT_FALSE(description.IsNull());
    EXPECT_EQ(SysStringLen(description), 0u);
}

TEST(ValidationResultTest, EachDescriptionIsTheCallersOwnCopy) {
    auto result = MakeValidationResult(false, u"Width out of range. ");
    CComBSTR first;
    CComBSTR second;
    ASSERT_EQ(result->get_Description(&first), S_OK);
    ASSERT_EQ(result->get_Description(&second), S_OK);
    EXPECT_NE(static_cast<BSTR>(first), static_cast<BSTR>(second));

    static_cast<BSTR>(first)[0] = u'X';
    EXPECT_EQ(second.View(), u"Width out of range. ");
    EXPECT_EQ(DescriptionOf(result), u"Width out of range. ");
}

TEST(ValidationResultTest, GettersRefuseANullOutPointer) {
    auto result = MakeValidResult();
    EXPECT_EQ(result->get_Valid(nullptr), E_POINTER);
    EXPECT_EQ(result->get_Description(nullptr), E_POINTER);
}

TEST(ValidationResultTest, AnswersItsInterfaceAndDispatchOnly) {
    auto result = MakeValidResult();
    EXPECT_TRUE(QueryAs<IDispatch>(result.Get()));
    EXPECT_FALSE(QueryAs<ISupportErrorInfo>(result.Get()));
}

struct ReadCase {
    bool valid;
    std::optional<std::u16string> description;
    std::u16string expected;
};

class ReadValidationResultTest : public ::testing::TestWithParam<ReadCase> {};

TEST_P(ReadValidationResultTest, ReadsBothValues) {
    const auto outcome = ReadValidationResult(MakeValidationResult(GetParam().valid, GetParam().description));
    EXPECT_EQ(outcome.valid, GetParam().valid);
    EXPECT_EQ(outcome.description, GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(ValidInvalidAndNull, ReadValidationResultTest,
                         ::testing::Values(ReadCase{true, u"OK", u"OK"},
                                           ReadCase{false, u"Height out of range. ",
                                                    u"Height out of range. "},
                                           ReadCase{false, std::nullopt, u""}));

// A result object of another implementation whose Valid getter fails with error information.
class CFailingValidationResult : public CComObjectRootBase, public IDispatchImpl<IPatternValidationResult> {
  public:
    using Interfaces = InterfaceMap<IPatternValidationResult>;

    HRESULT get_Valid(VARIANT_BOOL*) override {
        CComPtr<ICreateErrorInfo> create;
        CreateErrorInfo(&create);
        create->SetDescription(u"validation failed");
        SetErrorInfo(0, QueryAs<IErrorInfo>(create.Get()));
        return E_UNEXPECTED;
    }
    HRESULT get_Description(BSTR*) override { return E_UNEXPECTED; }
};

TEST(ReadValidationResultFailures, FailedCallIsThrownWithItsErrorInformation) {
    auto failing =
        Norvane::CComObjectEx<CFailingValidationResult>::CreateInstance<IPatternValidationResult>();
    try {
        ReadValidationResult(failing);
        FAIL() << "a failed call must throw";
    } catch (const Norvane::HResultException& e) {
        EXPECT_EQ(e.Error(), E_UNEXPECTED);
        EXPECT_EQ(e.Description(), u"validation failed");
    }
}

TEST(ReadValidationResultFailures, NullResultIsRefused) {
    EXPECT_THROW(ReadValidationResult(nullptr), std::invalid_argument);
}

} // namespace
