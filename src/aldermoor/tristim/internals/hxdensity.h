#ifndef ALDERMOOR_TRISTIM_INTERNALS_HXDENSITY_H
#define ALDERMOOR_TRISTIM_INTERNALS_HXDENSITY_H

#include <array>
#include <vector>

#include "aldermoor/tristim/hxmeasureconditions.h"
#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Tristim::Internals {

/// Four densities: black (visual), cyan, magenta, yellow.
///
/// Ownership: value; the user-defined filter is shared between copies.
class HXDensity {
 public:
  /// Curves of 36 values each.
  using UserFilter = Utilities::Tools::SmartPointer<std::vector<std::array<float, 36>>>;

  /// Zeros, not valid, of no standard.
  HXDensity() = default;
  /// Valid.
  HXDensity(float black, float cyan, float magenta, float yellow,
            const HXMeasureConditions& conditions, int standard, UserFilter userFilter);

  /// Not checked; `channel` is 0..3, also in the next three operations.
  float GetDensity(unsigned short channel) const { return densities_[channel]; }
  /// Does not make the object valid.
  void SetDensity(float value, int channel) { densities_[static_cast<unsigned>(channel)] = value; }
  float operator[](unsigned short channel) const { return densities_[channel]; }
  float& operator[](unsigned short channel) { return densities_[channel]; }

  /// By density filter mode: "Auto" (5) is the channel that would be reported, "Max" (4) is 0, any
  /// other is a channel.  A plain literal takes this form: use ByMode and ByChannel.
  float operator[](int mode) const;

  float ByChannel(int channel) const { return densities_[static_cast<unsigned>(channel)]; }
  float ByMode(int mode) const { return (*this)[mode]; }
  const Quadruple& GetAll() const { return densities_; }
  void SetAll(const Quadruple& densities) { densities_ = densities; }

  /// Takes the first four, and makes the object valid.
  void SetAllDensities(const std::vector<float>& values);
  bool IsValid() const { return is_valid_; }

  int GetDensityStd() const { return standard_; }
  void SetDensityStd(int standard) { standard_ = standard; }
  UserFilter GetUserDefinedFilter() const { return user_filter_; }
  void SetUserDefinedFilter(const UserFilter& filter) { user_filter_ = filter; }
  HXMeasureConditions GetPhysMeasCond() const { return conditions_; }
  void SetPhysMeasCond(const HXMeasureConditions& conditions) { conditions_ = conditions; }

 private:
  Quadruple densities_{};
  bool is_valid_ = false;
  UserFilter user_filter_;
  int standard_ = -1;
  HXMeasureConditions conditions_;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_HXDENSITY_H
