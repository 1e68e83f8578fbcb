// Entries of the state level, pulse, cycle and transition measurements.
//
// The histogram counters live in a HistogramBuffer that the caller keeps in
// a variable between calls; its release is registered with the host when the
// record is made, so it goes at the end of the host's run. A bin count that
// differs from the buffer's gives the record new counters; the record itself
// and its registration stay.
#include <cstdlib>
#include <cstring>
#include <initializer_list>

#include "frame/host.h"
#include "frame/handles.h"
#include "measure/fetch.h"
#include "measure/levels.h"
#include "measure/pulse.h"
#include "measure/transitions.h"

using namespace tsm;

namespace {

constexpr int32 kRegisterCleanup = 2;
// Counters are sized in 32-bit byte counts, as every block of the host.
constexpr std::uint64_t kMaxCounterBytes = 0xFFFFFFFFull;

int32 ReleaseHistogramBuffer(void* record) {
  auto* b = static_cast<HistogramBuffer*>(record);
  std::free(b->counts);
  std::free(b);
  return 0;
}

// Leaves a buffer of `bins` counters in *var (bins >= 1); -20001 when memory
// is short, with *var as it was.
ErrorCode EnsureHistogramBuffer(HistogramBuffer** var, int32 bins) {
  HistogramBuffer* b = *var;
  if (b != nullptr && b->bins == bins) return TSM_SUCCESS;
  const std::uint64_t bytes = static_cast<std::uint64_t>(bins) * sizeof(int32);
  if (bytes > kMaxCounterBytes) return TSM_ERR_NO_MEMORY;
  auto* counts = static_cast<int32*>(std::malloc(bytes));
  if (counts == nullptr) return TSM_ERR_NO_MEMORY;
  if (b == nullptr) {
    b = static_cast<HistogramBuffer*>(std::malloc(sizeof(HistogramBuffer)));
    if (b == nullptr) {
      std::free(counts);
      return TSM_ERR_NO_MEMORY;
    }
    b->counts = nullptr;
    HostRTSetCleanupProc(ReleaseHistogramBuffer, b, kRegisterCleanup);
    *var = b;
  }
  std::free(b->counts);
  b->counts = counts;
  b->bins = bins;
  return TSM_SUCCESS;
}

// The two records, checked in order: present, bins, method.
ErrorCode ReadRecords(const ReferenceLevels* refs, const LevelMethod* levels, WaveformRequest* rq) {
  if (refs == nullptr || levels == nullptr) return TSM_ERR_MISSING_RECORD;
  ReferenceLevels r;
  LevelMethod m;
  std::memcpy(&r, refs, sizeof r);
  std::memcpy(&m, levels, sizeof m);
  if (m.bins < 1) return TSM_ERR_BIN_COUNT;
  if (m.method > kLevelAuto) return TSM_ERR_METHOD_SELECTOR;
  rq->refs = References{r.highRef, r.midRef, r.lowRef};
  rq->percent = r.percent != 0;
  rq->levels.method = m.method;
  rq->levels.bins = m.bins;
  return TSM_SUCCESS;
}

// Counters for the request; a missing variable leaves the buffer to the clean-up alone.
ErrorCode AttachCounters(HistogramBuffer** var, WaveformRequest* rq) {
  HistogramBuffer* own = nullptr;
  if (var == nullptr) var = &own;
  const ErrorCode e = EnsureHistogramBuffer(var, rq->levels.bins);
  if (e == TSM_SUCCESS) rq->levels.counts = (*var)->counts;
  return e;
}

void SetSignal(F64ArrayHdl x, f64 t0, f64 dt, int32 option, WaveformRequest* rq) {
  const bool present = x != nullptr && *x != nullptr;
  rq->x = present ? Elems(x) : nullptr;
  rq->n = present ? Count(x) : 0;
  rq->t0 = t0;
  rq->dt = dt;
  rq->levels.option = option;
}

// Entry checks, the buffer, then the kernel.
template <class Kernel>
ErrorCode Measure(F64ArrayHdl x, f64 t0, f64 dt, const ReferenceLevels* refs, const LevelMethod* levels,
                  HistogramBuffer** var, int32 option, WaveformRequest rq, Kernel kernel) {
  ErrorCode e = ReadRecords(refs, levels, &rq);
  if (e == TSM_SUCCESS) e = AttachCounters(var, &rq);
  if (e != TSM_SUCCESS) return e;
  SetSignal(x, t0, dt, option, &rq);
  return kernel(rq);
}

// Outputs and their values; an output the caller left out (null) is skipped.
struct Output {
  f64* to;
  f64 value;
};
void Put(std::initializer_list<Output> outputs) {
  for (const Output& o : outputs)
    if (o.to != nullptr) *o.to = o.value;
}

WaveformRequest Asking(int32 polarity, bool ignorePeriod, int32 number) {
  WaveformRequest rq{};
  rq.polarity = polarity;
  rq.ignorePeriod = ignorePeriod;
  rq.number = number;
  return rq;
}

}  // namespace

extern "C" {

int32_t StateLevels(F64ArrayHdl x, double t0, double dt, uint32_t method, int32_t bins, HistogramBuffer** histogram,
                    double* high, double* low, double* amplitude, int32_t option) {
  WaveformRequest rq{};
  rq.levels.method = method;
  rq.levels.bins = bins;
  ErrorCode e = bins < 1 ? TSM_ERR_BIN_COUNT : AttachCounters(histogram, &rq);
  StateLevelsFound s{};
  if (e == TSM_SUCCESS) {
    SetSignal(x, t0, dt, option, &rq);
    e = FindStateLevels(rq.x, rq.n, rq.dt, rq.levels, &s);
  }
  if (e != TSM_SUCCESS) s.high = s.low = s.amplitude = kNaN;
  Put({{high, s.high}, {low, s.low}, {amplitude, s.amplitude}});
  return e;
}

int32_t PulseMeasEx(F64ArrayHdl x, double t0, double dt, uint16_t polarity, uint8_t ignorePeriod, int32_t pulseNumber,
                    const ReferenceLevels* refs, const LevelMethod* levels, HistogramBuffer** histogram,
                    double* period, double* width, double* dutyCycle, double* center, double* lowLevel,
                    double* midLevel, double* highLevel, int32_t option) {
  PulseFigures f{};
  const ErrorCode e = Measure(x, t0, dt, refs, levels, histogram, option,
                              Asking(polarity, ignorePeriod != 0, pulseNumber),
                              [&](const WaveformRequest& rq) { return MeasurePulse(rq, &f); });
  Put({{period, f.period}, {width, f.width}, {dutyCycle, f.dutyCycle}, {center, f.center}, {lowLevel, f.refs.low},
       {midLevel, f.refs.mid}, {highLevel, f.refs.high}});
  return e;
}

int32_t PulseMeas(F64ArrayHdl x, double t0, double dt, uint16_t polarity, int32_t pulseNumber,
                  const ReferenceLevels* refs, const LevelMethod* levels, HistogramBuffer** histogram, double* period,
                  double* width, double* dutyCycle, double* center, double* lowLevel, double* midLevel,
                  double* highLevel, int32_t option) {
  return PulseMeasEx(x, t0, dt, polarity, 0, pulseNumber, refs, levels, histogram, period, width, dutyCycle, center,
                     lowLevel, midLevel, highLevel, option);
}

int32_t CycleRMSAverage(F64ArrayHdl x, double t0, double dt, int32_t cycleNumber, const ReferenceLevels* refs,
                        const LevelMethod* levels, HistogramBuffer** histogram, double* mean, double* rms,
                        double* start, double* end, double* lowLevel, double* midLevel, double* highLevel,
                        int32_t option) {
  CycleFigures f{};
  const ErrorCode e = Measure(x, t0, dt, refs, levels, histogram, option, Asking(-1, false, cycleNumber),
                              [&](const WaveformRequest& rq) { return MeasureCycle(rq, &f); });
  Put({{mean, f.mean}, {rms, f.rms}, {start, f.start}, {end, f.end}, {lowLevel, f.refs.low}, {midLevel, f.refs.mid},
       {highLevel, f.refs.high}});
  return e;
}

int32_t TransMeas(F64ArrayHdl x, double t0, double dt, uint16_t polarity, int32_t transitionNumber,
                  const ReferenceLevels* refs, const LevelMethod* levels, HistogramBuffer** histogram, double* slope,
                  double* duration, double* start, double* end, double* lowLevel, double* midLevel,
                  double* highLevel, double* preshootUnder, double* preshootOver, double* postshootUnder,
                  double* postshootOver, int32_t option) {
  TransitionFigures f{};
  const ErrorCode e = Measure(x, t0, dt, refs, levels, histogram, option, Asking(polarity, false, transitionNumber),
                              [&](const WaveformRequest& rq) { return MeasureTransition(rq, &f); });
  Put({{slope, f.slope}, {duration, f.duration}, {start, f.start}, {end, f.end}, {lowLevel, f.refs.low},
       {midLevel, f.refs.mid}, {highLevel, f.refs.high}, {preshootUnder, f.preUnder}, {preshootOver, f.preOver},
       {postshootUnder, f.postUnder}, {postshootOver, f.postOver}});
  return e;
}

int32_t measurements_fetch(void* /*reserved*/, int32_t selector, const ReferenceLevels* refs,
                           const LevelMethod* levels, int32_t pulseNumber, double t0, double dt, const double* data,
                           int32_t n, double* result, double* times) {
  f64 ignored;
  if (result == nullptr) result = &ignored;
  ErrorCode e = TSM_SUCCESS;
  if (n < 1)
    e = TSM_ERR_MEASUREMENT_COUNT;
  else if (!(dt > 0))
    e = TSM_ERR_HISTOGRAM_ORDER;
  else if (data == nullptr)
    e = TSM_ERR_MEASUREMENT_COUNT;
  WaveformRequest rq = Asking(kRising, false, pulseNumber);
  if (e == TSM_SUCCESS) e = ReadRecords(refs, levels, &rq);
  // Every call has a fresh buffer, released by the host at the end of its run.
  if (e == TSM_SUCCESS) e = AttachCounters(nullptr, &rq);
  if (e != TSM_SUCCESS) {
    *result = kNaN;
    return e;
  }
  rq.x = data;
  rq.n = n;
  rq.t0 = t0;
  rq.dt = dt;
  rq.levels.option = 0;
  return MeasureBySelector(selector, rq, result, times);
}

// There is no measurement object: these three only answer.
int32_t measurements_create(void* /*object*/) { return 0; }
int32_t measurements_clear(void* /*object*/) { return 0; }
int32_t measurements_destroy(void* /*object*/) { return 0; }

}  // extern "C"
