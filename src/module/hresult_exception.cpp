#include "module/hresult_exception.h"

#include "module/byte_text.h"
#include "module/system_messages.h"

#include <cstdint>
#include <cstdio>
#include <utility>

namespace Norvane {

namespace {

// Upper-case hexadecimal of the code's 32 bits, no prefix and no leading zeros: "80070057".
std::string HexCode(HRESULT hr) {
    char digits[9];
    std::snprintf(digits, sizeof digits, "%X", static_cast<unsigned>(static_cast<std::uint32_t>(hr)));
    return digits;
}

} // namespace

HResultException::HResultException(HRESULT hr) : HResultException(hr, u"", u"", u"", 0) {}

HResultException::HResultException(HRESULT hr, const std::string& message)
    : HResultException(hr, u"", WidenBytes(message), u"", 0) {}

HResultException::HResultException(HRESULT hr, std::u16string source, std::u16string description,
                                   std::u16string helpFile, DWORD helpContext)
    : std::runtime_error(ComposeText(hr, source, description)), hr_(hr), source_(std::move(source)),
      description_(std::move(description)), helpFile_(std::move(helpFile)), helpContext_(helpContext) {}

const char* HResultException::what() const noexcept {
    return std::runtime_error::what();
}

std::string HResultException::ComposeText(HRESULT hr, const std::u16string& source,
                                          const std::u16string& description) {
    std::string text = "HRESULT " + HexCode(hr);
    if (const std::string_view system = SystemMessage(hr); !system.empty())
        text.append(": ").append(system);
    if (!description.empty())
        text.append(": ").append(NarrowToLowBytes(description));
    if (!source.empty())
        text.append("\nSource: ").append(NarrowToLowBytes(source));
    return text;
}

} // namespace Norvane
