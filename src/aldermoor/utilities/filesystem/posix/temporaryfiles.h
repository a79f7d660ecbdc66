#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_TEMPORARYFILES_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_TEMPORARYFILES_H

#include <string>

namespace Aldermoor::Platform::Posix {

/// ".aldermoor-PID-NUMBER.tmp": not the name of a document, and of another process or another save
/// only by an abandoned file.
std::string MakeTemporaryName();

/// Removes what saves have left in `directory` whose process was ended: regular files of such a
/// name that were last written more than an hour ago, and of whose process there is nothing any
/// more.  Failures are no matter.
void RemoveAbandonedFiles(const std::string& directory) noexcept;

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_TEMPORARYFILES_H
