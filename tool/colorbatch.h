#ifndef ALDERMOOR_TOOL_COLORBATCH_H
#define ALDERMOOR_TOOL_COLORBATCH_H

#include <optional>
#include <span>
#include <vector>

#include "aldermoor/measure/context.h"
#include "aldermoor/vexdoc/sample.h"

#include "jobs.h"
#include "samplerun.h"

namespace Aldermoor::Tool {

/// The colours of samples under one request.  Spectra are gathered and computed many at a time;
/// samples that hold something else are asked at once, one by one.
class ColorBatch {
 public:
  ColorBatch(const Vexdoc::Conditions& request, std::size_t channels, const JobOptions& jobs);

  /// Throws: what the request throws, unless the sample is put off.
  void Add(const Place& place, const Vexdoc::Sample& sample);
  bool IsFull() const { return places_.size() >= kMost; }

  /// Computes what was put off, calls `write(place, color)` for all samples in their order, and
  /// begins anew.
  template <class Write>
  void Flush(Write write) {
    Compute();
    for (std::size_t row = 0; row < places_.size(); ++row) {
      write(places_[row], std::span<const float>(colors_).subspan(row * channels_, channels_));
    }
    Clear();
  }

 private:
  static constexpr std::size_t kMost = 65536;

  /// Spectra of one kind and the rows to which they belong.
  struct Kind {
    std::optional<Measure::Context> context;  // none if there is no way from spectra
    std::vector<float> spectra;
    std::vector<std::size_t> rows;
  };

  Kind& KindOf(const Vexdoc::Spectrum& spectrum);
  void Compute();
  void Clear();

  const Vexdoc::Conditions& request_;
  std::size_t channels_;
  const JobOptions& jobs_;
  Kind reflecting_;
  Kind emitting_;
  std::vector<Place> places_;
  std::vector<float> colors_;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_COLORBATCH_H
