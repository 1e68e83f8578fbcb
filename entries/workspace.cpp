// Entries of the workspace: error-cluster form. A pending error in the cluster
// makes the call do nothing; otherwise the code is stored and a failure sets
// the status. Every entry returns 0.
#include <cstring>

#include "frame/workspace.h"
#include "tsmath/tsmath.h"

using namespace tsm;

namespace {

bool Pending(const ErrorCluster* e) { return e->status != 0; }

int32_t Report(ErrorCluster* e, ErrorCode code) {
  std::memcpy(reinterpret_cast<char*>(e) + offsetof(ErrorCluster, code), &code, sizeof code);
  if (code < 0) e->status = 1;
  return 0;
}

}  // namespace

extern "C" {

int32_t InitializeAnalysisWorkspaceH(uint32_t size, ErrorCluster* error) {
  return Pending(error) ? 0 : Report(error, WorkspaceSize(size));
}

int32_t EnableAnalysisWorkspaceH(ErrorCluster* error) {
  return Pending(error) ? 0 : Report(error, WorkspaceEnable(true));
}

int32_t DisableAnalysisWorkspaceH(ErrorCluster* error) {
  return Pending(error) ? 0 : Report(error, WorkspaceEnable(false));
}

int32_t UninitializeAnalysisWorkspaceH(ErrorCluster* error) {
  return Pending(error) ? 0 : Report(error, WorkspaceSize(0));
}

}  // extern "C"
