// The common part of every exclusion shape: transformation matrix, DAC ranges, Clone and CopyTo, and
// the point filter that removes the points the shape contains.
//
// A concrete shape derives from ShapeImpl<IShapeX>, declares its interface map
// (InterfaceMap<IShapeX, IPatternPointFilter, ISupportErrorInfo>), and supplies its own properties,
// Contains and CopyShapeTo. Its own fields are guarded by a lock of its own, separate from the one here.
#pragma once

#include "composition/point_filter.h"
#include "module/create_instance.h"
#include "module/geometry_io.h"
#include "module/method_guard.h"
#include "platform/dispatch_impl.h"
#include "platform/error_info.h"
#include "platform/object.h"

#include <beamweaver/exclusion.h>
#include <beamweaver/pattern.h>

#include <boost/thread/lock_guard.hpp>

#include <cstdint>
#include <functional>
#include <stdexcept>

namespace Norvane::Lumis::Scanning {

// The fields every shape shares: the matrix maps shape coordinates to field coordinates, the DAC
// ranges turn a DAC point into a relative position.
struct ShapeFrame {
    TransformationMatrix matrix;
    RangeInt dacRangeX{0, 65535};
    RangeInt dacRangeY{0, 65535};
};

// Reads a range given to a DACRange property; null gives "The range object is null".
RangeInt ReadRangeProperty(IRangeInt* value);
// A DACRange getter's out pointer; null gives "The output range object is null".
void RequireRangeOutput(IRangeInt** value);
// Clone's out pointer; null gives "ppIShape object is null".
void RequireCloneOutput(IShape** clone);
// CopyTo's target; null gives "pIShape object is null".
void RequireCopyTarget(IShape* target);
// Puts the matrix and both ranges on target through its properties.
void PutShapeFrame(const ShapeFrame& frame, IShape* target);

// The target's interface S for the class part of CopyTo; a target of another kind throws
// std::invalid_argument with failure.
template <class S> CComPtr<S> QueryShapeKind(IShape* target, const char* failure) {
    CComPtr<S> shape = QueryAs<S>(target);
    if (!shape)
        throw std::invalid_argument(failure);
    return shape;
}

template <class I>
class ShapeImpl : public CComObjectRootBase,
                  public IDispatchImpl<I>,
                  public IPatternPointFilter,
                  public ISupportErrorInfoImplEx<I, IShape, IPatternPointFilter> {
  public:
    explicit ShapeImpl(const CLSID& clsid) : clsid_(clsid) {}

    // IShape
    HRESULT get_TransformationMatrix(ITransformationMatrix2D** value) override {
        return Guarded(IID_IShape, mutex_, value, [&] { *value = CreateMatrix(frame_.matrix).Detach(); });
    }
    // Any matrix is stored, a singular one too: only a filter pass needs its inverse.
    HRESULT put_TransformationMatrix(ITransformationMatrix2D* value) override {
        return Guarded(IID_IShape, mutex_,
                       [&] { frame_.matrix = ReadMatrixProperty(value, "TransformationMatrix"); });
    }
    HRESULT get_DACRangeX(IRangeInt** value) override { return GetRange(value, &ShapeFrame::dacRangeX); }
    HRESULT put_DACRangeX(IRangeInt* value) override { return PutRange(value, &ShapeFrame::dacRangeX); }
    HRESULT get_DACRangeY(IRangeInt** value) override { return GetRange(value, &ShapeFrame::dacRangeY); }
    HRESULT put_DACRangeY(IRangeInt* value) override { return PutRange(value, &ShapeFrame::dacRangeY); }

    HRESULT Clone(IShape** clone) override {
        return Guarded(IID_IShape, [&] {
            RequireCloneOutput(clone);
            *clone = nullptr;
            CComPtr<IShape> copy = CreateInstance<IShape>(clsid_);
            CopyInto(copy);
            *clone = copy.Detach();
        });
    }
    HRESULT CopyTo(IShape* target) override {
        return Guarded(IID_IShape, [&] {
            RequireCopyTarget(target);
            CopyInto(target);
        });
    }

    // IPatternPointFilter
    HRESULT FilterList(IPatternPointList* list) override { return FilterListWithOffset(list, 0, 0); }
    HRESULT FilterListWithOffset(IPatternPointList* list, std::uint16_t offsetX,
                                 std::uint16_t offsetY) override {
        return Guarded(IID_IPatternPointFilter, mutex_, [&] {
            const std::function<bool(coordinate<double>)> contains = [this](coordinate<double> point) {
                return Contains(point);
            };
            FilterPointList(list, offsetX, offsetY,
                            ShapeView{frame_.matrix, frame_.dacRangeX, frame_.dacRangeY, &contains});
        });
    }

    // Whether a position in the shape's own relative coordinates lies inside the shape. Takes the
    // class's field lock, so it is safe while the shape's properties change on another thread.
    virtual bool Contains(coordinate<double> point) = 0;

  protected:
    // The class part of CopyTo: puts the class's own fields on target through its properties; throws
    // std::invalid_argument when target is not a shape of the same kind.
    virtual void CopyShapeTo(IShape* target) = 0;

  private:
    HRESULT GetRange(IRangeInt** value, RangeInt ShapeFrame::*field) {
        return Guarded(IID_IShape, mutex_, [&] {
            RequireRangeOutput(value);
            *value = CreateRange(frame_.*field).Detach();
        });
    }
    // The two values are stored as given: a range is not required to be ordered or non-empty.
    HRESULT PutRange(IRangeInt* value, RangeInt ShapeFrame::*field) {
        return Guarded(IID_IShape, mutex_, [&] { frame_.*field = ReadRangeProperty(value); });
    }

    // The target is written from copies taken under the locks, with no lock of this shape held while
    // it runs: two shapes copied into each other on two threads cannot wait for each other.
    void CopyInto(IShape* target) {
        PutShapeFrame(Frame(), target);
        CopyShapeTo(target);
    }
    ShapeFrame Frame() {
        boost::lock_guard<ObjectMutex> lock(mutex_);
        return frame_;
    }

    CLSID clsid_;
    ShapeFrame frame_;
    ObjectMutex mutex_;
};

} // namespace Norvane::Lumis::Scanning
