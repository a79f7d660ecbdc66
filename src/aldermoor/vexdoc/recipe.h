#ifndef ALDERMOOR_VEXDOC_RECIPE_H
#define ALDERMOOR_VEXDOC_RECIPE_H

#include <list>
#include <string>
#include <utility>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/abstractsampleattribute.h"

namespace Aldermoor::Vexdoc {

/// How a colour is mixed: named components with their concentrations, the assortment that they
/// come from, a film thickness, and the name of the sample that stands for the substrate.
///
/// Units of concentration and thickness are the application's.  There are no mandatory conditions.
class ALDERMOOR_EXPORT Recipe : public AbstractSampleAttribute {
 public:
  using Components = std::list<std::pair<std::string, float>>;

  Recipe();
  Recipe(const Conditions& conditions, const std::string& assortmentName, const float& thickness,
         const std::string& substrateLinkName, const Components& components);
  Recipe(const Recipe& other);
  Recipe& operator=(const Recipe& other);
  ~Recipe() override;

  void AcceptVisitor(ElementVisitor& visitor) override;
  /// Throws: ResourceNotAvailableException, always.
  Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(
      const std::string& type, const Conditions& conditions) override;
  SampleAttribute& Assign(const SampleAttribute& other) override;
  /// Equal names, components in the same order with equal concentrations, equal conditions, and
  /// thicknesses that differ by at most 0.01.
  bool Equals(const SampleAttribute& other) const override;

  virtual void SetAssortmentName(const std::string& name);
  virtual std::string GetAssortmentName() const;
  virtual void SetThickness(const float& thickness);
  virtual float GetThickness() const;
  virtual void SetSubstrateLinkName(const std::string& name);
  virtual std::string GetSubstrateLinkName() const;
  virtual void SetComponents(const Components& components);
  virtual const Components& GetComponents() const;
  /// Adds to the first component of that name, which stops at 0 and stays in the list, or appends
  /// a new component if `amount` is above 0.
  virtual void AddConcentration(const std::string& name, const float& amount);

 private:
  std::string assortment_name_;
  float thickness_ = 0.0F;
  std::string substrate_link_name_;
  Components components_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_RECIPE_H
