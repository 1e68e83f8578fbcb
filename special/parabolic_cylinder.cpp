// Parabolic cylinder function D_v(x), Weber's function, for real v and x.
//
// D_v solves y'' = (x^2/4 - v - 1/2) y and decays like x^v e^(-x^2/4) as
// x -> +inf. It is computed as follows.
//   v = n, a nonnegative integer: e^(-x^2/4) He_n(x), the Hermite polynomial
//                     by its three-term recurrence.
//   |x| >= 7, x > 0:  the large-argument form x^v e^(-x^2/4)
//                     2F0(-v/2, (1-v)/2; ; -2/x^2), at most 60 terms.
//   |x| >= 7, x < 0:  the connection formula D_v(-x) = cos(pi v) D_v(x) +
//                     sqrt(2 pi)/Gamma(-v) e^(x^2/4) x^(-v-1)
//                     2F0((v+1)/2, (v+2)/2; ; 2/x^2), same budget.
//   otherwise, or where those series do not reach MACHEP within their budget
//   (|v| large against |x|), Weber's equation is integrated by Taylor steps
//   in long double, in the direction in which the wanted solution grows:
//   D_v(|x|) from a point x0 >= 7 where the large-argument form holds (x0
//   grows by a factor 1.2 from max(|x|, 7) until it does) down to |x|; for
//   x < 0 also the growing part W(t) = D_v(-t) - cos(pi v) D_v(t) up from
//   t = 0, where W and W' follow from D_v(0) = 2^(v/2) sqrt(pi)/Gamma((1-v)/2)
//   and D_v'(0) = -sqrt(2) 2^(v/2) sqrt(pi)/Gamma(-v/2), the hypergeometric
//   form at x = 0. Step lengths keep sqrt|x^2/4 - v - 1/2| h <= 2.
// The power series of 1F1 in that form is not used away from x = 0: for
// x > 0 its two parts grow like e^(x^2/4) and cancel to a result of size
// e^(-x^2/4). x = +inf gives 0; x = -inf gives 0 for a nonnegative integer
// v, otherwise the infinity of the sign of 1/Gamma(-v). NaN gives NaN; an
// infinite v, or an order so large that no start x0 <= 200 serves (|v| above
// about 310), is a domain error (NaN); results beyond the range overflow
// (hook).
//
// Domain: v in [-100, 100], x in [-60, 60], normal results. Errors relative
// to an envelope: |D_v| itself where D_v is monotone, its local amplitude in
// the oscillating region x^2 < 4v + 2, and for x < 0 the sum of the
// magnitudes of the two terms of the connection formula. Against mpmath at
// 40 digits (tools/special/accuracy_bessel_i.py):
//   |v| <= 30, |x| <= 30 (1.1e4 points):   max 2.2e-15, median 1.3e-16
//   |v| <= 100, |x| <= 60 (1.9e3 points):  max 1.5e-15, median 1.5e-16
#include "special/parabolic_cylinder.h"

#include <cmath>
#include <limits>

#include "special/common.h"
#include "special/gamma.h"
#include "special/hypergeometric.h"

namespace tsm {
namespace {

using ld = long double;

constexpr f64 kInf = std::numeric_limits<f64>::infinity();
constexpr f64 kSqrtTwoPi = 2.5066282746310002;
constexpr f64 kSqrtPi = 1.7724538509055160;
constexpr f64 kMinusSqrt2 = -1.4142135623730951;
constexpr f64 kHalfLn2 = 0.34657359027997264;  // 2^(v/2) = exp(v ln2/2)
constexpr f64 kAsymptoticMinX = 7;
constexpr int32 kAsymptoticTerms = 60;
constexpr f64 kMaxLoss = 8;  // largest term over the sum accepted in the 2F0
constexpr f64 kMaxStart = 200;  // e^(-x0^2/4) stays within the range of long double


bool Series2F0(f64 a, f64 b, f64 z, f64* s) {
  f64 loss;
  return Hypergeometric2F0(a, b, z, kAsymptoticTerms, s, &loss) && loss <= kMaxLoss;
}

// D_v(x) for large x > 0.
bool Decaying(f64 v, f64 x, ld* d) {
  f64 s;
  if (!Series2F0(-v / 2, (1 - v) / 2, -2 / (x * x), &s)) return false;
  const ld lx = x;
  *d = std::exp(v * std::log(lx) - lx * lx / 4) * s;
  return true;
}

// sqrt(2 pi)/Gamma(-v) e^(x^2/4) x^(-v-1) 2F0(...): the part of D_v(-x) that
// grows, for large x > 0.
bool Growing(f64 v, f64 x, ld* d) {
  f64 s;
  if (!Series2F0((v + 1) / 2, (v + 2) / 2, 2 / (x * x), &s)) return false;
  const ld lx = x;
  *d = kSqrtTwoPi / static_cast<ld>(GammaFn(-v)) * std::exp(lx * lx / 4 - (v + 1.0L) * std::log(lx)) * s;
  return true;
}

// e^(-x^2/4) He_n(x).
ld Hermite(f64 n, f64 x) {
  const ld lx = x;
  ld prev = std::exp(-lx * lx / 4), cur = lx * prev;
  if (n == 0) return prev;
  for (f64 k = 1; k < n; ++k) {
    const ld next = lx * cur - k * prev;
    prev = cur;
    cur = next;
  }
  return cur;
}

// Carries (y, y') of y'' = (x^2/4 - v - 1/2) y from x0 to x1 by Taylor steps.
void Integrate(f64 v, ld x0, ld x1, ld* y, ld* dy) {
  const ld dir = x1 < x0 ? -1 : 1;
  ld xc = x0;
  while (xc != x1) {
    const ld q = xc * xc / 4 - v - 0.5L;
    ld h = dir * std::fmin(1.0L, 2 / std::sqrt(std::fabs(q)));
    if (std::fabs(x1 - xc) <= std::fabs(h)) h = x1 - xc;
    // d_k = c_k h^k with (k+1)(k+2) c_(k+2) = q c_k + (xc/2) c_(k-1) + c_(k-2)/4.
    ld d2 = 0, d1 = 0, d0 = *y, dk = *dy * h;
    ld sum = d0 + dk, dsum = dk;
    for (int32 k = 0; k < 400; ++k) {
      const ld next = h * h * (q * d0 + xc / 2 * h * d1 + h * h / 4 * d2) / ((k + 1) * (k + 2));
      d2 = d1;
      d1 = d0;
      d0 = dk;
      dk = next;
      sum += next;
      dsum += (k + 2) * next;
      // three terms in a row: at x = 0 with v = -1/2 every other pair of terms is 0
      if (k >= 2 && std::fabs(next) + std::fabs(d0) + std::fabs(d1) <= 1e-21L * (std::fabs(sum) + std::fabs(dsum))) break;
    }
    *y = sum;
    *dy = dsum / h;
    xc += h;
  }
}

f64 Finish(ld d) {
  const f64 r = static_cast<f64>(d);
  if (!IsFiniteValue(r)) return MathError(kMathOverflow, r);
  return r;
}

// 2^(v/2) sqrt(pi) / Gamma((1-v)/2) and -sqrt(2) 2^(v/2) sqrt(pi) / Gamma(-v/2):
// D_v(0) and D_v'(0), from the hypergeometric form of D_v.
void AtZero(f64 v, ld* d, ld* dy) {
  const ld scale = std::exp(static_cast<ld>(v) * kHalfLn2) * kSqrtPi;
  // Gamma((1-v)/2): 1 - v rounds for v < -1, so there (z-1) Gamma(z-1) with
  // z - 1 = (-1-v)/2, which is exact.
  const f64 z1 = (-1 - v) / 2;
  *d = scale / static_cast<ld>(v < -1 ? z1 * GammaFn(z1) : GammaFn((1 - v) / 2));
  *dy = kMinusSqrt2 * scale / static_cast<ld>(GammaFn(-v / 2));
}

// D_v(x) for x >= 0, v not a nonnegative integer.
ld PositiveSide(f64 v, f64 x) {
  ld d, d1;
  if (x >= kAsymptoticMinX && Decaying(v, x, &d)) return d;
  // The slope from a neighbouring order: D_v' = v D_(v-1) - (x/2) D_v, or
  // (x/2) D_v - D_(v+1) for v < 1/2. v - 1 (v + 1 below 1/2) is exact, and an
  // order rounded by an ulp would cost ln(x0) ulps in the slope.
  const bool down = v >= 0.5;
  const f64 w = down ? v - 1 : v + 1;
  f64 x0 = std::fmax(x, kAsymptoticMinX);
  while (!(Decaying(v, x0, &d) && Decaying(w, x0, &d1))) {
    x0 *= 1.2;
    if (x0 > kMaxStart) return std::numeric_limits<ld>::quiet_NaN();
  }
  ld dy = down ? v * d1 - x0 / 2 * d : x0 / 2 * d - d1;
  Integrate(v, x0, x, &d, &dy);
  return d;
}

// W(x) = D_v(-x) - cos(pi v) D_v(x) for x >= 0, the part of D_v(-x) that
// grows with x. W(0) = 2 sin^2(pi v/2) D_v(0) and W'(0) = -2 cos^2(pi v/2)
// D_v'(0), products without cancellation, so that W keeps its relative
// accuracy even where its factor 1/Gamma(-v) is small (v near an integer).
ld GrowingSide(f64 v, f64 x) {
  ld w, dw;
  if (x >= kAsymptoticMinX && Growing(v, x, &w)) return w;
  AtZero(v, &w, &dw);
  f64 s, c;
  SinCosPi(v / 2, &s, &c);
  w *= 2 * static_cast<ld>(s) * s;
  dw *= -2 * static_cast<ld>(c) * c;
  Integrate(v, 0, x, &w, &dw);
  return w;
}

}  // namespace

f64 ParabolicCylinderD(f64 v, f64 x) {
  if (IsNaNValue(v) || IsNaNValue(x)) return v + x;
  if (!IsFiniteValue(v)) return MathError(kMathDomain, std::numeric_limits<f64>::quiet_NaN());
  const bool hermite = v >= 0 && v == std::floor(v) && v <= 1e5;
  if (!IsFiniteValue(x)) {
    if (x > 0 || hermite) return 0;
    return GammaFn(-v) > 0 ? kInf : -kInf;
  }
  if (hermite) return Finish(Hermite(v, x));
  const f64 ax = std::fabs(x);
  const ld d = PositiveSide(v, ax);
  if (IsNaNValue(static_cast<f64>(d))) return MathError(kMathDomain, std::numeric_limits<f64>::quiet_NaN());
  if (x >= 0) return Finish(d);
  f64 s, c;
  SinCosPi(v, &s, &c);
  return Finish(c * d + GrowingSide(v, ax));
}

}  // namespace tsm
