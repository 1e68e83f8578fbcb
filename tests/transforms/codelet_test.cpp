// The generated passes of every radix, reached through the pass table, in the
// layouts the engine uses (strides, interleaved parts, 4-byte misaligned
// data), each checked to write nothing but its outputs. The leaf passes block
// by block against the defining sum; the twiddle passes, which run the
// codelets in place, as the last step of a decimation in time: r spectra of m
// decimated samples and exact twiddles in, the long double spectrum out.
#include <gtest/gtest.h>

#include <cmath>
#include <complex>
#include <cstdint>
#include <cstring>
#include <random>
#include <string>
#include <vector>

#include "support/reference_dft.h"
#include "transforms/kwfft_codelets.h"
#include "transforms/kwfft_passes.h"

namespace tsmtest {
namespace {

using tsm::f64;

#define TSM_RADIX_ROW(r) r,
const int kRadices[] = {TSM_KWFFT_CODELET_RADICES(TSM_RADIX_ROW)};
#undef TSM_RADIX_ROW

// Bound on the rms error over the rms of the exact output. About log2(r)
// rounding stages lie between an input and an output, each adding an error
// near eps relative to the data; in the short prime forms the Karatsuba and
// Toom-3 reconstructions (folded into the constants) combine products with
// weights of a few units, hence 4 eps per stage and 4 eps besides. Over 2000
// random inputs per radix the rms of this error was 0.2 eps (r = 2) to 2.4 eps
// (r = 37, 43), its largest value 7.3 eps (real radix 37).
double Bound(int r) { return (4.0 * std::log2(static_cast<double>(r)) + 4.0) * tsm::kEps; }

// Float64 slots in raw bytes at a chosen offset, so that data may stand at an
// address that is only 4-byte aligned; the test itself reads and writes them
// with memcpy. Every slot starts as a NaN with a payload no codelet can make.
constexpr std::uint64_t kUntouched = 0x7FF8BADC0FFEE000ULL;

class Slots {
 public:
  Slots(std::size_t n, std::size_t offset) : bytes_(n * sizeof(f64) + 16), offset_(offset), n_(n) {
    for (std::size_t i = 0; i < n; ++i) std::memcpy(Addr(i), &kUntouched, sizeof kUntouched);
  }
  f64* Data() { return reinterpret_cast<f64*>(Addr(0)); }
  std::size_t Size() const { return n_; }
  void Set(std::size_t i, f64 v) { std::memcpy(Addr(i), &v, sizeof v); }
  f64 Get(std::size_t i) const {
    f64 v;
    std::memcpy(&v, bytes_.data() + offset_ + i * sizeof(f64), sizeof v);
    return v;
  }
  bool Untouched(std::size_t i) const {
    std::uint64_t bits;
    std::memcpy(&bits, bytes_.data() + offset_ + i * sizeof(f64), sizeof bits);
    return bits == kUntouched;
  }

 private:
  unsigned char* Addr(std::size_t i) { return bytes_.data() + offset_ + i * sizeof(f64); }
  std::vector<unsigned char> bytes_;
  std::size_t offset_, n_;
};

const tsm::KwfftPasses& PassesOf(int r) {
  const tsm::KwfftPasses* p = tsm::KwfftPassesForRadix(r);
  EXPECT_NE(p, nullptr) << "radix " << r;
  static const tsm::KwfftPasses kNone{};
  return p != nullptr ? *p : kNone;
}

// The slots of `count` values at stride s >= 1 from slot 2, with 2 margin
// slots and the gaps between used slots left untouched.
std::size_t SlotsFor(std::size_t count, std::ptrdiff_t s) { return 4 + static_cast<std::size_t>(s) * count; }

// Every slot not in `used` still holds its initial NaN.
void ExpectUntouchedBut(const Slots& v, const std::vector<bool>& used, const char* what) {
  for (std::size_t i = 0; i < v.Size(); ++i) EXPECT_TRUE(used[i] || v.Untouched(i)) << what << ": slot " << i;
}

// A memory layout of the complex passes: split parts at stride s, or both
// parts interleaved in one array (re at 2i, im at 2i + 1, stride 2).
struct PassLayout {
  const char* name;
  std::ptrdiff_t stride;
  bool interleaved;
  std::size_t offset;
};
const PassLayout kPassLayouts[] = {
    {"split, unit stride", 1, false, 0},
    {"interleaved", 2, true, 0},
    {"split, stride 3, 4-byte misaligned", 3, false, 4},
};
// Input and output layouts of the leaf passes.
struct LeafLayout {
  PassLayout in, out;
};
const LeafLayout kLeafLayouts[] = {
    {kPassLayouts[0], kPassLayouts[0]},
    {kPassLayouts[1], kPassLayouts[1]},
    {kPassLayouts[2], {"split, stride 2, 4-byte misaligned", 2, false, 4}},
    {kPassLayouts[0], {"interleaved", 2, true, 0}},
};

// Complex values at slot 2 + i * stride of one array (interleaved) or two.
struct CxSlots {
  CxSlots(std::size_t n, const PassLayout& lay)
      : lay_(lay), re_(SlotsFor(n, lay.stride) + 1, lay.offset), im_(lay.interleaved ? 0 : re_.Size(), lay.offset),
        used_re_(re_.Size(), false), used_im_(im_.Size(), false) {}
  f64* Re() { return re_.Data() + 2; }
  f64* Im() { return lay_.interleaved ? re_.Data() + 3 : im_.Data() + 2; }
  std::size_t SlotRe(std::size_t i) const { return 2 + i * lay_.stride; }
  std::size_t SlotIm(std::size_t i) const { return SlotRe(i) + (lay_.interleaved ? 1 : 0); }
  Slots& ImArray() { return lay_.interleaved ? re_ : im_; }
  const Slots& ImArray() const { return lay_.interleaved ? re_ : im_; }
  void Set(std::size_t i, CxL v) {
    re_.Set(SlotRe(i), static_cast<f64>(v.real()));
    ImArray().Set(SlotIm(i), static_cast<f64>(v.imag()));
  }
  CxL Get(std::size_t i) const { return CxL(re_.Get(SlotRe(i)), ImArray().Get(SlotIm(i))); }
  // Marks value i as one the code under test may write.
  void Use(std::size_t i) {
    used_re_[SlotRe(i)] = true;
    (lay_.interleaved ? used_re_ : used_im_)[SlotIm(i)] = true;
  }
  void ExpectRestUntouched() const {
    ExpectUntouchedBut(re_, used_re_, "re");
    if (!lay_.interleaved) ExpectUntouchedBut(im_, used_im_, "im");
  }

 private:
  PassLayout lay_;
  Slots re_, im_;
  std::vector<bool> used_re_, used_im_;
};

std::vector<CxL> RandomSignal(std::size_t n, bool real, std::mt19937_64& rng) {
  std::uniform_real_distribution<double> u(-1.0, 1.0);
  std::vector<CxL> x(n);
  for (auto& v : x) v = real ? CxL(u(rng), 0) : CxL(u(rng), u(rng));
  return x;
}

// Twiddle tables of a pass of radix r over blocks of m: row k (1 <= k < m),
// entry j (1 <= j < r) at (k-1)(r-1) + j-1 holds exp(-2 pi i j k / (r m)),
// the cosine and the negative sine, rounded from long double.
void ExactTwiddles(int r, int m, std::vector<f64>& c, std::vector<f64>& t) {
  c.assign(static_cast<std::size_t>(r - 1) * (m > 1 ? m - 1 : 0), 0.0);
  t.assign(c.size(), 0.0);
  for (int k = 1; k < m; ++k)
    for (int j = 1; j < r; ++j) {
      const long double a = -2 * kPiL * (j * k) / (static_cast<long double>(r) * m);
      c[static_cast<std::size_t>(k - 1) * (r - 1) + j - 1] = static_cast<f64>(cosl(a));
      t[static_cast<std::size_t>(k - 1) * (r - 1) + j - 1] = static_cast<f64>(sinl(a));
    }
}

// The spectrum of length m of x[j], x[j + r], x[j + 2r], ...
std::vector<CxL> DecimatedSpectrum(const std::vector<CxL>& x, int r, int j) {
  std::vector<CxL> d(x.size() / r);
  for (std::size_t i = 0; i < d.size(); ++i) d[i] = x[j + i * r];
  return ReferenceDft(d);
}

// The twiddle passes start from spectra rounded to float64 and twiddles
// rounded to float64, and round once more in each complex product: a few eps
// beyond the codelet's own bound.
double TwiddleBound(int r) { return Bound(r) + 4 * tsm::kEps; }

constexpr int kBlockLengths[] = {1, 2, 3, 4, 5, 6, 8};

TEST(Passes, ComplexLeafMatchesTheDefiningSumPerBlock) {
  for (const int r : kRadices) {
    std::mt19937_64 rng(3000 + r);
    for (const LeafLayout& lay : kLeafLayouts)
      for (int count : {1, 3}) {
        SCOPED_TRACE("radix " + std::to_string(r) + ", " + lay.in.name + " to " + lay.out.name + ", count " +
                     std::to_string(count));
        const std::size_t n = static_cast<std::size_t>(r) * count;
        const std::vector<CxL> x = RandomSignal(n, false, rng);
        CxSlots in(n, lay.in), out(n, lay.out);
        for (std::size_t i = 0; i < n; ++i) in.Set(i, x[i]);
        PassesOf(r).cx_notw(in.Re(), in.Im(), out.Re(), out.Im(), lay.in.stride, lay.out.stride, count);
        for (int b = 0; b < count; ++b) {
          std::vector<CxL> block(r);
          for (int t = 0; t < r; ++t) block[t] = x[b + static_cast<std::size_t>(t) * count];
          const std::vector<CxL> want = ReferenceDft(block);
          const std::size_t at = static_cast<std::size_t>(b) * r;
          EXPECT_LE(RelativeRms([&](std::size_t k) { return out.Get(at + k); }, want), Bound(r)) << "block " << b;
        }
        for (std::size_t i = 0; i < n; ++i) {
          out.Use(i);
          EXPECT_EQ(in.Get(i), x[i]) << "input " << i << " changed";
        }
        out.ExpectRestUntouched();
      }
  }
}

TEST(Passes, RealLeafMatchesTheDefiningSumPerBlock) {
  for (const int r : kRadices) {
    std::mt19937_64 rng(4000 + r);
    for (const LeafLayout& lay : kLeafLayouts) {
      if (lay.in.interleaved || lay.out.interleaved) continue;
      const std::ptrdiff_t is = lay.in.stride, os = lay.out.stride;
      for (int count : {1, 3}) {
        SCOPED_TRACE("radix " + std::to_string(r) + ", " + lay.in.name + " to " + lay.out.name + ", count " +
                     std::to_string(count));
        const std::size_t n = static_cast<std::size_t>(r) * count;
        const std::vector<CxL> x = RandomSignal(n, true, rng);
        Slots in(SlotsFor(n, is), lay.in.offset), out(SlotsFor(n, os), lay.out.offset);
        for (std::size_t i = 0; i < n; ++i) in.Set(2 + i * is, static_cast<f64>(x[i].real()));
        PassesOf(r).real_notw(in.Data() + 2, out.Data() + 2, is, os, count);
        std::vector<bool> used(out.Size(), false);
        for (int b = 0; b < count; ++b) {
          std::vector<CxL> block(r);
          for (int t = 0; t < r; ++t) block[t] = x[b + static_cast<std::size_t>(t) * count];
          const std::vector<long double> want = ToHalfComplex(ReferenceDft(block));
          long double err = 0, ref = 0;
          for (int k = 0; k < r; ++k) {
            const std::size_t slot = 2 + (static_cast<std::size_t>(b) * r + k) * os;
            err += (out.Get(slot) - want[k]) * (out.Get(slot) - want[k]);
            ref += want[k] * want[k];
            used[slot] = true;
          }
          EXPECT_LE(static_cast<double>(sqrtl(err / ref)), Bound(r)) << "block " << b;
        }
        ExpectUntouchedBut(out, used, "out");
        for (std::size_t i = 0; i < n; ++i)
          EXPECT_EQ(in.Get(2 + i * is), static_cast<f64>(x[i].real())) << "input " << i << " changed";
      }
    }
  }
}

TEST(Passes, ComplexTwiddlePassCompletesADecimationInTime) {
  for (const int r : kRadices) {
    std::mt19937_64 rng(5000 + r);
    for (const PassLayout& lay : kPassLayouts)
      for (int m : kBlockLengths) {
        SCOPED_TRACE("radix " + std::to_string(r) + ", " + lay.name + ", m " + std::to_string(m));
        const std::size_t n = static_cast<std::size_t>(r) * m;
        const std::vector<CxL> x = RandomSignal(n, false, rng);
        CxSlots data(n, lay);
        for (int j = 0; j < r; ++j) {
          const std::vector<CxL> y = DecimatedSpectrum(x, r, j);
          for (int k = 0; k < m; ++k) data.Set(static_cast<std::size_t>(j) * m + k, y[k]);
        }
        std::vector<f64> c, t;
        ExactTwiddles(r, m, c, t);
        PassesOf(r).cx_tw(data.Re(), data.Im(), c.data(), t.data(), lay.stride, m);
        EXPECT_LE(RelativeRms([&](std::size_t q) { return data.Get(q); }, ReferenceDft(x)), TwiddleBound(r));
        for (std::size_t i = 0; i < n; ++i) data.Use(i);
        data.ExpectRestUntouched();
      }
  }
}

TEST(Passes, RealTwiddlePassCompletesADecimationInTimeAsHalfComplex) {
  for (const int r : kRadices) {
    std::mt19937_64 rng(6000 + r);
    for (const PassLayout& lay : kPassLayouts) {
      if (lay.interleaved) continue;
      for (int m : kBlockLengths) {
        SCOPED_TRACE("radix " + std::to_string(r) + ", " + lay.name + ", m " + std::to_string(m));
        const std::size_t n = static_cast<std::size_t>(r) * m;
        const std::vector<CxL> x = RandomSignal(n, true, rng);
        Slots data(SlotsFor(n, lay.stride), lay.offset);
        for (int j = 0; j < r; ++j) {
          const std::vector<long double> h = ToHalfComplex(DecimatedSpectrum(x, r, j));
          for (int k = 0; k < m; ++k)
            data.Set(2 + (static_cast<std::size_t>(j) * m + k) * lay.stride, static_cast<f64>(h[k]));
        }
        std::vector<f64> c, t;
        ExactTwiddles(r, m, c, t);
        PassesOf(r).real_tw(data.Data() + 2, c.data(), t.data(), lay.stride, m);
        std::vector<long double> got(n);
        std::vector<bool> used(data.Size(), false);
        for (std::size_t q = 0; q < n; ++q) {
          got[q] = data.Get(2 + q * lay.stride);
          used[2 + q * lay.stride] = true;
        }
        const std::vector<CxL> want = ReferenceDft(x);
        // Only the bins HalfComplex keeps: 0 .. n/2.
        std::vector<CxL> kept(want.begin(), want.begin() + n / 2 + 1);
        EXPECT_LE(RelativeRms([&](std::size_t q) { return FromHalfComplex(got, q); }, kept), TwiddleBound(r));
        ExpectUntouchedBut(data, used, "data");
      }
    }
  }
}

}  // namespace
}  // namespace tsmtest
