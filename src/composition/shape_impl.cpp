#include "composition/shape_impl.h"

#include "module/error_reporting.h"

namespace Norvane::Lumis::Scanning {

RangeInt ReadRangeProperty(IRangeInt* value) {
    if (value == nullptr)
        throw std::invalid_argument("The range object is null");
    return ReadRange(value);
}

void RequireRangeOutput(IRangeInt** value) {
    if (value == nullptr)
        throw std::invalid_argument("The output range object is null");
}

void RequireCloneOutput(IShape** clone) {
    if (clone == nullptr)
        throw std::invalid_argument("ppIShape object is null");
}

void RequireCopyTarget(IShape* target) {
    if (target == nullptr)
        throw std::invalid_argument("pIShape object is null");
}

void PutShapeFrame(const ShapeFrame& frame, IShape* target) {
    CheckResult(target->put_TransformationMatrix(CreateMatrix(frame.matrix)));
    CheckResult(target->put_DACRangeX(CreateRange(frame.dacRangeX)));
    CheckResult(target->put_DACRangeY(CreateRange(frame.dacRangeY)));
}

} // namespace Norvane::Lumis::Scanning
