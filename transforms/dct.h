// Cosine and sine transforms over the real FFT, in one and two dimensions.
//
// The cosine transform is the orthonormal type II,
//   y[k] = sqrt(2/n) c[k] sum_t x[t] cos(pi (2t+1) k / (2n)),  c[0] = 1/sqrt(2), else 1,
// by a reordering into a real FFT of length n for even n, and by a mirror
// into one of length 2n for odd n. The sine transform is the unscaled type I,
//   y[k] = sum_t x[t] sin(pi (t+1)(k+1) / (n+1)),
// through the odd extension of length 2n+2; its inverse scales by 2/(n+1).
// The plans are the caller's (lengths by TrigPlanLength); scratch comes from
// the C heap.
#pragma once

#include <cstdint>

#include "frame/types.h"
#include "transforms/kwfft_plan.h"

namespace tsm {

enum class TrigKind { kDct, kInverseDct, kDst, kInverseDst };

// FFT length that a transform of n points runs on: n or 2n (cosine, by the
// parity of n), 2n + 2 (sine). int64, since 2n + 2 need not fit in int32.
std::int64_t TrigPlanLength(TrigKind kind, int32 n);

// One transform of n points. x holds `count` values; an input shorter than n
// reads as zero-padded, a longer one is used up to n. x and y may be the same
// memory. -20003 (cosine) or -20115 (sine) for n below 1, -20001 without
// scratch, the engine's code for a plan of the wrong length.
ErrorCode TrigTransform(TrigKind kind, const kwfft_table* plan, const f64* x, int32 count, f64* y, int32 n);

// The transform of a rows x cols matrix: each row of length cols (planCols),
// then each column of length rows (planRows), in place in y. x is xRows x
// xCols, row-major, zero-padded or cut to rows x cols.
ErrorCode TrigTransform2D(TrigKind kind, const kwfft_table* planRows, const kwfft_table* planCols, const f64* x,
                          int32 xRows, int32 xCols, f64* y, int32 rows, int32 cols);

}  // namespace tsm
