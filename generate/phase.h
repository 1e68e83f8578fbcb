// Phase bookkeeping of the periodic waves. Phases are in degrees; a wave of
// frequency f (cycles per sample) that starts at phase p stands at
// p + k*360*f at sample k.
#pragma once

#include <cmath>

#include "frame/types.h"

namespace tsm {

inline constexpr f64 kFullTurn = 360.0;
inline constexpr f64 kRadiansPerDegree = 0.017453292519943295;

// p wrapped into [0, 360). fmod is exact; adding 360 to a tiny negative
// remainder can round up to 360, which is taken as 0.
inline f64 WrapDegrees(f64 p) {
  if (p >= 0 && p < kFullTurn) return p;
  f64 w = std::fmod(p, kFullTurn);
  if (w < 0) w += kFullTurn;
  return w == kFullTurn ? 0.0 : w;
}

// The wrapped phase at sample k of a wave that starts at phase0 (already
// wrapped). The product k*360*f is split into its rounded value and its exact
// error (k*360 is an exact integer), and the rounded value is reduced exactly
// before the small terms are added, so the result is good to a few ulps of 360
// however long the wave: two calls that continue each other give the samples
// of one long call.
inline f64 PhaseAt(f64 phase0, f64 k, f64 freq) {
  const f64 t = k * kFullTurn;
  const f64 p = t * freq;
  const f64 e = std::fma(t, freq, -p);
  return WrapDegrees(std::fmod(p, kFullTurn) + (e + phase0));
}

}  // namespace tsm
