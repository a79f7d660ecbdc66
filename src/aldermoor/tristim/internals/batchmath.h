#ifndef ALDERMOOR_TRISTIM_INTERNALS_BATCHMATH_H
#define ALDERMOOR_TRISTIM_INTERNALS_BATCHMATH_H

#include <cstddef>

#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/internals/densitymath.h"
#include "aldermoor/tristim/internals/instructionset.h"

/// The formulas of colormath.h, deltaemath.h and densitymath.h over arrays, with the widest vectors
/// that the processor has.
///
/// Bits: every result is the one that the scalar formula gives.  Sums and products are the same
/// ones in the same order, one row to a lane.  A function of the C library is computed by other
/// means in double together with a bound of the error; where both ends of the interval do not round
/// to the same single result, and where a result is not a number, the scalar formula decides.
/// So the results do not depend on the instruction set, and not on the rounding of the other means.
///
/// Layout: dense rows of three channels.  Nothing is allocated.
namespace Aldermoor::Tristim::Internals::Batch {

/// Spectra of 36 bands in rows that are `stride` floats apart.
struct Spectra {
  const float* values;
  std::size_t stride;
};

/// Rows of colours, or one that stands for every row.
struct Colors {
  const float* values;
  bool is_single;
};

/// `paper`: 36 values by which the spectra are divided first, or null.
void XyzFromSpectra(const AxisWeights& weights, const float* paper, const Spectra& spectra,
                    std::size_t count, float* xyz) noexcept;

/// `lab` may be `xyz`.
void LabFromXyz(const Triple& white, const float* xyz, std::size_t count, float* lab) noexcept;

/// The logarithms stand for themselves: four channels in a row.
void DensitiesFromSpectra(const DensityWeights& weights, const Spectra& spectra, std::size_t count,
                          float* densities) noexcept;

/// Differences of colours of three channels; the weights are decided and not 0.
void DeltaE76(const Colors& first, const Colors& second, std::size_t count,
              float* differences) noexcept;
void DeltaE94(const Colors& first, const Colors& second, const Triple& weights, std::size_t count,
              float* differences) noexcept;
void DeltaECmc(const Colors& first, const Colors& second, float l, float c, std::size_t count,
               float* differences) noexcept;
void DeltaE2000(const Colors& first, const Colors& second, const Triple& weights, std::size_t count,
                float* differences) noexcept;

/// Uses this set instead of the widest that there is, from now on: to compare them.  Returns false
/// and changes nothing if the processor lacks it or the formulas are not compiled for it.
bool UseInstructionSet(InstructionSet set) noexcept;

}  // namespace Aldermoor::Tristim::Internals::Batch

#endif  // ALDERMOOR_TRISTIM_INTERNALS_BATCHMATH_H
