#include "tools/dose_preview.h"

#include "tools/colour_map.h"
#include "tools/tool_error.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <string>

namespace Norvane::Lumis::Scanning::Tool {

namespace {

struct DoseRange {
    double minimum;
    double maximum;
};

DoseRange NonzeroRange(const std::vector<double>& dose) {
    DoseRange range{std::numeric_limits<double>::infinity(), 0.0};
    for (double d : dose)
        if (d > 0.0)
            range = {std::min(range.minimum, d), std::max(range.maximum, d)};
    return range;
}

// Where a dose lies between the range's ends on a logarithmic scale, 0 to 1.
double LogPosition(double d, const DoseRange& range) {
    if (!(range.maximum > range.minimum))
        return 1.0;
    return std::log(d / range.minimum) / std::log(range.maximum / range.minimum);
}

// The pixel index of a DAC position along one axis, or -1 outside the field.
int PixelOf(std::int64_t position, std::int64_t first, std::int64_t span, int pixels) {
    const std::int64_t offset = position - first;
    if (offset < 0 || offset >= span)
        return -1;
    return static_cast<int>(offset * pixels / span);
}

std::int64_t Span(std::int32_t first, std::int32_t last) {
    return std::int64_t{last} - first + 1;
}

} // namespace

PreviewSize PreviewSizeFor(const DacRectangle& field, int maxSide) {
    const std::int64_t spanX = Span(field.left, field.right);
    const std::int64_t spanY = Span(field.top, field.bottom);
    if (spanX < 1 || spanY < 1)
        throw ToolError("--preview: the field of view [" + std::to_string(field.left) + ", " +
                        std::to_string(field.top) + ", " + std::to_string(field.right) + ", " +
                        std::to_string(field.bottom) + "] is empty");
    const std::int64_t longer = std::max(spanX, spanY);
    const std::int64_t side = std::min<std::int64_t>(maxSide, longer);
    const auto follow = [&](std::int64_t span) {
        return static_cast<int>(std::max<std::int64_t>(1, (side * span + longer / 2) / longer));
    };
    return {follow(spanX), follow(spanY)};
}

std::vector<double> AccumulateDose(const RenderedScan& scan, PreviewSize size) {
    const DacRectangle& field = scan.fieldOfView;
    const std::int64_t spanX = Span(field.left, field.right);
    const std::int64_t spanY = Span(field.top, field.bottom);
    std::vector<double> dose(static_cast<std::size_t>(size.width) * static_cast<std::size_t>(size.height),
                             0.0);
    for (const RenderedSubPattern& subPattern : scan.subPatterns) {
        for (const PatternPoint& point : subPattern.points) {
            if (point.flags & PointFlag_Blank)
                continue;
            const int column =
                PixelOf(std::int64_t{point.x} + subPattern.offsetX, field.left, spanX, size.width);
            const int row =
                PixelOf(std::int64_t{point.y} + subPattern.offsetY, field.top, spanY, size.height);
            if (column < 0 || row < 0)
                continue;
            dose[static_cast<std::size_t>(row) * static_cast<std::size_t>(size.width) +
                 static_cast<std::size_t>(column)] +=
                point.dwell * scan.dwellTimeResolution * subPattern.repeatCount;
        }
    }
    return dose;
}

RgbImage ColourDose(const std::vector<double>& dose, PreviewSize size) {
    RgbImage image{size.width, size.height, std::vector<std::uint8_t>(dose.size() * 3, 0)};
    const DoseRange range = NonzeroRange(dose);
    for (std::size_t i = 0; i < dose.size(); ++i) {
        if (!(dose[i] > 0.0))
            continue;
        const Rgb colour = ViridisColour(LogPosition(dose[i], range));
        image.pixels[3 * i] = colour.r;
        image.pixels[3 * i + 1] = colour.g;
        image.pixels[3 * i + 2] = colour.b;
    }
    return image;
}

RgbImage RenderDosePreview(const RenderedScan& scan, int maxSide) {
    const PreviewSize size = PreviewSizeFor(scan.fieldOfView, maxSide);
    return ColourDose(AccumulateDose(scan, size), size);
}

} // namespace Norvane::Lumis::Scanning::Tool
