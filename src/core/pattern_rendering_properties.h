// A pattern's rendering properties as a value object: the PatternRenderingSettings record with the
// checks of its setters. The alignments are held by value; their getters hand out new alignment objects
// holding copies. Value object: no lock (see ValueField), no ISupportErrorInfo.
#pragma once

#include "core/alignment_fields.h"
#include "platform/dispatch_impl.h"
#include "platform/object.h"

#include <beamweaver/rendering.h>

#include <string_view>

namespace Norvane::Lumis::Scanning {

// Created by clients through its class identifier and by the library when it hands rendering properties
// out; both start from the defaults of PatternRenderingSettings or hold a copy of the record given.
class CPatternRenderingProperties : public CComObjectRootBase,
                                    public IDispatchImpl<IPatternRenderingProperties> {
  public:
    using Interfaces = InterfaceMap<IPatternRenderingProperties>;

    explicit CPatternRenderingProperties(const PatternRenderingSettings& value = PatternRenderingSettings{});

    HRESULT get_TargetDwellTimeResolution(double* value) override;
    HRESULT put_TargetDwellTimeResolution(double value) override;
    HRESULT get_GatePulseIdleTime(double* value) override;
    HRESULT put_GatePulseIdleTime(double value) override;
    HRESULT get_PreBlankingTime(double* value) override;
    HRESULT put_PreBlankingTime(double value) override;
    HRESULT get_PostBlankingTime(double* value) override;
    HRESULT put_PostBlankingTime(double value) override;
    HRESULT get_PatternStartAsymmetryTime(double* value) override;
    HRESULT put_PatternStartAsymmetryTime(double value) override;
    HRESULT get_GenerationStrategy(GenerationStrategy* value) override;
    HRESULT put_GenerationStrategy(GenerationStrategy value) override;
    HRESULT get_PatternAlignmentsX(IPatternAlignments** value) override;
    // Stores the Range and SlewRate read from value; null fails with "PatternAlignmentsX object is null".
    HRESULT put_PatternAlignmentsX(IPatternAlignments* value) override;
    HRESULT get_PatternAlignmentsY(IPatternAlignments** value) override;
    HRESULT put_PatternAlignmentsY(IPatternAlignments* value) override;

  private:
    static HRESULT GetAlignment(const PatternAlignmentFields& alignment, IPatternAlignments** value);
    static HRESULT PutAlignment(PatternAlignmentFields& alignment, IPatternAlignments* value,
                                std::string_view name);

    ValueField<double> targetDwellTimeResolution_;
    ValueField<double> gatePulseIdleTime_;
    ValueField<double> preBlankingTime_;
    ValueField<double> postBlankingTime_;
    ValueField<double> patternStartAsymmetryTime_;
    ValueField<GenerationStrategy> generationStrategy_;
    PatternAlignmentFields alignmentX_;
    PatternAlignmentFields alignmentY_;
};

// The creatable class is the same class: the two behave identically in every respect.
using CCoPatternRenderingProperties = CPatternRenderingProperties;

} // namespace Norvane::Lumis::Scanning
