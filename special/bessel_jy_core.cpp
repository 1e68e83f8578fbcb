// Building blocks of the Bessel J and Y kernels (special/bessel_jy.cpp):
// orders 0 and 1, the power series, Hankel's expansion and the continued
// fraction method.
//
// Orders 0 and 1: below x = 8, J0, J1/x and the smooth parts of Y0, Y1 (less
// their (2/pi) ln(x/2) J terms) are Chebyshev series in x^2/32 - 1; from 8 up,
// Hankel's form sqrt(2/(pi x)) (P cos chi -+ Q sin chi) with P and x Q/8
// Chebyshev series in 128/x^2 - 1. The phase chi = x - (n/2 + 1/4) pi is
// never rounded: cos chi and sin chi come from cos x and sin x (correctly
// reduced by the C library) and the exact sine and cosine of the multiple of
// pi/4. Coefficients: special/bessel_jy_coefficients.h
// (tools/special/fit_bessel_jy.py).
//
// The continued fraction method (Steed, Temme): the ratio f = J'_nu/J_nu by
// its continued fraction, then the recurrence downward to an order mu, from
// which upward would be stable for Y: |mu| <= 1/2 for x < 2, else mu about
// x. There Temme's series gives Y_mu and Y_(mu+1) (x < 2), or Steed's
// continued fraction gives p + iq = (J' + iY')/(J + iY), the logarithmic
// derivative of Hankel's function (x >= 2); the Wronskian J Y' - J' Y =
// 2/(pi x) then fixes J_mu, and Y climbs back to nu by the recurrence.
//
// Domain of these pieces: nu >= 0, x > 0 finite; bessel_jy.cpp handles the
// rest. The power series, both continued fractions and the recurrences run
// in long double, which their cancellation or length needs. Measured
// accuracy (tools/special/accuracy_bessel_jy.py): orders 0 and 1 to 1.2e-15
// (J) and 1.5e-15 (Y) of the modulus for x in [1e-6, 1e4]; the general
// orders as listed in bessel_jy.cpp.
#include <algorithm>
#include <cmath>
#include <complex>
#include <cstdint>
#include <limits>
#include <numbers>

#include "special/bessel_jy_coefficients.h"
#include "special/bessel_jy_parts.h"
#include "special/chebyshev.h"
#include "special/common.h"

namespace tsm {
namespace {

constexpr f64 kPi = std::numbers::pi;
constexpr f64 kTwoOverPi = 2 / std::numbers::pi;
constexpr f64 kTiny = 1e-300;
constexpr f64 kSqrtHalf = 0.7071067811865476;
constexpr int kRescaleExp = 800;              // rescaling of the downward recurrence
constexpr f64 kRescaleAt = 0x1p800;
constexpr long double kEpsLong = 1.0842021724855044e-19L;  // 2^-63
constexpr int kMaxTerms = 100000;
constexpr f64 kHankelHump = 16;  // largest term of Hankel's series accepted

}  // namespace

namespace {

// cos and sin of chi = x - (nu/2 + 1/4) pi, by the angle difference. The
// quarter turn is added after the reduction of nu/2: nu/2 + 1/4 itself may
// round (by 1e-14 of phase for orders near 64).
void HankelPhase(f64 nu, f64 x, f64* cchi, f64* schi) {
  f64 sh, ch;
  SinCosPi(std::fmod(nu / 2, 2.0), &sh, &ch);
  const f64 ca = (ch - sh) * kSqrtHalf, sa = (sh + ch) * kSqrtHalf;
  const f64 cx = std::cos(x), sx = std::sin(x);
  *cchi = cx * ca + sx * sa;
  *schi = sx * ca - cx * sa;
}

}  // namespace

void BesselJY01(f64 x, f64* j0, f64* j1, f64* y0, f64* y1) {
  if (x <= 8) {
    const f64 t = x * x / 32 - 1;
    // Y needs J of its order for the logarithmic part.
    const f64 a = j0 || y0 ? ChebSeries(t, kJ0Small) : 0;
    const f64 b = j1 || y1 ? x * ChebSeries(t, kJ1Small) : 0;
    if (j0) *j0 = a;
    if (j1) *j1 = b;
    if (!y0 && !y1) return;
    const f64 l = kTwoOverPi * std::log(x / 2);
    if (y0) *y0 = ChebSeries(t, kY0Small) + l * a;
    if (y1) *y1 = (ChebSeries(t, kY1Small) + x * l * b) / x;
    return;
  }
  // Hankel's form with the phases chi = x - pi/4 (order 0) and x - 3 pi/4
  // (order 1), both from one cos x and sin x.
  const f64 t = 128 / (x * x) - 1;
  const f64 k = std::sqrt(kTwoOverPi / x);
  const f64 cx = std::cos(x), sx = std::sin(x);
  const f64 cp = (cx + sx) * kSqrtHalf, cm = (sx - cx) * kSqrtHalf;  // cos, sin of x - pi/4
  if (j0 || y0) {
    const f64 p = ChebSeries(t, kP0Large), q = 8 / x * ChebSeries(t, kQ0Large);
    if (j0) *j0 = k * (p * cp - q * cm);
    if (y0) *y0 = k * (p * cm + q * cp);
  }
  if (j1 || y1) {
    // x - 3 pi/4 is x - pi/4 turned back by a quarter: cos = sin, sin = -cos
    const f64 p = ChebSeries(t, kP1Large), q = 8 / x * ChebSeries(t, kQ1Large);
    if (j1) *j1 = k * (p * cm + q * cp);
    if (y1) *y1 = k * (-p * cp + q * cm);
  }
}

long double SeriesPrefactor(f64 v, f64 x) {
  const long double h = static_cast<long double>(x) / 2;
  if (v >= 0 && v <= 1700 && v == std::floor(v)) {
    // (x/2)^n / n! as a product: far cheaper than the power and the gamma
    // function, and within long double's range wherever the result is.
    long double t = 1;
    for (int k = 1; k <= static_cast<int>(v) && t != 0; ++k) t *= h / k;
    return t;
  }
  const long double lp = v * std::log(h);
  // Within these bounds neither the power nor the gamma function leaves the
  // long double range; beyond them, through logarithms.
  if (std::fabs(lp) < 11000 && std::fabs(v) < 1700) return std::pow(h, static_cast<long double>(v)) / std::tgamma(v + 1.0L);
  int sign = 1;
  const long double lg = lgammal_r(v + 1.0L, &sign);
  return sign * std::exp(lp - lg);
}

f64 BesselPowerSeries(f64 v, f64 x, int sign, long double factor) {
  const long double y = sign * static_cast<long double>(x) * x / 4;
  long double term = 1, sum = 1;
  for (int k = 1; k < kMaxTerms; ++k) {
    term *= y / (k * (v + static_cast<long double>(k)));
    sum += term;
    // for negative orders the terms may still grow while v + k < 0
    if (v + k > 0 && std::fabs(term) <= kEpsLong * std::fabs(sum)) break;
  }
  return static_cast<f64>(factor * SeriesPrefactor(v, x) * sum);
}

long double BesselRecurUp(long double a, long double b, f64 m, f64 x, int64_t steps) {
  const long double xi = 2 / static_cast<long double>(x);
  for (int64_t k = 0; k < steps && std::isfinite(b); ++k) {
    const long double next = (m + k) * xi * b - a;
    a = b;
    b = next;
  }
  return b;
}

bool BesselJYHankel(f64 nu, f64 x, f64* j, f64* y) {
  const f64 mu = 4 * nu * nu;
  f64 p = 1, q = 0, term = 1;
  bool done = false;
  for (int k = 1; k < kMaxTerms; ++k) {
    const f64 a = 2 * k - 1;
    const f64 next = term * (mu - a * a) / (8 * k * x);
    if (std::fabs(next) > std::fabs(term) && a * a > mu) break;  // past the smallest term
    term = next;
    if (std::fabs(term) > kHankelHump) break;  // cancellation would cost too many digits
    switch (k & 3) {
      case 1: q += term; break;
      case 2: p -= term; break;
      case 3: q -= term; break;
      default: p += term; break;
    }
    if (std::fabs(term) <= 0.25 * kMachEp * (std::fabs(p) + std::fabs(q))) {
      done = true;
      break;
    }
  }
  if (!done) return false;
  f64 c, s;
  HankelPhase(nu, x, &c, &s);
  const f64 k = std::sqrt(kTwoOverPi / x);
  *j = k * (p * c - q * s);
  if (y) *y = k * (p * s + q * c);
  return true;
}

bool BesselJYUpward(f64 nu, f64 x, f64* j, f64* y) {
  const f64 n = std::floor(nu), mu = nu - n;
  f64 j0, y0, j1, y1;
  if (!BesselJYHankel(mu, x, &j0, &y0) || !BesselJYHankel(mu + 1, x, &j1, &y1)) return false;
  const int64_t steps = static_cast<int64_t>(n);
  *j = static_cast<f64>(steps == 0 ? j0 : BesselRecurUp(j0, j1, mu + 1, x, steps - 1));
  if (y) *y = static_cast<f64>(steps == 0 ? y0 : BesselRecurUp(y0, y1, mu + 1, x, steps - 1));
  return true;
}

namespace {

// f = J'_nu/J_nu by its continued fraction nu/x - 1/(2(nu+1)/x - 1/(...)),
// modified Lentz; *sign gets the sign of J_nu. Where nu < x the convergents
// oscillate for about x - nu terms and lose some 3 log10(x) digits in double:
// the fraction runs in long double.
f64 RatioCF(f64 nu, f64 x, int* sign) {
  using L = long double;
  const L xi = 1 / static_cast<L>(x);
  L f = nu * xi;
  if (f == 0) f = kTiny;
  L c = f, d = 0, b = 2 * nu * xi;
  *sign = 1;
  for (int i = 0; i < kMaxTerms; ++i) {
    b += 2 * xi;
    d = b - d;
    if (d == 0) d = kTiny;
    c = b - 1 / c;
    if (c == 0) c = kTiny;
    d = 1 / d;
    const L delta = c * d;
    f *= delta;
    if (d < 0) *sign = -*sign;
    if (std::fabs(delta - 1) < kEpsLong) break;
  }
  return static_cast<f64>(f);
}

// Temme's series for Y_mu and Y_(mu+1), |mu| <= 1/2, x < 2:
// Y_mu = -sum c_k g_k and Y_(mu+1) = -(2/x) sum c_k (p_k - k g_k), with
// c_k = (-x^2/4)^k / k!, g_k = f_k + (2/mu) sin^2(pi mu/2) q_k and
// f_k = (k f_(k-1) + p_(k-1) + q_(k-1)) / (k^2 - mu^2),
// p_k = p_(k-1)/(k - mu), q_k = q_(k-1)/(k + mu); the starting f_0 holds the
// limit of the quotient (cos(pi mu) J_mu - J_-mu)/sin(pi mu) through
// G1 and G2, smooth at mu = 0.
void TemmeY(f64 mu, f64 x, f64* ymu, f64* ymu1) {
  const f64 lg = -std::log(x / 2);
  const f64 sigma = mu * lg;
  const f64 g1 = ChebSeries(2 * mu, kTemmeG1), g2 = ChebSeries(2 * mu, kTemmeG2);
  const f64 rgamma_plus = g2 - mu * g1, rgamma_minus = g2 + mu * g1;  // 1/Gamma(1 +- mu)
  const f64 pimu = kPi * mu;
  const f64 pimu_over_sin = std::fabs(pimu) < 1e-9 ? 1 : pimu / std::sin(pimu);
  const f64 sinhc = std::fabs(sigma) < 1e-9 ? 1 + sigma * sigma / 6 : std::sinh(sigma) / sigma;
  const f64 e = std::exp(sigma);  // (2/x)^mu
  f64 fk = kTwoOverPi * pimu_over_sin * (g1 * std::cosh(sigma) + g2 * sinhc * lg);
  f64 pk = e / (rgamma_plus * kPi), qk = 1 / (e * rgamma_minus * kPi);
  const f64 half = pimu / 2;
  const f64 sinc_half = std::fabs(half) < 1e-9 ? 1 : std::sin(half) / half;
  const f64 r = kPi * half * sinc_half * sinc_half;  // (2/mu) sin^2(pi mu/2)
  f64 ck = 1, sum = fk + r * qk, sum1 = pk;
  const f64 z = -x * x / 4, mu2 = mu * mu;
  for (int k = 1; k < kMaxTerms; ++k) {
    fk = (k * fk + pk + qk) / (k * k - mu2);
    ck *= z / k;
    pk /= k - mu;
    qk /= k + mu;
    const f64 del = ck * (fk + r * qk);
    sum += del;
    const f64 del1 = ck * pk - k * del;
    sum1 += del1;
    if (std::fabs(del) < kMachEp / 4 * std::fabs(sum) && std::fabs(del1) < kMachEp / 4 * std::fabs(sum1)) break;
  }
  *ymu = -sum;
  *ymu1 = -sum1 * 2 / x;
}

// Steed's continued fraction for p + iq = (J'_mu + iY'_mu)/(J_mu + iY_mu),
// modified Lentz; in long double, since for mu near x it runs some
// 3 sqrt(x) terms (99 at x = 1000), whose rounding cost up to 5e-14 in
// double.
std::complex<f64> SteedCF(f64 mu, f64 x) {
  using C = std::complex<long double>;
  const C tiny(kTiny, 0);
  const long double mu2 = static_cast<long double>(mu) * mu;
  // K = a1/(b1 + a2/(b2 + ...)), a_k = (k - 1/2)^2 - mu^2, b_k = 2(x + ik)
  C f(2.0L * x, 2), c = f, d = 0;
  for (int k = 2; k < kMaxTerms; ++k) {
    const long double a = (k - 0.5L) * (k - 0.5L) - mu2;
    const C b(2.0L * x, 2.0L * k);
    d = b + a * d;
    if (d == 0.0L) d = tiny;
    c = b + a / c;
    if (c == 0.0L) c = tiny;
    d = 1.0L / d;
    const C delta = c * d;
    f *= delta;
    if (std::abs(delta - 1.0L) < kEpsLong) break;
  }
  const C k = (0.25L - mu2) / f;
  const C pq = C(-0.5L / x, 1) + C(0, 1) * k / static_cast<long double>(x);
  return {static_cast<f64>(pq.real()), static_cast<f64>(pq.imag())};
}

}  // namespace

namespace {

// The recurrence downward from J_nu = sign, J'_nu = sign f over `steps`
// orders, in long double, rescaled by 2^-800 when it grows past 2^800.
struct Downward {
  long double j, jp;  // J and J' at the last order, unnormalised
  int64_t scale = 0;  // number of rescalings
};

Downward RecurDown(f64 nu, f64 x, int64_t steps, int sign, f64 f) {
  using L = long double;
  const L xi = 1 / static_cast<L>(x);
  Downward d{static_cast<L>(sign), static_cast<L>(sign) * f};
  L k = nu;
  for (int64_t l = 0; l < steps; ++l) {
    const L jm = k * xi * d.j + d.jp;
    k -= 1;
    d.jp = k * xi * jm - d.j;
    d.j = jm;
    if (std::fabs(d.j) > kRescaleAt) {
      d.j = std::ldexp(d.j, -kRescaleExp);
      d.jp = std::ldexp(d.jp, -kRescaleExp);
      ++d.scale;
    }
  }
  return d;
}

// r times 2^(-800 scale).
f64 Unscaled(long double r, int64_t scale) {
  return static_cast<f64>(scale > 0 ? std::ldexp(r, static_cast<int>(std::max<int64_t>(-100000, -scale * kRescaleExp)))
                                    : r);
}

}  // namespace

f64 BesselJIntegerDown(int64_t n, f64 x) {
  int sign;
  const f64 f = RatioCF(static_cast<f64>(n), x, &sign);
  const Downward d = RecurDown(static_cast<f64>(n), x, n, sign, f);
  // d.j is J_0 and -d.jp is J_1, unnormalised: scale by the larger one.
  f64 j0, j1;
  BesselJY01(x, &j0, &j1, nullptr, nullptr);
  const long double r = std::fabs(j0) >= std::fabs(j1) ? sign * (j0 / d.j) : sign * (j1 / -d.jp);
  return Unscaled(r, d.scale);
}

void BesselJYSteed(f64 nu, f64 x, f64* j, f64* y) {
  const f64 steps = x < 2 ? std::floor(nu + 0.5) : std::fmax(0, std::floor(nu - x + 1.5));
  const int64_t nl = static_cast<int64_t>(steps);
  const f64 mu = nu - steps;
  int sign;
  const f64 f = RatioCF(nu, x, &sign);
  const Downward d = RecurDown(nu, x, nl, sign, f);
  const f64 w = kTwoOverPi / x;  // the Wronskian J Y' - J' Y
  const f64 fmu = static_cast<f64>(d.jp / d.j);
  f64 jmu, ymu, ymu1;
  if (x < 2) {
    TemmeY(mu, x, &ymu, &ymu1);
    const f64 ypmu = mu / x * ymu - ymu1;
    jmu = w / (ypmu - fmu * ymu);
  } else {
    const std::complex<f64> pq = SteedCF(mu, x);
    const f64 p = pq.real(), q = pq.imag();
    const f64 gamma = (p - fmu) / q;
    jmu = std::copysign(std::sqrt(w / (q * (1 + gamma * gamma))), static_cast<f64>(d.j));
    ymu = gamma * jmu;
    const f64 ypmu = p * ymu + q * jmu;
    ymu1 = mu / x * ymu - ypmu;
  }
  // J_nu = J_mu times (J_nu / J_mu) of the unnormalised recurrence
  *j = Unscaled(sign * (jmu / d.j), d.scale);
  if (!y) return;
  *y = static_cast<f64>(nl == 0 ? ymu : BesselRecurUp(ymu, ymu1, mu + 1, x, nl - 1));
  if (!std::isfinite(*y)) *y = -std::numeric_limits<f64>::infinity();
}

}  // namespace tsm
