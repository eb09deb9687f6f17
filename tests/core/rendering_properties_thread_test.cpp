#include "comtypes/comtypes_registration.h"
#include "core/rendering_conversions.h"
#include "module/geometry_io.h"

#include <gtest/gtest.h>

#include <thread>

namespace {

using namespace Norvane::Lumis;
using namespace Norvane::Lumis::Scanning;

// One thread switches a shared alignment between two ranges and slew rates while another reads it:
// without a lock every read must still see one of the two ranges whole, never the minimum of one and
// the maximum of the other.
TEST(RenderingPropertiesThreads, ConcurrentPutsAndGetsNeverTearARange) {
    RegisterComTypesClasses();
    constexpr int kRounds = 300;
    const RangeInt first{0, 10};
    const RangeInt second{20, 30};
    auto alignments = MakePatternAlignments({first, 1.0});
    auto firstRange = CreateRange(first);
    auto secondRange = CreateRange(second);

    std::thread writer([&] {
        for (int i = 0; i < kRounds; ++i) {
            EXPECT_EQ(alignments->put_Range(i % 2 == 0 ? secondRange : firstRange), S_OK);
            EXPECT_EQ(alignments->put_SlewRate(i % 2 == 0 ? 2.0 : 1.0), S_OK);
        }
    });
    for (int i = 0; i < kRounds; ++i) {
        const PatternAlignment read = ReadPatternAlignments(alignments, "PatternAlignments");
        EXPECT_TRUE(read.range == first || read.range == second);
        EXPECT_TRUE(read.slewRate == 1.0 || read.slewRate == 2.0);
    }
    writer.join();
}

} // namespace
