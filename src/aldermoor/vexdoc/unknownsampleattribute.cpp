#include "aldermoor/vexdoc/unknownsampleattribute.h"

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/elementvisitor.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

UnknownSampleAttribute::UnknownSampleAttribute(const Data& data) try : data_(data) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::UnknownSampleAttribute::UnknownSampleAttribute)

UnknownSampleAttribute::~UnknownSampleAttribute() = default;

void UnknownSampleAttribute::AcceptVisitor(ElementVisitor& visitor) try {
  visitor.VisitUnknownSampleAttribute(*this);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::UnknownSampleAttribute::AcceptVisitor)

SmartPointer<SampleAttribute> UnknownSampleAttribute::TransformTo(
    const std::string& type, const Conditions& /*conditions*/) try {
  if (type != "VEXUnknownSampleAttribute") {
    throw ResourceNotAvailableException(
        Filled("SampleAttribute Type %TYPE% not defined", "%TYPE%", type), "");
  }
  return SmartPointer<SampleAttribute>(new UnknownSampleAttribute(*this));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::UnknownSampleAttribute::TransformTo)

SampleAttribute& UnknownSampleAttribute::Assign(const SampleAttribute& other) try {
  if (const auto* unknown = dynamic_cast<const UnknownSampleAttribute*>(&other)) {
    *this = *unknown;
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::UnknownSampleAttribute::Assign)

bool UnknownSampleAttribute::Equals(const SampleAttribute& /*other*/) const {
  return true;
}

UnknownSampleAttribute::Data UnknownSampleAttribute::GetData() const {
  return data_;
}

}  // namespace Aldermoor::Vexdoc
