// Struve function H_v(x) of real order.
#pragma once

#include "frame/types.h"

namespace tsm {

// H_v(x). A negative x needs an integer order (H_v(-x) = (-1)^(v+1) H_v(x)).
f64 StruveH(f64 v, f64 x);

}  // namespace tsm
