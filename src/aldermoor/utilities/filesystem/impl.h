#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_IMPL_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_IMPL_H

#include <string>
#include <vector>

#include "aldermoor/utilities/filesystem/directory.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/utilities/tools/datetime.h"

namespace Aldermoor::Utilities::FileSystem {

/// What a platform provides for a File; the operations are those of File.
class File::Impl {
 public:
  Impl() = default;
  Impl(const Impl&) = delete;
  Impl& operator=(const Impl&) = delete;
  virtual ~Impl() = default;

  virtual std::string GetName() const = 0;
  virtual std::string GetAbsoluteName() const = 0;
  virtual std::string GetAbsolutePlatformName() const = 0;
  virtual Directory GetDirectory() const = 0;
  virtual long GetSize() const = 0;
  virtual Tools::DateTime GetModificationDate() const = 0;
  virtual bool IsAccessable(bool forWriting) const = 0;
  virtual bool IsOfType(const std::string& extension) const = 0;
  virtual bool Remove() const = 0;
  virtual void ApplyMacTypeCreator() = 0;
};

/// What a platform provides for a Directory; the operations are those of Directory.
class Directory::Impl {
 public:
  Impl() = default;
  Impl(const Impl&) = delete;
  Impl& operator=(const Impl&) = delete;
  virtual ~Impl() = default;

  virtual std::string GetName() const = 0;
  virtual std::string GetAbsoluteName() const = 0;
  virtual Directory GetParent() const = 0;
  virtual void CreateSubdir(const std::string& name) = 0;
  virtual std::vector<Directory> GetSubdirs(const std::string& pattern) const = 0;
  virtual std::vector<File> GetFiles(const std::string& pattern) const = 0;
};

}  // namespace Aldermoor::Utilities::FileSystem

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_IMPL_H
