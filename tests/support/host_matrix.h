// A 2-D host array made by the reference host: int32 rows, int32 cols, then
// the row-major elements at offset 8, read through memcpy.
#pragma once

#include <cstring>
#include <vector>

#include "tsmath/tsmath.h"
#include "tsrt.h"

namespace tsmtest {

template <class Block, class E, int32_t Type>
class HostMatrix {
 public:
  using Elem = E;
  HostMatrix() : HostMatrix(0, 0, {}) {}
  HostMatrix(int32_t rows, int32_t cols, const std::vector<E>& v) {
    h_ = static_cast<Block**>(tsrt_new_matrix(Type, rows, cols, v.empty() ? nullptr : v.data()));
    SetDims(rows, cols);
  }
  HostMatrix(const HostMatrix&) = delete;
  HostMatrix& operator=(const HostMatrix&) = delete;
  ~HostMatrix() { tsrt_dispose(h_); }
  Block** Handle() const { return h_; }
  int32_t Dim(int d) const {
    int32_t v;
    std::memcpy(&v, reinterpret_cast<const char*>(*h_) + 4 * d, 4);
    return v;
  }
  int32_t Rows() const { return Dim(0); }
  int32_t Cols() const { return Dim(1); }
  void SetDims(int32_t rows, int32_t cols) {
    std::memcpy(*h_, &rows, 4);
    std::memcpy(reinterpret_cast<char*>(*h_) + 4, &cols, 4);
  }
  std::vector<E> Values() const {
    const long n = static_cast<long>(Rows()) * Cols();
    std::vector<E> v(n > 0 ? n : 0);
    if (!v.empty()) std::memcpy(v.data(), reinterpret_cast<const char*>(*h_) + 8, v.size() * sizeof(E));
    return v;
  }

 private:
  Block** h_ = nullptr;
};

using Mat = HostMatrix<Matrix, double, TSM_TYPE_F64>;
using CxMat = HostMatrix<CxMatrix, cx, TSM_TYPE_CX128>;

}  // namespace tsmtest
