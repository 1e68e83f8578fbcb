// Error function, its complement and Dawson's integral.
#pragma once

#include "frame/types.h"

namespace tsm {

f64 ErrorFn(f64 x);
f64 ErrorFnC(f64 x);
f64 DawsonIntegral(f64 x);

}  // namespace tsm
