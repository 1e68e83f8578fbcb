#include "measure/transitions.h"

#include <algorithm>
#include <cstdint>

#include "frame/workspace.h"
#include "stats/order.h"

namespace tsm {
namespace {

struct Transition {
  int32 lowIndex, highIndex, first, last;
  f64 lowPos, highPos, start, end;
  int32 direction;
};

// Complete transitions between the two levels, at most `capacity`. Arming
// takes a visit at or beyond a level; the latest crossing of each level
// counts, so a runt that falls back only moves the start.
int32 FindTransitions(const f64* x, int32 n, f64 t0, f64 low, f64 high, Transition* list, std::int64_t capacity) {
  int32 found = 0, dir = kNoDirection;
  bool armed = false, lowSeen = false, highSeen = false;
  Transition t{};
  for (int32 i = 0; i + 1 < n && found < capacity; ++i) {
    if (x[i] >= high && dir != kFalling) {
      armed = true;
      dir = kFalling;
    } else if (low >= x[i] && dir != kRising) {
      armed = true;
      dir = kRising;
    }
    if (!armed) continue;
    if (Crosses(x, i, low)) {
      t.lowPos = CrossingPosition(x, i, low, t0);
      t.lowIndex = i + 1;
      lowSeen = true;
    }
    if (Crosses(x, i, high)) {
      t.highPos = CrossingPosition(x, i, high, t0);
      t.highIndex = i + 1;
      highSeen = true;
    }
    if (lowSeen && highSeen) {
      t.direction = dir;
      const bool rising = dir == kRising;
      t.start = rising ? t.lowPos : t.highPos;
      t.end = rising ? t.highPos : t.lowPos;
      t.first = rising ? t.lowIndex : t.highIndex;
      t.last = rising ? t.highIndex : t.lowIndex;
      list[found++] = t;
      armed = lowSeen = highSeen = false;
    }
  }
  return found;
}

struct Shoot {
  f64 under, over;
};

// Excursions of x[from..to] below and above `state`, in percent of the amplitude.
Shoot ShootOf(const f64* x, int32 from, int32 to, f64 state, f64 amplitude) {
  f64 mn, mx;
  int32 at;
  ArrayMaxMin(x + from, to - from + 1, &mx, &at, &mn, &at);
  return {100 * (state - mn) / amplitude, (mx - state) * 100 / amplitude};
}

}  // namespace

ErrorCode MeasureTransition(const WaveformRequest& rq, TransitionFigures* out) {
  *out = TransitionFigures{};
  if (rq.number < 1) return TSM_ERR_PULSE_NUMBER;
  StateLevelsFound s{};
  ErrorCode e = FindStateLevels(rq.x, rq.n, rq.dt, rq.levels, &s);
  if (e != TSM_SUCCESS) return e;
  const References r = ResolveReferences(rq.refs, rq.percent, s);
  if (r.mid < r.low || r.high < r.mid) return TSM_ERR_REFERENCE_ORDER;

  // Shoots are measured against the histogram's states whenever the levels
  // came from the bare extremes or from a half-populated histogram.
  const LevelSetup& how = rq.levels;
  const bool rebin = s.resolved == kLevelMinMax;
  if (rebin || (s.resolved == kLevelAuto && how.option == 1)) {
    if (rebin && (e = FillLevelHistogram(rq.x, rq.n, s.min, s.max, how.counts, how.bins)) != TSM_SUCCESS) return e;
    s.low = LowSide(how.counts, how.bins, s.min, s.max).level;
    s.high = HighSide(how.counts, how.bins, s.min, s.max).level;
  }
  const f64 amplitude = s.high - s.low;

  if (r.low >= r.high) return TSM_ERR_REFERENCE_ORDER;
  const std::int64_t p = rq.number, capacity = 2 * p + 1;
  Scratch<Transition> list;
  if (list.Allocate(capacity) != TSM_SUCCESS) return TSM_ERR_NO_PULSE;
  const int32 count = FindTransitions(rq.x, rq.n, rq.t0, r.low, r.high, list.get(), capacity);
  std::int64_t k = 0, seen = 0;
  for (; k < count; ++k)
    if (list[k].direction == rq.polarity && ++seen == p) break;
  if (k == count) return TSM_ERR_INCOMPLETE_TRANSITION;
  // The last of a full list has a successor that was never searched for.
  if (k + 1 == count && count == capacity) return TSM_ERR_INCOMPLETE_TRANSITION;

  const Transition& t = list[k];
  const bool rising = t.direction == kRising;
  const int32 w = t.last == t.first ? 1 : t.last - t.first;
  const int32 option = how.option;
  TransitionFigures f{};
  f.refs = r;

  // Bounds in 64 bits: midpoints and three widths may pass the int32 range.
  using I64 = std::int64_t;
  I64 left = k == 0 ? 0 : (I64{list[k - 1].last} + t.first) / 2;
  if (option == 1) left = std::max(left, I64{t.first} - 3 * I64{w});
  int32 j = t.first;
  while (j > left + 1 && !(rising ? rq.x[j] <= s.low : rq.x[j] >= s.high)) --j;
  const Shoot pre = ShootOf(rq.x, static_cast<int32>(left), j, rising ? s.low : s.high, amplitude);

  I64 right = k + 1 < count ? (I64{t.last} + list[k + 1].first) / 2 : rq.n - 1;
  if (option == 1) right = std::min(right, I64{t.last} + 3 * I64{w});
  j = t.last;
  while (j < right - 1 && !(rising ? rq.x[j] >= s.high : rq.x[j] <= s.low)) ++j;
  const Shoot post = ShootOf(rq.x, j, static_cast<int32>(right), rising ? s.high : s.low, amplitude);
  f.preUnder = pre.under;
  f.preOver = pre.over;
  f.postUnder = post.under;
  f.postOver = post.over;

  f.duration = t.end - t.start;
  if (!(f.duration > 0)) return TSM_ERR_PULSE_MISSING;
  f.slope = (r.high - r.low) / f.duration;
  f.duration *= rq.dt;
  f.slope /= rq.dt;
  f.start = rq.t0 + (t.start - rq.t0) * rq.dt;
  f.end = rq.t0 + (t.end - rq.t0) * rq.dt;
  *out = f;
  return TSM_SUCCESS;
}

}  // namespace tsm
