// Gamma function and its kin: the complete, logarithmic and Stirling forms,
// factorials, digamma and the regularised incomplete gamma functions.
#pragma once

#include "frame/types.h"

namespace tsm {

// 0! to 33! as float64; the last entry is 8.683317618811886e36.
extern const f64 FactorialTable[34];

f64 GammaFn(f64 x);
f64 StirlingGamma(f64 x);
f64 LogGamma(f64 x);  // no reflection: NaN for x < 0
f64 Factorial(int32 n);
f64 LogFactorial(int32 n);
f64 Digamma(f64 x);

// Regularised lower P(a, x) and upper Q(a, x) incomplete gamma functions.
f64 IncompleteGamma(f64 a, f64 x);
f64 IncompleteGammaC(f64 a, f64 x);

}  // namespace tsm
