// Spectra, Hilbert and Hartley entries through host handles, against long
// double DFTs; the _IDP twins must give the same bits as the plain entries.
#include <functional>

#include "entries/fft_state.h"
#include "spectra/spectra_support.h"

namespace tsmtest {
namespace {

using Out = std::vector<CxL>;
using Spectrum = std::vector<CxL>;

std::vector<cx> RandomCx(int n, unsigned seed) {
  const std::vector<double> re = RandomReal(n, seed), im = RandomReal(n, seed + 1000);
  std::vector<cx> v(n);
  for (int i = 0; i < n; ++i) v[i] = cx{re[i], im[i]};
  return v;
}

Spectrum Dft(const std::vector<double>& v) {
  Spectrum a;
  for (double x : v) a.emplace_back(x, 0);
  return ReferenceDft(a);
}
Spectrum Dft(const std::vector<cx>& v) {
  Spectrum a;
  for (const cx& z : v) a.emplace_back(z.re, z.im);
  return ReferenceDft(a);
}

struct Data {
  explicit Data(int n)
      : x(RandomReal(n, n)), y(RandomReal(n, n + 1)), z(RandomCx(n, n + 2)), w(RandomCx(n, n + 3)),
        X(Dft(x)), Y(Dft(y)), Z(Dft(z)), W(Dft(w)) {}
  std::vector<double> x, y;
  std::vector<cx> z, w;
  Spectrum X, Y, Z, W;
};

// conj(A) B / n^2 bin by bin.
Out Cross(const Spectrum& a, const Spectrum& b) {
  const long double n = a.size();
  Out s;
  for (size_t k = 0; k < a.size(); ++k) s.push_back(std::conj(a[k]) * b[k] / (n * n));
  return s;
}

// Positive bins times -i, negative ones times i, bin 0 and Nyquist dropped,
// back by the conjugate trick; `sign` -1 for the inverse.
Out Hilbert(const Spectrum& X, long double sign) {
  const size_t n = X.size();
  Spectrum h(n);
  for (size_t k = 1; 2 * k < n; ++k) {
    h[k] = std::conj(X[k] * CxL(0, -sign));
    h[n - k] = std::conj(X[n - k] * CxL(0, sign));
  }
  Out x = ReferenceDft(h);
  for (CxL& v : x) v = CxL(v.real() / n, 0);
  return x;
}

Out Hartley(const Spectrum& X, long double scale) {
  Out h;
  for (const CxL& v : X) h.emplace_back((v.real() - v.imag()) * scale, 0);
  return h;
}

template <class Host>
Out Read(const Host& a) {
  Out v;
  for (int i = 0; i < a.Count(); ++i) {
    if constexpr (std::is_same_v<Host, F64>) v.emplace_back(a.At(i), 0);
    else v.emplace_back(a.At(i).re, a.At(i).im);
  }
  return v;
}

// The host arrays of one call, made before it (making them is a resize too).
struct Arrays {
  explicit Arrays(const Data& d) : x(d.x), y(d.y), z(d.z), w(d.w) {}
  F64 x, y;
  Cx z, w;
  F64 s{7.0};
  Cx S{cx{5, 5}};
};

template <auto Plain, auto Twin>
int32_t InPlace(Arrays& a, States& s, bool twin) {
  return twin ? Twin(a.x.Handle(), &s.reserved) : Plain(a.x.Handle(), &s.plain);
}

template <auto Plain, auto Twin, class Host>
int32_t CrossOf(Host& x, Host& y, Cx& S, States& s, bool twin) {
  return twin ? Twin(x.Handle(), y.Handle(), S.Handle(), &s.reserved) : Plain(x.Handle(), y.Handle(), S.Handle(), &s.plain);
}

struct Case {
  const char* name;
  std::function<int32_t(Arrays&, States&, bool)> call;
  Out (*read)(const Arrays&);
  Out (*want)(const Data&);
};

Out ReadX(const Arrays& a) { return Read(a.x); }
Out ReadS(const Arrays& a) { return Read(a.s); }
Out ReadCross(const Arrays& a) { return Read(a.S); }

const std::vector<Case>& Cases() {
  static const std::vector<Case> cases = {
      {"SpectrumH", InPlace<SpectrumH, SpectrumH_IDP>, ReadX, [](const Data& d) { return Cross(d.X, d.X); }},
      {"CxSpectrumH",
       [](Arrays& a, States& s, bool twin) {
         return twin ? CxSpectrumH_IDP(a.z.Handle(), a.s.Handle(), &s.reserved)
                     : CxSpectrumH(a.z.Handle(), a.s.Handle(), &s.plain);
       },
       ReadS, [](const Data& d) { return Cross(d.Z, d.Z); }},
      {"CrossSpectrumH",
       [](Arrays& a, States& s, bool twin) { return CrossOf<CrossSpectrumH, CrossSpectrumH_IDP>(a.x, a.y, a.S, s, twin); },
       ReadCross, [](const Data& d) { return Cross(d.X, d.Y); }},
      {"CxCrossSpectrumH",
       [](Arrays& a, States& s, bool twin) {
         return CrossOf<CxCrossSpectrumH, CxCrossSpectrumH_IDP>(a.z, a.w, a.S, s, twin);
       },
       ReadCross, [](const Data& d) { return Cross(d.Z, d.W); }},
      {"FastHilbertTransformH", InPlace<FastHilbertTransformH, FastHilbertTransformH_IDP>, ReadX,
       [](const Data& d) { return Hilbert(d.X, 1); }},
      {"InvFastHilbertTransformH", InPlace<InvFastHilbertTransformH, InvFastHilbertTransformH_IDP>, ReadX,
       [](const Data& d) { return Hilbert(d.X, -1); }},
      {"FHTH", InPlace<FHTH, FHTH_IDP>, ReadX, [](const Data& d) { return Hartley(d.X, 1); }},
      {"InvFHTH", InPlace<InvFHTH, InvFHTH_IDP>, ReadX, [](const Data& d) { return Hartley(d.X, 1.0L / d.X.size()); }},
  };
  return cases;
}

class SpectraEntries : public TransformEntries {};

TEST_F(SpectraEntries, MatchLongDoubleDftsAndTwinsAgree) {
  for (int n : {1, 2, 3, 8, 9, 97, 1000, 1024, 9973, 10000}) {
    const Data d(n);
    for (const Case& c : Cases()) {
      States s;
      Arrays a(d), b(d);
      ASSERT_EQ(c.call(a, s, false), 0) << c.name << " n=" << n;
      ASSERT_EQ(c.call(b, s, true), 0) << c.name << " n=" << n;
      const Out plain = c.read(a), twin = c.read(b);
      EXPECT_LE(ScaledError(plain, c.want(d)), kBound) << c.name << " n=" << n;
      EXPECT_EQ(plain, twin) << c.name << " n=" << n;
      ASSERT_NE(s.plain, nullptr);  // both states keep a plan of the array's length
      EXPECT_EQ(s.plain->plan->n, n);
      EXPECT_EQ(s.reserved->plan0->plan->n, n);
      EXPECT_EQ(s.reserved->plan1, nullptr);
    }
  }
}

TEST_F(SpectraEntries, ChecksComeInOrderAndEmptyTheOutput) {
  for (auto f : {SpectrumH, FastHilbertTransformH, InvFastHilbertTransformH, FHTH, InvFHTH}) {
    F64 x;
    PlanHolder* state = nullptr;
    EXPECT_EQ(f(x.Handle(), &state), TSM_ERR_EMPTY);
    EXPECT_EQ(x.Count(), 0);
    EXPECT_EQ(state, nullptr);
  }
  for (auto f : {SpectrumH_IDP, FastHilbertTransformH_IDP, InvFastHilbertTransformH_IDP, FHTH_IDP, InvFHTH_IDP}) {
    F64 x;
    ReservedTransformState* state = nullptr;
    EXPECT_EQ(f(x.Handle(), &state), TSM_ERR_EMPTY);
    EXPECT_EQ(state, nullptr);
  }
  Cx none;
  F64 s{1.0, 2.0};
  States st;
  EXPECT_EQ(CxSpectrumH(none.Handle(), s.Handle(), &st.plain), TSM_ERR_EMPTY);
  EXPECT_EQ(s.Count(), 0);
  s.SetCount(1);
  EXPECT_EQ(CxSpectrumH_IDP(none.Handle(), s.Handle(), &st.reserved), TSM_ERR_EMPTY);
  EXPECT_EQ(s.Count(), 0);

  struct Sizes {
    int nx, ny, want;
  } sizes[] = {{0, 4, TSM_ERR_EMPTY}, {4, 0, TSM_ERR_EMPTY}, {0, 0, TSM_ERR_EMPTY}, {8, 9, TSM_ERR_SIZE_MISMATCH},
               {9, 8, TSM_ERR_SIZE_MISMATCH}};
  for (const Sizes& c : sizes) {
    for (bool twin : {false, true}) {
      F64 x(RandomReal(c.nx, 1)), y(RandomReal(c.ny, 2));
      Cx z(RandomCx(c.nx, 1)), w(RandomCx(c.ny, 2)), S{cx{1, 2}}, S2{cx{1, 2}};
      EXPECT_EQ((CrossOf<CrossSpectrumH, CrossSpectrumH_IDP>(x, y, S, st, twin)), c.want);
      EXPECT_EQ((CrossOf<CxCrossSpectrumH, CxCrossSpectrumH_IDP>(z, w, S2, st, twin)), c.want);
      EXPECT_EQ(S.Count(), 0);
      EXPECT_EQ(S2.Count(), 0);
    }
  }
  EXPECT_EQ(st.plain, nullptr);
  EXPECT_EQ(st.reserved, nullptr);
}

TEST_F(SpectraEntries, ARefusedResizeGivesNoMemoryAndAnEmptyOutput) {
  const Data d(12);
  for (const Case& c : Cases()) {
    for (bool twin : {false, true}) {
      States s;
      Arrays a(d);
      const int made = RunFailingEachResize([&] { return c.call(a, s, twin); },
                                            [&](int k, int32_t result) {
                                              EXPECT_EQ(result, TSM_ERR_NO_MEMORY) << c.name << " resize " << k;
                                              EXPECT_TRUE(c.read(a).empty()) << c.name << " resize " << k;
                                            });
      // Only the entries with an output of their own resize it.
      EXPECT_EQ(made, std::string(c.name).find("Spectrum") != std::string::npos && c.name != std::string("SpectrumH"))
          << c.name;
    }
  }
}

TEST_F(SpectraEntries, ScratchComesFromTheHeapNotTheWorkspace) {
  ErrorCluster e{0, 0};
  InitializeAnalysisWorkspaceH(64, &e);
  EnableAnalysisWorkspaceH(&e);
  const Data d(16);
  for (const Case& c : Cases()) {
    States s;
    Arrays a(d);
    EXPECT_EQ(c.call(a, s, false), 0) << c.name;
  }
  DisableAnalysisWorkspaceH(&e);
  UninitializeAnalysisWorkspaceH(&e);
  EXPECT_EQ(e.status, 0);
}

}  // namespace
}  // namespace tsmtest
