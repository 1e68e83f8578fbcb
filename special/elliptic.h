// Complete and incomplete elliptic integrals of the first and second kind,
// in the parameter m = k^2, and the Jacobi elliptic functions.
#pragma once

#include "frame/types.h"

namespace tsm {

f64 EllipticK(f64 m);
f64 EllipticE(f64 m);
f64 EllipticF(f64 phi, f64 m);
f64 EllipticEInc(f64 phi, f64 m);
// sn, cn, dn of u and the amplitude phi; NaN in all four outside 0 <= m <= 1.
void JacobiElliptic(f64 u, f64 m, f64* sn, f64* cn, f64* dn, f64* phi);

}  // namespace tsm
