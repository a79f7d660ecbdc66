#ifndef ALDERMOOR_VEXDOC_INTERNALS_XMLPARSERADAPTER_H
#define ALDERMOOR_VEXDOC_INTERNALS_XMLPARSERADAPTER_H

#include <iosfwd>

#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/utilities/filesystem/posix/filereplacement.h"
#include "aldermoor/vexdoc/internals/cachestamp.h"

namespace Aldermoor::Vexdoc::Internals {

/// Fills the document that it serves from XML, or writes it; lives for one call.
class XMLParserAdapter {
 public:
  XMLParserAdapter() = default;
  XMLParserAdapter(const XMLParserAdapter&) = delete;
  XMLParserAdapter& operator=(const XMLParserAdapter&) = delete;
  virtual ~XMLParserAdapter() = default;

  virtual void Load(std::istream& in) = 0;
  /// Returns what was read.
  virtual XmlReading Load(Utilities::FileSystem::File& file) = 0;
  virtual void Store(std::ostream& out) = 0;
  /// Returns the mark of the bytes written, whoever has replaced them since.
  virtual Platform::Posix::ContentMark Store(Utilities::FileSystem::File& file) = 0;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XMLPARSERADAPTER_H
