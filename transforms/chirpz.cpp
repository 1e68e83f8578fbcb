// Chirp-Z by direct sums or Bluestein's convolution, and the inverse by the
// Gohberg-Semencul form of the inverse Vandermonde matrix on the points W^k:
// two products of triangular Toeplitz matrices, each a convolution.
//
// Every power is z^p from the polar form with the phase p arg z formed and
// reduced modulo 2 pi in long double: p runs to 10^8 on long spirals, where
// a float64 phase would lose eight digits.
#include "transforms/chirpz.h"

#include <algorithm>
#include <cmath>

#include "frame/cx_ops.h"
#include "frame/heap.h"
#include "timedomain/convolution.h"

namespace tsm {
namespace {

constexpr long double kTwoPiL = 6.283185307179586476925286766559005768L;

// z^p = |z|^p exp(i p arg z) on the principal branch, for real p.
class PolarPower {
 public:
  explicit PolarPower(cx z) : logMag_(logl(hypotl(z.re, z.im))), arg_(atan2l(z.im, z.re)) {}
  cx operator()(f64 p) const {
    if (p == 0.0) return cx{1.0, 0.0};
    const f64 phase = static_cast<f64>(remainderl(p * arg_, kTwoPiL));
    const f64 mag = logMag_ == 0 ? 1.0 : static_cast<f64>(expl(p * logMag_));
    return cx{mag * std::cos(phase), mag * std::sin(phase)};
  }

 private:
  long double logMag_, arg_;
};

ErrorCode CheckSpiral(cx A, cx W) {
  if (!std::isfinite(A.re) || !std::isfinite(A.im) || !std::isfinite(W.re) || !std::isfinite(W.im))
    return TSM_ERR_NON_FINITE;
  if (Norm(A) == 0.0 || Norm(W) == 0.0) return TSM_ERR_NOTHING_TO_FIT;
  return TSM_SUCCESS;
}

// t[i] = A^-i, from A^(1-n) at the top multiplied by A downwards.
ErrorCode Direct(const cx* x, int32 n, cx A, cx W, int32 M, cx* X) {
  HeapScratch<cx> t;
  if (!t.Allocate(n)) return TSM_ERR_NO_MEMORY;
  const PolarPower powW(W);
  t[n - 1] = PolarPower(A)(1.0 - n);
  for (int32 i = n - 1; i > 0; --i) t[i - 1] = t[i] * A;
  for (int32 k = 0; k < M; ++k) {
    cx acc{0.0, 0.0};
    for (int32 i = 0; i < n; ++i) acc += (x[i] * t[i]) * powW(static_cast<f64>(i) * k);
    X[k] = acc;
  }
  return TSM_SUCCESS;
}

// c[j] = W^(-(j-n)^2 / 2); a[i] = x[i] A^-i / c[n-i]; X[k] = (a * c)[n+k] / c[n+k].
ErrorCode Bluestein(const cx* x, int32 n, cx A, cx W, int32 M, cx* X) {
  const std::int64_t nc = static_cast<std::int64_t>(n) + M;
  HeapScratch<cx> c, a, conv;
  if (nc + n - 1 > 0x7FFFFFFF || !c.Allocate(nc) || !a.Allocate(n) ||
      !conv.Allocate(nc + n - 1))
    return TSM_ERR_NO_MEMORY;
  const PolarPower powW(W), powA(A);
  for (std::int64_t j = 0; j < nc; ++j) {
    const f64 d = static_cast<f64>(j - n);
    c[j] = powW(-0.5 * d * d);
  }
  for (int32 i = 0; i < n; ++i) a[i] = (x[i] * powA(-static_cast<f64>(i))) / c[n - i];
  const ErrorCode e = CxConvolve(a.get(), n, c.get(), static_cast<int32>(nc), conv.get(), kConvolveFft);
  if (e != TSM_SUCCESS) return e;
  for (int32 k = 0; k < M; ++k) X[k] = conv[n + k] / c[n + k];
  return TSM_SUCCESS;
}

template <class T>
ErrorCode ChirpZAny(const T* x, int32 n, cx A, cx W, int32 M, int32 method, cx* X) {
  if (const ErrorCode e = CheckSpiral(A, W); e != TSM_SUCCESS) return e;
  HeapScratch<cx> z;
  if (!z.Allocate(n)) return TSM_ERR_NO_MEMORY;
  for (int32 i = 0; i < n; ++i) z[i] = AsCx(x[i]);
  return method == kChirpZDirect ? Direct(z.get(), n, A, W, M, X) : Bluestein(z.get(), n, A, W, M, X);
}

// y = T v for the M x M Toeplitz matrix that is lower triangular with first
// column c (upper = false), or upper triangular with first row c.
ErrorCode TriangularToeplitz(const cx* c, const cx* v, int32 M, bool upper, cx* y, cx* work) {
  cx* rev = work;
  cx* conv = work + M;
  if (upper) std::reverse_copy(v, v + M, rev);
  const ErrorCode e = CxConvolve(c, M, upper ? rev : v, M, conv, kConvolveFft);
  if (e != TSM_SUCCESS) return e;
  for (int32 i = 0; i < M; ++i) y[i] = upper ? conv[M - 1 - i] : conv[i];
  return TSM_SUCCESS;
}

}  // namespace

ErrorCode ChirpZ(const f64* x, int32 n, cx A, cx W, int32 M, int32 method, cx* X) {
  return ChirpZAny(x, n, A, W, M, method, X);
}
ErrorCode CxChirpZ(const cx* x, int32 n, cx A, cx W, int32 M, int32 method, cx* X) {
  return ChirpZAny(x, n, A, W, M, method, X);
}

// With v[k] = X[k] W^(-k^2/2), p[k] = prod_{j=1..k} (W^j - 1) and
//   u[k] = (-1)^k W^((2k^2 - (2M-1)k + M(M-1))/2) / (p[M-1-k] p[k]),
// the coefficients are (U L(u) v - U' L(u') v) / u[0] with u' = (0, u[M-1],
// .., u[1]), U and L the upper and lower triangular Toeplitz matrices of a
// sequence; then x[k] = A^k W^(-k^2/2) times that.
ErrorCode InvChirpZ(const cx* X, int32 M, cx A, cx W, cx* x) {
  if (const ErrorCode e = CheckSpiral(A, W); e != TSM_SUCCESS) return e;
  HeapScratch<cx> v, p, u, uhat, t1, t2, work;
  if (!v.Allocate(M) || !p.Allocate(M) || !u.Allocate(M) ||
      !uhat.Allocate(M) || !t1.Allocate(M) || !t2.Allocate(M) ||
      !work.Allocate(3 * static_cast<std::int64_t>(M)))
    return TSM_ERR_NO_MEMORY;
  const PolarPower powW(W), powA(A);
  for (int32 k = 0; k < M; ++k) {
    const f64 kk = k;
    v[k] = X[k] * powW(-0.5 * kk * kk);
  }
  p[0] = cx{1.0, 0.0};
  for (int32 k = 1; k < M; ++k) {
    const cx d = powW(k) - cx{1.0, 0.0};
    if (Norm(d) == 0.0) return TSM_ERR_ZERO_DIVISOR;
    p[k] = p[k - 1] * d;
  }
  const f64 m = M;
  for (int32 k = 0; k < M; ++k) {
    const f64 kk = k;
    const cx w = powW(0.5 * (2.0 * kk * kk - (2.0 * m - 1.0) * kk + m * (m - 1.0)));
    const cx q = w / (p[M - 1 - k] * p[k]);
    u[k] = (k % 2 == 0) ? q : cx{-q.re, -q.im};
  }
  uhat[0] = cx{0.0, 0.0};
  for (int32 k = 1; k < M; ++k) uhat[k] = u[M - k];
  ErrorCode e = TriangularToeplitz(uhat.get(), v.get(), M, true, t1.get(), work.get());
  if (e == TSM_SUCCESS) e = TriangularToeplitz(uhat.get(), t1.get(), M, false, t1.get(), work.get());
  if (e == TSM_SUCCESS) e = TriangularToeplitz(u.get(), v.get(), M, true, t2.get(), work.get());
  if (e == TSM_SUCCESS) e = TriangularToeplitz(u.get(), t2.get(), M, false, t2.get(), work.get());
  if (e != TSM_SUCCESS) return e;
  for (int32 k = 0; k < M; ++k) {
    const f64 kk = k;
    x[k] = ((t2[k] - t1[k]) / u[0]) * (powA(kk) * powW(-0.5 * kk * kk));
  }
  return TSM_SUCCESS;
}

}  // namespace tsm
