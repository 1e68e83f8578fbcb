// Life cycle of the arena: no arena -> arena disabled <-> arena enabled.
// The four workspace entries are meant for a quiet moment and take no lock.
#include <cstdlib>

#include "frame/arena.h"
#include "frame/host.h"
#include "frame/workspace.h"

namespace tsm {
namespace {

constexpr int32 kRegisterCleanup = 1;
constexpr int32 kWithdrawCleanup = 0;

}  // namespace

ErrorCode WorkspaceSize(uint32 size) {
  if (size != 0) {
    if (gArena.count.load() != kNoArena) return TSM_ERR_ARENA_EXISTS;
    void* buffer = std::malloc(std::size_t{size} + kArenaSlack);
    if (buffer == nullptr) return TSM_ERR_NO_MEMORY;
    const auto b = reinterpret_cast<std::uintptr_t>(buffer);
    gArena.base.store(b);
    gArena.top.store(b);
    // The usable size is a whole number of words, so that `top` stays aligned.
    gArena.limit.store(b + (size & ~(kArenaGrain - 1)));
    gArena.count.store(0);
    HostRTSetCleanupProc(WorkspaceCleanup, nullptr, kRegisterCleanup);
    return TSM_SUCCESS;
  }
  const uint32 count = gArena.count.load();
  if (count == kNoArena) return TSM_SUCCESS;
  if (count > 0) return TSM_ERR_ARENA_BLOCKS_LIVE;
  if (gArena.enabled.load()) return TSM_ERR_ARENA_ENABLED;
  HostRTSetCleanupProc(WorkspaceCleanup, nullptr, kWithdrawCleanup);
  void* buffer = reinterpret_cast<void*>(gArena.base.load());
  gArena.base.store(0);
  gArena.limit.store(0);
  gArena.top.store(0);
  gArena.count.store(kNoArena);
  std::free(buffer);
  return TSM_SUCCESS;
}

ErrorCode WorkspaceEnable(bool on) {
  if (gArena.count.load() == kNoArena) {
    WorkspaceSize(0);  // nothing to remove in this state; kept for the order of operations
    return TSM_ERR_NO_ARENA;
  }
  gArena.enabled.store(on ? 1 : 0);
  return TSM_SUCCESS;
}

int32 WorkspaceCleanup(void*) {
  if (gArena.count.load() != kNoArena) {
    gArena.enabled.store(0);
    gArena.top.exchange(gArena.base.load());
    gArena.count.exchange(0);
  }
  WorkspaceSize(0);
  return 0;
}

}  // namespace tsm
