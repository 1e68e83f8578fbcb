// Windows with a parameter, periodic form unless a form flag says otherwise,
// applied to x in place. T is f64 or cx (both parts scaled alike). All give
// -20003 for n below 1; n of 1 leaves x alone except where noted.
#pragma once

#include "frame/types.h"

namespace tsm {

// Cosine taper of m = int(ratio n / 2) samples at each end: x[0] and x[n-1]
// are set to 0, x[k] and x[n-1-k] scaled by sin^2(k pi / 2m) for 0 < k < m,
// the middle untouched. ratio at or below 0 (or NaN), or m below 1, leaves x
// alone; ratio at or above 1 is the Hanning window (-20001 possible there).
template <class T>
ErrorCode CosTaperedWindow(T* x, int32 n, f64 ratio);

// exp(i ln(final) / (n-1)), the exponent summed step by step. -20006 for n
// below 2, -20027 for final at or below 0.
template <class T>
ErrorCode ExpWindow(T* x, int32 n, f64 final_value);

// Keeps the first int(duty n / 100) samples (clamped to 0 .. n; NaN keeps
// none) and zeroes the rest. -20006 for n below 2.
template <class T>
ErrorCode ForceWindow(T* x, int32 n, f64 duty);

// Gaussian of relative width sigma (0.2 where sigma is not positive).
// symmetric: exp(-0.5 (i - (n-1)/2)^2 / (sigma n)^2); periodic:
// exp(-0.5 (i - n/2)^2 / (sigma (n+1))^2), the n+1 being part of the window.
template <class T>
ErrorCode GaussWindow(T* x, int32 n, f64 sigma, bool symmetric);

// I0(beta sqrt(1 - t^2)) / I0(beta), t = 1 - 2i/n, with I0 = BesselI0Series.
template <class T>
ErrorCode KaiserWindow(T* x, int32 n, f64 beta);

// Dolph-Chebyshev window with main-lobe to side-lobe ratio `ratio` (linear,
// below 1 taken as 1), by an inverse real FFT of the Chebyshev frequency
// samples, scaled to a peak of 1. symmetric: n points; periodic: the first n
// of n+1. -20001 without scratch or FFT table.
template <class T>
ErrorCode DolphChebyshevWindow(T* x, int32 n, f64 ratio, bool symmetric);

// The series sum_k ((x/2)^k / k!)^2, stopped after the first term below 1e-8
// or after 25 terms. The truncation is part of the Kaiser window's
// definition: large arguments are deliberately cut short.
f64 BesselI0Series(f64 x);

}  // namespace tsm
