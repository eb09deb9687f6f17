// A minimal shape pattern for driving the render pipeline in tests: a few relative positions, one dwell time.
#pragma once

#include "core/pattern_impl.h"

#include <vector>

namespace Norvane::Lumis::Scanning::Testing {

inline constexpr CLSID CLSID_TestPattern = MakeGuid("6D0B7A52-3C61-4E0B-9A54-0F1C2D3E4F50");

class CTestPattern : public IPatternShapeImpl<IPatternShape>, public ISupportErrorInfoImplEx<IPatternShape, IPattern> {
public:
    using Interfaces = InterfaceMap<IPatternShape, IExclusionAwarePattern, ISupportErrorInfo>;

    CTestPattern();
    explicit CTestPattern(const ScanDeviceConfig& config);

    void SetPositions(std::vector<coordinate<double>> positions) { positions_ = std::move(positions); }
    void SetDwellTime(double dwell) { dwellTime_ = dwell; }
    void SetCenter(coordinate<double> center) { center_ = center; }
    using CPattern::SetTransformationMatrix;

    HRESULT Validate(IPatternValidationResult** result) override;
    HRESULT GetLoopTime(double* loopTime) override;
    HRESULT GetMinDwellTime(double* dwellTime) override;
    HRESULT GetMaxDwellTime(double* dwellTime) override;
    HRESULT GetDacBoundingBox(IRectangleInt** box) override;
    HRESULT Accept(IPatternShapeVisitor* visitor) override;

protected:
    CComPtr<IScanDefinition> RenderPattern() override;

private:
    std::vector<coordinate<double>> positions_{{0.0, 0.0}, {0.5, 0.5}, {1.0, 1.0}};
    double dwellTime_ = 1e-6;
    coordinate<double> center_{};
};

// Removes every exposing point whose absolute X (point + offset) lies above a threshold, keeping order.
class CTestFilter : public CComObjectRootBase, public IPatternPointFilter {
public:
    using Interfaces = InterfaceMap<IPatternPointFilter>;
    explicit CTestFilter(std::uint16_t maximumX) : maximumX_(maximumX) {}

    HRESULT FilterList(IPatternPointList* list) override { return FilterListWithOffset(list, 0, 0); }
    HRESULT FilterListWithOffset(IPatternPointList* list, std::uint16_t offsetX, std::uint16_t offsetY) override;

private:
    std::uint16_t maximumX_;
};

// The sibling components and the library's value classes, registered once per test program.
void RegisterTestComponents();

// Creates a test pattern object; the configuration defaults unless given.
CComPtr<IPatternShape> MakeTestPattern(CTestPattern** object = nullptr);

} // namespace Norvane::Lumis::Scanning::Testing
