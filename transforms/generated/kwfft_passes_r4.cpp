// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// The four passes of radix 4 (see transforms/kwfft_passes.h): the DFT bodies
// of kwfft_r4.cpp in loops over blocks (leaf passes) and positions (twiddle
// passes), with the twiddle products taken as the values are loaded.
//
// Operations measured by the generator, per iteration (twiddle products
// included; loads include the twiddles):
//   kwfft_cx_notw_4     per block              16 additions    0 multiplications   8 loads   8 stores
//   kwfft_real_notw_4   per block               6 additions    0 multiplications   4 loads   4 stores
//   kwfft_cx_tw_4       per position k > 0     22 additions   12 multiplications  14 loads   8 stores
//   kwfft_real_tw_4     per pair k, m - k      22 additions   12 multiplications  14 loads   8 stores
//   kwfft_real_tw_4     middle, even m         10 additions    6 multiplications  10 loads   4 stores

#include <cstddef>

#include "transforms/generated/kwfft_codelet_passes.h"
#include "transforms/kwfft_codelets.h"

namespace tsm {

void kwfft_cx_notw_4(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in_re += is, in_im += is, out_re += 4 * os, out_im += 4 * os) {
    const double x0r = in_re[0];
    const double x2r = in_re[2 * s];
    const double t0 = x0r + x2r;
    const double t1 = x0r - x2r;
    const double x0i = in_im[0];
    const double x2i = in_im[2 * s];
    const double t2 = x0i + x2i;
    const double t3 = x0i - x2i;
    const double x1r = in_re[s];
    const double x3r = in_re[3 * s];
    const double t4 = x1r + x3r;
    const double t5 = x1r - x3r;
    const double t6 = t3 - t5;
    const double t7 = t3 + t5;
    const double t8 = t0 + t4;
    out_re[0] = t8;
    const double t9 = t0 - t4;
    out_re[2 * os] = t9;
    const double x1i = in_im[s];
    out_im[os] = t6;
    const double x3i = in_im[3 * s];
    out_im[3 * os] = t7;
    const double t10 = x1i + x3i;
    const double t11 = x1i - x3i;
    const double t12 = t1 + t11;
    out_re[os] = t12;
    const double t13 = t1 - t11;
    out_re[3 * os] = t13;
    const double t14 = t2 + t10;
    out_im[0] = t14;
    const double t15 = t2 - t10;
    out_im[2 * os] = t15;
  }
}

void kwfft_real_notw_4(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in += is, out += 4 * os) {
    const double x0 = in[0];
    const double x2 = in[2 * s];
    const double t0 = x0 + x2;
    const double t1 = x0 - x2;
    const double x1 = in[s];
    out[os] = t1;
    const double x3 = in[3 * s];
    const double t2 = x1 + x3;
    const double t3 = x3 - x1;
    out[3 * os] = t3;
    const double t4 = t0 + t2;
    out[0] = t4;
    const double t5 = t0 - t2;
    out[2 * os] = t5;
  }
}

void kwfft_cx_tw_4(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_cx_codelet_4(re, im, re, im, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; k < m; ++k, wc += 3, ws += 3) {
    f64* const pr = re + k * stride;
    f64* const pi = im + k * stride;
    const double x0r = pr[0];
    const double a2 = pr[2 * s], b2 = pi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double t0 = x0r + x2r;
    const double t1 = x0r - x2r;
    const double x0i = pi[0];
    const double t2 = x0i + x2i;
    const double t3 = x0i - x2i;
    const double a1 = pr[s], b1 = pi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a3 = pr[3 * s], b3 = pi[3 * s];
    const double c3 = wc[2], d3 = ws[2];
    const double x3r = a3 * c3 - b3 * d3;
    const double x3i = a3 * d3 + b3 * c3;
    const double t4 = x1i + x3i;
    const double t5 = x1i - x3i;
    const double t6 = t1 + t5;
    pr[s] = t6;
    const double t7 = t1 - t5;
    pr[3 * s] = t7;
    const double t8 = t2 + t4;
    pi[0] = t8;
    const double t9 = t2 - t4;
    pi[2 * s] = t9;
    const double t10 = x1r + x3r;
    const double t11 = x1r - x3r;
    const double t12 = t3 - t11;
    pi[s] = t12;
    const double t13 = t3 + t11;
    pi[3 * s] = t13;
    const double t14 = t0 + t10;
    pr[0] = t14;
    const double t15 = t0 - t10;
    pr[2 * s] = t15;
  }
}

void kwfft_real_tw_4(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_real_codelet_4(data, data, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; 2 * k < m; ++k, wc += 3, ws += 3) {
    f64* const lo = data + k * stride;
    f64* const hi = data + (m - k) * stride;
    const double x0r = lo[0];
    const double a2 = lo[2 * s], b2 = hi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double t0 = x0r + x2r;
    const double t1 = x0r - x2r;
    const double x0i = hi[0];
    const double t2 = x0i + x2i;
    const double t3 = x0i - x2i;
    const double a1 = lo[s], b1 = hi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a3 = lo[3 * s], b3 = hi[3 * s];
    const double c3 = wc[2], d3 = ws[2];
    const double x3r = a3 * c3 - b3 * d3;
    const double x3i = a3 * d3 + b3 * c3;
    const double t4 = x1i + x3i;
    const double t5 = x1i - x3i;
    const double t6 = t1 + t5;
    lo[s] = t6;
    const double t7 = t1 - t5;
    hi[0] = t7;
    const double t8 = t2 + t4;
    hi[3 * s] = t8;
    const double t9 = t4 - t2;
    lo[2 * s] = t9;
    const double t10 = x1r + x3r;
    const double t11 = x3r - x1r;
    const double t12 = t3 + t11;
    hi[2 * s] = t12;
    const double t13 = t11 - t3;
    lo[3 * s] = t13;
    const double t14 = t0 + t10;
    lo[0] = t14;
    const double t15 = t0 - t10;
    hi[s] = t15;
  }
  if (m % 2 == 0) {
    f64* const mid = data + (m / 2) * stride;
    const f64* const wc_mid = tw_cos + static_cast<std::ptrdiff_t>(m / 2 - 1) * 3;
    const f64* const ws_mid = tw_sin + static_cast<std::ptrdiff_t>(m / 2 - 1) * 3;
    const double x0r = mid[0];
    const double a2 = mid[2 * s];
    const double x2r = a2 * wc_mid[1];
    const double x2i = a2 * ws_mid[1];
    const double t0 = x0r + x2r;
    const double t1 = x0r - x2r;
    const double a1 = mid[s];
    const double x1r = a1 * wc_mid[0];
    const double x1i = a1 * ws_mid[0];
    const double a3 = mid[3 * s];
    const double x3r = a3 * wc_mid[2];
    const double x3i = a3 * ws_mid[2];
    const double t2 = x1i + x3i;
    const double t3 = x1i - x3i;
    const double t4 = t1 + t3;
    mid[s] = t4;
    const double t5 = x2i + t2;
    mid[3 * s] = t5;
    const double t6 = x1r + x3r;
    const double t7 = t0 + t6;
    mid[0] = t7;
    const double t8 = x3r - x1r;
    const double t9 = t8 - x2i;
    mid[2 * s] = t9;
  }
}

}  // namespace tsm
