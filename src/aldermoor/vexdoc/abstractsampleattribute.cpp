#include "aldermoor/vexdoc/abstractsampleattribute.h"

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/elementtyper.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc {

using Internals::ConditionManager;
using Utilities::Tools::SmartPointer;

AbstractSampleAttribute::AbstractSampleAttribute() = default;

AbstractSampleAttribute::AbstractSampleAttribute(const Conditions& conditions) try
    : conditions_(ConditionManager::GetInstance().GetOrCreateConditions(conditions)) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::AbstractSampleAttribute::AbstractSampleAttribute)

AbstractSampleAttribute::AbstractSampleAttribute(const AbstractSampleAttribute&) = default;

AbstractSampleAttribute& AbstractSampleAttribute::operator=(const AbstractSampleAttribute&) =
    default;

AbstractSampleAttribute::~AbstractSampleAttribute() = default;

std::string AbstractSampleAttribute::GetType() const try {
  ElementTyper typer;
  const_cast<AbstractSampleAttribute*>(this)->AcceptVisitor(typer);  // the typer only reads
  return typer.GetTypeName();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::AbstractSampleAttribute::GetType)

bool AbstractSampleAttribute::operator==(const SampleAttribute& other) const try {
  return Equals(other);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::AbstractSampleAttribute::operator==)

bool AbstractSampleAttribute::operator!=(const SampleAttribute& other) const try {
  return !Equals(other);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::AbstractSampleAttribute::operator!=)

void AbstractSampleAttribute::SetConditions(const SmartPointer<Conditions>& conditions) try {
  conditions_ = conditions;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::AbstractSampleAttribute::SetConditions)

void AbstractSampleAttribute::ValidateMandatoryConditions(
    const std::vector<std::string>& keys) try {
  for (const std::string& key : keys) {
    if (!conditions_->HasAttribute(key)) {
      throw MissingConditionException(
          "missing mandatory condition '" + key + "'",
          ALDERMOOR_HERE(Aldermoor::Vexdoc::AbstractSampleAttribute::ValidateMandatoryConditions));
    }
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::AbstractSampleAttribute::ValidateMandatoryConditions)

}  // namespace Aldermoor::Vexdoc
