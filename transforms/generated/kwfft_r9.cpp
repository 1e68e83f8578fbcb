// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 9, X[k] = sum_t x[t] exp(-2 pi i k t / 9), unscaled.
// Method: short form over the units mod 9: a cosine convolution modulo z^2 + z + 1 and a sine
//   convolution modulo z^2 - z + 1 (their residues modulo z - 1 and z + 1 vanish), with x[0] -
//   (x[3] + x[6])/2 and (sqrt(3)/2)(x[3] - x[6]) in their place; X[0], X[3], X[6] by the radix-3
//   short form over the sums of the residue classes mod 3.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_9          88 additions   20 multiplications    9 constants  18 loads  18 stores
//   kwfft_real_codelet_9        36 additions   10 multiplications    9 constants   9 loads   9 stores

#include <cstddef>

#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kCos1 = 0.17364817766693035;
constexpr double kCos2 = 0.76604444311897804;
constexpr double kCos3 = 0.93969262078590838;
constexpr double kHalf = 0.50000000000000000;
constexpr double kSin1 = 0.98480775301220806;
constexpr double kSin2 = 0.64278760968653933;
constexpr double kSin3 = 0.34202014332566873;
constexpr double kSqrt3Half = 0.86602540378443865;
constexpr double kThreeHalves = 1.5000000000000000;

}  // namespace

void kwfft_cx_codelet_9(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
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
  const double t0 = x1r + x8r;
  const double t1 = x1i + x8i;
  const double t2 = x4r + x5r;
  const double t3 = x4i + x5i;
  const double t4 = x2r + x7r;
  const double t5 = x2i + x7i;
  const double t6 = x1r - x8r;
  const double t7 = x1i - x8i;
  const double t8 = x4r - x5r;
  const double t9 = x4i - x5i;
  const double t10 = x2r - x7r;
  const double t11 = x2i - x7i;
  const double t12 = x1r + x4r;
  const double t13 = x1i + x4i;
  const double t14 = x7r + t12;
  const double t15 = x7i + t13;
  const double t16 = x2r + x5r;
  const double t17 = x2i + x5i;
  const double t18 = x8r + t16;
  const double t19 = x8i + t17;
  const double t20 = x3r + x6r;
  const double t21 = x3i + x6i;
  const double t22 = x3r - x6r;
  const double t23 = x3i - x6i;
  const double t24 = t14 + t18;
  const double t25 = t15 + t19;
  const double t26 = t14 - t18;
  const double t27 = t15 - t19;
  const double t28 = x0r + t20;
  const double t29 = x0i + t21;
  const double t30 = t24 + t28;
  const double t31 = t25 + t29;
  const double t32 = kThreeHalves * t24;
  const double t33 = t30 - t32;
  const double t34 = t0 - t4;
  const double t35 = t2 - t4;
  const double t36 = t34 - t35;
  const double t37 = kHalf * t20;
  const double t38 = x0r - t37;
  const double t39 = kCos1 * t34;
  const double t40 = kCos2 * t35;
  const double t41 = kCos3 * t36;
  const double t42 = t39 - t41;
  const double t43 = t40 + t41;
  const double t44 = t42 + t43;
  const double t45 = t38 + t44;
  const double t46 = t38 - t42;
  const double t47 = t38 - t43;
  const double t48 = t6 + t10;
  const double t49 = t8 + t10;
  const double t50 = t48 - t49;
  const double t51 = kSqrt3Half * t22;
  const double t52 = kSin1 * t48;
  const double t53 = kSin2 * t49;
  const double t54 = kSin3 * t50;
  const double t55 = t52 - t54;
  const double t56 = t53 - t54;
  const double t57 = t55 - t56;
  const double t58 = t51 - t57;
  const double t59 = t51 + t55;
  const double t60 = t51 - t56;
  const double t61 = kThreeHalves * t25;
  const double t62 = t31 - t61;
  const double t63 = t1 - t5;
  const double t64 = t3 - t5;
  const double t65 = t63 - t64;
  const double t66 = kHalf * t21;
  const double t67 = x0i - t66;
  const double t68 = kCos1 * t63;
  const double t69 = kCos2 * t64;
  const double t70 = kCos3 * t65;
  const double t71 = t68 - t70;
  const double t72 = t69 + t70;
  const double t73 = t71 + t72;
  const double t74 = t67 + t73;
  const double t75 = t67 - t71;
  const double t76 = t67 - t72;
  const double t77 = t7 + t11;
  const double t78 = t9 + t11;
  const double t79 = t77 - t78;
  const double t80 = kSqrt3Half * t23;
  const double t81 = kSin1 * t77;
  const double t82 = kSin2 * t78;
  const double t83 = kSin3 * t79;
  const double t84 = t81 - t83;
  const double t85 = t82 - t83;
  const double t86 = t84 - t85;
  const double t87 = t80 - t86;
  const double t88 = t80 + t84;
  const double t89 = t80 - t85;
  const double t90 = t46 + t88;
  const double t91 = t75 - t59;
  const double t92 = t46 - t88;
  const double t93 = t59 + t75;
  const double t94 = t45 - t87;
  const double t95 = t58 + t74;
  const double t96 = t45 + t87;
  const double t97 = t74 - t58;
  const double t98 = t47 + t89;
  const double t99 = t76 - t60;
  const double t100 = t47 - t89;
  const double t101 = t60 + t76;
  const double t102 = kSqrt3Half * t26;
  const double t103 = kSqrt3Half * t27;
  const double t104 = t33 + t103;
  const double t105 = t62 - t102;
  const double t106 = t33 - t103;
  const double t107 = t62 + t102;
  out_re[0] = t30;
  out_im[0] = t31;
  out_re[os] = t90;
  out_im[os] = t91;
  out_re[2 * os] = t94;
  out_im[2 * os] = t95;
  out_re[3 * os] = t104;
  out_im[3 * os] = t105;
  out_re[4 * os] = t98;
  out_im[4 * os] = t99;
  out_re[5 * os] = t100;
  out_im[5 * os] = t101;
  out_re[6 * os] = t106;
  out_im[6 * os] = t107;
  out_re[7 * os] = t96;
  out_im[7 * os] = t97;
  out_re[8 * os] = t92;
  out_im[8 * os] = t93;
}

void kwfft_real_codelet_9(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double x2 = in[2 * is];
  const double x3 = in[3 * is];
  const double x4 = in[4 * is];
  const double x5 = in[5 * is];
  const double x6 = in[6 * is];
  const double x7 = in[7 * is];
  const double x8 = in[8 * is];
  const double t0 = x1 + x8;
  const double t1 = x4 + x5;
  const double t2 = x2 + x7;
  const double t3 = x1 - x8;
  const double t4 = x4 - x5;
  const double t5 = x2 - x7;
  const double t6 = x1 + x4;
  const double t7 = x7 + t6;
  const double t8 = x2 + x5;
  const double t9 = x8 + t8;
  const double t10 = x3 + x6;
  const double t11 = x6 - x3;
  const double t12 = t7 + t9;
  const double t13 = t9 - t7;
  const double t14 = x0 + t10;
  const double t15 = t12 + t14;
  const double t16 = kThreeHalves * t12;
  const double t17 = t15 - t16;
  const double t18 = t0 - t2;
  const double t19 = t1 - t2;
  const double t20 = t18 - t19;
  const double t21 = kHalf * t10;
  const double t22 = x0 - t21;
  const double t23 = kCos1 * t18;
  const double t24 = kCos2 * t19;
  const double t25 = kCos3 * t20;
  const double t26 = t23 - t25;
  const double t27 = t24 + t25;
  const double t28 = t26 + t27;
  const double t29 = t22 + t28;
  const double t30 = t22 - t26;
  const double t31 = t22 - t27;
  const double t32 = t3 + t5;
  const double t33 = t4 + t5;
  const double t34 = t32 - t33;
  const double t35 = kSqrt3Half * t11;
  const double t36 = kSin1 * t32;
  const double t37 = kSin2 * t33;
  const double t38 = kSin3 * t34;
  const double t39 = t36 - t38;
  const double t40 = t37 - t38;
  const double t41 = t40 - t39;
  const double t42 = t41 - t35;
  const double t43 = t35 - t39;
  const double t44 = t35 + t40;
  const double t45 = kSqrt3Half * t13;
  out[0] = t15;
  out[os] = t30;
  out[2 * os] = t29;
  out[3 * os] = t17;
  out[4 * os] = t31;
  out[5 * os] = t44;
  out[6 * os] = t45;
  out[7 * os] = t42;
  out[8 * os] = t43;
}

}  // namespace tsm
