// Whatever fails, and whenever the process ends: a file is the old document or the new one.

#include <cerrno>
#include <chrono>
#include <clocale>
#include <csignal>
#include <iostream>
#include <set>
#include <span>
#include <system_error>

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include "tests/faults/interposition.h"
#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

namespace fs = std::filesystem;
using Utilities::FileSystem::File;

// An operation, and the files that it finds; ages in seconds, 0 for none.
struct Scene {
  const char* name;
  bool saves;
  bool uses_cache;
  int age_of_xml;
  int age_of_cache;
};

// The first two fail at each allocation too.
constexpr Scene kScenes[] = {{"save, writing a cache", true, true, 100, 50},
                             {"load, writing a cache", false, true, 100, 0},
                             {"first save", true, true, 0, 0},
                             {"load past old cache", false, true, 100, 200},
                             {"save", true, false, 100, 50},
                             {"load", false, false, 100, 0},
                             {"load from cache", false, false, 100, 50}};

// Without these, what is saved is not safe.
const std::set<std::string> kDecisive = {"write", "fsync", "rename", "mkdir", "fchmod"};

std::ptrdiff_t OpenDescriptors() {
  return std::distance(fs::directory_iterator("/proc/self/fd"), fs::directory_iterator());
}

// A document with its texts, made once.
struct Known {
  explicit Known(const VEX& vex) : document(vex), xml(XmlOf(vex)), text(DocumentText(vex)) {}

  VEX document;
  std::string xml;
  std::string text;
};

VEX AllKinds(std::size_t description) {
  VEX document;
  LoadFile(document, DataFile("legal", "all_kinds.xml"));
  document.SetDescription(std::string(description, 'x'));
  return document;
}

class FaultsTest : public ::testing::Test {
 protected:
  void Prepare(const Scene& scene) {
    fs::remove_all(directory_ / "");
    fs::create_directories(directory_ / "Cache");
    loaded_ = untouched_.document;
    old_xml_ = scene.age_of_xml == 0 ? "" : old_.xml;
    old_cache_ = CacheOf(scene.age_of_cache > scene.age_of_xml ? VEX("stale") : old_.document);
    for (const auto& [path, bytes, age] :
         {std::tuple(xml_, old_xml_, scene.age_of_xml), {cache_, old_cache_, scene.age_of_cache}}) {
      if (age > 0) {
        WriteFile(path, bytes);
        fs::last_write_time(path, fs::file_time_type::clock::now() - std::chrono::seconds(age));
      }
    }
    fs::remove(directory_ / "Cache", ignored_);  // if it is empty
  }

  Outcome Run(const Scene& scene, const Fault& fault) {
    return RunWith(fault, [&] {
      if (scene.saves) {
        Save(new_, scene.uses_cache);
      } else {
        loaded_.LoadXML(File(xml_.string()), scene.uses_cache);
      }
    });
  }

  void Save(const Known& known, bool updateCache) {
    File file(xml_.string());
    known.document.SaveXML(file, updateCache);
  }

  std::string LoadedText() {
    VEX document;
    document.LoadXML(File(xml_.string()), false);
    return DocumentText(document);
  }

  // That XML and cache are whole and of one document.  Returns what else is there.
  std::set<std::string> CheckFiles() {
    const std::string xml = fs::exists(xml_) ? ReadFile(xml_) : "";
    std::string text;
    for (const Known* known : {&old_, &new_, &other_}) {
      text = xml == known->xml ? known->text : text;
    }
    EXPECT_EQ(text.empty(), xml.empty() && old_xml_.empty()) << xml.size() << " bytes of XML";
    EXPECT_EQ(xml.empty() ? "" : LoadedText(), text);
    const std::string cache = fs::exists(cache_) ? ReadFile(cache_) : old_cache_;
    EXPECT_TRUE(cache == old_cache_ || DocumentText(*LoadedCache(cache)) == text) << cache;
    std::set<std::string> others;
    for (const auto& entry : fs::recursive_directory_iterator(directory_ / "")) {
      if (entry.path() != xml_ && entry.path() != cache_ && entry.path() != stamp_ &&
          !entry.is_directory()) {
        others.insert(entry.path().extension());
      }
    }
    return others;
  }

  void Check(const Scene& scene, const Outcome& outcome) {
    EXPECT_EQ(std::setlocale(LC_ALL, nullptr), locale_);
    EXPECT_EQ(OpenDescriptors(), descriptors_);
    EXPECT_EQ(CheckFiles(), std::set<std::string>());
    const bool has_loaded = !scene.saves && !outcome.has_failed;
    EXPECT_EQ(DocumentText(loaded_), has_loaded ? old_.text : untouched_.text);
    if (!outcome.has_failed) {
      EXPECT_EQ(ReadFile(xml_), scene.saves ? new_.xml : old_.xml);
      EXPECT_FALSE(scene.saves && kDecisive.contains(outcome.call) &&
                   outcome.error != kShortCount && outcome.error != EINTR);
      return;
    }
    reported_.insert(outcome.call);
    // Where there is no memory for a trace either, it is what it was.
    EXPECT_TRUE(outcome.is_traceable || outcome.message == "std::bad_alloc");
    EXPECT_TRUE(outcome.error != kShortCount && outcome.error != EINTR);
    const auto tells = [&](const std::string& text) {
      return outcome.error == 0 || outcome.message.find(text) != std::string::npos;
    };
    EXPECT_TRUE(tells((directory_ / "").parent_path()));
    // Only what is said of directories has no room for a reason.
    EXPECT_TRUE(!scene.saves || tells(std::generic_category().message(outcome.error)) ||
                tells("failed to create subdir") || tells("Error: Directory"));
  }

  const Known old_{AllKinds(10)};
  const Known new_{AllKinds(70000)};  // more than one call writes
  const Known other_{VEX("other")};
  const Known untouched_{VEX("as it was")};
  const TemporaryDirectory directory_;
  const fs::path xml_ = directory_ / "paper.xml";
  const fs::path cache_ = directory_ / "Cache/paper.vexb";
  const fs::path stamp_ = directory_ / "Cache/paper.vexb.stamp";
  const std::string locale_ = std::setlocale(LC_ALL, "C.UTF-8");
  const std::ptrdiff_t descriptors_ = OpenDescriptors();
  VEX loaded_;
  std::string old_xml_;
  std::string old_cache_;
  std::set<std::string> reported_;  // calls whose failure came out at least once
  std::error_code ignored_;
};

TEST_F(FaultsTest, AnyCallThatFailsLeavesTheOldFileOrTheNewAndIsReported) {
  int allocations = 0;
  for (const Fault::Kind kind : {Fault::kFile, Fault::kAllocation, Fault::kAllocations}) {
    const std::span scenes(kScenes);
    for (const Scene& scene : kind == Fault::kFile ? scenes : scenes.first(2)) {
      Outcome outcome;
      for (Fault fault{kind, 1}; fault.number == 1 || outcome.was_reached; ++fault.number) {
        fault.variant = 0;
        do {
          Prepare(scene);
          outcome = Run(scene, fault);
          SCOPED_TRACE(scene.name + (" " + outcome.call) + " " + std::to_string(fault.number) +
                       " error " + std::to_string(outcome.error) + ": " + outcome.message);
          Check(scene, outcome);
          ++fault.variant;
        } while (outcome.error != 0);
        allocations += kind == Fault::kFile ? 0 : 1;
      }
    }
  }
  EXPECT_TRUE(reported_.contains("close"));
  EXPECT_EQ(InjectedFaults().size(), 13U) << "not all functions that can fail were seen";
  EXPECT_GT(allocations, 1000);
  for (const auto& [call, count] : InjectedFaults()) {
    std::cout << call << " " << count << ", ";
  }
  std::cout << "allocation " << allocations << " faults injected\n";
}

TEST_F(FaultsTest, AnyAllocationThatFailsShowsInAStreamAndLeavesALoadedDocumentEmpty) {
  for (const Fault::Kind kind : {Fault::kAllocation, Fault::kAllocations}) {
    Outcome outcome;
    for (long number = 1; number == 1 || outcome.was_reached; ++number) {
      std::istringstream in(old_.xml);
      outcome = RunWith({kind, number}, [&] { loaded_.Load(in); });
      EXPECT_TRUE(outcome.has_failed ? loaded_.Size() == 0 : DocumentText(loaded_) == old_.text);
    }
    for (long number = 1; number == 1 || outcome.was_reached; ++number) {
      std::ostringstream out;
      outcome = RunWith({kind, number}, [&] { old_.document.Store(out); });
      EXPECT_TRUE(outcome.has_failed || !out || out.str() == old_.xml) << number;
    }
  }
}

TEST_F(FaultsTest, AProcessThatEndsAtAnyFileOperationLeavesTheOldFileOrTheNew) {
  int deaths = 0;
  for (const Scene& scene : kScenes) {
    int status = 0;
    for (long number = 1; number == 1 || WIFSIGNALED(status); ++number) {
      Prepare(scene);
      const pid_t child = fork();
      if (child == 0) {
        Run(scene, {Fault::kFile, number, 0, [] {
                      kill(getpid(), SIGKILL);
                    }});
        _exit(0);
      }
      ASSERT_EQ(waitpid(child, &status, 0), child);
      SCOPED_TRACE(scene.name + (" " + std::to_string(number)));
      for (const std::string& leftover : CheckFiles()) {
        EXPECT_EQ(leftover, ".tmp");
      }
      EXPECT_TRUE(!fs::exists(cache_) || ReadFile(cache_) == old_cache_ || fs::exists(stamp_))
          << "a new cache without a stamp would count by its date";
      deaths += WIFSIGNALED(status) ? 1 : 0;
    }
  }
  EXPECT_GT(deaths, 50);
  std::cout << deaths << " processes ended\n";
}

TEST_F(FaultsTest, AnotherSaveAtAnyMomentLeavesOneDocumentAndNoCacheOfAnother) {
  for (const Scene& scene : std::span(kScenes).first(4)) {
    Outcome outcome;
    for (long number = 1; number == 1 || outcome.was_reached; ++number) {
      Prepare(scene);
      outcome = Run(scene, {Fault::kFile, number, 0, [&] {
                              Save(other_, true);
                            }});
      SCOPED_TRACE(scene.name + (" " + std::to_string(number)) + " " + outcome.message);
      EXPECT_EQ(CheckFiles(), std::set<std::string>());
    }
  }
}

// The flush takes its time, and the file gets a date from before the cache of the other save.
TEST_F(FaultsTest, ASlowCallOfASaveLetsNoCacheOfAnotherSaveAnswerForIt) {
  for (const Scene& scene : kScenes) {
    Outcome outcome;
    for (long number = 1; number == 1 || outcome.was_reached; ++number) {
      Prepare(scene);
      outcome = Run(scene, {Fault::kFile, number, 0, [&] {
                              Save(other_, true);
                              fs::last_write_time(cache_, fs::file_time_type::clock::now() +
                                                              std::chrono::seconds(10));
                            }});
      SCOPED_TRACE(scene.name + (" " + std::to_string(number)) + " " + outcome.message);
      const std::string xml = ReadFile(xml_);
      EXPECT_EQ(LoadedText(), xml == other_.xml ? other_.text
                              : xml == new_.xml ? new_.text
                                                : old_.text);
      EXPECT_TRUE(xml == other_.xml || xml == new_.xml || xml == old_.xml);
    }
  }
}

// The savers date their caches ahead, so that the date alone would let each of them count; one
// without a stamp, for which nothing but the date speaks, must not be there then.
TEST_F(FaultsTest, TwoProcessesThatSaveToOneFileLeaveOneWholeDocumentAndAReaderReadsIt) {
  Prepare(kScenes[0]);
  fs::remove(cache_);
  for (const Known* known : {&new_, &other_}) {
    if (fork() == 0) {
      for (int round = 0; round < 100; ++round) {
        Save(*known, round % 2 == 0);
        fs::last_write_time(cache_, fs::file_time_type::clock::now() + std::chrono::seconds(10),
                            ignored_);
      }
      _exit(0);
    }
  }
  const auto state = [this] {
    struct stat status {};
    EXPECT_EQ(stat(xml_.c_str(), &status), 0);
    return std::tuple(status.st_ino, status.st_ctim.tv_sec, status.st_ctim.tv_nsec);
  };
  int status = 0;
  int compared = 0;
  for (int ended = 0; ended<2; ended += waitpid(-1, &status, WNOHANG)> 0 ? 1 : 0) {
    const auto before = state();
    const std::string xml = ReadFile(xml_);
    const std::string text = LoadedText();
    EXPECT_TRUE(text == old_.text || text == new_.text || text == other_.text) << text;
    if (state() == before) {
      EXPECT_EQ(text, xml == other_.xml ? other_.text : xml == new_.xml ? new_.text : old_.text);
      ++compared;
    }
    ASSERT_EQ(status, 0);
  }
  EXPECT_EQ(status, 0);
  EXPECT_GT(compared, 10);
  for (const auto& entry : fs::recursive_directory_iterator(directory_ / "")) {
    EXPECT_NE(entry.path().extension(), ".tmp");
  }
  std::cout << compared << " reads compared\n";
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
