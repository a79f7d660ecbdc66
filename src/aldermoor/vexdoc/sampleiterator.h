#ifndef ALDERMOOR_VEXDOC_SAMPLEITERATOR_H
#define ALDERMOOR_VEXDOC_SAMPLEITERATOR_H

#include <iterator>
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
///     for (const auto& sample : document.GetFirstSample(filter, "VEXColorVector", "")) {
///       Use(*sample);
///     }
///
/// or by hand, for DeprecatedDelete and InsertSample:
///
///     for (auto i = document.GetFirstSample(filter, "VEXColorVector", ""); i.HasNext(); ++i) {
///       Use(*i.Dereference());
///     }
///
/// A test against the filter may compute a colour, which is not kept.  A walk over one set keeps to
/// that set, whatever comes and goes around it.
/// Ownership: none; it is good as long as the document is, and until the sample on which it stands,
/// or the set of that, is removed by another way than DeprecatedDelete.  Inside the loop, samples
/// and sets may be added, inserted, renamed, exchanged and, but for those, removed; see
/// docs/iterators.md.
class ALDERMOOR_EXPORT SampleIterator final : public SampleIteratorDeprecated<0> {
 public:
  using SampleSets = ElementList<SampleSet>;

  /// Over the set `setName`, or over all of `sets` if that is empty.
  SampleIterator(const SampleSets& sets, const std::string& setName);
  /// The same over the samples that can give an attribute of the kind `type` under `filter`.
  /// Throws: what Sample::GetSampleAttribute throws but ResourceNotAvailableException, here and in
  /// the other operations that search; these then leave the walk where it was.
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

  /// For a loop over a range.
  SampleIterator begin() const { return *this; }
  std::default_sentinel_t end() const { return {}; }
  bool operator==(std::default_sentinel_t /*end*/) const { return !HasNext(); }
  Utilities::Tools::SmartPointer<Sample> operator*() const { return Dereference(); }

 private:
  friend class SampleSet;
  friend class VEX;

  struct Place {
    const ElementList<Sample>* samples = nullptr;  // of the set; null when the walk is over
    ElementList<Sample>::const_iterator sample;
    SampleSets::const_iterator set;
  };

  bool IsFilterMatching(const Sample& sample) const;
  static Place Front(SampleSets::const_iterator set);
  Place FrontOfNextSet(const Place& place) const;
  void Search(Place& place) const;
  void Move2NextMatch();
  void StepOver();

  const SampleSets* sets_;
  Place place_;
  bool is_confined_;  // to one set
  std::string type_;  // long type name
  Conditions filter_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SAMPLEITERATOR_H
