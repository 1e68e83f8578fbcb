// Sine, cosine and hyperbolic sine and cosine integrals.
//
// Si, Ci:  x < 4: Si = x S(x^2), Ci = Euler + ln x - x^2 C(x^2), S and C
//          Chebyshev series in x^2/16. From 4 on, through the auxiliary
//          functions f and g: Si = pi/2 - f cos x - g sin x, Ci = f sin x -
//          g cos x, with x f and x^2 g Chebyshev series in x on [4, 8) and in
//          64/x^2 from 8 up. Si(+-inf) = +-pi/2, Ci(inf) = 0, Ci(0) = -inf.
// Shi, Chi: power series up to x = 8; on (8, 18) and [18, 88] x e^-x Shi and
//          x e^-x Chi as Chebyshev series in (576/x - 52)/10 and
//          (6336/x - 212)/70; above 88 the asymptotic series of Ei(x)/2 (both
//          agree there to far below an ulp), which overflows to +inf near 716
//          by itself; +inf from 880 on.
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_integrals.py,
// about 10^4 log-spaced points each plus the break points):
//   Si   x in [1e-8, 1e6]   relative                                 max 2.8e-16
//   Ci   x in [1e-8, 1e6]   relative to the envelope max(|Ci|, min(1, 1/x))  max 2.0e-15
//   Shi  x in [1e-8, 715]   relative                                 max 7.8e-16
//   Chi  x in [1e-8, 715]   relative, to max(|Chi|, 1) below x = 1     max 7.8e-16
#include "special/sici.h"

#include <cmath>
#include <numbers>

#include "special/chebyshev.h"
#include "special/common.h"
#include "special/integrals_coefficients.h"

namespace tsm {
namespace {

constexpr f64 kPiO2 = std::numbers::pi / 2;
constexpr f64 kSiciSmall = 4;
constexpr f64 kSiciMid = 8;
constexpr f64 kShiSeriesEnd = 8;
constexpr f64 kShiMid = 18;
constexpr f64 kShiAsymptotic = 88;
constexpr f64 kShiInfinite = 880;

// Both integrals for x >= 0.
void SiCiPositive(f64 x, f64* si, f64* ci) {
  if (x < kSiciSmall) {
    const f64 z = x * x;
    const f64 t = z / 8 - 1;
    *si = x * ChebSeries(t, kSiSmall);
    *ci = kEuler + std::log(x) - z * ChebSeries(t, kCinSmall);
    return;
  }
  f64 f, g;
  if (x < kSiciMid) {
    const f64 t = (x - 6) / 2;
    f = ChebSeries(t, kSiciF4) / x;
    g = ChebSeries(t, kSiciG4) / (x * x);
  } else {
    const f64 t = 128 / (x * x) - 1;
    f = ChebSeries(t, kSiciF8) / x;
    g = ChebSeries(t, kSiciG8) / (x * x);
  }
  const f64 s = std::sin(x), c = std::cos(x);
  *si = kPiO2 - f * c - g * s;
  *ci = f * s - g * c;
}

// Shi and Chi for 0 < x <= 880.
void ShiChiPositive(f64 x, f64* shi, f64* chi) {
  if (x <= kShiSeriesEnd) {
    const f64 z = x * x;
    f64 a = 1, s = 1, c = 0, k = 2;
    do {
      a *= z / k;
      c += a / k;
      k += 1;
      a /= k;
      s += a / k;
      k += 1;
    } while (std::fabs(a / s) > kMachEp);
    *shi = s * x;
    *chi = kEuler + std::log(x) + c;
    return;
  }
  if (x <= kShiAsymptotic) {
    const f64 k = std::exp(x) / x;
    if (x < kShiMid) {
      const f64 t = (576 / x - 52) / 20;
      *shi = k * ChebSeries(t, kShi18);
      *chi = k * ChebSeries(t, kChi18);
    } else {
      const f64 t = (6336 / x - 212) / 140;
      *shi = k * ChebSeries(t, kShi88);
      *chi = k * ChebSeries(t, kChi88);
    }
    return;
  }
  // Ei(x)/2 = e^x/(2x) sum k!/x^k; E1(x) < e^-88 is far below an ulp.
  f64 term = 1, sum = 1;
  for (int k = 1; k < 200; ++k) {
    const f64 next = term * k / x;
    if (next > term) break;
    term = next;
    sum += term;
    if (term < kMachEp * sum) break;
  }
  const f64 h = std::exp(0.5 * x);  // e^x itself overflows before the result
  const f64 r = h * (h / (2 * x) * sum);
  *shi = *chi = r;
}

}  // namespace

void SineCosineIntegrals(f64 x, f64* si, f64* ci) {
  if (IsNaNValue(x)) {
    *si = *ci = x;
    return;
  }
  const f64 ax = std::fabs(x);
  if (ax == 0) {
    *si = x;
    *ci = MathError(kMathSingularity, -INFINITY);
    return;
  }
  if (!IsFiniteValue(ax)) {
    *si = std::copysign(kPiO2, x);
    *ci = 0;
    return;
  }
  SiCiPositive(ax, si, ci);
  if (x < 0) *si = -*si;
}

f64 HyperbolicSineIntegral(f64 x) {
  if (IsNaNValue(x)) return x;
  if (x == 0) return x;
  const f64 ax = std::fabs(x);
  if (ax > kShiInfinite) return MathError(kMathOverflow, std::copysign(INFINITY, x));
  f64 shi, chi;
  ShiChiPositive(ax, &shi, &chi);
  if (!IsFiniteValue(shi)) MathErrorHook(kMathKernel, kMathOverflow);
  return std::copysign(shi, x);
}

f64 HyperbolicCosineIntegral(f64 x) {
  if (IsNaNValue(x)) return x;
  if (x == 0) return MathError(kMathSingularity, -INFINITY);
  const f64 ax = std::fabs(x);
  if (ax > kShiInfinite) return MathError(kMathOverflow, INFINITY);
  f64 shi, chi;
  ShiChiPositive(ax, &shi, &chi);
  if (!IsFiniteValue(chi)) MathErrorHook(kMathKernel, kMathOverflow);
  return chi;
}

}  // namespace tsm
