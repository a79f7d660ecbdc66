#include "aldermoor/utilities/filesystem/posix/directoryimpl.h"

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <stdexcept>
#include <system_error>

#include <fnmatch.h>
#include <sys/stat.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/path.h"
#include "aldermoor/utilities/tools/stringtokenizer.h"

namespace Aldermoor::Platform::Posix {

using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::FileSystem::Directory;
using Utilities::FileSystem::File;
namespace FileSystem = Utilities::FileSystem;

namespace {

constexpr const char* kRoot = "/";

bool IsDirectory(const std::string& path) {
  struct stat status {};
  return ::stat(path.c_str(), &status) == 0 && S_ISDIR(status.st_mode);
}

std::string PathOf(Directory::DirectoryType type, const std::string& path) {
  switch (type) {
    case Directory::Current:
      return std::filesystem::current_path().string();
    case Directory::Application:
      return std::filesystem::read_symlink("/proc/self/exe").parent_path().string();
    case Directory::Named: {
      std::string named = FileSystem::ToPlatform(path);
      if (!IsDirectory(named)) {
        throw ResourceNotAvailableException("Error: Directory '" + path + "'does not exist", "");
      }
      if (named.size() > 1 && named.ends_with('/')) {
        named.pop_back();
      }
      return named;
    }
    case Directory::System:
    case Directory::Drives:
      break;
  }
  return kRoot;
}

}  // namespace

DirectoryImpl::DirectoryImpl(Directory::DirectoryType type, const std::string& path) try
    : path_(PathOf(type, path)), type_(type) {}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::DirectoryImpl::DirectoryImpl)

std::string DirectoryImpl::GetName() const try {
  return FileSystem::LastComponent(GetAbsoluteName());
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::DirectoryImpl::GetName)

std::string DirectoryImpl::GetAbsoluteName() const try { return FileSystem::ToPortable(path_); }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::DirectoryImpl::GetAbsoluteName)

Directory DirectoryImpl::GetParent() const try {
  return Directory(Directory::Named, FileSystem::ParentPath(GetAbsoluteName()));
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::DirectoryImpl::GetParent)

void DirectoryImpl::CreateSubdir(const std::string& name) try {
  if (name.empty() || FileSystem::IsAbsolutePath(name)) {
    throw std::invalid_argument("invalid sub-directory name '" + name + "'");
  }
  const Utilities::Tools::StringTokenizer levels(FileSystem::ToPortable(name), '/');
  std::string relative;
  for (const std::string& level : levels.GetTokens()) {
    relative += "/" + level;
    const std::string path = path_ + relative;
    if (::mkdir(path.c_str(), 0777) != 0 && !(errno == EEXIST && IsDirectory(path))) {
      throw ResourceNotAvailableException("failed to create subdir '" + path + "'", "");
    }
  }
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::DirectoryImpl::CreateSubdir)

std::vector<Directory> DirectoryImpl::GetSubdirs(const std::string& pattern) const try {
  if (type_ == Directory::Drives) {
    return {Directory(Directory::Named, kRoot)};
  }
  std::vector<Directory> subdirs;
  for (const std::string& path : ListEntries(pattern, true)) {
    subdirs.emplace_back(Directory::Named, FileSystem::ToPortable(path));
  }
  return subdirs;
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::DirectoryImpl::GetSubdirs)

std::vector<File> DirectoryImpl::GetFiles(const std::string& pattern) const try {
  std::vector<File> files;
  for (const std::string& path : ListEntries(pattern, false)) {
    files.emplace_back(FileSystem::ToPortable(path));
  }
  return files;
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::DirectoryImpl::GetFiles)

std::vector<std::string> DirectoryImpl::ListEntries(const std::string& pattern,
                                                    bool directories) const {
  std::vector<std::string> paths;
  std::error_code error;  // a directory that has gone, or cannot be read, has no entries
  for (std::filesystem::directory_iterator entry(path_, error), end; !error && entry != end;
       entry.increment(error)) {
    const std::string name = entry->path().filename().string();
    std::error_code unknown;
    if (::fnmatch(pattern.c_str(), name.c_str(), FNM_PERIOD) == 0 &&
        entry->is_directory(unknown) == directories) {
      paths.push_back(FileSystem::JoinPath(path_, name));
    }
  }
  std::sort(paths.begin(), paths.end());
  return paths;
}

}  // namespace Aldermoor::Platform::Posix
