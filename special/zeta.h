// Riemann zeta function.
#pragma once

#include "frame/types.h"

namespace tsm {

f64 RiemannZeta(f64 x);

}  // namespace tsm
