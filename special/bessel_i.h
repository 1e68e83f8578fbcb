// Modified Bessel function I of real order.
#pragma once

#include "frame/types.h"

namespace tsm {

// I_v(x) for real v and x; x < 0 only for integer v.
f64 BesselI(f64 v, f64 x);

}  // namespace tsm
