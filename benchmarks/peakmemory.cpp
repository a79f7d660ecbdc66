#include "benchmarks/peakmemory.h"

#include <array>
#include <fstream>
#include <iostream>
#include <stdexcept>
#include <string_view>
#include <vector>

#include <sys/wait.h>
#include <unistd.h>

#include "aldermoor/vexdoc/xmlplatform.h"

#include "benchmarks/figures.h"

namespace Aldermoor::Benchmarks {
namespace {

constexpr std::string_view kChildFlag = "--peak-memory";
constexpr int kChildArguments = 5;  // program, flag, task, source, path
constexpr int kProcesses = 3;
constexpr double kBytesPerKilobyte = 1024.0;

constexpr std::array<const char*, 4> kTaskNames = {"idle", "parse", "load", "tree"};

// "VmHWM" is the high-water mark of this program's own memory, "VmRSS" what it takes now.  The
// figure of getrusage is no use here: it also holds the peak that the process had before it became
// this program.
long OwnKilobytes(std::string_view kind) {
  std::ifstream in("/proc/self/status");
  for (std::string word; in >> word;) {
    long kilobytes = 0;
    if (word.ends_with(':') && word.starts_with(kind) && in >> kilobytes) {
      return kilobytes;
    }
  }
  throw std::runtime_error("the resident memory cannot be read");
}

std::string ReadToEnd(int descriptor) {
  std::string text;
  std::array<char, 256> chunk{};
  for (ssize_t got = 0; (got = read(descriptor, chunk.data(), chunk.size())) > 0;) {
    text.append(chunk.data(), static_cast<std::size_t>(got));
  }
  return text;
}

double KilobytesOfChild(Task task, const Document& document, Source source) {
  std::array<int, 2> ends{};
  if (pipe(ends.data()) != 0) {
    throw std::runtime_error("cannot make a pipe");
  }
  const pid_t child = fork();
  if (child == 0) {
    dup2(ends[1], STDOUT_FILENO);
    execl("/proc/self/exe", "benchmarks", kChildFlag.data(),
          kTaskNames[static_cast<std::size_t>(task)], NameOf(source), document.path.c_str(),
          static_cast<char*>(nullptr));
    _exit(127);
  }
  close(ends[1]);
  const std::string text = ReadToEnd(ends[0]);
  close(ends[0]);
  int status = 0;
  if (child < 0 || waitpid(child, &status, 0) != child || status != 0) {
    throw std::runtime_error("a child process that measures memory failed");
  }
  return std::stod(text);
}

}  // namespace

double PeakMemory(Task task, const Document& document, Source source) {
  std::vector<double> kilobytes;
  for (int i = 0; i < kProcesses; ++i) {
    kilobytes.push_back(KilobytesOfChild(task, document, source) -
                        KilobytesOfChild(Task::kIdle, document, source));
  }
  return Median(kilobytes) * kBytesPerKilobyte;
}

bool IsChild(int argc, char** argv) {
  return argc == kChildArguments && argv[1] == kChildFlag;
}

int RunChild(char** argv) {
  const std::string_view task = argv[2];
  const Source source = argv[3] == std::string_view("file") ? Source::kFile : Source::kStream;
  const Vexdoc::XMLPlatform platform;
  Document document{"", argv[4], ""};
  if (source == Source::kStream) {
    document.text = ReadFile(document.path);
  }
  Vexdoc::VEX vex;
  if (task == "load" || task == "tree") {
    Load(vex, document, source);
  } else if (task == "parse") {
    Parse(document, source);
  }
  std::cout << OwnKilobytes(task == "tree" ? "VmRSS" : "VmHWM") << std::endl;
  return 0;
}

}  // namespace Aldermoor::Benchmarks
