#include "aldermoor/vexdoc/internals/xercesadapter.h"

#include <array>
#include <istream>
#include <new>
#include <vector>

#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/dom/DOMException.hpp>
#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/PlatformUtils.hpp>
#include <xercesc/util/XMLException.hpp>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/filecontent.h"
#include "aldermoor/utilities/filesystem/posix/filereplacement.h"
#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/internals/documentparser.h"
#include "aldermoor/vexdoc/internals/documentwriter.h"
#include "aldermoor/vexdoc/internals/legacyloader.h"
#include "aldermoor/vexdoc/internals/localeguard.h"
#include "aldermoor/vexdoc/internals/parsebudget.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/internals/xmlcomposer.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::FileSystem::File;
using Utilities::Tools::SmartPointer;
using xercesc::XMLException;
using xercesc::XMLPlatformUtils;

namespace {

constexpr const char* kStreamName = "VEX";

constexpr const char* kInternalFailure =
    "An internal XML exception has occured while initializing XML:\n%REASON%";
constexpr const char* kLoadingFailure =
    "An internal XML exception has occurred while loading XML:\n'%REASON%'";

[[noreturn]] void FailInternally(const char* pattern, const std::string& reason) {
  throw VexException(Filled(pattern, "%REASON%", reason),
                     ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XercesAdapter));
}

[[noreturn]] void FailInternally(const char* pattern, const XMLCh* reason) {
  FailInternally(pattern, ToNativeString(reason));
}

std::string StreamFailure(const VexException& e) {
  return Filled("An error occurred during parsing a Stream:\n%REASON%", "%REASON%", e.what());
}

std::vector<char> ReadAll(std::istream& in) {
  in.unsetf(std::ios_base::skipws);
  std::vector<char> bytes;
  std::array<char, 65536> chunk;
  do {
    in.read(chunk.data(), static_cast<std::streamsize>(chunk.size()));
    bytes.insert(bytes.end(), chunk.data(), chunk.data() + in.gcount());
  } while (in);
  if (in.bad()) {
    throw ResourceNotAvailableException(
        "stream cannot be read", ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XercesAdapter::Load));
  }
  return bytes;
}

}  // namespace

XercesAdapter::XercesAdapter(VEX* document) : document_(document) {}

void XercesAdapter::Load(std::istream& in) try {
  RequireXMLPlatform();
  try {
    LoadFrom(ReadAll(in), kStreamName);
  } catch (const XMLException& e) {
    FailInternally(kInternalFailure, e.getMessage());
  } catch (const xercesc::DOMException& e) {
    FailInternally(kInternalFailure, e.getMessage());
  } catch (const WavelengthException&) {
    throw;
  } catch (const VexXMLParseException& e) {
    // Still a VexException to who asks for one, but with the place of the fault.
    throw VexXMLParseException(StreamFailure(e), e.GetFile(), e.GetLine(), e.GetColumn(),
                               ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XercesAdapter::Load));
  } catch (const VexException& e) {
    throw VexException(StreamFailure(e),
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XercesAdapter::Load));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XercesAdapter::Load)

XmlReading XercesAdapter::Load(File& file) try {
  RequireXMLPlatform();
  const std::string path = file.GetAbsolutePlatformName();
  if (!file.IsAccessable(false)) {
    throw ResourceNotAvailableException(
        "file '" + path + "' not accessable ",
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XercesAdapter::Load));
  }
  try {
    // Not by the parser: a pipe gives its bytes once, and a second parse may want them again; and
    // the parser does not close a file when memory runs out in between.
    const std::int64_t now = XmlReading::Now();
    const Platform::Posix::FileContent content = Platform::Posix::ReadFileContent(path);
    LoadFrom(content.bytes, path);
    return XmlReading(now, content.status, {content.bytes.data(), content.bytes.size()});
  } catch (const XMLException& e) {
    FailInternally(kLoadingFailure, e.getMessage());
  } catch (const xercesc::DOMException& e) {  // for an XML version that the parser knows half
    FailInternally(kLoadingFailure, e.getMessage());
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XercesAdapter::Load)

void XercesAdapter::Store(std::ostream& out) try {
  RequireXMLPlatform();
  try {
    const DocumentWriter writer;
    XMLComposer composer(writer.GetDocument());
    document_->AcceptVisitor(composer);
    writer.GetDocument().appendChild(composer.GetCurrentNode());
    writer.Write(out, composer.HasMixedContent());
  } catch (const XMLException& e) {
    FailInternally(kInternalFailure, e.getMessage());
  } catch (const xercesc::DOMException& e) {
    FailInternally(kInternalFailure, e.getMessage());
  } catch (const xercesc::OutOfMemoryException&) {
    throw std::bad_alloc();
  } catch (const XMLFailure& e) {
    FailInternally(kInternalFailure, e.what());
  } catch (const VexException& e) {
    throw VexException(
        Filled("An error occurred during composing a VEXStream:\n%REASON%", "%REASON%", e.what()),
        ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XercesAdapter::Store));
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XercesAdapter::Store)

Platform::Posix::ContentMark XercesAdapter::Store(File& file) try {
  const LocaleGuard guard(".ACP");
  Platform::Posix::FileReplacement replacement(file.GetAbsolutePlatformName());
  Store(replacement.GetStream());
  return replacement.Commit();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XercesAdapter::Store)

SmartPointer<XMLLoader> XercesAdapter::GetLoader(xercesc::DOMDocument* document) try {
  const NodeHolder holder(document);
  std::string name = "Version";
  std::string version;
  holder.FindChild("VEX", true).GetAttribute(name, version);
  return SmartPointer<XMLLoader>(version.empty() ? new LegacyLoader(holder)
                                                 : new XMLLoader(holder));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XercesAdapter::GetLoader)

void XercesAdapter::SetOptions(const LoadOptions& options, LoadReport& report) {
  options_ = &options;
  report_ = &report;
}

void XercesAdapter::LoadFrom(const std::vector<char>& bytes, const std::string& name) {
  const xercesc::MemBufInputSource source(reinterpret_cast<const XMLByte*>(bytes.data()),
                                          bytes.size(), XMLChBuffer(name).Get(), false,
                                          XMLPlatformUtils::fgMemoryManager);
  ParseBudget budget(bytes.size());
  DocumentParser parser(budget);
  try {
    try {
      parser.parse(source);
    } catch (const VexException&) {
      parser.resetDocumentPool();
      parser.setValidationScheme(xercesc::XercesDOMParser::Val_Never);
      parser.parse(source);
    }
  } catch (const xercesc::OutOfMemoryException&) {
    if (!budget.IsExceeded()) {
      throw std::bad_alloc();
    }
    throw VexParseException("The document takes more memory than the " +
                                std::to_string(budget.GetLimit()) + " bytes that a text of " +
                                std::to_string(bytes.size()) + " bytes may take",
                            ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XercesAdapter::Load));
  }
  const SmartPointer<XMLLoader> loader = GetLoader(parser.getDocument());
  if (options_ != nullptr) {
    loader->SetRules({.gives_dates = false,
                      .takes_any_count = options_->wavelengths == WavelengthUse::kComplete});
  }
  const SmartPointer<VEX> loaded = loader->Load();
  was_exact_ = loader->GetNotes().IsExact(*loaded);
  if (options_ != nullptr) {
    loader->GetNotes().Settle(*loaded, *options_, *report_);
  }
  DocumentAccess::Swap(*document_, *loaded);
}

}  // namespace Aldermoor::Vexdoc::Internals
