#include "samplerun.h"

#include <stdexcept>

#include <fmt/format.h>

#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "diagnostics.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

std::vector<Column> WithPlace(bool with_file, const std::vector<Column>& columns) {
  std::vector<Column> all;
  if (with_file) {
    all.push_back({"file"});
  }
  all.push_back({"set"});
  all.push_back({"sample"});
  all.insert(all.end(), columns.begin(), columns.end());
  return all;
}

bool TryBegin(SampleJob& job, const std::string& path, const Vexdoc::VEX& document) {
  try {
    job.Begin(path, document);
    return true;
  } catch (const OutputError&) {
    throw;
  } catch (const std::exception& e) {
    Report(fmt::format("{}: {}", path, e.what()));
    return false;
  }
}

}  // namespace

void ReportFailure(const Place& place, const Vexdoc::Sample& sample, const std::exception& reason) {
  const std::string content = DescribeAttributes(sample);
  Report(fmt::format("{}: {}/{}: {}{}{}{}", place.file, place.set, place.sample, reason.what(),
                     content.empty() ? "" : " (the sample holds ", content,
                     content.empty() ? "" : ")"));
}

const Vexdoc::Spectrum* FindSpectrum(const Vexdoc::Sample& sample) {
  for (const auto& [name, attribute] : sample.GetElements()) {
    if (const auto* const spectrum = dynamic_cast<const Vexdoc::Spectrum*>(attribute.Get())) {
      return spectrum;
    }
  }
  return nullptr;
}

const Vexdoc::Spectrum& SpectrumOf(const Vexdoc::Sample& sample) {
  const Vexdoc::Spectrum* const spectrum = FindSpectrum(sample);
  if (spectrum == nullptr) {
    throw std::runtime_error("there is no spectrum");
  }
  if (spectrum->GetData().size() != kBands) {
    throw std::runtime_error(fmt::format("the spectrum has {} values instead of {}",
                                         spectrum->GetData().size(), kBands));
  }
  if (const std::string fault = Vexdoc::GridFault(*spectrum); !fault.empty()) {
    throw std::runtime_error(fault);
  }
  return *spectrum;
}

const Vexdoc::Spectrum& ReflectanceOf(const Vexdoc::Sample& sample) {
  const Vexdoc::Spectrum& spectrum = SpectrumOf(sample);
  if (spectrum.GetConditions()->GetAttribute(kIlluminationKey, "") == kEmission) {
    throw std::runtime_error("the spectrum is that of a light, not of a reflecting sample");
  }
  return spectrum;
}

SampleTable::SampleTable(Format format, Output& output, bool with_file,
                         const std::vector<Column>& columns,
                         const std::map<std::string, std::string>& conditions)
    : with_file_(with_file),
      writer_(MakeRecordWriter(format, output, WithPlace(with_file, columns), conditions)) {}

void SampleTable::Add(const Place& place, const std::vector<Cell>& cells) {
  record_.clear();
  if (with_file_) {
    record_.emplace_back(std::string_view(place.file));
  }
  record_.emplace_back(std::string_view(place.set));
  record_.emplace_back(std::string_view(place.sample));
  record_.insert(record_.end(), cells.begin(), cells.end());
  writer_->Add(record_);
}

ExitStatus RunOverSamples(SampleJob& job, const InputOptions& inputs, const SampleFilter& filter,
                          Output& output) {
  std::size_t documents = 0;
  std::size_t matched = 0;
  bool failed = false;
  const auto visit = [&](const std::string& path, const Vexdoc::VEX& document) {
    ++documents;
    const std::size_t total =
        filter.ForEachSample(document, [](const auto&, const auto&, const auto&) {});
    matched += total;
    if (!TryBegin(job, path, document)) {
      failed = true;
      ++matched;  // the reason has been told
      return;
    }
    Progress progress(total);
    filter.ForEachSample(document, [&](const std::string& set, const std::string& name,
                                       const Vexdoc::Sample& sample) {
      const Place place{path, set, name};
      failed |= !TryFor(place, sample, [&] { job.Add(place, sample); });
      progress.Step();
    });
    job.EndDocument();
  };
  ExitStatus status = inputs.ForEachDocument(visit);
  if (documents == 0) {
    return status;  // the old output stays
  }
  if (matched == 0 && filter.IsSet()) {
    Report(filter.NoMatchText());
    failed = true;
  }
  job.End();
  output.Commit();
  return failed ? Worse(status, ExitStatus::kSomeFailed) : status;
}

}  // namespace Aldermoor::Tool
