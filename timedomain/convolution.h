// Linear convolution and correlation of sequences and matrices, each by the
// direct sums (algorithm 0) or through the FFT (algorithm 1); the caller
// chooses, there is no automatic crossover. A full 1-D result has n + m - 1
// values. Correlation puts zero lag at index n - 1:
//   out[k] = sum_i conj(x[n-1-i]) y[k-i].
#pragma once

#include "frame/types.h"

namespace tsm {

enum ConvolutionAlgorithm : int32 { kConvolveDirect = 0, kConvolveFft = 1 };
enum CorrelationNormalization : int32 { kNormalizeNone = 0, kNormalizeUnbiased = 1, kNormalizeBiased = 2 };
enum Convolution2DSize : int32 { kOutputFull = 0, kOutputSame = 1, kOutputValid = 2 };

// C = A B bin by bin for HalfComplex spectra of length n. When A and B are
// the same array, C is the power spectrum |A|^2 (imaginary slots 0.0). C may
// be A or B.
void ConjProductMultiply(const f64* A, const f64* B, f64* C, int32 n);

// Real convolution into out (n + m - 1 values). Any other algorithm writes
// nothing and returns 0.
ErrorCode Convolve(const f64* x, int32 n, const f64* y, int32 m, int32 algorithm, f64* out);
// The FFT path of real convolution (of reversed x, for correlation): one
// transform length from kwfft_next_smooth_length(n + m - 1), scratch of 3L.
ErrorCode ConvolveByFft(const f64* x, int32 n, bool reverseX, const f64* y, int32 m, f64* out);
// Complex convolution: -20003 for an empty operand, -20061 for another
// algorithm.
ErrorCode CxConvolve(const cx* x, int32 n, const cx* y, int32 m, cx* out, int32 algorithm);

// Real correlation. x == y (the same pointer) takes the autocorrelation path,
// which saves a transform. Another algorithm leaves out as it stands; the
// normalization runs in any case and -20061 reports an unknown one.
ErrorCode Correlate(const f64* x, int32 n, const f64* y, int32 m, int32 algorithm, f64* out, int32 normalization);
ErrorCode CxCorrelate(const cx* x, int32 n, const cx* y, int32 m, cx* out, int32 algorithm, int32 normalization);

// 2-D convolution of row-major matrices into out, sized for outputSize (full
// (r1+r2-1) x (c1+c2-1), same r1 x c1, valid (r1-r2+1) x (c1-c2+1)). Valid
// with x smaller than y gives -20008, another algorithm -20061.
ErrorCode Convolve2D(const f64* x, int32 r1, int32 c1, const f64* y, int32 r2, int32 c2, int32 outputSize,
                     int32 algorithm, f64* out);
ErrorCode CxConvolve2D(const cx* x, int32 r1, int32 c1, const cx* y, int32 r2, int32 c2, int32 outputSize,
                       int32 algorithm, cx* out);
// Full 2-D correlation: x turned by half a turn (and conjugated), convolved with y.
ErrorCode Correlate2D(const f64* x, int32 r1, int32 c1, const f64* y, int32 r2, int32 c2, int32 algorithm, f64* out);
ErrorCode CxCorrelate2D(const cx* x, int32 r1, int32 c1, const cx* y, int32 r2, int32 c2, int32 algorithm,
                        cx* out);

// Deconvolution of x (n) by y (m) in place: x[0 .. n-m] receives q with
// conv(q, y) = x. Spectral division over a power-of-two length, or the
// recursive time-domain division when the spectrum of y has a zero.
// -20010 for a length above 8388608, -20003 for an empty one, -20008 when
// y is longer than x.
ErrorCode Deconvolve(f64* x, int32 n, const f64* y, int32 m);

}  // namespace tsm
