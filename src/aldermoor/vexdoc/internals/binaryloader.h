#ifndef ALDERMOOR_VEXDOC_INTERNALS_BINARYLOADER_H
#define ALDERMOOR_VEXDOC_INTERNALS_BINARYLOADER_H

#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/dataitem.h"
#include "aldermoor/vexdoc/elementvisitor.h"
#include "aldermoor/vexdoc/internals/loadnotes.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {

/// Builds a new document from the binary format of the cache.
///
/// The file is read strictly forward.  Attributes know their conditions by the ID of the file only
/// until the condition table at its end was read; then all are given the shared block, and colours
/// their channels.
/// Throws: VexException for another version of the format and for data trees that nest too deep;
/// ResourceNotAvailableException at the end of the file and for a link to an ID that the table
/// lacks; what the constructors of the attributes throw.
class BinaryLoader : public ElementVisitor {
 public:
  /// Reads `in` to its end at once.  Nothing is read from one without positions, such as a pipe.
  explicit BinaryLoader(std::istream& in);
  /// `bytes` must outlive this object.
  explicit BinaryLoader(std::string_view bytes, const LoadRules& rules = {});
  ~BinaryLoader() override;

  Utilities::Tools::SmartPointer<VEX> Load();

  void VisitVex(VEX& vex) override;
  void VisitSampleSet(SampleSet& set) override;
  void VisitSample(Sample& sample) override;
  void VisitSpectrum(Spectrum& spectrum) override;
  void VisitColorVector(ColorVector& vector) override;
  void VisitRecipe(Recipe& recipe) override;
  void VisitUnknownSampleAttribute(UnknownSampleAttribute& attribute) override;

 protected:
  virtual void LoadHeader(Header& header);
  virtual void LoadConditions();
  virtual void LoadDataTree(DataTree& tree);
  virtual std::uint32_t ReadNumber();
  virtual std::string ReadString();
  virtual float ReadFloat();

 private:
  using Channels = std::vector<std::pair<std::string, float>>;

  template <class Node>
  void LoadVexNode(Node& node);
  template <class Attribute>
  void LoadSampleAttribute(Attribute& attribute);

  void LoadMembers(Spectrum& spectrum);
  void LoadMembers(ColorVector& vector);
  void LoadMembers(Recipe& recipe);
  void LoadMembers(UnknownSampleAttribute& attribute);
  void LoadVector(std::vector<float>& target);
  void LoadCustomIllumination(Conditions& conditions);
  void RelinkConditions(VEX& vex);

  // Takes `count` bytes from the front of what is left; null if there are fewer.
  const char* Take(std::size_t count);

  LoadRules rules_;
  // From the IDs of the file, to the blocks themselves as in XMLLoader.
  std::map<std::string, Utilities::Tools::SmartPointer<Conditions>> condition_links_;
  std::string owned_;            // of a stream
  std::string_view bytes_left_;  // of the file
  unsigned int tree_depth_ = 0;
  // Colours in the order of the file, whose constructor needs the real conditions.
  std::vector<std::pair<ColorVector*, Channels>> pending_colors_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_BINARYLOADER_H
