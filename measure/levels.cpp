#include "measure/levels.h"

#include "stats/order.h"

namespace tsm {
namespace {

constexpr f64 kLowSideFraction = 0.4;
constexpr f64 kHighSideFraction = 0.6;
// A side of the histogram counts as populated above this share of the samples.
constexpr f64 kPopulatedShare = 0.05;

f64 BinCentre(f64 min, f64 max, int32 bins, int32 bin) {
  const f64 w = (max - min) / bins;
  const f64 c = min + 0.5 * w;
  return c + w * bin;
}

}  // namespace

ErrorCode CheckLevelArgs(const f64* x, int32 n, f64 dt, int32 option, uint32 method) {
  if (n < 1) return TSM_ERR_MEASUREMENT_COUNT;
  if (!(dt > 0)) return TSM_ERR_HISTOGRAM_ORDER;
  if (x == nullptr) return TSM_ERR_MEASUREMENT_COUNT;
  if (option != 0 && option != 1) return TSM_ERR_BAD_SELECTOR;
  if (method > kLevelAuto) return TSM_ERR_METHOD_SELECTOR;
  return TSM_SUCCESS;
}

ErrorCode SignalExtremes(const f64* x, int32 n, f64* min, f64* max) {
  if (n < 1) return TSM_ERR_MEASUREMENT_COUNT;
  int32 at;
  return ArrayMaxMin(x, n, max, &at, min, &at);
}

ErrorCode FillLevelHistogram(const f64* x, int32 n, f64 min, f64 max, int32* counts, int32 bins) {
  const f64 range = max - min;
  if (!(range > 0)) return TSM_ERR_LEVELS_COINCIDE;
  for (int32 b = 0; b < bins; ++b) counts[b] = 0;
  const f64 scale = 1 / (range / bins);
  for (int32 i = 0; i < n; ++i) {
    const f64 pos = (x[i] - min) * scale;
    int32 b = 0;  // below 0 and NaN land in the first bin
    if (pos >= bins)
      b = bins - 1;
    else if (pos > 0)
      b = static_cast<int32>(pos);
    ++counts[b];
  }
  return TSM_SUCCESS;
}

HistogramSide LowSide(const int32* counts, int32 bins, f64 min, f64 max) {
  int32 best = -1, at = 0;
  for (int32 b = static_cast<int32>(kLowSideFraction * bins); b >= 0; --b)
    if (counts[b] >= best) {
      best = counts[b];
      at = b;
    }
  return {best, BinCentre(min, max, bins, at)};
}

HistogramSide HighSide(const int32* counts, int32 bins, f64 min, f64 max) {
  int32 best = -1, at = bins - 1;
  for (int32 b = static_cast<int32>(kHighSideFraction * bins); b < bins; ++b)
    if (counts[b] >= best) {
      best = counts[b];
      at = b;
    }
  return {best, BinCentre(min, max, bins, at)};
}

ErrorCode FindStateLevels(const f64* x, int32 n, f64 dt, const LevelSetup& how, StateLevelsFound* out) {
  ErrorCode e = CheckLevelArgs(x, n, dt, how.option, how.method);
  if (e == TSM_SUCCESS) e = SignalExtremes(x, n, &out->min, &out->max);
  if (e != TSM_SUCCESS) return e;
  out->low = out->min;
  out->high = out->max;
  out->resolved = how.method;
  if (how.method != kLevelMinMax) {
    e = FillLevelHistogram(x, n, out->min, out->max, how.counts, how.bins);
    if (e != TSM_SUCCESS) return e;
    const HistogramSide lo = LowSide(how.counts, how.bins, out->min, out->max);
    const HistogramSide hi = HighSide(how.counts, how.bins, out->min, out->max);
    const f64 threshold = kPopulatedShare * n;
    if (how.method == kLevelHistogram) {
      out->low = lo.level;
      out->high = hi.level;
    } else if (how.option == 0) {
      if (lo.count > threshold) out->low = lo.level;
      if (hi.count > threshold) out->high = hi.level;
    } else if (lo.count > threshold && hi.count > threshold) {
      out->low = lo.level;
      out->high = hi.level;
      out->resolved = kLevelHistogram;
    }
  }
  out->amplitude = out->high - out->low;
  return TSM_SUCCESS;
}

References ResolveReferences(const References& r, bool percent, const StateLevelsFound& s) {
  if (!percent) return r;
  const auto unit = [&](f64 v) { return s.amplitude * v / 100 + s.low; };
  return {unit(r.high), unit(r.mid), unit(r.low)};
}

}  // namespace tsm
