#include "aldermoor/tristim/internals/lab2spec.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>

#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr std::size_t kBands = HXSpectrum::kBands;
constexpr float kStart = 0.5F;
constexpr double kFar = 1e38;
// From this squared error in XYZ on the colour difference is looked at.
constexpr double kNear = 0.001;
constexpr double kLeastProgress = 1e-15;

float Dot(const Triple& a, const Triple& b) {
  return a[0] * b[0] + a[1] * b[1] + a[2] * b[2];
}

float Length(const Triple& a) {
  return std::sqrt(Dot(a, a));
}

/// XYZ of bare values under one set of conditions, and back to Lab; as the calculator does it,
/// without its objects.
class Observation {
 public:
  /// False, as the calculator has it, without the paper white that the conditions ask for.
  [[nodiscard]] bool Prepare(const HXMeasureConditions& conditions) {
    is_relative_ =
        conditions.GetWhiteBase() == WhiteBase::Paper &&
        conditions.GetIllumination().GetIlluminationType() != IlluminationType::kEmission;
    if (is_relative_) {
      HXSpectrum paper;
      if (!BaseCalculator::GetPaperSpectrum(conditions, paper)) {
        return false;
      }
      paper_ = paper.GetBands();
    }
    TristimFilter& filter = TristimFilter::Get();
    filter.SetMeasuringConditions(conditions);
    weights_ = {filter[0], filter[1], filter[2]};
    white_ = {filter.GetFilterSum(0), filter.GetFilterSum(1), filter.GetFilterSum(2)};
    return true;
  }

  Triple Xyz(const HXSpectrum::Bands& values) const {
    if (!is_relative_) {
      return XyzFromSpectrum(weights_, values.data());
    }
    HXSpectrum::Bands relative;
    std::transform(values.begin(), values.end(), paper_.begin(), relative.begin(),
                   [](float value, float paper) { return value / paper; });
    return XyzFromSpectrum(weights_, relative.data());
  }
  Triple Lab(const Triple& xyz) const { return LabFromXyz(xyz, white_); }
  Triple XyzOfLab(const Triple& lab) const { return XyzFromLab(lab, white_); }

 private:
  bool is_relative_ = false;
  HXSpectrum::Bands paper_{};
  AxisWeights weights_{};
  Triple white_{};
};

class Search {
 public:
  Search(const Observation& observation, const HXColorVector& lab)
      : observation_(observation), lab_(lab.GetChannels()) {
    for (std::size_t band = 0; band < kBands; ++band) {
      HXSpectrum::Bands unit{};
      unit[band] = 1.0F;
      response_[band] = observation_.Xyz(unit);
      length_[band] = Length(response_[band]);
    }
    target_ = observation_.XyzOfLab({lab[0], lab[1], lab[2]});
    for (float& value : target_) {
      value = value < 0.0F ? 0.0F : value;
    }
    values_.fill(kStart);
    UpdateError();
  }

  [[nodiscard]] bool Run(double most_delta_e, bool use_94, int most_iterations) {
    double former = kFar;
    for (int iteration = 1;; ++iteration) {
      MoveBestBand();
      UpdateError();
      const double error = static_cast<double>(Dot(error_, error_));
      const bool is_near = error < kNear && DeltaE(use_94) < most_delta_e;
      if (former - error < kLeastProgress || iteration > most_iterations) {
        return false;  // also where the limit was reached in the same step
      }
      if (is_near) {
        return true;
      }
      former = error;
    }
  }

  const HXSpectrum::Bands& GetValues() const { return values_; }

 private:
  // The band whose response points best along the error, if it has room in that direction.
  void MoveBestBand() {
    const float error_length = Length(error_);
    double best_angle = kFar;
    double best_cosine = 0.0;
    std::size_t best = kBands;
    for (std::size_t band = 0; band < kBands; ++band) {
      const double dot = static_cast<double>(Dot(response_[band], error_));
      const float value = values_[band];
      if (!((dot >= 0.0 && value < 1.0F) || (dot < 0.0 && value > 0.0F))) {
        continue;
      }
      const double denominator =
          static_cast<double>(length_[band]) * static_cast<double>(error_length);
      const double cosine = denominator > 0.0 ? std::clamp(dot / denominator, -1.0, 1.0) : 0.0;
      // A smaller cosine is never the smaller angle, and the arc cosine costs more than all else.
      if (best != kBands && !(std::abs(cosine) > std::abs(best_cosine))) {
        continue;
      }
      const double angle = std::acos(std::abs(cosine));
      if (angle < best_angle) {
        best_angle = angle;
        best_cosine = cosine;
        best = band;
      }
    }
    if (best < kBands && length_[best] > 0.0F) {
      const auto cosine = static_cast<float>(best_cosine);
      values_[best] = std::clamp(cosine * error_length / length_[best] + values_[best], 0.0F, 1.0F);
    }
  }

  void UpdateError() {
    current_ = observation_.Xyz(values_);
    for (std::size_t i = 0; i < error_.size(); ++i) {
      error_[i] = target_[i] - current_[i];
    }
  }

  double DeltaE(bool use_94) const {
    const auto [l, a, b] = observation_.Lab(current_);
    const Quadruple lab = {l, a, b, 0.0F};
    return static_cast<double>(use_94 ? DeltaE94(lab, lab_, {1.0F, 1.0F, 1.0F})
                                      : DeltaE76(lab, lab_));
  }

  const Observation& observation_;
  const Quadruple lab_;
  std::array<Triple, kBands> response_{};
  std::array<float, kBands> length_{};
  Triple target_{};
  Triple current_{};
  Triple error_{};
  HXSpectrum::Bands values_{};
};

}  // namespace

bool Lab2Spec::GetSpectrum(const HXColorVector& lab, HXSpectrum& spectrum, double maxDeltaE,
                           bool useDeltaE94, int maxIterations) const try {
  Observation observation;
  if (!observation.Prepare(lab.GetMeasureConditions())) {
    return false;
  }
  Search search(observation, lab);
  const bool is_found = search.Run(maxDeltaE, useDeltaE94, maxIterations);
  spectrum = HXSpectrum(search.GetValues().data(), lab.GetMeasureConditions());
  return is_found;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Lab2Spec::GetSpectrum)

}  // namespace Aldermoor::Tristim::Internals
