// Spence's function spence(x) = Li2(1 - x) for x >= 0.
//
// x < 0: NaN (domain); spence(0) = pi^2/6, spence(1) = 0, spence(+inf) = -inf.
// The argument is folded into w in [-0.5, 0.5], where spence(1 + w) =
// -w R(w), R a Chebyshev series: x > 2 goes to 1/x, then x > 1.5 takes
// w = 1/x - 1, x < 0.5 takes w = -x, else w = x - 1; the reflections
// spence(x) = pi^2/6 - ln(x) ln(1 - x) - spence(1 - x) and
// spence(1/x) = -ln(x)^2/2 - spence(x) undo the folding.
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_integrals.py),
// relative error over 10^4 x in [0, 3] and log-spaced in [1e-10, 1e10]: max 4.0e-16.
#include "special/dilog.h"

#include <cmath>

#include "special/chebyshev.h"
#include "special/common.h"
#include "special/integrals_coefficients.h"

namespace tsm {
namespace {

constexpr f64 kPiSquaredOver6 = 1.6449340668482264;

}  // namespace

f64 Dilogarithm(f64 x) {
  if (IsNaNValue(x)) return x;
  if (x < 0) return MathError(kMathDomain, NAN);
  if (x == 1) return 0;
  if (x == 0) return kPiSquaredOver6;
  if (!IsFiniteValue(x)) return -INFINITY;
  bool reflect = false, invert = false;
  if (x > 2) {
    x = 1 / x;
    invert = true;
  }
  f64 w;
  if (x > 1.5) {
    w = 1 / x - 1;
    invert = true;
  } else if (x < 0.5) {
    w = -x;
    reflect = true;
  } else {
    w = x - 1;
  }
  f64 y = -w * ChebSeries(2 * w, kSpence);
  if (reflect) y = kPiSquaredOver6 - std::log(x) * std::log1p(-x) - y;
  if (invert) {
    const f64 z = std::log(x);
    y = -0.5 * z * z - y;
  }
  return y;
}

}  // namespace tsm
