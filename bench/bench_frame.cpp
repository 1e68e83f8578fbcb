// Scratch allocation (workspace arena against the C heap) and the median
// (MedianOfArray against std::nth_element). Read the pairs as ratios:
// BM_ArenaAllocFree/N over BM_MallocFree/N, BM_Median/N over BM_NthElement/N.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <random>
#include <vector>

#include "frame/arena.h"
#include "frame/workspace.h"
#include "stats/order.h"
#include "tsrt.h"

namespace {

constexpr int kLiveBlocks = 8;
// Room for kLiveBlocks requests of the largest size with every header and spare.
constexpr std::uint32_t kArenaPerBlock = 64;
constexpr std::uint32_t kArenaExtra = 4096;
constexpr std::uint32_t kSeed = 20240611;

// Makes and enables the arena for the benchmark's lifetime; removes it after.
class ArenaOn {
 public:
  explicit ArenaOn(benchmark::State& state, std::uint32_t bytes) : state_(state) {
    const std::int32_t before = tsrt_cleanup_count();
    if (tsm::WorkspaceSize(bytes) != TSM_SUCCESS || tsm::WorkspaceEnable(true) != TSM_SUCCESS) {
      state.SkipWithError("cannot make the workspace arena");
      return;
    }
    if (tsrt_cleanup_count() != before + 1) state.SkipWithError("arena clean-up not registered with the host");
    // Make sure requests really land in the arena, not on the heap.
    void* p = nullptr;
    tsm::AnalysisAlloc(&p, 16);
    const auto a = reinterpret_cast<std::uintptr_t>(p);
    if (a < tsm::gArena.base.load() || a >= tsm::gArena.limit.load()) state.SkipWithError("block not in the arena");
    tsm::AnalysisFree(p);
  }
  ~ArenaOn() {
    tsm::WorkspaceEnable(false);
    if (tsm::WorkspaceSize(0) != TSM_SUCCESS) state_.SkipWithError("arena not removed: blocks still live");
  }

 private:
  benchmark::State& state_;
};

std::uint32_t ArenaBytes(std::uint32_t size) { return kLiveBlocks * (size + kArenaPerBlock) + kArenaExtra; }

void BM_ArenaAllocFree(benchmark::State& state) {
  const auto size = static_cast<std::uint32_t>(state.range(0));
  ArenaOn arena(state, ArenaBytes(size));
  for (auto _ : state) {
    void* p = nullptr;
    tsm::AnalysisAlloc(&p, size);
    benchmark::DoNotOptimize(p);
    benchmark::ClobberMemory();
    tsm::AnalysisFree(p);
  }
}

void BM_MallocFree(benchmark::State& state) {
  const auto size = static_cast<std::size_t>(state.range(0));
  for (auto _ : state) {
    void* p = std::malloc(size);
    benchmark::DoNotOptimize(p);
    benchmark::ClobberMemory();
    std::free(p);
  }
}

// kLiveBlocks blocks made in turn, freed newest first.
void BM_ArenaLive8(benchmark::State& state) {
  const auto size = static_cast<std::uint32_t>(state.range(0));
  ArenaOn arena(state, ArenaBytes(size));
  void* p[kLiveBlocks];
  for (auto _ : state) {
    for (int i = 0; i < kLiveBlocks; ++i) {
      tsm::AnalysisAlloc(&p[i], size);
      benchmark::DoNotOptimize(p[i]);
    }
    benchmark::ClobberMemory();
    for (int i = kLiveBlocks - 1; i >= 0; --i) tsm::AnalysisFree(p[i]);
  }
}

void BM_MallocLive8(benchmark::State& state) {
  const auto size = static_cast<std::size_t>(state.range(0));
  void* p[kLiveBlocks];
  for (auto _ : state) {
    for (int i = 0; i < kLiveBlocks; ++i) {
      p[i] = std::malloc(size);
      benchmark::DoNotOptimize(p[i]);
    }
    benchmark::ClobberMemory();
    for (int i = kLiveBlocks - 1; i >= 0; --i) std::free(p[i]);
  }
}

#define ALLOC_SIZES Arg(16)->Arg(256)->Arg(4 << 10)->Arg(64 << 10)->Arg(1 << 20)
BENCHMARK(BM_ArenaAllocFree)->ALLOC_SIZES;
BENCHMARK(BM_MallocFree)->ALLOC_SIZES;
BENCHMARK(BM_ArenaLive8)->ALLOC_SIZES;
BENCHMARK(BM_MallocLive8)->ALLOC_SIZES;

std::vector<double> Uniform(std::int64_t n) {
  std::mt19937_64 gen(kSeed);
  std::uniform_real_distribution<double> u(-1.0, 1.0);
  std::vector<double> x(static_cast<std::size_t>(n));
  for (double& v : x) v = u(gen);
  return x;
}

// The median as a user would take it with the standard library: copy, select
// the upper middle, and for even n the largest value below it.
double NthElementMedian(const std::vector<double>& x) {
  std::vector<double> a(x);
  const auto k = static_cast<std::ptrdiff_t>(a.size() / 2);
  std::nth_element(a.begin(), a.begin() + k, a.end());
  const double upper = a[k];
  if (a.size() % 2 == 1) return upper;
  return 0.5 * (upper + *std::max_element(a.begin(), a.begin() + k));
}

void BM_Median(benchmark::State& state) {
  const std::vector<double> x = Uniform(state.range(0));
  const auto n = static_cast<tsm::int32>(x.size());
  double m = 0.0;
  if (tsm::MedianOfArray(x.data(), n, &m) != TSM_SUCCESS || m != NthElementMedian(x)) {
    state.SkipWithError("MedianOfArray disagrees with nth_element");
    return;
  }
  for (auto _ : state) {
    tsm::MedianOfArray(x.data(), n, &m);
    benchmark::DoNotOptimize(m);
  }
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

void BM_NthElement(benchmark::State& state) {
  const std::vector<double> x = Uniform(state.range(0));
  for (auto _ : state) {
    double m = NthElementMedian(x);
    benchmark::DoNotOptimize(m);
  }
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

#define MEDIAN_SIZES Arg(15)->Arg(101)->Arg(1000)->Arg(10000)->Arg(100000)->Arg(1000000)
BENCHMARK(BM_Median)->MEDIAN_SIZES;
BENCHMARK(BM_NthElement)->MEDIAN_SIZES;

}  // namespace
