#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_PATH_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_PATH_H

#include <string>

namespace Aldermoor::Utilities::FileSystem {

/// The portable form of a path: "/" for every separator.
std::string ToPortable(const std::string& path);

/// The form of a path that the operating system takes; "/" is the separator here too.
std::string ToPlatform(const std::string& path);

/// The last component of a portable path; empty if it has none.
std::string LastComponent(const std::string& path);

/// A portable path up to its last "/" and without it; "/" for an entry of the root.  A path
/// without "/" is its own parent.
std::string ParentPath(const std::string& path);

/// `directory`, "/" and `name`, with one "/" between them also for the root.
std::string JoinPath(const std::string& directory, const std::string& name);

/// Whether `path` starts with a separator, or with a drive letter and ":".
bool IsAbsolutePath(const std::string& path);

}  // namespace Aldermoor::Utilities::FileSystem

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_PATH_H
