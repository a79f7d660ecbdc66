#include "aldermoor/utilities/filesystem/file.h"

#include "aldermoor/utilities/filesystem/impl.h"
#include "aldermoor/utilities/filesystem/posix/fileimpl.h"

namespace Aldermoor::Utilities::FileSystem {

File::File(const std::string& name, unsigned long /*macType*/, unsigned long /*macCreator*/) try
    : impl_(new Platform::Posix::FileImpl(name)) {}
ALDERMOOR_FRAME(Aldermoor::Utilities::FileSystem::File::File)

File::File(const File&) = default;
File& File::operator=(const File&) = default;
File::~File() = default;

std::string File::GetName() const {
  return impl_->GetName();
}

std::string File::GetAbsoluteName() const {
  return impl_->GetAbsoluteName();
}

std::string File::GetAbsolutePlatformName() const {
  return impl_->GetAbsolutePlatformName();
}

Directory File::GetDirectory() const {
  return impl_->GetDirectory();
}

long File::GetSize() const {
  return impl_->GetSize();
}

Tools::DateTime File::GetModificationDate() const {
  return impl_->GetModificationDate();
}

bool File::IsAccessable(bool forWriting) const {
  return impl_->IsAccessable(forWriting);
}

bool File::IsOfType(const std::string& extension) const {
  return impl_->IsOfType(extension);
}

bool File::Remove() const {
  return impl_->Remove();
}

void File::ApplyMacTypeCreator() {
  impl_->ApplyMacTypeCreator();
}

}  // namespace Aldermoor::Utilities::FileSystem
