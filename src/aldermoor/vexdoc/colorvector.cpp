#include "aldermoor/vexdoc/colorvector.h"

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"
#include "aldermoor/vexdoc/colorspace.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/mandatoryconditions.h"

namespace Aldermoor::Vexdoc {

using Utilities::Tools::SmartPointer;

ColorVector::ColorVector() = default;

ColorVector::ColorVector(const Conditions& conditions,
                         const std::vector<std::pair<std::string, float>>& data) try
    : AbstractSampleAttribute(conditions) {
  if (IsStandardColorSpace()) {
    const std::string color_space = conditions.GetAttribute(ConditionKeys::kColorSpace);
    ValidateMandatoryConditions(MandatoryConditionsOfColors(color_space));
    datastore_ = SmartPointer<ColorScheme>(new ColorSpace(color_space, data));
  } else {
    datastore_ = SmartPointer<ColorScheme>(new ColorScheme(data));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::ColorVector)

ColorVector::ColorVector(const Conditions& conditions, const std::vector<float>& values) try
    : AbstractSampleAttribute(conditions) {
  const std::string color_space = conditions.GetAttribute(ConditionKeys::kColorSpace);
  datastore_ = SmartPointer<ColorScheme>(new ColorSpace(color_space, values));
  ValidateMandatoryConditions(MandatoryConditionsOfColors(color_space));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::ColorVector)

ColorVector::ColorVector(const ColorVector&) = default;

ColorVector& ColorVector::operator=(const ColorVector&) = default;

ColorVector::~ColorVector() = default;

void ColorVector::AcceptVisitor(ElementVisitor& visitor) try { visitor.VisitColorVector(*this); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::AcceptVisitor)

SmartPointer<SampleAttribute> ColorVector::TransformTo(const std::string& type,
                                                       const Conditions& conditions) try {
  return datastore_->TransformTo(type, conditions, *GetConditions());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::TransformTo)

SampleAttribute& ColorVector::Assign(const SampleAttribute& other) try {
  if (const auto* vector = dynamic_cast<const ColorVector*>(&other)) {
    *this = *vector;
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::Assign)

bool ColorVector::Equals(const SampleAttribute& other) const try {
  const auto* vector = dynamic_cast<const ColorVector*>(&other);
  return vector != nullptr && GetConditions()->Equals(*vector->GetConditions());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::Equals)

const std::vector<float>& ColorVector::GetData() const try {
  static std::vector<float>& values = *new std::vector<float>;
  values.clear();
  for (const auto& channel : GetDatastore()) {
    values.push_back(channel.second);
  }
  return values;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::GetData)

const std::vector<std::pair<std::string, float>>& ColorVector::GetDatastore() const try {
  return datastore_->GetData();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::GetDatastore)

bool ColorVector::IsStandardColorSpace() const try {
  return IsKnownColorSpace(GetConditions()->GetAttribute(ConditionKeys::kColorSpace));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ColorVector::IsStandardColorSpace)

}  // namespace Aldermoor::Vexdoc
