#include "aldermoor/utilities/filesystem/directory.h"

#include "aldermoor/utilities/filesystem/impl.h"
#include "aldermoor/utilities/filesystem/posix/directoryimpl.h"

namespace Aldermoor::Utilities::FileSystem {

Directory::Directory(DirectoryType type, const std::string& path) try
    : impl_(new Platform::Posix::DirectoryImpl(type, path)) {}
ALDERMOOR_FRAME(Aldermoor::Utilities::FileSystem::Directory::Directory)

Directory::Directory(const Directory&) = default;
Directory& Directory::operator=(const Directory&) = default;
Directory::~Directory() = default;

std::string Directory::GetName() const {
  return impl_->GetName();
}

std::string Directory::GetAbsoluteName() const {
  return impl_->GetAbsoluteName();
}

Directory Directory::GetParent() const {
  return impl_->GetParent();
}

void Directory::CreateSubdir(const std::string& name) {
  impl_->CreateSubdir(name);
}

std::vector<Directory> Directory::GetSubdirs(const std::string& pattern) const {
  return impl_->GetSubdirs(pattern);
}

std::vector<File> Directory::GetFiles(const std::string& pattern) const {
  return impl_->GetFiles(pattern);
}

}  // namespace Aldermoor::Utilities::FileSystem
