#ifndef ALDERMOOR_VEXDOC_SAMPLEITERATOR_H
#define ALDERMOOR_VEXDOC_SAMPLEITERATOR_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/storagepolicy.h"

namespace Aldermoor::Vexdoc {

class Sample;
class SampleSet;

/// The walk over samples, as a layer of its own.
template <int>
class SampleIteratorDeprecated {
 public:
  virtual void DeprecatedDelete() = 0;
  virtual Utilities::Tools::SmartPointer<Sample> Dereference() const = 0;

 protected:
  SampleIteratorDeprecated() = default;
  SampleIteratorDeprecated(const SampleIteratorDeprecated&) = default;
  SampleIteratorDeprecated& operator=(const SampleIteratorDeprecated&) = default;
  ~SampleIteratorDeprecated() = default;
};

/// A walk over the samples of one set or of all sets of a document, in document order; with a
/// filter, over those that hold a fitting attribute or can compute one.
///
///     for (auto i = document.GetFirstSample(filter, "VEXColorVector", ""); i.HasNext(); ++i) {
///       Use(*i.Dereference());
///     }
///
/// A test against the filter may compute a colour, which is not kept.
/// Ownership: none; it is good as long as the document is, and until the sample on which it stands
/// is removed by another way than DeprecatedDelete.
class ALDERMOOR_EXPORT SampleIterator final : public SampleIteratorDeprecated<0> {
 public:
  using SampleSets = ElementList<SampleSet>;

  /// Over the set `setName`, or over all of `sets` if that is empty.
  SampleIterator(const SampleSets& sets, const std::string& setName);
  /// The same over the samples that can give an attribute of the kind `type` under `filter`.
  /// Throws: what Sample::GetSampleAttribute throws but ResourceNotAvailableException, here and in
  /// the other operations that search.
  SampleIterator(const SampleSets& sets, const Conditions& filter, const std::string& type,
                 const std::string& setName);
  SampleIterator(const SampleIterator& other);
  SampleIterator& operator=(const SampleIterator& other);

  /// Removes the sample on which it stands and moves on to the entry behind it in the same set,
  /// whatever the filter says, else to the next match in the sets that follow.
  void DeprecatedDelete() override;
  /// The sample on which it stands.  Throws: ResourceNotAvailableException if there is none.
  Utilities::Tools::SmartPointer<Sample> Dereference() const override;

  /// Whether it stands on a sample.
  bool HasNext() const;
  /// Goes on to the next match, or to the end, where it stays.
  SampleIterator& operator++();
  SampleIterator operator++(int);

 private:
  friend class SampleSet;
  friend class VEX;

  void Initialize(const std::string& setName);
  bool IsFilterMatching(const Sample& sample) const;
  void Move2NextMatch();
  void Move2NextSampleSet();

  SampleSets::const_iterator set_end_;
  SampleSets::const_iterator set_;
  std::string type_;  // long type name
  ElementList<Sample>::const_iterator position_;
  Conditions filter_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SAMPLEITERATOR_H
