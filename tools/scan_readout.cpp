#include "tools/scan_readout.h"

#include "tools/library_call.h"

namespace Norvane::Lumis::Scanning::Tool {

namespace {

std::vector<PatternPoint> ReadPoints(IPatternPointList& list) {
    std::int32_t count = 0;
    CheckCall(list.GetCount(&count), "PointList.GetCount");
    CComPtr<IPatternPointBuffer> buffer;
    CheckCall(list.GetPointBuffer(&buffer), "PointList.GetPointBuffer");
    PatternPoint* begin = nullptr;
    PatternPoint* end = nullptr;
    CheckCall(buffer->GetRange(0, static_cast<std::uint32_t>(count), &begin, &end), "PointBuffer.GetRange");
    return {begin, end};
}

RenderedSubPattern ReadSubPattern(ISubPattern& subPattern) {
    RenderedSubPattern result{};
    CheckCall(subPattern.get_OffsetX(&result.offsetX), "SubPattern.OffsetX");
    CheckCall(subPattern.get_OffsetY(&result.offsetY), "SubPattern.OffsetY");
    CheckCall(subPattern.get_RepeatCount(&result.repeatCount), "SubPattern.RepeatCount");
    CComPtr<IPatternPointList> list;
    CheckCall(subPattern.get_PointList(&list), "SubPattern.PointList");
    result.points = ReadPoints(*list);
    return result;
}

std::vector<RenderedSubPattern> ReadSubPatterns(ISubPatternCollection& collection) {
    std::int32_t count = 0;
    CheckCall(collection.get_Count(&count), "SubPatternCollection.Count");
    std::vector<RenderedSubPattern> subPatterns;
    for (std::int32_t i = 0; i < count; ++i) {
        CComPtr<ISubPattern> subPattern;
        CheckCall(collection.Item(i, &subPattern), "SubPatternCollection.Item");
        subPatterns.push_back(ReadSubPattern(*subPattern));
    }
    return subPatterns;
}

} // namespace

DacRectangle ReadRectangle(IRectangleInt& rectangle, const char* step) {
    DacRectangle result{};
    CheckCall(rectangle.get_Left(&result.left), step);
    CheckCall(rectangle.get_Top(&result.top), step);
    CheckCall(rectangle.get_Right(&result.right), step);
    CheckCall(rectangle.get_Bottom(&result.bottom), step);
    return result;
}

RenderedScan ReadScanDefinition(IScanDefinition& scanDefinition) {
    RenderedScan scan{};
    CheckCall(scanDefinition.get_GatePulseIdleTicks(&scan.gatePulseIdleTicks),
              "ScanDefinition.GatePulseIdleTicks");
    CheckCall(scanDefinition.get_AcquisitionUpdatePoints(&scan.acquisitionUpdatePoints),
              "ScanDefinition.AcquisitionUpdatePoints");
    CComPtr<ISubPatternCollection> collection;
    CheckCall(scanDefinition.get_SubPatternCollection(&collection), "ScanDefinition.SubPatternCollection");
    CheckCall(collection->get_DwellTimeResolution(&scan.dwellTimeResolution),
              "SubPatternCollection.DwellTimeResolution");
    CComPtr<IRectangleInt> fieldOfView;
    CheckCall(collection->get_FieldOfView(&fieldOfView), "SubPatternCollection.FieldOfView");
    scan.fieldOfView = ReadRectangle(*fieldOfView, "SubPatternCollection.FieldOfView");
    scan.subPatterns = ReadSubPatterns(*collection);
    return scan;
}

} // namespace Norvane::Lumis::Scanning::Tool
