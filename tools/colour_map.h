// A perceptually uniform colour map for dose pictures.
#pragma once

#include <cstdint>

namespace Norvane::Lumis::Scanning::Tool {

struct Rgb {
    std::uint8_t r;
    std::uint8_t g;
    std::uint8_t b;

    friend bool operator==(const Rgb&, const Rgb&) = default;
};

// The viridis map: dark violet at 0 through blue and green to yellow at 1, with brightness rising evenly,
// so equal steps of t look like equal steps of colour. Never black, so exposed pixels stand out from an
// unexposed background. t is clamped to [0, 1].
Rgb ViridisColour(double t);

} // namespace Norvane::Lumis::Scanning::Tool
