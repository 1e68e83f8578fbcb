// Modified Bessel function K_n(x) of integer order.
//
// K0 and K1 from Chebyshev series: for x <= 2, K0 = S0(x^2/2 - 1) - ln(x/2) I0
// and K1 = (S1(x^2/2 - 1) + x ln(x/2) I1)/x, with e^-x I0 and e^-x I1/x
// series in x/4 - 1 (the (x/2 - 2)/2 of the usual form); above 2,
// K = e^-x L(4/x - 1)/sqrt(x) (the (8/x - 2)/2 of the usual form). Higher
// orders by the upward recurrence K_(k+1) = K_(k-1) + (2k/x) K_k, stable for
// K; K_-n = K_n. x = 0 gives +inf (singularity), x < 0 and NaN give NaN
// (domain); a recurrence that overflows gives +inf (overflow). Coefficients:
// special/bessel_ik_coefficients.h (tools/special/fit_bessel.py).
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_bessel.py,
// about 10^4 (n, x) per row, x log-spaced in [1e-6, 705], normal results),
// relative: n = 0, 1 max 1.0e-15; n from 2 to 100 max 5.5e-15.
#include "special/bessel_ik.h"

#include <cmath>
#include <limits>

#include "special/bessel_ik_coefficients.h"
#include "special/chebyshev.h"
#include "special/common.h"

namespace tsm {
namespace {

void K01(f64 x, f64* k0, f64* k1) {
  if (x <= 2) {
    const f64 t = x * x / 2 - 1;
    const f64 e = std::exp(x), l = std::log(x / 2);
    const f64 i0 = e * ChebSeries(x / 4 - 1, kI0Small);
    const f64 i1 = e * x * ChebSeries(x / 4 - 1, kI1Small);
    *k0 = ChebSeries(t, kK0Small) - l * i0;
    *k1 = (ChebSeries(t, kK1Small) + x * l * i1) / x;
    return;
  }
  const f64 t = 4 / x - 1;
  const f64 s = std::exp(-x) / std::sqrt(x);
  *k0 = s * ChebSeries(t, kK0Large);
  *k1 = s * ChebSeries(t, kK1Large);
}

}  // namespace

f64 BesselK(int32 n, f64 x) {
  constexpr f64 kInf = std::numeric_limits<f64>::infinity();
  if (IsNaNValue(x) || x < 0) return MathError(kMathDomain, std::numeric_limits<f64>::quiet_NaN());
  if (x == 0) return MathError(kMathSingularity, kInf);
  if (InfinitySign(x) > 0) return 0;
  const int64_t m = n < 0 ? -static_cast<int64_t>(n) : n;
  f64 k0, k1;
  K01(x, &k0, &k1);
  if (m == 0) return k0;
  for (int64_t k = 1; k < m; ++k) {
    const f64 next = k0 + (2 * static_cast<f64>(k) / x) * k1;
    k0 = k1;
    k1 = next;
    if (!IsFiniteValue(k1)) return MathError(kMathOverflow, kInf);
  }
  return k1;
}

}  // namespace tsm
