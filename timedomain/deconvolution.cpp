// Deconvolution: spectral division over the next power of two, or, when the
// divisor's spectrum has a (near) zero, recursive division in the time
// domain.
#include <algorithm>
#include <cmath>

#include "frame/workspace.h"
#include "timedomain/convolution.h"
#include "transforms/kwfft.h"
#include "transforms/plan_ref.h"

namespace tsm {
namespace {

constexpr int32 kMaxDeconvolutionLength = 8388608;
constexpr f64 kMaxZeroTolerance = 1e-9;
constexpr f64 kSmallestNormal = 2.2250738585072014e-308;

// The test pairs bin k's real part with h[L/2 + k], not with its imaginary
// part h[L - k]: that is how a spectral zero is defined here.
bool HasSpectralZero(const f64* h, int32 L) {
  const f64 t = std::min(L * kEps, kMaxZeroTolerance);
  for (int32 k = 0; k <= L / 2; ++k) {
    const f64 u = h[k];
    const f64 v = (k == 0 || k == L / 2) ? 0.0 : h[L / 2 + k];
    if (std::fabs(u) < t && std::fabs(v) < t) return true;
  }
  return false;
}

// C = X / Y bin by bin for HalfComplex spectra of length L.
void DivideSpectra(const f64* X, const f64* Y, f64* C, int32 L) {
  C[0] = X[0] / Y[0];
  if (L == 1) return;
  for (int32 k = 1; k < L / 2; ++k) {
    const f64 a = X[k], b = X[L - k], c = Y[k], d = Y[L - k];
    const f64 q = 1.0 / (c * c + d * d);
    C[k] = (d * b + a * c) * q;
    C[L - k] = (c * b - d * a) * q;
  }
  C[L / 2] = X[L / 2] / Y[L / 2];
}

// The direct-form recursion with numerator 1 and denominator y[z ..], run in
// place over x with zero history (values below the smallest normal flushed
// to 0); the quotient starts at index z.
void DivideInTime(f64* x, int32 n, const f64* y, int32 m) {
  int32 z = 0;
  while (z < m && y[z] == 0.0) ++z;
  const int32 count = n - m + 1;
  if (z == m) {  // no denominator: the numerator alone passes x through
    for (int32 i = 0; i < count; ++i) x[i] = m + i < n ? x[m + i] : 0.0;
    return;
  }
  const f64* a = y + z;
  const int32 na = m - z;
  for (int32 i = 0; i < n; ++i) {
    f64 acc = x[i];
    for (int32 k = 1; k < na && k <= i; ++k) acc -= a[k] * x[i - k];
    f64 v = acc / a[0];
    if (!(std::fabs(v) > kSmallestNormal)) v = 0.0;
    x[i] = v;
  }
  std::copy(x + z, x + z + count, x);
}

}  // namespace

ErrorCode Deconvolve(f64* x, int32 n, const f64* y, int32 m) {
  if (m > kMaxDeconvolutionLength || n > kMaxDeconvolutionLength) return TSM_ERR_NEGATIVE_TRANSFORM_SIZE;
  if (n < 1 || m < 1) return TSM_ERR_EMPTY;
  if (n - m + 1 < 1) return TSM_ERR_SIZE_PAIR;
  int32 L = 1;
  while (L < n) L *= 2;
  Scratch<f64> s;
  if (s.Allocate(3 * static_cast<std::int64_t>(L)) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  f64* a = s.get();
  f64* b = a + L;
  f64* h = b + L;
  std::fill(a, h, 0.0);
  std::copy(y, y + m, a);
  std::copy(x, x + n, b);
  const PlanRef plan(L);
  if (plan.get() == nullptr) return TSM_ERR_NO_MEMORY;
  ErrorCode e = kwfft_real(plan.get(), a, h, 1, 1, L);
  if (e != TSM_SUCCESS) return e;
  if (HasSpectralZero(h, L)) {
    DivideInTime(x, n, y, m);
    return TSM_SUCCESS;
  }
  if ((e = kwfft_real(plan.get(), b, a, 1, 1, L)) != TSM_SUCCESS) return e;
  DivideSpectra(a, h, b, L);
  if ((e = kwfft_real_inverse(plan.get(), b, a, 1, 1, L)) != TSM_SUCCESS) return e;
  std::copy(a, a + (n - m + 1), x);
  return TSM_SUCCESS;
}

}  // namespace tsm
