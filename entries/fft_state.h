// Reserved transform state: how an entry keeps its FFT plan between calls.
//
// Plain entries take the address of a PlanHolder* variable that the host
// keeps for the node; the holder is made on the first call and a clean-up is
// registered with the host (mode 2) that releases plan and holder. The _IDP
// entries take the address of a ReservedTransformState* variable: a record of
// two holders (one per dimension) that the host releases itself through
// TransformUnreserveProc.
#pragma once

#include "frame/types.h"
#include "transforms/kwfft_plan.h"

struct PlanHolder {
  tsm::kwfft_table* plan;
};

struct ReservedTransformState {
  PlanHolder* plan0;
  PlanHolder* plan1;
};

namespace tsm {

// Leaves a plan of `length` in the holder, making the holder and registering
// its clean-up on first use; 0 or -20001 (holder freed and variable nulled).
ErrorCode EnsurePlanHeld(PlanHolder** state, int32 length);
// The same for a slot of a reserved record, with no registration.
ErrorCode EnsurePlanInSlot(PlanHolder** slot, int32 length);
// Makes the zeroed record on first use; -20001 on failure.
ErrorCode ReserveTransformState(ReservedTransformState** state);

// The plan behind either form of state, ensured for `length`.
struct PlainPlanState {
  PlanHolder** state;
  ErrorCode Ensure(int32 length, kwfft_table** plan) const {
    const ErrorCode e = EnsurePlanHeld(state, length);
    if (e == TSM_SUCCESS) *plan = (*state)->plan;
    return e;
  }
};

struct ReservedPlanState {
  ReservedTransformState** state;
  // Slot 0 for the first dimension (and 1-D transforms), 1 for the second.
  ErrorCode Ensure(int32 length, kwfft_table** plan, int slot = 0) const {
    ErrorCode e = ReserveTransformState(state);
    if (e != TSM_SUCCESS) return e;
    PlanHolder** holder = slot == 0 ? &(*state)->plan0 : &(*state)->plan1;
    e = EnsurePlanInSlot(holder, length);
    if (e == TSM_SUCCESS) *plan = (*holder)->plan;
    return e;
  }
};

}  // namespace tsm
