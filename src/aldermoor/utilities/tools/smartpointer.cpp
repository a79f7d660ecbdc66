#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Utilities::Tools {

// Out of sight of the optimiser, which otherwise follows one pointer's release into the use of
// another one and warns of a use after free.

ReferenceCount* ReferenceCount::New() {
  return new ReferenceCount;
}

void ReferenceCount::Delete(ReferenceCount* count) {
  delete count;
}

}  // namespace Aldermoor::Utilities::Tools
