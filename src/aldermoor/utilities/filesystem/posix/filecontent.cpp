#include "aldermoor/utilities/filesystem/posix/filecontent.h"

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <system_error>

#include <fcntl.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Platform::Posix {
namespace {

constexpr std::size_t kLeastChunk = 65536;

[[noreturn]] void FailToRead(const std::string& path, int error) {
  throw Utilities::Exceptions::ResourceNotAvailableException(
      "file '" + path + "' cannot be read: " + std::generic_category().message(error),
      ALDERMOOR_HERE(Aldermoor::Platform::Posix::ReadFileContent));
}

class Reader {
 public:
  explicit Reader(const std::string& path)
      : path_(path), descriptor_(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY)) {
    if (descriptor_ < 0) {
      FailToRead(path, errno);
    }
  }
  Reader(const Reader&) = delete;
  Reader& operator=(const Reader&) = delete;
  ~Reader() { ::close(descriptor_); }

  FileContent Read() const {
    FileContent content;
    if (::fstat(descriptor_, &content.status) != 0) {
      FailToRead(path_, errno);
    }
    content.bytes = ReadAll(descriptor_, content.status, path_);
    return content;
  }

 private:
  const std::string& path_;
  int descriptor_;
};

}  // namespace

FileContent ReadFileContent(const std::string& path) try { return Reader(path).Read(); }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::ReadFileContent)

std::vector<char> ReadAll(int descriptor, const struct stat& status, const std::string& path) {
  // One byte more than a regular file has, so that its end is seen without growing.
  std::vector<char> bytes(S_ISREG(status.st_mode) ? static_cast<std::size_t>(status.st_size) + 1
                                                  : kLeastChunk);
  std::size_t count = 0;
  for (;;) {
    if (count == bytes.size()) {
      bytes.resize(bytes.size() + std::max(bytes.size() / 2, kLeastChunk));
    }
    const ssize_t got = ::read(descriptor, bytes.data() + count, bytes.size() - count);
    if (got > 0) {
      count += static_cast<std::size_t>(got);
    } else if (got == 0) {
      bytes.resize(count);
      return bytes;
    } else if (errno != EINTR) {
      FailToRead(path, errno);
    }
  }
}

}  // namespace Aldermoor::Platform::Posix
