// One reference to a cached FFT plan, dropped on scope exit.
#pragma once

#include "transforms/kwfft_plan.h"

namespace tsm {

class PlanRef {
 public:
  explicit PlanRef(int32 n) : plan_(CreateKwfftTable(n)) {}
  PlanRef(const PlanRef&) = delete;
  PlanRef& operator=(const PlanRef&) = delete;
  ~PlanRef() { DestroyKwfftTable(plan_); }
  kwfft_table* get() const { return plan_; }

 private:
  kwfft_table* plan_;
};

}  // namespace tsm
