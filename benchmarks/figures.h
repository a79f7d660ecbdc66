#ifndef ALDERMOOR_BENCHMARKS_FIGURES_H
#define ALDERMOOR_BENCHMARKS_FIGURES_H

#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

namespace Aldermoor::Benchmarks {

/// One result of a run.  A target is the greatest value that is still good, or the least one.
struct Figure {
  std::string name;
  double value;
  std::string unit;
  std::optional<double> target;
  bool more_is_better = false;

  bool IsMissed() const {
    return target && !(more_is_better ? value >= *target : value <= *target);
  }
};

using Figures = std::vector<Figure>;

/// The middle one, or the mean of the middle two.  Throws: std::invalid_argument for none.
double Median(std::vector<double> values);

/// A line about the processor, the cores and the compiler.
std::string MachineLine();

void PrintTable(std::ostream& out, const Figures& figures);
/// A line for each figure: name, value, unit, target, and "met" or "missed"; "-" without target.
void PrintTsv(std::ostream& out, const Figures& figures);

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_FIGURES_H
