#ifndef ALDERMOOR_TRISTIM_INTERNALS_FAILURETEXTS_H
#define ALDERMOOR_TRISTIM_INTERNALS_FAILURETEXTS_H

#include <string>

/// What is said of requests that have no way; the same for one colour and for arrays.
namespace Aldermoor::Tristim::Internals {

inline std::string NoColorSpace(const std::string& color_space) {
  return "GetVector not supported for ColorSpace " + color_space;
}

inline std::string NoConversion(const std::string& from, const std::string& to) {
  return "Conversion not supported from ColorSpace " + from + " to ColorSpace " + to;
}

inline std::string NoFormula(const std::string& formula) {
  return "GetDeltaE not supported for DeltaEFormula " + formula;
}

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_FAILURETEXTS_H
