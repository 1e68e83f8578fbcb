// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// The four passes of radix 2 (see transforms/kwfft_passes.h): the DFT bodies
// of kwfft_r2.cpp in loops over blocks (leaf passes) and positions (twiddle
// passes), with the twiddle products taken as the values are loaded.
//
// Operations measured by the generator, per iteration (twiddle products
// included; loads include the twiddles):
//   kwfft_cx_notw_2     per block               4 additions    0 multiplications   4 loads   4 stores
//   kwfft_real_notw_2   per block               2 additions    0 multiplications   2 loads   2 stores
//   kwfft_cx_tw_2       per position k > 0      6 additions    4 multiplications   6 loads   4 stores
//   kwfft_real_tw_2     per pair k, m - k       6 additions    4 multiplications   6 loads   4 stores
//   kwfft_real_tw_2     middle, even m          1 additions    2 multiplications   4 loads   2 stores

#include <cstddef>

#include "transforms/generated/kwfft_codelet_passes.h"
#include "transforms/kwfft_codelets.h"

namespace tsm {

void kwfft_cx_notw_2(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in_re += is, in_im += is, out_re += 2 * os, out_im += 2 * os) {
    const double x0r = in_re[0];
    const double x1r = in_re[s];
    const double t0 = x0r + x1r;
    out_re[0] = t0;
    const double t1 = x0r - x1r;
    out_re[os] = t1;
    const double x0i = in_im[0];
    const double x1i = in_im[s];
    const double t2 = x0i + x1i;
    out_im[0] = t2;
    const double t3 = x0i - x1i;
    out_im[os] = t3;
  }
}

void kwfft_real_notw_2(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count) {
  const std::ptrdiff_t s = is * count;
  for (int32 i = 0; i < count; ++i, in += is, out += 2 * os) {
    const double x0 = in[0];
    const double x1 = in[s];
    const double t0 = x0 + x1;
    out[0] = t0;
    const double t1 = x0 - x1;
    out[os] = t1;
  }
}

void kwfft_cx_tw_2(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_cx_codelet_2(re, im, re, im, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; k < m; ++k, wc += 1, ws += 1) {
    f64* const pr = re + k * stride;
    f64* const pi = im + k * stride;
    const double x0r = pr[0];
    const double a1 = pr[s], b1 = pi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double t0 = x0r + x1r;
    pr[0] = t0;
    const double t1 = x0r - x1r;
    pr[s] = t1;
    const double x0i = pi[0];
    const double t2 = x0i + x1i;
    pi[0] = t2;
    const double t3 = x0i - x1i;
    pi[s] = t3;
  }
}

void kwfft_real_tw_2(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m) {
  const std::ptrdiff_t s = stride * m;
  kwfft_real_codelet_2(data, data, s, s);
  const f64* wc = tw_cos;
  const f64* ws = tw_sin;
  for (int32 k = 1; 2 * k < m; ++k, wc += 1, ws += 1) {
    f64* const lo = data + k * stride;
    f64* const hi = data + (m - k) * stride;
    const double x0r = lo[0];
    const double a1 = lo[s], b1 = hi[s];
    const double c1 = wc[0], d1 = ws[0];
    const double x1r = a1 * c1 - b1 * d1;
    const double x1i = a1 * d1 + b1 * c1;
    const double t0 = x0r + x1r;
    lo[0] = t0;
    const double t1 = x0r - x1r;
    const double x0i = hi[0];
    hi[0] = t1;
    const double t2 = x0i + x1i;
    hi[s] = t2;
    const double t3 = x1i - x0i;
    lo[s] = t3;
  }
  if (m % 2 == 0) {
    f64* const mid = data + (m / 2) * stride;
    const f64* const wc_mid = tw_cos + static_cast<std::ptrdiff_t>(m / 2 - 1) * 1;
    const f64* const ws_mid = tw_sin + static_cast<std::ptrdiff_t>(m / 2 - 1) * 1;
    const double x0r = mid[0];
    const double a1 = mid[s];
    const double x1r = a1 * wc_mid[0];
    const double x1i = a1 * ws_mid[0];
    mid[s] = x1i;
    const double t0 = x0r + x1r;
    mid[0] = t0;
  }
}

}  // namespace tsm
