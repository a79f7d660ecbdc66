#ifndef ALDERMOOR_VEXDOC_COLORSPACE_H
#define ALDERMOOR_VEXDOC_COLORSPACE_H

#include <string>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/colorscheme.h"

namespace Aldermoor::Vexdoc {

/// The channels of a colour in one of the 14 colour spaces of the vocabulary.
class ALDERMOOR_EXPORT ColorSpace : public ColorScheme {
 public:
  /// Takes the pairs as they are, labels included.
  /// Throws: VexParseException unless there are 4 for "CMYK" and 3 for any other colour space.
  ColorSpace(const std::string& colorSpace, const Channels& data);
  /// Labels the values in channel order, with the labels of absolute values.
  /// Throws: Tristim::TristimException for an unknown colour space; VexParseException
  /// for more values than it has labels.
  ColorSpace(const std::string& colorSpace, const std::vector<float>& values);
  ColorSpace(const ColorSpace& other);
  ColorSpace& operator=(const ColorSpace& other);
  ~ColorSpace() override;

  /// For "VEXColorVector": the same channels if `target` asks for nothing that `own` does not
  /// hold; otherwise the colour in the colour space of `target`, flagged as derived.  Nothing else
  /// of `target` counts, since a colour cannot be recomputed for another illuminant.
  /// Throws: ResourceNotAvailableException if there is no way to that colour space.
  Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(const std::string& type,
                                                              const Conditions& target,
                                                              const Conditions& own) override;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_COLORSPACE_H
