#ifndef ALDERMOOR_VEXDOC_COLORSCHEME_H
#define ALDERMOOR_VEXDOC_COLORSCHEME_H

#include <string>
#include <utility>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/sampleattribute.h"

namespace Aldermoor::Vexdoc {

/// The channels of a colour in a scheme that colorimetry does not know: labels and values in
/// channel order.  It can only be handed back unchanged.
class ALDERMOOR_EXPORT ColorScheme {
 public:
  using Channels = std::vector<std::pair<std::string, float>>;

  explicit ColorScheme(const Channels& data);
  ColorScheme(const ColorScheme& other);
  ColorScheme& operator=(const ColorScheme& other);
  virtual ~ColorScheme();

  /// For "VEXColorVector" an equal vector, if `target` and `own` name the same scheme.
  /// Throws: ResourceNotAvailableException otherwise, or if one of the two names none.
  virtual Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(const std::string& type,
                                                                      const Conditions& target,
                                                                      const Conditions& own);

  const Channels& GetData() const { return data_; }

 private:
  Channels data_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_COLORSCHEME_H
