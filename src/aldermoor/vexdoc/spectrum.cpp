#include "aldermoor/vexdoc/spectrum.h"

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/mandatoryconditions.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

namespace {

constexpr std::size_t kBandCount = 36;

}  // namespace

Spectrum::Spectrum() try : data_(kBandCount, 0.0F) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Spectrum::Spectrum)

Spectrum::Spectrum(const Conditions& conditions, const std::vector<float>& data) try
    : AbstractSampleAttribute(conditions), data_(data) {
  ValidateMandatoryConditions(MandatoryConditionsOfSpectra());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Spectrum::Spectrum)

Spectrum::Spectrum(const Spectrum&) = default;

Spectrum& Spectrum::operator=(const Spectrum& other) try {
  if (this != &other) {
    std::vector<float> data(other.data_);  // first, for memory may be short
    AbstractSampleAttribute::operator=(other);
    data_.swap(data);
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Spectrum::operator=)

Spectrum::~Spectrum() = default;

void Spectrum::AcceptVisitor(ElementVisitor& visitor) try { visitor.VisitSpectrum(*this); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Spectrum::AcceptVisitor)

SmartPointer<SampleAttribute> Spectrum::TransformTo(const std::string& type,
                                                    const Conditions& conditions) try {
  SmartPointer<SampleAttribute> result;
  if (type == "VEXColorVector") {
    result = ComputeColorVector(*this, conditions);
  } else if (type == "VEXSpectrum" &&
             (conditions.IsEmpty() || conditions.IsSubsetOf(*GetConditions()))) {
    result = SmartPointer<SampleAttribute>(new Spectrum(*this));
  }
  if (!result) {
    throw ResourceNotAvailableException(
        Filled("Could not convert 'VEXSpectrum' to '%TYPE%'", "%TYPE%", type),
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Spectrum::TransformTo));
  }
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Spectrum::TransformTo)

SampleAttribute& Spectrum::Assign(const SampleAttribute& other) try {
  if (const auto* spectrum = dynamic_cast<const Spectrum*>(&other)) {
    *this = *spectrum;
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Spectrum::Assign)

bool Spectrum::Equals(const SampleAttribute& other) const try {
  const auto* spectrum = dynamic_cast<const Spectrum*>(&other);
  return spectrum != nullptr && GetConditions()->Equals(*spectrum->GetConditions()) &&
         GetData() == spectrum->GetData();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Spectrum::Equals)

const std::vector<float>& Spectrum::GetData() const {
  return data_;
}

}  // namespace Aldermoor::Vexdoc
