#include "platform/thread_state.h"

#include <pthread.h>

#include <atomic>

namespace datetimelib::platform {

namespace {

// The state is freed by the destructor of a pthread key, not by a thread_local
// owner: glibc runs key destructors after every thread_local destructor of the
// ending thread, so a caller's thread_local object whose destructor asks for
// local time still finds the state alive, whenever that object was made. (An
// owner made after that object was destroyed before it.) A later key
// destructor that calls in gets a fresh state, which glibc's next round of key
// destructors frees.
void FreeThreadState(void* state) {
  delete static_cast<ThreadState*>(state);
  this_thread_state = nullptr;
}

pthread_key_t state_key;
std::atomic<bool> state_key_made{false};

bool MakeStateKeyOnce() {
  static const bool made = [] {
    const bool ok = pthread_key_create(&state_key, FreeThreadState) == 0;
    state_key_made.store(ok, std::memory_order_release);
    return ok;
  }();
  return made;
}

// Unloading the library (dlclose) must not leave glibc a key destructor in
// unmapped code; the states of threads still alive then are left behind.
__attribute__((destructor)) void DeleteStateKey() {
  if (state_key_made.load(std::memory_order_acquire)) pthread_key_delete(state_key);
}

// Where every key of the process is taken, a thread_local owner frees the state
// at thread end instead; a call after it is gone gets a state never freed.
__attribute__((tls_model("initial-exec"))) thread_local bool fallback_owner_gone = false;
struct FallbackOwner {
  ThreadState* state = nullptr;
  ~FallbackOwner() {
    fallback_owner_gone = true;
    if (state != nullptr) FreeThreadState(state);
  }
};
thread_local FallbackOwner fallback_owner;

}  // namespace

ThreadState* NewThreadState() {
  auto state = std::make_unique<ThreadState>();
  if (MakeStateKeyOnce() && pthread_setspecific(state_key, state.get()) == 0) {
    return state.release();
  }
  if (!fallback_owner_gone) fallback_owner.state = state.get();
  return state.release();
}

}  // namespace datetimelib::platform
