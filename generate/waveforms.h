// Continuous periodic waves. Each fills y[0..n) and carries its phase (in
// degrees, wrapped into [0, 360)) in the caller's variable, so that successive
// calls give one continuous wave; the phase is written only on success.
// Frequencies are in cycles per sample. All return -20003 for n below 1.
#pragma once

#include "frame/types.h"

namespace tsm {

// amp sin(phase + 2 pi freq i) by a two-step recurrence on the sine and
// cosine chains: five transcendental functions a call whatever n is. The
// sines are clipped into [-|amp|, |amp|], which bounds the drift near
// freq = 1/4 where the recurrence is only marginally stable.
ErrorCode SineWave(f64* y, int32 n, f64 amp, f64 freq, f64* phase);

// amp while the wrapped phase is below duty*3.6 degrees (duty clamped into
// 0 to 100 percent), -amp otherwise.
ErrorCode SquareWave(f64* y, int32 n, f64 amp, f64 freq, f64* phase, f64 duty);

// Rises from 0 to amp over the first half turn, jumps to -amp and rises to 0.
ErrorCode SawtoothWave(f64* y, int32 n, f64 amp, f64 freq, f64* phase);

// 0 up to amp at 90 degrees, down to -amp at 270, back to 0.
ErrorCode TriangleWave(f64* y, int32 n, f64 amp, f64 freq, f64* phase);

// amp times one period of table[0..m) read at the running position, linearly
// interpolated (cyclically) when interp is 1, else the element below. A
// non-finite phase or freq gives -20068; an empty table gives zeros and
// phase 0.
ErrorCode ArbitraryWave(f64* y, int32 n, f64 amp, f64 freq, f64* phase, const f64* table, int32 m,
                        int32 interp);

// amp sin(i (k i + 2 pi f1)) with k = (f2 - f1) pi / n: the frequency runs
// from f1 towards f2 over the n samples.
ErrorCode LinearChirp(f64* y, int32 n, f64 amp, f64 f1, f64 f2);

}  // namespace tsm
