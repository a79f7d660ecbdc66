#include "aldermoor/utilities/exceptions/traceableexception.h"

#include <ostream>

#include "aldermoor/utilities/tools/typename.h"

namespace Aldermoor::Utilities::Exceptions {
namespace {

bool g_use_implicite_stack_trace = false;

}  // namespace

Cause::Cause() : type_(&typeid(void)), empty_(true) {}

Cause::Cause(const std::exception& causing)
    : type_(&typeid(causing)), text_(causing.what()), empty_(false) {
  if (const auto* traceable = dynamic_cast<const TraceableException*>(&causing)) {
    where_ = traceable->where();
  }
}

Cause::~Cause() = default;

const char* Cause::what() const noexcept {
  return text_.c_str();
}

std::string Cause::GetTypeName() const {
  return Tools::TypeName(*type_);
}

TraceableException::TraceableException(const std::string& location) : where_{location} {}

TraceableException::TraceableException(const std::exception& cause, const std::string& location)
    : where_{location}, cause_(cause) {}

TraceableException::~TraceableException() = default;

void TraceableException::prepend(const std::string& /*context*/) {}

std::ostream& TraceableException::print_stack_trace(std::ostream& out) const {
  bool first = true;
  for (const std::string& location : where_) {
    if (!location.empty()) {
      out << (first ? "\t" : "\n\t") << location;
    }
    first = false;
  }
  if (!cause_.IsEmpty()) {
    out << "\ncaused by: " << cause_.GetTypeName() << ": " << cause_.what() << "\n";
    for (const std::string& location : cause_.where()) {
      if (!location.empty()) {
        out << "\t" << location << "\n";
      }
    }
  }
  return out;
}

void TraceableException::use_implicite_stack_trace(bool use) {
  g_use_implicite_stack_trace = use;
}

bool TraceableException::use_implicite_stack_trace() {
  return g_use_implicite_stack_trace;
}

}  // namespace Aldermoor::Utilities::Exceptions
