#include "stats/descriptive.h"

#include <algorithm>
#include <cmath>

namespace tsm {

// Four partial sums; the tail singly.
f64 SumOfSquares(const f64* x, int32 n) {
  f64 s0 = 0, s1 = 0, s2 = 0, s3 = 0;
  int32 i = 0;
  for (; i + 4 <= n; i += 4) {
    s0 += x[i] * x[i];
    s1 += x[i + 1] * x[i + 1];
    s2 += x[i + 2] * x[i + 2];
    s3 += x[i + 3] * x[i + 3];
  }
  f64 s = (s0 + s1) + (s2 + s3);
  for (; i < n; ++i) s += x[i] * x[i];
  return s;
}

namespace {

f64 PlainMean(const f64* x, int32 n) {
  f64 s = 0;
  for (int32 i = 0; i < n; ++i) s += x[i];
  return s / n;
}

}  // namespace

ErrorCode MeanOfArray(const f64* x, int32 n, f64* mean) {
  if (n < 1) return TSM_ERR_EMPTY;
  *mean = PlainMean(x, n);
  return TSM_SUCCESS;
}

ErrorCode RmsOfArray(const f64* x, int32 n, f64* rms) {
  if (n < 1) return TSM_ERR_EMPTY;
  *rms = std::sqrt(SumOfSquares(x, n) / n);
  return TSM_SUCCESS;
}

ErrorCode CxRmsOfArray(const cx* x, int32 n, f64* rms) {
  if (n < 1) {
    *rms = kNaN;
    return TSM_ERR_EMPTY;
  }
  // The interleaved parts are a float64 array of twice the length.
  *rms = std::sqrt(SumOfSquares(&x[0].re, 2 * n) / n);
  return TSM_SUCCESS;
}

f64 IntegerPower(f64 base, uint32 exponent) {
  while ((exponent & 1u) == 0) {
    base *= base;
    exponent >>= 1;
  }
  f64 result = base;
  while ((exponent >>= 1) != 0) {
    base *= base;
    if (exponent & 1u) result *= base;
  }
  return result;
}

ErrorCode CentralMoment(const f64* x, int32 n, int32 order, f64* moment) {
  if (n < 1) return TSM_ERR_EMPTY;
  if (order < 1) return TSM_ERR_ORDER_TOO_LOW;
  const f64 m = PlainMean(x, n);
  f64 s = 0;
  for (int32 i = 0; i < n; ++i) s += IntegerPower(x[i] - m, static_cast<uint32>(order));
  *moment = s / n;
  return TSM_SUCCESS;
}

ErrorCode MeanSquaredError(const f64* x, int32 nx, const f64* y, int32 ny, f64* mse) {
  if (nx < 1 || ny < 1) return TSM_ERR_EMPTY;
  const int32 m = std::min(nx, ny);
  f64 s = 0;
  for (int32 i = 0; i < m; ++i) s += x[i] * x[i] + y[i] * (y[i] - 2 * x[i]);
  *mse = s / m;
  return nx == ny ? TSM_SUCCESS : TSM_WARN_LENGTHS_DIFFER;
}

}  // namespace tsm
