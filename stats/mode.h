// Modes of a sample.
#pragma once

#include "frame/types.h"

namespace tsm {

// Finds the modes of x. intervals above 0: centres of the fullest of that many
// equal bins; 0 or below: values of the longest runs of equal values (equal
// within eps relative to the first of the run), in ascending order. A single
// sample, or no bin or run holding more than one sample, gives no modes.
// *modes receives a malloc'ed array of *count values (null when there are
// none), which the caller frees. -20003 for n below 1, -20001 without memory.
ErrorCode ModeOfArray(const f64* x, int32 n, int32 intervals, f64** modes, int32* count);

}  // namespace tsm
