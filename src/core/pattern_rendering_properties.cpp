#include "core/pattern_rendering_properties.h"

#include "core/rendering_conversions.h"

namespace Norvane::Lumis::Scanning {

CPatternRenderingProperties::CPatternRenderingProperties(const PatternRenderingSettings& value)
    : targetDwellTimeResolution_(value.targetDwellTimeResolution),
      gatePulseIdleTime_(value.gatePulseIdleTime), preBlankingTime_(value.preBlankingTime),
      postBlankingTime_(value.postBlankingTime), patternStartAsymmetryTime_(value.patternStartAsymmetryTime),
      generationStrategy_(value.generationStrategy), alignmentX_(value.alignmentX),
      alignmentY_(value.alignmentY) {}

HRESULT CPatternRenderingProperties::get_TargetDwellTimeResolution(double* value) {
    return targetDwellTimeResolution_.Get(IID_IPatternRenderingProperties, value);
}

HRESULT CPatternRenderingProperties::put_TargetDwellTimeResolution(double value) {
    return targetDwellTimeResolution_.Put(IID_IPatternRenderingProperties, value, IsPositive);
}

HRESULT CPatternRenderingProperties::get_GatePulseIdleTime(double* value) {
    return gatePulseIdleTime_.Get(IID_IPatternRenderingProperties, value);
}

HRESULT CPatternRenderingProperties::put_GatePulseIdleTime(double value) {
    return gatePulseIdleTime_.Put(IID_IPatternRenderingProperties, value, IsNotNegative);
}

HRESULT CPatternRenderingProperties::get_PreBlankingTime(double* value) {
    return preBlankingTime_.Get(IID_IPatternRenderingProperties, value);
}

HRESULT CPatternRenderingProperties::put_PreBlankingTime(double value) {
    return preBlankingTime_.Put(IID_IPatternRenderingProperties, value, IsNotNegative);
}

HRESULT CPatternRenderingProperties::get_PostBlankingTime(double* value) {
    return postBlankingTime_.Get(IID_IPatternRenderingProperties, value);
}

HRESULT CPatternRenderingProperties::put_PostBlankingTime(double value) {
    return postBlankingTime_.Put(IID_IPatternRenderingProperties, value, IsNotNegative);
}

HRESULT CPatternRenderingProperties::get_PatternStartAsymmetryTime(double* value) {
    return patternStartAsymmetryTime_.Get(IID_IPatternRenderingProperties, value);
}

HRESULT CPatternRenderingProperties::put_PatternStartAsymmetryTime(double value) {
    return patternStartAsymmetryTime_.Put(IID_IPatternRenderingProperties, value, IsNotNegative);
}

HRESULT CPatternRenderingProperties::get_GenerationStrategy(GenerationStrategy* value) {
    return generationStrategy_.Get(IID_IPatternRenderingProperties, value);
}

HRESULT CPatternRenderingProperties::put_GenerationStrategy(GenerationStrategy value) {
    return generationStrategy_.Put(IID_IPatternRenderingProperties, value, IsAnyValue<GenerationStrategy>);
}

HRESULT CPatternRenderingProperties::get_PatternAlignmentsX(IPatternAlignments** value) {
    return GetAlignment(alignmentX_, value);
}

HRESULT CPatternRenderingProperties::put_PatternAlignmentsX(IPatternAlignments* value) {
    return PutAlignment(alignmentX_, value, "PatternAlignmentsX");
}

HRESULT CPatternRenderingProperties::get_PatternAlignmentsY(IPatternAlignments** value) {
    return GetAlignment(alignmentY_, value);
}

HRESULT CPatternRenderingProperties::put_PatternAlignmentsY(IPatternAlignments* value) {
    return PutAlignment(alignmentY_, value, "PatternAlignmentsY");
}

HRESULT CPatternRenderingProperties::GetAlignment(const PatternAlignmentFields& alignment,
                                                  IPatternAlignments** value) {
    return Guarded(IID_IPatternRenderingProperties, value, [&] {
        *value = nullptr;
        *value = MakePatternAlignments(alignment.Load()).Detach();
    });
}

HRESULT CPatternRenderingProperties::PutAlignment(PatternAlignmentFields& alignment,
                                                  IPatternAlignments* value, std::string_view name) {
    return Guarded(IID_IPatternRenderingProperties,
                   [&] { alignment.Store(ReadPatternAlignments(value, name)); });
}

} // namespace Norvane::Lumis::Scanning
