#include "tools/colour_map.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

// A polynomial fit of degree 6 to the map, per channel, lowest power first; over [0, 1] it stays within
// a few 8-bit steps of the map.
constexpr std::array<std::array<double, 7>, 3> kCoefficients{{
    {0.2777273272234177, 0.1050930431085774, -0.3308618287255563, -4.634230498983486, 6.228269936347081,
     4.776384997670288, -5.435455855934631},
    {0.005407344544966578, 1.404613529898575, 0.214847559468213, -5.799100973351585, 14.17993336680509,
     -13.74514537774601, 4.645852612178535},
    {0.3340998053353061, 1.384590162594685, 0.09509516302823659, -19.33244095627987, 56.69055260068105,
     -65.35303263337234, 26.3124352495832},
}};

std::uint8_t Channel(const std::array<double, 7>& c, double t) {
    double value = 0.0;
    for (auto it = c.rbegin(); it != c.rend(); ++it)
        value = value * t + *it;
    return static_cast<std::uint8_t>(std::lround(std::clamp(value, 0.0, 1.0) * 255.0));
}

} // namespace

Rgb ViridisColour(double t) {
    const double x = std::isnan(t) ? 0.0 : std::clamp(t, 0.0, 1.0);
    return {Channel(kCoefficients[0], x), Channel(kCoefficients[1], x), Channel(kCoefficients[2], x)};
}

} // namespace Norvane::Lumis::Scanning::Tool
