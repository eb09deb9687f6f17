// Length-prefixed UTF-16 strings as they cross interfaces, and conversions to and from UTF-8.
//
// Layout: a 32-bit byte count, then the characters, then a terminating zero. A BSTR points at the
// first character, so it can be read as a zero-terminated string; a null BSTR is the empty string.
#pragma once

#include "platform/com_types.h"

#include <string>
#include <string_view>
#include <utility>

using BSTR = OLECHAR*;

BSTR SysAllocString(const OLECHAR* text);
// Allocates room for length characters, copied from text when it is not null, zero otherwise.
BSTR SysAllocStringLen(const OLECHAR* text, UINT length);
void SysFreeString(BSTR text);
UINT SysStringLen(BSTR text);
UINT SysStringByteLen(BSTR text);

std::u16string Utf8ToUtf16(std::string_view text);
std::string Utf16ToUtf8(std::u16string_view text);
std::u16string_view BstrView(BSTR text);

// Owning wrapper; throws std::bad_alloc when an allocation fails.
class CComBSTR {
  public:
    CComBSTR() = default;
    explicit CComBSTR(std::u16string_view text);
    explicit CComBSTR(std::string_view utf8);
    explicit CComBSTR(const char* utf8) : CComBSTR(std::string_view(utf8)) {}
    CComBSTR(const CComBSTR& other) : CComBSTR(other.View()) {}
    CComBSTR(CComBSTR&& other) noexcept : text_(std::exchange(other.text_, nullptr)) {}
    ~CComBSTR() { SysFreeString(text_); }
    CComBSTR& operator=(CComBSTR other) noexcept {
        std::swap(text_, other.text_);
        return *this;
    }

    static CComBSTR Copy(BSTR text) { return text ? CComBSTR(BstrView(text)) : CComBSTR(); }

    BSTR* operator&() { return &text_; }
    operator BSTR() const { return text_; }
    BSTR Detach() { return std::exchange(text_, nullptr); }
    std::u16string_view View() const { return BstrView(text_); }
    std::string Utf8() const { return Utf16ToUtf8(View()); }
    bool IsNull() const { return text_ == nullptr; }

  private:
    BSTR text_ = nullptr;
};
