#include "comtypes/comtypes_registration.h"
#include "module/geometry_io.h"
#include "module/rectangle_int_impl.h"
#include "module/size_int.h"

#include <gtest/gtest.h>

#include <thread>

namespace {

using namespace Norvane::Lumis;

constexpr int kRounds = 2000;

// One thread writes every value of 1..kRounds while another reads; each read must see a value that was
// written (or the initial 0), never a torn or made-up one. The sanitizer build checks for data races.
template <class Put, class Get> void WriteWhileReading(Put put, Get get) {
    std::thread writer([&] {
        for (int i = 1; i <= kRounds; ++i)
            put(i);
    });
    bool allSeenValuesWritten = true;
    for (int i = 0; i < kRounds; ++i) {
        const double seen = get();
        allSeenValuesWritten = allSeenValuesWritten && seen >= 0 && seen <= kRounds;
    }
    writer.join();
    EXPECT_TRUE(allSeenValuesWritten);
    EXPECT_EQ(get(), kRounds);
}

TEST(ValueObjectThreadTest, SizeIntFieldsAreGuarded) {
    auto size = Common::CreateSizeInt({});
    WriteWhileReading([&](int v) { size->put_Width(v); },
                      [&] {
                          std::int32_t width = -1;
                          size->get_Width(&width);
                          return static_cast<double>(width);
                      });
}

TEST(ValueObjectThreadTest, RectangleIntImplFieldsAreGuarded) {
    auto rectangle = Common::CreateRectangleIntImpl({});
    WriteWhileReading([&](int v) { rectangle->put_Bottom(v); },
                      [&] {
                          std::int32_t bottom = -1;
                          rectangle->get_Bottom(&bottom);
                          return static_cast<double>(bottom);
                      });
}

TEST(ValueObjectThreadTest, CreatedValueObjectsNeedNoLock) {
    RegisterComTypesClasses();
    auto coordinate = CreateCoordinate({});
    WriteWhileReading([&](int v) { coordinate->put_X(v); },
                      [&] {
                          double x = -1.0;
                          coordinate->get_X(&x);
                          return x;
                      });
}

} // namespace
