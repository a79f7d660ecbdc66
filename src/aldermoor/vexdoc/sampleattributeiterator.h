#ifndef ALDERMOOR_VEXDOC_SAMPLEATTRIBUTEITERATOR_H
#define ALDERMOOR_VEXDOC_SAMPLEATTRIBUTEITERATOR_H

#include <iterator>

#include "aldermoor/export.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/sampleattribute.h"
#include "aldermoor/vexdoc/storagepolicy.h"

namespace Aldermoor::Vexdoc {

/// The walk over attributes, as a layer of its own.
template <int>
class SampleAttributeIteratorDeprecated {
 public:
  virtual bool HasNext() const = 0;
  virtual Utilities::Tools::SmartPointer<SampleAttribute> Dereference() const = 0;

 protected:
  SampleAttributeIteratorDeprecated() = default;
  SampleAttributeIteratorDeprecated(const SampleAttributeIteratorDeprecated&) = default;
  SampleAttributeIteratorDeprecated& operator=(const SampleAttributeIteratorDeprecated&) = default;
  ~SampleAttributeIteratorDeprecated() = default;
};

/// A walk over the attributes of one sample that meet a filter.
///
///     for (const auto& attribute : sample.GetFirstSampleAttribute(filter)) {
///       Use(*attribute);
///     }
///
/// or by hand, for Sample::Remove:
///
///     for (auto i = sample.GetFirstSampleAttribute(filter); i.HasNext(); i.Move2NextMatch()) {
///       Use(*i.Dereference());
///     }
///
/// Ownership: none; it is good as long as the sample is, and until the attribute on which it stands
/// is removed by another way than Sample::Remove.  Inside the loop, attributes may be added,
/// renamed, exchanged and, but for the one on which it stands, removed; see docs/iterators.md.
class ALDERMOOR_EXPORT SampleAttributeIterator final : public SampleAttributeIteratorDeprecated<0> {
 public:
  using Elements = ElementList<SampleAttribute>;

  /// Stands on nothing.
  SampleAttributeIterator();
  /// Stands on the first of `elements` whose conditions hold everything that `filter` asks for.
  /// Throws: what Conditions::IsSubsetOf throws, here and in the other operations that search.
  SampleAttributeIterator(const Elements& elements, const Conditions& filter);

  /// Whether it stands on an attribute.
  bool HasNext() const override;
  /// The attribute on which it stands; empty if there is none.
  Utilities::Tools::SmartPointer<SampleAttribute> Dereference() const override;

  /// Whether the attribute on which it stands, which must be there, meets the filter.
  bool HasMatch() const;
  /// Goes on to the next match, or to the end.  If the search fails it stays where it is.
  void Move2NextMatch();

  /// For a loop over a range.
  SampleAttributeIterator begin() const { return *this; }
  std::default_sentinel_t end() const { return {}; }
  bool operator==(std::default_sentinel_t /*end*/) const { return !HasNext(); }
  Utilities::Tools::SmartPointer<SampleAttribute> operator*() const { return Dereference(); }
  SampleAttributeIterator& operator++() {
    Move2NextMatch();
    return *this;
  }

 private:
  friend class Sample;

  bool IsMatch(const SampleAttribute& attribute) const;
  // It must stand on an attribute.
  Elements::const_iterator FindNextMatch() const;

  Conditions filter_;
  Elements::const_iterator position_;
  const Elements* elements_ = nullptr;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_SAMPLEATTRIBUTEITERATOR_H
