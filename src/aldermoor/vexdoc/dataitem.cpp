#include "aldermoor/vexdoc/dataitem.h"

#include <stdexcept>

#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Vexdoc {

DataItem::DataItem(const std::string& name, const std::string& value) try
    : name_(name), value_(value) {}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::DataItem::DataItem)

std::string DataItem::GetAttribute(const std::string& name) const try {
  const auto entry = attributes_.find(name);
  return entry == attributes_.end() ? "" : entry->second;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::DataItem::GetAttribute)

void DataItem::SetAttribute(const std::string& name, const std::string& value) try {
  if (name.empty()) {
    throw std::invalid_argument("DataItem::SetAttribute(): name is empty !!!");
  }
  attributes_.insert_or_assign(name, value);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::DataItem::SetAttribute)

}  // namespace Aldermoor::Vexdoc
