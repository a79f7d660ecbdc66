#ifndef ALDERMOOR_TESTS_FAULTS_INTERPOSITION_H
#define ALDERMOOR_TESTS_FAULTS_INTERPOSITION_H

#include <functional>
#include <map>
#include <string>

namespace Aldermoor::Vexdoc::Testing {

/// Instead of an error number: less is transferred than was asked for.
inline constexpr int kShortCount = -1;

/// What goes wrong in a run.
struct Fault {
  enum Kind { kFile, kAllocation, kAllocations };  // the last: one and all that follow

  Kind kind;
  long number;                        ///< of the call, from 1
  std::size_t variant = 0;            ///< which of the errors of a file operation
  std::function<void()> action = {};  ///< before the file operation, which then succeeds
};

struct Outcome {
  bool was_reached = false;  ///< there was a call of that number
  long calls = 0;            ///< of those that may fail
  std::string call;
  int error = 0;  ///< that it got; none if it has no error of that variant
  bool has_failed = false;
  bool is_traceable = false;  ///< with an exception of the library
  std::string message;
};

/// Shared state: the fault of the process; one run at a time.
Outcome RunWith(const Fault& fault, const std::function<void()>& operation);
/// How often each file operation was made to fail.
const std::map<std::string, int>& InjectedFaults();
/// The most bytes that library and parser held at a time in a run, beyond those held before.
std::size_t GrowthIn(const std::function<void()>& operation);

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_FAULTS_INTERPOSITION_H
