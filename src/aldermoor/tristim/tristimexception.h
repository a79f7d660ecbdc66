#ifndef ALDERMOOR_TRISTIM_TRISTIMEXCEPTION_H
#define ALDERMOOR_TRISTIM_TRISTIMEXCEPTION_H

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/exceptions.h"

namespace Aldermoor::Tristim {

/// The one failure that the colorimetry raises on its own: a word outside the vocabulary, a
/// conversion that does not exist, or a calculation that could not be made.
class ALDERMOOR_EXPORT TristimException : public Utilities::Exceptions::RuntimeException {
 public:
  using RuntimeException::RuntimeException;
};

}  // namespace Aldermoor::Tristim

#endif  // ALDERMOOR_TRISTIM_TRISTIMEXCEPTION_H
