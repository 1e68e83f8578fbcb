// 2-D convolution and correlation. The FFT path transforms at the exact full
// size (no smooth-length step; prime sizes take the Rader pass).
#include <algorithm>
#include <type_traits>

#include "frame/cx_ops.h"
#include "frame/workspace.h"
#include "timedomain/convolution.h"
#include "transforms/fft2d.h"
#include "transforms/plan_ref.h"

namespace tsm {
namespace {

using Index = std::int64_t;

// Full result: the outer loops run over the result, the inner ones over the
// smaller operand, skipping terms that fall outside the larger.
template <class T>
void Convolve2DDirect(const T* x, int32 r1, int32 c1, const T* y, int32 r2, int32 c2, T* out) {
  if (static_cast<Index>(r1) * c1 < static_cast<Index>(r2) * c2) {
    std::swap(x, y);
    std::swap(r1, r2);
    std::swap(c1, c2);
  }
  const int32 R = r1 + r2 - 1, C = c1 + c2 - 1;
  for (int32 i = 0; i < R; ++i)
    for (int32 j = 0; j < C; ++j) {
      T acc{};
      for (int32 k = std::max(0, i - r1 + 1); k < std::min(r2, i + 1); ++k) {
        const T* big = x + static_cast<Index>(i - k) * c1;
        const T* small = y + static_cast<Index>(k) * c2;
        for (int32 l = std::max(0, j - c1 + 1); l < std::min(c2, j + 1); ++l) acc += small[l] * big[j - l];
      }
      out[static_cast<Index>(i) * C + j] = acc;
    }
}

template <class T>
ErrorCode Convolve2DFft(const T* x, int32 r1, int32 c1, const T* y, int32 r2, int32 c2, T* out) {
  const int32 R = r1 + r2 - 1, C = c1 + c2 - 1;
  const Index total = static_cast<Index>(R) * C;
  Scratch<cx> spectra;
  if (spectra.Allocate(2 * total) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  cx* X = spectra.get();
  cx* Y = X + total;
  const PlanRef planRows(R);
  const PlanRef planColsOwn(C == R ? 0 : C);  // one plan serves both when R == C
  const kwfft_table* planCols = C == R ? planRows.get() : planColsOwn.get();
  if (planRows.get() == nullptr || planCols == nullptr) return TSM_ERR_NO_MEMORY;
  const auto forward = [&](const T* a, int32 r, int32 c, cx* A) {
    if constexpr (std::is_same_v<T, f64>)
      return ReFft2D(planCols, planRows.get(), a, r, c, 0, 0, R, C, 0, A);
    else
      return CxFft2D(planCols, planRows.get(), a, r, c, 0, 0, R, C, 0, A);
  };
  ErrorCode e = forward(x, r1, c1, X);
  if (e == TSM_SUCCESS) e = forward(y, r2, c2, Y);
  if (e != TSM_SUCCESS) return e;
  for (Index k = 0; k < total; ++k) X[k] = X[k] * Y[k];
  if constexpr (std::is_same_v<T, f64>)
    return ReInvFft2D(planCols, planRows.get(), X, R, C, 0, out);
  else
    return CxInvFft2D(planCols, planRows.get(), X, R, C, 0, out);
}

template <class T>
ErrorCode Convolve2DAny(const T* x, int32 r1, int32 c1, const T* y, int32 r2, int32 c2, int32 outputSize,
                        int32 algorithm, T* out) {
  if (outputSize == kOutputValid && (r1 < r2 || c1 < c2)) return TSM_ERR_SIZE_PAIR;
  if (algorithm != kConvolveDirect && algorithm != kConvolveFft) return TSM_ERR_BAD_SELECTOR;
  const int32 R = r1 + r2 - 1, C = c1 + c2 - 1;
  Scratch<T> full;
  T* dest = out;
  if (outputSize != kOutputFull) {
    if (full.Allocate(static_cast<Index>(R) * C) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
    dest = full.get();
  }
  if (algorithm == kConvolveDirect) {
    Convolve2DDirect(x, r1, c1, y, r2, c2, dest);
  } else if (const ErrorCode e = Convolve2DFft(x, r1, c1, y, r2, c2, dest); e != TSM_SUCCESS) {
    return e;
  }
  if (outputSize == kOutputFull) return TSM_SUCCESS;
  // Same: r1 x c1 from (r2/2, c2/2). Valid: from (r2-1, c2-1).
  const bool same = outputSize == kOutputSame;
  const int32 top = same ? r2 / 2 : r2 - 1, left = same ? c2 / 2 : c2 - 1;
  const int32 rows = same ? r1 : r1 - r2 + 1, cols = same ? c1 : c1 - c2 + 1;
  for (int32 i = 0; i < rows; ++i) {
    const T* src = dest + static_cast<Index>(top + i) * C + left;
    std::copy(src, src + cols, out + static_cast<Index>(i) * cols);
  }
  return TSM_SUCCESS;
}

inline f64 Conjugate(f64 v) { return v; }
inline cx Conjugate(cx v) { return Conj(v); }

// x read backwards as one block is x turned by half a turn.
template <class T>
ErrorCode Correlate2DAny(const T* x, int32 r1, int32 c1, const T* y, int32 r2, int32 c2, int32 algorithm, T* out) {
  const Index total = static_cast<Index>(r1) * c1;
  Scratch<T> turned;
  if (turned.Allocate(total) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  for (Index k = 0; k < total; ++k) turned[k] = Conjugate(x[total - 1 - k]);
  return Convolve2DAny(turned.get(), r1, c1, y, r2, c2, kOutputFull, algorithm, out);
}

}  // namespace

ErrorCode Convolve2D(const f64* x, int32 r1, int32 c1, const f64* y, int32 r2, int32 c2, int32 outputSize,
                     int32 algorithm, f64* out) {
  return Convolve2DAny(x, r1, c1, y, r2, c2, outputSize, algorithm, out);
}
ErrorCode CxConvolve2D(const cx* x, int32 r1, int32 c1, const cx* y, int32 r2, int32 c2, int32 outputSize,
                       int32 algorithm, cx* out) {
  return Convolve2DAny(x, r1, c1, y, r2, c2, outputSize, algorithm, out);
}
ErrorCode Correlate2D(const f64* x, int32 r1, int32 c1, const f64* y, int32 r2, int32 c2, int32 algorithm, f64* out) {
  return Correlate2DAny(x, r1, c1, y, r2, c2, algorithm, out);
}
ErrorCode CxCorrelate2D(const cx* x, int32 r1, int32 c1, const cx* y, int32 r2, int32 c2, int32 algorithm,
                        cx* out) {
  return Correlate2DAny(x, r1, c1, y, r2, c2, algorithm, out);
}

}  // namespace tsm
