// Order statistics shared across the library: selection, median, sorting and
// the extremes of an array. Shared with the median filter, the pulse
// measurements and the robust fits.
#pragma once

#include "frame/types.h"

namespace tsm {

// Permutes a[0..n-1] so that a[k] holds the value of rank k, everything
// below k is not greater and everything above not less; returns a[k].
// Quickselect with a median-of-three pivot. n >= 1, 0 <= k < n, no NaN.
f64 SelectKth(f64* a, int32 n, int32 k);

// Median of x (mean of the two middle values for even n). -20003 for n below
// 1; -20104 and NaN when x holds a NaN; -20001 when no scratch memory.
ErrorCode MedianOfArray(const f64* x, int32 n, f64* out);

// Sorts src into dst (null dst: src in place), ascending or, with descending
// non-zero, descending. NaNs go to the front in either order. -20003 for n
// below 1.
ErrorCode SortArray(const f64* src, int32 n, int32 descending, f64* dst);

// Greatest and least non-NaN values with the index of their first
// occurrence; NaN and -1 when every element is NaN. -20003 for n below 1.
ErrorCode ArrayMaxMin(const f64* x, int32 n, f64* max, int32* maxIndex, f64* min, int32* minIndex);

}  // namespace tsm
