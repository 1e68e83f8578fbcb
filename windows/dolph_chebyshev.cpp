// Dolph-Chebyshev window of N points (N = n symmetric, n+1 periodic).
//
// Frequency samples W(k) = T_{N-1}(b cos(pi k / N)), b = cosh(acosh(ratio) /
// (N-1)), so W(0) = ratio; only k below N/2 are formed, where the argument
// is positive. The window centred on (N-1)/2 is
//   w(j) = sum_k W(k) exp(-2 pi i k (j - (N-1)/2) / N),
// real because W(N-k) = (-1)^(N-1) W(k). Its half from the centre on,
// w(m) for offset m (m - 1/2 for even N), is N times the inverse DFT of
// Q(k) = W(k) exp(-i pi k / N) for even N and of Q(k) = W(k) for odd N, and Q
// is Hermitian, so one inverse real transform of its HalfComplex form gives
// it. The other half is the mirror image; the window is scaled to a peak of 1.
#include <cmath>

#include "frame/workspace.h"
#include "transforms/kwfft.h"
#include "windows/apply.h"
#include "windows/special_windows.h"

namespace tsm {
namespace {

constexpr f64 kPi = 3.141592653589793;

// T_degree(v) at v = b cos(theta) > 0, with b - 1 given: cos(degree acos v)
// up to 1, cosh(degree acosh v) beyond. Near v = 1 both inverse functions are
// ill-conditioned in v, so they are taken from v - 1, formed without
// cancellation as (b-1) cos(theta) - 2 sin^2(theta/2).
f64 ChebyshevSample(int32 degree, f64 b_minus_1, f64 theta) {
  const f64 s = std::sin(0.5 * theta);
  const f64 v_minus_1 = b_minus_1 * std::cos(theta) - 2.0 * s * s;
  if (v_minus_1 > 0.0)
    return std::cosh(degree * std::log1p(v_minus_1 + std::sqrt(v_minus_1 * (v_minus_1 + 2.0))));
  const f64 v = 1.0 + v_minus_1;
  const f64 angle = v > 0.5 ? 2.0 * std::asin(std::sqrt(-0.5 * v_minus_1)) : std::acos(v);
  return std::cos(degree * angle);
}

// The N-point window into w (N values); hc and out are N values of work.
ErrorCode MakeDolphChebyshev(int32 N, f64 ratio, f64* hc, f64* out, f64* w) {
  kwfft_table* plan = CreateKwfftTable(N);
  if (plan == nullptr) return TSM_ERR_NO_MEMORY;
  const int32 half = (N + 1) / 2;
  const f64 sh = std::sinh(0.5 * std::acosh(ratio) / (N - 1));
  const f64 b_minus_1 = 2.0 * sh * sh;  // cosh(a) - 1
  const bool even = N % 2 == 0;
  for (int32 k = 0; k < N; ++k) hc[k] = 0.0;  // W(N/2) = 0 for even N
  hc[0] = ratio;
  for (int32 k = 1; k < half; ++k) {
    const f64 W = ChebyshevSample(N - 1, b_minus_1, kPi * k / N);
    if (even) {
      hc[k] = W * std::cos(kPi * k / N);
      hc[N - k] = -W * std::sin(kPi * k / N);
    } else {
      hc[k] = W;
    }
  }
  const ErrorCode e = kwfft_real_inverse(plan, hc, out, 1, 1, N);
  DestroyKwfftTable(plan);
  if (e != TSM_SUCCESS) return e;
  // out[m] belongs at the centre index plus m; even N has its centre between
  // N/2 - 1 and N/2, and out[m] (m >= 1) at N/2 - 1 + m.
  const int32 centre = even ? N / 2 - 1 : (N - 1) / 2;
  const int32 first = even ? 1 : 0;
  for (int32 m = first; m <= N / 2; ++m) {
    w[centre + m] = out[m];
    w[N - 1 - centre - m] = out[m];
  }
  f64 peak = w[0];
  for (int32 j = 1; j < N; ++j)
    if (w[j] > peak) peak = w[j];
  for (int32 j = 0; j < N; ++j) w[j] /= peak;
  return TSM_SUCCESS;
}

}  // namespace

template <class T>
ErrorCode DolphChebyshevWindow(T* x, int32 n, f64 ratio, bool symmetric) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) return TSM_SUCCESS;
  if (ratio < 1.0) ratio = 1.0;
  const std::int64_t points = symmetric ? n : n + std::int64_t{1};
  Scratch<f64> work;  // window, HalfComplex samples, transform output
  if (work.Allocate(3 * points) != TSM_SUCCESS) return TSM_ERR_NO_MEMORY;
  f64* w = work.get();
  const ErrorCode e = MakeDolphChebyshev(static_cast<int32>(points), ratio, w + points, w + 2 * points, w);
  if (e != TSM_SUCCESS) return e;
  MultiplyByWindow(x, w, n);
  return TSM_SUCCESS;
}

template ErrorCode DolphChebyshevWindow(f64*, int32, f64, bool);
template ErrorCode DolphChebyshevWindow(cx*, int32, f64, bool);

}  // namespace tsm
