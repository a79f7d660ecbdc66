#ifndef ALDERMOOR_TRISTIM_INTERNALS_INSTRUCTIONSET_H
#define ALDERMOOR_TRISTIM_INTERNALS_INSTRUCTIONSET_H

namespace Aldermoor::Tristim::Internals::Batch {

/// What formulas over arrays are compiled for; each set contains the ones before it.
enum class InstructionSet {
  kBaseline,  ///< what every processor of the architecture has
  kSsse3,
  kSse4,
  kAvx2,
  kAvx512,
};

/// Whether the processor has it, and the operating system lets programs use it.
bool IsOfProcessor(InstructionSet set) noexcept;

}  // namespace Aldermoor::Tristim::Internals::Batch

#endif  // ALDERMOOR_TRISTIM_INTERNALS_INSTRUCTIONSET_H
