// Dilogarithm in Spence's form: spence(x) = -int_1^x ln(t)/(t - 1) dt = Li2(1 - x).
#pragma once

#include "frame/types.h"

namespace tsm {

f64 Dilogarithm(f64 x);

}  // namespace tsm
