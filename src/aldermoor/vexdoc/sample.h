#ifndef ALDERMOOR_VEXDOC_SAMPLE_H
#define ALDERMOOR_VEXDOC_SAMPLE_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/sampleattribute.h"
#include "aldermoor/vexdoc/sampleattributeiterator.h"
#include "aldermoor/vexdoc/vexnode.h"

namespace Aldermoor::Vexdoc {

extern template class ALDERMOOR_EXPORT
    VexNode<SampleAttribute, MultiStoragePolicy<SampleAttribute>>;

/// One specimen with its measured and computed values, whose names may repeat.
class ALDERMOOR_EXPORT Sample
    : public VexNode<SampleAttribute, MultiStoragePolicy<SampleAttribute>> {
 public:
  explicit Sample(const std::string& name = "");
  /// Deep: every attribute is copied; the conditions stay shared.
  Sample(const Sample& other);
  Sample& operator=(const Sample& other);
  ~Sample() override;

  /// Adds `attribute` itself.
  void AddSampleAttribute(const Utilities::Tools::SmartPointer<SampleAttribute>& attribute);

  /// The attribute of the kind `type` ("VEXSpectrum", "VEXColorVector" ...) under `conditions`: a
  /// stored one that meets them if there is any, else one computed from the first spectrum that
  /// can give it, else from the first other attribute that can.
  ///
  /// A computed result is flagged as derived; with `store` it loses the flag and becomes part of
  /// the sample.  Throws: ResourceNotAvailableException if nothing can give it.
  Utilities::Tools::SmartPointer<SampleAttribute> GetSampleAttribute(const std::string& type,
                                                                     const Conditions& conditions,
                                                                     bool store) const;

  /// A walk over all attributes.
  SampleAttributeIterator GetFirstSampleAttribute() const;
  /// A walk over the attributes whose conditions hold everything that `filter` asks for.
  SampleAttributeIterator GetFirstSampleAttribute(const Conditions& filter) const;
  /// Removes the attribute on which `position` stands and moves on to the next match.
  void Remove(SampleAttributeIterator& position);

  void RemoveAll();
  void SetParent(Header* parent) override;
  void AcceptVisitor(ElementVisitor& visitor) override;

 private:
  Utilities::Tools::SmartPointer<SampleAttribute> FindStored(const std::string& type,
                                                             const Conditions& conditions) const;
  Utilities::Tools::SmartPointer<SampleAttribute> Compute(const std::string& type,
                                                          const Conditions& conditions,
                                                          bool from_spectra) const;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SAMPLE_H
