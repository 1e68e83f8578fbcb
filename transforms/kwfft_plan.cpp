// Plan cache, classification of lengths and the trigonometric tables.
#include "transforms/kwfft_plan.h"

#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <mutex>
#include <new>

#include "transforms/kwfft.h"
#include "transforms/kwfft_passes.h"

namespace tsm {
namespace {

// Guards the list and every reference count, and is held for the whole of a
// plan's construction (nested plans included).
std::mutex kwfft_table_mutex;
kwfft_table* kwfft_table_list = nullptr;

constexpr int32 kGenericBelow = 50;  // odd primes below this outside the list are kind 1

template <class T>
T* HeapArray(std::int64_t n) {
  return static_cast<T*>(std::malloc(sizeof(T) * static_cast<std::size_t>(n > 0 ? n : 1)));
}

// Splits n into factors of the three kinds and sorts them ascending, kinds
// moving with their factors.
void Classify(kwfft_table& t) {
  int32 rem = t.n;
  int32 count = 0;
  auto append = [&](int32 d, int32 kind) {
    t.factors[count] = d;
    t.kinds[count] = kind;
    ++count;
  };
  auto primeKind = [](int32 d) { return d < kGenericBelow ? int32{kKindGeneric} : int32{kKindRader}; };
  if (rem >= 2) {
    for (const int32* d = kwfft_radix_list; *d != -1 && rem != 1; ++d)
      while (rem % *d == 0) {
        append(*d, kKindCodelet);
        rem /= *d;
      }
    if (rem != 1 && rem >= 9) {
      int32 d = 3;
      do {
        while (rem % d == 0) {
          append(d, primeKind(d));
          rem /= d;
        }
        d += 2;
      } while (static_cast<std::int64_t>(d) * d <= rem);
    }
    if (rem != 1) append(rem, primeKind(rem));
  }
  t.factor_count = count;
  for (int32 i = 0; i < count; ++i)
    for (int32 j = i + 1; j < count; ++j)
      if (t.factors[j] < t.factors[i]) {
        std::swap(t.factors[i], t.factors[j]);
        std::swap(t.kinds[i], t.kinds[j]);
      }
}

std::int64_t PowMod(std::int64_t b, std::int64_t e, std::int64_t p) {
  std::int64_t r = 1;
  b %= p;
  for (; e > 0; e >>= 1) {
    if (e & 1) r = r * b % p;
    b = b * b % p;
  }
  return r;
}

// Smallest primitive root of the prime p: g is one when g^((p-1)/q) is not 1
// for every prime q dividing p-1. Products in 64 bits, so any int32 prime works.
int32 PrimitiveRoot(int32 p) {
  std::int64_t q[32];
  int nq = 0;
  std::int64_t rest = p - 1;
  for (std::int64_t d = 2; d * d <= rest; ++d) {
    if (rest % d != 0) continue;
    q[nq++] = d;
    while (rest % d == 0) rest /= d;
  }
  if (rest > 1) q[nq++] = rest;
  for (std::int64_t g = 2; g < p; ++g) {
    bool primitive = true;
    for (int i = 0; i < nq && primitive; ++i) primitive = PowMod(g, (p - 1) / q[i], p) != 1;
    if (primitive) return static_cast<int32>(g);
  }
  return 1;
}

bool BuildTwiddles(const kwfft_table& t) {
  int32 length = t.n;
  for (int32 i = 0; i + 1 < t.factor_count; ++i) {
    const int32 r = t.factors[i];
    const int32 m = length / r;
    kwfft_stage& st = *t.stages[i];
    const std::int64_t size = static_cast<std::int64_t>(r - 1) * (m - 1);
    st.tw_cos = HeapArray<f64>(size);
    st.tw_sin = HeapArray<f64>(size);
    f64* c = HeapArray<f64>(m);
    f64* s = HeapArray<f64>(m);
    const bool ok = st.tw_cos && st.tw_sin && c && s;
    if (ok) {
      const f64 theta = kKwfftTwoPi / length;
      for (int32 j = 1; j < r; ++j) {
        KwfftTrigTable(j * theta, m - 1, c, s);
        for (int32 k = 1; k < m; ++k) {
          st.tw_cos[static_cast<std::int64_t>(k - 1) * (r - 1) + (j - 1)] = c[k - 1];
          st.tw_sin[static_cast<std::int64_t>(k - 1) * (r - 1) + (j - 1)] = s[k - 1];
        }
      }
    }
    std::free(c);
    std::free(s);
    if (!ok) return false;
    length = m;
  }
  return true;
}

bool BuildRootTable(kwfft_stage& st, int32 r) {
  st.root_cos = HeapArray<f64>(r);
  st.root_sin = HeapArray<f64>(r);
  if (!st.root_cos || !st.root_sin) return false;
  st.root_cos[0] = 1;
  st.root_sin[0] = 0;
  KwfftTrigTable(kKwfftTwoPi / r, r - 1, st.root_cos + 1, st.root_sin + 1);
  return true;
}

bool BuildRader(kwfft_stage& st, int32 p) {
  const int32 n1 = p - 1;
  st.rader_plan = kwfft_table_create_locked(n1);
  st.rader_gather = HeapArray<int32>(p);
  st.rader_scatter = HeapArray<int32>(p);
  st.rader_cos = HeapArray<f64>(n1);
  st.rader_sin = HeapArray<f64>(n1);
  f64* b = HeapArray<f64>(2 * static_cast<std::int64_t>(n1));
  bool ok = st.rader_plan && st.rader_gather && st.rader_scatter && st.rader_cos && st.rader_sin && b;
  if (ok) {
    const std::int64_t g = PrimitiveRoot(p);
    st.rader_gather[0] = st.rader_scatter[0] = 0;
    st.rader_gather[1] = st.rader_scatter[1] = 1;
    std::int64_t v = 1;
    for (int32 i = 2; i <= n1; ++i) {
      v = v * g % p;
      st.rader_scatter[i] = static_cast<int32>(v);
      st.rader_gather[p + 1 - i] = static_cast<int32>(v);
    }
    // exp(-2 pi i (e+1)/p) for e < p-1, then b[i] = that of index g^i, over p-1.
    KwfftTrigTable(kKwfftTwoPi / p, n1, st.rader_cos, st.rader_sin);
    const f64 scale = 1.0 / n1;
    for (int32 i = 0; i < n1; ++i) {
      const int32 e = st.rader_scatter[i + 1] - 1;
      b[i] = st.rader_cos[e] * scale;
      b[n1 + i] = st.rader_sin[e] * scale;
    }
    ok = kwfft_complex(st.rader_plan, b, b + n1, st.rader_cos, st.rader_sin, 1, 1, n1) == TSM_SUCCESS;
  }
  std::free(b);
  return ok;
}

void FreePlan(kwfft_table* t) {
  for (int32 i = 0; i < t->factor_count; ++i) {
    kwfft_stage* st = t->stages[i];
    if (st == nullptr) continue;
    std::free(st->tw_cos);
    std::free(st->tw_sin);
    std::free(st->root_cos);
    std::free(st->root_sin);
    kwfft_table_destroy_locked(st->rader_plan);
    std::free(st->rader_cos);
    std::free(st->rader_sin);
    std::free(st->rader_gather);
    std::free(st->rader_scatter);
    delete st;
  }
  delete t;
}

kwfft_table* BuildPlan(int32 n) {
  kwfft_table* t = new (std::nothrow) kwfft_table;
  if (t == nullptr) return nullptr;
  t->n = n;
  Classify(*t);
  for (int32 i = 0; i < t->factor_count; ++i) {
    if (t->kinds[i] == kKindCodelet) t->passes[i] = KwfftPassesForRadix(t->factors[i]);
    t->stages[i] = new (std::nothrow) kwfft_stage;
    if (t->stages[i] == nullptr) {
      FreePlan(t);
      return nullptr;
    }
  }
  bool ok = BuildTwiddles(*t);
  for (int32 i = 0; ok && i < t->factor_count; ++i) {
    if (t->kinds[i] == kKindGeneric) ok = BuildRootTable(*t->stages[i], t->factors[i]);
    if (t->kinds[i] == kKindRader) ok = BuildRader(*t->stages[i], t->factors[i]);
  }
  if (!ok) {
    FreePlan(t);
    return nullptr;
  }
  return t;
}

}  // namespace

void KwfftTrigTable(f64 a, int32 count, f64* c, f64* t) {
  if (count < 1) return;
  const f64 h = std::sin(a / 2);
  const f64 s = -std::sin(a);
  const f64 d = h * (h + h);
  f64 cc = 1 - d, tt = s;
  c[0] = cc;
  t[0] = tt;
  for (int32 k = 1; k < count; ++k) {
    const f64 cn = cc - (cc * d + tt * s);
    const f64 tn = tt - (tt * d - cc * s);
    cc = c[k] = cn;
    tt = t[k] = tn;
  }
}

kwfft_table* kwfft_table_create_locked(int32 n) {
  if (n < 1) return nullptr;
  for (kwfft_table* t = kwfft_table_list; t != nullptr; t = t->next)
    if (t->n == n) {
      ++t->refcount;
      return t;
    }
  kwfft_table* t = BuildPlan(n);
  if (t == nullptr) return nullptr;
  t->refcount = 1;
  t->next = kwfft_table_list;
  if (kwfft_table_list != nullptr) kwfft_table_list->prev = t;
  kwfft_table_list = t;
  return t;
}

void kwfft_table_destroy_locked(kwfft_table* t) {
  if (t == nullptr || --t->refcount > 0) return;
  if (t->prev != nullptr) t->prev->next = t->next;
  if (t->next != nullptr) t->next->prev = t->prev;
  if (kwfft_table_list == t) kwfft_table_list = t->next;
  FreePlan(t);
}

kwfft_table* CreateKwfftTable(int32 n) {
  std::lock_guard<std::mutex> hold(kwfft_table_mutex);
  return kwfft_table_create_locked(n);
}

void DestroyKwfftTable(kwfft_table* plan) {
  if (plan == nullptr) return;
  std::lock_guard<std::mutex> hold(kwfft_table_mutex);
  kwfft_table_destroy_locked(plan);
}

int32 kwfft_next_smooth_length(int32 n) {
  static constexpr int32 kPrimes[] = {43, 41, 37, 31, 29, 19, 17, 13, 11, 7, 5, 3, 2};
  if (n < 2) return 1;
  for (std::int64_t m = n; m <= INT32_MAX; ++m) {
    std::int64_t rest = m;
    for (int32 p : kPrimes)
      while (rest % p == 0) rest /= p;
    if (rest == 1) return static_cast<int32>(m);
  }
  return 0;  // no such length fits in int32
}

void KwfftCacheCensus(int32* plans, int32* references) {
  std::lock_guard<std::mutex> hold(kwfft_table_mutex);
  *plans = *references = 0;
  for (kwfft_table* t = kwfft_table_list; t != nullptr; t = t->next) {
    ++*plans;
    *references += t->refcount;
  }
}

}  // namespace tsm
