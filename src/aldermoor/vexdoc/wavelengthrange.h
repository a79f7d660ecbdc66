#ifndef ALDERMOOR_VEXDOC_WAVELENGTHRANGE_H
#define ALDERMOOR_VEXDOC_WAVELENGTHRANGE_H

#include <optional>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/spectrum.h"

/// The wavelengths that the conditions of spectra name.
namespace Aldermoor::Vexdoc {

/// The nm of a condition as they are read: the whole number, -32768 to 32767, at the beginning of
/// "380nm", " 380", "0380" or "380.5 nm"; nothing if there is none.
ALDERMOOR_EXPORT std::optional<int> NanometresOf(const std::string& value);

/// Whether `sample` stores a colour that meets `request`, so that none is computed.
ALDERMOOR_EXPORT bool HoldsColor(const Sample& sample, const Conditions& request);

/// Whether the values of `spectrum` stand where colorimetry takes them: 36, from 380 to 730 nm by
/// its conditions or without a range that can be read.
///
/// The colours of a spectrum of 36 values are computed without a look at its range, so those of any
/// other grid are wrong.
ALDERMOOR_EXPORT bool IsOnMeasuringGrid(const Spectrum& spectrum);
/// Why the 36 values of `spectrum` are not to be computed with; empty if they are, or are not 36.
ALDERMOOR_EXPORT std::string GridFault(const Spectrum& spectrum);
/// The same of the first spectrum of `sample`, if the colour under `request` would be computed of
/// it.
ALDERMOOR_EXPORT std::string GridFault(const Sample& sample, const Conditions& request);

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_WAVELENGTHRANGE_H
