#include "module/hresult_exception.h"

#include <gtest/gtest.h>

#include <string>

namespace Norvane {
namespace {

// REGDB_E_CLASSNOTREG (80040154) has no system text in the table.

struct WhatCase {
    const char* name;
    HResultException exception;
    std::string expected;
};

class HResultExceptionWhat : public ::testing::TestWithParam<WhatCase> {};

TEST_P(HResultExceptionWhat, ComposesCodeSystemTextDescriptionAndSource) {
    EXPECT_EQ(GetParam().exception.what(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(
    Texts, HResultExceptionWhat,
    ::testing::Values(WhatCase{"InvalidArgWithMessage", HResultException(E_INVALIDARG, "bad"),
                               "HRESULT 80070057: The parameter is incorrect.: bad"},
                      WhatCase{"CodeOnly", HResultException(E_FAIL), "HRESULT 80004005: Unspecified error"},
                      WhatCase{"NoSystemText", HResultException(REGDB_E_CLASSNOTREG, "missing"),
                               "HRESULT 80040154: missing"},
                      // No leading zeros: S_FALSE is 1, S_OK is 0.
                      WhatCase{"SmallCodeHasNoLeadingZeros", HResultException(S_FALSE), "HRESULT 1"},
                      WhatCase{"ZeroCode", HResultException(S_OK), "HRESULT 0"},
                      WhatCase{"WithSource",
                               HResultException(E_POINTER, u"Callee", u"null IRangeInt", u"help.chm", 7),
                               "HRESULT 80004003: Invalid pointer: null IRangeInt\nSource: Callee"},
                      WhatCase{"SourceWithoutDescription",
                               HResultException(REGDB_E_CLASSNOTREG, u"Src", u"", u"", 0),
                               "HRESULT 80040154\nSource: Src"},
                      // U+00E9 keeps its low byte 0xE9; U+0141 keeps 0x41 ('A').
                      WhatCase{"WideCharactersNarrowedToLowByte",
                               HResultException(E_UNEXPECTED, u"", u"\u00E9\u0141", u"", 0),
                               "HRESULT 8000FFFF: Catastrophic failure: \xE9"
                               "A"}),
    [](const ::testing::TestParamInfo<WhatCase>& param) { return std::string(param.param.name); });

TEST(HResultException, MessageIsWidenedByteByByte) {
    const HResultException e(E_FAIL, "\xE9t\xFF");
    EXPECT_EQ(e.Description(), u"\u00E9t\u00FF");
    EXPECT_EQ(std::string(e.what()), "HRESULT 80004005: Unspecified error: \xE9t\xFF");
}

TEST(HResultException, CopyKeepsEveryFieldAndIsARuntimeError) {
    const HResultException original(E_OUTOFMEMORY, u"Src", u"Desc", u"file.hlp", 42);
    try {
        throw HResultException(original);
    } catch (const std::runtime_error& caught) {
        const auto& copy = dynamic_cast<const HResultException&>(caught);
        EXPECT_EQ(copy.Error(), E_OUTOFMEMORY);
        EXPECT_EQ(copy.Source(), u"Src");
        EXPECT_EQ(copy.Description(), u"Desc");
        EXPECT_EQ(copy.HelpFile(), u"file.hlp");
        EXPECT_EQ(copy.HelpContext(), 42u);
        EXPECT_STREQ(copy.what(), original.what());
    }
}

} // namespace
} // namespace Norvane
