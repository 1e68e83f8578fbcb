#include "windows/special_windows.h"

#include <cmath>

#include "windows/apply.h"
#include "windows/cosine_sum.h"
#include "windows/selector.h"

namespace tsm {
namespace {

constexpr f64 kPi = 3.141592653589793;
constexpr f64 kDefaultGaussSigma = 0.2;
constexpr int kBesselI0MaxTerms = 25;
constexpr f64 kBesselI0SmallTerm = 1e-8;

// w(i) scales x[i] and x[n-i] for 1 <= i <= last.
template <class T, class Value>
void ApplyPairs(T* x, int32 n, int32 last, Value value) {
  for (int32 i = 1; i <= last; ++i) {
    const f64 w = value(i);
    ScaleSample(x[i], w);
    ScaleSample(x[n - i], w);
  }
}

}  // namespace

f64 BesselI0Series(f64 x) {
  const f64 x2 = x * x;
  f64 term = 1.0, sum = 1.0;
  for (int k = 1; k <= kBesselI0MaxTerms; ++k) {
    const f64 twice_k = 2.0 * k;
    term *= x2 / (twice_k * twice_k);
    sum += term;
    if (term < kBesselI0SmallTerm) break;
  }
  return sum;
}

template <class T>
ErrorCode CosTaperedWindow(T* x, int32 n, f64 ratio) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (!(ratio > 0.0)) return TSM_SUCCESS;
  if (ratio >= 1.0) return SelectorCosineWindow(x, n, kWinHanning, false);
  const int32 m = static_cast<int32>(ratio * 0.5 * n);
  if (m < 1) return TSM_SUCCESS;
  ClearSample(x[0]);
  ClearSample(x[n - 1]);
  for (int32 k = 1; k < m; ++k) {
    const f64 s = std::sin(k * kPi / (2.0 * m));
    ScaleSample(x[k], s * s);
    ScaleSample(x[n - 1 - k], s * s);
  }
  return TSM_SUCCESS;
}

template <class T>
ErrorCode ExpWindow(T* x, int32 n, f64 final_value) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n < 2) return TSM_ERR_COUNT_BELOW_2;
  if (final_value <= 0.0) return TSM_ERR_EXP_FINAL_VALUE;
  const f64 step = std::log(final_value) / (n - 1);
  f64 exponent = 0.0;
  for (int32 i = 0; i < n; ++i) {
    ScaleSample(x[i], std::exp(exponent));
    exponent += step;
  }
  return TSM_SUCCESS;
}

template <class T>
ErrorCode ForceWindow(T* x, int32 n, f64 duty) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n < 2) return TSM_ERR_COUNT_BELOW_2;
  const f64 keep = duty * 0.01 * n;
  const int32 m = keep >= n ? n : keep > 0.0 ? static_cast<int32>(keep) : 0;
  for (int32 i = m; i < n; ++i) ClearSample(x[i]);
  return TSM_SUCCESS;
}

template <class T>
ErrorCode GaussWindow(T* x, int32 n, f64 sigma, bool symmetric) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) return TSM_SUCCESS;
  if (sigma <= 0.0) sigma = kDefaultGaussSigma;
  if (symmetric) {
    const f64 c = -0.5 / (sigma * sigma * (static_cast<f64>(n) * n));
    const f64 centre = 0.5 * (n - 1);
    for (int32 i = 0; i <= (n - 1) / 2; ++i) {
      const f64 d = i - centre;
      const f64 w = std::exp(d * c * d);
      ScaleSample(x[i], w);
      if (n - 1 - i != i) ScaleSample(x[n - 1 - i], w);
    }
    return TSM_SUCCESS;
  }
  const f64 np1 = n + 1.0;
  const f64 c = -0.5 / (sigma * sigma * (np1 * np1));
  ScaleSample(x[0], std::exp(c * (static_cast<f64>(n) * n) * 0.25));
  const f64 centre = 0.5 * n;
  ApplyPairs(x, n, (n - 1) / 2, [&](int32 i) {
    const f64 d = i - centre;
    return std::exp(d * c * d);
  });
  if (n % 2 == 0) ScaleSample(x[n / 2], std::exp(0.0 * c * 0.0));  // 1, or NaN for a NaN sigma
  return TSM_SUCCESS;
}

template <class T>
ErrorCode KaiserWindow(T* x, int32 n, f64 beta) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) return TSM_SUCCESS;
  const f64 den = BesselI0Series(beta);
  ScaleSample(x[0], BesselI0Series(0.0) / den);
  // The middle of an even length is left alone: the window is 1 there.
  ApplyPairs(x, n, n % 2 == 0 ? n / 2 - 1 : (n - 1) / 2, [&](int32 i) {
    const f64 t = 1.0 - 2.0 * i / n;
    return BesselI0Series(beta * std::sqrt(1.0 - t * t)) / den;
  });
  return TSM_SUCCESS;
}

#define TSM_WINDOW_INSTANCES(T)                                 \
  template ErrorCode CosTaperedWindow(T*, int32, f64);          \
  template ErrorCode ExpWindow(T*, int32, f64);                 \
  template ErrorCode ForceWindow(T*, int32, f64);               \
  template ErrorCode GaussWindow(T*, int32, f64, bool);         \
  template ErrorCode KaiserWindow(T*, int32, f64);
TSM_WINDOW_INSTANCES(f64)
TSM_WINDOW_INSTANCES(cx)
#undef TSM_WINDOW_INSTANCES

}  // namespace tsm
