#include "aldermoor/vexdoc/header.h"

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/datetime.h"

namespace Aldermoor::Vexdoc {

using Utilities::Tools::DateTime;

Header::Header(const std::string& name, const std::string& description) try {
  const std::string now = DateTime().GetDateTime();
  attributes_.emplace(kCreatedKey, now);
  attributes_.emplace(kModifiedKey, now);
  attributes_.emplace(kNameKey, name);
  if (!description.empty()) {
    attributes_.emplace(kDescriptionKey, description);
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::Header)

Header::Header(const Header& other) try
    : DeprecatedVexHeaderInterface(other), attributes_(other.attributes_) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::Header)

Header& Header::operator=(const Header& other) try {
  if (this != &other) {
    std::map<std::string, std::string> attributes(other.attributes_);
    attributes_.swap(attributes);
  }
  return *this;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::operator=)

Header::~Header() = default;

const std::map<std::string, std::string>& Header::GetAttributes() const {
  return attributes_;
}

std::string Header::GetAttribute(const std::string& key) const try {
  const auto entry = attributes_.find(key);
  return entry == attributes_.end() ? "" : entry->second;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::GetAttribute)

void Header::SetAttribute(const std::string& key, const std::string& value) try {
  // Files hold their keys in ascending order; the hint then spares the search.
  attributes_.insert_or_assign(attributes_.end(), key, value);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::SetAttribute)

void Header::RemoveAttribute(const std::string& key) try { attributes_.erase(key); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::RemoveAttribute)

std::string Header::GetName() const try { return GetAttribute(kNameKey); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::GetName)

void Header::SetDescription(const std::string& description) try {
  SetAttribute(kDescriptionKey, description);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::SetDescription)

std::string Header::GetDescription() const try { return GetAttribute(kDescriptionKey); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::GetDescription)

void Header::SetCreator(const std::string& creator) try { SetAttribute(kCreatorKey, creator); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::SetCreator)

std::string Header::GetCreator() const try { return GetAttribute(kCreatorKey); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::GetCreator)

void Header::SetModified() try { SetAttribute(kModifiedKey, DateTime().GetDateTime()); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::SetModified)

std::string Header::GetCreationDateTime() const try { return GetAttribute(kCreatedKey); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::GetCreationDateTime)

std::string Header::GetModificationDateTime() const try { return GetAttribute(kModifiedKey); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::GetModificationDateTime)

Header* Header::GetParent() {
  return parent_;
}

void Header::SetName(const std::string& name) try { SetAttribute(kNameKey, name); }
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Header::SetName)

}  // namespace Aldermoor::Vexdoc
