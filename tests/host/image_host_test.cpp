// This program is its own host: it exports AZNewHandle and the two host
// services, and doesn't link libtsrt. With no module or slot bound, entries
// must come here even when libtsrt is loaded in the process (RTLD_LOCAL).
// Blocks here are plain malloc'd: master pointer -> block.
#include <dlfcn.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <vector>

#include "tsmath/tsmath.h"

namespace {

struct Resize {
  int32_t type, dims, total;
  bool operator==(const Resize&) const = default;
};

struct Registration {
  int32_t (*proc)(void*);
  void* arg;
  int32_t mode;
};

std::vector<Resize> gResizes;
std::vector<Registration> gHeld;
int32_t gLastMode = -1;

}  // namespace

extern "C" {

void AZNewHandle() {}

int32_t NumericArrayResize(int32_t typeCode, int32_t numDims, void* handleAddress, int32_t totalElements) {
  gResizes.push_back({typeCode, numDims, totalElements});
  const std::size_t elem = typeCode == TSM_TYPE_I32 ? 4 : typeCode == TSM_TYPE_F64 ? 8 : 0;
  if (elem == 0 || numDims != 1 || totalElements < 0) return 1;
  auto slot = static_cast<void***>(handleAddress);
  if (*slot == nullptr) *slot = static_cast<void**>(std::calloc(1, sizeof(void*)));
  void* block = std::realloc(**slot, 4 + elem * static_cast<std::size_t>(totalElements));
  if (block == nullptr) return 2;
  **slot = block;
  return 0;
}

int32_t RTSetCleanupProc(int32_t (*proc)(void*), void* arg, int32_t mode) {
  gLastMode = mode;
  auto it = std::find_if(gHeld.begin(), gHeld.end(), [&](const Registration& r) { return r.proc == proc && r.arg == arg; });
  if (it != gHeld.end()) gHeld.erase(it);
  if (mode != 0) gHeld.push_back({proc, arg, mode});
  return 0;
}

}  // extern "C"

namespace {

template <class T>
class Array {
 public:
  explicit Array(const std::vector<T>& v = {}) : master_(std::malloc(4 + sizeof(T) * v.size())) {
    const auto n = static_cast<int32_t>(v.size());
    std::memcpy(master_, &n, 4);
    if (n > 0) std::memcpy(static_cast<char*>(master_) + 4, v.data(), sizeof(T) * v.size());
  }
  ~Array() { std::free(master_); }
  Array(const Array&) = delete;
  Array& operator=(const Array&) = delete;

  template <class Hdl>
  Hdl Handle() {
    return reinterpret_cast<Hdl>(&master_);
  }
  std::vector<T> Values() const {
    int32_t n;
    std::memcpy(&n, master_, 4);
    std::vector<T> v(static_cast<std::size_t>(std::max(n, 0)));
    if (n > 0) std::memcpy(v.data(), static_cast<const char*>(master_) + 4, sizeof(T) * v.size());
    return v;
  }

 private:
  void* master_;
};

TEST(ProcessImageHost, ServesEntriesWhileLibtsrtIsLoadedLocally) {
  void* tsrt = dlopen(TSM_TSRT_FILE, RTLD_NOW | RTLD_LOCAL);
  ASSERT_NE(tsrt, nullptr) << dlerror();
  // Loaded, so a search for libtsrt.so by name would find it.
  void* byName = dlopen("libtsrt.so", RTLD_NOLOAD | RTLD_LAZY);
  EXPECT_EQ(byName, tsrt);
  if (byName != nullptr) dlclose(byName);
  const auto tsrtResizes = reinterpret_cast<int64_t (*)()>(dlsym(tsrt, "tsrt_resize_calls"));
  const auto tsrtHeld = reinterpret_cast<int32_t (*)()>(dlsym(tsrt, "tsrt_cleanup_count"));
  ASSERT_TRUE(tsrtResizes != nullptr && tsrtHeld != nullptr);

  // Equal-width histogram of {0, 1, 2, 3} in 2 bins: centres, then counts.
  Array<double> x({0, 1, 2, 3}), centres;
  Array<int32_t> counts;
  int32_t bins = 2, err = -1;
  EXPECT_EQ(histgran_head(x.Handle<F64ArrayHdl>(), &bins, counts.Handle<I32ArrayHdl>(), centres.Handle<F64ArrayHdl>(), &err), 0);
  EXPECT_EQ(err, 0);
  EXPECT_EQ(centres.Values(), (std::vector<double>{0.75, 2.25}));
  EXPECT_EQ(counts.Values(), (std::vector<int32_t>{2, 2}));
  EXPECT_EQ(gResizes, (std::vector<Resize>{{TSM_TYPE_F64, 1, 2}, {TSM_TYPE_I32, 1, 2}}));

  Array<double> y({3, 1, 2, 2, 5}), modes;
  EXPECT_EQ(ModeH(y.Handle<F64ArrayHdl>(), 0, modes.Handle<F64ArrayHdl>()), 0);
  EXPECT_EQ(modes.Values(), std::vector<double>{2});
  EXPECT_EQ(gResizes.size(), 3u);

  // The workspace registers its clean-up here; running it, as a host does at
  // the end of a run, frees the workspace, which withdraws the registration.
  ErrorCluster error{};
  InitializeAnalysisWorkspaceH(4096, &error);
  ASSERT_EQ(error.status, 0);
  ASSERT_EQ(gHeld.size(), 1u);
  EXPECT_EQ(gHeld[0].mode, 1);
  const Registration r = gHeld[0];
  EXPECT_EQ(r.proc(r.arg), 0);
  EXPECT_TRUE(gHeld.empty());
  EXPECT_EQ(gLastMode, 0);
  InitializeAnalysisWorkspaceH(4096, &error);  // a second workspace: the first one is gone
  int32_t code = error.code;
  EXPECT_EQ(code, 0);
  UninitializeAnalysisWorkspaceH(&error);
  code = error.code;
  EXPECT_EQ(code, 0);
  EXPECT_TRUE(gHeld.empty());

  EXPECT_EQ(tsrtResizes(), 0);
  EXPECT_EQ(tsrtHeld(), 0);
}

}  // namespace
