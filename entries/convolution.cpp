// Entries of convolution, correlation and deconvolution.
#include <cstdlib>
#include <cstring>
#include <memory>

#include "frame/entry.h"
#include "timedomain/convolution.h"

using namespace tsm;

namespace {

// Convolution and correlation of two real sequences into out (form A).
template <class Kernel>
int32 SequencePairA(F64ArrayHdl x, F64ArrayHdl y, F64ArrayHdl& out, int32* err, Kernel kernel) {
  *err = 0;
  const int32 n = Count(x), m = Count(y);
  if (n < 1 || m < 1) return FailA(err, TSM_ERR_EMPTY, out);
  if (const int32 r = ResizeOutput(out, n + m - 1); r != 0) return HostFailA(err, r, out);
  const ErrorCode code = kernel(Elems(x), n, Elems(y), m, Elems(out));
  if (Failed(code, FailOn::kNonZero)) return FailA(err, code, out);
  return 0;
}

// Result dimensions of a 2-D convolution; -20008 when valid leaves nothing.
ErrorCode ResultSize(int32 r1, int32 c1, int32 r2, int32 c2, int32 outputSize, int32* rows, int32* cols) {
  switch (outputSize) {
    case kOutputFull:
      *rows = r1 + r2 - 1, *cols = c1 + c2 - 1;
      break;
    case kOutputSame:
      *rows = r1, *cols = c1;
      break;
    default:
      *rows = r1 - r2 + 1, *cols = c1 - c2 + 1;
      if (*rows < 1 || *cols < 1) return TSM_ERR_SIZE_PAIR;
  }
  return TSM_SUCCESS;
}

template <class Block, class Kernel>
int32 MatrixPairB(Block** x, Block** y, Block**& out, int32 outputSize, Kernel kernel) {
  const int32 r1 = Dim(x, 0), c1 = Dim(x, 1), r2 = Dim(y, 0), c2 = Dim(y, 1);
  if (r1 < 1 || c1 < 1 || r2 < 1 || c2 < 1) return FailB(TSM_ERR_EMPTY, out);
  if (static_cast<uint32>(outputSize) > kOutputValid) return FailB(TSM_ERR_BAD_SELECTOR, out);
  int32 rows = 0, cols = 0;
  if (const ErrorCode e = ResultSize(r1, c1, r2, c2, outputSize, &rows, &cols); e != TSM_SUCCESS)
    return FailB(e, out);
  if (ResizeOutput(out, rows, cols) != 0) return FailB(TSM_ERR_NO_MEMORY, out);
  const ErrorCode code = kernel(Elems(x), r1, c1, Elems(y), r2, c2, Elems(out));
  return ReportB(code, out);
}

}  // namespace

extern "C" {

int32_t Convolution(F64ArrayHdl x, F64ArrayHdl y, F64ArrayHdl out, int32_t* algorithm, int32_t* err) {
  const int32 alg = *algorithm;
  return SequencePairA(x, y, out, err, [alg](const f64* a, int32 n, const f64* b, int32 m, f64* o) {
    return Convolve(a, n, b, m, alg, o);
  });
}

int32_t Rxy80(F64ArrayHdl x, F64ArrayHdl y, F64ArrayHdl out, int32_t* algorithm, int32_t normalization,
              int32_t* err) {
  const int32 alg = *algorithm;
  return SequencePairA(x, y, out, err, [alg, normalization](const f64* a, int32 n, const f64* b, int32 m, f64* o) {
    return Correlate(a, n, b, m, alg, o, normalization);
  });
}

int32_t Rxy(F64ArrayHdl x, F64ArrayHdl y, F64ArrayHdl out, int32_t* algorithm, int32_t* err) {
  return Rxy80(x, y, out, algorithm, kNormalizeNone, err);
}

// In place: x grows to 2n - 1 lags, computed from a heap copy of x by the
// autocorrelation path of the FFT correlation.
int32_t AutoCorrelation80(F64ArrayHdl x, int32_t normalization, int32_t* err) {
  *err = 0;
  const int32 n = Count(x);
  if (n < 1) return FailA(err, TSM_ERR_EMPTY, x);
  const std::unique_ptr<f64, decltype(&std::free)> copy(
      static_cast<f64*>(std::malloc(sizeof(f64) * static_cast<std::size_t>(n))), &std::free);
  if (!copy) return FailA(err, TSM_ERR_NO_MEMORY, x);
  std::memcpy(copy.get(), Elems(x), sizeof(f64) * static_cast<std::size_t>(n));
  if (const int32 r = ResizeOutput(x, 2 * n - 1); r != 0) {
    // The run goes on after a refused resize and its code replaces -20001, but
    // into scratch: x could not grow, so it keeps its count and values.
    *err = TSM_ERR_NO_MEMORY;
    const std::unique_ptr<f64, decltype(&std::free)> lags(
        static_cast<f64*>(std::malloc(sizeof(f64) * static_cast<std::size_t>(2 * n - 1))), &std::free);
    if (lags) *err = Correlate(copy.get(), n, copy.get(), n, kConvolveFft, lags.get(), normalization);
    return r;
  }
  const ErrorCode code = Correlate(copy.get(), n, copy.get(), n, kConvolveFft, Elems(x), normalization);
  if (Failed(code, FailOn::kNonZero)) return FailA(err, code, x);
  return 0;
}

int32_t AutoCorrelation(F64ArrayHdl x, int32_t* err) { return AutoCorrelation80(x, kNormalizeNone, err); }

// correlate non-zero correlates, and only then is normalization read.
int32_t CxConvolution(CxArrayHdl x, CxArrayHdl y, CxArrayHdl out, int32_t algorithm, int32_t correlate,
                      int32_t normalization) {
  if (correlate != 0 && static_cast<uint32>(normalization) > kNormalizeBiased)
    return FailB(TSM_ERR_BAD_SELECTOR, out);
  const int32 n = Count(x), m = Count(y);
  if (n < 1 || m < 1) return FailB(TSM_ERR_EMPTY, out);
  if (const int32 r = ResizeOutput(out, n + m - 1); r != 0) return FailB(r, out);
  const ErrorCode code = correlate != 0 ? CxCorrelate(Elems(x), n, Elems(y), m, Elems(out), algorithm, normalization)
                                        : CxConvolve(Elems(x), n, Elems(y), m, Elems(out), algorithm);
  return ReportB(code, out);
}

int32_t Convolve_2DH(MatrixHdl x, MatrixHdl y, MatrixHdl out, int32_t outputSize, int32_t algorithm) {
  return MatrixPairB(x, y, out, outputSize,
                     [=](const f64* a, int32 r1, int32 c1, const f64* b, int32 r2, int32 c2, f64* o) {
                       return Convolve2D(a, r1, c1, b, r2, c2, outputSize, algorithm, o);
                     });
}

int32_t CxConvolve_2DH(CxMatrixHdl x, CxMatrixHdl y, CxMatrixHdl out, int32_t outputSize, int32_t algorithm) {
  return MatrixPairB(x, y, out, outputSize,
                     [=](const tsm::cx* a, int32 r1, int32 c1, const tsm::cx* b, int32 r2, int32 c2, tsm::cx* o) {
                       return CxConvolve2D(a, r1, c1, b, r2, c2, outputSize, algorithm, o);
                     });
}

int32_t Correlation_2DH(MatrixHdl x, MatrixHdl y, MatrixHdl out, int32_t algorithm) {
  return MatrixPairB(x, y, out, kOutputFull,
                     [=](const f64* a, int32 r1, int32 c1, const f64* b, int32 r2, int32 c2, f64* o) {
                       return Correlate2D(a, r1, c1, b, r2, c2, algorithm, o);
                     });
}

int32_t CxCorrelation_2DH(CxMatrixHdl x, CxMatrixHdl y, CxMatrixHdl out, int32_t algorithm) {
  return MatrixPairB(x, y, out, kOutputFull,
                     [=](const tsm::cx* a, int32 r1, int32 c1, const tsm::cx* b, int32 r2, int32 c2, tsm::cx* o) {
                       return CxCorrelate2D(a, r1, c1, b, r2, c2, algorithm, o);
                     });
}

// In place: x keeps the n - m + 1 values of the quotient.
int32_t Deconvolution(F64ArrayHdl x, F64ArrayHdl y, int32_t* err) {
  *err = 0;
  const int32 n = Count(x), m = Count(y);
  const ErrorCode code = Deconvolve(Elems(x), n, Elems(y), m);
  if (Failed(code, FailOn::kNonZero)) return FailA(err, code, x);
  if (const int32 r = ResizeOutput(x, n - m + 1); r != 0) return HostFailA(err, r, x);
  return 0;
}

}  // extern "C"
