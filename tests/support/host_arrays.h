// Test helpers: host arrays made by the reference host (libtsrt.so), owned by
// RAII wrappers, read back through the exact block layout, plus a driver that
// fails each resize an entry makes in turn.
#pragma once

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <algorithm>
#include <cstring>
#include <type_traits>
#include <functional>
#include <vector>

#include "tsmath/tsmath.h"
#include "tsrt.h"

namespace tsmtest {

template <class Block>
struct BlockType;
template <> struct BlockType<F64Array> { using Elem = double; static constexpr int32_t kType = TSM_TYPE_F64; };
template <> struct BlockType<I32Array> { using Elem = int32_t; static constexpr int32_t kType = TSM_TYPE_I32; };
template <> struct BlockType<U32Array> { using Elem = uint32_t; static constexpr int32_t kType = TSM_TYPE_U32; };
template <> struct BlockType<CxArray> { using Elem = cx; static constexpr int32_t kType = TSM_TYPE_CX128; };
template <> struct BlockType<GenHistIntervalArray> {
  using Elem = GenHistInterval;
  static constexpr int32_t kType = TSM_TYPE_U8;  // a host array of packed 20-byte records
};

// A 1-D host array. `Handle()` is what an entry receives; reads go through
// memcpy because elements are misaligned in the block.
template <class Block>
class HostArray {
 public:
  using Elem = typename BlockType<Block>::Elem;

  HostArray() : HostArray(std::vector<Elem>{}) {}
  explicit HostArray(const std::vector<Elem>& v) {
    const auto bytes = static_cast<int32_t>(v.size() * sizeof(Elem));
    const int32_t n = static_cast<int32_t>(v.size());
    // Records that are not a host element type travel as bytes; the count
    // field still holds the number of records.
    h_ = static_cast<Block**>(tsrt_new_array(BlockType<Block>::kType,
                                             sizeof(Elem) == 1 || std::is_arithmetic_v<Elem> || std::is_same_v<Elem, cx>
                                                 ? n
                                                 : bytes,
                                             nullptr));
    SetCount(n);
    if (!v.empty()) std::memcpy(reinterpret_cast<char*>(*h_) + 4, v.data(), v.size() * sizeof(Elem));
  }
  HostArray(std::initializer_list<Elem> v) : HostArray(std::vector<Elem>(v)) {}
  HostArray(const HostArray&) = delete;
  HostArray& operator=(const HostArray&) = delete;
  ~HostArray() { tsrt_dispose(h_); }

  Block** Handle() const { return h_; }
  int32_t Count() const {
    int32_t n;
    std::memcpy(&n, *h_, 4);
    return n;
  }
  void SetCount(int32_t n) { std::memcpy(*h_, &n, 4); }
  Elem At(int32_t i) const {
    Elem v;
    std::memcpy(&v, reinterpret_cast<const char*>(*h_) + 4 + sizeof(Elem) * i, sizeof v);
    return v;
  }
  std::vector<Elem> Values() const {
    std::vector<Elem> v(static_cast<size_t>(std::max(Count(), 0)));
    if (!v.empty()) std::memcpy(v.data(), reinterpret_cast<const char*>(*h_) + 4, v.size() * sizeof(Elem));
    return v;
  }

 private:
  Block** h_ = nullptr;
};

using F64 = HostArray<F64Array>;
using I32 = HostArray<I32Array>;
using Cx = HostArray<CxArray>;
using U32 = HostArray<U32Array>;
using Intervals = HostArray<GenHistIntervalArray>;

// Runs `call` once per resize it makes, failing the 1st, 2nd, ... resize in
// turn, then once more with no failure. `check(k, result)` is called after
// each failed run; returns how many resizes the clean run made.
inline int RunFailingEachResize(const std::function<int32_t()>& call,
                                const std::function<void(int k, int32_t result)>& check) {
  for (int k = 1; k < 64; ++k) {
    const int64_t before = tsrt_resize_calls();
    tsrt_fail_resize_at(k);
    const int32_t result = call();
    const int64_t made = tsrt_resize_calls() - before;
    tsrt_fail_resize_at(0);
    if (made < k) return k - 1;
    check(k, result);
  }
  ADD_FAILURE() << "an entry made 64 resizes";
  return 64;
}

inline constexpr double kEps = 2.220446049250313e-16;

// The library's NaN for a result that could not be computed: the quiet NaN
// 0x7FF8000000000000 exactly.
inline bool IsLibNaN(double v) {
  std::uint64_t bits;
  std::memcpy(&bits, &v, sizeof bits);
  return bits == 0x7FF8000000000000ull;
}

// A form A entry with a scalar result, called with garbage in both outputs
// beforehand: success must zero the error out-argument.
struct Scalar {
  int32_t ret, err;
  double value;
};
inline Scalar CallScalar(const std::function<int32_t(double*, int32_t*)>& call) {
  Scalar r{-1, 0x5A5A5A5A, 12345.0};
  r.ret = call(&r.value, &r.err);
  return r;
}

// An analysis workspace of `bytes`, enabled for the scope. Removing it fails
// while a scratch block is still out, so a leak shows here.
class ScopedWorkspace {
 public:
  explicit ScopedWorkspace(uint32_t bytes) {
    InitializeAnalysisWorkspaceH(bytes, &e_);
    EnableAnalysisWorkspaceH(&e_);
    const int status = e_.status;
    EXPECT_EQ(status, 0) << "workspace not made";
  }
  ~ScopedWorkspace() {
    DisableAnalysisWorkspaceH(&e_);
    UninitializeAnalysisWorkspaceH(&e_);
    const int status = e_.status;
    EXPECT_EQ(status, 0) << "scratch left live in the arena";
  }
  ScopedWorkspace(const ScopedWorkspace&) = delete;
  ScopedWorkspace& operator=(const ScopedWorkspace&) = delete;

 private:
  ErrorCluster e_{0, 0};
};

}  // namespace tsmtest
