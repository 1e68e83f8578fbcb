#include "measure/fetch.h"

#include <algorithm>
#include <cmath>

#include "measure/transitions.h"
#include "stats/descriptive.h"

namespace tsm {
namespace {

enum Selector : int32 {
  kMinimum = 0, kMaximum, kSpan, kHistLow, kHistHigh, kHistAmplitude, kAutoHigh, kAutoLow, kAutoAmplitude,
  kLowRef, kMidRef, kHighRef, kHysteresis, kRms, kMean, kPeriod, kFrequency, kCycleRms, kCycleMean,
  kFallDuration, kRiseDuration, kRootSumSquares, kPositiveWidth, kNegativeWidth, kPositiveDuty, kNegativeDuty,
  kRisePreshoot, kFallPreshoot, kRiseOvershoot, kFallOvershoot, kPositiveCenter, kNegativeCenter, kRiseSlope,
  kFallSlope, kLastSelector = kFallSlope
};

ErrorCode States(const WaveformRequest& rq, uint32 method, StateLevelsFound* s) {
  LevelSetup how = rq.levels;
  how.method = method;
  return FindStateLevels(rq.x, rq.n, rq.dt, how, s);
}

ErrorCode Pulse(int32 selector, WaveformRequest rq, f64* v) {
  rq.polarity = selector == kNegativeWidth || selector == kNegativeDuty || selector == kNegativeCenter ? kFalling
                                                                                                         : kRising;
  rq.ignorePeriod = false;
  PulseFigures f;
  const ErrorCode e = MeasurePulse(rq, &f);
  if (e != TSM_SUCCESS) return e;
  switch (selector) {
    case kPeriod: *v = f.period; break;
    case kFrequency: *v = 1 / f.period; break;
    case kPositiveWidth: case kNegativeWidth: *v = f.width; break;
    case kPositiveDuty: case kNegativeDuty: *v = f.dutyCycle; break;
    default: *v = f.center; break;
  }
  return e;
}

ErrorCode Transition(int32 selector, WaveformRequest rq, f64* v, f64* times) {
  const bool rising = selector == kRiseDuration || selector == kRisePreshoot || selector == kRiseOvershoot ||
                      selector == kRiseSlope;
  rq.polarity = rising ? kRising : kFalling;
  TransitionFigures f;
  const ErrorCode e = MeasureTransition(rq, &f);
  if (e != TSM_SUCCESS) return e;
  switch (selector) {
    case kFallDuration: case kRiseDuration: *v = f.duration; break;
    case kRisePreshoot: *v = f.preUnder; break;
    case kFallPreshoot: *v = f.preOver; break;
    case kRiseOvershoot: *v = f.postOver; break;
    case kFallOvershoot: *v = f.postUnder; break;
    default: *v = f.slope; break;
  }
  if (times != nullptr) {
    times[0] = f.start;
    times[1] = f.end;
  }
  return e;
}

}  // namespace

ErrorCode MeasureBySelector(int32 selector, const WaveformRequest& rq, f64* result, f64* times) {
  if (selector < 0 || selector > kLastSelector) return TSM_SUCCESS;
  f64 v = 0;
  ErrorCode e = TSM_SUCCESS;
  StateLevelsFound s{};
  switch (selector) {
    case kMinimum: case kMaximum: case kSpan:
      e = SignalExtremes(rq.x, rq.n, &s.min, &s.max);
      v = selector == kMinimum ? s.min : selector == kMaximum ? s.max : s.max - s.min;
      break;
    case kHistLow: case kHistHigh: case kHistAmplitude:
      e = States(rq, kLevelHistogram, &s);
      v = selector == kHistLow ? s.low : selector == kHistHigh ? s.high : s.amplitude;
      break;
    case kAutoHigh: case kAutoLow: case kAutoAmplitude:
      e = States(rq, kLevelAuto, &s);
      v = selector == kAutoHigh ? s.high : selector == kAutoLow ? s.low : s.amplitude;
      break;
    case kLowRef: case kMidRef: case kHighRef: case kHysteresis: {
      References r;
      e = ReferencesOf(rq, &s, &r);
      const f64 h = std::min(r.high - r.mid, r.mid - r.low);
      if (e == TSM_SUCCESS && selector == kHysteresis && h < 0) e = TSM_ERR_REFERENCE_ORDER;
      v = selector == kLowRef ? r.low : selector == kMidRef ? r.mid : selector == kHighRef ? r.high : h;
      break;
    }
    case kRms: e = RmsOfArray(rq.x, rq.n, &v); break;
    case kMean: e = MeanOfArray(rq.x, rq.n, &v); break;
    case kRootSumSquares: v = std::sqrt(SumOfSquares(rq.x, rq.n)); break;
    case kCycleRms: case kCycleMean: {
      CycleFigures c;
      e = MeasureCycle(rq, &c);
      v = selector == kCycleRms ? c.rms : c.mean;
      if (e == TSM_SUCCESS && times != nullptr) {
        times[0] = c.start;
        times[1] = c.end;
      }
      break;
    }
    case kFallDuration: case kRiseDuration: case kRisePreshoot: case kFallPreshoot: case kRiseOvershoot:
    case kFallOvershoot: case kRiseSlope: case kFallSlope:
      e = Transition(selector, rq, &v, times);
      break;
    default:
      e = Pulse(selector, rq, &v);
      break;
  }
  *result = e == TSM_SUCCESS ? v : kNaN;
  return e;
}

}  // namespace tsm
