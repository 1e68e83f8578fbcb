// Elliptic integrals and Jacobi elliptic functions, parameter m in [0, 1].
//
// EllipticK(m):  q = 1 - m; q < 7e-06: ln 4 - 0.5 ln q, otherwise
//                P(q) - ln(q) Q(q), P and Q of degree 10. m = 1 gives +inf.
// EllipticE(m):  P(q) - ln(q) q Q(q), degrees 10 and 9; E(1) = 1.
// EllipticF, EllipticEInc: phi is reduced by multiples of pi (each adding
//                2K or 2E), then the descending Landen transformation runs to
//                a relative tolerance of MACHEP; where tan(phi) exceeds 10 the
//                integral is taken from the complementary amplitude instead.
// JacobiElliptic: m < 1e-9 a first-order series in m, m >= 0.999999999 the
//                near-1 form in hyperbolic functions, otherwise the
//                arithmetic-geometric mean and its backward recurrence.
// Outside 0 <= m <= 1 everything is NaN (domain).
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_integrals.py,
// about 10^4 points each; tests/special_integrals holds the golden subset):
//   K      m in [0, 1 - 7e-06]                  relative  max 2.9e-16
//   K      q = 1 - m below 7e-06 (two-term form)  relative  up to 1.5e-6
//   E      m in [0, 1]                          relative  max 2.2e-16
//   F      phi in [-10, 10], m in [0, 1 - 1e-12]  relative  max 8.6e-16
//   Einc   same grid                            relative  max 6.5e-16
//   sn, cn, dn  u in [-10, 10], m < 0.999999999  absolute  max 5.0e-15
//   sn, cn, dn  m >= 0.999999999: the first-order form, about
//               ((1 - m)/4)^2 e^(2|u|)/4 absolute (1.7e-12 measured up to |u| = 10).
#include "special/elliptic.h"

#include <cmath>
#include <numbers>

#include "special/common.h"
#include "special/integrals_coefficients.h"

namespace tsm {
namespace {

constexpr f64 kPi = std::numbers::pi;
constexpr f64 kPiO2 = std::numbers::pi / 2;
constexpr f64 kLn4 = 1.3862943611198906;
constexpr f64 kKSmallQ = 7e-06;
constexpr f64 kJacobiSmallM = 1e-9;
constexpr f64 kJacobiNearOne = 0.999999999;

bool BadParameter(f64 m) { return !(m >= 0 && m <= 1); }

// Multiples of pi/2 (always even, so multiples of pi) to take off phi.
f64 HalfPiMultiples(f64 phi) {
  f64 n = std::floor(phi / kPiO2);
  if (std::fmod(n, 2.0) != 0) n += 1;
  return n;
}

// phi - n pi/2 with pi/2 carried in two parts: near the poles of tan the
// integrals amplify an error in the reduced phi by up to 1/sqrt(1 - m).
f64 ReduceHalfPi(f64 phi, f64 n) {
  constexpr f64 kPiO2Lo = 6.123233995736766e-17;  // pi/2 - kPiO2
  return std::fma(-n, kPiO2, phi) - n * kPiO2Lo;
}

// One descending Landen sweep from amplitude tangent t, complementary modulus
// b = sqrt(1 - m) and modulus c = sqrt(m). Returns the transformed amplitude
// (atan(t) + mod pi)/(d a) as F needs it; esum collects sum c_n sin(phi_n).
f64 LandenSweep(f64 phi, f64 t, f64 b, f64 m, f64* esum) {
  f64 a = 1, c = std::sqrt(m), d = 1, e = 0;
  int mod = 0;
  while (std::fabs(c / a) > kMachEp) {
    const f64 r = b / a;
    phi = phi + std::atan(t * r) + mod * kPi;
    mod = static_cast<int>((phi + kPiO2) / kPi);
    t = t * (1 + r) / (1 - r * t * t);
    c = (a - b) / 2;
    const f64 g = std::sqrt(a * b);
    a = (a + b) / 2;
    b = g;
    d += d;
    e += c * std::sin(phi);
  }
  *esum = e;
  return (std::atan(t) + mod * kPi) / (d * a);
}

// K from the full form P(q) - ln(q) Q(q) for 0 < q <= 1, which holds its
// accuracy down to the smallest q; the incomplete integrals use it near m = 1.
f64 CompleteK(f64 q) { return PolyEval(q, kEllipKP, 10) - std::log(q) * PolyEval(q, kEllipKQ, 10); }

}  // namespace

f64 EllipticK(f64 m) {
  if (IsNaNValue(m)) return m;
  if (BadParameter(m)) return MathError(kMathDomain, NAN);
  if (m == 1) return MathError(kMathSingularity, INFINITY);
  const f64 q = 1 - m;
  if (q < kKSmallQ) return kLn4 - 0.5 * std::log(q);
  return CompleteK(q);
}

f64 EllipticE(f64 m) {
  if (IsNaNValue(m)) return m;
  if (BadParameter(m)) return MathError(kMathDomain, NAN);
  const f64 q = 1 - m;
  if (q == 0) return 1;
  return PolyEval(q, kEllipEP, 10) - std::log(q) * q * PolyEval(q, kEllipEQ, 9);
}

f64 EllipticF(f64 phi, f64 m) {
  if (IsNaNValue(phi) || IsNaNValue(m)) return NAN;
  if (BadParameter(m)) return MathError(kMathDomain, NAN);
  if (!IsFiniteValue(phi)) return phi;
  if (m == 0) return phi;
  const f64 q = 1 - m;
  if (q == 0) {
    if (std::fabs(phi) >= kPiO2) return MathError(kMathSingularity, std::copysign(INFINITY, phi));
    return std::asinh(std::tan(phi));
  }
  const f64 npio2 = HalfPiMultiples(phi);
  // tan has period pi: take it from the unreduced phi, whose reduction
  // would round away what matters near its poles.
  const f64 tan_phi = std::tan(phi);
  f64 k = 0;
  if (npio2 != 0) {
    k = CompleteK(q);
    phi = ReduceHalfPi(phi, npio2);
  }
  const f64 sign = phi < 0 ? -1 : 1;
  phi = std::fabs(phi);
  const f64 b = std::sqrt(q);
  const f64 t = sign * tan_phi;
  f64 r;
  if (std::fabs(t) > 10 && std::fabs(1 / (b * t)) < 10) {
    // Near phi = pi/2: F(phi) = K - F(phi'), tan(phi') = 1/(b tan(phi)).
    const f64 e = std::atan(1 / (b * t));
    if (npio2 == 0) k = CompleteK(q);
    f64 unused;
    r = k - LandenSweep(e, std::tan(e), b, m, &unused);
  } else {
    f64 unused;
    r = LandenSweep(phi, t, b, m, &unused);
  }
  return sign * r + npio2 * k;
}

f64 EllipticEInc(f64 phi, f64 m) {
  if (IsNaNValue(phi) || IsNaNValue(m)) return NAN;
  if (BadParameter(m)) return MathError(kMathDomain, NAN);
  if (!IsFiniteValue(phi)) return phi;
  if (m == 0) return phi;
  const f64 npio2 = HalfPiMultiples(phi);
  const f64 tan_phi = std::tan(phi);  // as in EllipticF
  phi = ReduceHalfPi(phi, npio2);
  const f64 sign = phi < 0 ? -1 : 1;
  phi = std::fabs(phi);
  const f64 q = 1 - m;
  const f64 ecomp = EllipticE(m);
  f64 r;
  if (q == 0) {
    r = std::sin(phi);
  } else {
    const f64 b = std::sqrt(q);
    const f64 t = sign * tan_phi;
    const f64 k = CompleteK(q);
    if (std::fabs(t) > 10 && std::fabs(1 / (b * t)) < 10) {
      // E(phi) = E - E(phi') + m sin(phi) sin(phi'), tan(phi') = 1/(b tan(phi)).
      const f64 e = std::atan(1 / (b * t));
      f64 esum;
      const f64 f = LandenSweep(e, std::tan(e), b, m, &esum);
      r = ecomp + m * std::sin(phi) * std::sin(e) - (ecomp / k * f + esum);
    } else {
      f64 esum;
      const f64 f = LandenSweep(phi, t, b, m, &esum);
      r = ecomp / k * f + esum;
    }
  }
  return sign * r + npio2 * ecomp;
}

void JacobiElliptic(f64 u, f64 m, f64* sn, f64* cn, f64* dn, f64* phi) {
  if (IsNaNValue(u) || IsNaNValue(m) || BadParameter(m) || !IsFiniteValue(u)) {
    if (!IsNaNValue(u) && !IsNaNValue(m)) MathErrorHook(kMathKernel, kMathDomain);
    *sn = *cn = *dn = *phi = NAN;
    return;
  }
  if (m < kJacobiSmallM) {
    const f64 t = std::sin(u), b = std::cos(u);
    const f64 ai = 0.25 * m * (u - t * b);
    *sn = t - ai * b;
    *cn = b + ai * t;
    *phi = u - ai;
    *dn = 1 - 0.5 * m * t * t;
    return;
  }
  if (m >= kJacobiNearOne) {
    const f64 ai = 0.25 * (1 - m);
    const f64 b = std::cosh(u), t = std::tanh(u), sh = std::sinh(u);
    const f64 sech = 1 / b;
    *sn = t;
    *phi = 2 * std::atan(std::exp(u)) - kPiO2;
    *cn = *dn = sech;
    if (ai != 0) {
      *sn += ai * (t - u * sech * sech);
      *phi += ai * (sh - u * sech);
      *cn -= ai * t * (sh - u * sech);
      *dn += ai * t * (sh + u * sech);
    }
    return;
  }
  // Arithmetic-geometric mean, then back down from the limit amplitude.
  constexpr int kMaxSteps = 8;
  f64 a[kMaxSteps + 1], c[kMaxSteps + 1];
  a[0] = 1;
  c[0] = std::sqrt(m);
  f64 b = std::sqrt(1 - m);
  f64 twon = 1;
  int i = 0;
  while (std::fabs(c[i] / a[i]) > kMachEp && i < kMaxSteps) {
    const f64 ai = a[i];
    ++i;
    c[i] = (ai - b) / 2;
    const f64 g = std::sqrt(ai * b);
    a[i] = (ai + b) / 2;
    b = g;
    twon *= 2;
  }
  f64 ph = twon * a[i] * u;
  for (; i > 0; --i) ph = (std::asin(c[i] * std::sin(ph) / a[i]) + ph) / 2;
  *sn = std::sin(ph);
  *cn = std::cos(ph);
  // dn^2 = 1 - m sn^2 = (1 - m) + m cn^2: two positive terms, so dn is as
  // good as cn, also where cn vanishes.
  *dn = std::sqrt((1 - m) + m * *cn * *cn);
  *phi = ph;
}

}  // namespace tsm
