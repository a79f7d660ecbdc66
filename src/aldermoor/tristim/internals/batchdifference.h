#ifndef ALDERMOOR_TRISTIM_INTERNALS_BATCHDIFFERENCE_H
#define ALDERMOOR_TRISTIM_INTERNALS_BATCHDIFFERENCE_H

#include <cstddef>
#include <string>

#include "aldermoor/tristim/internals/batchmath.h"

/// The difference formulas of TristimService over arrays.
namespace Aldermoor::Tristim::Internals::Batch {

/// Colours to differences, with weights that are decided; kNoDeltaE where there is none.
using Difference = void (*)(const Colors& first, const Colors& second, const Triple& weights,
                            std::size_t count, float* differences);

struct Formula {
  const char* word;
  const char* color_space;  ///< of the colours that are compared
  bool takes_colors;        ///< not only spectra
  Triple usual_weights;     ///< for those that are 0
  Difference run;
};

/// Null for a word that is no formula.
const Formula* FindFormula(const std::string& word);

}  // namespace Aldermoor::Tristim::Internals::Batch

#endif  // ALDERMOOR_TRISTIM_INTERNALS_BATCHDIFFERENCE_H
