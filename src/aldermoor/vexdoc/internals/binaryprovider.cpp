#include "aldermoor/vexdoc/internals/binaryprovider.h"

#include <vector>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/regularfile.h"
#include "aldermoor/vexdoc/internals/binarydumper.h"
#include "aldermoor/vexdoc/internals/binaryloader.h"
#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using Platform::Posix::ContentMark;
using Platform::Posix::FileReplacement;
using Platform::Posix::RegularFile;
using Utilities::FileSystem::File;

BinaryProvider::BinaryProvider(VEX* document) : document_(document) {}

void BinaryProvider::Read(File& file) try {
  // To open a pipe would wait for its other end.
  const RegularFile opened(file.GetAbsolutePlatformName(), RegularFile::Link::kFollow);
  if (!opened.IsOpen()) {
    throw VexException(file.GetAbsoluteName() + " is not read accessable",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::BinaryProvider::Read));
  }
  const std::vector<char> bytes = opened.Read();
  Read({bytes.data(), bytes.size()}, LoadRules());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryProvider::Read)

void BinaryProvider::Read(std::string_view bytes, const LoadRules& rules) try {
  const auto loaded = BinaryLoader(bytes, rules).Load();
  DocumentAccess::Swap(*document_, *loaded);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryProvider::Read)

void BinaryProvider::Write(File& file) try {
  FileReplacement replacement(file.GetAbsolutePlatformName());
  WriteTo(replacement);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryProvider::Write)

ContentMark BinaryProvider::Write(File& file, const struct stat& owner) try {
  FileReplacement replacement(file.GetAbsolutePlatformName(), owner, FileReplacement::Flush::kYes);
  return WriteTo(replacement);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryProvider::Write)

ContentMark BinaryProvider::WriteTo(FileReplacement& replacement) {
  BinaryDumper dumper(replacement.GetStream());
  document_->AcceptVisitor(dumper);
  return replacement.Commit();
}

}  // namespace Aldermoor::Vexdoc::Internals
