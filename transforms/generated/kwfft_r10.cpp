// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 10, X[k] = sum_t x[t] exp(-2 pi i k t / 10), unscaled.
// Method: Good-Thomas 2 by 5, no twiddles.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_10         88 additions   20 multiplications    5 constants  20 loads  20 stores
//   kwfft_real_codelet_10       36 additions   10 multiplications    5 constants  10 loads  10 stores

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

void kwfft_cx_codelet_10(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
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
  const double x8r = in_re[8 * is];
  const double x8i = in_im[8 * is];
  const double x9r = in_re[9 * is];
  const double x9i = in_im[9 * is];
  const double t0 = x2r + x8r;
  const double t1 = x2i + x8i;
  const double t2 = x4r + x6r;
  const double t3 = x4i + x6i;
  const double t4 = x2r - x8r;
  const double t5 = x2i - x8i;
  const double t6 = x4r - x6r;
  const double t7 = x4i - x6i;
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
  const double t44 = x3r + x7r;
  const double t45 = x3i + x7i;
  const double t46 = x1r + x9r;
  const double t47 = x1i + x9i;
  const double t48 = x3r - x7r;
  const double t49 = x3i - x7i;
  const double t50 = x1r - x9r;
  const double t51 = x1i - x9i;
  const double t52 = t44 + t46;
  const double t53 = t44 - t46;
  const double t54 = x5r + t52;
  const double t55 = kBase * t52;
  const double t56 = t54 - t55;
  const double t57 = kCos1 * t53;
  const double t58 = t56 + t57;
  const double t59 = t56 - t57;
  const double t60 = t48 + t50;
  const double t61 = kSin0 * t48;
  const double t62 = kSin1 * t50;
  const double t63 = kSin2 * t60;
  const double t64 = t61 + t63;
  const double t65 = t62 - t63;
  const double t66 = t45 + t47;
  const double t67 = t45 - t47;
  const double t68 = x5i + t66;
  const double t69 = kBase * t66;
  const double t70 = t68 - t69;
  const double t71 = kCos1 * t67;
  const double t72 = t70 + t71;
  const double t73 = t70 - t71;
  const double t74 = t49 + t51;
  const double t75 = kSin0 * t49;
  const double t76 = kSin1 * t51;
  const double t77 = kSin2 * t74;
  const double t78 = t75 + t77;
  const double t79 = t76 - t77;
  const double t80 = t58 - t78;
  const double t81 = t64 + t72;
  const double t82 = t58 + t78;
  const double t83 = t64 - t72;
  const double t84 = t59 + t79;
  const double t85 = t65 - t73;
  const double t86 = t59 - t79;
  const double t87 = t65 + t73;
  const double t88 = t10 + t54;
  const double t89 = t24 + t68;
  const double t90 = t36 - t80;
  const double t91 = t37 - t81;
  const double t92 = t40 + t84;
  const double t93 = t41 - t85;
  const double t94 = t42 - t86;
  const double t95 = t43 - t87;
  const double t96 = t38 + t82;
  const double t97 = t39 - t83;
  const double t98 = t10 - t54;
  const double t99 = t24 - t68;
  const double t100 = t36 + t80;
  const double t101 = t37 + t81;
  const double t102 = t40 - t84;
  const double t103 = t41 + t85;
  const double t104 = t42 + t86;
  const double t105 = t43 + t87;
  const double t106 = t38 - t82;
  const double t107 = t39 + t83;
  out_re[0] = t88;
  out_im[0] = t89;
  out_re[os] = t90;
  out_im[os] = t91;
  out_re[2 * os] = t92;
  out_im[2 * os] = t93;
  out_re[3 * os] = t94;
  out_im[3 * os] = t95;
  out_re[4 * os] = t96;
  out_im[4 * os] = t97;
  out_re[5 * os] = t98;
  out_im[5 * os] = t99;
  out_re[6 * os] = t100;
  out_im[6 * os] = t101;
  out_re[7 * os] = t102;
  out_im[7 * os] = t103;
  out_re[8 * os] = t104;
  out_im[8 * os] = t105;
  out_re[9 * os] = t106;
  out_im[9 * os] = t107;
}

void kwfft_real_codelet_10(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double x2 = in[2 * is];
  const double x3 = in[3 * is];
  const double x4 = in[4 * is];
  const double x5 = in[5 * is];
  const double x6 = in[6 * is];
  const double x7 = in[7 * is];
  const double x8 = in[8 * is];
  const double x9 = in[9 * is];
  const double t0 = x2 + x8;
  const double t1 = x4 + x6;
  const double t2 = x2 - x8;
  const double t3 = x4 - x6;
  const double t4 = t0 + t1;
  const double t5 = t0 - t1;
  const double t6 = x0 + t4;
  const double t7 = kBase * t4;
  const double t8 = t6 - t7;
  const double t9 = kCos1 * t5;
  const double t10 = t8 + t9;
  const double t11 = t8 - t9;
  const double t12 = t2 + t3;
  const double t13 = kSin0 * t2;
  const double t14 = kSin1 * t3;
  const double t15 = kSin2 * t12;
  const double t16 = t13 + t15;
  const double t17 = t14 - t15;
  const double t18 = x3 + x7;
  const double t19 = x1 + x9;
  const double t20 = x3 - x7;
  const double t21 = x9 - x1;
  const double t22 = t18 + t19;
  const double t23 = t18 - t19;
  const double t24 = x5 + t22;
  const double t25 = kBase * t22;
  const double t26 = t24 - t25;
  const double t27 = kCos1 * t23;
  const double t28 = t26 + t27;
  const double t29 = t26 - t27;
  const double t30 = t21 - t20;
  const double t31 = kSin0 * t20;
  const double t32 = kSin1 * t21;
  const double t33 = kSin2 * t30;
  const double t34 = t33 - t31;
  const double t35 = t32 - t33;
  const double t36 = t6 + t24;
  const double t37 = t10 - t28;
  const double t38 = t34 - t16;
  const double t39 = t11 + t29;
  const double t40 = t17 + t35;
  const double t41 = t11 - t29;
  const double t42 = t35 - t17;
  const double t43 = t10 + t28;
  const double t44 = t16 + t34;
  const double t45 = t6 - t24;
  out[0] = t36;
  out[os] = t37;
  out[2 * os] = t39;
  out[3 * os] = t41;
  out[4 * os] = t43;
  out[5 * os] = t45;
  out[6 * os] = t44;
  out[7 * os] = t42;
  out[8 * os] = t40;
  out[9 * os] = t38;
}

}  // namespace tsm
