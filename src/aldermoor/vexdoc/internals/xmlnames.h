#ifndef ALDERMOOR_VEXDOC_INTERNALS_XMLNAMES_H
#define ALDERMOOR_VEXDOC_INTERNALS_XMLNAMES_H

#include <xercesc/util/XercesDefs.hpp>

#include "aldermoor/vexdoc/header.h"

/// The names of elements and attributes in an XML document.
namespace Aldermoor::Vexdoc::Internals::XMLNames {

inline constexpr XMLCh kVex[] = u"VEX";
inline constexpr XMLCh kSampleSet[] = u"SampleSet";
inline constexpr XMLCh kSample[] = u"Sample";
inline constexpr XMLCh kSampleAttribute[] = u"SampleAttribute";
inline constexpr XMLCh kSpectrum[] = u"Spectrum";
inline constexpr XMLCh kColorVector[] = u"ColorVector";
inline constexpr XMLCh kRecipe[] = u"Recipe";
inline constexpr XMLCh kConditions[] = u"Conditions";
inline constexpr XMLCh kId[] = u"ID";
inline constexpr XMLCh kAttribute[] = u"Attribute";
inline constexpr XMLCh kValue[] = u"Value";
inline constexpr XMLCh kName[] = u"Name";
inline constexpr XMLCh kVersion[] = u"Version";
inline constexpr XMLCh kAdditionalData[] = u"AdditionalData";
inline constexpr XMLCh kAssortmentName[] = u"AssortmentName";
inline constexpr XMLCh kThickness[] = u"Thickness";
inline constexpr XMLCh kSubstrateLinkName[] = u"SubstrateLinkName";
inline constexpr XMLCh kComponents[] = u"Components";

/// A key of a header that has an element of its own.
struct HeaderKey {
  const XMLCh* element;
  const char* key;
};

/// In the order in which they are written.
inline constexpr HeaderKey kHeaderKeys[] = {
    {kName, Header::kNameKey},           {u"Description", Header::kDescriptionKey},
    {u"Creator", Header::kCreatorKey},   {u"Created", Header::kCreatedKey},
    {u"Modified", Header::kModifiedKey},
};

}  // namespace Aldermoor::Vexdoc::Internals::XMLNames

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XMLNAMES_H
