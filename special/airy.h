// Airy functions Ai, Bi and their derivatives.
#pragma once

#include "frame/types.h"

namespace tsm {

// Ai(x), Ai'(x), Bi(x), Bi'(x). Above 103.892 Ai and Ai' underflow to 0 and
// Bi, Bi' saturate at the largest double (infinity for x = +inf).
void AiryFunctions(f64 x, f64* ai, f64* aip, f64* bi, f64* bip);

}  // namespace tsm
