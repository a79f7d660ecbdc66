#include "aldermoor/vexdoc/internals/xmlcache.h"

#include <algorithm>
#include <cerrno>
#include <climits>
#include <filesystem>
#include <system_error>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/directory.h"
#include "aldermoor/utilities/filesystem/path.h"
#include "aldermoor/utilities/filesystem/posix/contenthash.h"
#include "aldermoor/utilities/filesystem/posix/filereplacement.h"
#include "aldermoor/vexdoc/internals/binaryprovider.h"

namespace Aldermoor::Vexdoc::Internals {

namespace FileSystem = Utilities::FileSystem;
using FileSystem::File;
using Platform::Posix::FileReplacement;
using Platform::Posix::RegularFile;
using Link = RegularFile::Link;

namespace {

constexpr const char* kCacheDirectory = "Cache";
// A stamp has one line; what is longer is none.
constexpr off_t kLongestStamp = 4096;

constexpr const char* kAbsent = "absent";
constexpr const char* kNotRegular = "not a regular file";
constexpr const char* kNotLater = "not later than the document by whole seconds";
constexpr const char* kNoStamp = "it has no stamp that ties it to the document";
constexpr const char* kNoStampAndOld =
    "it has no stamp, and the document has changed or come to its place since";
constexpr const char* kTooLong = "it is too long for a cache of the document";
constexpr const char* kNoGoodStamp = "its stamp is unfinished or damaged";
constexpr const char* kOpenToMore = "it may be read by others than the document";
constexpr const char* kNotExact = "it does not hold exactly what the document says";
constexpr const char* kOtherBytes = "its bytes are not those that its stamp names";
constexpr const char* kOtherContent = "it belongs to another content of the document";

// A name that starts like one with a drive may have no "/" at all.
std::string DirectoryOf(const std::string& path) {
  return path.find('/') == std::string::npos ? "." : FileSystem::ParentPath(path);
}

std::string CacheName(const File& xml) {
  constexpr std::string_view kExtension = ".xml";
  std::string stem = xml.GetName();
  if (xml.IsOfType(std::string(kExtension))) {
    stem.resize(stem.size() - kExtension.size());
  }
  const std::string directory =
      FileSystem::JoinPath(DirectoryOf(xml.GetAbsoluteName()), kCacheDirectory);
  return FileSystem::JoinPath(directory, stem + ".vexb");
}

std::string WhyNotOpen(const RegularFile& cache) {
  if (cache.GetError() == ENOENT || cache.GetError() == ENOTDIR) {
    return kAbsent;
  }
  return cache.GetError() == 0
             ? kNotRegular
             : "it cannot be read: " + std::generic_category().message(cache.GetError());
}

std::string WhyXmlIsNotOpen(const RegularFile& xml) {
  return xml.GetError() == 0
             ? "the document is not a regular file"
             : "the document cannot be read: " + std::generic_category().message(xml.GetError());
}

bool IsLater(const struct stat& cache, const struct timespec& time) {
  return cache.st_mtim.tv_sec > time.tv_sec;
}

std::string_view View(const std::vector<char>& bytes) {
  return {bytes.data(), bytes.size()};
}

XmlCache::Found Unusable(std::string reason) {
  XmlCache::Found found;
  found.reason = std::move(reason);
  return found;
}

}  // namespace

XmlCache::XmlCache(const File& xml) try
    : xml_path_(xml.GetAbsolutePlatformName()),
      cache_(CacheName(xml)),
      cache_path_(cache_.GetAbsolutePlatformName()),
      stamp_path_(cache_path_ + ".stamp") {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XmlCache::XmlCache)

XmlCache::Found XmlCache::Find(Need need) const try {
  const RegularFile cache(cache_path_, Link::kRefuse);
  if (!cache.IsOpen()) {
    return Unusable(WhyNotOpen(cache));
  }
  const std::int64_t now = XmlReading::Now();
  // Whoever may not read the document may not read it in its cache either.
  const RegularFile xml(xml_path_, Link::kFollow);
  if (!xml.IsOpen()) {
    return Unusable(WhyXmlIsNotOpen(xml));
  }
  if (!IsLater(cache.GetStatus(), xml.GetStatus().st_mtim)) {
    return Unusable(kNotLater);
  }
  // The rights of the document may have been narrowed since; a cache that is written then has them.
  constexpr mode_t kRights = S_IRWXU | S_IRWXG | S_IRWXO;
  if ((cache.GetStatus().st_mode & ~xml.GetStatus().st_mode & kRights) != 0) {
    return Unusable(kOpenToMore);
  }
  const RegularFile stamp_file(stamp_path_, Link::kRefuse);
  Found found;
  if (stamp_file.GetError() == ENOENT) {
    if (!IsLaterThanAllOf(xml, cache)) {
      return Unusable(kNoStampAndOld);
    }
    if (need == Need::kExact) {
      return Unusable(kNoStamp);
    }
    if (IsTooLong(cache, xml)) {
      return Unusable(kTooLong);
    }
    found.bytes = cache.Read();
    return found;
  }
  std::optional<CacheStamp> stamp;
  if (stamp_file.IsOpen() && stamp_file.GetStatus().st_size <= kLongestStamp) {
    stamp = CacheStamp::FromText(View(stamp_file.Read()));
  }
  if (!stamp) {
    return Unusable(kNoGoodStamp);
  }
  if (need == Need::kExact && !stamp->is_exact) {
    return Unusable(kNotExact);
  }
  if (static_cast<std::uint64_t>(cache.GetStatus().st_size) != stamp->cache.size) {
    return Unusable(kOtherBytes);  // without a look at what may be any number of bytes
  }
  found.bytes = cache.Read();
  const Platform::Posix::ContentMark mark{
      found.bytes.size(), Platform::Posix::HashOf(found.bytes.data(), found.bytes.size())};
  if (mark != stamp->cache) {
    return Unusable(kOtherBytes);
  }
  return IsStamped(xml, now, *stamp, found) ? found : Unusable(kOtherContent);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XmlCache::Find)

bool XmlCache::IsTooLong(const RegularFile& cache, const RegularFile& xml) {
  // Elements without text take four bytes in XML and up to 17 in a cache.
  constexpr off_t kMostPerByte = 16;
  constexpr off_t kAnyway = 4096;
  return cache.GetStatus().st_size > kMostPerByte * xml.GetStatus().st_size + kAnyway;
}

// As git does with its index: times that agree and are settled need no look at the bytes.
bool XmlCache::IsStamped(const RegularFile& xml, std::int64_t now, const CacheStamp& stamp,
                         Found& found) {
  const FileState state(xml.GetStatus());
  if (state == stamp.xml.state && stamp.xml.IsSettled()) {
    return true;
  }
  if (state.size != stamp.xml.state.size) {
    return false;
  }
  const std::vector<char> bytes = xml.Read();
  const XmlReading reading(now, xml.GetStatus(), View(bytes));
  if (!reading.HasBytesOf(stamp.xml)) {
    return false;
  }
  found.renewed = stamp;
  found.renewed->xml = reading;
  return true;
}

// Links lead to the XML file one after the other, and each may have been set anew.
bool XmlCache::IsLaterThanAllOf(const RegularFile& xml, const RegularFile& cache) const {
  constexpr int kMostLinks = 40;
  if (!IsLater(cache.GetStatus(), xml.GetStatus().st_mtim) ||
      !IsLater(cache.GetStatus(), xml.GetStatus().st_ctim)) {
    return false;
  }
  std::filesystem::path path = xml_path_;
  for (int i = 0; i < kMostLinks; ++i) {
    struct stat status {};
    if (::lstat(path.c_str(), &status) != 0) {
      return false;
    }
    if (!S_ISLNK(status.st_mode)) {
      return true;
    }
    std::error_code error;
    const std::filesystem::path next = std::filesystem::read_symlink(path, error);
    if (error || !IsLater(cache.GetStatus(), status.st_mtim) ||
        !IsLater(cache.GetStatus(), status.st_ctim)) {
      return false;
    }
    path = path.parent_path() / next;  // an absolute one stays as it is
  }
  return false;
}

void XmlCache::Write(VEX& document, const XmlReading& reading, bool is_exact) try {
  const RegularFile xml(xml_path_, Link::kFollow);
  if (!xml.IsOpen()) {
    return;  // beside a device there is no place for a cache
  }
  if (FileSystem::LastComponent(stamp_path_).size() > NAME_MAX) {
    Remove();
    return;  // nor for a stamp, without which a new cache does not count
  }
  FileSystem::Directory(FileSystem::Directory::Named, DirectoryOf(xml_path_))
      .CreateSubdir(kCacheDirectory);
  // At no moment is there a new cache without a stamp, which would count by its date alone.
  WriteStamp(CacheStamp::UnfinishedText(), xml.GetStatus());
  CacheStamp stamp{reading, {}, is_exact};
  stamp.cache = BinaryProvider(&document).Write(cache_, xml.GetStatus());
  if (ConfirmLast(stamp.xml)) {
    WriteStamp(stamp.ToText(), xml.GetStatus());
  } else {
    Remove();  // somebody has replaced the XML file since, and writes a cache of his own
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XmlCache::Write)

void XmlCache::Renew(const CacheStamp& stamp) const try {
  const RegularFile xml(xml_path_, Link::kFollow);
  if (xml.IsOpen()) {
    WriteStamp(stamp.ToText(), xml.GetStatus());
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XmlCache::Renew)

void XmlCache::Remove() const try { cache_.Remove(); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::XmlCache::Remove)

// Whether the XML file still holds what was read.  Its bytes are looked at again if its times alone
// do not say so; a document that was just saved would be read at every load otherwise.
bool XmlCache::ConfirmLast(XmlReading& reading) const {
  const std::int64_t now = XmlReading::Now();
  const RegularFile xml(xml_path_, Link::kFollow);
  if (!xml.IsOpen()) {
    return false;
  }
  if (FileState(xml.GetStatus()) == reading.state && reading.IsSettled()) {
    return true;
  }
  const std::vector<char> bytes = xml.Read();
  const XmlReading again(now, xml.GetStatus(), View(bytes));
  const bool is_same = again.HasBytesOf(reading);
  reading = again;
  return is_same;
}

void XmlCache::WriteStamp(const std::string& text, const struct stat& owner) const {
  // After a power cut, a stamp that is torn or older than its cache does not fit.
  FileReplacement replacement(stamp_path_, owner, FileReplacement::Flush::kNo);
  replacement.GetStream() << text;
  replacement.Commit();
}

}  // namespace Aldermoor::Vexdoc::Internals
