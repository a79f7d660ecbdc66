#include "aldermoor/vexdoc/inspection.h"

#include <array>
#include <istream>
#include <string_view>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/filecontent.h"
#include "aldermoor/vexdoc/internals/cachedump.h"
#include "aldermoor/vexdoc/internals/cachewalker.h"
#include "aldermoor/vexdoc/internals/xmlchecker.h"

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

}  // namespace Aldermoor::Vexdoc
