// Bessel functions J_v(x), Y_v(x) of real order and the spherical j_n, y_n.
//
// Domain: any real order and x; J of non-integer order and Y need x >= 0.
// NaN or an infinite order gives NaN (domain hook); J_v(+inf) = Y_v(+inf) = 0.
// J: an integer order n is recognised exactly, with its parity taken modulo
//   16384 so that huge orders still have one; J_-n = (-1)^n J_n and
//   J_n(-x) = (-1)^n J_n(x). A negative x with a non-integer order is a
//   domain error (NaN). J_v(0) is 1 for v = 0, 0 for v > 0 or v a negative
//   integer, and an infinity of the sign of Gamma(v + 1) otherwise
//   (singularity). Orders 0 and 1 have their own Chebyshev kernels
//   (special/bessel_jy_core.cpp); other integer orders n recur from them:
//   upward below x (as Y does), downward from the continued fraction for
//   J'_n/J_n above x and beyond the power series. For nu = |v| otherwise:
//     x^2 < (nu + 1) MACHEP:  (x/2)^v / Gamma(v + 1);
//     deep below the turning point (Debye's leading exponent above 760):
//                             J = 0, Y = -inf;
//     x > t(nu) and nu < 3.6 sqrt(x), or nu >= 500 and x > 0.3 nu^2:
//                             Hankel's asymptotic expansion, if its terms
//                             reach the rounding; t = (0.0083 nu + 0.09) nu
//                             + 12.9 below order 26, else 0.9 nu;
//     x < max(2, 3.6 sqrt(nu)): the power series in long double;
//     nu < x, x >= 25:        Hankel's expansion at the fractional order and
//                             the next, then the recurrence upward;
//     otherwise:              the continued fraction for J'/J, downward
//                             recurrence, Temme's series (x < 2) or Steed's
//                             fraction for Hankel's form, normalised by the
//                             Wronskian.
//   A negative non-integer order reflects: J_-nu = cos(pi nu) J_nu -
//   sin(pi nu) Y_nu, with the sine and cosine exact at multiples of 1/2.
// Y: an order within 1e-8 of an integer n, |n| <= 2147483647, is taken as n:
//   Y0 and Y1 from their kernels, then the upward recurrence (stable for Y),
//   Y_-n = (-1)^n Y_n. Other orders as J without the power series: Temme's
//   series is the quotient (cos(pi v) J_v - J_-v)/sin(pi v) with its
//   cancellation removed; negative orders reflect, Y_-nu = sin(pi nu) J_nu +
//   cos(pi nu) Y_nu. x < 0 is a domain error; x = 0 gives the limit (-inf
//   for v >= 0; singularity). An overflow gives an infinity (overflow hook).
// Spherical: j_n = sqrt(pi/(2x)) J_(n+1/2), y_n likewise; negative orders
//   through j_n = (-1)^(m+1) y_m and y_n = (-1)^m j_m with m = -n-1; for
//   x < 0 the parities j_n(-x) = (-1)^n j_n(x), y_n(-x) = (-1)^(n+1) y_n(x);
//   j_0(0) = 1, j_n(0) = 0 and y_n(0) = -inf (singularity).
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_bessel_jy.py),
// relative to the modulus sqrt(J^2 + Y^2) where the functions oscillate and
// to the value where they are monotone (x < |v|), max over the grids of
// docs/accuracy.md:
//   orders 0 and 1, x in [1e-6, 1e4]:          J 1.2e-15, Y 1.5e-15;
//   |v| <= 100, x in [1e-6, 1e4]:              J 3.2e-15, Y 2.6e-15;
//   500 <= |v| <= 5000, x in [0.5, 1.3] |v|:   J 1.5e-15, Y 1.5e-15;
//   spherical, n in [-20, 100]:                j 2.2e-15, y 2.8e-15.
// The long double parts assume the 64-bit significand of x86-64.
#include "special/bessel_jy.h"

#include <cmath>
#include <cstdint>
#include <limits>
#include <numbers>

#include "special/bessel_jy_parts.h"
#include "special/common.h"

namespace tsm {
namespace {

constexpr f64 kInf = std::numeric_limits<f64>::infinity();
constexpr f64 kHalfPi = 1.5707963267948966;
constexpr f64 kIntegerTol = 1e-8;             // Y: orders this close to an integer are that integer
constexpr f64 kLargestIntegerOrder = 2147483647;
constexpr f64 kLargeOrder = 500;              // Hankel's form only for x/nu^2 above 0.3
constexpr f64 kParityModulus = 16384;         // parity of n from n mod 16384
constexpr f64 kParityScale = 6.103515625e-5;  // 1/16384
constexpr f64 kTemmeSteedSwitch = 2;
constexpr f64 kOutOfRange = 760;  // e^-760 is far below the smallest subnormal
constexpr f64 kUpwardFrom = 25;  // Hankel's expansion of orders below 2 reaches e^-50 from here

bool OddInteger(f64 an) { return std::fmod(an - kParityModulus * std::floor(an * kParityScale), 2.0) == 1; }

// The power series serves J_nu below x = 2 and, for larger orders, below
// 3.6 sqrt(nu), where its cancellation costs at most e^6.5 of long double's
// precision.
f64 SeriesLimit(f64 nu) { return std::fmax(kTemmeSteedSwitch, 3.6 * std::sqrt(nu)); }

// Hankel's expansion is tried beyond the classic boundary t(nu) for orders
// below 3.6 sqrt(x), and for large orders beyond x = 0.3 nu^2; it declines
// where its terms do not reach the rounding (near t they fall only to about
// e^-2x) or first grow too large.
bool HankelRegion(f64 nu, f64 x) {
  const f64 t = nu < 26 ? (0.0083 * nu + 0.09) * nu + 12.9 : 0.9 * nu;
  return (x > t && nu < 3.6 * std::sqrt(x)) || (nu >= kLargeOrder && x > 0.3 * nu * nu);
}

// Below the turning point, x = nu sech(a), J_nu(x) is about
// e^-nu(a - tanh a) / sqrt(2 pi nu tanh a) and Y_nu(x) minus twice its
// reciprocal: true when that exponent puts J below the subnormal range and Y
// beyond the largest double, with a wide margin.
bool BeyondRange(f64 nu, f64 x) {
  if (x >= nu) return false;
  const f64 z = x / nu, s = std::sqrt((1 - z) * (1 + z));
  const f64 e = nu * (std::log((1 + s) / z) - s) - 0.5 * std::log(2 * std::numbers::pi * nu * s);
  return e > kOutOfRange;
}

// J_nu and, if y is not null, Y_nu, for nu >= 0 and finite x > 0.
void JYNonNegative(f64 nu, f64 x, f64* j, f64* y) {
  if (BeyondRange(nu, x)) {  // spares a recurrence of about nu - x steps
    *j = 0;
    if (y) *y = -kInf;
    return;
  }
  if (HankelRegion(nu, x) && BesselJYHankel(nu, x, j, y)) return;
  if (!y) {
    if (x * x < (nu + 1) * kMachEp) {
      *j = static_cast<f64>(SeriesPrefactor(nu, x));
      return;
    }
    if (x < SeriesLimit(nu)) {
      *j = BesselPowerSeries(nu, x, -1);
      return;
    }
  }
  if (x >= kUpwardFrom && nu < x && BesselJYUpward(nu, x, j, y)) return;
  BesselJYSteed(nu, x, j, y);
}

// J_v or Y_v for a non-integer v and finite x > 0.
f64 NonIntegerOrder(f64 v, f64 x, bool second) {
  const f64 nu = std::fabs(v);
  f64 j, y;
  if (v >= 0) {
    JYNonNegative(nu, x, &j, second ? &y : nullptr);
    return second ? y : j;
  }
  if (!second && x * x < std::fabs(v + 1) * kMachEp) return static_cast<f64>(SeriesPrefactor(v, x));
  JYNonNegative(nu, x, &j, &y);
  f64 s, c;
  SinCosPi(nu, &s, &c);
  if (!std::isfinite(y)) return second ? (c == 0 ? s * j : -c * kInf) : (s == 0 ? c * j : s * kInf);
  return second ? s * j + c * y : c * j - s * y;
}

f64 Checked(f64 r) { return std::isfinite(r) ? r : MathError(kMathOverflow, r); }

}  // namespace

f64 BesselJ(f64 v, f64 x) {
  if (IsNaNValue(v) || IsNaNValue(x) || !IsFiniteValue(v)) return MathError(kMathDomain, kNaN);
  const bool integer = v == std::floor(v);
  f64 sign = 1;
  if (integer) {
    const bool odd = OddInteger(std::fabs(v));
    if (v < 0) {
      v = -v;
      if (odd) sign = -sign;
    }
    if (x < 0) {
      x = -x;
      if (odd) sign = -sign;
    }
  } else if (x < 0) {
    return MathError(kMathDomain, kNaN);
  }
  if (InfinitySign(x) > 0) return 0;
  if (x == 0) {
    if (v == 0) return 1;
    if (v > 0) return 0;
    return MathError(kMathSingularity, std::copysign(kInf, static_cast<f64>(std::tgamma(v + 1.0L))));
  }
  if (integer && v <= 1) {
    f64 j;
    BesselJY01(x, v == 0 ? &j : nullptr, v == 0 ? nullptr : &j, nullptr, nullptr);
    return sign * j;
  }
  if (integer && v < x) {  // the recurrence upward from J0 and J1 is neutral below x
    f64 a, b;
    BesselJY01(x, &a, &b, nullptr, nullptr);
    return sign * static_cast<f64>(BesselRecurUp(a, b, 1, x, static_cast<int64_t>(v) - 1));
  }
  if (integer && !BeyondRange(v, x) && x >= SeriesLimit(v)) return sign * BesselJIntegerDown(static_cast<int64_t>(v), x);
  if (integer) {
    f64 j;
    JYNonNegative(v, x, &j, nullptr);
    return sign * j;
  }
  return Checked(NonIntegerOrder(v, x, false));
}

f64 BesselY(f64 v, f64 x) {
  if (IsNaNValue(v) || IsNaNValue(x) || !IsFiniteValue(v) || x < 0) return MathError(kMathDomain, kNaN);
  const f64 n = std::nearbyint(v);
  const bool integer = std::fabs(v - n) <= kIntegerTol && std::fabs(n) <= kLargestIntegerOrder;
  const f64 sign = integer && n < 0 && OddInteger(-n) ? -1 : 1;
  if (x == 0) {
    if (integer || v > 0) return MathError(kMathSingularity, -sign * kInf);
    f64 s, c;
    SinCosPi(-v, &s, &c);
    return c == 0 ? 0 : MathError(kMathSingularity, -std::copysign(kInf, c));
  }
  if (InfinitySign(x) > 0) return 0;
  if (!integer) return Checked(NonIntegerOrder(v, x, true));
  const int64_t m = static_cast<int64_t>(std::fabs(n));
  if (BeyondRange(static_cast<f64>(m), x)) return MathError(kMathOverflow, -sign * kInf);
  f64 a, b;
  BesselJY01(x, nullptr, nullptr, &a, m == 0 ? nullptr : &b);
  if (m == 0) return a;
  const f64 r = static_cast<f64>(BesselRecurUp(a, b, 1, x, m - 1));
  return sign * (std::isfinite(r) ? r : MathError(kMathOverflow, -kInf));
}

f64 SphericalBesselJ(int32 n, f64 x) {
  if (IsNaNValue(x)) return MathError(kMathDomain, kNaN);
  if (n < 0) {
    const int64_t m = -static_cast<int64_t>(n) - 1;
    return (m % 2 == 0 ? -1 : 1) * SphericalBesselY(static_cast<int32>(m), x);
  }
  if (x < 0) return (n % 2 ? -1 : 1) * SphericalBesselJ(n, -x);
  if (x == 0) return n == 0 ? 1 : 0;
  if (InfinitySign(x) > 0) return 0;
  const f64 v = n + 0.5;
  // In long double the factor cannot push a small result out of range.
  if (x < SeriesLimit(v)) return BesselPowerSeries(v, x, -1, std::sqrt(static_cast<long double>(kHalfPi) / x));
  return std::sqrt(kHalfPi / x) * BesselJ(v, x);
}

f64 SphericalBesselY(int32 n, f64 x) {
  if (IsNaNValue(x)) return MathError(kMathDomain, kNaN);
  if (n < 0) {
    const int64_t m = -static_cast<int64_t>(n) - 1;
    return (m % 2 ? -1 : 1) * SphericalBesselJ(static_cast<int32>(m), x);
  }
  if (x < 0) return (n % 2 ? 1 : -1) * SphericalBesselY(n, -x);
  if (x == 0) return MathError(kMathSingularity, -kInf);
  if (InfinitySign(x) > 0) return 0;
  return Checked(std::sqrt(kHalfPi / x) * BesselY(n + 0.5, x));
}

}  // namespace tsm
