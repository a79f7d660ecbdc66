#ifndef ALDERMOOR_TRISTIM_INTERNALS_INITIALISATOR_H
#define ALDERMOOR_TRISTIM_INTERNALS_INITIALISATOR_H

#include <atomic>
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
/// look-up, whichever comes first, in whichever thread; constant from then on and never destroyed.
class Initialisator {
 public:
  static Initialisator& Get();

  /// The list of `key`; an empty one for an unknown key.  It stays as long as the process.
  const std::vector<std::string>& GetSupportedValues(std::string_view key) const;

 private:
  friend class NeverDestroyed<Initialisator>;

  Initialisator();
  /// Takes the words in front of the first "Undefined".
  void AddType(std::string_view key, std::span<const std::string_view> words);

  std::map<std::string, std::vector<std::string>, std::less<>> supported_values_;
  std::vector<std::string> none_;
};

/// Base of HXMeasureConditions: its constructor makes the tables if nobody has yet, so that they
/// are there for static objects too.
///
/// Shared state: whether the tables are built, which several threads may ask at a time.
class GlobalStringInitialisator {
 public:
  GlobalStringInitialisator() {
    if (!is_built_.load(std::memory_order_acquire)) [[unlikely]] {
      Initialisator::Get();
      is_built_.store(true, std::memory_order_release);
    }
  }
  GlobalStringInitialisator(const GlobalStringInitialisator&) = default;
  GlobalStringInitialisator& operator=(const GlobalStringInitialisator&) = default;

 protected:
  ~GlobalStringInitialisator() = default;

 private:
  static inline constinit std::atomic<bool> is_built_ = false;
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_INITIALISATOR_H
