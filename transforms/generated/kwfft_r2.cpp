// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 2, X[k] = sum_t x[t] exp(-2 pi i k t / 2), unscaled.
// Method: split radix: the even outputs by the half-length transform, the outputs 1 and 3 mod 4 by
//   quarter-length transforms after the rotations; rotations by odd multiples of pi/8 in three
//   multiplications.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_2           4 additions    0 multiplications    0 constants   4 loads   4 stores
//   kwfft_real_codelet_2         2 additions    0 multiplications    0 constants   2 loads   2 stores

#include <cstddef>

#include "transforms/kwfft_codelets.h"

namespace tsm {

void kwfft_cx_codelet_2(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
                        std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0r = in_re[0];
  const double x0i = in_im[0];
  const double x1r = in_re[is];
  const double x1i = in_im[is];
  const double t0 = x0r + x1r;
  const double t1 = x0i + x1i;
  const double t2 = x0r - x1r;
  const double t3 = x0i - x1i;
  out_re[0] = t0;
  out_im[0] = t1;
  out_re[os] = t2;
  out_im[os] = t3;
}

void kwfft_real_codelet_2(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double t0 = x0 + x1;
  const double t1 = x0 - x1;
  out[0] = t0;
  out[os] = t1;
}

}  // namespace tsm
