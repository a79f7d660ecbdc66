#include "samplevalues.h"

#include <limits>
#include <optional>
#include <string>
#include <vector>

#include <pybind11/stl.h>

#include "aldermoor/measure/measureexception.h"
#include "aldermoor/measure/paperwhite.h"
#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "lock.h"
#include "request.h"

namespace Aldermoor::Python {

namespace py = pybind11;
using Utilities::Exceptions::ResourceNotAvailableException;
using Vexdoc::Sample;
using Vexdoc::SampleSet;
using Vexdoc::VEX;

namespace {

constexpr float kNaN = std::numeric_limits<float>::quiet_NaN();
constexpr const char* kIllumination = "Colorimetric.Illumination";
constexpr const char* kEmission = "Emission";

// Colorimetry tells lights by their illumination alone, so that goes before the type.
std::string TypeOf(const Vexdoc::Spectrum& spectrum) {
  const auto& conditions = spectrum.GetConditions();
  if (conditions.IsNull()) {
    return "";
  }
  return conditions->GetAttribute(kIllumination, "") == kEmission
             ? kEmission
             : conditions->GetAttribute("Physical.SpectrumType", "");
}

Vexdoc::Conditions MakeRequest(const std::string& space, const Viewing& viewing,
                               const std::optional<Bands>& paper) {
  Vexdoc::Conditions request = MakeConditions(viewing, space);
  if (paper) {
    request.AddAttribute("Colorimetric.WhiteBase", "Paper");
  }
  return request;
}

// Whether a colour that the library converted from a stored one holds for what was asked: it
// cannot be taken to another illuminant, and comes back under its own.  Device colours name none,
// and the colour of a light is its own.
bool HoldsFor(const Vexdoc::Conditions& request, const Vexdoc::Conditions& own) {
  constexpr const char* kSpace = "ColorSpaceDescription.Type";
  const std::string space = own.GetAttribute(kSpace, "");
  if (space == "RGB" || space == "CMYK") {
    return true;
  }
  const std::string illumination = own.GetAttribute(kIllumination, "");
  for (const auto& [key, wanted] : request.GetAttributes()) {
    const bool is_own = key == kIllumination && illumination == kEmission;
    if (key != kSpace && !is_own && own.GetAttribute(key, "") != wanted) {
      return false;
    }
  }
  // By the values alone: the library gives the curve other conditions.
  return illumination != "Userdefined" ||
         (own.HasCustomIllumination() &&
          own.GetCustomIllumination().GetData() == request.GetCustomIllumination().GetData());
}

const Vexdoc::Spectrum& FindSpectrum(const Sample& sample, const std::optional<std::string>& type) {
  for (const auto& [name, attribute] : sample.GetElements()) {
    const auto* const spectrum = dynamic_cast<const Vexdoc::Spectrum*>(attribute.Get());
    if (spectrum != nullptr && (!type || TypeOf(*spectrum) == *type)) {
      return *spectrum;
    }
  }
  throw ResourceNotAvailableException("the sample '" + sample.GetName() + "' has no spectrum", "");
}

std::vector<float> FindColor(const Sample& sample, const Vexdoc::Conditions& request) {
  if (const std::string fault = Vexdoc::GridFault(sample, request); !fault.empty()) {
    throw Measure::MeasureException(fault, "");
  }
  const auto found = Utilities::Tools::DynamicCast<Vexdoc::ColorVector>(
      sample.GetSampleAttribute("VEXColorVector", request, false));
  if (!HoldsFor(request, *found->GetConditions())) {
    throw Measure::MeasureException(
        "the sample has a colour, but for other conditions, and no spectrum to compute it from",
        "");
  }
  std::vector<float> channels;
  for (const auto& [label, value] : found->GetDatastore()) {
    channels.push_back(value);
  }
  return channels;
}

void ForEachSet(const VEX& document, auto use) {
  for (const auto& [name, set] : document.GetElements()) {
    use(*set);
  }
}

void ForEachSet(const SampleSet& set, auto use) {
  use(set);
}

/// A row of `width` numbers for every sample, as SampleRows of Python.
class RowTable {
 public:
  explicit RowTable(std::size_t width) : width_(width) {}

  // What `row` returns for each sample; NaN where that fails or is not of the width.
  template <class Container, class Row>
  void Fill(const Container& container, Row row) {
    ForEachSet(container, [&](const SampleSet& set) {
      for (const auto& [name, sample] : set.GetElements()) {
        names_.push_back(name);
        sets_.push_back(set.GetName());
        Append(row, *sample);
      }
    });
  }

  py::object ToPython() const {
    const auto width = static_cast<py::ssize_t>(width_);
    const FloatArray values({static_cast<py::ssize_t>(names_.size()), width}, values_.data());
    return py::module_::import("aldermoor._results").attr("SampleRows")(values, names_, sets_);
  }

 private:
  template <class Row>
  void Append(Row& row, const Sample& sample) {
    try {
      const std::vector<float>& numbers = row(sample);
      if (numbers.size() == width_) {
        values_.insert(values_.end(), numbers.begin(), numbers.end());
        return;
      }
    } catch (const Utilities::Exceptions::RuntimeException&) {
      // The sample cannot give it; who wants to know why asks for it alone.
    }
    values_.resize(values_.size() + width_, kNaN);
  }

  std::size_t width_;
  std::vector<float> values_;
  std::vector<std::string> names_;
  std::vector<std::string> sets_;
};

template <class Container>
py::object SpectraTable(const Container& container, const std::optional<std::string>& type) {
  if (type) {
    CheckWord("type", *type, "SPECTRUM_TYPES");
  }
  RowTable table(kSpectrumBands);
  {
    const LibraryAlone library;
    table.Fill(container, [&](const Sample& sample) -> const std::vector<float>& {
      const Vexdoc::Spectrum& spectrum = FindSpectrum(sample, type);
      if (const std::string fault = Vexdoc::GridFault(spectrum); !fault.empty()) {
        throw Measure::MeasureException(fault, "");
      }
      return spectrum.GetData();
    });
  }
  return table.ToPython();
}

template <class Container>
py::object ColorsTable(const Container& container, const std::string& space,
                       const py::object& illuminant, const std::string& observer,
                       const py::object& paper) {
  const std::optional<Bands> paper_white = ReadPaper(paper);
  RowTable table(CountChannels(space));
  const LibraryLock lock;
  const Vexdoc::Conditions request = MakeRequest(space, {illuminant, observer}, paper_white);
  {
    const LibraryAlone library;
    std::optional<Measure::PaperWhite> scope;
    if (paper_white) {
      scope.emplace(MakeSpectrum(*paper_white));
    }
    table.Fill(container, [&](const Sample& sample) { return FindColor(sample, request); });
  }
  return table.ToPython();
}

}  // namespace

FloatArray ToArray(const std::vector<float>& values) {
  return FloatArray(static_cast<py::ssize_t>(values.size()), values.data());
}

const std::vector<float>& SpectrumOf(const Sample& sample, const std::optional<std::string>& type) {
  return FindSpectrum(sample, type).GetData();
}

FloatArray ColorOf(const Sample& sample, const std::string& space, const py::object& illuminant,
                   const std::string& observer, const py::object& paper) {
  const std::optional<Bands> paper_white = ReadPaper(paper);
  const LibraryLock lock;
  const Vexdoc::Conditions request = MakeRequest(space, {illuminant, observer}, paper_white);
  std::optional<Measure::PaperWhite> scope;
  if (paper_white) {
    scope.emplace(MakeSpectrum(*paper_white));
  }
  return ToArray(FindColor(sample, request));
}

py::object SpectraOf(const VEX& document, const std::optional<std::string>& type) {
  return SpectraTable(document, type);
}

py::object SpectraOf(const SampleSet& set, const std::optional<std::string>& type) {
  return SpectraTable(set, type);
}

py::object ColorsOf(const VEX& document, const std::string& space, const py::object& illuminant,
                    const std::string& observer, const py::object& paper) {
  return ColorsTable(document, space, illuminant, observer, paper);
}

py::object ColorsOf(const SampleSet& set, const std::string& space, const py::object& illuminant,
                    const std::string& observer, const py::object& paper) {
  return ColorsTable(set, space, illuminant, observer, paper);
}

}  // namespace Aldermoor::Python
