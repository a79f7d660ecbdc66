#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILECONTENT_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILECONTENT_H

#include <string>
#include <vector>

namespace Aldermoor::Platform::Posix {

/// All bytes of the file at `path`; of a pipe, what comes until its other end is closed.
/// Throws: ResourceNotAvailableException with the name and the system's reason.
std::vector<char> ReadFileContent(const std::string& path);

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILECONTENT_H
