// Entries of the noise generators and random permutations. white, Gauss and
// PeriodNoise are of form A with the caller's state records behind the error
// out-argument; the rest return their code. The distributions check their
// parameter before the count.
#include "frame/entry.h"
#include "generate/noise.h"
#include "generate/riffle.h"

using namespace tsm;

namespace {

// Form A: -20003 for n below 1, the resize, the kernel.
template <class Kernel>
int32 NoiseA(F64ArrayHdl out, int32 n, int32* err, Kernel kernel) {
  *err = TSM_SUCCESS;
  if (n < 1) return FailA(err, TSM_ERR_EMPTY, out);
  if (const int32 r = ResizeOutput(out, n); r != 0) return HostFailA(err, r, out);
  const ErrorCode code = kernel(Elems(out), n);
  if (code != TSM_SUCCESS) return FailA(err, code, out);
  return 0;
}

// Form B: the kernel's own checks run first on a null output (they come
// before any sample is drawn), then the resize and the kernel.
template <class Block, class Kernel>
ErrorCode NoiseB(Block** out, int32 n, Kernel kernel) {
  if (const ErrorCode e = kernel(nullptr, 0); e != TSM_SUCCESS && e != TSM_ERR_EMPTY)
    return FailB(e, out);
  if (n < 1) return FailB(TSM_ERR_EMPTY, out);
  if (ResizeOutput(out, n) != 0) return FailB(TSM_ERR_NO_MEMORY, out);
  return ReportB(kernel(Elems(out), n), out);
}

// The riffle of a data array in place, indices sized to the data's count.
template <class Block>
ErrorCode RiffleArray(Block** data, I32ArrayHdl indices, int32 seed, NoiseState* state, uint32 mode) {
  const int32 n = Count(data);
  if (n < 1) return FailB(TSM_ERR_EMPTY, indices);
  if (ResizeOutput(indices, n) != 0) return FailB(TSM_ERR_NO_MEMORY, indices, data);
  return Riffle(Elems(data), Elems(indices), n, seed, state, mode);
}

}  // namespace

extern "C" {

int32_t white(F64ArrayHdl out, int32_t* n, double* amp, int32_t* seed, int32_t* err, NoiseState* state) {
  return NoiseA(out, *n, err, [&](f64* y, int32 m) { return WhiteNoise(y, m, *amp, *seed, state); });
}

int32_t Gauss(F64ArrayHdl out, int32_t* n, double* sd, int32_t* seed, int32_t* err, NoiseState* state,
              GaussSpare* spare) {
  return NoiseA(out, *n, err, [&](f64* y, int32 m) { return GaussNoise(y, m, *sd, *seed, state, spare); });
}

int32_t PeriodNoise(int32_t* n, double* amp, int32_t* seed, F64ArrayHdl out, int32_t* err, NoiseState* state) {
  return NoiseA(out, *n, err, [&](f64* y, int32 m) { return PeriodicNoise(y, m, *amp, *seed, state); });
}

int32_t GammaNoiseH(F64ArrayHdl out, int32_t n, int32_t order, int32_t seed, NoiseState* state) {
  return NoiseB(out, n, [&](f64* y, int32 m) { return GammaNoise(y, m, order, seed, state); });
}

int32_t PoissonNoiseH(F64ArrayHdl out, int32_t n, double mean, int32_t seed, NoiseState* state) {
  return NoiseB(out, n, [&](f64* y, int32 m) { return PoissonNoise(y, m, mean, seed, state); });
}

int32_t BinomialNoiseH(U32ArrayHdl out, int32_t n, int32_t trials, double p, int32_t seed, NoiseState* state,
                       BinomialCache* cache) {
  return NoiseB(out, n, [&](uint32* y, int32 m) { return BinomialNoise(y, m, trials, p, seed, state, cache); });
}

int32_t RiffleArrayDBL2012_head(F64ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state,
                                uint32_t mode) {
  return RiffleArray(data, indices, seed, state, mode);
}

int32_t RiffleArrayCDB2012_head(CxArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state,
                                uint32_t mode) {
  return RiffleArray(data, indices, seed, state, mode);
}

int32_t RiffleArrayInt2012_head(I32ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state,
                                uint32_t mode) {
  return RiffleArray(data, indices, seed, state, mode);
}

int32_t RiffleIntNum2012_head(I32ArrayHdl out, int32_t n, int32_t seed, NoiseState* state, uint32_t mode) {
  if (n < 1) return FailB(TSM_ERR_EMPTY, out);
  if (ResizeOutput(out, n) != 0) return FailB(TSM_ERR_NO_MEMORY, out);
  return Riffle<int32>(nullptr, Elems(out), n, seed, state, mode);
}

int32_t RiffleArrayDBL_head(F64ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state) {
  return RiffleArrayDBL2012_head(data, indices, seed, state, 0);
}

int32_t RiffleArrayCDB_head(CxArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state) {
  return RiffleArrayCDB2012_head(data, indices, seed, state, 0);
}

int32_t RiffleArrayInt_head(I32ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state) {
  return RiffleArrayInt2012_head(data, indices, seed, state, 0);
}

int32_t RiffleIntNum_head(I32ArrayHdl out, int32_t n, int32_t seed, NoiseState* state) {
  return RiffleIntNum2012_head(out, n, seed, state, 0);
}

}  // extern "C"
