#include "aldermoor/utilities/filesystem/posix/descriptorbuffer.h"

#include <cerrno>
#include <cstddef>

#include <unistd.h>

namespace Aldermoor::Platform::Posix {
namespace {

constexpr std::size_t kBufferSize = 65536;

}  // namespace

DescriptorBuffer::DescriptorBuffer() : bytes_(kBufferSize) {
  setp(bytes_.data(), bytes_.data() + bytes_.size());
}

DescriptorBuffer::int_type DescriptorBuffer::overflow(int_type c) {
  if (sync() != 0) {
    return traits_type::eof();
  }
  if (!traits_type::eq_int_type(c, traits_type::eof())) {
    sputc(traits_type::to_char_type(c));
  }
  return traits_type::not_eof(c);
}

int DescriptorBuffer::sync() {
  const char* next = pbase();
  while (error_ == 0 && next != pptr()) {
    const ssize_t written = ::write(descriptor_, next, static_cast<std::size_t>(pptr() - next));
    if (written > 0) {
      next += written;
    } else if (written == 0) {
      error_ = EIO;  // it would go on like that for ever
    } else if (errno != EINTR) {
      error_ = errno;
    }
  }
  setp(bytes_.data(), bytes_.data() + bytes_.size());
  return error_ == 0 ? 0 : -1;
}

}  // namespace Aldermoor::Platform::Posix
