#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILECONTENT_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILECONTENT_H

#include <string>
#include <vector>

#include <sys/stat.h>

namespace Aldermoor::Platform::Posix {

/// What a file holds, with the status that the very same file had before its bytes were read.
struct FileContent {
  std::vector<char> bytes;
  struct stat status {};
};

/// The file at `path`; of a pipe, what comes until its other end is closed.
/// Throws: ResourceNotAvailableException with the name and the system's reason.
FileContent ReadFileContent(const std::string& path);

/// What an open file still holds; `path` is for messages.
/// Throws: ResourceNotAvailableException with the name and the system's reason.
std::vector<char> ReadAll(int descriptor, const struct stat& status, const std::string& path);

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILECONTENT_H
