// The scan device's configuration file "ScanDevice.cfg", read from the directory of the running program.
//
// The file holds three lines in this order, each a key and a number (further text on a line and further
// lines are ignored):
//
//     DwellTimeUnit 2.5e-8
//     MaximumDwellTimeFactor 4095
//     MaximumDwellTimeResolution 6.4e-6
#pragma once

#include "core/rendering_settings.h"

#include <filesystem>
#include <istream>

namespace Norvane::Lumis::Scanning {

// The file in the directory of the running program. When that directory cannot be found, the directory
// part is empty and the file is looked for at "/ScanDevice.cfg".
ScanDeviceConfig LoadScanDeviceConfig();

// The file directory + '/' + "ScanDevice.cfg". A file that is absent, not a regular file or cannot be
// opened leaves the defaults of ScanDeviceConfig; a malformed one throws as ParseScanDeviceConfig.
ScanDeviceConfig LoadScanDeviceConfigFrom(const std::filesystem::path& directory);

// Reads the three lines. A missing line, a wrong key (exact and case-sensitive), an unreadable number or
// a value out of range throws HResultException(E_INVALIDARG, "Invalid configuration file"). All three
// values must be > 0, and the factor must fit the 16-bit dwell count of a point (at most 65535).
ScanDeviceConfig ParseScanDeviceConfig(std::istream& input);

} // namespace Norvane::Lumis::Scanning
