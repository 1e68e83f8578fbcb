// Pieces shared by the Bessel kernels of real order (J, Y and I).
#pragma once

#include "frame/types.h"

namespace tsm {

// (x/2)^v / Gamma(v + 1) for any real v that is not a negative integer, x > 0.
long double SeriesPrefactor(f64 v, f64 x);

// factor (x/2)^v / Gamma(v + 1) sum_k (sign x^2/4)^k / (k! (v + 1)_k), summed
// in long double: the power series of J_v (sign -1) and of I_v (sign +1).
f64 BesselPowerSeries(f64 v, f64 x, int sign, long double factor = 1);

}  // namespace tsm
