#include "platform/module_lock.h"

#include <atomic>

namespace {
std::atomic<LONG> g_lockCount{0};
}

void ModuleLockIncrement() {
    g_lockCount.fetch_add(1, std::memory_order_relaxed);
}
void ModuleLockDecrement() {
    g_lockCount.fetch_sub(1, std::memory_order_acq_rel);
}
LONG ModuleLockCount() {
    return g_lockCount.load(std::memory_order_acquire);
}
