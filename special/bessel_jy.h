// Bessel functions of the first and second kind: real order and spherical.
#pragma once

#include "frame/types.h"

namespace tsm {

// J_v(x) and Y_v(x) of real order v. J accepts x < 0 for integer v only;
// Y needs x > 0 (x = 0 gives its infinite limit).
f64 BesselJ(f64 v, f64 x);
f64 BesselY(f64 v, f64 x);

// Spherical j_n(x) = sqrt(pi/(2x)) J_(n+1/2)(x) and y_n(x) likewise with Y.
f64 SphericalBesselJ(int32 n, f64 x);
f64 SphericalBesselY(int32 n, f64 x);

}  // namespace tsm
