#include "platform/bstr.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <string>

namespace {

std::uint32_t PrefixOf(BSTR text) {
    std::uint32_t bytes = 0;
    std::memcpy(&bytes, reinterpret_cast<const char*>(text) - sizeof bytes, sizeof bytes);
    return bytes;
}

TEST(Bstr, CarriesItsByteCountInFrontAndAZeroBehind) {
    const std::u16string text = u"Beam";
    BSTR b = SysAllocStringLen(text.data(), 4);
    ASSERT_NE(b, nullptr);
    EXPECT_EQ(PrefixOf(b), 8u); // 4 characters of 2 bytes
    EXPECT_EQ(SysStringLen(b), 4u);
    EXPECT_EQ(SysStringByteLen(b), 8u);
    EXPECT_EQ(b[4], u'\0');
    EXPECT_EQ(BstrView(b), text);
    SysFreeString(b);
}

TEST(Bstr, KeepsEmbeddedZeroCharacters) {
    const OLECHAR text[] = {u'a', u'\0', u'b', u'\0', u'c'};
    BSTR b = SysAllocStringLen(text, 5);
    ASSERT_NE(b, nullptr);
    EXPECT_EQ(SysStringLen(b), 5u);
    EXPECT_EQ(BstrView(b), std::u16string_view(text, 5));
    // Read as a zero-terminated string it ends at the first zero.
    EXPECT_EQ(std::char_traits<char16_t>::length(b), 1u);
    CComBSTR copy = CComBSTR::Copy(b);
    EXPECT_EQ(copy.View(), std::u16string_view(text, 5));
    SysFreeString(b);
}

TEST(Bstr, NullIsTheEmptyString) {
    EXPECT_EQ(SysStringLen(nullptr), 0u);
    EXPECT_EQ(SysStringByteLen(nullptr), 0u);
    EXPECT_TRUE(BstrView(nullptr).empty());
    EXPECT_EQ(SysAllocString(nullptr), nullptr);
    SysFreeString(nullptr);
    EXPECT_TRUE(CComBSTR::Copy(nullptr).IsNull());
    EXPECT_EQ(CComBSTR().Utf8(), "");
}

TEST(Bstr, AllocationWithoutTextIsZeroFilled) {
    BSTR b = SysAllocStringLen(nullptr, 3);
    ASSERT_NE(b, nullptr);
    EXPECT_EQ(BstrView(b), std::u16string_view(u"\0\0\0", 3));
    SysFreeString(b);
}

TEST(Bstr, WrapperCopiesAndMovesOwnership) {
    CComBSTR original("Spot");
    CComBSTR copy = original;
    EXPECT_NE(static_cast<BSTR>(copy), static_cast<BSTR>(original));
    EXPECT_EQ(copy.View(), u"Spot");
    CComBSTR moved = std::move(copy);
    EXPECT_TRUE(copy.IsNull());
    EXPECT_EQ(moved.Utf8(), "Spot");
    BSTR detached = moved.Detach();
    EXPECT_TRUE(moved.IsNull());
    SysFreeString(detached);
}

struct Utf8Case {
    const char* label;
    std::string utf8;
    std::u16string utf16;
};

// Well-formed text converts both ways without loss; U+1D11E lies beyond the 16-bit plane and
// travels as the surrogate pair D834 DD1E (0x1D11E - 0x10000 = 0xD11E: high 10 bits 0x34, low 0x11E).
TEST(Utf8Conversion, WellFormedTextRoundTrips) {
    const Utf8Case cases[] = {
        {"ascii", "Rectangle 1", u"Rectangle 1"},
        {"two-byte",
         "Gr\xC3\xBC\xC3\x9F"
         "e",
         u"Gr\u00FC\u00DFe"},
        {"three-byte", "\xE2\x82\xAC 5", u"\u20AC 5"},
        {"four-byte", "\xF0\x9D\x84\x9E", std::u16string{char16_t(0xD834), char16_t(0xDD1E)}},
        {"largest", "\xF4\x8F\xBF\xBF", std::u16string{char16_t(0xDBFF), char16_t(0xDFFF)}},
        {"embedded zero", std::string("a\0b", 3), std::u16string(u"a\0b", 3)},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.label);
        EXPECT_EQ(Utf8ToUtf16(c.utf8), c.utf16);
        EXPECT_EQ(Utf16ToUtf8(c.utf16), c.utf8);
        EXPECT_EQ(CComBSTR(c.utf8).View(), c.utf16);
    }
}

// Each malformed sequence (as far as it went before going wrong) becomes one U+FFFD; the byte that
// broke a sequence starts the next one.
TEST(Utf8Conversion, MalformedInputBecomesReplacementCharacters) {
    const Utf8Case cases[] = {
        {"lone continuation byte", "a\x80z", u"a\uFFFDz"},
        {"byte never used", "\xFFz", u"\uFFFDz"},
        {"lead beyond U+10FFFF", "\xF5\x80", u"\uFFFD\uFFFD"},
        {"truncated at the end", "z\xE2\x82", u"z\uFFFD"},
        {"interrupted by ASCII", "\xE2\x82z", u"\uFFFDz"},
        {"encoded surrogate", "\xED\xA0\x80", u"\uFFFD"},
        {"beyond U+10FFFF", "\xF4\x90\x80\x80", u"\uFFFD"},
        {"overlong slash in two bytes", "\xC0\xAF", u"\uFFFD"},
        {"overlong slash in three bytes", "\xE0\x80\xAF", u"\uFFFD"},
        {"overlong U+20AC in four bytes", "\xF0\x82\x82\xAC", u"\uFFFD"},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.label);
        EXPECT_EQ(Utf8ToUtf16(c.utf8), c.utf16);
    }
}

TEST(Utf8Conversion, UnpairedSurrogatesBecomeReplacementCharacters) {
    const std::string replacement = "\xEF\xBF\xBD"; // U+FFFD in UTF-8
    EXPECT_EQ(Utf16ToUtf8(std::u16string{char16_t(0xD834), u'x'}), replacement + "x");
    EXPECT_EQ(Utf16ToUtf8(std::u16string{char16_t(0xDD1E)}), replacement);
    EXPECT_EQ(Utf16ToUtf8(std::u16string{u'x', char16_t(0xD834)}), "x" + replacement);
}

} // namespace
