// Modified Bessel functions: K of integer order.
#pragma once

#include "frame/types.h"

namespace tsm {

// K_n(x) for x > 0; K_-n = K_n.
f64 BesselK(int32 n, f64 x);

}  // namespace tsm
