// An independent DFT for checking the engine: Bluestein's chirp over a
// radix-2 FFT, all in long double, every twiddle and chirp evaluated
// directly with cosl/sinl. Good to about 1e-18 relative: three orders
// below what float64 transforms are held to.
#pragma once

#include <cmath>
#include <complex>
#include <cstdint>
#include <vector>

namespace tsmtest {

using CxL = std::complex<long double>;

inline constexpr long double kPiL = 3.141592653589793238462643383279502884L;

// In-place radix-2 transform of a power-of-two length; sign -1 forward.
inline void Radix2Fft(std::vector<CxL>& a, int sign) {
  const size_t n = a.size();
  for (size_t i = 1, j = 0; i < n; ++i) {
    size_t bit = n >> 1;
    for (; j & bit; bit >>= 1) j ^= bit;
    j ^= bit;
    if (i < j) std::swap(a[i], a[j]);
  }
  for (size_t len = 2; len <= n; len <<= 1) {
    std::vector<CxL> w(len / 2);
    for (size_t k = 0; k < len / 2; ++k) {
      const long double ang = sign * 2 * kPiL * static_cast<long double>(k) / static_cast<long double>(len);
      w[k] = CxL(cosl(ang), sinl(ang));
    }
    for (size_t i = 0; i < n; i += len)
      for (size_t k = 0; k < len / 2; ++k) {
        const CxL u = a[i + k], v = a[i + k + len / 2] * w[k];
        a[i + k] = u + v;
        a[i + k + len / 2] = u - v;
      }
  }
}

// X[k] = sum_t x[t] exp(-2 pi i k t / n), any n >= 1.
inline std::vector<CxL> ReferenceDft(const std::vector<CxL>& x) {
  const size_t n = x.size();
  if (n <= 16) {
    std::vector<CxL> y(n);
    for (size_t k = 0; k < n; ++k)
      for (size_t t = 0; t < n; ++t) {
        const long double ang = -2 * kPiL * static_cast<long double>((k * t) % n) / static_cast<long double>(n);
        y[k] += x[t] * CxL(cosl(ang), sinl(ang));
      }
    return y;
  }
  size_t m = 1;
  while (m < 2 * n - 1) m <<= 1;
  // chirp[k] = exp(-i pi k^2 / n), with k^2 reduced mod 2n so the angle is exact.
  std::vector<CxL> chirp(n);
  for (size_t k = 0; k < n; ++k) {
    const std::uint64_t q = static_cast<std::uint64_t>(k) * k % (2 * n);
    const long double ang = -kPiL * static_cast<long double>(q) / static_cast<long double>(n);
    chirp[k] = CxL(cosl(ang), sinl(ang));
  }
  std::vector<CxL> a(m), b(m);
  for (size_t k = 0; k < n; ++k) a[k] = x[k] * chirp[k];
  b[0] = std::conj(chirp[0]);
  for (size_t k = 1; k < n; ++k) b[k] = b[m - k] = std::conj(chirp[k]);
  Radix2Fft(a, -1);
  Radix2Fft(b, -1);
  for (size_t i = 0; i < m; ++i) a[i] *= b[i];
  Radix2Fft(a, 1);
  std::vector<CxL> y(n);
  for (size_t k = 0; k < n; ++k) y[k] = a[k] * chirp[k] / static_cast<long double>(m);
  return y;
}

// HalfComplex layout of a real signal's spectrum: Re X[q] at q for
// 0 <= q <= n/2, Im X[q] at n - q for 0 < q < n/2.
inline std::vector<long double> ToHalfComplex(const std::vector<CxL>& spectrum) {
  const size_t n = spectrum.size();
  std::vector<long double> h(n);
  for (size_t q = 0; 2 * q <= n; ++q) {
    h[q] = spectrum[q].real();
    if (q != 0 && 2 * q != n) h[n - q] = spectrum[q].imag();
  }
  return h;
}
// Bin q (any q < n) of a HalfComplex array.
template <class T>
CxL FromHalfComplex(const std::vector<T>& h, size_t q) {
  const size_t n = h.size();
  if (q == 0 || 2 * q == n) return h[q];
  return 2 * q < n ? CxL(h[q], h[n - q]) : CxL(h[n - q], -h[q]);
}

// rms of (got - want) over the rms of want.
template <class Got>
double RelativeRms(const Got& got, const std::vector<CxL>& want) {
  long double err = 0, ref = 0;
  for (size_t k = 0; k < want.size(); ++k) {
    err += std::norm(CxL(got(k)) - want[k]);
    ref += std::norm(want[k]);
  }
  return ref > 0 ? static_cast<double>(sqrtl(err / ref)) : static_cast<double>(sqrtl(err));
}

}  // namespace tsmtest
