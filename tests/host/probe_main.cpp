// A process that links libtsmath but no host and exports nothing, so the
// library has to find its host among the loaded modules. argv[1] picks what
// is loaded before one entry call:
//   resize, cleanup  nothing: an entry that resizes, or one that registers a
//                    clean-up (both must end the process)
//   tsrt             libtsrt.so, dlopen'ed RTLD_LOCAL
//   tsffrt           the counting module under the name libtsffrt.so
//   both             both of them: libtsrt.so comes first
// Exit 0 when the call was served as expected, 2 with a note otherwise.
#include <dlfcn.h>

#include <cstdio>
#include <cstring>
#include <string>

#include "counting_host.h"
#include "tsmath/tsmath.h"
#include "tsrt.h"

namespace {

// A block that no host made: the entry reaches the host before it matters.
struct FakeArray {
  alignas(8) unsigned char block[64] = {};
  void* master = block;
  explicit FakeArray(int32_t count, double value = 0) {
    std::memcpy(block, &count, 4);
    for (int32_t i = 0; i < count; ++i) std::memcpy(block + 4 + 8 * i, &value, 8);
  }
  F64ArrayHdl Handle() { return reinterpret_cast<F64ArrayHdl>(&master); }
};

int Fail(const char* note) {
  std::printf("%s\n", note);
  return 2;
}

template <class Fn>
Fn Find(void* module, const char* name) {
  return reinterpret_cast<Fn>(dlsym(module, name));
}

// ModeH of {3, 1, 2, 2, 5} through libtsrt's own arrays: the one mode 2.
int ServedByTsrt(void* tsrt) {
  const auto newArray = Find<decltype(&tsrt_new_array)>(tsrt, "tsrt_new_array");
  const auto resizeCalls = Find<decltype(&tsrt_resize_calls)>(tsrt, "tsrt_resize_calls");
  const double values[] = {3, 1, 2, 2, 5};
  auto x = static_cast<F64ArrayHdl>(newArray(TSM_TYPE_F64, 5, values));
  auto modes = static_cast<F64ArrayHdl>(newArray(TSM_TYPE_F64, 0, nullptr));
  const int64_t before = resizeCalls();
  const int32_t result = ModeH(x, 0, modes);
  const int64_t made = resizeCalls() - before;
  const int32_t count = (*modes)->count;
  double mode = 0;
  if (count == 1) std::memcpy(&mode, reinterpret_cast<char*>(*modes) + 4, 8);
  Find<decltype(&tsrt_dispose)>(tsrt, "tsrt_dispose")(x);
  Find<decltype(&tsrt_dispose)>(tsrt, "tsrt_dispose")(modes);
  if (result != 0) return Fail("ModeH failed");
  if (made != 1) return Fail("libtsrt did not make the resize");
  if (count != 1 || mode != 2) return Fail("wrong modes");
  return 0;
}

// The counting module has no target, so ModeH returns its answer as it stands.
int ServedByCounting(void* module) {
  CountingHostState* state = Find<CountingHostStateFn>(module, "counting_host_state")();
  FakeArray x(2, 4.0), modes(0);
  if (ModeH(x.Handle(), 0, modes.Handle()) != kCountingHostNoTarget) return Fail("ModeH did not return the host's result");
  if (state->resizes != 2) return Fail("the counting module did not make both resizes");
  return 0;
}

}  // namespace

int main(int argc, char** argv) {
  const std::string mode = argc > 1 ? argv[1] : "";
  if (mode == "resize") {
    FakeArray x(2, 4.0), modes(0);
    ModeH(x.Handle(), 0, modes.Handle());
    return Fail("ModeH returned");
  }
  if (mode == "cleanup") {
    ErrorCluster error{};
    InitializeAnalysisWorkspaceH(4096, &error);
    return Fail("InitializeAnalysisWorkspaceH returned");
  }
  void* tsrt = mode == "tsrt" || mode == "both" ? dlopen(TSM_TSRT_FILE, RTLD_NOW | RTLD_LOCAL) : nullptr;
  void* tsffrt = mode == "tsffrt" || mode == "both" ? dlopen(TSM_TSFFRT_FILE, RTLD_NOW | RTLD_LOCAL) : nullptr;
  if (mode == "tsrt") return tsrt != nullptr ? ServedByTsrt(tsrt) : Fail("cannot load libtsrt.so");
  if (mode == "tsffrt") return tsffrt != nullptr ? ServedByCounting(tsffrt) : Fail("cannot load libtsffrt.so");
  if (mode == "both") {
    if (tsrt == nullptr || tsffrt == nullptr) return Fail("cannot load the modules");
    if (const int r = ServedByTsrt(tsrt); r != 0) return r;
    return Find<CountingHostStateFn>(tsffrt, "counting_host_state")()->resizes == 0 ? 0 : Fail("libtsffrt.so was used");
  }
  return Fail("unknown mode");
}
