// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 8, X[k] = sum_t x[t] exp(-2 pi i k t / 8), unscaled.
// Method: split radix: the even outputs by the half-length transform, the outputs 1 and 3 mod 4 by
//   quarter-length transforms after the rotations; rotations by odd multiples of pi/8 in three
//   multiplications.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_8          52 additions    4 multiplications    1 constants  16 loads  16 stores
//   kwfft_real_codelet_8        20 additions    2 multiplications    1 constants   8 loads   8 stores

#include <cstddef>

#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kSqrtHalf = 0.70710678118654752;

}  // namespace

void kwfft_cx_codelet_8(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
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
  const double x5r = in_re[5 * is];
  const double x5i = in_im[5 * is];
  const double x6r = in_re[6 * is];
  const double x6i = in_im[6 * is];
  const double x7r = in_re[7 * is];
  const double x7i = in_im[7 * is];
  const double t0 = x0r + x4r;
  const double t1 = x0i + x4i;
  const double t2 = x1r + x5r;
  const double t3 = x1i + x5i;
  const double t4 = x2r + x6r;
  const double t5 = x2i + x6i;
  const double t6 = x3r + x7r;
  const double t7 = x3i + x7i;
  const double t8 = t0 + t4;
  const double t9 = t1 + t5;
  const double t10 = t2 + t6;
  const double t11 = t3 + t7;
  const double t12 = t8 + t10;
  const double t13 = t9 + t11;
  const double t14 = t8 - t10;
  const double t15 = t9 - t11;
  const double t16 = t0 - t4;
  const double t17 = t1 - t5;
  const double t18 = t2 - t6;
  const double t19 = t3 - t7;
  const double t20 = t16 + t19;
  const double t21 = t17 - t18;
  const double t22 = t16 - t19;
  const double t23 = t17 + t18;
  const double t24 = x0r - x4r;
  const double t25 = x0i - x4i;
  const double t26 = x1r - x5r;
  const double t27 = x1i - x5i;
  const double t28 = x2r - x6r;
  const double t29 = x2i - x6i;
  const double t30 = x3r - x7r;
  const double t31 = x3i - x7i;
  const double t32 = t24 + t29;
  const double t33 = t25 - t28;
  const double t34 = t26 + t31;
  const double t35 = t27 - t30;
  const double t36 = t34 + t35;
  const double t37 = kSqrtHalf * t36;
  const double t38 = t34 - t35;
  const double t39 = kSqrtHalf * t38;
  const double t40 = t32 + t37;
  const double t41 = t33 - t39;
  const double t42 = t32 - t37;
  const double t43 = t33 + t39;
  const double t44 = t24 - t29;
  const double t45 = t25 + t28;
  const double t46 = t26 - t31;
  const double t47 = t27 + t30;
  const double t48 = t46 - t47;
  const double t49 = kSqrtHalf * t48;
  const double t50 = t46 + t47;
  const double t51 = kSqrtHalf * t50;
  const double t52 = t44 - t49;
  const double t53 = t45 - t51;
  const double t54 = t44 + t49;
  const double t55 = t45 + t51;
  out_re[0] = t12;
  out_im[0] = t13;
  out_re[os] = t40;
  out_im[os] = t41;
  out_re[2 * os] = t20;
  out_im[2 * os] = t21;
  out_re[3 * os] = t52;
  out_im[3 * os] = t53;
  out_re[4 * os] = t14;
  out_im[4 * os] = t15;
  out_re[5 * os] = t42;
  out_im[5 * os] = t43;
  out_re[6 * os] = t22;
  out_im[6 * os] = t23;
  out_re[7 * os] = t54;
  out_im[7 * os] = t55;
}

void kwfft_real_codelet_8(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double x2 = in[2 * is];
  const double x3 = in[3 * is];
  const double x4 = in[4 * is];
  const double x5 = in[5 * is];
  const double x6 = in[6 * is];
  const double x7 = in[7 * is];
  const double t0 = x0 + x4;
  const double t1 = x1 + x5;
  const double t2 = x2 + x6;
  const double t3 = x3 + x7;
  const double t4 = t0 + t2;
  const double t5 = t1 + t3;
  const double t6 = t4 + t5;
  const double t7 = t4 - t5;
  const double t8 = t0 - t2;
  const double t9 = t3 - t1;
  const double t10 = x0 - x4;
  const double t11 = x1 - x5;
  const double t12 = x2 - x6;
  const double t13 = x7 - x3;
  const double t14 = t11 + t13;
  const double t15 = kSqrtHalf * t14;
  const double t16 = t13 - t11;
  const double t17 = kSqrtHalf * t16;
  const double t18 = t10 + t15;
  const double t19 = t17 - t12;
  const double t20 = t10 - t15;
  const double t21 = t12 + t17;
  out[0] = t6;
  out[os] = t18;
  out[2 * os] = t8;
  out[3 * os] = t20;
  out[4 * os] = t7;
  out[5 * os] = t21;
  out[6 * os] = t9;
  out[7 * os] = t19;
}

}  // namespace tsm
