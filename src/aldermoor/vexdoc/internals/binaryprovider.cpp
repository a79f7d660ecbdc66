#include "aldermoor/vexdoc/internals/binaryprovider.h"

#include <filesystem>
#include <fstream>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/filereplacement.h"
#include "aldermoor/vexdoc/internals/binarydumper.h"
#include "aldermoor/vexdoc/internals/binaryloader.h"
#include "aldermoor/vexdoc/internals/documentaccess.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

using Utilities::FileSystem::File;

BinaryProvider::BinaryProvider(VEX* document) : document_(document) {}

void BinaryProvider::Read(File& file) try {
  const std::string path = file.GetAbsolutePlatformName();
  // To open a pipe would wait for its other end.
  if (!file.IsAccessable(false) || !std::filesystem::is_regular_file(path)) {
    throw VexException(file.GetAbsoluteName() + " is not read accessable",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::BinaryProvider::Read));
  }
  std::ifstream in(path, std::ios::binary);
  const auto loaded = BinaryLoader(in).Load();
  DocumentAccess::Swap(*document_, *loaded);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryProvider::Read)

void BinaryProvider::Write(File& file) try {
  Platform::Posix::FileReplacement replacement(file.GetAbsolutePlatformName());
  BinaryDumper dumper(replacement.GetStream());
  document_->AcceptVisitor(dumper);
  replacement.Commit();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::BinaryProvider::Write)

}  // namespace Aldermoor::Vexdoc::Internals
