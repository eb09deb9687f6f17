// Whether a point lies inside a polygon, by a winding count over its closed outline.
#pragma once

#include "module/geometry_values.h"

#include <span>

namespace Norvane::Lumis::Scanning {

// The outline runs through the vertices in order and closes from the last back to the first; it may
// be concave or cross itself. A horizontal ray from the point towards +x is followed along the outline:
// an edge that crosses the ray counts 2 (minus going towards -y, plus going towards +y), a vertex that
// lies on the ray counts half of that for each of its two edges. Edges lying on the ray's line count
// nothing, so a point in line with a horizontal edge is decided by the edges around it. The point is
// inside when the count is not zero; an empty outline contains nothing. Points on the outline itself
// may fall either way.
bool PolygonContains(std::span<const coordinate<double>> vertices, coordinate<double> point);

} // namespace Norvane::Lumis::Scanning
