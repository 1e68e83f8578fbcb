// Hypergeometric series shared by the Bessel I and parabolic cylinder kernels.
#pragma once

#include "frame/types.h"

namespace tsm {

// The asymptotic series 2F0(a, b; ; z) = sum_k (a)_k (b)_k z^k / k!, summed
// until a term falls to MACHEP of the sum. Gives false when that takes more
// than maxTerms terms or a term grows past 1e10 (the series has started to
// diverge); *sum then holds the partial sum. *loss receives the largest term
// over the sum, the factor by which cancellation magnifies rounding.
bool Hypergeometric2F0(f64 a, f64 b, f64 z, int32 maxTerms, f64* sum, f64* loss);

}  // namespace tsm
