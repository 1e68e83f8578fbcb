// One waveform figure chosen by a selector (0 to 33), computed by the level,
// pulse, cycle and transition measurements with option 0.
#pragma once

#include "measure/pulse.h"

namespace tsm {

// rq.number is the pulse, cycle or transition number; rq.polarity and
// rq.ignorePeriod are not read. `times` (null: not wanted) receives the start
// and end of a cycle or transition for the selectors that measure one.
// Selectors outside 0 to 33 give 0 and leave result unset.
ErrorCode MeasureBySelector(int32 selector, const WaveformRequest& rq, f64* result, f64* times);

}  // namespace tsm
