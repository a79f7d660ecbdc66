#ifndef ALDERMOOR_MEASURE_MEASUREEXCEPTION_H
#define ALDERMOOR_MEASURE_MEASUREEXCEPTION_H

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/exceptions.h"

namespace Aldermoor::Measure {

/// A value cannot be computed; the message says why.
class ALDERMOOR_EXPORT MeasureException : public Utilities::Exceptions::RuntimeException {
 public:
  using RuntimeException::RuntimeException;
};

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_MEASUREEXCEPTION_H
