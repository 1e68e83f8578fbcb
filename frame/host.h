// The two host services, found at run time (the library never links against a
// host). Each call resolves the host module: the thread-local slot named by
// SetTSRTTLSIndex, else the module given to SetTSRTModule, else the process
// image if it exports "gTSRTVersion" or "AZNewHandle", else an already loaded
// libtsrt.so, else an already loaded libtsffrt.so. No host at all, or a host
// without the service, ends the process with a one-line message on stderr.
#pragma once

#include "frame/types.h"

namespace tsm {

using CleanupProc = int32 (*)(void*);

// NumericArrayResize: 0 on success, the host's non-zero result on failure. The
// service never writes a block's dimension fields.
int32 HostNumericArrayResize(int32 typeCode, int32 numDims, void* handleAddress, int32 totalElements);

// RTSetCleanupProc: a non-zero mode registers proc(arg) to run when the host
// ends a run, mode 0 withdraws it.
int32 HostRTSetCleanupProc(CleanupProc proc, void* arg, int32 mode);

// Binding state behind SetTSRTModule and SetTSRTTLSIndex (-1: no slot).
void BindHostModule(void* module);
void BindHostTlsIndex(int32 index);

}  // namespace tsm
