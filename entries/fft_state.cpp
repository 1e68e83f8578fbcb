#include "entries/fft_state.h"

#include <cstdlib>
#include <initializer_list>

#include "frame/host.h"
#include "tsmath/tsmath.h"

namespace tsm {
namespace {

constexpr int32 kRegisterCleanup = 2;
constexpr int32 kWithdrawCleanup = 0;

// The host's clean-up of a plain state: the holder's plan and the holder.
int32 ReleasePlanHolder(void* holder) {
  auto* h = static_cast<PlanHolder*>(holder);
  DestroyKwfftTable(h->plan);
  std::free(h);
  return 0;
}

// The common steps; `registered` says whether the holder has a clean-up.
ErrorCode EnsurePlan(PlanHolder** state, int32 length, bool registered) {
  if (*state == nullptr) {
    *state = static_cast<PlanHolder*>(std::malloc(sizeof(PlanHolder)));
    if (*state == nullptr) return TSM_ERR_NO_MEMORY;
    (*state)->plan = nullptr;
  }
  PlanHolder* holder = *state;
  if (holder->plan == nullptr) {
    holder->plan = CreateKwfftTable(length);
    if (holder->plan == nullptr) {
      std::free(holder);
      *state = nullptr;
      return TSM_ERR_NO_MEMORY;
    }
    if (registered) HostRTSetCleanupProc(ReleasePlanHolder, holder, kRegisterCleanup);
    return TSM_SUCCESS;
  }
  if (holder->plan->n != length) {
    DestroyKwfftTable(holder->plan);
    holder->plan = CreateKwfftTable(length);
    if (holder->plan == nullptr) {
      if (registered) HostRTSetCleanupProc(ReleasePlanHolder, holder, kWithdrawCleanup);
      std::free(holder);
      *state = nullptr;
      return TSM_ERR_NO_MEMORY;
    }
  }
  return TSM_SUCCESS;
}

}  // namespace

ErrorCode EnsurePlanHeld(PlanHolder** state, int32 length) { return EnsurePlan(state, length, true); }

ErrorCode EnsurePlanInSlot(PlanHolder** slot, int32 length) { return EnsurePlan(slot, length, false); }

ErrorCode ReserveTransformState(ReservedTransformState** state) {
  if (*state != nullptr) return TSM_SUCCESS;
  *state = static_cast<ReservedTransformState*>(std::calloc(1, sizeof(ReservedTransformState)));
  return *state != nullptr ? TSM_SUCCESS : TSM_ERR_NO_MEMORY;
}

}  // namespace tsm

extern "C" int32_t TransformUnreserveProc(ReservedTransformState** state) {
  if (*state == nullptr) return 0;
  for (PlanHolder** slot : {&(*state)->plan0, &(*state)->plan1}) {
    if (*slot == nullptr) continue;
    tsm::DestroyKwfftTable((*slot)->plan);
    std::free(*slot);
    *slot = nullptr;
  }
  std::free(*state);
  *state = nullptr;
  return 0;
}
