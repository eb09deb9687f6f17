#include "common/error_info_probe.h"
#include "module/error_reporting.h"
#include "module/win32_error.h"
#include "platform/com_error.h"

#include <beamweaver/identifiers.h>

#include <gtest/gtest.h>

#include <any>
#include <functional>
#include <new>
#include <stdexcept>
#include <string>
#include <typeinfo>

namespace Norvane {
namespace {

using testing::PublishedErrorInfo;
using testing::TakePublishedErrorInfo;
using testing::ThrowAndTranslate;

constexpr HRESULT E_ACCESSDENIED_CODE = MakeHResult(0x80070005u);

struct TranslationCase {
    const char* name;
    std::function<HRESULT(REFIID)> throwAndTranslate;
    HRESULT expectedHr;
    std::u16string expectedDescription;
};

template <class T> std::function<HRESULT(REFIID)> Throwing(T value) {
    return [value](REFIID riid) { return ThrowAndTranslate(value, riid); };
}

struct UnknownThing {};

class ExceptionTranslation : public ::testing::TestWithParam<TranslationCase> {};

TEST_P(ExceptionTranslation, GivesCodeAndPublishesDescriptionForTheInterface) {
    const TranslationCase& c = GetParam();
    EXPECT_EQ(c.throwAndTranslate(IID_IExclusionZone), c.expectedHr);
    const std::optional<PublishedErrorInfo> info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IExclusionZone);
    EXPECT_EQ(info->description, c.expectedDescription);
    EXPECT_TRUE(info->source.empty());
    EXPECT_TRUE(info->helpFile.empty());
    EXPECT_EQ(info->helpContext, 0u);
}

INSTANTIATE_TEST_SUITE_P(
    Table, ExceptionTranslation,
    ::testing::Values(
        // Thrown integers are HRESULTs as they are; a long (64 bits here) keeps its low 32 bits.
        TranslationCase{"Long", Throwing(static_cast<long>(E_ACCESSDENIED_CODE)), E_ACCESSDENIED_CODE, u""},
        TranslationCase{"LongWiderThan32Bits", Throwing(0x1'8000'4001L), E_NOTIMPL, u""},
        TranslationCase{"Int", Throwing(E_NOTIMPL), E_NOTIMPL, u""},
        // Positive Win32 codes: (code & 0xFFFF) | 0x80070000.
        TranslationCase{"Win32Positive", Throwing(win32_error(5, "Access is denied.")), E_ACCESSDENIED_CODE,
                        u"Access is denied."},
        TranslationCase{"Win32PositiveAbove16Bits", Throwing(win32_error(0x12345, "big")),
                        MakeHResult(0x80072345u), u"big"},
        TranslationCase{"Win32NegativeIsTheCode", Throwing(win32_error(E_POINTER, "neg")), E_POINTER, u"neg"},
        // Code 0 maps to S_OK, which a thrown exception must not report: E_FAIL instead.
        TranslationCase{"Win32ZeroStillFails", Throwing(win32_error(0, "zero")), E_FAIL, u"zero"},
        TranslationCase{"ThrownZeroStillFails", Throwing(0), E_FAIL, u""},
        TranslationCase{"InvalidArgument", Throwing(std::invalid_argument("Shape object is null")),
                        E_INVALIDARG, u"Shape object is null"},
        TranslationCase{"OutOfRange", Throwing(std::out_of_range("index")), E_INVALIDARG, u"index"},
        TranslationCase{"BadCast", Throwing(std::bad_cast()), E_INVALIDARG, u"std::bad_cast"},
        TranslationCase{"DerivedFromBadCast", Throwing(std::bad_any_cast()), E_INVALIDARG, u"bad any_cast"},
        TranslationCase{"BadAlloc", Throwing(std::bad_alloc()), E_OUTOFMEMORY, u"std::bad_alloc"},
        TranslationCase{"OverflowFallsToStdException",
                        Throwing(std::overflow_error("matrix inverse does not exist")), E_FAIL,
                        u"matrix inverse does not exist"},
        TranslationCase{"RuntimeError", Throwing(std::runtime_error("\xE9t\xE9")), E_FAIL, u"\u00E9t\u00E9"},
        TranslationCase{"PlainStdException", Throwing(std::exception()), E_FAIL, u"std::exception"},
        TranslationCase{"ComErrorWithoutInfo", Throwing(ComError(E_NOINTERFACE)), E_NOINTERFACE, u""},
        TranslationCase{"UnknownStruct", Throwing(UnknownThing{}), E_UNEXPECTED, u""},
        TranslationCase{"UnsignedIsNotInTheTable", Throwing(0x80004005u), E_UNEXPECTED, u""},
        TranslationCase{"CharPointer", Throwing("text"), E_UNEXPECTED, u""}),
    [](const ::testing::TestParamInfo<TranslationCase>& param) { return std::string(param.param.name); });

TEST(ExceptionTranslationFields, HResultExceptionPassesUnchanged) {
    const HResultException thrown(E_POINTER, u"Callee", u"null IRangeInt", u"help.chm", 17);
    EXPECT_EQ(ThrowAndTranslate(thrown, IID_IPatternLine), E_POINTER);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IPatternLine);
    EXPECT_EQ(info->source, u"Callee");
    EXPECT_EQ(info->description, u"null IRangeInt");
    EXPECT_EQ(info->helpFile, u"help.chm");
    EXPECT_EQ(info->helpContext, 17u);
}

TEST(ExceptionTranslationFields, ComErrorTakesTheFieldsOfItsErrorInfo) {
    CComPtr<ICreateErrorInfo> creator;
    ASSERT_EQ(CreateErrorInfo(&creator), S_OK);
    creator->SetGUID(IID_IRangeInt);
    creator->SetSource(u"Sibling");
    creator->SetDescription(u"X");
    creator->SetHelpFile(u"sibling.hlp");
    creator->SetHelpContext(3);

    EXPECT_EQ(ThrowAndTranslate(ComError(E_OUTOFMEMORY, QueryAs<IErrorInfo>(creator.Get())), IID_IPattern),
              E_OUTOFMEMORY);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_EQ(info->guid, IID_IPattern); // the boundary's interface, not the callee's
    EXPECT_EQ(info->source, u"Sibling");
    EXPECT_EQ(info->description, u"X");
    EXPECT_EQ(info->helpFile, u"sibling.hlp");
    EXPECT_EQ(info->helpContext, 3u);
}

TEST(ExceptionTranslationFields, CallOutsideAnyHandlerIsUnexpected) {
    EXPECT_EQ(TranslateCurrentException(IID_IPattern), E_UNEXPECTED);
    const auto info = TakePublishedErrorInfo();
    ASSERT_TRUE(info.has_value());
    EXPECT_TRUE(info->description.empty());
}

TEST(Win32ErrorCode, KeepsZeroAndNegativeCodesAndMapsPositiveOnesIntoTheWin32Facility) {
    EXPECT_EQ(HResultFromWin32(0), S_OK);
    EXPECT_EQ(HResultFromWin32(E_POINTER), E_POINTER);
    EXPECT_EQ(HResultFromWin32(87), E_INVALIDARG);          // 87 = 0x57 -> 0x80070057
    EXPECT_EQ(HResultFromWin32(0x7FFF000E), E_OUTOFMEMORY); // low 16 bits 0x000E -> 0x8007000E
}

} // namespace
} // namespace Norvane
