// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// The four passes of radix 8 (see transforms/kwfft_passes.h): the DFT bodies
// of kwfft_r8.cpp in loops over blocks (leaf passes) and positions (twiddle
// passes), with the twiddle products taken as the values are loaded.
//
// Operations measured by the generator, per iteration (twiddle products
// included; loads include the twiddles):
//   kwfft_cx_notw_8     per block              52 additions    4 multiplications  16 loads  16 stores
//   kwfft_real_notw_8   per block              20 additions    2 multiplications   8 loads   8 stores
//   kwfft_cx_tw_8       per position k > 0     66 additions   32 multiplications  30 loads  16 stores
//   kwfft_real_tw_8     per pair k, m - k      66 additions   32 multiplications  30 loads  16 stores
//   kwfft_real_tw_8     middle, even m         42 additions   18 multiplications  22 loads   8 stores

#include <cstddef>

#include "transforms/generated/kwfft_codelet_passes.h"
#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kSqrtHalf = 0.70710678118654752;

}  // namespace

void kwfft_cx_notw_8(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in_re += is, in_im += is, out_re += 8 * os, out_im += 8 * os) {
    const double x0r = in_re[0];
    const double x4r = in_re[4 * s];
    const double t0 = x0r + x4r;
    const double t1 = x0r - x4r;
    const double x0i = in_im[0];
    const double x4i = in_im[4 * s];
    const double t2 = x0i + x4i;
    const double t3 = x0i - x4i;
    const double x1r = in_re[s];
    const double x5r = in_re[5 * s];
    const double t4 = x1r + x5r;
    const double t5 = x1r - x5r;
    const double x1i = in_im[s];
    const double x5i = in_im[5 * s];
    const double t6 = x1i + x5i;
    const double t7 = x1i - x5i;
    const double x2r = in_re[2 * s];
    const double x6r = in_re[6 * s];
    const double t8 = x2r + x6r;
    const double t9 = x2r - x6r;
    const double t10 = t3 - t9;
    const double t11 = t3 + t9;
    const double t12 = t0 + t8;
    const double t13 = t0 - t8;
    const double x2i = in_im[2 * s];
    const double x6i = in_im[6 * s];
    const double t14 = x2i + x6i;
    const double t15 = x2i - x6i;
    const double t16 = t1 + t15;
    const double t17 = t1 - t15;
    const double t18 = t2 + t14;
    const double t19 = t2 - t14;
    const double x3r = in_re[3 * s];
    const double x7r = in_re[7 * s];
    const double t20 = x3r + x7r;
    const double t21 = x3r - x7r;
    const double t22 = t7 - t21;
    const double t23 = t7 + t21;
    const double t24 = t4 + t20;
    const double t25 = t4 - t20;
    const double t26 = t19 - t25;
    out_im[2 * os] = t26;
    const double t27 = t19 + t25;
    out_im[6 * os] = t27;
    const double t28 = t12 + t24;
    out_re[0] = t28;
    const double t29 = t12 - t24;
    out_re[4 * os] = t29;
    const double x3i = in_im[3 * s];
    const double x7i = in_im[7 * s];
    const double t30 = x3i + x7i;
    const double t31 = x3i - x7i;
    const double t32 = t5 + t31;
    const double t33 = t5 - t31;
    const double t34 = t33 - t23;
    const double t35 = t33 + t23;
    const double t36 = kSqrtHalf * t35;
    const double t37 = kSqrtHalf * t34;
    const double t38 = t17 - t37;
    out_re[3 * os] = t38;
    const double t39 = t17 + t37;
    out_re[7 * os] = t39;
    const double t40 = t11 - t36;
    out_im[3 * os] = t40;
    const double t41 = t11 + t36;
    out_im[7 * os] = t41;
    const double t42 = t32 + t22;
    const double t43 = t32 - t22;
    const double t44 = kSqrtHalf * t43;
    const double t45 = kSqrtHalf * t42;
    const double t46 = t16 + t45;
    out_re[os] = t46;
    const double t47 = t16 - t45;
    out_re[5 * os] = t47;
    const double t48 = t10 - t44;
    out_im[os] = t48;
    const double t49 = t10 + t44;
    out_im[5 * os] = t49;
    const double t50 = t6 + t30;
    const double t51 = t6 - t30;
    const double t52 = t13 + t51;
    out_re[2 * os] = t52;
    const double t53 = t13 - t51;
    out_re[6 * os] = t53;
    const double t54 = t18 + t50;
    out_im[0] = t54;
    const double t55 = t18 - t50;
    out_im[4 * os] = t55;
  }
}

void kwfft_real_notw_8(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in += is, out += 8 * os) {
    const double x0 = in[0];
    const double x4 = in[4 * s];
    const double t0 = x0 + x4;
    const double t1 = x0 - x4;
    const double x1 = in[s];
    const double x5 = in[5 * s];
    const double t2 = x1 + x5;
    const double t3 = x1 - x5;
    const double x2 = in[2 * s];
    const double x6 = in[6 * s];
    const double t4 = x2 + x6;
    const double t5 = x2 - x6;
    const double t6 = t0 + t4;
    const double t7 = t0 - t4;
    out[2 * os] = t7;
    const double x3 = in[3 * s];
    const double x7 = in[7 * s];
    const double t8 = x3 + x7;
    const double t9 = x7 - x3;
    const double t10 = t3 + t9;
    const double t11 = t9 - t3;
    const double t12 = kSqrtHalf * t11;
    const double t13 = kSqrtHalf * t10;
    const double t14 = t1 + t13;
    out[os] = t14;
    const double t15 = t1 - t13;
    out[3 * os] = t15;
    const double t16 = t12 - t5;
    out[7 * os] = t16;
    const double t17 = t5 + t12;
    out[5 * os] = t17;
    const double t18 = t2 + t8;
    const double t19 = t8 - t2;
    out[6 * os] = t19;
    const double t20 = t6 + t18;
    out[0] = t20;
    const double t21 = t6 - t18;
    out[4 * os] = t21;
  }
}

void kwfft_cx_tw_8(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_cx_codelet_8(re, im, re, im, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; k < m; ++k, wc += 7, ws += 7) {
    f64* const pr = re + k * stride;
    f64* const pi = im + k * stride;
    const double x0r = pr[0];
    const double a4 = pr[4 * s], b4 = pi[4 * s];
    const double c4 = wc[3], d4 = ws[3];
    const double x4r = a4 * c4 - b4 * d4;
    const double x4i = a4 * d4 + b4 * c4;
    const double t0 = x0r + x4r;
    const double t1 = x0r - x4r;
    const double x0i = pi[0];
    const double t2 = x0i + x4i;
    const double t3 = x0i - x4i;
    const double a1 = pr[s], b1 = pi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a5 = pr[5 * s], b5 = pi[5 * s];
    const double c5 = wc[4], d5 = ws[4];
    const double x5r = a5 * c5 - b5 * d5;
    const double x5i = a5 * d5 + b5 * c5;
    const double t4 = x1i + x5i;
    const double t5 = x1i - x5i;
    const double t6 = x1r + x5r;
    const double t7 = x1r - x5r;
    const double a2 = pr[2 * s], b2 = pi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double a6 = pr[6 * s], b6 = pi[6 * s];
    const double c6 = wc[5], d6 = ws[5];
    const double x6r = a6 * c6 - b6 * d6;
    const double x6i = a6 * d6 + b6 * c6;
    const double t8 = x2i + x6i;
    const double t9 = x2i - x6i;
    const double t10 = t1 + t9;
    const double t11 = t1 - t9;
    const double t12 = t2 + t8;
    const double t13 = t2 - t8;
    const double t14 = x2r + x6r;
    const double t15 = x2r - x6r;
    const double t16 = t3 - t15;
    const double t17 = t3 + t15;
    const double t18 = t0 + t14;
    const double t19 = t0 - t14;
    const double a3 = pr[3 * s], b3 = pi[3 * s];
    const double c3 = wc[2], d3 = ws[2];
    const double x3r = a3 * c3 - b3 * d3;
    const double x3i = a3 * d3 + b3 * c3;
    const double a7 = pr[7 * s], b7 = pi[7 * s];
    const double c7 = wc[6], d7 = ws[6];
    const double x7r = a7 * c7 - b7 * d7;
    const double x7i = a7 * d7 + b7 * c7;
    const double t20 = x3i + x7i;
    const double t21 = x3i - x7i;
    const double t22 = t7 + t21;
    const double t23 = t7 - t21;
    const double t24 = t4 + t20;
    const double t25 = t4 - t20;
    const double t26 = t19 + t25;
    pr[2 * s] = t26;
    const double t27 = t19 - t25;
    pr[6 * s] = t27;
    const double t28 = t12 + t24;
    pi[0] = t28;
    const double t29 = t12 - t24;
    pi[4 * s] = t29;
    const double t30 = x3r + x7r;
    const double t31 = x3r - x7r;
    const double t32 = t5 - t31;
    const double t33 = t5 + t31;
    const double t34 = t23 - t33;
    const double t35 = t23 + t33;
    const double t36 = kSqrtHalf * t35;
    const double t37 = kSqrtHalf * t34;
    const double t38 = t11 - t37;
    pr[3 * s] = t38;
    const double t39 = t11 + t37;
    pr[7 * s] = t39;
    const double t40 = t17 - t36;
    pi[3 * s] = t40;
    const double t41 = t17 + t36;
    pi[7 * s] = t41;
    const double t42 = t22 + t32;
    const double t43 = t22 - t32;
    const double t44 = kSqrtHalf * t43;
    const double t45 = kSqrtHalf * t42;
    const double t46 = t10 + t45;
    pr[s] = t46;
    const double t47 = t10 - t45;
    pr[5 * s] = t47;
    const double t48 = t16 - t44;
    pi[s] = t48;
    const double t49 = t16 + t44;
    pi[5 * s] = t49;
    const double t50 = t6 + t30;
    const double t51 = t6 - t30;
    const double t52 = t13 - t51;
    pi[2 * s] = t52;
    const double t53 = t13 + t51;
    pi[6 * s] = t53;
    const double t54 = t18 + t50;
    pr[0] = t54;
    const double t55 = t18 - t50;
    pr[4 * s] = t55;
  }
}

void kwfft_real_tw_8(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_real_codelet_8(data, data, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; 2 * k < m; ++k, wc += 7, ws += 7) {
    f64* const lo = data + k * stride;
    f64* const hi = data + (m - k) * stride;
    const double x0r = lo[0];
    const double a4 = lo[4 * s], b4 = hi[4 * s];
    const double c4 = wc[3], d4 = ws[3];
    const double x4r = a4 * c4 - b4 * d4;
    const double x4i = a4 * d4 + b4 * c4;
    const double t0 = x0r + x4r;
    const double t1 = x0r - x4r;
    const double x0i = hi[0];
    const double t2 = x0i + x4i;
    const double t3 = x0i - x4i;
    const double a1 = lo[s], b1 = hi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a5 = lo[5 * s], b5 = hi[5 * s];
    const double c5 = wc[4], d5 = ws[4];
    const double x5r = a5 * c5 - b5 * d5;
    const double x5i = a5 * d5 + b5 * c5;
    const double t4 = x1i + x5i;
    const double t5 = x1i - x5i;
    const double t6 = x1r + x5r;
    const double t7 = x1r - x5r;
    const double a2 = lo[2 * s], b2 = hi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double a6 = lo[6 * s], b6 = hi[6 * s];
    const double c6 = wc[5], d6 = ws[5];
    const double x6r = a6 * c6 - b6 * d6;
    const double x6i = a6 * d6 + b6 * c6;
    const double t8 = x2i + x6i;
    const double t9 = x2i - x6i;
    const double t10 = t1 + t9;
    const double t11 = t1 - t9;
    const double t12 = t2 + t8;
    const double t13 = t2 - t8;
    const double t14 = x2r + x6r;
    const double t15 = x2r - x6r;
    const double t16 = t3 - t15;
    const double t17 = t3 + t15;
    const double t18 = t0 + t14;
    const double t19 = t0 - t14;
    const double a3 = lo[3 * s], b3 = hi[3 * s];
    const double c3 = wc[2], d3 = ws[2];
    const double x3r = a3 * c3 - b3 * d3;
    const double x3i = a3 * d3 + b3 * c3;
    const double a7 = lo[7 * s], b7 = hi[7 * s];
    const double c7 = wc[6], d7 = ws[6];
    const double x7r = a7 * c7 - b7 * d7;
    const double x7i = a7 * d7 + b7 * c7;
    const double t20 = x3i + x7i;
    const double t21 = x3i - x7i;
    const double t22 = t7 + t21;
    const double t23 = t21 - t7;
    const double t24 = t4 + t20;
    const double t25 = t4 - t20;
    const double t26 = t19 + t25;
    lo[2 * s] = t26;
    const double t27 = t19 - t25;
    hi[s] = t27;
    const double t28 = t12 + t24;
    hi[7 * s] = t28;
    const double t29 = t24 - t12;
    lo[4 * s] = t29;
    const double t30 = x3r + x7r;
    const double t31 = x3r - x7r;
    const double t32 = t5 - t31;
    const double t33 = t5 + t31;
    const double t34 = t23 + t33;
    const double t35 = t23 - t33;
    const double t36 = kSqrtHalf * t35;
    const double t37 = kSqrtHalf * t34;
    const double t38 = t11 + t37;
    lo[3 * s] = t38;
    const double t39 = t11 - t37;
    hi[0] = t39;
    const double t40 = t17 + t36;
    hi[4 * s] = t40;
    const double t41 = t36 - t17;
    lo[7 * s] = t41;
    const double t42 = t22 + t32;
    const double t43 = t32 - t22;
    const double t44 = kSqrtHalf * t43;
    const double t45 = kSqrtHalf * t42;
    const double t46 = t10 + t45;
    lo[s] = t46;
    const double t47 = t10 - t45;
    hi[2 * s] = t47;
    const double t48 = t16 + t44;
    hi[6 * s] = t48;
    const double t49 = t44 - t16;
    lo[5 * s] = t49;
    const double t50 = t6 + t30;
    const double t51 = t30 - t6;
    const double t52 = t13 + t51;
    hi[5 * s] = t52;
    const double t53 = t51 - t13;
    lo[6 * s] = t53;
    const double t54 = t18 + t50;
    lo[0] = t54;
    const double t55 = t18 - t50;
    hi[3 * s] = t55;
  }
  if (m % 2 == 0) {
    f64* const mid = data + (m / 2) * stride;
    const f64* const wc_mid = tw_cos + static_cast<std::ptrdiff_t>(m / 2 - 1) * 7;
    const f64* const ws_mid = tw_sin + static_cast<std::ptrdiff_t>(m / 2 - 1) * 7;
    const double x0r = mid[0];
    const double a4 = mid[4 * s];
    const double x4r = a4 * wc_mid[3];
    const double x4i = a4 * ws_mid[3];
    const double t0 = x0r + x4r;
    const double t1 = x0r - x4r;
    const double a1 = mid[s];
    const double x1r = a1 * wc_mid[0];
    const double x1i = a1 * ws_mid[0];
    const double a5 = mid[5 * s];
    const double x5r = a5 * wc_mid[4];
    const double x5i = a5 * ws_mid[4];
    const double t2 = x1i + x5i;
    const double t3 = x1i - x5i;
    const double t4 = x1r + x5r;
    const double t5 = x1r - x5r;
    const double a2 = mid[2 * s];
    const double x2r = a2 * wc_mid[1];
    const double x2i = a2 * ws_mid[1];
    const double a6 = mid[6 * s];
    const double x6r = a6 * wc_mid[5];
    const double x6i = a6 * ws_mid[5];
    const double t6 = x2i + x6i;
    const double t7 = x2i - x6i;
    const double t8 = t1 + t7;
    const double t9 = t1 - t7;
    const double t10 = x4i + t6;
    const double t11 = x4i - t6;
    const double t12 = x2r + x6r;
    const double t13 = x2r - x6r;
    const double t14 = x4i + t13;
    const double t15 = t13 - x4i;
    const double t16 = t0 + t12;
    const double t17 = t0 - t12;
    const double a3 = mid[3 * s];
    const double x3r = a3 * wc_mid[2];
    const double x3i = a3 * ws_mid[2];
    const double a7 = mid[7 * s];
    const double x7r = a7 * wc_mid[6];
    const double x7i = a7 * ws_mid[6];
    const double t18 = x3i + x7i;
    const double t19 = x3i - x7i;
    const double t20 = t5 + t19;
    const double t21 = t5 - t19;
    const double t22 = t2 + t18;
    const double t23 = t10 + t22;
    mid[7 * s] = t23;
    const double t24 = t2 - t18;
    const double t25 = t17 + t24;
    mid[2 * s] = t25;
    const double t26 = x3r + x7r;
    const double t27 = x3r - x7r;
    const double t28 = t3 - t27;
    const double t29 = t3 + t27;
    const double t30 = t21 - t29;
    const double t31 = t21 + t29;
    const double t32 = kSqrtHalf * t31;
    const double t33 = t15 - t32;
    mid[4 * s] = t33;
    const double t34 = kSqrtHalf * t30;
    const double t35 = t9 - t34;
    mid[3 * s] = t35;
    const double t36 = t20 + t28;
    const double t37 = t28 - t20;
    const double t38 = kSqrtHalf * t37;
    const double t39 = t38 - t14;
    mid[6 * s] = t39;
    const double t40 = kSqrtHalf * t36;
    const double t41 = t8 + t40;
    mid[s] = t41;
    const double t42 = t4 + t26;
    const double t43 = t16 + t42;
    mid[0] = t43;
    const double t44 = t4 - t26;
    const double t45 = t11 - t44;
    mid[5 * s] = t45;
  }
}

}  // namespace tsm
