// Entries of the waveform generators: the continuous waves and patterns of
// form A (every scalar by pointer, a trailing error out-argument) and the
// ramp and pulse entries of form B.
#include <algorithm>
#include <cmath>
#include <initializer_list>
#include <utility>

#include "frame/entry.h"
#include "generate/patterns.h"
#include "generate/pulses.h"
#include "generate/waveforms.h"

using namespace tsm;

namespace {

// The first failing check of a list, in the order written.
ErrorCode FirstFailure(std::initializer_list<std::pair<bool, ErrorCode>> checks) {
  for (const auto& [failed, code] : checks)
    if (failed) return code;
  return TSM_SUCCESS;
}

// Form A frame of a generator filling n samples: -20003 for n below 1, then
// the entry's own parameter check, the resize, the kernel. A kernel code that
// fails `test` empties the output; any other is reported as it is.
template <class Kernel>
int32 FillA(F64ArrayHdl out, int32 n, ErrorCode check, int32* err, FailOn test, Kernel kernel) {
  *err = TSM_SUCCESS;
  if (n < 1) return FailA(err, TSM_ERR_EMPTY, out);
  if (check != TSM_SUCCESS) return FailA(err, check, out);
  if (const int32 r = ResizeOutput(out, n); r != 0) return HostFailA(err, r, out);
  const ErrorCode code = kernel(Elems(out), n);
  if (Failed(code, test)) return FailA(err, code, out);
  *err = code;
  return 0;
}

// Form B frame of the sampled pulses. An xy holding values is taken as the
// sample times and overwritten in place (n and the grid are not used);
// otherwise xy is sized to n samples on the grid i*dt - delay. `check` holds
// the entry's checks in its order, n's among them for the grid only.
template <class Kernel>
int32 SampleB(F64ArrayHdl xy, int32 n, f64 delay, f64 dt, ErrorCode check, Kernel kernel) {
  if (check != TSM_SUCCESS) return FailB(check, xy);
  SampleTimes at{nullptr, dt, delay};
  if (Count(xy) > 0) {
    n = Count(xy);
    at = SampleTimes{Elems(xy), 1.0, 0.0};
  } else if (ResizeOutput(xy, n) != 0) {
    return FailB(TSM_ERR_NO_MEMORY, xy);
  }
  const ErrorCode code = kernel(Elems(xy), n, at);
  return code < 0 ? FailB(code, xy) : code;
}

// No times given and no samples asked for.
bool NoSamples(F64ArrayHdl xy, int32 n) { return Count(xy) < 1 && n < 1; }

}  // namespace

extern "C" {

int32_t SineWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, int32_t* err) {
  return FillA(out, *n, TSM_SUCCESS, err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return SineWave(y, m, *amp, *freq, phase); });
}

int32_t SquareWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, double* duty,
                      int32_t* err) {
  return FillA(out, *n, TSM_SUCCESS, err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return SquareWave(y, m, *amp, *freq, phase, *duty); });
}

int32_t SawtoothWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, int32_t* err) {
  return FillA(out, *n, TSM_SUCCESS, err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return SawtoothWave(y, m, *amp, *freq, phase); });
}

int32_t TriangleWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, int32_t* err) {
  return FillA(out, *n, TSM_SUCCESS, err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return TriangleWave(y, m, *amp, *freq, phase); });
}

int32_t ArbitraryWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, F64ArrayHdl table,
                         int32_t* interp, int32_t* err) {
  const bool finite = std::isfinite(*phase) && std::isfinite(*freq);
  return FillA(out, *n, finite ? TSM_SUCCESS : TSM_ERR_NON_FINITE, err, FailOn::kNonZero, [&](f64* y, int32 m) {
    return ArbitraryWave(y, m, *amp, *freq, phase, Elems(table), Count(table), *interp);
  });
}

int32_t ChirpCIN(F64ArrayHdl out, int32_t* n, double* amp, double* f1, double* f2, int32_t* err) {
  return FillA(out, *n, TSM_SUCCESS, err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return LinearChirp(y, m, *amp, *f1, *f2); });
}

int32_t SinePtrn(F64ArrayHdl out, int32_t* n, double* amp, double* phase, double* cycles, int32_t* err) {
  return FillA(out, *n, TSM_SUCCESS, err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return SinePattern(y, m, *amp, *phase, *cycles); });
}

// Every check runs and the last failure decides. The output is sized before
// the code is looked at, and emptied again on a failure.
int32_t Square(F64ArrayHdl out, int32_t* n, double* amp, double* duty, double* cycles, int32_t* err) {
  *err = TSM_SUCCESS;
  const int32 m = *n;
  ErrorCode code = TSM_SUCCESS;
  if (m < 1) code = TSM_ERR_EMPTY;
  if (!(*duty > 0)) code = TSM_ERR_DUTY_BELOW_ZERO;
  if (*cycles > m / 2 || !(*cycles > 0)) code = TSM_ERR_DUTY_ABOVE_LIMIT;
  if (const int32 r = ResizeOutput(out, std::max(m, 0)); r != 0) return HostFailA(err, r, out);
  if (code == TSM_SUCCESS) code = SquarePattern(Elems(out), m, *amp, *duty, *cycles);
  if (code != TSM_SUCCESS) return FailA(err, code, out);
  return 0;
}

int32_t RampPtrn(F64ArrayHdl out, int32_t* n, double* start, double* end, int32_t* err) {
  return FillA(out, *n, RampCheck(*n, *start, *end, true, 0), err, FailOn::kNegative,
               [&](f64* y, int32 m) { return RampPattern(y, m, *start, *end, true, false); });
}

int32_t ImpulsePtrn(F64ArrayHdl out, int32_t* n, double* amp, int32_t* delay, int32_t* err) {
  return FillA(out, *n, ImpulseCheck(*n, *delay), err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return ImpulsePattern(y, m, *amp, *delay); });
}

int32_t PulsePtrn(F64ArrayHdl out, int32_t* n, double* amp, int32_t* delay, int32_t* width, int32_t* err) {
  return FillA(out, *n, PulseCheck(*n, *delay, *width), err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return PulsePattern(y, m, *amp, *delay, *width); });
}

int32_t SincWave(F64ArrayHdl out, int32_t* n, double* amp, double* delay, double* dt, int32_t* err) {
  return FillA(out, *n, SincCheck(*dt), err, FailOn::kNonZero,
               [&](f64* y, int32 m) { return SincPattern(y, m, *amp, *delay, *dt); });
}

// Every mode other than 0 leaves the end point out.
int32_t RampPtrn85(F64ArrayHdl out, int32_t n, double start, double end, int32_t mode, uint32_t scale) {
  const bool includeEnd = mode == 0;
  if (const ErrorCode e = RampCheck(n, start, end, includeEnd, scale); e != TSM_SUCCESS) return FailB(e, out);
  if (ResizeOutput(out, n) != 0) return FailB(TSM_ERR_NO_MEMORY, out);
  const ErrorCode code = RampPattern(Elems(out), n, start, end, includeEnd, scale == 1);
  return code < 0 ? FailB(code, out) : code;
}

int32_t RampPtrn80(F64ArrayHdl out, int32_t n, double start, double end, int32_t mode) {
  return RampPtrn85(out, n, start, end, mode, 0);
}

int32_t AperiodTriangleH(F64ArrayHdl xy, int32_t n, double amp, double delay, double dt, double width,
                         double skew) {
  const ErrorCode check = FirstFailure({{NoSamples(xy, n), TSM_ERR_EMPTY},
                                        {!(width > 0), TSM_ERR_NOT_POSITIVE},
                                        {!(dt > 0), TSM_ERR_STEP_NOT_POSITIVE},
                                        {!(skew >= 0 && skew <= 1), TSM_ERR_PROBABILITY_RANGE}});
  return SampleB(xy, n, delay, dt, check, [&](f64* y, int32 m, const SampleTimes& at) {
    return AperiodicTriangle(y, m, at, amp, width, skew);
  });
}

int32_t GaussMonopulseH(F64ArrayHdl xy, int32_t n, double dt, double delay, double fc, double amp) {
  const ErrorCode check = FirstFailure({{!(fc > 0), TSM_ERR_NOT_POSITIVE},
                                        {NoSamples(xy, n), TSM_ERR_EMPTY},
                                        {!(dt > 0), TSM_ERR_STEP_NOT_POSITIVE}});
  return SampleB(xy, n, delay, dt, check,
                 [&](f64* y, int32 m, const SampleTimes& at) { return GaussMonopulse(y, m, at, fc, amp); });
}

int32_t GaussPulseH(F64ArrayHdl xy, int32_t n, double amp, double delay, double dt, double fc, double bw,
                    double att) {
  const ErrorCode check = FirstFailure({{!(fc > 0 && bw > 0 && att > 0), TSM_ERR_NOT_POSITIVE},
                                        {NoSamples(xy, n), TSM_ERR_EMPTY},
                                        {!(dt > 0), TSM_ERR_STEP_NOT_POSITIVE}});
  return SampleB(xy, n, delay, dt, check,
                 [&](f64* y, int32 m, const SampleTimes& at) { return GaussPulse(y, m, at, amp, fc, bw, att); });
}

int32_t PeriodicSincH(F64ArrayHdl xy, int32_t n, double amp, int32_t order, double dt, double delay) {
  const ErrorCode check = FirstFailure({{order < 1, TSM_ERR_NOT_POSITIVE},
                                        {NoSamples(xy, n), TSM_ERR_EMPTY},
                                        {!(dt > 0), TSM_ERR_STEP_NOT_POSITIVE}});
  return SampleB(xy, n, delay, dt, check,
                 [&](f64* y, int32 m, const SampleTimes& at) { return PeriodicSinc(y, m, at, amp, order); });
}

}  // extern "C"
