#include "aldermoor/utilities/filesystem/posix/fileimpl.h"

#include <algorithm>
#include <cctype>
#include <stdexcept>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/path.h"
#include "aldermoor/utilities/filesystem/posix/descriptor.h"

namespace Aldermoor::Platform::Posix {

using Utilities::FileSystem::Directory;
using Utilities::Tools::DateTime;
namespace FileSystem = Utilities::FileSystem;

namespace {

std::string MakeAbsolute(const std::string& name) {
  if (name.empty()) {
    throw std::invalid_argument("empty file name!!");
  }
  if (FileSystem::IsAbsolutePath(name)) {
    return name;
  }
  const std::string current = Directory(Directory::Current).GetAbsoluteName();
  return FileSystem::JoinPath(FileSystem::ToPlatform(current), name);
}

}  // namespace

FileImpl::FileImpl(const std::string& name) try : path_(MakeAbsolute(name)) {}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::FileImpl)

std::string FileImpl::GetName() const try { return FileSystem::LastComponent(GetAbsoluteName()); }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::GetName)

std::string FileImpl::GetAbsoluteName() const try { return FileSystem::ToPortable(path_); }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::GetAbsoluteName)

std::string FileImpl::GetAbsolutePlatformName() const try { return FileSystem::ToPlatform(path_); }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::GetAbsolutePlatformName)

Directory FileImpl::GetDirectory() const try {
  return Directory(Directory::Named, FileSystem::ParentPath(GetAbsoluteName()));
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::GetDirectory)

long FileImpl::GetSize() const try {
  const Descriptor file(GetAbsolutePlatformName(), O_RDONLY);
  if (!file.IsOpen()) {
    throw std::runtime_error(Utilities::Tools::TypeName<FileImpl>() + "::GetSize(): file '" +
                             path_ + "' doesn't exist");
  }
  return static_cast<long>(file.GetStatus().st_size);
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::GetSize)

DateTime FileImpl::GetModificationDate() const try {
  DateTime result;
  const Descriptor file(GetAbsolutePlatformName(), O_RDONLY);
  if (file.IsOpen()) {
    // The seconds as they are: a detour over local time would be an hour off across a change of
    // daylight saving.
    result.SetDateTime(static_cast<long>(file.GetStatus().st_mtime));
  }
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::GetModificationDate)

bool FileImpl::IsAccessable(bool forWriting) const try {
  const std::string path = GetAbsolutePlatformName();
  struct stat status {};
  if (::stat(path.c_str(), &status) == 0 && S_ISFIFO(status.st_mode)) {
    // To open a pipe and to close it again would end the program at its other end.
    return ::faccessat(AT_FDCWD, path.c_str(), forWriting ? R_OK | W_OK : R_OK, AT_EACCESS) == 0;
  }
  return Descriptor(path, forWriting ? O_RDWR : O_RDONLY).IsOpen();
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::IsAccessable)

bool FileImpl::IsOfType(const std::string& extension) const try {
  const std::string name = GetName();
  const auto dot = name.rfind('.');
  if (dot == std::string::npos || dot == 0) {
    return false;
  }
  const auto lower = [](unsigned char c) {
    return std::tolower(c);
  };
  return std::equal(name.begin() + static_cast<std::ptrdiff_t>(dot), name.end(), extension.begin(),
                    extension.end(), [&](char a, char b) {
                      return lower(static_cast<unsigned char>(a)) ==
                             lower(static_cast<unsigned char>(b));
                    });
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::IsOfType)

bool FileImpl::Remove() const try { return ::unlink(GetAbsolutePlatformName().c_str()) == 0; }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileImpl::Remove)

void FileImpl::ApplyMacTypeCreator() {}

}  // namespace Aldermoor::Platform::Posix
