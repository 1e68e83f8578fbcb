// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 5, X[k] = sum_t x[t] exp(-2 pi i k t / 5), unscaled.
// Method: short prime form, primitive root 2; cosine side modulo z^2 - 1 = Phi1 Phi2 (products: 1 +
//   1); sine side modulo z^2 + 1 = Phi4 (products: 3); base X[0] - kBase (x[1] + ... + x[4]) with
//   kBase = 5/4; kCos and kSin: the products of the two convolutions.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_5          34 additions   10 multiplications    5 constants  10 loads  10 stores
//   kwfft_real_codelet_5        13 additions    5 multiplications    5 constants   5 loads   5 stores

#include <cstddef>

#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kBase = 1.2500000000000000;
constexpr double kCos1 = 0.55901699437494742;
constexpr double kSin0 = 0.36327126400268044;
constexpr double kSin1 = 1.5388417685876267;
constexpr double kSin2 = 0.58778525229247313;

}  // namespace

void kwfft_cx_codelet_5(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
                        std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0r = in_re[0];
  const double x0i = in_im[0];
  const double x1r = in_re[is];
  const double x1i = in_im[is];
  const double x2r = in_re[2 * is];
  const double x2i = in_im[2 * is];
  const double x3r = in_re[3 * is];
  const double x3i = in_im[3 * is];
  const double x4r = in_re[4 * is];
  const double x4i = in_im[4 * is];
  const double t0 = x1r + x4r;
  const double t1 = x1i + x4i;
  const double t2 = x2r + x3r;
  const double t3 = x2i + x3i;
  const double t4 = x1r - x4r;
  const double t5 = x1i - x4i;
  const double t6 = x2r - x3r;
  const double t7 = x2i - x3i;
  const double t8 = t0 + t2;
  const double t9 = t0 - t2;
  const double t10 = x0r + t8;
  const double t11 = kBase * t8;
  const double t12 = t10 - t11;
  const double t13 = kCos1 * t9;
  const double t14 = t12 + t13;
  const double t15 = t12 - t13;
  const double t16 = t4 + t6;
  const double t17 = kSin0 * t4;
  const double t18 = kSin1 * t6;
  const double t19 = kSin2 * t16;
  const double t20 = t17 + t19;
  const double t21 = t18 - t19;
  const double t22 = t1 + t3;
  const double t23 = t1 - t3;
  const double t24 = x0i + t22;
  const double t25 = kBase * t22;
  const double t26 = t24 - t25;
  const double t27 = kCos1 * t23;
  const double t28 = t26 + t27;
  const double t29 = t26 - t27;
  const double t30 = t5 + t7;
  const double t31 = kSin0 * t5;
  const double t32 = kSin1 * t7;
  const double t33 = kSin2 * t30;
  const double t34 = t31 + t33;
  const double t35 = t32 - t33;
  const double t36 = t14 + t34;
  const double t37 = t28 - t20;
  const double t38 = t14 - t34;
  const double t39 = t20 + t28;
  const double t40 = t15 - t35;
  const double t41 = t21 + t29;
  const double t42 = t15 + t35;
  const double t43 = t29 - t21;
  out_re[0] = t10;
  out_im[0] = t24;
  out_re[os] = t36;
  out_im[os] = t37;
  out_re[2 * os] = t40;
  out_im[2 * os] = t41;
  out_re[3 * os] = t42;
  out_im[3 * os] = t43;
  out_re[4 * os] = t38;
  out_im[4 * os] = t39;
}

void kwfft_real_codelet_5(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double x2 = in[2 * is];
  const double x3 = in[3 * is];
  const double x4 = in[4 * is];
  const double t0 = x1 + x4;
  const double t1 = x2 + x3;
  const double t2 = x4 - x1;
  const double t3 = x2 - x3;
  const double t4 = t0 + t1;
  const double t5 = t0 - t1;
  const double t6 = x0 + t4;
  const double t7 = kBase * t4;
  const double t8 = t6 - t7;
  const double t9 = kCos1 * t5;
  const double t10 = t8 + t9;
  const double t11 = t8 - t9;
  const double t12 = t3 - t2;
  const double t13 = kSin0 * t2;
  const double t14 = kSin1 * t3;
  const double t15 = kSin2 * t12;
  const double t16 = t13 - t15;
  const double t17 = t14 - t15;
  out[0] = t6;
  out[os] = t10;
  out[2 * os] = t11;
  out[3 * os] = t17;
  out[4 * os] = t16;
}

}  // namespace tsm
