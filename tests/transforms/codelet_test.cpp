// The generated codelets: every complex and real codelet against the defining
// DFT sum in long double, in the memory layouts the passes use (strides,
// interleaved parts, in place, 4-byte misaligned data), and with a check that
// nothing but the r outputs of a block is written.
#include <gtest/gtest.h>

#include <cmath>
#include <complex>
#include <cstdint>
#include <cstring>
#include <numbers>
#include <random>
#include <string>
#include <vector>

#include "transforms/kwfft_codelets.h"

namespace tsmtest {
namespace {

using tsm::f64;
using CxL = std::complex<long double>;

struct Radix {
  int r;
  tsm::CxCodelet cx;
  tsm::RealCodelet real;
};
#define TSM_RADIX_ROW(r) Radix{r, tsm::kwfft_cx_codelet_##r, tsm::kwfft_real_codelet_##r},
const Radix kRadices[] = {TSM_KWFFT_CODELET_RADICES(TSM_RADIX_ROW)};
#undef TSM_RADIX_ROW

// Bound on the rms error over the rms of the exact output. About log2(r)
// rounding stages lie between an input and an output, each adding an error
// near eps relative to the data; in the short prime forms the Karatsuba and
// Toom-3 reconstructions (folded into the constants) combine products with
// weights of a few units, hence 4 eps per stage and 4 eps besides. Over 2000
// random inputs per radix the rms of this error was 0.2 eps (r = 2) to 2.4 eps
// (r = 37, 43), its largest value 7.3 eps (real codelet of 37).
double Bound(int r) { return (4.0 * std::log2(static_cast<double>(r)) + 4.0) * tsm::kEps; }

// X[k] = sum_t x[t] exp(-2 pi i k t / r) by its definition.
std::vector<CxL> Dft(const std::vector<CxL>& x) {
  const int r = static_cast<int>(x.size());
  std::vector<CxL> y(r);
  for (int k = 0; k < r; ++k)
    for (int t = 0; t < r; ++t) {
      const long double a = -2 * std::numbers::pi_v<long double> * ((k * t) % r) / r;
      y[k] += x[t] * CxL(cosl(a), sinl(a));
    }
  return y;
}

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

// The slots of r values at stride s (either sign), with a margin of 2 slots
// on each side that must stay untouched.
std::size_t Start(int r, std::ptrdiff_t s) { return 2 + (s < 0 ? static_cast<std::size_t>(-s) * (r - 1) : 0); }
std::size_t Span(int r, std::ptrdiff_t s, std::size_t extra) {
  return 4 + static_cast<std::size_t>(s < 0 ? -s : s) * (r - 1) + 1 + extra;
}
std::size_t At(int r, std::ptrdiff_t s, int t) { return Start(r, s) + t * s; }

std::vector<CxL> RandomInput(int r, bool real, std::mt19937_64& rng) {
  std::uniform_real_distribution<double> u(-1.0, 1.0);
  std::vector<CxL> x(r);
  for (auto& v : x) v = real ? CxL(u(rng), 0) : CxL(u(rng), u(rng));
  return x;
}

// Complex layouts: interleaved parts are one array with re at 2t, im at 2t + 1
// (stride 2); split parts are two arrays.
struct CxLayout {
  const char* name;
  std::ptrdiff_t is, os;
  bool interleaved, in_place;
  std::size_t offset;
};
const CxLayout kCxLayouts[] = {
    {"split, unit strides", 1, 1, false, false, 0},
    {"split, is 3, os 2", 3, 2, false, false, 0},
    {"split, is -2, os 1", -2, 1, false, false, 0},
    {"interleaved", 2, 2, true, false, 0},
    {"interleaved, in place", 2, 2, true, true, 0},
    {"split, in place, stride 3", 3, 3, false, true, 0},
    {"interleaved, in place, 4-byte misaligned", 2, 2, true, true, 4},
    {"split, is 3, os 2, 4-byte misaligned", 3, 2, false, false, 4},
};

TEST(Codelets, ComplexMatchTheDefiningSum) {
  for (const Radix& rad : kRadices) {
    const int r = rad.r;
    std::mt19937_64 rng(1000 + r);
    for (const CxLayout& lay : kCxLayouts) {
      SCOPED_TRACE("radix " + std::to_string(r) + ", " + lay.name);
      for (int trial = 0; trial < 3; ++trial) {
        const std::vector<CxL> x = RandomInput(r, false, rng);
        // Split parts have an array each; interleaved parts share one, with
        // im one slot after re.
        const int parts = lay.interleaved ? 1 : 2;
        std::vector<Slots> in, out;
        for (int p = 0; p < parts; ++p) {
          in.emplace_back(Span(r, lay.is, lay.interleaved), lay.offset);
          if (!lay.in_place) out.emplace_back(Span(r, lay.os, lay.interleaved), lay.offset);
        }
        std::vector<Slots>& dst = lay.in_place ? in : out;
        auto in_slot = [&](int part, int t) { return At(r, lay.is, t) + (lay.interleaved ? part : 0); };
        auto out_slot = [&](int part, int k) { return At(r, lay.os, k) + (lay.interleaved ? part : 0); };
        auto array = [&](std::vector<Slots>& v, int part) -> Slots& { return v[lay.interleaved ? 0 : part]; };
        for (int t = 0; t < r; ++t) {
          array(in, 0).Set(in_slot(0, t), static_cast<f64>(x[t].real()));
          array(in, 1).Set(in_slot(1, t), static_cast<f64>(x[t].imag()));
        }
        const std::size_t s0 = lay.interleaved ? 1 : 0;
        rad.cx(array(in, 0).Data() + Start(r, lay.is), array(in, 1).Data() + Start(r, lay.is) + s0,
               array(dst, 0).Data() + Start(r, lay.os), array(dst, 1).Data() + Start(r, lay.os) + s0, lay.is,
               lay.os);

        const std::vector<CxL> want = Dft(x);
        long double err = 0, ref = 0;
        std::vector<std::vector<bool>> written(parts);
        for (int p = 0; p < parts; ++p) written[p].assign(array(dst, p).Size(), false);
        for (int k = 0; k < r; ++k) {
          const CxL got(array(dst, 0).Get(out_slot(0, k)), array(dst, 1).Get(out_slot(1, k)));
          err += std::norm(got - want[k]);
          ref += std::norm(want[k]);
          written[0][out_slot(0, k)] = true;
          written[parts - 1][out_slot(1, k)] = true;
        }
        EXPECT_LE(static_cast<double>(sqrtl(err / ref)), Bound(r));
        for (int p = 0; p < parts; ++p)
          for (std::size_t i = 0; i < written[p].size(); ++i)
            EXPECT_TRUE(written[p][i] || array(dst, p).Untouched(i)) << "slot " << i << " of array " << p;
        if (!lay.in_place) {
          for (int t = 0; t < r; ++t) {
            EXPECT_EQ(array(in, 0).Get(in_slot(0, t)), static_cast<f64>(x[t].real()));
            EXPECT_EQ(array(in, 1).Get(in_slot(1, t)), static_cast<f64>(x[t].imag()));
          }
        }
      }
    }
  }
}

struct RealLayout {
  const char* name;
  std::ptrdiff_t is, os;
  bool in_place;
  std::size_t offset;
};
const RealLayout kRealLayouts[] = {
    {"unit strides", 1, 1, false, 0},
    {"is 3, os 2", 3, 2, false, 0},
    {"is 1, os -3", 1, -3, false, 0},
    {"in place, stride 2", 2, 2, true, 0},
    {"is 2, os 3, 4-byte misaligned", 2, 3, false, 4},
    {"in place, unit stride, 4-byte misaligned", 1, 1, true, 4},
};

// HalfComplex: out[0] = Re X[0]; out[k] = Re X[k], out[r-k] = Im X[k] for
// 1 <= k <= (r-1)/2; out[r/2] = Re X[r/2] for even r.
TEST(Codelets, RealMatchTheDefiningSumAsHalfComplex) {
  for (const Radix& rad : kRadices) {
    const int r = rad.r;
    std::mt19937_64 rng(2000 + r);
    for (const RealLayout& lay : kRealLayouts) {
      SCOPED_TRACE("radix " + std::to_string(r) + ", " + lay.name);
      for (int trial = 0; trial < 3; ++trial) {
        const std::vector<CxL> x = RandomInput(r, true, rng);
        Slots in(Span(r, lay.is, 0), lay.offset);
        Slots out_own(lay.in_place ? 0 : Span(r, lay.os, 0), lay.offset);
        Slots& out = lay.in_place ? in : out_own;
        for (int t = 0; t < r; ++t) in.Set(At(r, lay.is, t), static_cast<f64>(x[t].real()));
        rad.real(in.Data() + Start(r, lay.is), out.Data() + Start(r, lay.os), lay.is, lay.os);

        const std::vector<CxL> want = Dft(x);
        long double err = 0, ref = 0;
        for (int k = 0; k < r; ++k) {
          const long double w = 2 * k <= r ? want[k].real() : want[r - k].imag();
          err += (out.Get(At(r, lay.os, k)) - w) * (out.Get(At(r, lay.os, k)) - w);
          ref += w * w;
        }
        EXPECT_LE(static_cast<double>(sqrtl(err / ref)), Bound(r));
        std::vector<bool> written(out.Size(), false);
        for (int k = 0; k < r; ++k) written[At(r, lay.os, k)] = true;
        for (std::size_t i = 0; i < out.Size(); ++i)
          EXPECT_TRUE(written[i] || out.Untouched(i)) << "slot " << i;
        if (!lay.in_place) {
          for (int t = 0; t < r; ++t) EXPECT_EQ(in.Get(At(r, lay.is, t)), static_cast<f64>(x[t].real()));
        }
      }
    }
  }
}

}  // namespace
}  // namespace tsmtest
