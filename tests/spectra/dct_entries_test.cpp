// DCT and DST entries through host handles, against the long double values
// of tools/golden/dct_golden.py (tests/data/dct_golden.txt).
#include <cstring>
#include <fstream>
#include <sstream>
#include <string>

#include "entries/fft_state.h"
#include "spectra/spectra_support.h"

namespace tsmtest {
namespace {

using V = std::vector<double>;

struct Golden1 {
  std::string kind;
  int count = 0, size = 0;
  long long a = 0, b = 0, c = 0;
  std::vector<int> index;
  V value;
};
struct Golden2 {
  std::string kind;
  int xRows = 0, xCols = 0, rows = 0, cols = 0;
  long long a = 0, b = 0, c = 0;
  V value;
};

struct Golden {
  std::vector<Golden1> one;
  std::vector<Golden2> two;
};

const Golden& TheGolden() {
  static const Golden g = [] {
    Golden g;
    std::ifstream file(TSM_TEST_DATA "/dct_golden.txt");
    auto num = [](std::istream& in) {
      std::string s;
      in >> s;
      return std::strtod(s.c_str(), nullptr);
    };
    for (std::string line; std::getline(file, line);) {
      if (line.empty() || line[0] == '#') continue;
      std::istringstream in(line);
      std::string kind;
      in >> kind;
      if (kind == "dct1" || kind == "dst1") {
        Golden1 r;
        r.kind = kind;
        int k;
        in >> r.count >> r.size >> r.a >> r.b >> r.c >> k;
        for (int i = 0; i < k; ++i) {
          r.index.push_back(0);
          in >> r.index.back();
          r.value.push_back(num(in));
        }
        g.one.push_back(r);
      } else {
        Golden2 r;
        r.kind = kind;
        in >> r.xRows >> r.xCols >> r.rows >> r.cols >> r.a >> r.b >> r.c;
        const int rows = r.rows > 0 ? r.rows : r.xRows, cols = r.cols > 0 ? r.cols : r.xCols;
        for (int i = 0; i < rows * cols; ++i) r.value.push_back(num(in));
        g.two.push_back(r);
      }
    }
    return g;
  }();
  return g;
}

// The script's inputs, bit for bit.
V Samples(int count, long long a, long long b, long long c) {
  V x;
  for (long long t = 0; t < count; ++t) x.push_back(static_cast<double>((a * t * t + b * t + c) % 1000003) / 1000003.0 - 0.5);
  return x;
}

std::vector<CxL> AsCx(const V& v) {
  std::vector<CxL> out;
  for (double x : v) out.emplace_back(x, 0);
  return out;
}

class HostMatrix {
 public:
  HostMatrix(int rows, int cols, const V& v)
      : h_(static_cast<MatrixHdl>(tsrt_new_matrix(TSM_TYPE_F64, rows, cols, v.empty() ? nullptr : v.data()))) {}
  HostMatrix(const HostMatrix&) = delete;
  HostMatrix& operator=(const HostMatrix&) = delete;
  ~HostMatrix() { tsrt_dispose(h_); }
  MatrixHdl Handle() const { return h_; }
  int Dim(int d) const {
    int32_t v;
    std::memcpy(&v, reinterpret_cast<const char*>(*h_) + 4 * d, 4);
    return v;
  }
  V Values() const {
    V v(static_cast<size_t>(std::max(Dim(0) * Dim(1), 0)));
    if (!v.empty()) std::memcpy(v.data(), reinterpret_cast<const char*>(*h_) + 8, v.size() * sizeof(double));
    return v;
  }

 private:
  MatrixHdl h_;
};

// The entries by kind; the inverses, which have no size, take it as 0.
using Plain1 = int32_t (*)(F64ArrayHdl, F64ArrayHdl, int32_t, PlanHolder**);
using Twin1 = int32_t (*)(F64ArrayHdl, F64ArrayHdl, int32_t, ReservedTransformState**);
using Plain2 = int32_t (*)(MatrixHdl, MatrixHdl, int32_t, int32_t, PlanHolder**, PlanHolder**);
using Twin2 = int32_t (*)(MatrixHdl, MatrixHdl, int32_t, int32_t, ReservedTransformState**);
struct Kind {
  const char* name;
  Plain1 plain1;
  Twin1 twin1;
  Plain2 plain2;
  Twin2 twin2;
  bool sine;
};
const Kind kForward[] = {{"DCT", DCT_1DH, DCT_1DH_IDP, DCT_2DH, DCT_2DH_IDP, false},
                         {"DST", DST_1DH, DST_1DH_IDP, DST_2DH, DST_2DH_IDP, true}};
const Kind kInverse[] = {
    {"InvDCT", [](F64ArrayHdl y, F64ArrayHdl x, int32_t, PlanHolder** s) { return InvDCT_1DH(y, x, s); },
     [](F64ArrayHdl y, F64ArrayHdl x, int32_t, ReservedTransformState** s) { return InvDCT_1DH_IDP(y, x, s); },
     [](MatrixHdl y, MatrixHdl x, int32_t, int32_t, PlanHolder** r, PlanHolder** c) { return InvDCT_2DH(y, x, r, c); },
     [](MatrixHdl y, MatrixHdl x, int32_t, int32_t, ReservedTransformState** s) { return InvDCT_2DH_IDP(y, x, s); },
     false},
    {"InvDST", [](F64ArrayHdl y, F64ArrayHdl x, int32_t, PlanHolder** s) { return InvDST_1DH(y, x, s); },
     [](F64ArrayHdl y, F64ArrayHdl x, int32_t, ReservedTransformState** s) { return InvDST_1DH_IDP(y, x, s); },
     [](MatrixHdl y, MatrixHdl x, int32_t, int32_t, PlanHolder** r, PlanHolder** c) { return InvDST_2DH(y, x, r, c); },
     [](MatrixHdl y, MatrixHdl x, int32_t, int32_t, ReservedTransformState** s) { return InvDST_2DH_IDP(y, x, s); },
     true}};

int PlanLength(bool sine, int n) { return sine ? 2 * n + 2 : n % 2 == 0 ? n : 2 * n; }

// Runs the plain entry and its twin on x; both must succeed with the same
// bits and hold plans of the defined lengths. The plain result comes back.
V Run1(const Kind& k, const V& x, int size) {
  States s;
  F64 in(x), in2(x), out{3.0}, out2;
  EXPECT_EQ(k.plain1(in.Handle(), out.Handle(), size, &s.plain), 0) << k.name;
  EXPECT_EQ(k.twin1(in2.Handle(), out2.Handle(), size, &s.reserved), 0) << k.name;
  EXPECT_EQ(out.Values(), out2.Values()) << k.name;
  const int n = size > 0 ? size : static_cast<int>(x.size());
  EXPECT_EQ(out.Count(), n);
  if (s.plain != nullptr && s.reserved != nullptr) {
    EXPECT_EQ(s.plain->plan->n, PlanLength(k.sine, n)) << k.name << " " << n;
    EXPECT_EQ(s.reserved->plan0->plan->n, PlanLength(k.sine, n));
  }
  return out.Values();
}

V Run2(const Kind& k, const V& x, int xRows, int xCols, int rows, int cols) {
  States sRows, sCols;
  HostMatrix in(xRows, xCols, x), out(1, 1, {3.0}), out2(0, 0, {});
  EXPECT_EQ(k.plain2(in.Handle(), out.Handle(), rows, cols, &sRows.plain, &sCols.plain), 0) << k.name;
  EXPECT_EQ(k.twin2(in.Handle(), out2.Handle(), rows, cols, &sRows.reserved), 0) << k.name;
  EXPECT_EQ(out.Values(), out2.Values()) << k.name;
  rows = rows > 0 ? rows : xRows;
  cols = cols > 0 ? cols : xCols;
  EXPECT_EQ(out.Dim(0), rows);
  EXPECT_EQ(out.Dim(1), cols);
  EXPECT_EQ(out2.Dim(0), rows);
  if (sRows.plain != nullptr && sCols.plain != nullptr && sRows.reserved != nullptr) {
    // The first state, and plan0, serve the transforms of length rows.
    EXPECT_EQ(sRows.plain->plan->n, PlanLength(k.sine, rows)) << k.name;
    EXPECT_EQ(sCols.plain->plan->n, PlanLength(k.sine, cols)) << k.name;
    EXPECT_EQ(sRows.reserved->plan0->plan->n, PlanLength(k.sine, rows)) << k.name;
    EXPECT_EQ(sRows.reserved->plan1->plan->n, PlanLength(k.sine, cols)) << k.name;
  }
  return out.Values();
}

class DctEntries : public TransformEntries {};

TEST_F(DctEntries, OneDimensionMatchesGoldenAndInvertsIt) {
  ASSERT_EQ(TheGolden().one.size(), 34u);
  for (const Golden1& g : TheGolden().one) {
    const int sine = g.kind == "dst1";
    const int n = g.size > 0 ? g.size : g.count;
    V x = Samples(g.count, g.a, g.b, g.c);
    const V y = Run1(kForward[sine], x, g.size);
    V picked;
    for (int k : g.index) picked.push_back(y[k]);
    EXPECT_LE(ScaledError(AsCx(picked), AsCx(g.value)), kBound) << g.kind << " " << g.count << " " << g.size;
    // The inverse of the reference values where all are known, else of ours.
    x.resize(n);
    const V back = Run1(kInverse[sine], static_cast<int>(g.index.size()) == n ? g.value : y, 0);
    EXPECT_LE(ScaledError(AsCx(back), AsCx(x)), kBound) << "inverse " << g.kind << " " << n;
  }
}

TEST_F(DctEntries, TwoDimensionsMatchGoldenAndInvertIt) {
  ASSERT_EQ(TheGolden().two.size(), 18u);
  for (const Golden2& g : TheGolden().two) {
    const int sine = g.kind == "dst2";
    const int rows = g.rows > 0 ? g.rows : g.xRows, cols = g.cols > 0 ? g.cols : g.xCols;
    const V x = Samples(g.xRows * g.xCols, g.a, g.b, g.c);
    const V y = Run2(kForward[sine], x, g.xRows, g.xCols, g.rows, g.cols);
    EXPECT_LE(ScaledError(AsCx(y), AsCx(g.value)), kBound) << g.kind << " " << g.xRows << "x" << g.xCols;
    V fitted(static_cast<size_t>(rows * cols), 0.0);
    for (int r = 0; r < std::min(rows, g.xRows); ++r)
      for (int c = 0; c < std::min(cols, g.xCols); ++c) fitted[r * cols + c] = x[r * g.xCols + c];
    const V back = Run2(kInverse[sine], g.value, rows, cols, 0, 0);
    EXPECT_LE(ScaledError(AsCx(back), AsCx(fitted)), kBound) << "inverse " << g.kind << " " << rows << "x" << cols;
  }
}

TEST_F(DctEntries, OneStateForBothDimensionsStillTransforms) {
  const V x = RandomReal(12, 4);
  for (const Kind& k : kForward) {
    States shared, s;
    HostMatrix in(3, 4, x), y(0, 0, {});
    ASSERT_EQ(k.plain2(in.Handle(), y.Handle(), 0, 0, &shared.plain, &shared.plain), 0) << k.name;
    EXPECT_EQ(y.Values(), Run2(k, x, 3, 4, 0, 0)) << k.name;
  }
}

TEST_F(DctEntries, AnEmptyInputGivesEmptyAndAnEmptyOutput) {
  for (const Kind* set : {kForward, kInverse})
    for (int i = 0; i < 2; ++i) {
      const Kind& k = set[i];
      States s, sCols;
      F64 none, out{1.0};
      EXPECT_EQ(k.plain1(none.Handle(), out.Handle(), 4, &s.plain), TSM_ERR_EMPTY) << k.name;
      EXPECT_EQ(out.Count(), 0);
      out.SetCount(1);
      EXPECT_EQ(k.twin1(none.Handle(), out.Handle(), 4, &s.reserved), TSM_ERR_EMPTY) << k.name;
      EXPECT_EQ(out.Count(), 0);
      for (const auto& [rows, cols] : {std::pair{0, 3}, std::pair{3, 0}}) {
        HostMatrix in(rows, cols, {}), y(1, 1, {1.0}), y2(2, 1, {1.0, 2.0});
        EXPECT_EQ(k.plain2(in.Handle(), y.Handle(), 2, 2, &s.plain, &sCols.plain), TSM_ERR_EMPTY) << k.name;
        EXPECT_EQ(k.twin2(in.Handle(), y2.Handle(), 2, 2, &s.reserved), TSM_ERR_EMPTY) << k.name;
        for (const HostMatrix* m : {&y, &y2}) EXPECT_TRUE(m->Dim(0) == 0 && m->Dim(1) == 0) << k.name;
      }
      EXPECT_EQ(s.plain, nullptr);
      EXPECT_EQ(sCols.plain, nullptr);
      EXPECT_EQ(s.reserved, nullptr);
    }
}

TEST_F(DctEntries, ARefusedResizeGivesNoMemoryAndAnEmptyOutput) {
  const V x = RandomReal(12, 5);
  for (const Kind* set : {kForward, kInverse})
    for (int i = 0; i < 2; ++i) {
      const Kind& k = set[i];
      States s, sCols;
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
