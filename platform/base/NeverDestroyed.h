#pragma once

#include <new>
#include <utility>

namespace ax {

// A value that lives from its first use to the end of the process: its destructor never runs, so that what
// runs last in a process may still use it. Made as a static variable of a function:
//
//   static NeverDestroyed<Ref<Calendar>> calendar(make<Calendar>());
//   return *calendar;
//
// Making it is as safe between threads as any such variable; using it is as safe as T.
template <class T>
class NeverDestroyed {
 public:
  template <class... A>
  explicit NeverDestroyed(A&&... arguments) : value_(new (storage_) T(std::forward<A>(arguments)...)) {}
  NeverDestroyed(const NeverDestroyed&) = delete;
  NeverDestroyed& operator=(const NeverDestroyed&) = delete;

  T& operator*() { return *value_; }
  T* operator->() { return value_; }

 private:
  alignas(T) unsigned char storage_[sizeof(T)];
  T* value_;
};

}  // namespace ax
