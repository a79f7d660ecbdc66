#ifndef ALDERMOOR_TESTS_UTILITIES_MESSAGEOF_H
#define ALDERMOOR_TESTS_UTILITIES_MESSAGEOF_H

#include <string>
#include <typeinfo>

namespace Aldermoor::Tests {

/// The message of the exception that `action` throws, if it is exactly an `E`; other types pass
/// through, and so fail the test.
template <class E, class Action>
std::string MessageOf(Action action) {
  try {
    action();
  } catch (const E& e) {
    if (typeid(e) != typeid(E)) {
      throw;
    }
    return static_cast<const E&>(e).what();
  }
  return "nothing was thrown";
}

}  // namespace Aldermoor::Tests

#endif  // ALDERMOOR_TESTS_UTILITIES_MESSAGEOF_H
