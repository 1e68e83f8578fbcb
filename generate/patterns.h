// Patterns of a fixed length: no phase is carried between calls. Each
// returns -20003 for n below 1.
#pragma once

#include "frame/types.h"

namespace tsm {

// amp sin over `cycles` whole cycles of the n samples from the given phase
// (degrees); the phase is only read.
ErrorCode SinePattern(f64* y, int32 n, f64 amp, f64 phase, f64 cycles);

// A square pattern of `cycles` periods with levels amp and 0: period
// round(n/cycles) samples, the first round(duty% of the period) high. duty
// of exactly 100 is amp throughout. cycles above n or not above 0: -20012.
ErrorCode SquarePattern(f64* y, int32 n, f64 amp, f64 duty, f64 cycles);

// From start to end, evenly spaced, linearly or (logScale) in log10. With
// includeEnd the last sample is end exactly (divisor n-1), else the ramp
// stops one step short (divisor n). A log ramp needs start and end above 0
// (-20140).
ErrorCode RampPattern(f64* y, int32 n, f64 start, f64 end, bool includeEnd, bool logScale);

// The frame's checks of a ramp, first failure deciding: -20005 for fewer than
// one sample without the end point, -20006 for fewer than two with it (one is
// enough when start equals end), -20061 for a scale selector above 1.
ErrorCode RampCheck(int32 n, f64 start, f64 end, bool includeEnd, uint32 scale);

// Zeros with amp at index delay; delay outside 0 to n-1: -20017.
ErrorCode ImpulseCheck(int32 n, int32 delay);
ErrorCode ImpulsePattern(f64* y, int32 n, f64 amp, int32 delay);

// Zeros with amp at the width samples from delay on; a pulse that does not
// fit into n samples (or a negative delay or width): -20014.
ErrorCode PulseCheck(int32 n, int32 delay, int32 width);
ErrorCode PulsePattern(f64* y, int32 n, f64 amp, int32 delay, int32 width);

// amp sin(x)/x at x = (i dt - delay) pi, amp at x = 0; dt not above 0: -20016.
ErrorCode SincCheck(f64 dt);
ErrorCode SincPattern(f64* y, int32 n, f64 amp, f64 delay, f64 dt);

}  // namespace tsm
