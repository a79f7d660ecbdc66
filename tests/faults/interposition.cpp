#include "tests/faults/interposition.h"

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <initializer_list>
#include <new>
#include <utility>

#include <dlfcn.h>
#include <malloc.h>
#include <sys/stat.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/traceableexception.h"

using namespace Aldermoor::Vexdoc::Testing;

namespace {

std::map<std::string, int> injected;
const Fault* current = nullptr;  // while an operation runs
long calls = 0;
Outcome outcome;
bool is_short = false;
std::size_t in_use = 0;
std::size_t peak = 0;

template <class Function>
Function* Next(const char* call) {
  return reinterpret_cast<Function*>(::dlsym(RTLD_NEXT, call));
}

// Whether the call is to fail; `errno` is set then.
bool Fails(const char* call, std::initializer_list<int> errors) {
  is_short = false;
  if (current == nullptr || current->kind != Fault::kFile || ++calls != current->number) {
    return false;
  }
  const Fault* const fault = std::exchange(current, nullptr);
  outcome.was_reached = true;
  if (fault->action) {
    fault->action();
  } else if (fault->variant < errors.size()) {
    outcome.call = call;
    outcome.error = errors.begin()[fault->variant];
    ++injected[call];
    is_short = outcome.error == kShortCount;
    errno = outcome.error;
  }
  current = fault;
  return outcome.error > 0;
}

std::size_t Shortened(std::size_t count) {
  return is_short ? (count + 1) / 2 : count;
}

bool AllocationFails() {
  if (current == nullptr || current->kind == Fault::kFile || ++calls < current->number ||
      (calls > current->number && current->kind == Fault::kAllocation)) {
    return false;
  }
  outcome.was_reached = true;
  return true;
}

}  // namespace

namespace Aldermoor::Vexdoc::Testing {

Outcome RunWith(const Fault& fault, const std::function<void()>& operation) {
  outcome = Outcome();
  calls = 0;
  current = &fault;
  try {
    operation();
    current = nullptr;
  } catch (const std::exception& e) {
    current = nullptr;
    outcome.has_failed = true;
    outcome.is_traceable = dynamic_cast<const Utilities::Exceptions::TraceableException*>(&e);
    outcome.message = e.what();
  }
  outcome.calls = calls;
  return outcome;
}

const std::map<std::string, int>& InjectedFaults() {
  return injected;
}

std::size_t GrowthIn(const std::function<void()>& operation) {
  const std::size_t before = peak = in_use;
  operation();
  return peak - before;
}

}  // namespace Aldermoor::Vexdoc::Testing

// A function of the C library with the errors that it may have; in brackets, what goes on to it.
#define FAULTY(result, failure, call, parameters, arguments, ...)                              \
  result call parameters {                                                                     \
    return Fails(#call, {__VA_ARGS__}) ? (failure) : Next<result parameters>(#call) arguments; \
  }

using Path = const char*;
using Status = struct stat;

extern "C" {
// clang-format off
FAULTY(int, -1, open, (Path p, int flags, mode_t m), (p, flags, m), EIO, EACCES, EMFILE, ENOSPC, EROFS)
FAULTY(ssize_t, -1, read, (int f, void* p, std::size_t n), (f, p, Shortened(n)), kShortCount, EINTR, EIO)
FAULTY(ssize_t, -1, write, (int f, const void* p, std::size_t n), (f, p, Shortened(n)), kShortCount, EINTR, EIO, ENOSPC)
// Nothing is flushed: only a power cut would tell.
int fsync(int) { return Fails("fsync", {EIO, ENOSPC}) ? -1 : 0; }
FAULTY(int, (Next<int(int)>("close")(f), -1), close, (int f), (f), EIO, ENOSPC)
FAULTY(int, -1, rename, (Path from, Path to) noexcept, (from, to), EIO, ENOSPC, EACCES, EROFS)
FAULTY(int, -1, mkdir, (Path p, mode_t m) noexcept, (p, m), EIO, ENOSPC, EACCES, EROFS)
FAULTY(int, -1, stat, (Path p, Status* s) noexcept, (p, s), EIO, EACCES)
FAULTY(int, -1, fstat, (int f, Status* s) noexcept, (f, s), EIO)
FAULTY(int, -1, lstat, (Path p, Status* s) noexcept, (p, s), EIO, EACCES)
FAULTY(int, -1, faccessat, (int d, Path p, int mode, int flags) noexcept, (d, p, mode, flags), EIO, EACCES, EROFS)
FAULTY(int, -1, fchmod, (int f, mode_t m) noexcept, (f, m), EIO, EPERM, EROFS)
FAULTY(int, -1, fchown, (int f, uid_t u, gid_t g) noexcept, (f, u, g), EIO, EPERM)
// clang-format on

// All that the objects of this program allocate, by the linker's option --wrap.
void* __real_malloc(std::size_t size);
void __real_free(void* p);

void* __wrap_malloc(std::size_t size) {
  void* const p = AllocationFails() ? nullptr : __real_malloc(size);
  in_use += malloc_usable_size(p);
  peak = std::max(peak, in_use);
  return p;
}

void __wrap_free(void* p) {
  in_use -= malloc_usable_size(p);
  __real_free(p);
}

// Xerces-C++ loses some of its own memory where an allocation fails.
const char* __lsan_default_suppressions() {
  return "leak:MemoryManagerImpl::allocate";
}
}

// Not inline: the compiler knows what belongs to malloc and what to new.
[[gnu::noinline]] void* operator new(std::size_t size) {
  void* const p = std::malloc(size);
  return p != nullptr ? p : throw std::bad_alloc();
}

[[gnu::noinline]] void operator delete(void* p) noexcept {
  std::free(p);
}

[[gnu::noinline]] void operator delete(void* p, std::size_t /*size*/) noexcept {
  std::free(p);
}
