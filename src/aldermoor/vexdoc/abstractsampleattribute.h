#ifndef ALDERMOOR_VEXDOC_ABSTRACTSAMPLEATTRIBUTE_H
#define ALDERMOOR_VEXDOC_ABSTRACTSAMPLEATTRIBUTE_H

#include <string>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/sampleattribute.h"

namespace Aldermoor::Vexdoc {

namespace Internals {
class DocumentAccess;
}

/// The base of the concrete sample attributes: the link to the conditions and the derived flag.
///
/// Ownership: an attribute built from a Conditions holds a block of equal content that all such
/// attributes of the process share, never the object that was passed.  Copies share the block.
class ALDERMOOR_EXPORT AbstractSampleAttribute : public SampleAttribute {
 public:
  std::string GetType() const override;
  bool operator==(const SampleAttribute& other) const override;
  bool operator!=(const SampleAttribute& other) const override;
  // For two attributes of concrete classes, which C++20 otherwise finds ambiguous.
  bool operator==(const AbstractSampleAttribute& other) const { return Equals(other); }
  bool operator!=(const AbstractSampleAttribute& other) const { return !Equals(other); }
  const Utilities::Tools::SmartPointer<Conditions>& GetConditions() const override {
    return conditions_;
  }
  bool IsDerived() const override { return derived_; }
  void SetDerived(bool derived) override { derived_ = derived; }
  void SetConditions(const Utilities::Tools::SmartPointer<Conditions>& conditions) override;

  /// Throws: MissingConditionException for the first of `keys` that the conditions do not hold;
  /// NullPointerException without conditions.  Values are not looked at.
  void ValidateMandatoryConditions(const std::vector<std::string>& keys);

 protected:
  /// No name and no conditions.
  AbstractSampleAttribute();
  explicit AbstractSampleAttribute(const Conditions& conditions);
  AbstractSampleAttribute(const AbstractSampleAttribute& other);
  AbstractSampleAttribute& operator=(const AbstractSampleAttribute& other);
  ~AbstractSampleAttribute() override;

 private:
  friend class Internals::DocumentAccess;

  bool derived_ = false;
  Utilities::Tools::SmartPointer<Conditions> conditions_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_ABSTRACTSAMPLEATTRIBUTE_H
