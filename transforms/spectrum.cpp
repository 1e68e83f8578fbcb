#include "transforms/spectrum.h"

#include "frame/heap.h"
#include "transforms/kwfft.h"

namespace tsm {
namespace {

// A reference to the cached plan of length n and a heap scratch of float64:
// what every kernel here starts from, released on every path.
class PlanAndScratch {
 public:
  ErrorCode Take(int32 n, std::int64_t values) {
    plan_.reset(CreateKwfftTable(n));
    if (plan_ == nullptr || (values > 0 && !scratch_.Allocate(values))) return TSM_ERR_NO_MEMORY;
    return TSM_SUCCESS;
  }
  const kwfft_table* plan() const { return plan_.get(); }
  f64* scratch() const { return scratch_.get(); }

 private:
  KwfftTableReference plan_;
  HeapScratch<f64> scratch_;
};

// The scale of every spectrum, 1/(n n).
f64 SpectrumScale(int32 n) { return 1.0 / (static_cast<f64>(n) * n); }

// The HalfComplex spectrum of x (n values) in the work's scratch.
ErrorCode RealSpectrum(const f64* x, int32 n, PlanAndScratch& work) {
  const ErrorCode e = work.Take(n, n);
  return e != TSM_SUCCESS ? e : kwfft_real(work.plan(), x, work.scratch(), 1, 1, n);
}

// Both complex spectra, split: X in s[0..2n), Y in s[2n..4n).
ErrorCode SplitSpectra(const cx* x, const cx* y, int32 n, PlanAndScratch& work) {
  const std::ptrdiff_t m = n;
  ErrorCode e = work.Take(n, y != nullptr ? 4 * m : 2 * m);
  f64* s = work.scratch();
  if (e == TSM_SUCCESS) e = kwfft_complex(work.plan(), &x[0].re, &x[0].im, s, s + m, 2, 1, n);
  if (e == TSM_SUCCESS && y != nullptr) e = kwfft_complex(work.plan(), &y[0].re, &y[0].im, s + 2 * m, s + 3 * m, 2, 1, n);
  return e;
}

cx ConjTimes(f64 ar, f64 ai, f64 br, f64 bi) { return cx{ar * br + ai * bi, ar * bi - ai * br}; }

}  // namespace

ErrorCode PowerSpectrum(f64* x, int32 n) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) {
    x[0] *= x[0];
    return TSM_SUCCESS;
  }
  PlanAndScratch work;
  if (const ErrorCode e = RealSpectrum(x, n, work); e != TSM_SUCCESS) return e;
  const f64* h = work.scratch();
  const f64 d = SpectrumScale(n);
  x[0] = h[0] * h[0] * d;
  for (int32 k = 1; k <= (n - 1) / 2; ++k) x[k] = x[n - k] = (h[k] * h[k] + h[n - k] * h[n - k]) * d;
  if (n % 2 == 0) x[n / 2] = h[n / 2] * h[n / 2] * d;
  return TSM_SUCCESS;
}

ErrorCode CxPowerSpectrum(const cx* x, int32 n, f64* s) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) {
    s[0] = x[0].re * x[0].re + x[0].im * x[0].im;
    return TSM_SUCCESS;
  }
  PlanAndScratch work;
  if (const ErrorCode e = SplitSpectra(x, nullptr, n, work); e != TSM_SUCCESS) return e;
  const f64 *re = work.scratch(), *im = re + static_cast<std::ptrdiff_t>(n);
  const f64 d = SpectrumScale(n);
  for (int32 k = 0; k < n; ++k) s[k] = (re[k] * re[k] + im[k] * im[k]) * d;
  return TSM_SUCCESS;
}

ErrorCode CrossPowerSpectrum(const f64* x, const f64* y, int32 n, cx* S) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) {
    S[0] = cx{x[0] * y[0], 0.0};
    return TSM_SUCCESS;
  }
  PlanAndScratch work;
  ErrorCode e = work.Take(n, 0);
  // x's HalfComplex spectrum in the real slots of S, y's in the imaginary ones.
  if (e == TSM_SUCCESS) e = kwfft_real(work.plan(), x, &S[0].re, 1, 2, n);
  if (e == TSM_SUCCESS) e = kwfft_real(work.plan(), y, &S[0].im, 1, 2, n);
  if (e != TSM_SUCCESS) return e;
  const f64 d = SpectrumScale(n);
  S[0] = cx{S[0].re * S[0].im * d, 0.0};
  for (int32 k = 1; k <= (n - 1) / 2; ++k) {
    const cx a = S[k], b = S[n - k];  // a = (hx[k], hy[k]), b = (hx[n-k], hy[n-k])
    const cx p = ConjTimes(a.re, b.re, a.im, b.im);
    S[k] = cx{p.re * d, p.im * d};
    S[n - k] = cx{p.re * d, -p.im * d};
  }
  if (n % 2 == 0) S[n / 2] = cx{S[n / 2].re * S[n / 2].im * d, 0.0};
  return TSM_SUCCESS;
}

ErrorCode CxCrossPowerSpectrum(const cx* x, const cx* y, int32 n, cx* S) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) {
    S[0] = ConjTimes(x[0].re, x[0].im, y[0].re, y[0].im);
    return TSM_SUCCESS;
  }
  PlanAndScratch work;
  if (const ErrorCode e = SplitSpectra(x, y, n, work); e != TSM_SUCCESS) return e;
  const std::ptrdiff_t m = n;
  const f64 *xr = work.scratch(), *xi = xr + m, *yr = xi + m, *yi = yr + m;
  const f64 d = SpectrumScale(n);
  for (int32 k = 0; k < n; ++k) {
    const cx p = ConjTimes(xr[k], xi[k], yr[k], yi[k]);
    S[k] = cx{p.re * d, p.im * d};
  }
  return TSM_SUCCESS;
}

ErrorCode HilbertTransform(f64* x, int32 n) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) {
    x[0] = 0.0;
    return TSM_SUCCESS;
  }
  PlanAndScratch work;
  if (const ErrorCode e = RealSpectrum(x, n, work); e != TSM_SUCCESS) return e;
  f64* h = work.scratch();
  h[0] = 0.0;
  if (n % 2 == 0) h[n / 2] = 0.0;
  for (int32 k = 1; k <= (n - 1) / 2; ++k) {  // (re, im) becomes (im, -re)
    const f64 re = h[k];
    h[k] = h[n - k];
    h[n - k] = -re;
  }
  return kwfft_real_inverse(work.plan(), h, x, 1, 1, n);
}

ErrorCode InverseHilbertTransform(f64* x, int32 n) {
  const ErrorCode e = HilbertTransform(x, n);
  if (e == TSM_SUCCESS)
    for (int32 i = 0; i < n; ++i) x[i] = -x[i];
  return e;
}

ErrorCode HartleyTransform(f64* x, int32 n) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) return TSM_SUCCESS;
  PlanAndScratch work;
  if (const ErrorCode e = RealSpectrum(x, n, work); e != TSM_SUCCESS) return e;
  const f64* h = work.scratch();
  x[0] = h[0];
  for (int32 k = 1; k <= (n - 1) / 2; ++k) {
    x[k] = h[k] - h[n - k];
    x[n - k] = h[k] + h[n - k];
  }
  if (n % 2 == 0) x[n / 2] = h[n / 2];
  return TSM_SUCCESS;
}

ErrorCode InverseHartleyTransform(f64* x, int32 n) {
  const ErrorCode e = HartleyTransform(x, n);
  if (e == TSM_SUCCESS) {
    const f64 scale = 1.0 / n;
    for (int32 i = 0; i < n; ++i) x[i] *= scale;
  }
  return e;
}

}  // namespace tsm
