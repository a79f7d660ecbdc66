#include "benchmarks/storebenchmark.h"

#include <chrono>
#include <filesystem>
#include <iostream>
#include <sstream>
#include <stdexcept>

#include "aldermoor/vexdoc/internals/binaryprovider.h"

#include "benchmarks/barestore.h"
#include "benchmarks/loadbenchmark.h"
#include "benchmarks/operations.h"
#include "benchmarks/peakmemory.h"

namespace Aldermoor::Benchmarks {
namespace {

namespace fs = std::filesystem;
using Utilities::FileSystem::File;
using Vexdoc::VEX;

constexpr double kCachedToXmlTarget = 1.0 / 20.0;
constexpr double kCachedToBareTarget = 6.0;
constexpr double kMemoryTarget = 2.5;
constexpr double kXmlSaveTarget = 1.5;
constexpr double kCacheSaveTarget = 4.0;
constexpr double kMicro = 1e-6;

struct Size {
  unsigned samples;
  int repetitions;
  bool has_targets;
};

constexpr Size kSizes[] = {
    {1000, 9, false}, {10000, 5, true}, {100000, 3, false}, {200000, 3, true}};

// The cache counts if it is newer, which files made in one second are not.
void MakeOld(const std::string& path) {
  fs::last_write_time(path, fs::last_write_time(path) - std::chrono::hours(1));
}

double SecondsOfCachedLoad(const std::string& path) {
  ForgetConditions();
  VEX document;
  return SecondsOf([&] { document.LoadXML(File(path), false); });
}

double SecondsOfBareLoad(const std::string& cache_path, const VEX& model) {
  std::string bytes;
  const double reading = SecondsOf([&] { bytes = ReadFile(cache_path); });
  std::unique_ptr<BareTree> tree;
  return reading + SecondsOf([&] { tree = std::make_unique<BareTree>(model); });
}

double SecondsOfXmlSave(const VEX& document) {
  std::ostringstream out;
  return SecondsOf([&] { document.Store(out); });
}

double SecondsOfFind(const VEX& document) {
  const auto& set = *document.GetSampleSets().front().second;
  const std::string set_name = set.GetName();
  std::size_t found = 0;
  const double seconds = SecondsOf([&] {
    for (const auto& sample : set.GetSamples()) {
      found += document.FindSample(set_name, sample.first).IsNull() ? 0U : 1U;
    }
  });
  if (found != set.Size()) {
    throw std::runtime_error("a sample was not found");
  }
  return seconds;
}

double SecondsOfWalk(const VEX& document) {
  std::size_t count = 0;
  const double seconds = SecondsOf([&] {
    for (auto position = document.GetFirstSample(""); position.HasNext(); ++position) {
      count += position.Dereference().IsNull() ? 0U : 1U;
    }
  });
  if (count != document.GetSampleSets().front().second->Size()) {
    throw std::runtime_error("the walk passed a sample");
  }
  return seconds;
}

std::string CachedLoadLabel(const std::string& name) {
  return "load " + name + " from the cache";
}
std::string XmlSaveLabel(const std::string& name) {
  return "save " + name + " as XML";
}
std::string CacheSaveLabel(const std::string& name) {
  return "save " + name + " as cache";
}
std::string FindLabel(const std::string& name) {
  return "find and walk " + name;
}

}  // namespace

StoreBenchmark::StoreBenchmark(const Workspace& workspace) {
  for (const Size& size : kSizes) {
    Subject& subject = subjects_.emplace_back();
    subject.name = SamplesName(size.samples);
    subject.samples = size.samples;
    std::cerr << "files of " << subject.name << " ..." << std::endl;
    subject.path = workspace.PathOf("stored " + subject.name);
    Load(subject.document, {subject.name, "", SamplesText(size.samples)}, Source::kStream);
    File file(subject.path);
    subject.document.SaveXML(file, true);
    MakeOld(subject.path);
    const fs::path path = subject.path;
    subject.cache_path = path.parent_path() / "Cache" / path.stem().concat(".vexb");
    subject.cache_bytes = ReadFile(subject.cache_path);
    if (size.has_targets) {
      const Document document{subject.name, subject.path, ""};
      subject.memory_ratio = PeakMemory(Task::kLoad, document, Source::kFile) /
                             PeakMemory(Task::kTree, document, Source::kFile);
    }
    Register(subject, size.repetitions);
  }
}

void StoreBenchmark::Register(const Subject& subject, int repetitions) {
  RegisterPair(
      CachedLoadLabel(subject.name),
      [&subject] { return SecondsOfBareLoad(subject.cache_path, subject.document); },
      [&subject] { return SecondsOfCachedLoad(subject.path); })
      ->Iterations(1)
      ->Repetitions(repetitions);
  RegisterPair(
      XmlSaveLabel(subject.name),
      [&subject] { return SecondsOf([&] { SerialiseBareDom(subject.document); }); },
      [&subject] { return SecondsOfXmlSave(subject.document); })
      ->Iterations(1)
      ->Repetitions(subject.samples > 50000 ? 1 : repetitions);
  RegisterPair(
      CacheSaveLabel(subject.name),
      [&subject] {
        return SecondsOf([&] { WriteBareFile(subject.cache_path, subject.cache_bytes); });
      },
      [&subject] {
        File cache(subject.cache_path);
        return SecondsOf([&] {
          Vexdoc::Internals::BinaryProvider(const_cast<VEX*>(&subject.document)).Write(cache);
        });
      })
      ->Iterations(1)
      ->Repetitions(repetitions);
  RegisterPair(
      FindLabel(subject.name), [&subject] { return SecondsOfWalk(subject.document); },
      [&subject] { return SecondsOfFind(subject.document); })
      ->Iterations(1)
      ->Repetitions(repetitions);
}

Figures StoreBenchmark::Results(const Timings& timings) const {
  Figures figures;
  for (const Subject& subject : subjects_) {
    const bool has_targets = subject.memory_ratio != 0.0;
    const auto target = [has_targets](double value) {
      return has_targets ? std::optional<double>(value) : std::nullopt;
    };
    const auto cost = [&subject](double seconds) {
      return seconds / subject.samples / kMicro;
    };
    const std::string load = CachedLoadLabel(subject.name);
    const double seconds = timings.SubjectSeconds(load);
    figures.push_back({load + ": a sample", cost(seconds), "us", {}});
    figures.push_back({load + ": time / XML",
                       seconds / timings.SubjectSeconds(LoadBenchmark::CostLabel(subject.name)),
                       "ratio", target(kCachedToXmlTarget)});
    figures.push_back({load + ": time / bare read and tree", timings.Ratio(load), "ratio",
                       target(kCachedToBareTarget)});
    if (has_targets) {
      figures.push_back(
          {load + ": peak memory / tree", subject.memory_ratio, "ratio", kMemoryTarget});
    }
    const std::string xml = XmlSaveLabel(subject.name);
    figures.push_back({xml + ": a sample", cost(timings.SubjectSeconds(xml)), "us", {}});
    figures.push_back(
        {xml + ": time / bare DOM", timings.Ratio(xml), "ratio", target(kXmlSaveTarget)});
    const std::string cache = CacheSaveLabel(subject.name);
    figures.push_back({cache + ": a sample", cost(timings.SubjectSeconds(cache)), "us", {}});
    figures.push_back(
        {cache + ": time / bare write", timings.Ratio(cache), "ratio", target(kCacheSaveTarget)});
    const std::string find = FindLabel(subject.name);
    figures.push_back(
        {"find one of " + subject.name, cost(timings.SubjectSeconds(find)), "us", {}});
    figures.push_back(
        {"step over one of " + subject.name, cost(timings.YardstickSeconds(find)), "us", {}});
  }
  return figures;
}

}  // namespace Aldermoor::Benchmarks
