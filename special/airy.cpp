// Airy functions Ai, Ai', Bi, Bi' of a real argument.
//
// With zeta = 2/3 |x|^(3/2) and z = 1/zeta:
//   x < -2.09:        modulus and phase, theta = zeta + pi/4, the two smooth
//                     factors of each pair Chebyshev series in z;
//   x >= 2.09:        Ai and Ai' from their asymptotic forms, e^-zeta times a
//                     Chebyshev series in z;
//   x > 8.3203353:    Bi and Bi' likewise, e^zeta times a series in z;
//   otherwise:        the Maclaurin series (c1 f - c2 g, sqrt 3 (c1 f + c2 g)),
//                     summed to a relative term of MACHEP.
//   x > 103.892:      Ai = Ai' = 0, Bi = Bi' = the largest double (+inf at +inf);
//   x = -inf:         Ai = Bi = 0, Ai' and Bi' NaN.
// Coefficients: special/airy_coefficients.h (tools/special/fit_bessel.py).
//
// Accuracy against mpmath at 40 digits (tools/special/accuracy_bessel.py,
// 10^4 points on [-1000, 103.892] plus the break points), relative to the
// envelope of each function (its modulus where it oscillates):
//   max 9.5e-15 for |x| <= 20; beyond that about zeta eps (3.9e-12 at
//   x = -1000), the rounding of zeta itself.
#include "special/airy.h"

#include <cmath>
#include <limits>
#include <numbers>

#include "special/airy_coefficients.h"
#include "special/chebyshev.h"
#include "special/common.h"

namespace tsm {
namespace {

constexpr f64 kC1 = 0.355028053887817;   // Ai(0)
constexpr f64 kC2 = 0.258819403792807;   // -Ai'(0)
constexpr f64 kSqrt3 = 1.7320508075688772;
constexpr f64 kSqrtPi = 1.7724538509055160;
constexpr f64 kPiOver4 = 0.7853981633974483;

// Maclaurin series: f and g are the even and odd solutions, fd and gd their
// derivatives.
void Maclaurin(f64 x, f64* ai, f64* aip, f64* bi, f64* bip) {
  const f64 z = x * x * x;
  f64 f = 1, g = x, uf = 1, ug = x, k = 1, t = 1;
  while (t > kMachEp) {
    uf *= z / ((k + 1) * (k + 2));
    ug *= z / ((k + 2) * (k + 3));
    k += 3;
    f += uf;
    g += ug;
    t = std::fabs(uf / f);
  }
  // f' = x^2/2 + x^5/30 + ..., g' = 1 + x^3/3 + x^6/72 + ...
  f64 fd = x * x / 2, gd = 1 + z / 3, ud = fd, vd = z / 3;
  k = 4;
  t = 1;
  while (t > kMachEp) {
    ud *= z / ((k - 1) * (k + 1));
    vd *= z / (k * (k + 2));
    k += 3;
    fd += ud;
    gd += vd;
    t = std::fabs(vd / gd) + std::fabs(ud / (fd == 0 ? 1 : fd));
  }
  *ai = kC1 * f - kC2 * g;
  *bi = kSqrt3 * (kC1 * f + kC2 * g);
  *aip = kC1 * fd - kC2 * gd;
  *bip = kSqrt3 * (kC1 * fd + kC2 * gd);
}

}  // namespace

void AiryFunctions(f64 x, f64* ai, f64* aip, f64* bi, f64* bip) {
  if (IsNaNValue(x)) {
    *ai = *aip = *bi = *bip = x;
    return;
  }
  if (x > 103.892) {
    *ai = *aip = 0;
    *bi = *bip = InfinitySign(x) > 0 ? std::numeric_limits<f64>::infinity() : std::numeric_limits<f64>::max();
    return;
  }
  const f64 ax = std::fabs(x);
  const f64 r = std::sqrt(ax);
  const f64 zeta = 2 * ax * r / 3;
  const f64 q = std::sqrt(r);  // |x|^(1/4)
  if (x < -2.09) {
    if (InfinitySign(x) < 0) {  // Ai, Bi decay to 0; the derivatives oscillate unboundedly
      *ai = *bi = 0;
      *aip = *bip = MathError(kMathDomain, std::numeric_limits<f64>::quiet_NaN());
      return;
    }
    const f64 z = 1 / zeta;
    const f64 t = 2 * z / kAiryZPos - 1;
    const f64 theta = zeta + kPiOver4;
    const f64 s = std::sin(theta), c = std::cos(theta);
    const f64 f = ChebSeries(t, kAiryF), g = z * ChebSeries(t, kAiryG);
    const f64 k = 1 / (kSqrtPi * q);
    *ai = k * (s * f - c * g);
    *bi = k * (c * f + s * g);
    const f64 fp = ChebSeries(t, kAiryFp), gp = z * ChebSeries(t, kAiryGp);
    const f64 kp = q / kSqrtPi;
    *aip = -kp * (c * fp + s * gp);
    *bip = kp * (s * fp - c * gp);
    return;
  }
  if (x < 2.09) {
    Maclaurin(x, ai, aip, bi, bip);
    return;
  }
  const f64 z = 1 / zeta;
  const f64 e = std::exp(zeta);
  const f64 t = 2 * z / kAiryZPos - 1;
  *ai = ChebSeries(t, kAiryA) / (2 * kSqrtPi * q * e);
  *aip = -q * ChebSeries(t, kAiryAp) / (2 * kSqrtPi * e);
  if (x > 8.3203353) {
    const f64 tb = 2 * z / kAiryZBig - 1;
    *bi = ChebSeries(tb, kAiryB) * e / (kSqrtPi * q);
    *bip = q * ChebSeries(tb, kAiryBp) * e / kSqrtPi;
  } else {
    f64 ai_s, aip_s;
    Maclaurin(x, &ai_s, &aip_s, bi, bip);
  }
}

}  // namespace tsm
