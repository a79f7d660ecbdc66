#include "aldermoor/utilities/filesystem/posix/filecontent.h"

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <system_error>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Platform::Posix {
namespace {

constexpr std::size_t kLeastChunk = 65536;

class Reader {
 public:
  explicit Reader(const std::string& path)
      : path_(path), descriptor_(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY)) {
    if (descriptor_ < 0) {
      Fail(errno);
    }
  }
  Reader(const Reader&) = delete;
  Reader& operator=(const Reader&) = delete;
  ~Reader() { ::close(descriptor_); }

  std::vector<char> ReadAll() const {
    struct stat status {};
    if (::fstat(descriptor_, &status) != 0) {
      Fail(errno);
    }
    // One byte more than a regular file has, so that its end is seen without growing.
    std::vector<char> bytes(S_ISREG(status.st_mode) ? static_cast<std::size_t>(status.st_size) + 1
                                                    : kLeastChunk);
    std::size_t count = 0;
    for (;;) {
      if (count == bytes.size()) {
        bytes.resize(bytes.size() + std::max(bytes.size() / 2, kLeastChunk));
      }
      const ssize_t got = ::read(descriptor_, bytes.data() + count, bytes.size() - count);
      if (got > 0) {
        count += static_cast<std::size_t>(got);
      } else if (got == 0) {
        bytes.resize(count);
        return bytes;
      } else if (errno != EINTR) {
        Fail(errno);
      }
    }
  }

 private:
  [[noreturn]] void Fail(int error) const {
    throw Utilities::Exceptions::ResourceNotAvailableException(
        "file '" + path_ + "' cannot be read: " + std::generic_category().message(error),
        ALDERMOOR_HERE(Aldermoor::Platform::Posix::ReadFileContent));
  }

  const std::string& path_;
  int descriptor_;
};

}  // namespace

std::vector<char> ReadFileContent(const std::string& path) try { return Reader(path).ReadAll(); }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::ReadFileContent)

}  // namespace Aldermoor::Platform::Posix
