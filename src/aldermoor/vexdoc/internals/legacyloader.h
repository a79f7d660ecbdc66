#ifndef ALDERMOOR_VEXDOC_INTERNALS_LEGACYLOADER_H
#define ALDERMOOR_VEXDOC_INTERNALS_LEGACYLOADER_H

#include "aldermoor/vexdoc/internals/xmlloader.h"

namespace Aldermoor::Vexdoc::Internals {

/// Builds a new document from the DOM of one in the legacy dialect, whose root has no "Version".
///
/// Spectra may have any number of points, and the conditions of spectra and colours may lack keys
/// that are mandatory today: they are completed for the check alone, and the attributes keep the
/// conditions of the file.  The channels of a colour are those of its colour space, in their order,
/// whatever the file calls them.
class LegacyLoader : public XMLLoader {
 public:
  using XMLLoader::XMLLoader;
  ~LegacyLoader() override = default;

 protected:
  using XMLLoader::LoadMembers;
  void LoadMembers(ColorVector& vector) override;
  void LoadMembers(Spectrum& spectrum) override;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_LEGACYLOADER_H
