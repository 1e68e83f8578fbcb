// Pieces of the Bessel J and Y kernels shared by bessel_jy.cpp and
// bessel_jy_core.cpp. Orders nu >= 0 and x > 0 unless stated.
#pragma once

#include <cstdint>

#include "frame/types.h"
#include "special/bessel_series.h"

namespace tsm {

// J and Y of orders 0 and 1 from their Chebyshev sets, x > 0; only the
// outputs whose pointers are not null are formed.
void BesselJY01(f64 x, f64* j0, f64* j1, f64* y0, f64* y1);

// The recurrence C_(m+1) = (2m/x) C_m - C_(m-1) upward, `steps` times from
// a = C_(m-1), b = C_m, in long double; stops at an infinity.
long double BesselRecurUp(long double a, long double b, f64 m, f64 x, int64_t steps);

// Hankel's asymptotic expansion; false when its terms do not fall below the
// rounding before they grow again. y may be null.
bool BesselJYHankel(f64 nu, f64 x, f64* j, f64* y);

// Where nu < x: Hankel's expansion at the fractional order and the next,
// then the recurrence upward (neutral there), in long double. False when
// the expansion declines.
bool BesselJYUpward(f64 nu, f64 x, f64* j, f64* y);

// Continued fraction for J'/J, downward recurrence to a small order mu, there
// Temme's series (x < 2) or Steed's continued fraction for Hankel's form
// (x >= 2) with the Wronskian, then Y upward. y may be null.
void BesselJYSteed(f64 nu, f64 x, f64* j, f64* y);

// J_n for an integer n >= 2 and 0 < x <= n: the same fraction and downward
// recurrence to orders 1 and 0, normalised by the larger of J0 and J1 from
// their kernels.
f64 BesselJIntegerDown(int64_t n, f64 x);

}  // namespace tsm
