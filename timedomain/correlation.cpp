// 1-D correlation kernels and their normalizations.
#include <algorithm>

#include "frame/cx_ops.h"
#include "frame/workspace.h"
#include "timedomain/convolution.h"
#include "transforms/kwfft.h"
#include "transforms/plan_ref.h"

namespace tsm {
namespace {

inline f64 Divide(f64 v, f64 d) { return v / d; }
inline cx Divide(cx v, f64 d) { return cx{v.re / d, v.im / d}; }

// Unbiased: each lag over the number of products that formed it; biased:
// all lags over the longer length.
template <class T>
ErrorCode Normalize(T* r, int32 n, int32 m, int32 normalization) {
  const int32 s = std::min(n, m), L = std::max(n, m);
  switch (normalization) {
    case kNormalizeNone:
      return TSM_SUCCESS;
    case kNormalizeUnbiased:
      for (int32 i = 0; i <= s - 2; ++i) r[i] = Divide(r[i], i + 1.0);
      for (int32 i = s - 1; i <= L - 1; ++i) r[i] = Divide(r[i], s);
      for (int32 i = 0; i <= s - 2; ++i) r[L + i] = Divide(r[L + i], s - 1.0 - i);
      return TSM_SUCCESS;
    case kNormalizeBiased:
      for (int32 i = 0; i < n + m - 1; ++i) r[i] = Divide(r[i], L);
      return TSM_SUCCESS;
    default:
      return TSM_ERR_BAD_SELECTOR;
  }
}

// The power spectrum of one transform; the circular result is unrolled so
// that lag 0 lands at out[n-1].
ErrorCode AutoCorrelateFft(const f64* x, int32 n, f64* out) {
  const int32 L = kwfft_next_smooth_length(2 * n - 1);
  if (L == 0) return TSM_ERR_NO_MEMORY;
  Scratch<f64> s;
  if (s.Allocate(2 * static_cast<std::int64_t>(L)) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  f64* first = s.get();
  f64* second = first + L;
  std::copy(x, x + n, first);
  std::fill(first + n, second, 0.0);
  const PlanRef plan(L);
  if (plan.get() == nullptr) return TSM_ERR_NO_MEMORY;
  ErrorCode e = kwfft_real(plan.get(), first, second, 1, 1, L);
  if (e != TSM_SUCCESS) return e;
  ConjProductMultiply(second, second, first, L);
  if ((e = kwfft_real_inverse(plan.get(), first, second, 1, 1, L)) != TSM_SUCCESS) return e;
  std::copy(second, second + n, out + (n - 1));
  std::copy(second + (L - n + 1), second + L, out);
  return TSM_SUCCESS;
}

}  // namespace

ErrorCode Correlate(const f64* x, int32 n, const f64* y, int32 m, int32 algorithm, f64* out, int32 normalization) {
  ErrorCode e = TSM_SUCCESS;
  if (algorithm == kConvolveDirect) {
    std::fill(out, out + (n + m - 1), 0.0);
    for (int32 j = 0; j < m; ++j) {
      const f64 w = y[j];
      f64* o = out + j;
      for (int32 i = 0; i < n; ++i) o[i] += w * x[n - 1 - i];
    }
  } else if (algorithm == kConvolveFft) {
    e = x == y ? AutoCorrelateFft(x, n, out) : ConvolveByFft(x, n, true, y, m, out);
  }
  if (e != TSM_SUCCESS) return e;
  return Normalize(out, n, m, normalization);
}

ErrorCode CxCorrelate(const cx* x, int32 n, const cx* y, int32 m, cx* out, int32 algorithm, int32 normalization) {
  if (n < 1 || m < 1) return TSM_ERR_EMPTY;
  Scratch<cx> rev;
  if (rev.Allocate(n) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  for (int32 i = 0; i < n; ++i) rev[i] = Conj(x[n - 1 - i]);
  const ErrorCode e = CxConvolve(rev.get(), n, y, m, out, algorithm);
  if (e != TSM_SUCCESS) return e;
  return Normalize(out, n, m, normalization);
}

}  // namespace tsm
