// Scans of data for values that the fits and matrix kernels refuse (-20068).
#pragma once

#include "frame/types.h"

namespace tsm {

// 1 at the first element that is NaN or infinite, equals the largest float64,
// or is not greater than -1.7976931348623e308; 0 otherwise and for n below 1.
// The two bounds are deliberately not mirror images.
int32 HasNonFiniteValue(const f64* a, int32 n);

// The same test on the real and the imaginary part of each element.
int32 CxHasNonFiniteValue(const cx* a, int32 n);

}  // namespace tsm
