#include "comtypes/transformation_matrix_2d.h"

namespace Norvane::ComTypes {

HRESULT CTransformationMatrix2D::get_M0(double* value) {
    return m0_.Get(IID_ITransformationMatrix2D, value);
}

HRESULT CTransformationMatrix2D::put_M0(double value) {
    return m0_.Put(value);
}

HRESULT CTransformationMatrix2D::get_M1(double* value) {
    return m1_.Get(IID_ITransformationMatrix2D, value);
}

HRESULT CTransformationMatrix2D::put_M1(double value) {
    return m1_.Put(value);
}

HRESULT CTransformationMatrix2D::get_M2(double* value) {
    return m2_.Get(IID_ITransformationMatrix2D, value);
}

HRESULT CTransformationMatrix2D::put_M2(double value) {
    return m2_.Put(value);
}

HRESULT CTransformationMatrix2D::get_M3(double* value) {
    return m3_.Get(IID_ITransformationMatrix2D, value);
}

HRESULT CTransformationMatrix2D::put_M3(double value) {
    return m3_.Put(value);
}

HRESULT CTransformationMatrix2D::get_M4(double* value) {
    return m4_.Get(IID_ITransformationMatrix2D, value);
}

HRESULT CTransformationMatrix2D::put_M4(double value) {
    return m4_.Put(value);
}

HRESULT CTransformationMatrix2D::get_M5(double* value) {
    return m5_.Get(IID_ITransformationMatrix2D, value);
}

HRESULT CTransformationMatrix2D::put_M5(double value) {
    return m5_.Put(value);
}

} // namespace Norvane::ComTypes
