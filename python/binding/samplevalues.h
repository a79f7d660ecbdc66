#ifndef ALDERMOOR_PYTHON_SAMPLEVALUES_H
#define ALDERMOOR_PYTHON_SAMPLEVALUES_H

#include <optional>
#include <string>
#include <vector>

#include <pybind11/numpy.h>

#include "aldermoor/vexdoc/vex.h"

/// The spectra and colours of samples, for one of them and as tables.
namespace Aldermoor::Python {

using FloatArray = pybind11::array_t<float>;

FloatArray ToArray(const std::vector<float>& values);

/// The first spectrum, or the first of that type.  Needs the LibraryLock.
/// Throws: ResourceNotAvailableException if there is none.
const std::vector<float>& SpectrumOf(const Vexdoc::Sample& sample,
                                     const std::optional<std::string>& type = std::nullopt);

/// Throws: ResourceNotAvailableException, MeasureException; ValueError for words that are none.
FloatArray ColorOf(const Vexdoc::Sample& sample, const std::string& space,
                   const pybind11::object& illuminant, const std::string& observer,
                   const pybind11::object& paper);

/// SampleRows of Python: a row for every sample, NaN for one that cannot give it.
/// `type`: that of the spectra, or nothing for all.  Throws: ValueError for a word that is none.
pybind11::object SpectraOf(const Vexdoc::VEX& document, const std::optional<std::string>& type);
pybind11::object SpectraOf(const Vexdoc::SampleSet& set, const std::optional<std::string>& type);
pybind11::object ColorsOf(const Vexdoc::VEX& document, const std::string& space,
                          const pybind11::object& illuminant, const std::string& observer,
                          const pybind11::object& paper);
pybind11::object ColorsOf(const Vexdoc::SampleSet& set, const std::string& space,
                          const pybind11::object& illuminant, const std::string& observer,
                          const pybind11::object& paper);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_SAMPLEVALUES_H
