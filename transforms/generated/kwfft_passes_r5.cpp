// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// The four passes of radix 5 (see transforms/kwfft_passes.h): the DFT bodies
// of kwfft_r5.cpp in loops over blocks (leaf passes) and positions (twiddle
// passes), with the twiddle products taken as the values are loaded.
//
// Operations measured by the generator, per iteration (twiddle products
// included; loads include the twiddles):
//   kwfft_cx_notw_5     per block              34 additions   10 multiplications  10 loads  10 stores
//   kwfft_real_notw_5   per block              13 additions    5 multiplications   5 loads   5 stores
//   kwfft_cx_tw_5       per position k > 0     42 additions   26 multiplications  18 loads  10 stores
//   kwfft_real_tw_5     per pair k, m - k      42 additions   26 multiplications  18 loads  10 stores
//   kwfft_real_tw_5     middle, even m         26 additions   17 multiplications  13 loads   5 stores

#include <cstddef>

#include "transforms/generated/kwfft_codelet_passes.h"
#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kBase = 1.2500000000000000;
constexpr double kCos1 = 0.55901699437494742;
constexpr double kSin0 = 0.36327126400268044;
constexpr double kSin1 = 1.5388417685876267;
constexpr double kSin2 = 0.58778525229247313;

}  // namespace

void kwfft_cx_notw_5(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in_re += is, in_im += is, out_re += 5 * os, out_im += 5 * os) {
    const double x1r = in_re[s];
    const double x4r = in_re[4 * s];
    const double t0 = x1r + x4r;
    const double t1 = x1r - x4r;
    const double t2 = kSin0 * t1;
    const double x1i = in_im[s];
    const double x4i = in_im[4 * s];
    const double t3 = x1i + x4i;
    const double t4 = x1i - x4i;
    const double t5 = kSin0 * t4;
    const double x2r = in_re[2 * s];
    const double x3r = in_re[3 * s];
    const double t6 = x2r + x3r;
    const double t7 = x2r - x3r;
    const double t8 = t1 + t7;
    const double t9 = kSin2 * t8;
    const double t10 = t2 + t9;
    const double t11 = kSin1 * t7;
    const double t12 = t11 - t9;
    const double t13 = t0 + t6;
    const double t14 = t0 - t6;
    const double t15 = kCos1 * t14;
    const double t16 = kBase * t13;
    const double x0r = in_re[0];
    const double t17 = x0r + t13;
    out_re[0] = t17;
    const double t18 = t17 - t16;
    const double t19 = t18 + t15;
    const double t20 = t18 - t15;
    const double x2i = in_im[2 * s];
    const double x3i = in_im[3 * s];
    const double t21 = x2i + x3i;
    const double t22 = x2i - x3i;
    const double t23 = t4 + t22;
    const double t24 = kSin2 * t23;
    const double t25 = t5 + t24;
    const double t26 = kSin1 * t22;
    const double t27 = t26 - t24;
    const double t28 = t20 - t27;
    out_re[2 * os] = t28;
    const double t29 = t20 + t27;
    out_re[3 * os] = t29;
    const double t30 = t19 + t25;
    out_re[os] = t30;
    const double t31 = t19 - t25;
    out_re[4 * os] = t31;
    const double t32 = t3 + t21;
    const double t33 = t3 - t21;
    const double t34 = kCos1 * t33;
    const double t35 = kBase * t32;
    const double x0i = in_im[0];
    const double t36 = x0i + t32;
    out_im[0] = t36;
    const double t37 = t36 - t35;
    const double t38 = t37 + t34;
    const double t39 = t37 - t34;
    const double t40 = t12 + t39;
    out_im[2 * os] = t40;
    const double t41 = t39 - t12;
    out_im[3 * os] = t41;
    const double t42 = t38 - t10;
    out_im[os] = t42;
    const double t43 = t10 + t38;
    out_im[4 * os] = t43;
  }
}

void kwfft_real_notw_5(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in += is, out += 5 * os) {
    const double x1 = in[s];
    const double x4 = in[4 * s];
    const double t0 = x1 + x4;
    const double t1 = x4 - x1;
    const double t2 = kSin0 * t1;
    const double x2 = in[2 * s];
    const double x3 = in[3 * s];
    const double t3 = x2 + x3;
    const double t4 = x2 - x3;
    const double t5 = t4 - t1;
    const double t6 = kSin2 * t5;
    const double t7 = t2 - t6;
    out[4 * os] = t7;
    const double t8 = kSin1 * t4;
    const double t9 = t8 - t6;
    out[3 * os] = t9;
    const double t10 = t0 + t3;
    const double t11 = t0 - t3;
    const double t12 = kCos1 * t11;
    const double t13 = kBase * t10;
    const double x0 = in[0];
    const double t14 = x0 + t10;
    out[0] = t14;
    const double t15 = t14 - t13;
    const double t16 = t15 + t12;
    out[os] = t16;
    const double t17 = t15 - t12;
    out[2 * os] = t17;
  }
}

void kwfft_cx_tw_5(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_cx_codelet_5(re, im, re, im, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; k < m; ++k, wc += 4, ws += 4) {
    f64* const pr = re + k * stride;
    f64* const pi = im + k * stride;
    const double a1 = pr[s], b1 = pi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a4 = pr[4 * s], b4 = pi[4 * s];
    const double c4 = wc[3], d4 = ws[3];
    const double x4r = a4 * c4 - b4 * d4;
    const double x4i = a4 * d4 + b4 * c4;
    const double t0 = x1i + x4i;
    const double t1 = x1i - x4i;
    const double t2 = kSin0 * t1;
    const double t3 = x1r + x4r;
    const double t4 = x1r - x4r;
    const double t5 = kSin0 * t4;
    const double a2 = pr[2 * s], b2 = pi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double a3 = pr[3 * s], b3 = pi[3 * s];
    const double c3 = wc[2], d3 = ws[2];
    const double x3r = a3 * c3 - b3 * d3;
    const double x3i = a3 * d3 + b3 * c3;
    const double t6 = x2i + x3i;
    const double t7 = x2i - x3i;
    const double t8 = t1 + t7;
    const double t9 = kSin2 * t8;
    const double t10 = t2 + t9;
    const double t11 = kSin1 * t7;
    const double t12 = t11 - t9;
    const double t13 = t0 + t6;
    const double t14 = t0 - t6;
    const double t15 = kCos1 * t14;
    const double t16 = kBase * t13;
    const double t17 = x2r + x3r;
    const double t18 = x2r - x3r;
    const double t19 = t4 + t18;
    const double t20 = kSin2 * t19;
    const double t21 = t5 + t20;
    const double t22 = kSin1 * t18;
    const double t23 = t22 - t20;
    const double t24 = t3 + t17;
    const double t25 = t3 - t17;
    const double t26 = kCos1 * t25;
    const double t27 = kBase * t24;
    const double x0r = pr[0];
    const double t28 = x0r + t24;
    pr[0] = t28;
    const double t29 = t28 - t27;
    const double t30 = t29 + t26;
    const double t31 = t29 - t26;
    const double t32 = t31 - t12;
    pr[2 * s] = t32;
    const double t33 = t31 + t12;
    pr[3 * s] = t33;
    const double t34 = t30 + t10;
    pr[s] = t34;
    const double t35 = t30 - t10;
    pr[4 * s] = t35;
    const double x0i = pi[0];
    const double t36 = x0i + t13;
    pi[0] = t36;
    const double t37 = t36 - t16;
    const double t38 = t37 + t15;
    const double t39 = t37 - t15;
    const double t40 = t23 + t39;
    pi[2 * s] = t40;
    const double t41 = t39 - t23;
    pi[3 * s] = t41;
    const double t42 = t38 - t21;
    pi[s] = t42;
    const double t43 = t21 + t38;
    pi[4 * s] = t43;
  }
}

void kwfft_real_tw_5(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_real_codelet_5(data, data, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; 2 * k < m; ++k, wc += 4, ws += 4) {
    f64* const lo = data + k * stride;
    f64* const hi = data + (m - k) * stride;
    const double a1 = lo[s], b1 = hi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a4 = lo[4 * s], b4 = hi[4 * s];
    const double c4 = wc[3], d4 = ws[3];
    const double x4r = a4 * c4 - b4 * d4;
    const double x4i = a4 * d4 + b4 * c4;
    const double t0 = x1i + x4i;
    const double t1 = x1i - x4i;
    const double t2 = kSin0 * t1;
    const double t3 = x1r + x4r;
    const double t4 = x4r - x1r;
    const double t5 = kSin0 * t4;
    const double a2 = lo[2 * s], b2 = hi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double a3 = lo[3 * s], b3 = hi[3 * s];
    const double c3 = wc[2], d3 = ws[2];
    const double x3r = a3 * c3 - b3 * d3;
    const double x3i = a3 * d3 + b3 * c3;
    const double t6 = x2i + x3i;
    const double t7 = x2i - x3i;
    const double t8 = t1 + t7;
    const double t9 = kSin2 * t8;
    const double t10 = t2 + t9;
    const double t11 = kSin1 * t7;
    const double t12 = t11 - t9;
    const double t13 = t0 + t6;
    const double t14 = t0 - t6;
    const double t15 = kCos1 * t14;
    const double t16 = kBase * t13;
    const double t17 = x2r + x3r;
    const double t18 = x2r - x3r;
    const double t19 = t18 - t4;
    const double t20 = kSin2 * t19;
    const double t21 = t5 - t20;
    const double t22 = kSin1 * t18;
    const double t23 = t22 - t20;
    const double t24 = t3 + t17;
    const double t25 = t3 - t17;
    const double t26 = kCos1 * t25;
    const double t27 = kBase * t24;
    const double x0r = lo[0];
    const double t28 = x0r + t24;
    lo[0] = t28;
    const double t29 = t28 - t27;
    const double t30 = t29 + t26;
    const double t31 = t29 - t26;
    const double t32 = t31 - t12;
    lo[2 * s] = t32;
    const double t33 = t31 + t12;
    hi[s] = t33;
    const double t34 = t30 + t10;
    lo[s] = t34;
    const double t35 = t30 - t10;
    const double x0i = hi[0];
    hi[0] = t35;
    const double t36 = x0i + t13;
    hi[4 * s] = t36;
    const double t37 = t36 - t16;
    const double t38 = t37 + t15;
    const double t39 = t37 - t15;
    const double t40 = t23 + t39;
    hi[2 * s] = t40;
    const double t41 = t23 - t39;
    lo[3 * s] = t41;
    const double t42 = t21 + t38;
    hi[3 * s] = t42;
    const double t43 = t21 - t38;
    lo[4 * s] = t43;
  }
  if (m % 2 == 0) {
    f64* const mid = data + (m / 2) * stride;
    const f64* const wc_mid = tw_cos + static_cast<std::ptrdiff_t>(m / 2 - 1) * 4;
    const f64* const ws_mid = tw_sin + static_cast<std::ptrdiff_t>(m / 2 - 1) * 4;
    const double a1 = mid[s];
    const double x1r = a1 * wc_mid[0];
    const double x1i = a1 * ws_mid[0];
    const double a4 = mid[4 * s];
    const double x4r = a4 * wc_mid[3];
    const double x4i = a4 * ws_mid[3];
    const double t0 = x1i + x4i;
    const double t1 = x1i - x4i;
    const double t2 = kSin0 * t1;
    const double t3 = x1r + x4r;
    const double t4 = x1r - x4r;
    const double t5 = kSin0 * t4;
    const double a2 = mid[2 * s];
    const double x2r = a2 * wc_mid[1];
    const double x2i = a2 * ws_mid[1];
    const double a3 = mid[3 * s];
    const double x3r = a3 * wc_mid[2];
    const double x3i = a3 * ws_mid[2];
    const double t6 = x2i + x3i;
    const double t7 = x2i - x3i;
    const double t8 = t1 + t7;
    const double t9 = kSin2 * t8;
    const double t10 = t2 + t9;
    const double t11 = kSin1 * t7;
    const double t12 = t11 - t9;
    const double t13 = t0 + t6;
    mid[4 * s] = t13;
    const double t14 = t0 - t6;
    const double t15 = kCos1 * t14;
    const double t16 = kBase * t13;
    const double t17 = t13 - t16;
    const double t18 = t17 + t15;
    const double t19 = x2r + x3r;
    const double t20 = x2r - x3r;
    const double t21 = t4 + t20;
    const double t22 = kSin2 * t21;
    const double t23 = t5 + t22;
    const double t24 = t18 - t23;
    mid[3 * s] = t24;
    const double t25 = t3 + t19;
    const double t26 = t3 - t19;
    const double t27 = kCos1 * t26;
    const double t28 = kBase * t25;
    const double x0r = mid[0];
    const double t29 = x0r + t25;
    mid[0] = t29;
    const double t30 = t29 - t28;
    const double t31 = t30 + t27;
    const double t32 = t31 + t10;
    mid[s] = t32;
    const double t33 = t30 - t27;
    const double t34 = t33 - t12;
    mid[2 * s] = t34;
  }
}

}  // namespace tsm
