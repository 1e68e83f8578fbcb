// Clenshaw summation of a Chebyshev series, the form of the generated
// coefficient sets in integrals_coefficients.h.
#pragma once

#include "frame/types.h"

namespace tsm {

// sum c[k] T_k(t) for t in [-1, 1], c[0] not halved.
template <int N>
inline f64 ChebSeries(f64 t, const f64 (&c)[N]) {
  f64 b1 = 0, b2 = 0;
  const f64 t2 = 2 * t;
  for (int k = N - 1; k >= 1; --k) {
    const f64 b0 = t2 * b1 - b2 + c[k];
    b2 = b1;
    b1 = b0;
  }
  return t * b1 - b2 + c[0];
}

}  // namespace tsm
