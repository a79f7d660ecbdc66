#include "comparison.h"

#include <cmath>
#include <cstddef>
#include <stdexcept>

#include "aldermoor/measure/context.h"
#include "aldermoor/measure/measureexception.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "requestedcolor.h"
#include "samplerun.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

bool HasBands(const Vexdoc::Sample& sample) {
  const Vexdoc::Spectrum* const spectrum = FindSpectrum(sample);
  return spectrum != nullptr && Vexdoc::IsOnMeasuringGrid(*spectrum);
}

bool Reflects(const Vexdoc::Sample& sample) {
  return HasBands(sample) &&
         FindSpectrum(sample)->GetConditions()->GetAttribute(kIlluminationKey, "") != kEmission;
}

void Append(const Vexdoc::Sample& sample, std::vector<float>& spectra) {
  const std::vector<float>& values = FindSpectrum(sample)->GetData();
  spectra.insert(spectra.end(), values.begin(), values.end());
}

}  // namespace

float Comparison::Between(const Vexdoc::Sample& reference, const Vexdoc::Sample& sample) const {
  const float difference = HasBands(reference) && HasBands(sample)
                               ? BetweenSpectra(reference, sample)
                               : BetweenColors(reference, sample);
  if (!std::isfinite(difference)) {
    throw std::runtime_error("the difference is no number");
  }
  return difference;
}

std::vector<std::optional<float>> Comparison::BetweenSpectra(std::span<const SamplePair> pairs,
                                                             const JobOptions& jobs) const {
  std::vector<std::optional<float>> differences(pairs.size());
  std::vector<std::size_t> rows;
  std::vector<float> first;
  std::vector<float> second;
  for (std::size_t i = 0; i < pairs.size(); ++i) {
    if (Reflects(*pairs[i].reference) && Reflects(*pairs[i].sample)) {
      rows.push_back(i);
      Append(*pairs[i].reference, first);
      Append(*pairs[i].sample, second);
    }
  }
  std::vector<float> computed(rows.size());
  try {
    const Measure::Context context(RequestWithFormula());
    context.CompareSpectra(std::span<const float>(), std::span<const float>(), {});
    InParallel(jobs, rows.size(), [&](std::size_t from, std::size_t count) {
      const auto part = [&](std::vector<float>& spectra) {
        return std::span<const float>(spectra).subspan(from * kBands, count * kBands);
      };
      context.CompareSpectra(part(first), part(second), std::span(computed).subspan(from, count),
                             weights);
    });
  } catch (const Measure::MeasureException&) {
    return differences;
  }
  for (std::size_t i = 0; i < rows.size(); ++i) {
    if (computed[i] != Measure::kNoDifference && std::isfinite(computed[i])) {
      differences[rows[i]] = computed[i];
    }
  }
  return differences;
}

Vexdoc::Conditions Comparison::RequestWithFormula() const {
  Vexdoc::Conditions conditions = request;
  conditions.AddAttribute(kFormulaKey, formula);
  return conditions;
}

float Comparison::BetweenSpectra(const Vexdoc::Sample& reference,
                                 const Vexdoc::Sample& sample) const {
  const Vexdoc::Spectrum& first =
      OnReference([&]() -> const Vexdoc::Spectrum& { return ReflectanceOf(reference); });
  return Measure::ColorDifference(first, ReflectanceOf(sample), RequestWithFormula(), weights);
}

float Comparison::BetweenColors(const Vexdoc::Sample& reference,
                                const Vexdoc::Sample& sample) const {
  const Vexdoc::ColorVector first = OnReference([&] { return ColorOf(reference); });
  Vexdoc::Conditions conditions = *first.GetConditions();
  conditions.AddAttribute(kFormulaKey, formula);
  return Measure::ColorDifference(Vexdoc::ColorVector(conditions, first.GetDatastore()),
                                  ColorOf(sample), weights);
}

Vexdoc::ColorVector Comparison::ColorOf(const Vexdoc::Sample& sample) const {
  Vexdoc::ColorVector color = RequestedColor(sample, request);
  if (color.GetConditions()->GetAttribute(kIlluminationKey, "") == kEmission) {
    throw std::runtime_error("the colour is that of a light, not of a reflecting sample");
  }
  return color;
}

}  // namespace Aldermoor::Tool
