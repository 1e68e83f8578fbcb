// Binding of the host services in a process that links libtsrt: which module
// serves an entry after SetTSRTModule and through the thread-local slot, the
// default search among loaded modules (in child processes), the fatal paths
// and the exported hooks.
#include <dlfcn.h>
#include <gmock/gmock.h>
#include <pthread.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <string>
#include <thread>
#include <vector>

#include "counting_host.h"
#include "support/host_arrays.h"

extern char** environ;

namespace {

using tsmtest::F64;

// A counting module loaded RTLD_LOCAL and forwarding to libtsrt's services.
struct Module {
  void* handle;
  CountingHostState* state;
  explicit Module(const char* path) : handle(dlopen(path, RTLD_NOW | RTLD_LOCAL)) {
    state = reinterpret_cast<CountingHostStateFn>(dlsym(handle, "counting_host_state"))();
    state->resize = NumericArrayResize;
    state->cleanup = RTSetCleanupProc;
  }
};

Module& A() {
  static Module m(TSM_HOST_MODULE_A);
  return m;
}
Module& B() {
  static Module m(TSM_HOST_MODULE_B);
  return m;
}

// ModeH of {3, 1, 2, 2, 5}: one resize, to the one mode 2.
void CallModeH() {
  F64 x{3, 1, 2, 2, 5};
  F64 modes;
  ASSERT_EQ(ModeH(x.Handle(), 0, modes.Handle()), 0);
  EXPECT_EQ(modes.Values(), std::vector<double>{2});
}

// A workspace made and removed: one clean-up registered, then withdrawn, and
// both reach libtsrt whoever forwards them.
void CallWorkspace() {
  const int32_t held = tsrt_cleanup_count();
  ErrorCluster error{};
  InitializeAnalysisWorkspaceH(4096, &error);
  ASSERT_EQ(error.status, 0);
  EXPECT_EQ(tsrt_cleanup_count(), held + 1);
  UninitializeAnalysisWorkspaceH(&error);
  ASSERT_EQ(error.status, 0);
  EXPECT_EQ(tsrt_cleanup_count(), held);
}

int32_t Calls(const Module& m) { return m.state->resizes + m.state->cleanups; }

// Which host served `call`: 'A' or 'B' for a counting module alone, 'T' for
// libtsrt directly (neither module counted a call), '?' for a mixture.
char ServedBy(void (*call)()) {
  const int32_t a = Calls(A()), b = Calls(B());
  call();
  const bool byA = Calls(A()) != a, byB = Calls(B()) != b;
  return byA && byB ? '?' : byA ? 'A' : byB ? 'B' : 'T';
}

class HostBinding : public ::testing::Test {
 protected:
  void TearDown() override {
    SetTSRTTLSIndex(-1);
    SetTSRTModule(nullptr);
  }
};

TEST_F(HostBinding, EachRebindTakesEffectAtTheNextCallOfEachService) {
  const struct {
    void* module;
    char host;
  } steps[] = {{nullptr, 'T'}, {A().handle, 'A'}, {B().handle, 'B'}, {A().handle, 'A'}, {nullptr, 'T'}, {B().handle, 'B'}};
  for (const auto& s : steps) {
    SCOPED_TRACE(testing::Message() << "bound to " << s.host);
    SetTSRTModule(s.module);
    EXPECT_EQ(ServedBy(CallModeH), s.host);
    EXPECT_EQ(ServedBy(CallWorkspace), s.host);
  }
}

TEST_F(HostBinding, ServiceReceivesTheArgumentsAndItsResultReachesTheEntry) {
  CountingHostState& a = *A().state;
  SetTSRTModule(A().handle);
  F64 x{3, 1, 2, 2, 5};
  F64 modes;
  ASSERT_EQ(ModeH(x.Handle(), 0, modes.Handle()), 0);
  EXPECT_EQ(a.type, TSM_TYPE_F64);
  EXPECT_EQ(a.dims, 1);
  EXPECT_EQ(a.total, 1);
  a.failWith = 7;  // ModeH returns a refused resize's result as it stands
  EXPECT_EQ(ModeH(x.Handle(), 0, modes.Handle()), 7);
  EXPECT_EQ(modes.Count(), 0);

  ErrorCluster error{};
  InitializeAnalysisWorkspaceH(4096, &error);
  const int32_t code = error.code;
  EXPECT_EQ(code, 0);
  const CountingCleanupProc proc = a.proc;
  EXPECT_NE(proc, nullptr);
  EXPECT_EQ(a.arg, nullptr);
  EXPECT_EQ(a.mode, 1);
  EXPECT_EQ(tsrt_cleanup_mode(proc, nullptr), 1);
  UninitializeAnalysisWorkspaceH(&error);
  EXPECT_EQ(a.proc, proc);
  EXPECT_EQ(a.mode, 0);
  EXPECT_EQ(tsrt_cleanup_mode(proc, nullptr), 0);
}

// The hosts that serve ModeH on a new thread whose slot takes each of `slots`
// in turn.
std::string ServedOnThread(pthread_key_t key, const std::vector<void*>& slots) {
  std::string hosts;
  std::thread([&] {
    for (void* module : slots) {
      pthread_setspecific(key, module);
      hosts += ServedBy(CallModeH);
    }
  }).join();
  return hosts;
}

TEST_F(HostBinding, ThreadSlotComesFirstThenTheModuleThenTheSearch) {
  pthread_key_t key;
  ASSERT_EQ(pthread_key_create(&key, nullptr), 0);
  const struct {
    bool slotOn;
    void* module;
    std::vector<void*> slots;
    const char* hosts;
  } cases[] = {
      {true, B().handle, {A().handle, nullptr, A().handle, B().handle}, "ABAB"},
      {true, nullptr, {A().handle, nullptr, B().handle}, "ATB"},
      {false, B().handle, {A().handle, nullptr}, "BB"},
      {false, nullptr, {A().handle}, "T"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.hosts);
    SetTSRTModule(c.module);
    SetTSRTTLSIndex(c.slotOn ? static_cast<int32_t>(key) : -1);
    EXPECT_EQ(ServedOnThread(key, c.slots), c.hosts);
  }
  // This thread's slot was never set: the module serves it.
  SetTSRTModule(B().handle);
  SetTSRTTLSIndex(static_cast<int32_t>(key));
  EXPECT_EQ(ServedBy(CallModeH), 'B');
  SetTSRTTLSIndex(-1);
  pthread_key_delete(key);
}

TEST_F(HostBinding, HooksAreExportedAndChangeNothing) {
  void* lib = dlopen("libtsmath.so", RTLD_NOLOAD | RTLD_LAZY);
  ASSERT_NE(lib, nullptr);
  for (const char* name : {"SetTSRTModule", "SetTSRTTLSIndex", "SetTSRTModuleHook", "SetTSRTTLSIndexHook"})
    EXPECT_NE(dlsym(lib, name), nullptr) << name;
  dlclose(lib);

  pthread_key_t key;
  ASSERT_EQ(pthread_key_create(&key, nullptr), 0);
  pthread_setspecific(key, A().handle);
  SetTSRTModuleHook(B().handle);
  SetTSRTTLSIndexHook(static_cast<int32_t>(key));
  EXPECT_EQ(ServedBy(CallModeH), 'T');
  SetTSRTModule(B().handle);
  SetTSRTModuleHook(nullptr);
  EXPECT_EQ(ServedBy(CallModeH), 'B');
  SetTSRTTLSIndex(static_cast<int32_t>(key));
  SetTSRTTLSIndexHook(-1);
  EXPECT_EQ(ServedBy(CallModeH), 'A');
  SetTSRTTLSIndex(-1);
  pthread_key_delete(key);
}

TEST(HostBindingDeathTest, ModuleWithoutTheServiceEndsTheProcess) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  void* libm = dlopen("libm.so.6", RTLD_NOW);
  ASSERT_NE(libm, nullptr);
  const struct {
    const char* service;
    void (*call)();
  } cases[] = {{"NumericArrayResize", CallModeH}, {"RTSetCleanupProc", CallWorkspace}};
  for (const auto& c : cases) {
    const std::string text = std::string("Fatal Error: TESSARINV.LIB could not locate \"") + c.service + "\".\n";
    EXPECT_EXIT((SetTSRTModule(libm), c.call()), testing::ExitedWithCode(1), testing::StrEq(text)) << c.service;
    // A service already found in another module is looked up again.
    EXPECT_EXIT((SetTSRTModule(A().handle), c.call(), SetTSRTModule(libm), c.call()), testing::ExitedWithCode(1),
                testing::StrEq(text))
        << c.service;
  }
}

struct Outcome {
  int status;  // exit code, or -1 when the child did not exit normally
  std::string output;  // stdout and stderr
};

Outcome RunProbe(const char* mode) {
  int fds[2];
  if (pipe(fds) != 0) return {-1, "pipe"};
  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  posix_spawn_file_actions_adddup2(&actions, fds[1], STDOUT_FILENO);
  posix_spawn_file_actions_adddup2(&actions, fds[1], STDERR_FILENO);
  posix_spawn_file_actions_addclose(&actions, fds[0]);
  char* argv[] = {const_cast<char*>(TSM_HOST_PROBE), const_cast<char*>(mode), nullptr};
  pid_t pid;
  const int spawned = posix_spawn(&pid, TSM_HOST_PROBE, &actions, nullptr, argv, environ);
  posix_spawn_file_actions_destroy(&actions);
  close(fds[1]);
  Outcome out{-1, ""};
  char buf[256];
  for (ssize_t n; (n = read(fds[0], buf, sizeof buf)) > 0;) out.output.append(buf, static_cast<size_t>(n));
  close(fds[0]);
  int status = 0;
  if (spawned == 0 && waitpid(pid, &status, 0) == pid && WIFEXITED(status)) out.status = WEXITSTATUS(status);
  return out;
}

TEST(HostSearch, LoadedModulesInAProcessThatIsNoHost) {
  const std::string noHost = "Fatal Error: TESSARINV.LIB was not called from a Tessarin process.\n";
  const struct {
    const char* mode;
    int status;
    std::string output;
  } cases[] = {{"resize", 1, noHost}, {"cleanup", 1, noHost}, {"tsrt", 0, ""}, {"tsffrt", 0, ""}, {"both", 0, ""}};
  for (const auto& c : cases) {
    const Outcome out = RunProbe(c.mode);
    EXPECT_EQ(out.status, c.status) << c.mode;
    EXPECT_EQ(out.output, c.output) << c.mode;
  }
}

}  // namespace
