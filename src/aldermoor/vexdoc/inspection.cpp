#include "aldermoor/vexdoc/inspection.h"

#include <array>
#include <istream>
#include <string_view>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/filecontent.h"
#include "aldermoor/vexdoc/internals/cachedump.h"
#include "aldermoor/vexdoc/internals/cachewalker.h"
#include "aldermoor/vexdoc/internals/documentchecker.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/internals/xmlchecker.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc {

using Utilities::FileSystem::File;

namespace {

using Bytes = std::vector<char>;

Bytes ReadAll(std::istream& in) {
  Bytes bytes;
  std::array<char, 65536> chunk;
  do {
    in.read(chunk.data(), chunk.size());
    bytes.insert(bytes.end(), chunk.data(), chunk.data() + in.gcount());
  } while (in);
  return bytes;
}

Bytes ReadAll(const File& file) {
  return Platform::Posix::ReadFileContent(file.GetAbsolutePlatformName());
}

std::string MessageOf(const std::vector<DocumentFault>& faults) {
  std::string text = "The document cannot be saved as it is: " + faults.front().GetText();
  if (faults.size() > 1) {
    text += " (the first of " + std::to_string(faults.size()) + " faults)";
  }
  return text;
}

std::string_view View(const Bytes& bytes) {
  return {bytes.data(), bytes.size()};
}

}  // namespace

std::vector<Fault> CheckXML(const File& file) try {
  return Internals::XMLChecker().Check(View(ReadAll(file)));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::CheckXML)

std::vector<Fault> CheckXML(std::istream& in) try {
  return Internals::XMLChecker().Check(View(ReadAll(in)));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::CheckXML)

std::vector<Fault> CheckCache(const File& file) try {
  const Bytes bytes = ReadAll(file);
  return Internals::CacheWalker(View(bytes)).Walk();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::CheckCache)

std::vector<Fault> CheckCache(std::istream& in) try {
  const Bytes bytes = ReadAll(in);
  return Internals::CacheWalker(View(bytes)).Walk();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::CheckCache)

bool DumpCache(std::istream& in, std::ostream& out) try {
  const Bytes bytes = ReadAll(in);
  return Internals::CacheDump(View(bytes), out).Write();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::DumpCache)

std::string DocumentFault::GetText() const try {
  return Internals::PlaceText(set, sample, attribute) + reason;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::DocumentFault::GetText)

std::vector<DocumentFault> CheckDocument(const VEX& document) try {
  return Internals::DocumentChecker().Check(document);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::CheckDocument)

UnsavableDocumentException::UnsavableDocumentException(const std::vector<DocumentFault>& faults,
                                                       const std::string& location)
    : VexException(MessageOf(faults), location), faults_(faults) {}

void SaveCheckedXML(const VEX& document, File& file, bool updateCache) try {
  const std::vector<DocumentFault> faults = CheckDocument(document);
  if (!faults.empty()) {
    throw UnsavableDocumentException(faults, ALDERMOOR_HERE(Aldermoor::Vexdoc::SaveCheckedXML));
  }
  document.SaveXML(file, updateCache);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SaveCheckedXML)

}  // namespace Aldermoor::Vexdoc
