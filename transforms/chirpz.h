// Chirp-Z transform along the spiral A W^-k:
//   X[k] = sum_i x[i] A^-i W^(i k),  k = 0 .. M-1,
// and its inverse. Scratch comes from the C heap.
#pragma once

#include "frame/types.h"

namespace tsm {

enum ChirpZMethod : int32 { kChirpZDirect = 0, kChirpZBluestein = 1 };

// -20068 for a non-finite part of A or W, -20141 for A or W equal to 0.
// Direct: one complex power per term. Bluestein: one FFT convolution of
// length 2n + M - 1 through CxConvolve.
ErrorCode ChirpZ(const f64* x, int32 n, cx A, cx W, int32 M, int32 method, cx* X);
ErrorCode CxChirpZ(const cx* x, int32 n, cx A, cx W, int32 M, int32 method, cx* X);

// The M values x whose chirp-Z transform (same A and W) starts with
// X[0 .. M-1]. -20068 and -20141 as above; -20060 when W^k = 1 for some
// 0 < k < M (the points coincide and no inverse exists).
ErrorCode InvChirpZ(const cx* X, int32 M, cx A, cx W, cx* x);

}  // namespace tsm
