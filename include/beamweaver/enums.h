// Enumerations of the library's interfaces. Values outside an enumeration may still reach a setter;
// each property says whether it stores, refuses or renders them.
#pragma once

#include <cstdint>

enum GenerationStrategy : std::int32_t {
    GenerationStrategy_UseAlignments = 0,
    GenerationStrategy_DoNotUseAlignments = 1,
};

enum MultiPass : std::int32_t {
    MultiPass_None = 0,
    MultiPass_OneOrientation = 1,
    MultiPass_AllOrientations = 2,
};

enum FillStyle : std::int32_t {
    FillStyle_Solid = 0,
    FillStyle_Frame = 1,
};

enum CircleScanType : std::int32_t {
    CircleScanType_InnerToOuter = 0,
    CircleScanType_OuterToInner = 1,
};
