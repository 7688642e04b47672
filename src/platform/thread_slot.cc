#include "platform/thread_slot.h"

#include <pthread.h>

#include <atomic>
#include <utility>
#include <vector>

namespace datetimelib::platform {
namespace {

// The objects of one thread's slots, freed together at thread end.
using EndList = std::vector<std::pair<void*, void (*)(void*)>>;

void FreeAll(void* list) {
  auto* objects = static_cast<EndList*>(list);
  for (const auto& [object, free] : *objects) free(object);
  delete objects;
}

// The objects are freed by the destructor of a pthread key, not by a
// thread_local owner: glibc runs key destructors after every thread_local
// destructor of the ending thread, so a caller's thread_local object whose
// destructor calls in still finds its slots alive, whenever that object was made.
// (An owner made after that object would be destroyed before it.) A later key
// destructor that calls in gets fresh objects on a fresh list, which glibc's next
// round of key destructors frees.
pthread_key_t end_key;
std::atomic<bool> end_key_made{false};

bool MakeEndKeyOnce() {
  static const bool made = [] {
    const bool ok = pthread_key_create(&end_key, FreeAll) == 0;
    end_key_made.store(ok, std::memory_order_release);
    return ok;
  }();
  return made;
}

// Unloading the library (dlclose) must not leave glibc a key destructor in
// unmapped code; the objects of threads still alive then are left behind.
__attribute__((destructor)) void DeleteEndKey() {
  if (end_key_made.load(std::memory_order_acquire)) pthread_key_delete(end_key);
}

// Where every key of the process is taken, a thread_local owner frees the list
// at thread end instead; objects made after it is gone are never freed.
thread_local bool fallback_owner_gone = false;
struct FallbackOwner {
  EndList* list = nullptr;
  ~FallbackOwner() {
    fallback_owner_gone = true;
    if (list != nullptr) FreeAll(std::exchange(list, nullptr));
  }
};
thread_local FallbackOwner fallback_owner;

EndList* ThisThreadEndList() {
  if (MakeEndKeyOnce()) {
    auto* list = static_cast<EndList*>(pthread_getspecific(end_key));
    if (list != nullptr) return list;
    list = new EndList();
    if (pthread_setspecific(end_key, list) == 0) return list;
    delete list;
  }
  if (fallback_owner_gone) return nullptr;
  if (fallback_owner.list == nullptr) fallback_owner.list = new EndList();
  return fallback_owner.list;
}

}  // namespace

void FreeAtThreadEnd(void* object, void (*free)(void*)) {
  if (EndList* list = ThisThreadEndList()) list->emplace_back(object, free);
}

}  // namespace datetimelib::platform
