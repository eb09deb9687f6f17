#include "core/scan_device_config.h"

#include "module/hresult_exception.h"

#include <cstdint>
#include <fstream>
#include <limits>
#include <sstream>
#include <string>
#include <string_view>
#include <system_error>

namespace Norvane::Lumis::Scanning {

namespace {

constexpr const char* kFileName = "ScanDevice.cfg";
constexpr char kSeparator = '/';

[[noreturn]] void ThrowInvalidConfiguration() {
    throw HResultException(E_INVALIDARG, "Invalid configuration file");
}

// Reads the next line as "<key> <number> [anything]" and returns the number; the line must exist, start
// with exactly key and hold a number after it that accepts takes.
template <class T, class Accepts> T ReadSetting(std::istream& input, std::string_view key, Accepts accepts) {
    std::string line;
    if (!std::getline(input, line))
        ThrowInvalidConfiguration();
    std::istringstream fields(line);
    std::string readKey;
    T value{};
    if (!(fields >> readKey >> value) || readKey != key || !accepts(value))
        ThrowInvalidConfiguration();
    return value;
}

bool IsPositiveTime(double value) {
    return value > 0.0;
}

bool IsDwellCount(std::int32_t value) {
    return value > 0 && value <= std::numeric_limits<std::uint16_t>::max();
}

// The directory of the running program's executable, without the trailing separator; empty when the
// executable's path cannot be read or holds no separator.
std::string ExecutableDirectory() {
    std::error_code error;
    const std::string executable = std::filesystem::read_symlink("/proc/self/exe", error).string();
    if (error)
        return {};
    const auto separator = executable.rfind(kSeparator);
    return separator == std::string::npos ? std::string() : executable.substr(0, separator);
}

} // namespace

ScanDeviceConfig ParseScanDeviceConfig(std::istream& input) {
    ScanDeviceConfig config;
    config.dwellTimeUnit = ReadSetting<double>(input, "DwellTimeUnit", IsPositiveTime);
    config.maximumDwellTimeFactor = ReadSetting<std::int32_t>(input, "MaximumDwellTimeFactor", IsDwellCount);
    config.maximumDwellTimeResolution =
        ReadSetting<double>(input, "MaximumDwellTimeResolution", IsPositiveTime);
    return config;
}

ScanDeviceConfig LoadScanDeviceConfigFrom(const std::filesystem::path& directory) {
    const std::filesystem::path file(directory.string() + kSeparator + kFileName);
    std::error_code error;
    if (!std::filesystem::is_regular_file(file, error))
        return ScanDeviceConfig{};
    std::ifstream input(file);
    if (!input.is_open())
        return ScanDeviceConfig{};
    return ParseScanDeviceConfig(input);
}

ScanDeviceConfig LoadScanDeviceConfig() {
    return LoadScanDeviceConfigFrom(ExecutableDirectory());
}

} // namespace Norvane::Lumis::Scanning
