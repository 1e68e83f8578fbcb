#include "measure/pulse.h"

#include <algorithm>
#include <cmath>
#include <cstdint>

#include "frame/workspace.h"
#include "stats/descriptive.h"

namespace tsm {
namespace {

struct Edge {
  f64 position;
  int32 direction;
  int32 index;  // first sample past the crossing
};

// Crossings of mid, armed by a visit to the far side of the hysteresis band
// and disarmed by each crossing; at most `capacity` of them.
int32 FindMidCrossings(const f64* x, int32 n, f64 t0, f64 mid, f64 h, Edge* edges, std::int64_t capacity) {
  int32 found = 0, dir = kNoDirection;
  bool armed = false;
  for (int32 i = 0; i + 1 < n && found < capacity; ++i) {
    if (x[i] >= mid + h && dir != kFalling) {
      armed = true;
      dir = kFalling;
    } else if (x[i] <= mid - h && dir != kRising) {
      armed = true;
      dir = kRising;
    }
    if (armed && Crosses(x, i, mid)) {
      edges[found++] = Edge{CrossingPosition(x, i, mid, t0), dir, i + 1};
      armed = false;
    }
  }
  return found;
}

// A float index truncated toward zero, held inside int32 (NaN gives 0).
int32 TruncIndex(f64 v) {
  if (!(v > -2147483648.0)) return v < 0 ? INT32_MIN : 0;
  if (v >= 2147483647.0) return INT32_MAX;
  return static_cast<int32>(v);
}

}  // namespace

f64 CrossingPosition(const f64* x, int32 i, f64 level, f64 t0) {
  f64 d = x[i] - x[i + 1];
  if (d == 0) d = 1;
  return i + t0 + (x[i] - level) / d;
}

ErrorCode ReferencesOf(const WaveformRequest& rq, StateLevelsFound* states, References* refs) {
  *refs = rq.refs;
  if (!rq.percent)
    return rq.levels.option == 0 || rq.levels.option == 1 ? TSM_SUCCESS : TSM_ERR_BAD_SELECTOR;
  const ErrorCode e = FindStateLevels(rq.x, rq.n, rq.dt, rq.levels, states);
  if (e == TSM_SUCCESS) *refs = ResolveReferences(rq.refs, true, *states);
  return e;
}

ErrorCode MeasurePulse(const WaveformRequest& rq, PulseFigures* out) {
  *out = PulseFigures{};
  if (rq.number < 1) return TSM_ERR_PULSE_NUMBER;
  StateLevelsFound states{};
  References r;
  ErrorCode e = ReferencesOf(rq, &states, &r);
  if (e != TSM_SUCCESS) return e;
  const f64 h = std::min(r.high - r.mid, r.mid - r.low);
  if (h < 0) return TSM_ERR_REFERENCE_ORDER;

  const std::int64_t p = rq.number, capacity = 2 * p + 1;
  Scratch<Edge> edges;
  if (edges.Allocate(capacity) != TSM_SUCCESS) return TSM_ERR_NO_PULSE;
  const int32 count = FindMidCrossings(rq.x, rq.n, rq.t0, r.mid, h, edges.get(), capacity);
  if (count < capacity) {
    if (!rq.ignorePeriod || count < 2 * p) return TSM_ERR_TOO_FEW_CROSSINGS;
    if (edges[count - 1].direction == rq.polarity) return TSM_ERR_TOO_FEW_CROSSINGS;
  }

  std::int64_t k = 2 * p - 2;
  if (rq.polarity != -1) {
    std::int64_t seen = 0;
    for (k = 0; k < count; ++k)
      if (edges[k].direction == rq.polarity && ++seen == p) break;
    // A polarity that no crossing has leaves too few crossings of its kind.
    if (k + 1 >= count) return TSM_ERR_TOO_FEW_CROSSINGS;
  }
  PulseFigures f{};
  f.refs = r;
  f.width = edges[k + 1].position - edges[k].position;
  f.center = (edges[k].position + edges[k + 1].position) / 2;
  if (!rq.ignorePeriod) {
    f.period = edges[2 * p].position - edges[2 * p - 2].position;
    f.dutyCycle = f.width / f.period;
  }
  f.width *= rq.dt;
  f.period *= rq.dt;
  f.center = rq.t0 + (f.center - rq.t0) * rq.dt;
  *out = f;
  return TSM_SUCCESS;
}

ErrorCode MeasureCycle(const WaveformRequest& rq, CycleFigures* out) {
  *out = CycleFigures{};
  WaveformRequest q = rq;
  q.polarity = -1;
  q.ignorePeriod = false;
  PulseFigures pulse;
  ErrorCode e = MeasurePulse(q, &pulse);
  if (e != TSM_SUCCESS) return e;
  CycleFigures f{};
  f.refs = pulse.refs;
  f.start = pulse.center - pulse.width / 2;
  f.end = f.start + pulse.period;
  int32 count = TruncIndex(pulse.period / rq.dt + 0.5);
  int32 first = TruncIndex(0.5 + (f.start - rq.t0) / rq.dt);
  if (count < 1) return TSM_ERR_NO_CYCLE;
  // The cycle is moved back to end with the signal; the guards below keep
  // the samples inside it whatever the positions were.
  count = std::min(count, rq.n);
  if (static_cast<std::int64_t>(first) + count > rq.n) first = rq.n - count;
  first = std::max(first, 0);
  e = MeanOfArray(rq.x + first, count, &f.mean);
  if (e == TSM_SUCCESS) e = RmsOfArray(rq.x + first, count, &f.rms);
  if (e != TSM_SUCCESS) return e;
  *out = f;
  return TSM_SUCCESS;
}

}  // namespace tsm
