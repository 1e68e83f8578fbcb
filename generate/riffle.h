// Random permutations of an array, with the permutation itself in indices.
#pragma once

#include "frame/types.h"
#include "tsmath/tsmath.h"

namespace tsm {

// indices := 0..n-1, then the same swaps on data and indices. mode 0 is the
// classic riffle, swapping each element i with one drawn from the whole
// array; it is biased (n^n paths onto n! orderings) and kept because callers
// rely on its sequence. Any other mode is an unbiased Fisher-Yates shuffle.
// data may be null (indices alone are shuffled). Seeds as the noise sources.
template <class T>
ErrorCode Riffle(T* data, int32* indices, int32 n, int32 seed, NoiseState* state, uint32 mode);

}  // namespace tsm
