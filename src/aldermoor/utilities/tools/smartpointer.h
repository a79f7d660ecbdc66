#ifndef ALDERMOOR_UTILITIES_TOOLS_SMARTPOINTER_H
#define ALDERMOOR_UTILITIES_TOOLS_SMARTPOINTER_H

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <utility>

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/typename.h"

namespace Aldermoor::Utilities::Tools {

/// The number of SmartPointer values that share one object, in 16 bits.
///
/// At 65,535 it sticks: from then on the object is held for ever, which costs its memory and keeps
/// everybody's pointer good.
class ReferenceCount {
 public:
  static ALDERMOOR_EXPORT ReferenceCount* New();
  static ALDERMOOR_EXPORT void Delete(ReferenceCount* count);

  static constexpr std::uint16_t kStuck = std::numeric_limits<std::uint16_t>::max();

  void Increase() { count_ = count_ == kStuck ? kStuck : static_cast<std::uint16_t>(count_ + 1); }
  /// True when nobody is left.
  bool Decrease() {
    if (count_ == kStuck) {
      return false;
    }
    return --count_ == 0;
  }
  std::uint16_t Get() const { return count_; }

 private:
  std::uint16_t count_ = 0;
};

/// Shared owner of a heap object; the object itself needs no counter.
///
/// Ownership: the last SmartPointer deletes the object as a `T`, so bases need virtual destructors.
/// An assignment takes the new object over before it gives up the old one, so that the source may
/// live in the old one: `node = node->next`.
/// The count has no lock: all pointers to one object stay in one thread.  Throws:
/// NullPointerException from operator-> and operator* when empty.
template <class T>
class SmartPointer {
 public:
  SmartPointer() = default;

  /// Empty; from the word `nullptr` alone, so that 0 goes on to the forms below.
  template <std::same_as<std::nullptr_t> Null>
  SmartPointer(Null /*null*/) {}  // NOLINT(google-explicit-constructor)

  /// Takes ownership; null gives an empty pointer.
  explicit SmartPointer(T* pointee) {
    if (pointee != nullptr) {
      std::unique_ptr<T> guard(pointee);  // the count is allocated before the object is ours
      count_ = ReferenceCount::New();
      pointee_ = guard.release();
      count_->Increase();
    }
  }

  /// Shares the object of `other` under another of its types, for casts: `pointee` is that object,
  /// or null if the cast failed, which makes an empty pointer.
  template <class U>
  SmartPointer(T* pointee, const SmartPointer<U>& other) {
    if (pointee != nullptr && other.count_ != nullptr) {
      Share(pointee, other.count_);
    }
  }

  SmartPointer(const SmartPointer& other) { Share(other.pointee_, other.count_); }

  SmartPointer(SmartPointer&& other) noexcept : count_(other.count_), pointee_(other.pointee_) {
    other.count_ = nullptr;
    other.pointee_ = nullptr;
  }

  /// From a pointer to a derived class.
  template <class U>
  requires(std::is_convertible_v<U*, T*> && !std::is_same_v<U, T>)
      SmartPointer(const SmartPointer<U>& other) {  // NOLINT(google-explicit-constructor)
    Share(other.pointee_, other.count_);
  }

  ~SmartPointer() { Release(); }

  SmartPointer& operator=(const SmartPointer& other) {
    if (this != &other) {
      SmartPointer(other).Swap(*this);
    }
    return *this;
  }

  SmartPointer& operator=(SmartPointer&& other) noexcept {
    if (this != &other) {
      SmartPointer(std::move(other)).Swap(*this);
    }
    return *this;
  }

  /// Only 0 is accepted; it empties the pointer.  Throws: std::invalid_argument for other values.
  SmartPointer& operator=(long value) {
    if (value != 0) {
      throw std::invalid_argument("SmartPointer<T>& operator =(long) argument was != Zero");
    }
    return *this = SmartPointer();
  }

  T* operator->() const {
    if (pointee_ == nullptr) [[unlikely]] {
      FailNull("operator ->");
    }
    return pointee_;
  }

  T& operator*() const {
    if (pointee_ == nullptr) [[unlikely]] {
      FailNull("operator *");
    }
    return *pointee_;
  }

  bool IsNull() const { return pointee_ == nullptr; }
  explicit operator bool() const { return pointee_ != nullptr; }

  /// The raw pointer, null when empty; no ownership.
  T* Get() const { return pointee_; }

  /// How many SmartPointer values share the object; 0 when empty.
  std::uint16_t UseCount() const { return count_ == nullptr ? std::uint16_t{0} : count_->Get(); }

 private:
  template <class U>
  friend class SmartPointer;

  void Share(T* pointee, ReferenceCount* count) {
    pointee_ = pointee;
    count_ = count;
    if (count_ != nullptr) {
      count_->Increase();
    }
  }

  void Swap(SmartPointer& other) noexcept {
    std::swap(count_, other.count_);
    std::swap(pointee_, other.pointee_);
  }

  void Release() {
    ReferenceCount* const count = count_;
    T* const pointee = pointee_;
    count_ = nullptr;  // first, since the object's own destructor may come back here
    pointee_ = nullptr;
    if (count != nullptr && count->Decrease()) {
      delete pointee;
      ReferenceCount::Delete(count);
    }
  }

  [[noreturn]] static void FailNull(const char* operation);

  ReferenceCount* count_ = nullptr;
  T* pointee_ = nullptr;
};

template <class T>
void SmartPointer<T>::FailNull(const char* operation) {
  const auto name = [operation] {
    return "Aldermoor::Utilities::Tools::SmartPointer<" + TypeName<T>() + ">::" + operation;
  };
  try {
    throw Exceptions::NullPointerException(
        static_cast<const T*>(nullptr),
        Exceptions::MakeLocation("", name().c_str(), __FILE__, __LINE__));
  }
  ALDERMOOR_TEMPLATE_FRAME(name())
}

/// Whether two pointers share one object, or are both empty.
template <class T, class U>
bool IsSame(const SmartPointer<T>& first, const SmartPointer<U>& second) {
  return first.Get() == second.Get();
}

/// The same for pointers to a class and to one derived from it.
template <class T, class U>
requires(std::is_convertible_v<T*, U*> || std::is_convertible_v<U*, T*>) bool operator==(
    const SmartPointer<T>& first, const SmartPointer<U>& second) {
  return IsSame(first, second);
}

template <class T>
bool operator==(const SmartPointer<T>& pointer, std::nullptr_t) {
  return pointer.IsNull();
}

/// `other` as a pointer to the derived class `To`; empty if the object is none.
template <class To, class From>
SmartPointer<To> DynamicCast(const SmartPointer<From>& other) {
  return SmartPointer<To>(dynamic_cast<To*>(other.Get()), other);
}

}  // namespace Aldermoor::Utilities::Tools

#endif  // ALDERMOOR_UTILITIES_TOOLS_SMARTPOINTER_H
