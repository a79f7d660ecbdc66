#ifndef ALDERMOOR_VEXDOC_WAVELENGTHRANGE_H
#define ALDERMOOR_VEXDOC_WAVELENGTHRANGE_H

#include <optional>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/spectrum.h"

/// The wavelengths that the conditions of spectra name.
namespace Aldermoor::Vexdoc {

/// The nm of a condition as they are read: the whole number, -32768 to 32767, at the beginning of
/// "380nm", " 380", "0380" or "380.5 nm"; nothing if there is none.
ALDERMOOR_EXPORT std::optional<int> NanometresOf(const std::string& value);

/// Whether the values of `spectrum` stand where colorimetry takes them: 36, from 380 to 730 nm by
/// its conditions or without a range that can be read.
///
/// The colours of a spectrum of 36 values are computed without a look at its range, so those of any
/// other grid are wrong.
ALDERMOOR_EXPORT bool IsOnMeasuringGrid(const Spectrum& spectrum);

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_WAVELENGTHRANGE_H
