// The allocator front and the library's load routine.
#include <atomic>
#include <cstdlib>
#include <cstring>
#include <new>

#include "frame/arena.h"
#include "frame/workspace.h"

namespace tsm {
namespace {

enum Mode : int32 { kModeUnset = 0, kModeHooks = 1, kModeArena = 2, kModeHeap = 3 };

struct FrontHeader {
  int32 total;  // request plus header, as at the block's birth
  int32 mode;
};
constexpr uint32 kFrontHeader = sizeof(FrontHeader);
static_assert(kFrontHeader == 8);

// Written once: lazily to the heap mode by the first request (which happens
// during static initialisation, for the owner lock), then to the hook mode by
// the load routine.
std::atomic<int32> gDefaultMode{kModeUnset};
void* (*gHookAlloc)(std::size_t) = nullptr;
void* (*gHookResize)(void*, std::size_t) = nullptr;
void (*gHookFree)(void*) = nullptr;

void SetUpDefaultMode() {
  int32 unset = kModeUnset;
  if (gDefaultMode.load(std::memory_order_relaxed) == kModeUnset)
    gDefaultMode.compare_exchange_strong(unset, kModeHeap);
}

int32 WantedMode() {
  return gArena.enabled.load(std::memory_order_relaxed) ? int32{kModeArena} : gDefaultMode.load();
}

void* RawAllocate(int32 mode, uint32 total) {
  if (mode == kModeArena) {
    void* p = nullptr;
    ArenaAllocate(&p, total);  // every arena failure surfaces as a null pointer
    return p;
  }
  if (mode == kModeHooks) return gHookAlloc(total);
  return std::malloc(total);
}

void RawFree(int32 mode, void* header) {
  if (mode == kModeArena)
    ArenaFree(header);
  else if (mode == kModeHooks)
    gHookFree(header);
  else
    std::free(header);
}

FrontHeader* HeaderOf(void* p) { return reinterpret_cast<FrontHeader*>(static_cast<char*>(p) - kFrontHeader); }

void* Stamp(void* header, int32 total, int32 mode) {
  const FrontHeader h{total, mode};
  std::memcpy(header, &h, sizeof h);
  return static_cast<char*>(header) + kFrontHeader;
}

bool TotalFits(uint32 bytes) { return bytes <= 0xFFFFFFFFu - kFrontHeader; }

// Load routine, process attach only. The owner lock lives in a front block
// taken before the hook slots exist, hence the lazy heap mode above.
struct LibraryLoad {
  LibraryLoad() {
    void* lockBlock = AnalysisAllocPtr(sizeof(OwnerLock));
    gArena.ownerLock = lockBlock != nullptr ? new (lockBlock) OwnerLock : nullptr;
    if (gArena.ownerLock == nullptr) std::abort();  // no memory while loading: nothing can run
    gArena.count.store(kNoArena);
    gHookAlloc = std::malloc;
    gHookResize = std::realloc;
    gHookFree = std::free;
    gDefaultMode.store(kModeHooks);
  }
  ~LibraryLoad() {
    gArena.ownerLock->~OwnerLock();
    AnalysisFree(gArena.ownerLock);
    gArena.ownerLock = nullptr;
  }
};
LibraryLoad gLibraryLoad;

}  // namespace

ErrorCode AnalysisAlloc(void** p, uint32 bytes) {
  SetUpDefaultMode();
  *p = nullptr;
  if (!TotalFits(bytes)) return TSM_ERR_NO_MEMORY;
  const uint32 total = bytes + kFrontHeader;
  const int32 mode = WantedMode();
  void* header = RawAllocate(mode, total);
  if (header == nullptr) return TSM_ERR_NO_MEMORY;
  *p = Stamp(header, static_cast<int32>(total), mode);
  return TSM_SUCCESS;
}

void* AnalysisAllocPtr(uint32 bytes) {
  void* p = nullptr;
  AnalysisAlloc(&p, bytes);
  return p;
}

ErrorCode AnalysisFree(void* p) {
  if (p != nullptr) RawFree(HeaderOf(p)->mode, HeaderOf(p));
  return TSM_SUCCESS;
}

ErrorCode AnalysisResize(void** p, uint32 bytes) {
  if (bytes == 0) {
    AnalysisFree(*p);
    *p = nullptr;
    return TSM_SUCCESS;
  }
  if (*p == nullptr || HeaderOf(*p)->mode == kModeUnset) return AnalysisAlloc(p, bytes);
  if (!TotalFits(bytes)) return TSM_ERR_NO_MEMORY;
  FrontHeader old;
  std::memcpy(&old, HeaderOf(*p), sizeof old);
  const int32 mode = WantedMode();
  const uint32 total = bytes + kFrontHeader;

  if (mode == old.mode) {
    void* header = HeaderOf(*p);
    if (mode == kModeArena) {
      ArenaResize(&header, total);
    } else {
      header = mode == kModeHooks ? gHookResize(header, total) : std::realloc(header, total);
    }
    if (header == nullptr) {
      if (mode == kModeArena) *p = nullptr;  // the arena has freed the old block already
      return TSM_ERR_NO_MEMORY;
    }
    // `total` stays the size at the block's birth.
    *p = Stamp(header, old.total, old.mode);
    return TSM_SUCCESS;
  }

  // The workspace was enabled or disabled since the block was made: move it over.
  void* header = RawAllocate(mode, total);
  if (header == nullptr) return TSM_ERR_NO_MEMORY;
  const uint32 keep = (static_cast<uint32>(old.total) < total ? static_cast<uint32>(old.total) : total) - kFrontHeader;
  void* fresh = Stamp(header, static_cast<int32>(total), mode);
  std::memcpy(fresh, *p, keep);
  RawFree(old.mode, HeaderOf(*p));
  *p = fresh;
  return TSM_SUCCESS;
}

}  // namespace tsm
