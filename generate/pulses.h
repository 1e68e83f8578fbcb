// Single pulses and the periodic sinc, sampled at given times or on a grid.
// The kernels take the parameters as their entries have checked them.
#pragma once

#include "frame/types.h"

namespace tsm {

// Where sample i is taken: at times[i] when the caller gives times (grid
// step 1, delay 0), otherwise at i*dt - delay. times may be the output itself:
// each kernel reads a time before it writes that sample.
struct SampleTimes {
  const f64* times;
  f64 dt;
  f64 delay;
  bool Given() const { return times != nullptr; }
  f64 At(int32 i) const { return (Given() ? times[i] : i) * dt - delay; }
};

// A triangle of the given width with its peak amp at skew*width from its
// start, 0 outside. On a grid it starts at delay; at given times it is
// centred on time 0. skew 0 and 1 are the right-angled forms.
ErrorCode AperiodicTriangle(f64* y, int32 n, const SampleTimes& at, f64 amp, f64 width, f64 skew);

// The first derivative of a Gaussian, scaled to extremes of +-amp:
// 2 sqrt(e) amp u exp(-2 u^2) with u = t fc pi.
ErrorCode GaussMonopulse(f64* y, int32 n, const SampleTimes& at, f64 fc, f64 amp);

// A Gaussian-modulated cosine amp exp(a u^2) cos(2u), u = t fc pi, with
// a = -5 bw^2 / ln 10 / att.
ErrorCode GaussPulse(f64* y, int32 n, const SampleTimes& at, f64 amp, f64 fc, f64 bw, f64 att);

// The Dirichlet function amp sin(order x) / (order sin x), x = t/2, taken as
// amp wherever |sin x| is below eps (also for even orders, whose true value
// there is -amp at odd multiples of pi).
ErrorCode PeriodicSinc(f64* y, int32 n, const SampleTimes& at, f64 amp, int32 order);

}  // namespace tsm
