#include "aldermoor/tristim/internals/instructionset.h"

namespace Aldermoor::Tristim::Internals::Batch {

#if defined(__x86_64__) || defined(__i386__)

// Everything that Highway lets the compiler use in a set.  Compilers do not all know the name of
// F16C, which no processor with AVX2 lacks.
bool IsOfProcessor(InstructionSet set) noexcept {
  switch (set) {
    case InstructionSet::kBaseline:
      return true;
    case InstructionSet::kSsse3:
      return __builtin_cpu_supports("ssse3");
    case InstructionSet::kSse4:
      return IsOfProcessor(InstructionSet::kSsse3) && __builtin_cpu_supports("sse4.1") &&
             __builtin_cpu_supports("sse4.2") && __builtin_cpu_supports("aes") &&
             __builtin_cpu_supports("pclmul");
    case InstructionSet::kAvx2:
      return IsOfProcessor(InstructionSet::kSse4) && __builtin_cpu_supports("avx") &&
             __builtin_cpu_supports("avx2") && __builtin_cpu_supports("bmi") &&
             __builtin_cpu_supports("bmi2") && __builtin_cpu_supports("fma");
    case InstructionSet::kAvx512:
      return IsOfProcessor(InstructionSet::kAvx2) && __builtin_cpu_supports("avx512f") &&
             __builtin_cpu_supports("avx512vl") && __builtin_cpu_supports("avx512dq") &&
             __builtin_cpu_supports("avx512bw");
  }
  return false;
}

#else

bool IsOfProcessor(InstructionSet set) noexcept {
  return set == InstructionSet::kBaseline;
}

#endif

}  // namespace Aldermoor::Tristim::Internals::Batch
