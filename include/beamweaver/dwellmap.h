// The point-list component: the scan point record, point lists, sub patterns and sub-pattern collections
// that every rendering writes into, and the enumerations of scan definitions.
#pragma once

#include "platform/member_description.h"

#include <beamweaver/comtypes.h>
#include <beamweaver/identifiers.h>

#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>

// One scan point as the scan device plays it: 8 bytes, every field little-endian.
//
//   byte   0     1     2     3     4     5     6       7
//        +-----------+-----------+-----------+-------+----------+
//        |     x     |     y     |   dwell   | flags | reserved |
//        +-----------+-----------+-----------+-------+----------+
//
// x and y are DAC positions, dwell counts ticks of the collection's DwellTimeResolution, flags holds the
// PointFlag_ bits and reserved is always 0.
struct PatternPoint {
    std::uint16_t x;
    std::uint16_t y;
    std::uint16_t dwell;
    std::uint8_t flags;
    std::uint8_t reserved;

    friend constexpr bool operator==(const PatternPoint&, const PatternPoint&) = default;
};

static_assert(sizeof(PatternPoint) == 8 && alignof(PatternPoint) == 2, "the point record is 8 packed bytes");
static_assert(offsetof(PatternPoint, y) == 2 && offsetof(PatternPoint, dwell) == 4 &&
                  offsetof(PatternPoint, flags) == 6 && offsetof(PatternPoint, reserved) == 7,
              "point record fields are in scan-device order");
static_assert(std::endian::native == std::endian::little, "point records are little-endian in memory");

// Point flags.
inline constexpr std::uint8_t PointFlag_Acquire = 0x01; // a pixel is acquired at this point
inline constexpr std::uint8_t PointFlag_Blank = 0x02;   // the beam is blanked
inline constexpr std::uint8_t PointFlag_Sync = 0x80;    // first point of a synchronized line or frame

// A whole point record, composed as one 64-bit value.
constexpr PatternPoint MakePoint(std::uint16_t x, std::uint16_t y, std::uint16_t dwell, std::uint8_t flags) {
    return std::bit_cast<PatternPoint>(std::uint64_t{x} | std::uint64_t{y} << 16 |
                                       std::uint64_t{dwell} << 32 | std::uint64_t{flags} << 48);
}

// Writes a whole record with one 8-byte store. Generators fill lists of millions of points this way:
// assigning the fields one by one, or even the 2-byte-aligned record as a whole, lets the compiler split
// the write into several narrow stores per point.
inline void StorePoint(PatternPoint* at, PatternPoint point) {
    std::memcpy(at, &point, sizeof point);
}

// What the scan device synchronizes a raster's lines or frames to.
enum ScanSynchronizationSource : std::int32_t {
    ScanSynchronizationSource_None = 0,
    ScanSynchronizationSource_MainsLock = 1, // the mains frequency
    ScanSynchronizationSource_External = 2,  // an external trigger input
};

enum ScanDirection : std::int32_t {
    ScanDirection_Forward = 0, // from the low to the high coordinate
    ScanDirection_Reverse = 1,
};

// Which axis a line runs along: horizontal lines are stepped in Y, vertical lines in X.
enum ScanOrientation : std::int32_t {
    ScanOrientation_Horizontal = 0,
    ScanOrientation_Vertical = 1,
};

// Raster: every line runs in the line direction; serpentine: consecutive lines alternate.
enum ScanType : std::int32_t {
    ScanType_Raster = 0,
    ScanType_Serpentine = 1,
};

// Direct access to the contiguous records of a point list. Not automation-compatible: it hands out
// memory. Every range it gives stays valid, and is the list's own storage, until the buffer is released.
struct IPatternPointBuffer : IUnknown {
    using BaseInterface = IUnknown;
    static constexpr IID iid = IID_IPatternPointBuffer;

    // The records with indices first to last - 1: begin addresses record first, end one past record
    // last - 1. E_INVALIDARG when first > last or last is beyond the list's count.
    virtual HRESULT GetRange(std::uint32_t first, std::uint32_t last, PatternPoint** begin,
                             PatternPoint** end) = 0;

  protected:
    ~IPatternPointBuffer() = default;
};

// A list of point records. SetCount gives the list that many records; records it adds are all zero.
// A count above 2147483647 (what GetCount can report) is refused with E_INVALIDARG.
#define IPatternPointList_MEMBERS(X)                                                                         \
    X(METHOD, GetCount, (std::int32_t * count))                                                              \
    X(METHOD, SetCount, (std::uint32_t count))                                                               \
    X(METHOD, GetPointBuffer, (IPatternPointBuffer * *buffer))
BW_INTERFACE(IPatternPointList, IDispatch, IPatternPointList_MEMBERS);

// Shortens a list in place: the first count records stay as written. A count above the current
// count is refused with E_INVALIDARG.
#define IPatternPointListCount_MEMBERS(X) X(METHOD, SetPointCount, (std::uint32_t count))
BW_INTERFACE(IPatternPointListCount, IUnknown, IPatternPointListCount_MEMBERS);

// One entry of a collection: a point list placed at a DAC offset and played RepeatCount times.
#define ISubPattern_MEMBERS(X)                                                                               \
    X(GET, IPatternPointList*, PointList)                                                                    \
    X(GET, std::int32_t, Value)                                                                              \
    X(GET, std::uint16_t, OffsetX)                                                                           \
    X(GET, std::uint16_t, OffsetY)                                                                           \
    X(GET, std::uint32_t, RepeatCount)
BW_INTERFACE(ISubPattern, IDispatch, ISubPattern_MEMBERS);

// Sub patterns in playing order (Item 0 to Count - 1) and the values shared by all of them.
// MinimumDwellTicks and MaximumDwellTicks span the dwell of every point of every sub pattern, both 0
// when there is no point; TotalPointCount sums the counts of the sub patterns' lists.
#define ISubPatternCollection_MEMBERS(X)                                                                     \
    X(METHOD, Item, (std::int32_t index, ISubPattern * *item))                                               \
    X(GET, std::int32_t, Count)                                                                              \
    X(METHOD, Add,                                                                                           \
      (IPatternPointList * pointList, std::int32_t value, std::uint16_t offsetX, std::uint16_t offsetY,      \
       std::uint32_t repeatCount))                                                                           \
    X(PROP, double, DwellTimeResolution)                                                                     \
    X(GET, std::uint16_t, MinimumDwellTicks)                                                                 \
    X(GET, std::uint16_t, MaximumDwellTicks)                                                                 \
    X(GET, std::uint32_t, TotalPointCount)                                                                   \
    X(PROP, IRectangleInt*, FieldOfView)
BW_INTERFACE(ISubPatternCollection, IDispatch, ISubPatternCollection_MEMBERS);
