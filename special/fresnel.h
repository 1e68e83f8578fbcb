// Fresnel integrals S(x) and C(x), with the kernel sin(pi t^2/2) and cos(pi t^2/2).
#pragma once

#include "frame/types.h"

namespace tsm {

void FresnelIntegrals(f64 x, f64* s, f64* c);

}  // namespace tsm
