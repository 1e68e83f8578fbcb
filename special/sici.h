// Sine and cosine integrals, Si and Ci, and their hyperbolic twins Shi and Chi.
#pragma once

#include "frame/types.h"

namespace tsm {

// Si(x) and Ci(x); for x < 0, Si is odd and Ci gives Ci(|x|), the real part.
void SineCosineIntegrals(f64 x, f64* si, f64* ci);
f64 HyperbolicSineIntegral(f64 x);
// Chi(|x|): the real part for x < 0.
f64 HyperbolicCosineIntegral(f64 x);

}  // namespace tsm
