#include "aldermoor/vexdoc/conditions.h"

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Vexdoc {

using Utilities::Exceptions::Filled;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

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
    // All copies first, for memory may be short.
    std::string id(other.id_);
    std::map<std::string, std::string> attributes(other.attributes_);
    NoteChange();
    id_.swap(id);
    attributes_.swap(attributes);
    custom_illumination_ = other.custom_illumination_;
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Conditions::operator=)

Conditions::~Conditions() = default;

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

bool Conditions::Equals(const Conditions& other) const {
  if (HasCustomIllumination() != other.HasCustomIllumination() ||
      attributes_ != other.attributes_) {
    return false;
  }
  if (!HasCustomIllumination()) {
    return true;
  }
  // A custom illumination that the attributes do not refer to is not compared.
  const auto illumination = attributes_.find(ConditionKeys::kIllumination);
  return illumination == attributes_.end() || illumination->second != ConditionKeys::kUserdefined ||
         custom_illumination_->Equals(*other.custom_illumination_);
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

}  // namespace Aldermoor::Vexdoc
