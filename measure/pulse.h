// Pulse and cycle figures from the crossings of the middle reference level,
// found with a hysteresis band of the smaller distance from the middle
// reference to the other two.
//
// Positions are counted in samples from t0 (position = t0 + fractional sample
// index) and are turned into times only at the end: a width is multiplied by
// dt, an instant p becomes t0 + (p - t0) dt.
#pragma once

#include "measure/levels.h"

namespace tsm {

// What a pulse, cycle or transition measurement is asked to do.
struct WaveformRequest {
  const f64* x;
  int32 n;
  f64 t0, dt;
  int32 polarity;     // 1 from a rising crossing, 0 from a falling one, -1 crossings in sequence
  bool ignorePeriod;  // a pulse without a following period suffices
  int32 number;       // pulse, cycle or transition number, from 1
  References refs;
  bool percent;  // refs are percentages of the amplitude
  LevelSetup levels;
};

// Crossing direction: the signal was last high (falling) or last low (rising).
enum : int32 { kFalling = 0, kRising = 1, kNoDirection = 2 };

// Fractional position of the crossing of `level` between samples i and i+1.
f64 CrossingPosition(const f64* x, int32 i, f64 level, f64 t0);

// The product test: x[i] and x[i+1] lie on different sides of level, or one
// lies on it.
inline bool Crosses(const f64* x, int32 i, f64 level) { return (x[i + 1] - level) * (x[i] - level) <= 0; }

// Steps 1 and 2 of every measurement: the resolved references (with percent
// the states are found first; the option is checked in any case).
ErrorCode ReferencesOf(const WaveformRequest& rq, StateLevelsFound* states, References* refs);

struct PulseFigures {
  f64 period, width, dutyCycle, center;
  References refs;
};

// The pulse `number` of the given polarity. All figures stay 0 on failure.
ErrorCode MeasurePulse(const WaveformRequest& rq, PulseFigures* out);

struct CycleFigures {
  f64 mean, rms, start, end;
  References refs;
};

// Mean and RMS over cycle `number`, which starts at crossing 2 number - 2 of
// the crossings in sequence. All figures stay 0 on failure.
ErrorCode MeasureCycle(const WaveformRequest& rq, CycleFigures* out);

}  // namespace tsm
