// Feeds arbitrary bytes to the scan device configuration reader. A malformed file must end in the one
// configuration error; anything else escaping, or a sanitizer report, is a fault.

#include "core/scan_device_config.h"
#include "module/hresult_exception.h"

#include <cstddef>
#include <cstdint>
#include <sstream>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::istringstream input(std::string(reinterpret_cast<const char*>(data), size));
    try {
        Norvane::Lumis::Scanning::ParseScanDeviceConfig(input);
    } catch (const Norvane::HResultException&) {
    }
    return 0;
}
