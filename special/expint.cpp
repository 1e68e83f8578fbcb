// Exponential integral E_n(x) for n >= 0 and x >= 0.
//
// n < 0 or x < 0: NaN (domain). x > MAXLOG (+inf included): 0. x = 0: +inf
// for n < 2 (singularity), else 1/(n - 1). n = 0: e^-x/x. n > 5000: the
// first terms of the expansion in 1/(x + n)^2. x > 1: the continued
// fraction, its convergents rescaled by 1/big when they exceed big. x <= 1:
// the power series with psi(n) = -Euler + sum_{k<n} 1/k.
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_integrals.py),
// relative error over 10^4 points, x log-spaced in [1e-8, 700] and n in
// {0, 1, 2, 3, 5, 10, 30, 100, 1000, 5000, 5001, 20000}, results in the normal
// range: max 2.7e-15 (the expansion for n above 5000: 1.4e-15 at n = 5001).
#include "special/expint.h"

#include <cmath>

#include "special/common.h"

namespace tsm {
namespace {

constexpr int32 kLargeOrder = 5000;

f64 ContinuedFraction(int32 n, f64 x) {
  Convergents cf{1, 1, x, x + n, 1 / (x + n)};
  int32 k = 1;
  f64 t;
  do {
    ++k;
    t = k & 1 ? cf.Step(n + (k - 1) / 2, 1) : cf.Step(k / 2, x);
  } while (t > kMachEp);
  return cf.value * std::exp(-x);
}

f64 PowerSeries(int32 n, f64 x) {
  f64 psi = -kEuler - std::log(x);
  for (int32 i = 1; i < n; ++i) psi += 1.0 / i;
  const f64 z = -x;
  f64 xk = 0, yk = 1, pk = 1 - n, t;
  f64 ans = n == 1 ? 0.0 : 1.0 / pk;
  do {
    xk += 1;
    yk *= z / xk;
    pk += 1;
    if (pk != 0) ans += yk / pk;
    t = ans != 0 ? std::fabs(yk / ans) : 1;
  } while (t > kMachEp);
  // (-x)^(n-1)/(n-1)! as a product, which underflows gracefully for large n.
  f64 lead = 1;
  for (int32 i = 1; i < n; ++i) lead *= z / i;
  return lead * psi - ans;
}

}  // namespace

f64 ExpIntegralN(int32 n, f64 x) {
  if (IsNaNValue(x)) return x;
  if (n < 0 || x < 0) return MathError(kMathDomain, NAN);
  if (x > kMaxLog) return 0;
  if (x == 0) {
    if (n < 2) return MathError(kMathSingularity, INFINITY);
    return 1.0 / (n - 1);
  }
  if (n == 0) return std::exp(-x) / x;
  if (n > kLargeOrder) {
    const f64 xk = x + n;
    const f64 yk = 1 / (xk * xk);
    const f64 t = n;
    f64 ans = yk * t * (6 * x * x - 8 * t * x + t * t);
    ans = yk * (ans + t * (t - 2 * x));
    ans = yk * (ans + t);
    return (ans + 1) * std::exp(-x) / xk;
  }
  if (x > 1) return ContinuedFraction(n, x);
  return PowerSeries(n, x);
}

}  // namespace tsm
