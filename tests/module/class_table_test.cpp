#include "module/class_table.h"

#include "platform/module_lock.h"

#include <beamweaver/identifiers.h>
#include <beamweaver/shapes.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

using namespace Norvane::Lumis::Scanning;

namespace {

class ClassTableTest : public ::testing::Test {
  protected:
    void SetUp() override { RegisterComponents(); }
};

TEST_F(ClassTableTest, EveryEntryIsCreatableByIdentifierAndProgId) {
    for (const ClassEntry& entry : BeamweaverClassTable()) {
        CComPtr<IUnknown> object;
        EXPECT_EQ(CoCreateInstance(entry.clsid, nullptr, CLSCTX_ALL, IUnknown::iid,
                                   reinterpret_cast<void**>(&object)),
                  S_OK)
            << entry.name;
        CLSID byProgId{};
        EXPECT_EQ(CLSIDFromProgID(Utf8ToUtf16(entry.progId + ".1").c_str(), &byProgId), S_OK) << entry.progId;
        EXPECT_EQ(byProgId, entry.clsid);
    }
}

TEST_F(ClassTableTest, EntriesFollowThePublishedOrder) {
    // Of the classes built so far: the two alignments and rendering properties (104 to 107), the rectangle
    // (108), the circle (109), the line (110), the polygon (119), the strategies (122 to 124), the zone (125)
    // and the shapes (126 to 128).
    std::vector<std::string> names;
    for (const ClassEntry& entry : BeamweaverClassTable())
        names.push_back(entry.name);
    const std::vector<std::string> expected{"RasterAlignments",
                                            "PatternAlignments",
                                            "RasterRenderingProperties",
                                            "PatternRenderingProperties",
                                            "PatternRectangle",
                                            "PatternCircle",
                                            "PatternLine",
                                            "PatternPolygon",
                                            "ScanStrategyRaster",
                                            "ScanStrategyRectangular",
                                            "ScanStrategyCircular",
                                            "ExclusionZone",
                                            "ShapeRectangle",
                                            "ShapeCircle",
                                            "ShapePolygon"};
    EXPECT_EQ(names, expected);
}

TEST_F(ClassTableTest, ClassFactoryIsCachedAndUnknownClassesAreNotAvailable) {
    CComPtr<IClassFactory> first, second;
    ASSERT_EQ(DllGetClassObject(CLSID_PatternLine, IClassFactory::iid, reinterpret_cast<void**>(&first)),
              S_OK);
    ASSERT_EQ(DllGetClassObject(CLSID_PatternLine, IClassFactory::iid, reinterpret_cast<void**>(&second)),
              S_OK);
    EXPECT_EQ(first.Get(), second.Get());
    CComPtr<IClassFactory> none;
    EXPECT_EQ(DllGetClassObject(CLSID_PatternPointList, IClassFactory::iid, reinterpret_cast<void**>(&none)),
              CLASS_E_CLASSNOTAVAILABLE); // a sibling component's class, not this module's
}

TEST_F(ClassTableTest, ModuleCanUnloadOnlyWhenNoObjectIsAlive) {
    ASSERT_EQ(DllCanUnloadNow(), S_OK);
    CComPtr<IClassFactory> factory;
    ASSERT_EQ(DllGetClassObject(CLSID_PatternLine, IClassFactory::iid, reinterpret_cast<void**>(&factory)),
              S_OK);
    EXPECT_EQ(DllCanUnloadNow(), S_OK); // a held factory does not keep the module
    CComPtr<IPatternLine> line;
    ASSERT_EQ(factory->CreateInstance(nullptr, IPatternLine::iid, reinterpret_cast<void**>(&line)), S_OK);
    EXPECT_EQ(DllCanUnloadNow(), S_FALSE);
    line.Release();
    EXPECT_EQ(DllCanUnloadNow(), S_OK);
}

TEST_F(ClassTableTest, AggregationAsksForIUnknownOnly) {
    for (const ClassEntry& entry : BeamweaverClassTable()) {
        CComPtr<IUnknown> outer;
        ASSERT_EQ(CoCreateInstance(entry.clsid, nullptr, CLSCTX_ALL, IUnknown::iid,
                                   reinterpret_cast<void**>(&outer)),
                  S_OK);
        CComPtr<IDispatch> inner;
        EXPECT_EQ(CoCreateInstance(entry.clsid, outer, CLSCTX_ALL, IDispatch::iid,
                                   reinterpret_cast<void**>(&inner)),
                  CLASS_E_NOAGGREGATION)
            << entry.name;
    }
}

} // namespace
