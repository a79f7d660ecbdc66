#include "colorbatch.h"

#include <algorithm>
#include <stdexcept>

#include <fmt/format.h>

#include "aldermoor/measure/measureexception.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "requestedcolor.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

std::optional<Measure::Context> MakeContext(const Vexdoc::Conditions& request, bool is_emission) {
  Vexdoc::Conditions source;
  if (is_emission) {
    source.AddAttribute(kIlluminationKey, kEmission);
  }
  try {
    Measure::Context context(request, source);
    context.ConvertSpectra(std::span<const float>(), {});
    return context;
  } catch (const Measure::MeasureException&) {
    return std::nullopt;  // each sample tells of it
  }
}

/// The spectrum of which the request would be computed; none if the sample holds the colour or if
/// there is more to find out.
const Vexdoc::Spectrum* DecidingSpectrum(const Vexdoc::Sample& sample,
                                         const Vexdoc::Conditions& request) {
  const Vexdoc::Spectrum* const spectrum =
      Vexdoc::HoldsColor(sample, request) ? nullptr : FindSpectrum(sample);
  return spectrum != nullptr && Vexdoc::IsOnMeasuringGrid(*spectrum) ? spectrum : nullptr;
}

}  // namespace

ColorBatch::ColorBatch(const Vexdoc::Conditions& request, std::size_t channels,
                       const JobOptions& jobs)
    : request_(request),
      channels_(channels),
      jobs_(jobs),
      reflecting_{MakeContext(request, false), {}, {}},
      emitting_{MakeContext(request, true), {}, {}} {}

ColorBatch::Kind& ColorBatch::KindOf(const Vexdoc::Spectrum& spectrum) {
  const bool emits = spectrum.GetConditions()->GetAttribute(kIlluminationKey, "") == kEmission;
  return emits ? emitting_ : reflecting_;
}

void ColorBatch::Add(const Place& place, const Vexdoc::Sample& sample) {
  const Vexdoc::Spectrum* const spectrum = DecidingSpectrum(sample, request_);
  Kind* const kind = spectrum != nullptr ? &KindOf(*spectrum) : nullptr;
  if (kind != nullptr && kind->context) {
    kind->rows.push_back(places_.size());
    kind->spectra.insert(kind->spectra.end(), spectrum->GetData().begin(),
                         spectrum->GetData().end());
    colors_.resize(colors_.size() + channels_);
  } else {
    const Vexdoc::ColorVector color = RequestedColor(sample, request_);
    const auto& channels = color.GetDatastore();
    if (channels.size() != channels_) {
      throw std::runtime_error(fmt::format("the colour has {} channels", channels.size()));
    }
    for (const auto& channel : channels) {
      colors_.push_back(channel.second);
    }
  }
  places_.push_back(place);
}

void ColorBatch::Compute() {
  for (const Kind* const kind : {&reflecting_, &emitting_}) {
    if (kind->rows.empty()) {
      continue;  // perhaps without a context
    }
    std::vector<float> colors(kind->rows.size() * channels_);
    InParallel(jobs_, kind->rows.size(), [&](std::size_t first, std::size_t count) {
      kind->context->ConvertSpectra(
          std::span(kind->spectra).subspan(first * kBands, count * kBands),
          std::span(colors).subspan(first * channels_, count * channels_));
    });
    for (std::size_t i = 0; i < kind->rows.size(); ++i) {
      std::copy_n(colors.begin() + static_cast<std::ptrdiff_t>(i * channels_), channels_,
                  colors_.begin() + static_cast<std::ptrdiff_t>(kind->rows[i] * channels_));
    }
  }
}

void ColorBatch::Clear() {
  places_.clear();
  colors_.clear();
  for (Kind* const kind : {&reflecting_, &emitting_}) {
    kind->spectra.clear();
    kind->rows.clear();
  }
}

}  // namespace Aldermoor::Tool
