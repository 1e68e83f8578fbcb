// Kelvin functions of integer order n.
//
// ber_n + i bei_n = (x/2)^n e^(3 n pi i/4) sum_k (i x^2/4)^k / (k! (n + k)!),
// summed directly until a term falls to MACHEP of the sum; the phase
// 3 n pi/4 is 0.7853981633974483 times 3 (n mod 8). ker_n and kei_n follow
// from ber_n, bei_n with ln(x/2), the finite sum of n terms in (x/2)^-n and
// the series in psi(k + 1) + psi(n + k + 1) = -1.1544313298030664 + H_k +
// H_(n+k). Negative orders: f_-n = (-1)^n f_n. ker, kei need x > 0: x < 0 and
// NaN give NaN; x = 0 gives ker_0 = +inf, kei_0 = -pi/4, and NaN for n != 0.
//
// The series cancel: their terms reach about I_n(x) (ber, bei) and
// (|ln(x/2)| + ln(n + x + 2)) I_n(x) (ker, kei) while the functions grow or
// decay like e^(+-x/sqrt 2). Accuracy against mpmath at 40 digits
// (tools/special/accuracy_bessel.py, 10^4 x log-spaced in [1e-8, 30] for
// n = 0 and as many over seven other orders), relative to that scale of the
// terms: max 1.5e-15 for ber, bei and ker, kei. Relative to the functions
// the loss is about e^(x (1 - 1/sqrt 2)) for ber, bei and e^(x (1 + 1/sqrt 2))
// for ker, kei: ker, kei reach 5e-10 of their modulus at x = 10.
#include "special/kelvin.h"

#include <cmath>
#include <limits>

#include "special/common.h"
#include "special/gamma.h"

namespace tsm {
namespace {

constexpr f64 kQuarterPi = 0.7853981633974483;
constexpr f64 kMinusTwoEuler = -1.1544313298030664;

// (x/2)^n / n!, by a product that stops once it underflows.
f64 Leading(int32 n, f64 x) {
  f64 t = 1;
  for (int32 j = 1; j <= n && t != 0; ++j) t *= x / (2 * j);
  return t;
}

// The phase e^(i (3 n pi/4 + k pi/2)) as (cos, sin).
void Phase(int32 n, int32 k, f64* c, f64* s) {
  const f64 phi = kQuarterPi * (3 * (n % 8) + 2 * (k % 4));
  *c = std::cos(phi);
  *s = std::sin(phi);
}

// sum_k (i y)^k w_k / (k! (n + k)!) as real and imaginary parts, y = x^2/4,
// with weights w_k = 1 (plain) or psi(k + 1) + psi(n + k + 1) (log series).
void Series(int32 n, f64 x, bool log_weights, f64* re, f64* im) {
  const f64 y = x * x / 4;
  f64 t = Leading(n, x);  // (x/2)^n y^k / (k! (n + k)!)
  // psi(1) + psi(n + 1) = -2 Euler + H_n, summed directly for modest n
  f64 h = kMinusTwoEuler;
  if (n <= 64) {
    for (int32 j = 1; j <= n; ++j) h += 1.0 / j;
  } else {
    h = Digamma(n + 1.0) - kEuler;
  }
  f64 sr = 0, si = 0;
  for (int32 k = 0; t != 0; ++k) {
    const f64 term = log_weights ? t * h : t;
    switch (k % 4) {
      case 0: sr += term; break;
      case 1: si += term; break;
      case 2: sr -= term; break;
      default: si -= term; break;
    }
    const f64 size = log_weights ? std::fabs(t) * std::fmax(1.0, std::fabs(h)) : std::fabs(t);
    if (k > 0 && size <= kMachEp * (std::fabs(sr) + std::fabs(si))) break;
    t *= y / ((k + 1.0) * (n + k + 1.0));
    h += 1.0 / (k + 1) + 1.0 / (n + k + 1);
  }
  *re = sr;
  *im = si;
}

// Rotates the sums by the phase 3 n pi/4.
void Rotate(int32 n, f64 re, f64 im, f64* real, f64* imag) {
  f64 c, s;
  Phase(n, 0, &c, &s);
  *real = c * re - s * im;
  *imag = s * re + c * im;
}

// (-1)^n for the negative orders.
f64 OrderSign(int32 n) { return n < 0 && (n % 2) != 0 ? -1.0 : 1.0; }

int32 AbsOrder(int32 n) { return n == std::numeric_limits<int32>::min() ? std::numeric_limits<int32>::max() : (n < 0 ? -n : n); }

}  // namespace

void KelvinI(int32 n, f64 x, f64* ber, f64* bei) {
  if (IsNaNValue(x)) {
    *ber = *bei = x;
    return;
  }
  const int32 m = AbsOrder(n);
  f64 re, im;
  Series(m, x, false, &re, &im);
  Rotate(m, re, im, ber, bei);
  const f64 sign = OrderSign(n);
  *ber *= sign;
  *bei *= sign;
}

f64 KelvinSeries(int32 n, f64 x, bool real) {
  f64 ber, bei;
  KelvinI(n, x, &ber, &bei);
  return real ? ber : bei;
}

void KelvinK(int32 n, f64 x, f64* ker, f64* kei) {
  if (IsNaNValue(x) || x < 0) {
    *ker = *kei = MathError(kMathDomain, kNaN);
    return;
  }
  const int32 m = AbsOrder(n);
  if (x == 0) {
    *ker = MathError(kMathSingularity, m == 0 ? std::numeric_limits<f64>::infinity() : kNaN);
    *kei = m == 0 ? -kQuarterPi : kNaN;
    return;
  }
  f64 ber, bei, re, im, lr, li;
  Series(m, x, false, &re, &im);
  Rotate(m, re, im, &ber, &bei);
  Series(m, x, true, &re, &im);
  Rotate(m, re, im, &lr, &li);
  const f64 l = std::log(x / 2);
  f64 kr = -l * ber + kQuarterPi * bei + lr / 2;
  f64 ki = -l * bei - kQuarterPi * ber + li / 2;
  // 1/2 (x/2)^-n sum_{k<n} e^(i(3n/4 + k/2)pi) (n - k - 1)!/k! (x^2/4)^k, conjugated for kei
  if (m > 0) {
    const f64 y = x * x / 4;
    f64 t = 0.5;  // 1/2 (x/2)^-n (n - 1)!, built up without overflow where possible
    for (int32 j = 1; j < m && IsFiniteValue(t); ++j) t *= 2 * j / x;
    t *= 2 / x;
    f64 fr = 0, fi = 0;
    for (int32 k = 0; k < m; ++k) {
      f64 c, s;
      Phase(m, k, &c, &s);
      fr += c * t;
      fi += s * t;
      if (!IsFiniteValue(t)) break;  // the pole term alone decides
      t *= y / ((k + 1.0) * (m - k - 1.0 > 0 ? m - k - 1.0 : 1.0));
    }
    kr += fr;
    ki -= fi;
  }
  const f64 sign = OrderSign(n);
  *ker = sign * kr;
  *kei = sign * ki;
}

}  // namespace tsm
