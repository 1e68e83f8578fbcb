// Eight threads creating, using and destroying plans of overlapping lengths
// (nested Rader plans among them) at once. Run under ThreadSanitizer in CI.
#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <random>
#include <thread>
#include <vector>

#include "support/reference_dft.h"
#include "transforms/kwfft.h"

namespace tsmtest {
namespace {

TEST(KwfftConcurrency, PlansSharedAcrossThreads) {
  // 107 -> 106 -> 53 -> 52, 59 -> 58 -> 29, 214 = 2 * 107, and plain lengths.
  const std::vector<int> lengths = {52, 53, 106, 107, 214, 59, 58, 64, 96, 23, 46, 1000, 1};
  struct Case { std::vector<double> re, im; std::vector<CxL> exact; };
  std::vector<Case> cases;
  std::mt19937 rng(3);
  std::uniform_real_distribution<double> u(-1, 1);
  for (int n : lengths) {
    Case c;
    std::vector<CxL> x(n);
    for (int i = 0; i < n; ++i) {
      c.re.push_back(u(rng));
      c.im.push_back(u(rng));
      x[i] = CxL(c.re.back(), c.im.back());
    }
    c.exact = ReferenceDft(x);
    cases.push_back(std::move(c));
  }

  std::atomic<int> wrong{0}, runs{0};
  const auto until = std::chrono::steady_clock::now() + std::chrono::milliseconds(1500);
  std::vector<std::thread> threads;
  for (int t = 0; t < 8; ++t) {
    threads.emplace_back([&, t] {
      std::mt19937 pick(static_cast<unsigned>(t));
      while (std::chrono::steady_clock::now() < until) {
        const size_t i = pick() % lengths.size();
        const int n = lengths[i];
        kwfft_table* plan = tsm::CreateKwfftTable(n);
        std::vector<double> yr(n), yi(n);
        if (plan == nullptr ||
            tsm::kwfft_complex(plan, cases[i].re.data(), cases[i].im.data(), yr.data(), yi.data(), 1, 1, n) != 0 ||
            RelativeRms([&](size_t k) { return CxL(yr[k], yi[k]); }, cases[i].exact) > 1e-14)
          wrong.fetch_add(1);
        tsm::DestroyKwfftTable(plan);
        runs.fetch_add(1);
      }
    });
  }
  for (auto& th : threads) th.join();
  EXPECT_EQ(wrong.load(), 0);
  EXPECT_GT(runs.load(), 100);
  int plans = -1, refs = -1;
  tsm::KwfftCacheCensus(&plans, &refs);
  EXPECT_EQ(plans, 0);
  EXPECT_EQ(refs, 0);
}

}  // namespace
}  // namespace tsmtest
