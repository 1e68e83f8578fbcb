// Gamma, Poisson and binomial deviates from the Wichmann-Hill source. The
// rejection methods sample a Lorentzian (tan(pi u)) or Cauchy-type hull
// scaled to lie above the target density and accept under it; their loops
// have no round limit.
#include <algorithm>
#include <cmath>

#include "generate/noise.h"
#include "special/gamma.h"

namespace tsm {
namespace {

constexpr f64 kPi = 3.141592653589793;
// Below these the direct methods are used.
constexpr int32 kGammaRejectOrder = 6;
constexpr f64 kPoissonRejectMean = 12.0;
constexpr int32 kBinomialRejectTrials = 25;

f64 GammaDeviate(NoiseSource& src, int32 order) {
  if (order < kGammaRejectOrder) {
    f64 product = 1.0;
    for (int32 j = 0; j < order; ++j) product *= src.Uniform();
    return -std::log(product);
  }
  const f64 am = order - 1.0;
  if (src.Stuck()) return am;
  const f64 s = std::sqrt(2.0 * am + 1.0);
  for (;;) {
    const f64 p1 = 2.0 * src.Uniform() - 1.0;
    const f64 p2 = 2.0 * src.Uniform() - 1.0;
    if (p2 * p2 + p1 * p1 > 1.0) continue;
    const f64 y = p2 / p1;
    const f64 x = s * y + am;
    if (x <= 0.0) continue;
    const f64 e = (1.0 + y * y) * std::exp(am * std::log(x / am) - s * y);
    if (!(src.Uniform() > e)) return x;
  }
}

f64 PoissonDeviate(NoiseSource& src, f64 mean, f64 g, f64 sq, f64 al) {
  if (mean < kPoissonRejectMean) {
    f64 k = -1.0, t = 1.0;
    do {
      k += 1.0;
      t *= src.Uniform();
    } while (t > g);
    return k;
  }
  for (;;) {
    const f64 y = std::tan(kPi * src.Uniform());
    f64 k = sq * y + mean;
    if (k < 0.0) continue;
    k = std::floor(k);
    const f64 t = 0.9 * (1.0 + y * y) * std::exp(k * al - LogGamma(k + 1.0) - g);
    if (src.Uniform() <= t) return k;
  }
}

// The rejection set-up in a local copy of the caller's packed cache.
struct BinomialSetup {
  f64 pold, pc, plog, pclog, en, oldg;
  int32 nold;
};

f64 BinomialReject(NoiseSource& src, int32 trials, f64 pp, f64 am, BinomialSetup& c) {
  if (trials != c.nold) {
    c.en = trials;
    c.oldg = LogGamma(c.en + 1.0);
    c.nold = trials;
  }
  if (pp != c.pold) {
    c.pc = 1.0 - pp;
    c.plog = std::log(pp);
    c.pclog = std::log(c.pc);
    c.pold = pp;
  }
  const f64 sq = std::sqrt(2.0 * am * c.pc);
  for (;;) {
    const f64 y = std::tan(kPi * src.Uniform());
    f64 em = sq * y + am;
    if (em < 0.0 || em >= c.en + 1.0) continue;
    em = std::floor(em);
    const f64 t = 1.2 * sq * (1.0 + y * y) *
                  std::exp(c.oldg - LogGamma(em + 1.0) - LogGamma(c.en - em + 1.0) + em * c.plog +
                           (c.en - em) * c.pclog);
    if (src.Uniform() <= t) return em;
  }
}

f64 BinomialDeviate(NoiseSource& src, int32 trials, f64 pp, BinomialSetup& c) {
  const f64 am = trials * pp;
  if (trials < kBinomialRejectTrials) {
    int32 count = 0;
    for (int32 j = 0; j < trials; ++j)
      if (src.Uniform() < pp) ++count;
    return count;
  }
  if (am < 1.0) {
    const f64 g = std::exp(-am);
    f64 t = 1.0;
    int32 j = 0;
    for (; j <= trials; ++j) {
      t *= src.Uniform();
      if (t < g) break;
    }
    return std::min(j, trials);
  }
  return BinomialReject(src, trials, pp, am, c);
}

}  // namespace

ErrorCode GammaNoise(f64* y, int32 n, int32 order, int32 seed, NoiseState* state) {
  if (order < 1) return TSM_ERR_BAD_SELECTOR;
  if (n < 1) return TSM_ERR_EMPTY;
  NoiseSource src(state, seed);
  for (int32 i = 0; i < n; ++i) y[i] = GammaDeviate(src, order);
  return TSM_SUCCESS;
}

ErrorCode PoissonNoise(f64* y, int32 n, f64 mean, int32 seed, NoiseState* state) {
  if (!(mean > 0.0) || !std::isfinite(mean)) return TSM_ERR_BAD_SELECTOR;
  if (n < 1) return TSM_ERR_EMPTY;
  NoiseSource src(state, seed);
  const f64 al = std::log(mean);
  const f64 g = mean < kPoissonRejectMean ? std::exp(-mean) : mean * al - LogGamma(mean + 1.0);
  const f64 sq = std::sqrt(2.0 * mean);
  for (int32 i = 0; i < n; ++i) y[i] = PoissonDeviate(src, mean, g, sq, al);
  return TSM_SUCCESS;
}

ErrorCode BinomialNoise(uint32* y, int32 n, int32 trials, f64 p, int32 seed, NoiseState* state,
                        BinomialCache* cache) {
  if (trials < 0 || !(p >= 0.0 && p <= 1.0)) return TSM_ERR_BAD_SELECTOR;
  if (n < 1) return TSM_ERR_EMPTY;
  NoiseSource src(state, seed);
  BinomialSetup c{};
  if (cache != nullptr)
    c = {cache->pold, cache->pc, cache->plog, cache->pclog, cache->en, cache->oldg, cache->nold};
  const f64 pp = p <= 0.5 ? p : 1.0 - p;
  for (int32 i = 0; i < n; ++i) {
    const f64 v = BinomialDeviate(src, trials, pp, c);
    y[i] = static_cast<uint32>(pp != p ? trials - v : v);
  }
  if (cache != nullptr) {
    cache->pold = c.pold;
    cache->pc = c.pc;
    cache->plog = c.plog;
    cache->pclog = c.pclog;
    cache->en = c.en;
    cache->oldg = c.oldg;
    cache->nold = c.nold;
  }
  return TSM_SUCCESS;
}

}  // namespace tsm
