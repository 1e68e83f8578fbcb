#include "generate/patterns.h"

#include <cmath>
#include <cstdint>
#include <numbers>

#include "generate/waveforms.h"

namespace tsm {

ErrorCode SinePattern(f64* y, int32 n, f64 amp, f64 phase, f64 cycles) {
  if (n < 1) return TSM_ERR_EMPTY;
  return SineWave(y, n, amp, cycles / n, &phase);
}

// Period and high count stay in float64 (integer parts taken with trunc), so
// that tiny cycle counts or huge duty cycles need no conversion to int32.
ErrorCode SquarePattern(f64* y, int32 n, f64 amp, f64 duty, f64 cycles) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (cycles > n || !(cycles > 0)) return TSM_ERR_DUTY_ABOVE_LIMIT;
  if (duty == 100) {
    for (int32 i = 0; i < n; ++i) y[i] = amp;
    return TSM_SUCCESS;
  }
  const f64 period = std::trunc(n / cycles + 0.5);
  const f64 high = std::trunc(0.5 + duty * 0.01 * period);
  f64 j = 0;  // i mod period
  for (int32 i = 0; i < n; ++i) {
    y[i] = j < high ? amp : 0.0;
    if (++j >= period) j = 0;
  }
  return TSM_SUCCESS;
}

ErrorCode RampCheck(int32 n, f64 start, f64 end, bool includeEnd, uint32 scale) {
  if (!includeEnd && n < 1) return TSM_ERR_ENDPOINT_COUNT;
  if (includeEnd && n < 2 && !(n == 1 && start == end)) return TSM_ERR_COUNT_BELOW_2;
  if (scale > 1) return TSM_ERR_BAD_SELECTOR;
  return TSM_SUCCESS;
}

// Sample i is i*step + a (a = start, or log10 start), raised to a power of 10
// on the log scale. Sample 0 is start itself, and with the end point the last
// sample is end itself.
ErrorCode RampPattern(f64* y, int32 n, f64 start, f64 end, bool includeEnd, bool logScale) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (logScale && !(start > 0 && end > 0)) return TSM_ERR_NOT_POSITIVE;
  const f64 a = logScale ? std::log10(start) : start;
  const f64 b = logScale ? std::log10(end) : end;
  const f64 step = (b - a) / (includeEnd ? n - 1 : n);
  y[0] = start;
  for (int32 i = 1; i < n; ++i) {
    const f64 v = i * step + a;
    y[i] = logScale ? std::pow(10.0, v) : v;
  }
  if (includeEnd) y[n - 1] = end;
  return TSM_SUCCESS;
}

ErrorCode ImpulseCheck(int32 n, int32 delay) {
  return delay < 0 || delay > n - 1 ? TSM_ERR_INDEX_RANGE : TSM_SUCCESS;
}

ErrorCode ImpulsePattern(f64* y, int32 n, f64 amp, int32 delay) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (const ErrorCode e = ImpulseCheck(n, delay); e != TSM_SUCCESS) return e;
  for (int32 i = 0; i < n; ++i) y[i] = 0.0;
  y[delay] = amp;
  return TSM_SUCCESS;
}

ErrorCode PulseCheck(int32 n, int32 delay, int32 width) {
  const bool fits = delay >= 0 && width >= 0 && delay <= n && width <= n &&
                    static_cast<std::int64_t>(delay) + width <= n;
  return fits ? TSM_SUCCESS : TSM_ERR_PULSE_FIT;
}

ErrorCode PulsePattern(f64* y, int32 n, f64 amp, int32 delay, int32 width) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (const ErrorCode e = PulseCheck(n, delay, width); e != TSM_SUCCESS) return e;
  for (int32 i = 0; i < n; ++i) y[i] = i >= delay && i - delay < width ? amp : 0.0;
  return TSM_SUCCESS;
}

ErrorCode SincCheck(f64 dt) { return dt > 0 ? TSM_SUCCESS : TSM_ERR_STEP_NOT_POSITIVE; }

ErrorCode SincPattern(f64* y, int32 n, f64 amp, f64 delay, f64 dt) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (const ErrorCode e = SincCheck(dt); e != TSM_SUCCESS) return e;
  for (int32 i = 0; i < n; ++i) {
    const f64 x = (i * dt - delay) * std::numbers::pi;
    y[i] = x == 0 ? amp : amp * std::sin(x) / x;
  }
  return TSM_SUCCESS;
}

}  // namespace tsm
