// The noise generators through host handles: the uniform stream against an
// exact rational reference (tools/golden/noise_golden.py), the deviates against
// their exact distributions (Kolmogorov-Smirnov and chi-square at about four
// standard deviations, for fixed seeds), continuation across calls, the
// riffles as permutations with the exact distribution of each mode, every
// code with its order, and the failure paths.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <fstream>
#include <functional>
#include <map>
#include <numeric>
#include <sstream>
#include <string>
#include <vector>

#include "support/host_arrays.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;
using LD = long double;
const bool gMoving = (tsrt_always_move(1), true);

struct Golden {
  std::map<int32_t, V> uniform;
  std::map<int32_t, std::vector<int32_t>> int15, words;
};
const Golden& Gold() {
  static const Golden g = [] {
    Golden r;
    std::ifstream file(TSM_TEST_DATA "/noise_golden.txt");
    std::string line, kind;
    while (std::getline(file, line)) {
      if (line.empty() || line[0] == '#') continue;
      std::istringstream in(line);
      int32_t seed;
      in >> kind >> seed;
      std::string tok;
      while (in >> tok) {
        if (kind == "uniform") r.uniform[seed].push_back(std::strtod(tok.c_str(), nullptr));
        else (kind == "int15" ? r.int15 : r.words)[seed].push_back(std::stoi(tok));
      }
    }
    return r;
  }();
  return g;
}

// The caller's records of a stream, and one call of a noise entry: kind,
// count, the distribution's parameter (amp, sd, order, mean or trials), the
// binomial p. ret is the entry's result, code its error code; the output
// starts with a stale sample.
struct Rec {
  NoiseState s{};
  GaussSpare g{};
  BinomialCache c{};
};
struct Res {
  int32_t ret, code;
  V y;
};
Res NoiseInto(F64& out, U32& bin, const std::string& kind, int32_t n, double a, int32_t seed, Rec& r, double p) {
  int32_t e = 1, ret;
  if (kind == "white") ret = white(out.Handle(), &n, &a, &seed, &e, &r.s);
  else if (kind == "gauss") ret = Gauss(out.Handle(), &n, &a, &seed, &e, &r.s, &r.g);
  else if (kind == "period") ret = PeriodNoise(&n, &a, &seed, out.Handle(), &e, &r.s);
  else if (kind == "gamma") ret = e = GammaNoiseH(out.Handle(), n, static_cast<int32_t>(a), seed, &r.s);
  else if (kind == "poisson") ret = e = PoissonNoiseH(out.Handle(), n, a, seed, &r.s);
  else ret = e = BinomialNoiseH(bin.Handle(), n, static_cast<int32_t>(a), p, seed, &r.s, &r.c);
  if (kind != "binomial") return {ret, e, out.Values()};
  const auto u = bin.Values();
  return {ret, e, V(u.begin(), u.end())};
}
Res Noise(const std::string& kind, int32_t n, double a, int32_t seed, Rec& r, double p = 0.5) {
  F64 out{7};
  U32 bin{7};
  return NoiseInto(out, bin, kind, n, a, seed, r, p);
}
V Samples(const std::string& kind, int32_t n, double a, int32_t seed, double p = 0.5) {
  Rec r;
  return Noise(kind, n, a, seed, r, p).y;
}

TEST(Noise, UniformStreamAndWordsMatchTheReference) {
  for (const auto& [seed, u] : Gold().uniform) {
    Rec r{{5, 6, 7}};
    const V y = Noise("white", 40, 0.5, seed, r).y;
    ASSERT_EQ(y.size(), u.size()) << seed;
    for (size_t i = 0; i < u.size(); ++i) EXPECT_NEAR(y[i] + 0.5, u[i], 4 * kEps) << seed << " " << i;
    EXPECT_EQ((std::vector<int32_t>{r.s.s1, r.s.s2, r.s.s3}), Gold().words.at(seed)) << seed;
  }
  EXPECT_EQ(Samples("white", 5, 3, 0), V(5, -3.0));  // a record of zeros sticks at 0
}

// Kolmogorov-Smirnov distance of samples from a CDF.
double KsDistance(V x, const std::function<LD(LD)>& cdf) {
  std::sort(x.begin(), x.end());
  double d = 0;
  const double n = x.size();
  for (size_t i = 0; i < x.size(); ++i) {
    const double f = cdf(x[i]);
    d = std::max({d, std::fabs(f - i / n), std::fabs((i + 1) / n - f)});
  }
  return d;
}
// P(X <= x) for the gamma distribution of integer order k.
LD GammaCdf(int k, LD x) {
  if (x <= 0) return 0;
  LD term = 1, sum = 1;
  for (int j = 1; j < k; ++j) sum += term *= x / j;
  return 1 - std::exp(-x) * sum;
}

// Chi-square of integer samples against a pmf, bins merged from the left
// until each expects 5 or more, the tails folded into the outer bins.
void ExpectChiSquare(const V& x, const std::function<LD(int)>& pmf, int kmax, const std::string& what) {
  const LD n = x.size();
  std::vector<LD> expect;
  std::vector<int> upper;  // last k of each bin
  LD acc = 0;
  for (int k = 0; k <= kmax; ++k) {
    acc += pmf(k) * n;
    if (acc >= 5) expect.push_back(acc), upper.push_back(k), acc = 0;
  }
  expect.back() += acc, upper.back() = kmax;
  expect.back() += n - std::accumulate(expect.begin(), expect.end(), 0.0L);
  std::vector<LD> seen(expect.size(), 0);
  for (double v : x) {
    ASSERT_EQ(v, std::floor(v)) << what;
    ASSERT_GE(v, 0) << what;
    const size_t b = std::lower_bound(upper.begin(), upper.end(), static_cast<int>(v)) - upper.begin();
    ++seen[std::min(b, seen.size() - 1)];
  }
  LD chi = 0;
  for (size_t b = 0; b < seen.size(); ++b) chi += (seen[b] - expect[b]) * (seen[b] - expect[b]) / expect[b];
  const double df = seen.size() - 1.0;
  EXPECT_LT(chi, df + 4 * std::sqrt(2 * df)) << what << " df " << df;
}

TEST(Noise, DeviatesFollowTheirExactDistributions) {
  constexpr int32_t kN = 20000;
  const double bound = 1.95 / std::sqrt(kN);  // KS at p = 0.001
  EXPECT_LT(KsDistance(Samples("gauss", kN, 2, 17), [](LD x) { return 0.5L * std::erfc(-x / (2 * std::sqrt(2.0L))); }),
            bound);
  for (int order : {1, 5, 6, 20})
    EXPECT_LT(KsDistance(Samples("gamma", kN, order, 29), [&](LD x) { return GammaCdf(order, x); }), bound) << order;
  for (double mean : {0.5, 11.999, 12.0, 40.0}) {
    const auto pmf = [&](int k) { return std::exp(k * std::log(static_cast<LD>(mean)) - mean - std::lgamma(k + 1.0L)); };
    ExpectChiSquare(Samples("poisson", kN, mean, 31), pmf, static_cast<int>(mean + 12 * std::sqrt(mean) + 12),
                    "poisson " + std::to_string(mean));
  }
  // Direct counts, the Poisson-type count below mean 1, rejection; mirrored.
  const std::vector<std::pair<int, double>> cases = {{10, 0.3}, {24, 0.5}, {25, 0.5}, {200, 0.004}, {30, 0.97},
                                                     {100, 0.7}, {1000, 0.25}};
  for (const auto& [trials, p] : cases) {
    // Below mean 1 the count is Poisson with that mean, capped at trials.
    const LD pp = std::min(p, 1 - p), am = trials * pp;
    const auto poisson = [&](int j) { return std::exp(j * std::log(am) - am - std::lgamma(j + 1.0L)); };
    const auto pmf = [&](int k) {
      if (trials < 25 || am >= 1)
        return std::exp(std::lgamma(trials + 1.0L) - std::lgamma(k + 1.0L) - std::lgamma(trials - k + 1.0L) +
                        k * std::log(static_cast<LD>(p)) + (trials - k) * std::log1p(-static_cast<LD>(p)));
      const int j = pp == p ? k : trials - k;
      LD below = 0;
      for (int i = 0; i < trials; ++i) below += poisson(i);
      return j < trials ? poisson(j) : 1 - below;
    };
    ExpectChiSquare(Samples("binomial", kN, trials, 37, p), pmf, trials, "binomial " + std::to_string(trials));
  }
  EXPECT_EQ(Samples("binomial", 6, 40, 3, 0.0), V(6, 0.0));
  EXPECT_EQ(Samples("binomial", 6, 40, 3, 1.0), V(6, 40.0));
}

// Below its switch point each direct method is a plain function of the
// reference stream; at the switch point the rejection method takes over.
TEST(Noise, DirectMethodsFollowTheReferenceStream) {
  const V& u = Gold().uniform.at(1);
  const auto gamma = [&](int order) { LD prod = 1; for (int j = 0; j < order; ++j) prod *= u[j]; return -std::log(prod); };
  const auto poisson = [&](double mean) {
    V out;
    for (size_t at = 0; out.size() < 2;) {
      double k = -1, t = 1;
      do k += 1, t *= u.at(at++);
      while (t > std::exp(-mean));
      out.push_back(k);
    }
    return out;
  };
  const auto binomial = [&](int trials, double p) { double c = 0; for (int j = 0; j < trials; ++j) c += u[j] < p; return V{c}; };
  size_t at = 0;  // the polar method: b f now, a f kept for the next output
  LD a, b, r;
  do a = 2.0L * u[at] - 1, b = 2.0L * u[at + 1] - 1, r = a * a + b * b, at += 2;
  while (!(r < 1 && r > 0));
  const LD f = std::sqrt(-2 * std::log(r) / r);
  const V gs = Samples("gauss", 2, 3, 1);
  EXPECT_NEAR(gs[0], static_cast<double>(3 * b * f), 1e-12);
  EXPECT_NEAR(gs[1], static_cast<double>(3 * a * f), 1e-12);
  EXPECT_NEAR(Samples("gamma", 1, 5, 1)[0], static_cast<double>(gamma(5)), 1e-14);
  EXPECT_NE(Samples("gamma", 1, 6, 1)[0], static_cast<double>(gamma(6)));
  EXPECT_EQ(Samples("poisson", 2, 11.99, 1), poisson(11.99));
  EXPECT_NE(Samples("poisson", 2, 12, 1), poisson(12));
  EXPECT_EQ(Samples("binomial", 1, 24, 1, 0.3), binomial(24, 0.3));
  EXPECT_EQ(Samples("binomial", 1, 24, 1, 0.7), V{24 - binomial(24, 0.3)[0]});
  EXPECT_NE(Samples("binomial", 1, 25, 1, 0.4), binomial(25, 0.4));
}

// One call of 25 samples equals a call of 1 or 10 and one of the rest, the
// second continuing the first through the caller's records.
TEST(Noise, StreamsContinueAcrossCalls) {
  for (const auto& [kind, a, p] : std::vector<std::tuple<std::string, double, double>>{
           {"white", 2, 0}, {"gauss", 1.5, 0}, {"gamma", 9, 0}, {"poisson", 30, 0}, {"binomial", 60, 0.6}}) {
    for (int32_t split : {1, 10}) {
      Rec r;
      const V whole = Noise(kind, 25, a, 4321, r, p).y;
      V parts = Noise(kind, split, a, 4321, r, p).y;
      const V rest = Noise(kind, 25 - split, a, -1, r, p).y;
      parts.insert(parts.end(), rest.begin(), rest.end());
      EXPECT_EQ(parts, whole) << kind << " " << split;
    }
  }
  // A seed of 0 continues too; Gauss reseeds only above 0, clearing the spare.
  Rec r, cleared{{}, {1, 99.0}};
  const V pair = Samples("gauss", 2, 1, 8);
  EXPECT_EQ(Noise("gauss", 1, 1, 8, r).y[0], pair[0]);
  EXPECT_EQ(Noise("gauss", 1, 1, 0, r).y[0], pair[1]);
  EXPECT_EQ(Noise("gauss", 1, 1, 8, cleared).y[0], pair[0]);
}

// Each permutation of n as an index into n!, via its Lehmer code.
int PermIndex(const std::vector<int32_t>& p) {
  int idx = 0;
  for (size_t i = 0; i < p.size(); ++i) {
    int smaller = 0;
    for (size_t j = i + 1; j < p.size(); ++j) smaller += p[j] < p[i];
    idx = idx * static_cast<int>(p.size() - i) + smaller;
  }
  return idx;
}

// A riffle of data 0.5, 1.5, ... through one of the entries: kind "dbl",
// "cdb", "int" or "num"; mode -1 calls the older entry. The indices, with the
// data checked against them.
struct Perm {
  int32_t code;
  std::vector<int32_t> idx;
};
Perm RiffleCall(const std::string& kind, int32_t n, int32_t seed, int mode) {
  V d(n);
  std::iota(d.begin(), d.end(), 0.5);
  F64 dd(d);
  std::vector<cx> c(n);
  for (int32_t i = 0; i < n; ++i) c[i] = {d[i], -d[i]};
  Cx cd(c);
  std::vector<int32_t> iv(n);
  std::iota(iv.begin(), iv.end(), 100);
  I32 id(iv), idx{9}, num{9};
  NoiseState s{};
  const uint32_t m = mode < 0 ? 0 : mode;
  const bool old = mode < 0;
  int32_t code;
  if (kind == "dbl") code = old ? RiffleArrayDBL_head(dd.Handle(), idx.Handle(), seed, &s) : RiffleArrayDBL2012_head(dd.Handle(), idx.Handle(), seed, &s, m);
  else if (kind == "cdb") code = old ? RiffleArrayCDB_head(cd.Handle(), idx.Handle(), seed, &s) : RiffleArrayCDB2012_head(cd.Handle(), idx.Handle(), seed, &s, m);
  else if (kind == "int") code = old ? RiffleArrayInt_head(id.Handle(), idx.Handle(), seed, &s) : RiffleArrayInt2012_head(id.Handle(), idx.Handle(), seed, &s, m);
  else code = old ? RiffleIntNum_head(num.Handle(), n, seed, &s) : RiffleIntNum2012_head(num.Handle(), n, seed, &s, m);
  if (kind == "num") return {code, num.Values()};
  const auto p = idx.Values();
  for (int32_t i = 0; i < static_cast<int32_t>(p.size()); ++i) {
    const double got = kind == "dbl" ? dd.At(i) : kind == "cdb" ? -cd.At(i).im : id.At(i) - 99.5;
    EXPECT_EQ(got, d[p[i]]) << kind << " " << i;
  }
  return {code, p};
}

TEST(Noise, RifflesPermuteWithTheExactDistributionOfTheirMode) {
  // Mode 0 swaps each i with j uniform over all n: enumerate the n^n paths.
  constexpr int n = 3, kFact = 6, kSeeds = 30000;
  std::vector<LD> classic(kFact, 0);
  for (int path = 0; path < 27; ++path) {
    std::vector<int32_t> p{0, 1, 2};
    for (int i = 0, c = path; i < n; ++i, c /= n) std::swap(p[i], p[c % n]);
    classic[PermIndex(p)] += 1.0L / 27;
  }
  for (int mode : {0, 1, 7}) {
    V idx;
    for (int k = 1; k <= kSeeds; ++k) idx.push_back(PermIndex(RiffleCall("num", n, k, mode).idx));
    ExpectChiSquare(idx, [&](int k) { return mode == 0 ? classic[k] : 1.0L / kFact; }, kFact - 1,
                    "mode " + std::to_string(mode));
  }
  // Every entry gives the same permutation; the older entries are mode 0.
  for (int mode : {0, 1}) {
    const auto p = RiffleCall("num", 9, 5, mode).idx;
    auto sorted = p;
    std::sort(sorted.begin(), sorted.end());
    for (int32_t i = 0; i < 9; ++i) EXPECT_EQ(sorted[i], i);
    for (const char* kind : {"dbl", "cdb", "int", "num"}) {
      EXPECT_EQ(RiffleCall(kind, 9, 5, mode).idx, p) << kind;
      if (mode == 0) {
        EXPECT_EQ(RiffleCall(kind, 9, 5, -1).idx, p) << kind;
      }
    }
  }
  EXPECT_EQ(RiffleCall("num", 1, 3, 1).idx, std::vector<int32_t>{0});
}

// Inverse DFT of the flat spectrum with the reference's 15-bit phases, with
// scratch from the heap, from the arena, and from an arena too small (-20001).
TEST(Noise, PeriodNoiseIsTheInverseTransformOfItsSpectrum) {
  const auto& ks = Gold().int15.at(12345);
  for (int32_t n : {1, 2, 7, 8, 30}) {
    const V y = Samples("period", n, 1.5, 12345);
    ASSERT_EQ(y.size(), static_cast<size_t>(n));
    for (int t = 0; t < n; ++t) {
      LD sum = 0;  // bins k and n-k together: 2 mag cos(angle + 2 pi k t / n), mag = 1.5 n / 2
      for (int k = 1; 2 * k < n; ++k) sum += 1.5L * n * std::cos(ks[k - 1] + 2 * 3.14159265358979323846L * k * t / n);
      EXPECT_NEAR(y[t], static_cast<double>(sum / n), 64 * kEps * n) << n << " " << t;
    }
  }
  const V heap = Samples("period", 64, 1, 3);
  for (uint32_t size : {1u << 16, 100u}) {
    ScopedWorkspace ws(size);
    Rec r;
    const Res arena = Noise("period", 64, 1, 3, r);
    EXPECT_EQ(arena.code, size == 100u ? -20001 : 0);
    EXPECT_EQ(arena.y, size == 100u ? V{} : heap);
  }
}

// The checks in their order, each emptying the output.
TEST(Noise, CodesInTheirOrder) {
  const double nan = std::nan("");
  const std::vector<std::tuple<std::string, int32_t, double, double, int32_t>> cases = {
      {"white", 0, 1, 0, -20003},      {"gauss", -1, 1, 0, -20003},     {"period", 0, 1, 0, -20003},
      {"gamma", 0, 0, 0, -20061},      {"gamma", 0, 3, 0, -20003},      {"poisson", 0, 0, 0, -20061},
      {"poisson", 5, nan, 0, -20061},  {"poisson", 5, INFINITY, 0, -20061}, {"poisson", 0, 2, 0, -20003},
      {"binomial", 0, -1, 0.5, -20061}, {"binomial", 0, 5, 1.5, -20061}, {"binomial", 0, 5, nan, -20061},
      {"binomial", 0, 5, -0.1, -20061}, {"binomial", 0, 5, 0.5, -20003}};
  for (const auto& [kind, n, a, p, code] : cases) {
    Rec r;
    const Res res = Noise(kind, n, a, 1, r, p);
    EXPECT_EQ(res.code, code) << kind << " " << n << " " << a << " " << p;
    EXPECT_EQ(res.ret, kind == "white" || kind == "gauss" || kind == "period" ? 0 : code) << kind;
    EXPECT_TRUE(res.y.empty()) << kind;
  }
  for (const char* kind : {"dbl", "cdb", "int", "num"}) {
    const Perm p = RiffleCall(kind, 0, 1, 0);
    EXPECT_EQ(p.code, -20003) << kind;
    EXPECT_TRUE(p.idx.empty()) << kind;
  }
}

TEST(Noise, HostResizeFailuresEmptyTheOutputs) {
  for (const char* kind : {"white", "gauss", "period", "gamma", "poisson", "binomial"}) {
    Rec r;
    Res last;
    const bool formA = std::string(kind) == "white" || std::string(kind) == "gauss" || std::string(kind) == "period";
    F64 out{7};
    U32 bin{7};
    const auto call = [&] { last = NoiseInto(out, bin, kind, 5, 8, 1, r, 0.5); return last.ret; };
    const int made = RunFailingEachResize(call, [&](int, int32_t ret) {
      EXPECT_EQ(last.code, -20001) << kind;
      EXPECT_TRUE(formA ? ret != 0 : ret == -20001) << kind;
      EXPECT_TRUE(last.y.empty()) << kind;
    });
    EXPECT_EQ(made, 1) << kind;
  }
  F64 data{1, 2, 3};
  I32 idx, num;
  NoiseState s{};
  RunFailingEachResize([&] { return RiffleArrayDBL2012_head(data.Handle(), idx.Handle(), 1, &s, 1); }, [&](int, int32_t ret) {
    EXPECT_EQ(ret, -20001);
    EXPECT_EQ(idx.Count() + data.Count(), 0);
  });
  RunFailingEachResize([&] { return RiffleIntNum2012_head(num.Handle(), 4, 1, &s, 1); }, [&](int, int32_t ret) {
    EXPECT_EQ(ret, -20001);
    EXPECT_EQ(num.Count(), 0);
  });
}

}  // namespace
}  // namespace tsmtest
