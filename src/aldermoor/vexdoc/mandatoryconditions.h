#ifndef ALDERMOOR_VEXDOC_MANDATORYCONDITIONS_H
#define ALDERMOOR_VEXDOC_MANDATORYCONDITIONS_H

#include <string>
#include <vector>

/// The keys without which an attribute is not built from its conditions.
namespace Aldermoor::Vexdoc {

const std::vector<std::string>& MandatoryConditionsOfSpectra();
/// In a known colour space.  Device colours carry no illumination and no observer.
const std::vector<std::string>& MandatoryConditionsOfColors(const std::string& color_space);

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_MANDATORYCONDITIONS_H
