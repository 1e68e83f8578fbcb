// Beta function and the regularised incomplete beta function.
#pragma once

#include "frame/types.h"

namespace tsm {

f64 BetaFn(f64 a, f64 b);
// I_x(a, b), a > 0, b > 0, 0 <= x <= 1.
f64 IncompleteBeta(f64 a, f64 b, f64 x);
// The two continued fractions behind it: in x, and in x/(1 - x).
f64 IncompleteBetaCF(f64 a, f64 b, f64 x);
f64 IncompleteBetaCF2(f64 a, f64 b, f64 x);

}  // namespace tsm
