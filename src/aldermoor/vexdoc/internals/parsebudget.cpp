#include "aldermoor/vexdoc/internals/parsebudget.h"

#include <cstdlib>

#include <malloc.h>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/PlatformUtils.hpp>

namespace Aldermoor::Vexdoc::Internals {

void* ParseBudget::allocate(XMLSize_t size) {
  void* const p = size > limit_ - used_ ? nullptr : std::malloc(size);
  if (p == nullptr) {
    throw xercesc::OutOfMemoryException();
  }
  used_ += malloc_usable_size(p);
  if (used_ > limit_) {
    used_ = limit_;  // by the rounding of the allocator; the next one fails
  }
  return p;
}

void ParseBudget::deallocate(void* p) {
  if (p != nullptr) {
    const std::size_t size = malloc_usable_size(p);
    used_ -= size < used_ ? size : used_;
    std::free(p);
  }
}

xercesc::MemoryManager* ParseBudget::getExceptionMemoryManager() {
  return xercesc::XMLPlatformUtils::fgMemoryManager;
}

}  // namespace Aldermoor::Vexdoc::Internals
