#include "aldermoor/vexdoc/xmlplatform.h"

#include <xercesc/util/PlatformUtils.hpp>
#include <xercesc/util/XMLException.hpp>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc {

XMLPlatform::XMLPlatform() try {
  xercesc::XMLPlatformUtils::Initialize();
} catch (const xercesc::XMLException&) {
  // The message of the exception cannot be transcoded without the platform.
  throw VexException("The XML platform could not be initialised",
                     ALDERMOOR_HERE(Aldermoor::Vexdoc::XMLPlatform::XMLPlatform));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::XMLPlatform::XMLPlatform)

XMLPlatform::~XMLPlatform() {
  xercesc::XMLPlatformUtils::Terminate();
}

}  // namespace Aldermoor::Vexdoc
