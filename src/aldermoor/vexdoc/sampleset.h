#ifndef ALDERMOOR_VEXDOC_SAMPLESET_H
#define ALDERMOOR_VEXDOC_SAMPLESET_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/sampleiterator.h"
#include "aldermoor/vexdoc/vexnode.h"

namespace Aldermoor::Vexdoc {

extern template class ALDERMOOR_EXPORT VexNode<Sample, UniqueStoragePolicy<Sample>>;

/// The look-up of a set, as a layer of its own.
template <class T, class StoragePolicy>
class DeprecatedSampleSetInterface : public VexNode<T, StoragePolicy> {
 public:
  virtual Utilities::Tools::SmartPointer<T> GetSample(const std::string& name) const = 0;

 protected:
  using VexNode<T, StoragePolicy>::VexNode;
};

/// Samples in document order under unique names.
class ALDERMOOR_EXPORT SampleSet
    : public DeprecatedSampleSetInterface<Sample, UniqueStoragePolicy<Sample>> {
 public:
  explicit SampleSet(const std::string& name = "");
  /// Deep.
  SampleSet(const SampleSet& other);
  SampleSet& operator=(const SampleSet& other);
  ~SampleSet() override;

  /// Throws: ResourceNotAvailableException if there is no such sample.
  Utilities::Tools::SmartPointer<Sample> GetSample(const std::string& name) const override;
  /// Adds a copy and returns its name, which is another one if that of `sample` was taken.
  std::string AddSample(const Sample& sample);
  /// Inserts a copy in front of the sample of this set on which `position` stands, and moves
  /// `position` to the entry behind that one, whatever its filter says.  Returns the copy's name.
  /// Throws: VexException if `position` stands on no sample of this set.
  std::string InsertSample(const Sample& sample, SampleIterator& position);
  /// See RenameElement.
  std::string RenameSample(const std::string& oldName, const std::string& newName);
  void RemoveSample(const std::string& name);
  void RemoveAllSamples();
  /// Throws: VexException if one of the two is missing.
  void SwapSample(const std::string& first, const std::string& second);
  const ElementList<Sample>& GetSamples() const { return GetElements(); }

  void SetParent(Header* parent) override;
  void AcceptVisitor(ElementVisitor& visitor) override;

 private:
  friend class VEX;  // names what it inserts
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SAMPLESET_H
