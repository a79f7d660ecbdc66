#include "aldermoor/vexdoc/inspection.h"

#include <array>
#include <cstdio>
#include <filesystem>
#include <istream>
#include <string_view>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/filecontent.h"
#include "aldermoor/utilities/filesystem/posix/regularfile.h"
#include "aldermoor/vexdoc/internals/cachedump.h"
#include "aldermoor/vexdoc/internals/cachewalker.h"
#include "aldermoor/vexdoc/internals/documentchecker.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/internals/xmlcache.h"
#include "aldermoor/vexdoc/internals/xmlchecker.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc {

using Platform::Posix::RegularFile;
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
  return Platform::Posix::ReadFileContent(file.GetAbsolutePlatformName()).bytes;
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

// "broken at 0x00000027: ...", or nothing.
std::string FirstError(std::string_view cache) {
  for (const Fault& fault : Internals::CacheWalker(cache).Walk()) {
    if (fault.severity == Fault::Severity::kError) {
      constexpr std::size_t kLongest = 64;
      std::array<char, kLongest> place{};
      std::snprintf(place.data(), place.size(), "broken at 0x%08llx: ", fault.offset);
      return place.data() + fault.text;
    }
  }
  return "";
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

CacheState StateOfCache(const File& xml) try {
  Internals::XmlCache cache(xml);
  const std::string path = cache.GetFile().GetAbsolutePlatformName();
  CacheState state;
  state.path = cache.GetFile().GetAbsoluteName();
  try {
    state.reason = cache.Find(Internals::XmlCache::Need::kExact).reason;
    const RegularFile file(path, RegularFile::Link::kRefuse);
    const RegularFile document(xml.GetAbsolutePlatformName(), RegularFile::Link::kFollow);
    // Of what is not used anyway, damage is the reason that helps most.
    const bool is_worth_reading =
        file.IsOpen() && document.IsOpen() && !Internals::XmlCache::IsTooLong(file, document);
    const std::string fault = is_worth_reading ? FirstError(View(file.Read())) : "";
    state.reason = fault.empty() ? state.reason : fault;
  } catch (const Utilities::Exceptions::ResourceNotAvailableException& e) {
    state.reason = e.what();
  }
  state.exists = std::filesystem::exists(std::filesystem::symlink_status(path));
  state.is_used = state.reason.empty();
  return state;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::StateOfCache)

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
