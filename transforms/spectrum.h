// Power and cross spectra, Hilbert and Hartley transforms of a whole array,
// each over one or two FFTs of the array's own length. Every kernel takes its
// own reference to the cached plan of that length (a cache hit when the
// caller holds one) and its scratch from the C heap. Results: 0, -20003 for
// n below 1, -20001 when the plan or the scratch cannot be had.
#pragma once

#include "frame/types.h"

namespace tsm {

// Two-sided power spectrum |X[k]|^2 / n^2 of n real values, in place; it sums
// to the mean square of the input. n = 1 gives x[0] squared.
ErrorCode PowerSpectrum(f64* x, int32 n);
// The same of n complex values into s.
ErrorCode CxPowerSpectrum(const cx* x, int32 n, f64* s);
// Cross power spectrum conj(X[k]) Y[k] / n^2 of two real arrays into S; S's
// own storage holds the two HalfComplex spectra on the way.
ErrorCode CrossPowerSpectrum(const f64* x, const f64* y, int32 n, cx* S);
ErrorCode CxCrossPowerSpectrum(const cx* x, const cx* y, int32 n, cx* S);
// Hilbert transform in place: each positive bin times -i, each negative bin
// times i, bin 0 and the Nyquist bin removed. The inverse is its negative.
ErrorCode HilbertTransform(f64* x, int32 n);
ErrorCode InverseHilbertTransform(f64* x, int32 n);
// Discrete Hartley transform in place, H[k] = Re X[k] - Im X[k] (unscaled);
// the inverse scales by 1/n.
ErrorCode HartleyTransform(f64* x, int32 n);
ErrorCode InverseHartleyTransform(f64* x, int32 n);

}  // namespace tsm
