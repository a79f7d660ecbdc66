#ifndef ALDERMOOR_TESTS_TRISTIM_MEASURED_H
#define ALDERMOOR_TESTS_TRISTIM_MEASURED_H

#include <algorithm>
#include <fstream>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/internals/vocabulary.h"

namespace Aldermoor::Tristim::Tests {

/// A row of a file of measured figures.
struct Measured {
  std::string name;
  std::vector<float> values;  // 36
};

inline std::vector<Measured> ReadFigures(const std::string& file) {
  std::ifstream in(file);
  std::vector<Measured> rows;
  std::string line;
  std::getline(in, line);  // the heads
  while (std::getline(in, line)) {
    std::istringstream cells(line);
    std::string cell;
    Measured row;
    std::getline(cells, cell, ',');  // the number
    std::getline(cells, row.name, ',');
    while (std::getline(cells, cell, ',')) {
      row.values.push_back(std::stof(cell));
    }
    rows.push_back(row);
  }
  return rows.empty() ? throw std::runtime_error("no figures in " + file) : rows;
}

/// The rows of a file in tests/data/measured.
inline std::vector<Measured> ReadMeasured(const std::string& file) {
  return ReadFigures(ALDERMOOR_TEST_DATA "/measured/" + file);
}

/// The table of an illuminant on the 36 bands: each the mean over its own 10 nm, weighted 1:2:1, or
/// picked.
inline HXSpectrum LampOf(const std::string& word, bool averaged,
                         const HXMeasureConditions& conditions) {
  HXMeasureConditions illuminated;
  illuminated.SetMeasureCondition(Vocabulary::kIlluminationKey, word);
  const Internals::StandardFilter table =
      Internals::TristimFilter::GetIlluFilter(illuminated.GetIllumination());
  const int last = (table.GetMaxWavelength() - table.GetMinWavelength()) / table.GetStepSize();
  const auto at = [&](int wavelength) {
    const int index = (wavelength - table.GetMinWavelength()) / table.GetStepSize();
    return table.GetFilter()[std::clamp(index, 0, last)];
  };
  HXSpectrum lamp;
  lamp.SetMeasureConditions(conditions);
  for (int band = 0; band < 36; ++band) {
    const int nm = 380 + 10 * band;
    lamp[static_cast<unsigned>(band)] =
        averaged ? (at(nm - 5) + 2.0F * at(nm) + at(nm + 5)) / 4.0F : at(nm);
  }
  return lamp;
}

}  // namespace Aldermoor::Tristim::Tests

#endif  // ALDERMOOR_TESTS_TRISTIM_MEASURED_H
