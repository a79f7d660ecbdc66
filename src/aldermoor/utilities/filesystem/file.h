#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_FILE_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_FILE_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/filesystem/directory.h"
#include "aldermoor/utilities/tools/datetime.h"
#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Utilities::FileSystem {

/// A handle on the name of a file, which need not exist.
///
/// A relative name is taken against the current directory once, at construction.  "\" in a name
/// is read as a separator, like "/".  Copies share one implementation object.
class ALDERMOOR_EXPORT File {
 public:
  class Impl;

  /// The last two arguments are type and creator codes of platforms that have them; ignored here.
  /// Throws: InvalidArgumentException for an empty name.
  explicit File(const std::string& name, unsigned long macType = 0, unsigned long macCreator = 0);
  File(const File&);
  File& operator=(const File&);
  virtual ~File();

  /// The last component of the name.
  virtual std::string GetName() const;
  /// The whole path with "/" as separator.
  virtual std::string GetAbsoluteName() const;
  /// The whole path in the form that the operating system takes.
  virtual std::string GetAbsolutePlatformName() const;
  /// Throws: ResourceNotAvailableException if the directory does not exist.
  virtual Directory GetDirectory() const;
  /// In bytes.  Throws: RuntimeException if the file cannot be opened for reading.
  virtual long GetSize() const;
  /// Time of the last write; the current time if the file cannot be read.
  virtual Tools::DateTime GetModificationDate() const;
  /// Whether the existing file can be opened, for reading or for reading and writing.
  virtual bool IsAccessable(bool forWriting) const;
  /// Whether the name ends in `extension`, which includes the dot; case does not count.  A name
  /// whose only dot is its first character has no extension.
  virtual bool IsOfType(const std::string& extension) const;
  /// Deletes the file.  Returns whether that succeeded.
  virtual bool Remove() const;
  /// Does nothing on this platform.
  virtual void ApplyMacTypeCreator();

 private:
  Tools::SmartPointer<Impl> impl_;
};

}  // namespace Aldermoor::Utilities::FileSystem

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_FILE_H
