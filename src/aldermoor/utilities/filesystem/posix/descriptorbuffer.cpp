#include "aldermoor/utilities/filesystem/posix/descriptorbuffer.h"

#include <cerrno>
#include <cstddef>

#include <unistd.h>

namespace Aldermoor::Platform::Posix {
namespace {

constexpr std::size_t kBufferSize = 65536;

}  // namespace

int WriteAll(int descriptor, std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t written = ::write(descriptor, bytes.data(), bytes.size());
    if (written > 0) {
      bytes.remove_prefix(static_cast<std::size_t>(written));
    } else if (written == 0) {
      return EIO;  // it would go on like that for ever
    } else if (errno != EINTR) {
      return errno;
    }
  }
  return 0;
}

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
  const auto count = static_cast<std::size_t>(pptr() - pbase());
  hash_.Add(pbase(), count);
  size_ += count;
  if (is_held_back_) {
    held_back_.append(pbase(), count);
  } else if (error_ == 0) {
    error_ = WriteAll(descriptor_, {pbase(), count});
  }
  setp(bytes_.data(), bytes_.data() + bytes_.size());
  return error_ == 0 ? 0 : -1;
}

}  // namespace Aldermoor::Platform::Posix
