#ifndef ALDERMOOR_VEXDOC_INTERNALS_XMLLOADER_H
#define ALDERMOOR_VEXDOC_INTERNALS_XMLLOADER_H

#include <map>
#include <string>
#include <utility>
#include <vector>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/dataitem.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/internals/loadnotes.h"
#include "aldermoor/vexdoc/internals/nodeholder.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {

/// Builds a new document from the DOM of one in the current dialect.
///
/// The Visit operation of an element's class reads its content from the current node.  Condition
/// blocks come first and go to the ConditionManager, and links are translated from the IDs of the
/// file to those of the manager.
/// Throws: VexException, VexParseException, ResourceNotAvailableException, InvalidArgumentException
/// and NullPointerException for content that breaks the rules of the format.
class XMLLoader : public ElementVisitor {
 public:
  /// `document` stands on the DOM document node.
  explicit XMLLoader(NodeHolder document);

  /// Without it, the rules are those of a plain load.
  void SetRules(const LoadRules& rules) { rules_ = rules; }
  Utilities::Tools::SmartPointer<VEX> Load();
  /// What the load noticed.
  const LoadNotes& GetNotes() const { return notes_; }

  void VisitVex(VEX& vex) override;
  void VisitSampleSet(SampleSet& set) override;
  void VisitSample(Sample& sample) override;
  void VisitSpectrum(Spectrum& spectrum) override;
  void VisitColorVector(ColorVector& vector) override;
  void VisitRecipe(Recipe& recipe) override;
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override;

 protected:
  /// "Name" is optional for sample attributes only.
  virtual void HeaderParser(NodeHolder& holder, Header& header, bool isSampleAttribute);
  virtual void ConditionParser(NodeHolder& block);
  virtual void LoadMembers(UnknownSampleAttribute& attribute);
  virtual void LoadMembers(Recipe& recipe);
  virtual void LoadMembers(ColorVector& vector);
  virtual void LoadMembers(Spectrum& spectrum);

  /// The values of the "Value" children in ascending order of wavelength, and those; of equal
  /// wavelengths the first counts.
  Ruler SpectrumVectorParser(NodeHolder& holder, const Conditions& conditions,
                             std::vector<float>& out);
  Utilities::Tools::SmartPointer<DataTree> VEXDataTreeParser(const NodeHolder& holder);

  /// The values of `spectrum`, which is the current node, however many there are.
  std::vector<float> ReadSpectrumValues(const Spectrum& spectrum);
  /// Label and value of the "Value" children of the current node, in the order of the file.
  std::vector<std::pair<std::string, float>> ReadChannels() const;

 private:
  template <class Node>
  void LoadVexNode(Node& node, const XMLCh* childName);
  template <class Attribute>
  void LoadSampleAttribute(Attribute& attribute);

  LoadRules rules_;
  LoadNotes notes_;
  // From the IDs of the file.  To the blocks themselves: what an application has assigned to a
  // block may have given it another ID than that under which the manager keeps it.
  std::map<std::string, Utilities::Tools::SmartPointer<Conditions>> condition_links_;
  NodeHolder current_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XMLLOADER_H
