#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_DIRECTORY_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_DIRECTORY_H

#include <string>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Utilities::FileSystem {

class File;

/// A handle on an existing directory.  Copies share one implementation object.
class ALDERMOOR_EXPORT Directory {
 public:
  class Impl;

  enum DirectoryType {
    Current = 0,      ///< the working directory of the process
    Application = 1,  ///< the directory of the program file of the process
    System = 2,       ///< the directory of the operating system, "/"
    Named = 3,        ///< the path given to the constructor
    Drives = 4        ///< no directory on disk: the roots, of which there is one, "/"
  };

  /// `path` is used for `Named` only.
  /// Throws: ResourceNotAvailableException if `Named` and `path` is no existing directory.
  explicit Directory(DirectoryType type, const std::string& path = "");
  Directory(const Directory&);
  Directory& operator=(const Directory&);
  virtual ~Directory();

  /// The last component of the path.
  std::string GetName() const;
  /// The whole path with "/" as separator, without one at the end.
  std::string GetAbsoluteName() const;
  /// The directory that contains this one; a path without "/" is its own parent.
  Directory GetParent() const;
  /// Makes the directory `name`, relative to this one, with all levels of it that are missing.
  /// Throws: InvalidArgumentException for an empty or absolute name,
  /// ResourceNotAvailableException for a level that cannot be made.
  void CreateSubdir(const std::string& name);
  /// The subdirectories that match `pattern` (the shell's rules: "*", "?", "[...]"), in byte order
  /// of their names.
  std::vector<Directory> GetSubdirs(const std::string& pattern) const;
  /// The same for everything else in the directory.
  std::vector<File> GetFiles(const std::string& pattern) const;

 private:
  Tools::SmartPointer<Impl> impl_;
};

}  // namespace Aldermoor::Utilities::FileSystem

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_DIRECTORY_H
