#include "composition/polygon_containment.h"

namespace Norvane::Lumis::Scanning {
namespace {

// The contribution of the edge a -> b, both given relative to the tested point.
int EdgeWinding(coordinate<double> a, coordinate<double> b) {
    if (a.y * b.y < 0.0) {
        const double crossingX = (b.x - a.x) * a.y / (a.y - b.y) + a.x;
        if (crossingX > 0.0)
            return a.y >= 0.0 ? -2 : 2;
        return 0;
    }
    if (a.y == 0.0 && b.y == 0.0)
        return 0;
    if (a.y == 0.0 && a.x > 0.0)
        return b.y > 0.0 ? 1 : -1;
    if (b.y == 0.0 && b.x > 0.0)
        return a.y >= 0.0 ? -1 : 1;
    return 0;
}

coordinate<double> RelativeTo(coordinate<double> vertex, coordinate<double> origin) {
    return {vertex.x - origin.x, vertex.y - origin.y};
}

} // namespace

bool PolygonContains(std::span<const coordinate<double>> vertices, coordinate<double> point) {
    int winding = 0;
    for (std::size_t i = 0; i < vertices.size(); ++i) {
        const auto& next = vertices[(i + 1) % vertices.size()];
        winding += EdgeWinding(RelativeTo(vertices[i], point), RelativeTo(next, point));
    }
    return winding != 0;
}

} // namespace Norvane::Lumis::Scanning
