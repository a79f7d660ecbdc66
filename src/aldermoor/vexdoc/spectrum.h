#ifndef ALDERMOOR_VEXDOC_SPECTRUM_H
#define ALDERMOOR_VEXDOC_SPECTRUM_H

#include <string>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/abstractsampleattribute.h"

namespace Aldermoor::Vexdoc {

namespace Internals {
class DocumentAccess;
}

/// A measured spectrum: reflectance, transmittance or emission.
///
/// Scale: reflectance and transmittance, 1 = perfect reflector.  Grid: the conditions name it; for
/// colorimetry the spectrum must have 36 values, and value i stands for 380 + 10·i nm whatever the
/// conditions say.  Any other length can be stored and saved.
/// Mandatory conditions: "Physical.WavelengthSpectrumMin", "Physical.WavelengthSpectrumMax",
/// "Physical.NumberOfDataPointsSpectrum", "Physical.SpectrumType".
class ALDERMOOR_EXPORT Spectrum : public AbstractSampleAttribute {
 public:
  /// 36 zeros without conditions; nothing is checked.
  Spectrum();
  /// Throws: MissingConditionException for the first mandatory condition that is missing.
  Spectrum(const Conditions& conditions, const std::vector<float>& data);
  Spectrum(const Spectrum& other);
  Spectrum& operator=(const Spectrum& other);
  ~Spectrum() override;

  void AcceptVisitor(ElementVisitor& visitor) override;

  /// For "VEXSpectrum" a copy, if `conditions` ask for nothing that this spectrum's do not hold;
  /// for "VEXColorVector" a colour in the colour space and under the illuminant and observer of
  /// `conditions`, flagged as derived.
  /// Throws: ResourceNotAvailableException for everything else, and if the colour cannot be
  /// computed.
  Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(
      const std::string& type, const Conditions& conditions) override;
  SampleAttribute& Assign(const SampleAttribute& other) override;
  /// Equal conditions and equal values, compared with == as floats.
  bool Equals(const SampleAttribute& other) const override;

  virtual const std::vector<float>& GetData() const;

 private:
  friend class Internals::DocumentAccess;

  std::vector<float> data_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SPECTRUM_H
