// Spectra, Hilbert, Hartley, DCT and DST entries through host handles: values
// against long double DFTs and the long double values of
// tools/golden/dct_golden.py, checks and emptied outputs, refused resizes, the
// plans held, and the _IDP twins, which must give the plain entries' bits.
#include <gtest/gtest.h>

#include <cstring>
#include <fstream>
#include <functional>
#include <random>
#include <sstream>
#include <string>
#include <vector>

#include "entries/fft_state.h"
#include "support/host_arrays.h"
#include "support/host_fixture.h"
#include "support/host_matrix.h"
#include "support/random_data.h"
#include "support/reference_dft.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;
using Out = std::vector<CxL>;

// Every value within 1e3 eps of the largest reference value (of 1 where the
// reference is all zeros: the inputs lie in [-1, 1]).
constexpr double kBound = 1e3 * kEps;

double ScaledError(const Out& got, const Out& want) {
  EXPECT_EQ(got.size(), want.size());
  if (got.size() != want.size()) return 1;
  long double err = 0, scale = 0;
  for (size_t k = 0; k < want.size(); ++k) {
    err = std::max(err, std::abs(got[k] - want[k]));
    scale = std::max(scale, std::abs(want[k]));
  }
  return static_cast<double>(err / (scale > 0 ? scale : 1));
}

Out AsOut(const V& v) { return Out(v.begin(), v.end()); }
Out AsOut(const std::vector<cx>& v) {
  Out o;
  for (const cx& z : v) o.emplace_back(z.re, z.im);
  return o;
}

// Both kinds of state for an entry and its twin; the reserved one the host
// releases itself, the plain one goes at the end of the run.
struct States {
  PlanHolder* plain = nullptr;
  ReservedTransformState* reserved = nullptr;
  ~States() { TransformUnreserveProc(&reserved); }
};

using Entries = HostRunTest;

// ---- Spectra, Hilbert and Hartley ------------------------------------------

struct Data {
  Data(int n, int m)
      : x(RandomReal(n, n)), y(RandomReal(m, n + 1)), z(RandomCx(n, n + 2)), w(RandomCx(m, n + 3)),
        X(ReferenceDft(AsOut(x))), Y(ReferenceDft(AsOut(y))), Z(ReferenceDft(AsOut(z))), W(ReferenceDft(AsOut(w))) {}
  V x, y;
  std::vector<cx> z, w;
  Out X, Y, Z, W;
};

// conj(A) B / n^2, bin by bin.
Out Cross(const Out& a, const Out& b) {
  const long double n = a.size();
  Out s;
  for (size_t k = 0; k < a.size(); ++k) s.push_back(std::conj(a[k]) * b[k] / (n * n));
  return s;
}

// Positive bins times -i sign, negative ones times i sign, bin 0 and the
// Nyquist bin dropped, and back (the inverse DFT by conjugation).
Out Hilbert(const Out& X, long double sign) {
  const size_t n = X.size();
  Out h(n);
  for (size_t k = 1; 2 * k < n; ++k) {
    h[k] = std::conj(X[k] * CxL(0, -sign));
    h[n - k] = std::conj(X[n - k] * CxL(0, sign));
  }
  Out x = ReferenceDft(h);
  for (CxL& v : x) v = CxL(v.real() / n, 0);
  return x;
}

Out Hartley(const Out& X, long double scale) {
  Out h;
  for (const CxL& v : X) h.emplace_back((v.real() - v.imag()) * scale, 0);
  return h;
}

// The host arrays of one call, made before it (making one is a resize too).
struct Arrays {
  explicit Arrays(const Data& d) : x(d.x), y(d.y), z(d.z), w(d.w) {}
  F64 x, y;
  Cx z, w;
  F64 s{7.0};
  Cx S{cx{5, 5}};
};

template <class Host>
Out Read(const Host& a) {
  return AsOut(a.Values());
}

template <auto Plain, auto Twin>
int32_t InPlace(Arrays& a, States& s, bool twin) {
  return twin ? Twin(a.x.Handle(), &s.reserved) : Plain(a.x.Handle(), &s.plain);
}


struct Case {
  const char* name;
  bool pair;  // takes y as well, and checks the counts against each other
  std::function<int32_t(Arrays&, States&, bool)> call;
  Out (*read)(const Arrays&);
  Out (*want)(const Data&);
};

const std::vector<Case>& Cases() {
  static const auto x = [](const Arrays& a) { return Read(a.x); };
  static const std::vector<Case> cases = {
      {"SpectrumH", false, InPlace<SpectrumH, SpectrumH_IDP>, x, [](const Data& d) { return Cross(d.X, d.X); }},
      {"CxSpectrumH", false,
       [](Arrays& a, States& s, bool twin) {
         return twin ? CxSpectrumH_IDP(a.z.Handle(), a.s.Handle(), &s.reserved)
                     : CxSpectrumH(a.z.Handle(), a.s.Handle(), &s.plain);
       },
       [](const Arrays& a) { return Read(a.s); }, [](const Data& d) { return Cross(d.Z, d.Z); }},
      {"CrossSpectrumH", true,
       [](Arrays& a, States& s, bool twin) {
         return twin ? CrossSpectrumH_IDP(a.x.Handle(), a.y.Handle(), a.S.Handle(), &s.reserved)
                     : CrossSpectrumH(a.x.Handle(), a.y.Handle(), a.S.Handle(), &s.plain);
       },
       [](const Arrays& a) { return Read(a.S); }, [](const Data& d) { return Cross(d.X, d.Y); }},
      {"CxCrossSpectrumH", true,
       [](Arrays& a, States& s, bool twin) {
         return twin ? CxCrossSpectrumH_IDP(a.z.Handle(), a.w.Handle(), a.S.Handle(), &s.reserved)
                     : CxCrossSpectrumH(a.z.Handle(), a.w.Handle(), a.S.Handle(), &s.plain);
       },
       [](const Arrays& a) { return Read(a.S); }, [](const Data& d) { return Cross(d.Z, d.W); }},
      {"FastHilbertTransformH", false, InPlace<FastHilbertTransformH, FastHilbertTransformH_IDP>, x,
       [](const Data& d) { return Hilbert(d.X, 1); }},
      {"InvFastHilbertTransformH", false, InPlace<InvFastHilbertTransformH, InvFastHilbertTransformH_IDP>, x,
       [](const Data& d) { return Hilbert(d.X, -1); }},
      {"FHTH", false, InPlace<FHTH, FHTH_IDP>, x, [](const Data& d) { return Hartley(d.X, 1); }},
      {"InvFHTH", false, InPlace<InvFHTH, InvFHTH_IDP>, x,
       [](const Data& d) { return Hartley(d.X, 1.0L / d.X.size()); }},
  };
  return cases;
}

TEST_F(Entries, SpectraMatchLongDoubleDftsAndTwinsAgree) {
  for (int n : {1, 2, 3, 8, 9, 97, 1000, 1024, 9973, 10000}) {
    const Data d(n, n);
    for (const Case& c : Cases()) {
      States s;
      Arrays a(d), b(d);
      ASSERT_EQ(c.call(a, s, false), 0) << c.name << " n=" << n;
      ASSERT_EQ(c.call(b, s, true), 0) << c.name << " n=" << n;
      EXPECT_LE(ScaledError(c.read(a), c.want(d)), kBound) << c.name << " n=" << n;
      EXPECT_EQ(c.read(a), c.read(b)) << c.name << " n=" << n;
      ASSERT_NE(s.plain, nullptr);  // both states hold a plan of the array's length
      EXPECT_EQ(s.plain->plan->n, n);
      EXPECT_EQ(s.reserved->plan0->plan->n, n);
      EXPECT_EQ(s.reserved->plan1, nullptr);
    }
  }
}

// Counts checked in order, and refused resizes: each empties the output.
TEST_F(Entries, SpectraFailuresEmptyTheOutput) {
  const Data good(12, 12);
  for (const Case& c : Cases())
    for (bool twin : {false, true}) {
      for (const auto& [n, m] : {std::pair{0, 4}, std::pair{4, 0}, std::pair{0, 0}, std::pair{8, 9}, std::pair{9, 8}}) {
        const int32_t want = n < 1 || (c.pair && m < 1) ? TSM_ERR_EMPTY : c.pair && n != m ? TSM_ERR_SIZE_MISMATCH : 0;
        if (want == 0) continue;
        States s;
        Arrays a(Data(n, m));
        EXPECT_EQ(c.call(a, s, twin), want) << c.name << " " << n << " " << m;
        EXPECT_TRUE(c.read(a).empty()) << c.name;
        EXPECT_TRUE(s.plain == nullptr && s.reserved == nullptr) << c.name;
      }
      States s;
      Arrays a(good);
      const int made = RunFailingEachResize([&] { return c.call(a, s, twin); }, [&](int k, int32_t result) {
        EXPECT_EQ(result, TSM_ERR_NO_MEMORY) << c.name << " resize " << k;
        EXPECT_TRUE(c.read(a).empty()) << c.name << " resize " << k;
      });
      // The in-place entries make no resize but on failure.
      EXPECT_EQ(made, c.pair || std::string(c.name) == "CxSpectrumH") << c.name;
    }
}

TEST_F(Entries, ScratchComesFromTheHeapNotTheWorkspace) {
  ScopedWorkspace ws(64);
  const Data d(15, 15);  // plans of 15, 30 and 32 points take no scratch of their own
  for (const Case& c : Cases()) {
    States s;
    Arrays a(d);
    EXPECT_EQ(c.call(a, s, false), 0) << c.name;
  }
  F64 x(d.x), y;
  PlanHolder* state = nullptr;
  EXPECT_EQ(DCT_1DH(x.Handle(), y.Handle(), 0, &state), 0);
  EXPECT_EQ(DST_1DH(x.Handle(), y.Handle(), 0, &state), 0);
}

// ---- DCT and DST -------------------------------------------------------------

struct Golden {
  std::string kind;  // dct, dst
  int dims = 0, xRows = 1, xCols = 0, rows = 1, cols = 0;
  long long a = 0, b = 0, c = 0;
  std::vector<int> index;
  V value;
};

const std::vector<Golden>& TheGolden() {
  static const std::vector<Golden> all = [] {
    std::vector<Golden> all;
    std::ifstream file(TSM_TEST_DATA "/dct_golden.txt");
    for (std::string line; std::getline(file, line);) {
      if (line.empty() || line[0] == '#') continue;
      std::istringstream in(line);
      Golden g;
      in >> g.kind >> g.dims;
      if (g.dims == 2) in >> g.xRows;
      in >> g.xCols;
      if (g.dims == 2) in >> g.rows;
      int k = 0;
      in >> g.cols >> g.a >> g.b >> g.c >> k;
      for (std::string v; k-- > 0 && in >> g.index.emplace_back() >> v;) g.value.push_back(std::strtod(v.c_str(), nullptr));
      all.push_back(g);
    }
    return all;
  }();
  return all;
}

// The script's inputs, bit for bit.
V Samples(int count, long long a, long long b, long long c) {
  V x;
  for (long long t = 0; t < count; ++t)
    x.push_back(static_cast<double>((a * t * t + b * t + c) % 1000003) / 1000003.0 - 0.5);
  return x;
}

using HostMatrix = Mat;

// The entries of a kind; the inverses, which have no sizes, are called
// through forms that take and drop them.
using Plain1 = int32_t (*)(F64ArrayHdl, F64ArrayHdl, int32_t, PlanHolder**);
using Twin1 = int32_t (*)(F64ArrayHdl, F64ArrayHdl, int32_t, ReservedTransformState**);
using Plain2 = int32_t (*)(MatrixHdl, MatrixHdl, int32_t, int32_t, PlanHolder**, PlanHolder**);
using Twin2 = int32_t (*)(MatrixHdl, MatrixHdl, int32_t, int32_t, ReservedTransformState**);
struct Kind {
  const char* name;
  bool sine;
  Plain1 plain1;
  Twin1 twin1;
  Plain2 plain2;
  Twin2 twin2;
};
template <auto F, class State>
int32_t NoSize(F64ArrayHdl y, F64ArrayHdl x, int32_t, State s) {
  return F(y, x, s);
}
template <auto F, class... States>
int32_t NoSizes(MatrixHdl y, MatrixHdl x, int32_t, int32_t, States... s) {
  return F(y, x, s...);
}
const Kind kForward[] = {{"DCT", false, DCT_1DH, DCT_1DH_IDP, DCT_2DH, DCT_2DH_IDP},
                         {"DST", true, DST_1DH, DST_1DH_IDP, DST_2DH, DST_2DH_IDP}};
const Kind kInverse[] = {
    {"InvDCT", false, NoSize<InvDCT_1DH, PlanHolder**>, NoSize<InvDCT_1DH_IDP, ReservedTransformState**>,
     NoSizes<InvDCT_2DH, PlanHolder**, PlanHolder**>, NoSizes<InvDCT_2DH_IDP, ReservedTransformState**>},
    {"InvDST", true, NoSize<InvDST_1DH, PlanHolder**>, NoSize<InvDST_1DH_IDP, ReservedTransformState**>,
     NoSizes<InvDST_2DH, PlanHolder**, PlanHolder**>, NoSizes<InvDST_2DH_IDP, ReservedTransformState**>}};

int PlanLength(bool sine, int n) { return sine ? 2 * n + 2 : n % 2 == 0 ? n : 2 * n; }

// The plain entry and its twin on x (a row of cols values, or a matrix):
// both succeed with the same bits and hold plans of the defined lengths,
// the first state and plan0 those of length rows. Returns the plain output.
V RunBoth(const Kind& k, const V& x, int xRows, int xCols, int rows, int cols, int dims) {
  States s, sCols;
  V got, twin;
  if (dims == 1) {
    F64 in(x), out{3.0}, out2;
    EXPECT_EQ(k.plain1(in.Handle(), out.Handle(), cols, &s.plain), 0) << k.name;
    EXPECT_EQ(k.twin1(in.Handle(), out2.Handle(), cols, &s.reserved), 0) << k.name;
    got = out.Values(), twin = out2.Values();
  } else {
    HostMatrix in(xRows, xCols, x), out(1, 1, {3.0}), out2(0, 0, {});
    EXPECT_EQ(k.plain2(in.Handle(), out.Handle(), rows, cols, &s.plain, &sCols.plain), 0) << k.name;
    EXPECT_EQ(k.twin2(in.Handle(), out2.Handle(), rows, cols, &s.reserved), 0) << k.name;
    got = out.Values(), twin = out2.Values();
    EXPECT_TRUE(out.Dim(0) == (rows > 0 ? rows : xRows) && out2.Dim(1) == (cols > 0 ? cols : xCols)) << k.name;
  }
  rows = dims == 1 ? 1 : rows > 0 ? rows : xRows;
  cols = cols > 0 ? cols : xCols;
  EXPECT_EQ(got, twin) << k.name;
  EXPECT_EQ(got.size(), static_cast<size_t>(rows * cols)) << k.name;
  if (s.plain == nullptr || s.reserved == nullptr) return got;
  const int first = dims == 1 ? cols : rows;
  EXPECT_EQ(s.plain->plan->n, PlanLength(k.sine, first)) << k.name << " " << first;
  EXPECT_EQ(s.reserved->plan0->plan->n, PlanLength(k.sine, first)) << k.name;
  if (dims == 2 && sCols.plain != nullptr && s.reserved->plan1 != nullptr) {
    EXPECT_EQ(sCols.plain->plan->n, PlanLength(k.sine, cols)) << k.name;
    EXPECT_EQ(s.reserved->plan1->plan->n, PlanLength(k.sine, cols)) << k.name;
  }
  return got;
}

TEST_F(Entries, DctAndDstMatchGoldenAndTheInversesUndoThem) {
  ASSERT_EQ(TheGolden().size(), 52u);
  for (const Golden& g : TheGolden()) {
    const bool sine = g.kind == "dst";
    const int rows = g.rows > 0 ? g.rows : g.xRows, cols = g.cols > 0 ? g.cols : g.xCols;
    const V x = Samples(g.xRows * g.xCols, g.a, g.b, g.c);
    const V y = RunBoth(kForward[sine], x, g.xRows, g.xCols, g.rows, g.cols, g.dims);
    V picked;
    for (int k : g.index) picked.push_back(y[k]);
    EXPECT_LE(ScaledError(AsOut(picked), AsOut(g.value)), kBound)
        << g.kind << g.dims << " " << g.xRows << "x" << g.xCols << " to " << rows << "x" << cols;
    // The inverse of the reference values where all are known, else of ours,
    // against the input cut or padded.
    V fitted(static_cast<size_t>(rows * cols), 0.0);
    for (int r = 0; r < std::min(rows, g.xRows); ++r)
      for (int c = 0; c < std::min(cols, g.xCols); ++c) fitted[r * cols + c] = x[r * g.xCols + c];
    const V& from = g.value.size() == fitted.size() ? g.value : y;
    EXPECT_LE(ScaledError(AsOut(RunBoth(kInverse[sine], from, rows, cols, 0, 0, g.dims)), AsOut(fitted)), kBound)
        << "inverse " << g.kind << g.dims << " " << rows << "x" << cols;
  }
}

TEST_F(Entries, TwoDimensionsWithOneStateForBoth) {
  const V x = RandomReal(12, 4);
  for (const Kind& k : kForward) {
    States shared;
    HostMatrix in(3, 4, x), y(0, 0, {});
    ASSERT_EQ(k.plain2(in.Handle(), y.Handle(), 0, 0, &shared.plain, &shared.plain), 0) << k.name;
    EXPECT_EQ(y.Values(), RunBoth(k, x, 3, 4, 0, 0, 2)) << k.name;
  }
}

// An empty input, and refused resizes: each empties the output.
TEST_F(Entries, DctAndDstFailuresEmptyTheOutput) {
  const V x = RandomReal(12, 5);
  for (const Kind* set : {kForward, kInverse})
    for (int i = 0; i < 2; ++i) {
      const Kind& k = set[i];
      States s, sCols;
      F64 none, out1{1.0}, out2{1.0};
      EXPECT_EQ(k.plain1(none.Handle(), out1.Handle(), 4, &s.plain), TSM_ERR_EMPTY) << k.name;
      EXPECT_EQ(k.twin1(none.Handle(), out2.Handle(), 4, &s.reserved), TSM_ERR_EMPTY) << k.name;
      EXPECT_TRUE(out1.Count() == 0 && out2.Count() == 0) << k.name;
      for (const auto& [rows, cols] : {std::pair{0, 3}, std::pair{3, 0}}) {
        HostMatrix in(rows, cols, {}), y(1, 1, {1.0}), y2(2, 1, {1.0, 2.0});
        EXPECT_EQ(k.plain2(in.Handle(), y.Handle(), 2, 2, &s.plain, &sCols.plain), TSM_ERR_EMPTY) << k.name;
        EXPECT_EQ(k.twin2(in.Handle(), y2.Handle(), 2, 2, &s.reserved), TSM_ERR_EMPTY) << k.name;
        for (const HostMatrix* m : {&y, &y2}) EXPECT_TRUE(m->Dim(0) == 0 && m->Dim(1) == 0) << k.name;
      }
      EXPECT_TRUE(s.plain == nullptr && sCols.plain == nullptr && s.reserved == nullptr) << k.name;
      F64 in(x), out{1.0};
      HostMatrix min(3, 4, x), mout(1, 1, {1.0});
      const std::function<int32_t()> calls[] = {
          [&] { return k.plain1(in.Handle(), out.Handle(), 9, &s.plain); },
          [&] { return k.twin1(in.Handle(), out.Handle(), 0, &s.reserved); },
          [&] { return k.plain2(min.Handle(), mout.Handle(), 5, 0, &s.plain, &sCols.plain); },
          [&] { return k.twin2(min.Handle(), mout.Handle(), 0, 0, &s.reserved); },
      };
      for (int c = 0; c < 4; ++c) {
        const int made = RunFailingEachResize(calls[c], [&](int r, int32_t result) {
          EXPECT_EQ(result, TSM_ERR_NO_MEMORY) << k.name << " call " << c << " resize " << r;
          EXPECT_EQ(c < 2 ? out.Count() : mout.Dim(0) + mout.Dim(1), 0) << k.name << " call " << c;
        });
        EXPECT_EQ(made, 1) << k.name << " call " << c;
      }
    }
}

}  // namespace
}  // namespace tsmtest
