// Folder src/platform/: what the host platform gives, built here on the C and C++
// libraries (the zone engine in zone/, the locale layer in locale/, calendar
// arithmetic in civil/, and here files, the clock and per-thread state); it
// includes nothing of value/, text/, timezone/ or the public header.
//
// ThreadSlot<T>: one object of type T per thread, made on the thread's first
// call and kept until the thread ends. Each subsystem keeps its own state in a
// slot of its own type (the zone engine its compiled zone, the locale layer the
// locales it opened, the text readers their compiled forms), so nothing is shared
// between threads and the read paths take no lock.
//
// The objects outlive the thread's thread_local objects: they are freed after
// every thread_local destructor of the ending thread has run, so those
// destructors may call into the library (as may exit handlers on the main
// thread); see thread_slot.cc.
#ifndef DATETIMELIB_PLATFORM_THREAD_SLOT_H_
#define DATETIMELIB_PLATFORM_THREAD_SLOT_H_

namespace datetimelib::platform {

// Frees `object` with `free` when the calling thread ends, after its
// thread_local destructors.
void FreeAtThreadEnd(void* object, void (*free)(void*));

template <typename T>
class ThreadSlot {
 public:
  static T& Get() {
    T* object = object_;
    if (__builtin_expect(object == nullptr, 0)) object = Make();
    return *object;
  }

 private:
  static T* Make() {
    object_ = new T();
    FreeAtThreadEnd(object_, &Free);
    return object_;
  }
  static void Free(void* object) {
    delete static_cast<T*>(object);
    object_ = nullptr;  // a later call on this thread makes a fresh one
  }

  // A pointer with a constant initializer, in sight of every user: reading it
  // needs no TLS initialization check.
  static inline thread_local T* object_ = nullptr;
};

}  // namespace datetimelib::platform

#endif  // DATETIMELIB_PLATFORM_THREAD_SLOT_H_
