// Scalar descriptive statistics. Each returns -20003 for n below 1; sums are
// plain float64 left to right unless noted.
#pragma once

#include "frame/types.h"

namespace tsm {

// Sum of squares, unrolled by four.
f64 SumOfSquares(const f64* x, int32 n);

// Arithmetic mean.
ErrorCode MeanOfArray(const f64* x, int32 n, f64* mean);

// Root mean square.
ErrorCode RmsOfArray(const f64* x, int32 n, f64* rms);

// Root mean square of the magnitudes. Stores NaN itself on failure.
ErrorCode CxRmsOfArray(const cx* x, int32 n, f64* rms);

// Central moment of the given order about the mean, divided by n with no
// correction for the sample size. -20021 for order below 1.
ErrorCode CentralMoment(const f64* x, int32 n, int32 order, f64* moment);

// Mean squared error over the shorter of the two lengths; the warning 20004
// when the lengths differ, with the result valid.
ErrorCode MeanSquaredError(const f64* x, int32 nx, const f64* y, int32 ny, f64* mse);

// base raised to a positive integer exponent by repeated squaring: the factors
// of 2 of the exponent first, then the binary product.
f64 IntegerPower(f64 base, uint32 exponent);

}  // namespace tsm
