// Which of the two files a load reads, and what it leaves behind.

#include <chrono>
#include <clocale>
#include <sstream>

#include <gtest/gtest.h>
#include <sys/stat.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/utilities/messageof.h"
#include "tests/vexdoc/internals/loadsupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

namespace fs = std::filesystem;
using Aldermoor::Tests::MessageOf;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::FileSystem::File;

void Save(const VEX& document, const fs::path& path, bool updateCache) {
  File file(path.string());
  document.SaveXML(file, updateCache);
}

// `seconds` after the date of `reference`.
void SetDate(const fs::path& path, const fs::path& reference, int seconds) {
  fs::last_write_time(path, fs::last_write_time(reference) + std::chrono::seconds(seconds));
}

// An XML file and a cache with documents of other names, so that it shows which was read.  The
// cache has no stamp, which would tell them apart.
class CacheTest : public ::testing::Test {
 protected:
  CacheTest() {
    Save(VEX("from cache"), xml_, true);
    Save(VEX("from XML"), xml_, false);
    fs::remove(cache_.string() + ".stamp");
    old_cache_ = ReadFile(cache_);
  }

  std::string Load(bool updateCache) {
    VEX document;
    document.LoadXML(File(xml_.string()), updateCache);
    return document.GetName();
  }

  bool IsRewritten() {
    VEX document;
    SetDate(cache_, xml_, 10);
    document.LoadXML(File(xml_.string()), false);
    return ReadFile(cache_) != old_cache_ && document.GetName() == "from XML";
  }

  TemporaryDirectory directory_;
  fs::path xml_ = directory_ / "paper.a.XML";
  fs::path cache_ = directory_ / "Cache/paper.a.vexb";
  std::string old_cache_;
};

TEST_F(CacheTest, ANewerGoodCacheIsReadAndLeftAsItIsWhateverUpdateSays) {
  SetDate(cache_, xml_, 1);
  EXPECT_EQ(Load(false), "from cache");
  EXPECT_EQ(Load(true), "from cache");
  EXPECT_EQ(ReadFile(cache_), old_cache_);
}

TEST_F(CacheTest, AnOlderCacheOrOneOfTheSameDateIsPassedOverAndRewrittenOnDemand) {
  for (const int age : {-1, 0}) {
    WriteFile(cache_, old_cache_);
    SetDate(cache_, xml_, age);
    EXPECT_EQ(Load(false), "from XML");
    EXPECT_EQ(ReadFile(cache_), old_cache_);
    EXPECT_EQ(Load(true), "from XML");
    EXPECT_TRUE(IsRewritten());
  }
}

TEST_F(CacheTest, ABrokenNewerCacheIsPassedOverInSilenceAndRewrittenOnDemand) {
  std::string other_version = old_cache_;
  other_version[0] = 4;
  for (const std::string& broken :
       {other_version, std::string(), old_cache_.substr(0, old_cache_.size() - 1)}) {
    WriteFile(cache_, broken);
    SetDate(cache_, xml_, 10);
    EXPECT_EQ(Load(false), "from XML");
    EXPECT_EQ(ReadFile(cache_), broken) << "it fails again next time";
    EXPECT_EQ(Load(true), "from XML");
    EXPECT_TRUE(IsRewritten());
  }
}

TEST_F(CacheTest, AMissingCacheIsWrittenOnDemand) {
  fs::remove_all(directory_ / "Cache");
  EXPECT_EQ(Load(false), "from XML");
  EXPECT_FALSE(fs::exists(directory_ / "Cache"));
  EXPECT_EQ(Load(true), "from XML");
  EXPECT_TRUE(IsRewritten());
}

TEST_F(CacheTest, WhatIsInTheWayOfACacheHurtsNoLoadButASave) {
  fs::remove_all(directory_ / "Cache");
  WriteFile(directory_ / "Cache", "a file");
  EXPECT_EQ(Load(true), "from XML");
  EXPECT_EQ(ReadFile(directory_ / "Cache"), "a file");
  EXPECT_THROW(Save(VEX("new"), xml_, true), ResourceNotAvailableException);
  EXPECT_EQ(Load(true), "new") << "the XML comes first";
  fs::remove(directory_ / "Cache");
  fs::create_directories(cache_ / "a directory");
  SetDate(cache_, xml_, 10);
  EXPECT_EQ(Load(true), "new");
  EXPECT_THROW(Save(VEX("newer"), xml_, true), ResourceNotAvailableException);
  fs::remove_all(cache_);
  ASSERT_EQ(mkfifo(cache_.c_str(), 0600), 0);
  SetDate(cache_, xml_, 10);
  EXPECT_EQ(Load(false), "newer") << "a pipe is not waited for";
}

TEST_F(CacheTest, ACacheWithoutItsXmlFileIsOfNoUse) {
  fs::remove(xml_);
  SetDate(cache_, cache_, -10);
  VEX document("as it was");
  EXPECT_EQ(MessageOf<VexException>([&] { document.LoadXML(File(xml_.string()), true); }),
            "file '" + xml_.string() + "' not accessable ");
  EXPECT_EQ(document.GetName(), "as it was");
  EXPECT_EQ(MessageOf<VexException>([&] { document.LoadXML(File("/no/such/a.xml"), true); }),
            "file '/no/such/a.xml' not accessable ");
}

TEST_F(CacheTest, ASaveWithoutACacheLeavesTheOldOneWhichIsThenPassedOver) {
  SetDate(cache_, xml_, -1);
  EXPECT_EQ(ReadFile(cache_), old_cache_);
  EXPECT_EQ(Load(false), "from XML");
}

TEST(CacheNameTest, IsThatOfTheXmlFileWithoutItsExtension) {
  const TemporaryDirectory directory;
  for (const auto& [name, cache] : {std::pair{"paper.xml", "paper.vexb"},
                                    {"paper.a.xml", "paper.a.vexb"},
                                    {"paper.vex", "paper.vex.vexb"},
                                    {"paper", "paper.vexb"},
                                    {".xml", ".xml.vexb"}}) {
    fs::remove_all(directory / "Cache");
    Save(VEX(), directory / name, true);
    EXPECT_TRUE(fs::exists(directory / "Cache" / cache)) << name;
  }
}

TEST(SaveTest, ReplacesWhatALinkPointsToAndKeepsItsPermissions) {
  const TemporaryDirectory directory;
  WriteFile(directory / "real.xml", "old");
  fs::permissions(directory / "real.xml", fs::perms(0640));
  fs::create_symlink("real.xml", directory / "link.xml");
  fs::create_symlink("new.xml", directory / "dangling.xml");
  Save(VEX("new"), directory / "link.xml", false);
  Save(VEX("new"), directory / "dangling.xml", false);
  EXPECT_TRUE(fs::is_symlink(directory / "link.xml"));
  EXPECT_TRUE(fs::is_symlink(directory / "dangling.xml"));
  EXPECT_EQ(fs::status(directory / "real.xml").permissions(), fs::perms(0640));
  const mode_t mask = umask(027);
  Save(VEX("new"), directory / "plain.xml", false);
  umask(mask);
  EXPECT_EQ(fs::status(directory / "plain.xml").permissions(), fs::perms(0640));
  for (const char* name : {"real.xml", "new.xml", "plain.xml"}) {
    VEX document;
    LoadFile(document, directory / name);
    EXPECT_EQ(document.GetName(), "new");
  }
  EXPECT_EQ(std::distance(fs::directory_iterator(directory / ""), fs::directory_iterator()), 5)
      << "no temporary file is left";
}

TEST(SaveTest, AFileThatCannotBeWrittenIsReportedWithTheReasonAndTheLocaleStays) {
  const TemporaryDirectory directory;
  const std::string locale = std::setlocale(LC_ALL, nullptr);
  for (const auto& [path, reason] :
       {std::pair{std::string("/dev/full"), "No space left on device"},
        {(directory / "").string(), "Is a directory"},
        {(directory / "none/a.xml").string(), "No such file or directory"}}) {
    EXPECT_EQ(MessageOf<ResourceNotAvailableException>(
                  [&path = path] { Save(VEX(std::string(100000, 'a')), path, false); }),
              "file '" + path + "' cannot be written: " + reason);
    EXPECT_EQ(std::setlocale(LC_ALL, nullptr), locale);
  }
  WriteFile(directory / "old.xml", "old");
  EXPECT_THROW(Save(VEX("a\xFF"), directory / "old.xml", true), VexException);
  EXPECT_EQ(ReadFile(directory / "old.xml"), "old");
  EXPECT_EQ(std::setlocale(LC_ALL, nullptr), locale);
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
