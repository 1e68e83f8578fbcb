// Modified Bessel function I_v(x) of real order.
//
// I_v(x) = (x/2)^v e^-x 1F1(v + 1/2; 2v + 1; 2x) / Gamma(v + 1), for v >= 0:
//   x >= max(20, v^2/2): the large-argument form of that 1F1, which gives
//                     I_v = e^x / sqrt(2 pi x) 2F0(v + 1/2, 1/2 - v; ; 1/(2x)),
//                     summed to MACHEP in at most 100 terms (a term past 1e10
//                     ends it and the series below takes over);
//   otherwise:        the power series, taken in the form e^-x 1F1(v + 1/2;
//                     2v + 1; 2x) = 0F1(; v + 1; x^2/4) (Kummer's second
//                     transformation): positive terms, half as many as the
//                     1F1 series and no e^(2x) to overflow, summed in long
//                     double with the J series (special/bessel_series.h).
// Negative non-integer v: the series for x <= 2; above, where its terms of
// alternating sign cancel, I_-u = I_u + (2/pi) sin(pi u) K_u (u = -v), K_u
// from K_f and K_(f+1), f = u - floor(u), by the trapezoidal rule on their
// integral and the upward recurrence of K. I_-n = I_n; for x < 0, I_n(-x) =
// (-1)^n I_n(x) and a non-integer order is a domain error (NaN). x = 0: 1 for
// v = 0, 0 for v > 0, +inf (singularity) for negative non-integer v.
// x = +-inf gives the infinity of I's sign; an infinite v is a domain error;
// results beyond the range overflow to +-inf (overflow hook).
//
// Domain: v in [-50, 1000], x in [1e-6, 1e4], normal results. Accuracy
// against mpmath at 40 digits (tools/special/accuracy_bessel_i.py, 2.5e4
// points), relative for v >= 0, and for negative non-integer v, whose I_v has
// zeros, relative to I_u + (2/pi) |sin(pi u)| K_u:
//   v in [0, 100], x in [1e-6, 720]:      max 7.1e-16, median 4.0e-17
//   v in [-50, 0), x in [1e-6, 720]:      max 8.6e-16, median 4.3e-17
//   v in [100, 1000], x in [1e-3, 1e4]:   max 1.1e-16, median 3.8e-17
#include "special/bessel_i.h"

#include <cmath>
#include <cstdint>
#include <limits>

#include "special/bessel_series.h"
#include "special/common.h"
#include "special/hypergeometric.h"

namespace tsm {
namespace {

constexpr f64 kInf = std::numeric_limits<f64>::infinity();
constexpr f64 kTwoPi = 6.283185307179586;
constexpr long double kPi = 3.141592653589793238462643383279503L;
constexpr int32 kAsymptoticTerms = 100;
constexpr f64 kAsymptoticMinX = 20;  // e^-2x, the part the expansion drops, is below MACHEP

// e^x K_u(x) for u >= 0, x > 0: K_f and K_(f+1), f = u - floor(u), from
// K_f(x) = int_0^inf e^(-x cosh t) cosh(f t) dt by the trapezoidal rule
// (exponentially convergent for this integrand; the step is kept below the
// width 1/sqrt(x) of its peak), then the recurrence K_(m+1) = K_(m-1) +
// (2m/x) K_m, stable upward.
long double ScaledK(f64 u, f64 x) {
  const f64 f = u - std::floor(u);
  const long double h = std::fmin(0.2, 0.5 / std::sqrt(x));
  long double k0 = 0.5L, k1 = 0.5L;
  for (int32 j = 1; j < 100000; ++j) {
    const long double t = j * h, sh = std::sinh(t / 2);
    const long double g = std::exp(-2 * x * sh * sh);  // e^(-x (cosh t - 1))
    k0 += g * std::cosh(f * t);
    k1 += g * std::cosh((f + 1) * t);
    if (g * std::cosh((f + 1) * t) <= 1e-20L * k1) break;
  }
  k0 *= h;
  k1 *= h;
  const int64_t steps = static_cast<int64_t>(u - f) - 1;  // K_(f+1) up to K_u
  for (int64_t j = 1; j <= steps; ++j) {
    const long double next = k0 + (2 * (f + j) / x) * k1;
    k0 = k1;
    k1 = next;
  }
  return u < 1 ? k0 : k1;
}

// I_v(x) for v >= 0, x > 0.
f64 PositiveOrder(f64 v, f64 x) {
  f64 s, loss;
  if (x >= std::fmax(kAsymptoticMinX, v * v / 2) &&
      Hypergeometric2F0(v + 0.5, 0.5 - v, 1 / (2 * x), kAsymptoticTerms, &s, &loss)) {
    const f64 e = std::exp(x / 2);  // e^x in two halves: I_0 is finite a little past x = 709.78
    return e * (e / std::sqrt(kTwoPi * x)) * s;
  }
  return BesselPowerSeries(v, x, 1);
}

}  // namespace

f64 BesselI(f64 v, f64 x) {
  if (IsNaNValue(v) || IsNaNValue(x)) return v + x;
  if (!IsFiniteValue(v)) return MathError(kMathDomain, std::numeric_limits<f64>::quiet_NaN());
  const bool integer = v == std::floor(v);
  if (integer && v < 0) v = -v;
  f64 sign = 1;
  if (x < 0) {
    if (!integer) return MathError(kMathDomain, std::numeric_limits<f64>::quiet_NaN());
    if (std::fmod(v, 2) != 0) sign = -1;
    x = -x;
  }
  if (x == 0) {
    if (v == 0) return 1;
    if (v > 0) return 0;
    return MathError(kMathSingularity, kInf);
  }
  if (!IsFiniteValue(x)) return sign * kInf;
  f64 r;
  if (v >= 0) {
    r = PositiveOrder(v, x);
  } else if (x <= 2) {
    r = BesselPowerSeries(v, x, 1);
  } else {
    // I_-u = I_u + (2/pi) sin(pi u) K_u, u = -v.
    const f64 u = -v;
    f64 sinpi, cospi;
    SinCosPi(u, &sinpi, &cospi);
    r = static_cast<f64>(PositiveOrder(u, x) + 2 / kPi * sinpi * ScaledK(u, x) * std::exp(-static_cast<long double>(x)));
  }
  r *= sign;
  if (!IsFiniteValue(r)) return MathError(kMathOverflow, r);
  return r;
}

}  // namespace tsm
