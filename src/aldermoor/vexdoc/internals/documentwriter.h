#ifndef ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTWRITER_H
#define ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTWRITER_H

#include <iosfwd>
#include <memory>

#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/dom/DOMErrorHandler.hpp>
#include <xercesc/dom/DOMImplementation.hpp>

namespace Aldermoor::Vexdoc::Internals {

/// Ends the serialisation at the first error.
class DOMPrintErrorHandler : public xercesc::DOMErrorHandler {
 public:
  ~DOMPrintErrorHandler() override = default;
  bool handleError(const xercesc::DOMError& error) override;
};

/// An empty DOM document and what writes it.
class DocumentWriter {
 public:
  DocumentWriter();

  xercesc::DOMDocument& GetDocument() const { return *document_; }
  /// Writes the document in UTF-8, indented.  With `is_mixed`, no blanks are put between text and
  /// the element behind it, where they would belong to the text.
  /// Throws: DOMException, XMLException and VexException if it cannot be written.
  void Write(std::ostream& out, bool is_mixed) const;

 private:
  struct Release {
    template <class T>
    void operator()(T* object) const {
      object->release();
    }
  };
  template <class T>
  using Owner = std::unique_ptr<T, Release>;

  xercesc::DOMImplementation* implementation_;  // lives as long as the platform
  Owner<xercesc::DOMDocument> document_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_DOCUMENTWRITER_H
