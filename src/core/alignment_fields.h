// The stored form of one alignment inside a value object: one lock-free field per value of the record.
// The alignment objects keep one of these, the rendering-properties objects one per axis, so that an
// alignment is held by value everywhere and never as a reference to another object.
#pragma once

#include "core/rendering_settings.h"
#include "core/value_field.h"

namespace Norvane::Lumis::Scanning {

struct PatternAlignmentFields {
    using Record = PatternAlignment;

    explicit PatternAlignmentFields(const Record& value) : range(value.range), slewRate(value.slewRate) {}

    Record Load() const { return {range.Load(), slewRate.Load()}; }
    void Store(const Record& value) {
        range.Store(value.range);
        slewRate.Store(value.slewRate);
    }

    ValueField<RangeInt> range;
    ValueField<double> slewRate;
};

struct RasterAlignmentFields {
    using Record = RasterAlignment;

    explicit RasterAlignmentFields(const Record& value)
        : range(value.range), slewRate(value.slewRate), scanSync(value.scanSync), preScan(value.preScan),
          acquisitionWaitTime(value.acquisitionWaitTime), acquisitionDelay(value.acquisitionDelay),
          preFlyback(value.preFlyback) {}

    Record Load() const {
        return {range.Load(),
                slewRate.Load(),
                scanSync.Load(),
                preScan.Load(),
                acquisitionWaitTime.Load(),
                acquisitionDelay.Load(),
                preFlyback.Load()};
    }
    void Store(const Record& value) {
        range.Store(value.range);
        slewRate.Store(value.slewRate);
        scanSync.Store(value.scanSync);
        preScan.Store(value.preScan);
        acquisitionWaitTime.Store(value.acquisitionWaitTime);
        acquisitionDelay.Store(value.acquisitionDelay);
        preFlyback.Store(value.preFlyback);
    }

    ValueField<RangeInt> range;
    ValueField<double> slewRate;
    ValueField<double> scanSync;
    ValueField<double> preScan;
    ValueField<double> acquisitionWaitTime;
    ValueField<double> acquisitionDelay;
    ValueField<double> preFlyback;
};

} // namespace Norvane::Lumis::Scanning
