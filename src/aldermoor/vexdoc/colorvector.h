#ifndef ALDERMOOR_VEXDOC_COLORVECTOR_H
#define ALDERMOOR_VEXDOC_COLORVECTOR_H

#include <string>
#include <utility>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/abstractsampleattribute.h"
#include "aldermoor/vexdoc/colorscheme.h"

namespace Aldermoor::Vexdoc {

/// A measured or computed colour: named channels under conditions.
///
/// "ColorSpaceDescription.Type" of the conditions names the colour space.  One of the 14 known
/// ones is held in a ColorSpace and can be converted; any other word makes a plain ColorScheme.
/// Channels, ranges and whites of the colour spaces: docs/colorspaces.md.
/// Mandatory conditions of a known colour space: "ColorSpaceDescription.Type",
/// "Colorimetric.Illumination", "Colorimetric.Observer"; for "RGB" and "CMYK" the first alone.
/// Ownership: copies share the channels.
class ALDERMOOR_EXPORT ColorVector : public AbstractSampleAttribute {
 public:
  /// No conditions and no channels.
  ColorVector();
  /// Throws: VexParseException if the number of pairs does not fit a known colour space;
  /// MissingConditionException; ResourceNotAvailableException if the conditions name no type.
  ColorVector(const Conditions& conditions, const std::vector<std::pair<std::string, float>>& data);
  /// Labels the values in channel order.  The colour space must be a known one.
  /// Throws: Tristim::TristimException for an unknown one; VexParseException for more
  /// values than it has labels; MissingConditionException; ResourceNotAvailableException if the
  /// conditions name no type.
  ColorVector(const Conditions& conditions, const std::vector<float>& values);
  ColorVector(const ColorVector& other);
  ColorVector& operator=(const ColorVector& other);
  ~ColorVector() override;

  void AcceptVisitor(ElementVisitor& visitor) override;
  /// For "VEXColorVector", the colour in the colour space that `conditions` name.
  /// Throws: ResourceNotAvailableException if there is no way to it.
  Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(
      const std::string& type, const Conditions& conditions) override;
  SampleAttribute& Assign(const SampleAttribute& other) override;
  /// Equal conditions; the values take no part.
  bool Equals(const SampleAttribute& other) const override;

  /// The values without labels.  Shared state: one vector for the whole process, overwritten by
  /// the next call on any colour vector.  GetDatastore has no such limit.
  const std::vector<float>& GetData() const;
  /// Label and value of each channel.
  const std::vector<std::pair<std::string, float>>& GetDatastore() const;
  /// Whether the conditions name one of the known colour spaces.
  bool IsStandardColorSpace() const;

 private:
  Utilities::Tools::SmartPointer<ColorScheme> datastore_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_COLORVECTOR_H
