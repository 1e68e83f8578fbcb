// Shared pieces of the window kernels: how a window value scales a sample of
// either kind (a complex sample has both parts scaled by the real window),
// and the front scratch they build windows in. Samples in host blocks are only
// 4-byte aligned; nothing here assumes more.
#pragma once

#include "frame/types.h"
#include "frame/workspace.h"

namespace tsm {

inline void ScaleSample(f64& v, f64 w) { v *= w; }
inline void ScaleSample(cx& v, f64 w) {
  v.re *= w;
  v.im *= w;
}
inline void ClearSample(f64& v) { v = 0.0; }
inline void ClearSample(cx& v) { v = cx{0.0, 0.0}; }

// x[i] *= w[i] for i < n.
template <class T>
void MultiplyByWindow(T* x, const f64* w, int32 n) {
  for (int32 i = 0; i < n; ++i) ScaleSample(x[i], w[i]);
}

// A window that is symmetric about n/2 (w[i] = w[n-i]): value(i) for i up to
// n/2 into front scratch, mirrored, then multiplied into x. n of 1 leaves x
// alone.
template <class T, class Value>
ErrorCode ApplyHalfMirroredWindow(T* x, int32 n, Value value) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) return TSM_SUCCESS;
  Scratch<f64> w;
  if (w.Allocate(n) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  for (int32 i = 0; i <= n / 2; ++i) w[i] = value(i);
  for (int32 i = 1; i <= (n - 1) / 2; ++i) w[n - i] = w[i];
  MultiplyByWindow(x, w.get(), n);
  return TSM_SUCCESS;
}

}  // namespace tsm
