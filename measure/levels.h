// State levels of a two-state waveform and the reference levels derived from
// them. The states come from a histogram between the signal's extremes (the
// most populated bin of the lower 40% and of the upper 40% of the range), from
// the extremes themselves, or from a mix of both.
#pragma once

#include "frame/types.h"

namespace tsm {

enum : uint32 { kLevelHistogram = 0, kLevelMinMax = 1, kLevelAuto = 2 };

// How the states are found. `counts` holds `bins` counters owned by the
// caller; `option` 1 makes the automatic method take the histogram only when
// both sides are populated.
struct LevelSetup {
  uint32 method;
  int32 bins;
  int32* counts;
  int32 option;
};

struct StateLevelsFound {
  f64 low, high, amplitude;
  f64 min, max;
  uint32 resolved;  // the method that actually gave the levels
};

struct References {
  f64 high, mid, low;
};

// The most populated bin of one side of the histogram and its centre.
struct HistogramSide {
  int32 count;
  f64 level;
};

// -20312 for n below 1, -20315 for dt not above 0, -20312 for a null x,
// -20061 for option other than 0 or 1, -20316 for a method above 2.
ErrorCode CheckLevelArgs(const f64* x, int32 n, f64 dt, int32 option, uint32 method);

// Extremes in one pass; -20312 for n below 1.
ErrorCode SignalExtremes(const f64* x, int32 n, f64* min, f64* max);

// Counts x into `bins` equal bins between min and max (indices limited to
// the bins); -20309 when the range is not above 0.
ErrorCode FillLevelHistogram(const f64* x, int32 n, f64 min, f64 max, int32* counts, int32 bins);

// Lower side: bins trunc(0.4 bins) down to 0, a tie going to the lower bin.
// Upper side: bins trunc(0.6 bins) up to bins-1, a tie going to the upper bin.
HistogramSide LowSide(const int32* counts, int32 bins, f64 min, f64 max);
HistogramSide HighSide(const int32* counts, int32 bins, f64 min, f64 max);

// Checks the arguments, then finds the states by the chosen method.
ErrorCode FindStateLevels(const f64* x, int32 n, f64 dt, const LevelSetup& how, StateLevelsFound* out);

// References given as percentages of the amplitude above the low state
// become signal units; otherwise they stand.
References ResolveReferences(const References& r, bool percent, const StateLevelsFound& s);

}  // namespace tsm
