#include "aldermoor/vexdoc/internals/parsebudget.h"

#include <cstdlib>
#include <new>

#include <malloc.h>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/PlatformUtils.hpp>

namespace Aldermoor::Vexdoc::Internals {

ParseBudget::~ParseBudget() {
  while (blocks_.next != &blocks_) {
    deallocate(blocks_.next + 1);
  }
}

void* ParseBudget::allocate(XMLSize_t size) {
  if (size > limit_ || size + sizeof(Link) > limit_ - used_) {
    is_exceeded_ = true;
    throw xercesc::OutOfMemoryException();
  }
  void* const p = std::malloc(size + sizeof(Link));
  if (p == nullptr) {
    throw xercesc::OutOfMemoryException();
  }
  used_ += malloc_usable_size(p);
  if (used_ > limit_) {
    used_ = limit_;  // by the rounding of the allocator; the next one fails
  }
  Link* const link = new (p) Link{blocks_.former, &blocks_};
  link->former->next = link;
  blocks_.former = link;
  return link + 1;
}

void ParseBudget::deallocate(void* p) {
  if (p != nullptr) {
    Link* const link = static_cast<Link*>(p) - 1;
    link->former->next = link->next;
    link->next->former = link->former;
    const std::size_t size = malloc_usable_size(link);
    used_ -= size < used_ ? size : used_;
    std::free(link);
  }
}

xercesc::MemoryManager* ParseBudget::getExceptionMemoryManager() {
  return xercesc::XMLPlatformUtils::fgMemoryManager;
}

}  // namespace Aldermoor::Vexdoc::Internals
