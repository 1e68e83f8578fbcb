// Exponential integral E_n(x) = int_1^inf e^(-x t) t^-n dt.
#pragma once

#include "frame/types.h"

namespace tsm {

f64 ExpIntegralN(int32 n, f64 x);

}  // namespace tsm
