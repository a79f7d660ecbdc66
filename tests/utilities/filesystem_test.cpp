#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <fstream>
#include <string>

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/filesystem/directory.h"
#include "aldermoor/utilities/filesystem/file.h"

#include "tests/utilities/messageof.h"

namespace Aldermoor::Utilities::FileSystem {
namespace {

namespace fs = std::filesystem;
using Exceptions::InvalidArgumentException;
using Exceptions::ResourceNotAvailableException;
using Tests::MessageOf;

/// An empty directory of the test's own.
class FileSystemTest : public ::testing::Test {
 protected:
  FileSystemTest() {
    std::string path = ::testing::TempDir() + "aldermoorXXXXXX";
    if (::mkdtemp(path.data()) == nullptr) {
      throw std::runtime_error("no temporary directory");
    }
    root_ = fs::canonical(path).string();
    ::chmod(root_.c_str(), 0755);
  }
  ~FileSystemTest() override {
    ::chmod(root_.c_str(), 0755);
    fs::remove_all(root_);
  }

  std::string Path(const std::string& name) const { return root_ + "/" + name; }
  std::string Write(const std::string& name, mode_t mode = 0644) const {
    std::ofstream(Path(name)) << "12345";
    ::chmod(Path(name).c_str(), mode);
    return Path(name);
  }

  std::string root_;
};

/// A user whom file permissions bind, for a scope; root becomes nobody.
class OrdinaryUser {
 public:
  OrdinaryUser() {
    if (::geteuid() == 0 && ::seteuid(65534) != 0) {
      throw std::runtime_error("no ordinary user");
    }
  }
  ~OrdinaryUser() {
    if (::seteuid(::getuid()) != 0) {
      std::abort();
    }
  }
};

TEST_F(FileSystemTest, AFileIsNamedByItsPathWithEitherSeparator) {
  for (const char* given : {"/top/sub/file.xml", "\\top\\sub\\file.xml", "/top\\sub/file.xml"}) {
    EXPECT_EQ(File(given).GetName(), "file.xml");
    EXPECT_EQ(File(given).GetAbsoluteName(), "/top/sub/file.xml");
  }
  EXPECT_EQ(MessageOf<InvalidArgumentException>([] { File(""); }), "empty file name!!");
}

TEST_F(FileSystemTest, ARelativeNameIsTakenAgainstTheCurrentDirectoryOnce) {
  const fs::path before = fs::current_path();
  fs::current_path(root_);
  const File file("x");
  EXPECT_EQ(Directory(Directory::Current).GetAbsoluteName(), root_);
  fs::current_path(before);
  EXPECT_EQ(file.GetAbsoluteName(), Path("x"));
  EXPECT_EQ(file.GetDirectory().GetAbsoluteName(), root_);
}

TEST_F(FileSystemTest, AnExtensionIsComparedWithoutCase) {
  EXPECT_TRUE(File("/a/b.vexb").IsOfType(".VEXB"));
  EXPECT_TRUE(File("/a/b.VexB").IsOfType(".vexb"));
  EXPECT_FALSE(File("/a/b.vexb").IsOfType("vexb"));
  EXPECT_FALSE(File("/a/b.vexb").IsOfType(".vex"));
  EXPECT_FALSE(File("/a/b.xml.vexb").IsOfType(".xml.vexb"));
  EXPECT_FALSE(File("/a/bvexb").IsOfType(".vexb"));
  EXPECT_FALSE(File("/a/.vexb").IsOfType(".vexb")) << "a hidden file without an extension";
}

TEST_F(FileSystemTest, AFileTellsItsSizeAndTimeAndCanBeRemoved) {
  const File file(Write("some.txt"));
  const timespec times[] = {{1721037600, 0}, {1721037600, 999'999'999}};
  ASSERT_EQ(::utimensat(AT_FDCWD, Path("some.txt").c_str(), times, 0), 0);
  EXPECT_EQ(file.GetSize(), 5);
  EXPECT_EQ(file.GetModificationDate().GetSeconds(), 1721037600);
  EXPECT_TRUE(file.IsAccessable(true));
  EXPECT_TRUE(file.Remove());
  EXPECT_FALSE(file.Remove());
  EXPECT_FALSE(fs::exists(Path("some.txt")));
}

TEST_F(FileSystemTest, PermissionsDecideWhatCanBeReadAndWritten) {
  const std::string locked = Write("locked", 0);
  const File readable(Write("readable", 0444));
  ASSERT_EQ(::chmod(root_.c_str(), 0555), 0);
  Directory root(Directory::Named, root_);
  const OrdinaryUser user;
  EXPECT_TRUE(readable.IsAccessable(false));
  EXPECT_FALSE(readable.IsAccessable(true));
  EXPECT_FALSE(readable.Remove());
  EXPECT_EQ(MessageOf<ResourceNotAvailableException>([&] { root.CreateSubdir("new/sub"); }),
            "failed to create subdir '" + root_ + "/new'");
  // What cannot be opened has the current time and no size.
  for (const std::string& path : {Path("missing"), root_, locked}) {
    const File file(path);
    EXPECT_EQ(
        MessageOf<Exceptions::RuntimeException>([&] { static_cast<void>(file.GetSize()); }),
        "class Aldermoor::Platform::Posix::FileImpl::GetSize(): file '" + path + "' doesn't exist");
    EXPECT_NEAR(static_cast<double>(file.GetModificationDate().GetSeconds()),
                static_cast<double>(std::time(nullptr)), 2);
    EXPECT_FALSE(file.IsAccessable(false)) << path;
    EXPECT_FALSE(file.IsAccessable(true)) << path;
  }
}

TEST_F(FileSystemTest, ANamedDirectoryMustExist) {
  for (const std::string& path :
       {Path("missing"), Path("missing/"), Write("file"), std::string()}) {
    EXPECT_EQ(MessageOf<ResourceNotAvailableException>([&] { Directory(Directory::Named, path); }),
              "Error: Directory '" + path + "'does not exist");
  }
  for (const char* end : {"", "/", "\\"}) {
    const Directory directory(Directory::Named, root_ + end);
    EXPECT_EQ(directory.GetAbsoluteName(), root_);
    EXPECT_EQ(directory.GetName(), fs::path(root_).filename());
    EXPECT_EQ(directory.GetParent().GetAbsoluteName(), fs::path(root_).parent_path());
  }
}

TEST_F(FileSystemTest, TheOtherDirectoriesAreFoundByThemselves) {
  EXPECT_EQ(Directory(Directory::Application).GetAbsoluteName(),
            fs::read_symlink("/proc/self/exe").parent_path());
  EXPECT_EQ(Directory(Directory::System).GetParent().GetAbsoluteName(), "/");
  const auto drives = Directory(Directory::Drives).GetSubdirs("ignored");
  ASSERT_EQ(drives.size(), 1U);
  EXPECT_EQ(drives[0].GetAbsoluteName(), "/");
}

TEST_F(FileSystemTest, SubdirectoriesAreMadeWithAllTheirLevels) {
  Directory root(Directory::Named, root_);
  root.CreateSubdir("a\\b/c");
  root.CreateSubdir("a/b/c/");
  EXPECT_TRUE(fs::is_directory(Path("a/b/c")));
  for (const std::string name : {"", "/d", "\\d", "d:", "d:e"}) {
    EXPECT_EQ(MessageOf<InvalidArgumentException>([&] { root.CreateSubdir(name); }),
              "invalid sub-directory name '" + name + "'");
  }
  Write("a/file");
  EXPECT_EQ(MessageOf<ResourceNotAvailableException>([&] { root.CreateSubdir("a/file/x"); }),
            "failed to create subdir '" + root_ + "/a/file'");
}

TEST_F(FileSystemTest, EntriesAreListedByKindAndPatternInByteOrder) {
  Directory root(Directory::Named, root_);
  for (const char* name : {"b.xml", "a.xml", "Z.xml", "c.txt"}) {
    Write(name);
  }
  root.CreateSubdir("sub.xml");
  root.CreateSubdir("other");
  const auto joined = [](const auto& entries) {
    std::string names;
    for (const auto& entry : entries) {
      names += entry.GetName() + " ";
    }
    return names;
  };
  EXPECT_EQ(joined(root.GetFiles("*")), "Z.xml a.xml b.xml c.txt ");
  EXPECT_EQ(joined(root.GetFiles("[ab].x?l")), "a.xml b.xml ");
  EXPECT_EQ(joined(root.GetSubdirs("*")), "other sub.xml ");
  EXPECT_EQ(root.GetSubdirs("s*").at(0).GetAbsoluteName(), Path("sub.xml"));
  EXPECT_EQ(root.GetFiles("c*").at(0).GetAbsoluteName(), Path("c.txt"));
}

}  // namespace
}  // namespace Aldermoor::Utilities::FileSystem
