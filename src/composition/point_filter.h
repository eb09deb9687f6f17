// The exclusion filter: removes the exposing points that fall inside one shape from a point list, in
// place and in one pass, and keeps the blanking lead-in and lead-out consistent around what is left.
#pragma once

#include "module/geometry_values.h"
#include "platform/com_ptr.h"

#include <beamweaver/dwellmap.h>

#include <cstdint>
#include <functional>
#include <span>

namespace Norvane::Lumis::Scanning {

// What one filter pass needs of a shape: its transformation matrix (shape to field; the filter maps
// points through its inverse), its DAC ranges, and whether it contains a relative position.
struct ShapeView {
    TransformationMatrix matrix;
    RangeInt rangeX{0, 65535};
    RangeInt rangeY{0, 65535};
    const std::function<bool(coordinate<double>)>* contains = nullptr;
};

// Compacts points in place; returns how many were kept (the first ones). Offsets are added to each
// point's stored position for the containment test only. The lead-in regenerated in front of a kept
// point takes only the room of the points dropped before it, so a pass never writes over a point it has
// not read yet and never keeps more points than it was given. The inverse matrix is computed on the
// first exposing point: a singular matrix fails only a pass that has one. shape.contains must be set.
std::uint32_t FilterPoints(std::span<PatternPoint> points, std::uint16_t offsetX, std::uint16_t offsetY,
                           const ShapeView& shape);

// The same on a point list, shortened afterwards; a null list fails with "Null arguments supplied".
void FilterPointList(IPatternPointList* list, std::uint16_t offsetX, std::uint16_t offsetY,
                     const ShapeView& shape);

} // namespace Norvane::Lumis::Scanning
