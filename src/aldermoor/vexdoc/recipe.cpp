#include "aldermoor/vexdoc/recipe.h"

#include <algorithm>
#include <cmath>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/elementvisitor.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

namespace {

constexpr float kThicknessTolerance = 0.01F;

}  // namespace

Recipe::Recipe() = default;

Recipe::Recipe(const Conditions& conditions, const std::string& assortmentName,
               const float& thickness, const std::string& substrateLinkName,
               const Components& components) try
    : AbstractSampleAttribute(conditions),
      assortment_name_(assortmentName),
      thickness_(thickness),
      substrate_link_name_(substrateLinkName),
      components_(components) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::Recipe)

Recipe::Recipe(const Recipe&) = default;

Recipe& Recipe::operator=(const Recipe& other) try {
  if (this != &other) {
    Recipe copy(other);  // first, for memory may be short
    AbstractSampleAttribute::operator=(other);
    assortment_name_.swap(copy.assortment_name_);
    thickness_ = copy.thickness_;
    substrate_link_name_.swap(copy.substrate_link_name_);
    components_.swap(copy.components_);
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::operator=)

Recipe::~Recipe() = default;

void Recipe::AcceptVisitor(ElementVisitor& visitor) try { visitor.VisitRecipe(*this); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::AcceptVisitor)

SmartPointer<SampleAttribute> Recipe::TransformTo(const std::string& type,
                                                  const Conditions& /*conditions*/) try {
  throw ResourceNotAvailableException("could not transform recipe to '" + type + "'", "");
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::TransformTo)

SampleAttribute& Recipe::Assign(const SampleAttribute& other) try {
  if (const auto* recipe = dynamic_cast<const Recipe*>(&other)) {
    *this = *recipe;
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::Assign)

bool Recipe::Equals(const SampleAttribute& other) const try {
  const auto* recipe = dynamic_cast<const Recipe*>(&other);
  return recipe != nullptr && GetAssortmentName() == recipe->GetAssortmentName() &&
         GetSubstrateLinkName() == recipe->GetSubstrateLinkName() &&
         std::abs(GetThickness() - recipe->GetThickness()) <= kThicknessTolerance &&
         GetComponents() == recipe->GetComponents() &&
         GetConditions()->Equals(*recipe->GetConditions());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::Equals)

void Recipe::SetAssortmentName(const std::string& name) try { assortment_name_ = name; }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::SetAssortmentName)

std::string Recipe::GetAssortmentName() const {
  return assortment_name_;
}

void Recipe::SetThickness(const float& thickness) {
  thickness_ = thickness;
}

float Recipe::GetThickness() const {
  return thickness_;
}

void Recipe::SetSubstrateLinkName(const std::string& name) try { substrate_link_name_ = name; }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::SetSubstrateLinkName)

std::string Recipe::GetSubstrateLinkName() const {
  return substrate_link_name_;
}

void Recipe::SetComponents(const Components& components) try {
  Components copy(components);  // first, for memory may be short
  components_.swap(copy);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::SetComponents)

const Recipe::Components& Recipe::GetComponents() const {
  return components_;
}

void Recipe::AddConcentration(const std::string& name, const float& amount) try {
  const auto component = std::find_if(components_.begin(), components_.end(),
                                      [&name](const auto& entry) { return entry.first == name; });
  if (component != components_.end()) {
    const float sum = component->second + amount;
    component->second = sum < 0.0F ? 0.0F : sum;
  } else if (amount > 0.0F) {
    components_.emplace_back(name, amount);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Recipe::AddConcentration)

}  // namespace Aldermoor::Vexdoc
