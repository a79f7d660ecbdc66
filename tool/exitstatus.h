#ifndef ALDERMOOR_TOOL_EXITSTATUS_H
#define ALDERMOOR_TOOL_EXITSTATUS_H

#include <algorithm>
#include <stdexcept>

namespace Aldermoor::Tool {

/// How the program ends; of several failures the highest number counts.
enum class ExitStatus : int {
  kDone = 0,
  kSomeFailed = 1,  // some samples could not give what was asked for, or none was found
  kUsage = 2,       // the command line makes no sense; nothing was computed
  kUnreadable = 3,  // an input could not be read
  kNotWritten = 4,  // the output could not be written
};

inline ExitStatus Worse(ExitStatus a, ExitStatus b) {
  return std::max(a, b);
}

/// The command line asks for something that does not exist.
class UsageError : public std::runtime_error {
 public:
  using runtime_error::runtime_error;
};

/// An input without which nothing can be computed cannot be read.
class InputError : public std::runtime_error {
 public:
  using runtime_error::runtime_error;
};

/// An input can be read, but not as what it means, and nothing is made of it.
class RefusedError : public InputError {
 public:
  using InputError::InputError;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_EXITSTATUS_H
