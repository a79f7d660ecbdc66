#include "aldermoor/utilities/exceptions/frame.h"

#include <typeinfo>

#include "aldermoor/utilities/exceptions/exceptions.h"

namespace Aldermoor::Utilities::Exceptions {
namespace {

using Thrower = void (*)(const std::string& message, const std::string& location);

template <class Traceable>
[[noreturn]] void Throw(const std::string& message, const std::string& location) {
  throw Traceable(message, location);
}

struct Translation {
  const std::type_info& type;
  Thrower thrower;
};

// Exact types: a class derived from one of these is a type of its own.
const Translation kTranslations[] = {
    {typeid(std::runtime_error), Throw<RuntimeException>},
    {typeid(std::overflow_error), Throw<OverflowException>},
    {typeid(std::underflow_error), Throw<UnderflowException>},
    {typeid(std::range_error), Throw<RangeException>},
    {typeid(std::logic_error), Throw<LogicException>},
    {typeid(std::domain_error), Throw<DomainException>},
    {typeid(std::invalid_argument), Throw<InvalidArgumentException>},
    {typeid(std::length_error), Throw<LengthException>},
    {typeid(std::out_of_range), Throw<OutOfRangeException>},
    {typeid(std::bad_alloc), Throw<BadAllocException>},
    {typeid(std::bad_typeid), Throw<BadTypeidException>},
    {typeid(std::bad_cast), Throw<BadCastException>},
};

}  // namespace

ExceptionTranslator::ExceptionTranslator(const std::string& location) : location_(location) {}

void ExceptionTranslator::Rethrow(const std::exception& e) const {
  for (const Translation& translation : kTranslations) {
    if (translation.type == typeid(e)) {
      translation.thrower(e.what(), location_);
    }
  }
  throw RuntimeException(Tools::TypeName(typeid(e)) + " " + e.what(), location_);
}

void AddLocation(const char* function, const char* file, unsigned int line) {
  try {
    throw;
  } catch (TraceableException& e) {
    e.where().push_back(MakeLocation("", function, file, line));
    throw;
  } catch (std::exception& e) {
    ExceptionTranslator(MakeLocation("", function, file, line)).Rethrow(e);
  } catch (...) {
    throw RuntimeException("unkown exception caught", MakeLocation("", function, file, line));
  }
}

void AddLocation(const std::string& function, const char* file, unsigned int line) {
  AddLocation(function.c_str(), file, line);
}

}  // namespace Aldermoor::Utilities::Exceptions
