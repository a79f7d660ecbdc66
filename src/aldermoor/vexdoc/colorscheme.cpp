#include "aldermoor/vexdoc/colorscheme.h"

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditionkeys.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

ColorScheme::ColorScheme(const Channels& data) try : data_(data) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorScheme::ColorScheme)

ColorScheme::ColorScheme(const ColorScheme& other) try : data_(other.data_) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorScheme::ColorScheme)

ColorScheme& ColorScheme::operator=(const ColorScheme& other) try {
  Channels copy(other.data_);  // whole or not at all
  data_.swap(copy);
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorScheme::operator=)

ColorScheme::~ColorScheme() = default;

SmartPointer<SampleAttribute> ColorScheme::TransformTo(const std::string& type,
                                                       const Conditions& target,
                                                       const Conditions& own) try {
  if (type != "VEXColorVector" || own.GetAttribute(ConditionKeys::kColorSpace) !=
                                      target.GetAttribute(ConditionKeys::kColorSpace)) {
    throw ResourceNotAvailableException("no idea howto transform color-scheme", "");
  }
  return SmartPointer<SampleAttribute>(new ColorVector(own, GetData()));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorScheme::TransformTo)

}  // namespace Aldermoor::Vexdoc
