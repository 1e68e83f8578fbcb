// Struve function H_v(x) of real order v.
//
//   power series  H_v = 2 (x/2)^(v+1) / (sqrt(pi) Gamma(v + 3/2)) S,
//                 S = sum_k (-(x/2)^2)^k / ((3/2)_k (v + 3/2)_k),
//                 summed in double-double: its terms reach about e^x times
//                 the result, so a double sum would lose 8 digits by x = 18.
//                 A series whose terms pass 1e38 is abandoned.
//   asymptotic    H_v - Y_v = (x/2)^(v-1) / (sqrt(pi) Gamma(v + 1/2)) A,
//                 A = sum_k (1/2)_k (1/2 - v)_k (-1)^k (x/2)^(-2k), taken up
//                 to its smallest term, plus Y_v from BesselY.
// Below x = 18 the series alone; from 30 the asymptotic form when its
// smallest term is below rounding; between them, and wherever the preferred
// form falls short, both are formed with an estimate of their absolute error
// (the smallest omitted term, the double-double rounding of the largest
// series term, the rounding of Y_v) and the better one is kept.
// Half-integer orders v = -(n + 1/2) are (-1)^n J_(n+1/2)(x) exactly.
//
// Domain: x < 0 needs an integer order (else NaN, domain hook); x = 0 gives
// 0 for v > -1, 2/pi for v = -1 and an infinity for v < -1 (singularity
// hook); x = +inf gives 0 for v < 1, 2/pi for v = 1 and +inf above.
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_bessel.py,
// 9588 (v, x) with v in [-20, 100], x log-spaced in [1e-3, 1e4]), relative
// to sqrt(J_v^2 + Y_v^2) where x >= |v| or |H_v| where larger: max 1.7e-15,
// median 1.9e-16.
#include "special/struve.h"

#include <cmath>
#include <limits>

#include "special/bessel_jy.h"
#include "special/common.h"
#include "special/double_double.h"
#include "special/gamma.h"

namespace tsm {
namespace {

constexpr f64 kInf = std::numeric_limits<f64>::infinity();
constexpr f64 kSqrtPi = 1.7724538509055160;
constexpr f64 kTwoOverPi = 0.6366197723675814;
constexpr f64 kSeriesOnly = 18;      // below: the power series alone
constexpr f64 kAsymptotic = 30;      // from here: the asymptotic form first
constexpr f64 kSeriesLimit = 1e38;   // largest series term still summed
constexpr f64 kDoubleDoubleEps = 1.2e-32;

// A value with an estimate of its absolute error.
struct Estimate {
  f64 value;
  f64 error;
};

// base^p / (sqrt(pi) Gamma(g)). The power is taken in two halves so that
// neither it nor the gamma function leaves the double range on the way; only
// beyond that (Gamma(g) itself infinite) through logarithms.
f64 PowerOverGamma(f64 base, f64 p, f64 g) {
  const f64 gamma = GammaFn(g);
  const f64 half = std::pow(base, p / 2);
  if (IsFiniteValue(gamma) && IsFiniteValue(half)) return half / (kSqrtPi * gamma) * half;
  if (g <= 0) return std::pow(base, p) / (kSqrtPi * gamma);
  return std::exp(p * std::log(base) - LogGamma(g)) / kSqrtPi;
}

// The power series for x > 0.
Estimate PowerSeries(f64 v, f64 x) {
  const f64 h = x / 2;
  const DoubleDouble q = TwoProd(h, h);
  const DoubleDouble c = TwoSum(v, 1.5);
  DoubleDouble term{1, 0}, sum{1, 0};
  f64 largest = 1;
  for (int32 k = 0; k < 100000; ++k) {
    const DoubleDouble den = DoubleDouble{k + 1.5, 0} * (c + DoubleDouble{static_cast<f64>(k), 0});
    term = -(term * q) / den;
    sum = sum + term;
    const f64 t = std::fabs(term.hi);
    largest = std::fmax(largest, t);
    if (largest > kSeriesLimit) return {0, kInf};
    // Once the terms decrease for good, stop below double-double rounding.
    if (k + 1.5 > h && std::fabs(k + c.hi) > h && t <= kDoubleDoubleEps * std::fabs(sum.hi)) break;
  }
  const f64 pref = 2 * PowerOverGamma(h, v + 1, v + 1.5);
  const f64 value = pref * sum.hi;
  return {value, std::fabs(pref) * (largest * 4 * kDoubleDoubleEps) + 2 * kMachEp * std::fabs(value)};
}

// H_v - Y_v for x > 0 from the asymptotic series, up to its smallest term.
Estimate Asymptotic(f64 v, f64 x) {
  const f64 h2 = (x / 2) * (x / 2);
  f64 term = 1, sum = 1, omitted = 0;
  for (int32 k = 0;; ++k) {
    const f64 r = (k + 0.5) * (v - 0.5 - k) / h2;
    if (r == 0) break;  // a half-integer order ends the series
    if (std::fabs(r) >= 1 && k + 0.5 > v) {
      omitted = std::fabs(term);  // from here on the terms grow
      break;
    }
    term *= r;
    sum += term;
    if (std::fabs(term) <= kMachEp / 4 * std::fabs(sum)) break;
  }
  const f64 pref = PowerOverGamma(x / 2, v - 1, v + 0.5);
  const f64 value = pref * sum;
  return {value, std::fabs(pref) * omitted + 2 * kMachEp * std::fabs(value)};
}

f64 StruveAtInfinity(f64 v) {
  if (v < 1) return 0;
  return v == 1 ? kTwoOverPi : kInf;
}

f64 StruveAtZero(f64 v) {
  if (v > -1) return 0;
  if (v == -1) return kTwoOverPi;
  return MathError(kMathSingularity, GammaFn(v + 1.5) < 0 ? -kInf : kInf);
}

}  // namespace

f64 StruveH(f64 v, f64 x) {
  if (IsNaNValue(v) || IsNaNValue(x) || !IsFiniteValue(v)) return MathError(kMathDomain, std::nan(""));
  // v = -(n + 1/2): the series is (-1)^n J_(n+1/2).
  const f64 n = -(v + 0.5);
  if (n >= 0 && n == std::floor(n)) {
    const f64 j = BesselJ(n + 0.5, x);
    return std::fmod(n, 2) == 0 ? j : -j;
  }
  if (x < 0) {
    if (v != std::floor(v)) return MathError(kMathDomain, std::nan(""));
    const f64 h = StruveH(v, -x);
    return std::fmod(v, 2) == 0 ? -h : h;
  }
  if (x == 0) return StruveAtZero(v);
  if (!IsFiniteValue(x)) return StruveAtInfinity(v);

  if (x < kSeriesOnly) return PowerSeries(v, x).value;
  const Estimate a = Asymptotic(v, x);
  const f64 y = BesselY(v, x);
  Estimate best{a.value + y, a.error + 4 * kMachEp * std::fabs(y)};
  const f64 scale = std::fmax(std::fmax(std::fabs(y), std::fabs(a.value)), std::sqrt(kTwoOverPi / x));
  if (x >= kAsymptotic && best.error <= 4 * kMachEp * scale) return best.value;
  const Estimate s = PowerSeries(v, x);
  if (s.error < best.error || !std::isfinite(best.value)) best = s;
  if (!IsFiniteValue(best.value)) return MathError(kMathOverflow, best.value);
  return best.value;
}

}  // namespace tsm
