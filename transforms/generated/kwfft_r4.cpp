// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 4, X[k] = sum_t x[t] exp(-2 pi i k t / 4), unscaled.
// Method: split radix: the even outputs by the half-length transform, the outputs 1 and 3 mod 4 by
//   quarter-length transforms after the rotations; rotations by odd multiples of pi/8 in three
//   multiplications.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_4          16 additions    0 multiplications    0 constants   8 loads   8 stores
//   kwfft_real_codelet_4         6 additions    0 multiplications    0 constants   4 loads   4 stores

#include <cstddef>

#include "transforms/kwfft_codelets.h"

namespace tsm {

void kwfft_cx_codelet_4(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
                        std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0r = in_re[0];
  const double x0i = in_im[0];
  const double x1r = in_re[is];
  const double x1i = in_im[is];
  const double x2r = in_re[2 * is];
  const double x2i = in_im[2 * is];
  const double x3r = in_re[3 * is];
  const double x3i = in_im[3 * is];
  const double t0 = x0r + x2r;
  const double t1 = x0i + x2i;
  const double t2 = x1r + x3r;
  const double t3 = x1i + x3i;
  const double t4 = t0 + t2;
  const double t5 = t1 + t3;
  const double t6 = t0 - t2;
  const double t7 = t1 - t3;
  const double t8 = x0r - x2r;
  const double t9 = x0i - x2i;
  const double t10 = x1r - x3r;
  const double t11 = x1i - x3i;
  const double t12 = t8 + t11;
  const double t13 = t9 - t10;
  const double t14 = t8 - t11;
  const double t15 = t9 + t10;
  out_re[0] = t4;
  out_im[0] = t5;
  out_re[os] = t12;
  out_im[os] = t13;
  out_re[2 * os] = t6;
  out_im[2 * os] = t7;
  out_re[3 * os] = t14;
  out_im[3 * os] = t15;
}

void kwfft_real_codelet_4(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double x2 = in[2 * is];
  const double x3 = in[3 * is];
  const double t0 = x0 + x2;
  const double t1 = x1 + x3;
  const double t2 = t0 + t1;
  const double t3 = t0 - t1;
  const double t4 = x0 - x2;
  const double t5 = x3 - x1;
  out[0] = t2;
  out[os] = t4;
  out[2 * os] = t3;
  out[3 * os] = t5;
}

}  // namespace tsm
