// 1-D convolution kernels and the HalfComplex product they share with
// correlation.
#include <algorithm>
#include <cstring>

#include "frame/cx_ops.h"
#include "frame/workspace.h"
#include "timedomain/convolution.h"
#include "transforms/kwfft.h"
#include "transforms/plan_ref.h"

namespace tsm {

void ConjProductMultiply(const f64* A, const f64* B, f64* C, int32 n) {
  const bool power = &A[1] == &B[1];
  C[0] = A[0] * B[0];
  for (int32 k = 1; k <= (n - 1) / 2; ++k) {
    const f64 a = A[k], b = A[n - k], c = B[k], d = B[n - k];
    if (power) {
      C[k] = b * d + a * c;
      C[n - k] = 0.0;
    } else {
      C[k] = a * c - b * d;
      C[n - k] = a * d + b * c;
    }
  }
  if (n % 2 == 0) C[n / 2] = A[n / 2] * B[n / 2];
}

namespace {

// Transform length of a 1-D FFT convolution: the next length the codelets
// serve; 0 when none fits in int32.
int32 SmoothLength(int32 n, int32 m) {
  const std::int64_t full = static_cast<std::int64_t>(n) + m - 1;
  return full > 0x7FFFFFFF ? 0 : kwfft_next_smooth_length(static_cast<int32>(full));
}

}  // namespace

ErrorCode ConvolveByFft(const f64* x, int32 n, bool reverseX, const f64* y, int32 m, f64* out) {
  const int32 L = SmoothLength(n, m);
  if (L == 0) return TSM_ERR_NO_MEMORY;
  Scratch<f64> s;
  if (s.Allocate(3 * static_cast<std::int64_t>(L)) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  f64* first = s.get();
  f64* second = first + L;
  f64* third = second + L;
  std::fill(first, third, 0.0);
  if (reverseX)
    std::reverse_copy(x, x + n, first);
  else
    std::copy(x, x + n, first);
  std::copy(y, y + m, second);
  const PlanRef plan(L);
  if (plan.get() == nullptr) return TSM_ERR_NO_MEMORY;
  ErrorCode e = kwfft_real(plan.get(), first, third, 1, 1, L);
  if (e == TSM_SUCCESS) e = kwfft_real(plan.get(), second, first, 1, 1, L);
  if (e != TSM_SUCCESS) return e;
  ConjProductMultiply(third, first, second, L);
  if ((e = kwfft_real_inverse(plan.get(), second, first, 1, 1, L)) != TSM_SUCCESS) return e;
  std::copy(first, first + (n + m - 1), out);
  return TSM_SUCCESS;
}

namespace {

// Each output value is one inner product of the reversed shorter operand
// with the part of the longer one under it.
ErrorCode CxConvolveDirect(const cx* x, int32 n, const cx* y, int32 m, cx* out) {
  const bool ySmaller = m <= n;
  const cx* s = ySmaller ? y : x;
  const cx* l = ySmaller ? x : y;
  const int32 ns = ySmaller ? m : n, nl = ySmaller ? n : m;
  Scratch<cx> rev;
  if (rev.Allocate(ns) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  std::reverse_copy(s, s + ns, rev.get());
  // out[k] = sum_j rev[j] l[k - ns + 1 + j] over the j that stay in l.
  for (int32 k = 0; k < n + m - 1; ++k) {
    const int32 j0 = std::max(0, ns - 1 - k), j1 = std::min(ns, nl + ns - 1 - k);
    const int32 shift = k - ns + 1;
    cx acc{0.0, 0.0};
    for (int32 j = j0; j < j1; ++j) acc += rev[j] * l[shift + j];
    out[k] = acc;
  }
  return TSM_SUCCESS;
}

ErrorCode CxConvolveFft(const cx* x, int32 n, const cx* y, int32 m, cx* out) {
  const int32 L = SmoothLength(n, m);
  if (L == 0) return TSM_ERR_NO_MEMORY;
  Scratch<cx> s;
  if (s.Allocate(3 * static_cast<std::int64_t>(L)) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  cx* first = s.get();
  cx* second = first + L;
  cx* third = second + L;
  std::fill(first, third + L, cx{0.0, 0.0});
  std::copy(x, x + n, second);
  std::copy(y, y + m, third);
  const PlanRef plan(L);
  if (plan.get() == nullptr) return TSM_ERR_NO_MEMORY;
  ErrorCode e = kwfft_complex(plan.get(), &second->re, &second->im, &first->re, &first->im, 2, 2, L);
  if (e == TSM_SUCCESS) e = kwfft_complex(plan.get(), &third->re, &third->im, &second->re, &second->im, 2, 2, L);
  if (e != TSM_SUCCESS) return e;
  for (int32 k = 0; k < L; ++k) third[k] = first[k] * second[k];
  e = kwfft_complex_inverse(plan.get(), &third->re, &third->im, &first->re, &first->im, 2, 2, L);
  if (e != TSM_SUCCESS) return e;
  std::copy(first, first + (n + m - 1), out);
  return TSM_SUCCESS;
}

}  // namespace

ErrorCode Convolve(const f64* x, int32 n, const f64* y, int32 m, int32 algorithm, f64* out) {
  if (algorithm == kConvolveDirect) {
    std::fill(out, out + (n + m - 1), 0.0);
    for (int32 i = 0; i < n; ++i) {
      const f64 w = x[i];
      f64* o = out + i;
      for (int32 j = 0; j < m; ++j) o[j] += w * y[j];
    }
    return TSM_SUCCESS;
  }
  if (algorithm == kConvolveFft) return ConvolveByFft(x, n, false, y, m, out);
  return TSM_SUCCESS;
}

ErrorCode CxConvolve(const cx* x, int32 n, const cx* y, int32 m, cx* out, int32 algorithm) {
  if (n < 1 || m < 1) return TSM_ERR_EMPTY;
  if (algorithm == kConvolveDirect) return CxConvolveDirect(x, n, y, m, out);
  if (algorithm == kConvolveFft) return CxConvolveFft(x, n, y, m, out);
  return TSM_ERR_BAD_SELECTOR;
}

}  // namespace tsm
