#include "module/method_guard.h"

#include <beamweaver/identifiers.h>

#include <gtest/gtest.h>

#include <stdexcept>
#include <thread>

namespace Norvane {
namespace {

bool OtherThreadCanLock(ObjectMutex& mutex) {
    bool locked = false;
    std::thread([&] {
        locked = mutex.try_lock();
        if (locked)
            mutex.unlock();
    }).join();
    return locked;
}

TEST(GuardedThreads, LockIsHeldForTheWholeBody) {
    ObjectMutex mutex;
    int out = 0;
    bool lockedFromOutside = true;
    EXPECT_EQ(Guarded(IID_IPattern, mutex, &out, [&] { lockedFromOutside = OtherThreadCanLock(mutex); }),
              S_OK);
    EXPECT_FALSE(lockedFromOutside);
    EXPECT_TRUE(OtherThreadCanLock(mutex));
}

TEST(GuardedThreads, LockIsReleasedWhenTheBodyThrows) {
    ObjectMutex mutex;
    EXPECT_EQ(Guarded(IID_IPattern, mutex, []() -> HRESULT { throw std::out_of_range("index"); }),
              E_INVALIDARG);
    EXPECT_TRUE(OtherThreadCanLock(mutex));
}

} // namespace
} // namespace Norvane
