#include "core/rendering_classes.h"

#include "core/pattern_alignments.h"
#include "core/pattern_rendering_properties.h"
#include "core/raster_alignments.h"
#include "core/raster_rendering_properties.h"
#include "module/class_creator.h"

#include <string>

namespace Norvane::Lumis::Scanning {

namespace {

template <class T> ClassEntry EntryFor(REFCLSID clsid, const char* name) {
    return {clsid, name, std::string("Beamweaver.") + name, ThreadingModel::Free, &CreateComObject<T>};
}

} // namespace

std::vector<ClassEntry> RenderingClassEntries() {
    return {
        EntryFor<CCoPatternAlignments>(CLSID_PatternAlignments, "PatternAlignments"),
        EntryFor<CRasterAlignments>(CLSID_RasterAlignments, "RasterAlignments"),
        EntryFor<CCoPatternRenderingProperties>(CLSID_PatternRenderingProperties,
                                                "PatternRenderingProperties"),
        EntryFor<CRasterRenderingProperties>(CLSID_RasterRenderingProperties, "RasterRenderingProperties"),
    };
}

} // namespace Norvane::Lumis::Scanning
