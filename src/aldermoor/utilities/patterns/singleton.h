#ifndef ALDERMOOR_UTILITIES_PATTERNS_SINGLETON_H
#define ALDERMOOR_UTILITIES_PATTERNS_SINGLETON_H

namespace Aldermoor::Utilities::Patterns {

/// Base of a class with one object per process, built at first use and never destroyed, so that
/// destructors of static objects may still use it.
/// `T` has a default constructor that only this base can reach.
template <class T>
class Singleton {
 public:
  static T& GetInstance() {
    static T& instance = *new T;
    return instance;
  }

  Singleton(const Singleton&) = delete;
  Singleton& operator=(const Singleton&) = delete;

 protected:
  Singleton() = default;
  ~Singleton() = default;
};

}  // namespace Aldermoor::Utilities::Patterns

#endif  // ALDERMOOR_UTILITIES_PATTERNS_SINGLETON_H
