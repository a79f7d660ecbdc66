#ifndef ALDERMOOR_VEXDOC_INTERNALS_BINARYDUMPER_H
#define ALDERMOOR_VEXDOC_INTERNALS_BINARYDUMPER_H

#include <iosfwd>
#include <map>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/dataitem.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/internals/conditiontable.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {

/// Writes a document in the binary format of the cache.
///
/// Serves one document.  Every element that is visited writes its record and lets its children
/// follow.  Derived attributes have none.  The conditions of the attributes written come last, in
/// the order of the IDs' texts. Throws: NullPointerException for an attribute without conditions;
/// LengthException for a text or a count that does not fit into 32 bits.  Failures of the stream
/// are left to its owner.
class BinaryDumper : public ElementVisitor {
 public:
  /// `out` is kept by reference.
  explicit BinaryDumper(std::ostream& out);

  void VisitVex(VEX& vex) override;
  void VisitSampleSet(SampleSet& set) override;
  void VisitSample(Sample& sample) override;
  void VisitSpectrum(Spectrum& spectrum) override;
  void VisitColorVector(ColorVector& vector) override;
  void VisitRecipe(Recipe& recipe) override;
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override;

 private:
  // A count of -1 stands for the number of all children.
  template <class Node>
  void DumpVexNode(Node& node, long count);
  template <class Attribute>
  void DumpSampleAttribute(Attribute& attribute);
  void DumpHeader(Header& header);
  void DumpConditions();
  void DumpDataTree(const DataTree& tree);

  void DumpMembers(const Spectrum& spectrum);
  void DumpMembers(const ColorVector& vector);
  void DumpMembers(const Recipe& recipe);
  void DumpMembers(const UnknownSampleAttribute& attribute);

  void Write(const std::string& text);
  void Write(unsigned long number);
  void Write(float value);
  void Write(const std::map<std::string, std::string>& map);
  void Write(const std::vector<float>& values);
  void Put(const char* bytes, std::size_t count);

  ConditionTable conditions_;
  std::ostream& out_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_BINARYDUMPER_H
