#include "generate/pulses.h"

#include <cmath>
#include <numbers>

namespace tsm {
namespace {

// The constant e as the pulse formulas quote it.
constexpr f64 kE = 2.718281828459045;

}  // namespace

ErrorCode AperiodicTriangle(f64* y, int32 n, const SampleTimes& at, f64 amp, f64 width, f64 skew) {
  if (n < 1) return TSM_ERR_EMPTY;
  const f64 shift = at.Given() ? width / 2 : 0.0;
  const f64 peak = skew * width;
  for (int32 i = 0; i < n; ++i) {
    const f64 t = at.At(i) + shift;
    f64 v = 0.0;
    if (t >= 0 && t <= width) {
      if (skew == 0)
        v = (width - t) * amp / width;
      else if (skew == 1)
        v = t * amp / width;
      else
        v = t <= peak ? t * amp / peak : (width - t) * amp / (width - peak);
    }
    y[i] = v;
  }
  return TSM_SUCCESS;
}

ErrorCode GaussMonopulse(f64* y, int32 n, const SampleTimes& at, f64 fc, f64 amp) {
  if (n < 1) return TSM_ERR_EMPTY;
  const f64 k = 2 * std::sqrt(kE) * amp;
  for (int32 i = 0; i < n; ++i) {
    const f64 u = at.At(i) * fc * std::numbers::pi;
    y[i] = k * u * std::exp(-2 * u * u);
  }
  return TSM_SUCCESS;
}

ErrorCode GaussPulse(f64* y, int32 n, const SampleTimes& at, f64 amp, f64 fc, f64 bw, f64 att) {
  if (n < 1) return TSM_ERR_EMPTY;
  const f64 a = -5 * bw * bw / std::numbers::ln10 / att;
  for (int32 i = 0; i < n; ++i) {
    const f64 u = at.At(i) * fc * std::numbers::pi;
    y[i] = amp * std::exp(a * u * u) * std::cos(2 * u);
  }
  return TSM_SUCCESS;
}

ErrorCode PeriodicSinc(f64* y, int32 n, const SampleTimes& at, f64 amp, int32 order) {
  if (n < 1) return TSM_ERR_EMPTY;
  for (int32 i = 0; i < n; ++i) {
    const f64 x = at.At(i) / 2;
    const f64 s = std::sin(x);
    y[i] = (std::fabs(s) < kEps ? 1.0 : std::sin(order * x) / (order * s)) * amp;
  }
  return TSM_SUCCESS;
}

}  // namespace tsm
