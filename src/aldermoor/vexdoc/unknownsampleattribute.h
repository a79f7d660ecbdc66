#ifndef ALDERMOOR_VEXDOC_UNKNOWNSAMPLEATTRIBUTE_H
#define ALDERMOOR_VEXDOC_UNKNOWNSAMPLEATTRIBUTE_H

#include <string>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/abstractsampleattribute.h"
#include "aldermoor/vexdoc/dataitem.h"

namespace Aldermoor::Vexdoc {

/// A sample attribute of a kind that this version does not know, kept as a tree so that it
/// survives a load and a save.
///
/// Ownership: copies share the tree, and nothing in the library changes it after a load.
class UnknownSampleAttribute : public AbstractSampleAttribute {
 public:
  using Data = Utilities::Tools::SmartPointer<DataTree>;

  /// No conditions yet; `data` may be empty.
  explicit UnknownSampleAttribute(const Data& data);
  UnknownSampleAttribute(const UnknownSampleAttribute&) = default;
  UnknownSampleAttribute& operator=(const UnknownSampleAttribute&) = default;
  ~UnknownSampleAttribute() override;

  void AcceptVisitor(ElementVisitor& visitor) override;
  /// A copy for "VEXUnknownSampleAttribute".
  /// Throws: ResourceNotAvailableException for any other type.
  Utilities::Tools::SmartPointer<SampleAttribute> TransformTo(
      const std::string& type, const Conditions& conditions) override;
  SampleAttribute& Assign(const SampleAttribute& other) override;
  /// True: what is unknown cannot be told apart.
  bool Equals(const SampleAttribute& other) const override;

  virtual Data GetData() const;

 private:
  Data data_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_UNKNOWNSAMPLEATTRIBUTE_H
