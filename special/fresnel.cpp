// Fresnel integrals S(x) = int_0^x sin(pi t^2/2) dt and C(x), both odd.
//
// x^2 < 2.5625: S = x^3 P(x^4), C = x Q(x^4), Chebyshev series in x^4.
// Up to x = 36974: C = 0.5 + f sin(pi x^2/2) - g cos(pi x^2/2),
//                  S = 0.5 - f cos(pi x^2/2) - g sin(pi x^2/2), with pi x f and
//                  pi^2 x^3 g Chebyshev series in 2.5625/x^2. The phase is
//                  reduced exactly (x^2 split into two doubles, modulo 4).
// Above 36974: 0.5 and 0.5 (the oscillation is below 1/(pi x) < 8.7e-6 there).
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_integrals.py),
// relative error over 10^4 log-spaced x in [1e-8, 36974]: S and C max 3.7e-16.
#include "special/fresnel.h"

#include <cmath>
#include <numbers>

#include "special/chebyshev.h"
#include "special/common.h"
#include "special/integrals_coefficients.h"

namespace tsm {
namespace {

constexpr f64 kPi = std::numbers::pi;
constexpr f64 kSeriesEnd = 2.5625;  // on x^2
constexpr f64 kSeriesEnd2 = 6.56640625;  // its square, on x^4
constexpr f64 kLimit = 36974.0;

// sin and cos of pi x^2/2 with x^2 carried to twice the working precision
// and reduced modulo 4 exactly.
void HalfPiSquare(f64 x, f64* s, f64* c) {
  const f64 h = x * x;
  const f64 l = std::fma(x, x, -h);
  const f64 r = std::fmod(h, 4.0) + l;
  const f64 k = std::nearbyint(r);
  const f64 a = kPi / 2 * (r - k);
  const f64 sa = std::sin(a), ca = std::cos(a);
  switch (static_cast<int>(k) & 3) {
    case 0: *s = sa; *c = ca; break;
    case 1: *s = ca; *c = -sa; break;
    case 2: *s = -sa; *c = -ca; break;
    default: *s = -ca; *c = sa; break;
  }
}

}  // namespace

void FresnelIntegrals(f64 x, f64* s, f64* c) {
  if (IsNaNValue(x)) {
    *s = *c = x;
    return;
  }
  const f64 ax = std::fabs(x);
  const f64 x2 = ax * ax;
  f64 ss, cc;
  if (x2 < kSeriesEnd) {
    const f64 t = 2 * (x2 * x2 / kSeriesEnd2) - 1;
    ss = ax * x2 * ChebSeries(t, kFresnelS);
    cc = ax * ChebSeries(t, kFresnelC);
  } else if (ax > kLimit) {
    ss = cc = 0.5;
  } else {
    const f64 t = 2 * (kSeriesEnd / x2) - 1;
    const f64 f = ChebSeries(t, kFresnelF) / (kPi * ax);
    const f64 g = ChebSeries(t, kFresnelG) / (kPi * kPi * ax * x2);
    f64 sn, cs;
    HalfPiSquare(ax, &sn, &cs);
    cc = 0.5 + f * sn - g * cs;
    ss = 0.5 - f * cs - g * sn;
  }
  *s = std::copysign(ss, x);
  *c = std::copysign(cc, x);
}

}  // namespace tsm
