#include "stats/histogram.h"

#include <cmath>

namespace tsm {

ErrorCode HistogramFill(const f64* x, int32 n, f64 lower, f64 upper, int32* counts, f64* centres, int32 bins) {
  if (lower > upper) return TSM_ERR_HISTOGRAM_BOUNDS;
  if (n < 1 || bins < 1) return TSM_ERR_EMPTY;
  for (int32 b = 0; b < bins; ++b) counts[b] = 0;
  if (lower == upper) {
    for (int32 b = 0; b < bins; ++b) centres[b] = lower;
    counts[bins - 1] = n;
    return TSM_SUCCESS;
  }
  const f64 width = (upper - lower) / bins;
  f64 centre = 0.5 * width + lower;
  for (int32 b = 0; b < bins; ++b) {  // a running sum, as the centres are defined
    centres[b] = centre;
    centre += width;
  }
  const f64 scale = bins / (upper - lower);
  for (int32 i = 0; i < n; ++i) {
    const f64 s = x[i];
    const f64 at = std::floor((s - lower) * scale);
    if (at >= 0 && at < bins)  // false for NaN too: no out-of-range conversion
      ++counts[static_cast<int32>(at)];
    else if (s == upper)
      ++counts[bins - 1];
  }
  return TSM_SUCCESS;
}

ErrorCode EqualWidthHistogram(const f64* x, int32 n, int32* counts, f64* centres, int32 bins) {
  if (n < 1 || bins < 1) return TSM_ERR_EMPTY;
  f64 lo = x[0], hi = x[0];
  int32 i = 1;
  for (; i + 4 <= n; i += 4) {
    for (int32 j = i; j < i + 4; ++j) {
      if (x[j] < lo) lo = x[j];
      if (x[j] > hi) hi = x[j];
    }
  }
  for (; i < n; ++i) {
    if (x[i] < lo) lo = x[i];
    if (x[i] > hi) hi = x[i];
  }
  return HistogramFill(x, n, lo, hi, counts, centres, bins);
}

int32 IntervalPosition(f64 s, const HistInterval& iv) {
  const bool lowerIn = iv.inclusion == 0 || iv.inclusion == 2;
  const bool upperIn = iv.inclusion == 1 || iv.inclusion == 2;
  if (iv.inclusion < 0 || iv.inclusion > 3) return 0;
  if (std::isnan(s)) return 1;
  if (lowerIn ? s < iv.lower : s <= iv.lower) return -1;
  if (upperIn ? s > iv.upper : s >= iv.upper) return 1;
  return 0;
}

ErrorCode GeneralHistogram(const f64* x, int32 n, const HistInterval* intervals, int32 m, int32* counts,
                           HistOutliers* outliers) {
  *outliers = HistOutliers{0, 0, 0};
  if (n < 1) return TSM_ERR_EMPTY;
  for (int32 j = 0; j < m; ++j) counts[j] = 0;
  for (int32 i = 0; i < n; ++i) {
    bool placed = false;
    for (int32 j = 0; j < m; ++j) {
      const int32 pos = IntervalPosition(x[i], intervals[j]);
      if (pos == 0) {  // overlapping intervals all count the sample
        ++counts[j];
        placed = true;
      } else if (j == 0 && pos == -1) {
        ++outliers->below;
        ++outliers->total;
        break;
      } else if (j == m - 1 && !placed) {
        // Between two intervals this is -1 at the last one: counted in the
        // total only, neither below nor above.
        ++outliers->total;
        if (pos == 1) ++outliers->above;
      }
    }
  }
  return TSM_SUCCESS;
}

}  // namespace tsm
