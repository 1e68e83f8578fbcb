// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// The four passes of radix 3 (see transforms/kwfft_passes.h): the DFT bodies
// of kwfft_r3.cpp in loops over blocks (leaf passes) and positions (twiddle
// passes), with the twiddle products taken as the values are loaded.
//
// Operations measured by the generator, per iteration (twiddle products
// included; loads include the twiddles):
//   kwfft_cx_notw_3     per block              12 additions    4 multiplications   6 loads   6 stores
//   kwfft_real_notw_3   per block               4 additions    2 multiplications   3 loads   3 stores
//   kwfft_cx_tw_3       per position k > 0     16 additions   12 multiplications  10 loads   6 stores
//   kwfft_real_tw_3     per pair k, m - k      16 additions   12 multiplications  10 loads   6 stores
//   kwfft_real_tw_3     middle, even m          6 additions    6 multiplications   7 loads   3 stores

#include <cstddef>

#include "transforms/generated/kwfft_codelet_passes.h"
#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kBase = 1.5000000000000000;
constexpr double kSqrt3Half = 0.86602540378443865;

}  // namespace

void kwfft_cx_notw_3(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in_re += is, in_im += is, out_re += 3 * os, out_im += 3 * os) {
    const double x1r = in_re[s];
    const double x2r = in_re[2 * s];
    const double t0 = x1r + x2r;
    const double t1 = x1r - x2r;
    const double t2 = kSqrt3Half * t1;
    const double t3 = kBase * t0;
    const double x0r = in_re[0];
    const double t4 = x0r + t0;
    out_re[0] = t4;
    const double t5 = t4 - t3;
    const double x1i = in_im[s];
    const double x2i = in_im[2 * s];
    const double t6 = x1i + x2i;
    const double t7 = x1i - x2i;
    const double t8 = kSqrt3Half * t7;
    const double t9 = t5 + t8;
    out_re[os] = t9;
    const double t10 = t5 - t8;
    out_re[2 * os] = t10;
    const double t11 = kBase * t6;
    const double x0i = in_im[0];
    const double t12 = x0i + t6;
    out_im[0] = t12;
    const double t13 = t12 - t11;
    const double t14 = t13 - t2;
    out_im[os] = t14;
    const double t15 = t2 + t13;
    out_im[2 * os] = t15;
  }
}

void kwfft_real_notw_3(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in += is, out += 3 * os) {
    const double x1 = in[s];
    const double x2 = in[2 * s];
    const double t0 = x1 + x2;
    const double t1 = x2 - x1;
    const double t2 = kSqrt3Half * t1;
    out[2 * os] = t2;
    const double t3 = kBase * t0;
    const double x0 = in[0];
    const double t4 = x0 + t0;
    out[0] = t4;
    const double t5 = t4 - t3;
    out[os] = t5;
  }
}

void kwfft_cx_tw_3(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_cx_codelet_3(re, im, re, im, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; k < m; ++k, wc += 2, ws += 2) {
    f64* const pr = re + k * stride;
    f64* const pi = im + k * stride;
    const double a1 = pr[s], b1 = pi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a2 = pr[2 * s], b2 = pi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double t0 = x1i + x2i;
    const double t1 = x1i - x2i;
    const double t2 = kSqrt3Half * t1;
    const double t3 = kBase * t0;
    const double t4 = x1r + x2r;
    const double t5 = x1r - x2r;
    const double t6 = kSqrt3Half * t5;
    const double t7 = kBase * t4;
    const double x0r = pr[0];
    const double t8 = x0r + t4;
    pr[0] = t8;
    const double t9 = t8 - t7;
    const double t10 = t9 + t2;
    pr[s] = t10;
    const double t11 = t9 - t2;
    pr[2 * s] = t11;
    const double x0i = pi[0];
    const double t12 = x0i + t0;
    pi[0] = t12;
    const double t13 = t12 - t3;
    const double t14 = t13 - t6;
    pi[s] = t14;
    const double t15 = t6 + t13;
    pi[2 * s] = t15;
  }
}

void kwfft_real_tw_3(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_real_codelet_3(data, data, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; 2 * k < m; ++k, wc += 2, ws += 2) {
    f64* const lo = data + k * stride;
    f64* const hi = data + (m - k) * stride;
    const double a1 = lo[s], b1 = hi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double a2 = lo[2 * s], b2 = hi[2 * s];
    const double c2 = wc[1], d2 = ws[1];
    const double x2r = a2 * c2 - b2 * d2;
    const double x2i = a2 * d2 + b2 * c2;
    const double t0 = x1i + x2i;
    const double t1 = x1i - x2i;
    const double t2 = kSqrt3Half * t1;
    const double t3 = kBase * t0;
    const double t4 = x1r + x2r;
    const double t5 = x2r - x1r;
    const double t6 = kSqrt3Half * t5;
    const double t7 = kBase * t4;
    const double x0r = lo[0];
    const double t8 = x0r + t4;
    lo[0] = t8;
    const double t9 = t8 - t7;
    const double t10 = t9 + t2;
    lo[s] = t10;
    const double t11 = t9 - t2;
    const double x0i = hi[0];
    hi[0] = t11;
    const double t12 = x0i + t0;
    hi[2 * s] = t12;
    const double t13 = t12 - t3;
    const double t14 = t6 + t13;
    hi[s] = t14;
    const double t15 = t6 - t13;
    lo[2 * s] = t15;
  }
  if (m % 2 == 0) {
    f64* const mid = data + (m / 2) * stride;
    const f64* const wc_mid = tw_cos + static_cast<std::ptrdiff_t>(m / 2 - 1) * 2;
    const f64* const ws_mid = tw_sin + static_cast<std::ptrdiff_t>(m / 2 - 1) * 2;
    const double a1 = mid[s];
    const double x1r = a1 * wc_mid[0];
    const double x1i = a1 * ws_mid[0];
    const double a2 = mid[2 * s];
    const double x2r = a2 * wc_mid[1];
    const double x2i = a2 * ws_mid[1];
    const double t0 = x1r + x2r;
    const double t1 = kBase * t0;
    const double t2 = x1i + x2i;
    mid[2 * s] = t2;
    const double t3 = x1i - x2i;
    const double t4 = kSqrt3Half * t3;
    const double x0r = mid[0];
    const double t5 = x0r + t0;
    mid[0] = t5;
    const double t6 = t5 - t1;
    const double t7 = t6 + t4;
    mid[s] = t7;
  }
}

}  // namespace tsm
