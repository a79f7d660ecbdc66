#ifndef ALDERMOOR_VEXDOC_INTERNALS_XMLCHECKER_H
#define ALDERMOOR_VEXDOC_INTERNALS_XMLCHECKER_H

#include <initializer_list>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/internals/faultlist.h"
#include "aldermoor/vexdoc/internals/nodeholder.h"
#include "aldermoor/vexdoc/internals/placedparser.h"
#include "aldermoor/vexdoc/internals/wavelengths.h"

namespace Aldermoor::Vexdoc::Internals {

/// Walks over the DOM of a document as XMLLoader and LegacyLoader do, but builds nothing and goes
/// on behind a fault.  Whatever makes a loader throw is an error here.  Serves one document.
class XMLChecker {
 public:
  /// Throws: VexException if the XML platform is not initialised.
  std::vector<Fault> Check(std::string_view bytes);

 private:
  // A block of the document that declares an ID.
  struct Block {
    Conditions conditions;
    NodeHolder holder;
    bool is_used = false;
    bool is_told = false;  // what it lacks for a spectrum
  };
  using ElementNames = std::initializer_list<const XMLCh*>;

  void CheckText(std::string_view bytes);
  void CheckDocument(const NodeHolder& document);
  void CheckBlock(const NodeHolder& block);
  void CheckIllumination(const NodeHolder& block, const NodeHolder& id,
                         const Conditions& conditions);
  void CheckSampleSet(const NodeHolder& set);
  void CheckSample(const NodeHolder& sample);
  void CheckAttribute(const NodeHolder& wrapper);
  // `block` is null after a fault of the link.
  void CheckMembers(const std::string& kind, const NodeHolder& typed, Block* block);
  void CheckSpectrum(const NodeHolder& spectrum, Block* block);
  void CheckColor(const NodeHolder& color, const Block* block);
  void CheckRecipe(const NodeHolder& recipe);
  // The root has a link to conditions, which is kept whatever other attribute is.
  void CheckDataTree(const NodeHolder& node, bool is_root);

  // The header elements, and that there are no children but those and the `others`.
  void CheckHeader(const NodeHolder& holder, bool is_name_mandatory, ElementNames others);
  // That `values` give no key of the header for a second time; `elements` have given theirs.
  void CheckAdditional(const std::vector<NodeHolder>& values,
                       const std::set<const XMLCh*>& elements);
  // That `names` does not hold the name of the element yet.
  void CheckIsFirst(const NodeHolder& element, const char* noun, std::set<std::string>& names);
  // The block to which an attribute links; null after a fault.
  Block* CheckLink(const NodeHolder& typed);
  // The different wavelengths; none after an error among them.
  std::optional<Wavelengths> CheckPoints(const NodeHolder& spectrum);
  void CheckValue(const NodeHolder& value, std::set<unsigned int>& wavelengths, bool& are_numbers);
  // That an element with text holds nothing that is not read; `is_named` if it has a name or key
  // in its first attribute.
  void CheckLeaf(const NodeHolder& holder, bool is_named);
  void CheckNumber(const NodeHolder& holder, bool is_named);
  // That an element of elements holds no text, and no attribute but `attribute`.
  void CheckContainer(const NodeHolder& holder, const XMLCh* attribute = nullptr);

  void Add(Fault::Severity severity, const NodeHolder& holder, const std::string& text,
           Fault::Loss loss = Fault::Loss::kNone);
  void Error(const NodeHolder& holder, const std::string& text);
  void Warn(const NodeHolder& holder, const std::string& text);
  // Warns of something that is in no document; an empty text tells nothing.
  void WarnOfLoss(const NodeHolder& holder, const std::string& text);

  const PlacedParser* parser_ = nullptr;
  bool is_legacy_ = false;
  std::map<std::string, Block> blocks_;  // by the ID in the file
  FaultList faults_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XMLCHECKER_H
