#ifndef ALDERMOOR_TOOL_COMPARISON_H
#define ALDERMOOR_TOOL_COMPARISON_H

#include <optional>
#include <span>
#include <string>
#include <vector>

#include "aldermoor/measure/colordifference.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/sample.h"

#include "jobs.h"
#include "samplepairs.h"

namespace Aldermoor::Tool {

inline const std::string kFormulaKey = "ColorSpaceDescription.DeltaEFormula";

/// How two samples are compared: by their spectra if both have one of 36 bands, else by colours.
struct Comparison {
  std::string formula;
  Measure::DifferenceWeights weights;
  Vexdoc::Conditions request;  // of a colour in CIELab

  /// Throws: std::exception with the reason why there is no difference.
  float Between(const Vexdoc::Sample& reference, const Vexdoc::Sample& sample) const;

  /// The same for many pairs at a time, but only where two reflectance spectra have a difference;
  /// of the others Between() has something to say.
  std::vector<std::optional<float>> BetweenSpectra(std::span<const SamplePair> pairs,
                                                   const JobOptions& jobs) const;

 private:
  Vexdoc::Conditions RequestWithFormula() const;
  float BetweenSpectra(const Vexdoc::Sample& reference, const Vexdoc::Sample& sample) const;
  float BetweenColors(const Vexdoc::Sample& reference, const Vexdoc::Sample& sample) const;
  Vexdoc::ColorVector ColorOf(const Vexdoc::Sample& sample) const;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_COMPARISON_H
