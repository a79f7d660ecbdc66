#ifndef ALDERMOOR_MEASURE_DENSITY_H
#define ALDERMOOR_MEASURE_DENSITY_H

#include <array>
#include <span>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Measure {

/// The standards of density measurement, by the words of "Colorimetric.DensityStandard".
enum class DensityStandard { DIN = 0, DINNB, ANSIA, ANSIE, ANSII, ANSIT, SPI, User };

/// Which density is asked for, by the words of "Colorimetric.DensityFilterMode": that of a channel,
/// of the densest band from 410 nm to 700 nm, or of the channel that a densitometer would report.
enum class DensityMode { Black = 0, Cyan, Magenta, Yellow, Max, Auto };

enum class DensityChannel { Black = 0, Cyan, Magenta, Yellow };

/// The value for a word such as "ANSIT" or "Auto".  Throws: MeasureException for any other, with
/// those that would do.
ALDERMOOR_EXPORT DensityStandard DensityStandardOf(const std::string& word);
ALDERMOOR_EXPORT DensityMode DensityModeOf(const std::string& word);
/// "Black", "Cyan", "Magenta", "Yellow".  Throws: MeasureException for a value that is none.
ALDERMOOR_EXPORT const char* NameOf(DensityChannel channel);

/// The four densities of a field.
struct Densities {
  float black = 0.0F;  ///< visual
  float cyan = 0.0F;
  float magenta = 0.0F;
  float yellow = 0.0F;

  /// Throws: MeasureException for a value that is no channel.
  ALDERMOOR_EXPORT float Of(DensityChannel channel) const;
};

/// How densities are to be taken.
struct DensityOptions {
  DensityStandard standard = DensityStandard::DIN;
  bool paper_relative = false;  ///< less those of the paper white; see PaperWhite
};

/// A density and the channel to which it belongs.
struct ChannelDensity {
  float value = 0.0F;
  DensityChannel channel = DensityChannel::Black;
};

/// The densest band and its wavelength.
struct MaximumDensity {
  float value = 0.0F;
  unsigned int wavelength = 0;  ///< nm
};

/// All functions below take a reflectance spectrum of 36 values.  A reflectance of 0 or below has
/// the density 9.99, the visual channel then 11.99. Throws: MeasureException for another length,
/// without a paper white where one is needed, for a value that its enumeration does not have, and,
/// where the calibration is put on, for an unknown word under "Physical.Filter".
///
/// The calibration of the physical filter and standard is put on where it says so.

/// All four, calibrated.  Source of the standards: ISO 5-3, DIN 16536-2.
ALDERMOOR_EXPORT Densities DensitiesOf(const Vexdoc::Spectrum& spectrum,
                                       const DensityOptions& options);
/// All four as the filter gives them.
ALDERMOOR_EXPORT Densities UncalibratedDensitiesOf(const Vexdoc::Spectrum& spectrum,
                                                   const DensityOptions& options);
/// One of them, calibrated.  `mode` is a channel or "Auto".
/// Throws: MeasureException for "Max", which belongs to no channel: see MaximumDensityOf.
ALDERMOOR_EXPORT ChannelDensity DensityOf(const Vexdoc::Spectrum& spectrum, DensityMode mode,
                                          const DensityOptions& options);
/// Band by band.
ALDERMOOR_EXPORT std::array<float, 36> DensitySpectrumOf(const Vexdoc::Spectrum& spectrum,
                                                         bool paper_relative);
/// From 410 nm to 700 nm; of equal bands the one nearest to 550 nm.
ALDERMOOR_EXPORT MaximumDensity MaximumDensityOf(const Vexdoc::Spectrum& spectrum,
                                                 bool paper_relative);

/// Slope and offset of the densities that are measured through a physical filter ("No", "Polarizer"
/// ..., the words of "Physical.Filter").  At the start 1 and 0.
/// Shared state: that of the process.
/// Throws: MeasureException for an unknown word, with those that would do, and a standard that is
/// none.
struct DensityCalibration {
  Densities slope = {1.0F, 1.0F, 1.0F, 1.0F};
  Densities offset;  ///< not used relative to paper
};
ALDERMOOR_EXPORT DensityCalibration GetDensityCalibration(const std::string& physical_filter,
                                                          DensityStandard standard);
ALDERMOOR_EXPORT void SetDensityCalibration(const std::string& physical_filter,
                                            DensityStandard standard,
                                            const DensityCalibration& calibration);

/// The curves of the standard "User": weights on reflectance, 380 nm to 730 nm, 10 nm.  The visual
/// one adds up to 100 and the others to 1 for densities of 0 on white.  At the start all are 0; a
/// curve that is set is in force at once.
/// Shared state: that of the process.  Throws: MeasureException for a value that is no channel.
ALDERMOOR_EXPORT std::array<float, 36> GetUserDensityCurve(DensityChannel channel);
ALDERMOOR_EXPORT void SetUserDensityCurve(DensityChannel channel, std::span<const float, 36> curve);
/// Sets every value of every curve to 1.
ALDERMOOR_EXPORT void ResetUserDensityCurves();

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_DENSITY_H
