#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DIRECTORYIMPL_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DIRECTORYIMPL_H

#include <string>
#include <vector>

#include "aldermoor/utilities/filesystem/impl.h"

namespace Aldermoor::Platform::Posix {

/// A directory by its path, on POSIX systems.
class DirectoryImpl : public Utilities::FileSystem::Directory::Impl {
 public:
  DirectoryImpl(Utilities::FileSystem::Directory::DirectoryType type, const std::string& path);

  std::string GetName() const override;
  std::string GetAbsoluteName() const override;
  Utilities::FileSystem::Directory GetParent() const override;
  void CreateSubdir(const std::string& name) override;
  std::vector<Utilities::FileSystem::Directory> GetSubdirs(
      const std::string& pattern) const override;
  std::vector<Utilities::FileSystem::File> GetFiles(const std::string& pattern) const override;

 private:
  // Paths of the entries that match, in byte order; directories, or everything else.
  std::vector<std::string> ListEntries(const std::string& pattern, bool directories) const;

  std::string path_;  // platform form, without a separator at the end but for the root
  Utilities::FileSystem::Directory::DirectoryType type_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DIRECTORYIMPL_H
