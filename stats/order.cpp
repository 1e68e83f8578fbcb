#include "stats/order.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <functional>

#include "frame/workspace.h"

namespace tsm {

f64 SelectKth(f64* a, int32 n, int32 k) {
  int32 l = 0;
  int32 ir = n - 1;
  for (;;) {
    if (ir <= l + 1) {  // one or two elements left
      if (ir == l + 1 && a[ir] < a[l]) std::swap(a[l], a[ir]);
      return a[k];
    }
    // Median of a[l], a[mid], a[ir] as pivot at l+1; a[l] <= pivot <= a[ir]
    // then bound the inward scans.
    const int32 mid = l + (ir - l) / 2;
    std::swap(a[mid], a[l + 1]);
    if (a[l] > a[ir]) std::swap(a[l], a[ir]);
    if (a[l + 1] > a[ir]) std::swap(a[l + 1], a[ir]);
    if (a[l] > a[l + 1]) std::swap(a[l], a[l + 1]);
    const f64 pivot = a[l + 1];
    int32 i = l + 1;
    int32 j = ir;
    for (;;) {
      do ++i; while (a[i] < pivot);
      do --j; while (a[j] > pivot);
      if (j < i) break;
      std::swap(a[i], a[j]);
    }
    a[l + 1] = a[j];
    a[j] = pivot;
    if (j >= k) ir = j - 1;
    if (j <= k) l = i;
  }
}

ErrorCode MedianOfArray(const f64* x, int32 n, f64* out) {
  if (n < 1) {
    *out = kNaN;
    return TSM_ERR_EMPTY;
  }
  for (int32 i = 0; i < n; ++i) {
    if (std::isnan(x[i])) {
      *out = kNaN;
      return TSM_ERR_NAN_ARGUMENT;
    }
  }
  Scratch<f64> a;
  if (a.Allocate(n) != TSM_SUCCESS) {
    *out = kNaN;
    return TSM_ERR_NO_MEMORY;
  }
  std::memcpy(a.get(), x, sizeof(f64) * static_cast<std::size_t>(n));
  const int32 k = n / 2;
  const f64 upper = SelectKth(a.get(), n, k);
  if (n % 2 == 1) {
    *out = upper;
    return TSM_SUCCESS;
  }
  // The selection leaves the k smaller values unsorted below k.
  f64 lower = a[0];
  for (int32 i = 1; i < k; ++i) lower = std::max(lower, a[i]);
  *out = (upper + lower) * 0.5;
  return TSM_SUCCESS;
}

ErrorCode SortArray(const f64* src, int32 n, int32 descending, f64* dst) {
  if (n < 1) return TSM_ERR_EMPTY;
  f64* a = const_cast<f64*>(src);  // a null dst asks for the sort in place
  if (dst != nullptr) {
    if (dst != src) std::memmove(dst, src, sizeof(f64) * static_cast<std::size_t>(n));
    a = dst;
  }
  if (n == 1) return TSM_SUCCESS;
  int32 nans = 0;
  for (int32 i = 0; i < n; ++i)
    if (std::isnan(a[i])) std::swap(a[nans++], a[i]);
  if (descending != 0)
    std::sort(a + nans, a + n, std::greater<f64>());
  else
    std::sort(a + nans, a + n);
  return TSM_SUCCESS;
}

ErrorCode ArrayMaxMin(const f64* x, int32 n, f64* max, int32* maxIndex, f64* min, int32* minIndex) {
  if (n < 1) return TSM_ERR_EMPTY;
  int32 i = 0;
  while (i < n && std::isnan(x[i])) ++i;
  if (i == n) {
    *max = *min = kNaN;
    *maxIndex = *minIndex = -1;
    return TSM_SUCCESS;
  }
  f64 hi = x[i], lo = x[i];
  int32 hiAt = i, loAt = i;
  for (++i; i < n; ++i) {
    const f64 v = x[i];
    if (v > hi) {
      hi = v;
      hiAt = i;
    } else if (v < lo) {
      lo = v;
      loAt = i;
    }
  }
  *max = hi;
  *maxIndex = hiAt;
  *min = lo;
  *minIndex = loAt;
  return TSM_SUCCESS;
}

}  // namespace tsm
