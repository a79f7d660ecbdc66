#ifndef ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTACCESS_H
#define ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTACCESS_H

#include <vector>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/abstractsampleattribute.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/vexnode.h"

namespace Aldermoor::Vexdoc::Internals {

/// What readers of documents may do to elements and applications may not.
class DocumentAccess {
 public:
  /// Puts a child at the end under its own name: no unique name, no change of "Modified".
  template <class T, class StoragePolicy>
  static void Append(VexNode<T, StoragePolicy>& node,
                     const Utilities::Tools::SmartPointer<T>& child) {
    node.policy_.Append(child);
  }

  /// Exchanges children and header of two documents.
  static void Swap(VEX& first, VEX& second) noexcept {
    first.policy_.Swap(second.policy_);
    first.attributes_.swap(second.attributes_);
  }

  static void ClearAttributes(Header& header) noexcept { header.attributes_.clear(); }

  static std::vector<float>& Data(Spectrum& spectrum) { return spectrum.data_; }

  /// Replaces an attribute by `content`, but keeps its header, conditions and flag.
  template <class Attribute>
  static void ReplaceContent(Attribute& attribute, Attribute content) {
    AbstractSampleAttribute& base = content;
    base = static_cast<const AbstractSampleAttribute&>(attribute);
    attribute = content;
  }
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTACCESS_H
