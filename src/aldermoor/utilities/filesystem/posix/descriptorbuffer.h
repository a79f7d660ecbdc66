#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTORBUFFER_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTORBUFFER_H

#include <cstdint>
#include <streambuf>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/utilities/filesystem/posix/contenthash.h"

namespace Aldermoor::Platform::Posix {

/// Writes all bytes to a file descriptor.  Returns the error number of the system, 0 if all went
/// well.
int WriteAll(int descriptor, std::string_view bytes);

/// Writes to a file descriptor, which it does not own, and remembers what went wrong.
class DescriptorBuffer : public std::streambuf {
 public:
  DescriptorBuffer();

  void SetDescriptor(int descriptor) { descriptor_ = descriptor; }
  /// From now on, bytes stay in memory.
  void HoldBack() { is_held_back_ = true; }
  std::string_view GetHeldBack() const { return held_back_; }
  /// The first error number of the system, 0 if all went well.
  int GetError() const { return error_; }
  /// Of the bytes that were flushed, whether they are written or held back.
  std::uint64_t GetSize() const { return size_; }
  std::uint64_t GetHash() const { return hash_.Get(); }

 protected:
  int_type overflow(int_type c) override;
  int sync() override;

 private:
  int descriptor_ = -1;
  int error_ = 0;
  bool is_held_back_ = false;
  std::uint64_t size_ = 0;
  std::vector<char> bytes_;
  std::string held_back_;
  ContentHash hash_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTORBUFFER_H
