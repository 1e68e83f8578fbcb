// Riemann zeta function zeta(x) for real x.
//
// x < 0: the functional equation
//   zeta(x) = sin(pi x/2) (2 pi)^x Gamma(1 - x) zeta(1 - x) / pi,
//   declared an overflow below -30.8148 (+inf).
// Integers 0 to 30 from a table of zeta(n) - 1 (1 is the pole: +inf).
// 0 <= x < 1: 1 + R(x)/(S(x) (1 - x)), degree 5 each (S monic).
// 1 < x <= 10: 1 + x^2 P(1/x)/(2^x (1 - x) Q(1/x)), the pole held by the exact
//   factor 1 - x (P degree 8, Q monic degree 7).
// 10 < x <= 50: 1 + 2^-x + exp(A(x)/B(x)), degree 10 each (B monic).
// 50 < x < 127: 1 + (sum of n^-x over odd n >= 3, to MACHEP, plus 2^-x)
//   / (1 - 2^-x); from 127 up, 1. Plus infinity stays as it is.
//
// Accuracy against mpmath at 40 digits (docs/accuracy.md): max 5.8e-15
// relative on -30.8 .. 130 (envelope-relative below 0; 1 +- 1e-10 included).
#include "special/zeta.h"

#include <cmath>
#include <limits>

#include "special/common.h"
#include "special/gamma.h"
#include "special/zeta_coefficients.h"

namespace tsm {
namespace {

constexpr f64 kInf = std::numeric_limits<f64>::infinity();
constexpr f64 kPi = 3.141592653589793;
constexpr f64 kTwoPi = 6.283185307179586;
constexpr f64 kReflectionLimit = -30.8148;
constexpr f64 kAllOnes = 127.0;  // from here zeta(x) rounds to 1

}  // namespace

f64 RiemannZeta(f64 x) {
  if (IsNaNValue(x) || InfinitySign(x) > 0) return x;
  if (x < 0) {
    if (x < kReflectionLimit) return MathError(kMathOverflow, kInf);
    const f64 s = 1.0 - x;
    return std::sin(0.5 * kPi * x) * std::pow(kTwoPi, x) * GammaFn(s) * RiemannZeta(s) / kPi;
  }
  if (x >= kAllOnes) return 1.0;
  if (x == std::floor(x) && x < 31.0) {
    const int32 n = static_cast<int32>(x);
    if (n == 1) return MathError(kMathSingularity, kInf);
    return 1.0 + kZetaMinusOne[n];
  }
  if (x < 1.0) return 1.0 + PolyEval(x, kZetaR, 5) / (PolyEval1(x, kZetaS, 5) * (1.0 - x));
  if (x <= 10.0) {
    const f64 w = 1.0 / x;
    return 1.0 + x * x * PolyEval(w, kZetaP, 8) / (std::pow(2.0, x) * (1.0 - x) * PolyEval1(w, kZetaQ, 7));
  }
  if (x <= 50.0) return 1.0 + (std::pow(2.0, -x) + std::exp(PolyEval(x, kZetaA, 10) / PolyEval1(x, kZetaB, 10)));
  f64 s = 0.0, a = 1.0, b;
  do {
    a += 2.0;
    b = std::pow(a, -x);
    s += b;
  } while (b / s > kMachEp);
  b = std::pow(2.0, -x);
  return 1.0 + (s + b) / (1.0 - b);
}

}  // namespace tsm
