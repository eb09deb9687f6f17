#include "dwellmap/point_storage.h"

#include <cstdlib>
#include <cstring>
#include <new>
#include <stdexcept>

namespace Norvane::Dwellmap {

PointStorage::~PointStorage() {
    std::free(data_);
}

void PointStorage::Resize(std::uint32_t count) {
    if (count > capacity_) {
        RefuseMoveWhilePinned();
        if (count_ == 0) {
            AllocateZeroed(count);
        } else {
            Reallocate(count);
            ClearRecords(count_, count);
        }
    } else if (count > count_) {
        ClearRecords(count_, count);
    }
    count_ = count;
}

// Nothing to keep: a new zeroed block replaces the old one instead of copying it.
void PointStorage::AllocateZeroed(std::uint32_t count) {
    void* fresh = std::calloc(count, sizeof(PatternPoint));
    if (fresh == nullptr)
        throw std::bad_alloc();
    std::free(data_);
    data_ = static_cast<PatternPoint*>(fresh);
    capacity_ = count;
}

void PointStorage::Reallocate(std::uint32_t count) {
    void* moved = std::realloc(data_, std::size_t{count} * sizeof(PatternPoint));
    if (moved == nullptr)
        throw std::bad_alloc();
    data_ = static_cast<PatternPoint*>(moved);
    capacity_ = count;
}

void PointStorage::RefuseMoveWhilePinned() const {
    if (pins_.load(std::memory_order_relaxed) != 0)
        throw std::logic_error("SetCount cannot grow the point list beyond its memory while a point buffer "
                               "is in use; release the buffer first");
}

void PointStorage::ClearRecords(std::uint32_t first, std::uint32_t last) {
    std::memset(data_ + first, 0, std::size_t{last - first} * sizeof(PatternPoint));
}

} // namespace Norvane::Dwellmap
