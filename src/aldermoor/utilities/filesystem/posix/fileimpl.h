#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEIMPL_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEIMPL_H

#include <string>

#include "aldermoor/utilities/filesystem/impl.h"

namespace Aldermoor::Platform::Posix {

/// A file by its path, on POSIX systems.
class FileImpl : public Utilities::FileSystem::File::Impl {
 public:
  explicit FileImpl(const std::string& name);

  std::string GetName() const override;
  std::string GetAbsoluteName() const override;
  std::string GetAbsolutePlatformName() const override;
  Utilities::FileSystem::Directory GetDirectory() const override;
  long GetSize() const override;
  Utilities::Tools::DateTime GetModificationDate() const override;
  bool IsAccessable(bool forWriting) const override;
  bool IsOfType(const std::string& extension) const override;
  bool Remove() const override;
  void ApplyMacTypeCreator() override;

 private:
  std::string path_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEIMPL_H
