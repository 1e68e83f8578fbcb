// Transition figures: the crossings of the low and high reference levels that
// make a complete rising or falling transition, its duration and slope, and
// the shoots before and after it relative to the state levels.
#pragma once

#include "measure/pulse.h"

namespace tsm {

struct TransitionFigures {
  f64 slope, duration, start, end;
  References refs;
  // Percentages of the amplitude: how far the region before (pre) or after
  // (post) the transition goes below (under) or above (over) its state.
  f64 preUnder, preOver, postUnder, postOver;
};

// Transition `number` of direction `polarity`. All figures stay 0 on failure.
ErrorCode MeasureTransition(const WaveformRequest& rq, TransitionFigures* out);

}  // namespace tsm
