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

// Calls that fill n samples from a state record; seed -1 continues.
V White(int32_t n, double amp, int32_t seed, NoiseState& s, int32_t* err = nullptr) {
  F64 out{7};
  int32_t e = 1;
  white(out.Handle(), &n, &amp, &seed, err ? err : &e, &s);
  return out.Values();
}
V GaussV(int32_t n, double sd, int32_t seed, NoiseState& s, GaussSpare& g) {
  F64 out;
  int32_t e = 1;
  Gauss(out.Handle(), &n, &sd, &seed, &e, &s, &g);
  return out.Values();
}
V GammaV(int32_t n, int32_t order, int32_t seed, NoiseState& s) {
  F64 out;
  EXPECT_EQ(GammaNoiseH(out.Handle(), n, order, seed, &s), 0);
  return out.Values();
}
V PoissonV(int32_t n, double mean, int32_t seed, NoiseState& s) {
  F64 out;
  EXPECT_EQ(PoissonNoiseH(out.Handle(), n, mean, seed, &s), 0);
  return out.Values();
}
V BinomialV(int32_t n, int32_t trials, double p, int32_t seed, NoiseState& s, BinomialCache& c) {
  U32 out;
  EXPECT_EQ(BinomialNoiseH(out.Handle(), n, trials, p, seed, &s, &c), 0);
  const auto u = out.Values();
  return V(u.begin(), u.end());
}

TEST(Noise, UniformStreamAndWordsMatchTheReference) {
  for (const auto& [seed, u] : Gold().uniform) {
    NoiseState s{5, 6, 7};
    const V y = White(40, 0.5, seed, s);
    ASSERT_EQ(y.size(), u.size()) << seed;
    for (size_t i = 0; i < u.size(); ++i) EXPECT_NEAR(y[i] + 0.5, u[i], 4 * kEps) << seed << " " << i;
    EXPECT_EQ((std::vector<int32_t>{s.s1, s.s2, s.s3}), Gold().words.at(seed)) << seed;
  }
  NoiseState zero{0, 0, 0};
  EXPECT_EQ(White(5, 3, 0, zero), V(5, -3.0));  // a record of zeros sticks at 0
  NoiseState one{0, 0, 0};
  White(1, 1, 1, one);
  EXPECT_EQ((std::vector<int32_t>{one.s1, one.s2, one.s3}), (std::vector<int32_t>{171, 8191 * 172 % 30307, 170}));
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

TEST(Noise, ContinuousDeviatesFollowTheirDistributions) {
  constexpr int32_t kN = 20000;
  const double bound = 1.95 / std::sqrt(kN);  // KS at p = 0.001
  NoiseState s{};
  GaussSpare g{};
  EXPECT_LT(KsDistance(GaussV(kN, 2, 17, s, g), [](LD x) { return 0.5L * std::erfc(-x / (2 * std::sqrt(2.0L))); }),
            bound);
  for (int order : {1, 3, 5, 6, 7, 20}) {
    NoiseState t{};
    EXPECT_LT(KsDistance(GammaV(kN, order, 29, t), [&](LD x) { return GammaCdf(order, x); }), bound) << order;
  }
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

TEST(Noise, DiscreteDeviatesFollowTheirDistributions) {
  constexpr int32_t kN = 20000;
  for (double mean : {0.5, 3.0, 11.999, 12.0, 40.0}) {
    NoiseState s{};
    const auto pmf = [&](int k) { return std::exp(k * std::log(static_cast<LD>(mean)) - mean - std::lgamma(k + 1.0L)); };
    ExpectChiSquare(PoissonV(kN, mean, 31, s), pmf, static_cast<int>(mean + 12 * std::sqrt(mean) + 12),
                    "poisson " + std::to_string(mean));
  }
  // Direct counts, the Poisson-type count below mean 1, rejection; mirrored.
  const std::vector<std::pair<int, double>> cases = {{10, 0.3}, {24, 0.5}, {25, 0.5}, {200, 0.004}, {30, 0.97},
                                                     {100, 0.7}, {1000, 0.25}, {25, 0.04}};
  for (const auto& [trials, p] : cases) {
    NoiseState s{};
    BinomialCache c{};
    // Below mean 1 the count is Poisson with that mean, capped at trials.
    const LD pp = std::min(p, 1 - p), am = trials * pp;
    const auto poisson = [&](int j) { return std::exp(j * std::log(am) - am - std::lgamma(j + 1.0L)); };
    const auto pmf = [&](int k) {
      const LD q = p;
      if (trials < 25 || am >= 1)
        return std::exp(std::lgamma(trials + 1.0L) - std::lgamma(k + 1.0L) - std::lgamma(trials - k + 1.0L) +
                        k * std::log(q) + (trials - k) * std::log1p(-q));
      const int j = pp == p ? k : trials - k;
      LD below = 0;
      for (int i = 0; i < trials; ++i) below += poisson(i);
      return j < trials ? poisson(j) : 1 - below;
    };
    ExpectChiSquare(BinomialV(kN, trials, p, 37, s, c), pmf, trials,
                    "binomial " + std::to_string(trials) + " " + std::to_string(p));
  }
  NoiseState s{};
  BinomialCache c{};
  EXPECT_EQ(BinomialV(6, 40, 0.0, 3, s, c), V(6, 0.0));
  EXPECT_EQ(BinomialV(6, 40, 1.0, 3, s, c), V(6, 40.0));
}

// Below its switch point each direct method is a plain function of the
// reference stream; at the switch point the rejection method takes over.
TEST(Noise, DirectMethodsBelowTheirSwitchPoints) {
  const V& u = Gold().uniform.at(1);
  const auto direct_gamma = [&](int order, int i) {
    LD prod = 1;
    for (int j = 0; j < order; ++j) prod *= u[order * i + j];
    return static_cast<double>(-std::log(prod));
  };
  const auto direct_poisson = [&](double mean, int count) {
    V out;
    size_t at = 0;
    for (int i = 0; i < count; ++i) {
      double k = -1, t = 1;
      do k += 1, t *= u.at(at++);
      while (t > std::exp(-mean));
      out.push_back(k);
    }
    return out;
  };
  const auto direct_binomial = [&](int trials, double p) {
    double c = 0;
    for (int j = 0; j < trials; ++j) c += u[j] < p;
    return V{c};
  };
  NoiseState s{};
  BinomialCache c{};
  GaussSpare spare{};
  size_t at = 0;  // the polar method: b f now, a f kept for the next output
  LD a, b, r;
  do a = 2.0L * u[at] - 1, b = 2.0L * u[at + 1] - 1, r = a * a + b * b, at += 2;
  while (!(r < 1 && r > 0));
  const LD f = std::sqrt(-2 * std::log(r) / r);
  const V gs = GaussV(2, 3, 1, s, spare);
  EXPECT_NEAR(gs[0], static_cast<double>(3 * b * f), 1e-12);
  EXPECT_NEAR(gs[1], static_cast<double>(3 * a * f), 1e-12);
  const V g5 = GammaV(8, 5, 1, s);
  for (int i = 0; i < 8; ++i) EXPECT_NEAR(g5[i], direct_gamma(5, i), 8 * kEps * std::fabs(g5[i]) + 1e-15) << i;
  EXPECT_NE(GammaV(1, 6, 1, s)[0], direct_gamma(6, 0));
  EXPECT_EQ(PoissonV(2, 11.99, 1, s), direct_poisson(11.99, 2));
  EXPECT_NE(PoissonV(2, 12, 1, s), direct_poisson(12, 2));
  EXPECT_EQ(BinomialV(1, 24, 0.3, 1, s, c), direct_binomial(24, 0.3));
  EXPECT_EQ(BinomialV(1, 24, 0.7, 1, s, c), V{24 - direct_binomial(24, 0.3)[0]});
  EXPECT_NE(BinomialV(1, 25, 0.4, 1, s, c), direct_binomial(25, 0.4));
}

// One call of 25 samples equals calls of 10 and 15, the second continuing
// the first through the caller's records.
TEST(Noise, StreamsContinueAcrossCalls) {
  using Fill = std::function<V(int32_t n, int32_t seed, NoiseState&, GaussSpare&, BinomialCache&)>;
  const std::vector<std::pair<std::string, Fill>> fills = {
      {"white", [](int32_t n, int32_t sd, NoiseState& s, GaussSpare&, BinomialCache&) { return White(n, 2, sd, s); }},
      {"gauss", [](int32_t n, int32_t sd, NoiseState& s, GaussSpare& g, BinomialCache&) { return GaussV(n, 1.5, sd, s, g); }},
      {"gamma", [](int32_t n, int32_t sd, NoiseState& s, GaussSpare&, BinomialCache&) { return GammaV(n, 9, sd, s); }},
      {"poisson", [](int32_t n, int32_t sd, NoiseState& s, GaussSpare&, BinomialCache&) { return PoissonV(n, 30, sd, s); }},
      {"binomial", [](int32_t n, int32_t sd, NoiseState& s, GaussSpare&, BinomialCache& c) { return BinomialV(n, 60, 0.6, sd, s, c); }},
  };
  for (const auto& [name, fill] : fills) {
    for (int32_t split : {1, 10}) {
      NoiseState s{};
      GaussSpare g{};
      BinomialCache c{};
      const V whole = fill(25, 4321, s, g, c);
      V parts = fill(split, 4321, s, g, c);
      const V rest = fill(25 - split, -1, s, g, c);
      parts.insert(parts.end(), rest.begin(), rest.end());
      EXPECT_EQ(parts, whole) << name << " " << split;
    }
  }
  // A seed of 0 continues too; Gauss reseeds only above 0, clearing the spare.
  NoiseState s{};
  GaussSpare g{};
  const V first = GaussV(1, 1, 8, s, g);
  const V kept = GaussV(1, 1, 0, s, g);
  NoiseState s2{};
  GaussSpare g2{1, 99.0};
  EXPECT_EQ(GaussV(1, 1, 8, s2, g2), first);
  NoiseState s3{};
  GaussSpare g3{};
  EXPECT_EQ(GaussV(2, 1, 8, s3, g3), (V{first[0], kept[0]}));
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

TEST(Noise, RifflesPermuteWithTheExactDistributionOfTheirMode) {
  // Mode 0 swaps i with j uniform over all n: enumerate the n^n paths.
  constexpr int n = 3, kFact = 6, kCalls = 30000;
  std::vector<LD> classic(kFact, 0);
  for (int path = 0; path < 27; ++path) {
    std::vector<int32_t> p{0, 1, 2};
    for (int i = 0, c = path; i < n; ++i, c /= n) std::swap(p[i], p[c % n]);
    classic[PermIndex(p)] += 1.0L / 27;
  }
  for (uint32_t mode : {0u, 1u, 7u}) {
    NoiseState s{};
    V idx;
    for (int k = 0; k < kCalls; ++k) {
      I32 out;
      ASSERT_EQ(RiffleIntNum2012_head(out.Handle(), n, k + 1, &s, mode), 0);
      idx.push_back(PermIndex(out.Values()));
    }
    ExpectChiSquare(idx, [&](int k) { return mode == 0 ? classic[k] : 1.0L / kFact; }, kFact - 1,
                    "mode " + std::to_string(mode));
  }
  // The data follow their indices; the older entries are mode 0.
  for (uint32_t mode : {0u, 1u}) {
    const int32_t m = 9;
    std::vector<double> d(m);
    std::iota(d.begin(), d.end(), 0.5);
    F64 dd(d);
    Cx cd{std::vector<cx>(m)};
    I32 id(std::vector<int32_t>(m, 0)), ix, iy, iz, iw;
    NoiseState s1{}, s2{}, s3{}, s4{};
    ASSERT_EQ(RiffleArrayDBL2012_head(dd.Handle(), ix.Handle(), 5, &s1, mode), 0);
    ASSERT_EQ(RiffleArrayCDB2012_head(cd.Handle(), iy.Handle(), 5, &s2, mode), 0);
    ASSERT_EQ(RiffleArrayInt2012_head(id.Handle(), iz.Handle(), 5, &s3, mode), 0);
    ASSERT_EQ(RiffleIntNum2012_head(iw.Handle(), m, 5, &s4, mode), 0);
    const auto p = ix.Values();
    std::vector<int32_t> sorted = p;
    std::sort(sorted.begin(), sorted.end());
    std::vector<int32_t> ident(m);
    std::iota(ident.begin(), ident.end(), 0);
    EXPECT_EQ(sorted, ident);
    EXPECT_EQ(iy.Values(), p);
    EXPECT_EQ(iz.Values(), p);
    EXPECT_EQ(iw.Values(), p);
    for (int32_t i = 0; i < m; ++i) EXPECT_EQ(dd.At(i), p[i] + 0.5);
    if (mode == 0) {
      I32 a, b, c, w;
      F64 d2(d);
      Cx c2{std::vector<cx>(m)};
      I32 i2(std::vector<int32_t>(m, 0));
      NoiseState t1{}, t2{}, t3{}, t4{};
      RiffleArrayDBL_head(d2.Handle(), a.Handle(), 5, &t1);
      RiffleArrayCDB_head(c2.Handle(), b.Handle(), 5, &t2);
      RiffleArrayInt_head(i2.Handle(), c.Handle(), 5, &t3);
      RiffleIntNum_head(w.Handle(), m, 5, &t4);
      for (const auto* h : {&a, &b, &c, &w}) EXPECT_EQ(h->Values(), p);
    }
  }
  I32 one;
  NoiseState s{};
  ASSERT_EQ(RiffleIntNum2012_head(one.Handle(), 1, 3, &s, 1), 0);
  EXPECT_EQ(one.Values(), std::vector<int32_t>{0});
}

// Inverse DFT of the flat spectrum with the reference's 15-bit phases.
TEST(Noise, PeriodNoiseIsTheInverseTransformOfItsSpectrum) {
  const auto& ks = Gold().int15.at(12345);
  for (int32_t n : {1, 2, 7, 8, 30}) {
    int32_t m = n, seed = 12345, err = 1;
    double amp = 1.5;
    NoiseState s{};
    F64 out{3};
    ASSERT_EQ(PeriodNoise(&m, &amp, &seed, out.Handle(), &err, &s), 0);
    ASSERT_EQ(err, 0);
    ASSERT_EQ(out.Count(), n);
    const int half = n % 2 == 0 ? n / 2 - 1 : (n - 1) / 2;
    for (int t = 0; t < n; ++t) {
      LD sum = 0;  // bins k and n-k together: 2 mag cos(angle + 2 pi k t / n)
      for (int k = 1; k <= half; ++k)
        sum += 2 * (n * amp * 0.5L) * std::cos(ks[k - 1] + 2 * 3.14159265358979323846L * k * t / n);
      EXPECT_NEAR(out.At(t), static_cast<double>(sum / n), 64 * kEps * amp * n) << n << " " << t;
    }
  }
}

// Scratch from the arena: the same samples, and -20001 when it is too small.
TEST(Noise, PeriodNoiseInTheArena) {
  const auto run = [](int32_t* err) {
    int32_t n = 64, seed = 3;
    double amp = 1;
    NoiseState s{};
    F64 out;
    PeriodNoise(&n, &amp, &seed, out.Handle(), err, &s);
    return out.Values();
  };
  int32_t err = 1;
  const V heap = run(&err);
  for (uint32_t size : {1u << 16, 100u}) {
    ErrorCluster cl{0, 0};
    InitializeAnalysisWorkspaceH(size, &cl);
    EnableAnalysisWorkspaceH(&cl);
    const V arena = run(&err);
    DisableAnalysisWorkspaceH(&cl);
    UninitializeAnalysisWorkspaceH(&cl);
    EXPECT_EQ(cl.status, 0);
    EXPECT_EQ(err, size == 100u ? -20001 : 0);
    EXPECT_EQ(arena, size == 100u ? V{} : heap);
  }
}

// The checks in their order, each emptying the output.
TEST(Noise, CodesInTheirOrder) {
  const double nan = std::nan("");
  struct Case {
    std::string what;
    std::function<int32_t(F64ArrayHdl)> call;
    int32_t code;
  };
  const auto white_ = [](int32_t n) {
    return [n](F64ArrayHdl o) mutable { double a = 1; int32_t sd = 1, e = 1; NoiseState s{}; white(o, &n, &a, &sd, &e, &s); return e; };
  };
  const auto gauss_ = [](int32_t n) {
    return [n](F64ArrayHdl o) mutable { double a = 1; int32_t sd = 1, e = 1; NoiseState s{}; GaussSpare g{}; Gauss(o, &n, &a, &sd, &e, &s, &g); return e; };
  };
  const auto period_ = [](int32_t n) {
    return [n](F64ArrayHdl o) mutable { double a = 1; int32_t sd = 1, e = 1; NoiseState s{}; PeriodNoise(&n, &a, &sd, o, &e, &s); return e; };
  };
  const auto gamma_ = [](int32_t n, int32_t order) {
    return [=](F64ArrayHdl o) { NoiseState s{}; return GammaNoiseH(o, n, order, 1, &s); };
  };
  const auto poisson_ = [](int32_t n, double mean) {
    return [=](F64ArrayHdl o) { NoiseState s{}; return PoissonNoiseH(o, n, mean, 1, &s); };
  };
  const std::vector<Case> cases = {
      {"white n 0", white_(0), -20003},        {"gauss n -1", gauss_(-1), -20003},
      {"period n 0", period_(0), -20003},      {"gamma order 0 n 0", gamma_(0, 0), -20061},
      {"gamma n 0", gamma_(0, 3), -20003},     {"poisson mean 0 n 0", poisson_(0, 0), -20061},
      {"poisson nan", poisson_(5, nan), -20061}, {"poisson inf", poisson_(5, INFINITY), -20061},
      {"poisson n 0", poisson_(0, 2), -20003},
  };
  for (const auto& c : cases) {
    F64 out{1, 2};
    EXPECT_EQ(c.call(out.Handle()), c.code) << c.what;
    EXPECT_EQ(out.Count(), 0) << c.what;
  }
  const std::vector<std::tuple<int32_t, int32_t, double, int32_t>> binomial = {
      {0, -1, 0.5, -20061}, {0, 5, 1.5, -20061}, {0, 5, -0.1, -20061}, {0, 5, nan, -20061}, {0, 5, 0.5, -20003}};
  for (const auto& [n, trials, p, code] : binomial) {
    U32 out{1, 2};
    NoiseState s{};
    BinomialCache c{};
    EXPECT_EQ(BinomialNoiseH(out.Handle(), n, trials, p, 1, &s, &c), code) << trials << " " << p;
    EXPECT_EQ(out.Count(), 0);
  }
  F64 empty;
  I32 idx{4, 4}, num{4};
  NoiseState s{};
  EXPECT_EQ(RiffleArrayDBL2012_head(empty.Handle(), idx.Handle(), 1, &s, 0), -20003);
  EXPECT_EQ(idx.Count(), 0);
  EXPECT_EQ(RiffleIntNum_head(num.Handle(), 0, 1, &s), -20003);
  EXPECT_EQ(num.Count(), 0);
}

TEST(Noise, HostResizeFailuresEmptyTheOutputs) {
  NoiseState s{};
  GaussSpare g{};
  BinomialCache c{};
  const std::vector<std::pair<std::string, std::function<int32_t(F64ArrayHdl, int32_t*)>>> formA = {
      {"white", [&](F64ArrayHdl o, int32_t* e) { int32_t n = 5, sd = 1; double a = 1; return white(o, &n, &a, &sd, e, &s); }},
      {"gauss", [&](F64ArrayHdl o, int32_t* e) { int32_t n = 5, sd = 1; double a = 1; return Gauss(o, &n, &a, &sd, e, &s, &g); }},
      {"period", [&](F64ArrayHdl o, int32_t* e) { int32_t n = 5, sd = 1; double a = 1; return PeriodNoise(&n, &a, &sd, o, e, &s); }},
  };
  for (const auto& [name, f] : formA) {
    F64 out{1};
    int32_t err = 0;
    const int made = RunFailingEachResize([&] { return f(out.Handle(), &err); }, [&](int, int32_t r) {
      EXPECT_NE(r, 0) << name;
      EXPECT_EQ(err, -20001) << name;
      EXPECT_EQ(out.Count(), 0) << name;
    });
    EXPECT_EQ(made, 1) << name;
  }
  const auto expectB = [](const std::string& name, const std::function<int32_t()>& call,
                          const std::vector<std::function<int32_t()>>& counts) {
    RunFailingEachResize(call, [&](int, int32_t r) {
      EXPECT_EQ(r, -20001) << name;
      for (const auto& count : counts) EXPECT_EQ(count(), 0) << name;
    });
  };
  F64 o1, o2, data{1, 2, 3};
  U32 o3;
  I32 idx, num;
  expectB("gamma", [&] { return GammaNoiseH(o1.Handle(), 4, 8, 1, &s); }, {[&] { return o1.Count(); }});
  expectB("poisson", [&] { return PoissonNoiseH(o2.Handle(), 4, 20, 1, &s); }, {[&] { return o2.Count(); }});
  expectB("binomial", [&] { return BinomialNoiseH(o3.Handle(), 4, 30, 0.5, 1, &s, &c); }, {[&] { return o3.Count(); }});
  expectB("riffle", [&] { return RiffleArrayDBL2012_head(data.Handle(), idx.Handle(), 1, &s, 1); },
          {[&] { return idx.Count(); }, [&] { return data.Count(); }});
  expectB("riffle number", [&] { return RiffleIntNum2012_head(num.Handle(), 4, 1, &s, 1); }, {[&] { return num.Count(); }});
}

}  // namespace
}  // namespace tsmtest
