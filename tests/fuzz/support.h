#ifndef ALDERMOOR_TESTS_FUZZ_SUPPORT_H
#define ALDERMOOR_TESTS_FUZZ_SUPPORT_H

#include <cstdint>
#include <cstdlib>
#include <iostream>

#include "aldermoor/utilities/exceptions/traceableexception.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/xmlplatform.h"

#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace Aldermoor::Vexdoc::Testing {

/// Ends the process, which is what a fuzzer takes for a finding, unless two texts are equal.
inline void RequireEqual(const char* what, const std::string& first, const std::string& second) {
  if (first != second) {
    std::cerr << what << "\n---\n" << first << "\n---\n" << second << "\n";
    std::abort();
  }
}

/// Runs `use(text)`, whose only way to fail is an exception of the library, and forgets the blocks
/// of conditions, which the process would collect for ever.
template <class Use>
int OnInput(const std::uint8_t* data, std::size_t size, Use use) {
  static const XMLPlatform platform;
  std::cout.setstate(std::ios_base::badbit);  // warnings of the parser
  try {
    use(std::string(reinterpret_cast<const char*>(data), size));
  } catch (const Utilities::Exceptions::TraceableException&) {
  }
  Internals::ConditionManager::GetInstance().RemoveAllConditions(true);
  return 0;
}

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_FUZZ_SUPPORT_H
