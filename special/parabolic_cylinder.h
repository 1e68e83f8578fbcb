// Parabolic cylinder function D_v(x) (Weber's function).
#pragma once

#include "frame/types.h"

namespace tsm {

// D_v(x) for real v and x.
f64 ParabolicCylinderD(f64 v, f64 x);

}  // namespace tsm
