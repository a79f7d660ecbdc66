// Whatever happens to an XML file, its cache or its stamp: a load gives what the XML file says.

#include <array>
#include <chrono>
#include <csignal>
#include <functional>
#include <map>
#include <thread>

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/internals/cachestamp.h"
#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/utilities/messageof.h"
#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

namespace fs = std::filesystem;
using Aldermoor::Tests::MessageOf;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::FileSystem::File;

// How `from` comes to the place of `to`; the shell's tools do the same calls.
struct Way {
  const char* name;
  std::function<void(const fs::path& from, const fs::path& to)> restore;
};

void CopyDates(const fs::path& from, const fs::path& to) {
  fs::last_write_time(to, fs::last_write_time(from));
}

void Create(const fs::path& from, const fs::path& to) {
  WriteFile(to, ReadFile(from));
  CopyDates(from, to);
}

const Way kWays[] = {
    {"cp -p", Create},
    {"mv",
     [](const fs::path& from, const fs::path& to) {
       fs::rename(from, to);
     }},
    {"tar x",
     [](const fs::path& from, const fs::path& to) {
       fs::remove(to);
       Create(from, to);
     }},
    {"rsync -a",
     [](const fs::path& from, const fs::path& to) {
       Create(from, to.string() + ".tmp");
       fs::rename(to.string() + ".tmp", to);
     }},
    {"ln -sfn",
     [](const fs::path& from, const fs::path& to) {
       fs::create_symlink(from, to.string() + ".tmp");
       fs::rename(to.string() + ".tmp", to);
     }},
    {"ln -f",
     [](const fs::path& from, const fs::path& to) {
       fs::create_hard_link(from, to.string() + ".tmp");
       fs::rename(to.string() + ".tmp", to);
     }},
    {"link behind a link",
     [](const fs::path& from, const fs::path& to) {
       fs::create_symlink(from, to.string() + ".tmp");
       fs::remove(to);
       fs::create_symlink(to.string() + ".tmp", to);
     }},
    {"byte by byte",
     [](const fs::path& from, const fs::path& to) {
       const auto date = fs::last_write_time(from);
       const std::string bytes = ReadFile(from);
       fs::resize_file(to, bytes.size());
       const int file = ::open(to.c_str(), O_WRONLY);
       for (std::size_t i = 0; i < bytes.size(); ++i) {
         EXPECT_EQ(::pwrite(file, &bytes[i], 1, static_cast<off_t>(i)), 1);
       }
       ::close(file);
       fs::last_write_time(to, date);
     }},
};

// What is restored in the place of "first".  The second has its size.
constexpr const char* kRestored[] = {"first", "other", "of another size"};
constexpr int kAges[] = {100, 200};  // in seconds; the first is that of the document replaced

enum class StampState { kSettled, kFresh, kNone, kDamaged, kUnfinished };
constexpr StampState kStampStates[] = {StampState::kSettled, StampState::kFresh, StampState::kNone,
                                       StampState::kDamaged, StampState::kUnfinished};

// Returns the name of the document, and whether it came from the cache where that is told.
struct Reader {
  const char* name;
  std::function<LoadReport(VEX& document, const File& file)> load;
};

LoadReport LoadPlainly(VEX& document, const File& file, bool update) {
  document.LoadXML(file, update);
  return {};
}

const Reader kReaders[] = {
    {"plain",
     [](VEX& document, const File& file) {
       return LoadPlainly(document, file, false);
     }},
    {"updating",
     [](VEX& document, const File& file) {
       return LoadPlainly(document, file, true);
     }},
    {"reading",
     [](VEX& document, const File& file) {
       return document.LoadXML(file, LoadOptions{});
     }},
    {"writing",
     [](VEX& document, const File& file) {
       return document.LoadXML(file, LoadOptions{.cache = CacheUse::kReadAndWrite});
     }},
};

class StaleCacheTest : public ::testing::Test {
 protected:
  // Dates in the past, so that the date rule alone would take the cache.
  void WriteDocument(const fs::path& path, const char* name, int age) {
    WriteFile(path, XmlOf(VEX(name)));  // a save would wait for the disk
    fs::last_write_time(path, fs::file_time_type::clock::now() - std::chrono::seconds(age));
  }

  void Prepare(const char* restored, int age, StampState state) {
    fs::remove_all(directory_ / "");
    fs::create_directory(directory_ / "");
    WriteDocument(xml_, "first", kAges[0]);
    WriteDocument(other_, restored, age);
    CopyDatesOfAge(age);
    if (state == StampState::kSettled) {
      std::this_thread::sleep_for(std::chrono::milliseconds(40));
    }
    VEX document;
    document.LoadXML(File(xml_.string()), true);
    ASSERT_TRUE(fs::exists(cache_) && fs::exists(stamp_));
    if (state == StampState::kNone) {
      fs::remove(stamp_);
    } else if (state == StampState::kDamaged) {
      WriteFile(stamp_, ReadFile(stamp_).replace(20, 1, "x"));
    } else if (state == StampState::kUnfinished) {
      WriteFile(stamp_, Internals::CacheStamp::UnfinishedText());
    }
  }

  void CopyDatesOfAge(int age) {
    if (age == kAges[0]) {
      CopyDates(xml_, other_);  // to the nanosecond
    }
  }

  LoadReport Load(LoadOptions options = {}) {
    return document_.LoadXML(File(xml_.string()), options);
  }

  // In memory if there is such a place: very many caches are flushed.
  TemporaryDirectory directory_{fs::is_directory("/dev/shm") ? "/dev/shm"
                                                             : fs::temp_directory_path()};
  fs::path xml_ = directory_ / "paper.xml";
  fs::path other_ = directory_ / "other.xml";
  fs::path cache_ = directory_ / "Cache/paper.vexb";
  fs::path stamp_ = directory_ / "Cache/paper.vexb.stamp";
  VEX document_;
};

TEST_F(StaleCacheTest, NoWayOfRestoringAnotherFileLetsTheCacheAnswerForIt) {
  int cases = 0;
  int from_cache = 0;
  for (const Way& way : kWays) {
    for (const char* restored : kRestored) {
      for (const int age : kAges) {
        for (const StampState state : kStampStates) {
          for (const Reader& reader : kReaders) {
            SCOPED_TRACE(way.name + (" " + std::string(restored)) + " " + std::to_string(age) +
                         " s " + reader.name + " " + std::to_string(static_cast<int>(state)));
            Prepare(restored, age, state);
            way.restore(other_, xml_);
            VEX document;
            const LoadReport report = reader.load(document, File(xml_.string()));
            EXPECT_EQ(document.GetName(), restored);
            from_cache += report.from_cache ? 1 : 0;
            EXPECT_FALSE(report.from_cache && state > StampState::kFresh);
            // Once more, since the first load may have written.
            VEX again;
            again.LoadXML(File(xml_.string()), LoadOptions{});
            EXPECT_EQ(again.GetName(), restored);
            ++cases;
          }
        }
      }
    }
  }
  EXPECT_GE(cases, 200);
  // Where the same bytes came back under a good stamp, by the two readers that tell.
  EXPECT_EQ(from_cache, static_cast<int>(std::size(kWays)) * 2 * 2 * 2);
}

TEST_F(StaleCacheTest, AnUnchangedFileIsReadFromItsCacheWithoutALookAtItsBytes) {
  for (const StampState state : {StampState::kSettled, StampState::kFresh}) {
    Prepare("other", 200, state);
    EXPECT_TRUE(Load().from_cache);
    EXPECT_EQ(document_.GetName(), "first");
  }
  // The hash of other bytes under the same times: it is not looked at if they are settled.
  for (const auto& [state, is_trusted] :
       {std::pair{StampState::kSettled, true}, {StampState::kFresh, false}}) {
    Prepare("other", 200, state);
    auto stamp = Internals::CacheStamp::FromText(ReadFile(stamp_));
    ASSERT_TRUE(stamp);
    stamp->xml.hash ^= 1U;
    WriteFile(stamp_, stamp->ToText());
    EXPECT_EQ(Load().from_cache, is_trusted);
  }
}

TEST_F(StaleCacheTest, ALoadThatWritesMakesTheStampOfAMovedFileFitAgain) {
  Prepare("first", 100, StampState::kSettled);
  fs::rename(other_, xml_);
  const std::string stamp = ReadFile(stamp_);
  EXPECT_TRUE(Load().from_cache);
  EXPECT_EQ(ReadFile(stamp_), stamp);
  EXPECT_TRUE(Load({CacheUse::kReadAndWrite}).from_cache);
  EXPECT_NE(ReadFile(stamp_), stamp);
  EXPECT_TRUE(Load().from_cache);
}

TEST_F(StaleCacheTest, ADamagedByteOfTheStampOrTheXmlOrAStampThatIsNotExactLeadsToTheXml) {
  Prepare("other", 200, StampState::kSettled);
  const std::string stamp = ReadFile(stamp_);
  for (std::size_t i = 0; i < stamp.size(); ++i) {
    for (const char byte : {'\0', '0', '9', static_cast<char>(~stamp[i])}) {
      std::string damaged = stamp;
      damaged[i] = byte;
      WriteFile(stamp_, damaged);
      EXPECT_EQ(Load().from_cache, damaged == stamp) << damaged;
    }
    WriteFile(stamp_, stamp.substr(0, i));
    EXPECT_FALSE(Load().from_cache) << i;
  }
  WriteFile(stamp_, stamp + "\n");
  EXPECT_EQ(Load().cache_reason, "its stamp is unfinished or damaged");
  auto inexact = Internals::CacheStamp::FromText(stamp);
  ASSERT_TRUE(inexact);
  inexact->is_exact = false;
  WriteFile(stamp_, inexact->ToText());
  EXPECT_EQ(Load().cache_reason, "it does not hold exactly what the document says");
  WriteFile(stamp_, stamp);
  std::string xml = ReadFile(xml_);
  xml.replace(xml.find("first"), 5, "fir5t");
  const auto date = fs::last_write_time(xml_);
  WriteFile(xml_, xml);
  fs::last_write_time(xml_, date);
  EXPECT_EQ(Load().cache_reason, "it belongs to another content of the document");
  EXPECT_EQ(document_.GetName(), "fir5t");
}

TEST_F(StaleCacheTest, ACacheWithoutAStampCountsIfItIsLaterThanAllTimesOfTheXmlFile) {
  const auto name = [this] {
    document_.LoadXML(File(xml_.string()), false);
    return document_.GetName();
  };
  const auto write_cache = [this](int seconds) {
    WriteFile(cache_, CacheOf(VEX("from cache")));
    fs::last_write_time(cache_, fs::file_time_type::clock::now() + std::chrono::seconds(seconds));
  };
  Prepare("other", 200, StampState::kNone);
  write_cache(-50);  // later than the modification, but not than the change of times
  EXPECT_EQ(name(), "first");
  write_cache(10);
  EXPECT_EQ(name(), "from cache");
  EXPECT_EQ(Load().cache_reason, "it has no stamp that ties it to the document");
  // A link that was set after that.
  fs::rename(xml_, directory_ / "target.xml");
  fs::create_symlink("target.xml", xml_);
  EXPECT_EQ(name(), "from cache");
  const std::array<timespec, 2> times = {timespec{0, UTIME_OMIT}, {::time(nullptr) + 20, 0}};
  ASSERT_EQ(::utimensat(AT_FDCWD, xml_.c_str(), times.data(), AT_SYMLINK_NOFOLLOW), 0);
  EXPECT_EQ(name(), "first");
}

TEST_F(StaleCacheTest, FilesThatShareACacheAreToldApart) {
  const std::array<fs::path, 3> paths = {directory_ / "paper", directory_ / "paper.xml",
                                         directory_ / "paper.XML"};
  for (const fs::path& written : paths) {
    for (const fs::path& path : paths) {
      WriteDocument(path, path.filename().c_str(), 100);
    }
    VEX().LoadXML(File(written.string()), true);
    for (const fs::path& path : paths) {
      const LoadReport report = document_.LoadXML(File(path.string()), LoadOptions{});
      EXPECT_EQ(document_.GetName(), path.filename().string());
      EXPECT_EQ(report.from_cache, path == written);
    }
  }
}

TEST_F(StaleCacheTest, ASavedDocumentIsTheSameFromCacheAndXml) {
  VEX document("digits");
  Sample sample("sample");
  Conditions conditions;
  for (const auto& [key, value] : {std::pair{"NumberOfDataPointsSpectrum", "1"},
                                   {"SpectrumType", "Remission"},
                                   {"WavelengthSpectrumMin", "380nm"},
                                   {"WavelengthSpectrumMax", "380nm"}}) {
    conditions.AddAttribute(std::string("Physical.") + key, value);
  }
  sample.AddSampleAttribute(
      Utilities::Tools::SmartPointer<SampleAttribute>(new Spectrum(conditions, {0.123456789F})));
  document.AddSample("set", sample);
  File file(xml_.string());
  document.SaveXML(file, true);
  fs::last_write_time(cache_, fs::file_time_type::clock::now() + std::chrono::seconds(10));
  EXPECT_TRUE(Load().from_cache);
  const std::string text = DocumentText(document_);
  EXPECT_FALSE(Load({CacheUse::kNone}).from_cache);
  EXPECT_EQ(DocumentText(document_), text);
}

// ---- What stands in the place of a cache, and who may read it

TEST_F(StaleCacheTest, LinksPipesAndFoldersInThePlaceOfACacheAreReplacedOrPassedOver) {
  const fs::path victim = directory_ / "victim";
  const std::map<std::string, std::function<void(const fs::path&)>> things = {
      {"link",
       [&](const fs::path& path) {
         fs::create_symlink(victim, path);
       }},
      {"hard link",
       [&](const fs::path& path) {
         fs::create_hard_link(victim, path);
       }},
      {"dangling link",
       [&](const fs::path& path) {
         fs::create_symlink("none", path);
       }},
      {"pipe",
       [&](const fs::path& path) {
         ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
       }},
      {"folder",
       [&](const fs::path& path) {
         fs::create_directories(path / "a");
       }},
  };
  for (const char* file : {"Cache/paper.vexb", "Cache/paper.vexb.stamp"}) {
    for (const auto& [name, make] : things) {
      for (const bool saves : {false, true}) {
        SCOPED_TRACE(file + (" " + name));
        Prepare("other", 200, StampState::kFresh);
        const fs::path path = directory_ / file;
        WriteFile(victim, ReadFile(path));
        fs::remove(path);
        make(path);
        EXPECT_EQ(Load().from_cache, name == "hard link") << "the very bytes";
        WriteFile(victim, "untouched");
        const bool is_folder = name == "folder";
        if (saves) {
          File xml(xml_.string());
          const std::string message =
              MessageOf<ResourceNotAvailableException>([&] { VEX("saved").SaveXML(xml, true); });
          EXPECT_EQ(message == "nothing was thrown", !is_folder) << message;
        } else {
          VEX().LoadXML(File(xml_.string()), true);
        }
        EXPECT_EQ(fs::is_regular_file(fs::symlink_status(path)), !is_folder);
        EXPECT_EQ(ReadFile(victim), "untouched");
        Load();
        EXPECT_EQ(document_.GetName(), saves ? "saved" : "first");
      }
    }
  }
}

TEST_F(StaleCacheTest, CacheAndStampHaveThePermissionsOfTheXmlFile) {
  for (const int mode : {0600, 0640, 0644, 0664, 0400}) {
    Prepare("other", 200, StampState::kFresh);
    fs::permissions(xml_, fs::perms(mode));
    fs::remove_all(directory_ / "Cache");
    VEX().LoadXML(File(xml_.string()), true);
    EXPECT_EQ(fs::status(cache_).permissions(), fs::perms(mode));
    EXPECT_EQ(fs::status(stamp_).permissions(), fs::perms(mode));
  }
}

// Runs `check` without the rights of the superuser.
bool SucceedsAsSomebody(const std::function<bool()>& check) {
  constexpr uid_t kNobody = 65534;
  const pid_t child = ::fork();
  if (child == 0) {
    const bool dropped = ::geteuid() != 0 || (::setegid(kNobody) == 0 && ::seteuid(kNobody) == 0);
    ::_exit(dropped && check() ? 0 : 1);
  }
  int status = 0;
  return ::waitpid(child, &status, 0) == child && WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

void OpenToAll(const fs::path& path, int mode) {
  fs::permissions(path, fs::perms(mode));
}

TEST_F(StaleCacheTest, ADocumentThatMayNotBeReadIsNotReadFromItsCache) {
  Prepare("other", 200, StampState::kSettled);
  OpenToAll(directory_ / "", 0777);
  OpenToAll(cache_, 0644);
  OpenToAll(stamp_, 0644);
  const auto load = [this] {
    VEX document;
    return document.LoadXML(File(xml_.string()), LoadOptions{}).from_cache;
  };
  EXPECT_TRUE(SucceedsAsSomebody(load));
  fs::permissions(xml_, fs::perms::none);
  EXPECT_TRUE(SucceedsAsSomebody([&] {
    try {
      load();
      return false;
    } catch (const VexException& e) {
      return e.what() == "file '" + xml_.string() + "' not accessable " &&
             StateOfCache(File(xml_.string())).reason ==
                 "the document cannot be read: Permission denied";
    }
  }));
}

TEST_F(StaleCacheTest, AWritableFileInAFolderThatIsNotIsWrittenInPlaceOrNotAtAll) {
  Prepare("other", 200, StampState::kFresh);
  WriteFile(xml_, std::string(5000, ' '));
  for (const fs::path& path : {xml_, cache_, stamp_}) {
    OpenToAll(path, 0666);
    ASSERT_EQ(::chown(path.c_str(), 65534, 65534), ::geteuid() == 0 ? 0 : -1);
  }
  OpenToAll(directory_ / "Cache", 0555);
  OpenToAll(directory_ / "", 0555);
  EXPECT_TRUE(SucceedsAsSomebody([this] {
    File file(xml_.string());
    VEX("saved").SaveXML(file, true);
    return true;
  }));
  Load({CacheUse::kNone});
  EXPECT_EQ(document_.GetName(), "saved");
  EXPECT_EQ(DocumentText(*LoadedCache(ReadFile(cache_))), DocumentText(document_));
  // A file system that can reserve space refuses before anything is touched.
  const std::string before = ReadFile(xml_);
  EXPECT_TRUE(SucceedsAsSomebody([&] {
    const rlimit limit = {2000, 2000};
    ::signal(SIGXFSZ, SIG_IGN);
    ::setrlimit(RLIMIT_FSIZE, &limit);
    File file(xml_.string());
    const std::string message = MessageOf<ResourceNotAvailableException>(
        [&] { VEX(std::string(3000, 'x')).SaveXML(file, false); });
    const bool is_touched = message.find("holds neither the old nor the new") < message.size();
    return message.ends_with(": File too large") && is_touched == (ReadFile(xml_) != before);
  }));
  OpenToAll(directory_ / "", 0777);
  OpenToAll(directory_ / "Cache", 0777);
}

TEST_F(StaleCacheTest, ASaveRemovesTemporaryFilesOfEndedProcessesThatAreOld) {
  const pid_t ended = ::fork();
  if (ended == 0) {
    ::_exit(0);
  }
  ::waitpid(ended, nullptr, 0);
  const std::string process = std::to_string(ended);
  const std::string own = std::to_string(::getpid());
  const std::map<std::string, bool> goes = {
      {".aldermoor-" + process + "-1.tmp", true},      {".aldermoor-" + own + "-999999.tmp", false},
      {".aldermoor-" + process + "-1.tmp.xml", false}, {".aldermoor--1-1.tmp", false},
      {"aldermoor-" + process + "-1.tmp", false},      {".aldermoor-0-1.tmp", false},
      {".aldermoor-" + process + "-.tmp", false}};
  for (const int hours : {0, 2}) {
    Prepare("other", 200, StampState::kFresh);
    for (const char* folder : {"", "Cache/"}) {
      for (const auto& [name, is_swept] : goes) {
        const fs::path path = directory_ / (folder + name);
        WriteFile(path, "left");
        fs::last_write_time(path, fs::file_time_type::clock::now() - std::chrono::hours(hours));
      }
      fs::create_directory(directory_ / (folder + (".aldermoor-" + process) + "-7.tmp"));
    }
    File file(xml_.string());
    VEX("saved").SaveXML(file, true);
    for (const char* folder : {"", "Cache/"}) {
      for (const auto& [name, is_swept] : goes) {
        EXPECT_EQ(fs::exists(directory_ / (folder + name)), !(is_swept && hours > 0)) << name;
      }
      EXPECT_TRUE(fs::exists(directory_ / (folder + (".aldermoor-" + process) + "-7.tmp")));
    }
  }
}

TEST_F(StaleCacheTest, AFileWhoseNameStartsLikeADriveIsWrittenAndRead) {
  const fs::path before = fs::current_path();
  fs::current_path(directory_ / "");
  EXPECT_EQ(File("1:2.xml").GetAbsoluteName(), (directory_ / "1:2.xml").string());
  for (const char* name : {"1:2.xml", "a:b.xml"}) {
    File file(name);
    EXPECT_NO_THROW(VEX("drive").SaveXML(file, true)) << name;
    document_.LoadXML(file, false);
    EXPECT_EQ(document_.GetName(), "drive");
    EXPECT_TRUE(fs::exists("Cache/" + std::string(name, 3) + ".vexb"));
  }
  fs::current_path(before);
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
