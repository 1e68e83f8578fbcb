// Windows by selector: scaled to unit coherent gain, in the symmetric form,
// and their constants by name. T is f64 or cx.
#pragma once

#include "frame/types.h"
#include "tsmath/tsmath.h"

namespace tsm {

// Applies the periodic window of `selector` and divides by its coherent gain;
// consts receives the window's constants (the table's for the cosine sums and
// the rectangle, measured for 30 to 34 and 60 to 62) or NaN on failure. n of 0
// passes: table selectors give their constants, measured ones -20003.
// -20004 for n below 0, -20061 for an unknown selector, -20001 without scratch.
template <class T>
ErrorCode ScaledWindow(T* x, int32 n, int32 selector, f64 param, WinConsts* consts);

// Applies the symmetric window of n points (last sample equal to the first):
// the periodic window of n-1 points closed with its first value, or for 61
// and 62 their kernels' symmetric form. Cosine sums are not normalised.
// -20003 for n below 1 (n of 1 leaves x alone), -20061, -20001.
template <class T>
ErrorCode SymmetricWindow(T* x, int32 n, int32 selector, f64 param);

// Constants of the periodic window of n points: tabled for 0 to 9 and 11,
// measured for 30 to 34 and 60 to 62. consts is written only on success.
ErrorCode WindowConstsByName(int32 n, int32 selector, f64 param, WinConsts* consts);

}  // namespace tsm
