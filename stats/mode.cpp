#include "stats/mode.h"

#include <cmath>
#include <cstdlib>
#include <memory>

#include "stats/histogram.h"
#include "stats/order.h"

namespace tsm {
namespace {

struct FreeDeleter {
  void operator()(void* p) const { std::free(p); }
};
template <class T>
using HeapArray = std::unique_ptr<T[], FreeDeleter>;

template <class T>
HeapArray<T> HeapAlloc(int32 n) {
  return HeapArray<T>(static_cast<T*>(std::malloc(sizeof(T) * static_cast<std::size_t>(n))));
}

// Appends to or restarts the list of modes as candidates of weight `weight`
// come in; `best` is the greatest weight seen.
struct ModeList {
  f64* values;
  int32 count = 0;
  int32 best;
  void Offer(f64 value, int32 weight) {
    if (weight > best) {
      best = weight;
      count = 0;
    }
    if (weight == best) values[count++] = value;
  }
};

ErrorCode BinnedModes(const f64* x, int32 n, int32 intervals, f64* out, int32* count) {
  f64 max, min;
  int32 maxAt, minAt;
  ArrayMaxMin(x, n, &max, &maxAt, &min, &minAt);
  if (std::fabs(max - min) <= std::fabs(max) * kEps) {
    out[0] = max;
    *count = 1;
    return TSM_SUCCESS;
  }
  HeapArray<int32> counts = HeapAlloc<int32>(intervals);
  HeapArray<f64> centres = HeapAlloc<f64>(intervals);
  if (!counts || !centres) return TSM_ERR_NO_MEMORY;
  const ErrorCode r = HistogramFill(x, n, min, max, counts.get(), centres.get(), intervals);
  if (r < 0) return r;
  ModeList list{out, 0, 0};
  for (int32 b = 0; b < intervals; ++b) list.Offer(centres[b], counts[b]);
  *count = list.best > 1 ? list.count : 0;
  return TSM_SUCCESS;
}

// out holds n values: the sorted copy is made there and the modes are
// written over its front as the runs are passed.
ErrorCode ExactModes(const f64* x, int32 n, f64* out, int32* count) {
  SortArray(x, n, 0, out);
  const f64 first = out[0], last = out[n - 1];
  if (std::fabs(first - last) <= std::fabs(first) * kEps) {
    out[0] = first;
    *count = 1;
    return TSM_SUCCESS;
  }
  ModeList list{out, 0, 1};
  for (int32 i = 0; i < n;) {
    const f64 start = out[i];
    int32 j = i + 1;
    while (j < n && std::fabs(out[j] - start) <= std::fabs(start) * kEps) ++j;
    if (j - i > 1) list.Offer(start, j - i);  // writes at most one value per run, behind the read point
    i = j;
  }
  *count = list.count;
  return TSM_SUCCESS;
}

}  // namespace

ErrorCode ModeOfArray(const f64* x, int32 n, int32 intervals, f64** modes, int32* count) {
  *modes = nullptr;
  *count = 0;
  if (n < 1) return TSM_ERR_EMPTY;
  if (n == 1) return TSM_SUCCESS;
  const int32 slots = intervals > 0 ? intervals : n;
  HeapArray<f64> out = HeapAlloc<f64>(slots);
  if (!out) return TSM_ERR_NO_MEMORY;
  const ErrorCode r = intervals > 0 ? BinnedModes(x, n, intervals, out.get(), count)
                                    : ExactModes(x, n, out.get(), count);
  if (r < 0 || *count == 0) {
    *count = 0;
    return r;
  }
  *modes = out.release();
  return r;
}

}  // namespace tsm
