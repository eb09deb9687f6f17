// Conversions between narrow texts and the wide texts of error information, one byte per code unit.
//
// Exception messages are narrow and error information is wide. A message becomes a description by
// widening every byte to the code unit of the same value (0 to 255); a description or source appears
// in a narrow text through the low 8 bits of each code unit. Round trips of narrow texts are exact.
#pragma once

#include <string>
#include <string_view>

namespace Norvane {

std::u16string WidenBytes(std::string_view text);
std::string NarrowToLowBytes(std::u16string_view text);

} // namespace Norvane
