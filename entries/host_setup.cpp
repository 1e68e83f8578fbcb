// Entries by which a host names its runtime module or thread-local slot.
#include "frame/host.h"
#include "tsmath/tsmath.h"

extern "C" {

void SetTSRTModule(void* module) {
  tsm::BindHostModule(module);
  SetTSRTModuleHook(module);
}

void SetTSRTTLSIndex(int32_t index) {
  tsm::BindHostTlsIndex(index);
  SetTSRTTLSIndexHook(index);
}

// Points that a variant linked into a host can fill; nothing to do here.
void SetTSRTModuleHook(void*) {}
void SetTSRTTLSIndexHook(int32_t) {}

}  // extern "C"
