#ifndef ALDERMOOR_PYTHON_LOCK_H
#define ALDERMOOR_PYTHON_LOCK_H

#include <mutex>

#include <pybind11/pybind11.h>

#include "aldermoor/utilities/tools/smartpointer.h"

/// The library knows one thread at a time: condition blocks, current weights, paper white and the
/// counts of SmartPointers have no lock.  Here is the one that this module puts in front of it.
///
/// Nobody waits for the lock while holding the interpreter, so who has the lock may wait for the
/// interpreter, and the two cannot block each other.  A thread may take it again: objects die
/// whenever Python finds them, also in the middle of a call.
namespace Aldermoor::Python {

inline std::recursive_mutex& LibraryMutex() {
  static auto* const mutex = new std::recursive_mutex;  // outlives all documents
  return *mutex;
}

/// The library for a thread that keeps the interpreter.
class LibraryLock {
 public:
  LibraryLock() {
    if (!LibraryMutex().try_lock()) {
      const pybind11::gil_scoped_release release;
      LibraryMutex().lock();
    }
  }
  LibraryLock(const LibraryLock&) = delete;
  LibraryLock& operator=(const LibraryLock&) = delete;
  ~LibraryLock() { LibraryMutex().unlock(); }
};

/// The library for a thread that leaves the interpreter to others: no object of Python may be
/// touched in its scope.
class LibraryAlone {
 private:
  pybind11::gil_scoped_release release_;
  std::lock_guard<std::recursive_mutex> lock_{LibraryMutex()};
};

/// How a Python object holds an element of a document.  The element stays as long as anybody holds
/// it, whatever becomes of the document.
template <class T>
class Owner {
 public:
  explicit Owner(T* element) : pointer_(element) {}
  explicit Owner(const Utilities::Tools::SmartPointer<T>& pointer) : pointer_(pointer) {}
  Owner(const Owner& other) {
    const LibraryLock lock;
    pointer_ = other.pointer_;
  }
  Owner& operator=(const Owner&) = delete;
  ~Owner() {
    const LibraryLock lock;
    pointer_ = 0;
  }

  T* get() const { return pointer_.Get(); }

 private:
  Utilities::Tools::SmartPointer<T> pointer_;
};

}  // namespace Aldermoor::Python

PYBIND11_DECLARE_HOLDER_TYPE(T, Aldermoor::Python::Owner<T>)

#endif  // ALDERMOOR_PYTHON_LOCK_H
