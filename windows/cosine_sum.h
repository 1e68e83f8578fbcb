// Cosine-sum windows in the periodic form:
//   w[i] = sum_k (-1)^k a[k] cos(2 pi k i / n),  k = 0 .. m-1,
// multiplied into x in place. T is f64 or cx (both parts scaled alike).
#pragma once

#include "frame/types.h"

namespace tsm {

// -20003 for n or m below 1, -20001 when the rotation table can't be had.
// normalise divides every coefficient by a[0], which gives the window a mean
// of 1. n of 1, and a lone coefficient of exactly 1, leave x alone.
template <class T>
ErrorCode CosineSumWindow(T* x, int32 n, const f64* a, int32 m, bool normalise);

// The same with the coefficients of a window selector (0 to 9, 11); -20061
// for any other selector.
template <class T>
ErrorCode SelectorCosineWindow(T* x, int32 n, int32 selector, bool normalise);

}  // namespace tsm
