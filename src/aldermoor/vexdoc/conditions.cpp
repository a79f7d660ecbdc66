#include "aldermoor/vexdoc/conditions.h"

#include <cstddef>
#include <utility>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Vexdoc {

using Internals::ConditionManager;
using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

namespace {

bool HaveEqualAttributes(const Conditions& first, const Conditions& second) {
  return first.HasCustomIllumination() == second.HasCustomIllumination() &&
         first.GetAttributes() == second.GetAttributes();
}

}  // namespace

unsigned long Conditions::changes_of_shared_ = 0;

Conditions::Conditions() : Conditions("0") {}

Conditions::Conditions(const std::string& id) try : id_(id) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Conditions::Conditions)

Conditions::Conditions(const std::string& id, const Conditions& other) try
    : id_(id), attributes_(other.attributes_), custom_illumination_(other.custom_illumination_) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Conditions::Conditions)

Conditions::Conditions(const Conditions& other) try : Conditions(other.id_, other) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Conditions::Conditions)

Conditions& Conditions::operator=(const Conditions& other) try {
  if (this != &other) {
    // By a copy: `other` may be the block of the curve that is dropped here, and go with it.
    Conditions copy(other);
    NoteChange();
    id_.swap(copy.id_);
    attributes_.swap(copy.attributes_);
    std::swap(custom_illumination_, copy.custom_illumination_);
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Conditions::operator=)

// A curve may have conditions with a curve of their own, and so on: one after the other, since a
// long row of them would not fit on the stack.
Conditions::~Conditions() {
  SmartPointer<Spectrum> curve = std::move(custom_illumination_);
  while (curve.UseCount() == 1) {
    const SmartPointer<Conditions> block = curve->GetConditions();
    curve->SetConditions(SmartPointer<Conditions>());
    curve =
        block.UseCount() == 1 ? std::move(block->custom_illumination_) : SmartPointer<Spectrum>();
  }
}

std::string Conditions::GetID() const {
  return id_;
}

bool Conditions::HasCustomIllumination() const {
  return !custom_illumination_.IsNull();
}

const Spectrum& Conditions::GetCustomIllumination() const try {
  if (!HasCustomIllumination()) {
    throw ResourceNotAvailableException("User defined Illumination not defined!", "");
  }
  return *custom_illumination_;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Conditions::GetCustomIllumination)

void Conditions::SetCustomIllumination(const Spectrum& spectrum) try {
  const SmartPointer<Spectrum> illumination(new Spectrum(spectrum));
  NoteChange();
  custom_illumination_ = illumination;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Conditions::SetCustomIllumination)

// The look-ups and comparisons below have no frame: they are the inner loop of every request, and
// their failures are told apart by the frames of their callers.

std::string Conditions::AddAttribute(const std::string& key, const std::string& value) {
  if (key.empty()) {
    return "";
  }
  NoteChange();
  // Keys mostly come in ascending order, as files hold them; the hint then spares the search.
  const std::size_t count = attributes_.size();
  const auto entry = attributes_.try_emplace(attributes_.end(), key, value);
  if (attributes_.size() != count) {
    return "";
  }
  // `value` may lie in this very entry, so it is read before the entry changes.
  std::string old = value;
  entry->second.swap(old);
  return old;
}

std::string Conditions::GetAttribute(const std::string& key) const {
  const auto entry = attributes_.find(key);
  if (entry == attributes_.end()) {
    throw ResourceNotAvailableException(
        Filled("Condition Attribute <%NAME%> not found", "%NAME%", key), "");
  }
  return entry->second;
}

std::string Conditions::GetAttribute(const std::string& key,
                                     const std::string& defaultValue) const {
  const auto entry = attributes_.find(key);
  return entry == attributes_.end() ? defaultValue : entry->second;
}

void Conditions::RemoveAttribute(const std::string& key) {
  NoteChange();
  attributes_.erase(key);
}

void Conditions::RemoveAllAttributes() {
  NoteChange();
  attributes_.clear();
}

// A custom illumination that the attributes do not refer to is not compared.
bool Conditions::RefersToCustomIllumination() const {
  if (!HasCustomIllumination()) {
    return false;
  }
  const auto illumination = attributes_.find(ConditionKeys::kIllumination);
  return illumination != attributes_.end() && illumination->second == ConditionKeys::kUserdefined;
}

// Curves are compared as spectra are, by their conditions and then by their values; but in a loop,
// since their conditions may have curves again, thousands deep or in a ring.
bool Conditions::Equals(const Conditions& other) const {
  const Conditions* first = this;
  const Conditions* second = &other;
  bool have_equal_values = true;
  // A walk that comes back to a pair goes round for ever and finds nothing new.  The mark moves on
  // after 1, 2, 4 ... steps, so that it gets onto every ring.
  std::pair<const Conditions*, const Conditions*> mark;
  for (std::size_t step = 1, next_mark = 1; HaveEqualAttributes(*first, *second); ++step) {
    if (!first->RefersToCustomIllumination() || mark == std::pair(first, second)) {
      return have_equal_values;
    }
    if (step == next_mark) {
      mark = {first, second};
      next_mark *= 2;
    }
    const Spectrum& curve = *first->custom_illumination_;
    const Spectrum& other_curve = *second->custom_illumination_;
    have_equal_values = have_equal_values && curve.GetData() == other_curve.GetData();
    first = &*curve.GetConditions();
    second = &*other_curve.GetConditions();
  }
  return false;
}

bool Conditions::IsSubsetOf(const Conditions& other) const {
  if (other.attributes_.size() < attributes_.size()) {
    return false;
  }
  for (const auto& [key, value] : attributes_) {
    const auto entry = other.attributes_.find(key);
    if (entry == other.attributes_.end() || entry->second != value) {
      return false;
    }
    if (value == ConditionKeys::kUserdefined && key == ConditionKeys::kIllumination &&
        GetCustomIllumination() != other.GetCustomIllumination()) {
      return false;
    }
  }
  return true;
}

SmartPointer<Conditions> SharedConditions(const Conditions& conditions) try {
  return ConditionManager::GetInstance().GetOrCreateConditions(conditions);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::SharedConditions)

unsigned long ReleaseUnusedConditions() try {
  ConditionManager& manager = ConditionManager::GetInstance();
  const unsigned long count = manager.GetConditionsCount();
  manager.RemoveAllConditions(true);
  return count - manager.GetConditionsCount();
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ReleaseUnusedConditions)

}  // namespace Aldermoor::Vexdoc
