#ifndef ALDERMOOR_TRISTIM_INTERNALS_NEVERDESTROYED_H
#define ALDERMOOR_TRISTIM_INTERNALS_NEVERDESTROYED_H

#include <cstddef>
#include <new>

namespace Aldermoor::Tristim::Internals {

/// Holds a static object whose destructor never runs, so that other static objects may use it
/// until the very end of the process.
template <class T>
class NeverDestroyed {
 public:
  NeverDestroyed() : object_(::new (static_cast<void*>(storage_)) T()) {}
  NeverDestroyed(const NeverDestroyed&) = delete;
  NeverDestroyed& operator=(const NeverDestroyed&) = delete;

  T& Get() { return *object_; }

 private:
  alignas(T) std::byte storage_[sizeof(T)];
  T* object_;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_NEVERDESTROYED_H
