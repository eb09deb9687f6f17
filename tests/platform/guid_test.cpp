#include "platform/guid.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <string>

namespace {

constexpr GUID kLine = MakeGuid("D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1");

// The text form is big-endian per field: Data1, Data2 and Data3 read as numbers, Data4 as eight bytes.
static_assert(kLine.Data1 == 0xD62B8AB1u && kLine.Data2 == 0x6877u && kLine.Data3 == 0x4F6Du);
static_assert(kLine.Data4[0] == 0xB8 && kLine.Data4[1] == 0xCD && kLine.Data4[7] == 0xE1);
static_assert(MakeGuid("{d62b8ab1-6877-4f6d-b8cd-eecea2e937e1}") == kLine);

TEST(GuidParse, AcceptsBracedUnbracedAndEitherCase) {
    for (const char* text :
         {"D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1", "{D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1}",
          "d62b8ab1-6877-4f6d-b8cd-eecea2e937e1", "{d62B8aB1-6877-4F6d-B8cD-EECEA2E937e1}"}) {
        SCOPED_TRACE(text);
        const auto parsed = GuidFromString(text);
        ASSERT_TRUE(parsed.has_value());
        EXPECT_EQ(*parsed, kLine);
    }
}

TEST(GuidParse, RejectsMalformedText) {
    for (const char* text : {
             "",
             "D62B8AB1-6877-4F6D-B8CD-EECEA2E937EG",   // G is no hexadecimal digit
             "D62B8AB1-6877-4F6D-B8CD-EECEA2E937E",    // one digit short
             "D62B8AB1-6877-4F6D-B8CD-EECEA2E937E12",  // one digit long
             "D62B8AB1+6877-4F6D-B8CD-EECEA2E937E1",   // wrong separator
             "D62B8AB16-877-4F6D-B8CD-EECEA2E937E1",   // separator moved
             "{D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1",  // opening brace alone
             "D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1}",  // closing brace alone
             "(D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1)", // other brackets
             " D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1",  // leading space
             "D62B8AB1-6877-4F6D-B8CD- EECEA2E937E",   // space inside a group
             "0x2B8AB1-6877-4F6D-B8CD-EECEA2E937E1",   // prefix
         }) {
        SCOPED_TRACE(text);
        EXPECT_FALSE(GuidFromString(text).has_value());
    }
}

TEST(GuidFormat, RegistryFormIsBracedUpperCase) {
    EXPECT_EQ(GuidToString(MakeGuid("d62b8ab1-6877-4f6d-b8cd-eecea2e937e1")),
              "{D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1}");
    EXPECT_EQ(GuidToString(GUID_NULL), "{00000000-0000-0000-0000-000000000000}");
}

TEST(GuidFormat, StringFromGuid2WritesThirtyNineCharactersWithTheZero) {
    OLECHAR buffer[40];
    std::fill(std::begin(buffer), std::end(buffer), u'#');
    // 36 characters of the text form, two braces and the terminating zero.
    ASSERT_EQ(StringFromGUID2(kLine, buffer, 39), 39);
    EXPECT_EQ(std::u16string(buffer), u"{D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1}");
    EXPECT_EQ(buffer[39], u'#');
}

TEST(GuidFormat, StringFromGuid2RefusesASmallBufferAndLeavesItAlone) {
    OLECHAR buffer[38];
    std::fill(std::begin(buffer), std::end(buffer), u'#');
    EXPECT_EQ(StringFromGUID2(kLine, buffer, 38), 0);
    EXPECT_EQ(buffer[0], u'#');
    EXPECT_EQ(StringFromGUID2(kLine, nullptr, 39), 0);
}

TEST(GuidFormat, ParsingTheRegistryFormGivesTheSameIdentifier) {
    const GUID g = MakeGuid("00000001-0002-0003-0405-060708090A0B");
    EXPECT_EQ(GuidFromString(GuidToString(g)), g);
}

} // namespace
