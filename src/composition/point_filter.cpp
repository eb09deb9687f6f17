#include "composition/point_filter.h"

#include "core/point_buffer_view.h"
#include "module/error_reporting.h"
#include "module/geometry_io.h"
#include "module/hresult_exception.h"

#include <stdexcept>

namespace Norvane::Lumis::Scanning {

namespace {

// Dwell tick counts by which the filter recognises, and with which it regenerates, the lead-in: the
// default pre-blanking time (1e-6 s) and start asymmetry time (5e-8 s) at 2.5e-8 s per tick.
constexpr std::uint16_t kLeadInBlankTicks = 40;
constexpr std::uint16_t kStartAsymmetryTicks = 2;

enum class PointClass { Exposing, LeadInBlank, StartAsymmetry, Other };

// Only the acquire and blank bits decide; other bits (such as the sync marker) are ignored.
PointClass Classify(const PatternPoint& point) {
    switch (point.flags & (PointFlag_Acquire | PointFlag_Blank)) {
    case PointFlag_Acquire:
        return PointClass::Exposing;
    case PointFlag_Blank:
        return point.dwell == kLeadInBlankTicks ? PointClass::LeadInBlank : PointClass::Other;
    case 0:
        return point.dwell == kStartAsymmetryTicks ? PointClass::StartAsymmetry : PointClass::Other;
    default:
        return PointClass::Other;
    }
}

// Maps the DAC position of a point (with the sub pattern's offsets) into the shape's own relative
// coordinates. The arithmetic is done in doubles, which is exact for every 32-bit position and range, so
// no range stored on a shape can overflow it.
class ShapeMapping {
  public:
    ShapeMapping(const ShapeView& shape, std::uint16_t offsetX, std::uint16_t offsetY)
        : shape_(shape), offsetX_(offsetX), offsetY_(offsetY) {}

    bool Contains(const PatternPoint& point) {
        if (!inverted_) {
            inverse_ = InvertMatrix(shape_.matrix);
            inverted_ = true;
        }
        const double x = Relative(point.x + offsetX_, shape_.rangeX);
        const double y = Relative(point.y + offsetY_, shape_.rangeY);
        const TransformationMatrix& i = inverse_;
        return (*shape_.contains)({i.m0 * x + i.m1 * y + i.m2, i.m3 * x + i.m4 * y + i.m5});
    }

  private:
    static double Relative(std::int32_t dac, const RangeInt& range) {
        return (double(dac) - double(range.minimum)) / (double(range.maximum) - double(range.minimum));
    }

    const ShapeView& shape_;
    std::int32_t offsetX_;
    std::int32_t offsetY_;
    // Computed on the first exposing point: a pass without one never needs it, and never fails on a
    // singular matrix.
    TransformationMatrix inverse_;
    bool inverted_ = false;
};

// The write side of the compaction: points are written over those already read.
class PointWriter {
  public:
    explicit PointWriter(std::span<PatternPoint> points) : points_(points) {}

    std::uint32_t Written() const { return written_; }
    // How many points may be written before the one at index read without overwriting an unread point:
    // the one at read itself (the caller holds it) and the room left by the points dropped so far.
    std::uint32_t RoomBefore(std::uint32_t read) const { return read + 1 - written_; }
    const PatternPoint& Last() const { return points_[written_ - 1]; }

    void Write(PatternPoint point) { StorePoint(points_.data() + written_++, point); }

  private:
    std::span<PatternPoint> points_;
    std::uint32_t written_ = 0;
};

// A lead-in blank point rewritten at the position of the last written point, otherwise unchanged.
PatternPoint MovedTo(PatternPoint point, const PatternPoint& position) {
    point.x = position.x;
    point.y = position.y;
    return point;
}

// A kept exposing point after a start asymmetry: the lead-in is regenerated at its position, as far as
// the dropped points left room for it. There is always room for the asymmetry point (the one that made
// the lead-in pending was itself dropped); the blank point needs one more dropped point, which a normal
// rendering's leading blank point provides.
void WriteLeadInBefore(PointWriter& writer, std::uint32_t read, const PatternPoint& point) {
    if (writer.RoomBefore(read) >= 3)
        writer.Write(MakePoint(point.x, point.y, kLeadInBlankTicks, PointFlag_Blank));
    writer.Write(MakePoint(point.x, point.y, kStartAsymmetryTicks, 0));
}

} // namespace

std::uint32_t FilterPoints(std::span<PatternPoint> points, std::uint16_t offsetX, std::uint16_t offsetY,
                           const ShapeView& shape) {
    if (shape.contains == nullptr)
        throw std::invalid_argument("The shape has no containment test");
    ShapeMapping mapping(shape, offsetX, offsetY);
    PointWriter writer(points);
    bool pending = false;
    const auto count = static_cast<std::uint32_t>(points.size());
    for (std::uint32_t read = 0; read < count; ++read) {
        const PatternPoint point = points[read];
        switch (Classify(point)) {
        case PointClass::StartAsymmetry:
            pending = true;
            break;
        case PointClass::Exposing:
            if (mapping.Contains(point))
                break;
            if (pending)
                WriteLeadInBefore(writer, read, point);
            pending = false;
            writer.Write(point);
            break;
        case PointClass::LeadInBlank:
            if (pending)
                pending = false;
            else if (writer.Written() > 0)
                writer.Write(MovedTo(point, writer.Last()));
            break;
        case PointClass::Other:
            break;
        }
    }
    return writer.Written();
}

void FilterPointList(IPatternPointList* list, std::uint16_t offsetX, std::uint16_t offsetY,
                     const ShapeView& shape) {
    if (list == nullptr)
        throw HResultException(E_INVALIDARG, "Null arguments supplied");
    std::uint32_t kept = 0;
    {
        const PointBufferView view(list);
        kept = FilterPoints(view.Points(), offsetX, offsetY, shape);
    }
    if (const auto counted = QueryAs<IPatternPointListCount>(list))
        CheckResult(counted->SetPointCount(kept));
}

} // namespace Norvane::Lumis::Scanning
