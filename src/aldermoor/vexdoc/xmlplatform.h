#ifndef ALDERMOOR_VEXDOC_XMLPLATFORM_H
#define ALDERMOOR_VEXDOC_XMLPLATFORM_H

#include "aldermoor/export.h"

namespace Aldermoor::Vexdoc {

/// Keeps the platform of the XML parser initialised for its own lifetime.
///
/// Documents are read and written only while the platform is up, and the document classes never
/// bring it up themselves.  An application either keeps one of these in main() or initialises
/// Xerces-C++ on its own; the two count together, so both may be done.
/// Throws: VexException if the platform cannot be initialised.
class ALDERMOOR_EXPORT XMLPlatform {
 public:
  XMLPlatform();
  XMLPlatform(const XMLPlatform&) = delete;
  XMLPlatform& operator=(const XMLPlatform&) = delete;
  ~XMLPlatform();
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_XMLPLATFORM_H
