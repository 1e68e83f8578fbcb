// Histograms: equal-width bins between two bounds, and counts over a list of
// arbitrary intervals.
#pragma once

#include "frame/types.h"

namespace tsm {

// Counts x into `bins` equal bins between lower and upper and writes the bin
// centres. A sample equal to upper lands in the last bin; any other sample
// outside is dropped without a code. lower == upper puts all n into the last
// bin and every centre on lower. -20101 for lower above upper, then -20003
// for n or bins below 1.
ErrorCode HistogramFill(const f64* x, int32 n, f64 lower, f64 upper, int32* counts, f64* centres, int32 bins);

// Equal-width histogram between the least and the greatest sample.
ErrorCode EqualWidthHistogram(const f64* x, int32 n, int32* counts, f64* centres, int32 bins);

struct HistInterval {
  f64 lower;
  f64 upper;
  int32 inclusion;  // 0 [l,u), 1 (l,u], 2 [l,u], 3 (l,u), other: everything inside
};

struct HistOutliers {
  int32 total;  // samples placed in no interval
  int32 below;  // below the first interval
  int32 above;  // beyond the last interval
};

// 0 inside, -1 below, 1 above the interval. A sample on an excluded lower
// bound is below, on an excluded upper bound above; NaN is above.
int32 IntervalPosition(f64 s, const HistInterval& iv);

// Counts each sample into every interval that holds it; see HistOutliers for
// the samples placed nowhere. -20003 for n below 1.
ErrorCode GeneralHistogram(const f64* x, int32 n, const HistInterval* intervals, int32 m, int32* counts,
                           HistOutliers* outliers);

}  // namespace tsm
