// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 7, X[k] = sum_t x[t] exp(-2 pi i k t / 7), unscaled.
// Method: short prime form, primitive root 3; cosine side modulo z^3 - 1 = Phi1 Phi3 (products: 1 +
//   3); sine side modulo z^3 + 1 = Phi2 Phi6 (products: 1 + 3); base X[0] - kBase (x[1] + ... +
//   x[6]) with kBase = 7/6; kCos and kSin: the products of the two convolutions.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_7          72 additions   16 multiplications    8 constants  14 loads  14 stores
//   kwfft_real_codelet_7        30 additions    8 multiplications    8 constants   7 loads   7 stores

#include <cstddef>

#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kBase = 1.1666666666666667;
constexpr double kCos1 = 0.73430220123575246;
constexpr double kCos2 = 0.79015646852540020;
constexpr double kCos3 = 0.055854267289647738;
constexpr double kSin0 = 0.44095855184409843;
constexpr double kSin1 = 0.87484229096165655;
constexpr double kSin2 = 0.34087293062393138;
constexpr double kSin3 = 0.53396936033772518;

}  // namespace

void kwfft_cx_codelet_7(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
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
  const double t0 = x1r + x6r;
  const double t1 = x1i + x6i;
  const double t2 = x2r + x5r;
  const double t3 = x2i + x5i;
  const double t4 = x3r + x4r;
  const double t5 = x3i + x4i;
  const double t6 = x1r - x6r;
  const double t7 = x1i - x6i;
  const double t8 = x2r - x5r;
  const double t9 = x2i - x5i;
  const double t10 = x3r - x4r;
  const double t11 = x3i - x4i;
  const double t12 = t0 + t2;
  const double t13 = t4 + t12;
  const double t14 = t0 - t4;
  const double t15 = t2 - t4;
  const double t16 = t14 - t15;
  const double t17 = x0r + t13;
  const double t18 = kBase * t13;
  const double t19 = t17 - t18;
  const double t20 = kCos1 * t14;
  const double t21 = kCos2 * t15;
  const double t22 = kCos3 * t16;
  const double t23 = t20 + t22;
  const double t24 = t21 + t22;
  const double t25 = t23 - t24;
  const double t26 = t19 - t25;
  const double t27 = t19 + t23;
  const double t28 = t19 - t24;
  const double t29 = t6 + t8;
  const double t30 = t10 - t29;
  const double t31 = t6 + t10;
  const double t32 = t8 + t10;
  const double t33 = t31 - t32;
  const double t34 = kSin0 * t30;
  const double t35 = kSin1 * t31;
  const double t36 = kSin2 * t32;
  const double t37 = kSin3 * t33;
  const double t38 = t35 - t37;
  const double t39 = t36 - t37;
  const double t40 = t38 - t39;
  const double t41 = t34 + t40;
  const double t42 = t34 - t38;
  const double t43 = t34 + t39;
  const double t44 = t1 + t3;
  const double t45 = t5 + t44;
  const double t46 = t1 - t5;
  const double t47 = t3 - t5;
  const double t48 = t46 - t47;
  const double t49 = x0i + t45;
  const double t50 = kBase * t45;
  const double t51 = t49 - t50;
  const double t52 = kCos1 * t46;
  const double t53 = kCos2 * t47;
  const double t54 = kCos3 * t48;
  const double t55 = t52 + t54;
  const double t56 = t53 + t54;
  const double t57 = t55 - t56;
  const double t58 = t51 - t57;
  const double t59 = t51 + t55;
  const double t60 = t51 - t56;
  const double t61 = t7 + t9;
  const double t62 = t11 - t61;
  const double t63 = t7 + t11;
  const double t64 = t9 + t11;
  const double t65 = t63 - t64;
  const double t66 = kSin0 * t62;
  const double t67 = kSin1 * t63;
  const double t68 = kSin2 * t64;
  const double t69 = kSin3 * t65;
  const double t70 = t67 - t69;
  const double t71 = t68 - t69;
  const double t72 = t70 - t71;
  const double t73 = t66 + t72;
  const double t74 = t66 - t70;
  const double t75 = t66 + t71;
  const double t76 = t27 - t74;
  const double t77 = t42 + t59;
  const double t78 = t27 + t74;
  const double t79 = t59 - t42;
  const double t80 = t26 + t73;
  const double t81 = t58 - t41;
  const double t82 = t26 - t73;
  const double t83 = t41 + t58;
  const double t84 = t28 - t75;
  const double t85 = t43 + t60;
  const double t86 = t28 + t75;
  const double t87 = t60 - t43;
  out_re[0] = t17;
  out_im[0] = t49;
  out_re[os] = t76;
  out_im[os] = t77;
  out_re[2 * os] = t84;
  out_im[2 * os] = t85;
  out_re[3 * os] = t80;
  out_im[3 * os] = t81;
  out_re[4 * os] = t82;
  out_im[4 * os] = t83;
  out_re[5 * os] = t86;
  out_im[5 * os] = t87;
  out_re[6 * os] = t78;
  out_im[6 * os] = t79;
}

void kwfft_real_codelet_7(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double x2 = in[2 * is];
  const double x3 = in[3 * is];
  const double x4 = in[4 * is];
  const double x5 = in[5 * is];
  const double x6 = in[6 * is];
  const double t0 = x1 + x6;
  const double t1 = x2 + x5;
  const double t2 = x3 + x4;
  const double t3 = x1 - x6;
  const double t4 = x2 - x5;
  const double t5 = x3 - x4;
  const double t6 = t0 + t1;
  const double t7 = t2 + t6;
  const double t8 = t0 - t2;
  const double t9 = t1 - t2;
  const double t10 = t8 - t9;
  const double t11 = x0 + t7;
  const double t12 = kBase * t7;
  const double t13 = t11 - t12;
  const double t14 = kCos1 * t8;
  const double t15 = kCos2 * t9;
  const double t16 = kCos3 * t10;
  const double t17 = t14 + t16;
  const double t18 = t15 + t16;
  const double t19 = t17 - t18;
  const double t20 = t13 - t19;
  const double t21 = t13 + t17;
  const double t22 = t13 - t18;
  const double t23 = t3 + t4;
  const double t24 = t5 - t23;
  const double t25 = t3 + t5;
  const double t26 = t4 + t5;
  const double t27 = t25 - t26;
  const double t28 = kSin0 * t24;
  const double t29 = kSin1 * t25;
  const double t30 = kSin2 * t26;
  const double t31 = kSin3 * t27;
  const double t32 = t29 - t31;
  const double t33 = t30 - t31;
  const double t34 = t33 - t32;
  const double t35 = t34 - t28;
  const double t36 = t28 - t32;
  const double t37 = t28 + t33;
  out[0] = t11;
  out[os] = t21;
  out[2 * os] = t22;
  out[3 * os] = t20;
  out[4 * os] = t35;
  out[5 * os] = t37;
  out[6 * os] = t36;
}

}  // namespace tsm
