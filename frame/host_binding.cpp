// Resolver and thunks of the host services.
//
// A thunk record caches the service's address and the module it came from;
// when the resolved module changes (SetTSRTModule, or a thread whose slot
// names another module) the name is looked up again. The record's words are
// written without a lock: two threads resolving at once write the same
// values, the function word before the module word.
#include "frame/host.h"

#include <dlfcn.h>
#include <pthread.h>
#include <unistd.h>

#include <atomic>
#include <cstdio>
#include <cstring>

namespace tsm {
namespace {

struct ThunkRecord {
  std::atomic<void*> function;
  std::atomic<void*> module;
  const char name[28];
};

ThunkRecord gResizeRecord{{nullptr}, {nullptr}, "NumericArrayResize"};
ThunkRecord gCleanupRecord{{nullptr}, {nullptr}, "RTSetCleanupProc"};

std::atomic<void*> gModule{nullptr};
std::atomic<int32> gTlsIndex{-1};

// The process image counts as the host once it has been seen to export one of
// the host's marks; its exports never go away, so that answer is kept.
std::atomic<void*> gImageHost{nullptr};

constexpr char kCaption[] = "Fatal Error";
constexpr char kNoHostText[] = "TESSARINV.LIB was not called from a Tessarin process.";
constexpr char kNoServiceWords[] = "TESSARINV.LIB could not locate";

[[noreturn]] void FatalHostError(const char* text) {
  std::fprintf(stderr, "%s: %s\n", kCaption, text);
  std::fflush(nullptr);
  _exit(1);
}

void* LoadedModule(const char* name) {
  void* h = dlopen(name, RTLD_NOLOAD | RTLD_LAZY);
  if (h != nullptr) dlclose(h);  // a look-up, not a reference: the module stays loaded by its owner
  return h;
}

void* ProcessImageIfHost() {
  void* known = gImageHost.load(std::memory_order_acquire);
  if (known != nullptr) return known;
  void* image = dlopen(nullptr, RTLD_LAZY);
  if (image == nullptr) return nullptr;
  if (dlsym(image, "gTSRTVersion") == nullptr && dlsym(image, "AZNewHandle") == nullptr) {
    dlclose(image);
    return nullptr;
  }
  gImageHost.store(image, std::memory_order_release);
  return image;
}

void* ResolveHostModule() {
  void* module = nullptr;
  const int32 index = gTlsIndex.load(std::memory_order_acquire);
  if (index != -1) module = pthread_getspecific(static_cast<pthread_key_t>(index));
  if (module == nullptr) module = gModule.load(std::memory_order_acquire);
  if (module == nullptr) module = ProcessImageIfHost();
  if (module == nullptr) module = LoadedModule("libtsrt.so");
  if (module == nullptr) module = LoadedModule("libtsffrt.so");
  return module;
}

void* ResolveHostFunction(ThunkRecord& record) {
  void* module = ResolveHostModule();
  if (module == nullptr) FatalHostError(kNoHostText);
  void* function = record.function.load(std::memory_order_acquire);
  if (module != record.module.load(std::memory_order_acquire) || function == nullptr) {
    function = dlsym(module, record.name);
    record.function.store(function, std::memory_order_release);
    record.module.store(module, std::memory_order_release);
  }
  if (function == nullptr) {
    char text[300] = {};
    std::snprintf(text, sizeof text, "%s \"%s\".", kNoServiceWords, record.name);
    FatalHostError(text);
  }
  return function;
}

}  // namespace

int32 HostNumericArrayResize(int32 typeCode, int32 numDims, void* handleAddress, int32 totalElements) {
  using Service = int32 (*)(int32, int32, void*, int32);
  auto service = reinterpret_cast<Service>(ResolveHostFunction(gResizeRecord));
  return service(typeCode, numDims, handleAddress, totalElements);
}

int32 HostRTSetCleanupProc(CleanupProc proc, void* arg, int32 mode) {
  using Service = int32 (*)(CleanupProc, void*, int32);
  auto service = reinterpret_cast<Service>(ResolveHostFunction(gCleanupRecord));
  return service(proc, arg, mode);
}

void BindHostModule(void* module) { gModule.store(module, std::memory_order_release); }

void BindHostTlsIndex(int32 index) { gTlsIndex.store(index, std::memory_order_release); }

}  // namespace tsm
