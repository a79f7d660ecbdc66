#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTORBUFFER_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTORBUFFER_H

#include <streambuf>
#include <vector>

namespace Aldermoor::Platform::Posix {

/// Writes to a file descriptor, which it does not own, and remembers what went wrong.
class DescriptorBuffer : public std::streambuf {
 public:
  DescriptorBuffer();

  void SetDescriptor(int descriptor) { descriptor_ = descriptor; }
  /// The first error number of the system, 0 if all went well.
  int GetError() const { return error_; }

 protected:
  int_type overflow(int_type c) override;
  int sync() override;

 private:
  int descriptor_ = -1;
  int error_ = 0;
  std::vector<char> bytes_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTORBUFFER_H
