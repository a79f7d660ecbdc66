#ifndef ALDERMOOR_TRISTIM_INTERNALS_INITIALISATOR_H
#define ALDERMOOR_TRISTIM_INTERNALS_INITIALISATOR_H

#include <functional>
#include <map>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/tristim/internals/neverdestroyed.h"

namespace Aldermoor::Tristim::Internals {

/// The supported values of every key of the conditions, and the channel labels of every colour
/// space under "ColorSpaceDescription." and its word: the absolute ones first, then the delta ones.
///
/// Shared state: one object for the process, built by the first HXMeasureConditions or the first
/// look-up, whichever comes first, and never destroyed.
class Initialisator {
 public:
  static Initialisator& Get();

  /// The list of `key`.  An unknown key gets an empty list, which then stays.
  const std::vector<std::string>& GetSupportedValues(std::string_view key);

 private:
  friend class NeverDestroyed<Initialisator>;

  Initialisator();
  /// Takes the words in front of the first "Undefined".
  void AddType(std::string_view key, std::span<const std::string_view> words);

  std::map<std::string, std::vector<std::string>, std::less<>> supported_values_;
};

/// Base of HXMeasureConditions: its constructor makes the tables if nobody has yet, so that they
/// are there for static objects too.
///
/// Shared state: whether the tables are built.
class GlobalStringInitialisator {
 public:
  GlobalStringInitialisator() {
    if (initialisator_ == nullptr) [[unlikely]] {
      initialisator_ = &Initialisator::Get();
    }
  }
  GlobalStringInitialisator(const GlobalStringInitialisator&) = default;
  GlobalStringInitialisator& operator=(const GlobalStringInitialisator&) = default;

 protected:
  ~GlobalStringInitialisator() = default;

 private:
  static inline constinit Initialisator* initialisator_ = nullptr;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_INITIALISATOR_H
