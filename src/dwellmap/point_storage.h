// The contiguous memory of one point list.
//
// Records that the count takes in read as zero. A fresh allocation comes zeroed from calloc (pages the
// system hands out are zero already, so sizing tens of millions of points costs no extra pass); when a
// list grows past its allocation the memory is reallocated and only the new tail is cleared; shrinking
// keeps the memory. While a range is pinned (a point buffer is alive) the records never move: a growth
// that would move them is refused.
#pragma once

#include <beamweaver/dwellmap.h>

#include <atomic>
#include <cstdint>

namespace Norvane::Dwellmap {

class PointStorage {
  public:
    PointStorage() = default;
    ~PointStorage();
    PointStorage(const PointStorage&) = delete;
    PointStorage& operator=(const PointStorage&) = delete;

    std::uint32_t Count() const { return count_; }
    PatternPoint* Data() const { return data_; }

    // Sets the count. Throws std::bad_alloc when memory runs out and std::logic_error when the records
    // would have to move while pinned; either way the storage stays as it was.
    void Resize(std::uint32_t count);

    // Pins are counted atomically: a buffer may be released on another thread than the list's.
    void Pin() { pins_.fetch_add(1, std::memory_order_relaxed); }
    void Unpin() { pins_.fetch_sub(1, std::memory_order_relaxed); }

  private:
    void AllocateZeroed(std::uint32_t count);
    void Reallocate(std::uint32_t count);
    void RefuseMoveWhilePinned() const;
    void ClearRecords(std::uint32_t first, std::uint32_t last);

    PatternPoint* data_ = nullptr;
    std::uint32_t count_ = 0;
    std::uint32_t capacity_ = 0;
    std::atomic<std::uint32_t> pins_{0};
};

} // namespace Norvane::Dwellmap
