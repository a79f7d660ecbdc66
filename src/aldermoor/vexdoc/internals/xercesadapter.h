#ifndef ALDERMOOR_VEXDOC_INTERNALS_XERCESADAPTER_H
#define ALDERMOOR_VEXDOC_INTERNALS_XERCESADAPTER_H

#include <string>
#include <vector>

#include <xercesc/util/XercesDefs.hpp>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/internals/xmlloader.h"
#include "aldermoor/vexdoc/internals/xmlparseradapter.h"
#include "aldermoor/vexdoc/vex.h"

XERCES_CPP_NAMESPACE_BEGIN
class DOMDocument;
XERCES_CPP_NAMESPACE_END

namespace Aldermoor::Vexdoc::Internals {

/// The adapter on Xerces-C++.  A load builds a new document, and only a finished one replaces the
/// content of the document served.
///
/// A text that fails is parsed a second time without validation, so that a file loads whatever the
/// DTD that it names says; external DTDs and entities are never opened.
class XercesAdapter : public XMLParserAdapter {
 public:
  /// `document` is not owned.
  explicit XercesAdapter(VEX* document);

  /// Throws: VexException with the failure's text.
  void Load(std::istream& in) override;
  /// Throws: ResourceNotAvailableException for a file that cannot be read; else what the parse and
  /// the loader throw.
  XmlReading Load(Utilities::FileSystem::File& file) override;

  /// Writes the document in the current dialect, in UTF-8.
  /// Throws: VexException with the failure's text.
  void Store(std::ostream& out) override;
  /// The same to a file, which is replaced as a whole.  The locale of the process is changed for
  /// the time of the call.
  /// Throws: ResourceNotAvailableException for a file that cannot be written.
  Platform::Posix::ContentMark Store(Utilities::FileSystem::File& file) override;

  /// Makes loads follow `options` and fill `report`; both outlive this object.  They throw
  /// WavelengthException then, and give no dates that the text does not hold.
  void SetOptions(const LoadOptions& options, LoadReport& report);
  /// Whether the document of the last load said what its text says, before it was completed; see
  /// LoadNotes.
  bool WasExact() const { return was_exact_; }

  /// The loader for the dialect of a parsed document, which its root's "Version" tells.
  static Utilities::Tools::SmartPointer<XMLLoader> GetLoader(xercesc::DOMDocument* document);

 private:
  // From memory; failures name the source by `name`.
  void LoadFrom(const std::vector<char>& bytes, const std::string& name);

  VEX* document_;
  const LoadOptions* options_ = nullptr;
  LoadReport* report_ = nullptr;
  bool was_exact_ = false;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XERCESADAPTER_H
