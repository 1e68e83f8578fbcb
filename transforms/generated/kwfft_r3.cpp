// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// DFT of length 3, X[k] = sum_t x[t] exp(-2 pi i k t / 3), unscaled.
// Method: short prime form, primitive root 2; cosine side modulo z^1 - 1 = Phi1 (products: 1); sine
//   side modulo z^1 + 1 = Phi2 (products: 1); base X[0] - kBase (x[1] + ... + x[2]) with kBase =
//   3/2; kCos and kSin: the products of the two convolutions.
//
// Operations measured by the generator (additions include subtractions and
// negations; constants are the distinct multipliers):
//   kwfft_cx_codelet_3          12 additions    4 multiplications    2 constants   6 loads   6 stores
//   kwfft_real_codelet_3         4 additions    2 multiplications    2 constants   3 loads   3 stores

#include <cstddef>

#include "transforms/kwfft_codelets.h"

namespace tsm {
namespace {

constexpr double kBase = 1.5000000000000000;
constexpr double kSqrt3Half = 0.86602540378443865;

}  // namespace

void kwfft_cx_codelet_3(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,
                        std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0r = in_re[0];
  const double x0i = in_im[0];
  const double x1r = in_re[is];
  const double x1i = in_im[is];
  const double x2r = in_re[2 * is];
  const double x2i = in_im[2 * is];
  const double t0 = x1r + x2r;
  const double t1 = x1i + x2i;
  const double t2 = x1r - x2r;
  const double t3 = x1i - x2i;
  const double t4 = x0r + t0;
  const double t5 = kBase * t0;
  const double t6 = t4 - t5;
  const double t7 = kSqrt3Half * t2;
  const double t8 = x0i + t1;
  const double t9 = kBase * t1;
  const double t10 = t8 - t9;
  const double t11 = kSqrt3Half * t3;
  const double t12 = t6 + t11;
  const double t13 = t10 - t7;
  const double t14 = t6 - t11;
  const double t15 = t7 + t10;
  out_re[0] = t4;
  out_im[0] = t8;
  out_re[os] = t12;
  out_im[os] = t13;
  out_re[2 * os] = t14;
  out_im[2 * os] = t15;
}

void kwfft_real_codelet_3(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {
  const double x0 = in[0];
  const double x1 = in[is];
  const double x2 = in[2 * is];
  const double t0 = x1 + x2;
  const double t1 = x2 - x1;
  const double t2 = x0 + t0;
  const double t3 = kBase * t0;
  const double t4 = t2 - t3;
  const double t5 = kSqrt3Half * t1;
  out[0] = t2;
  out[os] = t4;
  out[2 * os] = t5;
}

}  // namespace tsm
