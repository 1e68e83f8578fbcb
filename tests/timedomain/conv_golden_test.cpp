// Convolution and correlation entries against numpy/scipy golden values
// (tools/golden/conv_golden.py, tests/data/conv_golden.txt) and, for lengths
// up to 10^4, against direct sums in long double. Every case runs the direct
// and the FFT algorithm.
//
// Tolerance: an output value is a sum of at most min(n, m) products; the
// direct sum is good to min(n, m) eps of S = min(n, m) max|x| max|y|, the FFT
// path to a few eps log2(L) of the rms. 1e3 eps S bounds both for n <= 10^4;
// the worst measured is 12 eps S (the FFT path with a 1-sample operand,
// where S is smallest), the golden cases stay below 4 eps S.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <complex>
#include <fstream>
#include <random>
#include <sstream>
#include <string>
#include <vector>

#include "support/host_arrays.h"
#include "support/host_matrix.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;
using CV = std::vector<cx>;

struct Line {
  std::string kind;
  std::vector<std::string> tok;
  size_t at = 0;
  int Int() { return std::stoi(tok[at++]); }
  double Real() { return std::strtod(tok[at++].c_str(), nullptr); }
  template <class T>
  std::vector<T> Read(long n) {
    std::vector<T> v(n);
    for (T& e : v) {
      if constexpr (std::is_same_v<T, double>) e = Real();
      else e = cx{Real(), Real()};
    }
    return v;
  }
};

std::vector<Line> Golden(const std::string& kind) {
  std::ifstream in(TSM_TEST_DATA "/conv_golden.txt");
  EXPECT_TRUE(in.good());
  std::vector<Line> out;
  std::string s;
  while (std::getline(in, s)) {
    std::istringstream ss(s);
    Line l;
    ss >> l.kind;
    if (l.kind != kind) continue;
    for (std::string t; ss >> t;) l.tok.push_back(t);
    out.push_back(l);
  }
  EXPECT_FALSE(out.empty()) << kind;
  return out;
}

double Dist(double a, double b) { return std::fabs(a - b); }
double Dist(cx a, cx b) { return std::hypot(a.re - b.re, a.im - b.im); }
template <class T>
double MaxAbs(const std::vector<T>& v) {
  double m = 0;
  for (const T& z : v) m = std::max(m, Dist(z, T{}));
  return m;
}

template <class T>
double MaxError(const std::vector<T>& got, const std::vector<T>& want) {
  EXPECT_EQ(got.size(), want.size());
  if (got.size() != want.size()) return 1e300;
  double e = 0;
  for (size_t i = 0; i < got.size(); ++i) e = std::max(e, Dist(got[i], want[i]));
  return e;
}

constexpr double kBound = 1e3 * kEps;

// `call` runs the entry for one algorithm and returns its code (form A: err).
template <class Arr, class Call>
void CheckSequences(const char* kind, bool correlation, Call call) {
  using T = typename Arr::Elem;
  for (Line l : Golden(kind)) {
    const int norm = correlation ? l.Int() : 0, n = l.Int(), m = l.Int();
    const auto x = l.Read<T>(n), y = l.Read<T>(m), want = l.Read<T>(n + m - 1);
    const double scale = std::min(n, m) * MaxAbs(x) * MaxAbs(y);
    for (int32_t alg : {0, 1}) {
      Arr hx(x), hy(y), out;
      ASSERT_EQ(call(hx, hy, out, alg, norm), 0);
      EXPECT_LE(MaxError(out.Values(), want), kBound * scale) << kind << " " << n << "x" << m << " " << norm;
    }
  }
}

TEST(ConvolutionGolden, Sequences) {
  CheckSequences<F64>("conv", false, [](F64& x, F64& y, F64& o, int32_t alg, int32_t) {
    int32_t err = 1;
    return Convolution(x.Handle(), y.Handle(), o.Handle(), &alg, &err) + err;
  });
  CheckSequences<F64>("corr", true, [](F64& x, F64& y, F64& o, int32_t alg, int32_t norm) {
    int32_t err = 1;
    return Rxy80(x.Handle(), y.Handle(), o.Handle(), &alg, norm, &err) + err;
  });
  CheckSequences<Cx>("cxconv", false, [](Cx& x, Cx& y, Cx& o, int32_t alg, int32_t) {
    return CxConvolution(x.Handle(), y.Handle(), o.Handle(), alg, 0, 12345);  // normalization unread
  });
  CheckSequences<Cx>("cxcorr", true, [](Cx& x, Cx& y, Cx& o, int32_t alg, int32_t norm) {
    return CxConvolution(x.Handle(), y.Handle(), o.Handle(), alg, 1, norm);
  });
}

template <class M>
void CheckMatrices(const char* kind, bool correlation) {
  for (Line l : Golden(kind)) {
    const int mode = correlation ? 0 : l.Int();
    const int r1 = l.Int(), c1 = l.Int(), r2 = l.Int(), c2 = l.Int();
    const auto x = l.Read<typename M::Elem>(r1 * c1), y = l.Read<typename M::Elem>(r2 * c2);
    const int ro = correlation ? r1 + r2 - 1 : l.Int(), co = correlation ? c1 + c2 - 1 : l.Int();
    const auto want = l.Read<typename M::Elem>(ro * co);
    const double scale = std::min(r1 * c1, r2 * c2) * MaxAbs(x) * MaxAbs(y);
    for (int32_t alg : {0, 1}) {
      M hx(r1, c1, x), hy(r2, c2, y), out;
      int32_t r;
      if constexpr (std::is_same_v<M, Mat>)
        r = correlation ? Correlation_2DH(hx.Handle(), hy.Handle(), out.Handle(), alg)
                        : Convolve_2DH(hx.Handle(), hy.Handle(), out.Handle(), mode, alg);
      else
        r = correlation ? CxCorrelation_2DH(hx.Handle(), hy.Handle(), out.Handle(), alg)
                        : CxConvolve_2DH(hx.Handle(), hy.Handle(), out.Handle(), mode, alg);
      ASSERT_EQ(r, 0);
      EXPECT_EQ(out.Rows(), ro);
      EXPECT_EQ(out.Cols(), co);
      EXPECT_LE(MaxError(out.Values(), want), kBound * scale)
          << kind << " mode " << mode << " " << r1 << "x" << c1 << " * " << r2 << "x" << c2 << " alg " << alg;
    }
  }
}

TEST(ConvolutionGolden, Matrices) {
  CheckMatrices<Mat>("conv2d", false);
  CheckMatrices<Mat>("corr2d", true);
  CheckMatrices<CxMat>("cxconv2d", false);
  CheckMatrices<CxMat>("cxcorr2d", true);
}

// Long sequences: the reference is the defining sum in long double.
TEST(ConvolutionLong, AgreesWithLongDoubleSums) {
  std::mt19937_64 rng(7);
  std::uniform_real_distribution<double> u(-1, 1);
  for (auto [n, m] : std::initializer_list<std::pair<int, int>>{{10000, 1}, {10000, 9973}, {4096, 4096}, {1, 10000}, {6007, 2}}) {
    V x(n), y(m);
    for (double& v : x) v = u(rng);
    for (double& v : y) v = u(rng);
    std::vector<long double> conv(n + m - 1), corr(n + m - 1);
    for (int i = 0; i < n; ++i)
      for (int j = 0; j < m; ++j) {
        conv[i + j] += static_cast<long double>(x[i]) * y[j];
        corr[(n - 1 - i) + j] += static_cast<long double>(x[i]) * y[j];
      }
    const double scale = std::min(n, m);
    for (int32_t alg : {0, 1}) {
      F64 hx(x), hy(y), c, r;
      int32_t err = 1;
      ASSERT_EQ(Convolution(hx.Handle(), hy.Handle(), c.Handle(), &alg, &err), 0);
      ASSERT_EQ(Rxy(hx.Handle(), hy.Handle(), r.Handle(), &alg, &err), 0);
      ASSERT_EQ(c.Count(), n + m - 1);
      ASSERT_EQ(r.Count(), n + m - 1);
      double ec = 0, er = 0;
      for (int k = 0; k < n + m - 1; ++k) {
        ec = std::max(ec, static_cast<double>(fabsl(c.At(k) - conv[k])));
        er = std::max(er, static_cast<double>(fabsl(r.At(k) - corr[k])));
      }
      EXPECT_LE(ec, kBound * scale) << n << "x" << m << " alg " << alg;
      EXPECT_LE(er, kBound * scale) << n << "x" << m << " alg " << alg;
    }
  }
}

}  // namespace
}  // namespace tsmtest
